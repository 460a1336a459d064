#include "host/broker/Broker.h"

#include <algorithm>
#include <mutex>
#include <stdexcept>

#include "host/broker/Arena.h"
#include "host/broker/BrokerTables.h"
#include "host/broker/Request.h"
#include "schema/ClassTable.h"

namespace Corvcim {
namespace {

const char* textOrNull(const std::optional<std::string>& text) {
  return text ? text->c_str() : nullptr;
}

[[noreturn]] void throwWrongKind(OperationKind kind) {
  throw std::invalid_argument(std::string(operationName(kind)) + " is no operation of this management interface");
}

UpcallReply scriptedReply(const std::vector<Instance>& instances, const Operation& operation) {
  UpcallReply reply;
  switch (operation.kind) {
    case OperationKind::EnumerateInstances:
      reply.response.instances = instances;
      return reply;
    case OperationKind::EnumerateInstanceNames:
      for (const Instance& each : instances) {
        reply.response.paths.push_back(each.path);
      }
      return reply;
    case OperationKind::GetInstance:
      for (const Instance& each : instances) {
        if (namesSameInstance(each.path, operation.path)) {
          reply.response.instances.push_back(each);
        }
      }
      return reply;
    default:
      return {failure(CMPI_RC_ERR_NOT_SUPPORTED, "scripted instances have no associations"), false};
  }
}

}  // namespace

Broker::Broker()
    : record_{this, &brokerOperations, &objectServices, &threadServices, &memoryServices},
      kept_(std::make_unique<Arena>(*this)) {}

Broker::~Broker() = default;

Broker* Broker::of(const CMPIBroker* handle) {
  return handle == nullptr ? nullptr : static_cast<Broker*>(const_cast<void*>(handle->hdl));
}

Response Broker::perform(CMPIInstanceMI* mi, const Operation& operation) {
  Request request(*this, operation.path.nameSpace);
  const CMPIContext* context = request.context();
  const CMPIResult* result = request.result();
  const CMPIObjectPath* path = request.objectPath(operation.path);
  const char** properties = request.propertyList(operation.properties);
  switch (operation.kind) {
    case OperationKind::EnumerateInstances:
      return request.response(mi->ft->enumerateInstances(mi, context, result, path, properties));
    case OperationKind::EnumerateInstanceNames:
      return request.response(mi->ft->enumerateInstanceNames(mi, context, result, path));
    case OperationKind::GetInstance:
      return request.response(mi->ft->getInstance(mi, context, result, path, properties));
    default:
      throwWrongKind(operation.kind);
  }
}

Response Broker::perform(CMPIAssociationMI* mi, const Operation& operation) {
  Request request(*this, operation.path.nameSpace);
  const CMPIContext* context = request.context();
  const CMPIResult* result = request.result();
  const CMPIObjectPath* path = request.objectPath(operation.path);
  const char** properties = request.propertyList(operation.properties);
  const char* assocClass = textOrNull(operation.filter.assocClass);
  const char* resultClass = textOrNull(operation.filter.resultClass);
  const char* role = textOrNull(operation.filter.role);
  const char* resultRole = textOrNull(operation.filter.resultRole);
  switch (operation.kind) {
    case OperationKind::Associators:
      return request.response(
          mi->ft->associators(mi, context, result, path, assocClass, resultClass, role, resultRole, properties));
    case OperationKind::AssociatorNames:
      return request.response(
          mi->ft->associatorNames(mi, context, result, path, assocClass, resultClass, role, resultRole));
    case OperationKind::References:
      return request.response(mi->ft->references(mi, context, result, path, resultClass, role, properties));
    case OperationKind::ReferenceNames:
      return request.response(mi->ft->referenceNames(mi, context, result, path, resultClass, role));
    default:
      throwWrongKind(operation.kind);
  }
}

Response Broker::enumerateInstances(CMPIInstanceMI* mi, const ObjectPath& classPath, const PropertyList& properties) {
  return perform(mi, {OperationKind::EnumerateInstances, classPath, properties, {}});
}

Response Broker::enumerateInstanceNames(CMPIInstanceMI* mi, const ObjectPath& classPath) {
  return perform(mi, {OperationKind::EnumerateInstanceNames, classPath, {}, {}});
}

Response Broker::getInstance(CMPIInstanceMI* mi, const ObjectPath& path, const PropertyList& properties) {
  return perform(mi, {OperationKind::GetInstance, path, properties, {}});
}

Response Broker::associators(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter,
                             const PropertyList& properties) {
  return perform(mi, {OperationKind::Associators, source, properties, filter});
}

Response Broker::associatorNames(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter) {
  return perform(mi, {OperationKind::AssociatorNames, source, {}, filter});
}

Response Broker::references(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter,
                            const PropertyList& properties) {
  return perform(mi, {OperationKind::References, source, properties, filter});
}

Response Broker::referenceNames(CMPIAssociationMI* mi, const ObjectPath& source, const AssociationFilter& filter) {
  return perform(mi, {OperationKind::ReferenceNames, source, {}, filter});
}

void Broker::serve(std::string_view className, UpcallHandler handler) {
  const std::unique_lock lock(handlersMutex_);
  handlers_.insert_or_assign(std::string(className), std::move(handler));
}

void Broker::serveInstances(std::string_view className, std::vector<Instance> instances) {
  serve(className,
        [instances = std::move(instances)](const Operation& operation) { return scriptedReply(instances, operation); });
}

void Broker::serveFailure(std::string_view className, CMPIrc rc, std::string_view message,
                          bool enumerationDespiteFailure) {
  serve(className,
        [reply = UpcallReply{failure(rc, message), enumerationDespiteFailure}](const Operation&) { return reply; });
}

void Broker::serveOthers(UpcallHandler handler) {
  const std::unique_lock lock(handlersMutex_);
  others_ = std::move(handler);
}

UpcallReply Broker::upcall(const Operation& operation) const {
  UpcallHandler handler;
  {
    const std::shared_lock lock(handlersMutex_);
    const auto found =
        std::ranges::find_if(handlers_, [&](const auto& each) { return isA(each.first, operation.path.className); });
    handler = found != handlers_.end() ? found->second : others_;
  }
  return handler ? handler(operation) : UpcallReply{};
}

}  // namespace Corvcim
