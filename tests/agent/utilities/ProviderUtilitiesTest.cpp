//===- ProviderUtilitiesTest.cpp - Reading keys, reading and writing props ===//

#include "HX/ProviderUtilities.h"

#include "FakeCmpi.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using fakecmpi::FakeWorld;
using HX::ProviderUtilities;

class ProviderUtilitiesTest : public ::testing::Test {
protected:
  FakeWorld World;
};

// --- getKeyProperty ---------------------------------------------------------

TEST_F(ProviderUtilitiesTest, KeyReadsAStringKey) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("Tag", World.stringValue("/System/Chassis 1"));
  std::string value;

  ASSERT_TRUE(ProviderUtilities::getKeyProperty(&path.object, "Tag", value));
  EXPECT_EQ(value, "/System/Chassis 1");
}

TEST_F(ProviderUtilitiesTest, KeyReadsACharsKey) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("CreationClassName", World.charsValue("TVR_Chassis"));
  std::string value;

  ASSERT_TRUE(ProviderUtilities::getKeyProperty(&path.object,
                                                "CreationClassName", value));
  EXPECT_EQ(value, "TVR_Chassis");
}

TEST_F(ProviderUtilitiesTest, AbsentKeyFailsAndLeavesTheValue) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("Tag", World.stringValue("x"));
  std::string value = "untouched";

  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, "Name", value));
  EXPECT_EQ(value, "untouched");
}

TEST_F(ProviderUtilitiesTest, NullKeyFails) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("Tag", FakeWorld::nullValue(CMPI_string));
  std::string value = "untouched";

  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, "Tag", value));
  EXPECT_EQ(value, "untouched");
}

TEST_F(ProviderUtilitiesTest, NumericKeyIsNotAString) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Slot");
  path.key("Number", FakeWorld::uint16Value(3));
  std::string value = "untouched";

  EXPECT_FALSE(
      ProviderUtilities::getKeyProperty(&path.object, "Number", value));
  EXPECT_EQ(value, "untouched");
}

TEST_F(ProviderUtilitiesTest, StringKeyWithoutAStringObjectFails) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  CMPIData broken = World.stringValue("x");
  broken.value.string = nullptr;
  path.key("Tag", broken);
  std::string value;

  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, "Tag", value));
}

TEST_F(ProviderUtilitiesTest, KeyReadWithNullArgumentsFails) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("Tag", World.stringValue("x"));
  std::string value;

  EXPECT_FALSE(ProviderUtilities::getKeyProperty(nullptr, "Tag", value));
  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, nullptr, value));
}

TEST_F(ProviderUtilitiesTest, KeyReadFromAPathWithoutFunctionsFails) {
  fakecmpi::FakePath &path = World.path("root/cimv2", "", "TVR_Chassis");
  path.key("Tag", World.stringValue("x"));
  path.object.ft = FakeWorld::emptyPathTable();
  std::string value;

  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, "Tag", value));
  path.object.ft = nullptr;
  EXPECT_FALSE(ProviderUtilities::getKeyProperty(&path.object, "Tag", value));
}

// --- getProperty ------------------------------------------------------------

TEST_F(ProviderUtilitiesTest, PropertyReadsStringAndCharsValues) {
  fakecmpi::FakeInstance &instance = World.instance();
  instance.property("ElementName", World.stringValue("Chassis 1"))
      .property("Caption", World.charsValue("Main chassis"));
  std::string value;

  ASSERT_TRUE(ProviderUtilities::getProperty(&instance.object, "ElementName",
                                             value, false));
  EXPECT_EQ(value, "Chassis 1");
  ASSERT_TRUE(ProviderUtilities::getProperty(&instance.object, "Caption",
                                             value, false));
  EXPECT_EQ(value, "Main chassis");
}

TEST_F(ProviderUtilitiesTest, PropertyAbsentNullOrNotAStringFails) {
  fakecmpi::FakeInstance &instance = World.instance();
  instance.property("Model", FakeWorld::nullValue(CMPI_string))
      .property("ChassisPackageType", FakeWorld::uint16Value(17));
  std::string value = "untouched";

  EXPECT_FALSE(ProviderUtilities::getProperty(&instance.object, "Serial",
                                              value, false));
  EXPECT_FALSE(ProviderUtilities::getProperty(&instance.object, "Model",
                                              value, false));
  EXPECT_FALSE(ProviderUtilities::getProperty(
      &instance.object, "ChassisPackageType", value, false));
  EXPECT_EQ(value, "untouched");
}

TEST_F(ProviderUtilitiesTest, ExactLookupDoesNotMatchOtherCase) {
  fakecmpi::FakeInstance &instance = World.instance();
  instance.property("ElementName", World.stringValue("Chassis 1"));
  std::string value = "untouched";

  EXPECT_FALSE(ProviderUtilities::getProperty(&instance.object, "elementname",
                                              value, false));
  EXPECT_EQ(value, "untouched");
}

TEST_F(ProviderUtilitiesTest, CaseInsensitiveLookupMatchesOtherCase) {
  fakecmpi::FakeInstance &instance = World.instance();
  instance.property("Tag", World.stringValue("t"))
      .property("ElementName", World.stringValue("Chassis 1"));
  std::string value;

  ASSERT_TRUE(ProviderUtilities::getProperty(&instance.object, "ELEMENTNAME",
                                             value, true));
  EXPECT_EQ(value, "Chassis 1");
}

TEST_F(ProviderUtilitiesTest, PropertyReadWithNullArgumentsOrNoFunctionsFails) {
  fakecmpi::FakeInstance &instance = World.instance();
  instance.property("Tag", World.stringValue("t"));
  std::string value;

  EXPECT_FALSE(ProviderUtilities::getProperty(nullptr, "Tag", value, false));
  EXPECT_FALSE(
      ProviderUtilities::getProperty(&instance.object, nullptr, value, true));
  instance.object.ft = FakeWorld::emptyInstanceTable();
  EXPECT_FALSE(
      ProviderUtilities::getProperty(&instance.object, "Tag", value, true));
}

// --- setProperty ------------------------------------------------------------

TEST_F(ProviderUtilitiesTest, SetPropertyStoresAStringArrayOfTheValues) {
  fakecmpi::FakeBroker &broker = World.broker();
  fakecmpi::FakeInstance &instance = World.instance();
  std::vector<std::string> values = {"Ethernet", "", "Fibre Channel"};

  ASSERT_TRUE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                             "ConnectorTypes", values));

  ASSERT_EQ(broker.arrays.size(), 1u);
  const fakecmpi::FakeArray &array = *broker.arrays[0];
  EXPECT_EQ(array.elementType, CMPI_string);
  EXPECT_EQ(array.size, 3u);
  EXPECT_EQ(array.texts, values);
  EXPECT_EQ(array.setTypes,
            (std::vector<CMPIType>{CMPI_chars, CMPI_chars, CMPI_chars}));
  ASSERT_EQ(instance.setCalls.size(), 1u);
  EXPECT_EQ(instance.setCalls[0].name, "ConnectorTypes");
  EXPECT_EQ(instance.setCalls[0].type, CMPI_stringA);
  EXPECT_EQ(instance.setCalls[0].value.array, &array.object);
}

TEST_F(ProviderUtilitiesTest, SetPropertyWithNoValuesStoresAnEmptyArray) {
  fakecmpi::FakeBroker &broker = World.broker();
  fakecmpi::FakeInstance &instance = World.instance();
  std::vector<std::string> values;

  ASSERT_TRUE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                             "ConnectorTypes", values));

  ASSERT_EQ(broker.arrays.size(), 1u);
  EXPECT_EQ(broker.arrays[0]->size, 0u);
  ASSERT_EQ(instance.setCalls.size(), 1u);
  EXPECT_EQ(instance.setCalls[0].type, CMPI_stringA);
}

TEST_F(ProviderUtilitiesTest, SetPropertyWithNullArgumentsFails) {
  fakecmpi::FakeBroker &broker = World.broker();
  fakecmpi::FakeInstance &instance = World.instance();
  std::vector<std::string> values = {"a"};

  EXPECT_FALSE(ProviderUtilities::setProperty(nullptr, &instance.object, "P",
                                              values));
  EXPECT_FALSE(
      ProviderUtilities::setProperty(&broker.object, nullptr, "P", values));
  EXPECT_FALSE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                              nullptr, values));
  broker.object.eft = nullptr;
  EXPECT_FALSE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                              "P", values));
  EXPECT_TRUE(instance.setCalls.empty());
}

TEST_F(ProviderUtilitiesTest, SetPropertyFailsWhenTheBrokerMakesNoArray) {
  fakecmpi::FakeBroker &refusing = World.broker();
  refusing.newArrayResult = CMPI_RC_ERR_FAILED;
  fakecmpi::FakeBroker &empty = World.broker();
  empty.newArrayReturnsNull = true;
  fakecmpi::FakeInstance &instance = World.instance();
  std::vector<std::string> values = {"a"};

  EXPECT_FALSE(ProviderUtilities::setProperty(&refusing.object,
                                              &instance.object, "P", values));
  EXPECT_FALSE(ProviderUtilities::setProperty(&empty.object, &instance.object,
                                              "P", values));
  EXPECT_TRUE(instance.setCalls.empty());
}

TEST_F(ProviderUtilitiesTest, SetPropertyFailsWhenAnElementCannotBeSet) {
  fakecmpi::FakeBroker &broker = World.broker();
  broker.arraySetElementResult = CMPI_RC_ERR_TYPE_MISMATCH;
  fakecmpi::FakeInstance &instance = World.instance();
  std::vector<std::string> values = {"a"};

  EXPECT_FALSE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                              "P", values));
  EXPECT_TRUE(instance.setCalls.empty());
}

TEST_F(ProviderUtilitiesTest, SetPropertyFailsWhenTheInstanceRefuses) {
  fakecmpi::FakeBroker &broker = World.broker();
  fakecmpi::FakeInstance &instance = World.instance();
  instance.setPropertyResult = CMPI_RC_ERR_NO_SUCH_PROPERTY;
  std::vector<std::string> values = {"a"};

  EXPECT_FALSE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                              "P", values));
}

TEST_F(ProviderUtilitiesTest, SetPropertyOnAnInstanceWithoutFunctionsFails) {
  fakecmpi::FakeBroker &broker = World.broker();
  fakecmpi::FakeInstance &instance = World.instance();
  instance.object.ft = FakeWorld::emptyInstanceTable();
  std::vector<std::string> values = {"a"};

  EXPECT_FALSE(ProviderUtilities::setProperty(&broker.object, &instance.object,
                                              "P", values));
}

// --- stripSpaces ------------------------------------------------------------

TEST(StripSpacesTest, RemovesEverySpaceAndTab) {
  EXPECT_EQ(HX::stripSpaces(" PCIe\tSlot  3 \t"), "PCIeSlot3");
}

TEST(StripSpacesTest, KeepsOtherCharactersIncludingLineBreaks) {
  EXPECT_EQ(HX::stripSpaces("a\nb\r-c_d"), "a\nb\r-c_d");
}

TEST(StripSpacesTest, EmptyAndBlankTextBecomeEmpty) {
  EXPECT_EQ(HX::stripSpaces(""), "");
  EXPECT_EQ(HX::stripSpaces(" \t "), "");
}

} // namespace
