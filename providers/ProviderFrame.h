#ifndef TARN_PROVIDERFRAME_H
#define TARN_PROVIDERFRAME_H

#include <CPUClassNames.h>
#include <CPUObjFactory.h>
#include <CmpiObjects.h>
#include <Trace.h>

#include <span>
#include <string>
#include <vector>

#include "BrokerGuard.h"

/// What every provider file is made of: its tables' version, the operations it refuses, and the
/// steps that operations have in common.
namespace Tarn::CPUProvider {

/// ftVersion and miVersion of every function table.
inline constexpr int interfaceVersion = 200;

/// Marks what the broker looks up by name.
#define CORVANE_EXPORTED extern "C" __attribute__((visibility("default")))

inline CMPIStatus succeeded() {
  return {CMPI_RC_OK, nullptr};
}
inline CMPIStatus notSupported() {
  return {CMPI_RC_ERR_NOT_SUPPORTED, nullptr};
}

/// Defines the operations that every provider answers in the same way: nothing is cleaned up before
/// the library is unloaded, and the inventory is read-only. Only the preprocessor can give each file
/// functions of its own names.
#define CORVANE_REFUSED_OPERATIONS(prefix)                                                                            \
  CMPIStatus prefix##_Cleanup(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean) {                                     \
    return succeeded();                                                                                               \
  }                                                                                                                   \
  CMPIStatus prefix##_CreateInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,   \
                                     const CMPIInstance*) {                                                           \
    return notSupported();                                                                                            \
  }                                                                                                                   \
  CMPIStatus prefix##_ModifyInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,   \
                                     const CMPIInstance*, const char**) {                                             \
    return notSupported();                                                                                            \
  }                                                                                                                   \
  CMPIStatus prefix##_DeleteInstance(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*) { \
    return notSupported();                                                                                            \
  }                                                                                                                   \
  CMPIStatus prefix##_ExecQuery(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,        \
                                const char*, const char*) {                                                           \
    return notSupported();                                                                                            \
  }

/// The same for the second table of an association provider.
#define CORVANE_ASSOCIATION_CLEANUP(prefix)                                                     \
  CMPIStatus prefix##_AssociationCleanup(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean) { \
    return succeeded();                                                                         \
  }

using Instances = std::vector<CMPIInstance*>;
using Paths = std::vector<CMPIObjectPath*>;

/// How many results to expect.
using CountRecords = unsigned short (CPUObjFactory::*)() const;

/// The text of a string key; NULL when the path does not have it or it is no string. Minimal brokers
/// leave the type of a string at 0.
inline CMPIString* stringKey(const CMPIObjectPath* path, const char* name, CMPIStatus* status = nullptr) {
  const CMPIData key = CMGetKey(path, name, status);
  const bool mayBeString = key.type == CMPI_string || key.type == CMPI_null;
  return mayBeString && isFound(key) && !isNull(key.value.string) ? key.value.string : nullptr;
}

/// Results are counted in 16 bits.
template <class Element>
unsigned short countOf(const std::vector<Element>& elements) {
  return static_cast<unsigned short>(elements.size());
}

/// The elements that the 16-bit count of results reaches.
template <class Element>
std::span<Element> counted(std::vector<Element>& elements) {
  return std::span(elements).first(countOf(elements));
}

// What could not be made is left out: some brokers end the process that returns NULL to them.

inline void deliver(const CMPIResult* result, Instances& instances) {
  for (const CMPIInstance* instance : counted(instances)) {
    if (!isNull(instance)) {
      CMReturnInstance(result, instance);
    }
  }
}

inline void deliver(const CMPIResult* result, Paths& paths) {
  for (const CMPIObjectPath* path : counted(paths)) {
    if (!isNull(path)) {
      CMReturnObjectPath(result, path);
    }
  }
}

}  // namespace Tarn::CPUProvider

#endif
