#ifndef CORVANE_PLATFORM_CVLOG_MESSAGESTREAM_H
#define CORVANE_PLATFORM_CVLOG_MESSAGESTREAM_H

#include <ostream>
#include <streambuf>
#include <string>

namespace CVLog {

class CVMessageBuffer;

/// The stream that a CVMessageBuffer hands out: unbuffered, so that the buffer's text is always complete.
///
/// Constructing a std::ostream costs more than a whole log event, so these are reused. The pool of idle
/// streams is a fixed set of atomic slots: no locks, no per-thread state, and the library can be unloaded
/// while threads that have logged live on.
class MessageStream final : public std::ostream {
 public:
  /// An idle stream, or a new one where none is idle, that appends to `text` for `owner`.
  static MessageStream& borrow(CVMessageBuffer& owner, std::string& text);
  /// The stream becomes idle. Its owner's text is not touched again.
  static void giveBack(MessageStream& stream) noexcept;

  MessageStream(const MessageStream&) = delete;
  MessageStream& operator=(const MessageStream&) = delete;
  ~MessageStream() override = default;

  [[nodiscard]] CVMessageBuffer& owner() const { return *owner_; }

  /// Puts back everything that a user of the stream may have changed: state, format, locale, destination.
  void reset();

 private:
  class Appender final : public std::streambuf {
   public:
    std::string* text = nullptr;

   protected:
    int_type overflow(int_type character) override;
    std::streamsize xsputn(const char* characters, std::streamsize count) override;
  };

  MessageStream();

  Appender appender_;
  CVMessageBuffer* owner_ = nullptr;
};

}  // namespace CVLog

#endif
