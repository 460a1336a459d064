#include "host/cli/SvgLayout.h"

#include <algorithm>
#include <string_view>
#include <utility>

#include "host/cli/BoxGrid.h"
#include "host/cli/Text.h"

namespace Corvcim {
namespace {

/// How much of each core is drawn.
enum class Detail {
  Full,     ///< each core with its caches
  Cells,    ///< small cells, and what they have in common
  Summary,  ///< one group of each shape
};

constexpr std::size_t fullUpTo = 32;
constexpr std::size_t cellsUpTo = 512;

constexpr int pageWidth = 1400;
constexpr int barHeight = 22;
constexpr int minimumProcessorWidth = 320;

struct Plan {
  Detail detail = Detail::Full;
  int cellWidth = 0;  ///< of every core
};

void addLine(Box& box, TextStyle style, int x, int y, std::string text) {
  if (!text.empty()) {
    box.lines.push_back({style, x, y, false, std::move(text)});
  }
}

void addCentredLine(Box& box, TextStyle style, int y, const std::string& text) {
  if (!text.empty()) {
    box.lines.push_back({style, box.width / 2, y, true, fitText(style, text, box.width - 4)});
  }
}

std::string joined(const std::vector<std::string>& texts) {
  std::string line;
  for (const std::string& text : texts) {
    line += (line.empty() ? "" : " · ") + text;
  }
  return line;
}

std::string cpuText(const Tarn::Inventory::CpuSet& cpus) {
  return cpus.empty() ? std::string() : (cpus.count() == 1 ? "CPU " : "CPUs ") + cpus.toList();
}

std::string describe(const TopologyPart& core) {
  std::vector<std::string> texts = {"core " + core.corePath};
  for (std::string text : {cpuText(core.cpus), labelsOf(core.caches), stateNote(core.status)}) {
    if (!text.empty()) {
      texts.push_back(std::move(text));
    }
  }
  return joined(texts);
}

int levelOf(const CacheUnit& cache) {
  return cache.name.starts_with('L') && cache.name.size() > 1 ? cache.name[1] - '0' : 0;
}

Box cacheBar(std::span<const CacheUnit> caches, int width) {
  Box bar(Box::Style::CacheBar);
  bar.level = levelOf(caches.front());
  bar.isInUse = caches.front().status == Tarn::Inventory::Status::inUse;
  bar.width = width;
  bar.height = barHeight;
  return bar;
}

Box fullCore(const TopologyPart& core, int width) {
  Box box(Box::Style::Core);
  box.isInUse = core.status == Tarn::Inventory::Status::inUse;
  box.tooltip = describe(core);
  box.width = width;
  int top = 0;
  for (const CacheUnit& cache : core.caches) {
    Box bar = cacheBar(std::span(&cache, 1), width);
    addCentredLine(bar, TextStyle::Label, 15, labelsOf(std::span(&cache, 1)));
    bar.y = top;
    top += barHeight;
    box.inner.push_back(std::move(bar));
  }
  addCentredLine(box, TextStyle::Label, top + 19, "core " + core.corePath);
  addCentredLine(box, TextStyle::Note, top + 35, cpuText(core.cpus));
  box.height = top + 44;
  if (const std::string note = stateNote(core.status); !note.empty()) {
    addCentredLine(box, TextStyle::Note, top + 50, note);
    box.height += 15;
  }
  return box;
}

Box smallCore(const TopologyPart& core, int width) {
  Box box(Box::Style::Core);
  box.isInUse = core.status == Tarn::Inventory::Status::inUse;
  box.tooltip = describe(core);
  box.width = width;
  box.height = 36;
  addCentredLine(box, TextStyle::Label, 15, core.corePath);
  addCentredLine(box, TextStyle::Note, 29, box.isInUse ? core.cpus.toList() : stateNote(core.status));
  return box;
}

int cellWidthFor(const TopologyPart& core, Detail detail) {
  if (detail != Detail::Full) {
    return std::max({40, textWidth(TextStyle::Label, core.corePath) + 8,
                     std::min(textWidth(TextStyle::Note, core.cpus.toList()) + 8, 80)});
  }
  int width = std::max(textWidth(TextStyle::Label, "core " + core.corePath), 76);
  width = std::max(width, std::min(textWidth(TextStyle::Note, cpuText(core.cpus)), 110));
  for (const CacheUnit& cache : core.caches) {
    width = std::max(width, textWidth(TextStyle::Label, labelsOf(std::span(&cache, 1))));
  }
  return width + 2 * boxPadding;
}

std::string commonTraits(PartRun cores) {
  const TopologyPart& first = cores.front();
  std::vector<std::string> traits;
  if (!first.cpus.empty()) {
    traits.push_back(counted(first.cpus.count(), "thread"));
  }
  if (!first.caches.empty()) {
    traits.push_back(labelsOf(first.caches));
  }
  if (traits.empty()) {
    return "";
  }
  return (cores.size() == 1 ? "" : "each: ") + joined(traits);
}

/// Cores of one shape as small cells, with what they have in common below them.
Box coreGroup(PartRun cores, const Plan& plan, int maxWidth) {
  Box group(Box::Style::CoreGroup);
  std::vector<Box> cells;
  if (plan.detail == Detail::Summary && cores.size() > 1) {
    Box cell(Box::Style::Core);
    const std::string label = counted(cores.size(), "core");
    const std::string range = cores.front().corePath + " to " + cores.back().corePath;
    cell.width = std::max(textWidth(TextStyle::Label, label), textWidth(TextStyle::Note, range)) + 2 * boxPadding;
    cell.height = 36;
    cell.isInUse = cores.front().status == Tarn::Inventory::Status::inUse;
    addCentredLine(cell, TextStyle::Label, 15, label);
    addCentredLine(cell, TextStyle::Note, 29, range);
    cells.push_back(std::move(cell));
  } else {
    for (const TopologyPart& core : cores) {
      cells.push_back(smallCore(core, plan.cellWidth));
    }
  }
  arrange(group, std::move(cells), boxPadding, maxWidth - 2 * boxPadding);
  const std::string traits = commonTraits(cores);
  group.width = std::max(group.width, std::min(textWidth(TextStyle::Note, traits) + 2 * boxPadding, maxWidth));
  addLine(group, TextStyle::Note, boxPadding, group.height + 6,
          fitText(TextStyle::Note, traits, group.width - 2 * boxPadding));
  group.height += traits.empty() ? 0 : 14;
  group.tooltip = traits;
  return group;
}

std::vector<Box> partBoxes(std::span<const TopologyPart> parts, const Plan& plan, int maxWidth);

/// Caches that several cores share, around these cores. `count` groups like this one are meant.
Box sharedCache(const TopologyPart& part, std::size_t count, const Plan& plan, int maxWidth) {
  Box box(Box::Style::SharedCache);
  box.level = levelOf(part.caches.front());
  const std::string label = (count == 1 ? "" : std::to_string(count) + " × ") + labelsOf(part.caches);
  const std::string note = (count == 1 ? "shared by " : "each shared by ") + counted(part.coreCount, "core");
  const int labelWidth = textWidth(TextStyle::Label, label);
  box.width = std::min(labelWidth + textWidth(TextStyle::Note, note) + 5 * boxPadding, maxWidth);
  arrange(box, partBoxes(part.parts, plan, maxWidth - 2 * boxPadding), barHeight + boxPadding,
          maxWidth - 2 * boxPadding);
  Box bar = cacheBar(part.caches, box.width);
  addLine(bar, TextStyle::Label, boxPadding, 15, fitText(TextStyle::Label, label, bar.width - 2 * boxPadding));
  const int noteLeft = labelWidth + 3 * boxPadding;
  addLine(bar, TextStyle::Note, noteLeft, 15,
          fitText(TextStyle::Note, note, std::max(bar.width - noteLeft - boxPadding, 0)));
  bar.tooltip = label + " · " + note + (part.cpus.empty() ? "" : " · " + cpuText(part.cpus));
  box.inner.push_back(std::move(bar));
  return box;
}

void addRun(std::vector<Box>& boxes, PartRun run, const Plan& plan, int maxWidth) {
  if (run.front().isCore() && plan.detail != Detail::Full) {
    boxes.push_back(coreGroup(run, plan, maxWidth));
    return;
  }
  if (plan.detail == Detail::Summary) {
    boxes.push_back(sharedCache(run.front(), run.size(), plan, maxWidth));
    return;
  }
  for (const TopologyPart& part : run) {
    boxes.push_back(part.isCore() ? fullCore(part, plan.cellWidth) : sharedCache(part, 1, plan, maxWidth));
  }
}

std::vector<Box> partBoxes(std::span<const TopologyPart> parts, const Plan& plan, int maxWidth) {
  std::vector<Box> boxes;
  for (const PartRun run : runsOfShape(parts)) {
    addRun(boxes, run, plan, maxWidth);
  }
  return boxes;
}

Box processorBox(const TopologyProcessor& processor, const Plan& plan, int maxWidth) {
  Box box(Box::Style::Processor);
  box.isInUse = processor.status == Tarn::Inventory::Status::inUse;
  const std::string heading = "processor " + processor.path;
  const std::string facts = joined(factsOf(processor));
  const int wanted = std::max({textWidth(TextStyle::Heading, heading), textWidth(TextStyle::Label, processor.name),
                               textWidth(TextStyle::Note, facts)});
  box.width = std::min(std::max(wanted + 2 * boxPadding, minimumProcessorWidth), maxWidth);
  arrange(box, partBoxes(processor.parts, plan, maxWidth - 2 * boxPadding), 70, maxWidth - 2 * boxPadding);
  if (!processor.otherCaches.empty()) {
    Box bar = cacheBar(processor.otherCaches, box.width - 2 * boxPadding);
    bar.x = boxPadding;
    bar.y = box.height;
    addLine(bar, TextStyle::Label, boxPadding, 15,
            fitText(TextStyle::Label, labelsOf(processor.otherCaches) + " (not known which cores share it)",
                    bar.width - 2 * boxPadding));
    box.inner.push_back(std::move(bar));
    box.height += barHeight + boxPadding;
  }
  const int room = box.width - 2 * boxPadding;
  addLine(box, TextStyle::Heading, boxPadding, 24, fitText(TextStyle::Heading, heading, room));
  addLine(box, TextStyle::Label, boxPadding, 42, fitText(TextStyle::Label, processor.name, room));
  addLine(box, TextStyle::Note, boxPadding, 58, fitText(TextStyle::Note, facts, room));
  return box;
}

Plan planFor(const Topology& topology) {
  Plan plan;
  const std::size_t cores = topology.coreCount();
  plan.detail = cores <= fullUpTo ? Detail::Full : cores <= cellsUpTo ? Detail::Cells : Detail::Summary;
  for (const TopologyProcessor& processor : topology.processors) {
    for (const TopologyPart& part : processor.parts) {
      for (const TopologyPart* core : coresOf(part)) {
        plan.cellWidth = std::max(plan.cellWidth, cellWidthFor(*core, plan.detail));
      }
    }
  }
  return plan;
}

}  // namespace

Box layOut(const Topology& topology) {
  const Plan plan = planFor(topology);
  const bool isAlone = topology.processors.size() == 1;
  const int room = pageWidth - 2 * boxPadding;
  const int processorRoom = isAlone ? room : (room - boxGap) / 2;
  std::vector<Box> processors;
  for (const TopologyProcessor& processor : topology.processors) {
    processors.push_back(processorBox(processor, plan, processorRoom));
  }
  Box page(Box::Style::Page);
  const std::string summary = summaryOf(topology);
  page.width =
      std::min(std::max({textWidth(TextStyle::Title, topology.systemName), textWidth(TextStyle::Label, summary)}) +
                   2 * boxPadding,
               pageWidth);
  arrange(page, std::move(processors), 66, room);
  addLine(page, TextStyle::Title, boxPadding, 32,
          fitText(TextStyle::Title, topology.systemName, page.width - 2 * boxPadding));
  addLine(page, TextStyle::Label, boxPadding, 52, fitText(TextStyle::Label, summary, page.width - 2 * boxPadding));
  return page;
}

}  // namespace Corvcim
