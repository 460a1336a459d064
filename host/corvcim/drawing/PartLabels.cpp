#include "host/corvcim/drawing/PartLabels.h"

#include <algorithm>
#include <utility>

#include "host/corvcim/text/Quantities.h"
#include "host/corvcim/text/StateNote.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

/// "8 cores", "8 cores, 6 enabled".
std::string coreTotal(std::size_t cores, std::size_t enabled) {
  return counted(cores, "core") + (enabled == cores ? "" : ", " + std::to_string(enabled) + " enabled");
}

}  // namespace

std::string labelOf(const CacheUnit& cache) {
  return cache.size == 0 ? cache.name : cache.name + ' ' + formatBytes(cache.size);
}

std::string coreLabel(const MachinePart& core) {
  return (core.coreKind.empty() ? "core" : core.coreKind) + ' ' + core.corePath;
}

std::string coreCountLabel(std::size_t count, const MachinePart& first) {
  return counted(count, first.coreKind.empty() ? "core" : first.coreKind);
}

std::string cpuListText(const Tarn::Inventory::CpuSet& cpus) {
  if (cpus.empty()) {
    return "";
  }
  return (cpus.count() == 1 ? "CPU " : "CPUs ") + cpus.toList();
}

std::string labelsOf(std::span<const CacheUnit> caches) {
  std::string text;
  while (!caches.empty()) {
    std::size_t equal = 1;
    while (equal < caches.size() && caches[equal] == caches.front()) {
      ++equal;
    }
    const std::string note = stateNote(caches.front().status);
    text += text.empty() ? "" : ", ";
    text += equal == 1 ? "" : std::to_string(equal) + " × ";
    text += labelOf(caches.front());
    text += note.empty() ? "" : " (" + note + ')';
    caches = caches.subspan(equal);
  }
  return text;
}

std::vector<std::string> factsOf(const MachineProcessor& processor) {
  std::vector<std::string> facts;
  if (processor.coreCount != 0) {
    facts.push_back(coreTotal(processor.coreCount, processor.enabledCount));
  }
  if (processor.threadCount != 0) {
    facts.push_back(counted(processor.threadCount, "thread"));
  }
  if (processor.maxClock != 0) {
    facts.push_back("up to " + formatMegahertz(processor.maxClock));
  }
  if (!processor.numaNodes.empty()) {
    facts.push_back(numaText(processor.numaNodes));
  }
  if (std::string note = stateNote(processor.status); !note.empty()) {
    facts.push_back(std::move(note));
  }
  return facts;
}

std::string summaryOf(const Machine& machine) {
  std::size_t threads = 0;
  for (const MachineProcessor& processor : machine.processors) {
    threads += processor.threadCount;
  }
  std::string summary = machine.model;
  const auto add = [&summary](const std::string& fact) { summary += (summary.empty() ? "" : " · ") + fact; };
  const auto empty = static_cast<std::size_t>(
      std::ranges::count(machine.processors, Tarn::Inventory::Status::emptySocket, &MachineProcessor::status));
  add(counted(machine.processors.size() - empty, "processor"));
  if (empty != 0) {
    add(counted(empty, "empty socket"));
  }
  add(coreTotal(machine.coreCount(), machine.enabledCount()));
  if (threads != 0) {
    add(counted(threads, "thread"));
  }
  return summary;
}

}  // namespace Corvcim
