#include "host/cli/drawing/TreeText.h"

#include <gtest/gtest.h>

#include "host/cli/drawing/TreeDot.h"
#include "tests/host/cli/Machines.h"

namespace Corvcim {
namespace {

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
            "      ├─ core P0.C0: CPUs 0-1; L2 1.25 MiB, L1d 48 KiB, L1i 32 KiB\n"
            "      ├─ core P0.C4: CPUs 2-3; L2 1.25 MiB, L1d 48 KiB, L1i 32 KiB\n"
            "      └─ L2 2 MiB: shared by 4 cores\n"
            "         ├─ core P0.C8: CPU 4; L1d 32 KiB, L1i 64 KiB\n"
            "         ├─ core P0.C9: CPU 5; L1d 32 KiB, L1i 64 KiB\n"
            "         ├─ core P0.C10: CPU 6; L1d 32 KiB, L1i 64 KiB\n"
            "         └─ core P0.C11: CPU 7; L1d 32 KiB, L1i 64 KiB\n");
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
            "├─ processor P0: Board CPU 4; 4 cores; 4 threads; up to 1.5 GHz\n"
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

}  // namespace
}  // namespace Corvcim
