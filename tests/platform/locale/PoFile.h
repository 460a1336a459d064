#ifndef CORVANE_TESTS_PLATFORM_LOCALE_POFILE_H
#define CORVANE_TESTS_PLATFORM_LOCALE_POFILE_H

#include <map>
#include <string>
#include <string_view>
#include <vector>

/// One entry of a catalogue file, its texts without quotes and escapes.
struct PoEntry {
  int line = 0;  ///< where its msgid stands
  std::string id{};
  std::string text{};
  std::string note{};  ///< what the programmer tells the translator
  bool isFuzzy = false;
  bool hasPlural = false;
};

/// A catalogue file as translators' tools see it.
struct PoFile {
  std::map<std::string, std::string> header{};  ///< its fields by name
  std::vector<PoEntry> entries{};               ///< without the header
};

PoFile parsePoFile(std::string_view text);
PoFile readPoFile(const std::string& file);

#endif
