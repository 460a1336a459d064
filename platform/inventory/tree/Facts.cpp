#include "platform/inventory/tree/Facts.h"

#include <algorithm>
#include <type_traits>
#include <utility>

namespace Tarn::Inventory {

using namespace NodeLexicon;

void Facts::number(Properties id, std::optional<unsigned int> value, Explain explain) {
  if (value) {
    add({id, *value, std::move(explain)});
  }
}

void Facts::text(Properties id, std::string value, Explain explain) {
  if (!value.empty()) {
    add({id, std::move(value), std::move(explain)});
  }
}

void Facts::list(Properties id, std::vector<unsigned int> value, Explain explain) {
  add({id, std::move(value), std::move(explain)});
}

const Facts::Fact* Facts::find(Properties id) const {
  const auto found = std::ranges::find(all_, id, &Fact::id);
  return found == all_.end() ? nullptr : &*found;
}

const unsigned int* Facts::number(Properties id) const {
  const Fact* fact = find(id);
  return fact == nullptr ? nullptr : std::get_if<unsigned int>(&fact->value);
}

const std::string* Facts::text(Properties id) const {
  const Fact* fact = find(id);
  return fact == nullptr ? nullptr : std::get_if<std::string>(&fact->value);
}

void Facts::addTo(TreeBuilder& tree) const {
  for (const Fact& fact : all_) {
    std::visit(
        [&]<class Given>(const Given& value) {
          if constexpr (std::is_same_v<Given, unsigned int>) {
            tree.number(fact.id, value);
          } else if constexpr (std::is_same_v<Given, std::string>) {
            tree.text(fact.id, value);
          } else {
            tree.list(fact.id, value);
          }
        },
        fact.value);
    tree.from(fact.explain);
  }
}

std::string describe(const Facts::Value& value) {
  if (const auto* number = std::get_if<unsigned int>(&value)) {
    return std::to_string(*number);
  }
  if (const auto* text = std::get_if<std::string>(&value)) {
    return *text;
  }
  std::string list;
  for (const unsigned int number : std::get<std::vector<unsigned int>>(value)) {
    list += (list.empty() ? "" : ", ") + std::to_string(number);
  }
  return list;
}

}  // namespace Tarn::Inventory
