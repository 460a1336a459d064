#include "host/broker/Call.h"

namespace Corvcim {
namespace {

// The three plain parts of a path are set and read alike.

CMPIStatus setPart(const CMPIObjectPath* self, Service service, std::string ObjectPath::*part, const char* text) {
  ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    return invalidHandle();
  }
  const Call call(object->broker(), service, text);
  if (call.fails()) {
    return call.status();
  }
  if (text == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, std::string(serviceName(service)) + ": the text is NULL");
  }
  object->path.*part = text;
  return okStatus();
}

CMPIString* getPart(const CMPIObjectPath* self, Service service, std::string ObjectPath::*part, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(object->broker(), service).object<StringObject>(status, object->path.*part);
}

CMPIStatus setNameSpace(const CMPIObjectPath* self, const char* text) {
  return setPart(self, Service::SetNameSpace, &ObjectPath::nameSpace, text);
}

CMPIString* getNameSpace(const CMPIObjectPath* self, CMPIStatus* status) {
  return getPart(self, Service::GetNameSpace, &ObjectPath::nameSpace, status);
}

CMPIStatus setHostname(const CMPIObjectPath* self, const char* text) {
  return setPart(self, Service::SetHostname, &ObjectPath::host, text);
}

CMPIString* getHostname(const CMPIObjectPath* self, CMPIStatus* status) {
  return getPart(self, Service::GetHostname, &ObjectPath::host, status);
}

CMPIStatus setClassName(const CMPIObjectPath* self, const char* text) {
  return setPart(self, Service::SetClassName, &ObjectPath::className, text);
}

CMPIString* getClassName(const CMPIObjectPath* self, CMPIStatus* status) {
  return getPart(self, Service::GetClassName, &ObjectPath::className, status);
}

CMPIStatus addKey(const CMPIObjectPath* self, const char* name, const CMPIValue* value, const CMPIType type) {
  ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    return invalidHandle();
  }
  const Call call(object->broker(), Service::AddKey, name);
  if (call.fails()) {
    return call.status();
  }
  if (name == nullptr || value == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "addKey: the name or the value is NULL");
  }
  ConvertedValue converted = fromCmpi(value, type);
  if (converted.rc != CMPI_RC_OK) {
    return call.refuse(converted.rc, "addKey of " + std::string(name) + ": " + converted.problem);
  }
  if (converted.value.isNull() || converted.value.isArray()) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER,
                       "addKey of " + std::string(name) + ": a key is neither NULL nor an array");
  }
  assignValue(object->path.keys, name, std::move(converted.value));
  return okStatus();
}

CMPIData getKey(const CMPIObjectPath* self, const char* name, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(object->broker(), Service::GetKey, name);
  if (name == nullptr) {
    return call.refuseData(status, CMPI_RC_ERR_INVALID_PARAMETER, "getKey: the name is NULL", CMPI_badValue);
  }
  const Value* value = object->path.key(name);
  if (value == nullptr && !call.fails()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY,
                           "the path of " + object->path.className + " has no key " + name, CMPI_notFound);
  }
  return call.data(status, value != nullptr ? *value : Value(), CMPI_keyValue);
}

CMPIData getKeyAt(const CMPIObjectPath* self, CMPICount index, CMPIString** name, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(object->broker(), Service::GetKeyAt, [&] { return std::to_string(index); });
  if (index >= object->path.keys.size()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY,
                           "the path of " + object->path.className + " has no key number " + std::to_string(index),
                           CMPI_notFound);
  }
  const NamedValue& key = object->path.keys[index];
  if (name != nullptr) {
    *name = call.broker().currentArena().make<StringObject>(key.name)->record();
  }
  return call.data(status, key.value, CMPI_keyValue);
}

CMPICount getKeyCount(const CMPIObjectPath* self, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  return Call(object->broker(), Service::GetKeyCount).number(status, static_cast<CMPICount>(object->path.keys.size()));
}

CMPIStatus copyLocation(const CMPIObjectPath* self, const CMPIObjectPath* source, Service service, bool withHost) {
  ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    return invalidHandle();
  }
  const Call call(object->broker(), service);
  if (call.fails()) {
    return call.status();
  }
  const ObjectPathObject* other = ObjectPathObject::of(source);
  if (other == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, std::string(serviceName(service)) + ": the source path is NULL");
  }
  object->path.nameSpace = other->path.nameSpace;
  if (withHost) {
    object->path.host = other->path.host;
  }
  return okStatus();
}

CMPIStatus setNameSpaceFromObjectPath(const CMPIObjectPath* self, const CMPIObjectPath* source) {
  return copyLocation(self, source, Service::SetNameSpaceFromObjectPath, false);
}

CMPIStatus setHostAndNameSpaceFromObjectPath(const CMPIObjectPath* self, const CMPIObjectPath* source) {
  return copyLocation(self, source, Service::SetHostAndNameSpaceFromObjectPath, true);
}

// The class table has no qualifiers but those that its columns stand for, and nobody asks for them.
CMPIData refuseQualifier(const CMPIObjectPath* self, const char* qualifier, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(object->broker(), Service::GetQualifier, qualifier);
  return call.refuseData(status, CMPI_RC_ERR_NOT_SUPPORTED, "this broker keeps no qualifiers");
}

CMPIData getClassQualifier(const CMPIObjectPath* self, const char* qualifier, CMPIStatus* status) {
  return refuseQualifier(self, qualifier, status);
}

CMPIData getMemberQualifier(const CMPIObjectPath* self, const char* /*member*/, const char* qualifier,
                            CMPIStatus* status) {
  return refuseQualifier(self, qualifier, status);
}

CMPIData getParameterQualifier(const CMPIObjectPath* self, const char* /*method*/, const char* /*parameter*/,
                               const char* qualifier, CMPIStatus* status) {
  return refuseQualifier(self, qualifier, status);
}

CMPIString* toString(const CMPIObjectPath* self, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(object->broker(), Service::PathToString).object<StringObject>(status, object->path.text());
}

}  // namespace

const CMPIObjectPathFT objectPathOperations = {
    CMPI_VERSION,
    releaseObject<ObjectPathObject>,
    cloneObject<ObjectPathObject>,
    setNameSpace,
    getNameSpace,
    setHostname,
    getHostname,
    setClassName,
    getClassName,
    addKey,
    getKey,
    getKeyAt,
    getKeyCount,
    setNameSpaceFromObjectPath,
    setHostAndNameSpaceFromObjectPath,
    getClassQualifier,
    getMemberQualifier,
    getMemberQualifier,
    getParameterQualifier,
    toString,
};

}  // namespace Corvcim
