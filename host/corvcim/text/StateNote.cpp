#include "host/corvcim/text/StateNote.h"

#include <algorithm>
#include <array>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim {
namespace {

struct State {
  unsigned int status;
  std::string_view note;
  Severity severity;
};

namespace Status = Tarn::Inventory::Status;

constexpr std::array<State, 13> states = {{
    {Status::inUse, "", Severity::Fine},
    {2, "starting", Severity::Degraded},
    {3, "stopping", Severity::Degraded},
    {8, "dormant", Severity::Fine},
    {10, "stopped", Severity::Degraded},
    {Status::offline, "offline", Severity::Degraded},
    {13, "lost communication", Severity::Unknown},
    {Status::emptySocket, "empty socket", Severity::Fine},
    {Status::disabled, "disabled", Severity::Degraded},
    {17, "no contact", Severity::Unknown},
    {20, "predictive failure", Severity::Degraded},
    {21, "degraded", Severity::Degraded},
    {Status::failed, "failed", Severity::Failed},
}};

const State* findState(unsigned int status) {
  const auto* const state = std::ranges::find(states, status, &State::status);
  return state == states.end() ? nullptr : state;
}

}  // namespace

std::string_view severityName(Severity severity) {
  constexpr std::array<std::string_view, 4> names = {"OK", "DEGRADED", "UNKNOWN", "FAILED"};
  return names[static_cast<std::size_t>(severity)];
}

Severity severityOf(unsigned int status) {
  const State* state = findState(status);
  return state == nullptr ? Severity::Unknown : state->severity;
}

std::string stateNote(unsigned int status) {
  const State* state = findState(status);
  return state == nullptr ? "status " + std::to_string(status) : std::string(state->note);
}

}  // namespace Corvcim
