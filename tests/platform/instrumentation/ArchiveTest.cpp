#include "platform/instrumentation/Archive.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "platform/instrumentation/Error.h"

namespace Tarn::Inventory {
namespace {

std::string refusalOf(const std::string& text) {
  try {
    readArchive(text, "root.txt");
  } catch (const InventoryError& error) {
    return error.what();
  }
  return "accepted";
}

TEST(Archive, HoldsFilesOfOneLineOfManyAndOfNone) {
  MemoryFileSystem files(
      readArchive("# A machine.\n"
                  "\n"
                  "[sys/devices/system/cpu]\n"
                  "online: 0-3\n"
                  "offline:\n"
                  "[proc]\n"
                  "cpuinfo:\n"
                  "\tprocessor\t: 0\n"
                  "\t\n"
                  "\t# no comment\n",
                  "root.txt"));
  std::string contents;

  EXPECT_EQ(files.read("sys/devices/system/cpu/online", contents), 0);
  EXPECT_EQ(contents, "0-3\n");
  EXPECT_EQ(files.read("sys/devices/system/cpu/offline", contents), 0);
  EXPECT_EQ(contents, "");
  EXPECT_EQ(files.read("proc/cpuinfo", contents), 0);
  EXPECT_EQ(contents, "processor\t: 0\n\n# no comment\n");
  EXPECT_EQ(files.files().size(), 3U);
}

TEST(Archive, HoldsFilesThatCanNotBeRead) {
  MemoryFileSystem files(readArchive("[a]\none! EACCES\ntwo! EIO\n", "root.txt"));
  std::string contents = "x";

  EXPECT_EQ(files.read("a/one", contents), EACCES);
  EXPECT_EQ(contents, "");
  EXPECT_EQ(files.read("a/two", contents), EIO);
}

TEST(Archive, IsReadBackAsItWasWritten) {
  MemoryFileSystem::Files files;
  files["sys/b/one"] = {"1\n", 0};
  files["sys/b/one: odd"] = {};
  files.erase("sys/b/one: odd");
  files["sys/b/deep/two"] = {"a\nb\n\nc\n", 0};
  files["sys/b/none"] = {"", 0};
  files["sys/b/denied"] = {"", EACCES};
  files["sys/a/three"] = {"[not a directory]\n", 0};
  files["sys/a/four"] = {"\n", 0};

  const MemoryFileSystem::Files again = readArchive(writeArchive(files), "root.txt");

  ASSERT_EQ(again.size(), files.size());
  for (const auto& [path, entry] : files) {
    EXPECT_EQ(again.at(path).contents, entry.contents) << path;
    EXPECT_EQ(again.at(path).error, entry.error) << path;
  }
}

TEST(Archive, NamesEachDirectoryOnce) {
  MemoryFileSystem::Files files;
  files["a/b/x"] = {"1\n", 0};
  files["a/c"] = {"2\n", 0};
  files["a/z"] = {"3\n", 0};

  EXPECT_EQ(writeArchive(files), "[a]\nc: 2\nz: 3\n[a/b]\nx: 1\n");
}

TEST(Archive, RefusesWhatIsNone) {
  EXPECT_EQ(refusalOf("[sys\n"),
            "can not read the captured files: root.txt, line 1: a directory without its closing bracket; "
            "write [sys/devices/system/cpu]");
  EXPECT_EQ(refusalOf("# x\nonline: 0\n"),
            "can not read the captured files: root.txt, line 2: a file before the first directory; begin with a line "
            "such as [sys/devices/system/cpu]");
  EXPECT_EQ(refusalOf("[a]\nonline\n"),
            "can not read the captured files: root.txt, line 2: no file name with a colon behind it; write name: "
            "contents");
  EXPECT_EQ(refusalOf("[a]\nb: 1\nb: 1\n"),
            "can not read the captured files: root.txt, line 3: a/b is there twice; remove one of the two");
  EXPECT_EQ(refusalOf("[a]\n\tx\n"),
            "can not read the captured files: root.txt, line 2: a line of contents that belongs to no file; begin with "
            "a line name: above it");
  EXPECT_EQ(refusalOf("[a]\nb! EOOPS\n"),
            "can not read the captured files: root.txt, line 2: unknown error EOOPS; use EACCES, EINVAL, EIO, ENOENT, "
            "ENXIO or EPERM");
}

}  // namespace
}  // namespace Tarn::Inventory
