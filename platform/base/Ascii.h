#ifndef CORVANE_PLATFORM_BASE_ASCII_H
#define CORVANE_PLATFORM_BASE_ASCII_H

#include <algorithm>
#include <string_view>

/// Letters and cases as ASCII has them, whatever locale the process runs in.
namespace Tarn::Common {

constexpr bool isDigit(char c) {
  return c >= '0' && c <= '9';
}
constexpr bool isLower(char c) {
  return c >= 'a' && c <= 'z';
}
constexpr bool isUpper(char c) {
  return c >= 'A' && c <= 'Z';
}
constexpr bool isLetter(char c) {
  return isLower(c) || isUpper(c);
}
constexpr bool isControl(char c) {
  return static_cast<unsigned char>(c) < ' ' || c == '\x7F';
}
constexpr char lower(char c) {
  return isUpper(c) ? static_cast<char>(c - 'A' + 'a') : c;
}
constexpr char upper(char c) {
  return isLower(c) ? static_cast<char>(c - 'a' + 'A') : c;
}

constexpr bool equalIgnoringCase(std::string_view left, std::string_view right) {
  return std::equal(left.begin(), left.end(), right.begin(), right.end(),
                    [](char a, char b) { return lower(a) == lower(b); });
}

constexpr bool lessIgnoringCase(std::string_view left, std::string_view right) {
  return std::lexicographical_compare(left.begin(), left.end(), right.begin(), right.end(),
                                      [](char a, char b) { return lower(a) < lower(b); });
}

/// The text without these characters at both ends; by default blanks, tabs and carriage returns, which surround a word
/// in a text file.
constexpr std::string_view trimmed(std::string_view text, std::string_view white = " \t\r") {
  const std::size_t first = text.find_first_not_of(white);
  if (first == std::string_view::npos) {
    return {};
  }
  return text.substr(first, text.find_last_not_of(white) - first + 1);
}

}  // namespace Tarn::Common

#endif
