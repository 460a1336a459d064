#include "tests/support/Paths.h"

#include <utility>

#include "tests/seam/Texts.h"

namespace Support {

using Corvcim::NamedValue;
using Corvcim::ObjectPath;
using Corvcim::Value;

namespace {

ObjectPath ownPath(const std::string& className, std::vector<NamedValue> keys) {
  return {Scripted::texts().systemName, testNameSpace, className, std::move(keys)};
}

ObjectPath devicePath(const std::string& className, const std::string& deviceId) {
  return ownPath(className, {textKey("CreationClassName", className), textKey("DeviceID", deviceId),
                             textKey("SystemCreationClassName", "HALDA_ComputerSystem"),
                             textKey("SystemName", Scripted::texts().systemName)});
}

}  // namespace

NamedValue textKey(const std::string& name, const std::string& value) {
  return {name, Value::string(value)};
}

ObjectPath classPath(const std::string& className) {
  return {"", testNameSpace, className, {}};
}

ObjectPath processorPath(const std::string& deviceId) {
  return devicePath("HALDA_CPUProcessor", deviceId);
}

ObjectPath cachePath(const std::string& deviceId) {
  return devicePath("HALDA_CPUMemory", deviceId);
}

ObjectPath corePath(const std::string& instanceId) {
  return ownPath("HALDA_CPUProcessorCore", {textKey("InstanceID", instanceId)});
}

ObjectPath capabilitiesPath(const std::string& deviceId) {
  return ownPath("HALDA_CPUProcessorCapabilities", {textKey("InstanceID", "NERITH:" + deviceId)});
}

ObjectPath associationPath(const std::string& className, const std::string& firstEnd, const ObjectPath& first,
                           const std::string& secondEnd, const ObjectPath& second) {
  return ownPath(className, {{firstEnd, Value::reference(first)}, {secondEnd, Value::reference(second)}});
}

ObjectPath systemPath(const std::string& name) {
  return systemInstance(name).path;
}

Corvcim::Instance systemInstance(const std::string& name) {
  return Corvcim::makeInstance(testNameSpace, "HALDA_ComputerSystem",
                               {textKey("CreationClassName", "HALDA_ComputerSystem"), textKey("Name", name),
                                textKey("Caption", "System " + name)});
}

ObjectPath withHost(ObjectPath path, const std::string& host) {
  path.host = host;
  return path;
}

ObjectPath withoutNameSpace(ObjectPath path) {
  path.nameSpace.clear();
  return path;
}

}  // namespace Support
