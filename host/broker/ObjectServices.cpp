#include "host/broker/BrokerTables.h"
#include "host/broker/Call.h"
#include "schema/ClassTable.h"

namespace Corvcim {
namespace {

CMPIInstance* newInstance(const CMPIBroker* handle, const CMPIObjectPath* path, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const ObjectPathObject* object = ObjectPathObject::of(path);
  const Call call(*broker, Service::NewInstance, object != nullptr ? object->path.className.c_str() : nullptr);
  if (object == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "newInstance: the path is NULL");
  }
  return call.object<InstanceObject>(status, Instance{object->path, {}});
}

// A path without a namespace is in order: references to instances in the same namespace are such.
CMPIObjectPath* newObjectPath(const CMPIBroker* handle, const char* nameSpace, const char* className,
                              CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::NewObjectPath, className);
  if (className == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "newObjectPath: the class name is NULL");
  }
  return call.object<ObjectPathObject>(status, ObjectPath{{}, nameSpace != nullptr ? nameSpace : "", className, {}});
}

CMPIArgs* newArgs(const CMPIBroker* handle, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(*broker, Service::NewArgs).object<ArgsObject>(status);
}

CMPIString* newString(const CMPIBroker* handle, const char* text, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::NewString, text);
  if (text == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "newString: the text is NULL");
  }
  return call.object<StringObject>(status, std::string(text));
}

CMPIArray* newArray(const CMPIBroker* handle, CMPICount size, CMPIType type, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::NewArray, [&] { return std::to_string(size) + " " + typeName(type); });
  if (!isValueType(type) || (type & CMPI_ARRAY) != 0) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "newArray: there are no arrays of " + typeName(type));
  }
  const CMPIType elementType = normalizedType(type);
  return call.object<ArrayObject>(status, elementType, std::vector<Value>(size, Value::null(elementType)));
}

CMPIDateTime* newDateTime(const CMPIBroker* handle, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(*broker, Service::NewDateTime).object<DateTimeObject>(status, DateTime::now());
}

CMPIDateTime* newDateTimeFromBinary(const CMPIBroker* handle, CMPIUint64 microseconds, CMPIBoolean interval,
                                    CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(*broker, Service::NewDateTimeFromBinary)
      .object<DateTimeObject>(status, DateTime{microseconds, interval != 0});
}

CMPIDateTime* newDateTimeFromChars(const CMPIBroker* handle, const char* text, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::NewDateTimeFromChars, text);
  const std::optional<DateTime> value = text != nullptr ? DateTime::parse(text) : std::nullopt;
  if (!value) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER,
                       "newDateTimeFromChars: " + quotedText(text != nullptr ? text : "NULL") + " is no CIM date-time");
  }
  return call.object<DateTimeObject>(status, *value);
}

CMPISelectExp* newSelectExp(const CMPIBroker* handle, const char* query, const char* /*language*/,
                            CMPIArray** /*projection*/, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(*broker, Service::NewSelectExp, query)
      .refuse(status, CMPI_RC_ERR_NOT_SUPPORTED, "this broker has no query language");
}

CMPIBoolean classPathIsA(const CMPIBroker* handle, const CMPIObjectPath* path, const char* className,
                         CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  const Call call(*broker, Service::ClassPathIsA, className);
  const ObjectPathObject* object = ObjectPathObject::of(path);
  if (object == nullptr || className == nullptr) {
    call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "classPathIsA: the path or the class name is NULL");
    return 0;
  }
  return call.number(status, static_cast<CMPIBoolean>(isA(object->path.className, className) ? 1 : 0));
}

// Any object's record begins with its handle and its table; the table tells what it is.
struct AnyRecord {
  const void* hdl;
  const void* ft;
};

struct ObjectKind {
  const void* table;
  const char* name;
  std::string (*text)(const void* object);  // of its content; nullptr: its name is all there is to say
};

const ObjectKind* kindOf(const void* object) {
  static const ObjectKind objectKinds[] = {
      {&stringOperations, "CMPIString",
       [](const void* any) { return StringObject::of(static_cast<const CMPIString*>(any))->text; }},
      {&objectPathOperations, "CMPIObjectPath",
       [](const void* any) { return ObjectPathObject::of(static_cast<const CMPIObjectPath*>(any))->path.text(); }},
      {&instanceOperations, "CMPIInstance",
       [](const void* any) { return InstanceObject::of(static_cast<const CMPIInstance*>(any))->complete().text(); }},
      {&arrayOperations, "CMPIArray",
       [](const void* any) {
         const auto* array = ArrayObject::of(static_cast<const CMPIArray*>(any));
         return Value::array(array->elementType, array->elements).text();
       }},
      {&dateTimeOperations, "CMPIDateTime",
       [](const void* any) { return DateTimeObject::of(static_cast<const CMPIDateTime*>(any))->value.text(); }},
      {&enumerationOperations, "CMPIEnumeration", nullptr},
      {&contextOperations, "CMPIContext", nullptr},
      {&argsOperations, "CMPIArgs", nullptr},
      {&resultOperations, "CMPIResult", nullptr},
  };
  const auto* record = static_cast<const AnyRecord*>(object);
  for (const ObjectKind& each : objectKinds) {
    if (record != nullptr && record->hdl != nullptr && each.table == record->ft) {
      return &each;
    }
  }
  return nullptr;
}

CMPIString* toString(const CMPIBroker* handle, const void* object, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::ToString);
  const ObjectKind* kind = kindOf(object);
  if (kind == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "toString: this is no object of this broker");
  }
  return call.object<StringObject>(status, kind->text != nullptr ? kind->text(object) : kind->name);
}

CMPIBoolean isOfType(const CMPIBroker* handle, const void* object, const char* type, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  const Call call(*broker, Service::IsOfType, type);
  const ObjectKind* kind = kindOf(object);
  if (kind == nullptr || type == nullptr) {
    call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "isOfType: no type, or no object of this broker");
    return 0;
  }
  return call.number(status, static_cast<CMPIBoolean>(std::string_view(type) == kind->name ? 1 : 0));
}

CMPIString* getType(const CMPIBroker* handle, const void* object, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::GetType);
  const ObjectKind* kind = kindOf(object);
  if (kind == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "getType: this is no object of this broker");
  }
  return call.object<StringObject>(status, std::string(kind->name));
}

// There are no message catalogues: the default text it is, as it stands.
CMPIString* defaultMessage(const CMPIBroker* handle, const char* id, const char* defaultText, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(*broker, Service::GetMessage, id);
  if (defaultText == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "getMessage: the default text is NULL");
  }
  return call.object<StringObject>(status, std::string(defaultText));
}

CMPIString* getMessage(const CMPIBroker* handle, const char* id, const char* defaultText, CMPIStatus* status,
                       CMPICount /*count*/, ...) {
  return defaultMessage(handle, id, defaultText, status);
}

CMPIString* getMessage2(const CMPIBroker* handle, const char* id, CMPIMsgFileHandle /*file*/, const char* defaultText,
                        CMPIStatus* status, CMPICount /*count*/, ...) {
  return defaultMessage(handle, id, defaultText, status);
}

// Log and trace messages are recorded with all other calls and go nowhere else.
CMPIStatus note(const CMPIBroker* handle, Service service, const char* text, const CMPIString* string) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    return invalidHandle();
  }
  const StringObject* object = StringObject::of(string);
  return Call(*broker, service, text == nullptr && object != nullptr ? object->text.c_str() : text).status();
}

CMPIStatus logMessage(const CMPIBroker* handle, CMPISeverity /*severity*/, const char* /*id*/, const char* text,
                      const CMPIString* string) {
  return note(handle, Service::LogMessage, text, string);
}

CMPIStatus trace(const CMPIBroker* handle, CMPILevel /*level*/, const char* /*component*/, const char* text,
                 const CMPIString* string) {
  return note(handle, Service::Trace, text, string);
}

CMPIError* newCMPIError(const CMPIBroker* handle, const char*, const char*, const char* message,
                        const CMPIErrorSeverity, const CMPIErrorProbableCause, const CMPIrc, CMPIStatus* status) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(*broker, Service::NewError, message)
      .refuse(status, CMPI_RC_ERR_NOT_SUPPORTED, "this broker has no error objects");
}

CMPIStatus openMessageFile(const CMPIBroker* handle, const char* file, CMPIMsgFileHandle* result) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    return invalidHandle();
  }
  if (result != nullptr) {
    *result = nullptr;
  }
  return Call(*broker, Service::OpenMessageFile, file)
      .refuse(CMPI_RC_ERR_NOT_SUPPORTED, "this broker has no message files");
}

CMPIStatus closeMessageFile(const CMPIBroker* handle, CMPIMsgFileHandle /*file*/) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    return invalidHandle();
  }
  return Call(*broker, Service::CloseMessageFile).refuse(CMPI_RC_ERR_NOT_SUPPORTED, "this broker has no message files");
}

}  // namespace

const CMPIBrokerEncFT objectServices = {
    CMPI_VERSION,
    newInstance,
    newObjectPath,
    newArgs,
    newString,
    newArray,
    newDateTime,
    newDateTimeFromBinary,
    newDateTimeFromChars,
    newSelectExp,
    classPathIsA,
    toString,
    isOfType,
    getType,
    getMessage,
    logMessage,
    trace,
    newCMPIError,
    openMessageFile,
    closeMessageFile,
    getMessage2,
};

}  // namespace Corvcim
