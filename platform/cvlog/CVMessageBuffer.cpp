#include <cvlog/CVMessageBuffer.h>

#include <array>
#include <charconv>
#include <cstdint>
#include <typeinfo>

#include "platform/cvlog/MessageStream.h"

namespace CVLog {
namespace {

// Room for the parameter list of one call, so that a text that grows value by value is moved once at most.
constexpr std::size_t expectedText = 160;

}  // namespace

std::string CVMessageBuffer::str(std::ostream& stream) {
  if (typeid(stream) != typeid(MessageStream)) {
    return {};
  }
  return str(static_cast<MessageStream&>(stream).owner());
}

std::ostream& CVMessageBuffer::appendAddress(const void* address) {
  std::ostream& stream = *this;
  if (address == nullptr) {
    text_.push_back('0');
    return stream;
  }
  std::array<char, 2 * sizeof(void*)> digits{};
  const auto number = reinterpret_cast<std::uintptr_t>(address);
  const std::to_chars_result end = std::to_chars(digits.data(), digits.data() + digits.size(), number, 16);
  text_.append("0x").append(digits.data(), end.ptr);
  return stream;
}

std::ostream& CVMessageBuffer::borrowStream() {
  text_.reserve(expectedText);
  stream_ = &MessageStream::borrow(*this, text_);
  return *stream_;
}

std::ostream& CVMessageBuffer::usableStream() {
  if (!stream_->good()) {
    stream_->clear();
  }
  return *stream_;
}

void CVMessageBuffer::resetStream() {
  stream_->reset();
}

void CVMessageBuffer::giveBackStream() noexcept {
  MessageStream::giveBack(*stream_);
}

}  // namespace CVLog
