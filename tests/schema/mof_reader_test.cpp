// The MOF reader: declarations, qualifiers, keys, includes and errors.
#include "tvr/broker/Mof.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <sys/stat.h>

#include <cstdio>
#include <fstream>

namespace tvr::broker {
namespace {

using ::testing::ElementsAre;

MofSchema read(const std::string& text) {
  MofError error;
  auto schema = MofSchema::parse(text, "test.mof", &error);
  EXPECT_TRUE(schema.has_value()) << error.str();
  return schema ? *schema : MofSchema{};
}

std::string errorOf(const std::string& text) {
  MofError error;
  EXPECT_FALSE(MofSchema::parse(text, "bad.mof", &error).has_value());
  return error.str();
}

TEST(MofReaderTest, ClassWithSuperclassQualifiersAndProperties) {
  MofSchema s = read(R"(
    // a comment
    [Description ("A thing." " Two parts."), Version ("1.0")]
    class Test_Thing : CIM_Thing
    {
          [Key, Override ("Tag"), MaxLen (256)]
       string Tag;
       uint16 Numbers[];
       uint32 Fixed[4] = {1, 2, 3, 4};
       boolean On = TRUE;
       uint32 Reset([IN] uint16 How, [IN (false), OUT] CIM_Job REF Job);
    };)");
  ASSERT_EQ(s.classes().size(), 1u);
  const MofClass& c = s.classes()[0];
  EXPECT_EQ(c.name, "Test_Thing");
  EXPECT_EQ(c.superclass, "CIM_Thing");
  EXPECT_EQ(c.line, 4);
  EXPECT_TRUE(c.hasQualifier("description"));
  ASSERT_EQ(c.properties.size(), 4u);
  EXPECT_EQ(c.properties[0].name, "Tag");
  EXPECT_EQ(c.properties[0].type, "string");
  EXPECT_TRUE(c.properties[0].isKey());
  EXPECT_TRUE(c.properties[1].array);
  EXPECT_EQ(c.properties[1].type, "uint16");
  EXPECT_TRUE(c.properties[2].array);
  EXPECT_FALSE(c.properties[3].isKey());
  ASSERT_EQ(c.methods.size(), 1u);
  EXPECT_EQ(c.methods[0].name, "Reset");
}

TEST(MofReaderTest, DescriptionPartsAreJoined) {
  MofSchema s = read(R"([Description ("One" " two")] class A { };)");
  ASSERT_EQ(s.classes()[0].qualifiers.size(), 1u);
  EXPECT_THAT(s.classes()[0].qualifiers[0].values, ElementsAre("One two"));
}

TEST(MofReaderTest, AssociationWithReferences) {
  MofSchema s = read(R"(
    [Association] class Test_Link {
      [Key] Test_A REF Antecedent;
      [Key] Test_B REF Dependent;
    };)");
  const MofClass& c = s.classes()[0];
  EXPECT_TRUE(c.isAssociation());
  EXPECT_EQ(c.properties[0].type, "ref");
  EXPECT_EQ(c.properties[0].refClass, "Test_A");
  EXPECT_THAT(s.keysOf("Test_Link"), ElementsAre("Antecedent", "Dependent"));
}

TEST(MofReaderTest, KeysAreInheritedFromTheRootDown) {
  MofSchema s = read(R"(
    class Base { [Key] string CreationClassName; [Key] string Name; string Other; };
    class Middle : Base { string More; };
    class Leaf : Middle { [Key, Override ("Name")] string Name; [Key] string Extra; };)");
  EXPECT_THAT(s.keysOf("Leaf"), ElementsAre("CreationClassName", "Name", "Extra"));
  EXPECT_THAT(s.keysOf("leaf"), ElementsAre("CreationClassName", "Name", "Extra"));
  EXPECT_THAT(s.ancestry("Leaf"), ElementsAre("Leaf", "Middle", "Base"));
  EXPECT_EQ(s.findProperty("Leaf", "Other")->type, "string");
}

TEST(MofReaderTest, SuperclassOutsideTheSchemaLeavesOwnKeys) {
  MofSchema s = read(R"(class Leaf : CIM_Elsewhere { [Key] string Tag; };)");
  EXPECT_THAT(s.keysOf("Leaf"), ElementsAre("Tag"));
  EXPECT_TRUE(s.keysOf("Unknown").empty());
}

TEST(MofReaderTest, InstancesPragmasAndQualifierTypes) {
  MofSchema s = read(R"(
    #pragma locale ("en_US")
    #pragma namespace ("root/PG_InterOp")
    Qualifier Key : boolean = false, Scope (property, reference), Flavor (DisableOverride, ToSubclass);
    instance of PG_ProviderModule as $Module
    {
       Name = "TVR";
       InterfaceVersion = "2.0.0";
       Versions = {"1", "2"};
    };
    instance of PG_Provider { ProviderModuleName = $Module; };)");
  ASSERT_EQ(s.instances().size(), 2u);
  EXPECT_EQ(s.instances()[0].className, "PG_ProviderModule");
  ASSERT_EQ(s.instances()[0].values.size(), 3u);
  EXPECT_EQ(s.instances()[0].values[0].second, "TVR");
  EXPECT_EQ(s.instances()[0].values[2].second, "{1,2}");
  EXPECT_EQ(s.instances()[1].values[0].second, "$Module");
}

TEST(MofReaderTest, ClassDeclaredAgainReplacesTheFirst) {
  MofSchema s = read("class A { string X; };\nclass A { string Y; };");
  ASSERT_EQ(s.classes().size(), 1u);
  EXPECT_EQ(s.classes()[0].properties[0].name, "Y");
}

TEST(MofReaderTest, ErrorsNameFileLineAndProblem) {
  EXPECT_EQ(errorOf("class A {\n string X\n};"), "bad.mof:3: expected ';', found '}'");
  EXPECT_EQ(errorOf("class A { string \"X\"; };"), "bad.mof:1: expected a property name, found a string");
  EXPECT_EQ(errorOf("klass A { };"), "bad.mof:1: expected a class or instance declaration, found 'klass'");
  EXPECT_EQ(errorOf("class A {\n [Description (\"open\n] string X; };"), "bad.mof:2: unterminated string");
  EXPECT_EQ(errorOf("class A { string X; }"), "bad.mof:1: expected ';', found the end of the file");
  EXPECT_EQ(errorOf("\n/* never closed\nclass A { };"), "bad.mof:2: unterminated comment");
}

TEST(MofReaderTest, IncludesAreReadRelativeToTheIncludingFile) {
  char dir[] = "/tmp/tvr-mof-XXXXXX";
  ASSERT_NE(mkdtemp(dir), nullptr);
  const std::string top = std::string(dir) + "/top.mof";
  std::ofstream(top) << "#pragma include (\"part.mof\")\nclass Top : Part { };\n";
  std::ofstream(std::string(dir) + "/part.mof") << "class Part { [Key] string Id; };\n";
  MofError error;
  auto s = MofSchema::load(top, &error);
  ASSERT_TRUE(s) << error.str();
  EXPECT_THAT(s->keysOf("Top"), ElementsAre("Id"));
  std::remove((std::string(dir) + "/part.mof").c_str());
  std::remove(top.c_str());
  rmdir(dir);
}

TEST(MofReaderTest, MissingIncludeIsAnErrorAtItsLine) {
  char dir[] = "/tmp/tvr-mof-XXXXXX";
  ASSERT_NE(mkdtemp(dir), nullptr);
  const std::string top = std::string(dir) + "/top.mof";
  std::ofstream(top) << "\n#pragma include (\"absent.mof\")\n";
  MofError error;
  EXPECT_FALSE(MofSchema::load(top, &error));
  EXPECT_EQ(error.line, 2);
  EXPECT_NE(error.message.find("absent.mof"), std::string::npos);
  std::remove(top.c_str());
  rmdir(dir);
}

TEST(MofReaderTest, TheDmtfSchemaReadsWhole) {
  const std::string top = std::string(TVR_DMTF_SCHEMA_DIR) + "/cim_schema_2.41.0.mof";
  struct stat st {};
  if (stat(top.c_str(), &st) != 0) GTEST_SKIP() << "no DMTF schema beside the tree";
  MofError error;
  auto s = MofSchema::load(top, &error);
  ASSERT_TRUE(s) << error.str();
  EXPECT_GT(s->classes().size(), 1000u);
  EXPECT_THAT(s->keysOf("CIM_Chassis"), ElementsAre("Tag", "CreationClassName"));
  EXPECT_TRUE(s->find("CIM_PackageInSlot")->isAssociation());
}

TEST(MofReaderTest, TheProjectSchemaReads) {
  MofError error;
  auto s = MofSchema::load(std::string(TVR_SCHEMA_DIR) + "/TVRHX_PhysicalAsset.mof", &error);
  ASSERT_TRUE(s) << error.str();
  EXPECT_THAT(s->keysOf("TVRHX_Chassis"), ElementsAre("Tag", "CreationClassName"));
}

} // namespace
} // namespace tvr::broker
