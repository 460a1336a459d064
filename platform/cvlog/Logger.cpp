#include "platform/cvlog/Logger.h"

#include <limits>
#include <stdexcept>
#include <utility>

#include "platform/common/Environment.h"
#include "platform/cvlog/FileSink.h"
#include "platform/cvlog/RateLimitedSink.h"
#include "platform/cvlog/StandardErrorSink.h"
#include "platform/cvlog/SystemLogSink.h"

namespace CVLog {
namespace {

using Tarn::Common::configuration;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::environmentOverride;

constexpr int kNothing = std::numeric_limits<int>::max();

std::unique_ptr<Sink> openDestination(const SinkSettings& settings) {
  const Destination& destination = settings.destination;
  switch (destination.kind) {
    case DestinationKind::kStandardError:
      return std::make_unique<StandardErrorSink>();
    case DestinationKind::kSystemLog:
      return std::make_unique<SystemLogSink>();
    case DestinationKind::kFile:
      return std::make_unique<FileSink>(destination.path, settings.rotation);
    case DestinationKind::kNone:
      break;
  }
  return nullptr;
}

std::unique_ptr<Sink> openSink(const SinkSettings& settings) {
  std::unique_ptr<Sink> sink = openDestination(settings);
  if (sink && settings.perMinute != 0) {
    return std::make_unique<RateLimitedSink>(std::move(sink), settings.perMinute);
  }
  return sink;
}

}  // namespace

Logger& Logger::instance() {
  static Logger logger(
      makeSettings(configuration(), environmentOverride("CORVANE_LOG"), environmentOverride("CORVANE_TRACE")));
  return logger;
}

Logger::Logger(const Settings& settings) {
  std::vector<ConfigurationProblem> problems = settings.problems;
  log_ = makeRoute(settings.log, defaultLog(), problems);
  trace_ = makeRoute(settings.trace, defaultTrace(), problems);
  report(problems);
  CVLogger::logThreshold_.store(log_.threshold(), std::memory_order_relaxed);
  CVLogger::traceThreshold_.store(trace_.threshold(), std::memory_order_relaxed);
}

Logger::~Logger() {
  CVLogger::logThreshold_.store(kNothing, std::memory_order_relaxed);
  CVLogger::traceThreshold_.store(kNothing, std::memory_order_relaxed);
}

int Logger::Route::threshold() const {
  return sink ? level : kNothing;
}

Logger::Route Logger::makeRoute(const SinkSettings& wanted, const SinkSettings& fallback,
                                std::vector<ConfigurationProblem>& problems) {
  try {
    return {wanted.level, openSink(wanted)};
  } catch (const std::runtime_error& error) {
    problems.push_back({error.what(), "the default destination is used"});
    return {fallback.level, openSink(fallback)};
  }
}

void Logger::report(const std::vector<ConfigurationProblem>& problems) {
  if (problems.empty()) {
    return;
  }
  // Not the configured sink: what is broken may be just that.
  const std::unique_ptr<Sink> sink = openSink(defaultLog());
  for (const ConfigurationProblem& problem : problems) {
    const std::string text = "Configuration: " + problem.where + ": " + problem.why;
    sink->write({.time = std::chrono::system_clock::now(),
                 .level = kLevelError,
                 .component = "Corvane.Logger",
                 .function = __func__,
                 .file = "Logger.cpp",
                 .line = __LINE__,
                 .text = text});
  }
}

void Logger::deliver(const Route& route, const Message& message) {
  if (route.sink && message.level >= route.level) {
    route.sink->write(message);
  }
}

}  // namespace CVLog
