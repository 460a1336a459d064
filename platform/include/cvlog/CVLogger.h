#ifndef CVLOG_CVLOGGER_H
#define CVLOG_CVLOGGER_H

#include <atomic>
#include <limits>
#include <string>

namespace CVLog {

/// The agent's logger: two sinks, log and trace, each with a level threshold and a destination of its own.
///
/// Levels rise with importance; a sink takes the messages that reach its threshold. Both are configured
/// with the first message, never at load, and follow their configuration from then on. All calls are safe
/// from several threads, throw nothing, and wait only for another message that is being written. A message that
/// its sink does not take costs one comparison, and those that look after the configuration a coarse clock.
class CVLogger {
 public:
  /// Delivers one message to the log sink. `extra`, `extraLength` and `reserved` are kept for the
  /// agent's binary attachments and are not used.
  static void logLevelMessage(const char* function, const char* file, int line, const std::string& component, int level,
                              char* /*extra*/, int /*extraLength*/, int /*reserved*/, const std::string& text) {
    if (level >= kLooksAfterConfiguration) {
      followConfiguration();
    }
    if (logTakes(level)) [[unlikely]] {
      deliver(false, function, file, line, component, level, text);
    }
  }
  /// Delivers one message to the trace sink; the arguments are those of logLevelMessage.
  static void traceLevelMessage(const char* function, const char* file, int line, const std::string& component,
                                int level, char* /*extra*/, int /*extraLength*/, int /*reserved*/,
                                const std::string& text) {
    if (traceTakes(level)) [[unlikely]] {
      deliver(true, function, file, line, component, level, text);
    }
  }

  /// Whether a message of this level can get anywhere, for callers whose text is costly to make.
  /// True, too, before the first message.
  static bool logTakes(int level) { return level >= logThreshold_.load(std::memory_order_relaxed); }
  static bool traceTakes(int level) { return level >= traceThreshold_.load(std::memory_order_relaxed); }

 private:
  friend class Logger;

  // Once a second the first message to the log that has at least this level looks whether the configuration
  // has changed. Each operation of a provider begins with one; the many below would only pay for the clock.
  static constexpr int kLooksAfterConfiguration = 4000;
  static void followConfiguration();
  static void deliver(bool isTrace, const char* function, const char* file, int line, const std::string& component,
                      int level, const std::string& text);

  // Until the configuration is read every message passes, so that the first one has it read.
  static constexpr int kNotConfigured = std::numeric_limits<int>::min();
  static inline std::atomic<int> logThreshold_{kNotConfigured};
  static inline std::atomic<int> traceThreshold_{kNotConfigured};
  // The logger has gone: what a thread logs while the process ends must not look after its configuration.
  static inline std::atomic<bool> isClosed_{false};
};

}  // namespace CVLog

#endif
