#include "tests/providers/HookedBroker.h"

namespace Guards {

namespace {

HookedBroker* current = nullptr;
const CMPIBrokerEncFT* originalServices = nullptr;

void callHook() {
  if (current->hook) {
    current->hook();
  }
}

CMPIInstance* newInstance(const CMPIBroker* broker, const CMPIObjectPath* path, CMPIStatus* status) {
  callHook();
  return originalServices->newInstance(broker, path, status);
}

CMPIObjectPath* newObjectPath(const CMPIBroker* broker, const char* nameSpace, const char* className,
                              CMPIStatus* status) {
  callHook();
  return originalServices->newObjectPath(broker, nameSpace, className, status);
}

}  // namespace

HookedBroker::HookedBroker(const CMPIBroker* original) : record_(*original), services_(*original->eft) {
  current = this;
  originalServices = original->eft;
  services_.newInstance = newInstance;
  services_.newObjectPath = newObjectPath;
  record_.eft = &services_;
}

HookedBroker::~HookedBroker() {
  current = nullptr;
}

bool Meeting::waitForAnother(std::chrono::milliseconds patience) {
  std::unique_lock lock(mutex_);
  ++arrivals_;
  if (++present_ == 2) {
    met_ = true;
    arrived_.notify_all();
  }
  arrived_.wait_for(lock, patience, [&] { return met_; });
  --present_;
  return met_;
}

unsigned int Meeting::arrivals() {
  const std::lock_guard lock(mutex_);
  return arrivals_;
}

bool Meeting::met() {
  const std::lock_guard lock(mutex_);
  return met_;
}

}  // namespace Guards
