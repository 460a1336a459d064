#include "platform/inventory/sources/files/Archive.h"

#include <gtest/gtest.h>

#include <cerrno>

#include "platform/inventory/tree/Error.h"

namespace Tarn::Inventory {
namespace {

std::string refusalOfArchive(const std::string& text) {
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

TEST(Archive, HoldsFilesThatCannotBeRead) {
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
  EXPECT_EQ(refusalOfArchive("[sys\n"),
            "cannot read the captured files: root.txt, line 1: a directory without its closing bracket; "
            "write [sys/devices/system/cpu]");
  EXPECT_EQ(refusalOfArchive("# x\nonline: 0\n"),
            "cannot read the captured files: root.txt, line 2: a file before the first directory; begin with a line "
            "such as [sys/devices/system/cpu]");
  EXPECT_EQ(refusalOfArchive("[a]\nonline\n"),
            "cannot read the captured files: root.txt, line 2: no file name with a colon after it; write name: "
            "contents");
  EXPECT_EQ(refusalOfArchive("[a]\nb: 1\nb: 1\n"),
            "cannot read the captured files: root.txt, line 3: a/b is there twice; remove one of the two");
  EXPECT_EQ(refusalOfArchive("[a]\n\tx\n"),
            "cannot read the captured files: root.txt, line 2: a line of contents that belongs to no file; begin with "
            "a line name: above it");
  EXPECT_EQ(refusalOfArchive("[a]\nb! EOOPS\n"),
            "cannot read the captured files: root.txt, line 2: unknown error EOOPS; use a name such as EACCES, EIO or "
            "ENOENT, or the error's number");
  EXPECT_EQ(refusalOfArchive("[a]\nb/c: 1\n"),
            "cannot read the captured files: root.txt, line 2: a file name with a slash; write the directory in "
            "brackets on a line above");
  for (const char* digits : {"0", "012", "0G", "AB", "01 02"}) {
    EXPECT_EQ(refusalOfArchive("[a]\nb#\n\t0102\n\t" + std::string(digits) + '\n'),
              "cannot read the captured files: root.txt, line 4: bytes that are not pairs of the digits 0 to 9 and a "
              "to f; write two digits for each byte");
  }
  for (const char* listing : {"./: one", "./# 00"}) {
    EXPECT_EQ(refusalOfArchive("[a]\n" + std::string(listing) + '\n'),
              "cannot read the captured files: root.txt, line 2: a directory's names beside its own; write them below, "
              "one on each line, after a tab");
  }
  EXPECT_EQ(refusalOfArchive("[a]\n./:\n./:\n"),
            "cannot read the captured files: root.txt, line 3: a/./ is there twice; remove one of the two");
}

TEST(Archive, HoldsFilesThatAreNoText) {
  const std::string bytes("\x00\x01\x7f\x80\xff\n", 6);
  MemoryFileSystem files(readArchive("[a]\none# 00017f80ff0a\ntwo#\n\t00017f\n\t80ff0a\nnone#\n", "root.txt"));
  std::string contents;

  EXPECT_EQ(files.read("a/one", contents), 0);
  EXPECT_EQ(contents, bytes);
  EXPECT_EQ(files.read("a/two", contents), 0);
  EXPECT_EQ(contents, bytes);
  EXPECT_EQ(files.read("a/none", contents), 0);
  EXPECT_EQ(contents, "");
}

TEST(Archive, WritesAsTextWhatSurvivesAsText) {
  MemoryFileSystem::Files files;
  files["a/bell"] = {"\a\n"};
  files["a/binary"] = {std::string(40, '\xfe')};
  files["a/german"] = {"gr\xc3\xbc\xc3\x9f\n"};
  files["a/latin"] = {"gr\xfc\n"};
  files["a/return"] = {"x\r\n"};
  files["a/tab"] = {"a\tb\n"};
  files["a/unfinished"] = {"x"};
  files["a/zero"] = {std::string("x\0\n", 3)};

  EXPECT_EQ(writeArchive(files),
            "[a]\n"
            "bell# 070a\n"
            "binary#\n"
            "\tfefefefefefefefefefefefefefefefefefefefefefefefefefefefefefefefe\n"
            "\tfefefefefefefefe\n"
            "german: gr\xc3\xbc\xc3\x9f\n"
            "latin# 6772fc0a\n"
            "return# 780d0a\n"
            "tab: a\tb\n"
            "unfinished# 78\n"
            "zero# 78000a\n");
}

TEST(Archive, HoldsWhatListingADirectoryGives) {
  MemoryFileSystem files(
      readArchive("[a]\n./:\n\tone\n\tunread\none: 1\n[a/denied]\n./! EACCES\n[a/none]\n./:\n", "root.txt"));
  std::vector<std::string> names;
  std::string contents;

  EXPECT_EQ(files.list("a", names), 0);
  EXPECT_EQ(names, (std::vector<std::string>{"one", "unread"}));
  EXPECT_EQ(files.read("a", contents), EISDIR);
  EXPECT_EQ(files.read("a/unread", contents), ENOENT);
  EXPECT_EQ(files.list("a/denied", names), EACCES);
  EXPECT_EQ(names, std::vector<std::string>());
  EXPECT_EQ(files.read("a/denied", contents), EACCES);
  EXPECT_EQ(files.list("a/none", names), 0);
  EXPECT_EQ(names, std::vector<std::string>());
}

TEST(Archive, HoldsEveryErrorByNameOrNumber) {
  for (const FileError error : {EPERM, ENOENT, EIO, ENXIO, EAGAIN, ENOMEM, EACCES, ENODEV, ENOTDIR, EISDIR, EINVAL,
                                ENFILE, EMFILE, EFBIG, ENAMETOOLONG, ELOOP, ENOSYS, 4095}) {
    MemoryFileSystem::Files files;
    files["a/b"] = {"", error};
    EXPECT_EQ(readArchive(writeArchive(files), "again"), files) << error;
  }
  EXPECT_EQ(readArchive("[a]\nb! 38\n", "root.txt")["a/b"].error, 38);
  for (const char* none : {"", "0", "-1", "4096", "1x", "eacces"}) {
    EXPECT_NE(refusalOfArchive("[a]\nb! " + std::string(none) + '\n'), "accepted") << none;
  }
}

TEST(Archive, ReadsDirectoriesBackAsTheyWereWritten) {
  MemoryFileSystem::Files files;
  files["a"] = {"", EISDIR, MemoryFileSystem::Listing{{"b", "c d"}, 0}};
  files["a/b"] = {"", EACCES, MemoryFileSystem::Listing{{}, EACCES}};
  files["a/denied"] = {"", EIO, MemoryFileSystem::Listing{{"x"}, 0}};
  files["a/file"] = {"1\n", 0, MemoryFileSystem::Listing{{}, ENOTDIR}};

  EXPECT_EQ(readArchive(writeArchive(files), "again"), files);
}

}  // namespace
}  // namespace Tarn::Inventory
