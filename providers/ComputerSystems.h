#ifndef TARN_COMPUTERSYSTEMS_H
#define TARN_COMPUTERSYSTEMS_H

#include "AssociationSteps.h"

/// The computer systems are another provider's: their names and instances come from the broker.
namespace Tarn::CPUProvider {

/// What the broker is asked for: everything of a class, for a request with this context.
struct SystemQuery {
  const CMPIContext* context;
  const CMPIObjectPath* systemClass;
  CMPIStatus* status;
};

namespace detail {

/// Hands each element of the broker's answer, an instance or a path, to `handle`. Brokers answer a failed call
/// with a failing status, and then with an enumeration or without one. An element counts when its pointer is not
/// NULL, whatever its state: some brokers deliver every element in the state of a null value. The walk ends after
/// 1,000 replies in a row without an element, if the enumeration still claims to have more.
template <class Element, class Handle>
bool forEachAnswer(const Association& association, const CMPIEnumeration* enumeration, const CMPIStatus& status,
                   Element* CMPIValue::*kind, Handle handle, unsigned int line, const char* function) {
  if (status.rc != CMPI_RC_OK) {
    // Names are asked for by another call. Log filters match this text: do not correct it.
    association.events.message(LevelError, "Call to CBEnumInstances of target Class Failed.", line, function);
    return false;
  }
  constexpr int maxEmptyReplies = 1000;
  int emptyReplies = 0;
  while (!isNull(enumeration) && CMHasNext(enumeration, nullptr) != 0) {
    if (emptyReplies == maxEmptyReplies) {
      association.events.message(LevelError, "1000 calls in a row gave no computer system: the enumeration is given up",
                                 line, function);
      break;
    }
    CMPIStatus unused = succeeded();  // what counts is whether there is an element
    const CMPIData data = CMGetNext(enumeration, &unused);
    const bool isElement = !isNull(data.value.*kind);
    if (isElement && !handle(data.value.*kind)) {
      return false;
    }
    emptyReplies = isElement ? 0 : emptyReplies + 1;
  }
  return true;
}

}  // namespace detail

// Each hands every computer system to `handle`, until that returns false. False also when the broker's answer
// was a failure, which is logged; the status is then the broker's. The association's broker is read before the
// up-call: during it, a registration may write it.

template <class Handle>
bool forEachSystem(const Association& association, const SystemQuery& query, Handle handle,
                   unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  const CMPIEnumeration* systems = upCall([&, caller = association.broker] {
    // Not CBEnumInstances, whose macro form in the standard's headers does not compile.
    return caller->bft->enumerateInstances(caller, query.context, query.systemClass, nullptr, query.status);
  });
  return detail::forEachAnswer(association, systems, *query.status, &CMPIValue::inst, handle, line, function);
}

template <class Handle>
bool forEachSystemName(const Association& association, const SystemQuery& query, Handle handle,
                       unsigned int line = __builtin_LINE(), const char* function = __builtin_FUNCTION()) {
  const CMPIEnumeration* systems = upCall([&, caller = association.broker] {
    return CBEnumInstanceNames(caller, query.context, query.systemClass, query.status);
  });
  return detail::forEachAnswer(association, systems, *query.status, &CMPIValue::ref, handle, line, function);
}

}  // namespace Tarn::CPUProvider

#endif
