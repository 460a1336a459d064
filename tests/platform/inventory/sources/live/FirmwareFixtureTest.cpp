#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <fstream>
#include <random>
#include <regex>

#include "platform/inventory/sources/SnapshotWriter.h"
#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/sources/snapshot/Snapshot.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"
#include "tests/platform/inventory/Scratch.h"
#include "tests/platform/inventory/sources/live/FirmwareMachines.h"
#include "tests/platform/inventory/sources/live/Origins.h"

namespace Tarn::Inventory {
namespace {

bool isUpdate() {
  return std::getenv("CORVANE_UPDATE_FIXTURES") != nullptr;
}

void expectFile(const std::string& file, const std::string& contents) {
  if (isUpdate()) {
    std::ofstream(file, std::ios::binary) << contents;
  }
  EXPECT_EQ(contents, contentsOf(file)) << file;
}

class FirmwareFixture : public testing::TestWithParam<FirmwareMachine> {
 protected:
  static std::string file(const char* name) { return fixtures + "smbios/" + std::string(GetParam().name) + '/' + name; }
  static std::string kernel() { return "root:" + fixtures + std::string(GetParam().kernel) + "/root.txt"; }
  static bool hasKernel() { return !GetParam().kernel.empty(); }
  static std::string alone() { return "smbios:" + file("dump.bin"); }
  static std::string joined() { return alone() + '+' + kernel(); }

  /// The fixture's files with the tables among them, as root sees them.
  static MemoryFileSystem::Files filesForRoot() {
    const std::string archive = fixtures + std::string(GetParam().kernel) + "/root.txt";
    MemoryFileSystem::Files files = readArchive(contentsOf(archive), archive);
    const Support::SmbiosEncoder tables = GetParam().tables();
    files[entryPointFile] = {tables.entryPoint(), 0};
    files[tableFile] = {tables.table(), 0};
    return files;
  }
};

TEST_P(FirmwareFixture, IsTheDumpThatTheMachineWouldWrite) {
  expectFile(file("dump.bin"), GetParam().tables().dump());
}

TEST_P(FirmwareFixture, TablesAloneGiveTheirWholeTree) {
  expectFile(file("alone.json"), writeJson(loadInventory(alone())));
}

TEST_P(FirmwareFixture, TablesAndKernelGiveTheirWholeTree) {
  if (hasKernel()) {
    expectFile(file("joined.json"), writeJson(loadInventory(joined())));
  }
}

TEST_P(FirmwareFixture, TreesReadBackAsTheSame) {
  EXPECT_EQ(loadInventory("json:" + file("alone.json")), loadInventory(alone()));
  if (hasKernel()) {
    EXPECT_EQ(loadInventory("json:" + file("joined.json")), loadInventory(joined()));
  }
}

TEST_P(FirmwareFixture, RootSeesTheSameInTheFilesOfTheKernel) {
  if (!hasKernel()) {
    return;
  }
  MemoryFileSystem files(filesForRoot());
  const ScratchDirectory directory;
  for (const auto& [path, entry] : files.files()) {
    if (entry.error == 0) {
      directory.write(path, entry.contents);
    }
  }

  EXPECT_EQ(readLiveInventory(files), loadInventory(joined()));
  const Tree captured = loadInventory("root:" + directory.name());
  EXPECT_TRUE(std::ranges::equal(captured.nodes(), loadInventory(joined()).nodes()));
}

/// What of a tree in JSON identifies a processor: serial numbers, asset tags and part numbers.
std::vector<std::string> identifiersIn(const std::string& json) {
  const std::regex identifier("\"(AssetTag|PartNumber|SerialNumber)\": \"([^\"]*)\"");
  std::vector<std::string> found;
  for (std::sregex_iterator match(json.begin(), json.end(), identifier), end; match != end; ++match) {
    found.push_back((*match)[2]);
  }
  return found;
}

std::string withMasks(std::string json) {
  for (const std::string& identifier : identifiersIn(json)) {
    const std::string mask(identifier.size(), 'X');
    json.replace(json.find(": \"" + identifier + '"') + 3, identifier.size(), mask);
  }
  return json;
}

TEST_P(FirmwareFixture, SnapshotIsReplayedAsTheSameTreeButForWhatIsMasked) {
  if (!hasKernel()) {
    return;
  }
  const ScratchDirectory directory;
  const std::string kept = directory.write("kept", takeSnapshot(joined(), Identifiers::Kept, "test").text);
  const std::string masked = directory.write("masked", takeSnapshot(joined(), Identifiers::Masked, "test").text);
  const std::string json = writeJson(loadInventory(joined()));

  EXPECT_EQ(loadInventory("snapshot:" + kept), loadInventory(joined()));
  EXPECT_EQ(writeJson(loadInventory("snapshot:" + masked)), withMasks(json));
  const std::string table = readSnapshot(contentsOf(masked), masked).at(tableFile).contents;
  for (const std::string& identifier : identifiersIn(json)) {
    EXPECT_EQ(table.find(identifier), std::string::npos) << identifier;
  }
}

TEST_P(FirmwareFixture, OrdinaryUsersSeeTheSameProcessorsCoresAndCachesAtTheSamePaths) {
  if (!hasKernel()) {
    return;
  }
  const Tree forRoot = loadInventory(joined());
  const Tree forOthers = loadInventory(kernel());

  for (const Node& node : forOthers.nodes()) {
    const NodeIndex index = forRoot.find(node.internalPath);
    ASSERT_NE(index, noNode) << node.path();
    const Node& same = forRoot.node(index);
    EXPECT_EQ(same.type, node.type) << node.path();
    EXPECT_EQ(same.status, node.status) << node.path();
    EXPECT_EQ(same.cpus, node.cpus) << node.path();
    for (const NumberProperty& property : forOthers.numbers(node)) {
      EXPECT_EQ(*forRoot.number(same, property.id), property.value) << node.path();
    }
  }
}

TEST_P(FirmwareFixture, TellsOfEveryValueWhereItComesFrom) {
  for (const std::string& source : {alone(), joined()}) {
    if (source == alone() || hasKernel()) {
      const Tree tree = loadInventory(source, Detail::WithOrigins);
      EXPECT_EQ(unexplainedValues(tree), std::vector<std::string>()) << source;
      EXPECT_EQ(tree, loadInventory(source)) << source;
    }
  }
}

TEST_P(FirmwareFixture, BrokenTablesHurtNobody) {
  const Support::SmbiosEncoder tables = GetParam().tables();
  const Tree kernelAlone = hasKernel() ? loadInventory(kernel()) : Tree();
  MemoryFileSystem files(hasKernel() ? filesForRoot() : MemoryFileSystem::Files());
  std::minstd_rand random(1);  // the same bytes in every run
  constexpr int attempts = 60;
  for (int attempt = 0; attempt < attempts; ++attempt) {
    std::string table = tables.table();
    for (int change = 0; change <= attempt % 8; ++change) {
      table[random() % table.size()] = static_cast<char>(random() % 256);
    }
    table.resize(attempt % 5 == 0 ? random() % table.size() : table.size());
    files.add(entryPointFile, tables.entryPoint());
    files.add(tableFile, table);

    if (!hasKernel()) {
      try {
        readFirmwareInventory(files);
      } catch (const InventoryError&) {  // no socket is left in it
      }
      continue;
    }
    const Tree tree = readLiveInventory(files);
    for (const Node& node : kernelAlone.nodes()) {
      ASSERT_NE(tree.find(node.internalPath), noNode) << node.path();
    }
  }
}

INSTANTIATE_TEST_SUITE_P(All, FirmwareFixture, testing::ValuesIn(firmwareMachines().begin(), firmwareMachines().end()),
                         [](const auto& machine) {
                           std::string name(machine.param.name);
                           std::erase(name, '-');
                           return name;
                         });

}  // namespace
}  // namespace Tarn::Inventory
