#include "host/broker/Call.h"

namespace Corvcim {
namespace {

CMPIData getNext(const CMPIEnumeration* self, CMPIStatus* status) {
  EnumerationObject* enumeration = EnumerationObject::of(self);
  if (enumeration == nullptr) {
    store(status, invalidHandle());
    return noData(CMPI_badValue);
  }
  const Call call(enumeration->broker(), Service::GetNext);
  if (enumeration->position == enumeration->elements.size()) {
    return call.refuseData(status, CMPI_RC_NO_MORE_ELEMENTS, "getNext: the enumeration is at its end", CMPI_notFound);
  }
  return call.data(status, enumeration->elements[enumeration->position++]);
}

CMPIBoolean hasNext(const CMPIEnumeration* self, CMPIStatus* status) {
  const EnumerationObject* enumeration = EnumerationObject::of(self);
  if (enumeration == nullptr) {
    store(status, invalidHandle());
    return 0;
  }
  const Call call(enumeration->broker(), Service::HasNext);
  return call.number(status, static_cast<CMPIBoolean>(enumeration->position < enumeration->elements.size() ? 1 : 0));
}

CMPIArray* toArray(const CMPIEnumeration* self, CMPIStatus* status) {
  const EnumerationObject* enumeration = EnumerationObject::of(self);
  if (enumeration == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(enumeration->broker(), Service::ToArray);
  return call.object<ArrayObject>(status, enumeration->elementType, enumeration->elements);
}

}  // namespace

const CMPIEnumerationFT enumerationOperations = {
    CMPI_VERSION, releaseObject<EnumerationObject>, cloneObject<EnumerationObject>, getNext, hasNext, toArray,
};

}  // namespace Corvcim
