// The target lookup of the association providers and the small helpers
// beside it, called directly with the embedded object manager's broker.
#include "PhysicalAssetProvider.h"
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace HX::PhysicalAssetProvider;

class TargetLookupTest : public ::testing::Test {
protected:
  // The target the lookup gives for a path of `sourceClass` and the
  // association class `assocClass`, and the broker trace texts it sent.
  std::pair<std::string, std::vector<std::string>> lookUp(const char* sourceClass, const char* assocClass,
                                                          const char* resultClass = nullptr) {
    std::string target;
    Response r = harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
      CMPIObjectPath* source = CMNewObjectPath(broker, "root/cimv2", sourceClass, nullptr);
      CMPIStatus rc = {CMPI_RC_OK, nullptr};
      target = getAssocTargetClassName(broker, source, assocClass, resultClass, &rc);
    });
    return {target, traceTexts(r)};
  }

  ProviderHarness harness;
};

TEST_F(TargetLookupTest, EachRuleGivesItsTargetWithItsTraceText) {
  struct Rule {
    const char* source;
    const char* association;
    const char* trace;
    const char* target;
  };
  const Rule rules[] = {
      {"TVRHX_Chassis", "TVRHX_PackageInSlot", "Target Class is Slot", "TVRHX_Slot"},
      {"TVRHX_Chassis", "TVRHX_SlotOnChassis", "Target Class is Slot", "TVRHX_Slot"},
      {"TVRHX_Slot", "TVRHX_PackageInSlot", "Target Class is ChassisClass", "TVRHX_Chassis"},
      {"TVRHX_Slot", "TVRHX_SlotOnChassis", "Target Class is ChassisClass", "TVRHX_Chassis"},
      {"TVRHX_Chassis", "TVRHX_UnitaryComputerSystemPackage", "Target Class is ComputerSystem Class",
       "TVRHX_ComputerSystem"},
      {"TVRHX_ComputerSystem", "TVRHX_UnitaryComputerSystemPackage", "Target Class is ChassisClass",
       "TVRHX_Chassis"},
      {"TVRHX_ComputerSystem", "TVRHX_CardCSPackage", "Target Class is TVRHX_NetworkCard", "TVRHX_NetworkCard"},
      {"TVRHX_NetworkCard", "TVRHX_CardCSPackage", "Target Class is ComputerSystem Class", "TVRHX_ComputerSystem"},
      {"TVRHX_ComputerSystem", "TVRHX_DiskControllerCSPackage", "Target Class is TVRHX_DiskController",
       "TVRHX_DiskController"},
      {"TVRHX_DiskController", "TVRHX_DiskControllerCSPackage", "Target Class is ComputerSystem Class",
       "TVRHX_ComputerSystem"},
      {"TVRHX_NetworkPort", "TVRHX_NPRealizesNC", "Target Class is TVRHX_NetworkCard", "TVRHX_NetworkCard"},
      {"TVRHX_NetworkCard", "TVRHX_NPRealizesNC", "Target Class is TVRHX_NetworkPort", "TVRHX_NetworkPort"},
      {"TVRHX_SASPortController", "TVRHX_SASPortRealizesDisk", "Target Class is TVRHX_DiskController",
       "TVRHX_DiskController"},
      {"TVRHX_DiskController", "TVRHX_SASPortRealizesDisk", "Target Class is TVRHX_SASPortController",
       "TVRHX_SASPortController"},
      {"TVRHX_Chassis", "TVRHX_ConnectorOnPackage", "Target Class is ConnectorClass", "TVRHX_Connector"},
      {"TVRHX_Connector", "TVRHX_ConnectorOnPackage", "Target Class is ChassisClass", "TVRHX_Chassis"},
      {"TVRHX_Connector", "TVRHX_ConnectedTo", "Target Class is ChassisClass", "TVRHX_Connector"},
  };
  for (const Rule& rule : rules) {
    const auto [target, traces] = lookUp(rule.source, rule.association);
    EXPECT_EQ(target, rule.target) << rule.source << " over " << rule.association;
    EXPECT_THAT(traces, ElementsAre(rule.trace)) << rule.source << " over " << rule.association;
  }
}

TEST_F(TargetLookupTest, RuleTraceGoesThroughTheBrokerAtLevelOne) {
  Response r = harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
    CMPIObjectPath* source = CMNewObjectPath(broker, "root/cimv2", "TVRHX_Chassis", nullptr);
    getAssocTargetClassName(broker, source, "TVRHX_PackageInSlot", nullptr, nullptr);
  });
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].level, 1);
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("PhysicalAssetProvider"));
}

TEST_F(TargetLookupTest, PairWithoutARuleGivesAnEmptyTextAndNoTrace) {
  const std::pair<const char*, const char*> pairs[] = {
      {"TVRHX_Slot", "TVRHX_ConnectedTo"},
      {"TVRHX_IDEController", "TVRHX_ChipSystemPackaging"},
      {"TVRHX_ChipIDECont", "TVRHX_ICRealizesChip"},
      {"TVRHX_ComputerSystem", "TVRHX_ChipSystemPackaging"},
      {"TVRHX_Chassis", "TVRHX_NoSuchAssociation"},
      {"CIM_Chassis", "TVRHX_PackageInSlot"},
  };
  for (const auto& [source, association] : pairs) {
    const auto [target, traces] = lookUp(source, association);
    EXPECT_EQ(target, "") << source << " over " << association;
    EXPECT_THAT(traces, IsEmpty()) << source << " over " << association;
  }
}

TEST_F(TargetLookupTest, ClassNamesAreComparedExactlyInCase) {
  EXPECT_EQ(lookUp("tvrhx_chassis", "TVRHX_PackageInSlot").first, "");
  EXPECT_EQ(lookUp("TVRHX_Chassis", "tvrhx_packageinslot").first, "");
}

TEST_F(TargetLookupTest, NullAssociationClassMatchesNoRule) {
  const auto [target, traces] = lookUp("TVRHX_Chassis", nullptr);
  EXPECT_EQ(target, "");
  EXPECT_THAT(traces, IsEmpty());
}

TEST_F(TargetLookupTest, ResultClassHasNoEffect) {
  EXPECT_EQ(lookUp("TVRHX_ComputerSystem", "TVRHX_CardCSPackage", nullptr).first, "TVRHX_NetworkCard");
  EXPECT_EQ(lookUp("TVRHX_ComputerSystem", "TVRHX_CardCSPackage", "TVRHX_Nothing").first, "TVRHX_NetworkCard");
}

TEST_F(TargetLookupTest, TargetPathHasTheFarClassTheSourceNamespaceThisHostAndNoKeys) {
  harness.useTree(R"({"systemName": "host.example.com", "nodes": []})");
  harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
    CMPIObjectPath* source = CMNewObjectPath(broker, "root/interop", "TVRHX_Slot", nullptr);
    CMPIObjectPath* target = getAssocTargetClassObjectPath(broker, source, "TVRHX_PackageInSlot", nullptr, nullptr);
    ASSERT_NE(target, nullptr);
    EXPECT_STREQ(CMGetCharsPtr(CMGetClassName(target, nullptr), nullptr), "TVRHX_Chassis");
    EXPECT_STREQ(CMGetCharsPtr(CMGetNameSpace(target, nullptr), nullptr), "root/interop");
    EXPECT_STREQ(CMGetCharsPtr(CMGetHostname(target, nullptr), nullptr), "host.example.com");
    EXPECT_EQ(CMGetKeyCount(target, nullptr), 0u);
  });
}

TEST_F(TargetLookupTest, NoRuleGivesANullTargetPath) {
  harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
    CMPIObjectPath* source = CMNewObjectPath(broker, "root/cimv2", "TVRHX_Slot", nullptr);
    EXPECT_EQ(getAssocTargetClassObjectPath(broker, source, "TVRHX_ConnectedTo", nullptr, nullptr), nullptr);
  });
}

TEST_F(TargetLookupTest, TargetPathTracesBothWaysWithTheTextArguments) {
  LoggerCapture capture;
  harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
    CMPIObjectPath* source = CMNewObjectPath(broker, "root/cimv2", "TVRHX_Chassis", nullptr);
    getAssocTargetClassObjectPath(broker, source, "TVRHX_PackageInSlot", "TVRHX_Slot", nullptr);
  });
  const std::vector<std::string> log = capture.texts(KVLog::Channel::Log);
  ASSERT_EQ(log.size(), 2u);
  EXPECT_NE(log[0].find("ENTERING: getAssocTargetClassObjectPath() in src/factory/AssocTargetLookup.cpp"),
            std::string::npos);
  EXPECT_NE(log[0].find(" _RefLeftClass=TVRHX_PackageInSlot _RefRightClass=TVRHX_Slot rc=0"), std::string::npos)
      << log[0];
  EXPECT_NE(log[1].find("EXITING: getAssocTargetClassObjectPath()"), std::string::npos);
  EXPECT_EQ(capture.texts(KVLog::Channel::Trace), log);
}

TEST_F(TargetLookupTest, NullRightClassCutsTheParameterListThere) {
  LoggerCapture capture;
  harness.om().runAsRequest([&](const CMPIBroker* broker, const CMPIContext*) {
    CMPIObjectPath* source = CMNewObjectPath(broker, "root/cimv2", "TVRHX_Chassis", nullptr);
    getAssocTargetClassObjectPath(broker, source, "TVRHX_PackageInSlot", nullptr, nullptr);
  });
  const std::vector<std::string> log = capture.texts(KVLog::Channel::Log);
  ASSERT_FALSE(log.empty());
  const std::string tail = " _RefLeftClass=TVRHX_PackageInSlot _RefRightClass=";
  ASSERT_GE(log[0].size(), tail.size());
  EXPECT_EQ(log[0].substr(log[0].size() - tail.size()), tail);
}

TEST(AdjustStringTest, FourteenDigitsAmongOtherCharactersMakeADateTime) {
  EXPECT_EQ(adjustString("2026-11-21 06:16:42"), "20261121061642.000000+000");
}

TEST(AdjustStringTest, DigitsBeyondFourteenAreIgnored) {
  EXPECT_EQ(adjustString("2026/11/21 06:16:42.123456"), "20261121061642.000000+000");
}

TEST(AdjustStringTest, ADateAloneGivesAnEmptyString) { EXPECT_EQ(adjustString("2026-11-21"), ""); }

TEST(AdjustStringTest, BytesAboveAsciiAreSkipped) {
  EXPECT_EQ(adjustString("\xc3\xa9" "20261121\xff" "061642"), "20261121061642.000000+000");
}

TEST(AdjustStringTest, ExactlyFourteenDigitsAtTheEndAreEnough) {
  EXPECT_EQ(adjustString("20261121061642"), "20261121061642.000000+000");
  EXPECT_EQ(adjustString("2026112106164"), "");
}

class SystemUuidTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(SystemUuidTest, SystemNodeWithAUuidGivesIt) {
  harness.useTree(R"({"nodes": [{"type": "SystemNode", "name": "S",
                                 "properties": {"PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132"}}]})");
  std::string uuid = "before";
  EXPECT_TRUE(getUnitaryComputerSystem_UUID(uuid));
  EXPECT_EQ(uuid, "4c4c4544-0042-3510-8051-b7c04f4e3132");
}

TEST_F(SystemUuidTest, SystemNodeWithoutAUuidLeavesTheTextAlone) {
  harness.useTree(R"({"nodes": [{"type": "SystemNode", "name": "S"}]})");
  std::string uuid = "before";
  EXPECT_FALSE(getUnitaryComputerSystem_UUID(uuid));
  EXPECT_EQ(uuid, "before");
}

TEST_F(SystemUuidTest, NoSystemNodeIsNoUuid) {
  harness.useTree(R"({"nodes": [{"type": "ChassisNode", "name": "C"}]})");
  std::string uuid = "before";
  EXPECT_FALSE(getUnitaryComputerSystem_UUID(uuid));
  EXPECT_EQ(uuid, "before");
}

TEST_F(SystemUuidTest, ThrowingCursorLeavesThroughTheCaller) {
  harness.useTree(R"({"faults": {"throwOnSelect": ["SystemNode"]}, "nodes": []})");
  std::string uuid;
  EXPECT_THROW(getUnitaryComputerSystem_UUID(uuid), std::exception);
}

} // namespace
} // namespace tvr::test
