#include <string_view>

#include "host/corvcim/overview/Overview.h"
#include "host/corvcim/overview/OverviewParts.h"
#include "host/corvcim/text/Json.h"
#include "host/corvcim/text/NodeFields.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::Tree;

OrderedJson countOrNull(std::optional<std::uint64_t> count) {
  return count ? OrderedJson(*count) : OrderedJson();
}

/// Clocks and widths, of which the library answers 0 where it does not know them.
std::optional<std::uint64_t> quantity(const Instance& instance, std::string_view property) {
  const std::optional<std::uint64_t> number = propertyNumber(instance, property);
  return number == 0U ? std::nullopt : number;
}

OrderedJson cachesAsJson(const std::vector<OverviewCache>& caches) {
  OrderedJson list = OrderedJson::array();
  for (const CacheKind& kind : cacheKinds(caches)) {
    list.push_back({{"name", kind.name},
                    {"size", kind.size == 0 ? OrderedJson() : OrderedJson(kind.size)},
                    {"count", kind.count}});
  }
  return list;
}

void addCounts(OrderedJson& json, const CoreCounts& counts) {
  json["cores"] = countOrNull(counts.cores);
  json["enabledCores"] = countOrNull(counts.enabled);
  json["threads"] = countOrNull(counts.threads);
}

OrderedJson processorAsJson(const Shown& shown, const Tree& tree) {
  const Instance& processor = shown.overview->processor;
  OrderedJson json = {{"path", shown.state.path},
                      {"severity", severityName(shown.state.severity)},
                      {"reasons", shown.state.reasons},
                      {"model", textOrNull(propertyText(processor, "Name"))},
                      {"inventoryModel", textOrNull(kernelModel(shown, tree))},
                      {"stepping", textOrNull(propertyText(processor, "Stepping"))}};
  for (const std::string_view code : {"Family", "CPUStatus", "EnabledState", "HealthState"}) {
    json[std::string(code)] = countOrNull(propertyNumber(processor, code));
  }
  for (const std::string_view name : {"CurrentClockSpeed", "MaxClockSpeed", "DataWidth", "AddressWidth"}) {
    json[std::string(name)] = countOrNull(quantity(processor, name));
  }
  addCounts(json, shown.state.counts);
  json["caches"] = cachesAsJson(shown.overview->caches);
  return json;
}

}  // namespace

std::string writeOverviewAsJson(const OverviewData& data, const Tree& tree) {
  const std::vector<Shown> processors = worstFirst(data, tree);
  const std::vector<ProcessorState> states = statesOf(processors);
  OrderedJson json = {{"system",
                       {{"name", textOrNull(propertyText(data.system, "Name"))},
                        {"manufacturer", textOrNull(propertyText(data.system, "Manufacturer"))},
                        {"model", textOrNull(propertyText(data.system, "Model"))},
                        {"virtual", isVirtual(data)}}}};
  addCounts(json, totalOf(states));
  json["processors"] = OrderedJson::array();
  for (const Shown& shown : processors) {
    json["processors"].push_back(processorAsJson(shown, tree));
  }
  json["notReported"] = OrderedJson::array();
  for (const Node* node : unreported(states, tree)) {
    json["notReported"].push_back({{"path", node->path()}, {"status", node->status}});
  }
  json["unread"] = unreadAsJson(tree.unread());
  return jsonDocument(json);
}

std::vector<Instance> overviewRows(const OverviewData& data, const Tree& tree) {
  const auto textOf = [](const std::string& text) {
    return text.empty() ? Value::null(CMPI_string) : Value::string(text);
  };
  const auto numberOf = [](std::optional<std::uint64_t> number) {
    return number ? Value::uint64(*number) : Value::null(CMPI_uint64);
  };
  std::vector<Instance> rows;
  for (const Shown& shown : worstFirst(data, tree)) {
    const Instance& processor = shown.overview->processor;
    const CoreCounts& counts = shown.state.counts;
    rows.push_back({{},
                    {{"Path", textOf(shown.state.path)},
                     {"Severity", Value::string(severityName(shown.state.severity))},
                     {"CPUStatus", numberOf(propertyNumber(processor, "CPUStatus"))},
                     {"HealthState", numberOf(propertyNumber(processor, "HealthState"))},
                     {"Cores", numberOf(counts.cores)},
                     {"EnabledCores", numberOf(counts.enabled)},
                     {"Threads", numberOf(counts.threads)},
                     {"MaxClockSpeed", numberOf(quantity(processor, "MaxClockSpeed"))},
                     {"Family", numberOf(propertyNumber(processor, "Family"))},
                     {"Model", textOf(propertyText(processor, "Name"))}}});
  }
  return rows;
}

}  // namespace Corvcim
