#include "host/cli/Text.h"

#include <algorithm>

#include "platform/common/Hex.h"
#include "platform/instrumentation/tree/Utf8.h"

namespace Corvcim {
namespace {

unsigned byteAt(std::string_view text, std::size_t index) {
  return static_cast<unsigned char>(text[index]);
}

bool isContinuation(unsigned byte) {
  return (byte & 0xC0U) == 0x80U;
}

/// The length of the character at the start of valid UTF-8.
std::size_t characterLength(std::string_view text) {
  const unsigned first = byteAt(text, 0);
  return first >= 0xF0U ? 4 : first >= 0xE0U ? 3 : first >= 0xC0U ? 2 : 1;
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

std::string toPrintable(std::string_view text) {
  const std::string valid = toValidUtf8(text);
  std::string_view rest = valid;
  std::string result;
  result.reserve(valid.size());
  while (!rest.empty()) {
    const std::string_view character = rest.substr(0, characterLength(rest));
    const unsigned first = byteAt(character, 0);
    if (isC1Control(character)) {
      appendEscape(result, byteAt(character, 1));
    } else if (first < 0x20U || first == 0x7FU) {
      appendEscape(result, first);
    } else {
      result += character;
    }
    rest.remove_prefix(character.size());
  }
  return result;
}

std::size_t columns(std::string_view text) {
  return static_cast<std::size_t>(
      std::ranges::count_if(text, [](char c) { return !isContinuation(static_cast<unsigned char>(c)); }));
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
  std::size_t end = 0;
  std::size_t taken = 0;
  while (taken + 1 < width && end < text.size()) {
    end += characterLength(std::string_view(text).substr(end));
    ++taken;
  }
  return width == 0 ? "" : text.substr(0, end) + "…";
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
