#include "platform/cvlog/Message.h"

#include <array>
#include <cstdio>

#include "platform/base/Ascii.h"
#include "platform/base/Hex.h"
#include "platform/cvlog/Level.h"

namespace CVLog {
namespace {

void appendEscaped(std::string& line, std::string_view text) {
  for (const char c : text) {
    if (c == '\\') {
      line += "\\\\";
    } else if (c == '\n') {
      line += "\\n";
    } else if (c == '\r') {
      line += "\\r";
    } else if (c == '\t') {
      line += "\\t";
    } else if (Tarn::Common::isControl(c)) {
      line += "\\x";
      Tarn::Common::appendHex(line, static_cast<unsigned char>(c));
    } else {
      line += c;
    }
  }
}

/// A field before the text. It is never empty and has no blanks, so that a line splits at blanks.
void appendField(std::string& line, std::string_view text) {
  const std::size_t start = line.size();
  appendEscaped(line, text.empty() ? "-" : text);
  for (std::size_t blank = line.find(' ', start); blank != std::string::npos; blank = line.find(' ', blank)) {
    line.replace(blank, 1, "\\x20");
  }
  line += ' ';
}

// Not gmtime: the C library's conversions read the process's time zone.
void appendTime(std::string& line, std::chrono::system_clock::time_point time) {
  using namespace std::chrono;
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

constexpr std::size_t timeLevelAndBlanks = 64;

}  // namespace

Message ownMessage(int level, std::string_view file, std::string_view text, std::chrono::system_clock::time_point time,
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
  std::string line;
  line.reserve(timeLevelAndBlanks + message.component.size() + message.function.size() + message.file.size() +
               message.text.size());
  appendTime(line, message.time);
  line.append(namedLevel(message.level).name).append(" ");
  appendSourceAndText(line, message);
  return line;
}

std::string formatForSystemLog(const Message& message) {
  std::string line;
  appendSourceAndText(line, message);
  return line;
}

}  // namespace CVLog
