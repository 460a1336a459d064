#include "host/corvcim/operations/DirectEnumeration.h"

#include <exception>
#include <string>
#include <vector>

#include "host/broker/Broker.h"
#include "host/broker/ProviderLibrary.h"
#include "host/corvcim/text/CrashReport.h"

namespace Corvcim {
namespace {

Response enumerate(const std::string& file, const ClassDefinition& definition, Operation operation) {
  // The process ends after this: unloading would only cost time. Until then the library may use its broker.
  static Broker broker;
  ProviderLibrary library(file);
  library.keepLoaded();
  CMPIInstanceMI* mi = library.instanceMI(broker, definition.provider);
  operation.path.className = definition.name;
  return broker.perform(mi, operation);
}

}  // namespace

const ClassDefinition* directClass(const Operation& operation) {
  if (operation.kind != OperationKind::EnumerateInstances && operation.kind != OperationKind::EnumerateInstanceNames) {
    return nullptr;
  }
  const std::vector<const ClassDefinition*> classes = classesServing(operation.path.className);
  return classes.size() == 1 && !classes.front()->association ? classes.front() : nullptr;
}

std::optional<Response> enumerateDirectly(const LibraryFiles& files, const ClassDefinition& definition,
                                          const Operation& operation) {
  const auto file = files.find(definition.library);
  if (file == files.end()) {
    return std::nullopt;
  }
  const CrashReport report(std::string(definition.name) + ": the provider library " + file->second + " crashed");
  try {
    return enumerate(file->second, definition, operation);
  } catch (const ProviderError& error) {
    return failure(CMPI_RC_ERR_FAILED, error.what());
  } catch (const std::exception& error) {
    return failure(CMPI_RC_ERR_FAILED,
                   "the provider of " + std::string(definition.name) + " threw an exception: " + error.what());
  }
}

}  // namespace Corvcim
