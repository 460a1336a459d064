#ifndef CORVCIM_OPERATION_H
#define CORVCIM_OPERATION_H

#include "host/broker/Instance.h"

#include <cmpidt.h>

#include <iosfwd>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// Names of the properties that a client wants; no list: all of them; an empty list: keys only.
using PropertyList = std::optional<std::vector<std::string>>;

enum class OperationKind : unsigned char {
  EnumerateInstances,
  EnumerateInstanceNames,
  GetInstance,
  Associators,
  AssociatorNames,
  References,
  ReferenceNames,
};

[[nodiscard]] std::string_view operationName(OperationKind kind);  ///< "EnumerateInstances", ...
[[nodiscard]] bool isAssociationOperation(OperationKind kind);
[[nodiscard]] bool isReferenceOperation(OperationKind kind);  ///< its results are associations
[[nodiscard]] bool givesPaths(OperationKind kind);            ///< and no instances

/// What narrows an association operation. Anything absent reaches the provider as NULL.
struct AssociationFilter {
  std::optional<std::string> assocClass;   ///< associators only
  std::optional<std::string> resultClass;  ///< of the far end; for references: of the association
  std::optional<std::string> role;         ///< reference property at the source's end
  std::optional<std::string> resultRole;   ///< associators only: reference property at the far end

  friend bool operator==(const AssociationFilter&, const AssociationFilter&) = default;
};

/// One request to a provider.
struct Operation {
  OperationKind kind = OperationKind::EnumerateInstances;
  ObjectPath path;  ///< a class for enumerations, else an instance
  PropertyList properties;
  AssociationFilter filter;

  friend bool operator==(const Operation&, const Operation&) = default;
};

/// What a provider did with a request.
struct Response {
  CMPIrc rc = CMPI_RC_OK;
  std::optional<std::string> message;  ///< of the status; none when the provider gave NULL
  std::vector<Instance> instances;     ///< in the order of their return; kept also when rc is a failure
  std::vector<ObjectPath> paths;
  unsigned doneCalls = 0;  ///< how often CMReturnDone was called

  [[nodiscard]] bool ok() const { return rc == CMPI_RC_OK; }
  [[nodiscard]] bool done() const { return doneCalls != 0; }

  friend bool operator==(const Response&, const Response&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const Response& response);
};

[[nodiscard]] Response failure(CMPIrc rc, std::string_view message);

/// "CMPI_RC_ERR_FAILED", ...; the number for a code that the standard does not have.
[[nodiscard]] std::string statusName(CMPIrc rc);

}  // namespace Corvcim

#endif
