#include "tests/platform/locale/PoFile.h"

#include <fstream>
#include <stdexcept>
#include <string_view>

namespace {

/// What stands between the first and the last quote.
std::string quotedPart(const std::string& line) {
  const std::size_t first = line.find('"');
  return line.substr(first + 1, line.rfind('"') - first - 1);
}

}  // namespace

std::map<std::string, std::string> readPoFile(const std::string& file) {
  std::ifstream stream(file);
  if (!stream) {
    throw std::runtime_error(file + " cannot be read");
  }
  std::map<std::string, std::string> texts;
  std::string id;
  for (std::string line; std::getline(stream, line);) {
    if (line.starts_with("msgid ")) {
      id = quotedPart(line);
    } else if (line.starts_with("msgstr ") && !id.empty()) {
      texts[id] = quotedPart(line);
    }
  }
  return texts;
}
