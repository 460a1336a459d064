#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host/broker/Request.h"
#include "tests/support/ProviderTest.h"

namespace {

using Corvcim::Request;
using Scripted::inventory;
using Support::answered;
using Support::processorPath;
using Support::ProviderFunctions;

std::string prefixOf(const ::testing::TestParamInfo<ProviderFunctions>& tested) {
  return tested.param.prefix;
}

/// One registered provider, whichever of the nine.
class Frame : public Support::ProviderTest, public ::testing::WithParamInterface<ProviderFunctions> {
 protected:
  const ProviderFunctions& provider() const { return GetParam(); }
  CMPIInstanceMI* mi() { return instanceMI(provider().className); }

  void expectNothingHappened(const Request& request, const CMPIStatus& status) {
    EXPECT_EQ(request.response(status).instances.size(), 0U);
    EXPECT_EQ(request.response(status).paths.size(), 0U);
    EXPECT_EQ(request.response(status).doneCalls, 0U);
    EXPECT_EQ(broker.services().totalCount(), 0U);
    EXPECT_EQ(Scripted::takeMessages().size(), 0U);
    EXPECT_EQ(inventory().calls(), std::vector<std::string>());
  }
};

INSTANTIATE_TEST_SUITE_P(OfEachProvider, Frame, ::testing::ValuesIn(Support::providerFunctions()), prefixOf);

TEST_P(Frame, FactoryFunctionAnswersAStaticInterfaceOfVersion200) {
  const CMPIInstanceMI* interface = mi();
  ASSERT_NE(interface, nullptr);
  EXPECT_EQ(interface->hdl, nullptr);
  ASSERT_NE(interface->ft, nullptr);
  EXPECT_EQ(interface->ft->ftVersion, 200);
  EXPECT_EQ(interface->ft->miVersion, 200);
  EXPECT_STREQ(interface->ft->miName, provider().instanceMIName().c_str());
  EXPECT_EQ(mi(), interface);
}

TEST_P(Frame, FactoryFunctionDoesNothingElse) {
  CMPIStatus status = {CMPI_RC_ERR_ACCESS_DENIED, nullptr};
  const Request request(broker);
  provider().createInstanceMI(broker.handle(), request.context(), &status);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(status.msg, nullptr);
  expectNothingHappened(request, status);
}

TEST_P(Frame, FactoryFunctionTakesAnyArguments) {
  EXPECT_EQ(provider().createInstanceMI(nullptr, nullptr, nullptr), mi());
}

TEST_P(Frame, InstanceTableHasEveryOperation) {
  const CMPIInstanceMIFT& table = *mi()->ft;
  EXPECT_NE(table.cleanup, nullptr);
  EXPECT_NE(table.enumerateInstanceNames, nullptr);
  EXPECT_NE(table.enumerateInstances, nullptr);
  EXPECT_NE(table.getInstance, nullptr);
  EXPECT_NE(table.createInstance, nullptr);
  EXPECT_NE(table.modifyInstance, nullptr);
  EXPECT_NE(table.deleteInstance, nullptr);
  EXPECT_NE(table.execQuery, nullptr);
}

// Each slot holds the operation of its name: the operations say in the log who they are.
TEST_P(Frame, InstanceTableIsInOrder) {
  Request request(broker, Support::testNameSpace);
  const CMPIObjectPath* path = request.objectPath(Support::classPath(provider().className));
  const CMPIInstanceMIFT& table = *mi()->ft;
  const auto firstText = [] { return Scripted::takeMessages().at(2).text; };
  const auto entering = [&](const std::string& operation) {
    return "ENTERING: " + provider().prefix + "_" + operation + "() in " + provider().file;
  };

  table.enumerateInstanceNames(mi(), request.context(), request.result(), path);
  EXPECT_EQ(firstText().find(entering("EnumInstanceNames")), 0U);
  table.enumerateInstances(mi(), request.context(), request.result(), path, nullptr);
  EXPECT_EQ(firstText().find(entering("EnumInstances")), 0U);
  table.getInstance(mi(), request.context(), request.result(), path, nullptr);
  EXPECT_EQ(firstText().find(entering("GetInstance")), 0U);
}

TEST_P(Frame, CleanupSucceedsAndReleasesNothing) {
  inventory().processor("cpu0").core("core0").cache("cache0");
  enumerateInstances(provider().className);
  const auto again = enumerateInstances(provider().className);
  CMPIAssociationMI* association =
      provider().createAssociationMI != nullptr ? associationMI(provider().className) : nullptr;
  forgetTraces();

  for (const CMPIBoolean terminating : {CMPIBoolean{0}, CMPIBoolean{1}}) {
    const Request request(broker);
    std::vector<CMPIStatus> statuses = {mi()->ft->cleanup(mi(), request.context(), terminating)};
    if (association != nullptr) {
      statuses.push_back(association->ft->cleanup(association, request.context(), terminating));
    }
    for (const CMPIStatus& status : statuses) {
      EXPECT_EQ(status.rc, CMPI_RC_OK);
      EXPECT_EQ(status.msg, nullptr);
      expectNothingHappened(request, status);
    }
  }

  // The other associations ask the inventory anew for what belongs together.
  inventory().reset();
  if (association == nullptr || provider().className == "HALDA_CPUElementCapabilities") {
    EXPECT_EQ(again.instances.size(), 1U);
    EXPECT_EQ(enumerateInstances(provider().className), again);
    EXPECT_EQ(inventory().calls(), std::vector<std::string>());
  }
}

TEST_P(Frame, RefusesToCreateModifyDeleteAndQuery) {
  Request request(broker, Support::testNameSpace);
  const CMPIObjectPath* path = request.objectPath(processorPath("cpu0"));
  const CMPIInstance* instance = request.instance(Support::systemInstance("system"));
  const char* noProperties[] = {nullptr};
  const CMPIInstanceMIFT& table = *mi()->ft;
  const CMPIStatus refusals[] = {
      table.createInstance(mi(), request.context(), request.result(), path, instance),
      table.modifyInstance(mi(), request.context(), request.result(), path, instance, noProperties),
      table.deleteInstance(mi(), request.context(), request.result(), path),
      table.execQuery(mi(), request.context(), request.result(), path, "SELECT * FROM CIM_Processor", "WQL"),
  };
  for (const CMPIStatus& status : refusals) {
    EXPECT_EQ(status.rc, CMPI_RC_ERR_NOT_SUPPORTED);
    EXPECT_EQ(status.msg, nullptr);
    expectNothingHappened(request, status);
  }
}

TEST_P(Frame, RefusedOperationsDoNotLookAtTheirArguments) {
  const CMPIInstanceMIFT& table = *mi()->ft;
  EXPECT_EQ(table.cleanup(nullptr, nullptr, 0).rc, CMPI_RC_OK);
  EXPECT_EQ(table.createInstance(nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(table.modifyInstance(nullptr, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(table.deleteInstance(nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(table.execQuery(nullptr, nullptr, nullptr, nullptr, nullptr, nullptr).rc, CMPI_RC_ERR_NOT_SUPPORTED);
}

/// The association half of the five providers that have one.
class AssociationFrame : public Frame {
 protected:
  CMPIAssociationMI* association() { return associationMI(provider().className); }
};

std::vector<ProviderFunctions> associationProviders() {
  std::vector<ProviderFunctions> result;
  for (const ProviderFunctions& each : Support::providerFunctions()) {
    if (each.createAssociationMI != nullptr) {
      result.push_back(each);
    }
  }
  return result;
}

INSTANTIATE_TEST_SUITE_P(OfEachAssociation, AssociationFrame, ::testing::ValuesIn(associationProviders()), prefixOf);

TEST_P(AssociationFrame, FactoryFunctionAnswersAStaticInterfaceOfVersion200) {
  const CMPIAssociationMI* interface = association();
  ASSERT_NE(interface, nullptr);
  EXPECT_EQ(interface->hdl, nullptr);
  ASSERT_NE(interface->ft, nullptr);
  EXPECT_EQ(interface->ft->ftVersion, 200);
  EXPECT_EQ(interface->ft->miVersion, 200);
  EXPECT_STREQ(interface->ft->miName, provider().associationMIName().c_str());
  EXPECT_EQ(association(), interface);
}

TEST_P(AssociationFrame, FactoryFunctionDoesNothingElse) {
  CMPIStatus status = {CMPI_RC_ERR_ACCESS_DENIED, nullptr};
  const Request request(broker);
  provider().createAssociationMI(broker.handle(), request.context(), &status);
  EXPECT_EQ(status.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(status.msg, nullptr);
  expectNothingHappened(request, status);
}

TEST_P(AssociationFrame, CleanupSucceedsAndDoesNotLookAtItsArguments) {
  const CMPIStatus status = association()->ft->cleanup(nullptr, nullptr, 1);
  EXPECT_EQ(status.rc, CMPI_RC_OK);
  EXPECT_EQ(status.msg, nullptr);
  expectNothingHappened(Request(broker), status);
}

TEST_P(AssociationFrame, AssociationTableIsInOrder) {
  Request request(broker, Support::testNameSpace);
  const CMPIObjectPath* path = request.objectPath(Support::classPath("HALDA_Unrelated"));
  const CMPIAssociationMIFT& table = *association()->ft;
  ASSERT_NE(table.associators, nullptr);
  ASSERT_NE(table.associatorNames, nullptr);
  ASSERT_NE(table.references, nullptr);
  ASSERT_NE(table.referenceNames, nullptr);
  const auto firstText = [] { return Scripted::takeMessages().at(2).text; };
  const auto entering = [&](const std::string& operation) {
    return "ENTERING: " + provider().prefix + "_" + operation + "() in " + provider().file;
  };
  const auto context = request.context();
  const auto result = request.result();

  table.associators(association(), context, result, path, "X", nullptr, nullptr, nullptr, nullptr);
  EXPECT_EQ(firstText().find(entering("Associators")), 0U);
  table.associatorNames(association(), context, result, path, "X", nullptr, nullptr, nullptr);
  EXPECT_EQ(firstText().find(entering("AssociatorNames")), 0U);
  table.references(association(), context, result, path, nullptr, nullptr, nullptr);
  EXPECT_EQ(firstText().find(entering("References")), 0U);
  table.referenceNames(association(), context, result, path, nullptr, nullptr);
  EXPECT_EQ(firstText().find(entering("ReferenceNames")), 0U);
}

// Without a broker the message of a failure stays NULL; that shows which broker an operation uses.
TEST_P(AssociationFrame, BothFactoryFunctionsStoreTheSameBroker) {
  const auto messageOfAFailure = [&](CMPIInstanceMI* interface) {
    Request request(broker, Support::testNameSpace);
    const CMPIObjectPath* keyless = request.objectPath(Support::classPath(provider().className));
    return interface->ft->getInstance(interface, request.context(), request.result(), keyless, nullptr).msg;
  };

  CMPIInstanceMI* interface = mi();
  provider().createAssociationMI(nullptr, nullptr, nullptr);
  EXPECT_EQ(messageOfAFailure(interface), nullptr);
  association();
  EXPECT_NE(messageOfAFailure(interface), nullptr);
  provider().createInstanceMI(nullptr, nullptr, nullptr);
  EXPECT_EQ(messageOfAFailure(interface), nullptr);
}

}  // namespace
