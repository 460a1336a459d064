#include "platform/inventory/sources/live/Reconciliation.h"

#include <algorithm>
#include <array>

#include "platform/inventory/sources/firmware/SocketMatching.h"
#include "platform/inventory/sources/kernel/CimFamily.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

using Same = bool (*)(const Facts::Value& kernel, const Facts::Value& firmware);

bool equal(const Facts::Value& kernel, const Facts::Value& firmware) {
  return kernel == firmware;
}

// One name in two spellings is no contradiction.
bool sameName(const Facts::Value& kernel, const Facts::Value& firmware) {
  return comparableName(describe(kernel)) == comparableName(describe(firmware));
}

// The firmware adds the feature bits to the identification register.
bool sameRegister(const Facts::Value& kernel, const Facts::Value& firmware) {
  return describe(firmware).starts_with(describe(kernel));
}

// A code that says "other" denies none.
bool sameFamily(const Facts::Value& kernel, const Facts::Value& firmware) {
  const Facts::Value other = CimFamily::other;
  return kernel == firmware || kernel == other || firmware == other;
}

// It changes from one moment to the next, or by somebody's hand.
bool changes(const Facts::Value& /*kernel*/, const Facts::Value& /*firmware*/) {
  return true;
}

struct Rule {
  Properties id;
  Same same;
};
constexpr std::array rules = {
    Rule{PropCurrentClockSpeed, changes},   Rule{PropEnabledCores, changes},   Rule{PropFamily, sameFamily},
    Rule{PropProcessorId, sameRegister},    Rule{PropProcessorName, sameName}, Rule{PropSystemModel, sameName},
    Rule{PropSystemManufacturer, sameName},
};

Same ruleFor(Properties id) {
  const auto* const rule = std::ranges::find(rules, id, &Rule::id);
  return rule == rules.end() ? equal : rule->same;
}

// The kernel always has a family code, and this one says that it knows none.
bool isUnknown(const Facts::Fact& fact) {
  return fact.id == PropFamily && fact.value == Facts::Value(CimFamily::unknown);
}

}  // namespace

Facts reconcile(const Facts& kernel, const Facts& firmware, const std::string& path,
                std::vector<Disagreement>& disagreements) {
  Facts all;
  for (const Facts::Fact& fact : kernel.all()) {
    const Facts::Fact* other = firmware.find(fact.id);
    if (other == nullptr || !isUnknown(fact)) {
      all.add(fact);
    }
    if (other != nullptr && !isUnknown(fact) && !ruleFor(fact.id)(fact.value, other->value)) {
      disagreements.push_back({path, std::string(findProperty(fact.id)->name), describe(fact.value),
                               fact.explain().source, describe(other->value), other->explain().source});
    }
  }
  for (const Facts::Fact& fact : firmware.all()) {
    if (all.find(fact.id) == nullptr) {
      all.add(fact);
    }
  }
  return all;
}

}  // namespace Tarn::Inventory
