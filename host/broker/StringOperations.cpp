#include "host/broker/Call.h"

namespace Corvcim {
namespace {

const char* getCharPtr(const CMPIString* self, CMPIStatus* status) {
  const StringObject* object = StringObject::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(object->broker(), Service::GetCharPtr, object->text.c_str());
  return call.number(status, object->text.c_str());
}

}  // namespace

const CMPIStringFT stringOperations = {
    CMPI_VERSION,
    releaseObject<StringObject>,
    cloneObject<StringObject>,
    getCharPtr,
};

}  // namespace Corvcim
