# GoogleTest from Debian's source package, so that one package serves both ABIs.

set(CORVANE_GTEST_SOURCE /usr/src/googletest CACHE PATH "GoogleTest sources (Debian package googletest)")
set(INSTALL_GTEST OFF CACHE BOOL "" FORCE)
add_subdirectory(${CORVANE_GTEST_SOURCE} ${PROJECT_BINARY_DIR}/googletest EXCLUDE_FROM_ALL SYSTEM)
if(CORVANE_SANITIZE)
  foreach(library gtest gmock gtest_main gmock_main)
    target_compile_options(${library} PRIVATE -fsanitize=${CORVANE_SANITIZE})
  endforeach()
endif()
include(GoogleTest)

# corvane_test(NAME SOURCES file... [LINK target...] [ISOLATED])
# One executable with GoogleTest's main. ISOLATED runs each test in a process of its own, for what
# depends on the state of a fresh process.
function(corvane_test name)
  cmake_parse_arguments(ARG "ISOLATED" "" "SOURCES;LINK" ${ARGN})
  add_executable(${name} ${ARG_SOURCES})
  target_link_libraries(${name} PRIVATE corvane_options ${ARG_LINK} gmock gtest_main)
  target_compile_definitions(${name} PRIVATE
    CORVANE_SOURCE_DIR="${PROJECT_SOURCE_DIR}" CORVANE_BINARY_DIR="${PROJECT_BINARY_DIR}")
  if(ARG_ISOLATED)
    gtest_discover_tests(${name} TEST_PREFIX ${name}. DISCOVERY_TIMEOUT 60)
  else()
    add_test(NAME ${name} COMMAND ${name})
  endif()
endfunction()
