#include <exception>
#include <optional>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "host/broker/BrokerTables.h"
#include "host/broker/Call.h"
#include "host/broker/Request.h"

namespace Corvcim {
namespace {

// Up-calls. The operation goes to whoever serves the class; its answer becomes objects of the
// caller's request.

std::optional<std::string> optionalText(const char* text) {
  return text != nullptr ? std::optional<std::string>(text) : std::nullopt;
}

PropertyList propertyList(const char* const* names) {
  if (names == nullptr) {
    return std::nullopt;
  }
  PropertyList result(std::in_place);
  while (*names != nullptr) {
    result->emplace_back(*names++);
  }
  return result;
}

UpcallReply answerOf(Broker& broker, const Operation& operation) {
  try {
    return broker.upcall(operation);
  } catch (const std::exception& error) {
    return {failure(CMPI_RC_ERR_FAILED, error.what()), false};
  }
}

std::vector<Value> elementsOf(Response& response, bool paths) {
  std::vector<Value> result;
  if (paths) {
    for (ObjectPath& each : response.paths) {
      result.push_back(Value::reference(std::move(each)));
    }
  } else {
    for (Instance& each : response.instances) {
      result.push_back(Value::instance(std::move(each)));
    }
  }
  return result;
}

CMPIEnumeration* enumerate(const Call& call, const CMPIObjectPath* path, Operation operation, CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(path);
  if (object == nullptr) {
    return call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER,
                       std::string(operationName(operation.kind)) + ": the path is NULL");
  }
  const bool paths = givesPaths(operation.kind);
  operation.path = object->path;
  UpcallReply reply = answerOf(call.broker(), operation);
  if (!reply.response.ok() && !reply.enumerationDespiteFailure) {
    return call.refuse(status, reply.response.rc, reply.response.message.value_or(""));
  }
  CMPIEnumeration* const result = call.object<EnumerationObject>(
      status, static_cast<CMPIType>(paths ? CMPI_ref : CMPI_instance), elementsOf(reply.response, paths));
  if (!reply.response.ok()) {
    store(status, call.refuse(reply.response.rc, reply.response.message.value_or("")));
  }
  return result;
}

const char* classOf(const CMPIObjectPath* path) {
  const ObjectPathObject* object = ObjectPathObject::of(path);
  return object != nullptr ? object->path.className.c_str() : "NULL";
}

// Every slot begins alike: a broker that is not ours cannot even give a message.
template <class Function>
std::invoke_result_t<Function, Broker&> withBroker(const CMPIBroker* handle, CMPIStatus* status, Function function) {
  Broker* broker = Broker::of(handle);
  if (broker == nullptr) {
    store(status, invalidHandle());
    return std::invoke_result_t<Function, Broker&>();
  }
  return function(*broker);
}

CMPIEnumeration* enumerateInstanceNames(const CMPIBroker* handle, const CMPIContext* /*context*/,
                                        const CMPIObjectPath* path, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::EnumerateInstanceNames, classOf(path));
    return enumerate(call, path, {OperationKind::EnumerateInstanceNames, {}, {}, {}}, status);
  });
}

CMPIEnumeration* enumerateInstances(const CMPIBroker* handle, const CMPIContext* /*context*/,
                                    const CMPIObjectPath* path, const char** properties, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::EnumerateInstances, classOf(path));
    return enumerate(call, path, {OperationKind::EnumerateInstances, {}, propertyList(properties), {}}, status);
  });
}

std::optional<Instance> oneInstance(const Call& call, const CMPIObjectPath* path, const char** properties,
                                    CMPIStatus* status) {
  const ObjectPathObject* object = ObjectPathObject::of(path);
  if (object == nullptr) {
    call.refuse(status, CMPI_RC_ERR_INVALID_PARAMETER, "GetInstance: the path is NULL");
    return std::nullopt;
  }
  Response response =
      answerOf(call.broker(), {OperationKind::GetInstance, object->path, propertyList(properties), {}}).response;
  if (!response.ok()) {
    call.refuse(status, response.rc, response.message.value_or(""));
    return std::nullopt;
  }
  if (response.instances.empty()) {
    call.refuse(status, CMPI_RC_ERR_NOT_FOUND, "there is no instance " + object->path.text());
    return std::nullopt;
  }
  return std::move(response.instances.front());
}

CMPIInstance* getInstance(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                          const char** properties, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) -> CMPIInstance* {
    const Call call(broker, Service::GetInstance, classOf(path));
    std::optional<Instance> instance = oneInstance(call, path, properties, status);
    return instance ? call.object<InstanceObject>(status, std::move(*instance)) : nullptr;
  });
}

CMPIData getProperty(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                     const char* name, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::BrokerGetProperty, name);
    if (name == nullptr) {
      return call.refuseData(status, CMPI_RC_ERR_INVALID_PARAMETER, "GetProperty: the name is NULL", CMPI_badValue);
    }
    const std::optional<Instance> instance = oneInstance(call, path, nullptr, status);
    if (!instance) {
      return noData(CMPI_badValue);
    }
    const Value* value = instance->property(name);
    return value != nullptr ? call.data(status, *value)
                            : call.refuseData(status, CMPI_RC_ERR_NO_SUCH_PROPERTY,
                                              "there is no property " + std::string(name), CMPI_notFound);
  });
}

CMPIEnumeration* associators(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                             const char* assocClass, const char* resultClass, const char* role, const char* resultRole,
                             const char** properties, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::Associators, classOf(path));
    const AssociationFilter filter = {optionalText(assocClass), optionalText(resultClass), optionalText(role),
                                      optionalText(resultRole)};
    return enumerate(call, path, {OperationKind::Associators, {}, propertyList(properties), filter}, status);
  });
}

CMPIEnumeration* associatorNames(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                                 const char* assocClass, const char* resultClass, const char* role,
                                 const char* resultRole, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::AssociatorNames, classOf(path));
    const AssociationFilter filter = {optionalText(assocClass), optionalText(resultClass), optionalText(role),
                                      optionalText(resultRole)};
    return enumerate(call, path, {OperationKind::AssociatorNames, {}, {}, filter}, status);
  });
}

CMPIEnumeration* references(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                            const char* resultClass, const char* role, const char** properties, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::References, classOf(path));
    const AssociationFilter filter = {{}, optionalText(resultClass), optionalText(role), {}};
    return enumerate(call, path, {OperationKind::References, {}, propertyList(properties), filter}, status);
  });
}

CMPIEnumeration* referenceNames(const CMPIBroker* handle, const CMPIContext* /*context*/, const CMPIObjectPath* path,
                                const char* resultClass, const char* role, CMPIStatus* status) {
  return withBroker(handle, status, [&](Broker& broker) {
    const Call call(broker, Service::ReferenceNames, classOf(path));
    const AssociationFilter filter = {{}, optionalText(resultClass), optionalText(role), {}};
    return enumerate(call, path, {OperationKind::ReferenceNames, {}, {}, filter}, status);
  });
}

// What this host does not do: it only reads.

CMPIStatus refusal(const CMPIBroker* handle, Service service) {
  CMPIStatus status = okStatus();
  withBroker(handle, &status, [&](Broker& broker) {
    status =
        Call(broker, service)
            .refuse(CMPI_RC_ERR_NOT_SUPPORTED, "this broker does not support " + std::string(serviceName(service)));
  });
  return status;
}

template <class Result>
Result refuseWith(const CMPIBroker* handle, Service service, CMPIStatus* status, Result result) {
  store(status, refusal(handle, service));
  return result;
}

CMPIStatus deliverIndication(const CMPIBroker* handle, const CMPIContext*, const char*, const CMPIInstance*) {
  return refusal(handle, Service::DeliverIndication);
}

CMPIObjectPath* createInstance(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                               CMPIStatus* status) {
  return refuseWith<CMPIObjectPath*>(handle, Service::CreateInstance, status, nullptr);
}

CMPIStatus modifyInstance(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                          const char**) {
  return refusal(handle, Service::ModifyInstance);
}

CMPIStatus deleteInstance(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*) {
  return refusal(handle, Service::DeleteInstance);
}

CMPIEnumeration* execQuery(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const char*,
                           const char*, CMPIStatus* status) {
  return refuseWith<CMPIEnumeration*>(handle, Service::ExecQuery, status, nullptr);
}

CMPIData invokeMethod(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const char*, const CMPIArgs*,
                      CMPIArgs*, CMPIStatus* status) {
  return refuseWith(handle, Service::InvokeMethod, status, noData(CMPI_nullValue));
}

CMPIStatus setProperty(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const char*,
                       const CMPIValue*, CMPIType) {
  return refusal(handle, Service::BrokerSetProperty);
}

// The filtered forms belong to CMPI 2.1. They are there so that no slot is NULL.

CMPIEnumeration* enumerateInstancesFiltered(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*,
                                            const char**, const char*, const char*, CMPIStatus* status) {
  return refuseWith<CMPIEnumeration*>(handle, Service::ExecQuery, status, nullptr);
}

CMPIEnumeration* associatorsFiltered(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const char*,
                                     const char*, const char*, const char*, const char**, const char*, const char*,
                                     CMPIStatus* status) {
  return refuseWith<CMPIEnumeration*>(handle, Service::ExecQuery, status, nullptr);
}

CMPIEnumeration* referencesFiltered(const CMPIBroker* handle, const CMPIContext*, const CMPIObjectPath*, const char*,
                                    const char*, const char**, const char*, const char*, CMPIStatus* status) {
  return refuseWith<CMPIEnumeration*>(handle, Service::ExecQuery, status, nullptr);
}

// Threads that a provider starts: what they make belongs to the request whose context they attach with.

CMPIContext* prepareAttachThread(const CMPIBroker* handle, const CMPIContext* context) {
  CMPIContext* result = nullptr;
  withBroker(handle, nullptr, [&](Broker& broker) {
    const Call call(broker, Service::PrepareAttachThread);
    if (const ContextObject* object = ContextObject::of(context)) {
      result = call.object<ContextObject>(nullptr, *object);
    }
  });
  return result;
}

CMPIStatus attachThread(const CMPIBroker* handle, const CMPIContext* context) {
  CMPIStatus status = okStatus();
  withBroker(handle, &status, [&](Broker& broker) {
    const Call call(broker, Service::AttachThread);
    const ContextObject* object = ContextObject::of(context);
    status = call.status();
    if (object == nullptr || !Request::attach(object->request)) {
      status =
          call.refuse(CMPI_RC_ERR_INVALID_PARAMETER, "attachThread: no context, or the thread is attached already");
    }
  });
  return status;
}

CMPIStatus detachThread(const CMPIBroker* handle, const CMPIContext* /*context*/) {
  CMPIStatus status = okStatus();
  withBroker(handle, &status, [&](Broker& broker) {
    status = Call(broker, Service::DetachThread).status();
    Request::detach();
  });
  return status;
}

}  // namespace

const CMPIBrokerFT brokerOperations = {
    0,  // no capabilities beyond the basic ones
    CMPI_VERSION,
    "corvcim",
    prepareAttachThread,
    attachThread,
    detachThread,
    deliverIndication,
    enumerateInstanceNames,
    getInstance,
    createInstance,
    modifyInstance,
    deleteInstance,
    execQuery,
    enumerateInstances,
    associators,
    associatorNames,
    references,
    referenceNames,
    invokeMethod,
    setProperty,
    getProperty,
    enumerateInstancesFiltered,
    associatorsFiltered,
    referencesFiltered,
};

}  // namespace Corvcim
