#ifndef CORVANE_TESTS_PLATFORM_LOCALE_POFILE_H
#define CORVANE_TESTS_PLATFORM_LOCALE_POFILE_H

#include <map>
#include <string>

/// The texts of a catalogue file by id, for files whose texts are one line each and have no escapes.
std::map<std::string, std::string> readPoFile(const std::string& file);

#endif
