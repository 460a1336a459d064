#include "host/corvcim/drawing/TreeSvg.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <vector>

#include "host/corvcim/drawing/BoxGrid.h"
#include "host/corvcim/drawing/SvgLayout.h"
#include "tests/host/corvcim/Machines.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Tree;

Box layoutOf(const Tree& tree) {
  return layOut(readMachine(tree, "host"));
}

bool overlap(const Box& left, const Box& right) {
  return left.x < right.x + right.width && right.x < left.x + left.width && left.y < right.y + right.height &&
         right.y < left.y + left.height;
}

/// What is wrong with a box and everything in it: outside of its owner, over a neighbour, text outside.
void collectFaults(const Box& box, const std::string& name, std::vector<std::string>& faults) {
  for (const TextLine& line : box.lines) {
    const int width = textWidth(line.style, line.text);
    const int left = line.isCentred ? line.x - width / 2 : line.x;
    if (left < 0 || left + width > box.width || line.y > box.height) {
      faults.push_back(name + ": text leaves the box: " + line.text);
    }
  }
  for (std::size_t i = 0; i < box.inner.size(); ++i) {
    const Box& inner = box.inner[i];
    const std::string innerName = name + '/' + std::to_string(i);
    if (inner.x < 0 || inner.y < 0 || inner.x + inner.width > box.width || inner.y + inner.height > box.height) {
      faults.push_back(innerName + " leaves its owner");
    }
    for (std::size_t k = i + 1; k < box.inner.size(); ++k) {
      if (overlap(inner, box.inner[k])) {
        faults.push_back(innerName + " lies over its neighbour " + std::to_string(k));
      }
    }
    collectFaults(inner, innerName, faults);
  }
}

std::vector<std::string> faultsOf(const Tree& tree) {
  std::vector<std::string> faults;
  collectFaults(layoutOf(tree), "page", faults);
  return faults;
}

const std::vector<std::string> none;

TEST(SvgLayout, NothingOverlapsAndNothingLeavesItsBox) {
  EXPECT_EQ(faultsOf(Testing::twoCoreMachine()), none);
  EXPECT_EQ(faultsOf(Testing::dualSocketServer()), none);
  EXPECT_EQ(faultsOf(Testing::hybridLaptop()), none);
  EXPECT_EQ(faultsOf(Testing::smallBoard()), none);
  EXPECT_EQ(faultsOf(Testing::strangeTexts()), none);
  EXPECT_EQ(faultsOf(Testing::numaServer()), none);
}

TEST(SvgLayout, BigMachinesStayWithinAPage) {
  const Box page = layoutOf(Testing::dualSocketServer());

  EXPECT_LE(page.width, 1400);
  EXPECT_LE(page.height, 1000);
}

std::size_t countCores(const Box& box) {
  std::size_t count = box.style == Box::Style::Core ? 1 : 0;
  for (const Box& inner : box.inner) {
    count += countCores(inner);
  }
  return count;
}

TEST(SvgLayout, EveryCoreHasItsCell) {
  EXPECT_EQ(countCores(layoutOf(Testing::hybridLaptop())), 6U);
  EXPECT_EQ(countCores(layoutOf(Testing::dualSocketServer())), 128U);
}

TEST(BoxGrid, ColumnsAvoidGaps) {
  EXPECT_EQ(columnsFor(0, 10), 1U);
  EXPECT_EQ(columnsFor(1, 10), 1U);
  EXPECT_EQ(columnsFor(4, 10), 4U);
  EXPECT_EQ(columnsFor(8, 10), 4U);
  EXPECT_EQ(columnsFor(6, 10), 3U);
  EXPECT_EQ(columnsFor(14, 20), 7U);
  EXPECT_EQ(columnsFor(64, 5), 4U);
  EXPECT_EQ(columnsFor(64, 1), 1U);
}

TEST(BoxGrid, TextsThatAreTooLongAreCut) {
  const std::string text = "a rather long label";
  const std::string fitting = fitText(TextStyle::Label, text, 60);

  EXPECT_LE(textWidth(TextStyle::Label, fitting), 60);
  EXPECT_TRUE(fitting.ends_with("…"));
  EXPECT_EQ(fitText(TextStyle::Label, text, 1000), text);
}

TEST(TreeSvg, IsAWholePictureWithTitleAndDescription) {
  const std::string svg = drawTreeSvg(readMachine(Testing::twoCoreMachine(), "host"));

  EXPECT_TRUE(svg.starts_with("<svg xmlns=\"http://www.w3.org/2000/svg\" role=\"img\" width=\""));
  EXPECT_TRUE(svg.ends_with("</svg>\n"));
  EXPECT_NE(svg.find("<title>Processors of host</title>"), std::string::npos);
  EXPECT_NE(svg.find("core P0.C1: CPU 1; L2 2 MiB, L1d 48 KiB, L1i 32 KiB\n"), std::string::npos);
  EXPECT_EQ(svg.find("href"), std::string::npos);
}

TEST(TreeSvg, ChangesNothingOfAPageAroundIt) {
  const std::string svg = drawTreeSvg(readMachine(Testing::dualSocketServer(), "host"));

  EXPECT_EQ(svg.find("<style"), std::string::npos);
  EXPECT_EQ(svg.find(" class="), std::string::npos);
  EXPECT_EQ(svg.find(" id="), std::string::npos);
}

TEST(TreeSvg, LabelsKindsOfCoreAndNumaNodes) {
  const std::string laptop = drawTreeSvg(readMachine(Testing::hybridLaptop(), "host"));
  const std::string server = drawTreeSvg(readMachine(Testing::numaServer(), "host"));

  EXPECT_NE(laptop.find(">P-core P0.C0</text>"), std::string::npos);
  EXPECT_NE(laptop.find(">E-core P0.C8</text>"), std::string::npos);
  EXPECT_NE(server.find(">shared by 2 cores · NUMA node 1</text>"), std::string::npos);
  EXPECT_NE(server.find("NUMA node 2</text>"), std::string::npos);
}

/// The tags of an XML text that are opened and not closed, in order; "?" for a stray closing tag.
std::vector<std::string> unclosedTags(const std::string& xml) {
  std::vector<std::string> open;
  for (std::size_t at = xml.find('<'); at != std::string::npos; at = xml.find('<', at + 1)) {
    const std::size_t end = xml.find('>', at);
    const bool isClosing = xml[at + 1] == '/';
    const std::size_t nameAt = at + (isClosing ? 2 : 1);
    const std::string name = xml.substr(nameAt, xml.find_first_of(" />", nameAt) - nameAt);
    if (isClosing) {
      if (open.empty() || open.back() != name) {
        return {"?" + name};
      }
      open.pop_back();
    } else if (xml[end - 1] != '/') {
      open.push_back(name);
    }
  }
  return open;
}

TEST(TreeSvg, IsWellFormedWhateverTheTextsHold) {
  const std::string svg = drawTreeSvg(readMachine(Testing::strangeTexts(), "<host>"));

  EXPECT_EQ(unclosedTags(svg), none);
  EXPECT_EQ(unclosedTags(drawTreeSvg(readMachine(Testing::dualSocketServer(), "host"))), none);
  EXPECT_NE(svg.find("A&lt;b&gt;&amp;&quot;c&quot;\\n\\x1B[31m"), std::string::npos);
  EXPECT_EQ(std::ranges::count_if(svg, [](char c) { return c != '\n' && static_cast<unsigned char>(c) < 0x20; }), 0);
}

}  // namespace
}  // namespace Corvcim
