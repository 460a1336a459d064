// Member names and types in the interface's order: the broker.

#include <cmpift.h>

#include <type_traits>

#include "tests/cmpi/Interface.h"

namespace {

template <class Actual, class Expected>
constexpr Member member(const char* name, std::size_t offset) {
  return {name, offset, sizeof(Expected), alignof(Expected), std::is_same_v<Actual, Expected>};
}

constexpr Member membersBrokerFT[] = {
    member<decltype(CMPIBrokerFT::brokerCapabilities), unsigned int>("brokerCapabilities",
                                                                     offsetof(CMPIBrokerFT, brokerCapabilities)),
    member<decltype(CMPIBrokerFT::brokerVersion), CMPIVersion>("brokerVersion", offsetof(CMPIBrokerFT, brokerVersion)),
    member<decltype(CMPIBrokerFT::brokerName), const char*>("brokerName", offsetof(CMPIBrokerFT, brokerName)),
    member<decltype(CMPIBrokerFT::prepareAttachThread), CMPIContext* (*)(const CMPIBroker*, const CMPIContext*)>(
        "prepareAttachThread", offsetof(CMPIBrokerFT, prepareAttachThread)),
    member<decltype(CMPIBrokerFT::attachThread), CMPIStatus (*)(const CMPIBroker*, const CMPIContext*)>(
        "attachThread", offsetof(CMPIBrokerFT, attachThread)),
    member<decltype(CMPIBrokerFT::detachThread), CMPIStatus (*)(const CMPIBroker*, const CMPIContext*)>(
        "detachThread", offsetof(CMPIBrokerFT, detachThread)),
    member<decltype(CMPIBrokerFT::deliverIndication),
           CMPIStatus (*)(const CMPIBroker*, const CMPIContext*, const char*, const CMPIInstance*)>(
        "deliverIndication", offsetof(CMPIBrokerFT, deliverIndication)),
    member<decltype(CMPIBrokerFT::enumerateInstanceNames),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, CMPIStatus*)>(
        "enumerateInstanceNames", offsetof(CMPIBrokerFT, enumerateInstanceNames)),
    member<decltype(CMPIBrokerFT::getInstance),
           CMPIInstance* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**, CMPIStatus*)>(
        "getInstance", offsetof(CMPIBrokerFT, getInstance)),
    member<decltype(CMPIBrokerFT::createInstance),
           CMPIObjectPath* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                               CMPIStatus*)>("createInstance", offsetof(CMPIBrokerFT, createInstance)),
    member<decltype(CMPIBrokerFT::modifyInstance),
           CMPIStatus (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const CMPIInstance*,
                          const char**)>("modifyInstance", offsetof(CMPIBrokerFT, modifyInstance)),
    member<decltype(CMPIBrokerFT::deleteInstance),
           CMPIStatus (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*)>(
        "deleteInstance", offsetof(CMPIBrokerFT, deleteInstance)),
    member<decltype(CMPIBrokerFT::execQuery),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                CMPIStatus*)>("execQuery", offsetof(CMPIBrokerFT, execQuery)),
    member<decltype(CMPIBrokerFT::enumerateInstances),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**,
                                CMPIStatus*)>("enumerateInstances", offsetof(CMPIBrokerFT, enumerateInstances)),
    member<decltype(CMPIBrokerFT::associators),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                const char*, const char*, const char**, CMPIStatus*)>(
        "associators", offsetof(CMPIBrokerFT, associators)),
    member<decltype(CMPIBrokerFT::associatorNames),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                const char*, const char*, CMPIStatus*)>("associatorNames",
                                                                        offsetof(CMPIBrokerFT, associatorNames)),
    member<decltype(CMPIBrokerFT::references),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                const char**, CMPIStatus*)>("references", offsetof(CMPIBrokerFT, references)),
    member<decltype(CMPIBrokerFT::referenceNames),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                CMPIStatus*)>("referenceNames", offsetof(CMPIBrokerFT, referenceNames)),
    member<decltype(CMPIBrokerFT::invokeMethod),
           CMPIData (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const CMPIArgs*,
                        CMPIArgs*, CMPIStatus*)>("invokeMethod", offsetof(CMPIBrokerFT, invokeMethod)),
    member<decltype(CMPIBrokerFT::setProperty),
           CMPIStatus (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const CMPIValue*,
                          CMPIType)>("setProperty", offsetof(CMPIBrokerFT, setProperty)),
    member<decltype(CMPIBrokerFT::getProperty),
           CMPIData (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, CMPIStatus*)>(
        "getProperty", offsetof(CMPIBrokerFT, getProperty)),
    member<decltype(CMPIBrokerFT::enumerateInstancesFiltered),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char**, const char*,
                                const char*, CMPIStatus*)>("enumerateInstancesFiltered",
                                                           offsetof(CMPIBrokerFT, enumerateInstancesFiltered)),
    member<decltype(CMPIBrokerFT::associatorsFiltered),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                const char*, const char*, const char**, const char*, const char*, CMPIStatus*)>(
        "associatorsFiltered", offsetof(CMPIBrokerFT, associatorsFiltered)),
    member<decltype(CMPIBrokerFT::referencesFiltered),
           CMPIEnumeration* (*)(const CMPIBroker*, const CMPIContext*, const CMPIObjectPath*, const char*, const char*,
                                const char**, const char*, const char*, CMPIStatus*)>(
        "referencesFiltered", offsetof(CMPIBrokerFT, referencesFiltered)),
};

constexpr Member membersBrokerEncFT[] = {
    member<decltype(CMPIBrokerEncFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIBrokerEncFT, ftVersion)),
    member<decltype(CMPIBrokerEncFT::newInstance),
           CMPIInstance* (*)(const CMPIBroker*, const CMPIObjectPath*, CMPIStatus*)>(
        "newInstance", offsetof(CMPIBrokerEncFT, newInstance)),
    member<decltype(CMPIBrokerEncFT::newObjectPath),
           CMPIObjectPath* (*)(const CMPIBroker*, const char*, const char*, CMPIStatus*)>(
        "newObjectPath", offsetof(CMPIBrokerEncFT, newObjectPath)),
    member<decltype(CMPIBrokerEncFT::newArgs), CMPIArgs* (*)(const CMPIBroker*, CMPIStatus*)>(
        "newArgs", offsetof(CMPIBrokerEncFT, newArgs)),
    member<decltype(CMPIBrokerEncFT::newString), CMPIString* (*)(const CMPIBroker*, const char*, CMPIStatus*)>(
        "newString", offsetof(CMPIBrokerEncFT, newString)),
    member<decltype(CMPIBrokerEncFT::newArray), CMPIArray* (*)(const CMPIBroker*, CMPICount, CMPIType, CMPIStatus*)>(
        "newArray", offsetof(CMPIBrokerEncFT, newArray)),
    member<decltype(CMPIBrokerEncFT::newDateTime), CMPIDateTime* (*)(const CMPIBroker*, CMPIStatus*)>(
        "newDateTime", offsetof(CMPIBrokerEncFT, newDateTime)),
    member<decltype(CMPIBrokerEncFT::newDateTimeFromBinary),
           CMPIDateTime* (*)(const CMPIBroker*, CMPIUint64, CMPIBoolean, CMPIStatus*)>(
        "newDateTimeFromBinary", offsetof(CMPIBrokerEncFT, newDateTimeFromBinary)),
    member<decltype(CMPIBrokerEncFT::newDateTimeFromChars),
           CMPIDateTime* (*)(const CMPIBroker*, const char*, CMPIStatus*)>(
        "newDateTimeFromChars", offsetof(CMPIBrokerEncFT, newDateTimeFromChars)),
    member<decltype(CMPIBrokerEncFT::newSelectExp),
           CMPISelectExp* (*)(const CMPIBroker*, const char*, const char*, CMPIArray**, CMPIStatus*)>(
        "newSelectExp", offsetof(CMPIBrokerEncFT, newSelectExp)),
    member<decltype(CMPIBrokerEncFT::classPathIsA),
           CMPIBoolean (*)(const CMPIBroker*, const CMPIObjectPath*, const char*, CMPIStatus*)>(
        "classPathIsA", offsetof(CMPIBrokerEncFT, classPathIsA)),
    member<decltype(CMPIBrokerEncFT::toString), CMPIString* (*)(const CMPIBroker*, const void*, CMPIStatus*)>(
        "toString", offsetof(CMPIBrokerEncFT, toString)),
    member<decltype(CMPIBrokerEncFT::isOfType),
           CMPIBoolean (*)(const CMPIBroker*, const void*, const char*, CMPIStatus*)>(
        "isOfType", offsetof(CMPIBrokerEncFT, isOfType)),
    member<decltype(CMPIBrokerEncFT::getType), CMPIString* (*)(const CMPIBroker*, const void*, CMPIStatus*)>(
        "getType", offsetof(CMPIBrokerEncFT, getType)),
    member<decltype(CMPIBrokerEncFT::getMessage),
           CMPIString* (*)(const CMPIBroker*, const char*, const char*, CMPIStatus*, CMPICount, ...)>(
        "getMessage", offsetof(CMPIBrokerEncFT, getMessage)),
    member<decltype(CMPIBrokerEncFT::logMessage),
           CMPIStatus (*)(const CMPIBroker*, CMPISeverity, const char*, const char*, const CMPIString*)>(
        "logMessage", offsetof(CMPIBrokerEncFT, logMessage)),
    member<decltype(CMPIBrokerEncFT::trace),
           CMPIStatus (*)(const CMPIBroker*, CMPILevel, const char*, const char*, const CMPIString*)>(
        "trace", offsetof(CMPIBrokerEncFT, trace)),
    member<decltype(CMPIBrokerEncFT::newCMPIError),
           CMPIError* (*)(const CMPIBroker*, const char*, const char*, const char*, const CMPIErrorSeverity,
                          const CMPIErrorProbableCause, const CMPIrc, CMPIStatus*)>(
        "newCMPIError", offsetof(CMPIBrokerEncFT, newCMPIError)),
    member<decltype(CMPIBrokerEncFT::openMessageFile),
           CMPIStatus (*)(const CMPIBroker*, const char*, CMPIMsgFileHandle*)>(
        "openMessageFile", offsetof(CMPIBrokerEncFT, openMessageFile)),
    member<decltype(CMPIBrokerEncFT::closeMessageFile), CMPIStatus (*)(const CMPIBroker*, const CMPIMsgFileHandle)>(
        "closeMessageFile", offsetof(CMPIBrokerEncFT, closeMessageFile)),
    member<decltype(CMPIBrokerEncFT::getMessage2),
           CMPIString* (*)(const CMPIBroker*, const char*, const CMPIMsgFileHandle, const char*, CMPIStatus*, CMPICount,
                           ...)>("getMessage2", offsetof(CMPIBrokerEncFT, getMessage2)),
};

constexpr Member membersBrokerExtFT[] = {
    member<decltype(CMPIBrokerExtFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIBrokerExtFT, ftVersion)),
    member<decltype(CMPIBrokerExtFT::resolveFileName), char* (*)(const char*)>(
        "resolveFileName", offsetof(CMPIBrokerExtFT, resolveFileName)),
    member<decltype(CMPIBrokerExtFT::newThread), void* (*)(CMPIThreadFunc, void*, int)>(
        "newThread", offsetof(CMPIBrokerExtFT, newThread)),
    member<decltype(CMPIBrokerExtFT::joinThread), int (*)(void*, void**)>("joinThread",
                                                                          offsetof(CMPIBrokerExtFT, joinThread)),
    member<decltype(CMPIBrokerExtFT::exitThread), int (*)(void*)>("exitThread", offsetof(CMPIBrokerExtFT, exitThread)),
    member<decltype(CMPIBrokerExtFT::cancelThread), int (*)(void*)>("cancelThread",
                                                                    offsetof(CMPIBrokerExtFT, cancelThread)),
    member<decltype(CMPIBrokerExtFT::threadSleep), int (*)(CMPIUint32)>("threadSleep",
                                                                        offsetof(CMPIBrokerExtFT, threadSleep)),
    member<decltype(CMPIBrokerExtFT::threadOnce), int (*)(int*, CMPIThreadOnceFunc)>(
        "threadOnce", offsetof(CMPIBrokerExtFT, threadOnce)),
    member<decltype(CMPIBrokerExtFT::createThreadKey), int (*)(unsigned int*, CMPIThreadKeyCleanupFunc)>(
        "createThreadKey", offsetof(CMPIBrokerExtFT, createThreadKey)),
    member<decltype(CMPIBrokerExtFT::destroyThreadKey), int (*)(unsigned int)>(
        "destroyThreadKey", offsetof(CMPIBrokerExtFT, destroyThreadKey)),
    member<decltype(CMPIBrokerExtFT::getThreadSpecific), void* (*)(unsigned int)>(
        "getThreadSpecific", offsetof(CMPIBrokerExtFT, getThreadSpecific)),
    member<decltype(CMPIBrokerExtFT::setThreadSpecific), int (*)(unsigned int, void*)>(
        "setThreadSpecific", offsetof(CMPIBrokerExtFT, setThreadSpecific)),
    member<decltype(CMPIBrokerExtFT::newMutex), void* (*)(int)>("newMutex", offsetof(CMPIBrokerExtFT, newMutex)),
    member<decltype(CMPIBrokerExtFT::destroyMutex), void (*)(void*)>("destroyMutex",
                                                                     offsetof(CMPIBrokerExtFT, destroyMutex)),
    member<decltype(CMPIBrokerExtFT::lockMutex), void (*)(void*)>("lockMutex", offsetof(CMPIBrokerExtFT, lockMutex)),
    member<decltype(CMPIBrokerExtFT::unlockMutex), void (*)(void*)>("unlockMutex",
                                                                    offsetof(CMPIBrokerExtFT, unlockMutex)),
    member<decltype(CMPIBrokerExtFT::newCondition), void* (*)(int)>("newCondition",
                                                                    offsetof(CMPIBrokerExtFT, newCondition)),
    member<decltype(CMPIBrokerExtFT::destroyCondition), void (*)(void*)>("destroyCondition",
                                                                         offsetof(CMPIBrokerExtFT, destroyCondition)),
    member<decltype(CMPIBrokerExtFT::condWait), int (*)(void*, void*)>("condWait", offsetof(CMPIBrokerExtFT, condWait)),
    member<decltype(CMPIBrokerExtFT::timedCondWait), int (*)(void*, void*, struct timespec*)>(
        "timedCondWait", offsetof(CMPIBrokerExtFT, timedCondWait)),
    member<decltype(CMPIBrokerExtFT::signalCondition), int (*)(void*)>("signalCondition",
                                                                       offsetof(CMPIBrokerExtFT, signalCondition)),
};

constexpr Member membersBrokerMemFT[] = {
    member<decltype(CMPIBrokerMemFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIBrokerMemFT, ftVersion)),
    member<decltype(CMPIBrokerMemFT::mark), CMPIGcStat* (*)(const CMPIBroker*, CMPIStatus*)>(
        "mark", offsetof(CMPIBrokerMemFT, mark)),
    member<decltype(CMPIBrokerMemFT::release), CMPIStatus (*)(const CMPIBroker*, const CMPIGcStat*)>(
        "release", offsetof(CMPIBrokerMemFT, release)),
    member<decltype(CMPIBrokerMemFT::cmpiMalloc), void* (*)(const CMPIBroker*, size_t)>(
        "cmpiMalloc", offsetof(CMPIBrokerMemFT, cmpiMalloc)),
    member<decltype(CMPIBrokerMemFT::cmpiCalloc), void* (*)(const CMPIBroker*, size_t, size_t)>(
        "cmpiCalloc", offsetof(CMPIBrokerMemFT, cmpiCalloc)),
    member<decltype(CMPIBrokerMemFT::cmpiRealloc), void* (*)(const CMPIBroker*, void*, size_t)>(
        "cmpiRealloc", offsetof(CMPIBrokerMemFT, cmpiRealloc)),
    member<decltype(CMPIBrokerMemFT::cmpiStrDup), char* (*)(const CMPIBroker*, const char*)>(
        "cmpiStrDup", offsetof(CMPIBrokerMemFT, cmpiStrDup)),
    member<decltype(CMPIBrokerMemFT::cmpiFree), void (*)(const CMPIBroker*, void*)>(
        "cmpiFree", offsetof(CMPIBrokerMemFT, cmpiFree)),
    member<decltype(CMPIBrokerMemFT::freeInstance), void (*)(const CMPIBroker*, CMPIInstance*)>(
        "freeInstance", offsetof(CMPIBrokerMemFT, freeInstance)),
    member<decltype(CMPIBrokerMemFT::freeObjectPath), void (*)(const CMPIBroker*, CMPIObjectPath*)>(
        "freeObjectPath", offsetof(CMPIBrokerMemFT, freeObjectPath)),
    member<decltype(CMPIBrokerMemFT::freeArgs), void (*)(const CMPIBroker*, CMPIArgs*)>(
        "freeArgs", offsetof(CMPIBrokerMemFT, freeArgs)),
    member<decltype(CMPIBrokerMemFT::freeString), void (*)(const CMPIBroker*, CMPIString*)>(
        "freeString", offsetof(CMPIBrokerMemFT, freeString)),
    member<decltype(CMPIBrokerMemFT::freeArray), void (*)(const CMPIBroker*, CMPIArray*)>(
        "freeArray", offsetof(CMPIBrokerMemFT, freeArray)),
    member<decltype(CMPIBrokerMemFT::freeDateTime), void (*)(const CMPIBroker*, CMPIDateTime*)>(
        "freeDateTime", offsetof(CMPIBrokerMemFT, freeDateTime)),
    member<decltype(CMPIBrokerMemFT::freeSelectExp), void (*)(const CMPIBroker*, CMPISelectExp*)>(
        "freeSelectExp", offsetof(CMPIBrokerMemFT, freeSelectExp)),
};

constexpr Record records[] = {
    {"CMPIBrokerFT", false, sizeof(CMPIBrokerFT), alignof(CMPIBrokerFT), membersBrokerFT},
    {"CMPIBrokerEncFT", false, sizeof(CMPIBrokerEncFT), alignof(CMPIBrokerEncFT), membersBrokerEncFT},
    {"CMPIBrokerExtFT", false, sizeof(CMPIBrokerExtFT), alignof(CMPIBrokerExtFT), membersBrokerExtFT},
    {"CMPIBrokerMemFT", false, sizeof(CMPIBrokerMemFT), alignof(CMPIBrokerMemFT), membersBrokerMemFT},
};

}  // namespace

std::span<const Record> brokerTables() {
  return records;
}
