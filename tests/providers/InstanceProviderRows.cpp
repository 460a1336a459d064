#include "tests/providers/InstanceProviderRows.h"

namespace InstanceProviders {

using Corvcim::ObjectPath;
using Scripted::inventory;

namespace {

constexpr unsigned int processorNode = 4;
constexpr unsigned int cacheNode = 31;
constexpr unsigned int coreNode = 42;

// Capabilities are named by the instance id of their processor.
ObjectPath capabilitiesOf(const std::string& instanceId) {
  return Support::capabilitiesPath(instanceId.substr(std::string("NERITH:").size()));
}

unsigned int countSelections(unsigned int nodeType) {
  return inventory().count("selectNode(" + std::to_string(nodeType) + ")");
}

constexpr const char* noKeys = "At least one key should be passed";

constexpr Row table[] = {
    {.className = "HALDA_CPUProcessor",
     .nodeType = processorNode,
     .pathOf = Support::processorPath,
     .identifiers = {"cpu0", "cpu1"},
     .key = "DeviceID",
     .failsWithoutKeys = false,
     .tracesKey = false,
     .noKeys = {noKeys, 251},
     .oneFailed = Text{"getOneCPUProcCMPIInstance Failed", 206},
     .allFailed = Text{"getAllCPUProcCMPIInstances Failed", 229},
     .exitLine = 257,
     .instancesVariable = {},
     .instancesFailed = Text{"Failed To get CMPIInstances", 151},
     .namesVariable = Text{"numObjPaths", 95},
     .namesFailed = {"Failed To get the ObjectPaths", 102}},
    {.className = "HALDA_CPUProcessorCore",
     .nodeType = coreNode,
     .pathOf = Support::corePath,
     .identifiers = {"core0", "core1"},
     .key = "InstanceID",
     .failsWithoutKeys = true,
     .tracesKey = true,
     .noKeys = {noKeys, {}},
     .oneFailed = Text{"getOneCPUProcCoreCMPIInstance Failed", {}},
     .allFailed = Text{"getAllCPUProcCoreCMPIInstances Failed", {}},
     .exitLine = {},
     .instancesVariable = "numInstances",
     .instancesFailed = Text{"getAllCPUProcCoreCMPIInstances Failed", {}},
     .namesVariable = {},
     .namesFailed = {"getAllCPUProcCoreCMPIObjPaths Failed", {}}},
    {.className = "HALDA_CPUMemory",
     .nodeType = cacheNode,
     .pathOf = Support::cachePath,
     .identifiers = {"cache0", "cache1"},
     .key = "DeviceID",
     .failsWithoutKeys = true,
     .tracesKey = false,
     .noKeys = {noKeys, {}},
     .oneFailed = Text{"***Can't get Instance.                                Exiting GetInstance***", {}},
     .allFailed = {},
     .exitLine = {},
     .instancesVariable = {},
     .instancesFailed = {},
     .namesVariable = {},
     .namesFailed = {"***Can't get ObjectPaths.                     Exiting EnumerateInstanceNames***", {}}},
    {.className = "HALDA_CPUProcessorCapabilities",
     .nodeType = processorNode,
     .pathOf = capabilitiesOf,
     .identifiers = {"NERITH:cpu0", "NERITH:cpu1"},
     .key = "InstanceID",
     .failsWithoutKeys = true,
     .tracesKey = true,
     .noKeys = {noKeys, {}},
     .oneFailed = {},
     .allFailed = Text{"getAllCPUProcCapCMPIInstances Failed", {}},
     .exitLine = {},
     .instancesVariable = {},
     .instancesFailed = Text{"getAllCPUProcCapCMPIInstances Failed ", {}},
     .namesVariable = {},
     .namesFailed = {"***Can't get ObjectPaths.             Exiting EnumerateInstanceNames***", {}}},
};

}  // namespace

std::span<const Row> rows() {
  return table;
}

void twoProcessors() {
  inventory().processor("cpu0").core("core0").cache("cache0").processor("cpu1").core("core1").cache("cache1");
}

std::vector<ObjectPath> InstanceProvider::allPaths() const {
  std::vector<ObjectPath> paths;
  for (const std::string_view identifier : row().identifiers) {
    paths.push_back(path(identifier));
  }
  return paths;
}

ObjectPath InstanceProvider::pathWithOtherKey() const {
  ObjectPath result = Support::classPath(row().className);
  result.keys.push_back(Support::textKey("Other", std::string(row().identifiers.front())));
  return result;
}

ObjectPath InstanceProvider::pathWithKey(const Corvcim::Value& value) const {
  ObjectPath result = pathWithOtherKey();
  result.keys.push_back({row().key, value});
  return result;
}

unsigned int InstanceProvider::collections() const {
  return countSelections(row().nodeType);
}

unsigned int InstanceProvider::otherCollections() const {
  return countSelections(processorNode) + countSelections(cacheNode) + countSelections(coreNode) - collections();
}

std::string className(const ::testing::TestParamInfo<Row>& tested) {
  return tested.param.className;
}

}  // namespace InstanceProviders
