#include "host/broker/ServiceMonitor.h"

#include <numeric>
#include <ostream>
#include <stdexcept>
#include <utility>

namespace Corvcim {
namespace {

Service knownService(std::string_view name) {
  if (const auto service = findService(name)) {
    return *service;
  }
  throw std::invalid_argument("no broker service is named \"" + std::string(name) + "\"; see host/broker/Service.h");
}

}  // namespace

std::ostream& operator<<(std::ostream& stream, const ServiceCall& call) {
  return stream << call.service << '(' << call.detail << ')';
}

void ServiceMonitor::failNth(std::string_view service, unsigned n, Failure failure, unsigned times) {
  if (n == 0) {
    throw std::invalid_argument("calls are counted from 1");
  }
  const std::lock_guard lock(mutex_);
  plans_.push_back({knownService(service), n - 1, times, std::move(failure)});
  failing_.store(true, std::memory_order_release);
}

void ServiceMonitor::clearFailures() {
  const std::lock_guard lock(mutex_);
  plans_.clear();
  failing_.store(false, std::memory_order_release);
}

unsigned ServiceMonitor::count(std::string_view service) const {
  return counts_[static_cast<std::size_t>(knownService(service))].load(std::memory_order_relaxed);
}

unsigned ServiceMonitor::totalCount() const {
  return std::accumulate(counts_.begin(), counts_.end(), 0U, [](unsigned sum, const std::atomic<unsigned>& each) {
    return sum + each.load(std::memory_order_relaxed);
  });
}

void ServiceMonitor::resetCounts() {
  for (auto& each : counts_) {
    each.store(0, std::memory_order_relaxed);
  }
}

void ServiceMonitor::record(bool on) {
  recording_.store(on, std::memory_order_relaxed);
}

std::vector<ServiceCall> ServiceMonitor::takeRecord() {
  const std::lock_guard lock(mutex_);
  return std::exchange(record_, {});
}

void ServiceMonitor::append(Service service, std::string detail) {
  const std::lock_guard lock(mutex_);
  record_.push_back({std::string(serviceName(service)), std::move(detail)});
}

std::optional<Failure> ServiceMonitor::nextFailure(Service service) {
  const std::lock_guard lock(mutex_);
  std::optional<Failure> result;
  for (Plan& plan : plans_) {
    if (plan.service != service) {
      continue;
    }
    if (plan.callsBefore > 0) {
      --plan.callsBefore;
      continue;
    }
    if (!result) {
      result = plan.failure;
    }
    if (plan.times > 0 && --plan.times == 0) {
      plan.service = Service::Count;  // used up
    }
  }
  return result;
}

}  // namespace Corvcim
