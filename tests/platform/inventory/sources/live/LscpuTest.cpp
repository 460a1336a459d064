// The live source and lscpu look at the same machine, so they must agree.

#include <gtest/gtest.h>

#include <cstdio>
#include <map>
#include <memory>
#include <nlohmann/json.hpp>
#include <set>
#include <string>

#include "platform/inventory/sources/Source.h"
#include "platform/inventory/sources/kernel/CimFamily.h"

namespace Tarn::Inventory {
namespace {

using namespace NodeLexicon;
using Json = nlohmann::json;

std::string outputOf(const std::string& command) {
  const std::unique_ptr<FILE, int (*)(FILE*)> pipe(::popen(command.c_str(), "r"), ::pclose);
  std::string output;
  char buffer[4096];
  while (pipe) {
    const std::size_t got = std::fread(buffer, 1, sizeof buffer, pipe.get());
    if (got == 0) {
      break;
    }
    output.append(buffer, got);
  }
  return output;
}

// Newer versions nest the fields; the names are the same.
void flatten(const Json& fields, std::map<std::string, std::string>& into) {
  for (const Json& field : fields) {
    if (field.contains("data") && field["data"].is_string()) {
      into[field["field"].get<std::string>()] = field["data"].get<std::string>();
    }
    if (field.contains("children")) {
      flatten(field["children"], into);
    }
  }
}

class Lscpu : public testing::Test {
 protected:
  Lscpu() : tree_(loadInventory("live")) {
    const std::string summary = outputOf("LC_ALL=C lscpu -B -J");
    if (!summary.empty()) {
      flatten(Json::parse(summary)["lscpu"], fields_);
    }
  }

  void SetUp() override {
    if (fields_.empty()) {
      GTEST_SKIP() << "lscpu is not installed";
    }
  }

  unsigned int number(const std::string& field) const {
    return static_cast<unsigned int>(std::stoul(fields_.at(field)));
  }

  unsigned int sumOf(Properties id) const {
    unsigned int sum = 0;
    for (const NodeIndex index : tree_.ofType(NodeProcessor)) {
      const unsigned int* value = tree_.number(tree_.node(index), id);
      sum += value == nullptr ? 0 : *value;
    }
    return sum;
  }

  const Node& firstProcessor() const { return tree_.node(tree_.ofType(NodeProcessor)[0]); }

  const Tree tree_;
  std::map<std::string, std::string> fields_;
};

TEST_F(Lscpu, CountsTheSamePackagesCoresAndThreads) {
  const unsigned int sockets = number("Socket(s):");
  const unsigned int cores = sockets * number("Core(s) per socket:");

  EXPECT_EQ(tree_.ofType(NodeProcessor).size(), sockets);
  EXPECT_EQ(tree_.ofType(NodeProcessorCore).size(), cores);
  EXPECT_EQ(sumOf(PropProcessorCores), cores);
  EXPECT_EQ(sumOf(PropHardwareThreads), number("CPU(s):"));
}

TEST_F(Lscpu, SeesTheSameCaches) {
  std::map<std::string, std::pair<unsigned int, std::uint64_t>> mine;  // instances and bytes
  for (const NodeIndex index : tree_.ofType(NodeCacheMemory)) {
    const Node& cache = tree_.node(index);
    const unsigned int* line = tree_.number(cache, PropCacheBlockSize);
    const unsigned int* blocks = tree_.number(cache, PropCacheNumberOfBlocks);
    ASSERT_TRUE(line != nullptr && blocks != nullptr) << cache.path();
    auto& [instances, bytes] = mine[*tree_.text(cache, PropCacheName)];
    ++instances;
    bytes += std::uint64_t{*line} * *blocks;
  }

  std::set<std::string> seen;
  for (const auto& [name, entry] : mine) {
    const std::string expected = std::to_string(entry.second) + " (" + std::to_string(entry.first) +
                                 (entry.first == 1 ? " instance)" : " instances)");
    EXPECT_EQ(fields_[name + " cache:"], expected) << name;
    seen.insert(name + " cache:");
  }
  for (const auto& [field, value] : fields_) {
    EXPECT_TRUE(!field.ends_with(" cache:") || seen.contains(field)) << field << ' ' << value;
  }
}

TEST_F(Lscpu, SeesTheSameCacheGeometry) {
  const Json caches = Json::parse(outputOf("LC_ALL=C lscpu -B -C -J"))["caches"];
  std::map<unsigned int, std::optional<unsigned int>> codes{{1, 1}, {2, 3}, {4, 4}, {8, 5}, {16, 6}};
  const std::map<std::string, unsigned int> types{{"Instruction", 1}, {"Data", 2}, {"Unified", 3}};

  for (const Json& cache : caches) {
    const std::string name = cache["name"];
    const auto found = std::ranges::find_if(tree_.nodes(), [&](const Node& node) {
      const std::string* own = tree_.text(node, PropCacheName);
      return own != nullptr && *own == name;
    });
    ASSERT_NE(found, tree_.nodes().end()) << name;
    EXPECT_EQ(*tree_.number(*found, PropCacheType), types.at(cache["type"])) << name;
    EXPECT_EQ(*tree_.number(*found, PropCacheBlockSize), cache["coherency-size"].get<unsigned int>()) << name;
    EXPECT_EQ(*tree_.number(*found, PropCacheLevel), cache["level"].get<unsigned int>() + 2) << name;
    if (cache["sets"].is_number() && cache["sets"] != 1) {
      const unsigned int* associativity = tree_.number(*found, PropCacheAssociativity);
      const std::optional<unsigned int> code = codes[cache["ways"].get<unsigned int>()];
      EXPECT_EQ(associativity == nullptr ? std::nullopt : std::optional(*associativity), code) << name;
    }
  }
}

TEST_F(Lscpu, NamesTheSameProcessor) {
  if (!fields_.contains("Model name:") || fields_.at("Model name:") == "-") {
    GTEST_SKIP() << "lscpu does not know the name either";
  }
  const std::string* name = tree_.text(firstProcessor(), PropProcessorName);
  ASSERT_NE(name, nullptr);
  EXPECT_EQ(*name, fields_.at("Model name:"));
}

TEST_F(Lscpu, KnowsTheSameFamilyAndStepping) {
  if (!fields_.contains("CPU family:") || !fields_.contains("Model:")) {
    GTEST_SKIP() << "only x86 has these numbers";
  }
  const auto family = static_cast<int>(number("CPU family:"));
  const auto model = static_cast<int>(number("Model:"));

  EXPECT_EQ(*tree_.number(firstProcessor(), PropFamily),
            cimFamily(fields_.at("Vendor ID:"), fields_.at("Model name:"), family, model));
  EXPECT_EQ(*tree_.text(firstProcessor(), PropStepping), fields_.at("Stepping:"));
}

TEST_F(Lscpu, KnowsTheSameMaximumClockSpeed) {
  const unsigned int* mine = tree_.number(firstProcessor(), PropMaxClockSpeed);
  if (!fields_.contains("CPU max MHz:")) {
    EXPECT_EQ(mine, nullptr);
    return;
  }
  ASSERT_NE(mine, nullptr);
  EXPECT_NEAR(*mine, std::stod(fields_.at("CPU max MHz:")), 1);
}

}  // namespace
}  // namespace Tarn::Inventory
