// The CMPI 2.0 binary interface, and the headers of this repository against it. Compiling this file is the test: every
// member has its name, its type and its place, and every code has its number, in both ABIs.

#include <cmpift.h>

#include <algorithm>
#include <concepts>
#include <cstddef>
#include <initializer_list>
#include <type_traits>

namespace {

struct Member {
  std::size_t offset;     // in the header's record
  std::size_t size;       // of the type in the interface
  std::size_t alignment;  // of that type
  bool hasType;           // whether the header gives the member exactly that type
};

template <class Actual, class Expected>
consteval Member member(std::size_t offset) {
  return {offset, sizeof(Expected), alignof(Expected), std::is_same_v<Actual, Expected>};
}

consteval std::size_t aligned(std::size_t offset, std::size_t alignment) {
  return (offset + alignment - 1) / alignment * alignment;
}

constexpr std::size_t none = static_cast<std::size_t>(-1);

/// The index of the first member that the header has differently, the number of members if only the record's own size
/// or alignment differs, or none. Both ABIs place each member at the next multiple of its alignment.
template <class Record>
consteval std::size_t firstDifference(std::initializer_list<Member> members) {
  std::size_t end = 0;
  std::size_t alignment = 1;
  std::size_t index = 0;
  for (const Member& each : members) {
    const std::size_t expected = std::is_union_v<Record> ? 0 : aligned(end, each.alignment);
    if (each.offset != expected || !each.hasType) {
      return index;
    }
    end = std::max(end, expected + each.size);
    alignment = std::max(alignment, each.alignment);
    ++index;
  }
  return alignof(Record) == alignment && sizeof(Record) == aligned(end, alignment) ? none : index;
}

/// A code in the header, and its number in the interface.
consteval bool is(unsigned long actual, unsigned long expected) {
  return actual == expected;
}

/// How many codes come before the first wrong one.
consteval std::size_t countCorrect(std::same_as<bool> auto... codes) {
  const std::initializer_list<bool> all = {codes...};
  return static_cast<std::size_t>(std::find(all.begin(), all.end(), false) - all.begin());
}

// The types that most slots have.
using Broker = const CMPIBroker*;
using Context = const CMPIContext*;
using Enumeration = CMPIEnumeration*;
using Instance = const CMPIInstance*;
using Path = const CMPIObjectPath*;
using Rc = CMPIStatus*;
using Result = const CMPIResult*;
using Status = CMPIStatus;
using String = CMPIString*;
using Text = const char*;
using Texts = const char**;
using Value = const CMPIValue*;

// A member of data; a function; a function whose first parameter is the object that the table belongs to.
#define MEMBER(name, ...) member<decltype(Record::name), __VA_ARGS__>(offsetof(Record, name))
#define CALL(name, result, ...) MEMBER(name, result (*)(__VA_ARGS__))
#define SLOT(name, result, ...) MEMBER(name, result (*)(Self __VA_OPT__(, ) __VA_ARGS__))

#define TABLE(record, self, ...)                       \
  static_assert(                                       \
      [] {                                             \
        using Record = record;                         \
        using Self [[maybe_unused]] = self;            \
        return firstDifference<Record>({__VA_ARGS__}); \
      }() == none,                                     \
      #record)
#define RECORD(record, ...) TABLE(record, void, __VA_ARGS__)
#define BROKER_TABLE(record, ...) TABLE(record, Broker, __VA_ARGS__)
// An object is its handle and its table.
#define OBJECT(object, self, ...)                                          \
  RECORD(object, MEMBER(hdl, const void*), MEMBER(ft, const object##FT*)); \
  TABLE(object##FT, self, MEMBER(ftVersion, CMPIVersion), __VA_ARGS__)
#define OBJECT_TABLE(object, ...) \
  OBJECT(object, const object*, CALL(release, CMPIStatus, object*), SLOT(clone, object*, Rc), __VA_ARGS__)
#define PROVIDER_TABLE(object, ...)                                                                                  \
  OBJECT(object, object*, MEMBER(miVersion, int), MEMBER(miName, Text), SLOT(cleanup, Status, Context, CMPIBoolean), \
         __VA_ARGS__)

// Scalars.
static_assert(std::is_same_v<CMPIBoolean, unsigned char>);
static_assert(std::is_same_v<CMPIChar16, unsigned short>);
static_assert(std::is_same_v<CMPIUint8, unsigned char>);
static_assert(std::is_same_v<CMPIUint16, unsigned short>);
static_assert(std::is_same_v<CMPIUint32, unsigned int>);
static_assert(std::is_same_v<CMPIUint64, unsigned long long>);
static_assert(std::is_same_v<CMPISint8, signed char>);
static_assert(std::is_same_v<CMPISint16, short>);
static_assert(std::is_same_v<CMPISint32, int>);
static_assert(std::is_same_v<CMPISint64, long long>);
static_assert(std::is_same_v<CMPIReal32, float>);
static_assert(std::is_same_v<CMPIReal64, double>);
static_assert(std::is_same_v<CMPICount, unsigned int>);
static_assert(std::is_same_v<CMPIType, unsigned short>);
static_assert(std::is_same_v<CMPIValueState, unsigned short>);
static_assert(std::is_same_v<CMPIAccessor, CMPIData(const char*, void*)>);
static_assert(std::is_same_v<CMPIThreadFunc, void* (*)(void*)>);
static_assert(std::is_same_v<CMPIThreadOnceFunc, void (*)(void)>);
static_assert(std::is_same_v<CMPIThreadKeyCleanupFunc, void (*)(void*)>);
static_assert(std::is_same_v<CMPIMsgFileHandle, void*>);
static_assert(std::is_same_v<CMPIGcStat, void>);
static_assert(std::is_same_v<CMPIFlags, unsigned int>);
static_assert(std::is_same_v<CMPIVersion, int>);

// Values.
RECORD(CMPIValuePtr, MEMBER(ptr, void*), MEMBER(length, CMPICount));
RECORD(CMPIValue, MEMBER(boolean, CMPIBoolean), MEMBER(char16, CMPIChar16), MEMBER(uint8, CMPIUint8),
       MEMBER(uint16, CMPIUint16), MEMBER(uint32, CMPIUint32), MEMBER(uint64, CMPIUint64), MEMBER(sint8, CMPISint8),
       MEMBER(sint16, CMPISint16), MEMBER(sint32, CMPISint32), MEMBER(sint64, CMPISint64), MEMBER(real32, CMPIReal32),
       MEMBER(real64, CMPIReal64), MEMBER(inst, CMPIInstance*), MEMBER(ref, CMPIObjectPath*), MEMBER(args, CMPIArgs*),
       MEMBER(filter, CMPISelectExp*), MEMBER(Enum, Enumeration), MEMBER(array, CMPIArray*), MEMBER(string, String),
       MEMBER(chars, char*), MEMBER(dateTime, CMPIDateTime*), MEMBER(dataPtr, CMPIValuePtr), MEMBER(Byte, CMPISint8),
       MEMBER(Short, CMPISint16), MEMBER(Int, CMPISint32), MEMBER(Long, CMPISint64), MEMBER(Float, CMPIReal32),
       MEMBER(Double, CMPIReal64));
RECORD(CMPIData, MEMBER(type, CMPIType), MEMBER(state, CMPIValueState), MEMBER(value, CMPIValue));
RECORD(CMPIStatus, MEMBER(rc, CMPIrc), MEMBER(msg, String));

constexpr bool is64Bit = sizeof(void*) == 8;
static_assert(sizeof(CMPIValuePtr) == (is64Bit ? 16 : 8) && alignof(CMPIValuePtr) == (is64Bit ? 8 : 4));
static_assert(sizeof(CMPIValue) == (is64Bit ? 16 : 8) && alignof(CMPIValue) == (is64Bit ? 8 : 4));
static_assert(sizeof(CMPIData) == (is64Bit ? 24 : 12) && alignof(CMPIData) == (is64Bit ? 8 : 4));
static_assert(sizeof(CMPIStatus) == (is64Bit ? 16 : 8) && alignof(CMPIStatus) == (is64Bit ? 8 : 4));
static_assert(offsetof(CMPIData, value) == (is64Bit ? 8 : 4) && offsetof(CMPIStatus, msg) == (is64Bit ? 8 : 4));

// The broker.
RECORD(CMPIBroker, MEMBER(hdl, const void*), MEMBER(bft, const CMPIBrokerFT*), MEMBER(eft, const CMPIBrokerEncFT*),
       MEMBER(xft, const CMPIBrokerExtFT*), MEMBER(mft, const CMPIBrokerMemFT*));
static_assert(sizeof(CMPIInstance) == 2 * sizeof(void*) && sizeof(CMPIBroker) == 5 * sizeof(void*));

// What a broker offers.
BROKER_TABLE(CMPIBrokerFT, MEMBER(brokerCapabilities, unsigned int), MEMBER(brokerVersion, CMPIVersion),
             MEMBER(brokerName, Text), SLOT(prepareAttachThread, CMPIContext*, Context),
             SLOT(attachThread, Status, Context), SLOT(detachThread, Status, Context),
             SLOT(deliverIndication, Status, Context, Text, Instance),
             SLOT(enumerateInstanceNames, Enumeration, Context, Path, Rc),
             SLOT(getInstance, CMPIInstance*, Context, Path, Texts, Rc),
             SLOT(createInstance, CMPIObjectPath*, Context, Path, Instance, Rc),
             SLOT(modifyInstance, Status, Context, Path, Instance, Texts), SLOT(deleteInstance, Status, Context, Path),
             SLOT(execQuery, Enumeration, Context, Path, Text, Text, Rc),
             SLOT(enumerateInstances, Enumeration, Context, Path, Texts, Rc),
             SLOT(associators, Enumeration, Context, Path, Text, Text, Text, Text, Texts, Rc),
             SLOT(associatorNames, Enumeration, Context, Path, Text, Text, Text, Text, Rc),
             SLOT(references, Enumeration, Context, Path, Text, Text, Texts, Rc),
             SLOT(referenceNames, Enumeration, Context, Path, Text, Text, Rc),
             SLOT(invokeMethod, CMPIData, Context, Path, Text, const CMPIArgs*, CMPIArgs*, Rc),
             SLOT(setProperty, Status, Context, Path, Text, Value, CMPIType),
             SLOT(getProperty, CMPIData, Context, Path, Text, Rc),
             SLOT(enumerateInstancesFiltered, Enumeration, Context, Path, Texts, Text, Text, Rc),
             SLOT(associatorsFiltered, Enumeration, Context, Path, Text, Text, Text, Text, Texts, Text, Text, Rc),
             SLOT(referencesFiltered, Enumeration, Context, Path, Text, Text, Texts, Text, Text, Rc));
BROKER_TABLE(CMPIBrokerEncFT, MEMBER(ftVersion, CMPIVersion), SLOT(newInstance, CMPIInstance*, Path, Rc),
             SLOT(newObjectPath, CMPIObjectPath*, Text, Text, Rc), SLOT(newArgs, CMPIArgs*, Rc),
             SLOT(newString, String, Text, Rc), SLOT(newArray, CMPIArray*, CMPICount, CMPIType, Rc),
             SLOT(newDateTime, CMPIDateTime*, Rc),
             SLOT(newDateTimeFromBinary, CMPIDateTime*, CMPIUint64, CMPIBoolean, Rc),
             SLOT(newDateTimeFromChars, CMPIDateTime*, Text, Rc),
             SLOT(newSelectExp, CMPISelectExp*, Text, Text, CMPIArray**, Rc),
             SLOT(classPathIsA, CMPIBoolean, Path, Text, Rc), SLOT(toString, String, const void*, Rc),
             SLOT(isOfType, CMPIBoolean, const void*, Text, Rc), SLOT(getType, String, const void*, Rc),
             SLOT(getMessage, String, Text, Text, Rc, CMPICount, ...),
             SLOT(logMessage, Status, CMPISeverity, Text, Text, const CMPIString*),
             SLOT(trace, Status, CMPILevel, Text, Text, const CMPIString*),
             SLOT(newCMPIError, CMPIError*, Text, Text, Text, CMPIErrorSeverity, CMPIErrorProbableCause, CMPIrc, Rc),
             SLOT(openMessageFile, Status, Text, CMPIMsgFileHandle*), SLOT(closeMessageFile, Status, CMPIMsgFileHandle),
             SLOT(getMessage2, String, Text, CMPIMsgFileHandle, Text, Rc, CMPICount, ...));
BROKER_TABLE(CMPIBrokerExtFT, MEMBER(ftVersion, CMPIVersion), CALL(resolveFileName, char*, Text),
             CALL(newThread, void*, CMPIThreadFunc, void*, int), CALL(joinThread, int, void*, void**),
             CALL(exitThread, int, void*), CALL(cancelThread, int, void*), CALL(threadSleep, int, CMPIUint32),
             CALL(threadOnce, int, int*, CMPIThreadOnceFunc),
             CALL(createThreadKey, int, unsigned int*, CMPIThreadKeyCleanupFunc),
             CALL(destroyThreadKey, int, unsigned int), CALL(getThreadSpecific, void*, unsigned int),
             CALL(setThreadSpecific, int, unsigned int, void*), CALL(newMutex, void*, int),
             CALL(destroyMutex, void, void*), CALL(lockMutex, void, void*), CALL(unlockMutex, void, void*),
             CALL(newCondition, void*, int), CALL(destroyCondition, void, void*), CALL(condWait, int, void*, void*),
             CALL(timedCondWait, int, void*, void*, struct timespec*), CALL(signalCondition, int, void*));
BROKER_TABLE(CMPIBrokerMemFT, MEMBER(ftVersion, CMPIVersion), SLOT(mark, CMPIGcStat*, Rc),
             SLOT(release, Status, const CMPIGcStat*), SLOT(cmpiMalloc, void*, size_t),
             SLOT(cmpiCalloc, void*, size_t, size_t), SLOT(cmpiRealloc, void*, void*, size_t),
             SLOT(cmpiStrDup, char*, Text), SLOT(cmpiFree, void, void*), SLOT(freeInstance, void, CMPIInstance*),
             SLOT(freeObjectPath, void, CMPIObjectPath*), SLOT(freeArgs, void, CMPIArgs*),
             SLOT(freeString, void, String), SLOT(freeArray, void, CMPIArray*), SLOT(freeDateTime, void, CMPIDateTime*),
             SLOT(freeSelectExp, void, CMPISelectExp*));

// Operations on objects.
OBJECT_TABLE(CMPIContext, SLOT(getEntry, CMPIData, Text, Rc), SLOT(getEntryAt, CMPIData, CMPICount, CMPIString**, Rc),
             SLOT(getEntryCount, CMPICount, Rc), SLOT(addEntry, Status, Text, Value, CMPIType));
OBJECT_TABLE(CMPIResult, SLOT(returnData, Status, Value, CMPIType), SLOT(returnInstance, Status, Instance),
             SLOT(returnObjectPath, Status, Path), SLOT(returnDone, Status),
             SLOT(returnError, Status, const CMPIError*));
OBJECT_TABLE(CMPIString, SLOT(getCharPtr, Text, Rc));
OBJECT_TABLE(CMPIArray, SLOT(getSize, CMPICount, Rc), SLOT(getSimpleType, CMPIType, Rc),
             SLOT(getElementAt, CMPIData, CMPICount, Rc), SLOT(setElementAt, Status, CMPICount, Value, CMPIType));
OBJECT_TABLE(CMPIEnumeration, SLOT(getNext, CMPIData, Rc), SLOT(hasNext, CMPIBoolean, Rc),
             SLOT(toArray, CMPIArray*, Rc));
OBJECT_TABLE(CMPIInstance, SLOT(getProperty, CMPIData, Text, Rc),
             SLOT(getPropertyAt, CMPIData, CMPICount, CMPIString**, Rc), SLOT(getPropertyCount, CMPICount, Rc),
             SLOT(setProperty, Status, Text, Value, CMPIType), SLOT(getObjectPath, CMPIObjectPath*, Rc),
             SLOT(setPropertyFilter, Status, Texts, Texts), SLOT(setObjectPath, Status, Path),
             SLOT(setPropertyWithOrigin, Status, Text, Value, CMPIType, Text));
OBJECT_TABLE(CMPIObjectPath, SLOT(setNameSpace, Status, Text), SLOT(getNameSpace, String, Rc),
             SLOT(setHostname, Status, Text), SLOT(getHostname, String, Rc), SLOT(setClassName, Status, Text),
             SLOT(getClassName, String, Rc), SLOT(addKey, Status, Text, Value, CMPIType),
             SLOT(getKey, CMPIData, Text, Rc), SLOT(getKeyAt, CMPIData, CMPICount, CMPIString**, Rc),
             SLOT(getKeyCount, CMPICount, Rc), SLOT(setNameSpaceFromObjectPath, Status, Path),
             SLOT(setHostAndNameSpaceFromObjectPath, Status, Path), SLOT(getClassQualifier, CMPIData, Text, Rc),
             SLOT(getPropertyQualifier, CMPIData, Text, Text, Rc), SLOT(getMethodQualifier, CMPIData, Text, Text, Rc),
             SLOT(getParameterQualifier, CMPIData, Text, Text, Text, Rc), SLOT(toString, String, Rc));
OBJECT_TABLE(CMPIArgs, SLOT(addArg, Status, Text, Value, CMPIType), SLOT(getArg, CMPIData, Text, Rc),
             SLOT(getArgAt, CMPIData, CMPICount, CMPIString**, Rc), SLOT(getArgCount, CMPICount, Rc));
OBJECT_TABLE(CMPIDateTime, SLOT(getBinaryFormat, CMPIUint64, Rc), SLOT(getStringFormat, String, Rc),
             SLOT(isInterval, CMPIBoolean, Rc));
OBJECT_TABLE(CMPISelectExp, SLOT(evaluate, CMPIBoolean, Instance, Rc), SLOT(getString, String, Rc),
             SLOT(getDOC, CMPISelectCond*, Rc), SLOT(getCOD, CMPISelectCond*, Rc),
             SLOT(evaluateUsingAccessor, CMPIBoolean, CMPIAccessor*, void*, Rc));
OBJECT_TABLE(CMPISelectCond, SLOT(getCountAndType, CMPICount, int*, Rc),
             SLOT(getSubCondAt, CMPISubCond*, CMPICount, Rc));
OBJECT_TABLE(CMPISubCond, SLOT(getCount, CMPICount, Rc), SLOT(getPredicateAt, CMPIPredicate*, CMPICount, Rc),
             SLOT(getPredicate, CMPIPredicate*, Text, Rc));
OBJECT_TABLE(CMPIPredicate, SLOT(getData, Status, CMPIType*, CMPIPredOp*, CMPIString**, CMPIString**),
             SLOT(evaluateUsingAccessor, CMPIBoolean, CMPIAccessor*, void*, Rc));
OBJECT_TABLE(CMPIError, SLOT(getErrorType, CMPIErrorType, Rc), SLOT(getOtherErrorType, String, Rc),
             SLOT(getOwningEntity, String, Rc), SLOT(getMessageID, String, Rc), SLOT(getMessage, String, Rc),
             SLOT(getPerceivedSeverity, CMPIErrorSeverity, Rc), SLOT(getProbableCause, CMPIErrorProbableCause, Rc),
             SLOT(getProbableCauseDescription, String, Rc), SLOT(getRecommendedActions, CMPIArray*, Rc),
             SLOT(getErrorSource, String, Rc), SLOT(getErrorSourceFormat, CMPIErrorSrcFormat, Rc),
             SLOT(getOtherErrorSourceFormat, String, Rc), SLOT(getCIMStatusCode, CMPIrc, Rc),
             SLOT(getCIMStatusCodeDescription, String, Rc), SLOT(getMessageArguments, CMPIArray*, Rc),
             SLOT(setErrorType, Status, CMPIErrorType), SLOT(setOtherErrorType, Status, Text),
             SLOT(setProbableCauseDescription, Status, Text), SLOT(setRecommendedActions, Status, const CMPIArray*),
             SLOT(setErrorSource, Status, Text), SLOT(setErrorSourceFormat, Status, CMPIErrorSrcFormat),
             SLOT(setOtherErrorSourceFormat, Status, Text), SLOT(setCIMStatusCodeDescription, Status, Text),
             SLOT(setMessageArguments, Status, const CMPIArray*));

// What a provider offers.
PROVIDER_TABLE(CMPIInstanceMI, SLOT(enumerateInstanceNames, Status, Context, Result, Path),
               SLOT(enumerateInstances, Status, Context, Result, Path, Texts),
               SLOT(getInstance, Status, Context, Result, Path, Texts),
               SLOT(createInstance, Status, Context, Result, Path, Instance),
               SLOT(modifyInstance, Status, Context, Result, Path, Instance, Texts),
               SLOT(deleteInstance, Status, Context, Result, Path),
               SLOT(execQuery, Status, Context, Result, Path, Text, Text));
PROVIDER_TABLE(CMPIAssociationMI, SLOT(associators, Status, Context, Result, Path, Text, Text, Text, Text, Texts),
               SLOT(associatorNames, Status, Context, Result, Path, Text, Text, Text, Text),
               SLOT(references, Status, Context, Result, Path, Text, Text, Texts),
               SLOT(referenceNames, Status, Context, Result, Path, Text, Text));
PROVIDER_TABLE(CMPIMethodMI, SLOT(invokeMethod, Status, Context, Result, Path, Text, const CMPIArgs*, CMPIArgs*));
PROVIDER_TABLE(CMPIPropertyMI, SLOT(setProperty, Status, Context, Result, Path, Text, CMPIData),
               SLOT(getProperty, Status, Context, Result, Path, Text),
               SLOT(setPropertyWithOrigin, Status, Context, Result, CMPIObjectPath*, Text, CMPIData, Text));
PROVIDER_TABLE(CMPIIndicationMI, SLOT(authorizeFilter, Status, Context, const CMPISelectExp*, Text, Path, Text),
               SLOT(mustPoll, Status, Context, Result, const CMPISelectExp*, Text, Path),
               SLOT(activateFilter, Status, Context, const CMPISelectExp*, Text, Path, CMPIBoolean),
               SLOT(deActivateFilter, Status, Context, const CMPISelectExp*, Text, Path, CMPIBoolean),
               SLOT(enableIndications, Status, Context), SLOT(disableIndications, Status, Context),
               SLOT(authorizeFilterCollection, Status, Context, Instance),
               SLOT(activateFilterCollection, Status, Context, Instance, CMPIBoolean),
               SLOT(deActivateFilterCollection, Status, Context, Instance, CMPIBoolean));

// Codes: types and value states; enumerators.
static_assert(countCorrect(is(CMPI_goodValue, 0), is(CMPI_null, 0), is(CMPI_SIMPLE, 2), is(CMPI_boolean, 2),
                           is(CMPI_keyBoolean, 2), is(CMPI_char16, 3), is(CMPI_Float, 8), is(CMPI_REAL, 8),
                           is(CMPI_real32, 8), is(CMPI_Double, 12), is(CMPI_real64, 12), is(CMPI_UINT, 128),
                           is(CMPI_uint8, 128), is(CMPI_uint16, 144), is(CMPI_uint32, 160), is(CMPI_uint64, 176),
                           is(CMPI_Byte, 192), is(CMPI_INTEGER, 192), is(CMPI_SINT, 192), is(CMPI_sint8, 192),
                           is(CMPI_Short, 208), is(CMPI_sint16, 208), is(CMPI_Int, 224), is(CMPI_sint32, 224),
                           is(CMPI_Long, 240), is(CMPI_keyInteger, 240), is(CMPI_sint64, 240), is(CMPI_nullValue, 256),
                           is(CMPI_keyValue, 512), is(CMPI_notFound, 1024), is(CMPI_ENC, 4096), is(CMPI_instance, 4096),
                           is(CMPI_keyRef, 4352), is(CMPI_ref, 4352), is(CMPI_args, 4608), is(CMPI_class, 4864),
                           is(CMPI_filter, 5120), is(CMPI_enumeration, 5376), is(CMPI_charString, 5632),
                           is(CMPI_keyString, 5632), is(CMPI_string, 5632), is(CMPI_booleanString, 5634),
                           is(CMPI_realString, 5644), is(CMPI_integerString, 5872), is(CMPI_numericString, 5884),
                           is(CMPI_chars, 5888), is(CMPI_classNameString, 5888), is(CMPI_dateTime, 6144),
                           is(CMPI_ptr, 6400), is(CMPI_charsptr, 6656), is(CMPI_dateTimeString, 7680),
                           is(CMPI_nameString, 7680), is(CMPI_ARRAY, 8192), is(CMPI_SIMPLEA, 8194),
                           is(CMPI_booleanA, 8194), is(CMPI_char16A, 8195), is(CMPI_FloatA, 8200), is(CMPI_REALA, 8200),
                           is(CMPI_real32A, 8200), is(CMPI_DoubleA, 8204), is(CMPI_real64A, 8204), is(CMPI_UINTA, 8320),
                           is(CMPI_uint8A, 8320), is(CMPI_uint16A, 8336), is(CMPI_uint32A, 8352),
                           is(CMPI_uint64A, 8368), is(CMPI_ByteA, 8384), is(CMPI_INTEGERA, 8384), is(CMPI_SINTA, 8384),
                           is(CMPI_sint8A, 8384), is(CMPI_ShortA, 8400), is(CMPI_sint16A, 8400), is(CMPI_IntA, 8416),
                           is(CMPI_sint32A, 8416), is(CMPI_LongA, 8432), is(CMPI_sint64A, 8432), is(CMPI_ENCA, 12288),
                           is(CMPI_instanceA, 12288), is(CMPI_refA, 12544), is(CMPI_stringA, 13824),
                           is(CMPI_charsA, 14080), is(CMPI_dateTimeA, 14336), is(CMPI_charsptrA, 14848),
                           is(CMPI_badValue, 32768)) == 84);
static_assert(countCorrect(is(CMPI_RC_OK, 0), is(CMPI_RC_ERR_FAILED, 1), is(CMPI_RC_ERR_ACCESS_DENIED, 2),
                           is(CMPI_RC_ERR_INVALID_NAMESPACE, 3), is(CMPI_RC_ERR_INVALID_PARAMETER, 4),
                           is(CMPI_RC_ERR_INVALID_CLASS, 5), is(CMPI_RC_ERR_NOT_FOUND, 6),
                           is(CMPI_RC_ERR_NOT_SUPPORTED, 7), is(CMPI_RC_ERR_CLASS_HAS_CHILDREN, 8),
                           is(CMPI_RC_ERR_CLASS_HAS_INSTANCES, 9), is(CMPI_RC_ERR_INVALID_SUPERCLASS, 10),
                           is(CMPI_RC_ERR_ALREADY_EXISTS, 11), is(CMPI_RC_ERR_NO_SUCH_PROPERTY, 12),
                           is(CMPI_RC_ERR_TYPE_MISMATCH, 13), is(CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED, 14),
                           is(CMPI_RC_ERR_INVALID_QUERY, 15), is(CMPI_RC_ERR_METHOD_NOT_AVAILABLE, 16),
                           is(CMPI_RC_ERR_METHOD_NOT_FOUND, 17), is(CMPI_RC_NO_MORE_ELEMENTS, 18),
                           is(CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED, 27), is(CMPI_RC_ERR_QUERY_FEATURE_NOT_SUPPORTED, 29),
                           is(CMPI_RC_DO_NOT_UNLOAD, 50), is(CMPI_RC_NEVER_UNLOAD, 51),
                           is(CMPI_RC_ERR_INVALID_HANDLE, 60), is(CMPI_RC_ERR_INVALID_DATA_TYPE, 61),
                           is(CMPI_RC_ERR_NOT_IN_CODEPAGE, 62), is(CMPI_RC_ERROR_SYSTEM, 100), is(CMPI_RC_ERROR, 200),
                           is(CMPI_PredOp_Equals, 1), is(CMPI_PredOp_NotEquals, 2), is(CMPI_PredOp_LessThan, 3),
                           is(CMPI_PredOp_GreaterThanOrEquals, 4), is(CMPI_PredOp_GreaterThan, 5),
                           is(CMPI_PredOp_LessThanOrEquals, 6), is(CMPI_PredOp_Isa, 7), is(CMPI_PredOp_NotIsa, 8),
                           is(CMPI_PredOp_Like, 9), is(CMPI_PredOp_NotLike, 10), is(CMPI_PredOp_Not_Null, 11),
                           is(CMPI_PredOp_Null, 12), is(CMPI_PredOp_And, 13), is(CMPI_PredOp_Or, 14),
                           is(CMPI_SEV_ERROR, 1), is(CMPI_SEV_INFO, 2), is(CMPI_SEV_WARNING, 3), is(CMPI_DEV_DEBUG, 4),
                           is(CMPI_LEV_INFO, 1), is(CMPI_LEV_WARNING, 2), is(CMPI_LEV_VERBOSE, 3),
                           is(UnknownErrorType, 0), is(OtherErrorType, 1), is(CommunicationsError, 2),
                           is(QualityOfServiceError, 3), is(SoftwareError, 4), is(HardwareError, 5),
                           is(EnvironmentalError, 6), is(SecurityError, 7), is(OversubscriptionError, 8),
                           is(Oversubscription_Error, 8), is(UnavailableResourceError, 9),
                           is(UnsupportedOperationError, 10), is(ErrorSevUnknown, 0), is(ErrorSevLow, 2),
                           is(ErrorSevMedium, 3), is(ErrorSevHigh, 4), is(ErrorSevFatal, 5), is(CMPIErrSrcUnknown, 0),
                           is(CMPIErrSrcOther, 1), is(CIMObjectHandle, 2)) == 69);
static_assert(sizeof(CMPIrc) == sizeof(int) && sizeof(CMPISeverity) == sizeof(int));
static_assert(sizeof(CMPIErrorProbableCause) == sizeof(int));

static_assert(CMPI_VERSION == 200);

}  // namespace
