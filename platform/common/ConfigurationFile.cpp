#include "platform/common/ConfigurationFile.h"

#include <sys/stat.h>

#include <string_view>
#include <utility>

#include "platform/common/Environment.h"

namespace Tarn::Common {
namespace {

constexpr std::string_view kDefaultFile = "/etc/corvane/corvane.conf";

}  // namespace

ConfigurationFile::ConfigurationFile(std::string path, Absence absence) : path_(std::move(path)), absence_(absence) {}

ConfigurationFile ConfigurationFile::ofThisProcess() {
  if (std::optional<std::string> path = environmentOverride("CORVANE_CONFIG")) {
    return {std::move(*path), Absence::kIsAProblem};
  }
  return {std::string(kDefaultFile), Absence::kIsFine};
}

Configuration ConfigurationFile::read() {
  // Before reading: what changes in between is then seen as a change.
  lastRead_ = state();
  if (!lastRead_ && absence_ == Absence::kIsFine) {
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
