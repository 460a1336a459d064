// The convenience operations of this repository's headers against the text that the interface gives each. The arguments
// are the parameters' own names, so that the text is the definition word for word. Compiling this file is the test.

#include <cmpimacs.h>

#include <algorithm>
#include <iterator>
#include <string_view>

// The texts name these, so they must not be expanded any further.
#undef NULL
#undef CMPI_ARRAY
#undef CMPI_keyValue
#undef CMPI_nullValue

#define TEXT_OF_TOKENS(...) #__VA_ARGS__
#define TEXT_OF(...) TEXT_OF_TOKENS(__VA_ARGS__)

namespace {

struct Operation {
  std::string_view actual;    // in the header
  std::string_view expected;  // in the interface
};

template <std::size_t size>
consteval std::size_t firstDifference(const Operation (&operations)[size]) {
  return static_cast<std::size_t>(
      std::find_if(operations, operations + size, [](const Operation& each) { return each.actual != each.expected; }) -
      operations);
}

constexpr Operation operations[] = {
    {TEXT_OF(CBAssociatorNames(mb, ctx, instPath, assocClass, resultClass, role, resultRole, rc)),
     "((mb)->bft->associatorNames((mb), (ctx), (instPath), (assocClass), (resultClass), (role), (resultRole), (rc)))"},
    {TEXT_OF(CBAssociators(mb, ctx, instPath, assocClass, resultClass, role, resultRole, properties, rc)),
     "((mb)->bft->associators((mb), (ctx), (instPath), (assocClass), (resultClass), (role), (resultRole), (properties), (rc)))"},
    {TEXT_OF(CBAttachThread(mb, ctx)), "((mb)->bft->attachThread((mb), (ctx)))"},
    {TEXT_OF(CBBrokerVersion(mb)), "((mb)->bft->brokerVersion)"},
    {TEXT_OF(CBCreateInstance(mb, ctx, classPath, newInst, rc)),
     "((mb)->bft->createInstance((mb), (ctx), (classPath), (newInst), (rc)))"},
    {TEXT_OF(CBDeleteInstance(mb, ctx, instPath)), "((mb)->bft->deleteInstance((mb), (ctx), (instPath)))"},
    {TEXT_OF(CBDeliverIndication(mb, ctx, ns, ind)), "((mb)->bft->deliverIndication((mb), (ctx), (ns), (ind)))"},
    {TEXT_OF(CBEnumInstanceNames(mb, ctx, classPath, rc)),
     "((mb)->bft->enumerateInstanceNames((mb), (ctx), (classPath), (rc)))"},
    {TEXT_OF(CBEnumInstances(mb, ctx, classPath, properties, rc)),
     "((mb)->bft->enumerateInstances((mb), (ctx), (classPath), (properties), (rc)))"},
    {TEXT_OF(CBExecQuery(mb, ctx, classPath, query, lang, rc)),
     "((mb)->bft->execQuery((mb), (ctx), (classPath), (query), (lang), (rc)))"},
    {TEXT_OF(CBGetCapabilities(mb)), "((mb)->bft->brokerCapabilities)"},
    {TEXT_OF(CBGetInstance(mb, ctx, instPath, properties, rc)),
     "((mb)->bft->getInstance((mb), (ctx), (instPath), (properties), (rc)))"},
    {TEXT_OF(CBGetProperty(mb, ctx, instPath, name, rc)),
     "(mb)->bft->getProperty((mb), (ctx), (instPath), (name), (rc))"},
    {TEXT_OF(CBInvokeMethod(mb, ctx, objPath, method, in, out, rc)),
     "((mb)->bft->invokeMethod((mb), (ctx), (objPath), (method), (in), (out), (rc)))"},
    {TEXT_OF(CBModifyInstance(mb, ctx, instPath, modInst, properties)),
     "((mb)->bft->modifyInstance((mb), (ctx), (instPath), (modInst), (properties)))"},
    {TEXT_OF(CBPrepareAttachThread(mb, ctx)), "((mb)->bft->prepareAttachThread((mb), (ctx)))"},
    {TEXT_OF(CBReferenceNames(mb, ctx, instPath, resultClass, role, rc)),
     "((mb)->bft->referenceNames((mb), (ctx), (instPath), (resultClass), (role), (rc)))"},
    {TEXT_OF(CBReferences(mb, ctx, instPath, resultClass, role, properties, rc)),
     "((mb)->bft->references((mb), (ctx), (instPath), (resultClass), (role), (properties), (rc)))"},
    {TEXT_OF(CBSetProperty(mb, ctx, instPath, name, value, type)),
     "((mb)->bft->setProperty((mb), (ctx), (instPath), (name), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMAddArg(args, name, value, type)), "((args)->ft->addArg((args), (name), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMAddContextEntry(ctx, name, value, type)),
     "((ctx)->ft->addEntry((ctx), (name), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMAddKey(op, key, value, type)), "((op)->ft->addKey((op), (key), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMClassPathIsA(mb, classPath, className, rc)),
     "((mb)->eft->classPathIsA((mb), (classPath), (className), (rc)))"},
    {TEXT_OF(CMClone(obj, rc)), "((obj)->ft->clone((obj), (rc)))"},
    {TEXT_OF(CMCloseMessageFile(mb, msgFileHandle)), "((mb)->eft->closeMessageFile((mb), (msgFileHandle)))"},
    {TEXT_OF(CMEvaluatePredicateUsingAccessor(pr, accessorFnc, parm, rc)),
     "((pr)->ft->evaluateUsingAccessor((pr), (accessorFnc), (parm), (rc)))"},
    {TEXT_OF(CMEvaluateSelExp(se, inst, rc)), "((se)->ft->evaluate((se), (inst), (rc)))"},
    {TEXT_OF(CMEvaluateSelExpUsingAccessor(se, accessor, parm, rc)),
     "((se)->ft->evaluateUsingAccessor((se), (accessor), (parm), (rc)))"},
    {TEXT_OF(CMGetArg(args, name, rc)), "((args)->ft->getArg((args), (name), (rc)))"},
    {TEXT_OF(CMGetArgAt(args, index, name, rc)), "((args)->ft->getArgAt((args), (index), (name), (rc)))"},
    {TEXT_OF(CMGetArgCount(args, rc)), "((args)->ft->getArgCount((args), (rc)))"},
    {TEXT_OF(CMGetArrayCount(ar, rc)), "((ar)->ft->getSize((ar), (rc)))"},
    {TEXT_OF(CMGetArrayElementAt(ar, index, rc)), "((ar)->ft->getElementAt((ar), (index), (rc)))"},
    {TEXT_OF(CMGetArrayType(ar, rc)), "((ar)->ft->getSimpleType((ar), (rc)))"},
    {TEXT_OF(CMGetBinaryFormat(dt, rc)), "((dt)->ft->getBinaryFormat((dt), (rc)))"},
    {TEXT_OF(CMGetCIMStatusCode(er, rc)), "((er)->ft->getCIMStatusCode((er), (rc)))"},
    {TEXT_OF(CMGetCIMStatusCodeDescription(er, rc)), "((er)->ft->getCIMStatusCodeDescription((er), (rc)))"},
    {TEXT_OF(CMGetCharPtr(str)), "((str)->ft->getCharPtr((str), NULL))"},
    {TEXT_OF(CMGetCharsPtr(str, rc)), "((str)->ft->getCharPtr((str), (rc)))"},
    {TEXT_OF(CMGetClassName(op, rc)), "((op)->ft->getClassName((op), (rc)))"},
    {TEXT_OF(CMGetClassQualifier(op, qName, rc)), "((op)->ft->getClassQualifier((op), (qName), (rc)))"},
    {TEXT_OF(CMGetCod(se, rc)), "((se)->ft->getCOD((se), (rc)))"},
    {TEXT_OF(CMGetContextEntry(ctx, name, rc)), "((ctx)->ft->getEntry((ctx), (name), (rc)))"},
    {TEXT_OF(CMGetContextEntryAt(ctx, index, name, rc)), "((ctx)->ft->getEntryAt((ctx), (index), (name), (rc)))"},
    {TEXT_OF(CMGetContextEntryCount(ctx, rc)), "((ctx)->ft->getEntryCount((ctx), (rc)))"},
    {TEXT_OF(CMGetDoc(se, rc)), "((se)->ft->getDOC((se), (rc)))"},
    {TEXT_OF(CMGetErrorMessage(er, rc)), "((er)->ft->getMessage((er), (rc)))"},
    {TEXT_OF(CMGetErrorSourceFormat(er, rc)), "((er)->ft->getErrorSourceFormat((er), (rc)))"},
    {TEXT_OF(CMGetErrorType(er, rc)), "((er)->ft->getErrorType((er), (rc)))"},
    {TEXT_OF(CMGetHostname(op, rc)), "((op)->ft->getHostname((op), (rc)))"},
    {TEXT_OF(CMGetKey(op, key, rc)), "((op)->ft->getKey((op),(key),(rc)))"},
    {TEXT_OF(CMGetKeyAt(op, index, name, rc)), "((op)->ft->getKeyAt((op), (index), (name), (rc)))"},
    {TEXT_OF(CMGetKeyCount(op, rc)), "((op)->ft->getKeyCount((op), (rc)))"},
    {TEXT_OF(CMGetMessage(mb, msgId, defMsg, rc, args)),
     "((mb)->eft->getMessage((mb), (msgId), (defMsg), (rc), args))"},
    {TEXT_OF(CMGetMessageArguments(er, rc)), "((er)->ft->getMessageArguments((er), (rc)))"},
    {TEXT_OF(CMGetMessageID(er, rc)), "((er)->ft->getMessageID((er), (rc)))"},
    {TEXT_OF(CMGetMethodQualifier(op, mName, qName, rc)),
     "((op)->ft->getMethodQualifier((op), (mName), (qName), (rc)))"},
    {TEXT_OF(CMGetNameSpace(op, rc)), "((op)->ft->getNameSpace((op), (rc)))"},
    {TEXT_OF(CMGetNext(en, rc)), "((en)->ft->getNext((en), (rc)))"},
    {TEXT_OF(CMGetObjectPath(inst, rc)), "((inst)->ft->getObjectPath((inst), (rc)))"},
    {TEXT_OF(CMGetOtherErrorSourceFormat(er, rc)), "((er)->ft->getOtherErrorSourceFormat((er), (rc)))"},
    {TEXT_OF(CMGetOtherErrorType(er, rc)), "((er)->ft->getOtherErrorType((er), (rc)))"},
    {TEXT_OF(CMGetOwningEntity(er, rc)), "((er)->ft->getOwningEntity((er), (rc)))"},
    {TEXT_OF(CMGetParameterQualifier(op, mName, pName, qName, rc)),
     "((op)->ft->getParameterQualifier((op), (mName), (pName), (qName), (rc)))"},
    {TEXT_OF(CMGetPerceivedSeverity(er, rc)), "((er)->ft->getPerceivedSeverity((er), (rc)))"},
    {TEXT_OF(CMGetPredicate(sc, name, rc)), "((sc)->ft->getPredicate((sc), (name), (rc)))"},
    {TEXT_OF(CMGetPredicateAt(sc, index, rc)), "((sc)->ft->getPredicateAt((sc), (index), (rc)))"},
    {TEXT_OF(CMGetPredicateCount(sc, rc)), "((sc)->ft->getCount((sc), (rc)))"},
    {TEXT_OF(CMGetPredicateData(pr, type, prop, lhs, rhs)), "((pr)->ft->getData((pr), (type), (prop), (lhs), (rhs)))"},
    {TEXT_OF(CMGetProbableCause(er, rc)), "((er)->ft->getProbableCause((er), (rc)))"},
    {TEXT_OF(CMGetProbableCauseDescription(er, rc)), "((er)->ft->getProbableCauseDescription((er), (rc)))"},
    {TEXT_OF(CMGetProperty(inst, name, rc)), "((inst)->ft->getProperty((inst), (name), (rc)))"},
    {TEXT_OF(CMGetPropertyAt(inst, index, name, rc)), "((inst)->ft->getPropertyAt((inst), (index), (name), (rc)))"},
    {TEXT_OF(CMGetPropertyCount(inst, rc)), "((inst)->ft->getPropertyCount((inst), (rc)))"},
    {TEXT_OF(CMGetPropertyQualifier(op, pName, qName, rc)),
     "((op)->ft->getPropertyQualifier((op), (pName), (qName), (rc)))"},
    {TEXT_OF(CMGetRecommendedActions(er, rc)), "((er)->ft->getRecommendedActions((er), (rc)))"},
    {TEXT_OF(CMGetSelExpString(se, rc)), "((se)->ft->getString((se), (rc)))"},
    {TEXT_OF(CMGetStringFormat(dt, rc)), "((dt)->ft->getStringFormat((dt), (rc)))"},
    {TEXT_OF(CMGetSubCondAt(sc, index, rc)), "((sc)->ft->getSubCondAt((sc), (index), (rc)))"},
    {TEXT_OF(CMGetSubCondCountAndType(sc, type, rc)), "((sc)->ft->getCountAndType((sc), (type), (rc)))"},
    {TEXT_OF(CMHasNext(en, rc)), "((en)->ft->hasNext((en), (rc)))"},
    {TEXT_OF(CMIsArray(data)), "(((data).type & CMPI_ARRAY) != 0)"},
    {TEXT_OF(CMIsInterval(dt, rc)), "((dt)->ft->isInterval((dt), (rc)))"},
    {TEXT_OF(CMIsKeyValue(data)), "(((data).state & CMPI_keyValue) != 0)"},
    {TEXT_OF(CMIsNullObject(objptr)), "((objptr) == NULL)"},
    {TEXT_OF(CMIsNullValue(data)), "(((data).state & CMPI_nullValue) != 0)"},
    {TEXT_OF(CMLogMessage(mb, severity, id, text, string)),
     "((mb)->eft->logMessage((mb), (severity), (id), (text), (string)))"},
    {TEXT_OF(CMNewArgs(mb, rc)), "((mb)->eft->newArgs((mb), (rc)))"},
    {TEXT_OF(CMNewArray(mb, size, type, rc)), "((mb)->eft->newArray((mb), (size), (type), (rc)))"},
    {TEXT_OF(CMNewCMPIError(mb, owner, msgID, msg, sev, pc, cimStatusCode, rc)),
     "((mb)->eft->newCMPIError((mb), (owner), (msgID), (msg), (sev), (pc), (cimStatusCode), (rc)))"},
    {TEXT_OF(CMNewDateTime(mb, rc)), "((mb)->eft->newDateTime((mb), (rc)))"},
    {TEXT_OF(CMNewDateTimeFromBinary(mb, binTime, interval, rc)),
     "((mb)->eft->newDateTimeFromBinary((mb), (binTime), (interval), (rc)))"},
    {TEXT_OF(CMNewDateTimeFromChars(mb, datetime, rc)), "((mb)->eft->newDateTimeFromChars((mb), (datetime), (rc)))"},
    {TEXT_OF(CMNewInstance(mb, instPath, rc)), "((mb)->eft->newInstance((mb), (instPath), (rc)))"},
    {TEXT_OF(CMNewObjectPath(mb, ns, cn, rc)), "((mb)->eft->newObjectPath((mb), (ns), (cn), (rc)))"},
    {TEXT_OF(CMNewSelectExp(mb, query, lang, projection, rc)),
     "((mb)->eft->newSelectExp((mb), (query), (lang), (projection), (rc)))"},
    {TEXT_OF(CMNewString(mb, data, rc)), "((mb)->eft->newString((mb), (data), (rc)))"},
    {TEXT_OF(CMOpenMessageFile(mb, msgFile, msgFileHandle)),
     "((mb)->eft->openMessageFile((mb), (msgFile), (msgFileHandle)))"},
    {TEXT_OF(CMRelease(obj)), "((obj)->ft->release((obj)))"},
    {TEXT_OF(CMReturnData(rslt, value, type)), "((rslt)->ft->returnData((rslt), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMReturnDone(rslt)), "((rslt)->ft->returnDone((rslt)))"},
    {TEXT_OF(CMReturnError(rslt, er)), "((rslt)->ft->returnError((rslt), (er)))"},
    {TEXT_OF(CMReturnInstance(rslt, inst)), "((rslt)->ft->returnInstance((rslt), (inst)))"},
    {TEXT_OF(CMReturnObjectPath(rslt, op)), "((rslt)->ft->returnObjectPath((rslt), (op)))"},
    {TEXT_OF(CMSetArrayElementAt(ar, index, value, type)),
     "((ar)->ft->setElementAt((ar), (index), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMSetCIMStatusCodeDescription(er, scd)), "((er)->ft->setCIMStatusCodeDescription((er), (scd)))"},
    {TEXT_OF(CMSetClassName(op, cn)), "((op)->ft->setClassName((op), (cn)))"},
    {TEXT_OF(CMSetErrorSource(er, es)), "((er)->ft->setErrorSource((er), (es)))"},
    {TEXT_OF(CMSetErrorSourceFormat(er, esf)), "((er)->ft->setErrorSourceFormat((er), (esf)))"},
    {TEXT_OF(CMSetErrorType(er, et)), "((er)->ft->setErrorType((er), (et)))"},
    {TEXT_OF(CMSetHostAndNameSpaceFromObjectPath(op, src)),
     "((op)->ft->setHostAndNameSpaceFromObjectPath((op), (src)))"},
    {TEXT_OF(CMSetHostname(op, hn)), "((op)->ft->setHostname((op), (hn)))"},
    {TEXT_OF(CMSetMessageArguments(er, values)), "((er)->ft->setMessageArguments((er), (values)))"},
    {TEXT_OF(CMSetNameSpace(op, ns)), "((op)->ft->setNameSpace((op), (ns)))"},
    {TEXT_OF(CMSetNameSpaceFromObjectPath(op, src)), "((op)->ft->setNameSpaceFromObjectPath((op), (src)))"},
    {TEXT_OF(CMSetObjectPath(inst, op)), "((inst)->ft->setObjectPath((inst), (op)))"},
    {TEXT_OF(CMSetOtherErrorSourceFormat(er, oef)), "((er)->ft->setOtherErrorSourceFormat((er), (oef)))"},
    {TEXT_OF(CMSetOtherErrorType(er, ot)), "((er)->ft->setOtherErrorType((er), (ot)))"},
    {TEXT_OF(CMSetProbableCauseDescription(er, pcd)), "((er)->ft->setProbableCauseDescription((er), (pcd)))"},
    {TEXT_OF(CMSetProperty(inst, name, value, type)),
     "((inst)->ft->setProperty((inst), (name), (CMPIValue *)(value), (type)))"},
    {TEXT_OF(CMSetPropertyFilter(inst, properties, keyList)),
     "((inst)->ft->setPropertyFilter((inst), (properties), (keyList)))"},
    {TEXT_OF(CMSetPropertyWithOrigin(inst, name, value, type, origin)),
     "((inst)->ft->setPropertyWithOrigin((inst), (name), (CMPIValue *)(value), (type), (origin)))"},
    {TEXT_OF(CMSetRecommendedActions(er, ra)), "((er)->ft->setRecommendedActions((er), (ra)))"},
    {TEXT_OF(CMSetStatus(st, rc_)), "do { if (st) { (st)->rc = (rc_); (st)->msg = NULL; } } while (0)"},
    {TEXT_OF(CMSetStatusWithChars(mb, st, rc_, msg_)),
     "do { if (st) { (st)->rc = (rc_); if (mb) (st)->msg = (mb)->eft->newString((mb), (msg_), NULL); else (st)->msg = NULL; } } while (0)"},
    {TEXT_OF(CMSetStatusWithString(st, rc_, msg_)),
     "do { if (st) { (st)->rc = (rc_); (st)->msg = (msg_); } } while (0)"},
    {TEXT_OF(CMToArray(en, rc)), "((en)->ft->toArray((en), (rc)))"},
    {TEXT_OF(CMTraceMessage(mb, level, component, text, string)),
     "((mb)->eft->trace((mb), (level), (component), (text), (string)))"},
};

#undef CMSetStatusWithChars
#undef CMSetStatusWithString

constexpr Operation operationsMadeOfOthers[] = {
    {TEXT_OF(CMReturnWithChars(mb, rc, chars)),
     "do { CMPIStatus stat; CMSetStatusWithChars(mb, &stat, rc, chars); return stat; } while (0)"},
    {TEXT_OF(CMReturnWithString(rc, str)),
     "do { CMPIStatus stat; CMSetStatusWithString(&stat, rc, str); return stat; } while (0)"},
};

// All are alike: the first that differs is the one past the end.
static_assert(firstDifference(operations) == 128);
static_assert(firstDifference(operationsMadeOfOthers) == 2);

}  // namespace
