#ifndef CORVCIM_SERVICE_H
#define CORVCIM_SERVICE_H

#include <array>
#include <cstddef>
#include <optional>
#include <string_view>

namespace Corvcim {

/// Every operation that a provider can call on the broker and its objects, by one flat list of names.
/// They are the slots' names, but for those that several tables have: clone and release are one
/// service each, the broker's own setProperty, getProperty and getMessage2 carry their table's name.
enum class Service : unsigned char {
  PrepareAttachThread,
  AttachThread,
  DetachThread,
  DeliverIndication,
  EnumerateInstanceNames,
  GetInstance,
  CreateInstance,
  ModifyInstance,
  DeleteInstance,
  ExecQuery,
  EnumerateInstances,
  Associators,
  AssociatorNames,
  References,
  ReferenceNames,
  InvokeMethod,
  BrokerSetProperty,
  BrokerGetProperty,
  NewInstance,
  NewObjectPath,
  NewArgs,
  NewString,
  NewArray,
  NewDateTime,
  NewDateTimeFromBinary,
  NewDateTimeFromChars,
  NewSelectExp,
  ClassPathIsA,
  ToString,
  IsOfType,
  GetType,
  GetMessage,
  LogMessage,
  Trace,
  NewError,
  OpenMessageFile,
  CloseMessageFile,
  Clone,
  Release,
  GetCharPtr,
  GetSize,
  GetSimpleType,
  GetElementAt,
  SetElementAt,
  GetNext,
  HasNext,
  ToArray,
  GetProperty,
  GetPropertyAt,
  GetPropertyCount,
  SetProperty,
  GetObjectPath,
  SetPropertyFilter,
  SetObjectPath,
  SetPropertyWithOrigin,
  SetNameSpace,
  GetNameSpace,
  SetHostname,
  GetHostname,
  SetClassName,
  GetClassName,
  AddKey,
  GetKey,
  GetKeyAt,
  GetKeyCount,
  SetNameSpaceFromObjectPath,
  SetHostAndNameSpaceFromObjectPath,
  GetQualifier,
  PathToString,
  AddArg,
  GetArg,
  GetArgAt,
  GetArgCount,
  GetEntry,
  GetEntryAt,
  GetEntryCount,
  AddEntry,
  ReturnData,
  ReturnInstance,
  ReturnObjectPath,
  ReturnDone,
  ReturnError,
  GetBinaryFormat,
  GetStringFormat,
  IsInterval,
  Count  ///< how many there are; no service
};

inline constexpr std::size_t serviceCount = static_cast<std::size_t>(Service::Count);

struct NamedService {
  Service service;
  std::string_view name;
};

/// In the order of the enumeration.
inline constexpr std::array<NamedService, serviceCount> namedServices = {{
    {Service::PrepareAttachThread, "prepareAttachThread"},
    {Service::AttachThread, "attachThread"},
    {Service::DetachThread, "detachThread"},
    {Service::DeliverIndication, "deliverIndication"},
    {Service::EnumerateInstanceNames, "enumerateInstanceNames"},
    {Service::GetInstance, "getInstance"},
    {Service::CreateInstance, "createInstance"},
    {Service::ModifyInstance, "modifyInstance"},
    {Service::DeleteInstance, "deleteInstance"},
    {Service::ExecQuery, "execQuery"},
    {Service::EnumerateInstances, "enumerateInstances"},
    {Service::Associators, "associators"},
    {Service::AssociatorNames, "associatorNames"},
    {Service::References, "references"},
    {Service::ReferenceNames, "referenceNames"},
    {Service::InvokeMethod, "invokeMethod"},
    {Service::BrokerSetProperty, "broker.setProperty"},
    {Service::BrokerGetProperty, "broker.getProperty"},
    {Service::NewInstance, "newInstance"},
    {Service::NewObjectPath, "newObjectPath"},
    {Service::NewArgs, "newArgs"},
    {Service::NewString, "newString"},
    {Service::NewArray, "newArray"},
    {Service::NewDateTime, "newDateTime"},
    {Service::NewDateTimeFromBinary, "newDateTimeFromBinary"},
    {Service::NewDateTimeFromChars, "newDateTimeFromChars"},
    {Service::NewSelectExp, "newSelectExp"},
    {Service::ClassPathIsA, "classPathIsA"},
    {Service::ToString, "toString"},
    {Service::IsOfType, "isOfType"},
    {Service::GetType, "getType"},
    {Service::GetMessage, "getMessage"},
    {Service::LogMessage, "logMessage"},
    {Service::Trace, "trace"},
    {Service::NewError, "newCMPIError"},
    {Service::OpenMessageFile, "openMessageFile"},
    {Service::CloseMessageFile, "closeMessageFile"},
    {Service::Clone, "clone"},
    {Service::Release, "release"},
    {Service::GetCharPtr, "getCharPtr"},
    {Service::GetSize, "getSize"},
    {Service::GetSimpleType, "getSimpleType"},
    {Service::GetElementAt, "getElementAt"},
    {Service::SetElementAt, "setElementAt"},
    {Service::GetNext, "getNext"},
    {Service::HasNext, "hasNext"},
    {Service::ToArray, "toArray"},
    {Service::GetProperty, "getProperty"},
    {Service::GetPropertyAt, "getPropertyAt"},
    {Service::GetPropertyCount, "getPropertyCount"},
    {Service::SetProperty, "setProperty"},
    {Service::GetObjectPath, "getObjectPath"},
    {Service::SetPropertyFilter, "setPropertyFilter"},
    {Service::SetObjectPath, "setObjectPath"},
    {Service::SetPropertyWithOrigin, "setPropertyWithOrigin"},
    {Service::SetNameSpace, "setNameSpace"},
    {Service::GetNameSpace, "getNameSpace"},
    {Service::SetHostname, "setHostname"},
    {Service::GetHostname, "getHostname"},
    {Service::SetClassName, "setClassName"},
    {Service::GetClassName, "getClassName"},
    {Service::AddKey, "addKey"},
    {Service::GetKey, "getKey"},
    {Service::GetKeyAt, "getKeyAt"},
    {Service::GetKeyCount, "getKeyCount"},
    {Service::SetNameSpaceFromObjectPath, "setNameSpaceFromObjectPath"},
    {Service::SetHostAndNameSpaceFromObjectPath, "setHostAndNameSpaceFromObjectPath"},
    {Service::GetQualifier, "getQualifier"},
    {Service::PathToString, "path.toString"},
    {Service::AddArg, "addArg"},
    {Service::GetArg, "getArg"},
    {Service::GetArgAt, "getArgAt"},
    {Service::GetArgCount, "getArgCount"},
    {Service::GetEntry, "getEntry"},
    {Service::GetEntryAt, "getEntryAt"},
    {Service::GetEntryCount, "getEntryCount"},
    {Service::AddEntry, "addEntry"},
    {Service::ReturnData, "returnData"},
    {Service::ReturnInstance, "returnInstance"},
    {Service::ReturnObjectPath, "returnObjectPath"},
    {Service::ReturnDone, "returnDone"},
    {Service::ReturnError, "returnError"},
    {Service::GetBinaryFormat, "getBinaryFormat"},
    {Service::GetStringFormat, "getStringFormat"},
    {Service::IsInterval, "isInterval"},
}};

static_assert([] {
  for (std::size_t i = 0; i < serviceCount; ++i) {
    if (namedServices[i].service != static_cast<Service>(i)) {
      return false;
    }
  }
  return true;
}());

constexpr std::string_view serviceName(Service service) {
  return namedServices[static_cast<std::size_t>(service)].name;
}

/// The service of this exact name; nothing if there is none.
constexpr std::optional<Service> findService(std::string_view name) {
  for (const NamedService& each : namedServices) {
    if (each.name == name) {
      return each.service;
    }
  }
  return std::nullopt;
}

}  // namespace Corvcim

#endif
