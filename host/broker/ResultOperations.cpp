#include "host/broker/Call.h"

namespace Corvcim {
namespace {

// A result is the request's own; nobody may end or double it.

CMPIStatus releaseResult(CMPIResult* self) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  return Call(result->broker(), Service::Release).refuse(CMPI_RC_ERR_NOT_SUPPORTED, "a result belongs to its request");
}

CMPIResult* cloneResult(const CMPIResult* self, CMPIStatus* status) {
  const ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(result->broker(), Service::Clone).refuse(status, CMPI_RC_ERR_NOT_SUPPORTED, "a result cannot be cloned");
}

CMPIStatus returnInstance(const CMPIResult* self, const CMPIInstance* instance) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  const InstanceObject* object = InstanceObject::of(instance);
  const Call call(result->broker(), Service::ReturnInstance,
                  [&] { return object != nullptr ? object->value.path.className : "NULL"; });
  if (call.fails()) {
    return call.status();
  }
  if (object == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "returnInstance: the instance is NULL");
  }
  result->response.instances.push_back(object->complete());
  return okStatus();
}

CMPIStatus returnObjectPath(const CMPIResult* self, const CMPIObjectPath* path) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  const ObjectPathObject* object = ObjectPathObject::of(path);
  const Call call(result->broker(), Service::ReturnObjectPath,
                  [&] { return object != nullptr ? object->path.className : "NULL"; });
  if (call.fails()) {
    return call.status();
  }
  if (object == nullptr) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "returnObjectPath: the path is NULL");
  }
  result->response.paths.push_back(object->path);
  return okStatus();
}

// The operations of this host return instances and paths, nothing else.
CMPIStatus returnData(const CMPIResult* self, const CMPIValue* value, const CMPIType type) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  const Call call(result->broker(), Service::ReturnData, [&] { return typeName(type); });
  if (call.fails()) {
    return call.status();
  }
  const ConvertedValue converted = fromCmpi(value, type);
  if (converted.rc != CMPI_RC_OK) {
    return call.refuse(converted.rc, converted.problem);
  }
  if (converted.value.isNull()) {
    return call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "returnData: the value is NULL");
  }
  if (type == CMPI_instance) {
    result->response.instances.push_back(converted.value.asInstance());
    return okStatus();
  }
  if (type == CMPI_ref) {
    result->response.paths.push_back(converted.value.asReference());
    return okStatus();
  }
  return call.refuse(CMPI_RC_ERR_NOT_SUPPORTED, "returnData: no operation returns a " + typeName(type));
}

CMPIStatus returnDone(const CMPIResult* self) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  const Call call(result->broker(), Service::ReturnDone);
  if (!call.fails()) {
    ++result->response.doneCalls;
  }
  return call.status();
}

CMPIStatus returnError(const CMPIResult* self, const CMPIError* /*error*/) {
  ResultObject* result = ResultObject::of(self);
  if (result == nullptr) {
    return invalidHandle();
  }
  return Call(result->broker(), Service::ReturnError)
      .refuse(CMPI_RC_ERR_NOT_SUPPORTED, "this broker has no error objects");
}

}  // namespace

const CMPIResultFT resultOperations = {
    CMPI_VERSION, releaseResult, cloneResult, returnData, returnInstance, returnObjectPath, returnDone, returnError,
};

}  // namespace Corvcim
