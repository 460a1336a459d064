#include "host/broker/Value.h"

#include <gtest/gtest.h>

#include <limits>
#include <sstream>

#include "host/broker/Instance.h"

namespace Corvcim {

TEST(Value, PrintsAsMof) {
  EXPECT_EQ(Value::boolean(true).text(), "TRUE");
  EXPECT_EQ(Value::uint64(std::numeric_limits<std::uint64_t>::max()).text(), "18446744073709551615");
  EXPECT_EQ(Value::sint64(std::numeric_limits<std::int64_t>::min()).text(), "-9223372036854775808");
  EXPECT_EQ(Value::sint8(-1).text(), "-1");
  EXPECT_EQ(Value::real64(0.5).text(), "0.5");
  EXPECT_EQ(Value::string("a\"b\\c\n\t\x01").text(), R"("a\"b\\c\n\t\x0001")");
  EXPECT_EQ(Value::uint16Array({2, 9}).text(), "{2, 9}");
  EXPECT_EQ(Value::stringArray({}).text(), "{}");
  EXPECT_EQ(Value::null(CMPI_string).text(), "NULL");
  EXPECT_EQ(Value::reference({{}, "root", "C", {{"k", Value::string("v")}}}).text(), R"("root:C.k=\"v\"")");
}

TEST(Value, KeepsBytesThatAreNoText) {
  EXPECT_EQ(Value::string("\xff\xc3").text(), "\"\xff\xc3\"");
}

TEST(Value, ComparesTypeAndContent) {
  EXPECT_EQ(Value::uint16(7), Value::uint16(7));
  EXPECT_FALSE(Value::uint16(7) == Value::uint32(7));
  EXPECT_FALSE(Value::uint16(7) == Value::null(CMPI_uint16));
  EXPECT_FALSE(Value::string("a") == Value::string("A"));
  EXPECT_FALSE(Value::string("20200101000000.000000+000") == Value::dateTime("20200101000000.000000+000"));
  EXPECT_EQ(Value::reference({{}, {}, "C", {}}), Value::reference({{}, {}, "C", {}}));
  EXPECT_FALSE(Value::reference({{}, {}, "C", {}}) == Value::reference({{}, {}, "D", {}}));
  EXPECT_EQ(Value::instance({{}, {{"p", Value::uint8(1)}}}), Value::instance({{}, {{"p", Value::uint8(1)}}}));
  EXPECT_FALSE(Value::instance({{}, {{"p", Value::uint8(1)}}}) == Value::instance({{}, {{"p", Value::uint8(2)}}}));
}

TEST(Value, OfAnotherKindThrows) {
  EXPECT_THROW((void)Value::string("7").asUnsigned(), std::bad_variant_access);
  EXPECT_THROW((void)Value::null(CMPI_uint16).asUnsigned(), std::bad_variant_access);
  EXPECT_THROW((void)Value::uint16(7).asSigned(), std::bad_variant_access);
}

TEST(Value, NamesTypes) {
  EXPECT_EQ(typeName(CMPI_uint16A), "uint16[]");
  EXPECT_EQ(typeName(CMPI_string), "string");
  EXPECT_EQ(typeName(CMPI_null), "null");
  EXPECT_EQ(typeName(0x1E01), "0x1e01");
}

TEST(Value, PrintsItsTypeToStreams) {
  std::ostringstream stream;

  stream << Value::uint16(7);

  EXPECT_EQ(stream.str(), "uint16 7");
}

TEST(NamedValues, AreFoundAndReplacedWithoutRegardToCase) {
  std::vector<NamedValue> values = {{"DeviceID", Value::string("a")}};

  assignValue(values, "DEVICEID", Value::string("b"));
  assignValue(values, "Name", Value::string("c"));

  EXPECT_EQ(values, (std::vector<NamedValue>{{"DeviceID", Value::string("b")}, {"Name", Value::string("c")}}));
  EXPECT_EQ(*findValue(values, "name"), Value::string("c"));
  EXPECT_EQ(findValue(values, "nam"), nullptr);
}

TEST(Instance, PrintsAsMof) {
  const Instance instance = makeInstance(
      "root/cimv2", "HALDA_CPUProcessorCore",
      {{"InstanceID", Value::string("1-2")}, {"HealthState", Value::uint16(5)}, {"Caption", Value::null(CMPI_string)}});

  EXPECT_EQ(instance.text(),
            "instance of HALDA_CPUProcessorCore {\n  InstanceID = \"1-2\";\n  HealthState = 5;\n  Caption = NULL;\n};");
}

TEST(Instance, TakesItsPathFromTheKeyPropertiesOfItsClass) {
  const Instance instance = makeInstance(
      "root/cimv2", "halda_CPUProcessor",
      {{"Name", Value::string("n")}, {"deviceid", Value::string("d")}, {"SystemName", Value::null(CMPI_string)}});

  EXPECT_EQ(instance.path.text(), "root/cimv2:halda_CPUProcessor.DeviceID=\"d\"");
}

TEST(Instance, OfAnUnknownClassKeepsThePathItWasGiven) {
  const ObjectPath path = {"h", "root", "Other", {{"k", Value::uint8(1)}}};

  EXPECT_EQ(instancePath(path, {{"k", Value::uint8(2)}}), path);
}

}  // namespace Corvcim
