#include <gtest/gtest.h>

#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;

Tree everything() {
  return TreeBuilder()
      .system()
      .description("Model \"X\"")
      .text(PropSystemModel, "Model \"X\"")
      .processor("P0")
      .status(12)
      .description("Processor 0")
      .cpus({0, 1, 2, 3, 8})
      .number(PropMaxClockSpeed, 4294967295U)
      .text(PropStepping, "7")
      .list(PropRequestedStatesSupported, {1, 3})
      .core("P0.C0")
      .cache("P0.L1d.0")
      .number(PropCacheLevel, 3)
      .processor("P1")
      .list(PropRequestedStatesSupported, {})
      .unread({"/sys/x", "permission denied", "run as root"})
      .unread({"/sys/y", "no such file or directory", "none"})
      .build();
}

TEST(JsonWriter, WritesEveryNodeOnALine) {
  EXPECT_EQ(writeJson(everything()), R"json({
  "format": "corvane-inventory",
  "version": 1,
  "unread": [
    {"file": "/sys/x", "reason": "permission denied", "remedy": "run as root"},
    {"file": "/sys/y", "reason": "no such file or directory", "remedy": "none"}
  ],
  "nodes": [
    {"type": "system", "path": "system", "status": 1, "description": "Model \"X\"", "properties": {"SystemModel": "Model \"X\""},
     "children": [
      {"type": "processor", "path": "P0", "status": 12, "description": "Processor 0", "cpus": "0-3,8", "properties": {"MaxClockSpeed": 4294967295, "Stepping": "7", "RequestedStatesSupported": [1, 3]},
       "children": [
        {"type": "core", "path": "P0.C0", "status": 1, "description": "", "properties": {}},
        {"type": "cache", "path": "P0.L1d.0", "status": 1, "description": "", "properties": {"CacheLevel": 3}}
      ]},
      {"type": "processor", "path": "P1", "status": 1, "description": "", "properties": {"RequestedStatesSupported": []}}
    ]}
  ]
}
)json");
}

TEST(JsonWriter, WritesAnEmptyTree) {
  EXPECT_EQ(writeJson(Tree()),
            "{\n  \"format\": \"corvane-inventory\",\n  \"version\": 1,\n  \"unread\": [],\n  \"nodes\": []\n}\n");
}

TEST(JsonWriter, IsReadBackAsTheSameTree) {
  EXPECT_EQ(readJson(writeJson(everything()), "x"), everything());
  EXPECT_EQ(readJson(writeJson(Tree()), "x"), Tree());
  const Tree withoutSystem = TreeBuilder().processor("A").core("B").processor("C").build();
  EXPECT_EQ(readJson(writeJson(withoutSystem), "x"), withoutSystem);
}

TEST(JsonWriter, WritesDisagreementsWhereThereAreSome) {
  const Tree tree = TreeBuilder()
                        .disagreement({"P0", "Family", "198", "/proc/cpuinfo", "205", "SMBIOS type 4"})
                        .disagreement({"P1", "status", "1", "a", "16", "b"})
                        .build();

  EXPECT_EQ(writeJson(tree), R"json({
  "format": "corvane-inventory",
  "version": 1,
  "unread": [],
  "disagreements": [
    {"path": "P0", "property": "Family", "chosen": "198", "chosenSource": "/proc/cpuinfo", "other": "205", "otherSource": "SMBIOS type 4"},
    {"path": "P1", "property": "status", "chosen": "1", "chosenSource": "a", "other": "16", "otherSource": "b"}
  ],
  "nodes": []
}
)json");
  EXPECT_EQ(readJson(writeJson(tree), "x"), tree);
}

TEST(JsonWriter, StrangeBytesNeverBreakIt) {
  std::string strange;
  for (int byte = 0; byte < 256; ++byte) {
    strange += static_cast<char>(byte);
  }
  const Tree tree = TreeBuilder()
                        .system()
                        .description(strange)
                        .text(PropSystemModel, strange + "\xC3\xA4")
                        .unread({strange, strange, strange})
                        .build();

  EXPECT_EQ(readJson(writeJson(tree), "x"), tree);
}

}  // namespace
}  // namespace Tarn::Inventory
