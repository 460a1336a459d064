#include "companion/ComputerSystem.h"

#include <tarn/Common.h>
#include <tarn/Instrumentation.h>
#include <tarn/NodeLexicon.h>

#include <algorithm>
#include <iterator>
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::ComputerSystemProvider {
namespace {

/// What the inventory's state of the system means in CIM.
struct State {
  unsigned int status;
  std::uint16_t enabledState;
  std::uint16_t healthState;
  std::uint16_t operationalStatus;
};

constexpr State states[] = {
    {0, 0, 0, 0},    // unknown
    {1, 2, 5, 2},    // in use: enabled, healthy
    {12, 6, 5, 10},  // offline: enabled but offline, stopped
    {16, 3, 5, 10},  // disabled by the user
    {21, 2, 10, 3},  // degraded
    {24, 2, 25, 6},  // failed: critical failure, error
};

const State& stateOf(unsigned int status) {
  const auto* const state = std::ranges::find(states, status, &State::status);
  return state == std::end(states) ? states[0] : *state;
}

}  // namespace

ComputerSystem readComputerSystem() {
  ComputerSystem system;
  system.name = getSystemName();
  Instrumentation cursor;
  cursor.selectNode(NodeLexicon::NodeSystem);
  if (!cursor) {
    return system;
  }
  cursor.getProperty(NodeLexicon::PropSystemModel, system.model);
  cursor.getProperty(Inventory::PropSystemManufacturer, system.manufacturer);
  const State& state = stateOf(cursor.getNodeStatus());
  system.enabledState = state.enabledState;
  system.healthState = state.healthState;
  system.operationalStatus = state.operationalStatus;
  return system;
}

}  // namespace Tarn::ComputerSystemProvider
