#include "host/corvcim/Commands.h"

#include <tarn/Common.h>

#include <algorithm>
#include <cstdlib>
#include <exception>
#include <iterator>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "host/broker/Dispatcher.h"
#include "host/corvcim/ClassList.h"
#include "host/corvcim/SnapshotCommand.h"
#include "host/corvcim/diff/DiffCommand.h"
#include "host/corvcim/drawing/Machine.h"
#include "host/corvcim/drawing/TreeDot.h"
#include "host/corvcim/drawing/TreeJson.h"
#include "host/corvcim/drawing/TreeSvg.h"
#include "host/corvcim/drawing/TreeText.h"
#include "host/corvcim/explain/ExplainCommand.h"
#include "host/corvcim/operations/Libraries.h"
#include "host/corvcim/operations/Operations.h"
#include "host/corvcim/options/SourceArgument.h"
#include "host/corvcim/overview/Health.h"
#include "host/corvcim/overview/Overview.h"
#include "host/corvcim/text/InventoryText.h"
#include "host/corvcim/text/LibraryErrors.h"
#include "platform/base/Configuration.h"
#include "platform/base/Environment.h"
#include "platform/cvlog/Settings.h"
#include "platform/inventory/ProcessTree.h"
#include "platform/inventory/tree/JsonTree.h"
#include "platform/locale/Catalogue.h"
#include "platform/locale/LanguageId.h"

namespace Corvcim {
namespace {

/// The libraries read these when they are loaded, and so does this program's own inventory.
void setEnvironment(const Options& options) {
  if (isForPrograms(options.format)) {
    setenv("CORVANE_LANGUAGE", "en", 1);
  } else if (!options.language.empty()) {
    setenv("CORVANE_LANGUAGE", options.language.c_str(), 1);
  }
}

/// Also what the environment or the configuration names may be read only once.
void setInventory(const Options& options) {
  if (!options.convertFrom.empty()) {
    return;
  }
  const std::string chosen = options.inventory.empty() ? Tarn::Inventory::chosenSource() : options.inventory;
  const std::string settled = settleSource(chosen);
  if (!options.inventory.empty() || settled != chosen) {
    setenv("CORVANE_INVENTORY", settled.c_str(), 1);
  }
}

/// What is wrong with the configuration, which the libraries log and otherwise ignore.
std::vector<std::string> configurationRemarks() {
  using Tarn::Common::configuration;
  using Tarn::Common::environmentOverride;
  std::vector<std::string> remarks;
  const CVLog::Settings settings =
      CVLog::makeSettings(configuration(), environmentOverride("CORVANE_LOG"), environmentOverride("CORVANE_TRACE"));
  for (const Tarn::Common::ConfigurationProblem& problem : settings.problems) {
    remarks.push_back(problem.where + ": " + problem.why);
  }
  const std::optional<Tarn::Common::Setting> language = Tarn::Locale::wantedLanguage();
  if (language && !Tarn::Locale::isTranslated(language->value)) {
    remarks.push_back(language->where + ": there are no texts in \"" + language->value +
                      "\"; English ones are used instead");
  }
  return remarks;
}

std::shared_ptr<const Tarn::Inventory::Tree> inventoryTree(const Options& options) {
  return options.convertFrom.empty()
             ? Tarn::Inventory::processTree()
             : std::make_shared<const Tarn::Inventory::Tree>(convertDescription(options.convertFrom));
}

std::string inventoryOutput(const Options& options) {
  const auto tree = inventoryTree(options);
  return options.format == Format::Json ? Tarn::Inventory::writeJson(*tree) : writeInventoryText(*tree);
}

std::string treeOutput(Format format, std::size_t width) {
  const Machine machine = readMachine(*Tarn::Inventory::processTree(), Tarn::getSystemName());
  switch (format) {
    case Format::Svg:
      return drawTreeSvg(machine);
    case Format::Dot:
      return drawTreeDot(machine);
    case Format::Json:
      return drawTreeJson(machine);
    default:
      return drawTreeText(machine, width);
  }
}

std::string classOutput(const Options& options) {
  return options.operands.empty() ? writeClassList(options.format) : writeClass(options.format, options.operand(0));
}

Outcome askLibraries(const Options& options) {
  if (options.verb->verb == Verb::Health) {
    return checkHealth(options);
  }
  const LibraryFiles files = libraryFiles(options);
  if (options.verb->verb == Verb::Explain) {
    return explainValues(files, options);
  }
  if (options.verb->verb == Verb::Overview) {
    Dispatcher dispatcher(files);
    return showOverview(dispatcher, options);
  }
  return performOperation(files, options);
}

/// What the libraries wrote beside their answers, as far as no error says it anyway.
std::vector<std::string> remarksOf(const std::vector<std::string>& written, const std::vector<std::string>& errors) {
  std::vector<std::string> remarks;
  for (const std::string& line : written) {
    const auto saysIt = [&](const std::string& error) { return error.find(line) != std::string::npos; };
    if (std::ranges::none_of(errors, saysIt)) {
      remarks.push_back("the provider library wrote: " + line);
    }
  }
  return remarks;
}

Outcome runWithInventory(const Options& options, std::size_t width) {
  switch (options.verb->verb) {
    case Verb::Inventory:
      return {inventoryOutput(options), {}};
    case Verb::Snapshot:
      return takeSnapshot(options);
    case Verb::Tree:
      return {treeOutput(options.format, width), {}};
    default:
      break;
  }
  LibraryErrors written;
  Outcome outcome = askLibraries(options);
  outcome.remarks = remarksOf(written.take(), outcome.errors);
  return outcome;
}

/// Monitoring takes the exit status of any other failure for a degraded processor.
Outcome runOnSource(const Options& options, std::size_t width) {
  try {
    setInventory(options);
    return runWithInventory(options, width);
  } catch (const std::exception& error) {
    if (options.verb->verb != Verb::Health) {
      throw;
    }
    return unknownHealth(error.what());
  }
}

}  // namespace

Outcome runCommand(const Options& options, std::size_t width) {
  if (options.verb->verb == Verb::Classes) {
    return {classOutput(options), {}};
  }
  setEnvironment(options);
  std::vector<std::string> remarks = configurationRemarks();
  Outcome outcome;
  if (options.verb->verb == Verb::Diff) {
    outcome = diffInventories(options);
  } else {
    outcome = runOnSource(options, width);
  }
  outcome.remarks.insert(outcome.remarks.begin(), std::make_move_iterator(remarks.begin()),
                         std::make_move_iterator(remarks.end()));
  return outcome;
}

}  // namespace Corvcim
