#include "host/corvcim/diff/FieldWordings.h"

#include <algorithm>
#include <array>

#include "host/corvcim/results/ValueNames.h"
#include "host/corvcim/text/Quantities.h"
#include "host/corvcim/text/StateNote.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

using namespace Tarn::NodeLexicon;
namespace Status = Tarn::Inventory::Status;

std::string quoted(const std::string& text) {
  return '"' + toPrintable(text) + '"';
}

std::string coded(std::string_view property, unsigned int code) {
  const std::string_view name = valueName(property, code);
  return name.empty() ? std::to_string(code) : std::string(name) + " (" + std::to_string(code) + ')';
}

/// How a field's change is worded: "the LABEL is NEW now, was OLD", or where it counts something, "has NEW LABELs now".
struct Wording {
  std::string_view field;
  std::string_view label;
  bool isCount;
  std::string (*number)(unsigned int value);
};

std::string plain(unsigned int value) {
  return std::to_string(value);
}
std::string megahertz(unsigned int value) {
  return formatMegahertz(value);
}
std::string bits(unsigned int value) {
  return counted(value, "bit");
}
std::string bytes(unsigned int value) {
  return formatBytes(value);
}

// CacheNumberOfBlocks is shown as the cache's size, CacheConsumableBlocks where it says something else.
constexpr std::array wordings = {
    Wording{"type", "type", false, plain},
    Wording{"parent", "part above it", false, plain},
    Wording{"description", "description", false, plain},
    Wording{"cpus", "CPU list", false, plain},
    Wording{"AddressWidth", "address width", false, bits},
    Wording{"AssetTag", "asset tag", false, plain},
    Wording{"CacheAssociativity", "associativity code", false, plain},
    Wording{"CacheBlockSize", "line size", false, bytes},
    Wording{"CacheConsumableBlocks", "number of usable lines", false, plain},
    Wording{"CacheLevel", "level code", false, plain},
    Wording{"CacheName", "name", false, plain},
    Wording{"CacheNumberOfBlocks", "number of lines", false, plain},
    Wording{"CacheType", "type code", false, plain},
    Wording{"CacheWritePolicy", "write policy code", false, plain},
    Wording{"CurrentClockSpeed", "current clock", false, megahertz},
    Wording{"DataWidth", "data width", false, bits},
    Wording{"EnabledCores", "enabled core", true, plain},
    Wording{"ExternalClockSpeed", "external clock", false, megahertz},
    Wording{"Family", "family", false, [](unsigned int value) { return coded("Family", value); }},
    Wording{"HardwareThreads", "hardware thread", true, plain},
    Wording{"MaxClockSpeed", "maximum clock", false, megahertz},
    Wording{"PartNumber", "part number", false, plain},
    Wording{"ProcessorCores", "core", true, plain},
    Wording{"ProcessorId", "identifier", false, plain},
    Wording{"ProcessorName", "model", false, plain},
    Wording{"RequestedStatesSupported", "list of states that can be requested", false, plain},
    Wording{"SerialNumber", "serial number", false, plain},
    Wording{"Socket", "socket", false, plain},
    Wording{"Stepping", "stepping", false, plain},
    Wording{"SystemManufacturer", "manufacturer", false, plain},
    Wording{"SystemModel", "model", false, plain},
    Wording{"SystemName", "name", false, plain},
    Wording{"UpgradeMethod", "upgrade method", false, plain},
};

std::string valueText(const FieldValue& value, std::string (*number)(unsigned int)) {
  if (const auto* const one = std::get_if<unsigned int>(&value)) {
    return number(*one);
  }
  if (const auto* const text = std::get_if<std::string>(&value)) {
    return quoted(*text);
  }
  return numberListText(std::get<std::vector<unsigned int>>(value));
}

/// What a state means for a part of that type, seen from where it was in use.
Predicate arrival(unsigned int status, NodeType type) {
  switch (status) {
    case Status::offline:
      return {Verbal::None, " went offline"};
    case Status::emptySocket:
      return {Verbal::None, ": the socket is empty now"};
    case Status::disabled:
      return {Verbal::Is, type == NodeCacheMemory ? "off now" : "disabled now"};
    case Status::failed:
      return {Verbal::None, " failed: the firmware's self-test disabled it"};
    default:
      return {Verbal::None, ": the state is " + std::to_string(status) + " now"};
  }
}

/// The way back from a state to where a part is in use.
Predicate recovery(unsigned int status, NodeType type) {
  switch (status) {
    case Status::offline:
      return {Verbal::None, " came online"};
    case Status::emptySocket:
      return {Verbal::None, ": the socket has a processor now"};
    case Status::disabled:
      return {Verbal::Is, type == NodeCacheMemory ? "on again" : "enabled again"};
    case Status::failed:
      return {Verbal::None, " works again"};
    default:
      return {Verbal::Is, "in use now; the state was " + std::to_string(status)};
  }
}

std::string stateWord(unsigned int status) {
  return status == Status::emptySocket ? "empty" : stateNote(status);
}

}  // namespace

Predicate describeFieldChange(const FieldChange& change) {
  const auto* const found = std::ranges::find(wordings, change.name, &Wording::field);
  const Wording wording = found == wordings.end() ? Wording{change.name, change.name, false, plain} : *found;
  const auto text = [&](const FieldValue& value) { return valueText(value, wording.number); };
  const std::string label(wording.label);
  if (!change.before) {
    return {Verbal::None,
            ": the " + label + (wording.isCount ? " count" : "") + " is known now: " + text(*change.after)};
  }
  if (!change.after) {
    return {Verbal::None, ": the " + label + (wording.isCount ? " count" : "") + " is not known any more, was " +
                              text(*change.before)};
  }
  if (wording.isCount) {
    return {Verbal::Has,
            counted(std::get<unsigned int>(*change.after), wording.label) + " now, had " + text(*change.before)};
  }
  return {Verbal::None, ": the " + label + " is " + text(*change.after) + " now, was " + text(*change.before)};
}

Predicate describeStatusChange(const FieldChange& change, NodeType type) {
  const auto from = std::get<unsigned int>(*change.before);
  const auto to = std::get<unsigned int>(*change.after);
  if (to == Status::inUse) {
    return recovery(from, type);
  }
  Predicate predicate = arrival(to, type);
  if (from != Status::inUse) {
    predicate.rest += ", was " + stateWord(from);
  }
  return predicate;
}

}  // namespace Corvcim
