// The management interface that a broker calls for HALDA_ComputerSystem. Requests may run in
// parallel: nothing is kept between them but the broker's own handle.

#include <cmpift.h>
#include <cmpimacs.h>
#include <cxxabi.h>

#include <atomic>
#include <exception>
#include <string>

#include "companion/ComputerSystem.h"
#include "companion/ComputerSystemInstance.h"
#include "include/CmpiObjects.h"

namespace Tarn::ComputerSystemProvider {
namespace {

std::atomic<const CMPIBroker*> registeredBroker = nullptr;

CMPIStatus statusOf(CMPIrc code, const std::string& text) {
  CMPIStatus status;
  CMSetStatusWithChars(registeredBroker.load(), &status, code, text.c_str());
  return status;
}

/// A broker survives no exception: it becomes a status here.
template <class Operation>
CMPIStatus answer(Operation operation) {
  try {
    return operation(registeredBroker.load());
  } catch (const abi::__forced_unwind&) {
    throw;  // a cancelled thread has to unwind to its end, or the whole process aborts
  } catch (const std::exception& error) {
    return statusOf(CMPI_RC_ERR_FAILED, error.what());
  } catch (...) {
    return statusOf(CMPI_RC_ERR_FAILED, "reading the computer system failed for a reason that is not known");
  }
}

/// A string key's text; NULL where the path has no such key or it is no string. Minimal brokers leave the type of
/// a string open.
const char* keyText(const CMPIObjectPath* path, const char* name) {
  CMPIStatus status = {CMPI_RC_OK, nullptr};
  const CMPIData key = CMGetKey(path, name, &status);
  const bool mayBeString = key.type == CMPI_string || key.type == CMPI_null;
  return status.rc == CMPI_RC_OK && mayBeString && CPUProvider::isFound(key)
             ? CPUProvider::charsOrNull(key.value.string)
             : nullptr;
}

CMPIStatus checkKeys(const CMPIObjectPath* path, const ComputerSystem& system) {
  const char* name = keyText(path, "Name");
  const char* creationClass = keyText(path, "CreationClassName");
  if (name == nullptr || creationClass == nullptr) {
    return statusOf(CMPI_RC_ERR_INVALID_PARAMETER,
                    "the path of a computer system needs the keys CreationClassName and Name");
  }
  if (!CPUProvider::equalIgnoringCase(creationClass, className) || system.name != name) {
    return statusOf(CMPI_RC_ERR_NOT_FOUND, std::string("no system has CreationClassName \"") + creationClass +
                                               "\" and Name \"" + name + "\"; this machine is \"" + system.name + "\"");
  }
  return {CMPI_RC_OK, nullptr};
}

CMPIStatus cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {
  return {CMPI_RC_OK, nullptr};
}

CMPIStatus enumInstanceNames(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* result,
                             const CMPIObjectPath* request) {
  return answer([&](const CMPIBroker* broker) {
    CMPIStatus status = {CMPI_RC_OK, nullptr};
    const CMPIObjectPath* path = makePath(broker, request, readComputerSystem(), &status);
    if (path != nullptr) {
      CMReturnObjectPath(result, path);
      CMReturnDone(result);
    }
    return status;
  });
}

CMPIStatus enumInstances(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* result, const CMPIObjectPath* request,
                         const char** properties) {
  return answer([&](const CMPIBroker* broker) {
    CMPIStatus status = {CMPI_RC_OK, nullptr};
    const CMPIInstance* instance = makeInstance(broker, request, readComputerSystem(), properties, &status);
    if (instance != nullptr) {
      CMReturnInstance(result, instance);
      CMReturnDone(result);
    }
    return status;
  });
}

CMPIStatus getInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult* result, const CMPIObjectPath* request,
                       const char** properties) {
  return answer([&](const CMPIBroker* broker) {
    const ComputerSystem system = readComputerSystem();
    CMPIStatus status = checkKeys(request, system);
    if (status.rc != CMPI_RC_OK) {
      return status;
    }
    const CMPIInstance* instance = makeInstance(broker, request, system, properties, &status);
    if (instance != nullptr) {
      CMReturnInstance(result, instance);
      CMReturnDone(result);
    }
    return status;
  });
}

constexpr CMPIStatus notSupported = {CMPI_RC_ERR_NOT_SUPPORTED, nullptr};

CMPIStatus createInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                          const CMPIInstance*) {
  return notSupported;
}

CMPIStatus modifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                          const CMPIInstance*, const char**) {
  return notSupported;
}

CMPIStatus deleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) {
  return notSupported;
}

CMPIStatus execQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                     const char*) {
  return notSupported;
}

constexpr CMPIInstanceMIFT functions = {200,
                                        200,
                                        "instanceCorvaneComputerSystemProvider",
                                        cleanup,
                                        enumInstanceNames,
                                        enumInstances,
                                        getInstance,
                                        createInstance,
                                        modifyInstance,
                                        deleteInstance,
                                        execQuery};

}  // namespace
}  // namespace Tarn::ComputerSystemProvider

extern "C" __attribute__((visibility("default"))) CMPIInstanceMI* CorvaneComputerSystemProvider_Create_InstanceMI(
    const CMPIBroker* broker, const CMPIContext*, CMPIStatus* status) {
  using namespace Tarn::ComputerSystemProvider;
  static CMPIInstanceMI mi = {nullptr, &functions};
  registeredBroker.store(broker);
  if (status != nullptr) {
    *status = {CMPI_RC_OK, nullptr};
  }
  return &mi;
}
