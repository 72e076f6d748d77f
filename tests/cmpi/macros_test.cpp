// Run-time behaviour of the convenience macros of cmpimacs.h. Each macro is
// called on an object whose function table is a fake that records the call,
// so the tests see which slot was called and with which arguments.

#include <cmpift.h>

#include <gtest/gtest.h>

#include <string>

namespace {

/// What the last call through one of the fake tables received.
struct RecordedCall {
  int calls = 0;
  const void *self = nullptr;     // first argument (broker, instance, ...)
  const void *object = nullptr;   // main object argument
  std::string text1, text2, text3;
  const void *pointer = nullptr;  // value, property list or similar
  long number = 0;                // type, level or similar
  const CMPIStatus *status = nullptr;
};

RecordedCall recorded;

std::string textOf(const char *s) { return s ? s : "<null>"; }

CMPIStatus statusWith(CMPIrc rc) { return CMPIStatus{rc, nullptr}; }

// Objects the fakes hand out, compared by address only.
CMPIString fakeString{};
CMPIObjectPath fakePath{};
CMPIEnumeration fakeEnumeration{};

/// A broker whose tables hold only the slots a test installs.
struct FakeBroker {
  CMPIBrokerFT bft{};
  CMPIBrokerEncFT eft{};
  CMPIBroker broker{};

  FakeBroker() {
    broker.bft = &bft;
    broker.eft = &eft;
  }
};

class CmpiMacros : public ::testing::Test {
protected:
  void SetUp() override { recorded = RecordedCall(); }

  FakeBroker fake;
  const CMPIBroker *broker = &fake.broker;
};

// --- Status and return macros ----------------------------------------------

CMPIStatus returnNotFoundThenContinue(bool *continued) {
  CMReturn(CMPI_RC_ERR_NOT_FOUND);
  *continued = true;
  return statusWith(CMPI_RC_OK);
}

TEST_F(CmpiMacros, CMReturnLeavesTheFunctionWithTheCodeAndNoMessage) {
  bool continued = false;
  CMPIStatus st = returnNotFoundThenContinue(&continued);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_NOT_FOUND);
  EXPECT_EQ(st.msg, nullptr);
  EXPECT_FALSE(continued);
}

CMPIStatus returnWithString(CMPIString *message) {
  CMReturnWithString(CMPI_RC_ERR_FAILED, message);
}

TEST_F(CmpiMacros, CMReturnWithStringReturnsTheGivenMessage) {
  CMPIStatus st = returnWithString(&fakeString);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(st.msg, &fakeString);
}

CMPIString *recordNewString(const CMPIBroker *mb, const char *data,
                            CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.text1 = textOf(data);
  recorded.status = rc;
  return &fakeString;
}

CMPIStatus returnWithChars(const CMPIBroker *b) {
  CMReturnWithChars(b, CMPI_RC_ERR_INVALID_PARAMETER, "bad slot number");
}

TEST_F(CmpiMacros, CMReturnWithCharsMakesTheMessageThroughNewString) {
  fake.eft.newString = recordNewString;
  CMPIStatus st = returnWithChars(broker);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(st.msg, &fakeString);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.text1, "bad slot number");
  EXPECT_EQ(recorded.status, nullptr);
}

TEST_F(CmpiMacros, CMSetStatusSetsTheCodeAndClearsTheMessage) {
  CMPIStatus st{CMPI_RC_OK, &fakeString};
  CMPIStatus *target = &st;
  CMSetStatus(target, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_ACCESS_DENIED);
  EXPECT_EQ(st.msg, nullptr);
}

TEST_F(CmpiMacros, CMSetStatusWithCharsStoresANewStringFromTheBroker) {
  fake.eft.newString = recordNewString;
  CMPIStatus st{CMPI_RC_OK, nullptr};
  CMPIStatus *target = &st;
  CMSetStatusWithChars(broker, target, CMPI_RC_ERR_NOT_SUPPORTED, "no way");
  EXPECT_EQ(st.rc, CMPI_RC_ERR_NOT_SUPPORTED);
  EXPECT_EQ(st.msg, &fakeString);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.text1, "no way");
  EXPECT_EQ(recorded.status, nullptr);
}

TEST_F(CmpiMacros, CMIsNullObjectIsTrueForANullPointer) {
  const CMPIInstance *none = nullptr;
  EXPECT_TRUE(CMIsNullObject(none));
}

TEST_F(CmpiMacros, CMIsNullObjectIsTrueForAnObjectWithoutHdl) {
  CMPIInstanceFT ft{};
  CMPIInstance inst{nullptr, &ft};
  EXPECT_TRUE(CMIsNullObject(&inst));
}

TEST_F(CmpiMacros, CMIsNullObjectIsFalseForAnObjectWithHdl) {
  int data = 0;
  CMPIInstance inst{&data, nullptr};
  EXPECT_FALSE(CMIsNullObject(&inst));
}

TEST_F(CmpiMacros, CMIsNullValueTestsTheNullStateBit) {
  CMPIData null{CMPI_uint16, CMPI_nullValue, {}};
  CMPIData good{CMPI_uint16, CMPI_goodValue, {}};
  EXPECT_TRUE(CMIsNullValue(null));
  EXPECT_FALSE(CMIsNullValue(good));
}

TEST_F(CmpiMacros, CMIsArrayTestsTheArrayTypeBit) {
  CMPIData array{CMPI_uint16A, CMPI_goodValue, {}};
  CMPIData scalar{CMPI_uint16, CMPI_goodValue, {}};
  EXPECT_TRUE(CMIsArray(array));
  EXPECT_FALSE(CMIsArray(scalar));
}

// --- Strings -------------------------------------------------------------

TEST_F(CmpiMacros, CMGetCharPtrReadsTheTextFromHdlWithoutACall) {
  char text[] = "chassis";
  CMPIString s{text, nullptr}; // no table: a call would crash
  CMPIString *str = &s;
  EXPECT_EQ(CMGetCharPtr(str), text);
}

const char *recordGetCharPtr(const CMPIString *st, CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = st;
  recorded.status = rc;
  return "through the table";
}

TEST_F(CmpiMacros, CMGetCharsPtrCallsGetCharPtr) {
  CMPIStringFT ft{};
  ft.getCharPtr = recordGetCharPtr;
  CMPIString s{nullptr, &ft};
  CMPIStatus rc{};
  EXPECT_STREQ(CMGetCharsPtr(&s, &rc), "through the table");
  EXPECT_EQ(recorded.self, &s);
  EXPECT_EQ(recorded.status, &rc);
}

// --- Broker factories and services ----------------------------------------

CMPIObjectPath *recordNewObjectPath(const CMPIBroker *mb, const char *ns,
                                    const char *cn, CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.text1 = textOf(ns);
  recorded.text2 = textOf(cn);
  recorded.status = rc;
  return &fakePath;
}

TEST_F(CmpiMacros, CMNewObjectPathPassesNamespaceClassAndStatus) {
  fake.eft.newObjectPath = recordNewObjectPath;
  CMPIStatus rc{};
  CMPIObjectPath *op =
      CMNewObjectPath(broker, "root/cimv2", "TVR_PhysicalFrame", &rc);
  EXPECT_EQ(op, &fakePath);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.text1, "root/cimv2");
  EXPECT_EQ(recorded.text2, "TVR_PhysicalFrame");
  EXPECT_EQ(recorded.status, &rc);
}

TEST_F(CmpiMacros, CMNewObjectPathForwardsANullStatusPointer) {
  fake.eft.newObjectPath = recordNewObjectPath;
  CMNewObjectPath(broker, "root/cimv2", "TVR_PhysicalFrame", nullptr);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.status, nullptr);
}

CMPIStatus recordTrace(const CMPIBroker *mb, int level, const char *component,
                       const char *text, const CMPIString *string) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.number = level;
  recorded.text1 = textOf(component);
  recorded.text2 = textOf(text);
  recorded.object = string;
  return statusWith(CMPI_RC_OK);
}

TEST_F(CmpiMacros, CMTraceMessageCallsTraceWithLevelComponentAndText) {
  fake.eft.trace = recordTrace;
  CMPIStatus st =
      CMTraceMessage(broker, CMPI_LEV_VERBOSE, "tvr.cmpi", "probe", nullptr);
  EXPECT_EQ(st.rc, CMPI_RC_OK);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.number, CMPI_LEV_VERBOSE);
  EXPECT_EQ(recorded.text1, "tvr.cmpi");
  EXPECT_EQ(recorded.text2, "probe");
  EXPECT_EQ(recorded.object, nullptr);
}

CMPIStatus recordLogMessage(const CMPIBroker *mb, int severity, const char *id,
                            const char *text, const CMPIString *string) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.number = severity;
  recorded.text1 = textOf(id);
  recorded.text2 = textOf(text);
  recorded.object = string;
  return statusWith(CMPI_RC_OK);
}

TEST_F(CmpiMacros, CMLogMessageCallsLogMessageWithSeverityIdAndText) {
  fake.eft.logMessage = recordLogMessage;
  CMLogMessage(broker, CMPI_SEV_WARNING, "TVR0001", "fan missing", nullptr);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.number, CMPI_SEV_WARNING);
  EXPECT_EQ(recorded.text1, "TVR0001");
  EXPECT_EQ(recorded.text2, "fan missing");
}

CMPIEnumeration *recordEnumerateInstanceNames(const CMPIBroker *mb,
                                              const CMPIContext *ctx,
                                              const CMPIObjectPath *op,
                                              CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.pointer = ctx;
  recorded.object = op;
  recorded.status = rc;
  return &fakeEnumeration;
}

TEST_F(CmpiMacros, CBEnumInstanceNamesCallsEnumerateInstanceNames) {
  fake.bft.enumerateInstanceNames = recordEnumerateInstanceNames;
  CMPIContext ctx{};
  CMPIStatus rc{};
  CMPIEnumeration *en = CBEnumInstanceNames(broker, &ctx, &fakePath, &rc);
  EXPECT_EQ(en, &fakeEnumeration);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.pointer, &ctx);
  EXPECT_EQ(recorded.object, &fakePath);
  EXPECT_EQ(recorded.status, &rc);
}

CMPIEnumeration *recordEnumerateInstances(const CMPIBroker *mb,
                                          const CMPIContext *ctx,
                                          const CMPIObjectPath *op,
                                          const char **properties,
                                          CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.object = op;
  recorded.pointer = properties;
  recorded.text1 = ctx ? "context" : "<null>";
  recorded.status = rc;
  return &fakeEnumeration;
}

TEST_F(CmpiMacros, CBEnumInstancesCallsEnumerateInstances) {
  fake.bft.enumerateInstances = recordEnumerateInstances;
  CMPIContext ctx{};
  const char *properties[] = {"Name", nullptr};
  CMPIStatus rc{};
  CMPIEnumeration *en =
      CBEnumInstances(broker, &ctx, &fakePath, properties, &rc);
  EXPECT_EQ(en, &fakeEnumeration);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.text1, "context");
  EXPECT_EQ(recorded.object, &fakePath);
  EXPECT_EQ(recorded.pointer, properties);
  EXPECT_EQ(recorded.status, &rc);
}

CMPIStatus recordModifyInstance(const CMPIBroker *mb, const CMPIContext *,
                                const CMPIObjectPath *op,
                                const CMPIInstance *inst,
                                const char **properties) {
  ++recorded.calls;
  recorded.self = mb;
  recorded.object = op;
  recorded.pointer = inst;
  recorded.text1 = properties ? "property list" : "<null>";
  return statusWith(CMPI_RC_OK);
}

TEST_F(CmpiMacros, CBSetInstanceCallsModifyInstanceWithoutPropertyList) {
  fake.bft.modifyInstance = recordModifyInstance;
  CMPIContext ctx{};
  CMPIInstance inst{};
  CBSetInstance(broker, &ctx, &fakePath, &inst);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, broker);
  EXPECT_EQ(recorded.object, &fakePath);
  EXPECT_EQ(recorded.pointer, &inst);
  EXPECT_EQ(recorded.text1, "<null>");
}

CMPIEnumeration *recordExecQuery(const CMPIBroker *, const CMPIContext *,
                                 const CMPIObjectPath *, const char *query,
                                 const char *lang, CMPIStatus *) {
  ++recorded.calls;
  recorded.text1 = textOf(query);
  recorded.text2 = textOf(lang);
  return &fakeEnumeration;
}

TEST_F(CmpiMacros, CBExecQueryPassesItsFourthArgumentAsTheQuery) {
  fake.bft.execQuery = recordExecQuery;
  CMPIContext ctx{};
  CBExecQuery(broker, &ctx, &fakePath, "SELECT * FROM TVR_Fan", "WQL",
              nullptr);
  EXPECT_EQ(recorded.text1, "SELECT * FROM TVR_Fan");
  EXPECT_EQ(recorded.text2, "WQL");
}

TEST_F(CmpiMacros, CBGetClassificationReadsTheCapabilityBits) {
  fake.bft.brokerCapabilities = CMPI_MB_Class_1 | CMPI_MB_Supports_Qualifier;
  EXPECT_EQ(CBGetClassification(broker),
            unsigned(CMPI_MB_Class_1 | CMPI_MB_Supports_Qualifier));
}

TEST_F(CmpiMacros, CBBrokerVersionAndNameReadTheDataMembers) {
  fake.bft.brokerVersion = CMPIVersion200;
  fake.bft.brokerName = "fake broker";
  EXPECT_EQ(CBBrokerVersion(broker), 200u);
  EXPECT_STREQ(CBBrokerName(broker), "fake broker");
}

// --- Instances -------------------------------------------------------------

CMPIStatus recordSetProperty(const CMPIInstance *inst, const char *name,
                             const CMPIValue *value, CMPIType type) {
  ++recorded.calls;
  recorded.self = inst;
  recorded.text1 = textOf(name);
  recorded.pointer = value;
  recorded.number = type;
  return statusWith(CMPI_RC_ERR_TYPE_MISMATCH);
}

TEST_F(CmpiMacros, CMSetPropertyPassesAnyValuePointerAsCMPIValue) {
  CMPIInstanceFT ft{};
  ft.setProperty = recordSetProperty;
  CMPIInstance inst{nullptr, &ft};
  CMPIUint16 port = 8080; // not a CMPIValue: the macro casts the pointer
  CMPIStatus st = CMSetProperty(&inst, "Port", &port, CMPI_uint16);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_TYPE_MISMATCH);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, &inst);
  EXPECT_EQ(recorded.text1, "Port");
  EXPECT_EQ(recorded.pointer, static_cast<const void *>(&port));
  EXPECT_EQ(static_cast<const CMPIValue *>(recorded.pointer)->uint16, 8080);
  EXPECT_EQ(recorded.number, CMPI_uint16);
}

TEST_F(CmpiMacros, CMSetPropertyPassesAStringValueUnchanged) {
  CMPIInstanceFT ft{};
  ft.setProperty = recordSetProperty;
  CMPIInstance inst{nullptr, &ft};
  const char *name = "Chassis 1";
  CMSetProperty(&inst, "ElementName", &name, CMPI_chars);
  EXPECT_EQ(recorded.pointer, static_cast<const void *>(&name));
  EXPECT_STREQ(static_cast<const CMPIValue *>(recorded.pointer)->chars,
               "Chassis 1");
  EXPECT_EQ(recorded.number, CMPI_chars);
}

// --- Results ---------------------------------------------------------------

CMPIStatus recordReturnInstance(const CMPIResult *rslt,
                                const CMPIInstance *inst) {
  ++recorded.calls;
  recorded.self = rslt;
  recorded.object = inst;
  recorded.text1 = "returnInstance";
  return statusWith(CMPI_RC_OK);
}

CMPIStatus recordReturnObjectPath(const CMPIResult *rslt,
                                  const CMPIObjectPath *ref) {
  ++recorded.calls;
  recorded.self = rslt;
  recorded.object = ref;
  recorded.text1 = "returnObjectPath";
  return statusWith(CMPI_RC_OK);
}

CMPIStatus recordReturnDone(const CMPIResult *rslt) {
  ++recorded.calls;
  recorded.self = rslt;
  recorded.text1 = "returnDone";
  return statusWith(CMPI_RC_ERR_FAILED);
}

/// A result whose table records returnInstance, returnObjectPath and
/// returnDone.
struct FakeResult {
  CMPIResultFT ft{};
  CMPIResult result{nullptr, &ft};

  FakeResult() {
    ft.returnInstance = recordReturnInstance;
    ft.returnObjectPath = recordReturnObjectPath;
    ft.returnDone = recordReturnDone;
  }
};

TEST_F(CmpiMacros, CMReturnInstanceHandsTheInstanceToTheResult) {
  FakeResult out;
  CMPIInstance inst{};
  CMReturnInstance(&out.result, &inst);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.text1, "returnInstance");
  EXPECT_EQ(recorded.self, &out.result);
  EXPECT_EQ(recorded.object, &inst);
}

TEST_F(CmpiMacros, CMReturnObjectPathHandsThePathToTheResult) {
  FakeResult out;
  CMReturnObjectPath(&out.result, &fakePath);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.text1, "returnObjectPath");
  EXPECT_EQ(recorded.self, &out.result);
  EXPECT_EQ(recorded.object, &fakePath);
}

CMPIStatus finishAndContinue(const CMPIResult *rslt, bool *continued) {
  CMPIStatus done = CMReturnDone(rslt);
  *continued = true;
  return done;
}

TEST_F(CmpiMacros, CMReturnDoneEvaluatesToTheStatusWithoutLeaving) {
  FakeResult out;
  bool continued = false;
  CMPIStatus st = finishAndContinue(&out.result, &continued);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.text1, "returnDone");
  EXPECT_EQ(recorded.self, &out.result);
  EXPECT_EQ(st.rc, CMPI_RC_ERR_FAILED);
  EXPECT_TRUE(continued);
}

// --- Any encapsulated object -----------------------------------------------

CMPIStatus recordRelease(CMPIArray *ar) {
  ++recorded.calls;
  recorded.self = ar;
  return statusWith(CMPI_RC_OK);
}

CMPIArray *recordClone(const CMPIArray *ar, CMPIStatus *rc) {
  ++recorded.calls;
  recorded.self = ar;
  recorded.status = rc;
  return nullptr;
}

TEST_F(CmpiMacros, CMReleaseCallsTheReleaseSlot) {
  CMPIArrayFT ft{};
  ft.release = recordRelease;
  CMPIArray array{nullptr, &ft};
  CMRelease(&array);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, &array);
}

TEST_F(CmpiMacros, CMCloneCallsTheCloneSlotWithTheStatusPointer) {
  CMPIArrayFT ft{};
  ft.clone = recordClone;
  CMPIArray array{nullptr, &ft};
  CMPIStatus rc{};
  CMClone(&array, &rc);
  EXPECT_EQ(recorded.calls, 1);
  EXPECT_EQ(recorded.self, &array);
  EXPECT_EQ(recorded.status, &rc);
}

} // namespace
