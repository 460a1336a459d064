#ifndef CORVANE_PLATFORM_CVLOG_LOGGER_H
#define CORVANE_PLATFORM_CVLOG_LOGGER_H

#include <cvlog/CVLogger.h>

#include <atomic>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "platform/common/ConfigurationFile.h"
#include "platform/cvlog/Replaceable.h"
#include "platform/cvlog/Settings.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {

/// The two sinks of this process and the thresholds in front of them. Safe from several threads.
class Logger {
 public:
  /// The one logger, configured from the configuration file and the environment overrides at the first call.
  static Logger& instance();

  /// The overrides are the values of CORVANE_LOG and CORVANE_TRACE. They come before the file, now and whenever it is
  /// read again.
  Logger(Tarn::Common::ConfigurationFile file, std::optional<std::string> logOverride,
         std::optional<std::string> traceOverride);
  Logger(const Logger&) = delete;
  Logger& operator=(const Logger&) = delete;
  /// From here on nothing is taken, so that what is logged while the library is unloaded is harmless.
  ~Logger();

  void log(const Message& message) { deliver(&Routes::log, message); }
  void trace(const Message& message) { deliver(&Routes::trace, message); }

  /// Reads the configuration file again if it has changed, and does as it says from then on. A sink whose settings stay
  /// the same stays as it is, with its open file and with the count of its limit. Costs one system call where nothing
  /// has changed, and nothing where another thread is just at it.
  void followConfiguration();

 private:
  struct Route {
    SinkSettings wanted;
    bool isFallback = false;       ///< the default, because what is wanted cannot be had
    int level = 0;                 ///< the lowest that is taken
    std::shared_ptr<Sink> sink{};  ///< null: nothing is taken

    [[nodiscard]] int threshold() const;
  };
  struct Routes {
    Route log;
    Route trace;
  };

  std::unique_ptr<const Routes> makeRoutes(const Routes* before);
  static Route makeRoute(const SinkSettings& wanted, const SinkSettings& fallback, const Route* before,
                         std::vector<Tarn::Common::ConfigurationProblem>& problems);
  static void report(const std::vector<Tarn::Common::ConfigurationProblem>& problems);
  static void setThresholds(const Routes& routes);
  void noteThatFileWasRead();
  void deliver(Route Routes::*sink, const Message& message);

  Tarn::Common::ConfigurationFile file_;
  const std::optional<std::string> logOverride_;
  const std::optional<std::string> traceOverride_;
  std::atomic_flag isFollowing_;  // guards file_ and the replacing of the routes
  Replaceable<Routes> routes_;
};

}  // namespace CVLog

#endif
