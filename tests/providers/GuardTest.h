#ifndef TESTS_PROVIDERS_GUARDTEST_H
#define TESTS_PROVIDERS_GUARDTEST_H

#include <chrono>
#include <string>
#include <thread>

#include "tests/providers/HookedBroker.h"
#include "tests/support/ProviderTest.h"

namespace Guards {

inline constexpr std::chrono::milliseconds longEnough{10000};  ///< for what has to happen
inline constexpr std::chrono::milliseconds shortWhile{200};    ///< for what must not

/// Requests through the hooked broker, on a machine whose inventory has been collected.
class GuardTest : public Support::ProviderTest {
 protected:
  GuardTest() : hooked(broker.handle()) {
    Scripted::inventory().processor("cpu0").core("core0").cache("cache0");
    broker.serveInstances("HALDA_ComputerSystem", {Support::systemInstance("system")});
    afterwards([&] {
      enumerateInstances("HALDA_CPUProcessor");
      enumerateInstances("HALDA_CPUMemory");
    });
  }

  /// Like the fixture's, with the hooked broker. Registers, so not while a request runs without a guard.
  CMPIInstanceMI* hookedMI(const std::string& className) {
    return Support::providerOf(className).createInstanceMI(hooked.handle(), nullptr, nullptr);
  }
  CMPIAssociationMI* hookedAssociationMI(const std::string& className) {
    return Support::providerOf(className).createAssociationMI(hooked.handle(), nullptr, nullptr);
  }

  /// Enumerates processors in two threads at once, whose hooks wait for each other.
  void enumerateInTwoThreads(Meeting& meeting, std::chrono::milliseconds patience) {
    CMPIInstanceMI* mi = hookedMI("HALDA_CPUProcessor");
    hooked.hook = [&] { meeting.waitForAnother(patience); };
    const auto enumerate = [&] {
      EXPECT_EQ(broker.enumerateInstances(mi, Support::classPath("HALDA_CPUProcessor")).instances.size(), 1U);
    };
    std::thread other(enumerate);
    enumerate();
    other.join();
    hooked.hook = nullptr;
  }

  HookedBroker hooked;
};

}  // namespace Guards

#endif
