// Apart from the broker itself: through its tables only, as a provider calls it.

#include <cmpimacs.h>

#include "bench/NullBroker.h"

namespace Corvane::Bench::NullBroker {
namespace {

template <class Call>
void times(std::size_t count, Call call) {
  for (; count != 0; --count) {
    call();
  }
}

constexpr const char* identifier = "P0-C100-L2d";
constexpr const char* text = "some text";

}  // namespace

void repeat(const Calls& calls) {
  const CMPIBroker* mb = broker();
  const CMPIResult* out = result();
  CMPIStatus rc{};
  const CMPIValue number{};

  // One object of each kind to call on; not counted.
  CMPIObjectPath* path = mb->eft->newObjectPath(mb, "root/cimv2", "HALDA_CPUProcessor", &rc);
  CMPIInstance* instance = mb->eft->newInstance(mb, path, &rc);
  const CMPIArray* array = mb->eft->newArray(mb, 1, CMPI_uint16, &rc);
  const CMPIString* string = path->ft->getNameSpace(path, &rc);
  const CMPIEnumeration* systems = mb->bft->enumerateInstances(mb, context(), path, nullptr, &rc);

  const auto chars = [](const char* value) { return reinterpret_cast<const CMPIValue*>(value); };
  times(calls[NewObjectPath], [&] { mb->eft->newObjectPath(mb, "root/cimv2", "HALDA_CPUProcessor", &rc); });
  times(calls[NewInstance], [&] { mb->eft->newInstance(mb, path, &rc); });
  times(calls[NewArray], [&] { mb->eft->newArray(mb, 1, CMPI_uint16, &rc); });
  times(calls[NewString], [&] { mb->eft->newString(mb, identifier, &rc); });
  times(calls[GetNameSpace], [&] { path->ft->getNameSpace(path, &rc); });
  times(calls[SetNameSpace], [&] { path->ft->setNameSpace(path, "root/cimv2"); });
  times(calls[SetHostname], [&] { path->ft->setHostname(path, text); });
  times(calls[GetClassName], [&] { path->ft->getClassName(path, &rc); });
  times(calls[AddKey], [&] { path->ft->addKey(path, "SystemName", chars(text), CMPI_chars); });
  times(calls[AddIdentifier], [&] { path->ft->addKey(path, "DeviceID", chars(identifier), CMPI_chars); });
  times(calls[GetKey], [&] { path->ft->getKey(path, "DeviceID", &rc); });
  times(calls[GetKeyCount], [&] { path->ft->getKeyCount(path, &rc); });
  times(calls[SetProperty], [&] { instance->ft->setProperty(instance, "MaxClockSpeed", &number, CMPI_uint32); });
  times(calls[SetIdentifier], [&] { instance->ft->setProperty(instance, "DeviceID", chars(identifier), CMPI_chars); });
  times(calls[SetPropertyFilter], [&] { instance->ft->setPropertyFilter(instance, nullptr, nullptr); });
  times(calls[GetObjectPath], [&] { instance->ft->getObjectPath(instance, &rc); });
  times(calls[GetCharPtr], [&] { string->ft->getCharPtr(string, &rc); });
  times(calls[SetElement], [&] { array->ft->setElementAt(array, 0, &number, CMPI_uint16); });
  times(calls[EnumerateInstances], [&] { mb->bft->enumerateInstances(mb, context(), path, nullptr, &rc); });
  times(calls[EnumerateInstanceNames], [&] { mb->bft->enumerateInstanceNames(mb, context(), path, &rc); });
  times(calls[HasNext], [&] { systems->ft->hasNext(systems, &rc); });
  times(calls[GetNext], [&] { systems->ft->getNext(systems, &rc); });
  times(calls[ReturnInstance], [&] { out->ft->returnInstance(out, instance); });
  times(calls[ReturnObjectPath], [&] { out->ft->returnObjectPath(out, path); });
  times(calls[ReturnDone], [&] { out->ft->returnDone(out); });
}

}  // namespace Corvane::Bench::NullBroker
