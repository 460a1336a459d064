#include "platform/inventory/sources/SnapshotWriter.h"
#include "platform/inventory/sources/snapshot/Snapshot.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <functional>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/files/Archive.h"
#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "tests/platform/inventory/KernelFiles.h"
#include "tests/platform/inventory/Scratch.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Inventory {
namespace {

std::string refusalOf(const std::function<void()>& action) {
  try {
    action();
  } catch (const InventoryError& error) {
    return error.what();
  }
  return "accepted";
}

/// A machine of one CPU, with firmware tables and a serial number.
MemoryFileSystem::Files boardWithTables() {
  Support::SmbiosEncoder encoder;
  encoder.add(Support::SmbiosSystem{.frame = {.handle = 1}});
  encoder.add(Support::SmbiosProcessor{.frame = {.handle = 4}});
  encoder.end();
  MemoryFileSystem::Files files;
  files["proc/cpuinfo"] = {"processor\t: 0\nSerial\t\t: 00000000a1b2c3d4\n"};
  files["sys/class/dmi/id/product_name"] = {"Example 100\n"};
  files["sys/class/dmi/id/product_serial"] = {"SYS-0001\n"};
  files["sys/devices/system/cpu/present"] = {"0\n"};
  files["sys/devices/system/cpu/online"] = {"0\n"};
  files["sys/devices/system/cpu/cpu0/topology/physical_package_id"] = {"0\n"};
  files["sys/devices/system/cpu/cpu0/topology/core_id"] = {"0\n"};
  files["sys/firmware/dmi/tables/DMI"] = {encoder.table()};
  files["sys/firmware/dmi/tables/smbios_entry_point"] = {encoder.entryPoint()};
  return files;
}

TEST(Snapshot, OfEveryFixtureIsReplayedAsTheSameTree) {
  const ScratchDirectory directory;
  unsigned int machines = 0;
  for (const auto& machine : std::filesystem::directory_iterator(fixtures)) {
    const std::string root = machine.path().string() + "/root.txt";
    if (!std::filesystem::exists(root)) {
      continue;
    }
    ++machines;
    const Tree tree = loadInventory("root:" + root);
    for (const Identifiers identifiers : {Identifiers::Masked, Identifiers::Kept}) {
      if (identifiers == Identifiers::Masked && tree.text(tree.node(0), PropSystemName) != nullptr) {
        continue;  // the next test is about the name
      }
      const Snapshot snapshot = takeSnapshot("root:" + root, identifiers, "test");

      EXPECT_EQ(snapshot.error, "");
      EXPECT_EQ(loadInventory("snapshot:" + directory.write("snapshot", snapshot.text)), tree) << root;
    }
  }
  EXPECT_GE(machines, 8U);
}

TEST(Snapshot, HasTheNameOfTheMachineUnlessItIsMasked) {
  const ScratchDirectory directory;
  const auto nameIn = [&](Identifiers identifiers) {
    const Snapshot snapshot = takeSnapshot("root:" + fixtures + "named-machine/root.txt", identifiers, "test");
    return textAt(loadInventory("snapshot:" + directory.write("snapshot", snapshot.text)), "system", PropSystemName);
  };

  EXPECT_EQ(nameIn(Identifiers::Kept), "node17.example");
  EXPECT_EQ(nameIn(Identifiers::Masked), "XXXXXXXXXXXXXX");
}

TEST(Snapshot, OfThisMachineIsReplayedAsTheSameFiles) {
  const ScratchDirectory directory;
  const Snapshot live = takeSnapshot("live", Identifiers::Kept, "test");

  const Snapshot again = takeSnapshot("snapshot:" + directory.write("snapshot", live.text), Identifiers::Kept, "test");

  ASSERT_EQ(live.error, "");
  EXPECT_EQ(readSnapshot(again.text, "again"), readSnapshot(live.text, "live"));
}

TEST(Snapshot, HoldsOnlyWhatWasRead) {
  const ScratchDirectory directory;
  MemoryFileSystem::Files files = boardWithTables();
  const std::string root = directory.write("root.txt", writeArchive(files));

  MemoryFileSystem::Files snapshot =
      readSnapshot(takeSnapshot("root:" + root, Identifiers::Kept, "test").text, "snapshot");

  EXPECT_EQ(snapshot.count("sys/class/dmi/id/product_name"), 1U);
  EXPECT_EQ(snapshot.count("sys/class/dmi/id/product_serial"), 0U);
  for (const auto& [path, entry] : snapshot) {
    if (!entry.listing) {
      EXPECT_EQ(entry, files[path]) << path;
    }
  }
}

TEST(Snapshot, SaysInItsHeadWhatIsMasked) {
  const ScratchDirectory directory;
  const std::string root = directory.write("root.txt", writeArchive(boardWithTables()));

  const std::string masked = takeSnapshot("root:" + root, Identifiers::Masked, "corvcim 9").text;
  const std::string kept = takeSnapshot("root:" + root, Identifiers::Kept, "corvcim 9").text;

  EXPECT_THAT(masked, testing::StartsWith("# corvane-snapshot 1\n"
                                          "# The files that corvcim 9 read for the inventory; source: root\n"
                                          "# To read the same inventory anywhere: corvcim --inventory snapshot:FILE\n"
                                          "# Masked at equal length, because it identifies this machine:\n"
                                          "#   proc/cpuinfo: Serial\n"));
  EXPECT_THAT(masked, testing::Not(testing::HasSubstr("a1b2c3d4")));
  EXPECT_THAT(kept, testing::StartsWith("# corvane-snapshot 1\n"
                                        "# The files that corvcim 9 read for the inventory; source: root\n"
                                        "# To read the same inventory anywhere: corvcim --inventory snapshot:FILE\n"
                                        "# Nothing is masked: serial numbers and other identifiers are as they were "
                                        "read.\n"
                                        "["));
  EXPECT_THAT(kept, testing::HasSubstr("a1b2c3d4"));
}

TEST(Snapshot, OfAMachineWithoutIdentifiersSaysSo) {
  EXPECT_THAT(takeSnapshot("root:" + fixtures + "kvm-two-cpus/root.txt", Identifiers::Masked, "test").text,
              testing::HasSubstr("# Masked: nothing; no identifier of this machine was read.\n"));
}

TEST(Snapshot, OfWhatGivesNoInventoryIsTakenAllTheSame) {
  const ScratchDirectory directory;
  const std::string root = directory.write("root.txt", "[proc]\ncpuinfo! EIO\n");
  const Snapshot snapshot = takeSnapshot("root:" + root, Identifiers::Masked, "test");
  const std::string file = directory.write("snapshot", snapshot.text);

  EXPECT_THAT(snapshot.error, testing::HasSubstr("neither this directory nor /proc/cpuinfo lists a processor"));
  EXPECT_THAT(snapshot.text,
              testing::HasSubstr("\n# No inventory came of it; reading this file as a source says why.\n"));
  EXPECT_THAT(snapshot.text, testing::Not(testing::HasSubstr("neither"))) << "the error names directories";
  EXPECT_EQ(refusalOf([&] { loadInventory("snapshot:" + file); }), snapshot.error);
}

TEST(Snapshot, OfWhatIsOneFileAlreadyIsRefused) {
  EXPECT_EQ(
      refusalOf([] { takeSnapshot("json:x.json", Identifiers::Masked, "test"); }),
      "cannot take a snapshot: json:x.json: the source is one file already, and none of a machine's files is read "
      "for it; pass on that file, or name live, root:DIRECTORY or snapshot:FILE");
}

TEST(Snapshot, OfADumpAloneIsRefused) {
  const std::string dump = "smbios:" + fixtures + "smbios/many-cores/dump.bin";

  EXPECT_EQ(refusalOf([&] { takeSnapshot(dump, Identifiers::Masked, "test"); }),
            "cannot take a snapshot: " + dump +
                ": the source is one file already, and none of a machine's files is read for it; pass on that file, or "
                "name live, root:DIRECTORY or snapshot:FILE");
}

TEST(Snapshot, IsKnownByItsFirstLine) {
  for (const char* text : {"", "[proc]\ncpuinfo: x\n", "# corvane-snapshot 2\n", "# corvane-snapshot 10\n"}) {
    EXPECT_EQ(refusalOf([&] { readSnapshot(text, "file"); }),
              "cannot read the snapshot: file, line 1: it does not begin with \"# corvane-snapshot 1\"; take it with "
              "corvcim snapshot; captured files without this line are a source root:FILE");
  }
  EXPECT_EQ(readSnapshot("# corvane-snapshot 1\n[a]\nb: 1\n", "file").size(), 1U);
  EXPECT_EQ(refusalOf([] { readSnapshot("# corvane-snapshot 1\nb: 1\n", "file"); }),
            "cannot read the captured files: file, line 2: a file before the first directory; begin with a line such "
            "as [sys/devices/system/cpu]");
}

TEST(Snapshot, ThatIsNotThereIsAnError) {
  EXPECT_EQ(refusalOf([] { loadInventory("snapshot:/nothing"); }),
            "cannot read the inventory: /nothing: no such file or directory; name a file that corvcim snapshot wrote");
}

}  // namespace
}  // namespace Tarn::Inventory
