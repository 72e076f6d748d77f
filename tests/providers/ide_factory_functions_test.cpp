// The IDE factory functions that no handler reaches, called directly with
// the object manager's broker, their results read through the CMPI function
// tables.
#include "DiskController.h"
#include "PhysicalAssetProvider.h"
#include "ProviderHarness.h"

#include <cmpimacs.h>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace tvr::test {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using broker::Fault;
using HX::PhysicalAssetProvider::DiskController;
namespace factory = HX::PhysicalAssetProvider;

// Two controllers, of which only the first has other identifying
// information.
const char* const kIDEAndRaid = R"({
  "systemName": "blade.example.com",
  "nodes": [
    {"type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 16,
     "properties": {"PropType": "IDE interface", "PropOtherIdentifyingInfo": "IDE mode", "PropFormFactor": 65541}},
    {"type": "StorageControllerNode", "name": "0000:18:00.0", "properties": {"PropType": "RAID bus controller"}}
  ]})";

std::string text(const CMPIString* s) {
  const char* chars = s ? s->ft->getCharPtr(s, nullptr) : nullptr;
  return chars ? chars : "(null)";
}

// A value read back from a CMPI object, as name, text and number.
struct Field {
  std::string name;
  CMPIType type;
  std::string text;
  std::uint64_t number;
};

Field fieldOf(CMPIString* name, const CMPIData& data) {
  Field field{text(name), data.type, "", 0};
  if (data.type == CMPI_string) field.text = text(data.value.string);
  else if (data.type == CMPI_uint16) field.number = data.value.uint16;
  else if (data.type == CMPI_uint32) field.number = data.value.uint32;
  else if (data.type == CMPI_boolean) field.number = data.value.boolean;
  return field;
}

std::vector<Field> keysOf(const CMPIObjectPath* path) {
  std::vector<Field> out;
  const CMPICount count = path->ft->getKeyCount(path, nullptr);
  for (CMPICount i = 0; i < count; ++i) {
    CMPIString* name = nullptr;
    const CMPIData data = path->ft->getKeyAt(path, i, &name, nullptr);
    out.push_back(fieldOf(name, data));
  }
  return out;
}

std::vector<Field> propertiesOf(const CMPIInstance* instance) {
  std::vector<Field> out;
  const CMPICount count = instance->ft->getPropertyCount(instance, nullptr);
  for (CMPICount i = 0; i < count; ++i) {
    CMPIString* name = nullptr;
    const CMPIData data = instance->ft->getPropertyAt(instance, i, &name, nullptr);
    out.push_back(fieldOf(name, data));
  }
  return out;
}

std::vector<std::string> namesOf(const std::vector<Field>& fields) {
  std::vector<std::string> out;
  for (const Field& f : fields) out.push_back(f.name);
  return out;
}

std::vector<std::string> textsOf(const std::vector<Field>& fields) {
  std::vector<std::string> out;
  for (const Field& f : fields) out.push_back(f.text);
  return out;
}

const Field& fieldNamed(const std::vector<Field>& fields, const std::string& name) {
  static const Field missing{"(missing)", CMPI_null, "", 0};
  for (const Field& f : fields)
    if (f.name == name) return f;
  ADD_FAILURE() << "no field " << name;
  return missing;
}

// The object manager's broker with its trace function replaced by a
// recorder: a request's traces are recorded by the object manager itself,
// but calls made outside a request need their own witness.
class TraceRecordingBroker {
public:
  explicit TraceRecordingBroker(const CMPIBroker* real) : broker_(*real), encFT_(*real->eft) {
    encFT_.trace = &TraceRecordingBroker::record;
    broker_.eft = &encFT_;
    recorder() = this;
  }
  ~TraceRecordingBroker() { recorder() = nullptr; }
  TraceRecordingBroker(const TraceRecordingBroker&) = delete;
  TraceRecordingBroker& operator=(const TraceRecordingBroker&) = delete;

  const CMPIBroker* get() const { return &broker_; }
  const std::vector<std::string>& texts() const { return texts_; }

private:
  static TraceRecordingBroker*& recorder() {
    static TraceRecordingBroker* current = nullptr;
    return current;
  }
  static CMPIStatus record(const CMPIBroker*, int level, const char* component, const char* text,
                           const CMPIString*) {
    if (TraceRecordingBroker* self = recorder())
      self->texts_.push_back(std::to_string(level) + " " + (component ? component : "(null)") + ": " +
                             (text ? text : "(null)"));
    CMReturn(CMPI_RC_OK);
  }

  CMPIBroker broker_;
  CMPIBrokerEncFT encFT_;
  std::vector<std::string> texts_;
};

class IDEFactoryFunctionsTest : public ::testing::Test {
protected:
  void SetUp() override { harness.useTree(kIDEAndRaid); }

  const CMPIBroker* broker() { return harness.om().broker(); }

  CMPIObjectPath* ref(const char* className = "TVRHX_IDEController") {
    return CMNewObjectPath(broker(), "root/cimv2", className, nullptr);
  }

  ProviderHarness harness;
  CMPIStatus rc = {CMPI_RC_OK, nullptr};
};

TEST_F(IDEFactoryFunctionsTest, ControllerPathListGivesEveryNodeAPath) {
  std::vector<CMPIObjectPath*> paths;
  EXPECT_EQ(factory::getAllIDEDiskControllerCOP(broker(), nullptr, ref(), paths, &rc), 0);
  ASSERT_EQ(paths.size(), 2u);
  for (const CMPIObjectPath* path : paths) {
    EXPECT_EQ(text(path->ft->getClassName(path, nullptr)), "TVRHX_IDEController");
    EXPECT_EQ(text(path->ft->getNameSpace(path, nullptr)), "root/cimv2");
    EXPECT_EQ(text(path->ft->getHostname(path, nullptr)), "blade.example.com");
    EXPECT_THAT(namesOf(keysOf(path)),
                ElementsAre("DeviceID", "CreationClassName", "SystemCreationClassName", "SystemName"));
  }
  EXPECT_THAT(textsOf(keysOf(paths[0])),
              ElementsAre("/0000:00:1f.2", "TVRHX_IDEController", "TVRHX_ComputerSystem", "blade.example.com"));
  EXPECT_EQ(fieldNamed(keysOf(paths[1]), "DeviceID").text, "/0000:18:00.0");
  EXPECT_EQ(rc.rc, CMPI_RC_OK);
}

TEST_F(IDEFactoryFunctionsTest, ChipPathListGivesEveryNodeAPath) {
  std::vector<CMPIObjectPath*> paths;
  EXPECT_EQ(factory::getAllIDEChipCOP(broker(), nullptr, ref("TVRHX_ChipIDECont"), paths, &rc), 0);
  ASSERT_EQ(paths.size(), 2u);
  EXPECT_EQ(text(paths[0]->ft->getClassName(paths[0], nullptr)), "TVRHX_ChipIDECont");
  EXPECT_EQ(text(paths[0]->ft->getHostname(paths[0], nullptr)), "blade.example.com");
  EXPECT_THAT(namesOf(keysOf(paths[0])), ElementsAre("Tag", "CreationClassName"));
  EXPECT_THAT(textsOf(keysOf(paths[0])), ElementsAre("/0000:00:1f.2", "TVRHX_ChipIDECont"));
  EXPECT_THAT(textsOf(keysOf(paths[1])), ElementsAre("/0000:18:00.0", "TVRHX_ChipIDECont"));
}

TEST_F(IDEFactoryFunctionsTest, ControllerInstanceListKeepsOnlyQualifyingNodes) {
  std::vector<CMPIInstance*> instances;
  EXPECT_EQ(factory::getAllIDEControllerInstances(broker(), nullptr, ref(), nullptr, instances, &rc), 0);
  ASSERT_EQ(instances.size(), 1u);
  const std::vector<Field> properties = propertiesOf(instances[0]);
  EXPECT_THAT(namesOf(properties),
              ElementsAre("DeviceID", "CreationClassName", "SystemCreationClassName", "SystemName", "EnabledState",
                          "ProtocolSupported", "MaxNumberControlled", "Description", "OtherIdentifyingInfo"));
  EXPECT_EQ(fieldNamed(properties, "DeviceID").text, "/0000:00:1f.2");
  EXPECT_EQ(fieldNamed(properties, "EnabledState").number, 3u);
  EXPECT_EQ(fieldNamed(properties, "ProtocolSupported").number, 36u);
  EXPECT_EQ(fieldNamed(properties, "MaxNumberControlled").type, CMPI_uint32);
  EXPECT_EQ(fieldNamed(properties, "MaxNumberControlled").number, 2u);
}

TEST_F(IDEFactoryFunctionsTest, ChipInstanceListKeepsOnlyQualifyingNodes) {
  std::vector<CMPIInstance*> instances;
  EXPECT_EQ(factory::getAllIDEChipControllerInstances(broker(), nullptr, ref("TVRHX_ChipIDECont"), nullptr,
                                                      instances, &rc),
            0);
  ASSERT_EQ(instances.size(), 1u);
  const std::vector<Field> properties = propertiesOf(instances[0]);
  EXPECT_THAT(namesOf(properties), ElementsAre("Tag", "CreationClassName", "FormFactor", "HotSwappable",
                                               "Removable", "Replaceable", "Description", "OtherIdentifyingInfo"));
  EXPECT_EQ(fieldNamed(properties, "FormFactor").number, 5u);
  EXPECT_EQ(fieldNamed(properties, "HotSwappable").type, CMPI_boolean);
  EXPECT_EQ(fieldNamed(properties, "HotSwappable").number, 0u);
}

TEST_F(IDEFactoryFunctionsTest, InstanceListsBuildTheirClassWhateverClassTheReferenceNames) {
  std::vector<CMPIInstance*> controllers;
  std::vector<CMPIInstance*> chips;
  factory::getAllIDEControllerInstances(broker(), nullptr, ref("CIM_Anything"), nullptr, controllers, &rc);
  factory::getAllIDEChipControllerInstances(broker(), nullptr, ref("TVRHX_DiskController"), nullptr, chips, &rc);
  ASSERT_EQ(controllers.size(), 1u);
  ASSERT_EQ(chips.size(), 1u);
  const CMPIObjectPath* controllerPath = controllers[0]->ft->getObjectPath(controllers[0], nullptr);
  const CMPIObjectPath* chipPath = chips[0]->ft->getObjectPath(chips[0], nullptr);
  EXPECT_EQ(text(controllerPath->ft->getClassName(controllerPath, nullptr)), "TVRHX_IDEController");
  EXPECT_EQ(text(chipPath->ft->getClassName(chipPath, nullptr)), "TVRHX_ChipIDECont");
}

TEST_F(IDEFactoryFunctionsTest, ListsEmptyWhatTheCallerPassedIn) {
  std::vector<CMPIObjectPath*> paths(3, nullptr);
  std::vector<CMPIInstance*> instances(3, nullptr);
  factory::getAllIDEChipCOP(broker(), nullptr, ref(), paths, &rc);
  factory::getAllIDEControllerInstances(broker(), nullptr, ref(), nullptr, instances, &rc);
  EXPECT_EQ(paths.size(), 2u);
  EXPECT_EQ(instances.size(), 1u);
  EXPECT_NE(paths[0], nullptr);
  EXPECT_NE(instances[0], nullptr);
}

TEST_F(IDEFactoryFunctionsTest, PathListSendsOneTraceForEachNodeAndOneAtTheEnd) {
  TraceRecordingBroker recording(broker());
  std::vector<CMPIObjectPath*> paths;
  factory::getAllIDEDiskControllerCOP(recording.get(), nullptr, ref(), paths, &rc);
  EXPECT_EQ(paths.size(), 2u);
  EXPECT_THAT(recording.texts(), ElementsAre("1 PhysicalAssetProvider: *** Returning COPs of DiskController ***",
                                             "1 PhysicalAssetProvider: *** Returning COPs of DiskController ***",
                                             "1 PhysicalAssetProvider: *** Returning COPs of DiskController ***"));
}

TEST_F(IDEFactoryFunctionsTest, ChipPathListSendsTheSameTraces) {
  TraceRecordingBroker recording(broker());
  std::vector<CMPIObjectPath*> paths;
  factory::getAllIDEChipCOP(recording.get(), nullptr, ref(), paths, &rc);
  EXPECT_EQ(recording.texts().size(), 3u);
  for (const std::string& line : recording.texts())
    EXPECT_EQ(line, "1 PhysicalAssetProvider: *** Returning COPs of DiskController ***");
}

TEST_F(IDEFactoryFunctionsTest, InstanceListsTraceEachKeptInstanceAsAChipController) {
  for (auto list : {factory::getAllIDEControllerInstances, factory::getAllIDEChipControllerInstances}) {
    TraceRecordingBroker recording(broker());
    std::vector<CMPIInstance*> instances;
    list(recording.get(), nullptr, ref(), nullptr, instances, &rc);
    EXPECT_THAT(recording.texts(),
                ElementsAre("1 PhysicalAssetProvider: *** Returning COPs of DiskController ***",
                            "1 PhysicalAssetProvider: *** Returning an instance of IDEController ***",
                            "1 PhysicalAssetProvider: *** Returning an instance of IDEChipController ***"));
  }
}

TEST_F(IDEFactoryFunctionsTest, PathListRetriesTheSameNodeWhilePathsCannotBeMade) {
  std::vector<CMPIObjectPath*> paths;
  CMPIObjectPath* reference = ref();
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  harness.om().faults().failNext(Fault::NewObjectPath, 2);
  factory::getAllIDEDiskControllerCOP(broker(), nullptr, reference, paths, &rc);
  ASSERT_EQ(paths.size(), 2u);
  EXPECT_EQ(fieldNamed(keysOf(paths[0]), "DeviceID").text, "/0000:00:1f.2");
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 4u);
}

TEST_F(IDEFactoryFunctionsTest, FailedPathLeavesTheOutArgumentAndStillTraces) {
  TraceRecordingBroker recording(broker());
  CMPIObjectPath* reference = ref();
  DiskController dc;
  CMPIObjectPath* sentinel = reference;
  CMPIObjectPath* path = sentinel;
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  EXPECT_EQ(factory::getIDEDiskControllerCOP(recording.get(), reference, dc, &rc, &path), 0);
  EXPECT_EQ(path, sentinel);
  harness.om().faults().failNext(Fault::NewObjectPath, 1);
  EXPECT_EQ(factory::getIDEChipCOP(recording.get(), reference, dc, &rc, &path), 0);
  EXPECT_EQ(path, sentinel);
  EXPECT_EQ(recording.texts().size(), 2u);
}

TEST_F(IDEFactoryFunctionsTest, NodeThatDoesNotQualifyGivesNoInstanceAndBuildsNoPath) {
  DiskController dc;
  ++dc; // the RAID controller
  ASSERT_TRUE(static_cast<bool>(dc));
  CMPIObjectPath* reference = ref();
  const auto before = harness.om().faults().calls(Fault::NewObjectPath);
  EXPECT_EQ(factory::makeIDEDiskControllerInstance(broker(), reference, dc, nullptr, &rc), nullptr);
  EXPECT_EQ(factory::makeIDEChipControllerInstance(broker(), reference, dc, nullptr, &rc), nullptr);
  EXPECT_EQ(harness.om().faults().calls(Fault::NewObjectPath) - before, 0u);
}

TEST_F(IDEFactoryFunctionsTest, NullBrokerMakesNoPathAndNoInstance) {
  DiskController dc;
  CMPIObjectPath* path = nullptr;
  EXPECT_EQ(factory::getIDEDiskControllerCOP(nullptr, ref(), dc, &rc, &path), 0);
  EXPECT_EQ(path, nullptr);
  EXPECT_EQ(factory::makeIDEChipControllerInstance(nullptr, ref(), dc, nullptr, &rc), nullptr);
  std::vector<CMPIInstance*> instances;
  EXPECT_EQ(factory::getAllIDEControllerInstances(nullptr, nullptr, ref(), nullptr, instances, &rc), 0);
  EXPECT_THAT(instances, IsEmpty());
}

TEST_F(IDEFactoryFunctionsTest, PathListsWriteEnteringOnly) {
  LoggerCapture capture;
  std::vector<CMPIObjectPath*> paths;
  factory::getAllIDEChipCOP(broker(), nullptr, ref(), paths, &rc);
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == KVLog::Channel::Log)
      functions.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  EXPECT_THAT(functions, ElementsAre("getAllIDEChipCOP in", "getIDEChipCOP in", "getIDEChipCOP in"));
  for (const LoggedLine& line : capture.lines()) EXPECT_EQ(line.category, "Korvane.PhysicalAssetObjFactory");
}

TEST_F(IDEFactoryFunctionsTest, InstanceListsWriteEnteringAndExiting) {
  LoggerCapture capture;
  std::vector<CMPIInstance*> instances;
  factory::getAllIDEControllerInstances(broker(), nullptr, ref(), nullptr, instances, &rc);
  std::vector<std::string> functions;
  for (const LoggedLine& line : capture.lines())
    if (line.channel == KVLog::Channel::Log)
      functions.push_back(line.function + (line.text.rfind("ENTERING", 0) == 0 ? " in" : " out"));
  EXPECT_THAT(functions, ElementsAre("getAllIDEControllerInstances in", "makeIDEDiskControllerInstance in",
                                     "getIDEDiskControllerCOP in", "makeIDEDiskControllerInstance out",
                                     "makeIDEDiskControllerInstance in", "makeIDEDiskControllerInstance out",
                                     "getAllIDEControllerInstances out"));
  const std::vector<std::string> texts = capture.texts(KVLog::Channel::Log);
  ASSERT_FALSE(texts.empty());
  EXPECT_NE(texts[0].find(",Parameters List:  broker=0x"), std::string::npos) << texts[0];
  EXPECT_NE(texts[0].find(" context=0 ref=0x"), std::string::npos) << texts[0];
  EXPECT_NE(texts[0].find(" properties=0 instances=0x"), std::string::npos) << texts[0];
}

} // namespace
} // namespace tvr::test
