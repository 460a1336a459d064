// The provider of HALDA_ComputerSystem, called through its shared object as a broker does.

#include <dlfcn.h>
#include <gtest/gtest.h>
#include <pthread.h>

#include <tarn/Common.h>
#include <cstdlib>
#include <string>
#include <thread>

#include "host/broker/Broker.h"
#include "host/broker/Objects.h"
#include "host/broker/ProviderLibrary.h"
#include "host/broker/Request.h"
#include "platform/inventory/tree/JsonTree.h"
#include "platform/inventory/tree/PropertyTable.h"
#include "platform/inventory/tree/TreeBuilder.h"
#include "tests/host/corvcim/Program.h"
#include "tests/support/UnionCopyingBroker.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::PropSystemManufacturer;
using Tarn::Inventory::TreeBuilder;
using namespace Tarn::NodeLexicon;

constexpr const char* provider = "CorvaneComputerSystemProvider";

class Companion : public testing::Test {
 protected:
  Companion() {
    setenv("CORVANE_LOG", "6000:none", 1);
    use(TreeBuilder().system().text(PropSystemModel, "DeskBox 2").text(PropSystemManufacturer, "Boxes Inc.").build());
  }

  /// The library reads its inventory once for each load.
  void use(const Tarn::Inventory::Tree& tree) {
    const std::string file = directory_.write("machine.json", Tarn::Inventory::writeJson(tree));
    setenv("CORVANE_INVENTORY", ("json:" + file).c_str(), 1);
    library_.emplace(COMPANION_LIBRARY);
  }

  CMPIInstanceMI* mi() { return library_->instanceMI(broker_, provider); }

  static ObjectPath classPath() { return {"", "root/test", "HALDA_ComputerSystem", {}}; }

  static ObjectPath systemPath(const std::string& name) {
    ObjectPath path = classPath();
    path.keys = {{"CreationClassName", Value::string("HALDA_ComputerSystem")}, {"Name", Value::string(name)}};
    return path;
  }

  Testing::Directory directory_;
  Broker broker_;
  std::optional<ProviderLibrary> library_;
};

std::vector<NamedValue> keys() {
  return {{"CreationClassName", Value::string("HALDA_ComputerSystem")}, {"Name", Value::string(Tarn::getSystemName())}};
}

TEST_F(Companion, InitializesEveryValueToTheEndOfItsUnion) {
  const Support::UnionCopyingBroker copying(broker_.handle());
  using CreateMI = CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
  const auto createMI = reinterpret_cast<CreateMI>(library_->find(std::string(provider) + "_Create_InstanceMI"));

  broker_.enumerateInstances(createMI(copying.handle(), nullptr, nullptr), classPath());

  EXPECT_GT(copying.copies(), 0U);
  EXPECT_EQ(copying.partialValues(), std::vector<std::string>());
}

TEST_F(Companion, TellsAboutTheSystem) {
  const Response response = broker_.enumerateInstances(mi(), classPath());

  std::vector<NamedValue> properties = keys();
  properties.push_back({"Caption", Value::string("Computer System")});
  properties.push_back({"Description", Value::string("The computer system that the processors belong to, with its "
                                                     "model, maker and state.")});
  properties.push_back({"ElementName", Value::string(Tarn::getSystemName())});
  properties.push_back({"Model", Value::string("DeskBox 2")});
  properties.push_back({"Manufacturer", Value::string("Boxes Inc.")});
  properties.push_back({"EnabledState", Value::uint16(2)});
  properties.push_back({"RequestedState", Value::uint16(12)});
  properties.push_back({"HealthState", Value::uint16(5)});
  properties.push_back({"OperationalStatus", Value::uint16Array({2})});
  ASSERT_TRUE(response.ok());
  ASSERT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.instances[0].properties, properties);
  EXPECT_EQ(response.instances[0].path.nameSpace, "root/test");
  EXPECT_EQ(response.doneCalls, 1U);
}

TEST_F(Companion, NamesTheSystem) {
  const Response response = broker_.enumerateInstanceNames(mi(), classPath());

  ASSERT_EQ(response.paths.size(), 1U);
  EXPECT_TRUE(namesSameInstance(response.paths[0], systemPath(Tarn::getSystemName())));
  EXPECT_EQ(response.paths[0].host, Tarn::getSystemName());
  EXPECT_EQ(response.doneCalls, 1U);
}

TEST_F(Companion, KeepsToThePropertyList) {
  const Response response = broker_.enumerateInstances(mi(), classPath(), std::vector<std::string>{"healthSTATE"});

  std::vector<NamedValue> properties = keys();
  properties.push_back({"HealthState", Value::uint16(5)});
  ASSERT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.instances[0].properties, properties);
  EXPECT_EQ(broker_.enumerateInstances(mi(), classPath(), std::vector<std::string>{}).instances.at(0).properties,
            keys());
}

TEST_F(Companion, GetsTheSystemByItsKeys) {
  const Response response = broker_.getInstance(mi(), systemPath(Tarn::getSystemName()));

  ASSERT_TRUE(response.ok());
  EXPECT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.doneCalls, 1U);
}

TEST_F(Companion, FindsNoOtherSystem) {
  const Response response = broker_.getInstance(mi(), systemPath("another"));

  EXPECT_EQ(response.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(response.message,
            "no system has CreationClassName \"HALDA_ComputerSystem\" and Name \"another\"; this "
            "machine is \"" +
                Tarn::getSystemName() + '"');
  EXPECT_TRUE(response.instances.empty());
}

TEST_F(Companion, NeedsBothKeys) {
  ObjectPath path = systemPath(Tarn::getSystemName());
  path.keys.pop_back();

  const Response response = broker_.getInstance(mi(), path);

  EXPECT_EQ(response.rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(response.message, "the path of a computer system needs the keys CreationClassName and Name");
}

TEST_F(Companion, StatesAreThoseOfTheInventory) {
  use(TreeBuilder().system().status(Tarn::Inventory::Status::failed).build());

  const Response response = broker_.enumerateInstances(
      mi(), classPath(), std::vector<std::string>{"EnabledState", "HealthState", "OperationalStatus", "Model"});

  std::vector<NamedValue> properties = keys();
  properties.push_back({"EnabledState", Value::uint16(2)});
  properties.push_back({"HealthState", Value::uint16(25)});
  properties.push_back({"OperationalStatus", Value::uint16Array({6})});
  EXPECT_EQ(response.instances.at(0).properties, properties);
}

TEST_F(Companion, AMachineWithoutASystemNodeHasANameAndUnknownStates) {
  use(TreeBuilder().processor("P0").build());

  const Response response = broker_.enumerateInstances(mi(), classPath(), std::vector<std::string>{"EnabledState"});

  EXPECT_EQ(response.instances.at(0).properties.back(), (NamedValue{"EnabledState", Value::uint16(0)}));
}

TEST_F(Companion, AnInventoryThatCanNotBeReadIsAStatus) {
  setenv("CORVANE_INVENTORY", "json:/nowhere.json", 1);
  library_.emplace(COMPANION_LIBRARY);

  const Response response = broker_.enumerateInstances(mi(), classPath());

  EXPECT_EQ(response.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(response.message,
            "cannot read the inventory: /nowhere.json: no such file or directory; name a file that "
            "holds an inventory as JSON");
}

TEST_F(Companion, ABrokerThatRefusesGivesAFailureAndNothingElse) {
  for (const char* service : {"newObjectPath", "newInstance"}) {
    broker_.failNth(service, 1);

    const Response response = broker_.enumerateInstances(mi(), classPath());

    EXPECT_EQ(response.rc, CMPI_RC_ERR_FAILED) << service;
    EXPECT_TRUE(response.instances.empty()) << service;
  }
}

// Some brokers say that they made nothing with an object that has no handle, and no other word.
const Failure silentRefusals[] = {
    {.result = FailureResult::Null, .rc = CMPI_RC_OK, .message = ""},
    {.result = FailureResult::HandleLess, .rc = CMPI_RC_OK, .message = ""},
};

TEST_F(Companion, ABrokerThatRefusesSilentlyGivesAFailureAndNothingElse) {
  broker_.services().record(true);
  for (const Failure& refusal : silentRefusals) {
    for (const char* service : {"newObjectPath", "newInstance"}) {
      broker_.failNth(service, 1, refusal);
      static_cast<void>(broker_.services().takeRecord());

      const Response response = broker_.enumerateInstances(mi(), classPath());

      EXPECT_EQ(response.rc, CMPI_RC_ERR_FAILED) << service;
      EXPECT_TRUE(response.instances.empty()) << service;
      EXPECT_EQ(broker_.services().takeRecord().back().service, service);
    }
  }
}

TEST_F(Companion, AnArrayThatCanNotBeMadeLeavesItsPropertyOut) {
  for (const Failure& refusal : {silentRefusals[0], silentRefusals[1], Failure()}) {
    broker_.failNth("newArray", 1, refusal);
    broker_.services().resetCounts();

    const Response response = broker_.enumerateInstances(mi(), classPath());

    ASSERT_EQ(response.instances.size(), 1U);
    EXPECT_EQ(response.instances[0].property("OperationalStatus"), nullptr);
    EXPECT_EQ(broker_.callCount("setElementAt"), 0U);
  }
}

TEST_F(Companion, ARequestWithoutNamespaceIsAnswered) {
  for (const Failure& refusal : silentRefusals) {
    broker_.failNth("getNameSpace", 1, refusal);

    const Response response = broker_.enumerateInstances(mi(), classPath());

    ASSERT_EQ(response.instances.size(), 1U);
    EXPECT_EQ(response.instances[0].path.nameSpace, "");
  }
}

TEST_F(Companion, AKeyWithoutAStringIsMissing) {
  for (const Failure& refusal : silentRefusals) {
    for (const unsigned int key : {1U, 2U}) {
      broker_.failNth("getKey", key, refusal);

      const Response response = broker_.getInstance(mi(), systemPath(Tarn::getSystemName()));

      EXPECT_EQ(response.rc, CMPI_RC_ERR_INVALID_PARAMETER);
    }
  }
}

// Minimal brokers leave the type of a string open, others deliver it in the state of a null value.
TEST_F(Companion, StringWithoutItsTypeInTheStateOfANullValueIsAKey) {
  Request request(broker_, "root/test");
  CMPIObjectPathFT table = objectPathOperations;
  table.getKey = [](const CMPIObjectPath* self, const char* name, CMPIStatus* status) {
    CMPIData key = objectPathOperations.getKey(self, name, status);
    key.type = CMPI_null;
    key.state = CMPI_nullValue;
    return key;
  };
  CMPIObjectPath* path = request.objectPath(systemPath(Tarn::getSystemName()));
  path->ft = &table;
  CMPIInstanceMI* instances = mi();

  const CMPIStatus status = instances->ft->getInstance(instances, request.context(), request.result(), path, nullptr);

  EXPECT_EQ(status.rc, CMPI_RC_OK);
  EXPECT_EQ(request.response(status).instances.size(), 1U);
}

/// A broker whose threads may end while they make an instance.
CMPIInstance* endThread(const CMPIBroker* /*broker*/, const CMPIObjectPath* /*path*/, CMPIStatus* /*status*/) {
  pthread_exit(nullptr);
}

// Brokers that end a worker by cancelling it unwind through the library.
TEST_F(Companion, AThreadThatEndsInsideLeavesTheLibraryUsable) {
#if defined(__SANITIZE_THREAD__) || defined(__SANITIZE_ADDRESS__)
  GTEST_SKIP() << "sanitizers do not follow a forced unwinding";
#endif
  CMPIBroker record = *broker_.handle();
  CMPIBrokerEncFT services = *record.eft;
  services.newInstance = endThread;
  record.eft = &services;
  const auto create = reinterpret_cast<CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*)>(
      library_->find(std::string(provider) + "_Create_InstanceMI"));
  CMPIInstanceMI* instances = create(&record, nullptr, nullptr);
  bool returned = false;
  std::thread cancelled([&] {
    broker_.enumerateInstances(instances, classPath());
    returned = true;
  });
  cancelled.join();

  EXPECT_FALSE(returned);
  EXPECT_EQ(broker_.enumerateInstances(mi(), classPath()).instances.size(), 1U);
}

TEST_F(Companion, RefusesEveryChange) {
  const Request request(broker_);
  CMPIInstanceMI* instances = mi();
  const CMPIInstanceMIFT* functions = instances->ft;

  EXPECT_EQ(functions->createInstance(instances, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(functions->modifyInstance(instances, nullptr, nullptr, nullptr, nullptr, nullptr).rc,
            CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(functions->deleteInstance(instances, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(functions->execQuery(instances, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(functions->cleanup(instances, nullptr, 1).rc, CMPI_RC_OK);
  EXPECT_STREQ(functions->miName, "instanceCorvaneComputerSystemProvider");
}

TEST_F(Companion, LeavesNothingBehind) {
  broker_.enumerateInstances(mi(), classPath());

  EXPECT_EQ(broker_.liveObjects(), 0U);
}

TEST_F(Companion, IsGoneAfterItsLastUse) {
  broker_.enumerateInstances(mi(), classPath());
  library_.reset();

  EXPECT_EQ(dlopen(COMPANION_LIBRARY, RTLD_NOW | RTLD_NOLOAD), nullptr);
}

}  // namespace
}  // namespace Corvcim
