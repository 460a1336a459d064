#ifndef CORVCIM_BROKER_H
#define CORVCIM_BROKER_H

#include "host/broker/Operation.h"
#include "host/broker/ServiceMonitor.h"
#include "schema/Names.h"

#include <cmpift.h>

#include <atomic>
#include <cstddef>
#include <functional>
#include <map>
#include <memory>
#include <shared_mutex>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

class Arena;

/// What an up-call gets from whoever serves the class.
struct UpcallReply {
  Response response;
  /// A failing enumeration is NULL by default; some production brokers hand over a non-NULL one
  /// (holding what came before the failure) together with the failing status.
  bool enumerationDespiteFailure = false;
};

/// A CMPI 2.0 broker in small: what providers are called through and what they call back into.
///
/// Everything that a provider obtains from it during a request belongs to that request and is gone
/// when the request ends; what it cloned lives until it releases it. The broker answers NULL
/// arguments with CMPI_RC_ERR_INVALID_PARAMETER, refuses what it does not do (indications, queries,
/// modifications) with CMPI_RC_ERR_NOT_SUPPORTED and never throws through a CMPI call.
///
/// Requests may run in any number of threads at once, up-call handlers are then called in these
/// threads. Handlers are registered before requests run. The broker must outlive its requests and
/// the provider library that holds its handle.
class Broker {
 public:
  using UpcallHandler = std::function<UpcallReply(const Operation&)>;

  Broker();
  ~Broker();
  Broker(const Broker&) = delete;
  Broker& operator=(const Broker&) = delete;

  [[nodiscard]] const CMPIBroker* handle() const { return &record_; }

  /// Runs one request. An exception that escapes the provider passes through, the request's objects
  /// being freed. The wrong kind of operation for the interface throws std::invalid_argument.
  Response perform(CMPIInstanceMI* mi, const Operation& operation);
  Response perform(CMPIAssociationMI* mi, const Operation& operation);

  Response enumerateInstances(CMPIInstanceMI* mi, const ObjectPath& classPath, const PropertyList& properties = {});
  Response enumerateInstanceNames(CMPIInstanceMI* mi, const ObjectPath& classPath);
  Response getInstance(CMPIInstanceMI* mi, const ObjectPath& path, const PropertyList& properties = {});
  Response associators(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter = {},
                       const PropertyList& properties = {});
  Response associatorNames(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter = {});
  Response references(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter = {},
                      const PropertyList& properties = {});
  Response referenceNames(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter = {});

  /// Who answers up-calls for a class (or, by the class table, for an ancestor of it). Without anybody
  /// an enumeration is empty and OK and a get finds nothing.
  void serve(std::string_view className, UpcallHandler handler);
  void serveInstances(std::string_view className, std::vector<Instance> instances);
  void serveFailure(std::string_view className, CMPIrc rc, std::string_view message,
                    bool enumerationDespiteFailure = false);
  /// Who answers for every class that has no handler of its own.
  void serveOthers(UpcallHandler handler);

  [[nodiscard]] UpcallReply upcall(const Operation& operation) const;

  /// Counting, recording and failing of services; failNth is the short form of the monitor's.
  [[nodiscard]] ServiceMonitor& services() { return services_; }
  void failNth(std::string_view service, unsigned n, Failure failure = {}, unsigned times = 1) {
    services_.failNth(service, n, std::move(failure), times);
  }
  [[nodiscard]] unsigned callCount(std::string_view service) const { return services_.count(service); }

  /// Objects handed out and not freed: those of running requests, and clones that nobody released.
  [[nodiscard]] std::size_t liveObjects() const { return liveObjects_.load(std::memory_order_relaxed); }

  /// For the services' implementation: where objects made by the calling thread belong (its request,
  /// else the broker itself), where clones belong, and the broker that a handle is of.
  [[nodiscard]] Arena& currentArena();
  [[nodiscard]] Arena& keptObjects() { return *kept_; }
  [[nodiscard]] std::atomic<std::size_t>& liveObjectCounter() { return liveObjects_; }
  [[nodiscard]] static Broker* of(const CMPIBroker* handle);

 private:
  CMPIBroker record_;
  ServiceMonitor services_;
  std::atomic<std::size_t> liveObjects_{0};
  std::unique_ptr<Arena> kept_;
  mutable std::shared_mutex handlersMutex_;
  std::map<std::string, UpcallHandler, NameLess> handlers_;
  UpcallHandler others_;
};

}  // namespace Corvcim

#endif
