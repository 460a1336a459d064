#include "tests/support/Responses.h"

#include <utility>

namespace Support {

using Corvcim::ObjectPath;
using Corvcim::Response;

Response answered(std::vector<Corvcim::Instance> instances) {
  return {CMPI_RC_OK, std::nullopt, std::move(instances), {}, 1};
}

Response answered(std::vector<ObjectPath> paths) {
  return {CMPI_RC_OK, std::nullopt, {}, std::move(paths), 1};
}

Response answeredNothing() {
  return {CMPI_RC_OK, std::nullopt, {}, {}, 1};
}

Response withoutDone(Response response) {
  response.doneCalls = 0;
  return response;
}

std::vector<ObjectPath> pathsOf(const Response& response) {
  std::vector<ObjectPath> paths;
  for (const Corvcim::Instance& each : response.instances) {
    paths.push_back(each.path);
  }
  return paths;
}

std::string outcome(const Response& response) {
  return Corvcim::statusName(response.rc) + (response.message ? " |" + *response.message + "|" : " no message") +
         (response.doneCalls == 0   ? " not done"
          : response.doneCalls == 1 ? " done"
                                    : " done more than once");
}

std::vector<std::string> detailsOf(const std::vector<Corvcim::ServiceCall>& record, const std::string& service) {
  std::vector<std::string> details;
  for (const Corvcim::ServiceCall& call : record) {
    if (call.service == service) {
      details.push_back(call.detail);
    }
  }
  return details;
}

}  // namespace Support
