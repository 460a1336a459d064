// Reading this machine's inventory, against opening, reading and closing the files that it comes from.

#include <fcntl.h>
#include <unistd.h>

#include <string>
#include <vector>

#include "bench/Rows.h"
#include "platform/instrumentation/FileSystem.h"
#include "platform/instrumentation/LiveSource.h"
#include "platform/instrumentation/RecordingFileSystem.h"

namespace Corvane::Bench {
namespace {

using namespace Tarn::Inventory;

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
}

}  // namespace Corvane::Bench
