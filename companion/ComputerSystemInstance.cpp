#include "companion/ComputerSystemInstance.h"

#include <cmpimacs.h>

#include <tarn/Common.h>
#include <tarn/Locale.h>
#include <string>

#include "include/CmpiObjects.h"

namespace Tarn::ComputerSystemProvider {
namespace {

using CPUProvider::addKey;
using CPUProvider::equalIgnoringCase;
using CPUProvider::isNull;
using CPUProvider::setProperty;

constexpr int messageCatalogue = 2;
constexpr CMPIUint16 notApplicable = 12;  // RequestedState of what no client can switch

const char* keyNames[] = {"CreationClassName", "Name", nullptr};

/// What a property's setter works on.
struct Target {
  const CMPIBroker* broker;
  CMPIInstance* instance;
  const ComputerSystem& system;
};

void setText(const Target& target, const char* name, const std::string& text) {
  if (!text.empty()) {
    setProperty(target.instance, name, text.c_str());
  }
}

void setNumber(const Target& target, const char* name, CMPIUint16 value) {
  setProperty(target.instance, name, CPUProvider::uint16Value, value);
}

void setList(const Target& target, const char* name, CMPIUint16 value) {
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const CMPIUint16 values[] = {value};
  CMPIArray* array = CPUProvider::newUint16Array(target.broker, values, &status);
  if (!isNull(array) && status.rc == CMPI_RC_OK) {
    setProperty(target.instance, name, CPUProvider::uint16ArrayValue, array);
  }
}

void setMessage(const Target& target, const char* name, const wchar_t* identifier) {
  const std::wstring catalogue = Locale::getResourceLibrary(messageCatalogue, Locale::getLanguageId());
  setText(target, name, make_string(ResourceString(catalogue, identifier).str()));
}

struct Property {
  const char* name;
  void (*set)(const Target& target, const char* name);
};

constexpr Property properties[] = {
    {"CreationClassName", [](const Target& t, const char* name) { setText(t, name, className); }},
    {"Name", [](const Target& t, const char* name) { setText(t, name, t.system.name); }},
    {"Caption", [](const Target& t, const char* name) { setMessage(t, name, L"MSGID_COMPUTER_SYSTEM_CAPTION"); }},
    {"Description",
     [](const Target& t, const char* name) { setMessage(t, name, L"MSGID_COMPUTER_SYSTEM_DESCRIPTION"); }},
    {"ElementName", [](const Target& t, const char* name) { setText(t, name, t.system.name); }},
    {"Model", [](const Target& t, const char* name) { setText(t, name, t.system.model); }},
    {"Manufacturer", [](const Target& t, const char* name) { setText(t, name, t.system.manufacturer); }},
    {"EnabledState", [](const Target& t, const char* name) { setNumber(t, name, t.system.enabledState); }},
    {"RequestedState", [](const Target& t, const char* name) { setNumber(t, name, notApplicable); }},
    {"HealthState", [](const Target& t, const char* name) { setNumber(t, name, t.system.healthState); }},
    {"OperationalStatus", [](const Target& t, const char* name) { setList(t, name, t.system.operationalStatus); }},
};

bool contains(const char* const* names, const char* name) {
  for (; *names != nullptr; ++names) {
    if (equalIgnoringCase(*names, name)) {
      return true;
    }
  }
  return false;
}

bool isSelected(const char* const* selection, const char* name) {
  return selection == nullptr || contains(keyNames, name) || contains(selection, name);
}

/// Whether the broker made nothing. A refusal without a code of its own becomes FAILED.
template <class Object>
bool isRefused(const Object* object, CMPIStatus* status) {
  if (isNull(object) && status->rc == CMPI_RC_OK) {
    status->rc = CMPI_RC_ERR_FAILED;
  }
  return status->rc != CMPI_RC_OK;
}

}  // namespace

CMPIObjectPath* makePath(const CMPIBroker* broker, const CMPIObjectPath* request, const ComputerSystem& system,
                         CMPIStatus* status) {
  CMPIObjectPath* path = CMNewObjectPath(broker, CPUProvider::namespaceOf(request), className, status);
  if (isRefused(path, status)) {
    return nullptr;
  }
  CMSetHostname(path, system.name.c_str());
  addKey(path, keyNames[0], className);
  addKey(path, keyNames[1], system.name.c_str());
  return path;
}

CMPIInstance* makeInstance(const CMPIBroker* broker, const CMPIObjectPath* request, const ComputerSystem& system,
                           const char** selection, CMPIStatus* status) {
  CMPIObjectPath* path = makePath(broker, request, system, status);
  if (path == nullptr) {
    return nullptr;
  }
  CMPIInstance* instance = CMNewInstance(broker, path, status);
  if (isRefused(instance, status)) {
    return nullptr;
  }
  CMSetPropertyFilter(instance, selection, keyNames);
  const Target target = {broker, instance, system};
  for (const Property& property : properties) {
    if (isSelected(selection, property.name)) {
      property.set(target, property.name);
    }
  }
  return instance;
}

}  // namespace Tarn::ComputerSystemProvider
