#include "bench/Machines.h"

#include "platform/inventory/tree/TreeBuilder.h"

namespace Corvane::Bench {
namespace {

using namespace Tarn::NodeLexicon;
using Tarn::Inventory::TreeBuilder;

void addCache(TreeBuilder& builder, const CacheKind& kind, std::size_t processor, std::size_t core) {
  builder.cache(cachePath(processor, kind, core))
      .description(kind.description)
      .number(PropCacheAssociativity, kind.associativity)
      .number(PropCacheType, kind.type)
      .number(PropCacheLevel, kind.level)
      .number(PropCacheBlockSize, cacheBlockSize)
      .number(PropCacheWritePolicy, cacheWritePolicy)
      .number(PropCacheConsumableBlocks, kind.blocks)
      .number(PropCacheNumberOfBlocks, kind.blocks)
      .text(PropCacheName, kind.name);
}

void addProcessor(TreeBuilder& builder, std::size_t processor, std::size_t coresEach) {
  const auto cores = static_cast<unsigned int>(coresEach);
  builder.processor(processorPath(processor))
      .description("Processor in socket " + std::to_string(processor))
      .number(PropDataWidth, 64)
      .number(PropAddressWidth, 64)
      .number(PropExternalClockSpeed, 100)
      .number(PropMaxClockSpeed, 4000)
      .number(PropCurrentClockSpeed, 2600)
      .number(PropHardwareThreads, 2 * cores)
      .number(PropEnabledCores, cores)
      .number(PropProcessorCores, cores)
      .number(PropFamily, 179)
      .number(PropUpgradeMethod, 6)
      .text(PropProcessorId, "57 06 05 00 FF FB EB BF")
      .text(PropStepping, "7")
      .text(PropProcessorName, "Server Processor 8480 at 2.60 GHz")
      .list(PropRequestedStatesSupported, {1});
}

std::string path(std::size_t processor, const std::string& part) {
  std::string result = processorPath(processor);
  return part.empty() ? result : result += "." + part;
}

}  // namespace

std::string processorPath(std::size_t processor) {
  return "P" + std::to_string(processor);
}

std::string corePath(std::size_t processor, std::size_t core) {
  return path(processor, "C" + std::to_string(core));
}

std::string cachePath(std::size_t processor, const CacheKind& kind, std::size_t core) {
  return path(processor, std::string(kind.name) + "." + std::to_string(core));
}

Tarn::Inventory::Tree makeMachine(const MachineSize& size) {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "PowerBox 9000");
  for (std::size_t processor = 0; processor < size.processors; ++processor) {
    addProcessor(builder, processor, size.coresEach);
    for (std::size_t core = 0; core < size.coresEach; ++core) {
      builder.core(corePath(processor, core)).description("Core " + std::to_string(core));
      for (const CacheKind& kind : coreCaches) {
        addCache(builder, kind, processor, core);
      }
    }
    addCache(builder, sharedCache, processor, 0);
  }
  return builder.build();
}

}  // namespace Corvane::Bench
