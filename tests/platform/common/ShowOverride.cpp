#include <cstdio>

#include "platform/common/Environment.h"

/// Prints what this process sees of the override that its argument names.
int main(int count, char** arguments) {
  if (count != 2) {
    return 2;
  }
  const auto value = Tarn::Common::environmentOverride(arguments[1]);
  std::puts(value ? value->c_str() : "(none)");
  return 0;
}
