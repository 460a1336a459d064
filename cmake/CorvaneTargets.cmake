# Options of every target of this repository.

add_library(corvane_options INTERFACE)
target_compile_options(corvane_options INTERFACE
  -Wall -Wextra -Wpedantic -Wconversion -Wshadow -Werror
  # Brokers load provider libraries with RTLD_GLOBAL: other libraries can interpose exported symbols, and a
  # unique-linkage symbol keeps the library mapped after dlclose.
  -fvisibility=hidden $<$<COMPILE_LANGUAGE:CXX>:-fvisibility-inlines-hidden>
  $<$<COMPILE_LANG_AND_ID:CXX,GNU>:-fno-gnu-unique>)  # clang creates no such symbols
if(CMAKE_CXX_COMPILER_ID STREQUAL GNU AND CMAKE_CXX_COMPILER_VERSION VERSION_LESS 13)
  # GCC 12 reports overlapping copies for concatenations of a literal and a std::string (GCC bug 105651).
  target_compile_options(corvane_options INTERFACE -Wno-restrict)
endif()
if(CMAKE_SYSTEM_PROCESSOR MATCHES "^(x86_64|i.86)$")
  # Runs everywhere; GCC's generic tuning copies short texts with "rep movs", which takes longer to
  # start than the copy takes.
  target_compile_options(corvane_options INTERFACE -mtune=haswell)
endif()
# Installed files do not contain the build directory, and two builds of one commit are equal.
target_compile_options(corvane_options INTERFACE
  -ffile-prefix-map=${PROJECT_BINARY_DIR}/= -ffile-prefix-map=${PROJECT_SOURCE_DIR}/=)
# Sources are compiled in batches; the linker removes functions that a library does not call.
target_compile_options(corvane_options INTERFACE -ffunction-sections -fdata-sections)
target_link_options(corvane_options INTERFACE -Wl,--gc-sections)
target_compile_definitions(corvane_options INTERFACE _FILE_OFFSET_BITS=64)
target_include_directories(corvane_options INTERFACE ${PROJECT_SOURCE_DIR})

# For code that runs once or waits for the kernel: its size in a daemon matters more than its speed.
if(NOT CORVANE_SANITIZE)
  set(CORVANE_SMALL -Os)
endif()

if(CORVANE_SANITIZE)
  # In front of each target's own options, which can override them.
  set(sanitizers "-fsanitize=${CORVANE_SANITIZE} -fno-sanitize-recover=all -fno-omit-frame-pointer")
  string(APPEND CMAKE_C_FLAGS " ${sanitizers}")
  string(APPEND CMAKE_CXX_FLAGS " ${sanitizers}")
  # -Og has the shortest time for compiling and running together. Reports name functions from the symbol table.
  set(CMAKE_C_FLAGS_RELEASE "-Og")
  set(CMAKE_CXX_FLAGS_RELEASE "-Og")
endif()

if(CORVANE_FUZZ)
  target_compile_options(corvane_options INTERFACE
    -Wno-sign-conversion  # part of clang's -Wconversion, not of GCC's
    -fsanitize=fuzzer-no-link,address,undefined -fno-sanitize-recover=all -fno-omit-frame-pointer -O1 -g1)
  target_link_options(corvane_options INTERFACE -fsanitize=address,undefined)
endif()

# The sources of the product.
set(CORVANE_MODEL_SOURCES
  CPU.cpp Records.cpp Relationships.cpp)
list(TRANSFORM CORVANE_MODEL_SOURCES PREPEND ${PROJECT_SOURCE_DIR}/model/)
set(CORVANE_FACTORY_SOURCES
  CPUObjFactory.cpp CoreAndCacheInstances.cpp Lookup.cpp Navigation.cpp ProcessorInstances.cpp)
list(TRANSFORM CORVANE_FACTORY_SOURCES PREPEND ${PROJECT_SOURCE_DIR}/factory/)
set(CORVANE_PROVIDER_SOURCES
  CPUAssociatedCacheMemoryProvider.cpp CPUConcreteComponentProvider.cpp
  CPUCoreAssociatedCacheMemoryProvider.cpp CPUElementCapabilitiesProvider.cpp CPUMemoryProvider.cpp
  CPUProcessorCapabilitiesProvider.cpp CPUProcessorCoreProvider.cpp CPUProcessorProvider.cpp
  CPUSystemDeviceProvider.cpp CacheAssociation.cpp InstanceProvider.cpp)
list(TRANSFORM CORVANE_PROVIDER_SOURCES PREPEND ${PROJECT_SOURCE_DIR}/providers/)

# corvane_product(NAME SEAM directory [DEFINE option...] [RECORDS product])
# The product, compiled against the implementation of the six platform headers in SEAM. DEFINE are the options of the
# build that are on, such as CORVANE_BROKER_GUARD. Only the providers depend on them: RECORDS names another
# product with the same SEAM, whose model and factory are reused.
function(corvane_product name)
  cmake_parse_arguments(ARG "" "SEAM;RECORDS" "DEFINE" ${ARGN})
  if(NOT ARG_RECORDS)
    set(ARG_RECORDS ${name})
    add_library(${name}_records OBJECT ${CORVANE_MODEL_SOURCES} ${CORVANE_FACTORY_SOURCES})
  endif()
  add_library(${name}_providers OBJECT ${CORVANE_PROVIDER_SOURCES})
  target_compile_definitions(${name}_providers PRIVATE ${ARG_DEFINE})

  add_library(${name} INTERFACE)
  target_include_directories(${name} INTERFACE ${PROJECT_SOURCE_DIR}/include ${ARG_SEAM})
  target_link_libraries(${name} INTERFACE cmpi)
  target_sources(${name} INTERFACE $<TARGET_OBJECTS:${ARG_RECORDS}_records> $<TARGET_OBJECTS:${name}_providers>)
  foreach(part ${name}_records ${name}_providers)
    if(TARGET ${part})
      # Provider files have statics with equal names, so these sources are compiled one by one.
      set_target_properties(${part} PROPERTIES UNITY_BUILD OFF)
      target_include_directories(${part} PRIVATE ${PROJECT_SOURCE_DIR}/include ${ARG_SEAM})
      target_link_libraries(${part} PRIVATE corvane_options cmpi)
    endif()
  endforeach()
endfunction()
