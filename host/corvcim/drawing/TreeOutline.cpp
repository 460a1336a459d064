#include "host/corvcim/drawing/TreeOutline.h"

#include <utility>

#include "host/corvcim/drawing/PartLabels.h"
#include "host/corvcim/drawing/PartShapes.h"
#include "host/corvcim/text/StateNote.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::CpuSet;
using Kind = OutlineItem::Kind;

/// Up to so many cores each one has an item of its own.
constexpr std::size_t fewCores = 16;

void addDetail(OutlineItem& item, std::string detail) {
  if (!detail.empty()) {
    item.details.push_back(std::move(detail));
  }
}

void addState(OutlineItem& item, unsigned int status) {
  item.isInUse = status == Tarn::Inventory::Status::inUse;
  addDetail(item, stateNote(status));
}

OutlineItem coreItem(const MachinePart& core) {
  OutlineItem item = {Kind::Core, coreLabel(core), {}, true, {}};
  addDetail(item, cpuListText(core.cpus));
  addDetail(item, core.numa);
  addDetail(item, labelsOf(core.caches));
  addState(item, core.status);
  return item;
}

std::string eachHas(const MachinePart& core) {
  const std::size_t threads = core.cpus.count();
  std::string text = threads == 0 ? "" : counted(threads, "thread");
  if (!core.caches.empty()) {
    text += (text.empty() ? "" : ", ") + labelsOf(core.caches);
  }
  return text.empty() ? text : "each " + text;
}

CpuSet cpusOf(PartRun run) {
  CpuSet cpus;
  for (const MachinePart& part : run) {
    cpus.add(part.cpus);
  }
  return cpus;
}

OutlineItem coreRunItem(PartRun run) {
  const MachinePart& first = run.front();
  const std::string label = coreCountLabel(run.size(), first) + ' ' + first.corePath + " to " + run.back().corePath;
  OutlineItem item = {Kind::Core, label, {}, true, {}};
  addDetail(item, cpuListText(cpusOf(run)));
  addDetail(item, first.numa);
  addDetail(item, eachHas(first));
  addState(item, first.status);
  return item;
}

std::vector<OutlineItem> partItems(std::span<const MachinePart> parts, bool isCompact);

OutlineItem sharedItem(const MachinePart& part, bool isCompact) {
  OutlineItem item = {Kind::Cache, labelsOf(part.caches), {}, true, partItems(part.parts, isCompact)};
  addDetail(item, "shared by " + counted(part.coreCount, "core"));
  addDetail(item, part.numa);
  return item;
}

OutlineItem sharedRunItem(PartRun run, bool isCompact) {
  const MachinePart& first = run.front();
  OutlineItem item = {Kind::Cache,
                      std::to_string(run.size()) + " × " + labelsOf(first.caches),
                      {},
                      true,
                      partItems(first.parts, isCompact)};
  addDetail(item, "each shared by " + counted(first.coreCount, "core"));
  addDetail(item, first.numa);
  addDetail(item, "the first:");
  return item;
}

std::vector<OutlineItem> partItems(std::span<const MachinePart> parts, bool isCompact) {
  std::vector<OutlineItem> items;
  for (const PartRun run : runsOfShape(parts)) {
    if (isCompact && run.size() > 1) {
      items.push_back(run.front().isCore() ? coreRunItem(run) : sharedRunItem(run, isCompact));
      continue;
    }
    for (const MachinePart& part : run) {
      items.push_back(part.isCore() ? coreItem(part) : sharedItem(part, isCompact));
    }
  }
  return items;
}

OutlineItem processorItem(const MachineProcessor& processor, bool isCompact) {
  OutlineItem item = {Kind::Processor, "processor " + processor.path, {}, true, {}};
  addDetail(item, processor.name);
  for (std::string& detail : factsOf(processor)) {
    addDetail(item, std::move(detail));
  }
  item.isInUse = processor.status == Tarn::Inventory::Status::inUse;
  item.below = partItems(processor.parts, isCompact);
  if (!processor.otherCaches.empty()) {
    item.below.push_back({Kind::Note, labelsOf(processor.otherCaches), {"sharing not known"}, true, {}});
  }
  return item;
}

}  // namespace

OutlineItem outlineOf(const Machine& machine) {
  const bool isCompact = machine.coreCount() > fewCores;
  OutlineItem system = {Kind::System, machine.systemName, {}, true, {}};
  addDetail(system, machine.model);
  for (const MachineProcessor& processor : machine.processors) {
    system.below.push_back(processorItem(processor, isCompact));
  }
  return system;
}

}  // namespace Corvcim
