#ifndef TESTS_PROVIDERS_THREADSMACHINE_H
#define TESTS_PROVIDERS_THREADSMACHINE_H

#include <cstddef>

/// A machine for the test with threads, on whichever platform it is linked with.
namespace ThreadsMachine {

inline constexpr std::size_t processors = 2;
inline constexpr std::size_t cores = 4;
inline constexpr std::size_t caches = 14;

void prepare();

}  // namespace ThreadsMachine

#endif
