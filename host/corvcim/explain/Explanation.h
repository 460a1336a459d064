#ifndef HOST_CORVCIM_EXPLAIN_EXPLANATION_H
#define HOST_CORVCIM_EXPLAIN_EXPLANATION_H

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

#include "host/broker/Dispatcher.h"
#include "host/corvcim/explain/ExplanationTable.h"
#include "platform/inventory/tree/Tree.h"

namespace Corvcim {

/// One CIM property and everything that is known of how it came about.
struct ExplainedProperty {
  const PropertySource* source = nullptr;
  std::optional<Value> value;  ///< as the library tells it; nothing where it leaves the property out
  Datum datum;                 ///< the inventory's value
  const Tarn::Inventory::Origin* origin = nullptr;  ///< of the datum, in the tree; nullptr where it has none
  std::string step;  ///< what the library did, in words; empty where it does not report the part
  std::vector<Tarn::Inventory::Unread> unread;  ///< the files that might have had a datum that is not there
  std::vector<Tarn::Inventory::Disagreement> disagreements;
};

/// One instance, or what would be one if the library reported it.
struct ExplainedInstance {
  std::string_view className;
  Tarn::Inventory::NodeIndex node = Tarn::Inventory::noNode;
  std::optional<ObjectPath> path;  ///< nothing where the library does not report the part
  std::string notReported;         ///< why not
  std::vector<ExplainedProperty> properties;
};

/// A part of the inventory, seen as an instance of one class.
struct ExplanationTarget {
  std::string_view className;
  Tarn::Inventory::NodeIndex node;
};

/// What a text means: a path of the tree (every class of that part), an object path, a class and a key
/// (HALDA_CPUMemory.P0.L2.0), a class (all its parts), or nothing (every processor). Throws
/// std::runtime_error where it means nothing in this inventory.
std::vector<ExplanationTarget> explanationTargets(const Tarn::Inventory::Tree& tree, const std::string& text);

/// Asks the library for values, and the tree for where they come from.
class Explainer {
 public:
  /// Both must outlive the explainer and what it returns. The tree was read with its origins.
  Explainer(const Tarn::Inventory::Tree& tree, Dispatcher& dispatcher, std::string nameSpace);

  /// Properties that are in the selection, by their CIM name, or by that of the inventory's field where no
  /// property of the class has it, without regard to case; all if it is empty.
  ExplainedInstance explain(const ExplanationTarget& target, const std::vector<std::string>& selection);

  /// One line about each class that could not be asked so far.
  std::vector<std::string> failures() const;

 private:
  const Instance* instanceOf(const ExplanationTarget& target, std::string& failure);
  const std::vector<Instance>& instancesOf(std::string_view className, std::string& failure);
  ExplainedProperty explainProperty(const ExplanationTarget& target, const PropertySource& source,
                                    const Instance* instance) const;

  const Tarn::Inventory::Tree& tree_;
  Dispatcher& dispatcher_;
  std::string nameSpace_;
  bool isVirtual_;
  std::map<std::string_view, std::vector<Instance>> instances_;
  std::map<std::string_view, std::string> failures_;
};

}  // namespace Corvcim

#endif
