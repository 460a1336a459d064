#ifndef TESTS_PROVIDERS_SCRIPTEDFACTORY_H
#define TESTS_PROVIDERS_SCRIPTEDFACTORY_H

#include <cmpidt.h>

#include <map>
#include <string>
#include <vector>

/// A factory that answers from a script, linked instead of the real one: it shows what the providers
/// ask it for, and lets everything fail, also what the real one never does.
namespace ScriptedFactory {

struct Script {
  /// By function: the result code (0 for those not named), and which throws.
  std::map<std::string, unsigned short> results;
  std::string throwing;
  /// What a failing function leaves in the status it was given, if any.
  CMPIrc failureStatus = CMPI_RC_OK;

  // What the functions find, whichever of them is asked.
  std::vector<CMPIObjectPath*> paths;
  std::vector<CMPIInstance*> instances;

  std::string targetClass;  ///< of associations; none: the target is NULL
  unsigned short cores = 0;

  /// The calls with what matters of their arguments, such as "getProcessorRefByMemoryHandle(HALDA_CPUProcessor,
  /// key cache0, properties NULL, isObjPath 1)".
  std::vector<std::string> calls;
};

Script& script();

inline constexpr const char* thrownText = "the factory broke";

}  // namespace ScriptedFactory

#endif
