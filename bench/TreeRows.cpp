// Reading this machine's inventory, with and without the firmware's tables, against opening, reading and
// closing the files that it comes from.

#include <fcntl.h>
#include <unistd.h>

#include <string>
#include <vector>

#include "bench/Rows.h"
#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/sources/files/OverlayFileSystem.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "tests/support/SmbiosEncoder.h"

namespace Corvane::Bench {
namespace {

using namespace Tarn::Inventory;
using namespace Tarn::NodeLexicon;

/// The files that building the tree reads, those that are not there included.
std::vector<std::string> filesOfLiveTree() {
  const std::unique_ptr<FileSystem> root = openDirectory("/");
  RecordingFileSystem::Record record;
  RecordingFileSystem recorder(*root, record);
  readLiveInventory(recorder);
  for (std::string& path : record.opened) {
    path.insert(0, "/");
  }
  return record.opened;
}

void readToTheEnd(const char* path) {
  char buffer[4096];
  const int file = open(path, O_RDONLY | O_CLOEXEC);
  if (file < 0) {
    return;
  }
  while (read(file, buffer, sizeof buffer) > 0) {
  }
  close(file);
}

/// The identification register whose first bytes this text shows, lowest first.
std::uint64_t registerOf(const std::string& text) {
  std::uint64_t value = 0;
  for (std::size_t byte = 0; 3 * byte < text.size(); ++byte) {
    value |= std::stoull(text.substr(3 * byte, 2), nullptr, 16) << (8 * byte);
  }
  return value;
}

/// Tables as the firmware of this machine would have them: a socket with three caches for each processor,
/// and one that is empty. Many machines to measure on are virtual and have none, or hide them.
MemoryFileSystem::Files tablesOf(const Tree& tree) {
  Support::SmbiosEncoder tables;
  tables.add(Support::SmbiosSystem{});
  for (const NodeIndex index : tree.ofType(NodeProcessor)) {
    const Node& node = tree.node(index);
    const std::string* id = tree.text(node, PropProcessorId);
    const std::string* name = tree.text(node, PropProcessorName);
    Support::SmbiosProcessor processor;
    processor.socket = "CPU" + std::to_string(index);
    processor.id = id == nullptr ? 0 : registerOf(*id);
    processor.version = name == nullptr ? "" : *name;
    for (std::uint16_t level = 1; level <= 3; ++level) {
      processor.caches[level - 1U] = tables.add(Support::SmbiosCache{.level = level});
    }
    tables.add(processor);
  }
  tables.add(Support::emptySocket("Spare"));
  tables.end();
  return {{entryPointFile, {tables.entryPoint(), 0}}, {tableFile, {tables.table(), 0}}};
}

Tree readWith(const MemoryFileSystem::Files& tables) {
  OverlayFileSystem root(tables, "tables", openDirectory("/"));
  return readLiveInventory(root);
}

}  // namespace

void addTreeRows() {
  addRow(
      {"building the live tree", 2.0},
      [] {
        const std::unique_ptr<FileSystem> root = openDirectory("/");
        benchmark::DoNotOptimize(readLiveInventory(*root));
      },
      [files = filesOfLiveTree()] {
        for (const std::string& file : files) {
          readToTheEnd(file.c_str());
        }
      });
  if (!selected("building the reconciled tree")) {
    return;
  }
  // The tables come from memory, so that the floor has no part in them: all that they cost counts.
  const MemoryFileSystem::Files tables = tablesOf(readLiveInventory(*openDirectory("/")));
  const Tree reconciled = readWith(tables);
  require(reconciled.find("/S:Spare") != noNode, "the reconciled tree", "has the empty socket");
  require(reconciled.text(reconciled.node(reconciled.ofType(NodeProcessor).front()), PropSocket) != nullptr,
          "the reconciled tree", "has the sockets of its processors");
  addRow(
      {"building the reconciled tree", 2.0}, [tables] { benchmark::DoNotOptimize(readWith(tables)); },
      [files = filesOfLiveTree()] {
        for (const std::string& file : files) {
          readToTheEnd(file.c_str());
        }
      });
}

}  // namespace Corvane::Bench
