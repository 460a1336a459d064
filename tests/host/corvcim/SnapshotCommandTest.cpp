// The verb snapshot from outside.

#include <gmock/gmock.h>
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <fstream>
#include <iterator>
#include <string>

#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

const std::string fixtures = CORVANE_SOURCE_DIR "/tests/fixtures/";

/// A machine with a serial number, in files.
const std::string board =
    "[sys/devices/system/cpu]\npresent: 0\nonline: 0\n"
    "[sys/devices/system/cpu/cpu0/topology]\nphysical_package_id: 0\ncore_id: 0\n"
    "[proc]\ncpuinfo:\n\tprocessor\t: 0\n\tSerial\t\t: 00000000a1b2c3d4\n";

class SnapshotCommand : public testing::Test {
 protected:
  Directory directory_;
  std::string source_ = "root:" + directory_.write("root.txt", board);
};

TEST_F(SnapshotCommand, IsReplayedAsTheSameInventory) {
  const std::string source = "root:" + fixtures + "dual-socket-server/root.txt";
  const Finished taken = corvcim({"-i", source, "snapshot"});
  const std::string file = directory_.write("snapshot", taken.output);

  EXPECT_EQ(taken.status, 0);
  EXPECT_EQ(taken.errors, "");
  for (const std::string format : {"json", "text"}) {
    EXPECT_EQ(corvcim({"-i", "snapshot:" + file, "inventory", "-o", format}),
              corvcim({"-i", source, "inventory", "-o", format}));
  }
  EXPECT_EQ(corvcim({"diff", "snapshot:" + file, source}), (Finished{0, "No differences.\n", ""}));
}

TEST_F(SnapshotCommand, OfThisMachineReadsBack) {
  const std::string file = directory_.file("snapshot");

  EXPECT_EQ(corvcim({"snapshot", file}), (Finished{0, "", ""}));
  EXPECT_EQ(corvcim({"diff", "--ignore", "CurrentClockSpeed,SystemName", "snapshot:" + file, "live"}),
            (Finished{0, "No differences.\n", ""}));
}

TEST_F(SnapshotCommand, OfThisMachineDoesNotHaveItsName) {
  const std::string name = "\"" + thisHost() + "\"";
  const std::string file = directory_.file("snapshot");
  EXPECT_NE(corvcim({"-o", "json", "ei", "HALDA_CPUProcessor"}).output.find(name), std::string::npos);

  EXPECT_EQ(corvcim({"snapshot", file}), (Finished{0, "", ""}));

  EXPECT_EQ(contentsOf(file).find("hostname: " + thisHost() + "\n"), std::string::npos);
  for (const std::vector<std::string>& verb :
       {std::vector<std::string>{"-o", "json", "ei", "HALDA_CPUProcessor"}, {"-o", "json", "inventory"}}) {
    std::vector<std::string> arguments = {"-i", "snapshot:" + file};
    arguments.insert(arguments.end(), verb.begin(), verb.end());
    EXPECT_EQ(corvcim(arguments).output.find(name), std::string::npos);
  }
}

TEST_F(SnapshotCommand, MasksIdentifiersUnlessAskedNotTo) {
  const Finished masked = corvcim({"-i", source_, "snapshot"});
  const Finished kept = corvcim({"-i", source_, "snapshot", "--unmasked"});

  EXPECT_THAT(masked.output, testing::HasSubstr("#   proc/cpuinfo: Serial\n"));
  EXPECT_THAT(masked.output, testing::Not(testing::HasSubstr("a1b2c3d4")));
  EXPECT_THAT(kept.output, testing::HasSubstr("# Nothing is masked"));
  EXPECT_THAT(kept.output, testing::HasSubstr("a1b2c3d4"));
}

TEST_F(SnapshotCommand, WritesAFileThatOthersCanReadOnlyWhereItIsMasked) {
  const auto modeOf = [](const std::string& file) {
    struct stat status {};
    EXPECT_EQ(::stat(file.c_str(), &status), 0);
    return status.st_mode & 0777U;
  };
  const std::string masked = directory_.file("masked");
  const std::string kept = directory_.file("kept");

  EXPECT_EQ(corvcim({"-i", source_, "snapshot", masked}), (Finished{0, "", ""}));
  EXPECT_EQ(corvcim({"-i", source_, "snapshot", "--unmasked", kept}), (Finished{0, "", ""}));

  EXPECT_EQ(contentsOf(masked), corvcim({"-i", source_, "snapshot"}).output);
  EXPECT_EQ(contentsOf(kept), corvcim({"-i", source_, "snapshot", "--unmasked"}).output);
  const mode_t mask = ::umask(0);
  ::umask(mask);
  EXPECT_EQ(modeOf(kept), 0600U & ~mask);
  // One that is there already has a mode of its own.
  ::chmod(kept.c_str(), 0644);
  EXPECT_EQ(corvcim({"-i", source_, "snapshot", "--unmasked", kept}), (Finished{0, "", ""}));
  EXPECT_EQ(modeOf(kept), 0600U);
  EXPECT_EQ(modeOf(masked), 0644U & ~mask);
}

TEST_F(SnapshotCommand, IsTakenOfWhatGivesNoInventory) {
  const Finished run = corvcim({"-i", "root:" + directory_.write("broken.txt", "[proc]\ncpuinfo! EIO\n"), "snapshot"});

  EXPECT_EQ(run.status, 1);
  EXPECT_THAT(run.output, testing::EndsWith("[proc]\ncpuinfo! EIO\n"));
  EXPECT_THAT(run.errors, testing::HasSubstr("lists a processor"));
}

TEST_F(SnapshotCommand, SaysWhatItCanNotDo) {
  const std::string file = directory_.file("nothing/snapshot");

  EXPECT_EQ(corvcim({"-i", source_, "snapshot", file}),
            (Finished{1, "",
                      "corvcim: cannot write the snapshot: " + file +
                          ": no such file or directory; name a file that can be written, or none for standard "
                          "output\n"}));
  EXPECT_EQ(
      corvcim({"-i", "json:x", "snapshot"}),
      (Finished{1, "",
                "corvcim: cannot take a snapshot: json:x: the source is one file already, and none of a machine's "
                "files is read for it; pass on that file, or name live, root:DIRECTORY or snapshot:FILE\n"}));
  EXPECT_EQ(
      corvcim({"inventory", "--unmasked"}),
      (Finished{2, "",
                "corvcim: inventory takes no option '--unmasked': it belongs to snapshot; see 'corvcim --help'\n"}));
}

}  // namespace
}  // namespace Corvcim::Testing
