#ifndef CORVANE_TESTS_CMPI_STANDARD_CMPIMACS_H
#define CORVANE_TESTS_CMPI_STANDARD_CMPIMACS_H

/* Convenience operations in the form of the standard's headers: inline functions, which convert no argument and hide no
 * type. Only the operations that the library and the companion use. There is no CBEnumInstances, because its macro form
 * in the standard's headers does not compile. */

#include <cmpift.h>

#define CORVANE_OPERATION(result, name, parameters, call) \
  static inline result name parameters {                  \
    return call;                                          \
  }

CORVANE_OPERATION(CMPIEnumeration*, CBEnumInstanceNames,
                  (const CMPIBroker* broker, const CMPIContext* context, const CMPIObjectPath* path, CMPIStatus* rc),
                  broker->bft->enumerateInstanceNames(broker, context, path, rc))

CORVANE_OPERATION(CMPIArray*, CMNewArray, (const CMPIBroker* broker, CMPICount size, CMPIType type, CMPIStatus* rc),
                  broker->eft->newArray(broker, size, type, rc))
CORVANE_OPERATION(CMPIInstance*, CMNewInstance, (const CMPIBroker* broker, const CMPIObjectPath* path, CMPIStatus* rc),
                  broker->eft->newInstance(broker, path, rc))
CORVANE_OPERATION(CMPIObjectPath*, CMNewObjectPath,
                  (const CMPIBroker* broker, const char* nameSpace, const char* className, CMPIStatus* rc),
                  broker->eft->newObjectPath(broker, nameSpace, className, rc))
CORVANE_OPERATION(CMPIString*, CMNewString, (const CMPIBroker* broker, const char* text, CMPIStatus* rc),
                  broker->eft->newString(broker, text, rc))

CORVANE_OPERATION(CMPIStatus, CMAddKey,
                  (const CMPIObjectPath* path, const char* name, const CMPIValue* value, const CMPIType type),
                  path->ft->addKey(path, name, value, type))
CORVANE_OPERATION(CMPIString*, CMGetClassName, (const CMPIObjectPath* path, CMPIStatus* rc),
                  path->ft->getClassName(path, rc))
CORVANE_OPERATION(CMPIData, CMGetKey, (const CMPIObjectPath* path, const char* name, CMPIStatus* rc),
                  path->ft->getKey(path, name, rc))
CORVANE_OPERATION(CMPICount, CMGetKeyCount, (const CMPIObjectPath* path, CMPIStatus* rc),
                  path->ft->getKeyCount(path, rc))
CORVANE_OPERATION(CMPIString*, CMGetNameSpace, (const CMPIObjectPath* path, CMPIStatus* rc),
                  path->ft->getNameSpace(path, rc))
CORVANE_OPERATION(CMPIStatus, CMSetClassName, (const CMPIObjectPath* path, const char* name),
                  path->ft->setClassName(path, name))
CORVANE_OPERATION(CMPIStatus, CMSetHostname, (const CMPIObjectPath* path, const char* name),
                  path->ft->setHostname(path, name))
CORVANE_OPERATION(CMPIStatus, CMSetNameSpace, (const CMPIObjectPath* path, const char* name),
                  path->ft->setNameSpace(path, name))

CORVANE_OPERATION(CMPIObjectPath*, CMGetObjectPath, (const CMPIInstance* instance, CMPIStatus* rc),
                  instance->ft->getObjectPath(instance, rc))
CORVANE_OPERATION(CMPIStatus, CMSetProperty,
                  (const CMPIInstance* instance, const char* name, const CMPIValue* value, const CMPIType type),
                  instance->ft->setProperty(instance, name, value, type))
CORVANE_OPERATION(CMPIStatus, CMSetPropertyFilter,
                  (const CMPIInstance* instance, const char** properties, const char** keys),
                  instance->ft->setPropertyFilter(instance, properties, keys))

CORVANE_OPERATION(CMPIStatus, CMSetArrayElementAt,
                  (const CMPIArray* array, CMPICount index, const CMPIValue* value, const CMPIType type),
                  array->ft->setElementAt(array, index, value, type))

CORVANE_OPERATION(CMPIData, CMGetNext, (const CMPIEnumeration* enumeration, CMPIStatus* rc),
                  enumeration->ft->getNext(enumeration, rc))
CORVANE_OPERATION(CMPIBoolean, CMHasNext, (const CMPIEnumeration* enumeration, CMPIStatus* rc),
                  enumeration->ft->hasNext(enumeration, rc))

CORVANE_OPERATION(const char*, CMGetCharPtr, (const CMPIString* string), string->ft->getCharPtr(string, NULL))
CORVANE_OPERATION(const char*, CMGetCharsPtr, (const CMPIString* string, CMPIStatus* rc),
                  string->ft->getCharPtr(string, rc))

CORVANE_OPERATION(CMPIStatus, CMReturnDone, (const CMPIResult* result), result->ft->returnDone(result))
CORVANE_OPERATION(CMPIStatus, CMReturnInstance, (const CMPIResult* result, const CMPIInstance* instance),
                  result->ft->returnInstance(result, instance))
CORVANE_OPERATION(CMPIStatus, CMReturnObjectPath, (const CMPIResult* result, const CMPIObjectPath* path),
                  result->ft->returnObjectPath(result, path))

#undef CORVANE_OPERATION

/* Operations of every kind of object, which the standard leaves as macros. */
#define CMClone(object, rc) ((object)->ft->clone((object), (rc)))
#define CMRelease(object) ((object)->ft->release((object)))

static inline void CMSetStatusWithChars(const CMPIBroker* broker, CMPIStatus* status, const CMPIrc code,
                                        const char* text) {
  if (status != NULL) {
    status->rc = code;
    status->msg = broker == NULL ? NULL : CMNewString(broker, text, NULL);
  }
}

#endif
