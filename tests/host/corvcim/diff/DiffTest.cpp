#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>

#include "host/corvcim/diff/DiffText.h"
#include "host/corvcim/diff/InventoryDiff.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;
using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

std::string told(const Tree& before, const Tree& after) {
  return writeDiffText(before, after, compareInventories(before, after));
}

/// One node, described by the caller, in a machine of that type's making.
Tree machineWith(NodeType type, const std::function<void(TreeBuilder&)>& describe) {
  TreeBuilder builder;
  if (type != NodeSystem) {
    builder.system();
  }
  if (type == NodeProcessorCore || type == NodeCacheMemory) {
    builder.processor("P0");
  }
  builder.node(type, "X");
  describe(builder);
  return builder.build();
}

std::string toldOf(NodeType type, const std::function<void(TreeBuilder&)>& before,
                   const std::function<void(TreeBuilder&)>& after) {
  return told(machineWith(type, before), machineWith(type, after));
}

std::string toldOfStatus(NodeType type, unsigned int before, unsigned int after) {
  return toldOf(
      type, [=](TreeBuilder& b) { b.status(before); }, [=](TreeBuilder& b) { b.status(after); });
}

TEST(Diff, EqualInventoriesHaveNone) {
  for (const Tree& machine : {twoCoreMachine(), dualSocketServer(), smallBoard(), strangeTexts(), Tree()}) {
    EXPECT_THAT(compareInventories(machine, machine), testing::IsEmpty());
    EXPECT_EQ(told(machine, machine), "");
  }
}

TEST(Diff, ACoreWentOffline) {
  const auto machine = [](unsigned int status) {
    return TreeBuilder()
        .processor("P0")
        .number(PropProcessorCores, 4)
        .number(PropEnabledCores, status == Status::inUse ? 4 : 3)
        .core("P0.C2")
        .core("P0.C3")
        .status(status)
        .build();
  };

  EXPECT_EQ(told(machine(Status::inUse), machine(Status::offline)),
            "P0 has 3 enabled cores now, had 4\n"
            "P0.C3 went offline\n");
  EXPECT_EQ(told(machine(Status::offline), machine(Status::inUse)),
            "P0 has 4 enabled cores now, had 3\n"
            "P0.C3 came online\n");
}

TEST(Diff, ASocketWasEmptiedAndFilled) {
  const Tree full = TreeBuilder()
                        .processor("P0")
                        .processor("P1")
                        .text(PropProcessorName, "Some CPU")
                        .number(PropProcessorCores, 2)
                        .core("P1.C0")
                        .core("P1.C1")
                        .cache("P1.L3.1")
                        .build();
  const Tree emptied = TreeBuilder().processor("P0").processor("P1").status(Status::emptySocket).build();

  EXPECT_EQ(told(full, emptied), "P1: the socket is empty now, with 2 cores and 1 cache gone\n");
  EXPECT_EQ(told(emptied, full), "P1: the socket has a processor now: Some CPU, with 2 cores and 1 cache\n");
}

TEST(Diff, TheSocketsThatWereEmptiedAlikeShareASentence) {
  const auto machine = [](bool isFull) {
    TreeBuilder builder;
    for (const std::string processor : {"P0", "P1"}) {
      builder.processor(processor).status(isFull ? Status::inUse : Status::emptySocket);
      if (isFull) {
        builder.core(processor + ".C0").core(processor + ".C1").cache(processor + ".L3.0");
      }
    }
    return builder.build();
  };

  EXPECT_EQ(told(machine(true), machine(false)),
            "P0 and P1: the socket is empty now, with 2 cores and 1 cache gone each\n");
}

TEST(Diff, WhatAnEmptySocketStillHasIsTold) {
  const auto machine = [](unsigned int status, std::string_view name) {
    return TreeBuilder().processor("P1").status(status).description(name).build();
  };

  EXPECT_EQ(told(machine(Status::inUse, "CPU 1"), machine(Status::emptySocket, "Socket 1")),
            "P1: the socket is empty now\n"
            "P1: the description is \"Socket 1\" now, was \"CPU 1\"\n");
}

TEST(Diff, AProcessorIsGoneOrNew) {
  const Tree one = TreeBuilder().processor("P0").build();
  const Tree two = TreeBuilder()
                       .processor("P0")
                       .processor("P1")
                       .text(PropProcessorName, "Some CPU")
                       .core("P1.C0")
                       .cache("P1.L1d.0")
                       .cache("P1.L1i.0")
                       .build();

  EXPECT_EQ(told(two, one), "P1 is gone, with 1 core and 2 caches\n");
  EXPECT_EQ(told(one, two), "P1 is new: Some CPU, with 1 core and 2 caches\n");
}

TEST(Diff, AnEmptySocketIsNoProcessor) {
  const Tree one = TreeBuilder().processor("P0").build();
  const Tree two = TreeBuilder().processor("P0").processor("S:CPU2").status(Status::emptySocket).build();

  EXPECT_EQ(told(one, two), "S:CPU2 is new: an empty socket\n");
}

TEST(Diff, CoresAndCachesAreGoneOrNewThemselves) {
  const Tree few = TreeBuilder().processor("P0").core("P0.C0").build();
  const Tree many =
      TreeBuilder().processor("P0").core("P0.C0").core("P0.C1").core("P0.C2").core("P0.C3").cache("P0.L2.1").build();

  EXPECT_EQ(told(many, few), "P0.C1 to P0.C3 are gone\nP0.L2.1 is gone\n");
  EXPECT_EQ(told(few, many), "P0.C1 to P0.C3 are new\nP0.L2.1 is new\n");
}

Tree cacheOf(unsigned int blocks, unsigned int blockSize, unsigned int usable) {
  return TreeBuilder()
      .processor("P0")
      .cache("P0.L3.0")
      .number(PropCacheBlockSize, blockSize)
      .number(PropCacheNumberOfBlocks, blocks)
      .number(PropCacheConsumableBlocks, usable)
      .build();
}

/// Four CPUs in one processor; the kernel shows those cores, with their caches, that have one online.
Tree machineShowing(const std::vector<unsigned int>& cores, const CpuSet& cpus) {
  TreeBuilder tree;
  tree.processor("P0").cpus(cpus);
  for (const unsigned int core : cores) {
    tree.core("P0.C" + std::to_string(core)).cpus({2 * core, 2 * core + 1});
  }
  for (const unsigned int core : cores) {
    tree.cache("P0.L1d." + std::to_string(core)).cpus({2 * core, 2 * core + 1});
    tree.cache("P0.L2." + std::to_string(core)).cpus({2 * core, 2 * core + 1});
  }
  return tree.build();
}

TEST(Diff, ACoreThatTheKernelHidesWentOffline) {
  const Tree all = machineShowing({0, 1, 2}, {0, 1, 2, 3, 4, 5});
  const Tree one = machineShowing({0}, {0, 1, 2, 3, 4, 5});

  EXPECT_EQ(told(all, one), "P0.C1 and P0.C2 went offline, with 2 caches each\n");
  EXPECT_EQ(told(one, all), "P0.C1 and P0.C2 came online, with 2 caches each\n");
}

TEST(Diff, ACoreWhoseCpusAreGoneDidNotGoOffline) {
  EXPECT_EQ(told(machineShowing({0, 1}, {0, 1, 2, 3}), machineShowing({0}, {0, 1})),
            "P0: the CPU list is \"0-1\" now, was \"0-3\"\n"
            "P0.C1 is gone\n"
            "P0.L1d.1 and P0.L2.1 are gone\n");
}

TEST(Diff, CoresOfAMachineThatShowsNoneDidNotGoOffline) {
  EXPECT_EQ(told(machineShowing({0, 1}, {0, 1, 2, 3}), machineShowing({}, {0, 1, 2, 3})),
            "P0.C0 and P0.C1 are gone\n"
            "P0.L1d.0, P0.L2.0, P0.L1d.1 and P0.L2.1 are gone\n");
}

TEST(Diff, ACoreUnderAnotherNumberDidNotGoOffline) {
  const Tree before =
      TreeBuilder().processor("P0").cpus({0, 1}).core("P0.C0").cpus({0}).core("P0.C1").cpus({1}).build();
  const Tree after =
      TreeBuilder().processor("P0").cpus({0, 1}).core("P0.C0").cpus({0}).core("P0.C@1").cpus({1}).build();

  EXPECT_EQ(told(before, after), "P0.C1 is gone\nP0.C@1 is new\n");
}

TEST(Diff, ACacheThatOtherCoresHaveTooIsTold) {
  const auto machine = [](bool isWhole) {
    TreeBuilder tree;
    tree.processor("P0").cpus({0, 1}).core("P0.C0").cpus({0});
    if (isWhole) {
      tree.core("P0.C1").cpus({1}).cache("P0.L2.0").cpus({0, 1});
    }
    return tree.build();
  };

  EXPECT_EQ(told(machine(true), machine(false)), "P0.C1 went offline\nP0.L2.0 is gone\n");
}

TEST(Diff, ACacheIsSmallerOrLarger) {
  constexpr unsigned int mebibyte = 1024 * 1024 / 64;
  const Tree large = cacheOf(36 * mebibyte, 64, 36 * mebibyte);
  const Tree small = cacheOf(32 * mebibyte, 64, 32 * mebibyte);

  EXPECT_EQ(told(large, small), "P0.L3.0 is smaller: 32 MiB, was 36 MiB\n");
  EXPECT_EQ(told(small, large), "P0.L3.0 is larger: 36 MiB, was 32 MiB\n");
}

TEST(Diff, TheSizeOfACacheIsNotAllThatMayDiffer) {
  EXPECT_EQ(told(cacheOf(1024, 64, 1024), cacheOf(512, 128, 512)),
            "P0.L3.0: the line size is 128 bytes now, was 64 bytes\n"
            "P0.L3.0: the number of usable lines is 512 now, was 1024\n"
            "P0.L3.0: the number of lines is 512 now, was 1024\n");
  EXPECT_EQ(told(cacheOf(1024, 64, 1024), cacheOf(512, 64, 256)),
            "P0.L3.0 is smaller: 32 KiB, was 64 KiB\n"
            "P0.L3.0: the number of usable lines is 256 now, was 1024\n");
  EXPECT_EQ(told(cacheOf(0xFFFFFFFF, 64, 1), cacheOf(0x80000000, 64, 1)), "P0.L3.0 is smaller: 128 GiB, was 256 GiB\n");
}

TEST(Diff, FirmwareChanged) {
  const auto machine = [](std::string_view model, unsigned int clock) {
    return TreeBuilder()
        .system()
        .text(PropSystemModel, model)
        .processor("P0")
        .number(PropExternalClockSpeed, clock)
        .build();
  };

  EXPECT_EQ(told(machine("PowerBox 300", 100), machine("PowerBox 300 Rev. 2", 200)),
            "system: the model is \"PowerBox 300 Rev. 2\" now, was \"PowerBox 300\"\n"
            "P0: the external clock is 200 MHz now, was 100 MHz\n");
}

TEST(Diff, StatesAreToldByWhatHappened) {
  EXPECT_EQ(toldOfStatus(NodeProcessor, Status::inUse, Status::failed),
            "X failed: the firmware's self-test disabled it\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, Status::failed, Status::inUse), "X works again\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, Status::inUse, Status::disabled), "X is disabled now\n");
  EXPECT_EQ(toldOfStatus(NodeProcessorCore, Status::disabled, Status::inUse), "X is enabled again\n");
  EXPECT_EQ(toldOfStatus(NodeCacheMemory, Status::inUse, Status::disabled), "X is off now\n");
  EXPECT_EQ(toldOfStatus(NodeCacheMemory, Status::disabled, Status::inUse), "X is on again\n");
  EXPECT_EQ(toldOfStatus(NodeProcessorCore, Status::disabled, Status::offline), "X went offline, was disabled\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, Status::emptySocket, Status::failed),
            "X failed: the firmware's self-test disabled it, was empty\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, Status::inUse, 7), "X: the state is 7 now\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, 7, 8), "X: the state is 8 now, was status 7\n");
  EXPECT_EQ(toldOfStatus(NodeProcessor, 7, Status::inUse), "X is in use now; the state was 7\n");
}

TEST(Diff, EveryPropertyHasWords) {
  for (const auto& entry : Tarn::Inventory::propertyTable()) {
    const auto set = [&](unsigned int number) {
      return [&entry, number](TreeBuilder& builder) {
        switch (entry.kind) {
          case Tarn::Inventory::PropertyKind::Number:
            builder.number(entry.id, number);
            break;
          case Tarn::Inventory::PropertyKind::Text:
            builder.text(entry.id, std::to_string(number));
            break;
          case Tarn::Inventory::PropertyKind::List:
            builder.list(entry.id, {number});
            break;
        }
      };
    };
    const auto unset = [](TreeBuilder&) {};
    const std::string name(entry.name);

    const std::string changed = toldOf(entry.nodeType, set(3), set(4));
    const std::string known = toldOf(entry.nodeType, unset, set(4));
    const std::string unknown = toldOf(entry.nodeType, set(3), unset);

    EXPECT_THAT(changed, testing::StartsWith("X")) << name;
    EXPECT_THAT(changed, testing::AllOf(testing::HasSubstr("4"), testing::HasSubstr("3"))) << name;
    EXPECT_THAT(known, testing::HasSubstr(" is known now: ")) << name;
    EXPECT_THAT(unknown, testing::HasSubstr(" is not known any more, was ")) << name;
    EXPECT_THAT(changed, testing::Not(testing::HasSubstr(name + " "))) << name;
  }
}

TEST(Diff, CountsAndQuantitiesAreReadable) {
  const auto number = [](Properties id, unsigned int value) {
    return [=](TreeBuilder& builder) { builder.number(id, value); };
  };

  EXPECT_EQ(toldOf(NodeProcessor, number(PropProcessorCores, 2), number(PropProcessorCores, 1)),
            "X has 1 core now, had 2\n");
  EXPECT_EQ(toldOf(NodeProcessor, number(PropMaxClockSpeed, 3500), number(PropMaxClockSpeed, 3600)),
            "X: the maximum clock is 3.6 GHz now, was 3.5 GHz\n");
  EXPECT_EQ(toldOf(NodeProcessor, number(PropFamily, 179), number(PropFamily, 2)),
            "X: the family is Unknown (2) now, was Xeon (179)\n");
  EXPECT_EQ(toldOf(NodeProcessor, number(PropHardwareThreads, 8), [](TreeBuilder&) {}),
            "X: the hardware thread count is not known any more, was 8\n");
}

TEST(Diff, TextsCanNotMoveTheCursor) {
  const auto named = [](std::string_view name) {
    return [=](TreeBuilder& builder) { builder.text(PropProcessorName, name); };
  };

  EXPECT_EQ(toldOf(NodeProcessor, named("a\x1B[31m"), named("{is} b\n")),
            "X: the model is \"{is} b\\n\" now, was \"a\\x1B[31m\"\n");
}

TEST(Diff, PlacesAndCpusCount) {
  const Tree before = TreeBuilder().processor("P0").processor("P1").cache("L4").cpus({0, 1, 2, 3}).build();
  const Tree after = TreeBuilder().processor("P0").cache("L4").cpus({0, 1}).processor("P1").build();

  EXPECT_EQ(told(before, after),
            "L4: the part above it is \"P0\" now, was \"P1\"\n"
            "L4: the CPU list is \"0-1\" now, was \"0-3\"\n");
}

TEST(Diff, APathCanBecomeAnotherKindOfPart) {
  const Tree before = TreeBuilder().processor("P0").core("X").build();
  const Tree after = TreeBuilder().processor("P0").cache("X").build();

  EXPECT_EQ(told(before, after), "X: the type is \"cache\" now, was \"core\"\n");
}

TEST(Diff, NodesAreMatchedByPathNotByOrder) {
  const Tree before = TreeBuilder().processor("P0").core("P0.C0").cpus({0}).core("P0.C1").cpus({1}).build();
  const Tree after = TreeBuilder().processor("P0").core("P0.C1").cpus({1}).core("P0.C0").cpus({0}).build();

  EXPECT_THAT(compareInventories(before, after), testing::IsEmpty());
}

TEST(Diff, ManyPartsThatChangedAlikeShareASentence) {
  TreeBuilder before;
  TreeBuilder after;
  before.processor("P0");
  after.processor("P0");
  for (unsigned int core = 0; core < 128; ++core) {
    before.core("P0.C" + std::to_string(core));
    after.core("P0.C" + std::to_string(core)).status(core < 64 ? Status::inUse : Status::offline);
  }

  EXPECT_EQ(told(before.build(), after.build()), "P0.C64 to P0.C127 went offline\n");
}

TEST(Diff, IgnoredFieldsDoNotCount) {
  const auto machine = [](unsigned int clock, std::string_view name) {
    return TreeBuilder().processor("P0").number(PropCurrentClockSpeed, clock).description(name).build();
  };
  const std::vector<std::string> clock = {"CurrentClockSpeed"};
  const std::vector<std::string> both = {"CurrentClockSpeed", "description"};

  const auto some = compareInventories(machine(2100, "a"), machine(2200, "b"), clock);

  ASSERT_EQ(some.size(), 1U);
  ASSERT_EQ(some[0].fields.size(), 1U);
  EXPECT_EQ(some[0].fields[0].name, "description");
  EXPECT_THAT(compareInventories(machine(2100, "a"), machine(2200, "b"), both), testing::IsEmpty());
}

TEST(Diff, WhatCouldNotBeReadIsNoPartOfTheMachine) {
  const Tree before = TreeBuilder().processor("P0").unread({"/a", "permission denied", "run as root"}).build();
  const Tree after = TreeBuilder().processor("P0").build();

  EXPECT_THAT(compareInventories(before, after), testing::IsEmpty());
}

}  // namespace
}  // namespace Corvcim::Testing
