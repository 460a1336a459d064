#ifndef CORVANE_PLATFORM_CVLOG_LOGGER_H
#define CORVANE_PLATFORM_CVLOG_LOGGER_H

#include <cvlog/CVLogger.h>

#include <memory>

#include "platform/cvlog/Settings.h"
#include "platform/cvlog/Sink.h"

namespace CVLog {

/// The two sinks of this process and the thresholds in front of them.
class Logger {
 public:
  /// The one logger, configured from the configuration file and the environment overrides at the first call.
  static Logger& instance();

  explicit Logger(const Settings& settings);
  Logger(const Logger&) = delete;
  Logger& operator=(const Logger&) = delete;
  /// From here on nothing is taken, so that what is logged while the library is unloaded is harmless.
  ~Logger();

  void log(const Message& message) { deliver(log_, message); }
  void trace(const Message& message) { deliver(trace_, message); }

 private:
  struct Route {
    int level = 0;
    std::unique_ptr<Sink> sink{};  ///< null: nothing is taken

    [[nodiscard]] int threshold() const;
  };

  static Route makeRoute(const SinkSettings& wanted, const SinkSettings& fallback,
                         std::vector<Tarn::Common::ConfigurationProblem>& problems);
  static void report(const std::vector<Tarn::Common::ConfigurationProblem>& problems);
  static void deliver(const Route& route, const Message& message);

  Route log_;
  Route trace_;
};

}  // namespace CVLog

#endif
