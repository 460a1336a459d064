// What providers can do with the broker's objects, through the operations of the interface.

#include <cmpimacs.h>
#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <string>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"

namespace Corvcim {
namespace {

class BrokerObjects : public testing::Test {
 protected:
  ~BrokerObjects() override {
    request_.reset();
    EXPECT_EQ(broker_.liveObjects(), 0U);
  }

  const CMPIBroker* mb() { return broker_.handle(); }
  Request& request() { return *request_; }
  CMPIInstance* newInstance(const char* className) {
    return CMNewInstance(mb(), CMNewObjectPath(mb(), "root/cimv2", className, nullptr), nullptr);
  }
  std::string message() { return textOf(status_.msg); }

  Broker broker_;
  std::unique_ptr<Request> request_ = std::make_unique<Request>(broker_);
  CMPIStatus status_ = {CMPI_RC_ERROR, nullptr};
};

}  // namespace

TEST_F(BrokerObjects, StringGivesItsText) {
  CMPIString* string = CMNewString(mb(), "text", &status_);

  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_STREQ(CMGetCharPtr(string), "text");
  EXPECT_STREQ(CMGetCharsPtr(string, &status_), "text");
}

TEST_F(BrokerObjects, StringOfNullIsRefused) {
  EXPECT_EQ(CMNewString(mb(), nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(message(), "newString: the text is NULL");
}

TEST_F(BrokerObjects, PathKeepsItsParts) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root/cimv2", "HALDA_CPUMemory", &status_);
  CMSetHostname(path, "box");

  EXPECT_STREQ(CMGetCharPtr(CMGetNameSpace(path, nullptr)), "root/cimv2");
  EXPECT_STREQ(CMGetCharPtr(CMGetClassName(path, nullptr)), "HALDA_CPUMemory");
  EXPECT_STREQ(CMGetCharPtr(CMGetHostname(path, nullptr)), "box");
  CMSetNameSpace(path, "other");
  CMSetClassName(path, "Other");
  EXPECT_EQ(valueOf(path), (ObjectPath{"box", "other", "Other", {}}));
}

TEST_F(BrokerObjects, PathWithoutNamespaceHasAnEmptyOne) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), nullptr, "C", &status_);

  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_STREQ(CMGetCharPtr(CMGetNameSpace(path, nullptr)), "");
}

TEST_F(BrokerObjects, PathWithoutClassIsRefused) {
  EXPECT_EQ(CMNewObjectPath(mb(), "root", nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_INVALID_PARAMETER);
}

TEST_F(BrokerObjects, PathCopiesNamespaceAndHostFromAnother) {
  CMPIObjectPath* source = request().objectPath({"box", "root", "A", {}});
  CMPIObjectPath* first = CMNewObjectPath(mb(), "x", "B", nullptr);
  CMPIObjectPath* second = CMNewObjectPath(mb(), "x", "B", nullptr);

  CMSetNameSpaceFromObjectPath(first, source);
  CMSetHostAndNameSpaceFromObjectPath(second, source);

  EXPECT_EQ(valueOf(first), (ObjectPath{{}, "root", "B", {}}));
  EXPECT_EQ(valueOf(second), (ObjectPath{"box", "root", "B", {}}));
}

TEST_F(BrokerObjects, KeysComeBackWithTheirTypes) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "C", nullptr);
  CMPIObjectPath* target = request().objectPath({"h", "n", "D", {{"k", Value::string("v")}}});
  CMPIString* text = CMNewString(mb(), "string", nullptr);
  const CMPIUint16 number = 65535;
  const CMPIBoolean truth = 1;
  CMAddKey(path, "Chars", "chars", CMPI_chars);
  CMAddKey(path, "String", &text, CMPI_string);
  CMAddKey(path, "Ref", &target, CMPI_ref);
  CMAddKey(path, "Number", &number, CMPI_uint16);
  CMAddKey(path, "Truth", &truth, CMPI_boolean);

  const CMPIData chars = CMGetKey(path, "cHARS", &status_);
  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_EQ(chars.type, CMPI_string);
  EXPECT_TRUE(CMIsKeyValue(chars));
  EXPECT_FALSE(CMIsNullValue(chars));
  EXPECT_STREQ(CMGetCharPtr(chars.value.string), "chars");
  EXPECT_STREQ(CMGetCharPtr(CMGetKey(path, "String", nullptr).value.string), "string");
  const CMPIData reference = CMGetKey(path, "Ref", nullptr);
  EXPECT_EQ(reference.type, CMPI_ref);
  EXPECT_EQ(valueOf(reference.value.ref).text(), "//h/n:D.k=\"v\"");
  EXPECT_EQ(CMGetKey(path, "Number", nullptr).value.uint16, 65535);
  EXPECT_EQ(CMGetKey(path, "Truth", nullptr).value.boolean, 1);
  EXPECT_EQ(CMGetKeyCount(path, nullptr), 5U);
}

TEST_F(BrokerObjects, KeysAreReachedByNumber) {
  CMPIObjectPath* path = request().objectPath({{}, {}, "C", {{"a", Value::uint8(1)}, {"b", Value::uint8(2)}}});
  CMPIString* name = nullptr;

  EXPECT_EQ(CMGetKeyAt(path, 1, &name, &status_).value.uint8, 2);
  EXPECT_EQ(textOf(name), "b");
  EXPECT_EQ(CMGetKeyAt(path, 2, &name, &status_).state, CMPI_notFound);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(BrokerObjects, AbsentKeyIsNotFound) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "C", nullptr);

  const CMPIData data = CMGetKey(path, "DeviceID", &status_);

  EXPECT_EQ(data.state, CMPI_notFound);
  EXPECT_EQ(data.value.string, nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_EQ(message(), "the path of C has no key DeviceID");
}

TEST_F(BrokerObjects, KeysAreNeitherNullNorArrays) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "C", nullptr);
  CMPIArray* array = CMNewArray(mb(), 1, CMPI_uint16, nullptr);
  CMPIString* none = nullptr;
  const char* const noText = nullptr;

  EXPECT_EQ(CMAddKey(path, nullptr, "v", CMPI_chars).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMAddKey(path, "k", noText, CMPI_chars).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMAddKey(path, "k", &none, CMPI_string).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMAddKey(path, "k", &array, CMPI_uint16A).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMAddKey(path, "k", "v", 0x1234).rc, CMPI_RC_ERR_INVALID_DATA_TYPE);
  EXPECT_EQ(CMGetKeyCount(path, nullptr), 0U);
}

TEST_F(BrokerObjects, ArrayHoldsElementsOfItsType) {
  CMPIArray* array = CMNewArray(mb(), 2, CMPI_uint16, &status_);
  const CMPIUint16 number = 7;

  EXPECT_EQ(CMSetArrayElementAt(array, 1, &number, CMPI_uint16).rc, CMPI_RC_OK);

  EXPECT_EQ(CMGetArrayCount(array, nullptr), 2U);
  EXPECT_EQ(CMGetArrayType(array, nullptr), CMPI_uint16);
  EXPECT_TRUE(CMIsNullValue(CMGetArrayElementAt(array, 0, &status_)));
  EXPECT_EQ(CMGetArrayElementAt(array, 1, &status_).value.uint16, 7);
  EXPECT_EQ(CMSetArrayElementAt(array, 0, "x", CMPI_chars).rc, CMPI_RC_ERR_TYPE_MISMATCH);
}

TEST_F(BrokerObjects, ArrayIsBoundsChecked) {
  CMPIArray* array = CMNewArray(mb(), 1, CMPI_uint16, nullptr);
  const CMPIUint16 number = 7;

  EXPECT_EQ(CMGetArrayElementAt(array, 1, &status_).state, CMPI_badValue);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
  EXPECT_EQ(message(), "index 1 is outside an array of 1 elements");
  EXPECT_EQ(CMSetArrayElementAt(array, 1, &number, CMPI_uint16).rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(BrokerObjects, ArrayOfCharsHandsOutStrings) {
  CMPIArray* array = CMNewArray(mb(), 1, CMPI_chars, nullptr);

  CMSetArrayElementAt(array, 0, "text", CMPI_chars);

  const CMPIData data = CMGetArrayElementAt(array, 0, nullptr);
  EXPECT_EQ(data.type, CMPI_string);
  EXPECT_STREQ(CMGetCharPtr(data.value.string), "text");
}

TEST_F(BrokerObjects, EmptyArrayAndArrayOfNothing) {
  EXPECT_EQ(CMGetArrayCount(CMNewArray(mb(), 0, CMPI_uint16, nullptr), nullptr), 0U);
  EXPECT_EQ(CMNewArray(mb(), 1, CMPI_null, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMNewArray(mb(), 1, CMPI_uint16A, &status_), nullptr);
}

TEST_F(BrokerObjects, InstanceKeepsPropertiesInTheOrderOfTheirSetting) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const CMPIUint64 size = 1ULL << 40U;
  const CMPIUint16 states[] = {2, 9};
  CMPIArray* array = CMNewArray(mb(), 2, CMPI_uint16, nullptr);
  CMSetArrayElementAt(array, 0, &states[0], CMPI_uint16);
  CMSetArrayElementAt(array, 1, &states[1], CMPI_uint16);

  CMSetProperty(instance, "DeviceID", "d", CMPI_chars);
  CMSetProperty(instance, "BlockSize", &size, CMPI_uint64);
  CMSetProperty(instance, "OperationalStatus", &array, CMPI_uint16A);
  CMSetProperty(instance, "DEVICEID", "e", CMPI_chars);

  EXPECT_EQ(valueOf(instance).properties, (std::vector<NamedValue>{{"DeviceID", Value::string("e")},
                                                                   {"BlockSize", Value::uint64(1ULL << 40U)},
                                                                   {"OperationalStatus", Value::uint16Array({2, 9})}}));
  EXPECT_EQ(CMGetPropertyCount(instance, nullptr), 3U);
  EXPECT_EQ(CMGetProperty(instance, "blocksize", &status_).value.uint64, size);
  CMPIString* name = nullptr;
  EXPECT_EQ(CMGetPropertyAt(instance, 1, &name, nullptr).value.uint64, size);
  EXPECT_EQ(textOf(name), "BlockSize");
  EXPECT_EQ(CMGetProperty(instance, "Caption", &status_).state, CMPI_notFound);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(BrokerObjects, InstanceRefusesKnownPropertiesOfAnotherType) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const CMPIUint32 size = 1;

  const CMPIStatus status = CMSetProperty(instance, "blockSize", &size, CMPI_uint32);

  EXPECT_EQ(status.rc, CMPI_RC_ERR_INVALID_DATA_TYPE);
  EXPECT_EQ(textOf(status.msg), "HALDA_CPUMemory.BlockSize is of type uint64, not uint32");
  EXPECT_EQ(CMGetPropertyCount(instance, nullptr), 0U);
}

TEST_F(BrokerObjects, InstanceTakesPropertiesThatNobodyKnows) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const CMPIUint32 number = 1;

  EXPECT_EQ(CMSetProperty(instance, "Vendor_Own", &number, CMPI_uint32).rc, CMPI_RC_OK);
  EXPECT_EQ(CMSetPropertyWithOrigin(instance, "Other", &number, CMPI_uint32, "CIM_Memory").rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetPropertyCount(instance, nullptr), 2U);
}

TEST_F(BrokerObjects, NullTextSetsANullProperty) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const char* const none = nullptr;

  EXPECT_EQ(CMSetProperty(instance, "Caption", none, CMPI_chars).rc, CMPI_RC_OK);

  EXPECT_TRUE(CMIsNullValue(CMGetProperty(instance, "Caption", &status_)));
  EXPECT_EQ(status_.rc, CMPI_RC_OK);
}

TEST_F(BrokerObjects, InstancesPathHasTheKeysOfItsClassFromItsProperties) {
  CMPIObjectPath* path = request().objectPath({"box", "root", "HALDA_CPUMemory", {{"DeviceID", Value::string("old")}}});
  CMPIInstance* instance = CMNewInstance(mb(), path, nullptr);
  CMSetProperty(instance, "SystemName", "box", CMPI_chars);
  CMSetProperty(instance, "Name", "L1", CMPI_chars);
  CMSetProperty(instance, "DeviceID", "new", CMPI_chars);

  EXPECT_EQ(valueOf(CMGetObjectPath(instance, nullptr)).text(),
            "//box/root:HALDA_CPUMemory.DeviceID=\"new\",SystemName=\"box\"");
}

TEST_F(BrokerObjects, InstanceOfAnUnknownClassHasThePathItWasMadeWith) {
  const ObjectPath path = {"box", "root", "Other", {{"k", Value::uint8(1)}}};
  CMPIInstance* instance = CMNewInstance(mb(), request().objectPath(path), nullptr);

  EXPECT_EQ(valueOf(CMGetObjectPath(instance, nullptr)), path);
  CMSetObjectPath(instance, request().objectPath({{}, {}, "Another", {}}));
  EXPECT_EQ(valueOf(CMGetObjectPath(instance, nullptr)).className, "Another");
}

TEST_F(BrokerObjects, FilterPassesListedPropertiesAndKeysOnly) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const char* properties[] = {"NAME", nullptr};
  const char* keys[] = {"deviceid", nullptr};
  CMSetProperty(instance, "Caption", "set before", CMPI_chars);
  CMSetPropertyFilter(instance, properties, keys);

  EXPECT_EQ(CMSetProperty(instance, "Description", "filtered", CMPI_chars).rc, CMPI_RC_OK);
  CMSetProperty(instance, "Name", "L1", CMPI_chars);
  CMSetProperty(instance, "DeviceID", "d", CMPI_chars);

  EXPECT_EQ(valueOf(instance).properties, (std::vector<NamedValue>{{"Caption", Value::string("set before")},
                                                                   {"Name", Value::string("L1")},
                                                                   {"DeviceID", Value::string("d")}}));
}

TEST_F(BrokerObjects, EmptyFilterPassesKeysOnly) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const char* properties[] = {nullptr};
  const char* keys[] = {"DeviceID", nullptr};
  CMSetPropertyFilter(instance, properties, keys);

  CMSetProperty(instance, "Name", "L1", CMPI_chars);
  CMSetProperty(instance, "DeviceID", "d", CMPI_chars);

  EXPECT_EQ(valueOf(instance).properties, (std::vector<NamedValue>{{"DeviceID", Value::string("d")}}));
}

TEST_F(BrokerObjects, FilterWithoutListPassesEverything) {
  CMPIInstance* instance = newInstance("HALDA_CPUMemory");
  const char* nothing[] = {nullptr};
  const char* keys[] = {"DeviceID", nullptr};
  CMSetPropertyFilter(instance, nothing, keys);
  CMSetPropertyFilter(instance, nullptr, keys);

  CMSetProperty(instance, "Name", "L1", CMPI_chars);

  EXPECT_EQ(CMGetPropertyCount(instance, nullptr), 1U);
}

TEST_F(BrokerObjects, ArgsAndContextHoldNamedValues) {
  CMPIArgs* args = CMNewArgs(mb(), &status_);
  const CMPIUint32 number = 7;
  CMPIString* name = nullptr;

  EXPECT_EQ(CMAddArg(args, "Number", &number, CMPI_uint32).rc, CMPI_RC_OK);
  EXPECT_EQ(CMGetArg(args, "NUMBER", nullptr).value.uint32, 7U);
  EXPECT_EQ(CMGetArgAt(args, 0, &name, nullptr).value.uint32, 7U);
  EXPECT_EQ(textOf(name), "Number");
  EXPECT_EQ(CMGetArgCount(args, nullptr), 1U);
  EXPECT_EQ(CMGetArg(args, "Other", &status_).state, CMPI_notFound);
  EXPECT_EQ(CMGetArgAt(args, 1, nullptr, &status_).state, CMPI_notFound);

  const CMPIContext* context = request().context();
  EXPECT_EQ(CMGetContextEntry(context, "CMPIInvocationFlags", &status_).type, CMPI_uint32);
  EXPECT_EQ(CMAddContextEntry(context, "Own", "text", CMPI_chars).rc, CMPI_RC_OK);
  EXPECT_EQ(textOf(CMGetContextEntry(context, "Own", nullptr).value.string), "text");
  EXPECT_EQ(CMGetContextEntryCount(context, nullptr), 3U);
  EXPECT_EQ(CMGetContextEntryAt(context, 2, &name, nullptr).type, CMPI_string);
}

TEST_F(BrokerObjects, DateTimesConvert) {
  CMPIDateTime* moment = CMNewDateTimeFromChars(mb(), "20200229120000.000001+000", &status_);
  CMPIDateTime* interval = CMNewDateTimeFromBinary(mb(), 61000000, 1, nullptr);
  CMPIInstance* instance = newInstance("Other");

  EXPECT_EQ(CMGetBinaryFormat(moment, nullptr), 1582977600000001U);
  EXPECT_EQ(CMIsInterval(moment, nullptr), 0);
  EXPECT_STREQ(CMGetCharPtr(CMGetStringFormat(interval, nullptr)), "00000000000101.000000:000");
  EXPECT_EQ(CMIsInterval(interval, nullptr), 1);
  EXPECT_NE(CMGetBinaryFormat(CMNewDateTime(mb(), nullptr), nullptr), 0U);
  CMSetProperty(instance, "When", &moment, CMPI_dateTime);
  EXPECT_EQ(*valueOf(instance).property("When"), Value::dateTime("20200229120000.000001+000"));
  EXPECT_EQ(CMGetBinaryFormat(CMGetProperty(instance, "When", nullptr).value.dateTime, nullptr), 1582977600000001U);
  EXPECT_EQ(CMNewDateTimeFromChars(mb(), "tomorrow", &status_), nullptr);
  EXPECT_EQ(message(), "newDateTimeFromChars: \"tomorrow\" is no CIM date-time");
}

TEST_F(BrokerObjects, AllScalarTypesSurviveAProperty) {
  const Value values[] = {Value::boolean(true),
                          Value::char16(0x20AC),
                          Value::uint8(255),
                          Value::uint16(65535),
                          Value::uint32(1),
                          Value::uint64(1ULL << 63U),
                          Value::sint8(-128),
                          Value::sint16(-1),
                          Value::sint32(-2147483647 - 1),
                          Value::sint64(-1),
                          Value::real32(0.5F),
                          Value::real64(-1e300),
                          Value::string("text"),
                          Value::stringArray({"a", "b"})};
  for (const Value& each : values) {
    CMPIObjectPath* path = request().objectPath({{}, {}, "Other", {{"k", each}}});
    CMPIInstance* instance = newInstance("Other");
    const CMPIData data = CMGetKey(path, "k", nullptr);
    CMSetProperty(instance, "p", &data.value, data.type);
    EXPECT_EQ(*valueOf(instance).property("p"), each);
  }
}

TEST_F(BrokerObjects, AnyObjectTellsWhatItIs) {
  CMPIObjectPath* path = request().objectPath({{}, "root", "C", {{"k", Value::uint8(1)}}});
  const CMPIBrokerEncFT* services = mb()->eft;

  EXPECT_EQ(textOf(services->toString(mb(), path, nullptr)), "root:C.k=1");
  EXPECT_EQ(textOf(path->ft->toString(path, nullptr)), "root:C.k=1");
  EXPECT_EQ(textOf(services->getType(mb(), path, nullptr)), "CMPIObjectPath");
  EXPECT_EQ(services->isOfType(mb(), path, "CMPIObjectPath", nullptr), 1);
  EXPECT_EQ(services->isOfType(mb(), path, "CMPIInstance", nullptr), 0);
  EXPECT_EQ(services->getType(mb(), nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_INVALID_PARAMETER);
}

TEST_F(BrokerObjects, ClassPathsKnowTheirAncestors) {
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "HALDA_CPUProcessor", nullptr);

  EXPECT_EQ(CMClassPathIsA(mb(), path, "cim_processor", &status_), 1);
  EXPECT_EQ(CMClassPathIsA(mb(), path, "CIM_Memory", &status_), 0);
  EXPECT_EQ(CMClassPathIsA(mb(), nullptr, "CIM_Memory", &status_), 0);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_INVALID_PARAMETER);
}

}  // namespace Corvcim
