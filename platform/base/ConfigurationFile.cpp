#include "platform/base/ConfigurationFile.h"

#include <sys/stat.h>

#include <cerrno>
#include <filesystem>
#include <string_view>
#include <system_error>
#include <utility>

#include "platform/base/Environment.h"

namespace Tarn::Common {
namespace {

constexpr std::string_view defaultFile = "/etc/corvane/corvane.conf";

}  // namespace

ConfigurationFile::ConfigurationFile(std::string path, Absence absence) : path_(std::move(path)), absence_(absence) {}

ConfigurationFile ConfigurationFile::ofThisProcess() {
  if (std::optional<std::string> path = environmentOverride("CORVANE_CONFIG")) {
    // The process may change its directory, and the file is checked for as long as it runs.
    std::error_code error;
    const std::filesystem::path absolute = std::filesystem::absolute(*path, error);
    return {error ? std::move(*path) : absolute.string(), Absence::IsAProblem};
  }
  return {std::string(defaultFile), Absence::IsFine};
}

Configuration ConfigurationFile::read() {
  // Before reading: what changes in between is then seen as a change.
  lastRead_ = state();
  if (!lastRead_ && absence_ == Absence::IsFine && (errno == ENOENT || errno == ENOTDIR)) {
    return {};
  }
  return Configuration::read(path_);
}

bool ConfigurationFile::hasChanged() const {
  return state() != lastRead_;
}

std::optional<ConfigurationFile::State> ConfigurationFile::state() const {
  struct stat status {};
  if (stat(path_.c_str(), &status) != 0) {
    return std::nullopt;
  }
  return State{.device = status.st_dev,
               .number = status.st_ino,
               .size = status.st_size,
               .modifiedSeconds = status.st_mtim.tv_sec,
               .modifiedNanoseconds = status.st_mtim.tv_nsec,
               .changedSeconds = status.st_ctim.tv_sec,
               .changedNanoseconds = status.st_ctim.tv_nsec};
}

}  // namespace Tarn::Common
