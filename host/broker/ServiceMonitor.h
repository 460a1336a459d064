#ifndef CORVCIM_SERVICE_MONITOR_H
#define CORVCIM_SERVICE_MONITOR_H

#include "host/broker/Service.h"

#include <cmpidt.h>

#include <array>
#include <atomic>
#include <iosfwd>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// How a service fails. Services that return a status or a count know only the status.
enum class FailureResult : unsigned char {
  Null,        ///< NULL object or NULL value, failing status
  HandleLess,  ///< an object whose handle is NULL, failing status
  StatusOnly,  ///< the right object, failing status
};

struct Failure {
  FailureResult result = FailureResult::Null;
  CMPIrc rc = CMPI_RC_ERR_FAILED;
  std::string message = "failure asked for by the test";
};

struct ServiceCall {
  std::string service;
  std::string detail;  ///< what it was about: the class, property, key, text, size

  friend bool operator==(const ServiceCall&, const ServiceCall&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const ServiceCall& call);
};

/// Counts, records and fails the calls of providers on the broker. The broker itself needs none of it: it is there
/// for the tests, which let every service fail once, and for measuring. Every service enters here, so it costs one
/// relaxed count where nobody asks for more. Safe from several threads; with
/// several, the n-th call is the n-th of all of them together. Service names are those of Service.h;
/// an unknown name throws std::invalid_argument.
class ServiceMonitor {
 public:
  /// Lets the n-th call from now on fail (1: the next one), and `times` - 1 calls after it; times 0: all of them.
  void failNth(std::string_view service, unsigned n, Failure failure = {}, unsigned times = 1);
  void clearFailures();

  /// Calls since construction or the last reset, failed ones included.
  [[nodiscard]] unsigned count(std::string_view service) const;
  [[nodiscard]] unsigned totalCount() const;
  void resetCounts();

  /// Recording is off at first. takeRecord empties the record.
  void record(bool on);
  [[nodiscard]] std::vector<ServiceCall> takeRecord();

  /// For the services themselves: counts and records one call, and says whether it has to fail.
  /// The detail is `detail()`, asked for only while recording.
  template <class Detail>
  std::optional<Failure> enter(Service service, const Detail& detail) {
    counts_[static_cast<std::size_t>(service)].fetch_add(1, std::memory_order_relaxed);
    if (recording_.load(std::memory_order_relaxed)) {
      append(service, detail());
    }
    if (!failing_.load(std::memory_order_acquire)) {
      return std::nullopt;
    }
    return nextFailure(service);
  }

 private:
  struct Plan {
    Service service;
    unsigned callsBefore;  ///< calls that still succeed
    unsigned times;        ///< failures left; 0: for ever
    Failure failure;
  };

  void append(Service service, std::string detail);
  std::optional<Failure> nextFailure(Service service);

  std::array<std::atomic<unsigned>, serviceCount> counts_{};
  std::atomic<bool> recording_{false};
  std::atomic<bool> failing_{false};
  mutable std::mutex mutex_;
  std::vector<Plan> plans_;
  std::vector<ServiceCall> record_;
};

}  // namespace Corvcim

#endif
