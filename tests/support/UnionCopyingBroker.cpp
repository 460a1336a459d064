#include "tests/support/UnionCopyingBroker.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace Support {

namespace {

const CMPIBrokerEncFT* originalServices = nullptr;
const CMPIInstanceFT* originalInstance = nullptr;
const CMPIObjectPathFT* originalPath = nullptr;
const CMPIArrayFT* originalArray = nullptr;
CMPIInstanceFT copyingInstance;
CMPIObjectPathFT copyingPath;
CMPIArrayFT copyingArray;
unsigned int valuesCopied = 0;
std::vector<std::string> valuesCut;

std::size_t sizeOf(CMPIType type) {
  switch (type) {
    case CMPI_boolean:
      return sizeof(CMPIBoolean);
    case CMPI_uint16:
      return sizeof(CMPIUint16);
    case CMPI_uint32:
      return sizeof(CMPIUint32);
    case CMPI_uint64:
      return sizeof(CMPIUint64);
    default:
      return sizeof(void*);
  }
}

CMPIValue copied(const std::string& call, const CMPIValue* value, CMPIType type) {
  std::array<unsigned char, sizeof(CMPIValue)> bytes{};
  std::memcpy(bytes.data(), value, bytes.size());
  ++valuesCopied;
  if (std::any_of(bytes.begin() + static_cast<std::ptrdiff_t>(sizeOf(type)), bytes.end(),
                  [](unsigned char byte) { return byte != 0; })) {
    valuesCut.push_back(call);
  }
  CMPIValue copy;
  std::memcpy(&copy, bytes.data(), bytes.size());
  return copy;
}

CMPIStatus setProperty(const CMPIInstance* instance, const char* name, const CMPIValue* value, CMPIType type) {
  if (type == CMPI_chars) {
    return originalInstance->setProperty(instance, name, value, type);
  }
  const CMPIValue copy = copied(std::string("setProperty ") + name, value, type);
  return originalInstance->setProperty(instance, name, &copy, type);
}

CMPIStatus addKey(const CMPIObjectPath* path, const char* name, const CMPIValue* value, CMPIType type) {
  if (type == CMPI_chars) {
    return originalPath->addKey(path, name, value, type);
  }
  const CMPIValue copy = copied(std::string("addKey ") + name, value, type);
  return originalPath->addKey(path, name, &copy, type);
}

CMPIStatus setElementAt(const CMPIArray* array, CMPICount index, const CMPIValue* value, CMPIType type) {
  const CMPIValue copy = copied("setElementAt", value, type);
  return originalArray->setElementAt(array, index, &copy, type);
}

/// Gives an object a table of its own that differs from the broker's in one function.
template <class Object, class Table, class Function>
Object* copying(Object* object, const Table*& original, Table& table, Function Table::*slot, Function function) {
  if (object != nullptr && object->hdl != nullptr) {
    original = object->ft;
    table = *original;
    table.*slot = function;
    object->ft = &table;
  }
  return object;
}

CMPIInstance* newInstance(const CMPIBroker* broker, const CMPIObjectPath* path, CMPIStatus* status) {
  return copying(originalServices->newInstance(broker, path, status), originalInstance, copyingInstance,
                 &CMPIInstanceFT::setProperty, &setProperty);
}

CMPIObjectPath* newObjectPath(const CMPIBroker* broker, const char* nameSpace, const char* className,
                              CMPIStatus* status) {
  return copying(originalServices->newObjectPath(broker, nameSpace, className, status), originalPath, copyingPath,
                 &CMPIObjectPathFT::addKey, &addKey);
}

CMPIArray* newArray(const CMPIBroker* broker, CMPICount size, CMPIType type, CMPIStatus* status) {
  return copying(originalServices->newArray(broker, size, type, status), originalArray, copyingArray,
                 &CMPIArrayFT::setElementAt, &setElementAt);
}

}  // namespace

UnionCopyingBroker::UnionCopyingBroker(const CMPIBroker* original) : record_(*original), services_(*original->eft) {
  originalServices = original->eft;
  valuesCopied = 0;
  valuesCut.clear();
  services_.newInstance = newInstance;
  services_.newObjectPath = newObjectPath;
  services_.newArray = newArray;
  record_.eft = &services_;
}

unsigned int UnionCopyingBroker::copies() const {
  return valuesCopied;
}

std::vector<std::string> UnionCopyingBroker::partialValues() const {
  return valuesCut;
}

}  // namespace Support
