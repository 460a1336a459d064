#ifndef TESTS_MODEL_STANDARDERROR_H
#define TESTS_MODEL_STANDARDERROR_H

#include <gtest/gtest.h>

#include <string>
#include <utility>

/// What reaches the process's standard error, by whatever means, while `call` runs.
template <class Call>
std::string standardErrorOf(Call&& call) {
  testing::internal::CaptureStderr();
  try {
    std::forward<Call>(call)();
  } catch (...) {
    testing::internal::GetCapturedStderr();
    throw;
  }
  return testing::internal::GetCapturedStderr();
}

#endif
