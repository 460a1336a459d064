#ifndef CORVCIM_CALL_H
#define CORVCIM_CALL_H

#include <cmpift.h>

#include <optional>
#include <string>
#include <string_view>
#include <utility>

#include "host/broker/Broker.h"
#include "host/broker/Conversion.h"
#include "host/broker/Objects.h"

namespace Corvcim {

/// A status whose message is made in the current request; `broker` NULL or an empty text: no message.
[[nodiscard]] CMPIStatus makeStatus(Broker* broker, CMPIrc rc, std::string_view message);

[[nodiscard]] inline CMPIStatus okStatus() {
  return {CMPI_RC_OK, nullptr};
}

inline void store(CMPIStatus* target, const CMPIStatus& status) {
  if (target != nullptr) {
    *target = status;
  }
}

/// For calls on a NULL object or one without a handle: nobody knows which broker it is of.
[[nodiscard]] inline CMPIStatus invalidHandle() {
  return {CMPI_RC_ERR_INVALID_HANDLE, nullptr};
}

/// A value that is not there, with that state.
[[nodiscard]] CMPIData noData(CMPIValueState state);

/// One call of a service by a provider: counted and recorded when made, failing if a test asked for
/// that, and turned into whatever the slot gives back. A slot reads: find the object, make the call,
/// test the arguments, do the work.
class Call {
 public:
  /// `detail` gives the text for the record; it is asked for only while recording.
  template <class Detail>
  Call(Broker& broker, Service service, const Detail& detail)
      : broker_(broker), failure_(broker.services().enter(service, detail)) {}
  Call(Broker& broker, Service service, const char* detail)
      : Call(broker, service, [detail] { return std::string(detail == nullptr ? "NULL" : detail); }) {}
  Call(Broker& broker, Service service) : Call(broker, service, "") {}

  [[nodiscard]] Broker& broker() const { return broker_; }

  /// Whether a test wants this call to fail, and the status for it (OK else).
  [[nodiscard]] bool fails() const { return failure_.has_value(); }
  [[nodiscard]] CMPIStatus status() const;

  /// A refusal of the broker's own: a failing status, with it a NULL object or a value that is not there.
  [[nodiscard]] CMPIStatus refuse(CMPIrc rc, std::string_view message) const;
  std::nullptr_t refuse(CMPIStatus* target, CMPIrc rc, std::string_view message) const;
  CMPIData refuseData(CMPIStatus* target, CMPIrc rc, std::string_view message,
                      CMPIValueState state = CMPI_nullValue) const;

  /// A new object of the current request, or what a test wants instead of it.
  template <class T, class... Arguments>
  typename T::Record* object(CMPIStatus* target, Arguments&&... arguments) const {
    return objectIn<T>(broker_.currentArena(), target, std::forward<Arguments>(arguments)...);
  }

  template <class T, class... Arguments>
  typename T::Record* objectIn(Arena& arena, CMPIStatus* target, Arguments&&... arguments) const {
    store(target, status());
    if (fails() && failure_->result == FailureResult::Null) {
      return nullptr;
    }
    auto* const record = arena.make<T>(std::forward<Arguments>(arguments)...)->record();
    if (fails() && failure_->result == FailureResult::HandleLess) {
      record->hdl = nullptr;
    }
    return record;
  }

  /// A value with its objects in the current request, `state` added to its own, or what a test wants.
  CMPIData data(CMPIStatus* target, const Value& value, CMPIValueState state = CMPI_goodValue) const;

  /// A count or truth: 0 when the call has to fail.
  template <class T>
  T number(CMPIStatus* target, T value) const {
    store(target, status());
    return fails() && failure_->result != FailureResult::StatusOnly ? T{} : value;
  }

 private:
  Broker& broker_;
  std::optional<Failure> failure_;
};

/// clone and release, the same for every kind of object.

template <class T>
typename T::Record* cloneObject(const typename T::Record* self, CMPIStatus* status) {
  const T* object = T::of(self);
  if (object == nullptr) {
    store(status, invalidHandle());
    return nullptr;
  }
  const Call call(object->broker(), Service::Clone);
  return call.objectIn<T>(call.broker().keptObjects(), status, *object);
}

template <class T>
CMPIStatus releaseObject(typename T::Record* self) {
  T* object = T::of(self);
  if (object == nullptr) {
    return invalidHandle();
  }
  const Call call(object->broker(), Service::Release);
  if (!call.fails()) {
    object->arena().free(object);
  }
  return call.status();
}

}  // namespace Corvcim

#endif
