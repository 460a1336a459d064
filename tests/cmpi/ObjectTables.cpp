// Member names and types in the interface's order: operations on objects.

#include <cmpift.h>

#include <type_traits>

#include "tests/cmpi/Interface.h"

namespace {

template <class Actual, class Expected>
constexpr Member member(const char* name, std::size_t offset) {
  return {name, offset, sizeof(Expected), alignof(Expected), std::is_same_v<Actual, Expected>};
}

constexpr Member membersContextFT[] = {
    member<decltype(CMPIContextFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIContextFT, ftVersion)),
    member<decltype(CMPIContextFT::release), CMPIStatus (*)(CMPIContext*)>("release", offsetof(CMPIContextFT, release)),
    member<decltype(CMPIContextFT::clone), CMPIContext* (*)(const CMPIContext*, CMPIStatus*)>(
        "clone", offsetof(CMPIContextFT, clone)),
    member<decltype(CMPIContextFT::getEntry), CMPIData (*)(const CMPIContext*, const char*, CMPIStatus*)>(
        "getEntry", offsetof(CMPIContextFT, getEntry)),
    member<decltype(CMPIContextFT::getEntryAt), CMPIData (*)(const CMPIContext*, CMPICount, CMPIString**, CMPIStatus*)>(
        "getEntryAt", offsetof(CMPIContextFT, getEntryAt)),
    member<decltype(CMPIContextFT::getEntryCount), CMPICount (*)(const CMPIContext*, CMPIStatus*)>(
        "getEntryCount", offsetof(CMPIContextFT, getEntryCount)),
    member<decltype(CMPIContextFT::addEntry),
           CMPIStatus (*)(const CMPIContext*, const char*, const CMPIValue*, const CMPIType)>(
        "addEntry", offsetof(CMPIContextFT, addEntry)),
};

constexpr Member membersResultFT[] = {
    member<decltype(CMPIResultFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIResultFT, ftVersion)),
    member<decltype(CMPIResultFT::release), CMPIStatus (*)(CMPIResult*)>("release", offsetof(CMPIResultFT, release)),
    member<decltype(CMPIResultFT::clone), CMPIResult* (*)(const CMPIResult*, CMPIStatus*)>(
        "clone", offsetof(CMPIResultFT, clone)),
    member<decltype(CMPIResultFT::returnData), CMPIStatus (*)(const CMPIResult*, const CMPIValue*, const CMPIType)>(
        "returnData", offsetof(CMPIResultFT, returnData)),
    member<decltype(CMPIResultFT::returnInstance), CMPIStatus (*)(const CMPIResult*, const CMPIInstance*)>(
        "returnInstance", offsetof(CMPIResultFT, returnInstance)),
    member<decltype(CMPIResultFT::returnObjectPath), CMPIStatus (*)(const CMPIResult*, const CMPIObjectPath*)>(
        "returnObjectPath", offsetof(CMPIResultFT, returnObjectPath)),
    member<decltype(CMPIResultFT::returnDone), CMPIStatus (*)(const CMPIResult*)>("returnDone",
                                                                                  offsetof(CMPIResultFT, returnDone)),
    member<decltype(CMPIResultFT::returnError), CMPIStatus (*)(const CMPIResult*, const CMPIError*)>(
        "returnError", offsetof(CMPIResultFT, returnError)),
};

constexpr Member membersStringFT[] = {
    member<decltype(CMPIStringFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIStringFT, ftVersion)),
    member<decltype(CMPIStringFT::release), CMPIStatus (*)(CMPIString*)>("release", offsetof(CMPIStringFT, release)),
    member<decltype(CMPIStringFT::clone), CMPIString* (*)(const CMPIString*, CMPIStatus*)>(
        "clone", offsetof(CMPIStringFT, clone)),
    member<decltype(CMPIStringFT::getCharPtr), const char* (*)(const CMPIString*, CMPIStatus*)>(
        "getCharPtr", offsetof(CMPIStringFT, getCharPtr)),
};

constexpr Member membersArrayFT[] = {
    member<decltype(CMPIArrayFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIArrayFT, ftVersion)),
    member<decltype(CMPIArrayFT::release), CMPIStatus (*)(CMPIArray*)>("release", offsetof(CMPIArrayFT, release)),
    member<decltype(CMPIArrayFT::clone), CMPIArray* (*)(const CMPIArray*, CMPIStatus*)>("clone",
                                                                                        offsetof(CMPIArrayFT, clone)),
    member<decltype(CMPIArrayFT::getSize), CMPICount (*)(const CMPIArray*, CMPIStatus*)>(
        "getSize", offsetof(CMPIArrayFT, getSize)),
    member<decltype(CMPIArrayFT::getSimpleType), CMPIType (*)(const CMPIArray*, CMPIStatus*)>(
        "getSimpleType", offsetof(CMPIArrayFT, getSimpleType)),
    member<decltype(CMPIArrayFT::getElementAt), CMPIData (*)(const CMPIArray*, CMPICount, CMPIStatus*)>(
        "getElementAt", offsetof(CMPIArrayFT, getElementAt)),
    member<decltype(CMPIArrayFT::setElementAt),
           CMPIStatus (*)(const CMPIArray*, CMPICount, const CMPIValue*, CMPIType)>(
        "setElementAt", offsetof(CMPIArrayFT, setElementAt)),
};

constexpr Member membersEnumerationFT[] = {
    member<decltype(CMPIEnumerationFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIEnumerationFT, ftVersion)),
    member<decltype(CMPIEnumerationFT::release), CMPIStatus (*)(CMPIEnumeration*)>(
        "release", offsetof(CMPIEnumerationFT, release)),
    member<decltype(CMPIEnumerationFT::clone), CMPIEnumeration* (*)(const CMPIEnumeration*, CMPIStatus*)>(
        "clone", offsetof(CMPIEnumerationFT, clone)),
    member<decltype(CMPIEnumerationFT::getNext), CMPIData (*)(const CMPIEnumeration*, CMPIStatus*)>(
        "getNext", offsetof(CMPIEnumerationFT, getNext)),
    member<decltype(CMPIEnumerationFT::hasNext), CMPIBoolean (*)(const CMPIEnumeration*, CMPIStatus*)>(
        "hasNext", offsetof(CMPIEnumerationFT, hasNext)),
    member<decltype(CMPIEnumerationFT::toArray), CMPIArray* (*)(const CMPIEnumeration*, CMPIStatus*)>(
        "toArray", offsetof(CMPIEnumerationFT, toArray)),
};

constexpr Member membersInstanceFT[] = {
    member<decltype(CMPIInstanceFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIInstanceFT, ftVersion)),
    member<decltype(CMPIInstanceFT::release), CMPIStatus (*)(CMPIInstance*)>("release",
                                                                             offsetof(CMPIInstanceFT, release)),
    member<decltype(CMPIInstanceFT::clone), CMPIInstance* (*)(const CMPIInstance*, CMPIStatus*)>(
        "clone", offsetof(CMPIInstanceFT, clone)),
    member<decltype(CMPIInstanceFT::getProperty), CMPIData (*)(const CMPIInstance*, const char*, CMPIStatus*)>(
        "getProperty", offsetof(CMPIInstanceFT, getProperty)),
    member<decltype(CMPIInstanceFT::getPropertyAt),
           CMPIData (*)(const CMPIInstance*, CMPICount, CMPIString**, CMPIStatus*)>(
        "getPropertyAt", offsetof(CMPIInstanceFT, getPropertyAt)),
    member<decltype(CMPIInstanceFT::getPropertyCount), CMPICount (*)(const CMPIInstance*, CMPIStatus*)>(
        "getPropertyCount", offsetof(CMPIInstanceFT, getPropertyCount)),
    member<decltype(CMPIInstanceFT::setProperty),
           CMPIStatus (*)(const CMPIInstance*, const char*, const CMPIValue*, CMPIType)>(
        "setProperty", offsetof(CMPIInstanceFT, setProperty)),
    member<decltype(CMPIInstanceFT::getObjectPath), CMPIObjectPath* (*)(const CMPIInstance*, CMPIStatus*)>(
        "getObjectPath", offsetof(CMPIInstanceFT, getObjectPath)),
    member<decltype(CMPIInstanceFT::setPropertyFilter),
           CMPIStatus (*)(const CMPIInstance*, const char**, const char**)>(
        "setPropertyFilter", offsetof(CMPIInstanceFT, setPropertyFilter)),
    member<decltype(CMPIInstanceFT::setObjectPath), CMPIStatus (*)(const CMPIInstance*, const CMPIObjectPath*)>(
        "setObjectPath", offsetof(CMPIInstanceFT, setObjectPath)),
    member<decltype(CMPIInstanceFT::setPropertyWithOrigin),
           CMPIStatus (*)(const CMPIInstance*, const char*, const CMPIValue*, const CMPIType, const char*)>(
        "setPropertyWithOrigin", offsetof(CMPIInstanceFT, setPropertyWithOrigin)),
};

constexpr Member membersObjectPathFT[] = {
    member<decltype(CMPIObjectPathFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIObjectPathFT, ftVersion)),
    member<decltype(CMPIObjectPathFT::release), CMPIStatus (*)(CMPIObjectPath*)>("release",
                                                                                 offsetof(CMPIObjectPathFT, release)),
    member<decltype(CMPIObjectPathFT::clone), CMPIObjectPath* (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "clone", offsetof(CMPIObjectPathFT, clone)),
    member<decltype(CMPIObjectPathFT::setNameSpace), CMPIStatus (*)(const CMPIObjectPath*, const char*)>(
        "setNameSpace", offsetof(CMPIObjectPathFT, setNameSpace)),
    member<decltype(CMPIObjectPathFT::getNameSpace), CMPIString* (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "getNameSpace", offsetof(CMPIObjectPathFT, getNameSpace)),
    member<decltype(CMPIObjectPathFT::setHostname), CMPIStatus (*)(const CMPIObjectPath*, const char*)>(
        "setHostname", offsetof(CMPIObjectPathFT, setHostname)),
    member<decltype(CMPIObjectPathFT::getHostname), CMPIString* (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "getHostname", offsetof(CMPIObjectPathFT, getHostname)),
    member<decltype(CMPIObjectPathFT::setClassName), CMPIStatus (*)(const CMPIObjectPath*, const char*)>(
        "setClassName", offsetof(CMPIObjectPathFT, setClassName)),
    member<decltype(CMPIObjectPathFT::getClassName), CMPIString* (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "getClassName", offsetof(CMPIObjectPathFT, getClassName)),
    member<decltype(CMPIObjectPathFT::addKey),
           CMPIStatus (*)(const CMPIObjectPath*, const char*, const CMPIValue*, const CMPIType)>(
        "addKey", offsetof(CMPIObjectPathFT, addKey)),
    member<decltype(CMPIObjectPathFT::getKey), CMPIData (*)(const CMPIObjectPath*, const char*, CMPIStatus*)>(
        "getKey", offsetof(CMPIObjectPathFT, getKey)),
    member<decltype(CMPIObjectPathFT::getKeyAt),
           CMPIData (*)(const CMPIObjectPath*, CMPICount, CMPIString**, CMPIStatus*)>(
        "getKeyAt", offsetof(CMPIObjectPathFT, getKeyAt)),
    member<decltype(CMPIObjectPathFT::getKeyCount), CMPICount (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "getKeyCount", offsetof(CMPIObjectPathFT, getKeyCount)),
    member<decltype(CMPIObjectPathFT::setNameSpaceFromObjectPath),
           CMPIStatus (*)(const CMPIObjectPath*, const CMPIObjectPath*)>(
        "setNameSpaceFromObjectPath", offsetof(CMPIObjectPathFT, setNameSpaceFromObjectPath)),
    member<decltype(CMPIObjectPathFT::setHostAndNameSpaceFromObjectPath),
           CMPIStatus (*)(const CMPIObjectPath*, const CMPIObjectPath*)>(
        "setHostAndNameSpaceFromObjectPath", offsetof(CMPIObjectPathFT, setHostAndNameSpaceFromObjectPath)),
    member<decltype(CMPIObjectPathFT::getClassQualifier),
           CMPIData (*)(const CMPIObjectPath*, const char*, CMPIStatus*)>(
        "getClassQualifier", offsetof(CMPIObjectPathFT, getClassQualifier)),
    member<decltype(CMPIObjectPathFT::getPropertyQualifier),
           CMPIData (*)(const CMPIObjectPath*, const char*, const char*, CMPIStatus*)>(
        "getPropertyQualifier", offsetof(CMPIObjectPathFT, getPropertyQualifier)),
    member<decltype(CMPIObjectPathFT::getMethodQualifier),
           CMPIData (*)(const CMPIObjectPath*, const char*, const char*, CMPIStatus*)>(
        "getMethodQualifier", offsetof(CMPIObjectPathFT, getMethodQualifier)),
    member<decltype(CMPIObjectPathFT::getParameterQualifier),
           CMPIData (*)(const CMPIObjectPath*, const char*, const char*, const char*, CMPIStatus*)>(
        "getParameterQualifier", offsetof(CMPIObjectPathFT, getParameterQualifier)),
    member<decltype(CMPIObjectPathFT::toString), CMPIString* (*)(const CMPIObjectPath*, CMPIStatus*)>(
        "toString", offsetof(CMPIObjectPathFT, toString)),
};

constexpr Member membersArgsFT[] = {
    member<decltype(CMPIArgsFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIArgsFT, ftVersion)),
    member<decltype(CMPIArgsFT::release), CMPIStatus (*)(CMPIArgs*)>("release", offsetof(CMPIArgsFT, release)),
    member<decltype(CMPIArgsFT::clone), CMPIArgs* (*)(const CMPIArgs*, CMPIStatus*)>("clone",
                                                                                     offsetof(CMPIArgsFT, clone)),
    member<decltype(CMPIArgsFT::addArg), CMPIStatus (*)(const CMPIArgs*, const char*, const CMPIValue*,
                                                        const CMPIType)>("addArg", offsetof(CMPIArgsFT, addArg)),
    member<decltype(CMPIArgsFT::getArg), CMPIData (*)(const CMPIArgs*, const char*, CMPIStatus*)>(
        "getArg", offsetof(CMPIArgsFT, getArg)),
    member<decltype(CMPIArgsFT::getArgAt), CMPIData (*)(const CMPIArgs*, CMPICount, CMPIString**, CMPIStatus*)>(
        "getArgAt", offsetof(CMPIArgsFT, getArgAt)),
    member<decltype(CMPIArgsFT::getArgCount), CMPICount (*)(const CMPIArgs*, CMPIStatus*)>(
        "getArgCount", offsetof(CMPIArgsFT, getArgCount)),
};

constexpr Member membersDateTimeFT[] = {
    member<decltype(CMPIDateTimeFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIDateTimeFT, ftVersion)),
    member<decltype(CMPIDateTimeFT::release), CMPIStatus (*)(CMPIDateTime*)>("release",
                                                                             offsetof(CMPIDateTimeFT, release)),
    member<decltype(CMPIDateTimeFT::clone), CMPIDateTime* (*)(const CMPIDateTime*, CMPIStatus*)>(
        "clone", offsetof(CMPIDateTimeFT, clone)),
    member<decltype(CMPIDateTimeFT::getBinaryFormat), CMPIUint64 (*)(const CMPIDateTime*, CMPIStatus*)>(
        "getBinaryFormat", offsetof(CMPIDateTimeFT, getBinaryFormat)),
    member<decltype(CMPIDateTimeFT::getStringFormat), CMPIString* (*)(const CMPIDateTime*, CMPIStatus*)>(
        "getStringFormat", offsetof(CMPIDateTimeFT, getStringFormat)),
    member<decltype(CMPIDateTimeFT::isInterval), CMPIBoolean (*)(const CMPIDateTime*, CMPIStatus*)>(
        "isInterval", offsetof(CMPIDateTimeFT, isInterval)),
};

constexpr Member membersSelectExpFT[] = {
    member<decltype(CMPISelectExpFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPISelectExpFT, ftVersion)),
    member<decltype(CMPISelectExpFT::release), CMPIStatus (*)(CMPISelectExp*)>("release",
                                                                               offsetof(CMPISelectExpFT, release)),
    member<decltype(CMPISelectExpFT::clone), CMPISelectExp* (*)(const CMPISelectExp*, CMPIStatus*)>(
        "clone", offsetof(CMPISelectExpFT, clone)),
    member<decltype(CMPISelectExpFT::evaluate),
           CMPIBoolean (*)(const CMPISelectExp*, const CMPIInstance*, CMPIStatus*)>(
        "evaluate", offsetof(CMPISelectExpFT, evaluate)),
    member<decltype(CMPISelectExpFT::getString), CMPIString* (*)(const CMPISelectExp*, CMPIStatus*)>(
        "getString", offsetof(CMPISelectExpFT, getString)),
    member<decltype(CMPISelectExpFT::getDOC), CMPISelectCond* (*)(const CMPISelectExp*, CMPIStatus*)>(
        "getDOC", offsetof(CMPISelectExpFT, getDOC)),
    member<decltype(CMPISelectExpFT::getCOD), CMPISelectCond* (*)(const CMPISelectExp*, CMPIStatus*)>(
        "getCOD", offsetof(CMPISelectExpFT, getCOD)),
    member<decltype(CMPISelectExpFT::evaluateUsingAccessor),
           CMPIBoolean (*)(const CMPISelectExp*, CMPIAccessor*, void*, CMPIStatus*)>(
        "evaluateUsingAccessor", offsetof(CMPISelectExpFT, evaluateUsingAccessor)),
};

constexpr Member membersSelectCondFT[] = {
    member<decltype(CMPISelectCondFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPISelectCondFT, ftVersion)),
    member<decltype(CMPISelectCondFT::release), CMPIStatus (*)(CMPISelectCond*)>("release",
                                                                                 offsetof(CMPISelectCondFT, release)),
    member<decltype(CMPISelectCondFT::clone), CMPISelectCond* (*)(const CMPISelectCond*, CMPIStatus*)>(
        "clone", offsetof(CMPISelectCondFT, clone)),
    member<decltype(CMPISelectCondFT::getCountAndType), CMPICount (*)(const CMPISelectCond*, int*, CMPIStatus*)>(
        "getCountAndType", offsetof(CMPISelectCondFT, getCountAndType)),
    member<decltype(CMPISelectCondFT::getSubCondAt), CMPISubCond* (*)(const CMPISelectCond*, CMPICount, CMPIStatus*)>(
        "getSubCondAt", offsetof(CMPISelectCondFT, getSubCondAt)),
};

constexpr Member membersSubCondFT[] = {
    member<decltype(CMPISubCondFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPISubCondFT, ftVersion)),
    member<decltype(CMPISubCondFT::release), CMPIStatus (*)(CMPISubCond*)>("release", offsetof(CMPISubCondFT, release)),
    member<decltype(CMPISubCondFT::clone), CMPISubCond* (*)(const CMPISubCond*, CMPIStatus*)>(
        "clone", offsetof(CMPISubCondFT, clone)),
    member<decltype(CMPISubCondFT::getCount), CMPICount (*)(const CMPISubCond*, CMPIStatus*)>(
        "getCount", offsetof(CMPISubCondFT, getCount)),
    member<decltype(CMPISubCondFT::getPredicateAt), CMPIPredicate* (*)(const CMPISubCond*, CMPICount, CMPIStatus*)>(
        "getPredicateAt", offsetof(CMPISubCondFT, getPredicateAt)),
    member<decltype(CMPISubCondFT::getPredicate), CMPIPredicate* (*)(const CMPISubCond*, const char*, CMPIStatus*)>(
        "getPredicate", offsetof(CMPISubCondFT, getPredicate)),
};

constexpr Member membersPredicateFT[] = {
    member<decltype(CMPIPredicateFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIPredicateFT, ftVersion)),
    member<decltype(CMPIPredicateFT::release), CMPIStatus (*)(CMPIPredicate*)>("release",
                                                                               offsetof(CMPIPredicateFT, release)),
    member<decltype(CMPIPredicateFT::clone), CMPIPredicate* (*)(const CMPIPredicate*, CMPIStatus*)>(
        "clone", offsetof(CMPIPredicateFT, clone)),
    member<decltype(CMPIPredicateFT::getData),
           CMPIStatus (*)(const CMPIPredicate*, CMPIType*, CMPIPredOp*, CMPIString**, CMPIString**)>(
        "getData", offsetof(CMPIPredicateFT, getData)),
    member<decltype(CMPIPredicateFT::evaluateUsingAccessor),
           CMPIBoolean (*)(const CMPIPredicate*, CMPIAccessor*, void*, CMPIStatus*)>(
        "evaluateUsingAccessor", offsetof(CMPIPredicateFT, evaluateUsingAccessor)),
};

constexpr Member membersErrorFT[] = {
    member<decltype(CMPIErrorFT::ftVersion), CMPIVersion>("ftVersion", offsetof(CMPIErrorFT, ftVersion)),
    member<decltype(CMPIErrorFT::release), CMPIStatus (*)(CMPIError*)>("release", offsetof(CMPIErrorFT, release)),
    member<decltype(CMPIErrorFT::clone), CMPIError* (*)(const CMPIError*, CMPIStatus*)>("clone",
                                                                                        offsetof(CMPIErrorFT, clone)),
    member<decltype(CMPIErrorFT::getErrorType), CMPIErrorType (*)(const CMPIError*, CMPIStatus*)>(
        "getErrorType", offsetof(CMPIErrorFT, getErrorType)),
    member<decltype(CMPIErrorFT::getOtherErrorType), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getOtherErrorType", offsetof(CMPIErrorFT, getOtherErrorType)),
    member<decltype(CMPIErrorFT::getOwningEntity), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getOwningEntity", offsetof(CMPIErrorFT, getOwningEntity)),
    member<decltype(CMPIErrorFT::getMessageID), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getMessageID", offsetof(CMPIErrorFT, getMessageID)),
    member<decltype(CMPIErrorFT::getMessage), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getMessage", offsetof(CMPIErrorFT, getMessage)),
    member<decltype(CMPIErrorFT::getPerceivedSeverity), CMPIErrorSeverity (*)(const CMPIError*, CMPIStatus*)>(
        "getPerceivedSeverity", offsetof(CMPIErrorFT, getPerceivedSeverity)),
    member<decltype(CMPIErrorFT::getProbableCause), CMPIErrorProbableCause (*)(const CMPIError*, CMPIStatus*)>(
        "getProbableCause", offsetof(CMPIErrorFT, getProbableCause)),
    member<decltype(CMPIErrorFT::getProbableCauseDescription), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getProbableCauseDescription", offsetof(CMPIErrorFT, getProbableCauseDescription)),
    member<decltype(CMPIErrorFT::getRecommendedActions), CMPIArray* (*)(const CMPIError*, CMPIStatus*)>(
        "getRecommendedActions", offsetof(CMPIErrorFT, getRecommendedActions)),
    member<decltype(CMPIErrorFT::getErrorSource), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getErrorSource", offsetof(CMPIErrorFT, getErrorSource)),
    member<decltype(CMPIErrorFT::getErrorSourceFormat), CMPIErrorSrcFormat (*)(const CMPIError*, CMPIStatus*)>(
        "getErrorSourceFormat", offsetof(CMPIErrorFT, getErrorSourceFormat)),
    member<decltype(CMPIErrorFT::getOtherErrorSourceFormat), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getOtherErrorSourceFormat", offsetof(CMPIErrorFT, getOtherErrorSourceFormat)),
    member<decltype(CMPIErrorFT::getCIMStatusCode), CMPIrc (*)(const CMPIError*, CMPIStatus*)>(
        "getCIMStatusCode", offsetof(CMPIErrorFT, getCIMStatusCode)),
    member<decltype(CMPIErrorFT::getCIMStatusCodeDescription), CMPIString* (*)(const CMPIError*, CMPIStatus*)>(
        "getCIMStatusCodeDescription", offsetof(CMPIErrorFT, getCIMStatusCodeDescription)),
    member<decltype(CMPIErrorFT::getMessageArguments), CMPIArray* (*)(const CMPIError*, CMPIStatus*)>(
        "getMessageArguments", offsetof(CMPIErrorFT, getMessageArguments)),
    member<decltype(CMPIErrorFT::setErrorType), CMPIStatus (*)(const CMPIError*, const CMPIErrorType)>(
        "setErrorType", offsetof(CMPIErrorFT, setErrorType)),
    member<decltype(CMPIErrorFT::setOtherErrorType), CMPIStatus (*)(const CMPIError*, const char*)>(
        "setOtherErrorType", offsetof(CMPIErrorFT, setOtherErrorType)),
    member<decltype(CMPIErrorFT::setProbableCauseDescription), CMPIStatus (*)(const CMPIError*, const char*)>(
        "setProbableCauseDescription", offsetof(CMPIErrorFT, setProbableCauseDescription)),
    member<decltype(CMPIErrorFT::setRecommendedActions), CMPIStatus (*)(const CMPIError*, const CMPIArray*)>(
        "setRecommendedActions", offsetof(CMPIErrorFT, setRecommendedActions)),
    member<decltype(CMPIErrorFT::setErrorSource), CMPIStatus (*)(const CMPIError*, const char*)>(
        "setErrorSource", offsetof(CMPIErrorFT, setErrorSource)),
    member<decltype(CMPIErrorFT::setErrorSourceFormat), CMPIStatus (*)(const CMPIError*, const CMPIErrorSrcFormat)>(
        "setErrorSourceFormat", offsetof(CMPIErrorFT, setErrorSourceFormat)),
    member<decltype(CMPIErrorFT::setOtherErrorSourceFormat), CMPIStatus (*)(const CMPIError*, const char*)>(
        "setOtherErrorSourceFormat", offsetof(CMPIErrorFT, setOtherErrorSourceFormat)),
    member<decltype(CMPIErrorFT::setCIMStatusCodeDescription), CMPIStatus (*)(const CMPIError*, const char*)>(
        "setCIMStatusCodeDescription", offsetof(CMPIErrorFT, setCIMStatusCodeDescription)),
    member<decltype(CMPIErrorFT::setMessageArguments), CMPIStatus (*)(const CMPIError*, const CMPIArray*)>(
        "setMessageArguments", offsetof(CMPIErrorFT, setMessageArguments)),
};

constexpr Record records[] = {
    {"CMPIContextFT", false, sizeof(CMPIContextFT), alignof(CMPIContextFT), membersContextFT},
    {"CMPIResultFT", false, sizeof(CMPIResultFT), alignof(CMPIResultFT), membersResultFT},
    {"CMPIStringFT", false, sizeof(CMPIStringFT), alignof(CMPIStringFT), membersStringFT},
    {"CMPIArrayFT", false, sizeof(CMPIArrayFT), alignof(CMPIArrayFT), membersArrayFT},
    {"CMPIEnumerationFT", false, sizeof(CMPIEnumerationFT), alignof(CMPIEnumerationFT), membersEnumerationFT},
    {"CMPIInstanceFT", false, sizeof(CMPIInstanceFT), alignof(CMPIInstanceFT), membersInstanceFT},
    {"CMPIObjectPathFT", false, sizeof(CMPIObjectPathFT), alignof(CMPIObjectPathFT), membersObjectPathFT},
    {"CMPIArgsFT", false, sizeof(CMPIArgsFT), alignof(CMPIArgsFT), membersArgsFT},
    {"CMPIDateTimeFT", false, sizeof(CMPIDateTimeFT), alignof(CMPIDateTimeFT), membersDateTimeFT},
    {"CMPISelectExpFT", false, sizeof(CMPISelectExpFT), alignof(CMPISelectExpFT), membersSelectExpFT},
    {"CMPISelectCondFT", false, sizeof(CMPISelectCondFT), alignof(CMPISelectCondFT), membersSelectCondFT},
    {"CMPISubCondFT", false, sizeof(CMPISubCondFT), alignof(CMPISubCondFT), membersSubCondFT},
    {"CMPIPredicateFT", false, sizeof(CMPIPredicateFT), alignof(CMPIPredicateFT), membersPredicateFT},
    {"CMPIErrorFT", false, sizeof(CMPIErrorFT), alignof(CMPIErrorFT), membersErrorFT},
};

}  // namespace

std::span<const Record> objectTables() {
  return records;
}
