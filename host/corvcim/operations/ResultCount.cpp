#include "host/corvcim/operations/ResultCount.h"

#include <algorithm>
#include <cstdint>
#include <exception>
#include <memory>
#include <string_view>

#include "platform/inventory/ProcessTree.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Node;
using Tarn::Inventory::NodeIndex;
using Tarn::Inventory::Tree;

constexpr std::uint64_t mostResults = 65535;

/// The library leaves out empty sockets and processors without a status.
bool isReported(const Node& processor) {
  return processor.status != 0 && processor.status != Tarn::Inventory::Status::emptySocket;
}

std::uint64_t processorsOf(const Tree& tree) {
  return static_cast<std::uint64_t>(
      std::ranges::count_if(tree.ofType(Tarn::NodeLexicon::NodeProcessor),
                            [&](NodeIndex processor) { return isReported(tree.node(processor)); }));
}

std::uint64_t coresOf(const Tree& tree) {
  return tree.ofType(Tarn::NodeLexicon::NodeProcessorCore).size();
}

std::uint64_t cachesOf(const Tree& tree) {
  return tree.ofType(Tarn::NodeLexicon::NodeCacheMemory).size();
}

/// Every core is linked to every cache of its processor.
std::uint64_t coreCacheLinksOf(const Tree& tree) {
  std::uint64_t links = 0;
  for (const NodeIndex processor : tree.ofType(Tarn::NodeLexicon::NodeProcessor)) {
    std::uint64_t cores = 0;
    std::uint64_t caches = 0;
    for (NodeIndex part = processor + 1; part < tree.node(processor).end; ++part) {
      cores += tree.node(part).type == Tarn::NodeLexicon::NodeProcessorCore ? 1U : 0U;
      caches += tree.node(part).type == Tarn::NodeLexicon::NodeCacheMemory ? 1U : 0U;
    }
    links += cores * caches;
  }
  return links;
}

/// How many objects of a class the inventory makes. Classes without a row cannot have too many.
struct ClassCount {
  std::string_view className;
  std::uint64_t (*objects)(const Tree& tree);
};
constexpr ClassCount classCounts[] = {
    {"HALDA_CPUProcessor", processorsOf},
    {"HALDA_CPUProcessorCore", coresOf},
    {"HALDA_CPUMemory", cachesOf},
    {"HALDA_CPUProcessorCapabilities", processorsOf},
    {"HALDA_CPUSystemDevice", processorsOf},
    {"HALDA_CPUConcreteComponent", coresOf},
    {"HALDA_CPUAssociatedCacheMemory", cachesOf},
    {"HALDA_CPUCoreAssociatedCacheMemory", coreCacheLinksOf},
    {"HALDA_CPUElementCapabilities", processorsOf},
};

std::uint64_t objectsIn(const Response& response, std::string_view className) {
  const auto ofClass = [&](const ObjectPath& path) { return sameName(path.className, className); };
  return static_cast<std::uint64_t>(std::ranges::count_if(response.paths, ofClass) +
                                    std::ranges::count_if(response.instances, ofClass, &Instance::path));
}

/// Names of links are delivered one by one, without a count, if the parts themselves are not too many.
bool namesAreComplete(const ClassDefinition& definition, const Operation& operation, const Tree& tree) {
  return operation.kind == OperationKind::EnumerateInstances && definition.association &&
         std::max({processorsOf(tree), coresOf(tree), cachesOf(tree)}) <= mostResults;
}

/// A running kernel has some thousand CPUs at most: only its links can be too many, and reading the inventory costs as
/// much as the rest of the request.
bool canBeTooMany(const ClassDefinition& definition) {
  return definition.association || Tarn::Inventory::chosenSource() != "live";
}

std::shared_ptr<const Tree> readableTree() {
  try {
    return Tarn::Inventory::processTree();
  } catch (const std::exception&) {
    return nullptr;  // reported with the answer
  }
}

}  // namespace

std::vector<std::string> describeMissingResults(const Operation& operation, const Response& response) {
  std::vector<std::string> lines;
  if (isAssociationOperation(operation.kind) || operation.kind == OperationKind::GetInstance) {
    return lines;
  }
  for (const ClassDefinition* definition : classesServing(operation.path.className)) {
    const auto* const row = std::ranges::find(classCounts, definition->name, &ClassCount::className);
    if (row == std::end(classCounts) || !canBeTooMany(*definition)) {
      continue;
    }
    const std::shared_ptr<const Tree> tree = readableTree();
    const std::uint64_t expected = tree == nullptr ? 0 : row->objects(*tree);
    const std::uint64_t delivered = objectsIn(response, definition->name);
    if (expected > mostResults && delivered < expected) {
      // An operation on one class names it already.
      const bool isAsked = sameName(definition->name, operation.path.className);
      lines.push_back((isAsked ? "" : std::string(definition->name) + ": ") + std::to_string(delivered) + " of " +
                      std::to_string(expected) +
                      " results: the library counts them in 16 bits and leaves out the rest; " +
                      (namesAreComplete(*definition, operation, *tree) ? "ein lists the paths of all"
                                                                       : "'corvcim inventory' lists all parts"));
    }
  }
  return lines;
}

}  // namespace Corvcim
