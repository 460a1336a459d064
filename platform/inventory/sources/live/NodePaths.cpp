#include "platform/inventory/sources/live/NodePaths.h"

#include <algorithm>
#include <utility>

namespace Tarn::Inventory {

namespace {

// With its mark in front a path of this length still fits a std::string without memory of its own.
constexpr std::size_t longestPath = 14;
constexpr unsigned int longestPackage = 9999;

/// What a part would be called, and what else if this will not do.
struct Choice {
  std::string preferred;  // empty where there is no number
  std::string byCpu;
};

std::vector<std::string> choose(std::vector<Choice> choices) {
  std::vector<std::string> taken;
  taken.reserve(choices.size());
  for (const Choice& choice : choices) {
    taken.push_back(choice.preferred);
  }
  std::ranges::sort(taken);
  std::vector<std::string> paths;
  paths.reserve(choices.size());
  for (Choice& choice : choices) {
    const auto [first, last] = std::equal_range(taken.begin(), taken.end(), choice.preferred);
    const bool good = !choice.preferred.empty() && choice.preferred.size() <= longestPath && last - first == 1;
    paths.push_back(std::move(good ? choice.preferred : choice.byCpu));
  }
  return paths;
}

std::string atCpu(unsigned int cpu) {
  return "@" + std::to_string(cpu);
}

// A group that is not the first of its kind.
std::string group(char letter, std::optional<unsigned int> number) {
  return number.value_or(0) == 0 ? std::string() : std::string(".") + letter + std::to_string(*number);
}

}  // namespace

std::string processorPath(const Package& package) {
  return "P" + (package.id && *package.id <= longestPackage ? std::to_string(*package.id) : atCpu(package.lowestCpu));
}

std::vector<std::string> corePaths(const std::string& processor, const std::vector<Core>& cores) {
  std::vector<Choice> choices;
  for (const Core& core : cores) {
    const CorePlace& place = core.place;
    const std::string number =
        place.core ? processor + group('D', place.die) + group('K', place.cluster) + ".C" + std::to_string(*place.core)
                   : std::string();
    choices.push_back({number, processor + ".C" + atCpu(core.cpus.first())});
  }
  return choose(std::move(choices));
}

std::vector<std::string> cachePaths(const std::string& processor, const std::vector<const Cache*>& caches) {
  std::vector<Choice> choices;
  for (const Cache* cache : caches) {
    const std::string name = processor + '.' + cacheName(*cache);
    choices.push_back(
        {cache->id ? name + '.' + std::to_string(*cache->id) : std::string(), name + atCpu(cache->cpus.first())});
  }
  return choose(std::move(choices));
}

std::string cacheName(unsigned int level, std::optional<CacheContents> contents) {
  std::string name = "L" + std::to_string(level);
  if (!contents) {
    name += 'x';
  } else if (contents != CacheContents::Unified) {
    name += contents == CacheContents::Data ? 'd' : 'i';
  }
  return name;
}

std::string cacheName(const Cache& cache) {
  return cacheName(cache.level, cache.contents);
}

}  // namespace Tarn::Inventory
