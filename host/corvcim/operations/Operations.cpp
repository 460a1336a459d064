#include "host/corvcim/operations/Operations.h"

#include <algorithm>
#include <iterator>
#include <stdexcept>
#include <utility>
#include <vector>

#include "host/broker/Dispatcher.h"
#include "host/corvcim/operations/DirectEnumeration.h"
#include "host/corvcim/operations/RequestCheck.h"
#include "host/corvcim/operations/ResultCount.h"
#include "host/corvcim/results/ResultWriter.h"
#include "host/corvcim/results/TableWriter.h"
#include "platform/inventory/ProcessTree.h"
#include "schema/ClassTable.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

OperationKind kindOf(Verb verb) {
  switch (verb) {
    case Verb::EnumerateInstanceNames:
      return OperationKind::EnumerateInstanceNames;
    case Verb::GetInstance:
      return OperationKind::GetInstance;
    case Verb::Associators:
      return OperationKind::Associators;
    case Verb::AssociatorNames:
      return OperationKind::AssociatorNames;
    case Verb::References:
      return OperationKind::References;
    case Verb::ReferenceNames:
      return OperationKind::ReferenceNames;
    default:
      return OperationKind::EnumerateInstances;
  }
}

bool isEnumeration(OperationKind kind) {
  return kind == OperationKind::EnumerateInstances || kind == OperationKind::EnumerateInstanceNames;
}

/// A reference's result class is the association; wbemcli's users give it by either option.
AssociationFilter filterOf(OperationKind kind, const AssociationOptions& options) {
  AssociationFilter filter;
  filter.role = options.role;
  if (isReferenceOperation(kind)) {
    filter.resultClass = options.associationClass;
    return filter;
  }
  filter.assocClass = options.associationClass;
  filter.resultClass = options.resultClass;
  filter.resultRole = options.resultRole;
  return filter;
}

Operation operationOf(const Options& options) {
  Operation operation;
  operation.kind = kindOf(options.verb->verb);
  operation.path = ObjectPath::parse(options.operand(0));
  if (operation.path.nameSpace.empty()) {
    operation.path.nameSpace = options.nameSpace;
  }
  if (isEnumeration(operation.kind) && !operation.path.keys.empty()) {
    throw std::runtime_error("this is the path of an instance, and " + std::string(options.verb->name) +
                             " takes a class; ask for the instance with gi");
  }
  if (!isEnumeration(operation.kind) && operation.path.keys.empty()) {
    throw std::runtime_error("this is a class, and " + std::string(options.verb->name) +
                             " takes the path of an instance; ein lists the paths of a class");
  }
  if (options.hasPropertyList) {
    operation.properties = options.asIs ? options.properties : asProvidersSpell(options.properties);
  }
  operation.filter = filterOf(operation.kind, options.association);
  return operation;
}

/// As brokers take it: a filter without text filters nothing.
Operation withoutEmptyFilters(Operation operation) {
  AssociationFilter& filter = operation.filter;
  for (std::optional<std::string>* each : {&filter.assocClass, &filter.resultClass, &filter.role, &filter.resultRole}) {
    if (*each && (*each)->empty()) {
      each->reset();
    }
  }
  return operation;
}

std::string write(const Options& options, const Operation& operation, const Response& response) {
  const Format format = options.format;
  if (hasColumns(format)) {
    const std::vector<Instance> rows = givesPaths(operation.kind) ? keysOf(response.paths) : response.instances;
    return rowsAs(format, rows, columnsAskedFor(options));
  }
  if (givesPaths(operation.kind)) {
    return writePaths(format, response.paths);
  }
  if (operation.kind == OperationKind::GetInstance && response.instances.size() == 1) {
    return writeInstance(format, response.instances.front(), operation.properties);
  }
  return writeInstances(format, response.instances, operation.properties);
}

Answer ask(const LibraryFiles& files, const Operation& operation) {
  if (const ClassDefinition* definition = directClass(operation)) {
    if (std::optional<Response> response = enumerateDirectly(files, *definition, operation)) {
      return {std::move(*response), {}};
    }
  }
  return Dispatcher(files).perform(operation);
}

bool isEmpty(const Response& response) {
  return response.instances.empty() && response.paths.empty();
}

bool mentions(const std::optional<std::string>& text, const std::string& cause) {
  return text && text->find(cause) != std::string::npos;
}

/// The error of the inventory where that is why an answer is empty. A provider that could not read it says so, finds
/// nothing, or is content with nothing; what is wrong with the request or the library is wrong all the same.
std::optional<std::string> unreadInventory(const Response& response) {
  const std::optional<std::string> error = isEmpty(response) ? inventoryError() : std::nullopt;
  const bool isCause =
      error && (response.ok() || response.rc == CMPI_RC_ERR_NOT_FOUND || mentions(response.message, *error));
  return isCause ? error : std::nullopt;
}

/// A line for each failure that has another cause than `known`, which is said elsewhere.
std::vector<std::string> describeFailures(const Operation& operation, const Answer& answer,
                                          const std::optional<std::string>& known) {
  std::vector<std::string> lines;
  if (!answer.response.ok() && answer.failures.empty() && !known) {
    lines.push_back(describeStatus(answer.response.rc, answer.response.message));
  }
  for (const ClassFailure& failure : answer.failures) {
    if (known && mentions(failure.message, *known)) {
      continue;
    }
    // An operation on one class has said already which one it is.
    const std::string className = sameName(failure.className, operation.path.className) ? "" : failure.className + ": ";
    lines.push_back(className + describeStatus(failure.rc, failure.message));
  }
  return lines;
}

}  // namespace

std::string describeStatus(CMPIrc rc, const std::optional<std::string>& message) {
  constexpr std::string_view cmpiPrefix = "CMPI_RC_";
  std::string name = statusName(rc);
  if (name.starts_with(cmpiPrefix)) {
    name.replace(0, cmpiPrefix.size(), "CIM_");
  }
  return message && !message->empty() ? name + ": " + *message : name;
}

std::optional<std::string> inventoryError() {
  try {
    Tarn::Inventory::processTree();
    return std::nullopt;
  } catch (const std::exception& error) {
    return error.what();
  }
}

namespace {

/// What the providers answer to the request as it was typed, and nothing else.
Outcome performAsTyped(const LibraryFiles& files, const Options& options) {
  const Operation operation = operationOf(options);
  const Answer answer = Dispatcher(files).performAsIs(operation);
  Outcome outcome;
  if (answer.response.ok()) {
    outcome.output = write(options, operation, answer.response);
  }
  outcome.errors = describeFailures(operation, answer, std::nullopt);
  return outcome;
}

/// Providers of associations answer for a path that names nothing as for an element without links.
std::vector<std::string> describeMissingSource(const LibraryFiles& files, const Operation& operation,
                                               const Response& response) {
  if (!isAssociationOperation(operation.kind) || !isEmpty(response)) {
    return {};
  }
  Operation request;
  request.kind = OperationKind::GetInstance;
  request.path = operation.path;
  const Response source = Dispatcher(files).perform(request).response;
  return source.rc == CMPI_RC_ERR_NOT_FOUND ? std::vector{describeStatus(source.rc, source.message)}
                                            : std::vector<std::string>();
}

Outcome performAsBroker(const LibraryFiles& files, const Options& options) {
  const Operation operation = withoutEmptyFilters(operationOf(options));
  checkRequest(operation);
  const Answer answer = ask(files, operation);
  Outcome outcome;
  if (answer.response.ok()) {
    outcome.output = write(options, operation, answer.response);
  }
  const std::optional<std::string> unreadable = unreadInventory(answer.response);
  outcome.errors = describeFailures(operation, answer, unreadable);
  if (unreadable) {
    outcome.errors.push_back(*unreadable);
  } else if (answer.response.ok()) {
    std::ranges::move(describeMissingResults(operation, answer.response), std::back_inserter(outcome.errors));
    std::ranges::move(describeMissingSource(files, operation, answer.response), std::back_inserter(outcome.errors));
  }
  return outcome;
}

}  // namespace

Outcome performOperation(const LibraryFiles& files, const Options& options) {
  const std::string what = std::string(options.verb->name).append(" ").append(options.operand(0)).append(": ");
  Outcome outcome;
  try {
    outcome = options.asIs ? performAsTyped(files, options) : performAsBroker(files, options);
    for (std::string& error : outcome.errors) {
      error.insert(0, what);
    }
  } catch (const std::exception& error) {
    outcome.errors.push_back(what + error.what());
  }
  return outcome;
}

}  // namespace Corvcim
