#include "host/broker/Call.h"

namespace Corvcim {
namespace {

void loseHandle(CMPIData& data) {
  switch (data.type) {
    case CMPI_string:
      data.value.string->hdl = nullptr;
      break;
    case CMPI_ref:
      data.value.ref->hdl = nullptr;
      break;
    case CMPI_instance:
      data.value.inst->hdl = nullptr;
      break;
    case CMPI_dateTime:
      data.value.dateTime->hdl = nullptr;
      break;
    default:
      if ((data.type & CMPI_ARRAY) != 0) {
        data.value.array->hdl = nullptr;
      }
      break;
  }
}

}  // namespace

CMPIStatus makeStatus(Broker* broker, CMPIrc rc, std::string_view message) {
  if (broker == nullptr || message.empty()) {
    return {rc, nullptr};
  }
  return {rc, broker->currentArena().make<StringObject>(std::string(message))->record()};
}

CMPIData noData(CMPIValueState state) {
  CMPIData data{};
  data.type = CMPI_null;
  data.state = state;
  return data;
}

CMPIStatus Call::status() const {
  return failure_ ? makeStatus(&broker_, failure_->rc, failure_->message) : okStatus();
}

CMPIStatus Call::refuse(CMPIrc rc, std::string_view message) const {
  return makeStatus(&broker_, rc, message);
}

std::nullptr_t Call::refuse(CMPIStatus* target, CMPIrc rc, std::string_view message) const {
  store(target, refuse(rc, message));
  return nullptr;
}

CMPIData Call::refuseData(CMPIStatus* target, CMPIrc rc, std::string_view message, CMPIValueState state) const {
  store(target, refuse(rc, message));
  return noData(state);
}

CMPIData Call::data(CMPIStatus* target, const Value& value, CMPIValueState state) const {
  store(target, status());
  if (fails() && failure_->result == FailureResult::Null) {
    return noData(CMPI_nullValue);
  }
  CMPIData data = toCmpi(broker_.currentArena(), value);
  data.state = static_cast<CMPIValueState>(data.state | state);
  if (fails() && failure_->result == FailureResult::HandleLess && !value.isNull()) {
    loseHandle(data);
  }
  return data;
}

}  // namespace Corvcim
