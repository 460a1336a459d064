#include "platform/base/Environment.h"

#include <sys/auxv.h>

#include <cstdlib>

namespace Tarn::Common {

std::optional<std::string> environmentOverride(const char* name) {
  if (getauxval(AT_SECURE) != 0) {
    return std::nullopt;
  }
  const char* value = std::getenv(name);
  if (value == nullptr || *value == '\0') {
    return std::nullopt;
  }
  return value;
}

}  // namespace Tarn::Common
