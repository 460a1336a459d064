#ifndef TESTS_PROVIDERS_HOOKEDBROKER_H
#define TESTS_PROVIDERS_HOOKEDBROKER_H

#include <cmpift.h>

#include <chrono>
#include <condition_variable>
#include <functional>
#include <mutex>

/// A look inside the library while it works: a broker that calls back whenever a provider has it make
/// an object, and a place where threads meet.
namespace Guards {

/// The host's broker with a hook in the services that make instances and object paths. One at a time.
class HookedBroker {
 public:
  explicit HookedBroker(const CMPIBroker* original);
  ~HookedBroker();
  HookedBroker(const HookedBroker&) = delete;
  HookedBroker& operator=(const HookedBroker&) = delete;

  const CMPIBroker* handle() const { return &record_; }

  /// Called before each object is made, in the thread that wants it. Set while no request runs.
  std::function<void()> hook;

 private:
  CMPIBroker record_;
  CMPIBrokerEncFT services_;
};

/// Where threads wait for each other.
class Meeting {
 public:
  /// Waits until a second thread is here, or until the time is over. Whether they met.
  bool waitForAnother(std::chrono::milliseconds patience);

  /// How many came, and whether two were here at the same time.
  unsigned int arrivals();
  bool met();

 private:
  std::mutex mutex_;
  std::condition_variable arrived_;
  unsigned int arrivals_ = 0;
  unsigned int present_ = 0;
  bool met_ = false;
};

}  // namespace Guards

#endif
