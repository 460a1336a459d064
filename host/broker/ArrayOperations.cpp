#include "host/broker/Call.h"

namespace Corvcim {
namespace {

std::string outOfRange(CMPICount index, const ArrayObject& array) {
  return "index " + std::to_string(index) + " is outside an array of " + std::to_string(array.elements.size()) +
         " elements";
}

CMPICount getSize(const CMPIArray* self, CMPIStatus* status) {
  const ArrayObject* array = ArrayObject::of(self);
  if (array == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  const Call call(array->broker(), Service::GetSize);
  return call.number(status, static_cast<CMPICount>(array->elements.size()));
}

CMPIType getSimpleType(const CMPIArray* self, CMPIStatus* status) {
  const ArrayObject* array = ArrayObject::of(self);
  if (array == nullptr) {
    store(status, invalidHandle());
    return CMPI_null;
  }
  const Call call(array->broker(), Service::GetSimpleType);
  return call.number(status, array->elementType);
}

CMPIData getElementAt(const CMPIArray* self, CMPICount index, CMPIStatus* status) {
  const ArrayObject* array = ArrayObject::of(self);
  if (array == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(array->broker(), Service::GetElementAt, [&] { return std::to_string(index); });
  if (index >= array->elements.size()) {
    return call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY, outOfRange(index, *array), CMPI_badValue);
  }
  return call.data(status, array->elements[index]);
}

CMPIStatus setElementAt(const CMPIArray* self, CMPICount index, const CMPIValue* value, CMPIType type) {
  ArrayObject* array = ArrayObject::of(self);
  if (array == nullptr) {
    return invalidHandle();
  }
  const Call call(array->broker(), Service::SetElementAt, [&] { return std::to_string(index); });
  if (call.fails()) {
    return call.status();
  }
  if (index >= array->elements.size()) {
    return call.refuse(CMPI_RC_ERR_NO_SUCH_PROPERTY, outOfRange(index, *array));
  }
  if (type == CMPI_null) {
    array->elements[index] = Value::null(array->elementType);
    return okStatus();
  }
  ConvertedValue converted = fromCmpi(value, type);
  if (converted.rc != CMPI_RC_OK) {
    return call.refuse(converted.rc, converted.problem);
  }
  if (converted.value.type() != array->elementType) {
    return call.refuse(CMPI_RC_ERR_TYPE_MISMATCH,
                       "an array of " + typeName(array->elementType) + " takes no element of type " + typeName(type));
  }
  array->elements[index] = std::move(converted.value);
  return okStatus();
}

}  // namespace

const CMPIArrayFT arrayOperations = {
    CMPI_VERSION, releaseObject<ArrayObject>, cloneObject<ArrayObject>, getSize, getSimpleType, getElementAt,
    setElementAt,
};

}  // namespace Corvcim
