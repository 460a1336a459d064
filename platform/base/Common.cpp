#include <tarn/Common.h>

#include <algorithm>
#include <cstdint>
#include <type_traits>

namespace Tarn {
namespace {

constexpr std::uint32_t replacementCharacter = 0xfffd;

constexpr bool isCharacter(std::uint32_t code) {
  const bool isSurrogate = code >= 0xd800 && code <= 0xdfff;
  return code <= 0x10ffff && !isSurrogate;
}

/// A continuation byte with the six bits of the code that begin at `shift`.
constexpr char continuation(std::uint32_t code, unsigned shift) {
  return static_cast<char>(0x80 | ((code >> shift) & 0x3f));
}

void appendUtf8(std::string& text, std::uint32_t code) {
  if (code < 0x80) {
    text += static_cast<char>(code);
  } else if (code < 0x800) {
    text += static_cast<char>(0xc0 | (code >> 6));
    text += continuation(code, 0);
  } else if (code < 0x10000) {
    text += static_cast<char>(0xe0 | (code >> 12));
    text += continuation(code, 6);
    text += continuation(code, 0);
  } else {
    text += static_cast<char>(0xf0 | (code >> 18));
    text += continuation(code, 12);
    text += continuation(code, 6);
    text += continuation(code, 0);
  }
}

}  // namespace

std::string stripSpaces(std::string text) {
  text.erase(text.find_last_not_of(' ') + 1);  // all of it where there is nothing else: npos + 1 is 0
  text.erase(0, text.find_first_not_of(' '));
  return text;
}

std::string make_string(const std::wstring& text) {
  const auto codeOf = [](wchar_t unit) { return std::uint32_t{std::make_unsigned_t<wchar_t>(unit)}; };
  // Most texts are ASCII from end to end, or begin so.
  const auto firstBeyondAscii = std::ranges::find_if(text, [&](wchar_t unit) { return codeOf(unit) >= 0x80; });
  std::string utf8(static_cast<std::size_t>(firstBeyondAscii - text.begin()), '\0');
  std::transform(text.begin(), firstBeyondAscii, utf8.begin(), [](wchar_t unit) { return static_cast<char>(unit); });
  std::for_each(firstBeyondAscii, text.end(), [&](wchar_t unit) {
    const std::uint32_t code = codeOf(unit);
    appendUtf8(utf8, isCharacter(code) ? code : replacementCharacter);
  });
  return utf8;
}

}  // namespace Tarn
