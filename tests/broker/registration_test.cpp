// Reading provider registration files into the registration table.
#include "tvr/broker/Registration.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <string>

namespace tvr::broker {
namespace {

std::optional<RegistrationTable> parse(const std::string& text, std::string* error = nullptr) {
  std::string ignored;
  return RegistrationTable::parse(text, "test.reg", error ? error : &ignored);
}

ClassRegistration instanceClass(const std::string& className, const std::string& provider) {
  ClassRegistration reg;
  reg.className = className;
  reg.provider = provider;
  reg.location = "l";
  reg.instance = true;
  return reg;
}

std::string errorOf(const std::string& text) {
  std::string error;
  EXPECT_FALSE(parse(text, &error).has_value()) << text;
  return error;
}

constexpr const char* kChassis = R"([TVRHX_Chassis]
   provider: ChassisProvider
   location: tvrkvphysicalassetprofileprovider
   type: instance
   namespace: root/cimv2
)";

TEST(RegistrationParse, ReadsOneSectionWithEveryField) {
  std::optional<RegistrationTable> table = parse(kChassis);
  ASSERT_TRUE(table);
  ASSERT_EQ(table->classes().size(), 1u);
  const ClassRegistration& reg = table->classes()[0];
  EXPECT_EQ(reg.className, "TVRHX_Chassis");
  EXPECT_EQ(reg.provider, "ChassisProvider");
  EXPECT_EQ(reg.location, "tvrkvphysicalassetprofileprovider");
  EXPECT_TRUE(reg.instance);
  EXPECT_FALSE(reg.association);
  EXPECT_FALSE(reg.method);
  EXPECT_FALSE(reg.indication);
  EXPECT_EQ(reg.namespaces, std::vector<std::string>{"root/cimv2"});
  EXPECT_EQ(reg.line, 1);
}

TEST(RegistrationParse, SkipsCommentsAndBlankLinesAndCountsThemInLineNumbers) {
  std::optional<RegistrationTable> table = parse("# staged by the installer\n"
                                                 "\n"
                                                 "   # indented comment\n"
                                                 "[A]\n"
                                                 "# between entries\n"
                                                 "provider: P\n"
                                                 "location: l\n"
                                                 "type: instance\n");
  ASSERT_TRUE(table);
  ASSERT_EQ(table->classes().size(), 1u);
  EXPECT_EQ(table->classes()[0].line, 4);
  EXPECT_EQ(table->classes()[0].provider, "P");
}

TEST(RegistrationParse, KeepsSectionsInFileOrder) {
  std::optional<RegistrationTable> table = parse("[B]\nprovider: PB\nlocation: l\ntype: instance\n"
                                                 "[A]\nprovider: PA\nlocation: l\ntype: instance\n"
                                                 "[C]\nprovider: PC\nlocation: l\ntype: association\n");
  ASSERT_TRUE(table);
  ASSERT_EQ(table->classes().size(), 3u);
  EXPECT_EQ(table->classes()[0].className, "B");
  EXPECT_EQ(table->classes()[1].className, "A");
  EXPECT_EQ(table->classes()[2].className, "C");
  EXPECT_EQ(table->classes()[2].line, 9);
}

TEST(RegistrationParse, ReadsSeveralNamespacesOnOneLineAndOnSeveralLines) {
  std::optional<RegistrationTable> table = parse("[A]\nprovider: P\nlocation: l\ntype: instance\n"
                                                 "namespace: root/cimv2   root/interop\n"
                                                 "namespace:\troot/tvr\n");
  ASSERT_TRUE(table);
  EXPECT_EQ(table->classes()[0].namespaces,
            (std::vector<std::string>{"root/cimv2", "root/interop", "root/tvr"}));
}

TEST(RegistrationParse, DefaultsToRootCimv2WithoutANamespaceLine) {
  std::optional<RegistrationTable> table = parse("[A]\nprovider: P\nlocation: l\ntype: instance\n");
  ASSERT_TRUE(table);
  EXPECT_EQ(table->classes()[0].namespaces, std::vector<std::string>{"root/cimv2"});
}

TEST(RegistrationParse, ReadsSeveralKindsOnTheTypeLine) {
  std::optional<RegistrationTable> table =
      parse("[A]\nprovider: P\nlocation: l\ntype: instance association\n"
            "[B]\nprovider: P\nlocation: l\ntype: method indication\n");
  ASSERT_TRUE(table);
  const ClassRegistration& a = table->classes()[0];
  EXPECT_TRUE(a.instance);
  EXPECT_TRUE(a.association);
  EXPECT_FALSE(a.method);
  EXPECT_FALSE(a.indication);
  const ClassRegistration& b = table->classes()[1];
  EXPECT_FALSE(b.instance);
  EXPECT_FALSE(b.association);
  EXPECT_TRUE(b.method);
  EXPECT_TRUE(b.indication);
}

TEST(RegistrationParse, AcceptsProcessSettingsWithoutUsingThem) {
  std::optional<RegistrationTable> table =
      parse("[A]\nprovider: P\nlocation: l\ntype: instance\nunload: never\ngroup: tvr\nuser: root\n"
            "parameters: -v\n");
  ASSERT_TRUE(table);
  EXPECT_EQ(table->classes()[0].provider, "P");
}

TEST(RegistrationParse, TrimsBlanksAndCarriageReturns) {
  std::optional<RegistrationTable> table =
      parse("[ A ]\r\n  provider :  P  \r\n\tlocation:\tl\t\r\n type: instance \r\n");
  ASSERT_TRUE(table);
  const ClassRegistration& reg = table->classes()[0];
  EXPECT_EQ(reg.className, "A");
  EXPECT_EQ(reg.provider, "P");
  EXPECT_EQ(reg.location, "l");
  EXPECT_TRUE(reg.instance);
}

TEST(RegistrationParse, ALaterSectionForTheSameClassReplacesTheEarlierOne) {
  std::optional<RegistrationTable> table = parse("[A]\nprovider: First\nlocation: l\ntype: instance\n"
                                                 "[B]\nprovider: P\nlocation: l\ntype: instance\n"
                                                 "[a]\nprovider: Second\nlocation: l\ntype: instance\n");
  ASSERT_TRUE(table);
  ASSERT_EQ(table->classes().size(), 2u);
  EXPECT_EQ(table->classes()[0].provider, "Second");
  EXPECT_EQ(table->classes()[1].className, "B");
}

TEST(RegistrationParse, ReadsAnEmptyFileAsAnEmptyTable) {
  std::optional<RegistrationTable> table = parse("# nothing staged yet\n");
  ASSERT_TRUE(table);
  EXPECT_TRUE(table->classes().empty());
}

TEST(RegistrationErrors, UnknownKeyNamesTheKeyAndItsLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation: l\nflavour: sweet\ntype: instance\n"),
            "test.reg:4: unknown key 'flavour'");
}

TEST(RegistrationErrors, KeysAreCaseSensitive) {
  EXPECT_EQ(errorOf("[A]\nProvider: P\n"), "test.reg:2: unknown key 'Provider'");
}

TEST(RegistrationErrors, EntryOutsideASectionNamesItsLine) {
  EXPECT_EQ(errorOf("# header comment\nprovider: P\n[A]\n"), "test.reg:2: entry outside of a [class] section");
}

TEST(RegistrationErrors, LineWithoutColonNamesItsLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation l\n"), "test.reg:3: expected 'key: value'");
}

TEST(RegistrationErrors, MissingProviderNamesTheSectionLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation: l\ntype: instance\n\n[B]\nlocation: l\ntype: instance\n"),
            "test.reg:6: section [B] has no provider");
}

TEST(RegistrationErrors, MissingLocationNamesTheSectionLine) {
  EXPECT_EQ(errorOf("\n[A]\nprovider: P\ntype: instance\n"), "test.reg:2: section [A] has no location");
}

TEST(RegistrationErrors, EmptyLocationCountsAsMissing) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation:\ntype: instance\n"), "test.reg:1: section [A] has no location");
}

TEST(RegistrationErrors, MissingTypeNamesTheSectionLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation: l\n[B]\nprovider: P\nlocation: l\ntype: instance\n"),
            "test.reg:1: section [A] has no type");
}

TEST(RegistrationErrors, HeaderWithoutClosingBracketNamesItsLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation: l\ntype: instance\n[B\n"), "test.reg:5: malformed section header");
}

TEST(RegistrationErrors, EmptyHeaderNamesItsLine) {
  EXPECT_EQ(errorOf("[]\n"), "test.reg:1: malformed section header");
}

TEST(RegistrationErrors, UnknownTypeNamesTheKindAndItsLine) {
  EXPECT_EQ(errorOf("[A]\nprovider: P\nlocation: l\ntype: instance property\n"),
            "test.reg:4: unknown provider type 'property'");
}

TEST(RegistrationErrors, ErrorNamesTheOriginGiven) {
  std::string error;
  EXPECT_FALSE(RegistrationTable::parse("[A\n", "/etc/tvr/providers.reg", &error));
  EXPECT_EQ(error, "/etc/tvr/providers.reg:1: malformed section header");
}

TEST(RegistrationLookup, FindsAClassWithoutRegardToCase) {
  std::optional<RegistrationTable> table = parse(kChassis);
  ASSERT_TRUE(table);
  const ClassRegistration* found = table->find("tvrhx_CHASSIS");
  ASSERT_NE(found, nullptr);
  EXPECT_EQ(found->className, "TVRHX_Chassis");
}

TEST(RegistrationLookup, FindsNothingForAnUnknownOrLongerName) {
  std::optional<RegistrationTable> table = parse(kChassis);
  ASSERT_TRUE(table);
  EXPECT_EQ(table->find("TVRHX_Chassis2"), nullptr);
  EXPECT_EQ(table->find("TVRHX_Chassi"), nullptr);
  EXPECT_EQ(table->find(""), nullptr);
}

TEST(RegistrationLookup, AssociationClassesAreThoseListingTheKindInFileOrder) {
  std::optional<RegistrationTable> table =
      parse("[Assoc2]\nprovider: P\nlocation: l\ntype: association\n"
            "[Plain]\nprovider: P\nlocation: l\ntype: instance\n"
            "[Both]\nprovider: P\nlocation: l\ntype: instance association\n");
  ASSERT_TRUE(table);
  const std::vector<const ClassRegistration*> found = table->associationClasses();
  ASSERT_EQ(found.size(), 2u);
  EXPECT_EQ(found[0]->className, "Assoc2");
  EXPECT_EQ(found[1]->className, "Both");
}

TEST(RegistrationTableAdd, AddsNewClassesAtTheEnd) {
  RegistrationTable table;
  table.add(instanceClass("A", "P"));
  table.add(instanceClass("B", "P"));
  ASSERT_EQ(table.classes().size(), 2u);
  EXPECT_EQ(table.classes()[1].className, "B");
}

TEST(RegistrationTableAdd, ReplacesAClassOfTheSameNameInPlace) {
  RegistrationTable table;
  table.add(instanceClass("A", "Old"));
  table.add(instanceClass("B", "P"));
  table.add(instanceClass("a", "New"));
  ASSERT_EQ(table.classes().size(), 2u);
  EXPECT_EQ(table.classes()[0].provider, "New");
}

TEST(RegistrationLoad, ReadsAFileAndNamesItInErrors) {
  const std::string path = ::testing::TempDir() + "registration_test_load.reg";
  {
    std::ofstream out(path);
    out << kChassis << "[Broken\n";
  }
  std::string error;
  EXPECT_FALSE(RegistrationTable::load(path, &error));
  EXPECT_EQ(error, path + ":6: malformed section header");
  {
    std::ofstream out(path);
    out << kChassis;
  }
  std::optional<RegistrationTable> table = RegistrationTable::load(path, &error);
  ASSERT_TRUE(table);
  EXPECT_EQ(table->classes().size(), 1u);
  std::remove(path.c_str());
}

TEST(RegistrationLoad, MissingFileIsAnError) {
  std::string error;
  EXPECT_FALSE(RegistrationTable::load("/nonexistent/tvr.reg", &error));
  EXPECT_EQ(error, "/nonexistent/tvr.reg: cannot open registration file");
}

} // namespace
} // namespace tvr::broker
