#include <algorithm>

#include "host/broker/Call.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

bool contains(const std::vector<std::string>& names, std::string_view name) {
  return std::ranges::any_of(names, [&](const std::string& each) { return sameName(each, name); });
}

bool passesFilter(const InstanceObject& instance, std::string_view name) {
  return !instance.filter || contains(*instance.filter, name) || contains(instance.filterKeys, name);
}

std::vector<std::string> copyNames(const char* const* names) {
  std::vector<std::string> result;
  while (names != nullptr && *names != nullptr) {
    result.emplace_back(*names++);
  }
  return result;
}

std::string joined(const char* const* names) {
  if (names == nullptr) {
    return "NULL";
  }
  std::string result;
  for (const std::string& each : copyNames(names)) {
    result += (result.empty() ? "" : ",") + each;
  }
  return "{" + result + "}";
}

// A class of the table takes its properties in their own types only, as a strict production broker
// does; what the table does not know passes.
std::string typeProblem(const InstanceObject& instance, std::string_view name, const Value& value) {
  const ClassDefinition* definition = findClass(instance.value.path.className);
  const PropertyDefinition* property = definition != nullptr ? findProperty(*definition, name) : nullptr;
  if (property == nullptr || property->type == value.type()) {
    return {};
  }
  return std::string(definition->name) + "." + std::string(property->name) + " is of type " + typeName(property->type) +
         ", not " + typeName(value.type());
}

CMPIData getProperty(const CMPIInstance* self, const char* name, CMPIStatus* status) {
  const InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(instance->broker(), Service::GetProperty, name);
  if (name == nullptr) {
    return call.refuseData(status, CMPI_RC_ERR_INVALID_PARAMETER, "getProperty: the name is NULL", CMPI_badValue);
  }
  const Value* value = instance->value.property(name);
  if (value == nullptr && !call.fails()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY,
                           "the instance of " + instance->value.path.className + " has no property " + name,
                           CMPI_notFound);
  }
  return call.data(status, value != nullptr ? *value : Value());
}

CMPIData getPropertyAt(const CMPIInstance* self, CMPICount index, CMPIString** name, CMPIStatus* status) {
  const InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(instance->broker(), Service::GetPropertyAt, [&] { return std::to_string(index); });
  if (index >= instance->value.properties.size()) {
    return call.refuseData(
        status, CMPI_RC_ERR_NO_SUCH_PROPERTY,
        "the instance of " + instance->value.path.className + " has no property number " + std::to_string(index),
        CMPI_notFound);
  }
  const NamedValue& property = instance->value.properties[index];
  if (name != nullptr) {
    *name = call.broker().currentArena().make<StringObject>(property.name)->record();
  }
  return call.data(status, property.value);
}

CMPICount getPropertyCount(const CMPIInstance* self, CMPIStatus* status) {
  const InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  const Call call(instance->broker(), Service::GetPropertyCount);
  return call.number(status, static_cast<CMPICount>(instance->value.properties.size()));
}

CMPIStatus assignProperty(const Call& call, InstanceObject& instance, const char* name, const CMPIValue* value,
                          CMPIType type) {
  if (call.fails()) {
    return call.status();
  }
  if (name == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "setProperty: the name is NULL");
  }
  if (!passesFilter(instance, name)) {
    return okStatus();
  }
  ConvertedValue converted = fromCmpi(value, type);
  if (converted.rc != CMPI_RC_OK) {
    return call.refuse(converted.rc, "setProperty of " + std::string(name) + ": " + converted.problem);
  }
  const std::string problem = typeProblem(instance, name, converted.value);
  if (!problem.empty()) {
    return call.refuse(CMPI_RC_ERR_INVALID_DATA_TYPE, problem);
  }
  assignValue(instance.value.properties, name, std::move(converted.value));
  return okStatus();
}

CMPIStatus setProperty(const CMPIInstance* self, const char* name, const CMPIValue* value, CMPIType type) {
  InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    return invalidHandle();
  }
  return assignProperty(Call(instance->broker(), Service::SetProperty, name), *instance, name, value, type);
}

// The class of origin is not kept: no operation of this host shows it.
CMPIStatus setPropertyWithOrigin(const CMPIInstance* self, const char* name, const CMPIValue* value,
                                 const CMPIType type, const char* /*origin*/) {
  InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    return invalidHandle();
  }
  return assignProperty(Call(instance->broker(), Service::SetPropertyWithOrigin, name), *instance, name, value, type);
}

CMPIObjectPath* getObjectPath(const CMPIInstance* self, CMPIStatus* status) {
  const InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(instance->broker(), Service::GetObjectPath, instance->value.path.className.c_str());
  return call.object<ObjectPathObject>(status, instance->complete().path);
}

CMPIStatus setPropertyFilter(const CMPIInstance* self, const char** properties, const char** keys) {
  InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    return invalidHandle();
  }
  const Call call(instance->broker(), Service::SetPropertyFilter,
                  [&] { return "properties " + joined(properties) + " keys " + joined(keys); });
  if (call.fails()) {
    return call.status();
  }
  instance->filter = properties != nullptr ? PropertyList(copyNames(properties)) : std::nullopt;
  instance->filterKeys = copyNames(keys);
  return okStatus();
}

CMPIStatus setObjectPath(const CMPIInstance* self, const CMPIObjectPath* path) {
  InstanceObject* instance = InstanceObject::of(self);
  if (instance == nullptr) {
    return invalidHandle();
  }
  const Call call(instance->broker(), Service::SetObjectPath);
  if (call.fails()) {
    return call.status();
  }
  const ObjectPathObject* other = ObjectPathObject::of(path);
  if (other == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "setObjectPath: the path is NULL");
  }
  instance->value.path = other->path;
  return okStatus();
}

}  // namespace

const CMPIInstanceFT instanceOperations = {
    CMPI_VERSION,
    releaseObject<InstanceObject>,
    cloneObject<InstanceObject>,
    getProperty,
    getPropertyAt,
    getPropertyCount,
    setProperty,
    getObjectPath,
    setPropertyFilter,
    setObjectPath,
    setPropertyWithOrigin,
};

}  // namespace Corvcim
