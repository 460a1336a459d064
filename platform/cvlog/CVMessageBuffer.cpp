#include <cvlog/CVMessageBuffer.h>

#include <array>
#include <atomic>
#include <charconv>
#include <cstdint>
#include <exception>
#include <locale>
#include <memory>
#include <streambuf>
#include <typeinfo>

namespace CVLog {

/// The stream of a CVMessageBuffer. It appends to the buffer's text at once, so that the text is always complete.
///
/// Constructing a std::ostream costs more than a whole log event, so the last one is reused. It waits in an atomic
/// slot: without a lock, without state of threads, and gone with the library while threads that logged live on.
class MessageStream final : public std::ostream {
 public:
  MessageStream() : std::ostream(nullptr) { reset(); }
  MessageStream(const MessageStream&) = delete;
  MessageStream& operator=(const MessageStream&) = delete;
  ~MessageStream() override = default;

  CVMessageBuffer* owner = nullptr;
  std::string* text = nullptr;  ///< of the owner

  /// Resets everything that a user of the stream may have changed: state, format, locale, destination.
  void reset() {
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

 private:
  class Appender final : public std::streambuf {
   public:
    explicit Appender(MessageStream& stream) : stream_(stream) {}

   protected:
    int_type overflow(int_type character) override {
      if (!traits_type::eq_int_type(character, traits_type::eof())) {
        stream_.text->push_back(traits_type::to_char_type(character));
      }
      return traits_type::not_eof(character);
    }
    std::streamsize xsputn(const char* characters, std::streamsize count) override {
      stream_.text->append(characters, static_cast<std::size_t>(count));
      return count;
    }

   private:
    MessageStream& stream_;
  };

  Appender appender_{*this};
};

namespace {

// Enough for the parameter list of one call, so that a text that grows value by value is moved once at most.
constexpr std::size_t expectedText = 160;

/// Keeps one stream for the next buffer that needs one.
class IdleStream {
 public:
  constexpr IdleStream() = default;
  IdleStream(const IdleStream&) = delete;
  IdleStream& operator=(const IdleStream&) = delete;
  ~IdleStream() {
    isClosed_.store(true);
    delete stream_.exchange(nullptr);
  }

  std::unique_ptr<MessageStream> take() {
    std::unique_ptr<MessageStream> stream(stream_.exchange(nullptr, std::memory_order_acquire));
    return stream ? std::move(stream) : std::make_unique<MessageStream>();
  }

  void put(std::unique_ptr<MessageStream> stream) noexcept {
    if (!isClosed_.load(std::memory_order_relaxed)) {
      stream.reset(stream_.exchange(stream.release(), std::memory_order_acq_rel));
    }
  }

 private:
  std::atomic<MessageStream*> stream_ = nullptr;
  std::atomic<bool> isClosed_ = false;
};

constinit IdleStream idleStream;

}  // namespace

std::string CVMessageBuffer::str(std::ostream& stream) {
  if (typeid(stream) != typeid(MessageStream)) {
    return {};
  }
  return str(*static_cast<MessageStream&>(stream).owner);
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
  stream_ = idleStream.take().release();
  stream_->owner = this;
  stream_->text = &text_;
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
  std::unique_ptr<MessageStream> stream(stream_);
  try {
    stream->reset();
  } catch (const std::exception&) {
    return;
  }
  idleStream.put(std::move(stream));
}

}  // namespace CVLog
