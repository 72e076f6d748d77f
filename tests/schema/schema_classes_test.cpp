// TVRHX_PhysicalAsset.mof: the nineteen classes the providers serve, the DMTF
// class each specialises, exactly their keys, and the Association qualifier
// on exactly the association classes.
#include "SchemaFiles.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

namespace tvr::test {
namespace {

using ::testing::ElementsAreArray;
using ::testing::HasSubstr;

struct ClassContract {
  const char* name;
  const char* superclass;
  std::vector<std::string> keys; ///< in the order the providers add them to paths
  bool association;
};

// The classes the provider library serves, as object managers see them.
const std::vector<ClassContract>& contracts() {
  static const std::vector<ClassContract> classes = {
      {"TVRHX_Chassis", "CIM_Chassis", {"Tag", "CreationClassName"}, false},
      {"TVRHX_Slot", "CIM_Slot", {"Tag", "CreationClassName"}, false},
      {"TVRHX_Connector", "CIM_PhysicalConnector", {"Tag", "CreationClassName"}, false},
      {"TVRHX_NetworkCard", "CIM_Card", {"Tag", "CreationClassName"}, false},
      {"TVRHX_DiskController", "CIM_PhysicalPackage", {"Tag", "CreationClassName"}, false},
      {"TVRHX_IDEController",
       "CIM_IDEController",
       {"DeviceID", "CreationClassName", "SystemCreationClassName", "SystemName"},
       false},
      {"TVRHX_ChipIDECont", "CIM_Chip", {"Tag", "CreationClassName"}, false},
      {"TVRHX_SASPortController",
       "CIM_PortController",
       {"SystemCreationClassName", "CreationClassName", "SystemName", "DeviceID"},
       false},
      {"TVRHX_PackageInSlot", "CIM_PackageInSlot", {"Antecedent", "Dependent"}, true},
      {"TVRHX_SlotOnChassis", "CIM_Container", {"GroupComponent", "PartComponent"}, true},
      {"TVRHX_ConnectorOnPackage", "CIM_ConnectorOnPackage", {"GroupComponent", "PartComponent"}, true},
      {"TVRHX_ConnectedTo", "CIM_ConnectedTo", {"Antecedent", "Dependent"}, true},
      {"TVRHX_UnitaryComputerSystemPackage", "CIM_ComputerSystemPackage", {"Antecedent", "Dependent"}, true},
      {"TVRHX_CardCSPackage", "CIM_ComputerSystemPackage", {"Antecedent", "Dependent"}, true},
      {"TVRHX_NPRealizesNC", "CIM_Realizes", {"Antecedent", "Dependent"}, true},
      {"TVRHX_DiskControllerCSPackage", "CIM_ComputerSystemPackage", {"Antecedent", "Dependent"}, true},
      {"TVRHX_ChipSystemPackaging", "CIM_SystemPackaging", {"Antecedent", "Dependent"}, true},
      {"TVRHX_SASPortRealizesDisk", "CIM_Realizes", {"Antecedent", "Dependent"}, true},
      {"TVRHX_ICRealizesChip", "CIM_Realizes", {"Antecedent", "Dependent"}, true},
  };
  return classes;
}

TEST(SchemaClassesTest, DeclaresExactlyTheNineteenServedClassesInOrder) {
  std::vector<std::string> declared;
  for (const broker::MofClass& c : projectSchema().classes()) declared.push_back(c.name);
  std::vector<std::string> served;
  for (const ClassContract& c : contracts()) served.push_back(c.name);
  EXPECT_THAT(declared, ElementsAreArray(served));
}

TEST(SchemaClassesTest, EachClassSpecialisesItsDmtfClass) {
  for (const ClassContract& contract : contracts()) {
    const broker::MofClass* c = projectSchema().find(contract.name);
    ASSERT_NE(c, nullptr) << contract.name;
    EXPECT_EQ(c->superclass, contract.superclass) << contract.name;
  }
}

TEST(SchemaClassesTest, KeysAreExactlyThoseOnThePathsInPathOrder) {
  for (const ClassContract& contract : contracts())
    EXPECT_THAT(projectSchema().keysOf(contract.name), ElementsAreArray(contract.keys)) << contract.name;
}

TEST(SchemaClassesTest, AssociationQualifierIsOnExactlyTheAssociationClasses) {
  for (const ClassContract& contract : contracts()) {
    const broker::MofClass* c = projectSchema().find(contract.name);
    ASSERT_NE(c, nullptr) << contract.name;
    EXPECT_EQ(c->isAssociation(), contract.association) << contract.name;
  }
}

TEST(SchemaClassesTest, AssociationsDeclareTheirEndsAsReferencesToTheServedClasses) {
  for (const ClassContract& contract : contracts()) {
    if (!contract.association) continue;
    for (const std::string& end : contract.keys) {
      const broker::MofProperty* p = projectSchema().find(contract.name)->property(end);
      ASSERT_NE(p, nullptr) << contract.name << "." << end;
      EXPECT_EQ(p->type, "ref") << contract.name << "." << end;
      EXPECT_FALSE(p->refClass.empty()) << contract.name << "." << end;
    }
  }
}

TEST(SchemaClassesTest, HeaderNamesTheCimSchemaVersionItNeeds) {
  std::ifstream in(projectSchemaFile());
  std::stringstream text;
  text << in.rdbuf();
  EXPECT_THAT(text.str().substr(0, text.str().find("#pragma")), HasSubstr("DMTF CIM Schema 2.41.0"));
}

} // namespace
} // namespace tvr::test
