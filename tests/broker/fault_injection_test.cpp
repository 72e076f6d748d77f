// Injected failures of the broker's factories and up-calls.
#include "BrokerTestSupport.h"

namespace tvr::broker::test {
namespace {

using FaultInjectionTest = TestProviderTest;

std::vector<std::string> factoryResults(ObjectManager& om, const std::string& factory) {
  std::vector<std::string> out;
  for (const std::string& text : dataTexts(om.enumerateInstances(classPath("TVR_Factories"))))
    if (text.rfind(factory + "#", 0) == 0) out.push_back(text);
  return out;
}

const std::string kFailed = std::to_string(CMPI_RC_ERR_FAILED);

TEST_F(FaultInjectionTest, WithoutInjectedFailuresEveryFactorySucceeds) {
  const std::vector<std::string> all = dataTexts(om.enumerateInstances(classPath("TVR_Factories")));
  ASSERT_EQ(all.size(), 9u);
  for (const std::string& text : all) EXPECT_NE(text.find(" ok 0"), std::string::npos) << text;
}

TEST_F(FaultInjectionTest, FailNextFailsThatManyCallsAsNullThenSucceeds) {
  om.faults().failNext(Fault::NewObjectPath, 2);
  EXPECT_EQ(factoryResults(om, "newObjectPath"),
            (std::vector<std::string>{"newObjectPath#1 null " + kFailed, "newObjectPath#2 null " + kFailed,
                                      "newObjectPath#3 ok 0"}));
}

TEST_F(FaultInjectionTest, HollowShapeGivesObjectsWithoutAHandle) {
  om.faults().failNext(Fault::NewInstance, 1, FailureShape::Hollow);
  EXPECT_EQ(factoryResults(om, "newInstance"),
            (std::vector<std::string>{"newInstance#1 hollow " + kFailed, "newInstance#2 ok 0", "newInstance#3 ok 0"}));
}

TEST_F(FaultInjectionTest, HollowArraysToo) {
  om.faults().failNext(Fault::NewArray, 3, FailureShape::Hollow);
  EXPECT_EQ(factoryResults(om, "newArray"),
            (std::vector<std::string>{"newArray#1 hollow " + kFailed, "newArray#2 hollow " + kFailed,
                                      "newArray#3 hollow " + kFailed}));
}

TEST_F(FaultInjectionTest, OnlyTheServiceNamedFails) {
  om.faults().failNext(Fault::NewArray, 1);
  const std::vector<std::string> all = dataTexts(om.enumerateInstances(classPath("TVR_Factories")));
  ASSERT_EQ(all.size(), 9u);
  EXPECT_EQ(all[0], "newObjectPath#1 ok 0");
  EXPECT_EQ(all[1], "newInstance#1 ok 0");
  EXPECT_EQ(all[2], "newArray#1 null " + kFailed);
  EXPECT_EQ(all[5], "newArray#2 ok 0");
}

TEST_F(FaultInjectionTest, PendingCountsDownWithEachFailedCall) {
  om.faults().failNext(Fault::NewObjectPath, 5);
  EXPECT_EQ(om.faults().pending(Fault::NewObjectPath), 5u);
  om.enumerateInstances(classPath("TVR_Factories"));
  EXPECT_EQ(om.faults().pending(Fault::NewObjectPath), 2u);
  EXPECT_EQ(om.faults().pending(Fault::NewInstance), 0u);
}

TEST_F(FaultInjectionTest, FailNextReplacesThePendingCountAndShape) {
  om.faults().failNext(Fault::NewObjectPath, 3, FailureShape::Hollow);
  om.faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null);
  EXPECT_EQ(om.faults().pending(Fault::NewObjectPath), 1u);
  EXPECT_EQ(factoryResults(om, "newObjectPath"),
            (std::vector<std::string>{"newObjectPath#1 null " + kFailed, "newObjectPath#2 ok 0",
                                      "newObjectPath#3 ok 0"}));
}

TEST_F(FaultInjectionTest, ResetRemovesEveryPendingFailure) {
  om.faults().failNext(Fault::NewObjectPath, 2);
  om.faults().failNext(Fault::NewInstance, 2);
  om.faults().failNext(Fault::NewArray, 2);
  om.faults().failNext(Fault::UpCall, 2);
  om.faults().reset();
  for (Fault f : {Fault::NewObjectPath, Fault::NewInstance, Fault::NewArray, Fault::UpCall})
    EXPECT_EQ(om.faults().pending(f), 0u);
  for (const std::string& text : dataTexts(om.enumerateInstances(classPath("TVR_Factories"))))
    EXPECT_NE(text.find(" ok 0"), std::string::npos) << text;
}

TEST_F(FaultInjectionTest, CallsCountEveryCallFailedOrNot) {
  const std::uint64_t before = om.faults().calls(Fault::NewArray);
  om.faults().failNext(Fault::NewArray, 2);
  om.enumerateInstances(classPath("TVR_Factories"));
  EXPECT_EQ(om.faults().calls(Fault::NewArray), before + 3);
}

TEST_F(FaultInjectionTest, ResetKeepsTheCallCounts) {
  om.enumerateInstances(classPath("TVR_Factories"));
  const std::uint64_t calls = om.faults().calls(Fault::NewInstance);
  EXPECT_GE(calls, 3u);
  om.faults().reset();
  EXPECT_EQ(om.faults().calls(Fault::NewInstance), calls);
}

TEST(FaultInjector, ShouldFailReportsTheShapeAndCountsDown) {
  FaultInjector faults;
  faults.failNext(Fault::UpCall, 2, FailureShape::Hollow);
  FailureShape shape = FailureShape::Null;
  EXPECT_TRUE(faults.shouldFail(Fault::UpCall, &shape));
  EXPECT_EQ(shape, FailureShape::Hollow);
  EXPECT_TRUE(faults.shouldFail(Fault::UpCall, nullptr));
  EXPECT_FALSE(faults.shouldFail(Fault::UpCall, &shape));
  EXPECT_EQ(faults.calls(Fault::UpCall), 3u);
  EXPECT_EQ(faults.calls(Fault::NewArray), 0u);
}

TEST(FaultInjector, DefaultShapeIsNull) {
  FaultInjector faults;
  faults.failNext(Fault::NewArray, 1, FailureShape::Hollow);
  faults.failNext(Fault::NewArray, 1);
  FailureShape shape = FailureShape::Hollow;
  EXPECT_TRUE(faults.shouldFail(Fault::NewArray, &shape));
  EXPECT_EQ(shape, FailureShape::Null);
}

} // namespace
} // namespace tvr::broker::test
