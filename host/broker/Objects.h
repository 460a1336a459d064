#ifndef CORVCIM_OBJECTS_H
#define CORVCIM_OBJECTS_H

#include <cmpift.h>

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "host/broker/Arena.h"
#include "host/broker/DateTime.h"
#include "host/broker/Instance.h"
#include "host/broker/Operation.h"

namespace Corvcim {

class Request;

extern const CMPIStringFT stringOperations;
extern const CMPIArrayFT arrayOperations;
extern const CMPIObjectPathFT objectPathOperations;
extern const CMPIInstanceFT instanceOperations;
extern const CMPIEnumerationFT enumerationOperations;
extern const CMPIContextFT contextOperations;
extern const CMPIArgsFT argsOperations;
extern const CMPIResultFT resultOperations;
extern const CMPIDateTimeFT dateTimeOperations;

/// What belongs to the { hdl, ft } record that a provider sees. The handle holds the address of this
/// part of a Derived.
template <class RecordType, class Derived>
class Encapsulated : public Object {
 public:
  using Record = RecordType;

  ~Encapsulated() override = default;
  Encapsulated& operator=(const Encapsulated&) = delete;

  /// NULL for a NULL record and for one without a handle.
  static Derived* of(const Record* record) {
    auto* const part = record == nullptr ? nullptr : static_cast<Encapsulated*>(const_cast<void*>(record->hdl));
    return static_cast<Derived*>(part);
  }

  [[nodiscard]] Record* record() { return &record_; }

 protected:
  template <class Table>
  explicit Encapsulated(const Table& table) : record_{this, &table} {}

  /// A copy has a handle of its own.
  Encapsulated(const Encapsulated& other) : Object(other), record_{this, other.record_.ft} {}

 private:
  Record record_;
};

class StringObject : public Encapsulated<CMPIString, StringObject> {
 public:
  explicit StringObject(std::string value) : Encapsulated(stringOperations), text(std::move(value)) {}

  const std::string text;
};

class ArrayObject : public Encapsulated<CMPIArray, ArrayObject> {
 public:
  ArrayObject(CMPIType type, std::vector<Value> values)
      : Encapsulated(arrayOperations), elementType(type), elements(std::move(values)) {}

  const CMPIType elementType;
  std::vector<Value> elements;
};

class ObjectPathObject : public Encapsulated<CMPIObjectPath, ObjectPathObject> {
 public:
  explicit ObjectPathObject(ObjectPath value) : Encapsulated(objectPathOperations), path(std::move(value)) {}

  ObjectPath path;
};

class InstanceObject : public Encapsulated<CMPIInstance, InstanceObject> {
 public:
  explicit InstanceObject(Instance contents) : Encapsulated(instanceOperations), value(std::move(contents)) {}

  /// The instance with the path that follows from its properties.
  [[nodiscard]] Instance complete() const { return {instancePath(value.path, value.properties), value.properties}; }

  Instance value;                       ///< its path is the one given to newInstance or setObjectPath
  PropertyList filter;                  ///< none: everything may be set
  std::vector<std::string> filterKeys;  ///< may always be set
};

class EnumerationObject : public Encapsulated<CMPIEnumeration, EnumerationObject> {
 public:
  /// Elements are all instances or all references, by `type`.
  EnumerationObject(CMPIType type, std::vector<Value> values)
      : Encapsulated(enumerationOperations), elementType(type), elements(std::move(values)) {}

  const CMPIType elementType;
  const std::vector<Value> elements;
  std::size_t position = 0;
};

class ContextObject : public Encapsulated<CMPIContext, ContextObject> {
 public:
  ContextObject(Request* owner, std::vector<NamedValue> values)
      : Encapsulated(contextOperations), request(owner), entries(std::move(values)) {}

  Request* const request;  ///< whose context it is; a thread that attaches with it works for that request
  std::vector<NamedValue> entries;
};

class ArgsObject : public Encapsulated<CMPIArgs, ArgsObject> {
 public:
  explicit ArgsObject(std::vector<NamedValue> values = {}) : Encapsulated(argsOperations), entries(std::move(values)) {}

  std::vector<NamedValue> entries;
};

class ResultObject : public Encapsulated<CMPIResult, ResultObject> {
 public:
  ResultObject() : Encapsulated(resultOperations) {}

  Response response;  ///< its status is not used
};

class DateTimeObject : public Encapsulated<CMPIDateTime, DateTimeObject> {
 public:
  explicit DateTimeObject(DateTime moment) : Encapsulated(dateTimeOperations), value(moment) {}

  const DateTime value;
};

}  // namespace Corvcim

#endif
