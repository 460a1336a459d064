#ifndef TESTS_SUPPORT_RESPONSES_H
#define TESTS_SUPPORT_RESPONSES_H

#include <string>
#include <vector>

#include "host/broker/Operation.h"
#include "host/broker/ServiceMonitor.h"

/// What became of requests.
namespace Support {

/// A request that succeeded and was ended with CMReturnDone; the same without, as associations answer.
Corvcim::Response answered(std::vector<Corvcim::Instance> instances);
Corvcim::Response answered(std::vector<Corvcim::ObjectPath> paths);
Corvcim::Response answeredNothing();
Corvcim::Response withoutDone(Corvcim::Response response);

/// The paths of a response's instances, in order.
std::vector<Corvcim::ObjectPath> pathsOf(const Corvcim::Response& response);

/// What happened to a request besides its results: status, message and CMReturnDone on one line, such
/// as "CMPI_RC_ERR_FAILED |the message| done".
std::string outcome(const Corvcim::Response& response);

/// The recorded calls of one service.
std::vector<std::string> detailsOf(const std::vector<Corvcim::ServiceCall>& record, const std::string& service);

}  // namespace Support

#endif
