#include "bench/NullBroker.h"

#include <cstring>
#include <deque>
#include <memory>
#include <vector>

namespace Corvane::Bench::NullBroker {
namespace {

constexpr CMPIStatus ok{CMPI_RC_OK, nullptr};

Calls counts{};

extern const CMPIStringFT stringTable;
extern const CMPIObjectPathFT pathTable;
extern const CMPIInstanceFT instanceTable;

/// A path, and the instance that goes with it.
struct Object {
  static constexpr std::size_t identifierSize = 48;

  Object() = default;
  Object(const Object&) = delete;  // its members point into it
  Object& operator=(const Object&) = delete;
  ~Object() = default;

  CMPIObjectPath path{this, &pathTable};
  CMPIInstance instance{this, &instanceTable};
  CMPIString className{nullptr, &stringTable};
  CMPIString key{identifier, &stringTable};
  char identifier[identifierSize] = "";

  static Object& of(const CMPIObjectPath* path) { return *static_cast<Object*>(const_cast<void*>(path->hdl)); }
  static Object& of(const CMPIInstance* instance) { return *static_cast<Object*>(const_cast<void*>(instance->hdl)); }

  void remember(const void* text) { std::strncpy(identifier, static_cast<const char*>(text), identifierSize - 1); }
};

/// Objects in the order they were asked for; a new request starts again at the first.
class Pool {
 public:
  Object& next() {
    if (position_ == chunkSize) {
      ++chunk_;
      position_ = 0;
    }
    if (chunk_ == chunks_.size()) {
      chunks_.push_back(std::make_unique<Object[]>(chunkSize));
    }
    return chunks_[chunk_][position_++];
  }

  void rewind() { chunk_ = position_ = 0; }

 private:
  static constexpr std::size_t chunkSize = 4096;

  std::vector<std::unique_ptr<Object[]>> chunks_;
  std::size_t chunk_ = 0;
  std::size_t position_ = 0;
};

Pool pool;

bool identifies(const char* name) {
  return (*name == 'D' && std::strcmp(name, "DeviceID") == 0) || (*name == 'I' && std::strcmp(name, "InstanceID") == 0);
}

// Strings: the handle is the text.

const char* getCharPtr(const CMPIString* string, CMPIStatus* /*rc*/) {
  ++counts[GetCharPtr];
  return static_cast<const char*>(string->hdl);
}

const CMPIStringFT stringTable = {CMPI_VERSION, nullptr, nullptr, getCharPtr};

CMPIString nameSpace{"root/cimv2", &stringTable};

// Object paths.

CMPIStatus setNameSpace(const CMPIObjectPath* /*path*/, const char* /*text*/) {
  ++counts[SetNameSpace];
  return ok;
}

CMPIString* getNameSpace(const CMPIObjectPath* /*path*/, CMPIStatus* /*rc*/) {
  ++counts[GetNameSpace];
  return &nameSpace;
}

CMPIStatus setHostname(const CMPIObjectPath* /*path*/, const char* /*text*/) {
  ++counts[SetHostname];
  return ok;
}

CMPIString* getClassName(const CMPIObjectPath* path, CMPIStatus* /*rc*/) {
  ++counts[GetClassName];
  return &Object::of(path).className;
}

CMPIStatus addKey(const CMPIObjectPath* path, const char* name, const CMPIValue* value, const CMPIType /*type*/) {
  if (!identifies(name)) {
    ++counts[AddKey];
    return ok;
  }
  ++counts[AddIdentifier];
  Object::of(path).remember(value);  // of type CMPI_chars: the value is the text itself
  return ok;
}

CMPIData getKey(const CMPIObjectPath* path, const char* /*name*/, CMPIStatus* /*rc*/) {
  ++counts[GetKey];
  CMPIData data{};
  data.type = CMPI_string;
  data.state = CMPI_keyValue;
  data.value.string = &Object::of(path).key;
  return data;
}

CMPICount getKeyCount(const CMPIObjectPath* path, CMPIStatus* /*rc*/) {
  ++counts[GetKeyCount];
  return Object::of(path).identifier[0] != '\0' ? 1 : 0;
}

const CMPIObjectPathFT pathTable = [] {
  CMPIObjectPathFT table{};
  table.ftVersion = CMPI_VERSION;
  table.setNameSpace = setNameSpace;
  table.getNameSpace = getNameSpace;
  table.setHostname = setHostname;
  table.getClassName = getClassName;
  table.addKey = addKey;
  table.getKey = getKey;
  table.getKeyCount = getKeyCount;
  return table;
}();

// Instances.

CMPIStatus setProperty(const CMPIInstance* instance, const char* name, const CMPIValue* value, CMPIType /*type*/) {
  if (!identifies(name)) {
    ++counts[SetProperty];
    return ok;
  }
  ++counts[SetIdentifier];
  Object::of(instance).remember(value);
  return ok;
}

CMPIStatus setPropertyFilter(const CMPIInstance* /*instance*/, const char** /*properties*/, const char** /*keys*/) {
  ++counts[SetPropertyFilter];
  return ok;
}

CMPIObjectPath* getObjectPath(const CMPIInstance* instance, CMPIStatus* /*rc*/) {
  ++counts[GetObjectPath];
  return &Object::of(instance).path;
}

const CMPIInstanceFT instanceTable = [] {
  CMPIInstanceFT table{};
  table.ftVersion = CMPI_VERSION;
  table.setProperty = setProperty;
  table.getObjectPath = getObjectPath;
  table.setPropertyFilter = setPropertyFilter;
  return table;
}();

// Arrays: one that takes everything.

CMPIStatus setElementAt(const CMPIArray* /*array*/, CMPICount /*index*/, const CMPIValue* /*value*/,
                        CMPIType /*type*/) {
  ++counts[SetElement];
  return ok;
}

const CMPIArrayFT arrayTable = {CMPI_VERSION, nullptr, nullptr, nullptr, nullptr, nullptr, setElementAt};

CMPIArray anyArray{&anyArray, &arrayTable};

// The computer system, which another provider serves: an enumeration of one element.

Object computerSystem;
bool delivered = false;
bool deliversPath = false;

CMPIBoolean hasNext(const CMPIEnumeration* /*enumeration*/, CMPIStatus* /*rc*/) {
  ++counts[HasNext];
  return static_cast<CMPIBoolean>(!delivered);
}

CMPIData getNext(const CMPIEnumeration* /*enumeration*/, CMPIStatus* /*rc*/) {
  ++counts[GetNext];
  delivered = true;
  CMPIData data{};
  if (deliversPath) {
    data.type = CMPI_ref;
    data.value.ref = &computerSystem.path;
  } else {
    data.type = CMPI_instance;
    data.value.inst = &computerSystem.instance;
  }
  return data;
}

const CMPIEnumerationFT enumerationTable = {CMPI_VERSION, nullptr, nullptr, getNext, hasNext, nullptr};

CMPIEnumeration enumeration{&enumeration, &enumerationTable};

CMPIEnumeration* deliver(bool path) {
  delivered = false;
  deliversPath = path;
  computerSystem.className.hdl = "HALDA_ComputerSystem";
  return &enumeration;
}

CMPIEnumeration* enumerateInstances(const CMPIBroker* /*broker*/, const CMPIContext* /*context*/,
                                    const CMPIObjectPath* /*path*/, const char** /*properties*/, CMPIStatus* /*rc*/) {
  ++counts[EnumerateInstances];
  return deliver(false);
}

CMPIEnumeration* enumerateInstanceNames(const CMPIBroker* /*broker*/, const CMPIContext* /*context*/,
                                        const CMPIObjectPath* /*path*/, CMPIStatus* /*rc*/) {
  ++counts[EnumerateInstanceNames];
  return deliver(true);
}

const CMPIBrokerFT brokerTable = [] {
  CMPIBrokerFT table{};
  table.brokerVersion = CMPI_VERSION;
  table.brokerName = "null";
  table.enumerateInstances = enumerateInstances;
  table.enumerateInstanceNames = enumerateInstanceNames;
  return table;
}();

// New objects.

CMPIObjectPath* newObjectPath(const CMPIBroker* /*broker*/, const char* /*nameSpace*/, const char* className,
                              CMPIStatus* /*rc*/) {
  ++counts[NewObjectPath];
  Object& object = pool.next();
  object.className.hdl = className;
  return &object.path;
}

CMPIInstance* newInstance(const CMPIBroker* /*broker*/, const CMPIObjectPath* path, CMPIStatus* /*rc*/) {
  ++counts[NewInstance];
  Object& object = pool.next();
  object.className.hdl = Object::of(path).className.hdl;
  return &object.instance;
}

CMPIArray* newArray(const CMPIBroker* /*broker*/, CMPICount /*size*/, CMPIType /*type*/, CMPIStatus* /*rc*/) {
  ++counts[NewArray];
  return &anyArray;
}

CMPIString* newString(const CMPIBroker* /*broker*/, const char* text, CMPIStatus* /*rc*/) {
  ++counts[NewString];
  Object& object = pool.next();
  object.remember(text);
  return &object.key;
}

const CMPIBrokerEncFT encapsulationTable = [] {
  CMPIBrokerEncFT table{};
  table.ftVersion = CMPI_VERSION;
  table.newInstance = newInstance;
  table.newObjectPath = newObjectPath;
  table.newArray = newArray;
  table.newString = newString;
  return table;
}();

const CMPIBroker theBroker{nullptr, &brokerTable, &encapsulationTable, nullptr, nullptr};

const CMPIContext theContext{nullptr, nullptr};

// Results.

CMPIStatus returnInstance(const CMPIResult* /*result*/, const CMPIInstance* /*instance*/) {
  ++counts[ReturnInstance];
  return ok;
}

CMPIStatus returnObjectPath(const CMPIResult* /*result*/, const CMPIObjectPath* /*path*/) {
  ++counts[ReturnObjectPath];
  return ok;
}

CMPIStatus returnDone(const CMPIResult* /*result*/) {
  ++counts[ReturnDone];
  return ok;
}

const CMPIResultFT resultTable = [] {
  CMPIResultFT table{};
  table.ftVersion = CMPI_VERSION;
  table.returnInstance = returnInstance;
  table.returnObjectPath = returnObjectPath;
  table.returnDone = returnDone;
  return table;
}();

const CMPIResult theResult{&theResult, &resultTable};

}  // namespace

const CMPIBroker* broker() {
  return &theBroker;
}
const CMPIContext* context() {
  return &theContext;
}
const CMPIResult* result() {
  return &theResult;
}

const CMPIObjectPath* requestPath(const char* className, const char* identifier) {
  static std::deque<Object> paths;
  Object& object = paths.emplace_back();
  object.className.hdl = className;
  if (identifier != nullptr) {
    object.remember(identifier);
  }
  return &object.path;
}

void beginRequest() {
  pool.rewind();
  counts = {};
}

const Calls& calls() {
  return counts;
}

}  // namespace Corvane::Bench::NullBroker
