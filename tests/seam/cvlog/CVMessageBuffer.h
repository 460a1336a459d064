#ifndef TESTS_SEAM_CVMESSAGEBUFFER_H
#define TESTS_SEAM_CVMESSAGEBUFFER_H

#include <locale>
#include <ostream>
#include <sstream>
#include <string>

namespace CVLog {

/// Has the promised operations and no other. A number that is streamed into the buffer itself, rather
/// than into its std::ostream, picks the bool overload here and comes out as 1 or 0.
class CVMessageBuffer {
 public:
  CVMessageBuffer() { stream_.imbue(std::locale::classic()); }
  CVMessageBuffer& operator<<(const char* text) {
    if (text != nullptr) {
      stream_ << text;
    }
    return *this;
  }
  CVMessageBuffer& operator<<(const std::string& text) {
    stream_ << text;
    return *this;
  }
  std::ostream& operator<<(bool value) { return stream_ << (value ? '1' : '0'); }
  // NOLINTNEXTLINE(google-explicit-constructor): the buffer is used where a stream is expected.
  operator std::ostream&() { return stream_; }

  static std::string str(std::ostream& stream) {
    auto& buffer = dynamic_cast<std::ostringstream&>(stream);
    std::string text = buffer.str();
    buffer.str(std::string());
    return text;
  }
  static std::string str(CVMessageBuffer& buffer) { return str(buffer.stream_); }

 private:
  std::ostringstream stream_;
};

template <class T>
std::ostream& operator<<(CVMessageBuffer& buffer, const T* pointer) {
  return static_cast<std::ostream&>(buffer) << static_cast<const void*>(pointer);
}

}  // namespace CVLog

#endif
