#include "platform/cvlog/Logger.h"

#include <limits>
#include <stdexcept>
#include <string_view>
#include <utility>

#include "platform/common/Environment.h"
#include "platform/cvlog/FileSink.h"
#include "platform/cvlog/HeldFlag.h"
#include "platform/cvlog/RateLimitedSink.h"
#include "platform/cvlog/StandardErrorSink.h"
#include "platform/cvlog/SystemLogSink.h"

namespace CVLog {
namespace {

using Tarn::Common::ConfigurationFile;
using Tarn::Common::ConfigurationProblem;
using Tarn::Common::environmentOverride;

constexpr int noLevel = std::numeric_limits<int>::max();

std::unique_ptr<Sink> openDestination(const SinkSettings& settings) {
  const Destination& destination = settings.destination;
  switch (destination.kind) {
    case DestinationKind::StandardError:
      return std::make_unique<StandardErrorSink>();
    case DestinationKind::SystemLog:
      return std::make_unique<SystemLogSink>();
    case DestinationKind::File:
      return std::make_unique<FileSink>(destination.path, settings.rotation);
    case DestinationKind::None:
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

constexpr std::string_view thisFile = "Logger.cpp";

}  // namespace

Logger& Logger::instance() {
  static Logger logger(ConfigurationFile::ofThisProcess(), environmentOverride("CORVANE_LOG"),
                       environmentOverride("CORVANE_TRACE"));
  return logger;
}

Logger::Logger(ConfigurationFile file, std::optional<std::string> logOverride, std::optional<std::string> traceOverride)
    : file_(std::move(file)),
      logOverride_(std::move(logOverride)),
      traceOverride_(std::move(traceOverride)),
      routes_(makeRoutes(nullptr)) {
  setThresholds(routes_.inForce());
  CVLogger::isClosed_.store(false, std::memory_order_relaxed);
}

Logger::~Logger() {
  CVLogger::isClosed_.store(true, std::memory_order_relaxed);
  CVLogger::logThreshold_.store(noLevel, std::memory_order_relaxed);
  CVLogger::traceThreshold_.store(noLevel, std::memory_order_relaxed);
}

void Logger::followConfiguration() {
  const HeldFlag following(isFollowing_);
  if (!following) {
    return;
  }
  if (file_.hasChanged()) {
    routes_.replace(makeRoutes(&routes_.inForce()));
    setThresholds(routes_.inForce());
    noteThatFileWasRead();
  }
  routes_.discardUnused();
}

int Logger::Route::threshold() const {
  return sink ? level : noLevel;
}

void Logger::setThresholds(const Routes& routes) {
  CVLogger::logThreshold_.store(routes.log.threshold(), std::memory_order_relaxed);
  CVLogger::traceThreshold_.store(routes.trace.threshold(), std::memory_order_relaxed);
}

std::unique_ptr<const Logger::Routes> Logger::makeRoutes(const Routes* before) {
  const Settings settings = makeSettings(file_.read(), logOverride_, traceOverride_);
  std::vector<ConfigurationProblem> problems = settings.problems;
  auto routes = std::make_unique<Routes>();
  routes->log = makeRoute(settings.log, defaultLog(), before != nullptr ? &before->log : nullptr, problems);
  routes->trace = makeRoute(settings.trace, defaultTrace(), before != nullptr ? &before->trace : nullptr, problems);
  report(problems);
  return routes;
}

Logger::Route Logger::makeRoute(const SinkSettings& wanted, const SinkSettings& fallback, const Route* before,
                                std::vector<ConfigurationProblem>& problems) {
  if (before != nullptr && !before->isFallback && wanted.differsOnlyInLevel(before->wanted)) {
    return {.wanted = wanted, .isFallback = false, .level = wanted.level, .sink = before->sink};
  }
  try {
    return {.wanted = wanted, .isFallback = false, .level = wanted.level, .sink = openSink(wanted)};
  } catch (const std::runtime_error& error) {
    problems.push_back({error.what(), "the default destination is used"});
    return {.wanted = wanted, .isFallback = true, .level = fallback.level, .sink = openSink(fallback)};
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
    sink->write(ownMessage(levelError, thisFile, text));
  }
}

void Logger::noteThatFileWasRead() {
  const std::string text = "Configuration: " + file_.path() + " was read again";
  const Message message = ownMessage(levelInfo, thisFile, text);
  log(message);
  trace(message);
}

void Logger::deliver(Route Routes::*sink, const Message& message) {
  routes_.with([&](const Routes& routes) {
    const Route& route = routes.*sink;
    if (route.sink && message.level >= route.level) {
      route.sink->write(message);
    }
  });
}

}  // namespace CVLog
