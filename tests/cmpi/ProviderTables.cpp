// Member names and types in the interface's order: management interfaces.

#include <cmpift.h>

#include <type_traits>

#include "tests/cmpi/Interface.h"

namespace {

template <class Actual, class Expected>
constexpr Member member(const char* name, std::size_t offset) {
  return {name, offset, sizeof(Expected), alignof(Expected), std::is_same_v<Actual, Expected>};
}

constexpr Member membersInstanceMIFT[] = {
    member<decltype(CMPIInstanceMIFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIInstanceMIFT, ftVersion)),
    member<decltype(CMPIInstanceMIFT::miVersion), int>("miVersion", offsetof(CMPIInstanceMIFT, miVersion)),
    member<decltype(CMPIInstanceMIFT::miName), const char*>("miName", offsetof(CMPIInstanceMIFT, miName)),
    member<decltype(CMPIInstanceMIFT::cleanup), CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, CMPIBoolean)>(
        "cleanup", offsetof(CMPIInstanceMIFT, cleanup)),
    member<decltype(CMPIInstanceMIFT::enumerateInstanceNames),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*)>(
        "enumerateInstanceNames", offsetof(CMPIInstanceMIFT, enumerateInstanceNames)),
    member<decltype(CMPIInstanceMIFT::enumerateInstances),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char**)>(
        "enumerateInstances", offsetof(CMPIInstanceMIFT, enumerateInstances)),
    member<decltype(CMPIInstanceMIFT::getInstance),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char**)>(
        "getInstance", offsetof(CMPIInstanceMIFT, getInstance)),
    member<decltype(CMPIInstanceMIFT::createInstance),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                          const CMPIInstance*)>("createInstance", offsetof(CMPIInstanceMIFT, createInstance)),
    member<decltype(CMPIInstanceMIFT::modifyInstance),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*,
                          const CMPIInstance*, const char**)>("modifyInstance",
                                                              offsetof(CMPIInstanceMIFT, modifyInstance)),
    member<decltype(CMPIInstanceMIFT::deleteInstance),
           CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*)>(
        "deleteInstance", offsetof(CMPIInstanceMIFT, deleteInstance)),
    member<decltype(CMPIInstanceMIFT::execQuery), CMPIStatus (*)(CMPIInstanceMI*, const CMPIContext*, const CMPIResult*,
                                                                 const CMPIObjectPath*, const char*, const char*)>(
        "execQuery", offsetof(CMPIInstanceMIFT, execQuery)),
};

constexpr Member membersAssociationMIFT[] = {
    member<decltype(CMPIAssociationMIFT::ftVersion), CMPIVersion>("ftVersion",
                                                                  offsetof(CMPIAssociationMIFT, ftVersion)),
    member<decltype(CMPIAssociationMIFT::miVersion), int>("miVersion", offsetof(CMPIAssociationMIFT, miVersion)),
    member<decltype(CMPIAssociationMIFT::miName), const char*>("miName", offsetof(CMPIAssociationMIFT, miName)),
    member<decltype(CMPIAssociationMIFT::cleanup), CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, CMPIBoolean)>(
        "cleanup", offsetof(CMPIAssociationMIFT, cleanup)),
    member<decltype(CMPIAssociationMIFT::associators),
           CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const char*, const char*, const char*, const char**)>(
        "associators", offsetof(CMPIAssociationMIFT, associators)),
    member<decltype(CMPIAssociationMIFT::associatorNames),
           CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const char*, const char*, const char*)>("associatorNames",
                                                                  offsetof(CMPIAssociationMIFT, associatorNames)),
    member<decltype(CMPIAssociationMIFT::references),
           CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const char*, const char**)>("references", offsetof(CMPIAssociationMIFT, references)),
    member<decltype(CMPIAssociationMIFT::referenceNames),
           CMPIStatus (*)(CMPIAssociationMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const char*)>("referenceNames", offsetof(CMPIAssociationMIFT, referenceNames)),
};

constexpr Member membersMethodMIFT[] = {
    member<decltype(CMPIMethodMIFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIMethodMIFT, ftVersion)),
    member<decltype(CMPIMethodMIFT::miVersion), int>("miVersion", offsetof(CMPIMethodMIFT, miVersion)),
    member<decltype(CMPIMethodMIFT::miName), const char*>("miName", offsetof(CMPIMethodMIFT, miName)),
    member<decltype(CMPIMethodMIFT::cleanup), CMPIStatus (*)(CMPIMethodMI*, const CMPIContext*, CMPIBoolean)>(
        "cleanup", offsetof(CMPIMethodMIFT, cleanup)),
    member<decltype(CMPIMethodMIFT::invokeMethod),
           CMPIStatus (*)(CMPIMethodMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const CMPIArgs*, CMPIArgs*)>("invokeMethod", offsetof(CMPIMethodMIFT, invokeMethod)),
};

constexpr Member membersPropertyMIFT[] = {
    member<decltype(CMPIPropertyMIFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIPropertyMIFT, ftVersion)),
    member<decltype(CMPIPropertyMIFT::miVersion), int>("miVersion", offsetof(CMPIPropertyMIFT, miVersion)),
    member<decltype(CMPIPropertyMIFT::miName), const char*>("miName", offsetof(CMPIPropertyMIFT, miName)),
    member<decltype(CMPIPropertyMIFT::cleanup), CMPIStatus (*)(CMPIPropertyMI*, const CMPIContext*, CMPIBoolean)>(
        "cleanup", offsetof(CMPIPropertyMIFT, cleanup)),
    member<decltype(CMPIPropertyMIFT::setProperty),
           CMPIStatus (*)(CMPIPropertyMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*,
                          const CMPIData)>("setProperty", offsetof(CMPIPropertyMIFT, setProperty)),
    member<decltype(CMPIPropertyMIFT::getProperty),
           CMPIStatus (*)(CMPIPropertyMI*, const CMPIContext*, const CMPIResult*, const CMPIObjectPath*, const char*)>(
        "getProperty", offsetof(CMPIPropertyMIFT, getProperty)),
    member<decltype(CMPIPropertyMIFT::setPropertyWithOrigin),
           CMPIStatus (*)(CMPIPropertyMI*, const CMPIContext*, const CMPIResult*, CMPIObjectPath*, const char*,
                          const CMPIData, const char*)>("setPropertyWithOrigin",
                                                        offsetof(CMPIPropertyMIFT, setPropertyWithOrigin)),
};

constexpr Member membersIndicationMIFT[] = {
    member<decltype(CMPIIndicationMIFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIIndicationMIFT, ftVersion)),
    member<decltype(CMPIIndicationMIFT::miVersion), int>("miVersion", offsetof(CMPIIndicationMIFT, miVersion)),
    member<decltype(CMPIIndicationMIFT::miName), const char*>("miName", offsetof(CMPIIndicationMIFT, miName)),
    member<decltype(CMPIIndicationMIFT::cleanup), CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, CMPIBoolean)>(
        "cleanup", offsetof(CMPIIndicationMIFT, cleanup)),
    member<decltype(CMPIIndicationMIFT::authorizeFilter),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPISelectExp*, const char*,
                          const CMPIObjectPath*, const char*)>("authorizeFilter",
                                                               offsetof(CMPIIndicationMIFT, authorizeFilter)),
    member<decltype(CMPIIndicationMIFT::mustPoll),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPIResult*, const CMPISelectExp*, const char*,
                          const CMPIObjectPath*)>("mustPoll", offsetof(CMPIIndicationMIFT, mustPoll)),
    member<decltype(CMPIIndicationMIFT::activateFilter),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPISelectExp*, const char*,
                          const CMPIObjectPath*, CMPIBoolean)>("activateFilter",
                                                               offsetof(CMPIIndicationMIFT, activateFilter)),
    member<decltype(CMPIIndicationMIFT::deActivateFilter),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPISelectExp*, const char*,
                          const CMPIObjectPath*, CMPIBoolean)>("deActivateFilter",
                                                               offsetof(CMPIIndicationMIFT, deActivateFilter)),
    member<decltype(CMPIIndicationMIFT::enableIndications), CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*)>(
        "enableIndications", offsetof(CMPIIndicationMIFT, enableIndications)),
    member<decltype(CMPIIndicationMIFT::disableIndications), CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*)>(
        "disableIndications", offsetof(CMPIIndicationMIFT, disableIndications)),
    member<decltype(CMPIIndicationMIFT::authorizeFilterCollection),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPIInstance*)>(
        "authorizeFilterCollection", offsetof(CMPIIndicationMIFT, authorizeFilterCollection)),
    member<decltype(CMPIIndicationMIFT::activateFilterCollection),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPIInstance*, CMPIBoolean)>(
        "activateFilterCollection", offsetof(CMPIIndicationMIFT, activateFilterCollection)),
    member<decltype(CMPIIndicationMIFT::deActivateFilterCollection),
           CMPIStatus (*)(CMPIIndicationMI*, const CMPIContext*, const CMPIInstance*, CMPIBoolean)>(
        "deActivateFilterCollection", offsetof(CMPIIndicationMIFT, deActivateFilterCollection)),
};

constexpr Record records[] = {
    {"CMPIInstanceMIFT", false, sizeof(CMPIInstanceMIFT), alignof(CMPIInstanceMIFT), membersInstanceMIFT},
    {"CMPIAssociationMIFT", false, sizeof(CMPIAssociationMIFT), alignof(CMPIAssociationMIFT), membersAssociationMIFT},
    {"CMPIMethodMIFT", false, sizeof(CMPIMethodMIFT), alignof(CMPIMethodMIFT), membersMethodMIFT},
    {"CMPIPropertyMIFT", false, sizeof(CMPIPropertyMIFT), alignof(CMPIPropertyMIFT), membersPropertyMIFT},
    {"CMPIIndicationMIFT", false, sizeof(CMPIIndicationMIFT), alignof(CMPIIndicationMIFT), membersIndicationMIFT},
};

}  // namespace

std::span<const Record> providerTables() {
  return records;
}
