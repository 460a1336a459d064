// Services failing as tests ask them to.

#include <cmpimacs.h>
#include <gtest/gtest.h>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"

namespace Corvcim {
namespace {

class FailingService : public testing::Test {
 protected:
  const CMPIBroker* mb() { return broker_.handle(); }
  std::string message() { return textOf(status_.msg); }

  Broker broker_;
  Request request_{broker_};
  CMPIObjectPath* path_ = request_.objectPath({{}, "root", "C", {{"k", Value::string("v")}, {"n", Value::uint8(1)}}});
  CMPIStatus status_ = {CMPI_RC_OK, nullptr};
};

}  // namespace

TEST_F(FailingService, GivesNull) {
  broker_.failNth("newArray", 2);

  EXPECT_NE(CMNewArray(mb(), 1, CMPI_uint16, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_EQ(CMNewArray(mb(), 1, CMPI_uint16, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(message(), "failure asked for by the test");
  EXPECT_NE(CMNewArray(mb(), 1, CMPI_uint16, &status_), nullptr);
}

TEST_F(FailingService, GivesAnObjectWithoutHandle) {
  broker_.failNth("newObjectPath", 1, {FailureResult::HandleLess});

  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "C", &status_);

  ASSERT_NE(path, nullptr);
  EXPECT_EQ(path->hdl, nullptr);
  EXPECT_NE(path->ft, nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
}

TEST_F(FailingService, GivesTheRightObjectWithAFailingStatus) {
  broker_.failNth("newString", 1, {FailureResult::StatusOnly, CMPI_RC_ERR_ACCESS_DENIED, "because"});

  CMPIString* string = CMNewString(mb(), "text", &status_);

  EXPECT_EQ(textOf(string), "text");
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(message(), "because");
}

TEST_F(FailingService, ServesCallersWithoutStatus) {
  broker_.failNth("newInstance", 1);

  EXPECT_EQ(CMNewInstance(mb(), path_, nullptr), nullptr);
}

TEST_F(FailingService, GivesKeysThatAreNull) {
  broker_.failNth("getKey", 1);

  const CMPIData data = CMGetKey(path_, "k", &status_);

  EXPECT_TRUE(CMIsNullValue(data));
  EXPECT_EQ(data.value.string, nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
}

TEST_F(FailingService, GivesKeysWhoseTextHasNoHandle) {
  broker_.failNth("getKey", 1, {FailureResult::HandleLess});

  const CMPIData data = CMGetKey(path_, "k", &status_);

  EXPECT_EQ(data.type, CMPI_string);
  ASSERT_NE(data.value.string, nullptr);
  EXPECT_EQ(data.value.string->hdl, nullptr);
}

TEST_F(FailingService, GivesKeysWithAFailingStatusOnly) {
  broker_.failNth("getKey", 1, {FailureResult::StatusOnly});

  EXPECT_EQ(CMGetKey(path_, "n", &status_).value.uint8, 1);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
}

TEST_F(FailingService, CountsNothing) {
  broker_.failNth("getKeyCount", 1);

  EXPECT_EQ(CMGetKeyCount(path_, &status_), 0U);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMGetKeyCount(path_, &status_), 2U);
}

TEST_F(FailingService, ChangesNothing) {
  broker_.failNth("addKey", 1);
  broker_.failNth("setHostname", 1);
  CMPIInstance* instance = CMNewInstance(mb(), path_, nullptr);
  broker_.failNth("setProperty", 1);

  EXPECT_EQ(CMAddKey(path_, "new", "v", CMPI_chars).rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMSetHostname(path_, "box").rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMSetProperty(instance, "p", "v", CMPI_chars).rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMGetKeyCount(path_, nullptr), 2U);
  EXPECT_EQ(valueOf(path_).host, "");
  EXPECT_EQ(CMGetPropertyCount(instance, nullptr), 0U);
}

TEST_F(FailingService, DeliversNothing) {
  broker_.failNth("returnInstance", 1);
  broker_.failNth("returnObjectPath", 1);
  broker_.failNth("returnDone", 1);

  EXPECT_EQ(CMReturnInstance(request_.result(), CMNewInstance(mb(), path_, nullptr)).rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMReturnObjectPath(request_.result(), path_).rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(CMReturnDone(request_.result()).rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(request_.response({CMPI_RC_OK, nullptr}), Response{});
}

TEST_F(FailingService, MayBeAnUpcall) {
  broker_.serveInstances("C", {makeInstance("root", "C", {})});
  broker_.failNth("enumerateInstances", 1, {FailureResult::StatusOnly, CMPI_RC_ERR_NOT_SUPPORTED, "x"});
  broker_.failNth("enumerateInstanceNames", 1);

  EXPECT_NE(CBEnumInstances(mb(), request_.context(), path_, nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CBEnumInstanceNames(mb(), request_.context(), path_, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
}

TEST_F(FailingService, RecordsSayWhatCallsWereAbout) {
  broker_.services().record(true);
  const char* properties[] = {"Name", "Caption", nullptr};
  const char* keys[] = {"k", nullptr};
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root", "C", nullptr);
  CMPIInstance* instance = CMNewInstance(mb(), path, nullptr);
  CMSetPropertyFilter(instance, properties, keys);
  CMSetPropertyFilter(instance, nullptr, keys);
  CMSetProperty(instance, "Name", "v", CMPI_chars);
  CMNewArray(mb(), 3, CMPI_uint16, nullptr);
  CMGetKey(path, "k", nullptr);
  CMReturnInstance(request_.result(), instance);
  CMReturnInstance(request_.result(), nullptr);

  EXPECT_EQ(broker_.services().takeRecord(),
            (std::vector<ServiceCall>{{"newObjectPath", "C"},
                                      {"newInstance", "C"},
                                      {"setPropertyFilter", "properties {Name,Caption} keys {k}"},
                                      {"setPropertyFilter", "properties NULL keys {k}"},
                                      {"setProperty", "Name"},
                                      {"newArray", "3 uint16"},
                                      {"getKey", "k"},
                                      {"returnInstance", "C"},
                                      {"returnInstance", "NULL"}}));
}

}  // namespace Corvcim
