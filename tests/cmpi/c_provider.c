// A provider written in C, built with all five MI stub macros (provider
// name TvrCProvider). It is compiled as C99 and C11 with -pedantic-errors
// -Werror, so it also pins that the headers and macros compile cleanly as C.
// Its instance functions use the result macros, so the C expansions are
// exercised at run time by the stub tests.

#include <cmpift.h>

#include "c_provider.h"

static const CMPIBroker *broker;

const CMPIBroker *tvr_c_provider_broker(void) { return broker; }

#define TVR_C_IGNORE(x) ((void)(x))

/* Instance provider: enumerates the requested path once. */

static CMPIStatus TvrCCleanup(CMPIInstanceMI *mi, const CMPIContext *ctx,
                              CMPIBoolean terminating) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(terminating);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCEnumInstanceNames(CMPIInstanceMI *mi,
                                        const CMPIContext *ctx,
                                        const CMPIResult *rslt,
                                        const CMPIObjectPath *op) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  CMReturnObjectPath(rslt, op);
  CMReturnDone(rslt);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCEnumInstances(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                    const CMPIResult *rslt,
                                    const CMPIObjectPath *op,
                                    const char **properties) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(properties);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCGetInstance(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt,
                                  const CMPIObjectPath *op,
                                  const char **properties) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(properties);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCCreateInstance(CMPIInstanceMI *mi,
                                     const CMPIContext *ctx,
                                     const CMPIResult *rslt,
                                     const CMPIObjectPath *op,
                                     const CMPIInstance *inst) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(inst);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCModifyInstance(CMPIInstanceMI *mi,
                                     const CMPIContext *ctx,
                                     const CMPIResult *rslt,
                                     const CMPIObjectPath *op,
                                     const CMPIInstance *inst,
                                     const char **properties) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(inst);
  TVR_C_IGNORE(properties);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCDeleteInstance(CMPIInstanceMI *mi,
                                     const CMPIContext *ctx,
                                     const CMPIResult *rslt,
                                     const CMPIObjectPath *op) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCExecQuery(CMPIInstanceMI *mi, const CMPIContext *ctx,
                                const CMPIResult *rslt,
                                const CMPIObjectPath *op, const char *query,
                                const char *lang) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(query);
  TVR_C_IGNORE(lang);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMInstanceMIStub(TvrC, TvrCProvider, broker, CMNoHook)

/* Association provider: supports nothing. */

static CMPIStatus TvrCAssociationCleanup(CMPIAssociationMI *mi,
                                         const CMPIContext *ctx,
                                         CMPIBoolean terminating) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(terminating);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCAssociators(CMPIAssociationMI *mi,
                                  const CMPIContext *ctx,
                                  const CMPIResult *rslt,
                                  const CMPIObjectPath *op,
                                  const char *assocClass,
                                  const char *resultClass, const char *role,
                                  const char *resultRole,
                                  const char **properties) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(assocClass);
  TVR_C_IGNORE(resultClass);
  TVR_C_IGNORE(role);
  TVR_C_IGNORE(resultRole);
  TVR_C_IGNORE(properties);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCAssociatorNames(CMPIAssociationMI *mi,
                                      const CMPIContext *ctx,
                                      const CMPIResult *rslt,
                                      const CMPIObjectPath *op,
                                      const char *assocClass,
                                      const char *resultClass,
                                      const char *role,
                                      const char *resultRole) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(assocClass);
  TVR_C_IGNORE(resultClass);
  TVR_C_IGNORE(role);
  TVR_C_IGNORE(resultRole);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCReferences(CMPIAssociationMI *mi, const CMPIContext *ctx,
                                 const CMPIResult *rslt,
                                 const CMPIObjectPath *op,
                                 const char *resultClass, const char *role,
                                 const char **properties) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(resultClass);
  TVR_C_IGNORE(role);
  TVR_C_IGNORE(properties);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCReferenceNames(CMPIAssociationMI *mi,
                                     const CMPIContext *ctx,
                                     const CMPIResult *rslt,
                                     const CMPIObjectPath *op,
                                     const char *resultClass,
                                     const char *role) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(resultClass);
  TVR_C_IGNORE(role);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMAssociationMIStub(TvrC, TvrCProvider, broker, CMNoHook)

/* Method provider. */

static CMPIStatus TvrCMethodCleanup(CMPIMethodMI *mi, const CMPIContext *ctx,
                                    CMPIBoolean terminating) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(terminating);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCInvokeMethod(CMPIMethodMI *mi, const CMPIContext *ctx,
                                   const CMPIResult *rslt,
                                   const CMPIObjectPath *op,
                                   const char *method, const CMPIArgs *in,
                                   CMPIArgs *out) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(method);
  TVR_C_IGNORE(in);
  TVR_C_IGNORE(out);
  CMReturn(CMPI_RC_ERR_METHOD_NOT_FOUND);
}

CMMethodMIStub(TvrC, TvrCProvider, broker, CMNoHook)

/* Property provider. */

static CMPIStatus TvrCPropertyCleanup(CMPIPropertyMI *mi,
                                      const CMPIContext *ctx,
                                      CMPIBoolean terminating) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(terminating);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCSetProperty(CMPIPropertyMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt,
                                  const CMPIObjectPath *op, const char *name,
                                  const CMPIData data) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(name);
  TVR_C_IGNORE(data);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCGetProperty(CMPIPropertyMI *mi, const CMPIContext *ctx,
                                  const CMPIResult *rslt,
                                  const CMPIObjectPath *op, const char *name) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(rslt);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(name);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

CMPropertyMIStub(TvrC, TvrCProvider, broker, CMNoHook)

/* Indication provider. */

static CMPIStatus TvrCIndicationCleanup(CMPIIndicationMI *mi,
                                        const CMPIContext *ctx,
                                        CMPIBoolean terminating) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(terminating);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCAuthorizeFilter(CMPIIndicationMI *mi,
                                      const CMPIContext *ctx,
                                      const CMPISelectExp *filter,
                                      const char *className,
                                      const CMPIObjectPath *op,
                                      const char *owner) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(filter);
  TVR_C_IGNORE(className);
  TVR_C_IGNORE(op);
  TVR_C_IGNORE(owner);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCMustPoll(CMPIIndicationMI *mi, const CMPIContext *ctx,
                               const CMPISelectExp *filter,
                               const char *className,
                               const CMPIObjectPath *classPath) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(filter);
  TVR_C_IGNORE(className);
  TVR_C_IGNORE(classPath);
  CMReturn(CMPI_RC_ERR_NOT_SUPPORTED);
}

static CMPIStatus TvrCActivateFilter(CMPIIndicationMI *mi,
                                     const CMPIContext *ctx,
                                     const CMPISelectExp *filter,
                                     const char *className,
                                     const CMPIObjectPath *classPath,
                                     CMPIBoolean firstActivation) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(filter);
  TVR_C_IGNORE(className);
  TVR_C_IGNORE(classPath);
  TVR_C_IGNORE(firstActivation);
  CMReturn(CMPI_RC_OK);
}

static CMPIStatus TvrCDeActivateFilter(CMPIIndicationMI *mi,
                                       const CMPIContext *ctx,
                                       const CMPISelectExp *filter,
                                       const char *className,
                                       const CMPIObjectPath *classPath,
                                       CMPIBoolean lastActivation) {
  TVR_C_IGNORE(mi);
  TVR_C_IGNORE(ctx);
  TVR_C_IGNORE(filter);
  TVR_C_IGNORE(className);
  TVR_C_IGNORE(classPath);
  TVR_C_IGNORE(lastActivation);
  CMReturn(CMPI_RC_OK);
}

CMIndicationMIStub(TvrC, TvrCProvider, broker, CMNoHook)
