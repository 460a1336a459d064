#include "platform/inventory/sources/files/FileSystem.h"

#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

#include "platform/inventory/sources/files/MemoryFileSystem.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/tree/Error.h"
#include "tests/platform/inventory/Scratch.h"

namespace Tarn::Inventory {
namespace {

using Names = std::vector<std::string>;

/// What every file system must do, on one that holds a/one, a/b/two and a/b/three.
void expectFiles(FileSystem& files) {
  std::string contents = "old";
  Names names{"old"};

  EXPECT_EQ(files.read("a/one", contents), 0);
  EXPECT_EQ(contents, "1\n");
  EXPECT_EQ(files.read("a/nothing", contents), ENOENT);
  EXPECT_EQ(contents, "");
  EXPECT_EQ(files.list("a", names), 0);
  EXPECT_EQ(names, (Names{"b", "one"}));
  EXPECT_EQ(files.list("a/nothing", names), ENOENT);
  EXPECT_EQ(names, Names{});

  const std::unique_ptr<FileSystem> below = files.below("a");
  EXPECT_EQ(below->read("b/two", contents), 0);
  EXPECT_EQ(contents, "2\n");
  EXPECT_EQ(below->list("b", names), 0);
  EXPECT_EQ(names, (Names{"three", "two"}));
  const std::unique_ptr<FileSystem> deeper = below->below("b");
  EXPECT_EQ(deeper->read("three", contents), 0);
  EXPECT_EQ(contents, "3\n");
  EXPECT_EQ(deeper->nameOf("three"), files.nameOf("a/b/three"));

  const std::unique_ptr<FileSystem> nowhere = files.below("nothing");
  EXPECT_EQ(nowhere->read("one", contents), ENOENT);
  EXPECT_EQ(nowhere->list("one", names), ENOENT);
}

MemoryFileSystem::Files threeFiles() {
  return {{"a/one", {"1\n", 0}}, {"a/b/two", {"2\n", 0}}, {"a/b/three", {"3\n", 0}}};
}

TEST(FileSystem, ReadsAndListsFilesInMemory) {
  MemoryFileSystem files(threeFiles());
  expectFiles(files);
  EXPECT_EQ(files.nameOf("a/one"), "/a/one");
}

TEST(FileSystem, ReadsAndListsFilesInADirectory) {
  const ScratchDirectory directory;
  for (const auto& [path, entry] : threeFiles()) {
    directory.write(path, entry.contents);
  }
  const std::unique_ptr<FileSystem> files = openDirectory(directory.name());
  expectFiles(*files);
  EXPECT_EQ(files->nameOf("a/one"), directory.name() + "/a/one");
}

TEST(FileSystem, RecordsWhatIsReadAndListed) {
  MemoryFileSystem target(threeFiles());
  target.fail("c/denied", EACCES);
  RecordingFileSystem::Record record;
  RecordingFileSystem files(target, record);

  expectFiles(files);
  std::string contents;
  EXPECT_EQ(files.read("c/denied", contents), EACCES);

  EXPECT_EQ(record.opened, (Names{"a/one", "a/nothing", "a/b/two", "a/b/three", "nothing/one", "c/denied"}));
  ASSERT_EQ(record.files.size(), 6U) << "what is not there is not kept";
  EXPECT_EQ(record.files.at("a/b/three").contents, "3\n");
  EXPECT_EQ(record.files.at("c/denied").error, EACCES);
  EXPECT_EQ(record.files.at("a").listing, (MemoryFileSystem::Listing{{"b", "one"}, 0}));
  EXPECT_EQ(record.files.at("a/b").listing, (MemoryFileSystem::Listing{{"three", "two"}, 0}));
}

TEST(FileSystem, RecordedGivesTheSameAnswers) {
  const ScratchDirectory directory;
  directory.write("a/read", "1\n");
  directory.write("a/never/read", "2\n");
  const std::unique_ptr<FileSystem> target = openDirectory(directory.name());
  RecordingFileSystem::Record record;
  RecordingFileSystem recorder(*target, record);
  struct Answers {
    FileError read, readDirectory, list, listFile, listNothing;
    std::string contents;
    Names names;
    bool operator==(const Answers&) const = default;
  };
  const auto ask = [](FileSystem& files) {
    Answers answers{};
    Names none;
    std::string nothing;
    answers.listFile = files.list("a/read", none);
    answers.read = files.read("a/read", answers.contents);
    answers.readDirectory = files.read("a", nothing);
    answers.list = files.list("a", answers.names);
    answers.listNothing = files.list("b", none);
    return answers;
  };

  const Answers recorded = ask(recorder);
  MemoryFileSystem replay(record.files);

  EXPECT_EQ(recorded, (Answers{0, EISDIR, 0, ENOTDIR, ENOENT, "1\n", {"never", "read"}}));
  EXPECT_EQ(ask(replay), recorded);
}

TEST(FileSystem, ReadsFilesLongerThanItsBuffer) {
  const ScratchDirectory directory;
  const std::string text = std::string(100000, 'x') + "end";
  directory.write("long", text);
  std::string contents;

  EXPECT_EQ(openDirectory(directory.name())->read("long", contents), 0);
  EXPECT_EQ(contents, text);
}

TEST(FileSystem, ReadsAttributesOfAnyNumberOfPages) {
  const ScratchDirectory directory;
  const auto files = openDirectory(directory.name());
  std::string contents;
  for (const std::size_t size : {0U, 1U, 4095U, 4096U, 4097U, 16384U, 20480U, 50000U}) {
    const std::string text(size, 'x');
    directory.write("sys/cpu/list", text);

    EXPECT_EQ(files->read("sys/cpu/list", contents), 0);
    EXPECT_EQ(contents, text);
    EXPECT_EQ(openDirectory(directory.name())->below("sys/cpu")->read("list", contents), 0);
    EXPECT_EQ(contents, text);
  }
}

TEST(FileSystem, TellsWhyAFileCannotBeRead) {
  const ScratchDirectory directory;
  directory.write("a/file", "x");
  const std::unique_ptr<FileSystem> files = openDirectory(directory.name());
  std::string contents;

  EXPECT_EQ(files->read("a", contents), EISDIR);
  EXPECT_EQ(files->read("a/file/more", contents), ENOTDIR);
}

TEST(FileSystem, RefusesAFileThatIsFarTooLarge) {
  const ScratchDirectory directory;
  const std::string name = directory.write("huge", "");
  ASSERT_EQ(::truncate(name.c_str(), off_t{65} << 20), 0);
  std::string contents;

  EXPECT_EQ(openDirectory(directory.name())->read("huge", contents), EFBIG);
  EXPECT_EQ(contents, "");
}

TEST(FileSystem, DoesNotWaitForAPipe) {
  const ScratchDirectory directory;
  ASSERT_EQ(::mkfifo((directory.name() + "/pipe").c_str(), 0600), 0);
  std::string contents;

  EXPECT_EQ(openDirectory(directory.name())->read("pipe", contents), 0);
  EXPECT_EQ(contents, "");
}

TEST(FileSystem, LeavesNoFileOpen) {
  const auto openFiles = [] {
    Names names;
    openDirectory("/proc/self")->list("fd", names);
    return names.size();
  };
  const std::size_t before = openFiles();

  const std::unique_ptr<FileSystem> files = openDirectory("/proc");
  std::string contents;
  Names names;
  files->read("cpuinfo", contents);
  files->read("nothing", contents);
  files->list("self/cpuinfo", names);
  files->below("self")->read("stat", contents);

  EXPECT_EQ(openFiles(), before + 1);
}

TEST(FileSystem, RefusesADirectoryThatIsNotThere) {
  try {
    openDirectory("/nothing/here");
    FAIL();
  } catch (const InventoryError& error) {
    EXPECT_STREQ(error.what(),
                 "cannot read the inventory: /nothing/here: no such file or directory; name a directory that holds "
                 "sys/ and proc/ of a machine");
  }
}

TEST(FileSystem, DescribesErrorsInEnglish) {
  EXPECT_EQ(describeError(EACCES), "permission denied");
  EXPECT_EQ(describeError(EMFILE), "too many open files");
  EXPECT_EQ(describeError(12345), "system error 12345");
}

TEST(MemoryFileSystem, ForgetsFilesByTheBeginOfTheirPath) {
  MemoryFileSystem files(threeFiles());

  files.remove("a/b/t");

  ASSERT_EQ(files.files().size(), 1U);
  EXPECT_EQ(files.files().begin()->first, "a/one");
}

}  // namespace
}  // namespace Tarn::Inventory
