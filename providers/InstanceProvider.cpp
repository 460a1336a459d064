#include "InstanceProvider.h"

namespace Tarn::CPUProvider {

namespace {

/// Asks the factory for one instance, or for all when there is no key. False, and the remark logged,
/// when it has none.
bool lookUp(const InstanceProvider& provider, const InstanceRequest& request, CMPIString* key, Instances& instances,
            CMPIStatus* status) {
  const auto& own = provider.getInstance;
  if (key != nullptr && own.tracesKey) {
    provider.events.variable(own.key, charsOrNull(key), request.line, request.function);
  }
  CPUObjFactory* factory = provider.factory();
  const unsigned short code = key == nullptr
                                  ? (factory->*provider.getAllInstances)(provider.broker, request.reference,
                                                                         request.properties, false, instances, status)
                                  : (factory->*provider.getOneInstance)(provider.broker, request.reference, key,
                                                                        request.properties, instances, status);
  const Remark& failed = key == nullptr ? own.allFailed : own.oneFailed;
  if (code != 0 && failed) {
    provider.events.message(LevelError, failed.text, failed.line, request.function);
  }
  return code == 0;
}

}  // namespace

CMPIStatus getInstance(const InstanceProvider& provider, const InstanceRequest& request) {
  const auto& own = provider.getInstance;
  provider.events.providerEntry(request.line, request.function);
  CMPIStatus status = succeeded();

  if (CMGetKeyCount(request.reference, &status) == 0) {
    if (own.failsWithoutKeys) {
      setFailure(provider.broker, &status, own.noKeys.text);
    }
    provider.events.message(LevelError, own.noKeys.text, own.noKeys.line, request.function);
  } else {
    Instances instances;
    CMPIString* key = stringKey(request.reference, own.key, &status);
    if (!lookUp(provider, request, key, instances, &status)) {
      return status;
    }
    deliver(request.result, instances);
  }

  CMReturnDone(request.result);
  provider.events.providerExit(own.exitLine != 0 ? own.exitLine : request.line, request.function);
  return status;
}

CMPIStatus enumInstances(const InstanceProvider& provider, const InstanceRequest& request) {
  const auto& own = provider.enumInstances;
  provider.events.providerEntry(request.line, request.function);
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = provider.factory();

  Instances instances;
  if (own.expected != nullptr) {
    const unsigned short expected = (factory->*own.expected)();
    if (own.variable != nullptr) {
      provider.events.variable(own.variable, expected, request.line, request.function);
    }
    instances.reserve(expected);
  }
  if ((factory->*provider.getAllInstances)(provider.broker, request.reference, request.properties, false, instances,
                                           &status) != 0) {
    provider.events.message(LevelError, own.failed.text, own.failed.line, request.function);
    return status;
  }
  deliver(request.result, instances);

  CMReturnDone(request.result);
  provider.events.providerExit(request.line, request.function);
  return status;
}

CMPIStatus enumInstanceNames(const InstanceProvider& provider, const InstanceRequest& request) {
  const auto& own = provider.enumInstanceNames;
  provider.events.providerEntry(request.line, request.function);
  CMPIStatus status = succeeded();
  CPUObjFactory* factory = provider.factory();

  Paths paths;
  const unsigned short expected = (factory->*own.expected)();
  if (own.variable) {
    provider.events.variable(own.variable.text, expected, own.variable.line, request.function);
  }
  paths.reserve(expected);
  if ((factory->*provider.getAllPaths)(provider.broker, request.reference, paths, &status) != 0) {
    provider.events.message(LevelError, own.failed.text, own.failed.line, request.function);
    return status;
  }
  deliver(request.result, paths);

  CMReturnDone(request.result);
  provider.events.providerExit(request.line, request.function);
  return status;
}

}  // namespace Tarn::CPUProvider
