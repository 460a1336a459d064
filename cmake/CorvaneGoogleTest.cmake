# GoogleTest from Debian's source package, so that one package serves both ABIs.

set(CORVANE_GTEST_SOURCE /usr/src/googletest CACHE PATH "GoogleTest sources (Debian package googletest)")
if(NOT EXISTS ${CORVANE_GTEST_SOURCE}/CMakeLists.txt)
  message(FATAL_ERROR "No GoogleTest sources in ${CORVANE_GTEST_SOURCE}; install the Debian package googletest, "
    "set CORVANE_GTEST_SOURCE, or build without tests: -DCORVANE_TESTS=OFF")
endif()
set(INSTALL_GTEST OFF CACHE BOOL "" FORCE)
add_subdirectory(${CORVANE_GTEST_SOURCE} ${PROJECT_BINARY_DIR}/googletest EXCLUDE_FROM_ALL SYSTEM)
foreach(library gtest gmock gtest_main gmock_main)
  target_compile_options(${library} PRIVATE -O0)
endforeach()
include(GoogleTest)

# Tests are compiled for a short build time and share one precompiled header: GoogleTest's headers take most of a
# test's compile time.
add_library(corvane_test_options INTERFACE)
target_compile_options(corvane_test_options INTERFACE -O0 $<$<COMPILE_LANGUAGE:CXX>:-fpch-preprocess>
  # In a unity build, GCC warns as if several sources shared the fixtures in unnamed namespaces.
  $<$<COMPILE_LANG_AND_ID:CXX,GNU>:-Wno-subobject-linkage>)
if(CORVANE_SANITIZE MATCHES undefined)
  # The undefined-behaviour sanitizer checks the sources under test, not those of the tests: it doubles the compile time
  # of GoogleTest's templates.
  target_compile_options(corvane_test_options INTERFACE -fno-sanitize=undefined)
endif()
target_link_libraries(corvane_test_options INTERFACE corvane_options gmock gtest_main)
target_compile_definitions(corvane_test_options INTERFACE
  CORVANE_SOURCE_DIR="${PROJECT_SOURCE_DIR}" CORVANE_BINARY_DIR="${PROJECT_BINARY_DIR}")

file(WRITE ${PROJECT_BINARY_DIR}/test_headers.cpp "int main() {}\n")
add_executable(corvane_test_headers EXCLUDE_FROM_ALL ${PROJECT_BINARY_DIR}/test_headers.cpp)
target_link_libraries(corvane_test_headers PRIVATE corvane_test_options)
target_precompile_headers(corvane_test_headers PRIVATE $<$<COMPILE_LANGUAGE:CXX>:<gmock/gmock.h$<ANGLE-R>>)

# corvane_test(NAME SOURCES file... [LINK target...] [ISOLATED])
# One executable with GoogleTest's main. ISOLATED runs each test in a separate process, for tests
# that need a fresh one.
function(corvane_test name)
  cmake_parse_arguments(ARG "ISOLATED" "" "SOURCES;LINK" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE corvane_test_options ${ARG_LINK})
  if(NOT ARG_SOURCES MATCHES "\\.c(;|$)")  # the precompiled header is C++ only
    target_precompile_headers(${name} REUSE_FROM corvane_test_headers)
  endif()
  if(ARG_ISOLATED)
    gtest_discover_tests(${name} TEST_PREFIX ${name}. DISCOVERY_TIMEOUT 60)
  else()
    add_test(NAME ${name} COMMAND ${name})
  endif()
endfunction()
