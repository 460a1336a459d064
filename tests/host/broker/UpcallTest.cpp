#include <cmpimacs.h>
#include <gtest/gtest.h>

#include <stdexcept>

#include "host/broker/Broker.h"
#include "host/broker/Request.h"
#include "tests/host/broker/ScriptedProvider.h"

namespace Corvcim {
namespace {

Instance computerSystem(std::string_view name) {
  return makeInstance("root/cimv2", "HALDA_ComputerSystem",
                      {{"CreationClassName", Value::string("HALDA_ComputerSystem")}, {"Name", Value::string(name)}});
}

class Upcall : public testing::Test {
 protected:
  const CMPIBroker* mb() { return broker_.handle(); }
  const CMPIContext* context() { return request_.context(); }
  CMPIObjectPath* systemClass() { return CMNewObjectPath(mb(), "root/cimv2", "HALDA_ComputerSystem", nullptr); }
  std::string message() { return textOf(status_.msg); }

  std::vector<std::string> names(CMPIEnumeration* enumeration) {
    std::vector<std::string> result;
    while (CMHasNext(enumeration, nullptr) != 0) {
      const CMPIData data = CMGetNext(enumeration, nullptr);
      const ObjectPath path = data.type == CMPI_ref ? valueOf(data.value.ref) : valueOf(data.value.inst).path;
      result.push_back(path.key("Name")->asString());
    }
    return result;
  }

  Broker broker_;
  Request request_{broker_};
  CMPIStatus status_ = {CMPI_RC_ERROR, nullptr};
};

}  // namespace

TEST_F(Upcall, ForAClassThatNobodyServesIsEmptyAndOk) {
  CMPIEnumeration* instances = CBEnumInstances(mb(), context(), systemClass(), nullptr, &status_);

  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_TRUE(names(instances).empty());
  EXPECT_EQ(CBGetInstance(mb(), context(), systemClass(), nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NOT_FOUND);
}

TEST_F(Upcall, GetsScriptedInstancesAndTheirNames) {
  broker_.serveInstances("HALDA_ComputerSystem", {computerSystem("a"), computerSystem("b")});

  EXPECT_EQ(names(CBEnumInstances(mb(), context(), systemClass(), nullptr, &status_)),
            (std::vector<std::string>{"a", "b"}));
  EXPECT_EQ(status_.rc, CMPI_RC_OK);
  EXPECT_EQ(names(CBEnumInstanceNames(mb(), context(), systemClass(), &status_)), (std::vector<std::string>{"a", "b"}));
  EXPECT_EQ(status_.rc, CMPI_RC_OK);
}

TEST_F(Upcall, ForAnAncestorReachesTheClass) {
  broker_.serveInstances("HALDA_ComputerSystem", {computerSystem("a")});
  CMPIObjectPath* path = CMNewObjectPath(mb(), "root/cimv2", "cim_computersystem", nullptr);

  EXPECT_EQ(names(CBEnumInstanceNames(mb(), context(), path, &status_)), (std::vector<std::string>{"a"}));
}

TEST_F(Upcall, EnumerationEndsAndBecomesAnArray) {
  broker_.serveInstances("HALDA_ComputerSystem", {computerSystem("a")});
  CMPIEnumeration* enumeration = CBEnumInstances(mb(), context(), systemClass(), nullptr, nullptr);

  CMPIArray* array = CMToArray(enumeration, &status_);
  EXPECT_EQ(CMGetArrayCount(array, nullptr), 1U);
  EXPECT_EQ(CMGetArrayType(array, nullptr), CMPI_instance);
  EXPECT_EQ(valueOf(CMGetArrayElementAt(array, 0, nullptr).value.inst), computerSystem("a"));
  CMGetNext(enumeration, nullptr);
  EXPECT_EQ(CMGetNext(enumeration, &status_).state, CMPI_notFound);
  EXPECT_EQ(status_.rc, CMPI_RC_NO_MORE_ELEMENTS);
}

TEST_F(Upcall, GetsOneInstanceAndOneProperty) {
  broker_.serveInstances("HALDA_ComputerSystem", {computerSystem("a"), computerSystem("b")});
  CMPIObjectPath* path = request_.objectPath(computerSystem("b").path);

  EXPECT_EQ(valueOf(CBGetInstance(mb(), context(), path, nullptr, &status_)), computerSystem("b"));
  EXPECT_EQ(textOf(CBGetProperty(mb(), context(), path, "name", &status_).value.string), "b");
  EXPECT_EQ(CBGetProperty(mb(), context(), path, "Model", &status_).state, CMPI_notFound);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_NO_SUCH_PROPERTY);
}

TEST_F(Upcall, FailureIsNullWithTheStatus) {
  broker_.serveFailure("HALDA_ComputerSystem", CMPI_RC_ERR_ACCESS_DENIED, "no");

  EXPECT_EQ(CBEnumInstances(mb(), context(), systemClass(), nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(message(), "no");
}

TEST_F(Upcall, FailureMayComeWithAnEnumeration) {
  broker_.serveFailure("HALDA_ComputerSystem", CMPI_RC_ERR_ACCESS_DENIED, "no", true);

  EXPECT_NE(CBEnumInstanceNames(mb(), context(), systemClass(), &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(message(), "no");
}

TEST_F(Upcall, HandlersExceptionIsAFailure) {
  broker_.serve("HALDA_ComputerSystem", [](const Operation&) -> UpcallReply { throw std::runtime_error("broken"); });

  EXPECT_EQ(CBEnumInstances(mb(), context(), systemClass(), nullptr, &status_), nullptr);
  EXPECT_EQ(status_.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(message(), "broken");
}

TEST_F(Upcall, HandlerSeesTheWholeOperation) {
  std::vector<Operation> seen;
  broker_.serveOthers([&seen](const Operation& operation) {
    seen.push_back(operation);
    return UpcallReply{};
  });
  const char* properties[] = {"Name", nullptr};
  const ObjectPath path = {{}, "root/cimv2", "HALDA_ComputerSystem", {}};

  CBEnumInstances(mb(), context(), systemClass(), properties, nullptr);
  CBAssociators(mb(), context(), systemClass(), "a", nullptr, "r", nullptr, nullptr, nullptr);
  CBAssociatorNames(mb(), context(), systemClass(), nullptr, "c", nullptr, "s", nullptr);
  CBReferences(mb(), context(), systemClass(), "c", "r", properties, nullptr);
  CBReferenceNames(mb(), context(), systemClass(), nullptr, nullptr, nullptr);

  EXPECT_EQ(seen, (std::vector<Operation>{
                      {OperationKind::EnumerateInstances, path, PropertyList({"Name"}), {}},
                      {OperationKind::Associators, path, {}, {"a", {}, "r", {}}},
                      {OperationKind::AssociatorNames, path, {}, {{}, "c", {}, "s"}},
                      {OperationKind::References, path, PropertyList({"Name"}), {{}, "c", "r", {}}},
                      {OperationKind::ReferenceNames, path, {}, {}},
                  }));
}

TEST_F(Upcall, MayRunAnotherProviderOfTheSameBroker) {
  ScriptedProvider inner([this](const ProviderCall& call) {
    CMPIInstance* instance = CMNewInstance(mb(), call.path, nullptr);
    CMSetProperty(instance, "Name", "inner", CMPI_chars);
    CMReturnInstance(call.result, instance);
    return CMPIStatus{CMPI_RC_OK, nullptr};
  });
  broker_.serve("HALDA_ComputerSystem", [&](const Operation& operation) {
    return UpcallReply{broker_.perform(inner.instanceMI(), operation), false};
  });

  EXPECT_EQ(names(CBEnumInstances(mb(), context(), systemClass(), nullptr, nullptr)),
            (std::vector<std::string>{"inner"}));
}

}  // namespace Corvcim
