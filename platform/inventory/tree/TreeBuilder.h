#ifndef CORVANE_PLATFORM_INVENTORY_TREE_TREEBUILDER_H
#define CORVANE_PLATFORM_INVENTORY_TREE_TREEBUILDER_H

#include <optional>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/inventory/tree/Tree.h"

namespace Tarn::Inventory {

/// Builds a tree from top to bottom: each call that adds a node puts it in its place below the ones
/// before, and the calls after it describe that node.
///
///     Tree tree = TreeBuilder()
///         .system().text(PropSystemModel, "PowerBox 300")
///         .processor("P0").number(PropProcessorCores, 2).cpus({0, 1})
///         .core("P0.C0").cpus({0})
///         .core("P0.C1").cpus({1}).status(Status::offline)
///         .cache("P0.L3.0").number(PropCacheLevel, 5).cpus({0, 1})
///         .build();
///
/// A builder that collects origins asks for each value where it comes from, right after the value:
///
///     builder.number(PropMaxClockSpeed, 3500).from([&] { return fileOrigin(...); });
///
/// Processors go below the system, or stand at the top where there is none; cores and caches go below
/// the processor added last. What cannot be is refused with std::invalid_argument and a text that
/// names the node: a second system, a system after a processor, a core without a processor, a path
/// that is empty, used twice or holds anything but visible ASCII characters, a property that is
/// unknown, given twice, of another kind or of another node type.
class TreeBuilder {
 public:
  explicit TreeBuilder(Detail detail = Detail::Values) : detail_(detail) {}

  TreeBuilder& system(std::string_view path = "system");
  TreeBuilder& processor(std::string_view path);
  TreeBuilder& core(std::string_view path);
  TreeBuilder& cache(std::string_view path);

  /// As the four above, by type.
  TreeBuilder& node(NodeLexicon::NodeType type, std::string_view path);

  // About the node added last. Texts are kept as valid UTF-8: what is not becomes U+FFFD.
  TreeBuilder& status(unsigned int status);  ///< unless called, the node is in use
  TreeBuilder& description(std::string_view text);
  TreeBuilder& cpus(CpuSet cpus);
  TreeBuilder& number(NodeLexicon::Properties id, unsigned int value);
  TreeBuilder& text(NodeLexicon::Properties id, std::string_view value);
  TreeBuilder& list(NodeLexicon::Properties id, std::vector<unsigned int> value);

  /// Says where the status, description or property given last comes from. `explain` returns an Origin;
  /// it is called only if origins are collected.
  template <class Explain>
  TreeBuilder& from(Explain&& explain) {
    if (detail_ == Detail::WithOrigins) {
      addOrigin(std::forward<Explain>(explain)());
    }
    return *this;
  }

  /// Adds a NUMA node. Throws std::invalid_argument unless its number is above those before and it has CPUs.
  TreeBuilder& numaNode(NumaNode node);

  /// Reports something that the source could not read.
  TreeBuilder& unread(const Unread& entry);

  /// Reports that two sources contradict each other.
  TreeBuilder& disagreement(const Disagreement& entry);

  /// The tree; the builder is empty afterwards.
  Tree build();

 private:
  Node& last();
  void addOrigin(const Origin& origin);

  Detail detail_;
  std::optional<NodeLexicon::Properties> lastValue_;  // what the next origin is about
  Tree tree_;
  NodeIndex system_ = noNode;
  NodeIndex processor_ = noNode;
};

}  // namespace Tarn::Inventory

#endif
