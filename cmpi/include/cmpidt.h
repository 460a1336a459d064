#ifndef CMPIDT_H
#define CMPIDT_H

/* CMPI 2.0 data types: what a broker and a provider pass to each other by value.
 *
 * Used where the system has no CMPI development package. Member order is the binary interface. */

#define CMPI_VERSION 200

#ifdef __cplusplus
extern "C" {
#endif

/* Scalars. */

typedef unsigned char CMPIBoolean;
typedef unsigned short CMPIChar16;
typedef unsigned char CMPIUint8;
typedef unsigned short CMPIUint16;
typedef unsigned int CMPIUint32;
typedef unsigned long long CMPIUint64;
typedef signed char CMPISint8;
typedef short CMPISint16;
typedef int CMPISint32;
typedef long long CMPISint64;
typedef float CMPIReal32;
typedef double CMPIReal64;
typedef unsigned int CMPICount;
typedef unsigned short CMPIType;
typedef unsigned short CMPIValueState;
typedef void* (*CMPIThreadFunc)(void*);
typedef void (*CMPIThreadOnceFunc)(void);
typedef void (*CMPIThreadKeyCleanupFunc)(void*);
typedef void* CMPIMsgFileHandle;
typedef void CMPIGcStat;
typedef unsigned int CMPIFlags;
typedef int CMPIVersion;

/* CMPIType: what a value holds. An array is its element's code plus CMPI_ARRAY. */

#define CMPI_null 0x0
#define CMPI_SIMPLE 0x2
#define CMPI_boolean 0x2
#define CMPI_keyBoolean 0x2
#define CMPI_char16 0x3
#define CMPI_Float 0x8
#define CMPI_REAL 0x8
#define CMPI_real32 0x8
#define CMPI_Double 0xc
#define CMPI_real64 0xc
#define CMPI_UINT 0x80
#define CMPI_uint8 0x80
#define CMPI_uint16 0x90
#define CMPI_uint32 0xa0
#define CMPI_uint64 0xb0
#define CMPI_Byte 0xc0
#define CMPI_INTEGER 0xc0
#define CMPI_SINT 0xc0
#define CMPI_sint8 0xc0
#define CMPI_Short 0xd0
#define CMPI_sint16 0xd0
#define CMPI_Int 0xe0
#define CMPI_sint32 0xe0
#define CMPI_Long 0xf0
#define CMPI_keyInteger 0xf0
#define CMPI_sint64 0xf0
#define CMPI_ENC 0x1000
#define CMPI_instance 0x1000
#define CMPI_keyRef 0x1100
#define CMPI_ref 0x1100
#define CMPI_args 0x1200
#define CMPI_class 0x1300
#define CMPI_filter 0x1400
#define CMPI_enumeration 0x1500
#define CMPI_charString 0x1600
#define CMPI_keyString 0x1600
#define CMPI_string 0x1600
#define CMPI_booleanString 0x1602
#define CMPI_realString 0x160c
#define CMPI_integerString 0x16f0
#define CMPI_numericString 0x16fc
#define CMPI_chars 0x1700
#define CMPI_classNameString 0x1700
#define CMPI_dateTime 0x1800
#define CMPI_ptr 0x1900
#define CMPI_charsptr 0x1a00
#define CMPI_dateTimeString 0x1e00
#define CMPI_nameString 0x1e00
#define CMPI_ARRAY 0x2000
#define CMPI_SIMPLEA (CMPI_ARRAY | CMPI_SIMPLE)
#define CMPI_booleanA (CMPI_ARRAY | CMPI_boolean)
#define CMPI_char16A (CMPI_ARRAY | CMPI_char16)
#define CMPI_FloatA (CMPI_ARRAY | CMPI_Float)
#define CMPI_REALA (CMPI_ARRAY | CMPI_REAL)
#define CMPI_real32A (CMPI_ARRAY | CMPI_real32)
#define CMPI_DoubleA (CMPI_ARRAY | CMPI_Double)
#define CMPI_real64A (CMPI_ARRAY | CMPI_real64)
#define CMPI_UINTA (CMPI_ARRAY | CMPI_UINT)
#define CMPI_uint8A (CMPI_ARRAY | CMPI_uint8)
#define CMPI_uint16A (CMPI_ARRAY | CMPI_uint16)
#define CMPI_uint32A (CMPI_ARRAY | CMPI_uint32)
#define CMPI_uint64A (CMPI_ARRAY | CMPI_uint64)
#define CMPI_ByteA (CMPI_ARRAY | CMPI_Byte)
#define CMPI_INTEGERA (CMPI_ARRAY | CMPI_INTEGER)
#define CMPI_SINTA (CMPI_ARRAY | CMPI_SINT)
#define CMPI_sint8A (CMPI_ARRAY | CMPI_sint8)
#define CMPI_ShortA (CMPI_ARRAY | CMPI_Short)
#define CMPI_sint16A (CMPI_ARRAY | CMPI_sint16)
#define CMPI_IntA (CMPI_ARRAY | CMPI_Int)
#define CMPI_sint32A (CMPI_ARRAY | CMPI_sint32)
#define CMPI_LongA (CMPI_ARRAY | CMPI_Long)
#define CMPI_sint64A (CMPI_ARRAY | CMPI_sint64)
#define CMPI_ENCA (CMPI_ARRAY | CMPI_ENC)
#define CMPI_instanceA (CMPI_ARRAY | CMPI_instance)
#define CMPI_refA (CMPI_ARRAY | CMPI_ref)
#define CMPI_stringA (CMPI_ARRAY | CMPI_string)
#define CMPI_charsA (CMPI_ARRAY | CMPI_chars)
#define CMPI_dateTimeA (CMPI_ARRAY | CMPI_dateTime)
#define CMPI_charsptrA (CMPI_ARRAY | CMPI_charsptr)

/* CMPIValueState: whether there is a value. */

#define CMPI_goodValue 0x0
#define CMPI_nullValue 0x100
#define CMPI_keyValue 0x200
#define CMPI_notFound 0x400
#define CMPI_badValue 0x8000

typedef enum _CMPIrc {
  CMPI_RC_OK = 0,
  CMPI_RC_ERR_FAILED = 1,
  CMPI_RC_ERR_ACCESS_DENIED = 2,
  CMPI_RC_ERR_INVALID_NAMESPACE = 3,
  CMPI_RC_ERR_INVALID_PARAMETER = 4,
  CMPI_RC_ERR_INVALID_CLASS = 5,
  CMPI_RC_ERR_NOT_FOUND = 6,
  CMPI_RC_ERR_NOT_SUPPORTED = 7,
  CMPI_RC_ERR_CLASS_HAS_CHILDREN = 8,
  CMPI_RC_ERR_CLASS_HAS_INSTANCES = 9,
  CMPI_RC_ERR_INVALID_SUPERCLASS = 10,
  CMPI_RC_ERR_ALREADY_EXISTS = 11,
  CMPI_RC_ERR_NO_SUCH_PROPERTY = 12,
  CMPI_RC_ERR_TYPE_MISMATCH = 13,
  CMPI_RC_ERR_QUERY_LANGUAGE_NOT_SUPPORTED = 14,
  CMPI_RC_ERR_INVALID_QUERY = 15,
  CMPI_RC_ERR_METHOD_NOT_AVAILABLE = 16,
  CMPI_RC_ERR_METHOD_NOT_FOUND = 17,
  CMPI_RC_NO_MORE_ELEMENTS = 18,
  CMPI_RC_ERR_SERVER_LIMITS_EXCEEDED = 27,
  CMPI_RC_ERR_QUERY_FEATURE_NOT_SUPPORTED = 29,
  CMPI_RC_DO_NOT_UNLOAD = 50,
  CMPI_RC_NEVER_UNLOAD = 51,
  CMPI_RC_ERR_INVALID_HANDLE = 60,
  CMPI_RC_ERR_INVALID_DATA_TYPE = 61,
  CMPI_RC_ERR_NOT_IN_CODEPAGE = 62,
  CMPI_RC_ERROR_SYSTEM = 100,
  CMPI_RC_ERROR = 200
} CMPIrc;

typedef enum _CMPIPredOp {
  CMPI_PredOp_Equals = 1,
  CMPI_PredOp_NotEquals = 2,
  CMPI_PredOp_LessThan = 3,
  CMPI_PredOp_GreaterThanOrEquals = 4,
  CMPI_PredOp_GreaterThan = 5,
  CMPI_PredOp_LessThanOrEquals = 6,
  CMPI_PredOp_Isa = 7,
  CMPI_PredOp_NotIsa = 8,
  CMPI_PredOp_Like = 9,
  CMPI_PredOp_NotLike = 10,
  CMPI_PredOp_Not_Null = 11,
  CMPI_PredOp_Null = 12,
  CMPI_PredOp_And = 13,
  CMPI_PredOp_Or = 14
} CMPIPredOp;

typedef enum _CMPISeverity {
  CMPI_SEV_ERROR = 1,
  CMPI_SEV_INFO = 2,
  CMPI_SEV_WARNING = 3,
  CMPI_DEV_DEBUG = 4
} CMPISeverity;

typedef enum _CMPILevel { CMPI_LEV_INFO = 1, CMPI_LEV_WARNING = 2, CMPI_LEV_VERBOSE = 3 } CMPILevel;

typedef enum _CMPIErrorType {
  UnknownErrorType = 0,
  OtherErrorType = 1,
  CommunicationsError = 2,
  QualityOfServiceError = 3,
  SoftwareError = 4,
  HardwareError = 5,
  EnvironmentalError = 6,
  SecurityError = 7,
  OversubscriptionError = 8,
  Oversubscription_Error = 8,
  UnavailableResourceError = 9,
  UnsupportedOperationError = 10
} CMPIErrorType;

typedef enum _CMPIErrorSeverity {
  ErrorSevUnknown = 0,
  ErrorSevLow = 2,
  ErrorSevMedium = 3,
  ErrorSevHigh = 4,
  ErrorSevFatal = 5
} CMPIErrorSeverity;

typedef enum _CMPIErrorSrcFormat { CMPIErrSrcUnknown = 0, CMPIErrSrcOther = 1, CIMObjectHandle = 2 } CMPIErrorSrcFormat;

/* The causes are those of the alarm standards and opaque here: a code passes through as it is. Only
 * its width counts, which the one enumerator fixes. */
typedef enum _CMPIErrorProbableCause { ErrorProbCauseUnknown = 0 } CMPIErrorProbableCause;

/* Encapsulated objects: a handle of the broker's and its table of operations (cmpift.h). */
typedef struct _CMPIBroker CMPIBroker;
typedef struct _CMPIBrokerFT CMPIBrokerFT;
typedef struct _CMPIBrokerEncFT CMPIBrokerEncFT;
typedef struct _CMPIBrokerExtFT CMPIBrokerExtFT;
typedef struct _CMPIBrokerMemFT CMPIBrokerMemFT;
typedef struct _CMPIContext CMPIContext;
typedef struct _CMPIContextFT CMPIContextFT;
typedef struct _CMPIResult CMPIResult;
typedef struct _CMPIResultFT CMPIResultFT;
typedef struct _CMPIString CMPIString;
typedef struct _CMPIStringFT CMPIStringFT;
typedef struct _CMPIArray CMPIArray;
typedef struct _CMPIArrayFT CMPIArrayFT;
typedef struct _CMPIEnumeration CMPIEnumeration;
typedef struct _CMPIEnumerationFT CMPIEnumerationFT;
typedef struct _CMPIInstance CMPIInstance;
typedef struct _CMPIInstanceFT CMPIInstanceFT;
typedef struct _CMPIObjectPath CMPIObjectPath;
typedef struct _CMPIObjectPathFT CMPIObjectPathFT;
typedef struct _CMPIArgs CMPIArgs;
typedef struct _CMPIArgsFT CMPIArgsFT;
typedef struct _CMPIDateTime CMPIDateTime;
typedef struct _CMPIDateTimeFT CMPIDateTimeFT;
typedef struct _CMPISelectExp CMPISelectExp;
typedef struct _CMPISelectExpFT CMPISelectExpFT;
typedef struct _CMPISelectCond CMPISelectCond;
typedef struct _CMPISelectCondFT CMPISelectCondFT;
typedef struct _CMPISubCond CMPISubCond;
typedef struct _CMPISubCondFT CMPISubCondFT;
typedef struct _CMPIPredicate CMPIPredicate;
typedef struct _CMPIPredicateFT CMPIPredicateFT;
typedef struct _CMPIError CMPIError;
typedef struct _CMPIErrorFT CMPIErrorFT;
typedef struct _CMPIInstanceMI CMPIInstanceMI;
typedef struct _CMPIInstanceMIFT CMPIInstanceMIFT;
typedef struct _CMPIAssociationMI CMPIAssociationMI;
typedef struct _CMPIAssociationMIFT CMPIAssociationMIFT;
typedef struct _CMPIMethodMI CMPIMethodMI;
typedef struct _CMPIMethodMIFT CMPIMethodMIFT;
typedef struct _CMPIPropertyMI CMPIPropertyMI;
typedef struct _CMPIPropertyMIFT CMPIPropertyMIFT;
typedef struct _CMPIIndicationMI CMPIIndicationMI;
typedef struct _CMPIIndicationMIFT CMPIIndicationMIFT;

typedef struct _CMPIValuePtr {
  void* ptr;
  CMPICount length;
} CMPIValuePtr;

typedef union _CMPIValue {
  CMPIBoolean boolean;
  CMPIChar16 char16;
  CMPIUint8 uint8;
  CMPIUint16 uint16;
  CMPIUint32 uint32;
  CMPIUint64 uint64;
  CMPISint8 sint8;
  CMPISint16 sint16;
  CMPISint32 sint32;
  CMPISint64 sint64;
  CMPIReal32 real32;
  CMPIReal64 real64;
  CMPIInstance* inst;
  CMPIObjectPath* ref;
  CMPIArgs* args;
  CMPISelectExp* filter;
  CMPIEnumeration* Enum;
  CMPIArray* array;
  CMPIString* string;
  char* chars;
  CMPIDateTime* dateTime;
  CMPIValuePtr dataPtr;
  CMPISint8 Byte;
  CMPISint16 Short;
  CMPISint32 Int;
  CMPISint64 Long;
  CMPIReal32 Float;
  CMPIReal64 Double;
} CMPIValue;

typedef struct _CMPIData {
  CMPIType type;
  CMPIValueState state;
  CMPIValue value;
} CMPIData;

typedef struct _CMPIStatus {
  CMPIrc rc;
  CMPIString* msg;
} CMPIStatus;

/* Reads a property by name for an expression; see CMPISelectExpFT. */
typedef CMPIData CMPIAccessor(const char*, void*);

#ifdef __cplusplus
}
#endif

#endif
