// The verb diff from outside.

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>

#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"
#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

class DiffCommand : public testing::Test {
 protected:
  std::string source(const std::string& name, const Tree& tree) const {
    return "json:" + directory_.write(name, Tarn::Inventory::writeJson(tree));
  }
  static Tree desk(unsigned int status, unsigned int clock) {
    return TreeBuilder()
        .processor("P0")
        .number(PropCurrentClockSpeed, clock)
        .core("P0.C0")
        .core("P0.C1")
        .status(status)
        .build();
  }

 private:
  Directory directory_;
};

TEST_F(DiffCommand, EqualInventoriesGiveStatusZero) {
  const std::string machine = source("machine.json", smallBoard());

  EXPECT_EQ(corvcim({"diff", machine, machine}), (Finished{0, "No differences.\n", ""}));
}

TEST_F(DiffCommand, DifferencesGiveStatusOne) {
  EXPECT_EQ(
      corvcim({"diff", source("a.json", desk(Status::inUse, 2000)), source("b.json", desk(Status::offline, 2500))}),
      (Finished{1, "P0: the current clock is 2.5 GHz now, was 2 GHz\nP0.C1 went offline\n", ""}));
}

TEST_F(DiffCommand, FieldsCanBeLeftOut) {
  const std::string before = source("a.json", desk(Status::inUse, 2000));
  const std::string after = source("b.json", desk(Status::inUse, 2500));

  EXPECT_EQ(corvcim({"diff", before, after, "--ignore", "CurrentClockSpeed"}), (Finished{0, "No differences.\n", ""}));
  EXPECT_EQ(corvcim({"diff", before, after}).status, 1);
}

TEST_F(DiffCommand, AFieldToLeaveOutThatThereIsNotIsNamed) {
  const std::string machine = source("a.json", smallBoard());

  const Finished run = corvcim({"diff", machine, machine, "--ignore", "Clock"});

  EXPECT_EQ(run.status, 2);
  EXPECT_TRUE(
      run.errors.starts_with("corvcim: diff: '--ignore' names no field of an inventory: 'Clock'; there are "
                             "type, parent, status, description, cpus, CacheAssociativity, "))
      << run;
}

TEST_F(DiffCommand, TroubleGivesStatusTwo) {
  const std::string machine = source("a.json", smallBoard());
  const std::string why =
      "corvcim: cannot read the inventory: /nowhere.json: no such file or directory; name a file that holds an "
      "inventory as JSON\n";

  EXPECT_EQ(corvcim({"diff", machine, "json:/nowhere.json"}), (Finished{2, "", why}));
  EXPECT_EQ(corvcim({"diff", "json:/nowhere.json", machine}), (Finished{2, "", why}));
  EXPECT_EQ(corvcim({"diff", machine}),
            (Finished{2, "", "corvcim: diff: B is missing; usage: corvcim [OPTION...] diff A B\n"}));
  EXPECT_EQ(
      corvcim({"diff", machine, machine, "-i", "live"}),
      (Finished{2, "", "corvcim: diff takes no option '-i': A and B say which inventories; see 'corvcim --help'\n"}));
  EXPECT_EQ(shell("\"$corvcim\" diff " + machine + ' ' + machine + " > /dev/full").status, 2);
}

TEST_F(DiffCommand, WhatOneSideCouldNotReadStandsBelowTheDifferences) {
  const Tree root = TreeBuilder().processor("P0").number(PropUpgradeMethod, 45).build();
  const Tree user = TreeBuilder()
                        .processor("P0")
                        .unread({"/sys/firmware/dmi/tables/DMI", "permission denied", "run as root"})
                        .build();

  EXPECT_EQ(corvcim({"diff", source("a.json", root), source("b.json", user)}).output,
            "P0: the upgrade method is not known any more, was 45\n"
            "\n"
            "Not read in B alone:\n"
            "  /sys/firmware/dmi/tables/DMI: permission denied\n"
            "    run as root\n");
}

TEST_F(DiffCommand, JsonHoldsEveryFieldOfEveryChange) {
  const Tree before = TreeBuilder()
                          .processor("P0")
                          .list(PropRequestedStatesSupported, {1})
                          .processor("P1")
                          .core("P1.C0")
                          .cpus({4})
                          .unread({"/a", "b", "c"})
                          .build();
  const Tree after = TreeBuilder()
                         .processor("P0")
                         .text(PropProcessorName, "A \"CPU\"")
                         .processor("P1")
                         .status(Status::emptySocket)
                         .build();
  const std::string a = source("a.json", before);
  const std::string b = source("b.json", after);

  const Finished run = corvcim({"diff", "-o", "json", a, b});

  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(nlohmann::json::parse(run.output),
            nlohmann::json({{"format", "corvane-inventory-diff"},
                            {"version", 1},
                            {"a", a},
                            {"b", b},
                            {"equal", false},
                            {"changes",
                             {{{"path", "P0"},
                               {"type", "processor"},
                               {"change", "changed"},
                               {"fields",
                                {{"RequestedStatesSupported", {{"a", {1}}, {"b", nullptr}}},
                                 {"ProcessorName", {{"a", nullptr}, {"b", "A \"CPU\""}}}}}},
                              {{"path", "P1"},
                               {"type", "processor"},
                               {"change", "changed"},
                               {"fields", {{"status", {{"a", 1}, {"b", 15}}}}}},
                              {{"path", "P1.C0"},
                               {"type", "core"},
                               {"change", "removed"},
                               {"fields",
                                {{"type", {{"a", "core"}, {"b", nullptr}}},
                                 {"parent", {{"a", "P1"}, {"b", nullptr}}},
                                 {"status", {{"a", 1}, {"b", nullptr}}},
                                 {"cpus", {{"a", "4"}, {"b", nullptr}}}}}}}},
                            {"unreadInA", {{{"file", "/a"}, {"reason", "b"}, {"remedy", "c"}}}},
                            {"unreadInB", nlohmann::json::array()}}));
}

TEST_F(DiffCommand, JsonOfEqualInventoriesSaysSo) {
  const std::string machine = source("machine.json", twoCoreMachine());

  const Finished run = corvcim({"diff", machine, machine, "-o", "json"});

  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(nlohmann::json::parse(run.output)["equal"], true);
  EXPECT_EQ(nlohmann::json::parse(run.output)["changes"], nlohmann::json::array());
}

}  // namespace
}  // namespace Corvcim::Testing
