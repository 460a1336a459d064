#include "tests/platform/locale/PoFile.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <sstream>
#include <stdexcept>
#include <utility>

namespace {

/// What stands between the first and the last quote, with its escapes resolved.
std::string quotedPart(std::string_view line) {
  const std::size_t first = line.find('"');
  const std::size_t last = line.rfind('"');
  if (first == last) {
    throw std::runtime_error("no quoted text in: " + std::string(line));
  }
  std::string text;
  for (std::size_t i = first + 1; i < last; ++i) {
    if (line[i] != '\\') {
      text += line[i];
    } else if (++i < last) {
      text += line[i] == 'n' ? '\n' : line[i] == 't' ? '\t' : line[i];
    }
  }
  return text;
}

std::map<std::string, std::string> headerFields(const std::string& text) {
  std::map<std::string, std::string> fields;
  std::istringstream lines(text);
  for (std::string line; std::getline(lines, line);) {
    const std::size_t colon = line.find(": ");
    fields[line.substr(0, colon)] = colon == std::string::npos ? "" : line.substr(colon + 2);
  }
  return fields;
}

/// Reads line by line; what a quoted line continues is the text that came before it.
class PoReader {
 public:
  void take(std::string_view line) {
    ++number_;
    if (line.starts_with("#,")) {
      isFuzzy_ = line.find("fuzzy") != std::string_view::npos;
    } else if (line.starts_with(note)) {
      note_ = line.substr(note.size());
    } else if (line.starts_with("msgid_plural")) {
      entries_.back().hasPlural = true;
      continued_ = nullptr;
    } else if (line.starts_with("msgid ")) {
      entries_.push_back(
          {.line = number_, .id = quotedPart(line), .note = std::exchange(note_, {}), .isFuzzy = isFuzzy_});
      isFuzzy_ = false;
      continued_ = &PoEntry::id;
    } else if (line.starts_with("msgstr")) {
      entries_.back().text = quotedPart(line);
      continued_ = &PoEntry::text;
    } else if (line.starts_with('"') && continued_ != nullptr) {
      entries_.back().*continued_ += quotedPart(line);
    }
  }

  PoFile finish() && {
    PoFile file;
    for (PoEntry& entry : entries_) {
      if (entry.id.empty()) {
        file.header = headerFields(entry.text);
      } else {
        file.entries.push_back(std::move(entry));
      }
    }
    return file;
  }

 private:
  static constexpr std::string_view note = "#. ";

  int number_ = 0;
  std::string note_;
  bool isFuzzy_ = false;
  std::string PoEntry::*continued_ = nullptr;
  std::vector<PoEntry> entries_;
};

}  // namespace

PoFile parsePoFile(std::string_view text) {
  PoReader reader;
  while (!text.empty()) {
    const std::size_t end = std::min(text.find('\n'), text.size());
    reader.take(text.substr(0, end));
    text.remove_prefix(std::min(end + 1, text.size()));
  }
  return std::move(reader).finish();
}

PoFile readPoFile(const std::string& file) {
  std::ifstream stream(file);
  if (!stream) {
    throw std::runtime_error(file + " cannot be read");
  }
  return parsePoFile(std::string(std::istreambuf_iterator<char>(stream), {}));
}
