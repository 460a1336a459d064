// Member names and types in the interface's order: values and object records.

#include <cmpift.h>

#include <type_traits>

#include "tests/cmpi/Interface.h"

namespace {

template <class Actual, class Expected>
constexpr Member member(const char* name, std::size_t offset) {
  return {name, offset, sizeof(Expected), alignof(Expected), std::is_same_v<Actual, Expected>};
}

constexpr Member membersValuePtr[] = {
    member<decltype(CMPIValuePtr::ptr), void*>("ptr", offsetof(CMPIValuePtr, ptr)),
    member<decltype(CMPIValuePtr::length), CMPICount>("length", offsetof(CMPIValuePtr, length)),
};

constexpr Member membersValue[] = {
    member<decltype(CMPIValue::boolean), CMPIBoolean>("boolean", offsetof(CMPIValue, boolean)),
    member<decltype(CMPIValue::char16), CMPIChar16>("char16", offsetof(CMPIValue, char16)),
    member<decltype(CMPIValue::uint8), CMPIUint8>("uint8", offsetof(CMPIValue, uint8)),
    member<decltype(CMPIValue::uint16), CMPIUint16>("uint16", offsetof(CMPIValue, uint16)),
    member<decltype(CMPIValue::uint32), CMPIUint32>("uint32", offsetof(CMPIValue, uint32)),
    member<decltype(CMPIValue::uint64), CMPIUint64>("uint64", offsetof(CMPIValue, uint64)),
    member<decltype(CMPIValue::sint8), CMPISint8>("sint8", offsetof(CMPIValue, sint8)),
    member<decltype(CMPIValue::sint16), CMPISint16>("sint16", offsetof(CMPIValue, sint16)),
    member<decltype(CMPIValue::sint32), CMPISint32>("sint32", offsetof(CMPIValue, sint32)),
    member<decltype(CMPIValue::sint64), CMPISint64>("sint64", offsetof(CMPIValue, sint64)),
    member<decltype(CMPIValue::real32), CMPIReal32>("real32", offsetof(CMPIValue, real32)),
    member<decltype(CMPIValue::real64), CMPIReal64>("real64", offsetof(CMPIValue, real64)),
    member<decltype(CMPIValue::inst), CMPIInstance*>("inst", offsetof(CMPIValue, inst)),
    member<decltype(CMPIValue::ref), CMPIObjectPath*>("ref", offsetof(CMPIValue, ref)),
    member<decltype(CMPIValue::args), CMPIArgs*>("args", offsetof(CMPIValue, args)),
    member<decltype(CMPIValue::filter), CMPISelectExp*>("filter", offsetof(CMPIValue, filter)),
    member<decltype(CMPIValue::Enum), CMPIEnumeration*>("Enum", offsetof(CMPIValue, Enum)),
    member<decltype(CMPIValue::array), CMPIArray*>("array", offsetof(CMPIValue, array)),
    member<decltype(CMPIValue::string), CMPIString*>("string", offsetof(CMPIValue, string)),
    member<decltype(CMPIValue::chars), char*>("chars", offsetof(CMPIValue, chars)),
    member<decltype(CMPIValue::dateTime), CMPIDateTime*>("dateTime", offsetof(CMPIValue, dateTime)),
    member<decltype(CMPIValue::dataPtr), CMPIValuePtr>("dataPtr", offsetof(CMPIValue, dataPtr)),
    member<decltype(CMPIValue::Byte), CMPISint8>("Byte", offsetof(CMPIValue, Byte)),
    member<decltype(CMPIValue::Short), CMPISint16>("Short", offsetof(CMPIValue, Short)),
    member<decltype(CMPIValue::Int), CMPISint32>("Int", offsetof(CMPIValue, Int)),
    member<decltype(CMPIValue::Long), CMPISint64>("Long", offsetof(CMPIValue, Long)),
    member<decltype(CMPIValue::Float), CMPIReal32>("Float", offsetof(CMPIValue, Float)),
    member<decltype(CMPIValue::Double), CMPIReal64>("Double", offsetof(CMPIValue, Double)),
};

constexpr Member membersData[] = {
    member<decltype(CMPIData::type), CMPIType>("type", offsetof(CMPIData, type)),
    member<decltype(CMPIData::state), CMPIValueState>("state", offsetof(CMPIData, state)),
    member<decltype(CMPIData::value), CMPIValue>("value", offsetof(CMPIData, value)),
};

constexpr Member membersStatus[] = {
    member<decltype(CMPIStatus::rc), CMPIrc>("rc", offsetof(CMPIStatus, rc)),
    member<decltype(CMPIStatus::msg), CMPIString*>("msg", offsetof(CMPIStatus, msg)),
};

constexpr Member membersBroker[] = {
    member<decltype(CMPIBroker::hdl), const void*>("hdl", offsetof(CMPIBroker, hdl)),
    member<decltype(CMPIBroker::bft), const CMPIBrokerFT*>("bft", offsetof(CMPIBroker, bft)),
    member<decltype(CMPIBroker::eft), const CMPIBrokerEncFT*>("eft", offsetof(CMPIBroker, eft)),
    member<decltype(CMPIBroker::xft), const CMPIBrokerExtFT*>("xft", offsetof(CMPIBroker, xft)),
    member<decltype(CMPIBroker::mft), const CMPIBrokerMemFT*>("mft", offsetof(CMPIBroker, mft)),
};

constexpr Member membersContext[] = {
    member<decltype(CMPIContext::hdl), const void*>("hdl", offsetof(CMPIContext, hdl)),
    member<decltype(CMPIContext::ft), const CMPIContextFT*>("ft", offsetof(CMPIContext, ft)),
};

constexpr Member membersResult[] = {
    member<decltype(CMPIResult::hdl), const void*>("hdl", offsetof(CMPIResult, hdl)),
    member<decltype(CMPIResult::ft), const CMPIResultFT*>("ft", offsetof(CMPIResult, ft)),
};

constexpr Member membersString[] = {
    member<decltype(CMPIString::hdl), const void*>("hdl", offsetof(CMPIString, hdl)),
    member<decltype(CMPIString::ft), const CMPIStringFT*>("ft", offsetof(CMPIString, ft)),
};

constexpr Member membersArray[] = {
    member<decltype(CMPIArray::hdl), const void*>("hdl", offsetof(CMPIArray, hdl)),
    member<decltype(CMPIArray::ft), const CMPIArrayFT*>("ft", offsetof(CMPIArray, ft)),
};

constexpr Member membersEnumeration[] = {
    member<decltype(CMPIEnumeration::hdl), const void*>("hdl", offsetof(CMPIEnumeration, hdl)),
    member<decltype(CMPIEnumeration::ft), const CMPIEnumerationFT*>("ft", offsetof(CMPIEnumeration, ft)),
};

constexpr Member membersInstance[] = {
    member<decltype(CMPIInstance::hdl), const void*>("hdl", offsetof(CMPIInstance, hdl)),
    member<decltype(CMPIInstance::ft), const CMPIInstanceFT*>("ft", offsetof(CMPIInstance, ft)),
};

constexpr Member membersObjectPath[] = {
    member<decltype(CMPIObjectPath::hdl), const void*>("hdl", offsetof(CMPIObjectPath, hdl)),
    member<decltype(CMPIObjectPath::ft), const CMPIObjectPathFT*>("ft", offsetof(CMPIObjectPath, ft)),
};

constexpr Member membersArgs[] = {
    member<decltype(CMPIArgs::hdl), const void*>("hdl", offsetof(CMPIArgs, hdl)),
    member<decltype(CMPIArgs::ft), const CMPIArgsFT*>("ft", offsetof(CMPIArgs, ft)),
};

constexpr Member membersDateTime[] = {
    member<decltype(CMPIDateTime::hdl), const void*>("hdl", offsetof(CMPIDateTime, hdl)),
    member<decltype(CMPIDateTime::ft), const CMPIDateTimeFT*>("ft", offsetof(CMPIDateTime, ft)),
};

constexpr Member membersSelectExp[] = {
    member<decltype(CMPISelectExp::hdl), const void*>("hdl", offsetof(CMPISelectExp, hdl)),
    member<decltype(CMPISelectExp::ft), const CMPISelectExpFT*>("ft", offsetof(CMPISelectExp, ft)),
};

constexpr Member membersSelectCond[] = {
    member<decltype(CMPISelectCond::hdl), const void*>("hdl", offsetof(CMPISelectCond, hdl)),
    member<decltype(CMPISelectCond::ft), const CMPISelectCondFT*>("ft", offsetof(CMPISelectCond, ft)),
};

constexpr Member membersSubCond[] = {
    member<decltype(CMPISubCond::hdl), const void*>("hdl", offsetof(CMPISubCond, hdl)),
    member<decltype(CMPISubCond::ft), const CMPISubCondFT*>("ft", offsetof(CMPISubCond, ft)),
};

constexpr Member membersPredicate[] = {
    member<decltype(CMPIPredicate::hdl), const void*>("hdl", offsetof(CMPIPredicate, hdl)),
    member<decltype(CMPIPredicate::ft), const CMPIPredicateFT*>("ft", offsetof(CMPIPredicate, ft)),
};

constexpr Member membersError[] = {
    member<decltype(CMPIError::hdl), const void*>("hdl", offsetof(CMPIError, hdl)),
    member<decltype(CMPIError::ft), const CMPIErrorFT*>("ft", offsetof(CMPIError, ft)),
};

constexpr Member membersInstanceMI[] = {
    member<decltype(CMPIInstanceMI::hdl), const void*>("hdl", offsetof(CMPIInstanceMI, hdl)),
    member<decltype(CMPIInstanceMI::ft), const CMPIInstanceMIFT*>("ft", offsetof(CMPIInstanceMI, ft)),
};

constexpr Member membersAssociationMI[] = {
    member<decltype(CMPIAssociationMI::hdl), const void*>("hdl", offsetof(CMPIAssociationMI, hdl)),
    member<decltype(CMPIAssociationMI::ft), const CMPIAssociationMIFT*>("ft", offsetof(CMPIAssociationMI, ft)),
};

constexpr Member membersMethodMI[] = {
    member<decltype(CMPIMethodMI::hdl), const void*>("hdl", offsetof(CMPIMethodMI, hdl)),
    member<decltype(CMPIMethodMI::ft), const CMPIMethodMIFT*>("ft", offsetof(CMPIMethodMI, ft)),
};

constexpr Member membersPropertyMI[] = {
    member<decltype(CMPIPropertyMI::hdl), const void*>("hdl", offsetof(CMPIPropertyMI, hdl)),
    member<decltype(CMPIPropertyMI::ft), const CMPIPropertyMIFT*>("ft", offsetof(CMPIPropertyMI, ft)),
};

constexpr Member membersIndicationMI[] = {
    member<decltype(CMPIIndicationMI::hdl), const void*>("hdl", offsetof(CMPIIndicationMI, hdl)),
    member<decltype(CMPIIndicationMI::ft), const CMPIIndicationMIFT*>("ft", offsetof(CMPIIndicationMI, ft)),
};

constexpr Record records[] = {
    {"CMPIValuePtr", false, sizeof(CMPIValuePtr), alignof(CMPIValuePtr), membersValuePtr},
    {"CMPIValue", true, sizeof(CMPIValue), alignof(CMPIValue), membersValue},
    {"CMPIData", false, sizeof(CMPIData), alignof(CMPIData), membersData},
    {"CMPIStatus", false, sizeof(CMPIStatus), alignof(CMPIStatus), membersStatus},
    {"CMPIBroker", false, sizeof(CMPIBroker), alignof(CMPIBroker), membersBroker},
    {"CMPIContext", false, sizeof(CMPIContext), alignof(CMPIContext), membersContext},
    {"CMPIResult", false, sizeof(CMPIResult), alignof(CMPIResult), membersResult},
    {"CMPIString", false, sizeof(CMPIString), alignof(CMPIString), membersString},
    {"CMPIArray", false, sizeof(CMPIArray), alignof(CMPIArray), membersArray},
    {"CMPIEnumeration", false, sizeof(CMPIEnumeration), alignof(CMPIEnumeration), membersEnumeration},
    {"CMPIInstance", false, sizeof(CMPIInstance), alignof(CMPIInstance), membersInstance},
    {"CMPIObjectPath", false, sizeof(CMPIObjectPath), alignof(CMPIObjectPath), membersObjectPath},
    {"CMPIArgs", false, sizeof(CMPIArgs), alignof(CMPIArgs), membersArgs},
    {"CMPIDateTime", false, sizeof(CMPIDateTime), alignof(CMPIDateTime), membersDateTime},
    {"CMPISelectExp", false, sizeof(CMPISelectExp), alignof(CMPISelectExp), membersSelectExp},
    {"CMPISelectCond", false, sizeof(CMPISelectCond), alignof(CMPISelectCond), membersSelectCond},
    {"CMPISubCond", false, sizeof(CMPISubCond), alignof(CMPISubCond), membersSubCond},
    {"CMPIPredicate", false, sizeof(CMPIPredicate), alignof(CMPIPredicate), membersPredicate},
    {"CMPIError", false, sizeof(CMPIError), alignof(CMPIError), membersError},
    {"CMPIInstanceMI", false, sizeof(CMPIInstanceMI), alignof(CMPIInstanceMI), membersInstanceMI},
    {"CMPIAssociationMI", false, sizeof(CMPIAssociationMI), alignof(CMPIAssociationMI), membersAssociationMI},
    {"CMPIMethodMI", false, sizeof(CMPIMethodMI), alignof(CMPIMethodMI), membersMethodMI},
    {"CMPIPropertyMI", false, sizeof(CMPIPropertyMI), alignof(CMPIPropertyMI), membersPropertyMI},
    {"CMPIIndicationMI", false, sizeof(CMPIIndicationMI), alignof(CMPIIndicationMI), membersIndicationMI},
};

}  // namespace

std::span<const Record> dataRecords() {
  return records;
}
