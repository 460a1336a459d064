#include "host/corvcim/hwloc/HwlocTopology.h"

#include <unistd.h>

#include <charconv>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <stdexcept>
#include <string_view>
#include <vector>

#include "platform/inventory/tree/Error.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::InventoryError;

constexpr const char* whatFailed = "cannot read the inventory";
constexpr const char* aboutXml =
    "it takes XML as lstopo of version 2 or 1 writes it; HWLOC_XML_VERBOSE=1 lstopo -i FILE says what is wrong with it";
constexpr const char* aboutSynthetic =
    "it takes levels and how many there are of each in the one above: \"package:2 l3:1 l2:4 core:1 pu:2\"";

/// hwloc's variables can name another file, another root directory or another description than the one
/// that was asked for, and make it print. Its plugins ask graphics drivers about this machine when the
/// first topology is made; with an empty path none is found.
void settleEnvironment() {
  std::vector<std::string> names;
  for (char** entry = environ; entry != nullptr && *entry != nullptr; ++entry) {
    const std::string_view text = *entry;
    if (text.starts_with("HWLOC_")) {
      names.emplace_back(text.substr(0, text.find('=')));
    }
  }
  for (const std::string& name : names) {
    unsetenv(name.c_str());
  }
  setenv("HWLOC_PLUGINS_PATH", "", 1);
  setenv("HWLOC_HIDE_ERRORS", "2", 1);
}

HwlocTopology newTopology(const std::string& name) {
  settleEnvironment();
  if (!hwloc().problem.empty()) {
    throw InventoryError(whatFailed, name, "it takes hwloc: " + hwloc().problem,
                         "install hwloc 2.4 or later (libhwloc15) for corvcim's architecture");
  }
  hwloc_topology_t topology = nullptr;
  if (hwloc().topologyInit(&topology) != 0) {
    throw std::runtime_error("hwloc cannot make a topology");
  }
  HwlocTopology owned(topology);
  hwloc().topologySetAllTypesFilter(topology, HWLOC_TYPE_FILTER_KEEP_ALL);
  hwloc().topologySetIoTypesFilter(topology, HWLOC_TYPE_FILTER_KEEP_NONE);
  hwloc().topologySetFlags(topology, HWLOC_TOPOLOGY_FLAG_INCLUDE_DISALLOWED);
  return owned;
}

void load(const HwlocTopology& topology, const std::string& name, const char* remedy) {
  if (hwloc().topologyLoad(topology.get()) != 0) {
    throw InventoryError(whatFailed, name, "hwloc cannot make a topology of it", remedy);
  }
}

/// How many CPUs a synthetic description makes, at least; hwloc would make any number, and take the memory
/// for it. What stands in parentheses and brackets is no level of them.
std::uint64_t countCpus(std::string_view description) {
  constexpr std::uint64_t enough = std::uint64_t{CpuSet::limit} + 1;
  std::uint64_t cpus = 1;
  int depth = 0;
  for (std::size_t i = 0; i < description.size(); ++i) {
    const char c = description[i];
    depth += c == '(' || c == '[' ? 1 : c == ')' || c == ']' ? -1 : 0;
    const char before = i == 0 ? ' ' : description[i - 1];
    if (depth != 0 || (before != ':' && before != ' ') || c < '0' || c > '9') {
      continue;
    }
    std::uint64_t count = 0;
    const auto parsed = std::from_chars(description.data() + i, description.data() + description.size(), count);
    count = parsed.ec == std::errc() ? count : enough;
    cpus = count != 0 && cpus > enough / count ? enough : cpus * count;
  }
  return cpus;
}

}  // namespace

HwlocTopology loadXml(const std::string& text, const std::string& name) {
  if (text.size() >= std::numeric_limits<int>::max()) {
    throw InventoryError(whatFailed, name, "it is larger than any description of a machine", aboutXml);
  }
  HwlocTopology topology = newTopology(name);
  // The size that hwloc asks for includes the final NUL.
  if (hwloc().topologySetXmlbuffer(topology.get(), text.c_str(), static_cast<int>(text.size() + 1)) != 0) {
    throw InventoryError(whatFailed, name, "hwloc does not find a topology in it", aboutXml);
  }
  load(topology, name, aboutXml);
  return topology;
}

HwlocTopology loadSynthetic(const std::string& description, const std::string& name) {
  if (countCpus(description) > CpuSet::limit) {
    throw InventoryError(whatFailed, name, "it describes more than " + std::to_string(CpuSet::limit) + " CPUs",
                         "describe a smaller machine");
  }
  HwlocTopology topology = newTopology(name);
  if (hwloc().topologySetSynthetic(topology.get(), description.c_str()) != 0) {
    throw InventoryError(whatFailed, name, "hwloc does not understand the description", aboutSynthetic);
  }
  load(topology, name, aboutSynthetic);
  return topology;
}

CpuSet cpuSetOf(hwloc_const_bitmap_t set) {
  CpuSet cpus;
  if (set == nullptr) {
    return cpus;
  }
  if (hwloc().bitmapLast(set) < 0 && !hwloc().bitmapIszero(set)) {
    throw std::invalid_argument("a set of CPUs has no end");
  }
  for (int cpu = hwloc().bitmapFirst(set); cpu >= 0; cpu = hwloc().bitmapNext(set, cpu)) {
    const auto number = static_cast<unsigned int>(cpu);
    if (number >= CpuSet::limit) {
      throw std::invalid_argument("CPU " + std::to_string(number) + " has a number above " +
                                  std::to_string(CpuSet::limit - 1));
    }
    cpus.add(number);
  }
  return cpus;
}

}  // namespace Corvcim
