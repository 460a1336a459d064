#include "host/broker/Operation.h"

#include <algorithm>
#include <array>
#include <ostream>

namespace Corvcim {
namespace {

constexpr std::array<std::string_view, 7> operationNames = {
    "EnumerateInstances", "EnumerateInstanceNames", "GetInstance", "Associators", "AssociatorNames",
    "References",         "ReferenceNames",
};

struct StatusName {
  CMPIrc rc;
  std::string_view name;
};

constexpr StatusName statusNames[] = {
    {CMPI_RC_OK, "CMPI_RC_OK"},
    {CMPI_RC_ERR_FAILED, "CMPI_RC_ERR_FAILED"},
    {CMPI_RC_ERR_ACCESS_DENIED, "CMPI_RC_ERR_ACCESS_DENIED"},
    {CMPI_RC_ERR_INVALID_NAMESPACE, "CMPI_RC_ERR_INVALID_NAMESPACE"},
    {CMPI_RC_ERR_INVALID_PARAMETER, "CMPI_RC_ERR_INVALID_PARAMETER"},
    {CMPI_RC_ERR_INVALID_CLASS, "CMPI_RC_ERR_INVALID_CLASS"},
    {CMPI_RC_ERR_NOT_FOUND, "CMPI_RC_ERR_NOT_FOUND"},
    {CMPI_RC_ERR_NOT_SUPPORTED, "CMPI_RC_ERR_NOT_SUPPORTED"},
    {CMPI_RC_ERR_CLASS_HAS_CHILDREN, "CMPI_RC_ERR_CLASS_HAS_CHILDREN"},
    {CMPI_RC_ERR_CLASS_HAS_INSTANCES, "CMPI_RC_ERR_CLASS_HAS_INSTANCES"},
    {CMPI_RC_ERR_INVALID_SUPERCLASS, "CMPI_RC_ERR_INVALID_SUPERCLASS"},
    {CMPI_RC_ERR_ALREADY_EXISTS, "CMPI_RC_ERR_ALREADY_EXISTS"},
    {CMPI_RC_ERR_NO_SUCH_PROPERTY, "CMPI_RC_ERR_NO_SUCH_PROPERTY"},
    {CMPI_RC_ERR_TYPE_MISMATCH, "CMPI_RC_ERR_TYPE_MISMATCH"},
    {CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED, "CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED"},
    {CMPI_RC_ERR_INVALID_QUERY, "CMPI_RC_ERR_INVALID_QUERY"},
    {CMPI_RC_ERR_METHOD_NOT_AVAILABLE, "CMPI_RC_ERR_METHOD_NOT_AVAILABLE"},
    {CMPI_RC_ERR_METHOD_NOT_FOUND, "CMPI_RC_ERR_METHOD_NOT_FOUND"},
    {CMPI_RC_NO_MORE_ELEMENTS, "CMPI_RC_NO_MORE_ELEMENTS"},
    {CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED, "CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED"},
    {CMPI_RC_ERR_QUERY_FEATURE_NOT_SUPPORTED, "CMPI_RC_ERR_QUERY_FEATURE_NOT_SUPPORTED"},
    {CMPI_RC_DO_NOT_UNLOAD, "CMPI_RC_DO_NOT_UNLOAD"},
    {CMPI_RC_NEVER_UNLOAD, "CMPI_RC_NEVER_UNLOAD"},
    {CMPI_RC_ERR_INVALID_HANDLE, "CMPI_RC_ERR_INVALID_HANDLE"},
    {CMPI_RC_ERR_INVALID_DATA_TYPE, "CMPI_RC_ERR_INVALID_DATA_TYPE"},
    {CMPI_RC_ERR_NOT_IN_CODEPAGE, "CMPI_RC_ERR_NOT_IN_CODEPAGE"},
    {CMPI_RC_ERROR_SYSTEM, "CMPI_RC_ERROR_SYSTEM"},
    {CMPI_RC_ERROR, "CMPI_RC_ERROR"},
};

}  // namespace

std::string_view operationName(OperationKind kind) {
  return operationNames.at(static_cast<std::size_t>(kind));
}

bool isAssociationOperation(OperationKind kind) {
  return kind >= OperationKind::Associators;
}

bool isReferenceOperation(OperationKind kind) {
  return kind == OperationKind::References || kind == OperationKind::ReferenceNames;
}

bool givesPaths(OperationKind kind) {
  return kind == OperationKind::EnumerateInstanceNames || kind == OperationKind::AssociatorNames ||
         kind == OperationKind::ReferenceNames;
}

Response failure(CMPIrc rc, std::string_view message) {
  return {rc, std::string(message), {}, {}, 0};
}

std::string statusName(CMPIrc rc) {
  const auto* found = std::ranges::find(statusNames, rc, &StatusName::rc);
  return found != std::end(statusNames) ? std::string(found->name) : std::to_string(static_cast<int>(rc));
}

std::ostream& operator<<(std::ostream& stream, const Response& response) {
  stream << statusName(response.rc);
  if (response.message) {
    stream << ' ' << quotedText(*response.message);
  }
  stream << ", done " << response.doneCalls << " times\n";
  for (const Instance& each : response.instances) {
    stream << each << '\n';
  }
  for (const ObjectPath& each : response.paths) {
    stream << each << '\n';
  }
  return stream;
}

}  // namespace Corvcim
