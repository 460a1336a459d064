# Google Benchmark from Debian's source package, so that both ABIs are measured with the same library.
# scripts/bench fetches it.

set(CORVANE_BENCHMARK_SOURCE ${PROJECT_SOURCE_DIR}/build/downloads/benchmark CACHE PATH
  "Google Benchmark sources (Debian source package benchmark)")
if(NOT EXISTS ${CORVANE_BENCHMARK_SOURCE}/CMakeLists.txt)
  message(FATAL_ERROR "No Google Benchmark sources in ${CORVANE_BENCHMARK_SOURCE}; "
    "run scripts/bench, which fetches them, or set CORVANE_BENCHMARK_SOURCE")
endif()

foreach(part TESTING GTEST_TESTS INSTALL WERROR ASSEMBLY_TESTS)
  set(BENCHMARK_ENABLE_${part} OFF CACHE BOOL "" FORCE)
endforeach()
set(GIT_VERSION 0.0.0)  # not a git checkout: the library then takes its version from its own project
add_subdirectory(${CORVANE_BENCHMARK_SOURCE} ${PROJECT_BINARY_DIR}/benchmark EXCLUDE_FROM_ALL SYSTEM)
