#include "host/corvcim/text/Text.h"

#include <wchar.h>

#include <algorithm>
#include <array>
#include <iterator>

#include "platform/base/Hex.h"
#include "platform/inventory/tree/Utf8.h"

namespace Corvcim {
namespace {

unsigned byteAt(std::string_view text, std::size_t index) {
  return static_cast<unsigned char>(text[index]);
}

/// The length of the character at the start of valid UTF-8.
std::size_t characterLength(std::string_view text) {
  const unsigned first = byteAt(text, 0);
  return first >= 0xF0U ? 4 : first >= 0xE0U ? 3 : first >= 0xC0U ? 2 : 1;
}

Charset outputCharset = Charset::Utf8;

char32_t codePoint(std::string_view character) {
  constexpr std::array<unsigned, 5> leadBits = {0, 0x7FU, 0x1FU, 0x0FU, 0x07U};
  char32_t code = byteAt(character, 0) & leadBits[character.size()];
  for (std::size_t i = 1; i < character.size(); ++i) {
    code = (code << 6U) | (byteAt(character, i) & 0x3FU);
  }
  return code;
}

std::size_t widthOf(std::string_view character) {
  if (character.size() == 1 || outputCharset == Charset::Ascii) {
    return 1;
  }
  const int width = wcwidth(static_cast<wchar_t>(codePoint(character)));
  return width < 0 ? 1 : static_cast<std::size_t>(width);
}

/// Calls `use` with one character of valid UTF-8 after the other.
template <class Use>
void forEachCharacter(std::string_view text, Use use) {
  while (!text.empty()) {
    const std::string_view character = text.substr(0, characterLength(text));
    use(character);
    text.remove_prefix(character.size());
  }
}

struct Substitute {
  std::string_view character;
  char ascii;
};
constexpr std::array<Substitute, 7> substitutes = {
    {{"·", '-'}, {"×", 'x'}, {"…", '~'}, {"─", '-'}, {"│", '|'}, {"└", '`'}, {"├", '|'}}};

void appendInCharset(std::string& text, std::string_view character) {
  if (character.size() == 1 || outputCharset == Charset::Utf8) {
    text += character;
    return;
  }
  const auto* const substitute = std::ranges::find(substitutes, character, &Substitute::character);
  if (substitute != substitutes.end()) {
    text += substitute->ascii;
  } else {
    constexpr char32_t basicPlane = 0x10000;
    const char32_t code = codePoint(character);
    text += code < basicPlane ? "\\u" : "\\U";
    text += Tarn::Common::hexText(code, code < basicPlane ? 4 : 8, Tarn::Common::hexCapitals);
  }
}

void appendEscape(std::string& text, unsigned byte) {
  switch (byte) {
    case '\n':
      text += "\\n";
      return;
    case '\r':
      text += "\\r";
      return;
    case '\t':
      text += "\\t";
      return;
    default:
      text += "\\x";
      Tarn::Common::appendHex(text, static_cast<unsigned char>(byte), Tarn::Common::hexCapitals);
  }
}

/// C1 controls, which terminals obey like ESC sequences, are two bytes in UTF-8: C2 80 to C2 9F.
bool isC1Control(std::string_view character) {
  return character.size() == 2 && byteAt(character, 0) == 0xC2U && byteAt(character, 1) < 0xA0U;
}

}  // namespace

std::string toValidUtf8(std::string_view text) {
  return Tarn::Inventory::validUtf8(text);
}

void useCharset(Charset charset) {
  outputCharset = charset;
}

std::string inCharset(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  forEachCharacter(toValidUtf8(text), [&](std::string_view character) { appendInCharset(result, character); });
  return result;
}

std::string toPrintable(std::string_view text) {
  std::string result;
  result.reserve(text.size());
  forEachCharacter(toValidUtf8(text), [&](std::string_view character) {
    const unsigned first = byteAt(character, 0);
    if (isC1Control(character)) {
      appendEscape(result, byteAt(character, 1));
    } else if (first < 0x20U || first == 0x7FU) {
      appendEscape(result, first);
    } else {
      appendInCharset(result, character);
    }
  });
  return result;
}

std::size_t columns(std::string_view text) {
  std::size_t count = 0;
  forEachCharacter(text, [&](std::string_view character) { count += widthOf(character); });
  return count;
}

std::string padRight(std::string text, std::size_t width) {
  const std::size_t taken = columns(text);
  if (taken < width) {
    text.append(width - taken, ' ');
  }
  return text;
}

std::string shorten(const std::string& text, std::size_t width) {
  if (columns(text) <= width) {
    return text;
  }
  if (width == 0) {
    return "";
  }
  std::string shortened;
  std::size_t taken = 1;  // by the mark
  bool isFull = false;
  forEachCharacter(text, [&](std::string_view character) {
    taken += widthOf(character);
    isFull = isFull || taken > width;
    shortened += isFull ? std::string_view() : character;
  });
  return shortened + "…";
}

std::string numberListText(const std::vector<unsigned int>& numbers) {
  std::string text;
  for (const unsigned int number : numbers) {
    text += (text.empty() ? "" : ", ") + std::to_string(number);
  }
  return text.empty() ? "(none)" : text;
}

std::string counted(std::uint64_t count, std::string_view noun) {
  return std::to_string(count) + ' ' + std::string(noun) + (count == 1 ? "" : "s");
}

}  // namespace Corvcim
