// Function-table slots called the wrong way: with null arguments, objects of
// another kind, foreign or hollow objects, or without a broker. Each must
// answer an error status and nothing may crash.
#include "BrokerTestSupport.h"

namespace tvr::broker::test {
namespace {

using Kind = ResultItem::Kind;

bool isHandleOrParameterError(CMPIrc rc) {
  return rc == CMPI_RC_ERR_INVALID_HANDLE || rc == CMPI_RC_ERR_INVALID_PARAMETER;
}

/// Collects the status of one call after another, as "label -> rc".
class Calls {
public:
  /// The status argument for the next call, preset to a code the broker
  /// never answers, so a call that leaves its status alone shows up.
  CMPIStatus* rc() {
    status_ = CMPIStatus{CMPI_RC_ERROR_SYSTEM, nullptr};
    return &status_;
  }
  template <class Result> void after(const std::string& label, Result&&) { results.emplace_back(label, status_.rc); }
  void returned(const std::string& label, CMPIStatus status) { results.emplace_back(label, status.rc); }

  std::vector<std::pair<std::string, CMPIrc>> results;

private:
  CMPIStatus status_{CMPI_RC_OK, nullptr};
};

void expectEvery(const std::vector<std::pair<std::string, CMPIrc>>& results, CMPIrc expected) {
  ASSERT_FALSE(results.empty());
  for (const auto& [label, rc] : results) EXPECT_EQ(rc, expected) << label << " answered " << statusName(rc);
}

// --- Inside a request, through the test provider ------------------------------

using RequestProbeTest = TestProviderTest;

TEST_F(RequestProbeTest, EveryWrongCallInsideARequestAnswersAnError) {
  const Response r = om.enumerateInstances(classPath("TVR_NullProbe"));
  EXPECT_TRUE(r.ok()) << r.message.value_or("");
  const std::map<std::string, CMPIrc> statuses = probeStatuses(r);
  EXPECT_GE(statuses.size(), 50u);
  for (const auto& [label, rc] : statuses)
    EXPECT_TRUE(isHandleOrParameterError(rc)) << label << " answered " << statusName(rc);
}

TEST_F(RequestProbeTest, NullNamesAndNullArgumentsAreInvalidParameters) {
  const std::map<std::string, CMPIrc> statuses = probeStatuses(om.enumerateInstances(classPath("TVR_NullProbe")));
  for (const char* label : {"path.getKey(null name)", "path.addKey(null name)", "instance.getProperty(null name)",
                            "instance.setProperty(null name)", "args.addArg(null name)", "args.getArg(null name)",
                            "context.getEntry(null name)", "context.addEntry(null name)",
                            "newDateTimeFromChars(null)", "newDateTimeFromChars(malformed)",
                            "classPathIsA(null type)", "isOfType(null type)", "openMessageFile(null handle)",
                            "enumerateInstanceNames(null path)", "associators(null path)"})
    EXPECT_EQ(statuses.at(label), CMPI_RC_ERR_INVALID_PARAMETER) << label;
}

TEST_F(RequestProbeTest, NullForeignAndWrongKindObjectsAreInvalidHandles) {
  const std::map<std::string, CMPIrc> statuses = probeStatuses(om.enumerateInstances(classPath("TVR_NullProbe")));
  for (const char* label :
       {"path.getKeyCount(null)", "path.getKeyCount(instance)", "path.getKey(foreign)",
        "path.addKey(instance as ref)", "path.setNameSpaceFromObjectPath(null)", "instance.getPropertyCount(path)",
        "instance.setObjectPath(null)", "instance.setProperty(path as instance)",
        "instance.setProperty(foreign string)", "instance.setProperty(path as array)", "string.getCharPtr(null)",
        "string.getCharPtr(path)", "array.getSize(null)", "array.setElementAt(path)",
        "dateTime.getBinaryFormat(null)", "dateTime.isInterval(string)", "args.getArgCount(null)",
        "context.getEntryCount(instance)", "enumeration.getNext(null)", "enumeration.hasNext(path)",
        "result.returnData(null result)", "result.release(null)", "result.clone(null)",
        "result.returnInstance(null result)", "result.returnObjectPath(null result)", "result.returnDone(null)",
        "result.returnError(null)", "result.returnData(foreign)", "newInstance(null path)",
        "newInstance(instance as path)", "classPathIsA(instance)", "toString(null)", "getType(foreign)",
        "attachThread(null context)", "mft.release(null mark)"})
    EXPECT_EQ(statuses.at(label), CMPI_RC_ERR_INVALID_HANDLE) << label;
}

TEST_F(RequestProbeTest, ReturningANullOrWrongObjectRecordsANullElementAndAnInvalidParameter) {
  const Response r = om.enumerateInstances(classPath("TVR_NullProbe"));
  const std::map<std::string, CMPIrc> statuses = probeStatuses(r);
  EXPECT_EQ(statuses.at("result.returnObjectPath(instance)"), CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(statuses.at("result.returnInstance(null)"), CMPI_RC_ERR_INVALID_PARAMETER);
  std::vector<Kind> nullElements;
  for (Kind kind : kindsOf(r))
    if (kind != Kind::Data) nullElements.push_back(kind);
  EXPECT_EQ(nullElements, (std::vector<Kind>{Kind::NullObjectPath, Kind::NullInstance}));
}

class HollowProbeTest : public TestProviderTest {
protected:
  Response probeHollowObjects() {
    om.faults().failNext(Fault::NewObjectPath, 1, FailureShape::Hollow);
    om.faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
    om.faults().failNext(Fault::NewArray, 1, FailureShape::Hollow);
    return om.enumerateInstances(classPath("TVR_HollowProbe"));
  }
  static bool isBrokerHelper(const std::string& label) {
    return label == "toString(hollow)" || label == "isOfType(hollow)" || label == "getType(hollow)";
  }
};

TEST_F(HollowProbeTest, FactoriesGiveHollowObjectsWithAFailedStatus) {
  const std::map<std::string, CMPIrc> statuses = probeStatuses(probeHollowObjects());
  EXPECT_EQ(statuses.at("made path hollow"), CMPI_RC_ERR_FAILED);
  EXPECT_EQ(statuses.at("made instance hollow"), CMPI_RC_ERR_FAILED);
  EXPECT_EQ(statuses.at("made array hollow"), CMPI_RC_ERR_FAILED);
}

TEST_F(HollowProbeTest, EveryObjectFunctionAnswersAnErrorForAHollowObject) {
  const Response r = probeHollowObjects();
  EXPECT_TRUE(r.ok()) << r.message.value_or("");
  const std::map<std::string, CMPIrc> statuses = probeStatuses(r);
  EXPECT_GE(statuses.size(), 50u);
  for (const auto& [label, rc] : statuses) {
    if (label.rfind("made ", 0) == 0 || isBrokerHelper(label)) continue;
    EXPECT_TRUE(isHandleOrParameterError(rc)) << label << " answered " << statusName(rc);
  }
  EXPECT_EQ(statuses.at("path.release"), CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(statuses.at("instance.setProperty(hollow ref)"), CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(statuses.at("instance.setProperty(hollow array)"), CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(statuses.at("instance.setProperty(hollow instance)"), CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(HollowProbeTest, ReturningAHollowObjectRecordsANullElement) {
  const Response r = probeHollowObjects();
  const std::map<std::string, CMPIrc> statuses = probeStatuses(r);
  EXPECT_EQ(statuses.at("result.returnObjectPath(hollow)"), CMPI_RC_ERR_INVALID_PARAMETER);
  EXPECT_EQ(statuses.at("result.returnInstance(hollow)"), CMPI_RC_ERR_INVALID_PARAMETER);
  std::vector<Kind> nullElements;
  for (Kind kind : kindsOf(r))
    if (kind != Kind::Data) nullElements.push_back(kind);
  EXPECT_EQ(nullElements, (std::vector<Kind>{Kind::NullObjectPath, Kind::NullInstance}));
}

TEST_F(HollowProbeTest, BrokerHelpersAnswerAnErrorForAHollowObject) {
  const std::map<std::string, CMPIrc> statuses = probeStatuses(probeHollowObjects());
  EXPECT_EQ(statuses.at("toString(hollow)"), CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(statuses.at("isOfType(hollow)"), CMPI_RC_ERR_INVALID_HANDLE);
  EXPECT_EQ(statuses.at("getType(hollow)"), CMPI_RC_ERR_INVALID_HANDLE);
}

// --- Outside any request, straight through the function tables ---------------

/// Objects of every kind the test can make without a request.
class FunctionTableTest : public TestProviderTest {
protected:
  const CMPIBroker* b = om.broker();
  CMPIObjectPath* path = CMNewObjectPath(b, kTestNamespace, "TVR_AllTypes", nullptr);
  CMPIInstance* inst = CMNewInstance(b, path, nullptr);
  CMPIString* string = CMNewString(b, "text", nullptr);
  CMPIArray* array = CMNewArray(b, 2, CMPI_uint8, nullptr);
  CMPIDateTime* dateTime = CMNewDateTime(b, nullptr);
  CMPIArgs* args = CMNewArgs(b, nullptr);
  CMPIEnumeration* found = CBEnumInstanceNames(b, nullptr, path, nullptr);
  CMPIUint8 small = 1;
  CMPIValue* value = reinterpret_cast<CMPIValue*>(&small);
  CMPIString* name = nullptr;

  template <class To, class From> static To* as(From* object) { return reinterpret_cast<To*>(object); }

  Calls objectPathCalls(CMPIObjectPath* bad) {
    const CMPIObjectPathFT* ft = path->ft;
    Calls c;
    c.returned("release", ft->release(bad));
    c.after("clone", ft->clone(bad, c.rc()));
    c.returned("setNameSpace", ft->setNameSpace(bad, "root/x"));
    c.after("getNameSpace", ft->getNameSpace(bad, c.rc()));
    c.returned("setHostname", ft->setHostname(bad, "h"));
    c.after("getHostname", ft->getHostname(bad, c.rc()));
    c.returned("setClassName", ft->setClassName(bad, "C"));
    c.after("getClassName", ft->getClassName(bad, c.rc()));
    c.returned("addKey", ft->addKey(bad, "k", value, CMPI_uint8));
    c.after("getKey", ft->getKey(bad, "k", c.rc()));
    c.after("getKeyAt", ft->getKeyAt(bad, 0, &name, c.rc()));
    c.after("getKeyCount", ft->getKeyCount(bad, c.rc()));
    c.returned("setNameSpaceFromObjectPath", ft->setNameSpaceFromObjectPath(bad, path));
    c.returned("setNameSpaceFromObjectPath(source)", ft->setNameSpaceFromObjectPath(path, bad));
    c.returned("setHostAndNameSpaceFromObjectPath", ft->setHostAndNameSpaceFromObjectPath(bad, path));
    c.returned("setHostAndNameSpaceFromObjectPath(source)", ft->setHostAndNameSpaceFromObjectPath(path, bad));
    c.after("getClassQualifier", ft->getClassQualifier(bad, "q", c.rc()));
    c.after("getPropertyQualifier", ft->getPropertyQualifier(bad, "p", "q", c.rc()));
    c.after("getMethodQualifier", ft->getMethodQualifier(bad, "m", "q", c.rc()));
    c.after("getParameterQualifier", ft->getParameterQualifier(bad, "m", "p", "q", c.rc()));
    c.after("toString", ft->toString(bad, c.rc()));
    return c;
  }

  Calls instanceCalls(CMPIInstance* bad) {
    const CMPIInstanceFT* ft = inst->ft;
    Calls c;
    c.returned("release", ft->release(bad));
    c.after("clone", ft->clone(bad, c.rc()));
    c.after("getProperty", ft->getProperty(bad, "p", c.rc()));
    c.after("getPropertyAt", ft->getPropertyAt(bad, 0, &name, c.rc()));
    c.after("getPropertyCount", ft->getPropertyCount(bad, c.rc()));
    c.returned("setProperty", ft->setProperty(bad, "p", value, CMPI_uint8));
    c.after("getObjectPath", ft->getObjectPath(bad, c.rc()));
    c.returned("setPropertyFilter", ft->setPropertyFilter(bad, nullptr, nullptr));
    c.returned("setObjectPath", ft->setObjectPath(bad, path));
    c.returned("setPropertyWithOrigin", ft->setPropertyWithOrigin(bad, "p", value, CMPI_uint8, "C"));
    return c;
  }

  Calls otherObjectCalls(void* bad) {
    Calls c;
    c.returned("string.release", string->ft->release(as<CMPIString>(bad)));
    c.after("string.clone", string->ft->clone(as<CMPIString>(bad), c.rc()));
    c.after("string.getCharPtr", string->ft->getCharPtr(as<CMPIString>(bad), c.rc()));
    c.returned("array.release", array->ft->release(as<CMPIArray>(bad)));
    c.after("array.clone", array->ft->clone(as<CMPIArray>(bad), c.rc()));
    c.after("array.getSize", array->ft->getSize(as<CMPIArray>(bad), c.rc()));
    c.after("array.getSimpleType", array->ft->getSimpleType(as<CMPIArray>(bad), c.rc()));
    c.after("array.getElementAt", array->ft->getElementAt(as<CMPIArray>(bad), 0, c.rc()));
    c.returned("array.setElementAt", array->ft->setElementAt(as<CMPIArray>(bad), 0, value, CMPI_uint8));
    c.returned("dateTime.release", dateTime->ft->release(as<CMPIDateTime>(bad)));
    c.after("dateTime.clone", dateTime->ft->clone(as<CMPIDateTime>(bad), c.rc()));
    c.after("dateTime.getBinaryFormat", dateTime->ft->getBinaryFormat(as<CMPIDateTime>(bad), c.rc()));
    c.after("dateTime.getStringFormat", dateTime->ft->getStringFormat(as<CMPIDateTime>(bad), c.rc()));
    c.after("dateTime.isInterval", dateTime->ft->isInterval(as<CMPIDateTime>(bad), c.rc()));
    c.returned("args.release", args->ft->release(as<CMPIArgs>(bad)));
    c.after("args.clone", args->ft->clone(as<CMPIArgs>(bad), c.rc()));
    c.returned("args.addArg", args->ft->addArg(as<CMPIArgs>(bad), "a", value, CMPI_uint8));
    c.after("args.getArg", args->ft->getArg(as<CMPIArgs>(bad), "a", c.rc()));
    c.after("args.getArgAt", args->ft->getArgAt(as<CMPIArgs>(bad), 0, &name, c.rc()));
    c.after("args.getArgCount", args->ft->getArgCount(as<CMPIArgs>(bad), c.rc()));
    c.returned("enumeration.release", found->ft->release(as<CMPIEnumeration>(bad)));
    c.after("enumeration.clone", found->ft->clone(as<CMPIEnumeration>(bad), c.rc()));
    c.after("enumeration.getNext", found->ft->getNext(as<CMPIEnumeration>(bad), c.rc()));
    c.after("enumeration.hasNext", found->ft->hasNext(as<CMPIEnumeration>(bad), c.rc()));
    c.after("enumeration.toArray", found->ft->toArray(as<CMPIEnumeration>(bad), c.rc()));
    return c;
  }
};

TEST_F(FunctionTableTest, EveryObjectPathSlotAnswersInvalidHandleForANullPath) {
  expectEvery(objectPathCalls(nullptr).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryObjectPathSlotAnswersInvalidHandleForAnInstance) {
  expectEvery(objectPathCalls(as<CMPIObjectPath>(inst)).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryInstanceSlotAnswersInvalidHandleForANullInstance) {
  expectEvery(instanceCalls(nullptr).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryInstanceSlotAnswersInvalidHandleForAPath) {
  expectEvery(instanceCalls(as<CMPIInstance>(path)).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryOtherObjectSlotAnswersInvalidHandleForANullObject) {
  ASSERT_NE(found, nullptr);
  expectEvery(otherObjectCalls(nullptr).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryOtherObjectSlotAnswersInvalidHandleForAnInstance) {
  ASSERT_NE(found, nullptr);
  expectEvery(otherObjectCalls(inst).results, CMPI_RC_ERR_INVALID_HANDLE);
}

TEST_F(FunctionTableTest, EveryContextSlotAnswersInvalidHandleForANullOrWrongContext) {
  om.runAsRequest([&](const CMPIBroker*, const CMPIContext* ctx) {
    for (CMPIContext* bad : {static_cast<CMPIContext*>(nullptr), as<CMPIContext>(inst)}) {
      Calls c;
      c.returned("release", ctx->ft->release(bad));
      c.after("clone", ctx->ft->clone(bad, c.rc()));
      c.after("getEntry", ctx->ft->getEntry(bad, CMPIInitNameSpace, c.rc()));
      c.after("getEntryAt", ctx->ft->getEntryAt(bad, 0, &name, c.rc()));
      c.after("getEntryCount", ctx->ft->getEntryCount(bad, c.rc()));
      c.returned("addEntry", ctx->ft->addEntry(bad, "e", value, CMPI_uint8));
      expectEvery(c.results, CMPI_RC_ERR_INVALID_HANDLE);
    }
  });
}

TEST_F(FunctionTableTest, ObjectsSurviveTheWrongCalls) {
  objectPathCalls(as<CMPIObjectPath>(inst));
  instanceCalls(as<CMPIInstance>(path));
  otherObjectCalls(inst);
  EXPECT_EQ(CMGetKeyCount(path, nullptr), 0u);
  EXPECT_EQ(CMGetPropertyCount(inst, nullptr), 0u);
  EXPECT_STREQ(CMGetCharsPtr(string, nullptr), "text");
  EXPECT_EQ(CMGetArrayCount(array, nullptr), 2u);
}

TEST_F(FunctionTableTest, EveryBrokerFunctionAnswersInvalidHandleWithoutABroker) {
  const CMPIBrokerFT* bft = b->bft;
  const CMPIBrokerEncFT* eft = b->eft;
  CMPIBroker foreign = *b;
  foreign.bft = nullptr; // the same handle behind a table that is not ours
  for (const CMPIBroker* none : {static_cast<const CMPIBroker*>(nullptr), static_cast<const CMPIBroker*>(&foreign)}) {
    Calls c;
    c.after("enumerateInstanceNames", bft->enumerateInstanceNames(none, nullptr, path, c.rc()));
    c.after("enumerateInstances", bft->enumerateInstances(none, nullptr, path, nullptr, c.rc()));
    c.after("getInstance", bft->getInstance(none, nullptr, path, nullptr, c.rc()));
    c.after("associators", bft->associators(none, nullptr, path, nullptr, nullptr, nullptr, nullptr, nullptr, c.rc()));
    c.after("associatorNames", bft->associatorNames(none, nullptr, path, nullptr, nullptr, nullptr, nullptr, c.rc()));
    c.after("references", bft->references(none, nullptr, path, nullptr, nullptr, nullptr, c.rc()));
    c.after("referenceNames", bft->referenceNames(none, nullptr, path, nullptr, nullptr, c.rc()));
    c.returned("attachThread", bft->attachThread(none, nullptr));
    c.returned("detachThread", bft->detachThread(none, nullptr));
    c.after("newInstance", eft->newInstance(none, path, c.rc()));
    c.after("newObjectPath", eft->newObjectPath(none, "ns", "C", c.rc()));
    c.after("newArgs", eft->newArgs(none, c.rc()));
    c.after("newString", eft->newString(none, "s", c.rc()));
    c.after("newArray", eft->newArray(none, 1, CMPI_uint8, c.rc()));
    c.after("newDateTime", eft->newDateTime(none, c.rc()));
    c.after("newDateTimeFromBinary", eft->newDateTimeFromBinary(none, 0, 0, c.rc()));
    c.after("newDateTimeFromChars", eft->newDateTimeFromChars(none, "20240229123456.000000+000", c.rc()));
    c.after("classPathIsA", eft->classPathIsA(none, path, "C", c.rc()));
    c.after("toString", eft->toString(none, path, c.rc()));
    c.after("isOfType", eft->isOfType(none, path, "CMPIObjectPath", c.rc()));
    c.after("getType", eft->getType(none, path, c.rc()));
    c.after("getMessage", eft->getMessage(none, "id", "text", c.rc(), 0));
    c.returned("logMessage", eft->logMessage(none, 1, "id", "text", nullptr));
    c.returned("trace", eft->trace(none, 1, "c", "text", nullptr));
    CMPIMsgFileHandle handle = nullptr;
    c.returned("openMessageFile", eft->openMessageFile(none, "f", &handle));
    c.returned("closeMessageFile", eft->closeMessageFile(none, handle));
    c.after("getMessage2", eft->getMessage2(none, "id", handle, "text", c.rc(), 0));
    c.after("mark", b->mft->mark(none, c.rc()));
    c.returned("release", b->mft->release(none, nullptr));
    expectEvery(c.results, CMPI_RC_ERR_INVALID_HANDLE);
  }
  EXPECT_EQ(bft->prepareAttachThread(nullptr, nullptr), nullptr);
}

TEST_F(FunctionTableTest, UnsupportedBrokerServicesSayNotSupported) {
  const CMPIBrokerFT* bft = b->bft;
  Calls c;
  c.after("createInstance", bft->createInstance(b, nullptr, path, inst, c.rc()));
  c.returned("modifyInstance", bft->modifyInstance(b, nullptr, path, inst, nullptr));
  c.returned("deleteInstance", bft->deleteInstance(b, nullptr, path));
  c.after("execQuery", bft->execQuery(b, nullptr, path, "SELECT * FROM C", "WQL", c.rc()));
  c.after("invokeMethod", bft->invokeMethod(b, nullptr, path, "m", args, args, c.rc()));
  c.returned("setProperty", bft->setProperty(b, nullptr, path, "p", value, CMPI_uint8));
  c.after("getProperty", bft->getProperty(b, nullptr, path, "p", c.rc()));
  c.returned("deliverIndication", bft->deliverIndication(b, nullptr, "ns", inst));
  c.after("newSelectExp", b->eft->newSelectExp(b, "SELECT * FROM C", "WQL", nullptr, c.rc()));
  c.after("newCMPIError", b->eft->newCMPIError(b, "o", "id", "m", ErrorSevUnknown, ErrorProbCauseUnknown,
                                               CMPI_RC_ERR_FAILED, c.rc()));
  c.after("getClassQualifier", path->ft->getClassQualifier(path, "Key", c.rc()));
  expectEvery(c.results, CMPI_RC_ERR_NOT_SUPPORTED);
}

// --- The thread services, which answer with errno codes ----------------------

TEST(ThreadServices, NullArgumentsAnswerAnErrorCode) {
  ObjectManager om(testProviderOptions());
  const CMPIBrokerExtFT* xft = om.broker()->xft;
  EXPECT_NE(xft->threadOnce(nullptr, nullptr), 0);
  EXPECT_NE(xft->createThreadKey(nullptr, nullptr), 0);
  EXPECT_NE(xft->condWait(nullptr, nullptr), 0);
  EXPECT_NE(xft->timedCondWait(nullptr, nullptr, nullptr), 0);
  EXPECT_NE(xft->signalCondition(nullptr), 0);
  EXPECT_NE(xft->joinThread(nullptr, nullptr), 0);
  xft->lockMutex(nullptr);
  xft->unlockMutex(nullptr);
  xft->destroyMutex(nullptr);
  xft->destroyCondition(nullptr);
}

TEST(ThreadServices, CancelThreadOfANullThreadAnswersAnError) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_EXIT(
      {
        ObjectManager om(testProviderOptions());
        std::_Exit(om.broker()->xft->cancelThread(nullptr) != 0 ? 0 : 1);
      },
      ::testing::ExitedWithCode(0), "");
}

TEST(ThreadServices, NewThreadWithoutAStartFunctionAnswersNull) {
  GTEST_FLAG_SET(death_test_style, "threadsafe");
  EXPECT_EXIT(
      {
        ObjectManager om(testProviderOptions());
        CMPI_THREAD_TYPE thread = om.broker()->xft->newThread(nullptr, nullptr, 0);
        if (thread) om.broker()->xft->joinThread(thread, nullptr);
        std::_Exit(thread == nullptr ? 0 : 1);
      },
      ::testing::ExitedWithCode(0), "");
}

} // namespace
} // namespace tvr::broker::test
