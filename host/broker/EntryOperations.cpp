// Contexts and method arguments: two kinds of named values with the same operations.

#include "host/broker/Call.h"

namespace Corvcim {
namespace {

// What differs: which services the calls are.
struct EntryServices {
  Service add;
  Service get;
  Service getAt;
  Service count;
};

constexpr EntryServices contextServices = {Service::AddEntry, Service::GetEntry, Service::GetEntryAt,
                                           Service::GetEntryCount};
constexpr EntryServices argsServices = {Service::AddArg, Service::GetArg, Service::GetArgAt, Service::GetArgCount};

template <class T, const EntryServices& services>
CMPIStatus addEntry(const typename T::Record* self, const char* name, const CMPIValue* value, const CMPIType type) {
  T* object = T::of(self);
  if (object == nullptr) {
    return invalidHandle();
  }
  const Call call(object->broker(), services.add, name);
  if (call.fails()) {
    return call.status();
  }
  if (name == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, std::string(serviceName(services.add)) + ": the name is NULL");
  }
  ConvertedValue converted = fromCmpi(value, type);
  if (converted.rc != CMPI_RC_OK) {
    return call.refuse(converted.rc, converted.problem);
  }
  assignValue(object->entries, name, std::move(converted.value));
  return okStatus();
}

template <class T, const EntryServices& services>
CMPIData getEntry(const typename T::Record* self, const char* name, CMPIStatus* status) {
  const T* object = T::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(object->broker(), services.get, name);
  if (name == nullptr) {
    return call.refuseData(status, CMPI_RC_ERR_INVALID_PARAMETER,
                           std::string(serviceName(services.get)) + ": the name is NULL", CMPI_badValue);
  }
  const Value* value = findValue(object->entries, name);
  if (value == nullptr && !call.fails()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY, "there is no entry " + std::string(name),
                           CMPI_notFound);
  }
  return call.data(status, value != nullptr ? *value : Value());
}

template <class T, const EntryServices& services>
CMPIData getEntryAt(const typename T::Record* self, CMPICount index, CMPIString** name, CMPIStatus* status) {
  const T* object = T::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(object->broker(), services.getAt, [&] { return std::to_string(index); });
  if (index >= object->entries.size()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY, "there is no entry number " + std::to_string(index),
                           CMPI_notFound);
  }
  if (name != nullptr) {
    *name = call.broker().currentArena().make<StringObject>(object->entries[index].name)->record();
  }
  return call.data(status, object->entries[index].value);
}

template <class T, const EntryServices& services>
CMPICount getEntryCount(const typename T::Record* self, CMPIStatus* status) {
  const T* object = T::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  return Call(object->broker(), services.count).number(status, static_cast<CMPICount>(object->entries.size()));
}

}  // namespace

const CMPIContextFT contextOperations = {
    CMPI_VERSION,
    releaseObject<ContextObject>,
    cloneObject<ContextObject>,
    getEntry<ContextObject, contextServices>,
    getEntryAt<ContextObject, contextServices>,
    getEntryCount<ContextObject, contextServices>,
    addEntry<ContextObject, contextServices>,
};

const CMPIArgsFT argsOperations = {
    CMPI_VERSION,
    releaseObject<ArgsObject>,
    cloneObject<ArgsObject>,
    addEntry<ArgsObject, argsServices>,
    getEntry<ArgsObject, argsServices>,
    getEntryAt<ArgsObject, argsServices>,
    getEntryCount<ArgsObject, argsServices>,
};

}  // namespace Corvcim
