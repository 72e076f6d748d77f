// Up-calls: a provider asks the object manager for instances of other
// classes while it serves a request.
#include "BrokerTestSupport.h"

#include <pthread.h>

namespace tvr::broker::test {
namespace {

using Kind = ResultItem::Kind;
using UpCallTest = TestProviderTest;

ObjectPath upCall(const std::string& call, const std::string& target,
                  std::vector<std::pair<std::string, std::string>> extraKeys = {}) {
  extraKeys.insert(extraKeys.begin(), {{"Call", call}, {"Target", target}});
  return keyedPath("TVR_UpCaller", extraKeys);
}

/// The data element the up-calling provider ends with: its own thread.
CMPIUint64 callerThread(const Response& r) {
  for (const ResultItem& item : r.items)
    if (item.kind == Kind::Data && item.data.type == CMPI_uint64) return item.data.scalar.uint64;
  ADD_FAILURE() << "no thread element";
  return 0;
}

TEST_F(UpCallTest, EnumerateInstanceNamesIsServedThroughTheRegistration) {
  const Response r = om.getInstance(upCall("enumerateInstanceNames", "TVR_AllTypes"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall 0", "enumeration=ok"}));
  ASSERT_EQ(r.paths().size(), 2u);
  EXPECT_EQ(*r.paths()[0].key("Name"), Value::chars("one"));
  EXPECT_EQ(r.paths()[0].nameSpace, "root/tvrtest");
  EXPECT_EQ(r.paths()[1].className, "TVR_AllTypes");
}

TEST_F(UpCallTest, EnumeratedInstancesAreUsableByTheProvider) {
  const Response r = om.getInstance(upCall("enumerateInstances", "TVR_AllTypes"));
  EXPECT_EQ(dataTexts(r),
            (std::vector<std::string>{"upcall 0", "enumeration=ok", "read Name=one", "read Name=two"}));
  const std::vector<Instance> instances = r.instances();
  ASSERT_EQ(instances.size(), 2u);
  // Handed on unchanged, the instances keep the types their provider set.
  EXPECT_EQ(*instances[1].property("Name"), Value::chars("two"));
  EXPECT_EQ(*instances[1].property("Uint16"), Value::uint16(65000));
  EXPECT_EQ(*instances[1].property("Uint16s"),
            Value::array(CMPI_uint16, {Value::uint16(1), Value::uint16(2), Value::uint16(65535)}));
}

TEST_F(UpCallTest, GetInstanceFindsTheInstanceOfThePath) {
  const Response r = om.getInstance(upCall("getInstance", "TVR_AllTypes", {{"Name", "two"}}));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall 0", "instance=ok", "read Name=two"}));
  ASSERT_EQ(r.instances().size(), 1u);
  EXPECT_EQ(*r.instances()[0].property("Name"), Value::chars("two"));
}

TEST_F(UpCallTest, GetInstanceOfAnEmptyAnswerIsNotFound) {
  const Response r = om.getInstance(upCall("getInstance", "TVR_NullInstance"));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall " + std::to_string(CMPI_RC_ERR_NOT_FOUND),
                                                    "instance=null"}));
}

TEST_F(UpCallTest, GetInstanceGivesAnInstanceEvenWhenTheAnswerStartsWithAPath) {
  const Response r = om.getInstance(upCall("getInstance", "TVR_Sequence"));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall 0", "instance=ok"}));
  ASSERT_EQ(r.instances().size(), 1u);
  EXPECT_EQ(*r.instances()[0].property("Id"), Value::chars("b"));
}

TEST_F(UpCallTest, UpCallOutsideARequestLeavesOnlyItsEnumerationLongLived) {
  const CMPIBroker* b = om.broker();
  CMPIObjectPath* target = CMNewObjectPath(b, kTestNamespace, "TVR_AllTypes", nullptr);
  const std::size_t before = om.longLivedObjects();
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
  CMPIEnumeration* found = CBEnumInstanceNames(b, nullptr, target, &rc);
  ASSERT_NE(found, nullptr);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  EXPECT_EQ(om.longLivedObjects(), before + 1);
}

TEST_F(UpCallTest, UpCallOutsideARequestIsServed) {
  const CMPIBroker* b = om.broker();
  CMPIStatus rc = {CMPI_RC_ERROR_SYSTEM, nullptr};
  CMPIEnumeration* found =
      CBEnumInstanceNames(b, nullptr, CMNewObjectPath(b, kTestNamespace, "TVR_AllTypes", nullptr), &rc);
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
  ASSERT_NE(found, nullptr);
  int paths = 0;
  while (CMHasNext(found, nullptr)) paths += CMGetNext(found, nullptr).type == CMPI_ref;
  EXPECT_EQ(paths, 2);
}

TEST_F(UpCallTest, AssociatorsAreServedByEveryAssociationProvider) {
  const Response r = om.getInstance(upCall("associators", "TVR_Source"));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{
                              "upcall 0", "enumeration=ok",
                              "Echo associators assocClass=NULL resultClass=NULL role=NULL resultRole=NULL "
                              "properties=NULL",
                              "Other associators assocClass=NULL resultClass=NULL role=NULL resultRole=NULL "
                              "properties=NULL"}));
}

TEST_F(UpCallTest, AssociationUpCallsPassTheirClassArgument) {
  EXPECT_EQ(dataTexts(om.getInstance(upCall("associatorNames", "TVR_Source", {{"AssocClass", "TVR_EchoAssociation"}}))),
            (std::vector<std::string>{"upcall 0", "enumeration=ok",
                                      "Echo associatorNames assocClass=TVR_EchoAssociation resultClass=NULL "
                                      "role=NULL resultRole=NULL properties=NULL"}));
  EXPECT_EQ(dataTexts(om.getInstance(upCall("references", "TVR_Source", {{"AssocClass", "TVR_OtherAssociation"}}))),
            (std::vector<std::string>{"upcall 0", "enumeration=ok",
                                      "Other references resultClass=TVR_OtherAssociation role=NULL properties=NULL"}));
  EXPECT_EQ(
      dataTexts(om.getInstance(upCall("referenceNames", "TVR_Source", {{"AssocClass", "TVR_EchoAssociation"}}))),
      (std::vector<std::string>{"upcall 0", "enumeration=ok",
                                "Echo referenceNames resultClass=TVR_EchoAssociation role=NULL properties=NULL"}));
}

TEST_F(UpCallTest, UpCallRunsOnTheCallingThread) {
  const Response r = om.getInstance(upCall("enumerateInstances", "TVR_Echo"));
  const std::vector<Instance> instances = r.instances();
  ASSERT_EQ(instances.size(), 1u);
  const Value* servedOn = instances[0].property("Thread");
  ASSERT_NE(servedOn, nullptr);
  const CMPIUint64 testThread = static_cast<CMPIUint64>(pthread_self());
  EXPECT_EQ(servedOn->scalar.uint64, testThread);
  EXPECT_EQ(callerThread(r), testThread);
}

TEST_F(UpCallTest, TracesOfTheServingProviderGoToTheOuterResponse) {
  const Response r = om.getInstance(upCall("enumerateInstances", "TVR_Echo"));
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, "echo enumerated");
}

TEST_F(UpCallTest, UnregisteredClassAnswersInvalidClassAndNoEnumeration) {
  const Response r = om.getInstance(upCall("enumerateInstanceNames", "TVR_Unregistered"));
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall " + std::to_string(CMPI_RC_ERR_INVALID_CLASS),
                                                    "enumeration=null"}));
}

TEST_F(UpCallTest, FailingProviderStatusReachesTheCaller) {
  const Response r = om.getInstance(upCall("enumerateInstances", "TVR_Error"));
  EXPECT_EQ(dataTexts(r)[0], "upcall " + std::to_string(CMPI_RC_ERR_NOT_FOUND));
}

TEST_F(UpCallTest, ExceptionInTheServingProviderIsAFailedUpCall) {
  const Response r = om.getInstance(upCall("enumerateInstances", "TVR_Throws"));
  EXPECT_TRUE(r.ok());
  EXPECT_FALSE(r.exception);
  EXPECT_EQ(dataTexts(r)[0], "upcall " + std::to_string(CMPI_RC_ERR_FAILED));
}

TEST_F(UpCallTest, InjectedUpCallFailureIsAFailedUpCallWithoutEnumeration) {
  om.faults().failNext(Fault::UpCall, 1);
  const Response r = om.getInstance(upCall("enumerateInstanceNames", "TVR_AllTypes"));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall " + std::to_string(CMPI_RC_ERR_FAILED),
                                                    "enumeration=null"}));
  EXPECT_TRUE(r.paths().empty());
  const Response next = om.getInstance(upCall("enumerateInstanceNames", "TVR_AllTypes"));
  EXPECT_EQ(dataTexts(next)[0], "upcall 0");
}

TEST_F(UpCallTest, InjectedHollowUpCallFailureGivesAHollowEnumeration) {
  om.faults().failNext(Fault::UpCall, 1, FailureShape::Hollow);
  const Response r = om.getInstance(upCall("enumerateInstanceNames", "TVR_AllTypes"));
  EXPECT_EQ(dataTexts(r), (std::vector<std::string>{"upcall " + std::to_string(CMPI_RC_ERR_FAILED),
                                                    "enumeration=hollow"}));
}

TEST_F(UpCallTest, UpCallsCountInTheFaultInjector) {
  const std::uint64_t before = om.faults().calls(Fault::UpCall);
  om.getInstance(upCall("enumerateInstanceNames", "TVR_AllTypes"));
  om.getInstance(upCall("associators", "TVR_Source"));
  EXPECT_EQ(om.faults().calls(Fault::UpCall), before + 2);
}

TEST_F(UpCallTest, ProviderUpCallingItselfIsStoppedBeforeTheStackRunsOut) {
  const Response r = om.enumerateInstanceNames(classPath("TVR_Recursive"));
  EXPECT_TRUE(r.ok());
  const std::vector<ObjectPath> paths = r.paths();
  ASSERT_GE(paths.size(), 2u);
  EXPECT_LE(paths.size(), 64u);
  // The innermost provider's up-call was refused; every other one succeeded.
  EXPECT_EQ(paths.front().key("Below")->asUnsigned(), 0u);
  EXPECT_EQ(paths.front().key("UpCallStatus")->asUnsigned(), static_cast<unsigned>(CMPI_RC_ERR_FAILED));
  for (std::size_t i = 1; i < paths.size(); ++i) {
    EXPECT_EQ(paths[i].key("Below")->asUnsigned(), i);
    EXPECT_EQ(paths[i].key("UpCallStatus")->asUnsigned(), 0u);
  }
}

} // namespace
} // namespace tvr::broker::test
