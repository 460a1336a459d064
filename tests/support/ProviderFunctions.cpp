#include "tests/support/ProviderFunctions.h"

#include <stdexcept>

#define DECLARE_INSTANCE_MI(provider) \
  extern "C" CMPIInstanceMI* provider##_Create_InstanceMI(const CMPIBroker*, const CMPIContext*, CMPIStatus*)
#define DECLARE_ASSOCIATION_MI(provider) \
  extern "C" CMPIAssociationMI* provider##_Create_AssociationMI(const CMPIBroker*, const CMPIContext*, CMPIStatus*)

DECLARE_INSTANCE_MI(CPUMemoryProvider);
DECLARE_INSTANCE_MI(CPUProcessorProvider);
DECLARE_INSTANCE_MI(CPUProcessorCoreProvider);
DECLARE_INSTANCE_MI(CPUProcessorCapProvider);
DECLARE_INSTANCE_MI(CPUAssociatedCacheMemoryProvider);
DECLARE_INSTANCE_MI(CPUCoreAssociatedCacheMemoryProvider);
DECLARE_INSTANCE_MI(CPUSystemDeviceProvider);
DECLARE_INSTANCE_MI(CPUElementCapabilitiesProvider);
DECLARE_INSTANCE_MI(CPUConcreteComponentProvider);
DECLARE_ASSOCIATION_MI(CPUAssociatedCacheMemoryProvider);
DECLARE_ASSOCIATION_MI(CPUCoreAssociatedCacheMemoryProvider);
DECLARE_ASSOCIATION_MI(CPUSystemDeviceProvider);
DECLARE_ASSOCIATION_MI(CPUElementCapabilitiesProvider);
DECLARE_ASSOCIATION_MI(CPUConcreteComponentProvider);

namespace Support {

const std::vector<ProviderFunctions>& providerFunctions() {
  static const std::vector<ProviderFunctions> providers = {
      {"HALDA_CPUMemory", "CPUMemoryProvider", "CPUMemory", "CPUMemoryProvider.cpp", "Corvane.CPUMemoryProvider",
       CPUMemoryProvider_Create_InstanceMI, nullptr},
      {"HALDA_CPUProcessor", "CPUProcessorProvider", "CPUProcessor", "CPUProcessorProvider.cpp",
       "Corvane.CPUProcessorProvider", CPUProcessorProvider_Create_InstanceMI, nullptr},
      {"HALDA_CPUProcessorCore", "CPUProcessorCoreProvider", "CPUProcessorCore", "CPUProcessorCoreProvider.cpp",
       "Corvane.CPUProcessorCoreProvider", CPUProcessorCoreProvider_Create_InstanceMI, nullptr},
      {"HALDA_CPUProcessorCapabilities", "CPUProcessorCapProvider", "CPUProcessorCapabilities",
       "CPUProcessorCapabilitiesProvider.cpp", "Corvane.CPUProcessorCapProvider",
       CPUProcessorCapProvider_Create_InstanceMI, nullptr},
      {"HALDA_CPUAssociatedCacheMemory", "CPUAssociatedCacheMemoryProvider", "CPUAssociatedCacheMemory",
       "CPUAssociatedCacheMemoryProvider.cpp", "Corvane.CPUAssociatedCacheProvider",
       CPUAssociatedCacheMemoryProvider_Create_InstanceMI, CPUAssociatedCacheMemoryProvider_Create_AssociationMI},
      {"HALDA_CPUCoreAssociatedCacheMemory", "CPUCoreAssociatedCacheMemoryProvider", "CPUCoreAssociatedCacheMemory",
       "CPUCoreAssociatedCacheMemoryProvider.cpp", "Corvane.CPUCoreAssociatedCacheProvider",
       CPUCoreAssociatedCacheMemoryProvider_Create_InstanceMI,
       CPUCoreAssociatedCacheMemoryProvider_Create_AssociationMI},
      {"HALDA_CPUSystemDevice", "CPUSystemDeviceProvider", "CPUSystemDevice", "CPUSystemDeviceProvider.cpp",
       "Corvane.CPUSystemDeviceProvider", CPUSystemDeviceProvider_Create_InstanceMI,
       CPUSystemDeviceProvider_Create_AssociationMI},
      {"HALDA_CPUElementCapabilities", "CPUElementCapabilitiesProvider", "CPUElementCapabilities",
       "CPUElementCapabilitiesProvider.cpp", "Corvane.CPUElementCapabilitiesProvider",
       CPUElementCapabilitiesProvider_Create_InstanceMI, CPUElementCapabilitiesProvider_Create_AssociationMI},
      {"HALDA_CPUConcreteComponent", "CPUConcreteComponentProvider", "CPUConcreteComponent",
       "CPUConcreteComponentProvider.cpp", "Corvane.CPUConcreteComponentProvider",
       CPUConcreteComponentProvider_Create_InstanceMI, CPUConcreteComponentProvider_Create_AssociationMI},
  };
  return providers;
}

const ProviderFunctions& providerOf(const std::string& className) {
  for (const ProviderFunctions& each : providerFunctions()) {
    if (each.className == className) {
      return each;
    }
  }
  throw std::out_of_range("no provider serves " + className);
}

}  // namespace Support
