#include "host/corvcim/drawing/CoreBoxes.h"

#include <algorithm>
#include <utility>

#include "host/corvcim/drawing/BoxGrid.h"
#include "host/corvcim/drawing/PartLabels.h"
#include "host/corvcim/drawing/PartShapes.h"
#include "host/corvcim/text/StateNote.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

constexpr std::size_t fullUpTo = 32;
constexpr std::size_t cellsUpTo = 512;
constexpr int cellHeight = 36;

void addCentredLine(Box& box, TextStyle style, int y, const std::string& text) {
  if (!text.empty()) {
    box.lines.push_back({style, box.width / 2, y, true, fitText(style, text, box.width - 4)});
  }
}

bool isInUse(unsigned int status) {
  return status == Tarn::Inventory::Status::inUse;
}

std::string describe(const MachinePart& core) {
  std::string text = coreLabel(core);
  for (const std::string& fact : {cpuListText(core.cpus), core.numa, labelsOf(core.caches), stateNote(core.status)}) {
    text += fact.empty() ? "" : " · " + fact;
  }
  return text;
}

/// "CPUs 0-1", "CPU 3, offline".
std::string noteOf(const MachinePart& core) {
  const std::string cpus = cpuListText(core.cpus);
  const std::string state = stateNote(core.status);
  return cpus + (cpus.empty() || state.empty() ? "" : ", ") + state;
}

Box emptyCell(const MachinePart& core, int width) {
  Box box(Box::Style::Core);
  box.isInUse = isInUse(core.status);
  box.tooltip = describe(core);
  box.width = width;
  return box;
}

Box smallCore(const MachinePart& core, int width) {
  Box box = emptyCell(core, width);
  box.height = cellHeight;
  addCentredLine(box, TextStyle::Label, 15, core.corePath);
  addCentredLine(box, TextStyle::Note, 29, box.isInUse ? core.cpus.toList() : stateNote(core.status));
  return box;
}

/// One cell that stands for all the cores.
Box summaryCell(std::span<const MachinePart> cores) {
  Box box(Box::Style::Core);
  const std::string label = coreCountLabel(cores.size(), cores.front());
  const std::string range = cores.front().corePath + " to " + cores.back().corePath;
  box.isInUse = isInUse(cores.front().status);
  box.width = std::max(textWidth(TextStyle::Label, label), textWidth(TextStyle::Note, range)) + 2 * boxPadding;
  box.height = cellHeight;
  addCentredLine(box, TextStyle::Label, 15, label);
  addCentredLine(box, TextStyle::Note, 29, range);
  return box;
}

int smallCellWidth(const MachinePart& core) {
  constexpr int narrowest = 40;
  constexpr int widest = 80;
  return std::max({narrowest, textWidth(TextStyle::Label, core.corePath) + 8,
                   std::min(textWidth(TextStyle::Note, core.cpus.toList()) + 8, widest)});
}

int fullCellWidth(const MachinePart& core) {
  constexpr int narrowest = 76;
  constexpr int widestNote = 130;
  int width = std::max({narrowest, textWidth(TextStyle::Label, coreLabel(core)),
                        std::min(textWidth(TextStyle::Note, noteOf(core)), widestNote)});
  for (const CacheUnit& cache : core.caches) {
    width = std::max(width, textWidth(TextStyle::Label, labelsOf(std::span(&cache, 1))));
  }
  return width + 2 * boxPadding;
}

int levelOf(const CacheUnit& cache) {
  return cache.name.starts_with('L') && cache.name.size() > 1 ? cache.name[1] - '0' : 0;
}

std::string traitsOf(const MachinePart& core) {
  std::string traits;
  for (const std::string& trait : {core.coreKind, core.cpus.empty() ? "" : counted(core.cpus.count(), "thread"),
                                   labelsOf(core.caches), core.numa}) {
    traits += trait.empty() ? "" : (traits.empty() ? "" : " · ") + trait;
  }
  return traits;
}

}  // namespace

void addLine(Box& box, TextStyle style, int x, int y, std::string text) {
  if (!text.empty()) {
    box.lines.push_back({style, x, y, false, std::move(text)});
  }
}

CorePlan planCores(const Machine& machine) {
  CorePlan plan;
  const std::size_t count = machine.coreCount();
  plan.detail = count <= fullUpTo ? Detail::Full : count <= cellsUpTo ? Detail::Cells : Detail::Summary;
  for (const MachineProcessor& processor : machine.processors) {
    for (const MachinePart* core : coresOf(processor.parts)) {
      plan.cellWidth =
          std::max(plan.cellWidth, plan.detail == Detail::Full ? fullCellWidth(*core) : smallCellWidth(*core));
    }
  }
  return plan;
}

Box cacheBar(std::span<const CacheUnit> caches, int width) {
  Box bar(Box::Style::CacheBar);
  bar.level = levelOf(caches.front());
  bar.isInUse = isInUse(caches.front().status);
  bar.width = width;
  bar.height = barHeight;
  return bar;
}

Box fullCore(const MachinePart& core, const CorePlan& plan) {
  Box box = emptyCell(core, plan.cellWidth);
  int top = 0;
  for (const CacheUnit& cache : core.caches) {
    Box bar = cacheBar(std::span(&cache, 1), box.width);
    addCentredLine(bar, TextStyle::Label, 15, labelsOf(std::span(&cache, 1)));
    bar.y = top;
    top += barHeight;
    box.inner.push_back(std::move(bar));
  }
  addCentredLine(box, TextStyle::Label, top + 19, coreLabel(core));
  addCentredLine(box, TextStyle::Note, top + 35, noteOf(core));
  box.height = top + 44;
  return box;
}

Box coreGroup(std::span<const MachinePart> cores, const CorePlan& plan, int maxWidth, const std::string& traits) {
  Box group(Box::Style::CoreGroup);
  std::vector<Box> cells;
  if (plan.detail == Detail::Summary && cores.size() > 1) {
    cells.push_back(summaryCell(cores));
  } else {
    for (const MachinePart& core : cores) {
      cells.push_back(smallCore(core, plan.cellWidth));
    }
  }
  arrange(group, std::move(cells), {0, 0}, maxWidth);
  if (!traits.empty()) {
    const std::string line = (cores.size() == 1 ? "" : "each: ") + traits;
    group.width = std::max(group.width, std::min(textWidth(TextStyle::Note, line), maxWidth));
    addLine(group, TextStyle::Note, 0, group.height + 15, fitText(TextStyle::Note, line, group.width));
    group.height += 18;
  }
  return group;
}

std::string commonTraits(std::span<const MachinePart* const> cores) {
  std::string common;
  for (const MachinePart* core : cores) {
    const std::string traits = traitsOf(*core);
    if (core != cores.front() && traits != common) {
      return "";
    }
    common = traits;
  }
  return common;
}

}  // namespace Corvcim
