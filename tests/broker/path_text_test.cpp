// The text form of object paths: writing, reading, and reading back what
// was written.
#include "tvr/broker/PathText.h"

#include "Printers.h"

#include <gtest/gtest.h>

namespace tvr::broker {
namespace {

ObjectPath roundTrip(const ObjectPath& path, PathFormat format = {}) {
  const std::string text = formatObjectPath(path, format);
  PathParseError error;
  std::optional<ObjectPath> back = parseObjectPath(text, &error);
  EXPECT_TRUE(back) << text << ": column " << error.column << ": " << error.message;
  return back.value_or(ObjectPath());
}

PathParseError errorOf(std::string_view text) {
  PathParseError error;
  EXPECT_FALSE(parseObjectPath(text, &error)) << text;
  return error;
}

ObjectPath disk() {
  ObjectPath path("root/cimv2", "TVR_Disk");
  path.setKey("DeviceID", Value::chars("sda"));
  return path;
}

TEST(PathFormat, WritesNamespaceClassAndKeysInTheirOrder) {
  ObjectPath path("root/cimv2", "TVR_Disk");
  path.setKey("SystemName", Value::chars("node1"));
  path.setKey("DeviceID", Value::chars("sda"));
  EXPECT_EQ(formatObjectPath(path), R"(root/cimv2:TVR_Disk.SystemName="node1",DeviceID="sda")");
}

TEST(PathFormat, WritesAClassPathWithoutKeys) {
  EXPECT_EQ(formatObjectPath(ObjectPath("root/cimv2", "TVR_Disk")), "root/cimv2:TVR_Disk");
  EXPECT_EQ(formatObjectPath(ObjectPath("", "TVR_Disk")), "TVR_Disk");
}

TEST(PathFormat, WritesTheHostOnlyWhenAskedAndPresent) {
  ObjectPath path = disk();
  path.host = "node1.example";
  EXPECT_EQ(formatObjectPath(path), R"(root/cimv2:TVR_Disk.DeviceID="sda")");
  EXPECT_EQ(formatObjectPath(path, PathFormat{true, true}), R"(//node1.example/root/cimv2:TVR_Disk.DeviceID="sda")");
  EXPECT_EQ(formatObjectPath(disk(), PathFormat{true, true}), R"(root/cimv2:TVR_Disk.DeviceID="sda")");
}

TEST(PathFormat, LeavesTheNamespaceOutWhenAsked) {
  EXPECT_EQ(formatObjectPath(disk(), PathFormat{false, false}), R"(TVR_Disk.DeviceID="sda")");
}

TEST(PathFormat, EscapesQuotesAndBackslashesInStrings) {
  ObjectPath path("", "C");
  path.setKey("Name", Value::string(R"(say "hi" \o/)"));
  EXPECT_EQ(formatObjectPath(path), R"(C.Name="say \"hi\" \\o/")");
}

TEST(PathFormat, WritesNumbersBareAndBooleansAsWords) {
  ObjectPath path("", "C");
  path.setKey("U", Value::uint16(42));
  path.setKey("S", Value::sint32(-7));
  path.setKey("Big", Value::uint64(18446744073709551615ull));
  path.setKey("Yes", Value::boolean(true));
  path.setKey("No", Value::boolean(false));
  EXPECT_EQ(formatObjectPath(path), "C.U=42,S=-7,Big=18446744073709551615,Yes=TRUE,No=FALSE");
}

TEST(PathFormat, WritesAReferenceAsAQuotedPath) {
  ObjectPath path("root/cimv2", "TVR_Link");
  path.setKey("Antecedent", Value::reference(disk()));
  EXPECT_EQ(formatObjectPath(path), R"(root/cimv2:TVR_Link.Antecedent="root/cimv2:TVR_Disk.DeviceID=\"sda\"")");
}

TEST(PathFormat, FormatValueWritesNullArraysAndDateTimes) {
  EXPECT_EQ(formatValue(Value::nullOf(CMPI_string)), "NULL");
  EXPECT_EQ(formatValue(Value::array(CMPI_uint8, {Value::uint8(1), Value::uint8(2)})), "{1,2}");
  Value when = Value::chars("20240229123456.789012+000");
  when.type = CMPI_dateTime;
  EXPECT_EQ(formatValue(when), "\"20240229123456.789012+000\"");
}

TEST(PathParse, ReadsNamespaceClassAndKeys) {
  std::optional<ObjectPath> path = parseObjectPath(R"(root/cimv2:TVR_Disk.SystemName="node1",DeviceID="sda")");
  ASSERT_TRUE(path);
  EXPECT_EQ(path->nameSpace, "root/cimv2");
  EXPECT_EQ(path->host, "");
  EXPECT_EQ(path->className, "TVR_Disk");
  ASSERT_EQ(path->keys.size(), 2u);
  EXPECT_EQ(path->keys[0].name, "SystemName");
  EXPECT_EQ(path->keys[0].value, Value::chars("node1"));
  EXPECT_EQ(path->keys[1].name, "DeviceID");
}

TEST(PathParse, ReadsAClassAlone) {
  std::optional<ObjectPath> path = parseObjectPath("TVR_Disk");
  ASSERT_TRUE(path);
  EXPECT_EQ(path->nameSpace, "");
  EXPECT_EQ(path->className, "TVR_Disk");
  EXPECT_TRUE(path->keys.empty());
}

TEST(PathParse, ReadsHostAndNamespace) {
  std::optional<ObjectPath> path = parseObjectPath(R"(//node1:5989/root/tvr:TVR_Disk.DeviceID="sda")");
  ASSERT_TRUE(path);
  EXPECT_EQ(path->host, "node1:5989");
  EXPECT_EQ(path->nameSpace, "root/tvr");
  EXPECT_EQ(path->className, "TVR_Disk");
}

TEST(PathParse, ReadsValueTypesByTheirForm) {
  std::optional<ObjectPath> path = parseObjectPath(R"(C.S="text",U=42,N=-42,T=TRUE,F=false,R=2.5)");
  ASSERT_TRUE(path);
  EXPECT_EQ(*path->key("S"), Value::chars("text"));
  EXPECT_EQ(*path->key("U"), Value::uint64(42));
  EXPECT_EQ(*path->key("N"), Value::sint64(-42));
  EXPECT_EQ(*path->key("T"), Value::boolean(true));
  EXPECT_EQ(*path->key("F"), Value::boolean(false));
  EXPECT_EQ(*path->key("R"), Value::real64(2.5));
}

TEST(PathParse, ReadsAQuotedPathWithKeysAsAReference) {
  std::optional<ObjectPath> path = parseObjectPath(R"(C.Ref="root/cimv2:TVR_Disk.DeviceID=\"sda\"")");
  ASSERT_TRUE(path);
  const Value* ref = path->key("Ref");
  ASSERT_NE(ref, nullptr);
  ASSERT_EQ(ref->type, CMPI_ref);
  EXPECT_EQ(*ref->ref, disk());
}

TEST(PathParse, ReadsAQuotedClassNameWithoutKeysAsAString) {
  std::optional<ObjectPath> path = parseObjectPath(R"(C.Name="TVR_Disk")");
  ASSERT_TRUE(path);
  EXPECT_EQ(*path->key("Name"), Value::chars("TVR_Disk"));
}

// The text form cannot tell a string that reads as a keyed path from a
// reference; the reader takes it for a reference, as documented.
TEST(PathParse, ReadsAStringThatLooksLikeAKeyedPathAsAReference) {
  ObjectPath path("", "C");
  path.setKey("Name", Value::chars("X.a=1"));
  std::optional<ObjectPath> back = parseObjectPath(formatObjectPath(path));
  ASSERT_TRUE(back);
  EXPECT_EQ(back->key("Name")->type, CMPI_ref);
}

TEST(PathRoundTrip, QuotesAndBackslashes) {
  ObjectPath path("root/cimv2", "C");
  path.setKey("Name", Value::chars(R"(a "quoted" word, a \ backslash and a trailing \)"));
  path.setKey("Empty", Value::chars(""));
  EXPECT_EQ(roundTrip(path), path);
}

TEST(PathRoundTrip, NumbersBooleansAndNegatives) {
  ObjectPath path("root/cimv2", "C");
  path.setKey("Zero", Value::uint64(0));
  path.setKey("Max", Value::uint64(18446744073709551615ull));
  path.setKey("Min", Value::sint64(-9223372036854775807ll - 1));
  path.setKey("Minus", Value::sint64(-1));
  path.setKey("Yes", Value::boolean(true));
  path.setKey("No", Value::boolean(false));
  EXPECT_EQ(roundTrip(path), path);
}

TEST(PathRoundTrip, NestedReferencesTwoLevelsDeep) {
  ObjectPath inner("root/cimv2", "TVR_Disk");
  inner.setKey("DeviceID", Value::chars(R"(disk "0" \ slot)"));
  ObjectPath middle("root/cimv2", "TVR_Link");
  middle.setKey("Antecedent", Value::reference(inner));
  middle.setKey("Index", Value::uint64(3));
  ObjectPath outer("root/tvr", "TVR_Outer");
  outer.setKey("Link", Value::reference(middle));
  outer.setKey("Name", Value::chars("outer"));
  const ObjectPath back = roundTrip(outer);
  EXPECT_EQ(back, outer);
  ASSERT_EQ(back.key("Link")->type, CMPI_ref);
  const ObjectPath& readMiddle = *back.key("Link")->ref;
  ASSERT_EQ(readMiddle.key("Antecedent")->type, CMPI_ref);
  EXPECT_EQ(readMiddle.key("Antecedent")->ref->key("DeviceID")->text, R"(disk "0" \ slot)");
}

TEST(PathRoundTrip, HostAndNamespace) {
  ObjectPath path = disk();
  path.host = "node1.example";
  EXPECT_EQ(roundTrip(path, PathFormat{true, true}), path);
}

TEST(PathRoundTrip, RealsThatFormatWithAFractionOrExponent) {
  ObjectPath path("", "C");
  path.setKey("Half", Value::real64(2.5));
  path.setKey("Negative", Value::real64(-0.125));
  path.setKey("Large", Value::real64(1e+20));
  EXPECT_EQ(roundTrip(path), path);
}

TEST(PathRoundTrip, NestedReferencesKeepTheirHost) {
  ObjectPath inner = disk();
  inner.host = "node2";
  ObjectPath outer("root/cimv2", "TVR_Link");
  outer.setKey("Antecedent", Value::reference(inner));
  const ObjectPath back = roundTrip(outer, PathFormat{true, true});
  ASSERT_EQ(back.key("Antecedent")->type, CMPI_ref);
  EXPECT_EQ(back.key("Antecedent")->ref->host, "node2");
}

TEST(PathParseErrors, EmptyTextWantsAClassAtColumnOne) {
  const PathParseError error = errorOf("");
  EXPECT_EQ(error.column, 1u);
  EXPECT_EQ(error.message, "expected a class name");
}

TEST(PathParseErrors, HostWithoutSlashPointsAtTheHost) {
  const PathParseError error = errorOf("//node1");
  EXPECT_EQ(error.column, 3u);
  EXPECT_EQ(error.message, "expected '/' after the host name");
}

TEST(PathParseErrors, EmptyNamespacePointsAtTheColon) {
  const PathParseError error = errorOf(":TVR_Disk");
  EXPECT_EQ(error.column, 1u);
  EXPECT_EQ(error.message, "empty namespace before ':'");
}

TEST(PathParseErrors, MissingClassAfterNamespacePointsBehindTheColon) {
  const PathParseError error = errorOf("root/cimv2:");
  EXPECT_EQ(error.column, 12u);
  EXPECT_EQ(error.message, "expected a class name");
}

TEST(PathParseErrors, ClassStartingWithADigitPointsAtIt) {
  const PathParseError error = errorOf("root/cimv2:9Disk");
  EXPECT_EQ(error.column, 12u);
  EXPECT_EQ(error.message, "expected a class name");
}

TEST(PathParseErrors, JunkAfterTheClassPointsAtIt) {
  const PathParseError error = errorOf("TVR_Disk DeviceID=1");
  EXPECT_EQ(error.column, 9u);
  EXPECT_EQ(error.message, "expected '.' before the keys");
}

TEST(PathParseErrors, MissingKeyNamePointsBehindTheDot) {
  const PathParseError error = errorOf("TVR_Disk.=1");
  EXPECT_EQ(error.column, 10u);
  EXPECT_EQ(error.message, "expected a key name");
}

TEST(PathParseErrors, MissingEqualsNamesTheKey) {
  const PathParseError error = errorOf("TVR_Disk.DeviceID");
  EXPECT_EQ(error.column, 18u);
  EXPECT_EQ(error.message, "expected '=' after key DeviceID");
}

TEST(PathParseErrors, MissingValuePointsBehindTheEquals) {
  const PathParseError error = errorOf("TVR_Disk.DeviceID=");
  EXPECT_EQ(error.column, 19u);
  EXPECT_EQ(error.message, "expected a key value");
}

TEST(PathParseErrors, EmptyValueBeforeACommaPointsAtTheComma) {
  const PathParseError error = errorOf("TVR_Disk.A=,B=1");
  EXPECT_EQ(error.column, 12u);
  EXPECT_EQ(error.message, "expected a key value");
}

TEST(PathParseErrors, UnterminatedStringPointsAtItsOpeningQuote) {
  const PathParseError error = errorOf(R"(TVR_Disk.A=1,DeviceID="sda)");
  EXPECT_EQ(error.column, 23u);
  EXPECT_EQ(error.message, "unterminated quoted value");
}

TEST(PathParseErrors, TrailingBackslashLeavesTheStringUnterminated) {
  const PathParseError error = errorOf(R"(C.A="x\)");
  EXPECT_EQ(error.column, 5u);
  EXPECT_EQ(error.message, "unterminated quoted value");
}

TEST(PathParseErrors, BareWordPointsAtItsStart) {
  const PathParseError error = errorOf("TVR_Disk.A=1,B=sda");
  EXPECT_EQ(error.column, 16u);
  EXPECT_EQ(error.message, "expected a quoted string, a number, TRUE or FALSE");
}

TEST(PathParseErrors, PlusSignedNumberIsNotANumber) {
  const PathParseError error = errorOf("C.A=+5");
  EXPECT_EQ(error.column, 5u);
}

TEST(PathParseErrors, NumberOutOfRangeIsNotANumber) {
  EXPECT_EQ(errorOf("C.A=18446744073709551616").column, 5u);
  EXPECT_EQ(errorOf("C.A=-9223372036854775809").column, 5u);
}

TEST(PathParseErrors, JunkAfterAQuotedValuePointsAtIt) {
  const PathParseError error = errorOf(R"(C.A="x"y)");
  EXPECT_EQ(error.column, 8u);
  EXPECT_EQ(error.message, "expected ',' between keys");
}

TEST(PathParseErrors, TrailingCommaWantsAnotherKey) {
  const PathParseError error = errorOf("C.A=1,");
  EXPECT_EQ(error.column, 7u);
  EXPECT_EQ(error.message, "expected a key name");
}

TEST(PathParseErrors, ErrorArgumentIsOptional) { EXPECT_FALSE(parseObjectPath("C.A=", nullptr)); }

} // namespace
} // namespace tvr::broker
