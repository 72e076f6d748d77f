/* Copyright (c) 2026 TVR. CMPI 2.0 interface declarations. */

/// \file
/// CMPI function tables: the encapsulated objects the broker (MB) hands to a
/// provider (MI), the tables of functions reached through them, and the
/// tables an MI hands back to the broker.
///
/// Every encapsulated object is a pair {hdl, ft}: hdl is the owner's private
/// data, ft points to the object's function table. Every MB table starts
/// with ftVersion, followed by release (slot 1) and clone (slot 2), so
/// CMRelease and CMClone work on any object. Members appended at level 2.0
/// are the last ones of their tables; a table of a lower level is a prefix
/// of the 2.0 table, so check ftVersion before using a 2.0-only slot.
///
/// Member order, member types and the const placement of every parameter
/// are part of the binary interface and are pinned by tests/cmpi.

#ifndef TVR_CMPI_CMPIFT_H
#define TVR_CMPI_CMPIFT_H

#include "cmpidt.h"
#include "cmpios.h"

#ifdef __cplusplus
extern "C" {
#endif

/// Used by CMPIBrokerExtFT.timedCondWait; the system's struct timespec.
struct timespec;

/* ======================================================================== */
/* Encapsulated objects                                                     */
/* ======================================================================== */

/// The broker: entry to all services of the MB, one table per service group.
struct _CMPIBroker {
  void *hdl;
  /// CIM operations (up-calls).
  CMPIBrokerFT *bft;
  /// Object factories and helpers.
  CMPIBrokerEncFT *eft;
  /// Operating-system services (threads, mutexes, conditions).
  CMPIBrokerExtFT *xft;
#ifdef CMPI_VER_200
  /// Memory management.
  CMPIBrokerMemFT *mft;
#endif
};

/// Request context: named entries such as CMPIPrincipal.
struct _CMPIContext {
  void *hdl;
  CMPIContextFT *ft;
};

/// Sink for the results of an MI operation.
struct _CMPIResult {
  void *hdl;
  CMPIResultFT *ft;
};

struct _CMPIInstance {
  void *hdl;
  CMPIInstanceFT *ft;
};

struct _CMPIObjectPath {
  void *hdl;
  CMPIObjectPathFT *ft;
};

struct _CMPIString {
  void *hdl;
  CMPIStringFT *ft;
};

struct _CMPIArray {
  void *hdl;
  CMPIArrayFT *ft;
};

struct _CMPIEnumeration {
  void *hdl;
  CMPIEnumerationFT *ft;
};

/// Method parameters (in or out).
struct _CMPIArgs {
  void *hdl;
  CMPIArgsFT *ft;
};

struct _CMPIDateTime {
  void *hdl;
  CMPIDateTimeFT *ft;
};

/// Parsed query (select expression).
struct _CMPISelectExp {
  void *hdl;
  CMPISelectExpFT *ft;
};

struct _CMPISelectCond {
  void *hdl;
  CMPISelectCondFT *ft;
};

struct _CMPISubCond {
  void *hdl;
  CMPISubCondFT *ft;
};

struct _CMPIPredicate {
  void *hdl;
  CMPIPredicateFT *ft;
};

#ifdef CMPI_VER_200
/// Extended error information.
struct _CMPIError {
  void *hdl;
  CMPIErrorFT *ft;
};
#endif

/* ======================================================================== */
/* Broker function tables                                                   */
/* ======================================================================== */

/// CIM operations a provider may ask the broker to perform (up-calls).
/// Unlike every other table it starts with three data members and has no
/// ftVersion.
struct _CMPIBrokerFT {
  /// CMPI_MB_* bits describing what the broker supports.
  unsigned int brokerCapabilities;
  /// CMPI level of the broker (compare with CMPIVersion200).
  unsigned int brokerVersion;
  /// Name of the broker.
  const char *brokerName;
  CMPIContext *(*prepareAttachThread)(const CMPIBroker *mb,
                                      const CMPIContext *ctx);
  CMPIStatus (*attachThread)(const CMPIBroker *, const CMPIContext *);
  CMPIStatus (*detachThread)(const CMPIBroker *mb, const CMPIContext *ctx);
  CMPIStatus (*deliverIndication)(const CMPIBroker *mb, const CMPIContext *ctx,
                                  const char *ns, const CMPIInstance *ind);
  CMPIEnumeration *(*enumerateInstanceNames)(
      const CMPIBroker *mb, const CMPIContext *ctx, const CMPIObjectPath *op,
      CMPIStatus *rc);
  CMPIInstance *(*getInstance)(const CMPIBroker *mb, const CMPIContext *ctx,
                               const CMPIObjectPath *op,
                               const char **properties, CMPIStatus *rc);
  CMPIObjectPath *(*createInstance)(const CMPIBroker *mb,
                                    const CMPIContext *ctx,
                                    const CMPIObjectPath *op,
                                    const CMPIInstance *inst, CMPIStatus *rc);
  CMPIStatus (*modifyInstance)(const CMPIBroker *mb, const CMPIContext *ctx,
                               const CMPIObjectPath *op,
                               const CMPIInstance *inst,
                               const char **properties);
  CMPIStatus (*deleteInstance)(const CMPIBroker *mb, const CMPIContext *ctx,
                               const CMPIObjectPath *op);
  /// Note the order: query text first, then its language.
  CMPIEnumeration *(*execQuery)(const CMPIBroker *mb, const CMPIContext *ctx,
                                const CMPIObjectPath *op, const char *query,
                                const char *lang, CMPIStatus *rc);
  CMPIEnumeration *(*enumerateInstances)(const CMPIBroker *mb,
                                         const CMPIContext *ctx,
                                         const CMPIObjectPath *op,
                                         const char **properties,
                                         CMPIStatus *rc);
  CMPIEnumeration *(*associators)(const CMPIBroker *mb, const CMPIContext *ctx,
                                  const CMPIObjectPath *op,
                                  const char *assocClass,
                                  const char *resultClass, const char *role,
                                  const char *resultRole,
                                  const char **properties, CMPIStatus *rc);
  CMPIEnumeration *(*associatorNames)(const CMPIBroker *mb,
                                      const CMPIContext *ctx,
                                      const CMPIObjectPath *op,
                                      const char *assocClass,
                                      const char *resultClass, const char *role,
                                      const char *resultRole, CMPIStatus *rc);
  CMPIEnumeration *(*references)(const CMPIBroker *mb, const CMPIContext *ctx,
                                 const CMPIObjectPath *op,
                                 const char *resultClass, const char *role,
                                 const char **properties, CMPIStatus *rc);
  CMPIEnumeration *(*referenceNames)(const CMPIBroker *mb,
                                     const CMPIContext *ctx,
                                     const CMPIObjectPath *op,
                                     const char *resultClass, const char *role,
                                     CMPIStatus *rc);
  CMPIData (*invokeMethod)(const CMPIBroker *mb, const CMPIContext *ctx,
                           const CMPIObjectPath *op, const char *method,
                           const CMPIArgs *in, CMPIArgs *out, CMPIStatus *rc);
  CMPIStatus (*setProperty)(const CMPIBroker *mb, const CMPIContext *ctx,
                            const CMPIObjectPath *op, const char *name,
                            const CMPIValue *value, CMPIType type);
  CMPIData (*getProperty)(const CMPIBroker *mb, const CMPIContext *ctx,
                          const CMPIObjectPath *op, const char *name,
                          CMPIStatus *rc);
};

/// Factories for encapsulated objects, type helpers, messages and tracing.
struct _CMPIBrokerEncFT {
  int ftVersion;
  CMPIInstance *(*newInstance)(const CMPIBroker *mb, const CMPIObjectPath *op,
                               CMPIStatus *rc);
  CMPIObjectPath *(*newObjectPath)(const CMPIBroker *mb, const char *ns,
                                   const char *cn, CMPIStatus *rc);
  CMPIArgs *(*newArgs)(const CMPIBroker *mb, CMPIStatus *rc);
  CMPIString *(*newString)(const CMPIBroker *mb, const char *data,
                           CMPIStatus *rc);
  CMPIArray *(*newArray)(const CMPIBroker *mb, CMPICount max, CMPIType type,
                         CMPIStatus *rc);
  CMPIDateTime *(*newDateTime)(const CMPIBroker *mb, CMPIStatus *rc);
  CMPIDateTime *(*newDateTimeFromBinary)(const CMPIBroker *mb,
                                         CMPIUint64 binTime,
                                         CMPIBoolean interval, CMPIStatus *rc);
  CMPIDateTime *(*newDateTimeFromChars)(const CMPIBroker *mb,
                                        const char *utcTime, CMPIStatus *rc);
  CMPISelectExp *(*newSelectExp)(const CMPIBroker *mb, const char *query,
                                 const char *lang, CMPIArray **projection,
                                 CMPIStatus *st);
  CMPIBoolean (*classPathIsA)(const CMPIBroker *mb, const CMPIObjectPath *op,
                              const char *type, CMPIStatus *rc);
  CMPIString *(*toString)(const CMPIBroker *mb, const void *object,
                          CMPIStatus *rc);
  CMPIBoolean (*isOfType)(const CMPIBroker *mb, const void *object,
                          const char *type, CMPIStatus *rc);
  CMPIString *(*getType)(const CMPIBroker *mb, const void *object,
                         CMPIStatus *rc);
  /// \p count is the number of substitution values that follow.
  CMPIString *(*getMessage)(const CMPIBroker *mb, const char *msgId,
                            const char *defMsg, CMPIStatus *rc, CMPICount count,
                            ...);
  /// \p severity is a CMPISeverity value.
  CMPIStatus (*logMessage)(const CMPIBroker *, int severity, const char *id,
                           const char *text, const CMPIString *string);
  /// \p level is a CMPILevel value.
  CMPIStatus (*trace)(const CMPIBroker *, int level, const char *component,
                      const char *text, const CMPIString *string);
#ifdef CMPI_VER_200
  /// Parameters: owner, message id, message, severity, probable cause, CIM
  /// status code, status.
  CMPIError *(*newCMPIError)(const CMPIBroker *, const char *, const char *,
                             const char *, const CMPIErrorSeverity,
                             const CMPIErrorProbableCause, const CMPIrc,
                             CMPIStatus *rc);
  CMPIStatus (*openMessageFile)(const CMPIBroker *mb, const char *msgFile,
                                CMPIMsgFileHandle *msgFileHandle);
  CMPIStatus (*closeMessageFile)(const CMPIBroker *mb,
                                 const CMPIMsgFileHandle msgFileHandle);
  /// \p count is the number of substitution values that follow.
  CMPIString *(*getMessage2)(const CMPIBroker *mb, const char *msgId,
                             const CMPIMsgFileHandle msgFileHandle,
                             const char *defMsg, CMPIStatus *rc,
                             CMPICount count, ...);
#endif
};

/// Operating-system encapsulation: threads, thread-specific data, mutexes
/// and condition variables. The types come from cmpios.h.
struct _CMPIBrokerExtFT {
  int ftVersion;
  char *(*resolveFileName)(const char *filename);
  CMPI_THREAD_TYPE (*newThread)(
      CMPI_THREAD_RETURN (CMPI_THREAD_CDECL *start)(void *), void *parm,
      int detached);
  int (*joinThread)(CMPI_THREAD_TYPE thread, CMPI_THREAD_RETURN *retval);
  int (*exitThread)(CMPI_THREAD_RETURN return_code);
  int (*cancelThread)(CMPI_THREAD_TYPE thread);
  int (*threadSleep)(CMPIUint32 msec);
  int (*threadOnce)(int *once, void (*init)(void));
  /// See CMPI_THREAD_KEY_TYPE about the width of \p *key.
  int (*createThreadKey)(CMPI_THREAD_KEY_TYPE *key, void (*cleanup)(void *));
  int (*destroyThreadKey)(CMPI_THREAD_KEY_TYPE key);
  void *(*getThreadSpecific)(CMPI_THREAD_KEY_TYPE key);
  int (*setThreadSpecific)(CMPI_THREAD_KEY_TYPE key, void *value);
  CMPI_MUTEX_TYPE (*newMutex)(int opt);
  void (*destroyMutex)(CMPI_MUTEX_TYPE mutex);
  void (*lockMutex)(CMPI_MUTEX_TYPE mutex);
  void (*unlockMutex)(CMPI_MUTEX_TYPE mutex);
  CMPI_COND_TYPE (*newCondition)(int opt);
  void (*destroyCondition)(CMPI_COND_TYPE cond);
  int (*condWait)(CMPI_COND_TYPE cond, CMPI_MUTEX_TYPE mutex);
  int (*timedCondWait)(CMPI_COND_TYPE cond, CMPI_MUTEX_TYPE mutex,
                       struct timespec *wait);
  int (*signalCondition)(CMPI_COND_TYPE cond);
};

#if defined(CMPI_VER_200)
/// Memory management of broker-allocated objects and plain memory.
struct _CMPIBrokerMemFT {
  const int ftVersion;
  /// Starts a memory-management block; pass the result to release.
  CMPIGcStat *(*mark)(const CMPIBroker *mb, CMPIStatus *rc);
  CMPIStatus (*release)(const CMPIBroker *mb, const CMPIGcStat *gc);
  void *(*cmpiMalloc)(const CMPIBroker *mb, size_t size);
  void *(*cmpiCalloc)(const CMPIBroker *mb, size_t, size_t);
  void *(*cmpiRealloc)(const CMPIBroker *mb, void *, size_t);
  char *(*cmpiStrDup)(const CMPIBroker *mb, const char *);
  void (*cmpiFree)(const CMPIBroker *mb, void *);
  void (*freeInstance)(const CMPIBroker *mb, CMPIInstance *inst);
  void (*freeObjectPath)(const CMPIBroker *mb, CMPIObjectPath *obj);
  void (*freeArgs)(const CMPIBroker *mb, CMPIArgs *args);
  void (*freeString)(const CMPIBroker *mb, CMPIString *str);
  void (*freeArray)(const CMPIBroker *mb, CMPIArray *array);
  void (*freeDateTime)(const CMPIBroker *mb, CMPIDateTime *date);
  void (*freeSelectExp)(const CMPIBroker *mb, CMPISelectExp *se);
};
#endif

/* ======================================================================== */
/* Function tables of the encapsulated objects                              */
/* ======================================================================== */

/// Access to the entries of a request context.
struct _CMPIContextFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIContext *ctx);
  CMPIContext *(*clone)(const CMPIContext *ctx, CMPIStatus *rc);
  CMPIData (*getEntry)(const CMPIContext *ctx, const char *name,
                       CMPIStatus *rc);
  CMPIData (*getEntryAt)(const CMPIContext *ctx, CMPICount index,
                         CMPIString **name, CMPIStatus *rc);
  CMPICount (*getEntryCount)(const CMPIContext *ctx, CMPIStatus *rc);
  CMPIStatus (*addEntry)(const CMPIContext *ctx, const char *name,
                         const CMPIValue *value, const CMPIType type);
};

/// Delivery of results (values, instances, object paths) to the broker.
struct _CMPIResultFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIResult *rslt);
  CMPIResult *(*clone)(const CMPIResult *rslt, CMPIStatus *rc);
  CMPIStatus (*returnData)(const CMPIResult *rslt, const CMPIValue *value,
                           const CMPIType type);
  CMPIStatus (*returnInstance)(const CMPIResult *rslt,
                               const CMPIInstance *inst);
  CMPIStatus (*returnObjectPath)(const CMPIResult *rslt,
                                 const CMPIObjectPath *ref);
  CMPIStatus (*returnDone)(const CMPIResult *rslt);
#ifdef CMPI_VER_200
  /// Attaches an extended error to the response.
  CMPIStatus (*returnError)(const CMPIResult *rslt, const CMPIError *er);
#endif
};

#ifdef CMPI_VER_200
/// Getters and setters of the attributes of an extended error. Getters take
/// a const object, setters a non-const one.
struct _CMPIErrorFT {
  CMPISint32 ftVersion;
  CMPIStatus (*release)(CMPIError *);
  CMPIError *(*clone)(const CMPIError *, CMPIStatus *);
  CMPIErrorType (*getErrorType)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getOtherErrorType)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getOwningEntity)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getMessageID)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getMessage)(const CMPIError *, CMPIStatus *);
  CMPIErrorSeverity (*getPerceivedSeverity)(const CMPIError *, CMPIStatus *);
  CMPIErrorProbableCause (*getProbableCause)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getProbableCauseDescription)(const CMPIError *, CMPIStatus *);
  CMPIArray *(*getRecommendedActions)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getErrorSource)(const CMPIError *, CMPIStatus *);
  CMPIErrorSrcFormat (*getErrorSourceFormat)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getOtherErrorSourceFormat)(const CMPIError *, CMPIStatus *);
  CMPIrc (*getCIMStatusCode)(const CMPIError *, CMPIStatus *);
  CMPIString *(*getCIMStatusCodeDescription)(const CMPIError *, CMPIStatus *);
  CMPIArray *(*getMessageArguments)(const CMPIError *, CMPIStatus *);
  CMPIStatus (*setErrorType)(CMPIError *, const CMPIErrorType);
  CMPIStatus (*setOtherErrorType)(CMPIError *, const char *);
  CMPIStatus (*setProbableCauseDescription)(CMPIError *, const char *);
  CMPIStatus (*setRecommendedActions)(CMPIError *, const CMPIArray *);
  CMPIStatus (*setErrorSource)(CMPIError *, const char *);
  CMPIStatus (*setErrorSourceFormat)(CMPIError *, const CMPIErrorSrcFormat);
  CMPIStatus (*setOtherErrorSourceFormat)(CMPIError *, const char *);
  CMPIStatus (*setCIMStatusCodeDescription)(CMPIError *, const char *);
  CMPIStatus (*setMessageArguments)(CMPIError *, CMPIArray *);
};
#endif

/// Properties, object path and property filter of an instance.
struct _CMPIInstanceFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIInstance *inst);
  CMPIInstance *(*clone)(const CMPIInstance *inst, CMPIStatus *rc);
  CMPIData (*getProperty)(const CMPIInstance *inst, const char *name,
                          CMPIStatus *rc);
  CMPIData (*getPropertyAt)(const CMPIInstance *inst, CMPICount index,
                            CMPIString **name, CMPIStatus *rc);
  CMPICount (*getPropertyCount)(const CMPIInstance *inst, CMPIStatus *rc);
  CMPIStatus (*setProperty)(const CMPIInstance *inst, const char *name,
                            const CMPIValue *value, CMPIType type);
  CMPIObjectPath *(*getObjectPath)(const CMPIInstance *inst, CMPIStatus *rc);
  CMPIStatus (*setPropertyFilter)(CMPIInstance *inst, const char **propertyList,
                                  const char **keys);
  CMPIStatus (*setObjectPath)(CMPIInstance *inst, const CMPIObjectPath *op);
#ifdef CMPI_VER_200
  /// Parameters: instance, name, value, type, origin class (NULL for none).
  CMPIStatus (*setPropertyWithOrigin)(const CMPIInstance *, const char *,
                                      const CMPIValue *, const CMPIType,
                                      const char *);
#endif
};

/// Namespace, host, class name, keys and qualifiers of an object path.
struct _CMPIObjectPathFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIObjectPath *op);
  CMPIObjectPath *(*clone)(const CMPIObjectPath *op, CMPIStatus *rc);
  CMPIStatus (*setNameSpace)(CMPIObjectPath *op, const char *ns);
  CMPIString *(*getNameSpace)(const CMPIObjectPath *op, CMPIStatus *rc);
  CMPIStatus (*setHostname)(CMPIObjectPath *op, const char *hn);
  CMPIString *(*getHostname)(const CMPIObjectPath *op, CMPIStatus *rc);
  CMPIStatus (*setClassName)(CMPIObjectPath *op, const char *cn);
  CMPIString *(*getClassName)(const CMPIObjectPath *op, CMPIStatus *rc);
  CMPIStatus (*addKey)(CMPIObjectPath *op, const char *name,
                       const CMPIValue *value, const CMPIType type);
  CMPIData (*getKey)(const CMPIObjectPath *op, const char *name,
                     CMPIStatus *rc);
  CMPIData (*getKeyAt)(const CMPIObjectPath *op, CMPICount index,
                       CMPIString **name, CMPIStatus *rc);
  CMPICount (*getKeyCount)(const CMPIObjectPath *op, CMPIStatus *rc);
  CMPIStatus (*setNameSpaceFromObjectPath)(
      CMPIObjectPath *op, const CMPIObjectPath *src);
  CMPIStatus (*setHostAndNameSpaceFromObjectPath)(
      CMPIObjectPath *op, const CMPIObjectPath *src);
  CMPIData (*getClassQualifier)(const CMPIObjectPath *op, const char *qName,
                                CMPIStatus *rc);
  CMPIData (*getPropertyQualifier)(const CMPIObjectPath *op, const char *pName,
                                   const char *qName, CMPIStatus *rc);
  CMPIData (*getMethodQualifier)(const CMPIObjectPath *op,
                                 const char *methodName, const char *qName,
                                 CMPIStatus *rc);
  CMPIData (*getParameterQualifier)(const CMPIObjectPath *op, const char *mName,
                                    const char *pName, const char *qName,
                                    CMPIStatus *rc);
  CMPIString *(*toString)(const CMPIObjectPath *op, CMPIStatus *rc);
};

/// Evaluation and decomposition of a select expression.
struct _CMPISelectExpFT {
  int ftVersion;
  CMPIStatus (*release)(CMPISelectExp *se);
  CMPISelectExp *(*clone)(const CMPISelectExp *se, CMPIStatus *rc);
  CMPIBoolean (*evaluate)(const CMPISelectExp *se, const CMPIInstance *inst,
                          CMPIStatus *rc);
  CMPIString *(*getString)(const CMPISelectExp *se, CMPIStatus *rc);
  CMPISelectCond *(*getDOC)(const CMPISelectExp *se, CMPIStatus *rc);
  CMPISelectCond *(*getCOD)(const CMPISelectExp *se, CMPIStatus *rc);
  CMPIBoolean (*evaluateUsingAccessor)(const CMPISelectExp *se,
                                       CMPIAccessor *accessor, void *parm,
                                       CMPIStatus *rc);
};

/// Access to the sub-conditions of a select condition.
struct _CMPISelectCondFT {
  const int ftVersion;
  CMPIStatus (*release)(CMPISelectCond *sc);
  CMPISelectCond *(*clone)(const CMPISelectCond *sc, CMPIStatus *rc);
  /// Writes a CMPISelectCondType value through \p type.
  CMPICount (*getCountAndType)(const CMPISelectCond *sc, int *type,
                               CMPIStatus *rc);
  CMPISubCond *(*getSubCondAt)(const CMPISelectCond *sc, CMPICount index,
                               CMPIStatus *rc);
};

/// Access to the predicates of a sub-condition.
struct _CMPISubCondFT {
  int ftVersion;
  CMPIStatus (*release)(CMPISubCond *sc);
  CMPISubCond *(*clone)(const CMPISubCond *sc, CMPIStatus *rc);
  CMPICount (*getCount)(const CMPISubCond *sc, CMPIStatus *rc);
  CMPIPredicate *(*getPredicateAt)(const CMPISubCond *sc, CMPICount index,
                                   CMPIStatus *rc);
  CMPIPredicate *(*getPredicate)(const CMPISubCond *sc, const char *name,
                                 CMPIStatus *rc);
};

/// Decomposition and evaluation of a predicate.
struct _CMPIPredicateFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIPredicate *pr);
  CMPIPredicate *(*clone)(const CMPIPredicate *pr, CMPIStatus *rc);
  CMPIStatus (*getData)(const CMPIPredicate *pr, CMPIType *type, CMPIPredOp *op,
                        CMPIString **lhs, CMPIString **rhs);
  CMPIBoolean (*evaluateUsingAccessor)(const CMPIPredicate *pr,
                                       CMPIAccessor *accessorFnc, void *parm,
                                       CMPIStatus *rc);
};

/// Access to method parameters.
struct _CMPIArgsFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIArgs *as);
  CMPIArgs *(*clone)(const CMPIArgs *as, CMPIStatus *rc);
  CMPIStatus (*addArg)(const CMPIArgs *as, const char *name,
                       const CMPIValue *value, const CMPIType type);
  CMPIData (*getArg)(const CMPIArgs *as, const char *name, CMPIStatus *rc);
  CMPIData (*getArgAt)(const CMPIArgs *as, CMPICount index, CMPIString **name,
                       CMPIStatus *rc);
  CMPICount (*getArgCount)(const CMPIArgs *as, CMPIStatus *rc);
};

/// Access to the text of a string.
struct _CMPIStringFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIString *st);
  CMPIString *(*clone)(const CMPIString *st, CMPIStatus *rc);
  /// The portable way to reach the text (CMGetCharsPtr).
  const char *(*getCharPtr)(const CMPIString *st, CMPIStatus *rc);
};

/// Size, element type and elements of an array.
struct _CMPIArrayFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIArray *ar);
  CMPIArray *(*clone)(const CMPIArray *ar, CMPIStatus *rc);
  /// Number of elements (CMGetArrayCount).
  CMPICount (*getSize)(const CMPIArray *ar, CMPIStatus *rc);
  /// Element type (CMGetArrayType).
  CMPIType (*getSimpleType)(const CMPIArray *ar, CMPIStatus *rc);
  CMPIData (*getElementAt)(const CMPIArray *ar, CMPICount index,
                           CMPIStatus *rc);
  CMPIStatus (*setElementAt)(CMPIArray *ar, CMPICount index,
                             const CMPIValue *value, CMPIType type);
};

/// Iteration over the results of an up-call.
struct _CMPIEnumerationFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIEnumeration *en);
  CMPIEnumeration *(*clone)(const CMPIEnumeration *en, CMPIStatus *rc);
  CMPIData (*getNext)(const CMPIEnumeration *en, CMPIStatus *rc);
  CMPIBoolean (*hasNext)(const CMPIEnumeration *en, CMPIStatus *rc);
  CMPIArray *(*toArray)(const CMPIEnumeration *en, CMPIStatus *rc);
};

/// Binary and string forms of a date/time value.
struct _CMPIDateTimeFT {
  int ftVersion;
  CMPIStatus (*release)(CMPIDateTime *dt);
  CMPIDateTime *(*clone)(const CMPIDateTime *dt, CMPIStatus *rc);
  CMPIUint64 (*getBinaryFormat)(const CMPIDateTime *dt, CMPIStatus *rc);
  CMPIString *(*getStringFormat)(const CMPIDateTime *dt, CMPIStatus *rc);
  CMPIBoolean (*isInterval)(const CMPIDateTime *dt, CMPIStatus *rc);
};

/* ======================================================================== */
/* Provider (MI) objects and their function tables                          */
/* ======================================================================== */

/// Instance provider, returned by <pn>_Create_InstanceMI. The only MI object
/// whose hdl points to const.
struct _CMPIInstanceMI {
  const void *hdl;
  CMPIInstanceMIFT *ft;
};

/// Instance provider operations.
struct _CMPIInstanceMIFT {
  /// CMPI level the MI was compiled for.
  int ftVersion;
  /// Lowest CMPI level the MI needs from the broker.
  int miVersion;
  /// Name of the MI.
  const char *miName;
  CMPIStatus (*cleanup)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                        CMPIBoolean terminating);
  CMPIStatus (*enumerateInstanceNames)(CMPIInstanceMI *mi,
                                       const CMPIContext *ctx,
                                       const CMPIResult *rslt,
                                       const CMPIObjectPath *op);
  CMPIStatus (*enumerateInstances)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                   const CMPIResult *rslt,
                                   const CMPIObjectPath *op,
                                   const char **properties);
  CMPIStatus (*getInstance)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                            const CMPIResult *rslt, const CMPIObjectPath *op,
                            const char **properties);
  CMPIStatus (*createInstance)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                               const CMPIResult *rslt, const CMPIObjectPath *op,
                               const CMPIInstance *inst);
  CMPIStatus (*modifyInstance)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                               const CMPIResult *rslt, const CMPIObjectPath *op,
                               const CMPIInstance *inst,
                               const char **properties);
  CMPIStatus (*deleteInstance)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                               const CMPIResult *rslt,
                               const CMPIObjectPath *op);
  CMPIStatus (*execQuery)(CMPIInstanceMI *mi, const CMPIContext *ctx,
                          const CMPIResult *rslt, const CMPIObjectPath *op,
                          const char *query, const char *lang);
};

/// Association provider, returned by <pn>_Create_AssociationMI.
struct _CMPIAssociationMI {
  void *hdl;
  CMPIAssociationMIFT *ft;
};

/// Association provider operations.
struct _CMPIAssociationMIFT {
  int ftVersion;
  /// Lowest CMPI level the MI needs from the broker.
  const CMPISint32 miVersion;
  const char *miName;
  CMPIStatus (*cleanup)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                        CMPIBoolean terminating);
  CMPIStatus (*associators)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                            const CMPIResult *rslt, const CMPIObjectPath *op,
                            const char *asscClass, const char *resultClass,
                            const char *role, const char *resultRole,
                            const char **properties);
  CMPIStatus (*associatorNames)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                const CMPIResult *rslt,
                                const CMPIObjectPath *op,
                                const char *assocClass, const char *resultClass,
                                const char *role, const char *resultRole);
  CMPIStatus (*references)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                           const CMPIResult *rslt, const CMPIObjectPath *op,
                           const char *resultClass, const char *role,
                           const char **properties);
  CMPIStatus (*referenceNames)(CMPIAssociationMI *mi, const CMPIContext *ctx,
                               const CMPIResult *rslt, const CMPIObjectPath *op,
                               const char *resultClass, const char *role);
};

/// Method provider, returned by <pn>_Create_MethodMI.
struct _CMPIMethodMI {
  void *hdl;
  CMPIMethodMIFT *ft;
};

/// Method provider operations.
struct _CMPIMethodMIFT {
  int ftVersion;
  int miVersion;
  const char *miName;
  CMPIStatus (*cleanup)(CMPIMethodMI *mi, const CMPIContext *ctx,
                        CMPIBoolean terminating);
  CMPIStatus (*invokeMethod)(CMPIMethodMI *mi, const CMPIContext *ctx,
                             const CMPIResult *rslt, const CMPIObjectPath *op,
                             const char *method, const CMPIArgs *in,
                             CMPIArgs *out);
};

/// Property provider, returned by <pn>_Create_PropertyMI.
struct _CMPIPropertyMI {
  void *hdl;
  CMPIPropertyMIFT *ft;
};

/// Property provider operations.
struct _CMPIPropertyMIFT {
  int ftVersion;
  int miVersion;
  const char *miName;
  CMPIStatus (*cleanup)(CMPIPropertyMI *mi, const CMPIContext *ctx,
                        CMPIBoolean terminating);
  /// The value arrives by value (24 bytes, on the stack).
  CMPIStatus (*setProperty)(CMPIPropertyMI *mi, const CMPIContext *ctx,
                            const CMPIResult *rslt, const CMPIObjectPath *op,
                            const char *name, const CMPIData data);
  CMPIStatus (*getProperty)(CMPIPropertyMI *, const CMPIContext *,
                            const CMPIResult *, const CMPIObjectPath *,
                            const char *name);
#ifdef CMPI_VER_200
  /// Like setProperty, plus the origin class as the last parameter.
  CMPIStatus (*setPropertyWithOrigin)(CMPIPropertyMI *, const CMPIContext *,
                                      const CMPIResult *, CMPIObjectPath *op,
                                      const char *name, const CMPIData data,
                                      const char *);
#endif
};

/// Indication provider, returned by <pn>_Create_IndicationMI.
struct _CMPIIndicationMI {
  void *hdl;
  CMPIIndicationMIFT *ft;
};

/// Indication provider operations.
struct _CMPIIndicationMIFT {
  int ftVersion;
  int miVersion;
  const char *miName;
  CMPIStatus (*cleanup)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                        CMPIBoolean terminating);
  CMPIStatus (*authorizeFilter)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                const CMPISelectExp *filter,
                                const char *className, const CMPIObjectPath *op,
                                const char *owner);
  /// No CMPIResult parameter at this level.
  CMPIStatus (*mustPoll)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                         const CMPISelectExp *filter, const char *className,
                         const CMPIObjectPath *classPath);
  CMPIStatus (*activateFilter)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                               const CMPISelectExp *filter,
                               const char *className,
                               const CMPIObjectPath *classPath,
                               CMPIBoolean firstActivation);
  CMPIStatus (*deActivateFilter)(CMPIIndicationMI *mi, const CMPIContext *ctx,
                                 const CMPISelectExp *filter,
                                 const char *className,
                                 const CMPIObjectPath *classPath,
                                 CMPIBoolean lastActiviation);
  /// Always part of the table; the stub macros leave it NULL.
  CMPIStatus (*enableIndications)(CMPIIndicationMI *mi, const CMPIContext *);
  /// Always part of the table; the stub macros leave it NULL.
  CMPIStatus (*disableIndications)(CMPIIndicationMI *mi, const CMPIContext *);
};

#include "cmpimacs.h"

#ifdef __cplusplus
}
#endif

#endif /* TVR_CMPI_CMPIFT_H */
