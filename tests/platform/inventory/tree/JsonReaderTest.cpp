#include <gtest/gtest.h>

#include "platform/inventory/tree/Error.h"
#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/platform/inventory/Scratch.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

std::string document(const std::string& nodes) {
  return R"({"format": "corvane-inventory", "version": 1, "nodes": [)" + nodes + "]}";
}

std::string processor(const std::string& members) {
  return document(R"({"type": "processor", "path": "P0", "status": 1, )" + members + "}");
}

TEST(JsonReader, ReadsAWholeTree) {
  const Tree tree = readJson(document(R"({
      "type": "system", "path": "box", "status": 1, "description": "A box",
      "properties": {"SystemModel": "PowerBox"},
      "children": [{
        "type": "processor", "path": "A", "status": 15, "cpus": "0-1,4",
        "properties": {"Family": 179, "Stepping": "B0", "RequestedStatesSupported": [1, 2]},
        "children": [{"type": "cache", "path": "A.1", "status": 16}, {"type": "core", "path": "A.2", "status": 0}]
      }]})"),
                             "box.json");

  EXPECT_EQ(tree, TreeBuilder()
                      .system("box")
                      .description("A box")
                      .text(PropSystemModel, "PowerBox")
                      .processor("A")
                      .status(15)
                      .cpus({0, 1, 4})
                      .number(PropFamily, 179)
                      .text(PropStepping, "B0")
                      .list(PropRequestedStatesSupported, {1, 2})
                      .cache("A.1")
                      .status(16)
                      .core("A.2")
                      .status(0)
                      .build());
}

TEST(JsonReader, KeepsTextsAsTheFileStatesThem) {
  const Tree tree = readJson(
      processor(R"("description": " a\u001b\tb ", "properties": {"ProcessorName": "\u0001\n", "Stepping": ""})"), "x");

  EXPECT_EQ(tree.node(0).description, " a\x1B\tb ");
  EXPECT_EQ(*tree.text(tree.node(0), PropProcessorName), "\001\n");
  EXPECT_EQ(*tree.text(tree.node(0), PropStepping), "");
}

TEST(JsonReader, ReadsWhatCouldNotBeRead) {
  const Tree tree = readJson(R"({"format": "corvane-inventory", "version": 1, "nodes": [],
                                 "unread": [{"file": "f", "reason": "r", "remedy": "m"}]})",
                             "x");

  ASSERT_EQ(tree.unread().size(), 1U);
  EXPECT_EQ(tree.unread()[0], (Unread{"f", "r", "m"}));
}

TEST(JsonReader, ReadsNumaNodesAsTheyAreWritten) {
  const Tree tree = TreeBuilder().processor("P0").numaNode({0, {0, 1, 4}}).numaNode({3, {2}}).build();
  const std::string text = writeJson(tree);

  EXPECT_NE(text.find(R"("numaNodes": [
    {"number": 0, "cpus": "0-1,4"},
    {"number": 3, "cpus": "2"}
  ])"),
            std::string::npos)
      << text;
  EXPECT_EQ(readJson(text, "x"), tree);
  EXPECT_NE(readJson(text, "x"), TreeBuilder().processor("P0").build());
}

TEST(JsonReader, TheOriginOfAValueIsItsPlaceInTheFile) {
  const std::string text = document(R"({"type": "processor", "path": "P0", "status": 12, "description": "CPU",
      "properties": {"Family": 179, "ProcessorName": "A \"B\"", "RequestedStatesSupported": [1, 2]}},
      {"type": "processor", "path": "P1", "status": 1})");

  const Tree tree = readJson(text, "box.json", Detail::WithOrigins);

  const char* const rule = "as the file states it";
  EXPECT_EQ(*tree.statusOrigin(0), (Origin{"box.json, /nodes/0/status", "12", rule}));
  EXPECT_EQ(*tree.descriptionOrigin(0), (Origin{"box.json, /nodes/0/description", "\"CPU\"", rule}));
  EXPECT_EQ(*tree.origin(0, PropFamily), (Origin{"box.json, /nodes/0/properties/Family", "179", rule}));
  EXPECT_EQ(*tree.origin(0, PropProcessorName),
            (Origin{"box.json, /nodes/0/properties/ProcessorName", R"("A \"B\"")", rule}));
  EXPECT_EQ(*tree.origin(0, PropRequestedStatesSupported),
            (Origin{"box.json, /nodes/0/properties/RequestedStatesSupported", "[1,2]", rule}));
  EXPECT_EQ(tree.statusOrigin(1)->source, "box.json, /nodes/1/status");
  EXPECT_EQ(tree.descriptionOrigin(1), nullptr);
  EXPECT_EQ(tree, readJson(text, "box.json"));
}

TEST(JsonReader, ReadsTheExampleOfTheDocumentation) {
  const std::string page = contentsOf(CORVANE_SOURCE_DIR "/docs/inventory.md");
  const std::string fence = "```json\n";
  const std::size_t begin = page.find(fence) + fence.size();

  const Tree tree = readJson(page.substr(begin, page.find("```", begin) - begin), "docs/inventory.md");

  EXPECT_EQ(tree.nodes().size(), 4U);
  EXPECT_EQ(tree.unread().size(), 1U);
}

struct Broken {
  std::string text;
  std::string where;
  std::string why;
};

class BrokenJson : public testing::TestWithParam<Broken> {};

TEST_P(BrokenJson, IsRefusedWithThePlaceAndTheReason) {
  const Broken& broken = GetParam();
  try {
    readJson(broken.text, "box.json");
    FAIL() << "was accepted";
  } catch (const InventoryError& error) {
    EXPECT_EQ(error.what(), "cannot read the inventory: box.json" + broken.where + ": " + broken.why +
                                "; correct the file; the format is described in docs/inventory.md");
  }
}

INSTANTIATE_TEST_SUITE_P(
    Document, BrokenJson,
    testing::Values(
        Broken{"", "",
               "it is not JSON: parse error at line 1, column 1: syntax error while parsing value - unexpected end "
               "of input; expected '[', '{', or a literal"},
        Broken{"{\n  \"format\": oops}", "",
               "it is not JSON: parse error at line 2, column 13: syntax error while parsing value - invalid literal; "
               "last read: '\"format\": o'"},
        Broken{R"({"format": "corvane-inventory", "format": "x"})", "",
               "the member \"format\" is there twice in one object"},
        Broken{"[]", ", the whole document", "is not an object"}, Broken{"{}", ", /format", "is missing"},
        Broken{R"({"format": 1})", ", /format", "is not a text"},
        Broken{R"({"format": "x"})", ", /format", "is not \"corvane-inventory\""},
        Broken{R"({"format": "corvane-inventory"})", ", /version", "is missing"},
        Broken{R"({"format": "corvane-inventory", "version": 2, "nodes": []})", ", /version",
               "is a version of the format that this program does not know; it knows 1"},
        Broken{R"({"format": "corvane-inventory", "version": 1})", ", /nodes", "is missing"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": {}})", ", /nodes", "is not a list"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": [], "note": 1})", ", /note",
               "is not a member that is known here"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": [], "unread": [{"file": "f"}]})",
               ", /unread/0/reason", "is missing"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": [], "disagreements": 1})", ", /disagreements",
               "is not a list"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": [], "disagreements": [{"path": "P0"}]})",
               ", /disagreements/0/property", "is missing"},
        Broken{R"({"format": "corvane-inventory", "version": 1, "nodes": [], "disagreements": [{"who": "P0"}]})",
               ", /disagreements/0/who", "is not a member that is known here"},
        Broken{
            R"({"format": "corvane-inventory", "version": 1, "nodes": [], "numaNodes": [{"number": 0, "cpus": ""}]})",
            ", /numaNodes/0", "NUMA node 0 has no CPUs"},
        Broken{
            R"({"format": "corvane-inventory", "version": 1, "nodes": [], "numaNodes": [{"number": 0, "cpus": "x"}]})",
            ", /numaNodes/0/cpus", "is no list of CPU numbers such as \"0-3,8\""}));

INSTANTIATE_TEST_SUITE_P(
    Nodes, BrokenJson,
    testing::Values(
        Broken{document("7"), ", /nodes/0", "is not an object"},
        Broken{document(R"({"path": "P0"})"), ", /nodes/0/type", "is missing"},
        Broken{document(R"({"type": "chip", "path": "P0", "status": 1})"), ", /nodes/0/type",
               "is \"chip\", not system, processor, core or cache"},
        Broken{document(R"({"type": "processor", "status": 1})"), ", /nodes/0/path", "is missing"},
        Broken{document(R"({"type": "processor", "path": "P0"})"), ", /nodes/0/status", "is missing"},
        Broken{document(R"({"type": "processor", "path": "P0", "status": -1})"), ", /nodes/0/status",
               "is not a whole number from 0 to 4294967295"},
        Broken{document(R"({"type": "processor", "path": "P0", "status": 1.5})"), ", /nodes/0/status",
               "is not a whole number from 0 to 4294967295"},
        Broken{document(R"({"type": "processor", "path": "P0", "status": 4294967296})"), ", /nodes/0/status",
               "is not a whole number from 0 to 4294967295"},
        Broken{document(R"({"type": "processor", "path": "P 0", "status": 1})"), ", /nodes/0/path",
               "processor \"P 0\": a path consists of visible ASCII characters without blanks, at least one"},
        Broken{
            document(
                R"({"type": "processor", "path": "P", "status": 1}, {"type": "processor", "path": "P", "status": 1})"),
            ", /nodes/1/path", "is the path of /nodes/0, too"},
        Broken{document(R"({"type": "core", "path": "C", "status": 1})"), ", /nodes/0/type",
               "is \"core\", which cannot stand at the top"},
        Broken{processor(R"("children": [{"type": "system", "path": "S", "status": 1}])"), ", /nodes/0/children/0/type",
               "is \"system\", which cannot stand below a processor"},
        Broken{processor(R"("children": [{"type": "core", "path": "C", "status": 1,
                              "children": [{"type": "cache", "path": "L", "status": 1}]}])"),
               ", /nodes/0/children/0/children/0/type", "is \"cache\", which cannot stand below a core"},
        Broken{document(
                   R"({"type": "processor", "path": "P", "status": 1}, {"type": "system", "path": "S", "status": 1})"),
               ", /nodes/1/path", "system \"S\": the system is the first node, and the only one of its type"},
        Broken{processor(R"("description": 5)"), ", /nodes/0/description", "is not a text"},
        Broken{processor(R"("cpus": "0-")"), ", /nodes/0/cpus", "is no list of CPU numbers such as \"0-3,8\""},
        Broken{processor(R"("children": {})"), ", /nodes/0/children", "is not a list"},
        Broken{processor(R"("colour": "red")"), ", /nodes/0/colour", "is not a member that is known here"}));

INSTANTIATE_TEST_SUITE_P(
    Properties, BrokenJson,
    testing::Values(
        Broken{processor(R"("properties": [])"), ", /nodes/0/properties", "is not an object"},
        Broken{processor(R"("properties": {"Speed": 1})"), ", /nodes/0/properties/Speed",
               "is not the name of a property"},
        Broken{processor(R"("properties": {"Family": "x"})"), ", /nodes/0/properties/Family",
               "is not a whole number from 0 to 4294967295"},
        Broken{processor(R"("properties": {"Stepping": 3})"), ", /nodes/0/properties/Stepping", "is not a text"},
        Broken{processor(R"("properties": {"RequestedStatesSupported": 1})"),
               ", /nodes/0/properties/RequestedStatesSupported", "is not a list"},
        Broken{processor(R"("properties": {"RequestedStatesSupported": [1, "x"]})"),
               ", /nodes/0/properties/RequestedStatesSupported/1", "is not a whole number from 0 to 4294967295"},
        Broken{processor(R"("properties": {"CacheLevel": 3})"), ", /nodes/0/properties/CacheLevel",
               "processor \"P0\": property CacheLevel belongs to a cache node"}));

TEST(JsonReader, RefusesInvalidUtf8) {
  EXPECT_THROW(readJson(processor("\"description\": \"\xFF\""), "x"), InventoryError);
}

TEST(JsonReader, SurvivesDeepNesting) {
  EXPECT_THROW(readJson(document(std::string(200000, '[')), "x"), InventoryError);
  EXPECT_THROW(readJson(document(std::string(200000, '[') + std::string(200000, ']')), "x"), InventoryError);
}

}  // namespace
}  // namespace Tarn::Inventory
