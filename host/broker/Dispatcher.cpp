#include "host/broker/Dispatcher.h"

#include <algorithm>
#include <functional>

#include "host/broker/ProviderProcess.h"
#include "platform/base/NearestName.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using Classes = std::vector<const ClassDefinition*>;

// A provider that calls up into itself without end is stopped here.
constexpr unsigned deepestUpcall = 16;

Answer answerOf(Response response) {
  return {std::move(response), {}};
}

Response unknownClass(std::string_view name) {
  return failure(CMPI_RC_ERR_INVALID_CLASS,
                 "no class " + quotedText(name) + " is served here; " + suggestClasses(name));
}

Response unknownAssociation(std::string_view name) {
  return failure(CMPI_RC_ERR_INVALID_PARAMETER,
                 "no association class " + quotedText(name) + " is served here; " + suggestClasses(name, true));
}

ObjectPath withClass(ObjectPath path, const ClassDefinition& definition) {
  path.className = definition.name;
  return path;
}

template <class T>
void append(std::vector<T>& target, std::vector<T>& source) {
  std::ranges::move(source, std::back_inserter(target));
}

void merge(Answer& answer, const ClassDefinition& definition, Response response) {
  if (!response.ok()) {
    answer.failures.push_back({std::string(definition.name), response.rc, response.message.value_or("")});
    return;
  }
  append(answer.response.instances, response.instances);
  append(answer.response.paths, response.paths);
  answer.response.doneCalls += response.doneCalls;
}

Answer mergeAll(const Classes& classes, const std::function<Response(const ClassDefinition&)>& ask) {
  Answer answer;
  for (const ClassDefinition* each : classes) {
    merge(answer, *each, ask(*each));
  }
  if (!classes.empty() && answer.failures.size() == classes.size()) {
    answer.response = failure(answer.failures.front().rc, answer.failures.front().message);
  }
  return answer;
}

// Counts the operations in progress.
class Nesting {
 public:
  explicit Nesting(unsigned& depth) : depth_(depth) { ++depth_; }
  ~Nesting() { --depth_; }
  Nesting(const Nesting&) = delete;
  Nesting& operator=(const Nesting&) = delete;

 private:
  unsigned& depth_;
};

// The end of an association at which `source` stands, and the other one.
struct Ends {
  const PropertyDefinition* near;
  const PropertyDefinition* far;
};

Ends endsFrom(const ClassDefinition& association, const ClassDefinition& source) {
  const auto ends = referenceEnds(association);
  return isA(source.name, ends.front().referenceClass) ? Ends{&ends.front(), &ends.back()}
                                                       : Ends{&ends.back(), &ends.front()};
}

bool isWanted(const ClassDefinition& association, const ClassDefinition& source, const Operation& operation) {
  const bool references = isReferenceOperation(operation.kind);
  const AssociationFilter& filter = operation.filter;
  const std::optional<std::string>& associationClass = references ? filter.resultClass : filter.assocClass;
  const Ends ends = endsFrom(association, source);
  if (associationClass && !isA(association.name, *associationClass)) {
    return false;
  }
  if (filter.role && !sameName(ends.near->name, *filter.role)) {
    return false;
  }
  if (references) {
    return true;
  }
  return (!filter.resultRole || sameName(ends.far->name, *filter.resultRole)) &&
         (!filter.resultClass || isA(ends.far->referenceClass, *filter.resultClass));
}

// What the provider of `association` is asked: by the exact name of its class.
Operation operationFor(const ClassDefinition& association, const ClassDefinition& source, const Operation& operation) {
  Operation result = operation;
  result.path = withClass(operation.path, source);
  const bool references = isReferenceOperation(operation.kind);
  if (!references) {
    result.filter.assocClass = association.name;
  } else if (result.filter.resultClass) {
    result.filter.resultClass = association.name;
  }
  return result;
}

// The key names that a path of this class has and should not have, for a message; empty if all is well.
std::string strangeKeys(const ClassDefinition& definition, const ObjectPath& path) {
  std::string result;
  for (const NamedValue& each : path.keys) {
    const PropertyDefinition* property = findProperty(definition, each.name);
    if (property == nullptr || !property->key) {
      result += (result.empty() ? "" : ", ") + each.name;
    }
  }
  return result;
}

std::string keyList(const ClassDefinition& definition) {
  std::string result;
  for (const PropertyDefinition& each : definition.properties) {
    if (each.key) {
      result += (result.empty() ? "" : ", ") + std::string(each.name);
    }
  }
  return result;
}

Answer exactlyOne(Answer answer, const ObjectPath& path) {
  if (!answer.response.ok()) {
    return answer;
  }
  if (answer.response.instances.empty() && !answer.failures.empty()) {
    return answerOf(failure(answer.failures.front().rc, answer.failures.front().message));
  }
  if (answer.response.instances.empty()) {
    return answerOf(failure(CMPI_RC_ERR_NOT_FOUND, "there is no instance " + path.text()));
  }
  if (answer.response.instances.size() > 1) {
    return answerOf(failure(CMPI_RC_ERR_INVALID_PARAMETER, "the path " + path.text() + " names " +
                                                               std::to_string(answer.response.instances.size()) +
                                                               " instances; give every key that tells them apart"));
  }
  return answer;
}

// The association classes that the filter names, by any spelling; all of them if it names none.
Classes associationsNamed(const Operation& operation) {
  Classes all;
  for (const ClassDefinition& each : classDefinitions()) {
    if (each.association) {
      all.push_back(&each);
    }
  }
  const bool references = isReferenceOperation(operation.kind);
  const auto& name = references ? operation.filter.resultClass : operation.filter.assocClass;
  Classes named = all;
  std::erase_if(named, [&](const ClassDefinition* each) { return !isA(each->name, name.value_or("")); });
  return named.empty() ? all : named;
}

}  // namespace

std::string suggestClasses(std::string_view name, bool onlyAssociations) {
  std::vector<std::string_view> served;
  std::vector<std::string_view> known;
  for (const ClassDefinition& each : classDefinitions()) {
    if (!onlyAssociations || each.association) {
      served.push_back(each.name);
      for (std::string_view ancestor = each.name; !ancestor.empty(); ancestor = parentOf(ancestor)) {
        known.push_back(ancestor);
      }
    }
  }
  return Tarn::Common::suggestNames(name, Tarn::Common::nearestName(name, known).empty() ? served : known);
}

Dispatcher::Dispatcher(LibraryFiles libraryFiles) : libraryFiles_(std::move(libraryFiles)) {}

Dispatcher::~Dispatcher() = default;

Answer Dispatcher::enumerateInstances(const ObjectPath& classPath, const PropertyList& properties) {
  return perform({OperationKind::EnumerateInstances, classPath, properties, {}});
}

Answer Dispatcher::enumerateInstanceNames(const ObjectPath& classPath) {
  return perform({OperationKind::EnumerateInstanceNames, classPath, {}, {}});
}

Answer Dispatcher::getInstance(const ObjectPath& path, const PropertyList& properties) {
  return perform({OperationKind::GetInstance, path, properties, {}});
}

Answer Dispatcher::associators(const ObjectPath& source, const AssociationFilter& filter,
                               const PropertyList& properties) {
  return perform({OperationKind::Associators, source, properties, filter});
}

Answer Dispatcher::associatorNames(const ObjectPath& source, const AssociationFilter& filter) {
  return perform({OperationKind::AssociatorNames, source, {}, filter});
}

Answer Dispatcher::references(const ObjectPath& source, const AssociationFilter& filter,
                              const PropertyList& properties) {
  return perform({OperationKind::References, source, properties, filter});
}

Answer Dispatcher::referenceNames(const ObjectPath& source, const AssociationFilter& filter) {
  return perform({OperationKind::ReferenceNames, source, {}, filter});
}

Answer Dispatcher::perform(const Operation& operation) {
  return isAssociationOperation(operation.kind) ? performOnAssociations(operation) : performOnClasses(operation);
}

Answer Dispatcher::performAsIs(const Operation& operation) {
  const Classes classes =
      isAssociationOperation(operation.kind) ? associationsNamed(operation) : classesServing(operation.path.className);
  if (classes.empty()) {
    return answerOf(unknownClass(operation.path.className));
  }
  return mergeAll(classes, [&](const ClassDefinition& each) { return performOn(each, operation); });
}

Answer Dispatcher::performOnClasses(const Operation& operation) {
  const Classes classes = classesServing(operation.path.className);
  if (classes.empty()) {
    return answerOf(unknownClass(operation.path.className));
  }
  Answer answer = mergeAll(classes, [&](const ClassDefinition& each) {
    Operation own = operation;
    own.path = withClass(operation.path, each);
    const std::string strange = strangeKeys(each, own.path);
    return strange.empty() ? performOn(each, own)
                           : failure(CMPI_RC_ERR_INVALID_PARAMETER, "class " + std::string(each.name) + " has no key " +
                                                                        strange + "; its keys are " + keyList(each));
  });
  return operation.kind == OperationKind::GetInstance ? exactlyOne(std::move(answer), operation.path) : answer;
}

Answer Dispatcher::performOnAssociations(const Operation& operation) {
  const bool references = isReferenceOperation(operation.kind);
  const auto& named = references ? operation.filter.resultClass : operation.filter.assocClass;
  if (named && std::ranges::none_of(classesServing(*named), &ClassDefinition::association)) {
    return answerOf(unknownAssociation(*named));
  }
  const Classes sources = classesServing(operation.path.className);
  if (sources.empty()) {
    return answerOf(unknownClass(operation.path.className));
  }
  const ClassDefinition& source = *sources.front();
  Classes associations = associationsOf(source.name);
  std::erase_if(associations, [&](const ClassDefinition* each) { return !isWanted(*each, source, operation); });
  return mergeAll(associations,
                  [&](const ClassDefinition& each) { return performOn(each, operationFor(each, source, operation)); });
}

Response Dispatcher::performOn(const ClassDefinition& definition, const Operation& operation) {
  const auto file = libraryFiles_.find(definition.library);
  if (file == libraryFiles_.end()) {
    return failure(CMPI_RC_ERR_FAILED, "no file is known for provider library " + std::string(definition.library) +
                                           ", which serves " + std::string(definition.name));
  }
  if (depth_ == deepestUpcall) {
    return failure(CMPI_RC_ERR_FAILED, "up-calls of providers are nested more than " + std::to_string(deepestUpcall) +
                                           " deep; one calls itself without end");
  }
  auto& process = processes_[definition.group];
  if (process == nullptr) {
    process = std::make_unique<ProviderProcess>(std::string(definition.group), file->second,
                                                [this](const Operation& upcalled) { return upcall(upcalled); });
  }
  const Nesting nesting(depth_);
  return process->perform(definition, operation);
}

// Production brokers answer an up-call for a class that nobody serves with nothing and OK.
Response Dispatcher::upcall(const Operation& operation) {
  const Classes classes = classesServing(operation.path.className);
  const bool served =
      std::ranges::any_of(classes, [&](const ClassDefinition* each) { return libraryFiles_.contains(each->library); });
  if (!served) {
    return operation.kind == OperationKind::GetInstance
               ? failure(CMPI_RC_ERR_NOT_FOUND, "nobody serves class " + operation.path.className)
               : Response{};
  }
  return perform(operation).response;
}

}  // namespace Corvcim
