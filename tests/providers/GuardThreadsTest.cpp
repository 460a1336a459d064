// Sixteen threads on a fresh library, from the very first request on. The same test runs on the scripted
// platform and on the real one.

#include <gtest/gtest.h>

#include <barrier>
#include <map>
#include <string>
#include <thread>
#include <vector>

#include "host/broker/Broker.h"
#include "tests/providers/ThreadsMachine.h"
#include "tests/support/ProviderFunctions.h"

namespace {

using Corvcim::Instance;
using Corvcim::ObjectPath;
using Corvcim::Operation;
using Corvcim::OperationKind;
using Corvcim::Response;

constexpr unsigned int threadCount = 16;

/// Serves while cores are unknown only, so its answers depend on what was asked before.
const std::string dependsOnCores = "HALDA_CPUAssociatedCacheMemory";

using Answers = std::map<std::string, Response>;

/// Enumerates everything, beginning with another class in each thread.
Answers enumerateEverything(Corvcim::Broker& broker, unsigned int first) {
  const auto& providers = Support::providerFunctions();
  Answers answers;
  for (std::size_t i = 0; i < providers.size(); ++i) {
    const Support::ProviderFunctions& provider = providers[(first + i) % providers.size()];
    CMPIInstanceMI* mi = provider.createInstanceMI(broker.handle(), nullptr, nullptr);
    const ObjectPath path{"", "root/test", provider.className, {}};
    answers[provider.className] = broker.enumerateInstances(mi, path);
    answers[provider.className + " names"] = broker.enumerateInstanceNames(mi, path);
  }
  return answers;
}

/// From the first processor to its caches or cores, by each association that has a far end for it.
Answers navigateEverywhere(Corvcim::Broker& broker, const ObjectPath& processor) {
  Answers answers;
  for (const Support::ProviderFunctions& provider : Support::providerFunctions()) {
    if (provider.createAssociationMI == nullptr || provider.className == dependsOnCores ||
        provider.className == "HALDA_CPUCoreAssociatedCacheMemory") {
      continue;
    }
    CMPIAssociationMI* mi = provider.createAssociationMI(broker.handle(), nullptr, nullptr);
    Corvcim::AssociationFilter filter;
    filter.assocClass = provider.className;
    for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                     OperationKind::References, OperationKind::ReferenceNames}) {
      answers[provider.className + " " + std::string(Corvcim::operationName(kind))] =
          broker.perform(mi, Operation{kind, processor, {}, filter});
    }
  }
  return answers;
}

TEST(GuardThreads, SixteenThreadsOnAFreshLibraryGetRightAnswers) {
  ThreadsMachine::prepare();
  Corvcim::Broker broker;
  broker.serveInstances("HALDA_ComputerSystem",
                        {Corvcim::makeInstance("root/test", "HALDA_ComputerSystem",
                                               {{"CreationClassName", Corvcim::Value::string("HALDA_ComputerSystem")},
                                                {"Name", Corvcim::Value::string("system")}})});

  std::vector<Answers> answers(threadCount);
  std::vector<Answers> navigations(threadCount);
  std::barrier start(threadCount);
  std::vector<std::thread> threads;
  for (unsigned int i = 0; i < threadCount; ++i) {
    threads.emplace_back([&, i] {
      start.arrive_and_wait();
      answers[i] = enumerateEverything(broker, i);
      const auto& processors = answers[i]["HALDA_CPUProcessor names"].paths;
      if (!processors.empty()) {
        navigations[i] = navigateEverywhere(broker, processors.front());
      }
    });
  }
  for (std::thread& each : threads) {
    each.join();
  }

  Answers expected = enumerateEverything(broker, 0);
  EXPECT_EQ(expected["HALDA_CPUProcessor"].instances.size(), ThreadsMachine::processors);
  EXPECT_EQ(expected["HALDA_CPUProcessorCore"].instances.size(), ThreadsMachine::cores);
  EXPECT_EQ(expected["HALDA_CPUMemory"].instances.size(), ThreadsMachine::caches);
  const Answers expectedNavigations = navigateEverywhere(broker, expected["HALDA_CPUProcessor names"].paths.at(0));
  for (unsigned int i = 0; i < threadCount; ++i) {
    for (const std::string& key : {dependsOnCores, dependsOnCores + " names"}) {
      const Response& answer = answers[i][key];
      const std::size_t results = answer.instances.size() + answer.paths.size();
      EXPECT_EQ(answer.rc, CMPI_RC_OK);
      EXPECT_TRUE(results == 0 || results == ThreadsMachine::caches) << results;
      answers[i].erase(key);
    }
  }
  expected.erase(dependsOnCores);
  expected.erase(dependsOnCores + " names");
  for (unsigned int i = 0; i < threadCount; ++i) {
    EXPECT_EQ(answers[i], expected) << "thread " << i;
    EXPECT_EQ(navigations[i], expectedNavigations) << "thread " << i;
  }
  EXPECT_EQ(broker.liveObjects(), 0U);
}

}  // namespace
