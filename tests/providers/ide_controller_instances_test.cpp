// TVRHX_IDEController and TVRHX_ChipIDECont instances, as
// DiskController_EnumInstances serves them through the embedded object
// manager.
#include "ProviderHarness.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cctype>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using KVLog::Channel;

// The example blade's chipset controller in IDE mode.
const char* const kIDEController = R"({
  "systemName": "blade.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 1,
     "description": "Chipset SATA controller in IDE mode",
     "properties": {"PropManufacturer": "Northwind Semiconductor", "PropType": "IDE interface",
                    "PropOtherIdentifyingInfo": "IDE mode", "PropNumControlled": 4, "PropPortType": 94,
                    "PropFormFactor": 5}}
  ]})";

// One controller with other identifying information and the given extra
// fields.
std::string ideController(const std::string& fields) {
  return R"({"systemName": "blade.example.com", "nodes": [{"type": "StorageControllerNode", "name": "C")" +
         (fields.empty() ? std::string() : ", " + fields) + "}]}";
}

std::string withProperties(const std::string& properties) {
  return ideController(R"("properties": {"PropOtherIdentifyingInfo": "IDE mode")" +
                       (properties.empty() ? std::string() : ", " + properties) + "}");
}

class IDEControllerInstancesTest : public ::testing::Test {
protected:
  Instance only(const std::string& className, const std::string& tree) {
    harness.useTree(tree);
    Response r = harness.enumerateInstances(className);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.items.size(), 1u);
    return r.items.empty() ? Instance{} : r.items.front().instance;
  }
  Instance onlyController(const std::string& tree) { return only("TVRHX_IDEController", tree); }
  Instance onlyChip(const std::string& tree) { return only("TVRHX_ChipIDECont", tree); }

  ProviderHarness harness;
};

TEST_F(IDEControllerInstancesTest, ControllerPathHasTheFourKeysOfASystemDevice) {
  const Instance ide = onlyController(kIDEController);
  const ObjectPath& path = ide.path;
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.className, "TVRHX_IDEController");
  EXPECT_EQ(path.host, "blade.example.com");
  ASSERT_EQ(path.keys.size(), 4u);
  EXPECT_EQ(path.keys[0].name, "DeviceID");
  EXPECT_EQ(path.keys[0].value, Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(path.keys[1].name, "CreationClassName");
  EXPECT_EQ(path.keys[1].value, Value::chars("TVRHX_IDEController"));
  EXPECT_EQ(path.keys[2].name, "SystemCreationClassName");
  EXPECT_EQ(path.keys[2].value, Value::chars("TVRHX_ComputerSystem"));
  EXPECT_EQ(path.keys[3].name, "SystemName");
  EXPECT_EQ(path.keys[3].value, Value::chars("blade.example.com"));
}

TEST_F(IDEControllerInstancesTest, ControllerCarriesItsPropertiesInOrderWithTheirTypes) {
  const Instance ide = onlyController(kIDEController);
  EXPECT_THAT(propertyNames(ide), ElementsAre("DeviceID", "CreationClassName", "SystemCreationClassName",
                                              "SystemName", "EnabledState", "ProtocolSupported",
                                              "MaxNumberControlled", "Description", "OtherIdentifyingInfo"));
  EXPECT_EQ(property(ide, "DeviceID"), Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(property(ide, "CreationClassName"), Value::chars("TVRHX_IDEController"));
  EXPECT_EQ(property(ide, "SystemCreationClassName"), Value::chars("TVRHX_ComputerSystem"));
  EXPECT_EQ(property(ide, "SystemName"), Value::chars("blade.example.com"));
  EXPECT_EQ(property(ide, "EnabledState"), Value::uint16(2));
  EXPECT_EQ(property(ide, "ProtocolSupported"), Value::uint16(94));
  EXPECT_EQ(property(ide, "MaxNumberControlled"), Value::uint32(4));
  EXPECT_EQ(property(ide, "Description"), Value::chars("IDE interface"));
  EXPECT_EQ(property(ide, "OtherIdentifyingInfo"), Value::chars("IDE mode"));
}

TEST_F(IDEControllerInstancesTest, ChipPathHasTagAndCreationClassName) {
  const Instance chip = onlyChip(kIDEController);
  const ObjectPath& path = chip.path;
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.className, "TVRHX_ChipIDECont");
  EXPECT_EQ(path.host, "blade.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Tag");
  EXPECT_EQ(path.keys[0].value, Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(path.keys[1].name, "CreationClassName");
  EXPECT_EQ(path.keys[1].value, Value::chars("TVRHX_ChipIDECont"));
}

TEST_F(IDEControllerInstancesTest, ChipCarriesItsPropertiesInOrderWithTheirTypes) {
  const Instance chip = onlyChip(kIDEController);
  EXPECT_THAT(propertyNames(chip), ElementsAre("Tag", "CreationClassName", "FormFactor", "HotSwappable",
                                               "Removable", "Replaceable", "Description", "OtherIdentifyingInfo"));
  EXPECT_EQ(property(chip, "Tag"), Value::chars("/0000:00:1f.2"));
  EXPECT_EQ(property(chip, "CreationClassName"), Value::chars("TVRHX_ChipIDECont"));
  EXPECT_EQ(property(chip, "FormFactor"), Value::uint16(5));
  EXPECT_EQ(property(chip, "HotSwappable"), Value::boolean(false));
  EXPECT_EQ(property(chip, "Removable"), Value::boolean(false));
  EXPECT_EQ(property(chip, "Replaceable"), Value::boolean(false));
  EXPECT_EQ(property(chip, "Description"), Value::chars("IDE interface"));
  EXPECT_EQ(property(chip, "OtherIdentifyingInfo"), Value::chars("IDE mode"));
}

TEST_F(IDEControllerInstancesTest, NodeWithoutOtherIdentifyingInfoIsNeitherControllerNorChip) {
  harness.useTree(R"({"nodes": [{"type": "StorageControllerNode", "name": "raid",
                                  "properties": {"PropType": "RAID bus controller"}}]})");
  for (const char* ideClass : {"TVRHX_IDEController", "TVRHX_ChipIDECont"}) {
    Response r = harness.enumerateInstances(ideClass);
    EXPECT_EQ(r.rc, CMPI_RC_OK) << ideClass;
    EXPECT_THAT(r.items, IsEmpty()) << ideClass;
    EXPECT_EQ(r.doneCount, 1) << ideClass;
  }
  EXPECT_EQ(harness.enumerateInstances("TVRHX_DiskController").items.size(), 1u);
}

TEST_F(IDEControllerInstancesTest, EmptyOtherIdentifyingInfoStillQualifies) {
  const std::string tree = ideController(R"("properties": {"PropOtherIdentifyingInfo": ""})");
  EXPECT_EQ(property(onlyController(tree), "OtherIdentifyingInfo"), Value::chars(""));
  EXPECT_EQ(property(onlyChip(tree), "OtherIdentifyingInfo"), Value::chars(""));
}

TEST_F(IDEControllerInstancesTest, EnabledStateMapsOneToEnabledAndSixteenToDisabled) {
  // The mapping sees the low 16 bits of the node status.
  const std::vector<std::pair<unsigned, std::uint16_t>> cases = {{1, 2},     {16, 3},    {2, 0},    {0, 0},
                                                                 {3, 0},     {17, 0},    {65537, 2}, {65552, 3},
                                                                 {65538, 0}};
  for (const auto& [status, enabledState] : cases) {
    const Instance ide = onlyController(
        ideController("\"status\": " + std::to_string(status) + R"(, "properties": {"PropOtherIdentifyingInfo": "x"})"));
    EXPECT_EQ(property(ide, "EnabledState"), Value::uint16(enabledState)) << "node status " << status;
  }
}

TEST_F(IDEControllerInstancesTest, ProtocolSupportedIs36WhenTheNodeHasNoPortType) {
  EXPECT_EQ(property(onlyController(withProperties("")), "ProtocolSupported"), Value::uint16(36));
}

TEST_F(IDEControllerInstancesTest, ProtocolSupportedOfPortTypeZeroIsZero) {
  EXPECT_EQ(property(onlyController(withProperties(R"("PropPortType": 0)")), "ProtocolSupported"),
            Value::uint16(0));
}

TEST_F(IDEControllerInstancesTest, ProtocolSupportedKeepsTheLow16BitsOfThePortType) {
  EXPECT_EQ(property(onlyController(withProperties(R"("PropPortType": 65542)")), "ProtocolSupported"),
            Value::uint16(6));
}

TEST_F(IDEControllerInstancesTest, MaxNumberControlledIsTwoWhenTheNodeDoesNotSay) {
  EXPECT_EQ(property(onlyController(withProperties("")), "MaxNumberControlled"), Value::uint32(2));
}

TEST_F(IDEControllerInstancesTest, MaxNumberControlledOfZeroIsZero) {
  EXPECT_EQ(property(onlyController(withProperties(R"("PropNumControlled": 0)")), "MaxNumberControlled"),
            Value::uint32(0));
}

TEST_F(IDEControllerInstancesTest, MaxNumberControlledKeepsAll32Bits) {
  EXPECT_EQ(property(onlyController(withProperties(R"("PropNumControlled": 70000)")), "MaxNumberControlled"),
            Value::uint32(70000));
}

TEST_F(IDEControllerInstancesTest, NodeWithoutTypeHasNoDescriptionOnEitherClassButAnEmptyCaption) {
  const std::string tree = withProperties("");
  const Instance ide = onlyController(tree);
  const Instance chip = onlyChip(tree);
  EXPECT_EQ(ide.property("Description"), nullptr);
  EXPECT_EQ(chip.property("Description"), nullptr);
  EXPECT_THAT(propertyNames(ide), ElementsAre("DeviceID", "CreationClassName", "SystemCreationClassName",
                                              "SystemName", "EnabledState", "ProtocolSupported",
                                              "MaxNumberControlled", "OtherIdentifyingInfo"));
  harness.useTree(tree);
  Response disk = harness.enumerateInstances("TVRHX_DiskController");
  ASSERT_EQ(disk.items.size(), 1u);
  EXPECT_EQ(property(disk.items[0].instance, "Caption"), Value::chars(""));
}

TEST_F(IDEControllerInstancesTest, DescriptionIsTheNodeTypeNotTheNodeDescription) {
  const std::string tree = ideController(
      R"("description": "the node's own words", "properties": {"PropOtherIdentifyingInfo": "x", "PropType": "IDE"})");
  EXPECT_EQ(property(onlyController(tree), "Description"), Value::chars("IDE"));
  EXPECT_EQ(property(onlyChip(tree), "Description"), Value::chars("IDE"));
}

TEST_F(IDEControllerInstancesTest, ChipFormFactorIsZeroWhenTheNodeHasNone) {
  EXPECT_EQ(property(onlyChip(withProperties("")), "FormFactor"), Value::uint16(0));
}

TEST_F(IDEControllerInstancesTest, ChipFormFactorKeepsTheLow16Bits) {
  EXPECT_EQ(property(onlyChip(withProperties(R"("PropFormFactor": 65539)")), "FormFactor"), Value::uint16(3));
}

TEST_F(IDEControllerInstancesTest, EveryChipIsNeitherHotSwappableNorRemovableNorReplaceable) {
  harness.useTree(R"({"nodes": [
    {"type": "StorageControllerNode", "name": "a", "status": 1, "properties": {"PropOtherIdentifyingInfo": "x"}},
    {"type": "StorageControllerNode", "name": "b", "status": 16,
     "properties": {"PropOtherIdentifyingInfo": "y", "PropFormFactor": 9}}]})");
  Response r = harness.enumerateInstances("TVRHX_ChipIDECont");
  ASSERT_EQ(r.items.size(), 2u);
  for (const broker::ResultItem& item : r.items)
    for (const char* name : {"HotSwappable", "Removable", "Replaceable"})
      EXPECT_EQ(property(item.instance, name), Value::boolean(false)) << name;
}

TEST_F(IDEControllerInstancesTest, PropertyListNarrowsNothing) {
  harness.useTree(kIDEController);
  for (const char* ideClass : {"TVRHX_IDEController", "TVRHX_ChipIDECont"}) {
    Response all = harness.enumerateInstances(ideClass);
    Response description = harness.enumerateInstances(ideClass, std::vector<std::string>{"Description"});
    ASSERT_EQ(all.items.size(), 1u);
    EXPECT_EQ(description.instances(), all.instances()) << ideClass;
  }
}

TEST_F(IDEControllerInstancesTest, OneNodeNamesTheSameTextAsDeviceIDTagAndDiskControllerTag) {
  harness.useTree(kIDEController);
  const Instance ide = harness.enumerateInstances("TVRHX_IDEController").items.at(0).instance;
  const Instance chip = harness.enumerateInstances("TVRHX_ChipIDECont").items.at(0).instance;
  const Instance disk = harness.enumerateInstances("TVRHX_DiskController").items.at(0).instance;
  EXPECT_EQ(property(ide, "DeviceID"), property(chip, "Tag"));
  EXPECT_EQ(property(chip, "Tag"), property(disk, "Tag"));
}

TEST_F(IDEControllerInstancesTest, ChipTracesItsInstanceWithTheControllerText) {
  harness.useTree(kIDEController);
  Response r = harness.enumerateInstances("TVRHX_ChipIDECont");
  EXPECT_THAT(traceTexts(r), ElementsAre("*** Returning COPs of DiskController ***",
                                         "*** Returning an instance of IDEController ***",
                                         "*** Returning an instance of DiskController ***"));
}

// The logger lines of the IDE builders.
class IDEControllerLoggingTest : public IDEControllerInstancesTest {
protected:
  std::vector<std::string> events() const {
    std::vector<std::string> out;
    for (const LoggedLine& line : capture.lines())
      if (line.channel == Channel::Log)
        out.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
    return out;
  }

  LoggerCapture capture;
};

TEST_F(IDEControllerLoggingTest, PathBuilderWritesEnteringOnlyInsideTheInstanceBuilder) {
  harness.useTree(kIDEController);
  capture.clear();
  harness.enumerateInstances("TVRHX_IDEController");
  EXPECT_THAT(events(), ElementsAre("DiskController_EnumInstances in", "getAllDiskControllerInstances in",
                                    "makeIDEDiskControllerInstance in", "getIDEDiskControllerCOP in",
                                    "makeIDEDiskControllerInstance out", "getAllDiskControllerInstances out",
                                    "DiskController_EnumInstances out"));
}

TEST_F(IDEControllerLoggingTest, NodeThatDoesNotQualifyStillEntersAndExitsTheBuilder) {
  harness.useTree(R"({"nodes": [{"type": "StorageControllerNode", "name": "raid"}]})");
  capture.clear();
  harness.enumerateInstances("TVRHX_ChipIDECont");
  EXPECT_THAT(events(), ElementsAre("DiskController_EnumInstances in", "getAllDiskControllerInstances in",
                                    "makeIDEChipControllerInstance in", "makeIDEChipControllerInstance out",
                                    "getAllDiskControllerInstances out", "DiskController_EnumInstances out"));
}

TEST_F(IDEControllerLoggingTest, PathBuilderListsBrokerRefViewStatusAndOutArgument) {
  harness.useTree(kIDEController);
  capture.clear();
  harness.enumerateInstances("TVRHX_ChipIDECont");
  std::vector<std::string> texts;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "getIDEChipCOP") texts.push_back(line.text);
  ASSERT_EQ(texts.size(), 2u);
  EXPECT_EQ(maskedLine(texts[0]),
            "ENTERING: getIDEChipCOP() in src/factory/IDEControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ref=0x? dc=0x? rc=0x? op_parm=0x?");
  EXPECT_EQ(texts[0], texts[1]);
}

TEST_F(IDEControllerLoggingTest, InstanceBuilderListsBrokerRefViewPropertiesAndStatus) {
  harness.useTree(kIDEController);
  capture.clear();
  harness.enumerateInstances("TVRHX_IDEController", std::vector<std::string>{"Description"});
  std::vector<std::string> texts;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "makeIDEDiskControllerInstance" && line.channel == Channel::Log) texts.push_back(line.text);
  ASSERT_EQ(texts.size(), 2u);
  EXPECT_EQ(maskedLine(texts[0]),
            "ENTERING: makeIDEDiskControllerInstance() in src/factory/IDEControllerFactory.cpp [Line: N],Parameters List:  broker=0x? ref=0x? dc=0x? properties=0x? rc=0x?");
  EXPECT_EQ(texts[1].rfind("EXITING: makeIDEDiskControllerInstance() in src/factory/IDEControllerFactory.cpp", 0),
            0u)
      << texts[1];
}

} // namespace
} // namespace tvr::test
