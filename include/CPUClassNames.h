#ifndef TARN_CPUCLASSNAMES_H
#define TARN_CPUCLASSNAMES_H

/// The CIM classes that the library serves or refers to.
namespace Tarn::CPUProvider {

constexpr const char* cpuProcessorClass = "HALDA_CPUProcessor";
constexpr const char* cpuProcessorCoreClass = "HALDA_CPUProcessorCore";
constexpr const char* cpuMemoryClass = "HALDA_CPUMemory";
constexpr const char* cpuProcessorCapClass = "HALDA_CPUProcessorCapabilities";
constexpr const char* computerSystemClass = "HALDA_ComputerSystem";  ///< served by another provider

constexpr const char* cpuAssociatedCacheMemoryClass = "HALDA_CPUAssociatedCacheMemory";
constexpr const char* cpuCoreAssociatedCacheMemoryClass = "HALDA_CPUCoreAssociatedCacheMemory";
constexpr const char* cpuSystemDeviceClass = "HALDA_CPUSystemDevice";
constexpr const char* cpuElementCapClass = "HALDA_CPUElementCapabilities";
constexpr const char* cpuConcreteComponentClass = "HALDA_CPUConcreteComponent";

}  // namespace Tarn::CPUProvider

#endif
