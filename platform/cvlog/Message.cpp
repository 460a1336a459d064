#include "platform/cvlog/Message.h"

#include <array>
#include <cstdio>

#include "platform/common/Hex.h"
#include "platform/cvlog/Level.h"

namespace CVLog {
namespace {

using std::chrono::days;
using std::chrono::floor;
using std::chrono::hh_mm_ss;
using std::chrono::milliseconds;
using std::chrono::system_clock;
using std::chrono::year_month_day;

bool mustEscape(char c) {
  const auto byte = static_cast<unsigned char>(c);
  return byte < 0x20 || byte == 0x7f || c == '\\';
}

void appendEscapedByte(std::string& line, char c) {
  switch (c) {
    case '\\':
      line += "\\\\";
      return;
    case '\n':
      line += "\\n";
      return;
    case '\r':
      line += "\\r";
      return;
    case '\t':
      line += "\\t";
      return;
    default:
      line += "\\x";
      Tarn::Common::appendHex(line, static_cast<unsigned char>(c));
  }
}

void appendEscaped(std::string& line, std::string_view text) {
  for (char c : text) {
    if (mustEscape(c)) {
      appendEscapedByte(line, c);
    } else {
      line += c;
    }
  }
}

/// A field before the text: never empty and without blanks, so that a line splits at blanks.
void appendField(std::string& line, std::string_view text) {
  const std::size_t start = line.size();
  appendEscaped(line, text.empty() ? "-" : text);
  for (std::size_t blank = line.find(' ', start); blank != std::string::npos; blank = line.find(' ', blank)) {
    line.replace(blank, 1, "\\x20");
  }
  line += ' ';
}

// Calendar arithmetic instead of gmtime: the C library's conversions read the process's time zone.
void appendTime(std::string& line, system_clock::time_point time) {
  const auto today = floor<days>(time);
  const year_month_day date(today);
  const hh_mm_ss clock(floor<milliseconds>(time - today));
  std::array<char, 48> text{};
  const int length =
      std::snprintf(text.data(), text.size(), "%04d-%02u-%02uT%02d:%02d:%02d.%03dZ ", static_cast<int>(date.year()),
                    static_cast<unsigned>(date.month()), static_cast<unsigned>(date.day()),
                    static_cast<int>(clock.hours().count()), static_cast<int>(clock.minutes().count()),
                    static_cast<int>(clock.seconds().count()), static_cast<int>(clock.subseconds().count()));
  line.append(text.data(), static_cast<std::size_t>(length));
}

void appendSourceAndText(std::string& line, const Message& message) {
  appendField(line, message.component);
  appendField(line, message.function);
  appendField(line, std::string(message.file) + ':' + std::to_string(message.line));
  appendEscaped(line, message.text);
}

// Time, level and the blanks between the fields.
constexpr std::size_t lineOverhead = 64;

std::string roomFor(const Message& message) {
  std::string line;
  line.reserve(lineOverhead + message.component.size() + message.function.size() + message.file.size() +
               message.text.size());
  return line;
}

}  // namespace

Message ownMessage(int level, std::string_view file, std::string_view text, system_clock::time_point time,
                   std::string_view function, int line) {
  return {.time = time,
          .level = level,
          .component = "Corvane.Logger",
          .function = function,
          .file = file,
          .line = line,
          .text = text};
}

std::string formatLine(const Message& message) {
  std::string line = roomFor(message);
  appendTime(line, message.time);
  line.append(levelName(message.level)).append(" ");
  appendSourceAndText(line, message);
  return line;
}

std::string formatForSystemLog(const Message& message) {
  std::string line = roomFor(message);
  appendSourceAndText(line, message);
  return line;
}

}  // namespace CVLog
