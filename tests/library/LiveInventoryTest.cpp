// The live inventory, through the library's instances, agrees with what lscpu says of this machine.

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstdio>
#include <map>
#include <memory>
#include <nlohmann/json.hpp>
#include <set>
#include <sstream>
#include <string>

#include "tests/library/LoadedLibrary.h"

namespace {

using Corvcim::Instance;
using Library::Environment;
using Library::LoadedLibrary;

std::string outputOf(const std::string& command) {
  const std::unique_ptr<FILE, int (*)(FILE*)> pipe(popen((command + " 2>/dev/null").c_str(), "r"), pclose);
  std::string text;
  std::array<char, 4096> buffer{};
  while (pipe != nullptr && fgets(buffer.data(), static_cast<int>(buffer.size()), pipe.get()) != nullptr) {
    text += buffer.data();
  }
  return text;
}

nlohmann::json jsonOf(const std::string& command) {
  return nlohmann::json::parse(outputOf(command), nullptr, false);
}

/// The fields of "lscpu -J" by name, those of its groups too.
void collectFields(const nlohmann::json& fields, std::map<std::string, std::string>& collected) {
  for (const auto& field : fields) {
    if (field.contains("data") && field["data"].is_string()) {
      collected.emplace(field["field"].get<std::string>(), field["data"].get<std::string>());
    }
    if (field.contains("children")) {
      collectFields(field["children"], collected);
    }
  }
}

/// The fields of lscpu by name; none where it does not write JSON.
std::map<std::string, std::string> fieldsOfLscpu() {
  std::map<std::string, std::string> fields;
  const nlohmann::json output = jsonOf("LC_ALL=C lscpu -J");
  if (!output.is_discarded()) {
    collectFields(output["lscpu"], fields);
  }
  return fields;
}

/// The online CPUs of the machine, and how many packages and cores they make up.
struct OnlineCpus {
  std::size_t cpus = 0;
  std::set<std::string> cores;
  std::set<std::string> sockets;
};

OnlineCpus onlineCpusOfLscpu() {
  OnlineCpus online;
  std::istringstream lines(outputOf("LC_ALL=C lscpu -b -p=CPU,SOCKET,CORE"));
  for (std::string line; std::getline(lines, line);) {
    if (line.empty() || line.front() == '#') {
      continue;
    }
    // The rest of the line names the core, for some versions of lscpu within its socket only.
    const std::string core = line.substr(line.find(',') + 1);
    const std::string socket = core.substr(0, core.find(','));
    ++online.cpus;
    online.cores.insert(core);
    if (!socket.empty()) {
      online.sockets.insert(socket);
    }
  }
  return online;
}

std::uint64_t numberOf(const Instance& instance, const std::string& property) {
  const Corvcim::Value* value = instance.property(property);
  return value != nullptr ? value->asUnsigned() : 0;
}

/// The computer system's model, as the provider that the library comes with tells it.
std::string systemModel() {
  Corvcim::Broker broker;
  const Corvcim::ProviderLibrary library(CORVANE_BINARY_DIR "/lib/libcorvcomputersystemprovider.so");
  const auto response = broker.enumerateInstances(library.instanceMI(broker, "CorvaneComputerSystemProvider"),
                                                  {"", "root/cimv2", "HALDA_ComputerSystem", {}});
  const Corvcim::Value* model = response.instances.empty() ? nullptr : response.instances.front().property("Model");
  return model != nullptr ? model->asString() : "";
}

class LiveInventory : public ::testing::Test {
 protected:
  LiveInventory() : environment_(Library::quietly("live")) {}

  Environment environment_;
  LoadedLibrary library;
};

TEST_F(LiveInventory, HasThePackagesCoresAndThreadsOfLscpu) {
  const OnlineCpus online = onlineCpusOfLscpu();
  if (online.sockets.empty()) {
    GTEST_SKIP() << "lscpu does not know of sockets here";
  }

  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), online.sockets.size());
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessorCore").instances.size(), online.cores.size());
  std::uint64_t coresOfAll = 0;
  std::uint64_t threadsOfAll = 0;
  for (const Instance& each : library.enumerateInstances("HALDA_CPUProcessorCapabilities").instances) {
    coresOfAll += numberOf(each, "NumberOfProcessorCores");
    threadsOfAll += numberOf(each, "NumberOfHardwareThreads");
  }
  EXPECT_EQ(coresOfAll, online.cores.size());
  EXPECT_EQ(threadsOfAll, online.cpus);
}

// A virtual machine's processors are told as unknown.
TEST_F(LiveInventory, HasTheNameAndFamilyOfLscpu) {
  const auto fields = fieldsOfLscpu();
  if (!fields.contains("Model name:") || !fields.contains("Vendor ID:") || !fields.contains("CPU family:")) {
    GTEST_SKIP() << "lscpu does not tell the processors' name and family here";
  }
  constexpr std::uint64_t unknownFamily = 2;
  constexpr std::uint64_t zen = 107;
  const bool isVirtual = systemModel().find("Virtual") != std::string::npos;
  const std::string family = fields.at("CPU family:");
  const bool isZen = fields.at("Vendor ID:") == "AuthenticAMD" && (family == "23" || family == "25" || family == "26");

  const auto processors = library.enumerateInstances("HALDA_CPUProcessor").instances;
  EXPECT_FALSE(processors.empty());
  for (const Instance& each : processors) {
    EXPECT_EQ(each.property("Name")->asString(), isVirtual ? "Unknown" : fields.at("Model name:"));
    if (isVirtual || isZen) {
      EXPECT_EQ(numberOf(each, "Family"), isVirtual ? unknownFamily : zen);
    }
  }
}

// Whatever this machine is, these are one that is not virtual and one that is.
TEST(WrittenInventory, HasItsNamesAndFamiliesUnlessItIsVirtual) {
  const struct {
    const char* machine;
    const char* name;
    std::uint64_t family;
  } machines[] = {
      {"dual-socket-server", "Intel(R) Xeon(R) Gold 6334 CPU @ 3.60GHz", 179},
      {"large-server", "AMD EPYC 9754 128-Core Processor", 107},
      {"virtual-machine", "Unknown", 2},
  };
  for (const auto& each : machines) {
    const Environment environment(Library::quietly(Library::fixture(each.machine)));
    LoadedLibrary library;
    const auto processors = library.enumerateInstances("HALDA_CPUProcessor").instances;
    EXPECT_EQ(processors.size(), 2U);
    for (const Instance& processor : processors) {
      EXPECT_EQ(processor.property("Name")->asString(), each.name);
      EXPECT_EQ(numberOf(processor, "Family"), each.family);
    }
  }
}

TEST_F(LiveInventory, HasTheCachesOfLscpu) {
  const nlohmann::json output = jsonOf("LC_ALL=C lscpu -C -J -B");
  if (output.is_discarded() || !output.contains("caches") || output["caches"].empty()) {
    GTEST_SKIP() << "lscpu tells no caches here";
  }
  struct Kind {
    std::uint64_t instances = 0;
    std::uint64_t bytes = 0;
    bool operator==(const Kind&) const = default;
  };
  std::map<std::string, Kind> expected;
  for (const auto& cache : output["caches"]) {
    const std::uint64_t one = std::stoull(cache["one-size"].get<std::string>());
    const std::uint64_t all = std::stoull(cache["all-size"].get<std::string>());
    expected[cache["name"].get<std::string>()] = {all / one, all};
  }

  std::map<std::string, Kind> caches;
  for (const Instance& each : library.enumerateInstances("HALDA_CPUMemory").instances) {
    Kind& kind = caches[each.property("Name")->asString()];
    ++kind.instances;
    kind.bytes += numberOf(each, "BlockSize") * numberOf(each, "NumberOfBlocks");
  }
  ASSERT_EQ(caches.size(), expected.size());
  for (const auto& [name, kind] : expected) {
    EXPECT_EQ(caches[name].instances, kind.instances) << name;
    EXPECT_EQ(caches[name].bytes, kind.bytes) << name;
  }
}

// CIM counts cache levels from 3.
TEST_F(LiveInventory, AssociatesTheLevelsOfLscpu) {
  const nlohmann::json output = jsonOf("LC_ALL=C lscpu -C -J -B");
  if (output.is_discarded() || !output.contains("caches") || output["caches"].empty()) {
    GTEST_SKIP() << "lscpu tells no caches here";
  }
  std::map<std::string, std::uint64_t> levels;
  for (const auto& cache : output["caches"]) {
    const auto level = cache["level"].get<std::uint64_t>();
    levels[cache["name"].get<std::string>()] = level <= 3 ? level + 2 : 1;
  }
  const auto associations = library.enumerateInstances("HALDA_CPUAssociatedCacheMemory").instances;
  EXPECT_FALSE(associations.empty());
  EXPECT_EQ(associations.size(), library.enumerateInstances("HALDA_CPUMemory").instances.size());
  for (const Instance& each : associations) {
    const auto cache = library.getInstance(each.property("Antecedent")->asReference());
    ASSERT_EQ(cache.instances.size(), 1U);
    EXPECT_EQ(numberOf(each, "Level"), levels.at(cache.instances[0].property("Name")->asString()));
  }
}

}  // namespace
