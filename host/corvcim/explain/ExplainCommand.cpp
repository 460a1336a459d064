#include "host/corvcim/explain/ExplainCommand.h"

#include <algorithm>
#include <utility>

#include "host/broker/Dispatcher.h"
#include "host/corvcim/explain/Explanation.h"
#include "host/corvcim/explain/ExplanationWriters.h"
#include "host/corvcim/options/Options.h"
#include "platform/base/NearestName.h"
#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/sources/Source.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Tarn::Inventory::Tree;

/// Every name must be that of a property, or of the inventory's field that it comes from, in one of the
/// classes that are explained.
void checkSelection(const std::vector<std::string>& selection, const std::vector<ExplanationTarget>& targets) {
  std::vector<const PropertySource*> sources;
  for (const PropertySource& source : propertySources()) {
    if (std::ranges::find(targets, source.className, &ExplanationTarget::className) != targets.end()) {
      sources.push_back(&source);
    }
  }
  for (const std::string& name : selection) {
    const bool isKnown = std::ranges::any_of(sources, [&](const PropertySource* source) {
      return sameName(source->property, name) || sameName(source->field, name);
    });
    if (isKnown) {
      continue;
    }
    std::vector<std::string_view> known;
    for (const PropertySource* source : sources) {
      if (std::ranges::find(known, source->property) == known.end()) {
        known.push_back(source->property);
      }
    }
    throw UsageError("explain: no property '" + name + "'; " + Tarn::Common::suggestNames(name, known));
  }
}

}  // namespace

Outcome explainValues(const LibraryFiles& files, const Options& options) {
  const std::string source = Tarn::Inventory::chosenSource();
  const Tree tree = Tarn::Inventory::loadInventory(source, Tarn::Inventory::Detail::WithOrigins);
  const std::vector<ExplanationTarget> targets = explanationTargets(tree, std::string(options.operand(0)));
  checkSelection(options.properties, targets);

  Dispatcher dispatcher(files);
  Explainer explainer(tree, dispatcher, options.nameSpace);
  std::vector<ExplainedInstance> instances;
  for (const ExplanationTarget& target : targets) {
    ExplainedInstance explained = explainer.explain(target, options.properties);
    if (!explained.properties.empty()) {
      instances.push_back(std::move(explained));
    }
  }
  Outcome outcome;
  outcome.errors = explainer.failures();
  if (options.format == Format::Json) {
    const std::string& given = options.inventory.empty() ? source : options.inventory;
    outcome.output = writeExplanationsAsJson(tree, instances, given);
  } else if (options.operand(0).empty()) {
    outcome.output = writeShortExplanations(tree, instances);
  } else {
    outcome.output = writeExplanations(tree, instances);
  }
  return outcome;
}

}  // namespace Corvcim
