#ifndef TARN_CPUCLASSNAMES_H
#define TARN_CPUCLASSNAMES_H

/// The CIM classes that the library serves or refers to, and their parents.
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

/// A class and the one that it is derived from.
struct ClassParent {
  const char* name;
  const char* parent;
};

/// Each of the classes above, and each class above it that has a parent.
inline constexpr ClassParent classParents[] = {
    {cpuProcessorClass, "CIM_Processor"},
    {cpuProcessorCoreClass, "CIM_ProcessorCore"},
    {cpuMemoryClass, "CIM_Memory"},
    {cpuProcessorCapClass, "CIM_ProcessorCapabilities"},
    {computerSystemClass, "CIM_ComputerSystem"},
    {cpuAssociatedCacheMemoryClass, "CIM_AssociatedCacheMemory"},
    {cpuCoreAssociatedCacheMemoryClass, "CIM_AssociatedCacheMemory"},
    {cpuSystemDeviceClass, "CIM_SystemDevice"},
    {cpuElementCapClass, "CIM_ElementCapabilities"},
    {cpuConcreteComponentClass, "CIM_ConcreteComponent"},
    {"CIM_AssociatedCacheMemory", "CIM_AssociatedMemory"},
    {"CIM_AssociatedMemory", "CIM_Dependency"},
    {"CIM_Capabilities", "CIM_ManagedElement"},
    {"CIM_ComputerSystem", "CIM_System"},
    {"CIM_ConcreteComponent", "CIM_Component"},
    {"CIM_EnabledLogicalElement", "CIM_LogicalElement"},
    {"CIM_EnabledLogicalElementCapabilities", "CIM_Capabilities"},
    {"CIM_LogicalDevice", "CIM_EnabledLogicalElement"},
    {"CIM_LogicalElement", "CIM_ManagedSystemElement"},
    {"CIM_ManagedSystemElement", "CIM_ManagedElement"},
    {"CIM_Memory", "CIM_StorageExtent"},
    {"CIM_Processor", "CIM_LogicalDevice"},
    {"CIM_ProcessorCapabilities", "CIM_EnabledLogicalElementCapabilities"},
    {"CIM_ProcessorCore", "CIM_EnabledLogicalElement"},
    {"CIM_StorageExtent", "CIM_LogicalDevice"},
    {"CIM_System", "CIM_EnabledLogicalElement"},
    {"CIM_SystemComponent", "CIM_Component"},
    {"CIM_SystemDevice", "CIM_SystemComponent"},
};

}  // namespace Tarn::CPUProvider

#endif
