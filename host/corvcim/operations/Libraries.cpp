#include "host/corvcim/operations/Libraries.h"

#include <unistd.h>

#include <array>
#include <climits>
#include <stdexcept>
#include <utility>
#include <vector>

namespace Corvcim {
namespace {

/// The directory above the one that this program's file is in; empty where the system does not tell.
std::string installationPrefix() {
  std::array<char, PATH_MAX> path = {};
  const ssize_t length = readlink("/proc/self/exe", path.data(), path.size());
  if (length <= 0) {
    return "";
  }
  std::string_view directory(path.data(), static_cast<std::size_t>(length));
  for (int i = 0; i < 2; ++i) {
    directory = directory.substr(0, directory.rfind('/'));
  }
  return std::string(directory);
}

/// Where a library may lie below the prefix: the build tree, then the installed layouts.
constexpr std::array<std::string_view, 4> places = {"/lib/", "/lib/cmpi/", "/" CORVCIM_LIBRARY_PLACE "/",
                                                    "/" CORVCIM_LIBRARY_PLACE "/cmpi/"};

/// The link for developers and brokers, then the name that the runtime package has in any case.
constexpr std::array<std::string_view, 2> endings = {".so", ".so.1"};

std::vector<std::string> candidates(std::string_view baseName) {
  const std::string prefix = installationPrefix();
  std::vector<std::string> files;
  for (const std::string_view place : places) {
    for (const std::string_view ending : endings) {
      files.push_back(std::string(prefix).append(place).append("lib").append(baseName).append(ending));
    }
  }
  return files;
}

}  // namespace

std::string findLibrary(std::string_view baseName) {
  for (std::string& file : candidates(baseName)) {
    if (access(file.c_str(), R_OK) == 0) {
      return std::move(file);
    }
  }
  return "";
}

LibraryFiles libraryFiles(const Options& options) {
  LibraryFiles files;
  std::string provider = options.library.empty() ? findLibrary(providerLibraryName) : options.library;
  if (provider.empty()) {
    throw std::runtime_error(
        "no provider library: looked for lib" + std::string(providerLibraryName) + ".so below " + installationPrefix() +
        ", in lib, " CORVCIM_LIBRARY_PLACE " and their cmpi directories; name its file with --library");
  }
  files.emplace(providerLibraryName, std::move(provider));
  std::string companion = options.companion.empty() ? findLibrary(companionLibraryName) : options.companion;
  if (!companion.empty()) {
    files.emplace(companionLibraryName, std::move(companion));
  }
  return files;
}

}  // namespace Corvcim
