#include "platform/instrumentation/Source.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "platform/instrumentation/Archive.h"
#include "platform/instrumentation/Error.h"
#include "platform/instrumentation/JsonTree.h"
#include "platform/instrumentation/LiveSource.h"
#include "platform/instrumentation/RecordingFileSystem.h"
#include "tests/platform/instrumentation/Scratch.h"

namespace Tarn::Inventory {
namespace {

const std::string fixture = CORVANE_SOURCE_DIR "/tests/fixtures/virtual-machine/";

std::string refusalOf(const std::string& specification) {
  try {
    loadInventory(specification);
  } catch (const InventoryError& error) {
    return error.what();
  }
  return "accepted";
}

TEST(Source, ReadsJson) {
  EXPECT_EQ(loadInventory("json:" + fixture + "tree.json"), readJson(contentsOf(fixture + "tree.json"), "x"));
}

TEST(Source, ReadsACapturedRootInOneFile) {
  EXPECT_EQ(loadInventory("root:" + fixture + "root.txt"), loadInventory("json:" + fixture + "tree.json"));
}

TEST(Source, ReadsACapturedRootDirectory) {
  const ScratchDirectory directory;
  for (const auto& [path, entry] : readArchive(contentsOf(fixture + "root.txt"), "root.txt")) {
    directory.write(path, entry.contents);
  }

  const Tree tree = loadInventory("root:" + directory.name());

  const Tree expected = loadInventory("json:" + fixture + "tree.json");
  EXPECT_TRUE(std::ranges::equal(tree.nodes(), expected.nodes()));
  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_EQ(tree.unread()[0].file, directory.name() + "/sys/devices/system/cpu/cpu{0,2}/cpufreq/cpuinfo_max_freq");
}

TEST(Source, ReadsTheLiveMachine) {
  EXPECT_FALSE(loadInventory("live").ofType(NodeLexicon::NodeProcessor).empty());
}

TEST(Source, ACaptureOfTheLiveMachineGivesTheSameTree) {
  const std::unique_ptr<FileSystem> root = openDirectory("/");
  RecordingFileSystem::Record record;
  RecordingFileSystem recorder(*root, record);
  const Tree live = readLiveInventory(recorder);
  const ScratchDirectory directory;

  const Tree again = loadInventory("root:" + directory.write("root.txt", writeArchive(record.files)));

  EXPECT_EQ(writeJson(again), writeJson(live));
}

TEST(Source, RefusesWhatNamesNoSource) {
  for (const char* text : {"", "foo", "foo:x", "json", "json:", "root", "root:", "live:", "live:x", "Live", " live",
                           "snapshot", "snapshot:"}) {
    EXPECT_EQ(refusalOf(text), "can not read the inventory: \"" + std::string(text) +
                                   "\": it names no source of an inventory; set CORVANE_INVENTORY, or inventory in the "
                                   "configuration, to live, root:DIRECTORY, snapshot:FILE or json:FILE");
  }
}

TEST(Source, RefusesFilesThatCanNotBeRead) {
  EXPECT_EQ(refusalOf("json:/nothing"),
            "can not read the inventory: /nothing: no such file or directory; name a file that holds an inventory as "
            "JSON");
  EXPECT_EQ(refusalOf("json:/"),
            "can not read the inventory: /: is a directory; name a file that holds an inventory as JSON");
  EXPECT_EQ(refusalOf("root:/nothing"),
            "can not read the inventory: /nothing: no such file or directory; name a captured root directory, or a "
            "file of captured files");
}

TEST(Source, RefusesARootWithoutAnyProcessor) {
  const ScratchDirectory directory;
  EXPECT_EQ(refusalOf("root:" + directory.name()),
            "can not read the inventory: " + directory.name() +
                "/sys/devices/system/cpu: neither this directory nor /proc/cpuinfo tells of a processor; mount sysfs "
                "on /sys and proc on /proc");
}

TEST(Source, RefusesAFileThatHoldsNoCapture) {
  EXPECT_EQ(refusalOf("root:" + fixture + "tree.json"),
            "can not read the captured files: " + fixture +
                "tree.json, line 1: no file name with a colon behind it; write name: contents");
}

}  // namespace
}  // namespace Tarn::Inventory
