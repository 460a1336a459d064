#include "host/broker/ObjectPath.h"

#include <gtest/gtest.h>

#include <limits>
#include <string>

namespace Corvcim {
namespace {

const ObjectPath processor = {"box",
                              "root/cimv2",
                              "HALDA_CPUProcessor",
                              {{"CreationClassName", Value::string("HALDA_CPUProcessor")},
                               {"DeviceID", Value::string("1-1")},
                               {"SystemCreationClassName", Value::string("HALDA_ComputerSystem")},
                               {"SystemName", Value::string("box")}}};

std::string errorOf(std::string_view text) {
  try {
    return "no error, but " + ObjectPath::parse(text).text();
  } catch (const PathSyntaxError& error) {
    return error.what();
  }
}

}  // namespace

TEST(ObjectPath, PrintsHostNamespaceClassAndKeys) {
  EXPECT_EQ(processor.text(),
            "//box/root/cimv2:HALDA_CPUProcessor.CreationClassName=\"HALDA_CPUProcessor\",DeviceID=\"1-1\","
            "SystemCreationClassName=\"HALDA_ComputerSystem\",SystemName=\"box\"");
}

TEST(ObjectPath, LeavesOutWhatIsNotGiven) {
  EXPECT_EQ((ObjectPath{{}, {}, "C", {}}.text()), "C");
  EXPECT_EQ((ObjectPath{{}, "root", "C", {}}.text()), "root:C");
  EXPECT_EQ((ObjectPath{{}, {}, "C", {{"n", Value::uint8(7)}, {"b", Value::boolean(false)}}}.text()), "C.n=7,b=FALSE");
}

TEST(ObjectPath, ReadsBackWhatItPrints) {
  EXPECT_EQ(ObjectPath::parse(processor.text()), processor);
}

TEST(ObjectPath, ReadsBackNestedReferences) {
  const ObjectPath association = {
      {},
      "root/cimv2",
      "HALDA_CPUSystemDevice",
      {{"GroupComponent",
        Value::reference({"a.b:1", "root", "HALDA_ComputerSystem", {{"Name", Value::string("x\"\\y")}}})},
       {"PartComponent", Value::reference(processor)}}};

  EXPECT_EQ(ObjectPath::parse(association.text()), association);
}

TEST(ObjectPath, ReadsBackStrangeTexts) {
  for (const std::string text : {"", "a,b=\"c\".d:e//f", "\\", "\n\t\x01\x1f", "\xff\xfe", "\xc3\xa4", "TRUE", "7"}) {
    const ObjectPath path = {{}, "root", "C", {{"k", Value::string(text)}}};
    EXPECT_EQ(ObjectPath::parse(path.text()), path) << path;
  }
}

TEST(ObjectPath, ReadsTheFormsThatClientsWrite) {
  EXPECT_EQ(ObjectPath::parse("C"), (ObjectPath{{}, {}, "C", {}}));
  EXPECT_EQ(ObjectPath::parse("/root/cimv2:C"), (ObjectPath{{}, "root/cimv2", "C", {}}));
  EXPECT_EQ(ObjectPath::parse("http://host:5988/root/cimv2:C"), (ObjectPath{"host:5988", "root/cimv2", "C", {}}));
  EXPECT_EQ(ObjectPath::parse("https://h/root:C.k=\"v\"").host, "h");
  EXPECT_EQ(ObjectPath::parse("C.k=\"v\"").key("K")->asString(), "v");
}

TEST(ObjectPath, GivesUnknownKeysTheTypeThatTheyLookLike) {
  const ObjectPath path = ObjectPath::parse("C.a=7,b=-7,c=18446744073709551615,d=true,e=\"7\"");

  EXPECT_EQ(path.keys, (std::vector<NamedValue>{{"a", Value::sint64(7)},
                                                {"b", Value::sint64(-7)},
                                                {"c", Value::uint64(std::numeric_limits<std::uint64_t>::max())},
                                                {"d", Value::boolean(true)},
                                                {"e", Value::string("7")}}));
}

TEST(ObjectPath, GivesKnownPropertiesTheTypeOfTheirClass) {
  EXPECT_EQ(*ObjectPath::parse("halda_cpuprocessor.FAMILY=7").key("Family"), Value::uint16(7));
  EXPECT_EQ(*ObjectPath::parse("HALDA_CPUProcessorCapabilities.ElementNameEditSupported=TRUE")
                 .key("ElementNameEditSupported"),
            Value::boolean(true));
}

struct SyntaxCase {
  std::string_view text;
  std::string_view error;
};

TEST(ObjectPath, SaysWhereAndWhyATextIsNone) {
  constexpr SyntaxCase cases[] = {
      {"", "object path \"\", column 1: expected a class name"},
      {"root:", "object path \"root:\", column 6: expected a class name"},
      {":C", "object path \":C\", column 1: the namespace before ':' is empty"},
      {"//box", "object path \"//box\", column 3: expected '/' and a namespace after the host"},
      {"///root:C", "object path \"///root:C\", column 3: the host is empty"},
      {"//box/C", "object path \"//box/C\", column 7: expected a namespace and ':' after the host"},
      {"C k", "object path \"C k\", column 2: expected '.' and the keys, or the end, after the class name"},
      {"C.", "object path \"C.\", column 3: expected a key name"},
      {"C.k", "object path \"C.k\", column 4: expected '=' after the key name k"},
      {"C.k=", "object path \"C.k=\", column 5: expected a value: a text in double quotes, TRUE, FALSE or a number"},
      {"C.k=v", "object path \"C.k=v\", column 5: expected a value: a text in double quotes, TRUE, FALSE or a number"},
      {"C.k=\"v", "object path \"C.k=\\\"v\", column 5: the text has no closing double quote"},
      {"C.k=\"v\\", "object path \"C.k=\\\"v\\\\\", column 5: the text has no closing double quote"},
      {"C.k=\"\\x00ff\"",
       "object path \"C.k=\\\"\\\\x00ff\\\"\", column 7: expected four hexadecimal digits up to 007f after \\x"},
      {"C.k=\"v\"x", "object path \"C.k=\\\"v\\\"x\", column 8: expected ',' or the end after a key's value"},
      {"C.k=\"v\",", "object path \"C.k=\\\"v\\\",\", column 9: expected a key name"},
      {"C.k=1,K=2", "object path \"C.k=1,K=2\", column 7: key K is given twice"},
      {"C.k=18446744073709551616",
       "object path \"C.k=18446744073709551616\", column 5: expected a value: a text in double quotes, TRUE, FALSE or a "
       "number"},
      {"HALDA_CPUProcessor.Family=65536",
       "object path \"HALDA_CPUProcessor.Family=65536\", column 27: expected a value: a text in double quotes, TRUE, "
       "FALSE or a number of type uint16"},
      {"HALDA_CPUProcessor.Family=\"7\"",
       "object path \"HALDA_CPUProcessor.Family=\\\"7\\\"\", column 27: this key's value is of type uint16 and must "
       "stand without quotes"},
      {"HALDA_CPUProcessor.DeviceID=7",
       "object path \"HALDA_CPUProcessor.DeviceID=7\", column 29: this key's value is a text and must stand in double "
       "quotes"},
      {"HALDA_CPUSystemDevice.PartComponent=\"C.\"",
       "object path \"HALDA_CPUSystemDevice.PartComponent=\\\"C.\\\"\", column 37: the reference is no object path: "
       "object path \"C.\", column 3: expected a key name"},
  };
  for (const SyntaxCase& each : cases) {
    EXPECT_EQ(errorOf(each.text), each.error);
  }
}

TEST(ObjectPath, RefusesReferencesNestedWithoutEnd) {
  std::string text = "C";
  for (int i = 0; i < 12; ++i) {
    text = "HALDA_CPUSystemDevice.PartComponent=" + quotedText(text);
  }

  EXPECT_NE(errorOf(text).find("references are nested too deeply"), std::string::npos);
}

TEST(ObjectPath, NamesTheSameInstanceInAnySpellingAndOrder) {
  const ObjectPath left = ObjectPath::parse("//a/root:C.x=\"1\",y=2");

  EXPECT_TRUE(namesSameInstance(left, ObjectPath::parse("//b/ROOT:c.Y=2,X=\"1\"")));
  EXPECT_TRUE(namesSameInstance(left, ObjectPath::parse("C.x=\"1\",y=2")));
  EXPECT_TRUE(namesSameInstance(left, {{}, "root", "C", {{"x", Value::string("1")}, {"y", Value::uint8(2)}}}));
}

TEST(ObjectPath, NamesAnotherInstanceIfAnythingThatCountsDiffers) {
  const ObjectPath left = ObjectPath::parse("root:C.x=\"1\",y=2");

  for (const std::string_view other :
       {"root:D.x=\"1\",y=2", "other:C.x=\"1\",y=2", "root:C.x=\"1\"", "root:C.x=\"1\",z=2", "root:C.x=\"1\",y=3",
        "root:C.x=\"a\",y=2", "root:C.x=\"1\",y=-2"}) {
    EXPECT_FALSE(namesSameInstance(left, ObjectPath::parse(other))) << other;
  }
}

TEST(ObjectPath, ComparesReferencesByTheSameRule) {
  const auto association = [](std::string_view part) {
    return ObjectPath{{}, {}, "HALDA_CPUSystemDevice", {{"PartComponent", Value::reference(ObjectPath::parse(part))}}};
  };

  EXPECT_TRUE(namesSameInstance(association("//h/root:C.x=1"), association("c.X=1")));
  EXPECT_FALSE(namesSameInstance(association("C.x=1"), association("C.x=2")));
}

}  // namespace Corvcim
