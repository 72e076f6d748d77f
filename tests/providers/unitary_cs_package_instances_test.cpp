// TVRHX_UnitaryComputerSystemPackage as an instance provider, through the
// embedded object manager: every chassis tied to every computer system the
// object manager knows, the systems fetched back through the broker.
#include "ProviderHarness.h"

#include "tvr/broker/PathText.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>

namespace tvr::test {
namespace {

using ::testing::Contains;
using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::FailureShape;
using broker::Fault;
using broker::RequestOptions;
using KVLog::Channel;

const char* const kClass = "TVRHX_UnitaryComputerSystemPackage";
const char* const kUuid = "4c4c4544-0042-3510-8051-b7c04f4e3132";

// A blade system with a UUID, its enclosure and an expansion unit.
const char* const kSystemWithUuid = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System",
             "properties": {"PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132"},
             "children": [
               {"type": "ChassisNode", "name": "Main", "properties": {"PropChassisType": 17}},
               {"type": "ChassisNode", "name": "Expansion", "properties": {"PropChassisType": 18}}]}]})";

const char* const kSystemWithoutUuid = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "SystemNode", "name": "System",
             "children": [{"type": "ChassisNode", "name": "Main"}]}]})";

// Chassis the companion finds no computer system for.
const char* const kNoSystem = R"({
  "systemName": "host.example.com",
  "nodes": [{"type": "ChassisNode", "name": "Main"}]})";

ObjectPath chassisPath(const std::string& tag) {
  ObjectPath path = pathWithKeys("TVRHX_Chassis", {{"Tag", tag}, {"CreationClassName", "TVRHX_Chassis"}});
  path.host = "host.example.com";
  return path;
}

ObjectPath systemPath() {
  ObjectPath path = pathWithKeys("TVRHX_ComputerSystem",
                                 {{"CreationClassName", "TVRHX_ComputerSystem"}, {"Name", "host.example.com"}});
  path.host = "host.example.com";
  return path;
}

// The path with its keys in name order: the enumerated names add their keys
// in an order of their own, instance paths take the class's order.
ObjectPath keysSorted(ObjectPath path) {
  std::sort(path.keys.begin(), path.keys.end(),
            [](const broker::Binding& a, const broker::Binding& b) { return a.name < b.name; });
  return path;
}

std::vector<ObjectPath> keysSorted(const std::vector<ObjectPath>& paths) {
  std::vector<ObjectPath> out;
  for (const ObjectPath& path : paths) out.push_back(keysSorted(path));
  return out;
}

// "chassis Tag -> system Name" for each association path of a response.
std::vector<std::string> ties(const Response& r) {
  std::vector<std::string> out;
  for (const ObjectPath& p : r.paths()) {
    const Value* antecedent = p.key("Antecedent");
    const Value* dependent = p.key("Dependent");
    out.push_back((antecedent && antecedent->ref ? antecedent->ref->key("Tag")->text : "?") + " -> " +
                  (dependent && dependent->ref ? dependent->ref->key("Name")->text : "?"));
  }
  return out;
}

// A message line with its line number written N.
std::string lineMasked(std::string text) {
  const std::string label = ", Line: ";
  const std::size_t at = text.find(label);
  if (at == std::string::npos) return text;
  const std::size_t digits = at + label.size();
  return text.replace(digits, text.find(']', digits) - digits, "N");
}

// The failure reports (level 6000) of the logger, channel and category named.
std::vector<std::string> reports(const LoggerCapture& capture) {
  std::vector<std::string> out;
  for (const LoggedLine& line : capture.lines())
    if (line.level == 6000)
      out.push_back(std::string(line.channel == Channel::Log ? "log " : "trace ") + line.category + " " +
                    lineMasked(line.text));
  return out;
}

// Whether the provider itself wrote an EXITING line (the target lookup
// writes its own).
bool providerExited(const LoggerCapture& capture) {
  for (const LoggedLine& line : capture.lines())
    if (line.category == "Korvane.UnitaryComputerSystemPackage" && line.text.rfind("EXITING", 0) == 0) return true;
  return false;
}

const std::string kUpCallReport = "Korvane.UnitaryComputerSystemPackage MESSAGE [File: "
                                  "src/providers/UnitaryComputerSystemPackage.cpp, Line: N]: Call to "
                                  "CBEnumInstances of target Class Failed.";

class UnitaryCSPackageInstancesTest : public ::testing::Test {
protected:
  ProviderHarness harness;
};

TEST_F(UnitaryCSPackageInstancesTest, EnumerateInstanceNamesTiesEveryChassisToTheSystem) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(ties(r), ElementsAre("/System/Main -> host.example.com", "/System/Expansion -> host.example.com"));
}

TEST_F(UnitaryCSPackageInstancesTest, EnumeratedPathHasDependentThenAntecedentAsReferences) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.enumerateInstanceNames(kClass);
  ASSERT_FALSE(r.items.empty());
  const ObjectPath& path = r.items[0].path;
  EXPECT_EQ(path.className, kClass);
  EXPECT_EQ(path.nameSpace, "root/cimv2");
  EXPECT_EQ(path.host, "host.example.com");
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "Dependent");
  EXPECT_EQ(path.keys[0].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[0].value.ref, systemPath());
  EXPECT_EQ(path.keys[1].name, "Antecedent");
  EXPECT_EQ(path.keys[1].value.type, CMPI_ref);
  EXPECT_EQ(*path.keys[1].value.ref, chassisPath("/System/Main"));
}

TEST_F(UnitaryCSPackageInstancesTest, InstancesCarryTheSystemsUuidAsPlatformGuid) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.items.size(), 2u);
  for (const broker::ResultItem& item : r.items) {
    EXPECT_THAT(propertyNames(item.instance), ElementsAre("Dependent", "Antecedent", "PlatformGUID"));
    EXPECT_EQ(property(item.instance, "PlatformGUID"), Value::chars(kUuid));
    EXPECT_EQ(*property(item.instance, "Dependent").ref, systemPath());
  }
  EXPECT_EQ(*property(r.items[1].instance, "Antecedent").ref, chassisPath("/System/Expansion"));
}

TEST_F(UnitaryCSPackageInstancesTest, SystemWithoutUuidGivesInstancesWithoutPlatformGuid) {
  harness.useTree(kSystemWithoutUuid);
  Response r = harness.enumerateInstances(kClass);
  ASSERT_EQ(r.items.size(), 1u);
  EXPECT_THAT(propertyNames(r.items[0].instance), ElementsAre("Dependent", "Antecedent"));
}

TEST_F(UnitaryCSPackageInstancesTest, WithoutComputerSystemBothEnumerationsAnswerNothingAndComplete) {
  harness.useTree(kNoSystem);
  for (const Response& r : {harness.enumerateInstanceNames(kClass), harness.enumerateInstances(kClass)}) {
    EXPECT_TRUE(r.ok());
    EXPECT_THAT(r.items, IsEmpty());
    EXPECT_EQ(r.doneCount, 1);
    EXPECT_EQ(r.message, std::nullopt);
  }
}

TEST_F(UnitaryCSPackageInstancesTest, SystemWithoutChassisHasNoAssociation) {
  harness.useTree(R"({"nodes": [{"type": "SystemNode", "name": "System"}]})");
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_TRUE(r.ok());
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(UnitaryCSPackageInstancesTest, InstancePathsEqualTheEnumeratedNames) {
  harness.useTree(kSystemWithUuid);
  EXPECT_EQ(keysSorted(harness.enumerateInstances(kClass).paths()),
            keysSorted(harness.enumerateInstanceNames(kClass).paths()));
}

TEST_F(UnitaryCSPackageInstancesTest, GetInstanceFindsEveryEnumeratedPath) {
  harness.useTree(kSystemWithUuid);
  for (const ObjectPath& path : harness.enumerateInstanceNames(kClass).paths()) {
    Response r = harness.getInstance(path);
    EXPECT_TRUE(r.ok());
    EXPECT_EQ(r.doneCount, 1);
    ASSERT_EQ(r.items.size(), 1u) << broker::formatObjectPath(path);
    EXPECT_EQ(keysSorted(r.items[0].path), keysSorted(path));
    EXPECT_EQ(property(r.items[0].instance, "PlatformGUID"), Value::chars(kUuid));
  }
}

TEST_F(UnitaryCSPackageInstancesTest, GetInstanceOfAChassisThatIsNotThereFindsNothing) {
  harness.useTree(kSystemWithUuid);
  ObjectPath path("root/cimv2", kClass);
  path.keys.push_back(broker::Binding{"Antecedent", Value::reference(chassisPath("/System/Nowhere"))});
  path.keys.push_back(broker::Binding{"Dependent", Value::reference(systemPath())});
  Response r = harness.getInstance(path);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
}

TEST_F(UnitaryCSPackageInstancesTest, GetInstanceWithoutKeysFailsAndStillCompletes) {
  harness.useTree(kSystemWithUuid);
  Response r = harness.getInstance(ObjectPath("root/cimv2", kClass));
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.doneCount, 1);
  ASSERT_EQ(r.traces.size(), 1u);
  EXPECT_EQ(r.traces[0].text, std::optional<std::string>("At least one key should be passed"));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("UnitaryComputerSystemPackage"));
  EXPECT_EQ(r.traces[0].level, 1);
}

TEST_F(UnitaryCSPackageInstancesTest, FailedUpCallFailsEnumerateInstanceNamesWithTheReport) {
  harness.useTree(kSystemWithUuid);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
  EXPECT_THAT(reports(capture), ElementsAre("log " + kUpCallReport, "trace " + kUpCallReport));
  EXPECT_FALSE(providerExited(capture));
}

TEST_F(UnitaryCSPackageInstancesTest, FailedUpCallGivesEnumerateInstancesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemWithUuid);
  LoggerCapture capture;
  harness.om().faults().failNext(Fault::UpCall, 1);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(reports(capture), ElementsAre("log " + kUpCallReport, "trace " + kUpCallReport));
}

TEST_F(UnitaryCSPackageInstancesTest, FailedSystemClassPathFailsEnumerateInstanceNames) {
  harness.useTree(kSystemWithUuid);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed."));
  EXPECT_THAT(traceTexts(r), ElementsAre("Create CMPIObjectPath failed for ComputerSystemClass."));
  EXPECT_EQ(r.traces[0].component, std::optional<std::string>("UnitaryComputerSystemPackage"));
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(UnitaryCSPackageInstancesTest, FailedAssociationPathFailsEnumerateInstanceNamesWithAFullStop) {
  harness.useTree(kSystemWithUuid);
  // The system class path, the companion's system path and two chassis paths
  // are made first.
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 4);
  Response r = harness.enumerateInstanceNames(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::optional<std::string>("Create CMPIObjectPath failed for UnitaryComputerSystemPackage."));
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for UnitaryComputerSystemPackage."));
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(UnitaryCSPackageInstancesTest, FailedBuilderGivesAnEmptySuccessfulAnswer) {
  harness.useTree(kSystemWithUuid);
  harness.om().faults().failNext(Fault::NewObjectPath, 1, FailureShape::Null, 4);
  Response r = harness.enumerateInstances(kClass);
  EXPECT_EQ(r.rc, CMPI_RC_OK);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.items, IsEmpty());
  EXPECT_EQ(r.doneCount, 1);
  EXPECT_THAT(traceTexts(r), Contains("Create CMPIObjectPath failed for UnitaryComputerSystemPackage."));
}

TEST_F(UnitaryCSPackageInstancesTest, WithoutBrokerEnumerateInstanceNamesFailsSilently) {
  harness.useTree(kSystemWithUuid);
  RequestOptions options;
  options.nullBroker = true;
  Response r = harness.enumerateInstanceNames(kClass, options);
  EXPECT_EQ(r.rc, CMPI_RC_ERR_FAILED);
  EXPECT_EQ(r.message, std::nullopt);
  EXPECT_THAT(r.traces, IsEmpty());
  EXPECT_EQ(r.doneCount, 0);
}

TEST_F(UnitaryCSPackageInstancesTest, BuilderTracesItsEntryAndExit) {
  harness.useTree(kSystemWithUuid);
  LoggerCapture capture;
  harness.enumerateInstances(kClass);
  std::vector<std::string> builderLines;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == Channel::Log && line.function == "UnitaryComputerSystemPackageCMPIInstances")
      builderLines.push_back(maskedLine(line.text));
  const std::string where = "UnitaryComputerSystemPackageCMPIInstances() in "
                            "src/providers/UnitaryComputerSystemPackage.cpp [Line: N],Parameters List: "
                            " ref=0x? properties=0 ctx=0x? instances=0x?";
  EXPECT_THAT(builderLines, ElementsAre("ENTERING: " + where, "EXITING: " + where));
}

TEST_F(UnitaryCSPackageInstancesTest, EntryPointsMakeTwoMisNamedAfterTheProvider) {
  std::string error;
  CMPIInstanceMI* instance = harness.om().instanceMI("UnitaryComputerSystemPackageProvider", &error);
  CMPIAssociationMI* association = harness.om().associationMI("UnitaryComputerSystemPackageProvider", &error);
  ASSERT_NE(instance, nullptr) << error;
  ASSERT_NE(association, nullptr) << error;
  EXPECT_NE(static_cast<void*>(instance), static_cast<void*>(association));
  EXPECT_STREQ(instance->ft->miName, "instanceUnitaryComputerSystemPackageProvider");
  EXPECT_STREQ(association->ft->miName, "associationUnitaryComputerSystemPackageProvider");
  EXPECT_EQ(instance->ft->ftVersion, 200);
  EXPECT_EQ(association->ft->miVersion, 200);
}

TEST_F(UnitaryCSPackageInstancesTest, EnumerateInstanceNamesTracesEntryAndExitOnBothChannels) {
  harness.useTree(kSystemWithUuid);
  LoggerCapture capture;
  harness.enumerateInstanceNames(kClass);
  std::vector<std::string> lines;
  for (const LoggedLine& line : capture.lines())
    if (line.function == "UnitaryComputerSystemPackage_EnumInstanceNames")
      lines.push_back(std::string(line.channel == KVLog::Channel::Log ? "log " : "trace ") + maskedLine(line.text));
  const std::string where = "UnitaryComputerSystemPackage_EnumInstanceNames() in src/providers/UnitaryComputerSystemPackage.cpp [Line: N],"
                            "Parameters List:  mi=0x? ctx=0x? rslt=0x? ref=0x?";
  EXPECT_THAT(lines, ElementsAre("log ENTERING: " + where, "trace ENTERING: " + where, "log EXITING: " + where,
                                 "trace EXITING: " + where));
}

} // namespace
} // namespace tvr::test
