// Every convenience operation against the text that the interface gives it. The arguments of each call
// are the parameters' own names, so that the text is the operation's definition word for word.

#include <cmpimacs.h>
#include <gtest/gtest.h>

#include <string_view>

// Operations of the interface stand in the texts by their names; they must not be expanded any further.
#undef NULL
#undef CMPI_ARRAY
#undef CMPI_keyValue
#undef CMPI_nullValue

#define TEXT_OF_TOKENS(...) #__VA_ARGS__
#define TEXT_OF(...) TEXT_OF_TOKENS(__VA_ARGS__)

namespace {

struct Operation {
  std::string_view name;
  std::string_view actual;
  std::string_view expected;
};

constexpr Operation operations[] = {
    {"CBAssociatorNames", TEXT_OF(CBAssociatorNames(mb, ctx, instPath, assocClass, resultClass, role, resultRole, rc)),
     "((mb)->bft->associatorNames((mb), (ctx), (instPath), (assocClass), (resultClass), (role), (resultRole), (rc)))"},
    {"CBAssociators",
     TEXT_OF(CBAssociators(mb, ctx, instPath, assocClass, resultClass, role, resultRole, properties, rc)),
     "((mb)->bft->associators((mb), (ctx), (instPath), (assocClass), (resultClass), (role), (resultRole), (properties), (rc)))"},
    {"CBAttachThread", TEXT_OF(CBAttachThread(mb, ctx)), "((mb)->bft->attachThread((mb), (ctx)))"},
    {"CBBrokerVersion", TEXT_OF(CBBrokerVersion(mb)), "((mb)->bft->brokerVersion)"},
    {"CBCreateInstance", TEXT_OF(CBCreateInstance(mb, ctx, classPath, newInst, rc)),
     "((mb)->bft->createInstance((mb), (ctx), (classPath), (newInst), (rc)))"},
    {"CBDeleteInstance", TEXT_OF(CBDeleteInstance(mb, ctx, instPath)),
     "((mb)->bft->deleteInstance((mb), (ctx), (instPath)))"},
    {"CBDeliverIndication", TEXT_OF(CBDeliverIndication(mb, ctx, ns, ind)),
     "((mb)->bft->deliverIndication((mb), (ctx), (ns), (ind)))"},
    {"CBEnumInstanceNames", TEXT_OF(CBEnumInstanceNames(mb, ctx, classPath, rc)),
     "((mb)->bft->enumerateInstanceNames((mb), (ctx), (classPath), (rc)))"},
    {"CBEnumInstances", TEXT_OF(CBEnumInstances(mb, ctx, classPath, properties, rc)),
     "((mb)->bft->enumerateInstances((mb), (ctx), (classPath), (properties), (rc)))"},
    {"CBExecQuery", TEXT_OF(CBExecQuery(mb, ctx, classPath, query, lang, rc)),
     "((mb)->bft->execQuery((mb), (ctx), (classPath), (query), (lang), (rc)))"},
    {"CBGetCapabilities", TEXT_OF(CBGetCapabilities(mb)), "((mb)->bft->brokerCapabilities)"},
    {"CBGetInstance", TEXT_OF(CBGetInstance(mb, ctx, instPath, properties, rc)),
     "((mb)->bft->getInstance((mb), (ctx), (instPath), (properties), (rc)))"},
    {"CBGetProperty", TEXT_OF(CBGetProperty(mb, ctx, instPath, name, rc)),
     "(mb)->bft->getProperty((mb), (ctx), (instPath), (name), (rc))"},
    {"CBInvokeMethod", TEXT_OF(CBInvokeMethod(mb, ctx, objPath, method, in, out, rc)),
     "((mb)->bft->invokeMethod((mb), (ctx), (objPath), (method), (in), (out), (rc)))"},
    {"CBModifyInstance", TEXT_OF(CBModifyInstance(mb, ctx, instPath, modInst, properties)),
     "((mb)->bft->modifyInstance((mb), (ctx), (instPath), (modInst), (properties)))"},
    {"CBPrepareAttachThread", TEXT_OF(CBPrepareAttachThread(mb, ctx)), "((mb)->bft->prepareAttachThread((mb), (ctx)))"},
    {"CBReferenceNames", TEXT_OF(CBReferenceNames(mb, ctx, instPath, resultClass, role, rc)),
     "((mb)->bft->referenceNames((mb), (ctx), (instPath), (resultClass), (role), (rc)))"},
    {"CBReferences", TEXT_OF(CBReferences(mb, ctx, instPath, resultClass, role, properties, rc)),
     "((mb)->bft->references((mb), (ctx), (instPath), (resultClass), (role), (properties), (rc)))"},
    {"CBSetProperty", TEXT_OF(CBSetProperty(mb, ctx, instPath, name, value, type)),
     "((mb)->bft->setProperty((mb), (ctx), (instPath), (name), (CMPIValue *)(value), (type)))"},
    {"CMAddArg", TEXT_OF(CMAddArg(args, name, value, type)),
     "((args)->ft->addArg((args), (name), (CMPIValue *)(value), (type)))"},
    {"CMAddContextEntry", TEXT_OF(CMAddContextEntry(ctx, name, value, type)),
     "((ctx)->ft->addEntry((ctx), (name), (CMPIValue *)(value), (type)))"},
    {"CMAddKey", TEXT_OF(CMAddKey(op, key, value, type)),
     "((op)->ft->addKey((op), (key), (CMPIValue *)(value), (type)))"},
    {"CMClassPathIsA", TEXT_OF(CMClassPathIsA(mb, classPath, className, rc)),
     "((mb)->eft->classPathIsA((mb), (classPath), (className), (rc)))"},
    {"CMClone", TEXT_OF(CMClone(obj, rc)), "((obj)->ft->clone((obj), (rc)))"},
    {"CMCloseMessageFile", TEXT_OF(CMCloseMessageFile(mb, msgFileHandle)),
     "((mb)->eft->closeMessageFile((mb), (msgFileHandle)))"},
    {"CMEvaluatePredicateUsingAccessor", TEXT_OF(CMEvaluatePredicateUsingAccessor(pr, accessorFnc, parm, rc)),
     "((pr)->ft->evaluateUsingAccessor((pr), (accessorFnc), (parm), (rc)))"},
    {"CMEvaluateSelExp", TEXT_OF(CMEvaluateSelExp(se, inst, rc)), "((se)->ft->evaluate((se), (inst), (rc)))"},
    {"CMEvaluateSelExpUsingAccessor", TEXT_OF(CMEvaluateSelExpUsingAccessor(se, accessor, parm, rc)),
     "((se)->ft->evaluateUsingAccessor((se), (accessor), (parm), (rc)))"},
    {"CMGetArg", TEXT_OF(CMGetArg(args, name, rc)), "((args)->ft->getArg((args), (name), (rc)))"},
    {"CMGetArgAt", TEXT_OF(CMGetArgAt(args, index, name, rc)), "((args)->ft->getArgAt((args), (index), (name), (rc)))"},
    {"CMGetArgCount", TEXT_OF(CMGetArgCount(args, rc)), "((args)->ft->getArgCount((args), (rc)))"},
    {"CMGetArrayCount", TEXT_OF(CMGetArrayCount(ar, rc)), "((ar)->ft->getSize((ar), (rc)))"},
    {"CMGetArrayElementAt", TEXT_OF(CMGetArrayElementAt(ar, index, rc)),
     "((ar)->ft->getElementAt((ar), (index), (rc)))"},
    {"CMGetArrayType", TEXT_OF(CMGetArrayType(ar, rc)), "((ar)->ft->getSimpleType((ar), (rc)))"},
    {"CMGetBinaryFormat", TEXT_OF(CMGetBinaryFormat(dt, rc)), "((dt)->ft->getBinaryFormat((dt), (rc)))"},
    {"CMGetCIMStatusCode", TEXT_OF(CMGetCIMStatusCode(er, rc)), "((er)->ft->getCIMStatusCode((er), (rc)))"},
    {"CMGetCIMStatusCodeDescription", TEXT_OF(CMGetCIMStatusCodeDescription(er, rc)),
     "((er)->ft->getCIMStatusCodeDescription((er), (rc)))"},
    {"CMGetCharPtr", TEXT_OF(CMGetCharPtr(str)), "((str)->ft->getCharPtr((str), NULL))"},
    {"CMGetCharsPtr", TEXT_OF(CMGetCharsPtr(str, rc)), "((str)->ft->getCharPtr((str), (rc)))"},
    {"CMGetClassName", TEXT_OF(CMGetClassName(op, rc)), "((op)->ft->getClassName((op), (rc)))"},
    {"CMGetClassQualifier", TEXT_OF(CMGetClassQualifier(op, qName, rc)),
     "((op)->ft->getClassQualifier((op), (qName), (rc)))"},
    {"CMGetCod", TEXT_OF(CMGetCod(se, rc)), "((se)->ft->getCOD((se), (rc)))"},
    {"CMGetContextEntry", TEXT_OF(CMGetContextEntry(ctx, name, rc)), "((ctx)->ft->getEntry((ctx), (name), (rc)))"},
    {"CMGetContextEntryAt", TEXT_OF(CMGetContextEntryAt(ctx, index, name, rc)),
     "((ctx)->ft->getEntryAt((ctx), (index), (name), (rc)))"},
    {"CMGetContextEntryCount", TEXT_OF(CMGetContextEntryCount(ctx, rc)), "((ctx)->ft->getEntryCount((ctx), (rc)))"},
    {"CMGetDoc", TEXT_OF(CMGetDoc(se, rc)), "((se)->ft->getDOC((se), (rc)))"},
    {"CMGetErrorMessage", TEXT_OF(CMGetErrorMessage(er, rc)), "((er)->ft->getMessage((er), (rc)))"},
    {"CMGetErrorSourceFormat", TEXT_OF(CMGetErrorSourceFormat(er, rc)), "((er)->ft->getErrorSourceFormat((er), (rc)))"},
    {"CMGetErrorType", TEXT_OF(CMGetErrorType(er, rc)), "((er)->ft->getErrorType((er), (rc)))"},
    {"CMGetHostname", TEXT_OF(CMGetHostname(op, rc)), "((op)->ft->getHostname((op), (rc)))"},
    {"CMGetKey", TEXT_OF(CMGetKey(op, key, rc)), "((op)->ft->getKey((op),(key),(rc)))"},
    {"CMGetKeyAt", TEXT_OF(CMGetKeyAt(op, index, name, rc)), "((op)->ft->getKeyAt((op), (index), (name), (rc)))"},
    {"CMGetKeyCount", TEXT_OF(CMGetKeyCount(op, rc)), "((op)->ft->getKeyCount((op), (rc)))"},
    {"CMGetMessage", TEXT_OF(CMGetMessage(mb, msgId, defMsg, rc, args)),
     "((mb)->eft->getMessage((mb), (msgId), (defMsg), (rc), args))"},
    {"CMGetMessageArguments", TEXT_OF(CMGetMessageArguments(er, rc)), "((er)->ft->getMessageArguments((er), (rc)))"},
    {"CMGetMessageID", TEXT_OF(CMGetMessageID(er, rc)), "((er)->ft->getMessageID((er), (rc)))"},
    {"CMGetMethodQualifier", TEXT_OF(CMGetMethodQualifier(op, mName, qName, rc)),
     "((op)->ft->getMethodQualifier((op), (mName), (qName), (rc)))"},
    {"CMGetNameSpace", TEXT_OF(CMGetNameSpace(op, rc)), "((op)->ft->getNameSpace((op), (rc)))"},
    {"CMGetNext", TEXT_OF(CMGetNext(en, rc)), "((en)->ft->getNext((en), (rc)))"},
    {"CMGetObjectPath", TEXT_OF(CMGetObjectPath(inst, rc)), "((inst)->ft->getObjectPath((inst), (rc)))"},
    {"CMGetOtherErrorSourceFormat", TEXT_OF(CMGetOtherErrorSourceFormat(er, rc)),
     "((er)->ft->getOtherErrorSourceFormat((er), (rc)))"},
    {"CMGetOtherErrorType", TEXT_OF(CMGetOtherErrorType(er, rc)), "((er)->ft->getOtherErrorType((er), (rc)))"},
    {"CMGetOwningEntity", TEXT_OF(CMGetOwningEntity(er, rc)), "((er)->ft->getOwningEntity((er), (rc)))"},
    {"CMGetParameterQualifier", TEXT_OF(CMGetParameterQualifier(op, mName, pName, qName, rc)),
     "((op)->ft->getParameterQualifier((op), (mName), (pName), (qName), (rc)))"},
    {"CMGetPerceivedSeverity", TEXT_OF(CMGetPerceivedSeverity(er, rc)), "((er)->ft->getPerceivedSeverity((er), (rc)))"},
    {"CMGetPredicate", TEXT_OF(CMGetPredicate(sc, name, rc)), "((sc)->ft->getPredicate((sc), (name), (rc)))"},
    {"CMGetPredicateAt", TEXT_OF(CMGetPredicateAt(sc, index, rc)), "((sc)->ft->getPredicateAt((sc), (index), (rc)))"},
    {"CMGetPredicateCount", TEXT_OF(CMGetPredicateCount(sc, rc)), "((sc)->ft->getCount((sc), (rc)))"},
    {"CMGetPredicateData", TEXT_OF(CMGetPredicateData(pr, type, prop, lhs, rhs)),
     "((pr)->ft->getData((pr), (type), (prop), (lhs), (rhs)))"},
    {"CMGetProbableCause", TEXT_OF(CMGetProbableCause(er, rc)), "((er)->ft->getProbableCause((er), (rc)))"},
    {"CMGetProbableCauseDescription", TEXT_OF(CMGetProbableCauseDescription(er, rc)),
     "((er)->ft->getProbableCauseDescription((er), (rc)))"},
    {"CMGetProperty", TEXT_OF(CMGetProperty(inst, name, rc)), "((inst)->ft->getProperty((inst), (name), (rc)))"},
    {"CMGetPropertyAt", TEXT_OF(CMGetPropertyAt(inst, index, name, rc)),
     "((inst)->ft->getPropertyAt((inst), (index), (name), (rc)))"},
    {"CMGetPropertyCount", TEXT_OF(CMGetPropertyCount(inst, rc)), "((inst)->ft->getPropertyCount((inst), (rc)))"},
    {"CMGetPropertyQualifier", TEXT_OF(CMGetPropertyQualifier(op, pName, qName, rc)),
     "((op)->ft->getPropertyQualifier((op), (pName), (qName), (rc)))"},
    {"CMGetRecommendedActions", TEXT_OF(CMGetRecommendedActions(er, rc)),
     "((er)->ft->getRecommendedActions((er), (rc)))"},
    {"CMGetSelExpString", TEXT_OF(CMGetSelExpString(se, rc)), "((se)->ft->getString((se), (rc)))"},
    {"CMGetStringFormat", TEXT_OF(CMGetStringFormat(dt, rc)), "((dt)->ft->getStringFormat((dt), (rc)))"},
    {"CMGetSubCondAt", TEXT_OF(CMGetSubCondAt(sc, index, rc)), "((sc)->ft->getSubCondAt((sc), (index), (rc)))"},
    {"CMGetSubCondCountAndType", TEXT_OF(CMGetSubCondCountAndType(sc, type, rc)),
     "((sc)->ft->getCountAndType((sc), (type), (rc)))"},
    {"CMHasNext", TEXT_OF(CMHasNext(en, rc)), "((en)->ft->hasNext((en), (rc)))"},
    {"CMIsArray", TEXT_OF(CMIsArray(data)), "(((data).type & CMPI_ARRAY) != 0)"},
    {"CMIsInterval", TEXT_OF(CMIsInterval(dt, rc)), "((dt)->ft->isInterval((dt), (rc)))"},
    {"CMIsKeyValue", TEXT_OF(CMIsKeyValue(data)), "(((data).state & CMPI_keyValue) != 0)"},
    {"CMIsNullObject", TEXT_OF(CMIsNullObject(objptr)), "((objptr) == NULL)"},
    {"CMIsNullValue", TEXT_OF(CMIsNullValue(data)), "(((data).state & CMPI_nullValue) != 0)"},
    {"CMLogMessage", TEXT_OF(CMLogMessage(mb, severity, id, text, string)),
     "((mb)->eft->logMessage((mb), (severity), (id), (text), (string)))"},
    {"CMNewArgs", TEXT_OF(CMNewArgs(mb, rc)), "((mb)->eft->newArgs((mb), (rc)))"},
    {"CMNewArray", TEXT_OF(CMNewArray(mb, size, type, rc)), "((mb)->eft->newArray((mb), (size), (type), (rc)))"},
    {"CMNewCMPIError", TEXT_OF(CMNewCMPIError(mb, owner, msgID, msg, sev, pc, cimStatusCode, rc)),
     "((mb)->eft->newCMPIError((mb), (owner), (msgID), (msg), (sev), (pc), (cimStatusCode), (rc)))"},
    {"CMNewDateTime", TEXT_OF(CMNewDateTime(mb, rc)), "((mb)->eft->newDateTime((mb), (rc)))"},
    {"CMNewDateTimeFromBinary", TEXT_OF(CMNewDateTimeFromBinary(mb, binTime, interval, rc)),
     "((mb)->eft->newDateTimeFromBinary((mb), (binTime), (interval), (rc)))"},
    {"CMNewDateTimeFromChars", TEXT_OF(CMNewDateTimeFromChars(mb, datetime, rc)),
     "((mb)->eft->newDateTimeFromChars((mb), (datetime), (rc)))"},
    {"CMNewInstance", TEXT_OF(CMNewInstance(mb, instPath, rc)), "((mb)->eft->newInstance((mb), (instPath), (rc)))"},
    {"CMNewObjectPath", TEXT_OF(CMNewObjectPath(mb, ns, cn, rc)), "((mb)->eft->newObjectPath((mb), (ns), (cn), (rc)))"},
    {"CMNewSelectExp", TEXT_OF(CMNewSelectExp(mb, query, lang, projection, rc)),
     "((mb)->eft->newSelectExp((mb), (query), (lang), (projection), (rc)))"},
    {"CMNewString", TEXT_OF(CMNewString(mb, data, rc)), "((mb)->eft->newString((mb), (data), (rc)))"},
    {"CMOpenMessageFile", TEXT_OF(CMOpenMessageFile(mb, msgFile, msgFileHandle)),
     "((mb)->eft->openMessageFile((mb), (msgFile), (msgFileHandle)))"},
    {"CMRelease", TEXT_OF(CMRelease(obj)), "((obj)->ft->release((obj)))"},
    {"CMReturnData", TEXT_OF(CMReturnData(rslt, value, type)),
     "((rslt)->ft->returnData((rslt), (CMPIValue *)(value), (type)))"},
    {"CMReturnDone", TEXT_OF(CMReturnDone(rslt)), "((rslt)->ft->returnDone((rslt)))"},
    {"CMReturnError", TEXT_OF(CMReturnError(rslt, er)), "((rslt)->ft->returnError((rslt), (er)))"},
    {"CMReturnInstance", TEXT_OF(CMReturnInstance(rslt, inst)), "((rslt)->ft->returnInstance((rslt), (inst)))"},
    {"CMReturnObjectPath", TEXT_OF(CMReturnObjectPath(rslt, op)), "((rslt)->ft->returnObjectPath((rslt), (op)))"},
    {"CMSetArrayElementAt", TEXT_OF(CMSetArrayElementAt(ar, index, value, type)),
     "((ar)->ft->setElementAt((ar), (index), (CMPIValue *)(value), (type)))"},
    {"CMSetCIMStatusCodeDescription", TEXT_OF(CMSetCIMStatusCodeDescription(er, scd)),
     "((er)->ft->setCIMStatusCodeDescription((er), (scd)))"},
    {"CMSetClassName", TEXT_OF(CMSetClassName(op, cn)), "((op)->ft->setClassName((op), (cn)))"},
    {"CMSetErrorSource", TEXT_OF(CMSetErrorSource(er, es)), "((er)->ft->setErrorSource((er), (es)))"},
    {"CMSetErrorSourceFormat", TEXT_OF(CMSetErrorSourceFormat(er, esf)),
     "((er)->ft->setErrorSourceFormat((er), (esf)))"},
    {"CMSetErrorType", TEXT_OF(CMSetErrorType(er, et)), "((er)->ft->setErrorType((er), (et)))"},
    {"CMSetHostAndNameSpaceFromObjectPath", TEXT_OF(CMSetHostAndNameSpaceFromObjectPath(op, src)),
     "((op)->ft->setHostAndNameSpaceFromObjectPath((op), (src)))"},
    {"CMSetHostname", TEXT_OF(CMSetHostname(op, hn)), "((op)->ft->setHostname((op), (hn)))"},
    {"CMSetMessageArguments", TEXT_OF(CMSetMessageArguments(er, values)),
     "((er)->ft->setMessageArguments((er), (values)))"},
    {"CMSetNameSpace", TEXT_OF(CMSetNameSpace(op, ns)), "((op)->ft->setNameSpace((op), (ns)))"},
    {"CMSetNameSpaceFromObjectPath", TEXT_OF(CMSetNameSpaceFromObjectPath(op, src)),
     "((op)->ft->setNameSpaceFromObjectPath((op), (src)))"},
    {"CMSetObjectPath", TEXT_OF(CMSetObjectPath(inst, op)), "((inst)->ft->setObjectPath((inst), (op)))"},
    {"CMSetOtherErrorSourceFormat", TEXT_OF(CMSetOtherErrorSourceFormat(er, oef)),
     "((er)->ft->setOtherErrorSourceFormat((er), (oef)))"},
    {"CMSetOtherErrorType", TEXT_OF(CMSetOtherErrorType(er, ot)), "((er)->ft->setOtherErrorType((er), (ot)))"},
    {"CMSetProbableCauseDescription", TEXT_OF(CMSetProbableCauseDescription(er, pcd)),
     "((er)->ft->setProbableCauseDescription((er), (pcd)))"},
    {"CMSetProperty", TEXT_OF(CMSetProperty(inst, name, value, type)),
     "((inst)->ft->setProperty((inst), (name), (CMPIValue *)(value), (type)))"},
    {"CMSetPropertyFilter", TEXT_OF(CMSetPropertyFilter(inst, properties, keyList)),
     "((inst)->ft->setPropertyFilter((inst), (properties), (keyList)))"},
    {"CMSetPropertyWithOrigin", TEXT_OF(CMSetPropertyWithOrigin(inst, name, value, type, origin)),
     "((inst)->ft->setPropertyWithOrigin((inst), (name), (CMPIValue *)(value), (type), (origin)))"},
    {"CMSetRecommendedActions", TEXT_OF(CMSetRecommendedActions(er, ra)),
     "((er)->ft->setRecommendedActions((er), (ra)))"},
    {"CMSetStatus", TEXT_OF(CMSetStatus(st, rc_)), "do { if (st) { (st)->rc = (rc_); (st)->msg = NULL; } } while (0)"},
    {"CMSetStatusWithChars", TEXT_OF(CMSetStatusWithChars(mb, st, rc_, msg_)),
     "do { if (st) { (st)->rc = (rc_); if (mb) (st)->msg = (mb)->eft->newString((mb), (msg_), NULL); else (st)->msg = NULL; } } while (0)"},
    {"CMSetStatusWithString", TEXT_OF(CMSetStatusWithString(st, rc_, msg_)),
     "do { if (st) { (st)->rc = (rc_); (st)->msg = (msg_); } } while (0)"},
    {"CMToArray", TEXT_OF(CMToArray(en, rc)), "((en)->ft->toArray((en), (rc)))"},
    {"CMTraceMessage", TEXT_OF(CMTraceMessage(mb, level, component, text, string)),
     "((mb)->eft->trace((mb), (level), (component), (text), (string)))"},
};

#undef CMSetStatusWithChars
#undef CMSetStatusWithString

constexpr Operation operationsMadeOfOthers[] = {
    {"CMReturnWithChars", TEXT_OF(CMReturnWithChars(mb, rc, chars)),
     "do { CMPIStatus stat; CMSetStatusWithChars(mb, &stat, rc, chars); return stat; } while (0)"},
    {"CMReturnWithString", TEXT_OF(CMReturnWithString(rc, str)),
     "do { CMPIStatus stat; CMSetStatusWithString(&stat, rc, str); return stat; } while (0)"},
};

}  // namespace

TEST(ConvenienceOperations, ExpandToTheInterfacesText) {
  for (const Operation& each : operations) {
    EXPECT_EQ(each.actual, each.expected) << each.name;
  }
  EXPECT_EQ(std::size(operations) + std::size(operationsMadeOfOthers), 130);
}

TEST(ConvenienceOperations, ThatReturnAStatusAreMadeOfThoseThatSetOne) {
  for (const Operation& each : operationsMadeOfOthers) {
    EXPECT_EQ(each.actual, each.expected) << each.name;
  }
}
