#include "tests/host/corvcim/Machines.h"

#include <string>
#include <utility>

#include "platform/inventory/tree/TreeBuilder.h"

namespace Corvcim::Testing {
namespace {

using Tarn::Inventory::CpuSet;
using Tarn::Inventory::Tree;
using Tarn::Inventory::TreeBuilder;
namespace Status = Tarn::Inventory::Status;
using namespace Tarn::NodeLexicon;

enum CacheType : unsigned int { Instruction = 1, Data = 2, Unified = 3 };

struct ProcessorFacts {
  std::string name;
  unsigned int cores;
  unsigned int threads;
  unsigned int maxClock;
};

void addProcessor(TreeBuilder& builder, const std::string& path, const ProcessorFacts& facts) {
  constexpr unsigned int xeon = 179;
  builder.processor(path)
      .description("Socket " + path)
      .text(PropProcessorName, facts.name)
      .number(PropFamily, xeon)
      .number(PropCurrentClockSpeed, 2000)
      .number(PropMaxClockSpeed, facts.maxClock)
      .number(PropDataWidth, 64)
      .number(PropProcessorCores, facts.cores)
      .number(PropEnabledCores, facts.cores)
      .number(PropHardwareThreads, facts.threads)
      .text(PropStepping, "8")
      .text(PropProcessorId, "0f a9");
}

void addCache(TreeBuilder& builder, const std::string& path, unsigned int level, CacheType type, unsigned int kibibytes,
              CpuSet cpus) {
  constexpr unsigned int lineSize = 64;
  constexpr unsigned int firstLevelCode = 3;
  const unsigned int blocks = kibibytes * 1024 / lineSize;
  builder.cache(path)
      .description("Cache " + path)
      .number(PropCacheLevel, firstLevelCode + level - 1)
      .number(PropCacheType, type)
      .number(PropCacheBlockSize, lineSize)
      .number(PropCacheNumberOfBlocks, blocks)
      .number(PropCacheConsumableBlocks, blocks)
      .text(PropCacheName, "L" + std::to_string(level))
      .cpus(std::move(cpus));
}

void addFirstLevel(TreeBuilder& builder, const std::string& prefix, const std::string& number, unsigned int data,
                   unsigned int instructions, const CpuSet& cpus) {
  addCache(builder, prefix + ".L1d." + number, 1, Data, data, cpus);
  addCache(builder, prefix + ".L1i." + number, 1, Instruction, instructions, cpus);
}

CpuSet range(unsigned int first, unsigned int count) {
  CpuSet cpus;
  for (unsigned int i = 0; i < count; ++i) {
    cpus.add(first + i);
  }
  return cpus;
}

void addServerSocket(TreeBuilder& builder, unsigned int socket) {
  constexpr unsigned int cores = 64;
  constexpr unsigned int siblings = 128;  // from a CPU to its core's other thread
  constexpr unsigned int sharing = 8;
  const std::string prefix = "P" + std::to_string(socket);
  addProcessor(builder, prefix, {"Server CPU 64", cores, 2 * cores, 3529});
  for (unsigned int i = 0; i < cores; ++i) {
    const unsigned int cpu = socket * cores + i;
    builder.core(prefix + ".C" + std::to_string(i)).cpus({cpu, cpu + siblings});
  }
  for (unsigned int i = 0; i < cores; ++i) {
    const unsigned int cpu = socket * cores + i;
    addFirstLevel(builder, prefix, std::to_string(i), 32, 32, {cpu, cpu + siblings});
    addCache(builder, prefix + ".L2." + std::to_string(i), 2, Unified, 512, {cpu, cpu + siblings});
  }
  for (unsigned int i = 0; i < cores / sharing; ++i) {
    CpuSet cpus = range(socket * cores + i * sharing, sharing);
    cpus.add(range(socket * cores + i * sharing + siblings, sharing));
    addCache(builder, prefix + ".L3." + std::to_string(i), 3, Unified, 32768, std::move(cpus));
  }
}

}  // namespace

Tree twoCoreMachine() {
  TreeBuilder builder;
  builder.system().description("DeskBox 2").text(PropSystemModel, "DeskBox 2");
  addProcessor(builder, "P0", {"Desk CPU 2", 2, 2, 2300});
  builder.core("P0.C0").description("Core 0").cpus({0});
  builder.core("P0.C1").description("Core 1").cpus({1});
  for (unsigned int i = 0; i < 2; ++i) {
    addFirstLevel(builder, "P0", std::to_string(i), 48, 32, {i});
    addCache(builder, "P0.L2." + std::to_string(i), 2, Unified, 2048, {i});
  }
  addCache(builder, "P0.L3.0", 3, Unified, 16384, {0, 1});
  return builder.build();
}

Tree dualSocketServer() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "RackBox 2U");
  addServerSocket(builder, 0);
  addServerSocket(builder, 1);
  return builder.build();
}

Tree numaServer() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "RackBox 1U");
  for (unsigned int socket = 0; socket < 2; ++socket) {
    const std::string prefix = "P" + std::to_string(socket);
    addProcessor(builder, prefix, {"Server CPU 4", 4, 4, 3000});
    builder.cpus(range(4 * socket, 4));
    for (unsigned int i = 0; i < 4; ++i) {
      builder.core(prefix + ".C" + std::to_string(i)).cpus({4 * socket + i});
    }
    for (unsigned int i = 0; i < 2; ++i) {
      addCache(builder, prefix + ".L3." + std::to_string(i), 3, Unified, 8192, {4 * socket + i, 4 * socket + i + 2});
    }
  }
  builder.numaNode({0, {0, 2}}).numaNode({1, {1, 3}}).numaNode({2, range(4, 4)});
  return builder.build();
}

Tree hybridLaptop() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "LapBook 14");
  addProcessor(builder, "P0", {"Mobile CPU 6", 6, 8, 4700});
  builder.core("P0.C0").description("Performance core 0").cpus({0, 1});
  builder.core("P0.C4").description("Performance core 4").cpus({2, 3});
  for (unsigned int i = 0; i < 4; ++i) {
    const std::string number = std::to_string(8 + i);
    builder.core("P0.C" + number).description("Efficient core " + number).cpus({4 + i});
  }
  for (unsigned int i = 0; i < 2; ++i) {
    const std::string number = std::to_string(4 * i);
    addFirstLevel(builder, "P0", number, 48, 32, range(2 * i, 2));
    addCache(builder, "P0.L2." + number, 2, Unified, 1280, range(2 * i, 2));
  }
  for (unsigned int i = 0; i < 4; ++i) {
    addFirstLevel(builder, "P0", std::to_string(8 + i), 32, 64, {4 + i});
  }
  addCache(builder, "P0.L2.8", 2, Unified, 2048, range(4, 4));
  addCache(builder, "P0.L3.0", 3, Unified, 12288, range(0, 8));
  return builder.build();
}

Tree smallBoard() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "BoardBox");
  addProcessor(builder, "P0", {"Board CPU 4", 4, 4, 1500});
  for (unsigned int i = 0; i < 4; ++i) {
    builder.core("P0.C" + std::to_string(i)).cpus({i});
    builder.status(i == 3 ? Status::offline : Status::inUse);
  }
  for (unsigned int i = 0; i < 4; ++i) {
    addFirstLevel(builder, "P0", std::to_string(i), 32, 48, {i});
  }
  addCache(builder, "P0.L2.0", 2, Unified, 1024, range(0, 4));
  builder.cache("P0.X").number(PropCacheLevel, 1).text(PropCacheName, "System cache").status(Status::disabled);
  builder.processor("P1").status(Status::emptySocket).description("Socket P1");
  builder.unread({"/sys/firmware/dmi/tables/DMI", "permission denied", "run as root to read it"});
  return builder.build();
}

Tree virtualMachine() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "Virtual Machine");
  addProcessor(builder, "P0", {"Host CPU", 1, 1, 0});
  builder.core("P0.C0").cpus({0});
  return builder.build();
}

Tree strangeTexts() {
  TreeBuilder builder;
  builder.system().text(PropSystemModel, "A<b>&\"c\"\n\x1B[31m");
  addProcessor(builder, "P0", {"say \"hi\" \\ <there>\x07 \xC3\xA9\n", 1, 1, 1000});
  builder.core("P0.C0").description("x\ty").cpus({0});
  return builder.build();
}

}  // namespace Corvcim::Testing
