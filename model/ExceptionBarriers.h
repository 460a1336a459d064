#ifndef TARN_EXCEPTIONBARRIERS_H
#define TARN_EXCEPTIONBARRIERS_H

#include <cxxabi.h>

#include <exception>
#include <iostream>

#include "ModelEvents.h"

/// What becomes of an exception in a walk of the inventory: its result is 1, and somebody is told.
namespace Tarn::CPUProvider {

/// Runs a walk whose exceptions are logged as `text`.
template <class Walk>
unsigned short loggingExceptions(const char* text, Walk walk, const char* function = __builtin_FUNCTION()) {
  try {
    return walk();
  } catch (const abi::__forced_unwind&) {
    throw;  // a cancelled thread has to unwind to its end, or the whole process aborts
  } catch (...) {
    modelEvents.message(LevelError, text, __builtin_LINE(), function);
    return 1;
  }
}

/// Runs a walk whose exceptions go to standard error; what is no std::exception passes on.
template <class Walk>
unsigned short printingExceptions(Walk walk) {
  try {
    return walk();
  } catch (const std::exception& error) {
    std::cerr << error.what() << std::endl;
    return 1;
  }
}

}  // namespace Tarn::CPUProvider

#endif
