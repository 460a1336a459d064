#ifndef CORVANE_PLATFORM_BASE_CONFIGURATIONFILE_H
#define CORVANE_PLATFORM_BASE_CONFIGURATIONFILE_H

#include <sys/types.h>

#include <cstdint>
#include <optional>
#include <string>

#include "platform/base/Configuration.h"

namespace Tarn::Common {

/// A configuration file that is read more than once. Not safe from several threads at once.
class ConfigurationFile {
 public:
  /// Whether the configuration has a problem when there is no such file.
  enum class Absence { IsFine, IsAProblem };

  ConfigurationFile(std::string path, Absence absence);
  /// The file that CORVANE_CONFIG names, which must be there, else /etc/corvane/corvane.conf, which may be missing.
  static ConfigurationFile ofThisProcess();

  [[nodiscard]] const std::string& path() const { return path_; }

  /// What the file holds now.
  Configuration read();
  /// Whether the file is another than the one that was read last, or was written, made or removed since. Costs one
  /// system call. Two changes within one tick of the file system's clock that leave the size as it is look like one.
  [[nodiscard]] bool hasChanged() const;

 private:
  /// What tells two states of a file apart without reading it. The time of the last change of the file's status counts
  /// because access may be granted or withdrawn, and because a copy may bring its time of modification along.
  struct State {
    dev_t device;
    ino_t number;
    off_t size;
    std::int64_t modifiedSeconds;
    std::int64_t modifiedNanoseconds;
    std::int64_t changedSeconds;
    std::int64_t changedNanoseconds;

    friend bool operator==(const State&, const State&) = default;
  };
  [[nodiscard]] std::optional<State> state() const;

  std::string path_;
  Absence absence_;
  std::optional<State> lastRead_;
};

}  // namespace Tarn::Common

#endif
