// The object manager's copies of CIM data: values, object paths, instances.
#include "tvr/broker/Value.h"

#include "Printers.h"

#include <gtest/gtest.h>

namespace tvr::broker {
namespace {

TEST(ValueFactories, SetTypeAndNullness) {
  EXPECT_EQ(Value::chars("x").type, CMPI_chars);
  EXPECT_EQ(Value::string("x").type, CMPI_string);
  EXPECT_EQ(Value::boolean(true).type, CMPI_boolean);
  EXPECT_EQ(Value::uint8(1).type, CMPI_uint8);
  EXPECT_EQ(Value::sint64(-1).type, CMPI_sint64);
  EXPECT_EQ(Value::real32(1).type, CMPI_real32);
  EXPECT_EQ(Value::reference(ObjectPath("ns", "C")).type, CMPI_ref);
  EXPECT_EQ(Value::array(CMPI_uint16, {}).type, CMPI_uint16A);
  EXPECT_FALSE(Value::chars("").null);
  EXPECT_TRUE(Value::nullOf(CMPI_uint32).null);
  EXPECT_EQ(Value::nullOf(CMPI_uint32).type, CMPI_uint32);
  EXPECT_TRUE(Value().null);
  EXPECT_EQ(Value().type, CMPI_null);
}

TEST(ValueFactories, ArrayKeepsTheArrayBitWhenGivenTheArrayType) {
  EXPECT_EQ(Value::array(CMPI_stringA, {}).type, CMPI_stringA);
}

TEST(ValueKinds, TextTypesAreCharsStringAndDateTime) {
  EXPECT_TRUE(Value::chars("").isText());
  EXPECT_TRUE(Value::string("").isText());
  EXPECT_TRUE(Value::nullOf(CMPI_dateTime).isText());
  EXPECT_FALSE(Value::uint8(1).isText());
  EXPECT_FALSE(Value::array(CMPI_string, {}).isText());
  EXPECT_TRUE(Value::array(CMPI_string, {}).isArray());
  EXPECT_FALSE(Value::string("").isArray());
}

TEST(ValueNumbers, AsUnsignedAndAsSignedReadEveryIntegerWidth) {
  EXPECT_EQ(Value::uint8(255).asUnsigned(), 255u);
  EXPECT_EQ(Value::uint16(65535).asUnsigned(), 65535u);
  EXPECT_EQ(Value::uint32(4294967295u).asUnsigned(), 4294967295u);
  EXPECT_EQ(Value::uint64(18446744073709551615ull).asUnsigned(), 18446744073709551615ull);
  EXPECT_EQ(Value::sint8(-128).asSigned(), -128);
  EXPECT_EQ(Value::sint16(-32768).asSigned(), -32768);
  EXPECT_EQ(Value::sint32(-5).asSigned(), -5);
  EXPECT_EQ(Value::sint64(-9223372036854775807ll).asSigned(), -9223372036854775807ll);
  EXPECT_EQ(Value::uint16(7).asSigned(), 7);
}

TEST(ValueNumbers, NonIntegersReadAsZero) {
  EXPECT_EQ(Value::real64(2.5).asUnsigned(), 0u);
  EXPECT_EQ(Value::chars("12").asSigned(), 0);
  EXPECT_EQ(Value::boolean(true).asUnsigned(), 0u);
}

TEST(ValueEquality, SameTypeAndContentAreEqual) {
  EXPECT_EQ(Value::chars("a"), Value::chars("a"));
  EXPECT_EQ(Value::uint32(5), Value::uint32(5));
  EXPECT_EQ(Value::real64(0.5), Value::real64(0.5));
  EXPECT_EQ(Value::boolean(false), Value::boolean(false));
  EXPECT_NE(Value::chars("a"), Value::chars("b"));
  EXPECT_NE(Value::sint8(-1), Value::sint8(1));
}

TEST(ValueEquality, DifferentTypesAreNeverEqual) {
  EXPECT_NE(Value::chars("a"), Value::string("a"));
  EXPECT_NE(Value::uint16(5), Value::uint32(5));
  EXPECT_NE(Value::uint64(5), Value::sint64(5));
  EXPECT_NE(Value::real32(1), Value::real64(1));
}

TEST(ValueEquality, NullsOfTheSameTypeAreEqualWhateverTheirLeftovers) {
  Value a = Value::nullOf(CMPI_string);
  Value b = Value::nullOf(CMPI_string);
  b.text = "left over";
  EXPECT_EQ(a, b);
  EXPECT_NE(Value::nullOf(CMPI_string), Value::string(""));
  EXPECT_NE(Value::nullOf(CMPI_string), Value::nullOf(CMPI_chars));
}

TEST(ValueEquality, ReferencesCompareTheWholePath) {
  ObjectPath a("root/cimv2", "C");
  a.setKey("K", Value::chars("1"));
  ObjectPath b = a;
  EXPECT_EQ(Value::reference(a), Value::reference(b));
  b.setKey("K", Value::chars("2"));
  EXPECT_NE(Value::reference(a), Value::reference(b));
  ObjectPath c = a;
  c.host = "elsewhere";
  EXPECT_NE(Value::reference(a), Value::reference(c));
}

TEST(ValueEquality, ArraysCompareElementByElement) {
  const Value a = Value::array(CMPI_uint8, {Value::uint8(1), Value::uint8(2)});
  EXPECT_EQ(a, Value::array(CMPI_uint8, {Value::uint8(1), Value::uint8(2)}));
  EXPECT_NE(a, Value::array(CMPI_uint8, {Value::uint8(2), Value::uint8(1)}));
  EXPECT_NE(a, Value::array(CMPI_uint8, {Value::uint8(1)}));
  EXPECT_NE(a, Value::array(CMPI_uint16, {Value::uint8(1), Value::uint8(2)}));
}

TEST(ValueEquality, EmbeddedInstancesCompareInFull) {
  Instance inner;
  inner.path = ObjectPath("ns", "C");
  inner.setProperty("P", Value::uint8(1));
  Value a;
  a.type = CMPI_instance;
  a.null = false;
  a.instance = std::make_shared<const Instance>(inner);
  Value b = a;
  b.instance = std::make_shared<const Instance>(inner);
  EXPECT_EQ(a, b);
  inner.setProperty("P", Value::uint8(2));
  b.instance = std::make_shared<const Instance>(inner);
  EXPECT_NE(a, b);
}

TEST(TypeNames, CmpiNamesOfScalarsAndArrays) {
  EXPECT_EQ(typeName(CMPI_uint16), "CMPI_uint16");
  EXPECT_EQ(typeName(CMPI_chars), "CMPI_chars");
  EXPECT_EQ(typeName(CMPI_string), "CMPI_string");
  EXPECT_EQ(typeName(CMPI_dateTime), "CMPI_dateTime");
  EXPECT_EQ(typeName(CMPI_ref), "CMPI_ref");
  EXPECT_EQ(typeName(CMPI_boolean), "CMPI_boolean");
  EXPECT_EQ(typeName(CMPI_char16), "CMPI_char16");
  EXPECT_EQ(typeName(CMPI_real32), "CMPI_real32");
  EXPECT_EQ(typeName(CMPI_sint64), "CMPI_sint64");
  EXPECT_EQ(typeName(CMPI_null), "CMPI_null");
  EXPECT_EQ(typeName(CMPI_stringA), "CMPI_stringA");
  EXPECT_EQ(typeName(CMPI_uint16A), "CMPI_uint16A");
}

TEST(TypeNames, UnknownCodesShowTheirNumber) { EXPECT_EQ(typeName(static_cast<CMPIType>(0x77)), "CMPI_type(119)"); }

TEST(TypeNames, CimNamesOfScalarsAndArrays) {
  EXPECT_EQ(cimTypeName(CMPI_uint16), "uint16");
  EXPECT_EQ(cimTypeName(CMPI_string), "string");
  EXPECT_EQ(cimTypeName(CMPI_chars), "string");
  EXPECT_EQ(cimTypeName(CMPI_charsptr), "string");
  EXPECT_EQ(cimTypeName(CMPI_dateTime), "datetime");
  EXPECT_EQ(cimTypeName(CMPI_ref), "ref");
  EXPECT_EQ(cimTypeName(CMPI_boolean), "boolean");
  EXPECT_EQ(cimTypeName(CMPI_char16), "char16");
  EXPECT_EQ(cimTypeName(CMPI_real64), "real64");
  EXPECT_EQ(cimTypeName(CMPI_sint8), "sint8");
  EXPECT_EQ(cimTypeName(CMPI_stringA), "string[]");
  EXPECT_EQ(cimTypeName(CMPI_uint16A), "uint16[]");
  EXPECT_EQ(cimTypeName(static_cast<CMPIType>(0x77)), "unknown");
}

TEST(ObjectPathKeys, SetKeyAddsNewKeysInOrder) {
  ObjectPath path("ns", "C");
  path.setKey("B", Value::uint8(1));
  path.setKey("A", Value::uint8(2));
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "B");
  EXPECT_EQ(path.keys[1].name, "A");
}

TEST(ObjectPathKeys, SetKeyReplacesInPlaceWithoutRegardToCaseKeepingTheFirstSpelling) {
  ObjectPath path("ns", "C");
  path.setKey("DeviceID", Value::chars("sda"));
  path.setKey("Other", Value::uint8(1));
  path.setKey("DEVICEid", Value::chars("sdb"));
  ASSERT_EQ(path.keys.size(), 2u);
  EXPECT_EQ(path.keys[0].name, "DeviceID");
  EXPECT_EQ(path.keys[0].value, Value::chars("sdb"));
}

TEST(ObjectPathKeys, KeyLooksUpTheExactName) {
  ObjectPath path("ns", "C");
  path.setKey("DeviceID", Value::chars("sda"));
  ASSERT_NE(path.key("DeviceID"), nullptr);
  EXPECT_EQ(*path.key("DeviceID"), Value::chars("sda"));
  EXPECT_EQ(path.key("deviceid"), nullptr);
  EXPECT_EQ(path.key("Missing"), nullptr);
}

TEST(ObjectPathEquality, ComparesNamespaceHostClassAndKeysInOrder) {
  ObjectPath a("ns", "C");
  a.setKey("X", Value::uint8(1));
  a.setKey("Y", Value::uint8(2));
  ObjectPath b = a;
  EXPECT_EQ(a, b);
  b.nameSpace = "other";
  EXPECT_NE(a, b);
  b = a;
  b.host = "h";
  EXPECT_NE(a, b);
  b = a;
  b.className = "D";
  EXPECT_NE(a, b);
  ObjectPath swapped("ns", "C");
  swapped.setKey("Y", Value::uint8(2));
  swapped.setKey("X", Value::uint8(1));
  EXPECT_NE(a, swapped);
}

TEST(InstanceProperties, SetPropertyReplacesInPlaceWithoutRegardToCase) {
  Instance inst;
  inst.setProperty("Name", Value::chars("a"));
  inst.setProperty("Size", Value::uint64(1));
  inst.setProperty("NAME", Value::chars("b"));
  ASSERT_EQ(inst.properties.size(), 2u);
  EXPECT_EQ(inst.properties[0].name, "Name");
  EXPECT_EQ(inst.properties[0].value, Value::chars("b"));
  EXPECT_EQ(inst.properties[1].name, "Size");
}

TEST(InstanceProperties, ReplacingMayChangeTheType) {
  Instance inst;
  inst.setProperty("Size", Value::uint64(1));
  inst.setProperty("size", Value::nullOf(CMPI_uint32));
  EXPECT_EQ(*inst.property("Size"), Value::nullOf(CMPI_uint32));
}

TEST(InstanceProperties, PropertyLooksUpTheExactName) {
  Instance inst;
  inst.setProperty("Name", Value::chars("a"));
  EXPECT_NE(inst.property("Name"), nullptr);
  EXPECT_EQ(inst.property("name"), nullptr);
}

TEST(InstanceEquality, ComparesPathAndPropertiesInOrder) {
  Instance a;
  a.path = ObjectPath("ns", "C");
  a.setProperty("P", Value::uint8(1));
  Instance b = a;
  EXPECT_EQ(a, b);
  b.path.className = "D";
  EXPECT_FALSE(a == b);
  b = a;
  b.setProperty("Q", Value::uint8(1));
  EXPECT_FALSE(a == b);
}

} // namespace
} // namespace tvr::broker
