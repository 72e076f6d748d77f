// What every element provider shares, seen through TVRHX_Chassis: entry
// points and function tables, the class check of the read handlers, the
// 16-bit answer count, and the ENTERING/EXITING lines in both logger channels.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sstream>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using KVLog::Channel;

using InstanceEntry = CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);

const char* const kOneChassis = R"({"nodes": [{"type": "ChassisNode", "name": "Main"}]})";

std::string address(const void* p) {
  std::ostringstream out;
  out << p;
  return out.str();
}

std::string manyChassis(int count) {
  std::string json = R"({"nodes": [)";
  for (int i = 0; i < count; ++i) {
    if (i) json += ",";
    json += R"({"type": "ChassisNode", "name": "C)" + std::to_string(i) + "\"}";
  }
  return json + "]}";
}

class ProviderFrameTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(ProviderFrameTest, EntryPointReturnsTheSameStaticMiEveryTime) {
  std::string error;
  auto entry = reinterpret_cast<InstanceEntry>(
      harness.om().providerSymbol("ChassisProvider", "ChassisProvider_Create_InstanceMI", &error));
  ASSERT_NE(entry, nullptr) << error;
  CMPIStatus rc = {CMPI_RC_ERR_FAILED, nullptr};
  CMPIInstanceMI* first = entry(harness.om().broker(), nullptr, &rc);
  CMPIInstanceMI* second = entry(harness.om().broker(), nullptr, &rc);
  EXPECT_EQ(first, second);
  EXPECT_EQ(rc.rc, CMPI_RC_ERR_FAILED) << "the entry point leaves the status alone";
}

TEST_F(ProviderFrameTest, FunctionTableIsTheStandardInstanceTable) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ChassisProvider", &error);
  ASSERT_NE(mi, nullptr) << error;
  EXPECT_EQ(mi->hdl, nullptr);
  EXPECT_EQ(mi->ft->ftVersion, 200);
  EXPECT_EQ(mi->ft->miVersion, 200);
  EXPECT_STREQ(mi->ft->miName, "instanceChassisProvider");
  EXPECT_NE(mi->ft->cleanup, nullptr);
  EXPECT_NE(mi->ft->enumerateInstanceNames, nullptr);
  EXPECT_NE(mi->ft->enumerateInstances, nullptr);
  EXPECT_NE(mi->ft->getInstance, nullptr);
  EXPECT_NE(mi->ft->createInstance, nullptr);
  EXPECT_NE(mi->ft->modifyInstance, nullptr);
  EXPECT_NE(mi->ft->deleteInstance, nullptr);
  EXPECT_NE(mi->ft->execQuery, nullptr);
}

TEST_F(ProviderFrameTest, InstanceProviderHasNoAssociationEntryPoint) {
  std::string error;
  EXPECT_EQ(harness.om().providerSymbol("ChassisProvider", "ChassisProvider_Create_AssociationMI", &error), nullptr);
}

TEST_F(ProviderFrameTest, EachEntryPointCallOverwritesTheBrokerTheHandlersUse) {
  harness.useTree(kOneChassis);
  ProviderHarness other;
  std::string error;
  auto entry = reinterpret_cast<InstanceEntry>(
      harness.om().providerSymbol("ChassisProvider", "ChassisProvider_Create_InstanceMI", &error));
  ASSERT_NE(entry, nullptr) << error;
  harness.enumerateInstanceNames("TVRHX_Chassis"); // the provider is loaded and has our broker

  entry(other.om().broker(), nullptr, nullptr);
  Response viaOther = harness.enumerateInstanceNames("TVRHX_Chassis");
  ASSERT_FALSE(viaOther.traces.empty());
  EXPECT_EQ(viaOther.traces[0].broker, other.om().broker());

  entry(harness.om().broker(), nullptr, nullptr);
  Response viaOurs = harness.enumerateInstanceNames("TVRHX_Chassis");
  ASSERT_FALSE(viaOurs.traces.empty());
  EXPECT_EQ(viaOurs.traces[0].broker, harness.om().broker());
}

TEST_F(ProviderFrameTest, ClassNameIsComparedWithoutRegardToCase) {
  harness.useTree(kOneChassis);
  for (const char* name : {"TVRHX_Chassis", "tvrhx_chassis", "TVRHX_CHASSIS", "tVrHx_cHaSsIs"}) {
    broker::RequestOptions options;
    options.routeTo = "TVRHX_Chassis";
    Response names = harness.om().enumerateInstanceNames(classPath(name), options);
    Response instances = harness.om().enumerateInstances(classPath(name), std::nullopt, options);
    EXPECT_EQ(names.items.size(), 1u) << name;
    EXPECT_EQ(instances.items.size(), 1u) << name;
  }
}

TEST_F(ProviderFrameTest, AnotherClassIsAnsweredWithNothingAndOk) {
  harness.useTree(kOneChassis);
  broker::RequestOptions options;
  options.routeTo = "TVRHX_Chassis";
  Response names = harness.om().enumerateInstanceNames(classPath("CIM_Chassis"), options);
  Response instances = harness.om().enumerateInstances(classPath("CIM_Chassis"), std::nullopt, options);
  Response one =
      harness.om().getInstance(pathWithKeys("CIM_Chassis", {{"Tag", "/Main"}}), std::nullopt, options);
  for (const Response* r : {&names, &instances, &one}) {
    EXPECT_EQ(r->rc, CMPI_RC_OK);
    EXPECT_EQ(r->message, std::nullopt);
    EXPECT_THAT(r->items, IsEmpty());
    EXPECT_EQ(r->doneCount, 1);
    EXPECT_THAT(r->traces, IsEmpty());
  }
}

TEST_F(ProviderFrameTest, EmptyAnswerIsOkAndDone) {
  harness.useTree(R"({"nodes": []})");
  Response r = harness.enumerateInstances("TVRHX_Chassis");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ProviderFrameTest, AnswerOf65536ElementsCountsAsZero) {
  harness.useTree(manyChassis(65536));
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(ProviderFrameTest, AnswerOf65537ElementsReturnsOne) {
  harness.useTree(manyChassis(65537));
  Response r = harness.enumerateInstanceNames("TVRHX_Chassis");
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_EQ(*r.items[0].path.key("Tag"), Value::chars("/C0"));
  EXPECT_EQ(r.doneCount, 1);
}

// The logger lines of one request: each event goes to the log channel first,
// then to the trace channel, with the same text.
class FrameLoggingTest : public ProviderFrameTest {
protected:
  void SetUp() override { harness.useTree(kOneChassis); }

  std::vector<std::string> logTexts() const { return capture.texts(Channel::Log); }

  LoggerCapture capture;
};

TEST_F(FrameLoggingTest, EveryEventGoesToTheLogThenToTheTraceWithTheSameText) {
  harness.enumerateInstanceNames("TVRHX_Chassis");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size() % 2, 0u);
  ASSERT_FALSE(lines.empty());
  for (std::size_t i = 0; i < lines.size(); i += 2) {
    EXPECT_EQ(lines[i].channel, Channel::Log);
    EXPECT_EQ(lines[i + 1].channel, Channel::Trace);
    EXPECT_EQ(lines[i].text, lines[i + 1].text);
    EXPECT_EQ(lines[i].level, 3000);
    EXPECT_EQ(lines[i].category, lines[i + 1].category);
  }
}

TEST_F(FrameLoggingTest, EnumerateInstanceNamesWritesEnteringTheListAndExiting) {
  harness.enumerateInstanceNames("TVRHX_Chassis");
  const std::vector<LoggedLine> lines = capture.lines();
  ASSERT_EQ(lines.size(), 6u);
  EXPECT_EQ(lines[0].function, "Chassis_EnumInstanceNames");
  EXPECT_EQ(lines[0].file, "src/providers/ChassisProvider.cpp");
  EXPECT_EQ(lines[0].category, "Korvane.ChassisProvider");
  EXPECT_EQ(lines[2].function, "getAllChassisCOP");
  EXPECT_EQ(lines[2].category, "Korvane.PhysicalAssetObjFactory");
  EXPECT_EQ(lines[4].function, "Chassis_EnumInstanceNames");
  EXPECT_EQ(maskedLine(lines[0].text),
            "ENTERING: Chassis_EnumInstanceNames() in src/providers/ChassisProvider.cpp [Line: N],"
            "Parameters List:  mi=0x? ctx=0x? result=0x? ref=0x?");
  EXPECT_EQ(maskedLine(lines[2].text),
            "ENTERING: getAllChassisCOP() in src/factory/ChassisFactory.cpp [Line: N],"
            "Parameters List:  broker=0x? ctx=0x? ref=0x? objpaths=0x? rc=0x?");
  EXPECT_EQ(lines[4].text.rfind("EXITING: Chassis_EnumInstanceNames() in src/providers/ChassisProvider.cpp", 0), 0u)
      << lines[4].text;
}

TEST_F(FrameLoggingTest, ParameterListShowsTheAddressesTheHandlerWasGiven) {
  std::string error;
  CMPIInstanceMI* mi = harness.om().instanceMI("ChassisProvider", &error);
  harness.enumerateInstanceNames("TVRHX_Chassis");
  ASSERT_FALSE(logTexts().empty());
  EXPECT_NE(logTexts()[0].find(" mi=" + address(mi) + " ctx="), std::string::npos) << logTexts()[0];
}

TEST_F(FrameLoggingTest, EnumerateInstancesListsThePropertiesPointer) {
  harness.enumerateInstances("TVRHX_Chassis", std::vector<std::string>{"Name"});
  ASSERT_FALSE(logTexts().empty());
  EXPECT_EQ(maskedLine(logTexts()[0]),
            "ENTERING: Chassis_EnumInstances() in src/providers/ChassisProvider.cpp [Line: N],"
            "Parameters List:  mi=0x? ctx=0x? result=0x? ref=0x? properties=0x?");
}

TEST_F(FrameLoggingTest, NullPropertyListPrintsAsANullPointer) {
  harness.enumerateInstances("TVRHX_Chassis");
  ASSERT_FALSE(logTexts().empty());
  EXPECT_NE(logTexts()[0].find(" properties=0"), std::string::npos) << logTexts()[0];
}

TEST_F(FrameLoggingTest, EnumerateInstancesTracesEachInstanceBuilt) {
  harness.enumerateInstances("TVRHX_Chassis");
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log) functions.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  EXPECT_THAT(functions, ElementsAre("Chassis_EnumInstances in", "getAllChassisInstances in",
                                     "makeChassisInstance in", "makeChassisInstance out",
                                     "getAllChassisInstances out", "Chassis_EnumInstances out"));
}

TEST_F(FrameLoggingTest, GetInstanceThatFindsWritesNoExitOfTheLookup) {
  harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Main"}}));
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log) functions.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  EXPECT_THAT(functions, ElementsAre("Chassis_GetInstance in", "getOneChassisInstance in", "makeChassisInstance in",
                                     "makeChassisInstance out", "Chassis_GetInstance out"));
}

TEST_F(FrameLoggingTest, GetInstanceThatFindsNothingLeavesOnlyEnteringOfTheHandler) {
  Response r = harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Elsewhere"}}));
  EXPECT_FALSE(r.done());
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log) functions.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  EXPECT_THAT(functions, ElementsAre("Chassis_GetInstance in", "getOneChassisInstance in", "getOneChassisInstance out"));
}

TEST_F(FrameLoggingTest, LookupThatFindsNothingSaysInstancesInItsExitLine) {
  harness.getInstance(pathWithKeys("TVRHX_Chassis", {{"Tag", "/Elsewhere"}}));
  const std::vector<std::string> texts = logTexts();
  ASSERT_EQ(texts.size(), 3u);
  EXPECT_NE(texts[1].find(" properties=0 instance=0 rc=0x"), std::string::npos) << texts[1];
  EXPECT_NE(texts[2].find(" properties=0 instances=0 rc=0x"), std::string::npos) << texts[2];
}

} // namespace
} // namespace tvr::test
