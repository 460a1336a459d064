#ifndef CVLOG_CVMESSAGEBUFFER_H
#define CVLOG_CVMESSAGEBUFFER_H

#include <ostream>
#include <string>
#include <type_traits>
#include <utility>

namespace CVLog {

class MessageStream;

namespace detail {

template <class T>
concept Streamable = requires(std::ostream& stream, const T& value) {
  stream << value;
};

/// What std::ostream prints by value; not text, bool and addresses, which have operations of their own.
template <class T>
concept Printable = Streamable<T> && !std::is_same_v<T, bool> && !std::is_pointer_v<T> && !std::is_array_v<T> &&
                    !std::is_null_pointer_v<T>;

}  // namespace detail

/// Accumulates the text of one message, and then of the next.
///
/// Text is appended at the price of a string append. What needs a std::ostream (numbers, manipulators,
/// anything after the first bool or pointer) borrows one that writes into the same text, in the classic
/// locale and with default formatting; it stays valid as long as the buffer. Any number of buffers may
/// live at once, in any threads; one buffer belongs to one thread at a time. Throws std::bad_alloc only.
class CVMessageBuffer {
 public:
  CVMessageBuffer() = default;
  CVMessageBuffer(const CVMessageBuffer&) = delete;
  CVMessageBuffer& operator=(const CVMessageBuffer&) = delete;
  ~CVMessageBuffer() {
    if (stream_ != nullptr) {
      giveBackStream();
    }
  }

  /// Appends the text; a null pointer appends nothing.
  CVMessageBuffer& operator<<(const char* text) {
    if (text != nullptr) {
      text_.append(text);
    }
    return *this;
  }
  CVMessageBuffer& operator<<(const std::string& text) {
    text_.append(text);
    return *this;
  }

  /// Appends 1 or 0.
  std::ostream& operator<<(bool value) {
    std::ostream& stream = *this;
    text_.push_back(value ? '1' : '0');
    return stream;
  }

  /// Appends anything else as std::ostream prints it: a number, an enumerator, a string view, a manipulator.
  /// (Without this, a number would convert to bool.)
  template <detail::Printable Value>
  std::ostream& operator<<(const Value& value) {
    return static_cast<std::ostream&>(*this) << value;
  }

  /// The stream that appends to this buffer. A stream that an earlier operation left failed comes back usable.
  // NOLINTNEXTLINE(google-explicit-constructor): the buffer is used where a stream is expected.
  operator std::ostream&() { return stream_ == nullptr ? borrowStream() : usableStream(); }

  /// The text so far; leaves the buffer empty and its stream, if it has one, as new. The stream must be
  /// one that a living CVMessageBuffer handed out; any other yields the empty text.
  static std::string str(std::ostream& stream);
  static std::string str(CVMessageBuffer& buffer) {
    if (buffer.stream_ == nullptr) {
      return std::exchange(buffer.text_, std::string());
    }
    buffer.resetStream();
    // A copy: the next text grows value by value, too, and finds the room of this one.
    std::string text = buffer.text_;
    buffer.text_.clear();
    return text;
  }

  /// Appends an address as std::ostream prints a const void*.
  std::ostream& appendAddress(const void* address);

 private:
  std::ostream& borrowStream();
  std::ostream& usableStream();
  void resetStream();
  void giveBackStream() noexcept;

  std::string text_;
  MessageStream* stream_ = nullptr;
};

/// Pointers to anything but text stand for themselves: their address is appended.
template <class T>
std::ostream& operator<<(CVMessageBuffer& buffer, const T* pointer) {
  return buffer.appendAddress(pointer);
}

}  // namespace CVLog

#endif
