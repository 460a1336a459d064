# Debian packages: cpack in a directory of an install preset.
#   corvane-cpu-provider  libraries, schema, registration; installs beside that of another architecture
#   corvane-cpu-tools     corvcim

if(CMAKE_SYSTEM_PROCESSOR MATCHES "^(x86_64|i.86)$" AND CMAKE_SIZEOF_VOID_P EQUAL 4)
  set(CPACK_DEBIAN_PACKAGE_ARCHITECTURE i386)
elseif(CMAKE_SYSTEM_PROCESSOR STREQUAL x86_64)
  set(CPACK_DEBIAN_PACKAGE_ARCHITECTURE amd64)
endif()

set(CPACK_GENERATOR DEB)
set(CPACK_PACKAGE_NAME corvane-cpu)
set(CPACK_PACKAGE_VENDOR Corvane)
set(CPACK_PACKAGE_CONTACT "Corvane maintainers <maintainers@corvane.example>")
set(CPACK_PACKAGE_DIRECTORY ${PROJECT_BINARY_DIR}/packages)
set(CPACK_VERBATIM_VARIABLES ON)
set(CPACK_STRIP_FILES ON)
# The configuration is in /etc for every prefix, so files are staged below a separate root.
set(CPACK_SET_DESTDIR ON)

set(CPACK_DEB_COMPONENT_INSTALL ON)
set(CPACK_COMPONENTS_ALL provider tools)
set(CPACK_DEBIAN_FILE_NAME DEB-DEFAULT)
set(CPACK_DEBIAN_PACKAGE_SECTION admin)
# A fixed list, because on a 64-bit system dpkg-shlibdeps names the 64-bit system's 32-bit libraries for a 32-bit build.
# scripts/check-packages compares the list with the libraries that the files need.
set(CPACK_DEBIAN_PACKAGE_DEPENDS "libc6 (>= 2.34), libgcc-s1 (>= 3.3.1), libstdc++6 (>= 12)")

set(CPACK_DEBIAN_PROVIDER_PACKAGE_NAME corvane-cpu-provider)
set(CPACK_DEBIAN_PROVIDER_PACKAGE_CONTROL_EXTRA
  ${PROJECT_SOURCE_DIR}/packaging/debian/conffiles ${PROJECT_SOURCE_DIR}/packaging/debian/postinst)

set(CPACK_DEBIAN_TOOLS_PACKAGE_NAME corvane-cpu-tools)
set(CPACK_DEBIAN_TOOLS_PACKAGE_DEPENDS
  "${CPACK_DEBIAN_PACKAGE_DEPENDS}, corvane-cpu-provider (= ${PROJECT_VERSION})")
if(CORVANE_HWLOC AND CORVANE_HWLOC_USABLE)
  set(CPACK_DEBIAN_TOOLS_PACKAGE_RECOMMENDS "libhwloc15 (>= 2.4.0)")
endif()

# Adds what CPack cannot write: Multi-Arch, a description for each package, compressed manual pages, a reproducible
# archive.
set(CPACK_POST_BUILD_SCRIPTS ${PROJECT_SOURCE_DIR}/packaging/debian/FinishPackages.cmake)

include(CPack)
