#include "tests/factory/RecordingBroker.h"

#include <cmpimacs.h>

#include <stdexcept>
#include <utility>

namespace FactoryTests {

namespace {

const CMPIBrokerEncFT* originalServices = nullptr;
const CMPIInstanceFT* originalInstance = nullptr;
const CMPIObjectPathFT* originalPath = nullptr;
CMPIInstanceFT listeningInstance;
CMPIObjectPathFT listeningPath;
std::vector<std::string> properties;
std::vector<std::string> keys;

std::string arrayText(const CMPIArray* array) {
  std::string text = "{";
  for (CMPICount i = 0; i < CMGetArrayCount(array, nullptr); ++i) {
    const CMPIData element = CMGetArrayElementAt(array, i, nullptr);
    text += (i == 0 ? "" : ", ") + std::to_string(element.value.uint16);
  }
  return text + "}";
}

std::string described(const char* name, const CMPIValue* value, CMPIType type) {
  const std::string start = std::string(name) + " ";
  switch (type) {
    case CMPI_chars:
      return start + "chars |" + reinterpret_cast<const char*>(value) + "|";
    case CMPI_boolean:
      return start + "boolean " + std::to_string(value->boolean);
    case CMPI_uint16:
      return start + "uint16 " + std::to_string(value->uint16);
    case CMPI_uint32:
      return start + "uint32 " + std::to_string(value->uint32);
    case CMPI_uint64:
      return start + "uint64 " + std::to_string(value->uint64);
    case CMPI_uint16A:
      return start + "uint16[] " + arrayText(value->array);
    default:
      return start + "type " + std::to_string(type);
  }
}

CMPIStatus setProperty(const CMPIInstance* instance, const char* name, const CMPIValue* value, CMPIType type) {
  properties.push_back(described(name, value, type));
  return originalInstance->setProperty(instance, name, value, type);
}

CMPIStatus addKey(const CMPIObjectPath* path, const char* name, const CMPIValue* value, CMPIType type) {
  keys.push_back(described(name, value, type));
  return originalPath->addKey(path, name, value, type);
}

CMPIInstance* newInstance(const CMPIBroker* broker, const CMPIObjectPath* path, CMPIStatus* rc) {
  CMPIInstance* instance = originalServices->newInstance(broker, path, rc);
  if (instance != nullptr && instance->hdl != nullptr) {
    originalInstance = instance->ft;
    listeningInstance = *originalInstance;
    listeningInstance.setProperty = setProperty;
    instance->ft = &listeningInstance;
  }
  return instance;
}

CMPIObjectPath* newObjectPath(const CMPIBroker* broker, const char* nameSpace, const char* className, CMPIStatus* rc) {
  CMPIObjectPath* path = originalServices->newObjectPath(broker, nameSpace, className, rc);
  if (path != nullptr && path->hdl != nullptr) {
    originalPath = path->ft;
    listeningPath = *originalPath;
    listeningPath.addKey = addKey;
    path->ft = &listeningPath;
  }
  return path;
}

}  // namespace

RecordingBroker::RecordingBroker(Corvcim::Broker& broker)
    : record_(*broker.handle()), services_(*broker.handle()->eft) {
  if (originalServices != nullptr) {
    throw std::logic_error("a second recording broker");
  }
  originalServices = broker.handle()->eft;
  services_.newInstance = newInstance;
  services_.newObjectPath = newObjectPath;
  record_.eft = &services_;
  properties.clear();
  keys.clear();
}

RecordingBroker::~RecordingBroker() {
  originalServices = nullptr;
}

std::vector<std::string> RecordingBroker::takeProperties() {
  return std::exchange(properties, {});
}

std::vector<std::string> RecordingBroker::takeKeys() {
  return std::exchange(keys, {});
}

}  // namespace FactoryTests
