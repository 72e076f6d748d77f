//===- ObjectPathEqualityTest.cpp - When two object paths name one object ===//

#include "HX/ProviderUtilities.h"

#include "FakeCmpi.h"

#include <gtest/gtest.h>

#include <limits>

namespace {

using fakecmpi::FakePath;
using fakecmpi::FakeWorld;
using HX::isObjPathsEqual;

constexpr bool IgnoreHostAndNamespace = true;
constexpr bool CompareHostAndNamespace = false;

class ObjectPathEqualityTest : public ::testing::Test {
protected:
  /// A slot path in the usual namespace on host "hx1".
  FakePath &slot() { return World.path("root/cimv2", "hx1", "TVR_Slot"); }

  /// Two slot paths whose only key "Number" holds \p a and \p b.
  bool numberKeysEqual(CMPIData a, CMPIData b) {
    return isObjPathsEqual(&slot().key("Number", a).object,
                           &slot().key("Number", b).object,
                           IgnoreHostAndNamespace);
  }

  FakeWorld World;
};

TEST_F(ObjectPathEqualityTest, TwoNullPathsAreEqual) {
  EXPECT_TRUE(isObjPathsEqual(nullptr, nullptr, IgnoreHostAndNamespace));
  EXPECT_TRUE(isObjPathsEqual(nullptr, nullptr, CompareHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, NullAndNonNullPathsDiffer) {
  FakePath &path = slot();

  EXPECT_FALSE(isObjPathsEqual(&path.object, nullptr, IgnoreHostAndNamespace));
  EXPECT_FALSE(isObjPathsEqual(nullptr, &path.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, SameKeysInAnotherOrderAreEqual) {
  FakePath &a = slot()
                    .key("Tag", World.stringValue("/C/S1"))
                    .key("CreationClassName", World.stringValue("TVR_Slot"));
  FakePath &b = slot()
                    .key("CreationClassName", World.stringValue("TVR_Slot"))
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, ClassNamesCompareWithoutRegardToCase) {
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("root/cimv2", "hx1", "tvr_slot")
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, DifferentClassesDiffer) {
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("root/cimv2", "hx1", "TVR_Chassis")
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, KeyNamesMatchWithoutRegardToCase) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/S1"));
  FakePath &b = slot().key("TAG", World.stringValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, DifferentKeyCountsDiffer) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/S1"));
  FakePath &b = slot()
                    .key("Tag", World.stringValue("/C/S1"))
                    .key("CreationClassName", World.stringValue("TVR_Slot"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
  EXPECT_FALSE(isObjPathsEqual(&b.object, &a.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, KeyMissingFromTheOtherPathDiffers) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/S1"));
  FakePath &b = slot().key("Name", World.stringValue("/C/S1"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, StringKeysCompareExactly) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/Slot 1"));
  FakePath &b = slot().key("Tag", World.stringValue("/C/slot 1"));
  FakePath &c = slot().key("Tag", World.stringValue("/C/Slot 1 "));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
  EXPECT_FALSE(isObjPathsEqual(&a.object, &c.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, StringAndCharsKeysWithTheSameTextAreEqual) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/S1"));
  FakePath &b = slot().key("Tag", World.charsValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, NumericKeysCompareByValueAcrossWidthAndSign) {
  EXPECT_TRUE(numberKeysEqual(FakeWorld::uint8Value(5),
                              FakeWorld::sint64Value(5)));
  EXPECT_TRUE(numberKeysEqual(FakeWorld::uint32Value(70000),
                              FakeWorld::uint64Value(70000)));
  EXPECT_TRUE(numberKeysEqual(FakeWorld::sint32Value(-4),
                              FakeWorld::sint64Value(-4)));
  EXPECT_TRUE(numberKeysEqual(FakeWorld::real64Value(2.0),
                              FakeWorld::uint16Value(2)));
}

TEST_F(ObjectPathEqualityTest, NumericKeysWithDifferentValuesDiffer) {
  EXPECT_FALSE(numberKeysEqual(FakeWorld::uint32Value(5),
                               FakeWorld::uint32Value(6)));
  EXPECT_FALSE(numberKeysEqual(
      FakeWorld::sint64Value(-1),
      FakeWorld::uint64Value(std::numeric_limits<CMPIUint64>::max())));
  EXPECT_FALSE(numberKeysEqual(FakeWorld::real64Value(2.5),
                               FakeWorld::uint16Value(2)));
}

TEST_F(ObjectPathEqualityTest, StringAndNumberKeysDiffer) {
  EXPECT_FALSE(numberKeysEqual(World.stringValue("5"),
                               FakeWorld::uint32Value(5)));
}

TEST_F(ObjectPathEqualityTest, BooleanKeysCompareByTruth) {
  EXPECT_TRUE(numberKeysEqual(FakeWorld::booleanValue(true),
                              FakeWorld::booleanValue(true)));
  EXPECT_FALSE(numberKeysEqual(FakeWorld::booleanValue(true),
                               FakeWorld::booleanValue(false)));
}

TEST_F(ObjectPathEqualityTest, NullKeysEqualOnlyNullKeys) {
  EXPECT_TRUE(numberKeysEqual(FakeWorld::nullValue(CMPI_string),
                              FakeWorld::nullValue(CMPI_string)));
  EXPECT_FALSE(numberKeysEqual(FakeWorld::nullValue(CMPI_string),
                               World.stringValue("")));
}

TEST_F(ObjectPathEqualityTest, ReferenceKeysCompareRecursively) {
  FakePath &chassisA = World.path("root/cimv2", "hx1", "TVR_Chassis")
                           .key("Tag", World.stringValue("/C"))
                           .key("CreationClassName",
                                World.stringValue("TVR_Chassis"));
  FakePath &chassisB = World.path("root/cimv2", "hx1", "tvr_chassis")
                           .key("creationclassname",
                                World.charsValue("TVR_Chassis"))
                           .key("Tag", World.stringValue("/C"));
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(chassisA));
  FakePath &b = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(chassisB));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, ReferenceKeysToDifferentObjectsDiffer) {
  FakePath &chassisA = World.path("root/cimv2", "hx1", "TVR_Chassis")
                           .key("Tag", World.stringValue("/C1"));
  FakePath &chassisB = World.path("root/cimv2", "hx1", "TVR_Chassis")
                           .key("Tag", World.stringValue("/C2"));
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(chassisA));
  FakePath &b = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(chassisB));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, NestedReferencesFollowTheSameHostAndNamespaceMode) {
  FakePath &innerA = World.path("root/cimv2", "hx1", "TVR_Chassis")
                         .key("Tag", World.stringValue("/C"));
  FakePath &innerB = World.path("root/other", "hx2", "TVR_Chassis")
                         .key("Tag", World.stringValue("/C"));
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(innerA));
  FakePath &b = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(innerB));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, CompareHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, ReferenceKeyAndStringKeyDiffer) {
  FakePath &chassis = World.path("root/cimv2", "hx1", "TVR_Chassis")
                          .key("Tag", World.stringValue("/C"));
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", FakeWorld::refValue(chassis));
  FakePath &b = World.path("root/cimv2", "hx1", "TVR_ChassisInRack")
                    .key("PartComponent", World.stringValue("/C"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, PathReferringToItselfEndsUnequal) {
  FakePath &a = slot();
  a.key("Self", FakeWorld::refValue(a));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &a.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, HostsAndNamespacesAreIgnoredWhenAsked) {
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("root/interop", "other-host", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, DifferentNamespacesDifferWhenCompared) {
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("root/interop", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, CompareHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, DifferentHostsDifferWhenCompared) {
  FakePath &a = World.path("root/cimv2", "hx1", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("root/cimv2", "hx2", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &local = World.path("root/cimv2", "", "TVR_Slot")
                        .key("Tag", World.stringValue("/C/S1"));

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, CompareHostAndNamespace));
  EXPECT_FALSE(
      isObjPathsEqual(&a.object, &local.object, CompareHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, HostsAndNamespacesCompareWithoutRegardToCase) {
  FakePath &a = World.path("root/cimv2", "HX1.example.com", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));
  FakePath &b = World.path("ROOT/CIMV2", "hx1.EXAMPLE.com", "TVR_Slot")
                    .key("Tag", World.stringValue("/C/S1"));

  EXPECT_TRUE(isObjPathsEqual(&a.object, &b.object, CompareHostAndNamespace));
}

TEST_F(ObjectPathEqualityTest, PathsThatCannotBeReadDiffer) {
  FakePath &a = slot().key("Tag", World.stringValue("/C/S1"));
  FakePath &b = slot().key("Tag", World.stringValue("/C/S1"));
  b.object.ft = FakeWorld::emptyPathTable();

  EXPECT_FALSE(isObjPathsEqual(&a.object, &b.object, IgnoreHostAndNamespace));
  EXPECT_FALSE(isObjPathsEqual(&b.object, &a.object, IgnoreHostAndNamespace));
}

} // namespace
