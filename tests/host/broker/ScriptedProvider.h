#ifndef CORVCIM_TESTS_SCRIPTED_PROVIDER_H
#define CORVCIM_TESTS_SCRIPTED_PROVIDER_H

#include <cmpift.h>

#include <functional>
#include <string>
#include <vector>

namespace Corvcim {

// What a management interface was called with.
struct ProviderCall {
  const CMPIContext* context;
  const CMPIResult* result;
  const CMPIObjectPath* path;
  const char** properties;
  std::vector<const char*> filter;  // assocClass, resultClass, role, resultRole, as far as the operation has them
};

// Both management interfaces of one provider, every operation being the same function. A call of the
// wrong slot shows in `lastOperation`.
class ScriptedProvider {
 public:
  using Body = std::function<CMPIStatus(const ProviderCall&)>;

  explicit ScriptedProvider(Body operation) : body(std::move(operation)) {}

  CMPIInstanceMI* instanceMI() { return &instance_; }
  CMPIAssociationMI* associationMI() { return &association_; }

  const Body body;
  std::string lastOperation;

 private:
  static CMPIStatus run(const void* self, const char* operation, const ProviderCall& call) {
    auto* provider = static_cast<ScriptedProvider*>(const_cast<void*>(self));
    provider->lastOperation = operation;
    return provider->body(call);
  }

  static const CMPIInstanceMIFT instanceTable;
  static const CMPIAssociationMIFT associationTable;

  CMPIInstanceMI instance_{this, &instanceTable};
  CMPIAssociationMI association_{this, &associationTable};
};

}  // namespace Corvcim

#endif
