// TVRHX_PhysicalAsset.mof read against the DMTF CIM Schema 2.41.0: every
// superclass is a DMTF class, every redeclared property is the DMTF property
// of the same type, references narrow only to subclasses, and only qualifiers
// the DMTF declares are used. Object managers refuse a class file that breaks
// any of these.
#include "SchemaFiles.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <set>

namespace tvr::test {
namespace {

using broker::MofClass;
using broker::MofProperty;
using broker::MofQualifier;

class SchemaAgainstDmtfTest : public ::testing::Test {
protected:
  void SetUp() override {
    if (!dmtfSchema()) GTEST_SKIP() << "no DMTF CIM schema beside the source tree";
  }

  const broker::MofSchema& dmtf() const { return *dmtfSchema(); }
  const broker::MofSchema& combined() const { return *combinedSchema(); }

  /// The property of the same name the class inherits from its DMTF superclass.
  const MofProperty* inherited(const MofClass& c, const std::string& property) const {
    return dmtf().findProperty(c.superclass, property);
  }

  bool isSameOrSubclass(const std::string& derived, const std::string& base) const {
    for (const std::string& ancestor : combined().ancestry(derived))
      if (lowerCase(ancestor) == lowerCase(base)) return true;
    return false;
  }
};

std::set<std::string> lowerCased(const std::vector<std::string>& names) {
  std::set<std::string> out;
  for (const std::string& n : names) out.insert(lowerCase(n));
  return out;
}

const MofQualifier* qualifier(const MofProperty& p, const std::string& name) {
  for (const MofQualifier& q : p.qualifiers)
    if (lowerCase(q.name) == lowerCase(name)) return &q;
  return nullptr;
}

std::string typeText(const MofProperty& p) { return p.type + (p.array ? "[]" : ""); }

TEST_F(SchemaAgainstDmtfTest, EverySuperclassIsADmtfClass) {
  for (const MofClass& c : projectSchema().classes())
    EXPECT_NE(dmtf().find(c.superclass), nullptr) << c.name << " : " << c.superclass;
}

TEST_F(SchemaAgainstDmtfTest, KeysAreTheKeysOfTheDmtfSuperclass) {
  for (const MofClass& c : projectSchema().classes())
    EXPECT_EQ(lowerCased(projectSchema().keysOf(c.name)), lowerCased(dmtf().keysOf(c.superclass))) << c.name;
}

TEST_F(SchemaAgainstDmtfTest, EveryOverriddenPropertyIsInheritedWithTheSameType) {
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofProperty& p : c.properties) {
      if (!qualifier(p, "Override")) continue;
      const MofProperty* parent = inherited(c, p.name);
      ASSERT_NE(parent, nullptr) << c.name << "." << p.name << " overrides nothing";
      EXPECT_EQ(typeText(p), typeText(*parent)) << c.name << "." << p.name;
    }
  }
}

TEST_F(SchemaAgainstDmtfTest, PropertiesWithoutOverrideAreNewToTheClassChain) {
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofProperty& p : c.properties) {
      if (qualifier(p, "Override")) continue;
      EXPECT_EQ(inherited(c, p.name), nullptr) << c.name << "." << p.name << " hides an inherited property";
    }
  }
}

TEST_F(SchemaAgainstDmtfTest, OverrideNamesThePropertyItRedeclares) {
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofProperty& p : c.properties) {
      const MofQualifier* q = qualifier(p, "Override");
      if (!q) continue;
      EXPECT_THAT(q->values, ::testing::ElementsAre(p.name)) << c.name << "." << p.name;
    }
  }
}

TEST_F(SchemaAgainstDmtfTest, ReferencesToServedClassesNarrowTheInheritedReference) {
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofProperty& p : c.properties) {
      if (p.type != "ref" || !projectSchema().find(p.refClass)) continue;
      const MofProperty* parent = inherited(c, p.name);
      ASSERT_NE(parent, nullptr) << c.name << "." << p.name;
      EXPECT_TRUE(isSameOrSubclass(p.refClass, parent->refClass))
          << c.name << "." << p.name << ": " << p.refClass << " is no " << parent->refClass;
    }
  }
}

TEST_F(SchemaAgainstDmtfTest, OtherReferencesNameOnlyTheCompanionClasses) {
  std::set<std::string> elsewhere;
  for (const MofClass& c : projectSchema().classes())
    for (const MofProperty& p : c.properties)
      if (p.type == "ref" && !projectSchema().find(p.refClass)) elsewhere.insert(p.refClass);
  EXPECT_EQ(elsewhere, (std::set<std::string>{"TVRHX_ComputerSystem", "TVRHX_NetworkPort"}));
}

TEST_F(SchemaAgainstDmtfTest, CompanionClassesNarrowTheReferencesToThem) {
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofProperty& p : c.properties) {
      if (p.type != "ref" || projectSchema().find(p.refClass)) continue;
      ASSERT_NE(companionSchema()->find(p.refClass), nullptr) << p.refClass << " is not in TVRHX_Companion.mof";
      const MofProperty* parent = inherited(c, p.name);
      ASSERT_NE(parent, nullptr) << c.name << "." << p.name;
      EXPECT_TRUE(isSameOrSubclass(p.refClass, parent->refClass))
          << c.name << "." << p.name << ": " << p.refClass << " is no " << parent->refClass;
    }
  }
}

TEST_F(SchemaAgainstDmtfTest, EveryQualifierUsedIsDeclaredByTheDmtf) {
  ASSERT_FALSE(dmtfQualifierNames().empty());
  for (const MofClass& c : projectSchema().classes()) {
    for (const MofQualifier& q : c.qualifiers)
      EXPECT_EQ(dmtfQualifierNames().count(lowerCase(q.name)), 1u) << c.name << ": " << q.name;
    for (const MofProperty& p : c.properties)
      for (const MofQualifier& q : p.qualifiers)
        EXPECT_EQ(dmtfQualifierNames().count(lowerCase(q.name)), 1u) << c.name << "." << p.name << ": " << q.name;
  }
}

} // namespace
} // namespace tvr::test
