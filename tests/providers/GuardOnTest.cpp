// The build with CORVANE_BROKER_GUARD: one request at a time, and no exception leaves.

#include <pthread.h>

#include <future>
#include <optional>

#include "tests/providers/GuardTest.h"

namespace {

using Corvcim::Operation;
using Corvcim::OperationKind;
using Corvcim::Response;
using Guards::Meeting;
using Support::classPath;
using Support::processorPath;

class GuardOn : public Guards::GuardTest {
 protected:
  Response enumerateProcessors() {
    return broker.enumerateInstances(hookedMI("HALDA_CPUProcessor"), classPath("HALDA_CPUProcessor"));
  }

  /// Every operation of every provider that has to make an object, once.
  template <class Check>
  void performEverything(Check check) {
    for (const Support::ProviderFunctions& provider : Support::providerFunctions()) {
      Support::forgetInventory();  // the cores, which the processor-cache association does not bear
      CMPIInstanceMI* mi = hookedMI(provider.className);
      Corvcim::ObjectPath path = classPath(provider.className);
      check(broker.enumerateInstances(mi, path));
      check(broker.enumerateInstanceNames(mi, path));
      path.keys = {Support::textKey("Other", "x")};
      check(broker.getInstance(mi, path));
      if (provider.createAssociationMI == nullptr) {
        continue;
      }
      Corvcim::AssociationFilter filter;
      filter.assocClass = provider.className;
      for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                       OperationKind::References, OperationKind::ReferenceNames}) {
        const auto source = provider.className == "HALDA_CPUCoreAssociatedCacheMemory" ? Support::cachePath("cache0")
                                                                                       : processorPath("cpu0");
        check(broker.perform(hookedAssociationMI(provider.className), Operation{kind, source, {}, filter}));
      }
    }
  }
};

TEST_F(GuardOn, AnExceptionBecomesAFailureWithItsText) {
  hooked.hook = [] { throw std::runtime_error("out of objects"); };
  unsigned int requests = 0;
  performEverything([&](const Response& response) {
    ++requests;
    EXPECT_EQ(Support::outcome(response), "CMPI_RC_ERR_FAILED |out of objects| not done");
  });
  EXPECT_EQ(requests, 9U * 3 + 5U * 4);
}

TEST_F(GuardOn, AnythingElseThatIsThrownBecomesAFailure) {
  hooked.hook = [] { throw 7; };
  performEverything([](const Response& response) {
    EXPECT_EQ(response.rc, CMPI_RC_ERR_FAILED);
    EXPECT_TRUE(response.message.has_value());
  });
}

TEST_F(GuardOn, AFailedRequestDoesNotKeepTheLibrary) {
  const Response before = enumerateProcessors();
  hooked.hook = [] { throw std::runtime_error("out of objects"); };
  EXPECT_EQ(enumerateProcessors().rc, CMPI_RC_ERR_FAILED);
  hooked.hook = nullptr;
  EXPECT_EQ(enumerateProcessors(), before);
}

TEST_F(GuardOn, TwoThreadsNeverMeetInsideTheLibrary) {
  Meeting meeting;
  enumerateInTwoThreads(meeting, Guards::shortWhile);
  EXPECT_EQ(meeting.arrivals(), 4U);
  EXPECT_FALSE(meeting.met());
}

TEST_F(GuardOn, AnUpCallMayBringAnotherRequestInAnotherThread) {
  unsigned int upCalls = 0;
  broker.serve("HALDA_ComputerSystem", [&](const Operation& operation) {
    ++upCalls;
    auto processors = std::async(std::launch::async, [&] { return enumerateInstances("HALDA_CPUProcessor"); });
    EXPECT_EQ(processors.wait_for(Guards::longEnough), std::future_status::ready) << "the library is locked";
    EXPECT_EQ(processors.get().instances.size(), 1U);
    const auto system = Support::systemInstance("system");
    Corvcim::UpcallReply reply;
    if (operation.kind == OperationKind::EnumerateInstances) {
      reply.response.instances = {system};
    } else {
      reply.response.paths = {system.path};
    }
    return reply;
  });
  EXPECT_EQ(enumerateInstances("HALDA_CPUSystemDevice").instances.size(), 1U);
  Corvcim::AssociationFilter filter;
  filter.assocClass = "HALDA_CPUSystemDevice";
  for (const OperationKind kind : {OperationKind::Associators, OperationKind::AssociatorNames,
                                   OperationKind::References, OperationKind::ReferenceNames}) {
    const Response response = associate("HALDA_CPUSystemDevice", kind, processorPath("cpu0"), filter);
    EXPECT_EQ(response.instances.size() + response.paths.size(), 1U);
  }
  EXPECT_EQ(upCalls, 5U);
}

TEST_F(GuardOn, TheLibraryIsHeldAgainAfterAnUpCall) {
  CMPIInstanceMI* processors = hookedMI("HALDA_CPUProcessor");
  CMPIInstanceMI* systemDevice = hookedMI("HALDA_CPUSystemDevice");
  Meeting meeting;
  std::atomic<bool> upCallDone = false;
  broker.serve("HALDA_ComputerSystem", [&](const Operation&) {
    upCallDone = true;
    Corvcim::UpcallReply reply;
    reply.response.paths = {Support::systemPath("system")};
    return reply;
  });
  std::optional<std::thread> other;
  hooked.hook = [&] {
    if (!upCallDone) {
      return;
    }
    if (!other) {
      other.emplace([&] { broker.enumerateInstances(processors, classPath("HALDA_CPUProcessor")); });
    }
    meeting.waitForAnother(Guards::shortWhile);
  };
  EXPECT_EQ(broker.enumerateInstances(systemDevice, classPath("HALDA_CPUSystemDevice")).instances.size(), 1U);
  ASSERT_TRUE(other.has_value());
  other->join();
  EXPECT_FALSE(meeting.met());
}

TEST_F(GuardOn, ARegistrationDoesNotDisturbARunningRequest) {
  CMPIInstanceMI* mi = hookedMI("HALDA_CPUProcessor");
  std::optional<std::future<CMPIInstanceMI*>> registration;
  hooked.hook = [&] {
    if (!registration) {
      registration = std::async(std::launch::async, [&] { return hookedMI("HALDA_CPUProcessor"); });
    }
    EXPECT_EQ(registration->wait_for(std::chrono::milliseconds(50)), std::future_status::timeout);
  };
  EXPECT_EQ(broker.enumerateInstances(mi, classPath("HALDA_CPUProcessor")).instances.size(), 1U);
  ASSERT_TRUE(registration.has_value());
  EXPECT_EQ(registration->get(), mi);
}

// Brokers that end a worker by cancelling it unwind through the library.
TEST_F(GuardOn, AThreadThatEndsInsideLeavesTheLibraryUsable) {
#if defined(__SANITIZE_THREAD__) || defined(__SANITIZE_ADDRESS__)
  GTEST_SKIP() << "sanitizers do not follow a forced unwinding";
#endif
  CMPIInstanceMI* mi = hookedMI("HALDA_CPUProcessor");
  hooked.hook = [] { pthread_exit(nullptr); };
  bool returned = false;
  std::thread cancelled([&] {
    broker.enumerateInstances(mi, classPath("HALDA_CPUProcessor"));
    returned = true;
  });
  cancelled.join();
  hooked.hook = nullptr;
  EXPECT_FALSE(returned);
  auto next = std::async(std::launch::async, [&] { return enumerateProcessors(); });
  ASSERT_EQ(next.wait_for(Guards::longEnough), std::future_status::ready);
  EXPECT_EQ(next.get().instances.size(), 1U);
}

}  // namespace
