// Run-time behaviour of the MI stub macros: the entry points they generate
// in test_provider.cpp (C++) and c_provider.c (C), what the returned MI
// objects hold, and that the entry points are exported under their plain
// names. The test executable exports its dynamic symbols, and both providers
// are compiled with -fvisibility=hidden, so dlsym finds exactly what
// CMPI_EXTERN_C exports.

#include "c_provider.h"
#include "test_provider.h"

#include <gtest/gtest.h>

#include <dlfcn.h>

namespace {

// Distinct brokers, compared by address only.
CMPIBroker firstBroker{};
CMPIBroker secondBroker{};

void *exportedSymbol(const char *name) { return dlsym(RTLD_DEFAULT, name); }

// --- Export --------------------------------------------------------------

TEST(CmpiMIStub, InstanceEntryPointIsExportedUnderItsPlainName) {
  EXPECT_EQ(exportedSymbol("TvrTestProvider_Create_InstanceMI"),
            reinterpret_cast<void *>(&TvrTestProvider_Create_InstanceMI));
}

TEST(CmpiMIStub, AssociationEntryPointIsExportedUnderItsPlainName) {
  EXPECT_EQ(exportedSymbol("TvrTestProvider_Create_AssociationMI"),
            reinterpret_cast<void *>(&TvrTestProvider_Create_AssociationMI));
}

TEST(CmpiMIStub, MethodPropertyAndIndicationEntryPointsAreExported) {
  EXPECT_EQ(exportedSymbol("TvrTestProvider_Create_MethodMI"),
            reinterpret_cast<void *>(&TvrTestProvider_Create_MethodMI));
  EXPECT_EQ(exportedSymbol("TvrTestProvider_Create_PropertyMI"),
            reinterpret_cast<void *>(&TvrTestProvider_Create_PropertyMI));
  EXPECT_EQ(exportedSymbol("TvrTestProvider_Create_IndicationMI"),
            reinterpret_cast<void *>(&TvrTestProvider_Create_IndicationMI));
}

// Shows that the export checks above can fail: a C function of the same
// provider without CMPI_EXTERN_C stays hidden.
TEST(CmpiMIStub, FunctionsWithoutCmpiExternCAreNotExported) {
  EXPECT_EQ(tvrTestProviderUnexportedFunction(), 0);
  EXPECT_EQ(exportedSymbol("tvrTestProviderUnexportedFunction"), nullptr);
}

TEST(CmpiMIStub, EntryPointsOfACProviderAreExported) {
  EXPECT_NE(exportedSymbol("TvrCProvider_Create_InstanceMI"), nullptr);
  EXPECT_NE(exportedSymbol("TvrCProvider_Create_AssociationMI"), nullptr);
  EXPECT_NE(exportedSymbol("TvrCProvider_Create_MethodMI"), nullptr);
  EXPECT_NE(exportedSymbol("TvrCProvider_Create_PropertyMI"), nullptr);
  EXPECT_NE(exportedSymbol("TvrCProvider_Create_IndicationMI"), nullptr);
}

// --- Instance stub -------------------------------------------------------

TEST(CmpiMIStub, InstanceEntryPointReturnsTheSameMiOnEveryCall) {
  CMPIInstanceMI *first =
      TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  CMPIInstanceMI *second =
      TvrTestProvider_Create_InstanceMI(&secondBroker, nullptr, nullptr);
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(first, second);
}

TEST(CmpiMIStub, InstanceMiHasNoHdl) {
  CMPIInstanceMI *mi =
      TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(mi->hdl, nullptr);
}

TEST(CmpiMIStub, InstanceTableCarriesVersion200AndTheProviderName) {
  CMPIInstanceMI *mi =
      TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  ASSERT_NE(mi->ft, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceTvrTestProvider");
}

TEST(CmpiMIStub, InstanceTableHoldsTheProviderFunctionsInSlotOrder) {
  CMPIInstanceMIFT *ft =
      TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr)->ft;
  EXPECT_EQ(ft->cleanup, &TvrTestCleanup);
  EXPECT_EQ(ft->enumerateInstanceNames, &TvrTestEnumInstanceNames);
  EXPECT_EQ(ft->enumerateInstances, &TvrTestEnumInstances);
  EXPECT_EQ(ft->getInstance, &TvrTestGetInstance);
  EXPECT_EQ(ft->createInstance, &TvrTestCreateInstance);
  EXPECT_EQ(ft->modifyInstance, &TvrTestModifyInstance);
  EXPECT_EQ(ft->deleteInstance, &TvrTestDeleteInstance);
  EXPECT_EQ(ft->execQuery, &TvrTestExecQuery);
}

TEST(CmpiMIStub, InstanceEntryPointStoresTheBrokerArgument) {
  TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &firstBroker);
  TvrTestProvider_Create_InstanceMI(&secondBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &secondBroker);
}

TEST(CmpiMIStub, InstanceEntryPointRunsTheHookOncePerCall) {
  const int before = tvrTestInstanceHookCalls;
  TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestInstanceHookCalls, before + 1);
  TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestInstanceHookCalls, before + 2);
}

TEST(CmpiMIStub, InstanceEntryPointRunsTheHookAfterStoringTheBroker) {
  TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestBrokerSeenByHook, &firstBroker);
  TvrTestProvider_Create_InstanceMI(&secondBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestBrokerSeenByHook, &secondBroker);
}

TEST(CmpiMIStub, InstanceEntryPointLeavesTheCallersStatusUntouched) {
  CMPIString message{};
  CMPIStatus rc{CMPI_RC_ERR_FAILED, &message};
  TvrTestProvider_Create_InstanceMI(&firstBroker, nullptr, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(rc.msg, &message);
}

// --- Association stub ----------------------------------------------------

TEST(CmpiMIStub, AssociationEntryPointReturnsTheSameMiOnEveryCall) {
  CMPIAssociationMI *first =
      TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, nullptr);
  CMPIAssociationMI *second =
      TvrTestProvider_Create_AssociationMI(&secondBroker, nullptr, nullptr);
  ASSERT_NE(first, nullptr);
  EXPECT_EQ(first, second);
  EXPECT_EQ(first->hdl, nullptr);
}

TEST(CmpiMIStub, AssociationTableCarriesVersion200AndTheProviderName) {
  CMPIAssociationMIFT *ft =
      TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, nullptr)->ft;
  EXPECT_EQ(ft->ftVersion, 200);
  EXPECT_EQ(ft->miVersion, 200);
  EXPECT_STREQ(ft->miName, "associationTvrTestProvider");
}

TEST(CmpiMIStub, AssociationTableHoldsTheProviderFunctionsInSlotOrder) {
  CMPIAssociationMIFT *ft =
      TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, nullptr)->ft;
  EXPECT_EQ(ft->cleanup, &TvrTestAssociationCleanup);
  EXPECT_EQ(ft->associators, &TvrTestAssociators);
  EXPECT_EQ(ft->associatorNames, &TvrTestAssociatorNames);
  EXPECT_EQ(ft->references, &TvrTestReferences);
  EXPECT_EQ(ft->referenceNames, &TvrTestReferenceNames);
}

TEST(CmpiMIStub, AssociationEntryPointStoresTheBrokerArgument) {
  TvrTestProvider_Create_AssociationMI(&secondBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &secondBroker);
  TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &firstBroker);
}

TEST(CmpiMIStub, AssociationEntryPointLeavesTheCallersStatusUntouched) {
  CMPIStatus rc{CMPI_RC_ERR_NOT_FOUND, nullptr};
  TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(rc.msg, nullptr);
}

TEST(CmpiMIStub, AssociationHooklessStubDoesNotRunTheInstanceHook) {
  const int before = tvrTestInstanceHookCalls;
  TvrTestProvider_Create_AssociationMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestInstanceHookCalls, before);
}

// --- Method, property and indication stubs -------------------------------

TEST(CmpiMIStub, MethodStubFillsItsTable) {
  CMPIMethodMI *mi =
      TvrTestProvider_Create_MethodMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(mi, TvrTestProvider_Create_MethodMI(&secondBroker, nullptr,
                                                nullptr));
  EXPECT_EQ(tvrTestProviderBroker, &secondBroker);
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "methodTvrTestProvider");
  EXPECT_EQ(mi->ft->cleanup, &TvrTestMethodCleanup);
  EXPECT_EQ(mi->ft->invokeMethod, &TvrTestInvokeMethod);
}

TEST(CmpiMIStub, PropertyStubFillsItsTableAndLeavesSetPropertyWithOriginNull) {
  CMPIPropertyMI *mi =
      TvrTestProvider_Create_PropertyMI(&firstBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &firstBroker);
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "propertyTvrTestProvider");
  EXPECT_EQ(mi->ft->cleanup, &TvrTestPropertyCleanup);
  EXPECT_EQ(mi->ft->setProperty, &TvrTestSetProperty);
  EXPECT_EQ(mi->ft->getProperty, &TvrTestGetProperty);
  EXPECT_EQ(mi->ft->setPropertyWithOrigin, nullptr);
}

TEST(CmpiMIStub, IndicationStubUsesACapitalIInItsName) {
  CMPIIndicationMI *mi =
      TvrTestProvider_Create_IndicationMI(&firstBroker, nullptr, nullptr);
  EXPECT_STREQ(mi->ft->miName, "IndicationTvrTestProvider");
}

TEST(CmpiMIStub, IndicationStubFillsFilterSlotsAndLeavesEnableDisableNull) {
  CMPIIndicationMI *mi =
      TvrTestProvider_Create_IndicationMI(&secondBroker, nullptr, nullptr);
  EXPECT_EQ(tvrTestProviderBroker, &secondBroker);
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_EQ(mi->ft->cleanup, &TvrTestIndicationCleanup);
  EXPECT_EQ(mi->ft->authorizeFilter, &TvrTestAuthorizeFilter);
  EXPECT_EQ(mi->ft->mustPoll, &TvrTestMustPoll);
  EXPECT_EQ(mi->ft->activateFilter, &TvrTestActivateFilter);
  EXPECT_EQ(mi->ft->deActivateFilter, &TvrTestDeActivateFilter);
  EXPECT_EQ(mi->ft->enableIndications, nullptr);
  EXPECT_EQ(mi->ft->disableIndications, nullptr);
}

// --- Stubs compiled as C -------------------------------------------------

using InstanceFactory = CMPIInstanceMI *(*)(const CMPIBroker *,
                                            const CMPIContext *, CMPIStatus *);

CMPIInstanceMI *createCInstanceMI(const CMPIBroker *broker) {
  auto factory = reinterpret_cast<InstanceFactory>(
      exportedSymbol("TvrCProvider_Create_InstanceMI"));
  return factory ? factory(broker, nullptr, nullptr) : nullptr;
}

TEST(CmpiMIStub, CInstanceStubBuildsTheSameKindOfMi) {
  CMPIInstanceMI *mi = createCInstanceMI(&firstBroker);
  ASSERT_NE(mi, nullptr);
  EXPECT_EQ(mi, createCInstanceMI(&secondBroker));
  EXPECT_EQ(tvr_c_provider_broker(), &secondBroker);
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceTvrCProvider");
}

const CMPIObjectPath *returnedPath = nullptr;
int doneCalls = 0;

CMPIStatus recordReturnedPath(const CMPIResult *, const CMPIObjectPath *ref) {
  returnedPath = ref;
  return CMPIStatus{CMPI_RC_OK, nullptr};
}

CMPIStatus recordDone(const CMPIResult *) {
  ++doneCalls;
  return CMPIStatus{CMPI_RC_OK, nullptr};
}

// The C provider's enumerateInstanceNames uses CMReturnObjectPath,
// CMReturnDone and CMReturn, so this runs their C expansions.
TEST(CmpiMIStub, CInstanceStubSlotsCallTheCProviderFunctions) {
  CMPIInstanceMI *mi = createCInstanceMI(&firstBroker);
  ASSERT_NE(mi, nullptr);
  CMPIResultFT resultFt{};
  resultFt.returnObjectPath = recordReturnedPath;
  resultFt.returnDone = recordDone;
  CMPIResult result{nullptr, &resultFt};
  CMPIObjectPath path{};
  returnedPath = nullptr;
  doneCalls = 0;

  CMPIStatus st =
      mi->ft->enumerateInstanceNames(mi, nullptr, &result, &path);

  EXPECT_EQ(st.rc, CMPI_RC_OK);
  EXPECT_EQ(returnedPath, &path);
  EXPECT_EQ(doneCalls, 1);
  EXPECT_EQ(mi->ft->getInstance(mi, nullptr, &result, &path, nullptr).rc,
            CMPI_RC_ERR_NOT_SUPPORTED);
}

TEST(CmpiMIStub, CIndicationStubLeavesEnableDisableNull) {
  using Factory = CMPIIndicationMI *(*)(const CMPIBroker *,
                                        const CMPIContext *, CMPIStatus *);
  auto factory = reinterpret_cast<Factory>(
      exportedSymbol("TvrCProvider_Create_IndicationMI"));
  ASSERT_NE(factory, nullptr);
  CMPIIndicationMI *mi = factory(&firstBroker, nullptr, nullptr);
  EXPECT_STREQ(mi->ft->miName, "IndicationTvrCProvider");
  EXPECT_NE(mi->ft->deActivateFilter, nullptr);
  EXPECT_EQ(mi->ft->enableIndications, nullptr);
  EXPECT_EQ(mi->ft->disableIndications, nullptr);
}

} // namespace
