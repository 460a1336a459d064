#ifndef CORVANE_TESTS_PLATFORM_LOCALE_CATALOGUEPROBLEMS_H
#define CORVANE_TESTS_PLATFORM_LOCALE_CATALOGUEPROBLEMS_H

#include <string>
#include <vector>

#include "tests/platform/locale/PoFile.h"

/// What keeps a catalogue from being a complete translation of the English one, a sentence each; none where nothing
/// does. `language` is what the file is named after.
std::vector<std::string> problemsOf(const PoFile& catalogue, const std::string& language, const PoFile& english);

#endif
