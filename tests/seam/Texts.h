#ifndef TESTS_SEAM_TEXTS_H
#define TESTS_SEAM_TEXTS_H

#include <map>
#include <string>

/// What the scripted locale and common helpers answer.
namespace Scripted {

struct Texts {
  std::string language = "en";
  /// By language and message identifier; anything else reads "LANGUAGE:IDENTIFIER".
  std::map<std::pair<std::string, std::wstring>, std::wstring> catalogue;
  std::string systemName = "scripted-host";

  // How often each was asked for, and the catalogue number asked for last.
  unsigned int languageCalls = 0;
  unsigned int libraryCalls = 0;
  unsigned int stringCalls = 0;
  unsigned int systemNameCalls = 0;
  int lastCatalogue = -1;
};

Texts& texts();

}  // namespace Scripted

#endif
