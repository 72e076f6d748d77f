// The test provider: dummy provider functions and one stub of each kind.
// The functions do nothing; the stub tests only compare slot contents.

#include "test_provider.h"

const CMPIBroker *tvrTestProviderBroker = nullptr;
int tvrTestInstanceHookCalls = 0;
const CMPIBroker *tvrTestBrokerSeenByHook = nullptr;

extern "C" int tvrTestProviderUnexportedFunction(void) { return 0; }

namespace {

CMPIStatus ok() { return CMPIStatus{CMPI_RC_OK, nullptr}; }

void recordInstanceHook() {
  ++tvrTestInstanceHookCalls;
  tvrTestBrokerSeenByHook = tvrTestProviderBroker;
}

} // namespace

CMPIStatus TvrTestCleanup(CMPIInstanceMI *, const CMPIContext *, CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestEnumInstanceNames(CMPIInstanceMI *, const CMPIContext *,
                                    const CMPIResult *,
                                    const CMPIObjectPath *) {
  return ok();
}
CMPIStatus TvrTestEnumInstances(CMPIInstanceMI *, const CMPIContext *,
                                const CMPIResult *, const CMPIObjectPath *,
                                const char **) {
  return ok();
}
CMPIStatus TvrTestGetInstance(CMPIInstanceMI *, const CMPIContext *,
                              const CMPIResult *, const CMPIObjectPath *,
                              const char **) {
  return ok();
}
CMPIStatus TvrTestCreateInstance(CMPIInstanceMI *, const CMPIContext *,
                                 const CMPIResult *, const CMPIObjectPath *,
                                 const CMPIInstance *) {
  return ok();
}
CMPIStatus TvrTestModifyInstance(CMPIInstanceMI *, const CMPIContext *,
                                 const CMPIResult *, const CMPIObjectPath *,
                                 const CMPIInstance *, const char **) {
  return ok();
}
CMPIStatus TvrTestDeleteInstance(CMPIInstanceMI *, const CMPIContext *,
                                 const CMPIResult *, const CMPIObjectPath *) {
  return ok();
}
CMPIStatus TvrTestExecQuery(CMPIInstanceMI *, const CMPIContext *,
                            const CMPIResult *, const CMPIObjectPath *,
                            const char *, const char *) {
  return ok();
}

CMPIStatus TvrTestAssociationCleanup(CMPIAssociationMI *, const CMPIContext *,
                                     CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestAssociators(CMPIAssociationMI *, const CMPIContext *,
                              const CMPIResult *, const CMPIObjectPath *,
                              const char *, const char *, const char *,
                              const char *, const char **) {
  return ok();
}
CMPIStatus TvrTestAssociatorNames(CMPIAssociationMI *, const CMPIContext *,
                                  const CMPIResult *, const CMPIObjectPath *,
                                  const char *, const char *, const char *,
                                  const char *) {
  return ok();
}
CMPIStatus TvrTestReferences(CMPIAssociationMI *, const CMPIContext *,
                             const CMPIResult *, const CMPIObjectPath *,
                             const char *, const char *, const char **) {
  return ok();
}
CMPIStatus TvrTestReferenceNames(CMPIAssociationMI *, const CMPIContext *,
                                 const CMPIResult *, const CMPIObjectPath *,
                                 const char *, const char *) {
  return ok();
}

CMPIStatus TvrTestMethodCleanup(CMPIMethodMI *, const CMPIContext *,
                                CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestInvokeMethod(CMPIMethodMI *, const CMPIContext *,
                               const CMPIResult *, const CMPIObjectPath *,
                               const char *, const CMPIArgs *, CMPIArgs *) {
  return ok();
}

CMPIStatus TvrTestPropertyCleanup(CMPIPropertyMI *, const CMPIContext *,
                                  CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestSetProperty(CMPIPropertyMI *, const CMPIContext *,
                              const CMPIResult *, const CMPIObjectPath *,
                              const char *, const CMPIData) {
  return ok();
}
CMPIStatus TvrTestGetProperty(CMPIPropertyMI *, const CMPIContext *,
                              const CMPIResult *, const CMPIObjectPath *,
                              const char *) {
  return ok();
}

CMPIStatus TvrTestIndicationCleanup(CMPIIndicationMI *, const CMPIContext *,
                                    CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestAuthorizeFilter(CMPIIndicationMI *, const CMPIContext *,
                                  const CMPISelectExp *, const char *,
                                  const CMPIObjectPath *, const char *) {
  return ok();
}
CMPIStatus TvrTestMustPoll(CMPIIndicationMI *, const CMPIContext *,
                           const CMPISelectExp *, const char *,
                           const CMPIObjectPath *) {
  return ok();
}
CMPIStatus TvrTestActivateFilter(CMPIIndicationMI *, const CMPIContext *,
                                 const CMPISelectExp *, const char *,
                                 const CMPIObjectPath *, CMPIBoolean) {
  return ok();
}
CMPIStatus TvrTestDeActivateFilter(CMPIIndicationMI *, const CMPIContext *,
                                   const CMPISelectExp *, const char *,
                                   const CMPIObjectPath *, CMPIBoolean) {
  return ok();
}

// Stubs of all five kinds share this translation unit: each uses its own
// fixed table name.
CMInstanceMIStub(TvrTest, TvrTestProvider, tvrTestProviderBroker,
                 recordInstanceHook())
CMAssociationMIStub(TvrTest, TvrTestProvider, tvrTestProviderBroker, CMNoHook)
CMMethodMIStub(TvrTest, TvrTestProvider, tvrTestProviderBroker, CMNoHook)
CMPropertyMIStub(TvrTest, TvrTestProvider, tvrTestProviderBroker, CMNoHook)
CMIndicationMIStub(TvrTest, TvrTestProvider, tvrTestProviderBroker, CMNoHook)
