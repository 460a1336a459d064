#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <tarn/Common.h>
#include <tarn/Locale.h>

#include <filesystem>
#include <map>
#include <set>
#include <string>

#include "platform/locale/Catalogue.h"
#include "tests/platform/locale/CatalogueProblems.h"
#include "tests/platform/locale/PoFile.h"

namespace {

using Tarn::make_string;
using Tarn::ResourceString;
using Tarn::Locale::getResourceLibrary;
using testing::IsEmpty;
using testing::IsSupersetOf;

const std::map<std::string, PoFile>& catalogueFiles() {
  static const std::map<std::string, PoFile> files = [] {
    std::map<std::string, PoFile> read;
    for (const auto& entry : std::filesystem::directory_iterator(CORVANE_SOURCE_DIR "/locale")) {
      read[entry.path().stem()] = readPoFile(entry.path());
    }
    return read;
  }();
  return files;
}

const std::set<std::string> idsAskedFor = {
    "MSGID_COMPUTER_SYSTEM_CAPTION",   "MSGID_COMPUTER_SYSTEM_DESCRIPTION",   "MSGID_CPU_PROCESSOR_CAPTION",
    "MSGID_CPU_PROCESSOR_DESCRIPTION", "MSGID_CPU_PROC_CAPABILITIES_CAPTION", "MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION",
    "MSGID_CPU_PROC_CORE_CAPTION",     "MSGID_CPU_PROC_CORE_DESCRIPTION",     "MSGID_CPU_MEMORY_CAPTION",
    "MSGID_CPU_MEMORY_DESCRIPTION"};

TEST(Catalogues, AreThereInTheseLanguages) {
  std::set<std::string> languages;
  for (const auto& [language, file] : catalogueFiles()) {
    languages.insert(language);
  }
  EXPECT_THAT(languages, IsSupersetOf({"de", "en", "es", "fr", "ja", "zh_CN"}));
  EXPECT_EQ(Tarn::Locale::catalogues().size(), languages.size());
}

TEST(Catalogues, ListTheirLanguages) {
  std::vector<std::string> languages;
  for (const auto& [language, file] : catalogueFiles()) {
    languages.push_back(language);
  }
  EXPECT_EQ(Tarn::Locale::translatedLanguages(), languages);
}

TEST(Catalogues, TranslateIntoTheirLanguagesAndTheVariantsOfThese) {
  for (const char* id : {"en", "en_GB", "fr_CA.UTF-8", "de_DE.UTF-8", "DE-at", "zh", "zh_CN", "zh_Hans_SG"}) {
    EXPECT_TRUE(Tarn::Locale::isTranslated(id)) << id;
  }
  for (const char* id : {"", "C", "C.UTF-8", "fi", "fi_FI", "zh_TW", "German"}) {
    EXPECT_FALSE(Tarn::Locale::isTranslated(id)) << id;
  }
}

TEST(Catalogues, HaveInEnglishWhatTheLibraryAsksFor) {
  std::set<std::string> ids;
  for (const PoEntry& entry : catalogueFiles().at("en").entries) {
    ids.insert(entry.id);
  }
  EXPECT_EQ(ids, idsAskedFor);
}

TEST(Catalogues, AreComplete) {
  for (const auto& [language, file] : catalogueFiles()) {
    EXPECT_THAT(problemsOf(file, language, catalogueFiles().at("en")), IsEmpty()) << language;
  }
}

TEST(Catalogues, AreCompiledInAsTheyAreWritten) {
  for (const auto& [language, file] : catalogueFiles()) {
    for (const PoEntry& entry : file.entries) {
      const ResourceString found(getResourceLibrary(2, language), std::wstring(entry.id.begin(), entry.id.end()));
      EXPECT_EQ(make_string(found.str()), entry.text) << language << ' ' << entry.id;
    }
  }
}

// A caption may be the same word in two languages, a sentence may not.
TEST(Catalogues, TranslateTheDescriptions) {
  std::map<std::string, std::string> english;
  for (const PoEntry& entry : catalogueFiles().at("en").entries) {
    english[entry.id] = entry.text;
  }
  for (const auto& [language, file] : catalogueFiles()) {
    for (const PoEntry& entry : file.entries) {
      if (language != "en" && entry.id.ends_with("_DESCRIPTION")) {
        EXPECT_NE(entry.text, english[entry.id]) << language << ' ' << entry.id;
      }
    }
  }
}

}  // namespace
