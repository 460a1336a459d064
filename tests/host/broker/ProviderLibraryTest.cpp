#include "host/broker/ProviderLibrary.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <optional>
#include <string>
#include <utility>

#include "host/broker/Broker.h"

namespace Corvcim {
namespace {

bool isMapped(const std::string& file) {
  std::ifstream maps("/proc/self/maps");
  for (std::string line; std::getline(maps, line);) {
    if (line.find(file) != std::string::npos) {
      return true;
    }
  }
  return false;
}

template <class Function>
std::string errorOf(Function function) {
  try {
    function();
  } catch (const ProviderError& error) {
    return error.what();
  }
  return "no error";
}

}  // namespace

TEST(ProviderLibrary, GivesManagementInterfacesByProviderName) {
  Broker broker;
  const ProviderLibrary library(TEST_PROVIDER);

  CMPIInstanceMI* mi = library.instanceMI(broker, "CPUMemoryProvider");

  const Response response = broker.enumerateInstances(mi, {{}, "plain", "HALDA_CPUMemory", {}});
  ASSERT_EQ(response.instances.size(), 1U);
  EXPECT_EQ(response.instances[0].property("DeviceID")->asString(), "enumerateInstances");
  EXPECT_NE(library.associationMI(broker, "CPUSystemDeviceProvider"), nullptr);
  EXPECT_NE(library.find("CPUMemoryProvider_Create_InstanceMI"), nullptr);
  EXPECT_EQ(library.find("Nothing"), nullptr);
}

TEST(ProviderLibrary, IsGoneFromMemoryAfterUnloading) {
  for (const LoadScope scope : {LoadScope::Global, LoadScope::Local}) {
    {
      const ProviderLibrary library(TEST_PROVIDER, scope);
      EXPECT_TRUE(isMapped(TEST_PROVIDER));
    }
    EXPECT_FALSE(isMapped(TEST_PROVIDER));
  }
}

TEST(ProviderLibrary, StaysInMemoryWhereItIsKept) {
  // A copy: the other tests expect to find the library unloaded.
  const std::string copy = testing::TempDir() + "kept-provider.so";
  std::filesystem::copy_file(TEST_PROVIDER, copy, std::filesystem::copy_options::overwrite_existing);

  ProviderLibrary first(copy);
  first.keepLoaded();
  std::optional<ProviderLibrary> second(std::move(first));
  second.reset();

  EXPECT_TRUE(isMapped(copy));
  std::filesystem::remove(copy);
}

TEST(ProviderLibrary, MovesWithoutUnloading) {
  Broker broker;
  ProviderLibrary first(TEST_PROVIDER);
  ProviderLibrary second(std::move(first));

  EXPECT_EQ(second.file(), TEST_PROVIDER);
  EXPECT_NE(second.instanceMI(broker, "CPUMemoryProvider"), nullptr);
}

TEST(ProviderLibrary, SaysWhichFileCannotBeLoaded) {
  EXPECT_EQ(errorOf([] { ProviderLibrary("/nowhere/libnone.so"); }),
            "cannot load provider library: /nowhere/libnone.so: cannot open shared object file: No such file or "
            "directory");
  EXPECT_EQ(errorOf([] { ProviderLibrary("libnone-here.so"); }),
            "cannot load provider library: ./libnone-here.so: cannot open shared object file: No such file or "
            "directory");
}

TEST(ProviderLibrary, SaysWhichFactoryIsMissing) {
  Broker broker;
  const ProviderLibrary library(TEST_PROVIDER);

  EXPECT_EQ(errorOf([&] { (void)library.instanceMI(broker, "CPUProcessorCapProvider"); }),
            "provider library " TEST_PROVIDER
            " exports no CPUProcessorCapProvider_Create_InstanceMI: it does not serve this class");
}

TEST(ProviderLibrary, SaysWhyAFactoryFailed) {
  Broker broker;
  const ProviderLibrary library(TEST_PROVIDER);

  EXPECT_EQ(errorOf([&] { (void)library.instanceMI(broker, "RefusingProvider"); }),
            "RefusingProvider_Create_InstanceMI of provider library " TEST_PROVIDER
            " failed with CMPI_RC_ERR_ACCESS_DENIED no licence");
}

}  // namespace Corvcim
