#include "platform/inventory/sources/files/OverlayFileSystem.h"

#include <gtest/gtest.h>

#include <cerrno>

namespace Tarn::Inventory {
namespace {

MemoryFileSystem::Files front() {
  return {{"sys/a", {"front", 0}}, {"sys/deep/c", {"front", 0}}, {"sys/refused", {"", EACCES}}};
}

std::unique_ptr<FileSystem> behind() {
  auto files = std::make_unique<MemoryFileSystem>();
  files->add("sys/a", "behind");
  files->add("sys/b", "behind");
  files->add("sys/refused", "behind");
  return files;
}

std::string read(FileSystem& files, const char* path) {
  std::string contents = "something from before";
  const FileError error = files.read(path, contents);
  return error == 0 ? contents : describeError(error) + ' ' + contents;
}

std::vector<std::string> list(FileSystem& files, const char* directory) {
  std::vector<std::string> names = {"something from before"};
  EXPECT_EQ(files.list(directory, names), 0);
  return names;
}

TEST(OverlayFileSystem, FilesInFrontHideThoseBehind) {
  OverlayFileSystem files(front(), "dump.bin", behind());

  EXPECT_EQ(read(files, "sys/a"), "front");
  EXPECT_EQ(read(files, "sys/b"), "behind");
  EXPECT_EQ(read(files, "sys/refused"), "permission denied ");
  EXPECT_EQ(read(files, "sys/none"), "no such file or directory ");
}

TEST(OverlayFileSystem, DirectoriesShowBoth) {
  OverlayFileSystem files(front(), "dump.bin", behind());

  EXPECT_EQ(list(files, "sys"), (std::vector<std::string>{"a", "b", "deep", "refused"}));
  EXPECT_EQ(list(files, "sys/deep"), std::vector<std::string>{"c"});
  std::vector<std::string> names;
  EXPECT_EQ(files.list("none", names), ENOENT);
}

TEST(OverlayFileSystem, IsTheSameFromBelow) {
  OverlayFileSystem files(front(), "dump.bin", behind());
  const std::unique_ptr<FileSystem> below = files.below("sys");
  const std::unique_ptr<FileSystem> deep = below->below("deep");

  EXPECT_EQ(read(*below, "a"), "front");
  EXPECT_EQ(read(*below, "b"), "behind");
  EXPECT_EQ(read(*deep, "c"), "front");
  EXPECT_EQ(deep->nameOf("c"), "dump.bin");
  EXPECT_EQ(below->nameOf("b"), "/sys/b");
}

TEST(OverlayFileSystem, NeedsNothingBehind) {
  OverlayFileSystem files(front(), "dump.bin", nullptr);
  const std::unique_ptr<FileSystem> below = files.below("sys");

  EXPECT_EQ(read(files, "sys/a"), "front");
  EXPECT_EQ(read(files, "sys/b"), "no such file or directory ");
  EXPECT_EQ(list(files, "sys"), (std::vector<std::string>{"a", "deep", "refused"}));
  EXPECT_EQ(read(*below, "a"), "front");
  EXPECT_EQ(below->nameOf("b"), "/sys/b");
}

}  // namespace
}  // namespace Tarn::Inventory
