// Descriptions by hwloc, from the command line to the providers' answers.

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

#include "tests/host/corvcim/Program.h"
#include "tests/host/corvcim/hwloc/HwlocXml.h"

namespace Corvcim::Testing {
namespace {

constexpr const char* twoPackages =
    "hwloc-synthetic:package:2 l3:1(size=33554432) l2:2(size=1048576) l1d:1(size=32768) core:1 pu:2";

TEST(HwlocCommand, ADescribedMachineAnswersThroughTheLibrary) {
  const Directory directory;
  const Finished json = corvcim({"inventory", "-o", "json", "--from", twoPackages});
  ASSERT_EQ(json.errors, "");
  const std::string source = "json:" + directory.write("machine.json", json.output);

  EXPECT_EQ(corvcim({"-i", source}).output,
            "unnamed\n"
            "2 processors: 4 cores, all enabled, 8 threads\n"
            "\n"
            "2 equal processors: P0, P1\n"
            "  Model   not known\n"
            "  Family  Unknown\n"
            "  State   Enabled, health OK\n"
            "  Cores   2 cores, all enabled, 4 threads\n"
            "  Clocks  not known\n"
            "  Caches  2 × L1d 32 KiB, 2 × L2 1 MiB, L3 32 MiB\n"
            "  Widths  not known\n");
  EXPECT_EQ(corvcim({"-i", source, "ein", "HALDA_CPUProcessorCore"}).output,
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C0\"\n"
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"\n"
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P1.C2\"\n"
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P1.C3\"\n");
  EXPECT_EQ(corvcim({"-i", source, "inventory", "-o", "json"}), json);
}

TEST(HwlocCommand, AFileIsReadLikeADescription) {
  HwlocXml xml("0x1");
  xml.begin("Package", "0", "0x1").info("CPUModel", "Some CPU").plainCore(0).end();
  const Directory directory;

  const Finished run = corvcim({"inventory", "--from", "hwloc:" + directory.write("machine.xml", xml.text())});

  EXPECT_EQ(run, (Finished{0,
                           "system system\n"
                           "    description  Computer system\n"
                           "  processor P0\n"
                           "      description               Processor 0\n"
                           "      cpus                      0\n"
                           "      ProcessorName             Some CPU\n"
                           "      HardwareThreads           1\n"
                           "      EnabledCores              1\n"
                           "      ProcessorCores            1\n"
                           "      Family                    2\n"
                           "      RequestedStatesSupported  1\n"
                           "    core P0.C0\n"
                           "        description  Core 0\n"
                           "        cpus         0\n",
                           ""}));
}

// Version 2.9 of hwloc reads through a null pointer here; others may refuse it.
TEST(HwlocCommand, AFileThatHwlocCrashesOnIsOneLine) {
  HwlocXml xml("0x3");
  xml.begin("Package", "0", "0x1").plainCore(0).end().begin("Package", "1", "0x2").plainCore(1).end();
  std::string text = xml.text();
  const std::string attribute = " complete_cpuset=\"0x2\"";
  text.erase(text.find(attribute), attribute.size());
  const Directory directory;
  const std::string file = directory.write("machine.xml", text);

  const Finished run = corvcim({"inventory", "--from", "hwloc:" + file});

  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.output, "");
  EXPECT_EQ(std::ranges::count(run.errors, '\n'), 1) << run;
  EXPECT_TRUE(run.errors.starts_with("corvcim: cannot read the inventory: ")) << run;
  EXPECT_NE(run.errors.find(file), std::string::npos) << run;
}

TEST(HwlocCommand, ADescriptionAndAnInventoryAreTwoSources) {
  EXPECT_EQ(corvcim({"inventory", "-i", "live", "--from", twoPackages}),
            (Finished{2, "", "corvcim: '--from' and '--inventory' both name a source; see 'corvcim --help'\n"}));
  EXPECT_EQ(
      corvcim({"tree", "--from", twoPackages}),
      (Finished{2, "", "corvcim: tree takes no option '--from': it belongs to inventory; see 'corvcim --help'\n"}));
}

/// What a conversion says where hwloc's library is another file than hwloc's.
Finished withLibrary(const Directory& directory) {
  return shell("LD_LIBRARY_PATH='" + directory.file("") + "' \"$corvcim\" inventory --from 'hwloc-synthetic:pu:1'");
}

constexpr const char* remedy = "; install hwloc 2.4 or later (libhwloc15) for corvcim's architecture\n";

TEST(HwlocCommand, ALibraryThatCanNotBeLoadedIsOneLine) {
  const Directory directory;
  const std::string library = directory.write("libhwloc.so.15", "");

  EXPECT_EQ(withLibrary(directory), (Finished{1, "",
                                              "corvcim: cannot read the inventory: \"pu:1\": it takes hwloc: " +
                                                  library + ": file too short" + remedy}));
}

TEST(HwlocCommand, ALibraryWithoutAFunctionIsOneLine) {
  const Directory directory;
  shell("ln -s \"$(ldd \"$corvcim\" | sed -n 's/.*=> \\(.*libm\\.so[^ ]*\\).*/\\1/p')\" '" +
        directory.file("libhwloc.so.15") + "'");

  const Finished run = withLibrary(directory);

  EXPECT_EQ(run.status, 1);
  EXPECT_EQ(run.output, "");
  EXPECT_TRUE(run.errors.ends_with(std::string("undefined symbol: hwloc_topology_init") + remedy)) << run;
}

TEST(HwlocCommand, OnlyAConversionLoadsIt) {
  const std::string count = " 2>&1 | grep -c 'calling init:.*libhwloc'";

  EXPECT_EQ(shell("LD_DEBUG=files \"$corvcim\" inventory --from 'hwloc-synthetic:pu:1'" + count).output, "1\n");
  EXPECT_EQ(shell("LD_DEBUG=files \"$corvcim\" ei HALDA_CPUProcessor" + count).output, "0\n");
}

TEST(HwlocCommand, NoPluginIsLoaded) {
  const Finished run = shell(
      "LD_DEBUG=files \"$corvcim\" inventory --from 'hwloc-synthetic:pu:1' 2>&1 | "
      "grep -c 'file=.*hwloc_' ");

  EXPECT_EQ(run.output, "0\n");
}

}  // namespace
}  // namespace Corvcim::Testing
