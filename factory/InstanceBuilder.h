#ifndef TARN_INSTANCEBUILDER_H
#define TARN_INSTANCEBUILDER_H

#include <CmpiObjects.h>
#include <tarn/Common.h>
#include <tarn/Locale.h>

#include <span>
#include <string>
#include <string_view>
#include <vector>

#include "FactoryEvents.h"
#include "ObjectKeys.h"

/// From a record to a CMPI instance, by a table of the class's properties.
namespace Tarn::CPUProvider {

/// What a builder says when the broker cannot make the array of a property.
struct ArrayFailure {
  const char* text;
  int level;
  bool setsStatus;
};

/// The instance that is being made, and what its properties may need.
struct InstanceTarget {
  const CMPIBroker* broker;
  CMPIInstance* instance;
  CMPIStatus* rc;
  const ArrayFailure& arrayFailure;
  const char* function;  ///< that events are reported for
};

/// One property: its name, and how its value gets from the record into the instance.
template <class Record>
struct Property {
  const char* name;
  void (*set)(const InstanceTarget& target, const Property& property, Record& record);
  const wchar_t* messageId = nullptr;  ///< localized texts: the message
  const char* traceName = nullptr;     ///< the name of the variable that the value is traced as
  const char* selection = name;        ///< the name by which a property list selects it
};

template <class Record>
struct InstanceClass {
  const char* name;
  KeyStyle keyStyle;
  std::string (Record::*identifier)() const;
  std::span<const Property<Record>> properties;
  ArrayFailure arrayFailure;
};

/// The name that selects a property of a class, by that name in any case of its letters; NULL if the class has none.
template <class Record>
const char* selectionOf(std::span<const Property<Record>> properties, std::string_view name) {
  for (const Property<Record>& property : properties) {
    if (equalIgnoringCase(property.selection, name)) {
      return property.selection;
    }
  }
  return nullptr;
}

/// The same for the classes of cores and caches.
const char* selectionOfCoresAndCaches(std::string_view name);

/// Which properties a request wants beside the keys. Names compare exactly.
class Selection {
 public:
  Selection(const char** properties, bool isObjPath)
      : properties_(properties), all_(properties == nullptr && !isObjPath) {}

  bool wants(std::string_view name) const {
    if (properties_ == nullptr) {
      return all_;
    }
    for (const char** entry = properties_; *entry != nullptr; ++entry) {
      if (*entry == name) {
        return true;
      }
    }
    return false;
  }

 private:
  const char** properties_;
  bool all_;
};

// The ways of setting a property; Getter is the record's member function.

template <auto Getter, class Record>
void chars(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  const std::string value = (record.*Getter)();
  if (property.traceName != nullptr) {
    factoryEvents.variable(property.traceName, value.c_str(), __builtin_LINE(), target.function);
  }
  setProperty(target.instance, property.name, value.c_str());
}

template <class Record>
void localized(const InstanceTarget& target, const Property<Record>& property, Record& /*record*/) {
  constexpr int processorTexts = 2;
  const std::wstring library = Locale::getResourceLibrary(processorTexts, Locale::getLanguageId());
  const std::string text = make_string(ResourceString(library, property.messageId).str());
  setProperty(target.instance, property.name, text.c_str());
}

template <auto Getter, class Record>
void uint16(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  const CMPIUint16 value = (record.*Getter)();
  if (property.traceName != nullptr) {
    factoryEvents.variable(property.traceName, value, __builtin_LINE(), target.function);
  }
  setProperty(target.instance, property.name, uint16Value, value);
}

template <auto Getter, class Record>
void uint16UnlessZero(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  if ((record.*Getter)() != 0) {
    uint16<Getter>(target, property, record);
  }
}

template <auto Getter, class Record>
void uint32(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  setProperty(target.instance, property.name, uint32Value, (record.*Getter)());
}

template <auto Getter, class Record>
void uint64(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  setProperty(target.instance, property.name, uint64Value, (record.*Getter)());
}

template <auto Getter, class Record>
void boolean(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  setProperty(target.instance, property.name, booleanValue, (record.*Getter)() ? 1 : 0);
}

/// An array that the broker cannot make leaves the property out.
template <auto Getter, class Record>
void uint16Array(const InstanceTarget& target, const Property<Record>& property, Record& record) {
  CMPIArray* array = newUint16Array(target.broker, (record.*Getter)(), target.rc);
  if (isNull(array)) {
    const ArrayFailure& failure = target.arrayFailure;
    if (failure.setsStatus) {
      setFailure(target.broker, target.rc, failure.text);
    }
    factoryEvents.message(failure.level, failure.text, __builtin_LINE(), target.function);
    return;
  }
  setProperty(target.instance, property.name, uint16ArrayValue, array);
}

/// Makes the instance of one record. NULL when there is no object path; the broker's own answer when
/// there is no instance.
template <class Record>
CMPIInstance* makeInstance(const InstanceClass<Record>& instanceClass, const CMPIBroker* broker,
                           const CMPIObjectPath* ref, Record& record, const char** properties, bool isObjPath,
                           CMPIStatus* rc, const char* function = __builtin_FUNCTION()) {
  const std::string systemName = getSystemName();
  const CMPIObjectPath* path = newPath(broker, ref, instanceClass.name, systemName, rc, nullptr);
  if (isNull(path)) {
    return nullptr;
  }
  CMPIInstance* instance = CMNewInstance(broker, path, nullptr);
  if (isNull(instance)) {
    return instance;
  }
  if (!isObjPath) {
    CMSetPropertyFilter(instance, properties, keyNames(instanceClass.keyStyle));
  }
  const ObjectKeys keys(instanceClass.keyStyle, instanceClass.name, (record.*instanceClass.identifier)(), systemName);
  for (const ObjectKeys::Key& key : keys) {
    setProperty(instance, key.name, key.value);
  }

  const InstanceTarget target{broker, instance, rc, instanceClass.arrayFailure, function};
  const Selection selection(properties, isObjPath);
  for (const Property<Record>& property : instanceClass.properties) {
    if (selection.wants(property.selection)) {
      property.set(target, property, record);
    }
  }
  return instance;
}

}  // namespace Tarn::CPUProvider

#endif
