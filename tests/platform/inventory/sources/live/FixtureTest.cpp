#include <gtest/gtest.h>

#include <cstdlib>
#include <fstream>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/JsonTree.h"
#include "tests/platform/inventory/Scratch.h"
#include "tests/platform/inventory/sources/live/Origins.h"

namespace Tarn::Inventory {
namespace {

class Fixture : public testing::TestWithParam<const char*> {
 protected:
  std::string file(const char* name) const { return fixtures + GetParam() + '/' + name; }
};

TEST_P(Fixture, GivesItsWholeTree) {
  const std::string json = writeJson(loadInventory("root:" + file("root.txt")));

  if (std::getenv("CORVANE_UPDATE_FIXTURES") != nullptr) {
    // A generated fixture has no such directory, and keeps its expected tree.
    std::ofstream(std::string(CORVANE_SOURCE_DIR "/tests/fixtures/") + GetParam() + "/tree.json", std::ios::binary)
        << json;
  }
  EXPECT_EQ(json, contentsOf(file("tree.json")));
}

TEST_P(Fixture, TreeReadsBackAsTheSame) {
  EXPECT_EQ(loadInventory("json:" + file("tree.json")), loadInventory("root:" + file("root.txt")));
}

TEST_P(Fixture, TellsOfEveryValueWhereItComesFrom) {
  for (const std::string& source : {"root:" + file("root.txt"), "json:" + file("tree.json")}) {
    const Tree tree = loadInventory(source, Detail::WithOrigins);

    EXPECT_EQ(unexplainedValues(tree), std::vector<std::string>()) << source;
    EXPECT_EQ(tree, loadInventory(source)) << source;
  }
}

TEST_P(Fixture, ArchiveIsWrittenBackAsTheSameFiles) {
  const MemoryFileSystem::Files files = readArchive(contentsOf(file("root.txt")), "root.txt");
  MemoryFileSystem again(readArchive(writeArchive(files), "again"));

  EXPECT_EQ(readLiveInventory(again), loadInventory("root:" + file("root.txt")));
}

TEST_P(Fixture, PathsAreShort) {
  const Tree tree = loadInventory("json:" + file("tree.json"));
  for (const Node& node : tree.nodes()) {
    EXPECT_LE(node.path().size(), 15U) << node.path();
  }
}

INSTANTIATE_TEST_SUITE_P(All, Fixture,
                         testing::Values("arm64-board", "container", "dual-socket-server", "favoured-cores",
                                         "first-cpu-offline", "hybrid-laptop", "implausible-numbers", "itanium-server",
                                         "kvm-two-cpus", "large-server", "loongarch-desktop", "masks-alone",
                                         "named-machine", "offline-cpus", "offline-siblings", "power9-server",
                                         "riscv-board", "riscv-without-uarch", "s390-partition", "sparc-server",
                                         "virtual-machine"),
                         [](const auto& fixture) {
                           std::string name = fixture.param;
                           std::erase(name, '-');
                           return name;
                         });

}  // namespace
}  // namespace Tarn::Inventory
