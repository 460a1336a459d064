#ifndef CORVANE_PLATFORM_INVENTORY_TREE_FACTS_H
#define CORVANE_PLATFORM_INVENTORY_TREE_FACTS_H

#include <functional>
#include <optional>
#include <string>
#include <variant>
#include <vector>

#include "platform/inventory/tree/Tree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

/// What one source says of a part: values, each with the account of where it comes from.
class Facts {
 public:
  using Value = std::variant<unsigned int, std::string, std::vector<unsigned int>>;
  using Explain = std::function<Origin()>;
  struct Fact {
    NodeLexicon::Properties id;
    Value value;
    Explain explain;
  };

  /// Adds a value; what is not known (nothing, an empty text) is left out.
  void number(NodeLexicon::Properties id, std::optional<unsigned int> value, Explain explain);
  void text(NodeLexicon::Properties id, std::string value, Explain explain);
  void list(NodeLexicon::Properties id, std::vector<unsigned int> value, Explain explain);

  void add(Fact fact) { all_.push_back(std::move(fact)); }

  /// nullptr where the source does not know it.
  const Fact* find(NodeLexicon::Properties id) const;
  const unsigned int* number(NodeLexicon::Properties id) const;
  const std::string* text(NodeLexicon::Properties id) const;

  const std::vector<Fact>& all() const { return all_; }

  /// Puts the values on the node that the builder added last.
  void addTo(TreeBuilder& tree) const;

 private:
  std::vector<Fact> all_;
};

/// The value for people.
std::string describe(const Facts::Value& value);

}  // namespace Tarn::Inventory

#endif
