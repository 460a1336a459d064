#ifndef CORVCIM_REQUEST_H
#define CORVCIM_REQUEST_H

#include "host/broker/Broker.h"
#include "host/broker/Operation.h"

#include <cmpift.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

class Arena;

/// One request in one thread: while it lives, whatever this thread makes through the broker belongs to
/// it; its end frees all of that. Requests nest (an up-call served in the same thread). Broker::perform
/// makes one by itself; make one by hand to call functions that need a broker, a path or a result
/// without going through an MI. It must end in the thread where it began.
class Request {
 public:
  explicit Request(Broker& broker, std::string_view nameSpace = {});
  ~Request();
  Request(const Request&) = delete;
  Request& operator=(const Request&) = delete;

  [[nodiscard]] Broker& broker() const { return broker_; }
  [[nodiscard]] Arena& arena() const { return *arena_; }

  [[nodiscard]] const CMPIContext* context() const { return context_; }
  /// Where a provider puts its results; response() shows them.
  [[nodiscard]] const CMPIResult* result() const { return result_; }

  /// Broker objects of this request for these values. None of them is counted as a call of a service.
  CMPIObjectPath* objectPath(const ObjectPath& path);
  CMPIInstance* instance(const Instance& instance);
  CMPIString* string(std::string_view text);

  /// NULL for no list, else a NULL-terminated array that lives as long as the request.
  const char** propertyList(const PropertyList& properties);

  /// What was returned so far, with this status.
  [[nodiscard]] Response response(const CMPIStatus& status) const;

  /// Lets the calling thread, which has no request, work for this one until it detaches; false if it has one.
  static bool attach(Request* request);
  static void detach();

 private:
  friend class Broker;  ///< walks the chain of requests

  Broker& broker_;
  Request* previous_;
  std::unique_ptr<Arena> arena_;
  CMPIContext* context_;
  CMPIResult* result_;
  std::vector<std::unique_ptr<std::vector<std::string>>> listTexts_;
  std::vector<std::unique_ptr<std::vector<const char*>>> lists_;
};

/// The values in broker objects. NULL and handle-less objects give an empty value.
[[nodiscard]] ObjectPath valueOf(const CMPIObjectPath* path);
[[nodiscard]] Instance valueOf(const CMPIInstance* instance);
[[nodiscard]] std::string textOf(const CMPIString* string);

}  // namespace Corvcim

#endif
