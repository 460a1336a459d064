#include "host/corvcim/drawing/SvgLayout.h"

#include <algorithm>
#include <utility>

#include "host/corvcim/drawing/BoxGrid.h"
#include "host/corvcim/drawing/CoreBoxes.h"
#include "host/corvcim/drawing/PartLabels.h"
#include "host/corvcim/drawing/PartShapes.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

constexpr int pageWidth = 1400;
constexpr int minimumProcessorWidth = 320;

/// What placing the parts of one processor needs to know.
struct Plan {
  CorePlan cores;
  bool saysTraits = true;  ///< whether each group of cores says what they have
};

std::vector<Box> partBoxes(std::span<const MachinePart> parts, const Plan& plan, int maxWidth);

/// Caches that several cores share, around these cores. `count` groups like this one are meant.
Box sharedCache(const MachinePart& part, std::size_t count, const Plan& plan, int maxWidth) {
  Box box(Box::Style::SharedCache);
  const int room = maxWidth - 2 * boxPadding;
  const std::string label = (count == 1 ? "" : std::to_string(count) + " × ") + labelsOf(part.caches);
  const std::string note = (count == 1 ? "shared by " : "each shared by ") + counted(part.coreCount, "core") +
                           (part.numa.empty() ? "" : " · " + part.numa);
  const int labelWidth = textWidth(TextStyle::Label, label);
  box.width = std::min(labelWidth + textWidth(TextStyle::Note, note) + 5 * boxPadding, maxWidth);
  arrange(box, partBoxes(part.parts, plan, room), {boxPadding, barHeight + boxPadding}, room);
  Box bar = cacheBar(part.caches, box.width);
  box.level = bar.level;
  addLine(bar, TextStyle::Label, boxPadding, 15, fitText(TextStyle::Label, label, bar.width - 2 * boxPadding));
  const int noteLeft = labelWidth + 3 * boxPadding;
  const int noteRoom = bar.width - noteLeft - boxPadding;
  if (noteRoom > 0) {
    addLine(bar, TextStyle::Note, noteLeft, 15, fitText(TextStyle::Note, note, noteRoom));
  }
  bar.tooltip = label + " · " + note + (part.cpus.empty() ? "" : " · " + cpuListText(part.cpus));
  box.inner.push_back(std::move(bar));
  return box;
}

void addRun(std::vector<Box>& boxes, PartRun run, const Plan& plan, int maxWidth) {
  if (run.front().isCore() && plan.cores.detail != Detail::Full) {
    const std::string traits = plan.saysTraits ? commonTraits(coresOf(run)) : "";
    boxes.push_back(coreGroup(run, plan.cores, maxWidth, traits));
    return;
  }
  if (plan.cores.detail == Detail::Summary) {
    boxes.push_back(sharedCache(run.front(), run.size(), plan, maxWidth));
    return;
  }
  for (const MachinePart& part : run) {
    boxes.push_back(part.isCore() ? fullCore(part, plan.cores) : sharedCache(part, 1, plan, maxWidth));
  }
}

/// Small cells show a core's state, so that cores need not be in the same state to stand in one group.
std::vector<Box> partBoxes(std::span<const MachinePart> parts, const Plan& plan, int maxWidth) {
  std::vector<Box> boxes;
  for (const PartRun run :
       runsOfShape(parts, plan.cores.detail == Detail::Cells ? States::Ignored : States::Compared)) {
    addRun(boxes, run, plan, maxWidth);
  }
  return boxes;
}

void addOtherCaches(Box& box, const std::vector<CacheUnit>& caches) {
  if (caches.empty()) {
    return;
  }
  Box bar = cacheBar(caches, box.width - 2 * boxPadding);
  bar.x = boxPadding;
  bar.y = box.height;
  addLine(bar, TextStyle::Label, boxPadding, 15,
          fitText(TextStyle::Label, labelsOf(caches) + " (sharing not known)", bar.width - 2 * boxPadding));
  box.inner.push_back(std::move(bar));
  box.height += barHeight + boxPadding;
}

struct HeadLine {
  TextStyle style;
  int height;
  std::string text;
};

std::vector<HeadLine> headLines(const MachineProcessor& processor, const std::string& traits) {
  std::string facts;
  for (const std::string& fact : factsOf(processor)) {
    facts += (facts.empty() ? "" : " · ") + fact;
  }
  std::vector<HeadLine> lines = {{TextStyle::Heading, 24, "processor " + processor.path},
                                 {TextStyle::Label, 18, processor.name},
                                 {TextStyle::Note, 16, facts},
                                 {TextStyle::Note, 16, traits.empty() ? "" : "each core: " + traits}};
  std::erase_if(lines, [](const HeadLine& line) { return line.text.empty(); });
  return lines;
}

Box processorBox(const MachineProcessor& processor, const CorePlan& cores, int maxWidth) {
  Box box(Box::Style::Processor);
  box.isInUse = processor.status == Tarn::Inventory::Status::inUse;
  const std::string traits = cores.detail == Detail::Full ? "" : commonTraits(coresOf(processor.parts));
  const Plan plan = {cores, traits.empty()};
  const std::vector<HeadLine> lines = headLines(processor, traits);
  const int room = maxWidth - 2 * boxPadding;
  int top = 0;
  box.width = minimumProcessorWidth;
  for (const HeadLine& line : lines) {
    box.width = std::max(box.width, std::min(textWidth(line.style, line.text) + 2 * boxPadding, maxWidth));
    top += line.height;
    addLine(box, line.style, boxPadding, top, fitText(line.style, line.text, room));
  }
  arrange(box, partBoxes(processor.parts, plan, room), {boxPadding, top + 12}, room);
  addOtherCaches(box, processor.otherCaches);
  return box;
}

}  // namespace

Box layOut(const Machine& machine) {
  const CorePlan cores = planCores(machine);
  const int room = pageWidth - 2 * boxPadding;
  const int processorRoom = machine.processors.size() == 1 ? room : (room - boxGap) / 2;
  std::vector<Box> processors;
  for (const MachineProcessor& processor : machine.processors) {
    processors.push_back(processorBox(processor, cores, processorRoom));
  }
  const std::string summary = summaryOf(machine);
  Box page(Box::Style::Page);
  page.width = std::min(
      std::max(textWidth(TextStyle::Title, machine.systemName), textWidth(TextStyle::Label, summary)) + 2 * boxPadding,
      pageWidth);
  arrange(page, std::move(processors), {boxPadding, 66}, room);
  const int textRoom = page.width - 2 * boxPadding;
  addLine(page, TextStyle::Title, boxPadding, 32, fitText(TextStyle::Title, machine.systemName, textRoom));
  addLine(page, TextStyle::Label, boxPadding, 52, fitText(TextStyle::Label, summary, textRoom));
  stretch(page, page.width);
  return page;
}

}  // namespace Corvcim
