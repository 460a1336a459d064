#include "host/corvcim/results/ResultWriter.h"

#include <gtest/gtest.h>

#include <nlohmann/json.hpp>
#include <string>
#include <vector>

#include "host/corvcim/results/JsonWriter.h"
#include "host/corvcim/results/TableWriter.h"

namespace Corvcim {
namespace {

ObjectPath corePath(const std::string& identifier) {
  return {"host-7", "root/cimv2", "HALDA_CPUProcessorCore", {{"InstanceID", Value::string(identifier)}}};
}

/// One property of every kind, with a name that the class does not have, so that nothing is added.
Instance everyKind() {
  return {{"host-7", "root/cimv2", "Sample", {{"Key", Value::string("k\"1")}}},
          {{"Key", Value::string("k\"1")},
           {"EnabledState", Value::uint16(2)},
           {"HealthState", Value::uint16(77)},
           {"MaxClockSpeed", Value::uint32(2300)},
           {"Big", Value::uint64(18446744073709551615U)},
           {"Small", Value::sint64(-5)},
           {"Share", Value::real64(0.25)},
           {"Flag", Value::boolean(true)},
           {"When", Value::dateTime("20240229120000.000000+060")},
           {"Empty", Value::string("")},
           {"Nothing", Value::null(CMPI_uint16)},
           {"OperationalStatus", Value::uint16Array({2, 5})},
           {"None", Value::uint16Array({})},
           {"Texts", Value::stringArray({"a,b", "c\nd"})},
           {"Core", Value::reference(corePath("P0.C1"))},
           {"Cores", Value::array(CMPI_ref, {Value::reference(corePath("a")), Value::reference(corePath("b"))})}}};
}

std::string instances(Format format, const std::vector<Instance>& list, const PropertyList& selection = {}) {
  return writeInstances(format, list, selection);
}

TEST(TextWriter, ValuesAreAlignedAndHaveTheirMeaningOrUnit) {
  EXPECT_EQ(instances(Format::Text, {everyKind()}),
            "root/cimv2:Sample.Key=\"k\\\"1\"\n"
            "  Key                k\"1\n"
            "  EnabledState       2 (Enabled)\n"
            "  HealthState        77\n"
            "  MaxClockSpeed      2300 MHz\n"
            "  Big                18446744073709551615\n"
            "  Small              -5\n"
            "  Share              0.25\n"
            "  Flag               true\n"
            "  When               20240229120000.000000+060\n"
            "  Empty              \"\"\n"
            "  Nothing            -\n"
            "  OperationalStatus  2 (OK), 5 (Predictive Failure)\n"
            "  None               (none)\n"
            "  Texts              a,b, c\\nd\n"
            "  Core               root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"\n"
            "  Cores              root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\", "
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"b\"\n");
}

TEST(TextWriter, AnEmptyLineStandsBetweenInstances) {
  const Instance core = {corePath("a"), {{"InstanceID", Value::string("a")}}};

  EXPECT_EQ(instances(Format::Text, {core, core}),
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"\n"
            "  InstanceID  a\n"
            "\n"
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"\n"
            "  InstanceID  a\n");
}

TEST(TextWriter, NothingGivesNothing) {
  EXPECT_EQ(instances(Format::Text, {}), "");
  EXPECT_EQ(writePaths(Format::Text, {}), "");
}

TEST(TextWriter, TerminalsAreSafeFromTexts) {
  const Instance core = {corePath("\x1B[2J"), {{"Name", Value::string("\x1B]0;title\x07\xFF")}}};

  EXPECT_EQ(instances(Format::Text, {core}).find('\x1B'), std::string::npos);
  EXPECT_NE(instances(Format::Text, {core}).find("  Name  \\x1B]0;title\\x07\uFFFD\n"), std::string::npos);
}

TEST(TextWriter, PathsStandOneOnEachLine) {
  const std::vector<ObjectPath> paths = {corePath("a"), corePath("b")};

  EXPECT_EQ(writePaths(Format::Text, paths),
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"\n"
            "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"b\"\n");
}

TEST(MofWriter, ValuesAreThoseOfMof) {
  EXPECT_EQ(instances(Format::Mof, {everyKind()}),
            "instance of Sample {\n"
            "  Key = \"k\\\"1\";\n"
            "  EnabledState = 2;\n"
            "  HealthState = 77;\n"
            "  MaxClockSpeed = 2300;\n"
            "  Big = 18446744073709551615;\n"
            "  Small = -5;\n"
            "  Share = 0.25;\n"
            "  Flag = TRUE;\n"
            "  When = \"20240229120000.000000+060\";\n"
            "  Empty = \"\";\n"
            "  Nothing = NULL;\n"
            "  OperationalStatus = {2, 5};\n"
            "  None = {};\n"
            "  Texts = {\"a,b\", \"c\\nd\"};\n"
            "  Core = \"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"P0.C1\\\"\";\n"
            "  Cores = {\"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"a\\\"\", "
            "\"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"b\\\"\"};\n"
            "};\n");
}

TEST(MofWriter, BytesThatAreNoCharactersAreReplaced) {
  EXPECT_EQ(instances(Format::Mof, {{corePath("a"), {{"Name", Value::string("a\xFF\tb")}}}}),
            "instance of HALDA_CPUProcessorCore {\n"
            "  Name = \"a\uFFFD\\tb\";\n"
            "};\n");
}

TEST(MofWriter, PathsAreInstancesWithKeysAlone) {
  const std::vector<ObjectPath> paths = {corePath("a"), corePath("b")};

  EXPECT_EQ(writePaths(Format::Mof, paths),
            "instance of HALDA_CPUProcessorCore {\n"
            "  InstanceID = \"a\";\n"
            "};\n"
            "\n"
            "instance of HALDA_CPUProcessorCore {\n"
            "  InstanceID = \"b\";\n"
            "};\n");
}

TEST(JsonWriter, ValuesAreRaw) {
  EXPECT_EQ(instances(Format::Json, {everyKind()}), R"json([
  {
    "class": "Sample",
    "namespace": "root/cimv2",
    "path": "root/cimv2:Sample.Key=\"k\\\"1\"",
    "properties": {
      "Key": "k\"1",
      "EnabledState": 2,
      "HealthState": 77,
      "MaxClockSpeed": 2300,
      "Big": 18446744073709551615,
      "Small": -5,
      "Share": 0.25,
      "Flag": true,
      "When": "20240229120000.000000+060",
      "Empty": "",
      "Nothing": null,
      "OperationalStatus": [
        2,
        5
      ],
      "None": [],
      "Texts": [
        "a,b",
        "c\nd"
      ],
      "Core": "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"P0.C1\"",
      "Cores": [
        "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"",
        "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"b\""
      ]
    }
  }
]
)json");
}

TEST(JsonWriter, WhatTheClassHasAndTheInstanceLacksIsNull) {
  const Instance core = {corePath("a"), {{"InstanceID", Value::string("a")}, {"HealthState", Value::uint16(5)}}};

  EXPECT_EQ(writeInstance(Format::Json, core, PropertyList()), R"json({
  "class": "HALDA_CPUProcessorCore",
  "namespace": "root/cimv2",
  "path": "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"",
  "properties": {
    "InstanceID": "a",
    "HealthState": 5,
    "Caption": null,
    "Description": null,
    "ElementName": null,
    "CoreEnabledState": null,
    "EnabledState": null,
    "RequestedState": null,
    "OperationalStatus": null
  }
}
)json");
}

TEST(JsonWriter, OnlyWhatWasAskedForCanBeNull) {
  const Instance core = {corePath("a"), {{"InstanceID", Value::string("a")}}};

  EXPECT_EQ(writeInstance(Format::Json, core, std::vector<std::string>{"caption"}), R"json({
  "class": "HALDA_CPUProcessorCore",
  "namespace": "root/cimv2",
  "path": "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"",
  "properties": {
    "InstanceID": "a",
    "Caption": null
  }
}
)json");
}

TEST(JsonWriter, PathsHaveTheirKeys) {
  const std::vector<ObjectPath> paths = {corePath("a")};

  EXPECT_EQ(writePaths(Format::Json, paths), R"json([
  {
    "class": "HALDA_CPUProcessorCore",
    "namespace": "root/cimv2",
    "path": "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"a\"",
    "keys": {
      "InstanceID": "a"
    }
  }
]
)json");
}

TEST(JsonWriter, NothingIsAnEmptyList) {
  EXPECT_EQ(instances(Format::Json, {}), "[]\n");
  EXPECT_EQ(writePaths(Format::Json, {}), "[]\n");
}

TEST(JsonWriter, EveryByteGivesValidJson) {
  std::string bytes;
  for (int byte = 0; byte < 256; ++byte) {
    bytes += static_cast<char>(byte);
  }
  const Instance instance = {corePath(bytes), {{bytes, Value::string(bytes)}}};

  const nlohmann::json parsed = nlohmann::json::parse(instances(Format::Json, {instance}));

  const std::string text = parsed[0]["properties"].begin().value();
  EXPECT_EQ(text.substr(0, 128), bytes.substr(0, 128));
  EXPECT_EQ(text.find("\uFFFD"), 128U);
}

TEST(JsonWriter, NumbersThatJsonDoesNotHaveAreNull) {
  EXPECT_EQ(jsonLine(valueAsJson(Value::real64(1.5))), "1.5");
  EXPECT_EQ(jsonLine(valueAsJson(Value::real64(1.0 / 0.0))), "null");
}

TEST(JsonWriter, AnEmptyListIsADocument) {
  EXPECT_EQ(instances(Format::Json, {}), "[]\n");
}

Instance sample(std::string_view className, std::vector<NamedValue> properties) {
  return makeInstance("root/cimv2", className, std::move(properties));
}

TEST(TableWriter, ColumnsAreAlignedUnderTheirNames) {
  const std::vector<Instance> rows = {
      sample("HALDA_CPUProcessorCore", {{"InstanceID", Value::string("P0.C0")}, {"HealthState", Value::uint16(5)}}),
      sample("HALDA_CPUProcessorCore", {{"InstanceID", Value::string("é")}, {"Caption", Value::string("x")}})};

  EXPECT_EQ(rowsAsTable(rows, std::nullopt),
            "InstanceID  HealthState  Caption\n"
            "P0.C0       5 (OK)       -\n"
            "é           -            x\n");
}

TEST(TableWriter, ListedPropertiesAreTheColumnsInTheirOrderAndTheSpellingOfTheClass) {
  const std::vector<Instance> rows = {
      sample("HALDA_CPUProcessorCore", {{"InstanceID", Value::string("P0.C0")}, {"HealthState", Value::uint16(5)}})};

  EXPECT_EQ(rowsAsTable(rows, std::vector<std::string>{"healthSTATE", "instanceid", "Nothing"}),
            "HealthState  InstanceID  Nothing\n"
            "5 (OK)       P0.C0       -\n");
  EXPECT_EQ(rowsAsTable(rows, std::vector<std::string>()), "InstanceID\nP0.C0\n");
}

TEST(TableWriter, RowsOfSeveralClassesBeginWithTheirClass) {
  const std::vector<Instance> rows = {sample("HALDA_CPUProcessorCore", {{"InstanceID", Value::string("a")}}),
                                      sample("HALDA_CPUProcessorCapabilities", {{"InstanceID", Value::string("b")}})};

  EXPECT_EQ(rowsAsCsv(rows, std::nullopt),
            "Class,InstanceID\r\n"
            "HALDA_CPUProcessorCore,a\r\n"
            "HALDA_CPUProcessorCapabilities,b\r\n");
}

TEST(TableWriter, CsvQuotesWhatRfc4180AsksFor) {
  EXPECT_EQ(rowsAsCsv(std::vector{everyKind()}, std::nullopt),
            "Key,EnabledState,HealthState,MaxClockSpeed,Big,Small,Share,Flag,When,Empty,Nothing,OperationalStatus,None,"
            "Texts,Core,Cores\r\n"
            "\"k\"\"1\",2,77,2300,18446744073709551615,-5,0.25,true,20240229120000.000000+060,\"\",,\"[2,5]\",[],"
            "\"[\"\"a,b\"\",\"\"c\\nd\"\"]\",\"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"\"P0.C1\"\"\","
            "\"[\"\"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"\"a\\\"\"\"\","
            "\"\"root/cimv2:HALDA_CPUProcessorCore.InstanceID=\\\"\"b\\\"\"\"\"]\"\r\n");
  EXPECT_EQ(
      rowsAsCsv(std::vector{sample("X", {{"A", Value::string("1\r\n2")}, {"B", Value::string("\xFF")}})}, std::nullopt),
      "A,B\r\n\"1\r\n2\",\uFFFD\r\n");
}

}  // namespace
}  // namespace Corvcim
