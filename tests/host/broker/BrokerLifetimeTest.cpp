// How long the broker's objects live, and what it does with nothing in place of one.

#include <cmpimacs.h>
#include <gtest/gtest.h>

#include <cstring>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"

namespace Corvcim {

TEST(BrokerLifetime, RequestFreesWhateverWasMadeInIt) {
  Broker broker;
  {
    const Request request(broker);
    CMPIObjectPath* path = CMNewObjectPath(broker.handle(), "root", "C", nullptr);
    CMNewInstance(broker.handle(), path, nullptr);
    CMGetNameSpace(path, nullptr);
    EXPECT_EQ(broker.liveObjects(), 5U);  // with the request's own context and result
  }

  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(BrokerLifetime, CloneOutlivesTheRequestUntilItsRelease) {
  Broker broker;
  CMPIObjectPath* clone = nullptr;
  {
    Request request(broker);
    clone = CMClone(request.objectPath({{}, "root", "C", {{"k", Value::string("v")}}}), nullptr);
  }
  {
    const Request later(broker);
    EXPECT_EQ(valueOf(clone).text(), "root:C.k=\"v\"");
    EXPECT_STREQ(CMGetCharPtr(CMGetClassName(clone, nullptr)), "C");
  }
  EXPECT_EQ(broker.liveObjects(), 1U);

  EXPECT_EQ(CMRelease(clone).rc, CMPI_RC_OK);
  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(BrokerLifetime, CloneIsAnObjectOfItsOwn) {
  Broker broker;
  const Request request(broker);
  CMPIArray* array = CMNewArray(broker.handle(), 1, CMPI_uint8, nullptr);
  CMPIArray* clone = CMClone(array, nullptr);
  const CMPIUint8 number = 7;

  CMSetArrayElementAt(array, 0, &number, CMPI_uint8);

  EXPECT_TRUE(CMIsNullValue(CMGetArrayElementAt(clone, 0, nullptr)));
  CMRelease(clone);
}

TEST(BrokerLifetime, ReleasedObjectGoesBeforeItsRequest) {
  Broker broker;
  const Request request(broker);
  CMPIString* string = CMNewString(broker.handle(), "text", nullptr);
  const std::size_t live = broker.liveObjects();

  CMRelease(string);

  EXPECT_EQ(broker.liveObjects(), live - 1);
}

TEST(BrokerLifetime, NestedRequestFreesOnlyItsOwn) {
  Broker broker;
  const Request outer(broker);
  CMPIString* kept = CMNewString(broker.handle(), "kept", nullptr);
  {
    const Request inner(broker);
    CMNewString(broker.handle(), "freed", nullptr);
  }

  EXPECT_STREQ(CMGetCharPtr(kept), "kept");
  EXPECT_EQ(broker.liveObjects(), 3U);
}

TEST(BrokerLifetime, ObjectsMadeOutsideARequestBelongToTheBroker) {
  Broker broker;

  CMPIString* string = CMNewString(broker.handle(), "text", nullptr);

  EXPECT_STREQ(CMGetCharPtr(string), "text");
  EXPECT_EQ(broker.liveObjects(), 1U);
}

TEST(BrokerLifetime, MemoryOfTheBrokerGoesWithItsRequest) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  {
    const Request request(broker);
    void* memory = mb->mft->cmpiMalloc(mb, 10);
    std::memset(memory, 1, 10);
    auto* grown = static_cast<char*>(mb->mft->cmpiRealloc(mb, memory, 1000));
    EXPECT_EQ(grown[9], 1);
    auto* zeros = static_cast<char*>(mb->mft->cmpiCalloc(mb, 3, 5));
    EXPECT_EQ(zeros[14], 0);
    EXPECT_STREQ(mb->mft->cmpiStrDup(mb, "text"), "text");
    mb->mft->cmpiFree(mb, zeros);
    EXPECT_EQ(mb->mft->cmpiCalloc(mb, static_cast<std::size_t>(-1), 2), nullptr);
    EXPECT_EQ(mb->mft->cmpiStrDup(mb, nullptr), nullptr);
  }

  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(BrokerLifetime, ReleaseOfAMarkFreesWhatWasMadeSince) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  const Request request(broker);
  const std::size_t before = broker.liveObjects();

  CMPIGcStat* mark = mb->mft->mark(mb, nullptr);
  CMNewString(mb, "a", nullptr);
  mb->mft->freeString(mb, CMNewString(mb, "b", nullptr));
  CMNewArray(mb, 3, CMPI_uint16, nullptr);

  EXPECT_EQ(mb->mft->release(mb, mark).rc, CMPI_RC_OK);
  EXPECT_EQ(broker.liveObjects(), before);
}

TEST(BrokerTables, HaveNoEmptySlot) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  const auto expectFilled = [](const auto* table, std::size_t scalars, const char* name) {
    const auto* slots = reinterpret_cast<const void* const*>(table);
    for (std::size_t i = scalars; i < sizeof(*table) / sizeof(void*); ++i) {
      EXPECT_NE(slots[i], nullptr) << name << " " << i;
    }
  };
  constexpr std::size_t firstNameSlot = 2 * sizeof(int) / sizeof(void*);

  expectFilled(mb->bft, firstNameSlot, "bft");
  expectFilled(mb->eft, 1, "eft");
  expectFilled(mb->xft, 1, "xft");
  expectFilled(mb->mft, 1, "mft");
  EXPECT_EQ(CBBrokerVersion(mb), CMPI_VERSION);
  EXPECT_EQ(mb->eft->ftVersion, CMPI_VERSION);
}

TEST(BrokerNulls, NoOperationMindsAnObjectThatIsNone) {
  Broker broker;
  const Request request(broker);
  const CMPIBroker* mb = broker.handle();
  const CMPIStringFT* strings = CMNewString(mb, "", nullptr)->ft;
  const CMPIObjectPathFT* paths = CMNewObjectPath(mb, "", "C", nullptr)->ft;
  const CMPIInstanceFT* instances = CMNewInstance(mb, CMNewObjectPath(mb, "", "C", nullptr), nullptr)->ft;
  const CMPIArrayFT* arrays = CMNewArray(mb, 0, CMPI_uint8, nullptr)->ft;
  const CMPIString noString = {nullptr, strings};
  CMPIObjectPath noPath = {nullptr, paths};
  CMPIStatus status = {CMPI_RC_OK, nullptr};

  EXPECT_EQ(strings->getCharPtr(nullptr, &status), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(strings->getCharPtr(&noString, nullptr), nullptr);
  EXPECT_EQ(strings->clone(nullptr, &status), nullptr);
  EXPECT_EQ(strings->release(nullptr).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(paths->getKey(&noPath, "k", &status).state, CMPI_badValue);
  EXPECT_EQ(paths->getKeyAt(nullptr, 0, nullptr, &status).state, CMPI_badValue);
  EXPECT_EQ(paths->getKeyCount(nullptr, &status), 0U);
  EXPECT_EQ(paths->addKey(nullptr, "k", nullptr, CMPI_chars).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(paths->getClassName(&noPath, &status), nullptr);
  EXPECT_EQ(paths->setClassName(nullptr, "C").rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(paths->release(&noPath).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(instances->getObjectPath(nullptr, &status), nullptr);
  EXPECT_EQ(instances->setProperty(nullptr, "p", nullptr, CMPI_chars).rc, CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(arrays->getElementAt(nullptr, 0, &status).state, CMPI_badValue);
  EXPECT_EQ(arrays->getSize(nullptr, &status), 0U);
}

TEST(BrokerNulls, NullArgumentsAreRefusedWithAMessage) {
  Broker broker;
  const Request request(broker);
  const CMPIBroker* mb = broker.handle();
  CMPIObjectPath* path = CMNewObjectPath(mb, "root", "C", nullptr);
  CMPIInstance* instance = CMNewInstance(mb, path, nullptr);
  CMPIStatus status = {CMPI_RC_OK, nullptr};

  EXPECT_EQ(textOf(CMSetHostname(path, nullptr).msg), "setHostname: the text is NULL");
  EXPECT_EQ(CMSetNameSpaceFromObjectPath(path, nullptr).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  CMGetKey(path, nullptr, &status);
  EXPECT_EQ(textOf(status.msg), "getKey: the name is NULL");
  CMGetProperty(instance, nullptr, &status);
  EXPECT_EQ(textOf(status.msg), "getProperty: the name is NULL");
  EXPECT_EQ(textOf(CMSetProperty(instance, nullptr, "v", CMPI_chars).msg), "setProperty: the name is NULL");
  EXPECT_EQ(CMSetObjectPath(instance, nullptr).rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(CMNewInstance(mb, nullptr, &status), nullptr);
  EXPECT_EQ(textOf(status.msg), "newInstance: the path is NULL");
  EXPECT_EQ(textOf(CMReturnInstance(request.result(), nullptr).msg), "returnInstance: the instance is NULL");
  EXPECT_EQ(textOf(CMReturnObjectPath(request.result(), nullptr).msg), "returnObjectPath: the path is NULL");
  EXPECT_EQ(CBEnumInstances(mb, request.context(), nullptr, nullptr, &status), nullptr);
  EXPECT_EQ(textOf(status.msg), "EnumerateInstances: the path is NULL");
  EXPECT_EQ(mb->eft->newString(nullptr, "text", &status), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST(BrokerRefusals, WhatTheHostDoesNotDoIsNotSupported) {
  Broker broker;
  const Request request(broker);
  const CMPIBroker* mb = broker.handle();
  const CMPIContext* context = request.context();
  CMPIObjectPath* path = CMNewObjectPath(mb, "root", "C", nullptr);
  CMPIInstance* instance = CMNewInstance(mb, path, nullptr);
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  CMPIMsgFileHandle file = &status;

  EXPECT_EQ(CBDeliverIndication(mb, context, "root", instance).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CBCreateInstance(mb, context, path, instance, &status), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(textOf(status.msg), "this broker does not support createInstance");
  EXPECT_EQ(CBModifyInstance(mb, context, path, instance, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CBDeleteInstance(mb, context, path).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CBExecQuery(mb, context, path, "q", "WQL", &status), nullptr);
  CBInvokeMethod(mb, context, path, "m", nullptr, nullptr, &status);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CBSetProperty(mb, context, path, "p", "v", CMPI_chars).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CMNewSelectExp(mb, "q", "WQL", nullptr, &status), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CMNewCMPIError(mb, "o", "i", "m", ErrorSevLow, ErrorProbCauseUnknown, CMPI_RC_ERR_FAILED, &status),
            nullptr);
  EXPECT_EQ(CMOpenMessageFile(mb, "f", &file).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(file, nullptr);
  EXPECT_EQ(CMCloseMessageFile(mb, file).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(CMReturnError(request.result(), nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  CMGetClassQualifier(path, "Key", &status);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(mb->bft->enumerateInstancesFiltered(mb, context, path, nullptr, "WQL", "q", &status), nullptr);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
}

TEST(BrokerMessages, AreTheDefaultTexts) {
  Broker broker;
  const Request request(broker);
  const CMPIBroker* mb = broker.handle();
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  broker.services().record(true);

  EXPECT_EQ(textOf(mb->eft->getMessage(mb, "ID1", "the default", &status, 0)), "the default");
  EXPECT_EQ(textOf(mb->eft->getMessage2(mb, "ID2", nullptr, "the default", &status, 0)), "the default");
  EXPECT_EQ(CMLogMessage(mb, CMPI_SEV_ERROR, "id", "logged", nullptr).rc, CMPI_RC_OK);
  EXPECT_EQ(CMTraceMessage(mb, CMPI_LEV_INFO, "component", "traced", nullptr).rc, CMPI_RC_OK);
  EXPECT_EQ(broker.services().takeRecord(),
            (std::vector<ServiceCall>{
                {"getMessage", "ID1"}, {"getMessage", "ID2"}, {"logMessage", "logged"}, {"trace", "traced"}}));
}

}  // namespace Corvcim
