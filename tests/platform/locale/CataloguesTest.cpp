#include <gtest/gtest.h>
#include <tarn/Common.h>
#include <tarn/Locale.h>

#include <filesystem>
#include <map>
#include <set>
#include <string>

#include "platform/locale/Catalogue.h"
#include "tests/platform/locale/PoFile.h"

namespace {

using Tarn::make_string;
using Tarn::ResourceString;
using Tarn::Locale::getResourceLibrary;

std::map<std::string, std::map<std::string, std::string>> catalogueFiles() {
  std::map<std::string, std::map<std::string, std::string>> files;
  for (const auto& entry : std::filesystem::directory_iterator(CORVANE_SOURCE_DIR "/locale")) {
    files[entry.path().stem()] = readPoFile(entry.path());
  }
  return files;
}

std::set<std::string> idsOf(const std::map<std::string, std::string>& texts) {
  std::set<std::string> ids;
  for (const auto& [id, text] : texts) {
    ids.insert(id);
  }
  return ids;
}

const std::set<std::string> kIds = {
    "MSGID_COMPUTER_SYSTEM_CAPTION",   "MSGID_COMPUTER_SYSTEM_DESCRIPTION",   "MSGID_CPU_PROCESSOR_CAPTION",
    "MSGID_CPU_PROCESSOR_DESCRIPTION", "MSGID_CPU_PROC_CAPABILITIES_CAPTION", "MSGID_CPU_PROC_CAPABILITIES_DESCRIPTION",
    "MSGID_CPU_PROC_CORE_CAPTION",     "MSGID_CPU_PROC_CORE_DESCRIPTION",     "MSGID_CPU_MEMORY_CAPTION",
    "MSGID_CPU_MEMORY_DESCRIPTION"};

TEST(Catalogues, AreThereInEnglishAndGerman) {
  const auto files = catalogueFiles();
  EXPECT_TRUE(files.contains("en"));
  EXPECT_TRUE(files.contains("de"));
  EXPECT_EQ(Tarn::Locale::catalogues().size(), files.size());
}

TEST(Catalogues, HaveEveryText) {
  for (const auto& [language, texts] : catalogueFiles()) {
    EXPECT_EQ(idsOf(texts), kIds) << language;
    for (const auto& [id, text] : texts) {
      EXPECT_NE(text, "") << language << ' ' << id;
    }
  }
}

TEST(Catalogues, AreCompiledInAsTheyAreWritten) {
  for (const auto& [language, texts] : catalogueFiles()) {
    for (const auto& [id, text] : texts) {
      const ResourceString found(getResourceLibrary(2, language), std::wstring(id.begin(), id.end()));
      EXPECT_EQ(make_string(found.str()), text) << language << ' ' << id;
    }
  }
}

TEST(Catalogues, TranslateTheCaptions) {
  for (const auto& [language, texts] : catalogueFiles()) {
    if (language == "en") {
      continue;
    }
    for (const auto& [id, text] : texts) {
      EXPECT_NE(text, catalogueFiles().at("en").at(id)) << language << ' ' << id;
    }
  }
}

}  // namespace
