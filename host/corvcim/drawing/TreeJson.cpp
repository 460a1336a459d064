#include "host/corvcim/drawing/TreeJson.h"

#include "host/corvcim/text/Json.h"

namespace Corvcim {
namespace {

OrderedJson numberOrNull(std::uint64_t number) {
  return number == 0 ? OrderedJson() : OrderedJson(number);
}

OrderedJson cachesAsJson(const std::vector<CacheUnit>& caches) {
  OrderedJson list = OrderedJson::array();
  for (const CacheUnit& cache : caches) {
    list.push_back({{"name", cache.name}, {"size", numberOrNull(cache.size)}, {"status", cache.status}});
  }
  return list;
}

OrderedJson partsAsJson(const std::vector<MachinePart>& parts) {
  OrderedJson list = OrderedJson::array();
  for (const MachinePart& part : parts) {
    OrderedJson json = OrderedJson::object();
    if (part.isCore()) {
      json["core"] = part.corePath;
      json["kind"] = textOrNull(part.coreKind);
      json["status"] = part.status;
    }
    json["cpus"] = textOrNull(part.cpus.toList());
    json["numaNodes"] = part.numaNodes;
    json["caches"] = cachesAsJson(part.caches);
    if (!part.isCore()) {
      json["cores"] = part.coreCount;
      json["parts"] = partsAsJson(part.parts);
    }
    list.push_back(std::move(json));
  }
  return list;
}

}  // namespace

std::string drawTreeJson(const Machine& machine) {
  OrderedJson processors = OrderedJson::array();
  for (const MachineProcessor& processor : machine.processors) {
    processors.push_back({{"path", processor.path},
                          {"name", textOrNull(processor.name)},
                          {"status", processor.status},
                          {"cores", processor.coreCount},
                          {"enabledCores", processor.enabledCount},
                          {"threads", numberOrNull(processor.threadCount)},
                          {"maxClock", numberOrNull(processor.maxClock)},
                          {"numaNodes", processor.numaNodes},
                          {"parts", partsAsJson(processor.parts)},
                          {"otherCaches", cachesAsJson(processor.otherCaches)}});
  }
  return jsonDocument(
      {{"system", machine.systemName}, {"model", textOrNull(machine.model)}, {"processors", std::move(processors)}});
}

}  // namespace Corvcim
