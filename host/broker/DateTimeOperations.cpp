#include "host/broker/Call.h"

namespace Corvcim {
namespace {

CMPIUint64 getBinaryFormat(const CMPIDateTime* self, CMPIStatus* status) {
  const DateTimeObject* object = DateTimeObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  return Call(object->broker(), Service::GetBinaryFormat)
      .number(status, static_cast<CMPIUint64>(object->value.microseconds));
}

CMPIString* getStringFormat(const CMPIDateTime* self, CMPIStatus* status) {
  const DateTimeObject* object = DateTimeObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  return Call(object->broker(), Service::GetStringFormat).object<StringObject>(status, object->value.text());
}

CMPIBoolean isInterval(const CMPIDateTime* self, CMPIStatus* status) {
  const DateTimeObject* object = DateTimeObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  return Call(object->broker(), Service::IsInterval)
      .number(status, static_cast<CMPIBoolean>(object->value.interval ? 1 : 0));
}

}  // namespace

const CMPIDateTimeFT dateTimeOperations = {
    CMPI_VERSION, releaseObject<DateTimeObject>, cloneObject<DateTimeObject>, getBinaryFormat, getStringFormat,
    isInterval,
};

}  // namespace Corvcim
