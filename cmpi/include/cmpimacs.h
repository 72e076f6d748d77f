/* Copyright (c) 2026 TVR. CMPI 2.0 interface declarations. */

/// \file
/// Convenience macros over the CMPI function tables, and the stub macros
/// that generate a provider's entry points.
///
/// Every item is a preprocessor macro; there are no inline-function variants
/// (CMPI_INLINE is ignored). Arguments are parenthesised unless a comment
/// says otherwise. Macros taking a status pointer \p rc pass it straight to
/// the table slot, where NULL means "no status wanted"; they never look at
/// it themselves. Macros taking a value pointer \p v cast it to CMPIValue *.

#ifndef TVR_CMPI_CMPIMACS_H
#define TVR_CMPI_CMPIMACS_H

#include "cmpidt.h"
#include "cmpift.h"

/* ======================================================================== */
/* Status, return and test macros                                           */
/* ======================================================================== */

// The status and return macros expand to a bare { ... } block, not to
// do { } while (0): "if (x) CMReturn(rc); else ..." does not compile. The
// CMReturn* macros declare a block-local CMPIStatus named stat.

/// Returns CMPIStatus {rc, NULL} from the enclosing function.
#define CMReturn(rc)                                                           \
  {                                                                            \
    CMPIStatus stat = {(rc), NULL};                                            \
    return stat;                                                               \
  }

/// Returns CMPIStatus {rc, str} from the enclosing function.
#define CMReturnWithString(rc, str)                                            \
  {                                                                            \
    CMPIStatus stat = {(rc), (str)};                                           \
    return stat;                                                               \
  }

/// Returns CMPIStatus {rc, <new string made from chars by broker b>} from
/// the enclosing function.
#define CMReturnWithChars(b, rc, chars)                                        \
  {                                                                            \
    CMPIStatus stat = {(rc), NULL};                                            \
    stat.msg = (b)->eft->newString((b), (chars), NULL);                        \
    return stat;                                                               \
  }

/// Sets *st to {rcp, NULL}. \p st must not be NULL.
#define CMSetStatus(st, rcp)                                                   \
  {                                                                            \
    (st)->rc = (rcp);                                                          \
    (st)->msg = NULL;                                                          \
  }

/// Sets *st to {rcp, string}. \p st must not be NULL.
#define CMSetStatusWithString(st, rcp, string)                                 \
  {                                                                            \
    (st)->rc = (rcp);                                                          \
    (st)->msg = (string);                                                      \
  }

/// Sets *st to {rcp, <new string made from chars by broker mb>}. Neither
/// \p st nor \p mb is checked for NULL.
#define CMSetStatusWithChars(mb, st, rcp, chars)                               \
  {                                                                            \
    (st)->rc = (rcp);                                                          \
    (st)->msg = (mb)->eft->newString((mb), (chars), NULL);                     \
  }

/// True if the encapsulated object \p o is NULL or has no hdl.
#define CMIsNullObject(o) ((o) == NULL || *((void **)(o)) == NULL)

// The next three take a CMPIData value (not a pointer); the argument is
// not parenthesised.

/// Nonzero if the CMPIData \p v holds a NULL value.
#define CMIsNullValue(v) ((v.state) & CMPI_nullValue)
/// Nonzero if the CMPIData \p v is a key value.
#define CMIsKeyValue(v) ((v.state) & CMPI_keyValue)
/// Nonzero if the CMPIData \p v holds an array.
#define CMIsArray(v) ((v.type) & CMPI_ARRAY)

/// Clones any encapsulated object (clone is slot 2 of every table).
#define CMClone(o, rc) ((o)->ft->clone((o), (rc)))
/// Releases any encapsulated object (release is slot 1 of every table).
#define CMRelease(o) ((o)->ft->release((o)))

/* ======================================================================== */
/* Broker factories and helpers (eft)                                       */
/* ======================================================================== */

#define CMNewInstance(b, c, rc) ((b)->eft->newInstance((b), (c), (rc)))
/// \p n is the namespace, \p c the class name.
#define CMNewObjectPath(b, n, c, rc)                                           \
  ((b)->eft->newObjectPath((b), (n), (c), (rc)))
#define CMNewString(b, s, rc) ((b)->eft->newString((b), (s), (rc)))
#define CMNewArgs(b, rc) ((b)->eft->newArgs((b), (rc)))
#define CMNewArray(b, c, t, rc) ((b)->eft->newArray((b), (c), (t), (rc)))
#define CMNewDateTime(b, rc) ((b)->eft->newDateTime((b), (rc)))
#define CMNewDateTimeFromBinary(b, d, i, rc)                                   \
  ((b)->eft->newDateTimeFromBinary((b), (d), (i), (rc)))
#define CMNewDateTimeFromChars(b, d, rc)                                       \
  ((b)->eft->newDateTimeFromChars((b), (d), (rc)))
/// \p q is the query, \p l its language, \p p receives the projection.
#define CMNewSelectExp(b, q, l, p, rc)                                         \
  ((b)->eft->newSelectExp((b), (q), (l), (p), (rc)))
#define CMClassPathIsA(b, p, pn, rc)                                           \
  ((b)->eft->classPathIsA((b), (p), (pn), (rc)))
#define CDToString(b, o, rc) ((b)->eft->toString((b), (void *)(o), (rc)))
/// Note: no outer parentheses.
#define CDIsOfType(b, o, t, rc) (b)->eft->isOfType((b), (void *)(o), (t), (rc))
#define CDGetType(b, o, rc) ((b)->eft->getType((b), (void *)(o), (rc)))

#ifdef CMPI_VER_100
#define CMLogMessage(b, severity, id, text, string)                            \
  ((b)->eft->logMessage((b), (severity), (id), (text), (string)))
#define CMTraceMessage(b, level, component, text, string)                      \
  ((b)->eft->trace((b), (level), (component), (text), (string)))
#endif

#ifdef CMPI_VER_200
#define CMNewCMPIError(b, owner, msgID, msg, sev, pc, cimStatusCode, rc)       \
  ((b)->eft->newCMPIError((b), (owner), (msgID), (msg), (sev), (pc),          \
                          (cimStatusCode), (rc)))
#define CMOpenMessageFile(b, mf, mfh)                                          \
  ((b)->eft->openMessageFile((b), (mf), (mfh)))
#define CMCloseMessageFile(b, mfh) ((b)->eft->closeMessageFile((b), (mfh)))
/// \p parms is pasted unparenthesised so that it can carry
/// "count, type1, value1, ...".
#define CMGetMessage2(b, id, mfh, def, rc, parms)                              \
  ((b)->eft->getMessage2((b), (id), (mfh), (def), (rc), parms))
#endif

// Message formatting helpers. They sit behind CMPI_VER_85, which these
// headers never define (a 2.0 build does not have them); a provider that
// wants them defines CMPI_VER_85 itself.
#ifdef CMPI_VER_85
/// \p parms is built with one of the CMFmtArgsN macros.
#define CMGetMessage(b, id, def, rc, parms)                                    \
  ((b)->eft->getMessage((b), (id), (def), (rc), parms))
#define CMFmtArgs0() 0
#define CMFmtArgs1(v1) 1, v1
#define CMFmtArgs2(v1, v2) 2, v1, v2
#define CMFmtArgs3(v1, v2, v3) 3, v1, v2, v3
#define CMFmtArgs4(v1, v2, v3, v4) 4, v1, v2, v3, v4
#define CMFmtArgs5(v1, v2, v3, v4, v5) 5, v1, v2, v3, v4, v5
#define CMFmtArgs6(v1, v2, v3, v4, v5, v6) 6, v1, v2, v3, v4, v5, v6
#define CMFmtArgs7(v1, v2, v3, v4, v5, v6, v7) 7, v1, v2, v3, v4, v5, v6, v7
#define CMFmtArgs8(v1, v2, v3, v4, v5, v6, v7, v8)                            \
  8, v1, v2, v3, v4, v5, v6, v7, v8
#define CMFmtArgs9(v1, v2, v3, v4, v5, v6, v7, v8, v9)                        \
  9, v1, v2, v3, v4, v5, v6, v7, v8, v9
#define CMFmtArgs10(v1, v2, v3, v4, v5, v6, v7, v8, v9, v10)                  \
  10, v1, v2, v3, v4, v5, v6, v7, v8, v9, v10
#define CMFmtSint(v) CMPI_sint32, ((long int)v)
#define CMFmtUint(v) CMPI_uint32, ((unsigned long int)v)
#define CMFmtSint64(v) CMPI_sint64, ((long long int)v)
#define CMFmtUint64(v) CMPI_uint64, ((unsigned long long int)v)
#define CMFmtReal(v) CMPI_real64, ((double)v)
#define CMFmtBoolean(v) CMPI_boolean, ((int)v)
#define CMFmtChars(v) CMPI_chars, ((char *)v)
#endif /* CMPI_VER_85 */

/* ======================================================================== */
/* Instances                                                                */
/* ======================================================================== */

#define CMGetProperty(i, n, rc) ((i)->ft->getProperty((i), (n), (rc)))
#define CMGetPropertyAt(i, num, s, rc)                                         \
  ((i)->ft->getPropertyAt((i), (num), (s), (rc)))
#define CMSetProperty(i, n, v, t)                                              \
  ((i)->ft->setProperty((i), (n), (CMPIValue *)(v), (t)))
#define CMGetPropertyCount(i, rc) ((i)->ft->getPropertyCount((i), (rc)))
#define CMGetObjectPath(i, rc) ((i)->ft->getObjectPath((i), (rc)))
#ifdef CMPI_VER_100
#define CMSetObjectPath(i, obj) ((i)->ft->setObjectPath((i), (obj)))
#endif
#define CMSetPropertyFilter(i, pl, k)                                          \
  ((i)->ft->setPropertyFilter((i), (pl), (k)))
#ifdef CMPI_VER_200
/// \p o is the origin class; NULL attaches none.
#define CMSetPropertyWithOrigin(i, n, v, t, o)                                 \
  ((i)->ft->setPropertyWithOrigin((i), (n), (CMPIValue *)(v), (t), (o)))
#endif

/* ======================================================================== */
/* Object paths                                                             */
/* ======================================================================== */

#define CMSetHostname(p, n) ((p)->ft->setHostname((p), (n)))
#define CMGetHostname(p, rc) ((p)->ft->getHostname((p), (rc)))
#define CMSetNameSpace(p, n) ((p)->ft->setNameSpace((p), (n)))
#define CMGetNameSpace(p, rc) ((p)->ft->getNameSpace((p), (rc)))
#define CMSetClassName(p, n) ((p)->ft->setClassName((p), (n)))
#define CMGetClassName(p, rc) ((p)->ft->getClassName((p), (rc)))
#define CMAddKey(p, n, v, t) ((p)->ft->addKey((p), (n), (CMPIValue *)(v), (t)))
#define CMGetKey(p, n, rc) ((p)->ft->getKey((p), (n), (rc)))
#define CMGetKeyAt(p, i, n, rc) ((p)->ft->getKeyAt((p), (i), (n), (rc)))
#define CMGetKeyCount(p, rc) ((p)->ft->getKeyCount((p), (rc)))
#define CMSetNameSpaceFromObjectPath(p, s)                                     \
  ((p)->ft->setNameSpaceFromObjectPath((p), (s)))
#define CMSetHostAndNameSpaceFromObjectPath(p, s)                              \
  ((p)->ft->setHostAndNameSpaceFromObjectPath((p), (s)))
#define CMGetClassQualifier(op, qName, rc)                                     \
  ((op)->ft->getClassQualifier((op), (qName), (rc)))
#define CMGetPropertyQualifier(op, pName, qName, rc)                           \
  ((op)->ft->getPropertyQualifier((op), (pName), (qName), (rc)))
#define CMGetMethodQualifier(op, methodName, qName, rc)                        \
  ((op)->ft->getMethodQualifier((op), (methodName), (qName), (rc)))
#define CMGetParameterQualifier(op, mName, pName, qName, rc)                   \
  ((op)->ft->getParameterQualifier((op), (mName), (pName), (qName), (rc)))

// Behind CMPI_VER_86, which these headers never define: a 2.0 build has no
// macro for CMPIObjectPathFT.toString.
#ifdef CMPI_VER_86
#define CMObjectPathToString(p, rc) ((p)->ft->toString((p), (rc)))
#endif

/* ======================================================================== */
/* Arrays, arguments, strings, date/time values                             */
/* ======================================================================== */

#define CMGetArrayCount(a, rc) ((a)->ft->getSize((a), (rc)))
#define CMGetArrayType(a, rc) ((a)->ft->getSimpleType((a), (rc)))
#define CMGetArrayElementAt(a, n, rc) ((a)->ft->getElementAt((a), (n), (rc)))
#define CMSetArrayElementAt(a, n, v, t)                                        \
  ((a)->ft->setElementAt((a), (n), (CMPIValue *)(v), (t)))

#define CMAddArg(a, n, v, t) ((a)->ft->addArg((a), (n), (CMPIValue *)(v), (t)))
#define CMGetArg(a, n, rc) ((a)->ft->getArg((a), (n), (rc)))
#define CMGetArgAt(a, p, n, rc) ((a)->ft->getArgAt((a), (p), (n), (rc)))
#define CMGetArgCount(a, rc) ((a)->ft->getArgCount((a), (rc)))

/// The text of a CMPIString without a call: assumes the broker keeps the
/// NUL-terminated text pointer in hdl. Not portable; CMGetCharsPtr is.
/// The argument is not parenthesised.
#define CMGetCharPtr(s) ((char *)s->hdl)
/// The text of a CMPIString, through CMPIStringFT.getCharPtr.
#define CMGetCharsPtr(st, rc) ((st)->ft->getCharPtr((st), (rc)))

#define CMGetStringFormat(d, rc) ((d)->ft->getStringFormat((d), (rc)))
#define CMGetBinaryFormat(d, rc) ((d)->ft->getBinaryFormat((d), (rc)))
#define CMIsInterval(d, rc) ((d)->ft->isInterval((d), (rc)))

/* ======================================================================== */
/* Enumerations, results and contexts                                       */
/* ======================================================================== */

#define CMGetNext(n, rc) ((n)->ft->getNext((n), (rc)))
#define CMHasNext(n, rc) ((n)->ft->hasNext((n), (rc)))
#define CMToArray(n, rc) ((n)->ft->toArray((n), (rc)))

// The CMReturn<Item> macros call the result table and evaluate to its
// status; unlike CMReturn they do not leave the calling function.
#define CMReturnData(r, v, t) ((r)->ft->returnData((r), (CMPIValue *)(v), (t)))
#define CMReturnInstance(r, i) ((r)->ft->returnInstance((r), (i)))
#define CMReturnObjectPath(r, o) ((r)->ft->returnObjectPath((r), (o)))
#define CMReturnDone(r) ((r)->ft->returnDone((r)))
#ifdef CMPI_VER_200
#define CMReturnError(r, e) ((r)->ft->returnError((r), (e)))
#endif

#define CMGetContextEntry(c, n, rc) ((c)->ft->getEntry((c), (n), (rc)))
#define CMGetContextEntryAt(c, p, n, rc)                                       \
  ((c)->ft->getEntryAt((c), (p), (n), (rc)))
#define CMGetContextEntryCount(c, rc) ((c)->ft->getEntryCount((c), (rc)))
#define CMAddContextEntry(c, n, v, t)                                          \
  ((c)->ft->addEntry((c), (n), (CMPIValue *)(v), (t)))

/* ======================================================================== */
/* Queries: select expressions, conditions, predicates                      */
/* ======================================================================== */

#define CMGetSelExpString(s, rc) ((s)->ft->getString((s), (rc)))
#define CMEvaluateSelExp(s, i, r) ((s)->ft->evaluate((s), (i), (r)))
#define CMGetDoc(s, rc) ((s)->ft->getDOC((s), (rc)))
#define CMGetCod(s, rc) ((s)->ft->getCOD((s), (rc)))
#define CMGetSubCondCountAndType(c, t, rc)                                     \
  ((c)->ft->getCountAndType((c), (t), (rc)))
#define CMGetSubCondAt(c, p, rc) ((c)->ft->getSubCondAt((c), (p), (rc)))
#define CMGetPredicateCount(s, rc) ((s)->ft->getCount((s), (rc)))
#define CMGetPredicateAt(s, p, rc) ((s)->ft->getPredicateAt((s), (p), (rc)))
#define CMGetPredicate(s, n, rc) ((s)->ft->getPredicate((s), (n), (rc)))
#define CMGetPredicateData(p, t, o, n, v)                                      \
  ((p)->ft->getData((p), (t), (o), (n), (v)))
#ifdef CMPI_VER_100
#define CMEvaluatePredicateUsingAccessor(p, a, parm, rc)                       \
  ((p)->ft->evaluateUsingAccessor((p), (a), (parm), (rc)))
#endif

// Behind CMPI_VER_87, which these headers never define.
#ifdef CMPI_VER_87
#define CMEvaluateSelExpUsingAccessor(s, i, p, r)                              \
  ((s)->ft->evaluateUsingAccessor((s), (i), (p), (r)))
#endif

/* ======================================================================== */
/* Extended errors                                                          */
/* ======================================================================== */

#ifdef CMPI_VER_200
#define CMGetErrorType(e, rc) ((e)->ft->getErrorType((e), (rc)))
#define CMGetOtherErrorType(e, rc) ((e)->ft->getOtherErrorType((e), (rc)))
#define CMGetOwningEntity(e, rc) ((e)->ft->getOwningEntity((e), (rc)))
#define CMGetMessageID(e, rc) ((e)->ft->getMessageID((e), (rc)))
/// The message of an extended error (not the broker's getMessage).
#define CMGetErrorMessage(e, rc) ((e)->ft->getMessage((e), (rc)))
#define CMGetPerceivedSeverity(e, rc) ((e)->ft->getPerceivedSeverity((e), (rc)))
#define CMGetProbableCause(e, rc) ((e)->ft->getProbableCause((e), (rc)))
#define CMGetProbableCauseDescription(e, rc)                                   \
  ((e)->ft->getProbableCauseDescription((e), (rc)))
#define CMGetRecommendedActions(e, rc)                                         \
  ((e)->ft->getRecommendedActions((e), (rc)))
#define CMGetErrorSource(e, rc) ((e)->ft->getErrorSource((e), (rc)))
#define CMGetErrorSourceFormat(e, rc) ((e)->ft->getErrorSourceFormat((e), (rc)))
#define CMGetOtherErrorSourceFormat(e, rc)                                     \
  ((e)->ft->getOtherErrorSourceFormat((e), (rc)))
#define CMGetCIMStatusCode(e, rc) ((e)->ft->getCIMStatusCode((e), (rc)))
#define CMGetCIMStatusCodeDescription(e, rc)                                   \
  ((e)->ft->getCIMStatusCodeDescription((e), (rc)))
#define CMGetMessageArguments(e, rc) ((e)->ft->getMessageArguments((e), (rc)))
#define CMSetErrorType(e, et) ((e)->ft->setErrorType((e), (et)))
#define CMSetOtherErrorType(e, oet) ((e)->ft->setOtherErrorType((e), (oet)))
#define CMSetProbableCauseDescription(e, pcd)                                  \
  ((e)->ft->setProbableCauseDescription((e), (pcd)))
#define CMSetRecommendedActions(e, ra)                                         \
  ((e)->ft->setRecommendedActions((e), (ra)))
#define CMSetErrorSource(e, es) ((e)->ft->setErrorSource((e), (es)))
#define CMSetErrorSourceFormat(e, esf)                                         \
  ((e)->ft->setErrorSourceFormat((e), (esf)))
#define CMSetOtherErrorSourceFormat(e, oesf)                                   \
  ((e)->ft->setOtherErrorSourceFormat((e), (oesf)))
#define CMSetCIMStatusCodeDescription(e, cd)                                   \
  ((e)->ft->setCIMStatusCodeDescription((e), (cd)))
#define CMSetMessageArguments(e, ma) ((e)->ft->setMessageArguments((e), (ma)))
#endif /* CMPI_VER_200 */

/* ======================================================================== */
/* Broker services (bft)                                                    */
/* ======================================================================== */

/// The broker's capability bits (CMPI_MB_*). Reads brokerCapabilities: some
/// copies of these headers read a brokerClassification member here, which
/// does not exist.
#define CBGetClassification(b) ((b)->bft->brokerCapabilities)
#define CBBrokerVersion(b) ((b)->bft->brokerVersion)
#define CBBrokerName(b) ((b)->bft->brokerName)

#define CBPrepareAttachThread(b, c) ((b)->bft->prepareAttachThread((b), (c)))
#define CBAttachThread(b, c) ((b)->bft->attachThread((b), (c)))
#define CBDetachThread(b, c) ((b)->bft->detachThread((b), (c)))
#define CBDeliverIndication(b, c, n, i)                                        \
  ((b)->bft->deliverIndication((b), (c), (n), (i)))

// CBEnumInstanceNames and CBEnumInstances call the slots by their real
// names, enumerateInstanceNames and enumerateInstances. Some copies of these
// headers name non-existent slots (enumInstanceNames, enumInstances) here,
// so the macros fail to compile as soon as they are used; a widely used
// object manager's copy calls the real slots, as these do.
#define CBEnumInstanceNames(b, c, p, rc)                                       \
  ((b)->bft->enumerateInstanceNames((b), (c), (p), (rc)))
#define CBEnumInstances(b, c, p, pr, rc)                                       \
  ((b)->bft->enumerateInstances((b), (c), (p), (pr), (rc)))

#define CBGetInstance(b, c, p, pr, rc)                                         \
  ((b)->bft->getInstance((b), (c), (p), (pr), (rc)))
#define CBCreateInstance(b, c, p, i, rc)                                       \
  ((b)->bft->createInstance((b), (c), (p), (i), (rc)))

#ifdef CMPI_VER_90
#ifdef CMPI_VER_100
#define CBModifyInstance(b, c, p, i, pr)                                       \
  ((b)->bft->modifyInstance((b), (c), (p), (i), (pr)))
#endif
#else
/// Replaces an instance with all its properties. Calls modifyInstance with
/// no property list: some copies of these headers call a setInstance slot
/// here, which does not exist.
#define CBSetInstance(b, c, p, i)                                              \
  ((b)->bft->modifyInstance((b), (c), (p), (i), NULL))
#endif

#define CBDeleteInstance(b, c, p) ((b)->bft->deleteInstance((b), (c), (p)))
/// The 4th argument lands in the slot's query parameter and the 5th in its
/// language parameter, whatever the names l and q suggest: pass the query
/// first.
#define CBExecQuery(b, c, p, l, q, rc)                                         \
  ((b)->bft->execQuery((b), (c), (p), (l), (q), (rc)))
/// Arguments after \p p: association class, result class, role, result
/// role, property list, status.
#define CBAssociators(b, c, p, acl, rcl, r, rr, pr, rc)                        \
  ((b)->bft->associators((b), (c), (p), (acl), (rcl), (r), (rr), (pr), (rc)))
#define CBAssociatorNames(b, c, p, acl, rcl, r, rr, rc)                        \
  ((b)->bft->associatorNames((b), (c), (p), (acl), (rcl), (r), (rr), (rc)))
/// \p acl is passed as the result class.
#define CBReferences(b, c, p, acl, r, pr, rc)                                  \
  ((b)->bft->references((b), (c), (p), (acl), (r), (pr), (rc)))
/// \p acl is passed as the result class.
#define CBReferenceNames(b, c, p, acl, r, rc)                                  \
  ((b)->bft->referenceNames((b), (c), (p), (acl), (r), (rc)))
#define CBInvokeMethod(b, c, p, m, ai, ao, rc)                                 \
  ((b)->bft->invokeMethod((b), (c), (p), (m), (ai), (ao), (rc)))
#define CBSetProperty(b, c, p, n, v, t)                                        \
  ((b)->bft->setProperty((b), (c), (p), (n), (CMPIValue *)(v), (t)))
/// Note: no outer parentheses.
#define CBGetProperty(b, c, p, n, rc)                                          \
  (b)->bft->getProperty((b), (c), (p), (n), (rc))

/* ======================================================================== */
/* MI entry points                                                          */
/* ======================================================================== */

/// Hook argument of the stub macros that adds nothing.
#define CMNoHook

/// Slot filler for CMPIInstanceMIFT.modifyInstance: the provider function
/// pfx##ModifyInstance from level 1.0 on.
#ifdef CMPI_VER_100
#define CMInstanceMIStubChange(pfx) pfx##ModifyInstance
#else
#define CMInstanceMIStubChange(pfx) pfx##SetInstance
#endif

/// Slot fillers for CMPIIndicationMIFT.enableIndications and
/// disableIndications. A 2.0 build leaves both slots NULL; CMPI_VER_86
/// (never defined by these headers) fills them from the provider. The NULLs
/// are written out rather than left to zero-initialisation so that
/// providers compile without -Wmissing-field-initializers warnings.
#ifdef CMPI_VER_86
#define CMIndicationMIStubExtensions(pfx)                                      \
  pfx##EnableIndications, pfx##DisableIndications,
#else
#define CMIndicationMIStubExtensions(pfx) NULL, NULL,
#endif

// The five stub macros below each define, for provider name pn:
//  1. a static function table with a fixed name (instMIFT__, assocMIFT__,
//     methMIFT__, propMIFT__, indMIFT__) holding CMPICurrentVersion as
//     ftVersion and miVersion, "<kind>" #pn as miName, and the provider's
//     functions pfx##<Operation> in table order;
//  2. the exported entry point pn##_Create_<Kind>MI(brkr, ctx, rc), which
//     returns the same static MI object {NULL, &<table>} on every call after
//     storing brkr in the variable broker and running hook. The entry point
//     never fails and never writes through rc.
// The fixed names allow one stub of each kind per translation unit. Under
// C++, broker must be a const CMPIBroker * variable. The (void) casts only
// keep -Wunused-parameter quiet in providers.

/// Defines the instance MI entry point pn##_Create_InstanceMI. The provider
/// supplies pfx##Cleanup, pfx##EnumInstanceNames, pfx##EnumInstances,
/// pfx##GetInstance, pfx##CreateInstance, pfx##ModifyInstance,
/// pfx##DeleteInstance and pfx##ExecQuery. miName is "instance" #pn.
#define CMInstanceMIStub(pfx, pn, broker, hook)                                \
  static CMPIInstanceMIFT instMIFT__ = {                                       \
      CMPICurrentVersion,                                                      \
      CMPICurrentVersion,                                                      \
      "instance" #pn,                                                          \
      pfx##Cleanup,                                                            \
      pfx##EnumInstanceNames,                                                  \
      pfx##EnumInstances,                                                      \
      pfx##GetInstance,                                                        \
      pfx##CreateInstance,                                                     \
      CMInstanceMIStubChange(pfx),                                             \
      pfx##DeleteInstance,                                                     \
      pfx##ExecQuery,                                                          \
  };                                                                           \
  CMPI_EXTERN_C                                                                \
  CMPIInstanceMI *pn##_Create_InstanceMI(const CMPIBroker *brkr,               \
                                         const CMPIContext *ctx,               \
                                         CMPIStatus *rc) {                     \
    static CMPIInstanceMI mi = {NULL, &instMIFT__};                            \
    (void)ctx;                                                                 \
    (void)rc;                                                                  \
    broker = brkr;                                                             \
    hook;                                                                      \
    return &mi;                                                                \
  }

/// Defines the association MI entry point pn##_Create_AssociationMI. The
/// provider supplies pfx##AssociationCleanup, pfx##Associators,
/// pfx##AssociatorNames, pfx##References and pfx##ReferenceNames. miName is
/// "association" #pn.
#define CMAssociationMIStub(pfx, pn, broker, hook)                             \
  static CMPIAssociationMIFT assocMIFT__ = {                                   \
      CMPICurrentVersion,                                                      \
      CMPICurrentVersion,                                                      \
      "association" #pn,                                                       \
      pfx##AssociationCleanup,                                                 \
      pfx##Associators,                                                        \
      pfx##AssociatorNames,                                                    \
      pfx##References,                                                         \
      pfx##ReferenceNames,                                                     \
  };                                                                           \
  CMPI_EXTERN_C                                                                \
  CMPIAssociationMI *pn##_Create_AssociationMI(const CMPIBroker *brkr,         \
                                               const CMPIContext *ctx,         \
                                               CMPIStatus *rc) {               \
    static CMPIAssociationMI mi = {NULL, &assocMIFT__};                        \
    (void)ctx;                                                                 \
    (void)rc;                                                                  \
    broker = brkr;                                                             \
    hook;                                                                      \
    return &mi;                                                                \
  }

/// Defines the method MI entry point pn##_Create_MethodMI. The provider
/// supplies pfx##MethodCleanup and pfx##InvokeMethod. miName is
/// "method" #pn.
#define CMMethodMIStub(pfx, pn, broker, hook)                                  \
  static CMPIMethodMIFT methMIFT__ = {                                         \
      CMPICurrentVersion,                                                      \
      CMPICurrentVersion,                                                      \
      "method" #pn,                                                            \
      pfx##MethodCleanup,                                                      \
      pfx##InvokeMethod,                                                       \
  };                                                                           \
  CMPI_EXTERN_C                                                                \
  CMPIMethodMI *pn##_Create_MethodMI(const CMPIBroker *brkr,                   \
                                     const CMPIContext *ctx, CMPIStatus *rc) { \
    static CMPIMethodMI mi = {NULL, &methMIFT__};                              \
    (void)ctx;                                                                 \
    (void)rc;                                                                  \
    broker = brkr;                                                             \
    hook;                                                                      \
    return &mi;                                                                \
  }

/// Slot filler for CMPIPropertyMIFT.setPropertyWithOrigin, which the
/// property stub leaves NULL (written out for the same reason as above).
#ifdef CMPI_VER_200
#define CMPropertyMIStubExtensions(pfx) NULL,
#else
#define CMPropertyMIStubExtensions(pfx)
#endif

/// Defines the property MI entry point pn##_Create_PropertyMI. The provider
/// supplies pfx##PropertyCleanup, pfx##SetProperty and pfx##GetProperty;
/// setPropertyWithOrigin stays NULL. miName is "property" #pn.
#define CMPropertyMIStub(pfx, pn, broker, hook)                                \
  static CMPIPropertyMIFT propMIFT__ = {                                       \
      CMPICurrentVersion,                                                      \
      CMPICurrentVersion,                                                      \
      "property" #pn,                                                          \
      pfx##PropertyCleanup,                                                    \
      pfx##SetProperty,                                                        \
      pfx##GetProperty,                                                        \
      CMPropertyMIStubExtensions(pfx)                                          \
  };                                                                           \
  CMPI_EXTERN_C                                                                \
  CMPIPropertyMI *pn##_Create_PropertyMI(const CMPIBroker *brkr,               \
                                         const CMPIContext *ctx,               \
                                         CMPIStatus *rc) {                     \
    static CMPIPropertyMI mi = {NULL, &propMIFT__};                            \
    (void)ctx;                                                                 \
    (void)rc;                                                                  \
    broker = brkr;                                                             \
    hook;                                                                      \
    return &mi;                                                                \
  }

/// Defines the indication MI entry point pn##_Create_IndicationMI. The
/// provider supplies pfx##IndicationCleanup, pfx##AuthorizeFilter,
/// pfx##MustPoll, pfx##ActivateFilter and pfx##DeActivateFilter;
/// enableIndications and disableIndications stay NULL (see
/// CMIndicationMIStubExtensions). miName is "Indication" #pn, with a
/// capital I.
#define CMIndicationMIStub(pfx, pn, broker, hook)                              \
  static CMPIIndicationMIFT indMIFT__ = {                                      \
      CMPICurrentVersion,                                                      \
      CMPICurrentVersion,                                                      \
      "Indication" #pn,                                                        \
      pfx##IndicationCleanup,                                                  \
      pfx##AuthorizeFilter,                                                    \
      pfx##MustPoll,                                                           \
      pfx##ActivateFilter,                                                     \
      pfx##DeActivateFilter,                                                   \
      CMIndicationMIStubExtensions(pfx)                                        \
  };                                                                           \
  CMPI_EXTERN_C                                                                \
  CMPIIndicationMI *pn##_Create_IndicationMI(const CMPIBroker *brkr,           \
                                             const CMPIContext *ctx,           \
                                             CMPIStatus *rc) {                 \
    static CMPIIndicationMI mi = {NULL, &indMIFT__};                           \
    (void)ctx;                                                                 \
    (void)rc;                                                                  \
    broker = brkr;                                                             \
    hook;                                                                      \
    return &mi;                                                                \
  }

#endif /* TVR_CMPI_CMPIMACS_H */
