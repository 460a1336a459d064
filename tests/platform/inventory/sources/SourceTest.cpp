#include "platform/inventory/sources/Source.h"

#include <gmock/gmock.h>
#include <grp.h>
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"
#include "tests/platform/inventory/Scratch.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {
namespace {

const std::string dump = CORVANE_SOURCE_DIR "/tests/fixtures/smbios/socket-per-virtual-cpu/dump.bin";
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
    if (entry.error == 0) {
      directory.write(path, entry.contents);
    }
  }

  const Tree tree = loadInventory("root:" + directory.name());

  const Tree expected = loadInventory("json:" + fixture + "tree.json");
  EXPECT_TRUE(std::ranges::equal(tree.nodes(), expected.nodes()));
  ASSERT_EQ(tree.unread().size(), 2U);
  EXPECT_EQ(tree.unread()[0].file, directory.name() + "/sys/firmware/dmi/tables/smbios_entry_point");
  EXPECT_EQ(tree.unread()[1].file, directory.name() + "/sys/devices/system/cpu/cpu{0,2}/cpufreq/cpuinfo_max_freq");
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
                           "snapshot", "snapshot:", "smbios", "smbios:"}) {
    EXPECT_EQ(refusalOf(text), "cannot read the inventory: \"" + std::string(text) +
                                   "\": it names no source of an inventory; set CORVANE_INVENTORY, or inventory in the "
                                   "configuration, to live, root:DIRECTORY, snapshot:FILE, json:FILE or smbios:FILE");
    EXPECT_FALSE(namesSource(text)) << text;
  }
}

TEST(Source, IsNamedWhetherItIsThereOrNot) {
  for (const char* text : {"live", "root:/nowhere", "snapshot:x", "json:a:b", "smbios:x", "smbios:x+live"}) {
    EXPECT_TRUE(namesSource(text)) << text;
  }
}

TEST(Source, HasTheLocationsThatItsTextNames) {
  const std::vector<std::pair<std::string, std::vector<std::string_view>>> rows = {
      {"live", {}},
      {"nonsense", {}},
      {"json:a:b", {"a:b"}},
      {"root:/x", {"/x"}},
      {"snapshot:s", {"s"}},
      {"smbios:a+live", {"a"}},
      {"smbios:a+b", {"a+b"}},
      {"smbios:a+live+b+root:/x", {"a+live+b", "/x"}},
  };
  for (const auto& [text, locations] : rows) {
    EXPECT_EQ(locationsOf(text), locations) << text;
  }
}

TEST(Source, ADumpsNameMayHoldAPlusSign) {
  const ScratchDirectory directory;
  const std::string file = directory.write("a+live+b.bin", contentsOf(dump));
  const std::string base = "+root:" + fixture + "root.txt";

  EXPECT_EQ(loadInventory("smbios:" + file), loadInventory("smbios:" + dump));
  EXPECT_EQ(loadInventory("smbios:" + file + base), loadInventory("smbios:" + dump + base));
}

TEST(Source, ADumpCanStandOverTheLiveMachine) {
  const Tree tree = loadInventory("smbios:" + dump + "+live");

  EXPECT_EQ(tree.ofType(NodeLexicon::NodeProcessorCore).size(),
            loadInventory("live").ofType(NodeLexicon::NodeProcessorCore).size());
  EXPECT_FALSE(tree.disagreements().empty()) << "four sockets, with signatures of another machine";
}

TEST(Source, OrdinaryUsersSeeTheLiveMachineAtTheSamePaths) {
  if (::getuid() != 0) {
    GTEST_SKIP() << "only root can become another user";
  }
  constexpr uid_t nobody = 65534;
  const ScratchDirectory directory;
  const std::string file = directory.write("tree.json", "");
  ASSERT_EQ(::chown(file.c_str(), nobody, nobody), 0);
  std::filesystem::permissions(directory.name(), std::filesystem::perms::all);

  const pid_t child = ::fork();
  if (child == 0) {
    const bool changed = ::setgroups(0, nullptr) == 0 && ::setgid(nobody) == 0 && ::setuid(nobody) == 0;
    if (changed) {
      std::ofstream(file) << writeJson(loadInventory("live"));
    }
    ::_exit(changed ? 0 : 1);
  }
  int status = -1;
  ASSERT_EQ(::waitpid(child, &status, 0), child);
  ASSERT_EQ(status, 0);

  const Tree forOthers = loadInventory("json:" + file);
  const Tree forRoot = loadInventory("live");
  ASSERT_FALSE(forOthers.nodes().empty());
  for (const Node& node : forOthers.nodes()) {
    const NodeIndex index = forRoot.find(node.internalPath);
    ASSERT_NE(index, noNode) << node.path();
    EXPECT_EQ(forRoot.node(index).cpus, node.cpus) << node.path();
  }
}

TEST(Source, RefusesWhatIsNoDump) {
  const std::string fixtureFile = fixture + "root.txt";
  EXPECT_THAT(
      refusalOf("smbios:" + fixtureFile),
      testing::AllOf(testing::StartsWith("cannot read the SMBIOS dump: " + fixtureFile + ": SMBIOS entry point"),
                     testing::EndsWith("; name a file that dmidecode --dump-bin wrote")));
  EXPECT_EQ(refusalOf("smbios:/nothing"),
            "cannot read the inventory: /nothing: no such file or directory; name a file that dmidecode --dump-bin "
            "wrote");
  EXPECT_EQ(refusalOf("smbios:" + dump + "+root:/nothing"),
            "cannot read the inventory: /nothing: no such file or directory; name a captured root directory, or a "
            "file of captured files");
}

TEST(Source, RefusesADumpWithoutSockets) {
  Support::SmbiosEncoder tables;
  tables.add(Support::SmbiosSystem{});
  tables.end();
  const ScratchDirectory directory;
  const std::string file = directory.write("dump.bin", tables.dump());

  EXPECT_EQ(refusalOf("smbios:" + file),
            "cannot read the inventory: " + file +
                ": its tables list no processor socket; name a dump of a machine's SMBIOS tables, or join it with "
                "another source: smbios:FILE+live");
}

TEST(Source, RefusesFilesThatCannotBeRead) {
  EXPECT_EQ(refusalOf("json:/nothing"),
            "cannot read the inventory: /nothing: no such file or directory; name a file that holds an inventory as "
            "JSON");
  EXPECT_EQ(refusalOf("json:/"),
            "cannot read the inventory: /: is a directory; name a file that holds an inventory as JSON");
  EXPECT_EQ(refusalOf("root:/nothing"),
            "cannot read the inventory: /nothing: no such file or directory; name a captured root directory, or a "
            "file of captured files");
}

TEST(Source, RefusesARootWithoutAnyProcessor) {
  const ScratchDirectory directory;
  EXPECT_EQ(refusalOf("root:" + directory.name()),
            "cannot read the inventory: " + directory.name() +
                "/sys/devices/system/cpu: neither this directory nor /proc/cpuinfo lists a processor; mount sysfs "
                "on /sys and proc on /proc; a captured root holds both as sys and proc");
}

TEST(Source, RefusesAFileThatHoldsNoCapture) {
  EXPECT_EQ(refusalOf("root:" + fixture + "tree.json"),
            "cannot read the captured files: " + fixture +
                "tree.json, line 1: no file name with a colon after it; write name: contents");
}

}  // namespace
}  // namespace Tarn::Inventory
