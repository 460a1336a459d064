#include "host/corvcim/drawing/TreeText.h"

#include <gtest/gtest.h>

#include "host/corvcim/drawing/TreeDot.h"
#include "host/corvcim/drawing/TreeJson.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::TreeBuilder;

std::string drawn(const Tarn::Inventory::Tree& tree, std::size_t width = 0) {
  return drawTreeText(readMachine(tree, "host"), width);
}

TEST(TreeText, TwoCoreMachine) {
  EXPECT_EQ(drawn(Testing::twoCoreMachine()),
            "host: DeskBox 2\n"
            "└─ processor P0: Desk CPU 2; 2 cores; 2 threads; up to 2.3 GHz\n"
            "   └─ L3 16 MiB: shared by 2 cores\n"
            "      ├─ core P0.C0: CPU 0; L2 2 MiB, L1d 48 KiB, L1i 32 KiB\n"
            "      └─ core P0.C1: CPU 1; L2 2 MiB, L1d 48 KiB, L1i 32 KiB\n");
}

TEST(TreeText, HybridLaptop) {
  EXPECT_EQ(drawn(Testing::hybridLaptop()),
            "host: LapBook 14\n"
            "└─ processor P0: Mobile CPU 6; 6 cores; 8 threads; up to 4.7 GHz\n"
            "   └─ L3 12 MiB: shared by 6 cores\n"
            "      ├─ P-core P0.C0: CPUs 0-1; L2 1.25 MiB, L1d 48 KiB, L1i 32 KiB\n"
            "      ├─ P-core P0.C4: CPUs 2-3; L2 1.25 MiB, L1d 48 KiB, L1i 32 KiB\n"
            "      └─ L2 2 MiB: shared by 4 cores\n"
            "         ├─ E-core P0.C8: CPU 4; L1d 32 KiB, L1i 64 KiB\n"
            "         ├─ E-core P0.C9: CPU 5; L1d 32 KiB, L1i 64 KiB\n"
            "         ├─ E-core P0.C10: CPU 6; L1d 32 KiB, L1i 64 KiB\n"
            "         └─ E-core P0.C11: CPU 7; L1d 32 KiB, L1i 64 KiB\n");
}

TEST(TreeText, PartsInOtherNumaNodesThanThoseAroundThemAreLabelled) {
  EXPECT_EQ(drawn(Testing::numaServer()),
            "host: RackBox 1U\n"
            "├─ processor P0: Server CPU 4; 4 cores; 4 threads; up to 3 GHz; NUMA nodes 0, 1\n"
            "│  ├─ L3 8 MiB: shared by 2 cores; NUMA node 0\n"
            "│  │  ├─ core P0.C0: CPU 0\n"
            "│  │  └─ core P0.C2: CPU 2\n"
            "│  └─ L3 8 MiB: shared by 2 cores; NUMA node 1\n"
            "│     ├─ core P0.C1: CPU 1\n"
            "│     └─ core P0.C3: CPU 3\n"
            "└─ processor P1: Server CPU 4; 4 cores; 4 threads; up to 3 GHz; NUMA node 2\n"
            "   ├─ L3 8 MiB: shared by 2 cores\n"
            "   │  ├─ core P1.C0: CPU 4\n"
            "   │  └─ core P1.C2: CPU 6\n"
            "   └─ L3 8 MiB: shared by 2 cores\n"
            "      ├─ core P1.C1: CPU 5\n"
            "      └─ core P1.C3: CPU 7\n");
}

TEST(TreeText, RunsOfCoresAreOfOneKindAndOneNumaNode) {
  TreeBuilder builder;
  builder.processor("P0").cpus({0});
  Tarn::Inventory::CpuSet first;
  Tarn::Inventory::CpuSet second;
  for (unsigned int i = 0; i < 18; ++i) {
    const std::string number = std::to_string(i);
    builder.core("P0.C" + number).description((i < 10 ? "Performance core " : "Efficient core ") + number).cpus({i});
    (i % 2 == 0 ? first : second).add(i);
  }
  builder.numaNode({0, first}).numaNode({1, second});

  EXPECT_EQ(drawn(builder.build()),
            "host\n"
            "└─ processor P0: 18 cores; NUMA node 0\n"
            "   ├─ 5 P-cores P0.C0 to P0.C8: CPUs 0,2,4,6,8; each 1 thread\n"
            "   ├─ 4 E-cores P0.C10 to P0.C16: CPUs 10,12,14,16; each 1 thread\n"
            "   ├─ 5 P-cores P0.C1 to P0.C9: CPUs 1,3,5,7,9; NUMA node 1; each 1 thread\n"
            "   └─ 4 E-cores P0.C11 to P0.C17: CPUs 11,13,15,17; NUMA node 1; each 1 thread\n");
}

TEST(TreeText, DualSocketServerFitsAScreen) {
  EXPECT_EQ(drawn(Testing::dualSocketServer()),
            "host: RackBox 2U\n"
            "├─ processor P0: Server CPU 64; 64 cores; 128 threads; up to 3.53 GHz\n"
            "│  └─ 8 × L3 32 MiB: each shared by 8 cores; the first:\n"
            "│     └─ 8 cores P0.C0 to P0.C7: CPUs 0-7,128-135; each 2 threads, L2 512 KiB, L1d 32 KiB, L1i 32 KiB\n"
            "└─ processor P1: Server CPU 64; 64 cores; 128 threads; up to 3.53 GHz\n"
            "   └─ 8 × L3 32 MiB: each shared by 8 cores; the first:\n"
            "      └─ 8 cores P1.C0 to P1.C7: CPUs 64-71,192-199; each 2 threads, L2 512 KiB, L1d 32 KiB, "
            "L1i 32 KiB\n");
}

TEST(TreeText, StatesAndUnknownSharingAreSaid) {
  EXPECT_EQ(drawn(Testing::smallBoard()),
            "host: BoardBox\n"
            "├─ processor P0: Board CPU 4; 4 cores, 3 enabled; 4 threads; up to 1.5 GHz\n"
            "│  ├─ L2 1 MiB: shared by 4 cores\n"
            "│  │  ├─ core P0.C0: CPU 0; L1d 32 KiB, L1i 48 KiB\n"
            "│  │  ├─ core P0.C1: CPU 1; L1d 32 KiB, L1i 48 KiB\n"
            "│  │  ├─ core P0.C2: CPU 2; L1d 32 KiB, L1i 48 KiB\n"
            "│  │  └─ core P0.C3: CPU 3; L1d 32 KiB, L1i 48 KiB; offline\n"
            "│  └─ System cache (disabled): sharing not known\n"
            "└─ processor P1: empty socket\n");
}

TEST(TreeText, LinesAreCutAtTheTerminalsWidth) {
  EXPECT_EQ(drawn(Testing::twoCoreMachine(), 30),
            "host: DeskBox 2\n"
            "└─ processor P0: Desk CPU 2; …\n"
            "   └─ L3 16 MiB: shared by 2 …\n"
            "      ├─ core P0.C0: CPU 0; L…\n"
            "      └─ core P0.C1: CPU 1; L…\n");
}

TEST(TreeText, TextsCanNotBreakTheDrawing) {
  EXPECT_EQ(drawn(Testing::strangeTexts()),
            "host: A<b>&\"c\"\\n\\x1B[31m\n"
            "└─ processor P0: say \"hi\" \\ <there>\\x07 é\\n; 1 core; 1 thread; up to 1 GHz\n"
            "   └─ core P0.C0: CPU 0\n");
}

TEST(TreeDot, EachItemIsANodeBelowItsOwner) {
  EXPECT_EQ(
      drawTreeDot(readMachine(Testing::strangeTexts(), "host")),
      "digraph corvcim {\n"
      "  graph [rankdir=LR, ranksep=0.4, nodesep=0.12, bgcolor=white, fontname=\"Helvetica\"];\n"
      "  node [shape=box, style=\"filled,rounded\", fontname=\"Helvetica\", fontsize=11, color=\"#5b6770\", "
      "margin=\"0.12,0.06\"];\n"
      "  edge [arrowhead=none, tailport=e, headport=w, color=\"#5b6770\"];\n"
      "  n0 [label=\"host\\nA<b>&\\\"c\\\"\\\\n\\\\x1B[31m\", fillcolor=\"#ffffff\"];\n"
      "  n1 [label=\"processor P0\\nsay \\\"hi\\\" \\\\ <there>\\\\x07 é\\\\n\\n1 core\\n1 thread\\nup to 1 GHz\", "
      "fillcolor=\"#e9edf2\"];\n"
      "  n2 [label=\"core P0.C0\\nCPU 0\", fillcolor=\"#dff0e0\"];\n"
      "  n1 -> n2;\n"
      "  n0 -> n1;\n"
      "}\n");
}

TEST(TreeJson, NestsPartsAsTheDrawingsDo) {
  TreeBuilder builder;
  builder.system().text(Tarn::NodeLexicon::PropSystemModel, "X");
  builder.processor("P0").cpus({0, 1});
  builder.core("P0.C0").description("Efficient core 0").cpus({0}).core("P0.C1").cpus({1}).status(12);
  builder.cache("P0.L3").number(Tarn::NodeLexicon::PropCacheLevel, 5).cpus({0, 1});
  builder.number(Tarn::NodeLexicon::PropCacheBlockSize, 64).number(Tarn::NodeLexicon::PropCacheNumberOfBlocks, 16);
  builder.numaNode({0, {0}}).numaNode({1, {1}});

  EXPECT_EQ(drawTreeJson(readMachine(builder.build(), "host")), R"({
  "system": "host",
  "model": "X",
  "processors": [
    {
      "path": "P0",
      "name": null,
      "status": 1,
      "cores": 2,
      "enabledCores": 1,
      "threads": null,
      "maxClock": null,
      "numaNodes": [
        0,
        1
      ],
      "parts": [
        {
          "cpus": "0-1",
          "numaNodes": [
            0,
            1
          ],
          "caches": [
            {
              "name": "L3",
              "size": 1024,
              "status": 1
            }
          ],
          "cores": 2,
          "parts": [
            {
              "core": "P0.C0",
              "kind": "E-core",
              "status": 1,
              "cpus": "0",
              "numaNodes": [
                0
              ],
              "caches": []
            },
            {
              "core": "P0.C1",
              "kind": null,
              "status": 12,
              "cpus": "1",
              "numaNodes": [
                1
              ],
              "caches": []
            }
          ]
        }
      ],
      "otherCaches": []
    }
  ]
}
)");
}

}  // namespace
}  // namespace Corvcim
