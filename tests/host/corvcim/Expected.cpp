#include "tests/host/corvcim/Expected.h"

#include <tarn/Common.h>

namespace Corvcim::Testing {

std::string host() {
  return "unnamed";
}

std::string thisHost() {
  return Tarn::getSystemName();
}

std::string processorPath(const std::string& identifier) {
  return "root/cimv2:HALDA_CPUProcessor.CreationClassName=\"HALDA_CPUProcessor\",DeviceID=\"" + identifier +
         "\",SystemCreationClassName=\"HALDA_ComputerSystem\",SystemName=\"" + host() + '"';
}

std::string cachePath(const std::string& identifier) {
  return "root/cimv2:HALDA_CPUMemory.CreationClassName=\"HALDA_CPUMemory\",DeviceID=\"" + identifier +
         "\",SystemCreationClassName=\"HALDA_ComputerSystem\",SystemName=\"" + host() + '"';
}

std::string corePath(const std::string& identifier) {
  return "root/cimv2:HALDA_CPUProcessorCore.InstanceID=\"" + identifier + '"';
}

std::string systemPath(const std::string& name) {
  return "root/cimv2:HALDA_ComputerSystem.CreationClassName=\"HALDA_ComputerSystem\",Name=\"" + name + '"';
}

Finished success(const std::string& output) {
  return {0, output, ""};
}

Finished failed(const std::string& error) {
  return {1, "", "corvcim: " + error + '\n'};
}

}  // namespace Corvcim::Testing
