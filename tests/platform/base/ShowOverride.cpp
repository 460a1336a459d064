#include <cstdio>

#include "platform/base/Environment.h"

/// The leak checker of the address sanitizer cannot attach to a process with raised privileges.
extern "C" __attribute__((visibility("default"))) const char* __asan_default_options() {
  return "detect_leaks=0";
}

/// Prints what this process sees of the override that its argument names.
int main(int count, char** arguments) {
  if (count != 2) {
    return 2;
  }
  const auto value = Tarn::Common::environmentOverride(arguments[1]);
  std::puts(value ? value->c_str() : "(none)");
  return 0;
}
