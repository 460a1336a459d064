#ifndef HOST_CORVCIM_TEXT_TEXT_H
#define HOST_CORVCIM_TEXT_TEXT_H

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// The characters that output may have.
enum class Charset { Utf8, Ascii };

/// Sets the character set of this process's output; UTF-8 unless it is set.
void useCharset(Charset charset);

/// The text in the character set in use. ASCII has "x" for "×" and the like for the signs of drawings, each as wide
/// as before, and escapes such as \u00E9 for any other character.
std::string inCharset(std::string_view text);

/// The text in valid UTF-8: every byte that belongs to no character becomes U+FFFD.
std::string toValidUtf8(std::string_view text);

/// The text for a terminal's line: in the character set in use, and control characters as escapes (\n, \t, \x1B), so
/// that a name in the inventory cannot move the cursor.
std::string toPrintable(std::string_view text);

/// The columns that valid UTF-8 takes on a terminal, by wcwidth(): 2 for a wide character, 0 for a combining one. A
/// character that the process's locale does not know takes one.
std::size_t columns(std::string_view text);

/// Valid UTF-8, filled with blanks on the right up to that many columns.
std::string padRight(std::string text, std::size_t width);

/// Valid UTF-8, shortened at the end to at most that many columns; what was cut shows as "…".
std::string shorten(const std::string& text, std::size_t width);

/// "1, 2, 8"; "(none)" for an empty list.
std::string numberListText(const std::vector<unsigned int>& numbers);

/// "1 core", "2 cores".
std::string counted(std::uint64_t count, std::string_view noun);

}  // namespace Corvcim

#endif
