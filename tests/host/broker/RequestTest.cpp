// Requests through a management interface: what the provider sees and what comes of it.

#include <cmpimacs.h>
#include <gtest/gtest.h>

#include <atomic>
#include <stdexcept>
#include <thread>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"
#include "tests/host/broker/ScriptedProvider.h"

namespace Corvcim {
namespace {

const ObjectPath cacheClass = {{}, "root/cimv2", "HALDA_CPUMemory", {}};
const ObjectPath cache = {{}, "root/cimv2", "HALDA_CPUMemory", {{"DeviceID", Value::string("1-1")}}};

CMPIStatus ok() {
  return {CMPI_RC_OK, nullptr};
}

CMPIInstance* makeCache(const CMPIBroker* mb, const char* id) {
  CMPIInstance* instance = CMNewInstance(mb, CMNewObjectPath(mb, "root/cimv2", "HALDA_CPUMemory", nullptr), nullptr);
  CMSetProperty(instance, "DeviceID", id, CMPI_chars);
  return instance;
}

}  // namespace

TEST(Request, DeliversInstancesPathsAndDone) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  ScriptedProvider provider([mb](const ProviderCall& call) {
    CMPIInstance* instance = makeCache(mb, "a");
    CMReturnInstance(call.result, instance);
    CMSetProperty(instance, "DeviceID", "changed later", CMPI_chars);
    CMReturnObjectPath(call.result, call.path);
    CMReturnDone(call.result);
    return ok();
  });

  const Response response = broker.enumerateInstances(provider.instanceMI(), cacheClass);

  Response expected;
  expected.instances = {makeInstance("root/cimv2", "HALDA_CPUMemory", {{"DeviceID", Value::string("a")}})};
  expected.paths = {cacheClass};
  expected.doneCalls = 1;
  EXPECT_EQ(response, expected);
  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(Request, DeliversInstancesAndPathsReturnedAsData) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  ScriptedProvider provider([mb](const ProviderCall& call) {
    CMPIInstance* instance = makeCache(mb, "a");
    CMPIInstance* none = nullptr;
    const CMPIUint8 number = 1;
    EXPECT_EQ(CMReturnData(call.result, &instance, CMPI_instance).rc, CMPI_RC_OK);
    EXPECT_EQ(CMReturnData(call.result, &call.path, CMPI_ref).rc, CMPI_RC_OK);
    EXPECT_EQ(CMReturnData(call.result, &none, CMPI_instance).rc, CMPI_RC_ERR_INVALID_PARAMETER);
    EXPECT_EQ(CMReturnData(call.result, &number, CMPI_uint8).rc, CMPI_RC_ERR_NOT_SUPPORTED);
    return ok();
  });

  const Response response = broker.enumerateInstances(provider.instanceMI(), cacheClass);

  EXPECT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.paths.size(), 1U);
  EXPECT_FALSE(response.done());
}

TEST(Request, DeliversTheStatusWithItsMessage) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  ScriptedProvider provider([mb](const ProviderCall& call) {
    CMReturnInstance(call.result, makeCache(mb, "a"));
    CMReturnWithChars(mb, CMPI_RC_ERR_ACCESS_DENIED, "not for you");
  });

  const Response response = broker.getInstance(provider.instanceMI(), cache);

  EXPECT_EQ(response.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(response.message, "not for you");
  EXPECT_EQ(response.instances.size(), 1U);
}

TEST(Request, ReachesTheSlotOfItsOperationWithItsArguments) {
  Broker broker;
  std::string seen;
  ScriptedProvider provider([&seen](const ProviderCall& call) {
    const auto text = [](const char* value) { return std::string(value == nullptr ? "NULL" : value); };
    seen = valueOf(call.path).text();
    for (const char* each : call.filter) {
      seen += " " + text(each);
    }
    for (const char** each = call.properties; each != nullptr && *each != nullptr; ++each) {
      seen += " " + text(*each);
    }
    seen += call.properties == nullptr ? " all" : " listed";
    return ok();
  });
  const AssociationFilter filter = {"assoc", "result", "role", "resultRole"};
  const std::string path = cache.text();

  broker.enumerateInstanceNames(provider.instanceMI(), cacheClass);
  EXPECT_EQ(provider.lastOperation + " " + seen, "enumerateInstanceNames root/cimv2:HALDA_CPUMemory all");
  broker.enumerateInstances(provider.instanceMI(), cacheClass, PropertyList({"Name", "Caption"}));
  EXPECT_EQ(provider.lastOperation + " " + seen, "enumerateInstances root/cimv2:HALDA_CPUMemory Name Caption listed");
  broker.getInstance(provider.instanceMI(), cache, PropertyList(std::in_place));
  EXPECT_EQ(provider.lastOperation + " " + seen, "getInstance " + path + " listed");
  broker.associators(provider.associationMI(), cache, filter, PropertyList({"Name"}));
  EXPECT_EQ(provider.lastOperation + " " + seen, "associators " + path + " assoc result role resultRole Name listed");
  broker.associatorNames(provider.associationMI(), cache);
  EXPECT_EQ(provider.lastOperation + " " + seen, "associatorNames " + path + " NULL NULL NULL NULL all");
  broker.references(provider.associationMI(), cache, filter);
  EXPECT_EQ(provider.lastOperation + " " + seen, "references " + path + " result role all");
  broker.referenceNames(provider.associationMI(), cache, filter);
  EXPECT_EQ(provider.lastOperation + " " + seen, "referenceNames " + path + " result role all");
}

TEST(Request, OfTheWrongInterfaceIsACallersError) {
  Broker broker;
  ScriptedProvider provider([](const ProviderCall&) { return ok(); });

  EXPECT_THROW(broker.perform(provider.instanceMI(), {OperationKind::Associators, cache, {}, {}}),
               std::invalid_argument);
  EXPECT_THROW(broker.perform(provider.associationMI(), {OperationKind::GetInstance, cache, {}, {}}),
               std::invalid_argument);
}

TEST(Request, LetsAnExceptionPassAndFreesItsObjects) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  ScriptedProvider provider([mb](const ProviderCall&) -> CMPIStatus {
    makeCache(mb, "a");
    throw std::runtime_error("escaped");
  });

  EXPECT_THROW(broker.enumerateInstances(provider.instanceMI(), cacheClass), std::runtime_error);
  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(Request, TellsTheProviderItsNamespaceAndFlags) {
  Broker broker;
  std::string nameSpace;
  ScriptedProvider provider([&nameSpace](const ProviderCall& call) {
    nameSpace = textOf(CMGetContextEntry(call.context, "CMPIInitNameSpace", nullptr).value.string);
    return ok();
  });

  broker.enumerateInstances(provider.instanceMI(), cacheClass);

  EXPECT_EQ(nameSpace, "root/cimv2");
}

TEST(Request, ThreadOfTheProviderWorksForTheRequestItAttachesTo) {
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  ScriptedProvider provider([mb](const ProviderCall& call) {
    CMPIContext* context = CBPrepareAttachThread(mb, call.context);
    std::thread([&] {
      EXPECT_EQ(CBAttachThread(mb, context).rc, CMPI_RC_OK);
      EXPECT_EQ(CBAttachThread(mb, context).rc, CMPI_RC_ERR_INVALID_PARAMETER);
      CMReturnInstance(call.result, makeCache(mb, "from a thread"));
      EXPECT_EQ(mb->bft->detachThread(mb, context).rc, CMPI_RC_OK);
    }).join();
    return ok();
  });

  const Response response = broker.enumerateInstances(provider.instanceMI(), cacheClass);

  EXPECT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(broker.liveObjects(), 0U);
}

TEST(Request, SixteenThreadsAtOnceEachSeeTheirOwn) {
  constexpr int threadCount = 16;
  constexpr int requestsEach = 50;
  Broker broker;
  const CMPIBroker* mb = broker.handle();
  broker.serveInstances("HALDA_ComputerSystem",
                        {makeInstance("root", "HALDA_ComputerSystem", {{"Name", Value::string("box")}})});
  std::atomic<int> wrong = 0;
  const auto runRequests = [&](int thread) {
    ScriptedProvider provider([&, thread](const ProviderCall& call) {
      CMPIObjectPath* system = CMNewObjectPath(mb, "root", "HALDA_ComputerSystem", nullptr);
      CMPIEnumeration* names = CBEnumInstanceNames(mb, call.context, system, nullptr);
      while (CMHasNext(names, nullptr) != 0) {
        CMReturnObjectPath(call.result, CMGetNext(names, nullptr).value.ref);
      }
      CMReturnInstance(call.result, makeCache(mb, std::to_string(thread).c_str()));
      return ok();
    });
    for (int i = 0; i < requestsEach; ++i) {
      const Response response = broker.enumerateInstances(provider.instanceMI(), cacheClass);
      const bool right = response.instances.size() == 1 && response.paths.size() == 1 &&
                         *response.instances[0].property("DeviceID") == Value::string(std::to_string(thread));
      wrong += right ? 0 : 1;
    }
  };

  std::vector<std::thread> threads;
  for (int i = 0; i < threadCount; ++i) {
    threads.emplace_back(runRequests, i);
  }
  for (std::thread& each : threads) {
    each.join();
  }

  EXPECT_EQ(wrong, 0);
  EXPECT_EQ(broker.liveObjects(), 0U);
  EXPECT_EQ(broker.callCount("returnInstance"), static_cast<unsigned>(threadCount * requestsEach));
}

TEST(BrokerThreads, ServicesStartJoinAndSynchronize) {
  Broker broker;
  const CMPIBrokerExtFT* services = broker.handle()->xft;
  struct Shared {
    const CMPIBrokerExtFT* services;
    void* mutex;
    void* condition;
    bool ready;
  };
  Shared shared = {services, services->newMutex(0), services->newCondition(0), false};
  const CMPIThreadFunc body = [](void* argument) -> void* {
    auto* own = static_cast<Shared*>(argument);
    own->services->lockMutex(own->mutex);
    own->ready = true;
    own->services->signalCondition(own->condition);
    own->services->unlockMutex(own->mutex);
    return argument;
  };

  void* thread = services->newThread(body, &shared, 0);
  services->lockMutex(shared.mutex);
  while (!shared.ready) {
    services->condWait(shared.condition, shared.mutex);
  }
  services->unlockMutex(shared.mutex);
  void* result = nullptr;

  EXPECT_EQ(services->joinThread(thread, &result), 0);
  EXPECT_EQ(result, &shared);
  timespec past = {1, 0};
  services->lockMutex(shared.mutex);
  EXPECT_NE(services->timedCondWait(shared.condition, shared.mutex, &past), 0);
  services->unlockMutex(shared.mutex);
  services->destroyCondition(shared.condition);
  services->destroyMutex(shared.mutex);
}

TEST(BrokerThreads, KeysOnceAndNames) {
  Broker broker;
  const CMPIBrokerExtFT* services = broker.handle()->xft;
  unsigned int key = 0;
  int once = 0;
  static int runs = 0;

  ASSERT_EQ(services->createThreadKey(&key, nullptr), 0);
  EXPECT_EQ(services->setThreadSpecific(key, &key), 0);
  EXPECT_EQ(services->getThreadSpecific(key), &key);
  EXPECT_EQ(services->destroyThreadKey(key), 0);
  services->threadOnce(&once, [] { ++runs; });
  services->threadOnce(&once, [] { ++runs; });
  EXPECT_EQ(runs, 1);
  EXPECT_EQ(services->threadSleep(1), 0);
  char* name = services->resolveFileName("provider");
  EXPECT_STREQ(name, "libprovider.so");
  std::free(name);
  EXPECT_EQ(services->newThread(nullptr, nullptr, 0), nullptr);
  EXPECT_NE(services->joinThread(nullptr, nullptr), 0);
}

}  // namespace Corvcim
