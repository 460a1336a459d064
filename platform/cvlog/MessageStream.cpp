#include "platform/cvlog/MessageStream.h"

#include <array>
#include <atomic>
#include <locale>
#include <memory>

namespace CVLog {
namespace {

/// Idle streams. A slot is taken and filled by one atomic exchange, so two threads never get the same stream.
class IdleStreams {
 public:
  constexpr IdleStreams() = default;
  IdleStreams(const IdleStreams&) = delete;
  IdleStreams& operator=(const IdleStreams&) = delete;

  ~IdleStreams() {
    closed_.store(true);
    while (std::unique_ptr<MessageStream> stream = take()) {
    }
  }

  std::unique_ptr<MessageStream> take() noexcept {
    for (auto& slot : slots_) {
      if (slot.load(std::memory_order_relaxed) == nullptr) {
        continue;
      }
      if (MessageStream* stream = slot.exchange(nullptr, std::memory_order_acquire)) {
        return std::unique_ptr<MessageStream>(stream);
      }
    }
    return nullptr;
  }

  /// Keeps the stream where a slot is free; frees it otherwise.
  void put(std::unique_ptr<MessageStream> stream) noexcept {
    if (closed_.load(std::memory_order_relaxed)) {
      return;
    }
    for (auto& slot : slots_) {
      MessageStream* empty = nullptr;
      if (slot.compare_exchange_strong(empty, stream.get(), std::memory_order_release, std::memory_order_relaxed)) {
        (void)stream.release();
        return;
      }
    }
  }

 private:
  // As many requests as brokers run at once in one library, with two buffers each.
  std::array<std::atomic<MessageStream*>, 16> slots_{};
  std::atomic<bool> closed_ = false;
};

constinit IdleStreams idleStreams;

}  // namespace

MessageStream::Appender::int_type MessageStream::Appender::overflow(int_type character) {
  if (!traits_type::eq_int_type(character, traits_type::eof())) {
    text->push_back(traits_type::to_char_type(character));
  }
  return traits_type::not_eof(character);
}

std::streamsize MessageStream::Appender::xsputn(const char* characters, std::streamsize count) {
  text->append(characters, static_cast<std::size_t>(count));
  return count;
}

MessageStream::MessageStream() : std::ostream(nullptr) {
  reset();
}

MessageStream& MessageStream::borrow(CVMessageBuffer& owner, std::string& text) {
  std::unique_ptr<MessageStream> stream = idleStreams.take();
  if (!stream) {
    stream.reset(new MessageStream);  // the constructor is private
  }
  stream->owner_ = &owner;
  stream->appender_.text = &text;
  return *stream.release();
}

void MessageStream::giveBack(MessageStream& stream) noexcept {
  try {
    stream.reset();
  } catch (const std::exception&) {
    delete &stream;
    return;
  }
  idleStreams.put(std::unique_ptr<MessageStream>(&stream));
}

void MessageStream::reset() {
  exceptions(goodbit);
  rdbuf(&appender_);
  tie(nullptr);
  flags(skipws | dec);
  precision(6);
  width(0);
  fill(' ');
  if (getloc() != std::locale::classic()) {
    imbue(std::locale::classic());
  }
}

}  // namespace CVLog
