// The live inventory, through the library's instances, agrees with what lscpu says of this machine.

#include <gtest/gtest.h>

#include <array>
#include <cstdint>
#include <cstdio>
#include <map>
#include <memory>
#include <nlohmann/json.hpp>
#include <string>

#include "tests/library/LoadedLibrary.h"

namespace {

using Corvcim::Instance;
using Library::Environment;
using Library::LoadedLibrary;

nlohmann::json outputOf(const std::string& command) {
  const std::unique_ptr<FILE, int (*)(FILE*)> pipe(popen((command + " 2>/dev/null").c_str(), "r"), pclose);
  std::string text;
  std::array<char, 4096> buffer{};
  while (pipe != nullptr && fgets(buffer.data(), static_cast<int>(buffer.size()), pipe.get()) != nullptr) {
    text += buffer.data();
  }
  return nlohmann::json::parse(text, nullptr, false);
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

std::uint64_t numberOf(const Instance& instance, const std::string& property) {
  const Corvcim::Value* value = instance.property(property);
  return value != nullptr ? value->asUnsigned() : 0;
}

class LiveInventory : public ::testing::Test {
 protected:
  LiveInventory() : environment_(Library::quietly("live")) {}

  Environment environment_;
  LoadedLibrary library;
};

TEST_F(LiveInventory, HasThePackagesCoresAndThreadsOfLscpu) {
  const nlohmann::json output = outputOf("LC_ALL=C lscpu -J");
  if (output.is_discarded()) {
    GTEST_SKIP() << "no lscpu that writes JSON";
  }
  std::map<std::string, std::string> fields;
  collectFields(output["lscpu"], fields);
  if (!fields.contains("Socket(s):") || !fields.contains("Core(s) per socket:")) {
    GTEST_SKIP() << "lscpu does not know of sockets here";
  }
  const std::size_t sockets = std::stoul(fields["Socket(s):"]);
  const std::size_t cores = sockets * std::stoul(fields["Core(s) per socket:"]);
  const std::size_t threads = cores * std::stoul(fields["Thread(s) per core:"]);

  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessor").instances.size(), sockets);
  EXPECT_EQ(library.enumerateInstances("HALDA_CPUProcessorCore").instances.size(), cores);
  std::uint64_t coresOfAll = 0;
  std::uint64_t threadsOfAll = 0;
  for (const Instance& each : library.enumerateInstances("HALDA_CPUProcessorCapabilities").instances) {
    coresOfAll += numberOf(each, "NumberOfProcessorCores");
    threadsOfAll += numberOf(each, "NumberOfHardwareThreads");
  }
  EXPECT_EQ(coresOfAll, cores);
  EXPECT_EQ(threadsOfAll, threads);
}

TEST_F(LiveInventory, HasTheCachesOfLscpu) {
  const nlohmann::json output = outputOf("LC_ALL=C lscpu -C -J -B");
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
  const nlohmann::json output = outputOf("LC_ALL=C lscpu -C -J -B");
  if (output.is_discarded() || !output.contains("caches") || output["caches"].empty()) {
    GTEST_SKIP() << "lscpu tells no caches here";
  }
  std::map<std::string, std::uint64_t> levels;
  for (const auto& cache : output["caches"]) {
    const auto level = cache["level"].get<std::uint64_t>();
    levels[cache["name"].get<std::string>()] = level <= 3 ? level + 2 : 1;
  }
  for (const Instance& each : library.enumerateInstances("HALDA_CPUAssociatedCacheMemory").instances) {
    const auto cache = library.getInstance(each.property("Antecedent")->asReference());
    ASSERT_EQ(cache.instances.size(), 1U);
    EXPECT_EQ(numberOf(each, "Level"), levels.at(cache.instances[0].property("Name")->asString()));
  }
}

}  // namespace
