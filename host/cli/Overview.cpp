#include "host/cli/Overview.h"

#include <algorithm>
#include <optional>
#include <string_view>
#include <utility>

#include "host/cli/InventoryText.h"
#include "host/cli/Operations.h"
#include "host/cli/Quantities.h"
#include "host/cli/Text.h"
#include "host/cli/results/TextWriter.h"
#include "host/cli/results/ValueNames.h"
#include "platform/instrumentation/ProcessTree.h"

namespace Corvcim {
namespace {

std::string textOf(const Instance& instance, std::string_view property) {
  const Value* value = instance.property(property);
  return value == nullptr || value->isNull() || value->type() != CMPI_string ? std::string()
                                                                             : toPrintable(value->asString());
}

std::optional<std::uint64_t> numberOf(const Instance& instance, std::string_view property) {
  const Value* value = instance.property(property);
  return value != nullptr && isUnsignedNumber(*value) ? std::optional(value->asUnsigned()) : std::nullopt;
}

std::string nameOf(const Instance& instance, std::string_view property) {
  const std::optional<std::uint64_t> code = numberOf(instance, property);
  if (!code) {
    return "not known";
  }
  const std::string_view name = valueName(property, *code);
  return name.empty() ? std::to_string(*code) : std::string(name);
}

/// The texts that say something, with ", " between them.
std::string listed(std::initializer_list<std::string> texts) {
  std::string line;
  for (const std::string& text : texts) {
    if (!text.empty()) {
      line += (line.empty() ? "" : ", ") + text;
    }
  }
  return line;
}

std::string clockText(const Instance& processor, std::string_view property, std::string_view what) {
  const std::uint64_t clock = numberOf(processor, property).value_or(0);
  return clock == 0 ? std::string() : formatMegahertz(clock) + ' ' + std::string(what);
}

std::string familyText(const Instance& processor) {
  const std::string stepping = textOf(processor, "Stepping");
  return listed({nameOf(processor, "Family"), stepping.empty() ? "" : "stepping " + stepping});
}

std::string coreText(const OverviewProcessor& overview) {
  const std::optional<std::uint64_t> cores = numberOf(overview.capabilities, "NumberOfProcessorCores");
  const std::optional<std::uint64_t> threads = numberOf(overview.capabilities, "NumberOfHardwareThreads");
  const std::uint64_t enabled = numberOf(overview.processor, "NumberOfEnabledCores").value_or(0);
  const bool allEnabled = cores && *cores == enabled;
  return listed({cores ? counted(*cores, "core") : "",
                 allEnabled && enabled > 1 ? "all enabled"
                 : enabled == 0            ? ""
                                           : std::to_string(enabled) + " enabled",
                 threads ? counted(*threads, "thread") : ""});
}

/// Data and address width. The library reports the data width for both where the platform tells one.
std::string widthText(const Instance& processor) {
  const std::uint64_t data = numberOf(processor, "DataWidth").value_or(0);
  const std::uint64_t address = numberOf(processor, "AddressWidth").value_or(0);
  return listed({data == 0 ? "" : std::to_string(data) + " data bits",
                 address == 0 ? "" : std::to_string(address) + " address bits"});
}

struct CacheKind {
  std::string label;
  std::size_t count;
};

std::string cacheLabel(const OverviewCache& overview) {
  constexpr std::uint64_t firstLevelCode = 3;
  constexpr std::uint64_t lastLevelCode = 5;
  constexpr std::uint64_t instruction = 2;
  constexpr std::uint64_t data = 3;
  const std::uint64_t level = numberOf(overview.association, "Level").value_or(0);
  const std::uint64_t type = numberOf(overview.association, "CacheType").value_or(0);
  std::string label = "cache";
  if (level >= firstLevelCode && level <= lastLevelCode) {
    label = "L" + std::to_string(level - firstLevelCode + 1);
    label += type == instruction ? "i" : type == data ? "d" : "";
  }
  const std::uint64_t size =
      numberOf(overview.cache, "BlockSize").value_or(0) * numberOf(overview.cache, "NumberOfBlocks").value_or(0);
  return size == 0 ? label : label + ' ' + formatBytes(size);
}

std::string cacheText(const std::vector<OverviewCache>& caches) {
  std::vector<CacheKind> kinds;
  for (const OverviewCache& cache : caches) {
    const std::string label = cacheLabel(cache);
    const auto kind = std::ranges::find(kinds, label, &CacheKind::label);
    if (kind == kinds.end()) {
      kinds.push_back({label, 1});
    } else {
      ++kind->count;
    }
  }
  std::ranges::sort(kinds, {}, &CacheKind::label);
  std::string text;
  for (const CacheKind& kind : kinds) {
    text += text.empty() ? "" : ", ";
    text += (kind.count == 1 ? "" : std::to_string(kind.count) + " × ") + kind.label;
  }
  return text;
}

/// Everything about a processor but its identity.
std::string traitsOf(const OverviewProcessor& overview) {
  const Instance& processor = overview.processor;
  const std::string name = textOf(processor, "Name");
  const std::pair<std::string_view, std::string> rows[] = {
      {"Model", name.empty() ? "not known" : name},
      {"Family", familyText(processor)},
      {"State", listed({nameOf(processor, "EnabledState"), "health " + nameOf(processor, "HealthState")})},
      {"Cores", coreText(overview)},
      {"Clocks",
       listed({clockText(processor, "CurrentClockSpeed", "now"), clockText(processor, "MaxClockSpeed", "at most")})},
      {"Caches", cacheText(overview.caches)},
      {"Widths", widthText(processor)}};
  std::string text;
  for (const auto& [label, value] : rows) {
    text += "  " + padRight(std::string(label), 6) + "  " + (value.empty() ? "not known" : value) + '\n';
  }
  return text;
}

struct Paragraph {
  std::vector<std::string> identities;
  std::string traits;
};

std::vector<Paragraph> paragraphsOf(const std::vector<OverviewProcessor>& processors) {
  std::vector<Paragraph> paragraphs;
  for (const OverviewProcessor& processor : processors) {
    const std::string traits = traitsOf(processor);
    const auto same = std::ranges::find(paragraphs, traits, &Paragraph::traits);
    const std::string identity = textOf(processor.processor, "DeviceID");
    if (same == paragraphs.end()) {
      paragraphs.push_back({{identity}, traits});
    } else {
      same->identities.push_back(identity);
    }
  }
  return paragraphs;
}

std::string headingOf(const Paragraph& paragraph) {
  std::string heading = paragraph.identities.size() == 1
                            ? "Processor "
                            : std::to_string(paragraph.identities.size()) + " equal processors: ";
  for (const std::string& identity : paragraph.identities) {
    heading += (&identity == &paragraph.identities.front() ? "" : ", ") + identity;
  }
  return heading + '\n';
}

std::string systemLine(const Instance& system) {
  const std::string name = textOf(system, "Name");
  const std::string maker = textOf(system, "Manufacturer");
  const std::string model = textOf(system, "Model");
  const std::string make = maker.empty() || model.starts_with(maker) ? model : maker + ' ' + model;
  return (name.empty() ? "This machine" : name) + (make.empty() ? "" : ": " + make) + '\n';
}

bool isVirtual(const OverviewData& data) {
  return textOf(data.system, "Model").find("Virtual") != std::string::npos;
}

}  // namespace

std::string writeOverview(const OverviewData& data, std::span<const Tarn::Inventory::Unread> unread) {
  std::string text = systemLine(data.system);
  if (data.processors.empty()) {
    text += "\nThe library knows no processors.\n";
  }
  for (const Paragraph& paragraph : paragraphsOf(data.processors)) {
    text += '\n' + headingOf(paragraph) + paragraph.traits;
  }
  if (isVirtual(data) && !data.processors.empty()) {
    text += "\nA virtual machine: its processors' model and family are not reported.\n";
  }
  const std::string notRead = writeUnread(unread);
  return notRead.empty() ? text : text + '\n' + notRead;
}

Outcome showOverview(Dispatcher& dispatcher, const std::string& nameSpace) {
  const OverviewData data = gatherOverview(dispatcher, nameSpace);
  Outcome outcome;
  outcome.errors = data.failures;
  if (data.processors.empty()) {
    if (const std::optional<std::string> error = inventoryError()) {
      return {"", {*error}};
    }
  }
  if (!data.processorsAreKnown) {
    return outcome;
  }
  outcome.output = writeOverview(data, Tarn::Inventory::processTree()->unread());
  return outcome;
}

}  // namespace Corvcim
