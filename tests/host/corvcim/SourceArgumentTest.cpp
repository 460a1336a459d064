// Sources as the command line takes them: files without a kind, standard input, pipes, descriptions.

#include <gtest/gtest.h>

#include <string>

#include "platform/inventory/tree/JsonTree.h"
#include "tests/host/corvcim/Expected.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

const std::string sources = CORVANE_SOURCE_DIR "/tests/fixtures/";

class SourceArgument : public testing::Test {
 protected:
  // The class is asked in a process of its own, the inventory of an empty answer in the program itself.
  std::string request_ = " ein CIM_LogicalElement";
  Directory directory_;
  std::string json_ = directory_.write("machine", Tarn::Inventory::writeJson(twoCoreMachine()));
  Finished expected_ = corvcim({"-i", "json:" + json_, "ein", "CIM_LogicalElement"});
};

TEST_F(SourceArgument, StandardInputIsReadOnceForAllProcesses) {
  ASSERT_NE(expected_.output, "");
  for (const std::string source : {"json:/dev/stdin", "json:-", "-", "json:/dev/fd/0", "json:/proc/self/fd/0"}) {
    EXPECT_EQ(shell("(sleep 0.1; cat " + json_ + ") | \"$corvcim\" -i " + source + request_), expected_) << source;
  }
  EXPECT_EQ(shell("\"$corvcim\" -i -" + request_ + " < " + json_), expected_);
}

TEST_F(SourceArgument, PipesAreReadOnceForAllProcesses) {
  const std::string pipe = directory_.file("pipe");
  const std::string write = "mkfifo " + pipe + " 2>&-; (cat " + json_ + " > " + pipe + " &); ";

  EXPECT_EQ(shell(write + "\"$corvcim\" -i json:" + pipe + request_), expected_);
  EXPECT_EQ(shell(write + "\"$corvcim\" -i " + pipe + request_), expected_);
  EXPECT_EQ(shell("\"$corvcim\" -i <(cat " + json_ + ")" + request_), expected_);
  EXPECT_EQ(shell(write + "CORVANE_INVENTORY=json:" + pipe + " \"$corvcim\"" + request_), expected_);
}

TEST_F(SourceArgument, AMessageHasTheNameThatTheUserGave) {
  const std::string pipe = directory_.file("pipe");
  const Finished run =
      shell("mkfifo " + pipe + "; (echo '{no' > " + pipe + " &); \"$corvcim\" -i json:" + pipe + " tree");

  EXPECT_EQ(run.status, 1);
  EXPECT_TRUE(run.errors.starts_with("corvcim: cannot read the inventory: " + pipe + ": it is not JSON: ")) << run;
}

TEST_F(SourceArgument, BothSidesOfAComparisonMayBeStandardInput) {
  EXPECT_EQ(shell("cat " + json_ + " | \"$corvcim\" diff - json:/dev/stdin"), success("No differences.\n"));
  EXPECT_EQ(shell("\"$corvcim\" diff <(cat " + json_ + ") " + json_), success("No differences.\n"));
}

TEST_F(SourceArgument, TheKindOfAFileIsSeenFromItsFirstBytes) {
  const std::string root = "root:" + sources + "virtual-machine/root.txt";
  const std::string snapshot = directory_.write("snapshot", corvcim({"-i", root, "snapshot"}).output);
  const std::string dump = sources + "smbios/socket-per-virtual-cpu/dump.bin";
  const auto inventory = [](const std::string& source) { return corvcim({"-i", source, "inventory"}); };

  EXPECT_EQ(inventory(json_), inventory("json:" + json_));
  EXPECT_EQ(inventory(snapshot), inventory("snapshot:" + snapshot));
  EXPECT_EQ(inventory(dump), inventory("smbios:" + dump));
  EXPECT_EQ(inventory(sources + "virtual-machine/root.txt"), inventory(root));
  EXPECT_EQ(inventory("/"), inventory("root:/"));
}

TEST_F(SourceArgument, AFileThatIsNoInventoryIsRefused) {
  const std::string other = directory_.write("other", "hello\n");
  const std::string empty = directory_.write("empty", " \n");

  EXPECT_EQ(corvcim({"-i", other, "tree"}),
            failed("cannot read the inventory: " + other +
                   ": its first bytes are those of no inventory; name its kind as well: snapshot:FILE, json:FILE, "
                   "root:FILE, smbios:FILE or hwloc:FILE"));
  EXPECT_EQ(corvcim({"-i", empty, "tree"}),
            failed("cannot read the inventory: " + empty + ": it is empty; name a file that holds an inventory"));
  EXPECT_EQ(shell("\"$corvcim\" -i json:/dev/zero tree"),
            failed("cannot read the inventory: /dev/zero: file too large; name a file, or a pipe that an inventory "
                   "comes through"));
}

TEST_F(SourceArgument, TheDescriptionOfAMachineIsConverted) {
  const std::string machine = "hwloc-synthetic:package:2 core:2 pu:1";
  if (corvcim({"inventory", "--from", machine}).errors.find("without hwloc") != std::string::npos) {
    GTEST_SKIP() << "built without hwloc";
  }

  EXPECT_EQ(corvcim({"-i", machine, "inventory"}), corvcim({"inventory", "--from", machine}));
  EXPECT_EQ(corvcim({"-i", machine, "ein", "HALDA_CPUProcessorCore"}),
            success(corePath("P0.C0") + '\n' + corePath("P0.C1") + '\n' + corePath("P1.C2") + '\n' + corePath("P1.C3") +
                    '\n'));
  EXPECT_EQ(corvcim({"-i", machine, "snapshot"}).errors.substr(0, 71),
            "corvcim: cannot take a snapshot: " + machine + ":");
}

}  // namespace
}  // namespace Corvcim::Testing
