//===- TreeFileRefusalTest.cpp - Which hardware-tree files are refused ----===//
//
// Every refusal names the file, the JSON pointer of the offending place and
// what is wrong. checkHardwareTree reports exactly what selectNode throws.
//
//===----------------------------------------------------------------------===//

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"

#include "ScratchDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>

namespace {

using namespace HX::NodeLexicon;
using ::testing::HasSubstr;
using ::testing::StartsWith;

class TreeFileRefusalTest : public ::testing::Test {
protected:
  /// Writes \p json as t.json and returns the refusal checkHardwareTree
  /// gives, or "accepted".
  std::string refusalOf(const std::string &json) {
    Scratch.write("t.json", json);
    return HX::checkHardwareTree(Path).value_or("accepted");
  }

  /// The refusal expected for t.json: "<path>: <place and reason>".
  std::string refused(const std::string &placeAndReason) const {
    return Path + ": " + placeAndReason;
  }

  hxtest::ScratchDirectory Scratch;
  const std::string Path = Scratch.pathOf("t.json");
};

TEST_F(TreeFileRefusalTest, WellFormedTreeIsAccepted) {
  EXPECT_EQ(refusalOf(R"({"systemName": "lab-7.example.com",
    "faults": {"throwOnSelect": ["SlotNode"]},
    "nodes": [{"type": "ChassisNode", "name": "C", "segment": "c",
      "status": 2, "description": "main",
      "properties": {"PropChassisType": 23, "PropModel": "M"},
      "children": [{"type": "SlotNode"}]}]})"),
            "accepted");
}

TEST_F(TreeFileRefusalTest, EmptyTreeIsAccepted) {
  EXPECT_EQ(refusalOf(R"({"nodes": []})"), "accepted");
}

TEST_F(TreeFileRefusalTest, SelectNodeThrowsTheSameMessage) {
  const std::string expected = refusalOf(R"({"nodes": [{"type": 7}]})");
  HX::useHardwareTree(Path);
  HX::Instrumentation cursor;

  try {
    cursor.selectNode(ChassisNode);
    ADD_FAILURE() << "selectNode accepted a refused tree";
  } catch (const HX::InstrumentationError &error) {
    EXPECT_EQ(error.what(), expected);
  }
  EXPECT_EQ(expected, refused("/nodes/0/type: expected a string, found 7"));
}

TEST_F(TreeFileRefusalTest, DocumentMustBeAnObject) {
  EXPECT_EQ(refusalOf(R"([{"type": "ChassisNode"}])"),
            refused("(root): expected an object, found an array"));
}

TEST_F(TreeFileRefusalTest, NodesAreRequired) {
  EXPECT_EQ(refusalOf(R"({"systemName": "x"})"),
            refused("/nodes: missing; expected an array of nodes"));
}

TEST_F(TreeFileRefusalTest, NodesMustBeAnArray) {
  EXPECT_EQ(refusalOf(R"({"nodes": {"type": "ChassisNode"}})"),
            refused("/nodes: expected an array, found an object"));
}

TEST_F(TreeFileRefusalTest, UnknownTopLevelKeyIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [], "sytemName": "x"})"),
            refused("/sytemName: unknown key"));
}

TEST_F(TreeFileRefusalTest, UnknownNodeKeyIsRefusedNotIgnored) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode"}, {"type": "SlotNode"},
    {"type": "SlotNode"}, {"type": "SlotNode", "nmae": "x"}]})"),
            refused("/nodes/3/nmae: unknown key"));
}

TEST_F(TreeFileRefusalTest, NodeMustBeAnObject) {
  EXPECT_EQ(refusalOf(R"({"nodes": [3]})"),
            refused("/nodes/0: expected an object, found 3"));
}

TEST_F(TreeFileRefusalTest, NodeTypeIsRequired) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"name": "x"}]})"),
            refused("/nodes/0/type: missing; expected a node type name"));
}

TEST_F(TreeFileRefusalTest, UnknownNodeTypeNameIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "GizmoNode"}]})"),
            refused("/nodes/0/type: unknown node type \"GizmoNode\""));
}

TEST_F(TreeFileRefusalTest, NodeTypeNamesAreCaseSensitive) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "chassisnode"}]})"),
            refused("/nodes/0/type: unknown node type \"chassisnode\""));
}

TEST_F(TreeFileRefusalTest, NameMustBeAString) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "name": 5}]})"),
            refused("/nodes/0/name: expected a non-empty string, found 5"));
}

TEST_F(TreeFileRefusalTest, NameMustNotBeEmpty) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "name": ""}]})"),
            refused("/nodes/0/name: expected a non-empty string, found \"\""));
}

TEST_F(TreeFileRefusalTest, SegmentMustBeANonEmptyString) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "segment": ""}]})"),
            refused("/nodes/0/segment: expected a non-empty string, found \"\""));
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "segment": null}]})"),
            refused("/nodes/0/segment: expected a non-empty string, found null"));
}

TEST_F(TreeFileRefusalTest, NegativeStatusIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "status": -1}]})"),
            refused("/nodes/0/status: expected an integer from 0 to "
                    "4294967295, found -1"));
}

TEST_F(TreeFileRefusalTest, StatusAbove32BitsIsRefused) {
  EXPECT_EQ(
      refusalOf(R"({"nodes": [{"type": "SlotNode", "status": 4294967296}]})"),
      refused("/nodes/0/status: expected an integer from 0 to 4294967295, "
              "found 4294967296"));
}

TEST_F(TreeFileRefusalTest, FractionalStatusIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "status": 1.5}]})"),
            refused("/nodes/0/status: expected an integer from 0 to "
                    "4294967295, found 1.5"));
}

TEST_F(TreeFileRefusalTest, StatusWrittenAsFloatIsRefusedEvenIfWhole) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "status": 2.0}]})"),
            refused("/nodes/0/status: expected an integer from 0 to "
                    "4294967295, found 2.0"));
}

TEST_F(TreeFileRefusalTest, StatusAsTextOrBooleanIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "status": "3"}]})"),
            refused("/nodes/0/status: expected an integer from 0 to "
                    "4294967295, found \"3\""));
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "status": true}]})"),
            refused("/nodes/0/status: expected an integer from 0 to "
                    "4294967295, found true"));
}

TEST_F(TreeFileRefusalTest, DescriptionMustBeAString) {
  EXPECT_EQ(
      refusalOf(R"({"nodes": [{"type": "SlotNode", "description": ["x"]}]})"),
      refused("/nodes/0/description: expected a string, found an array"));
}

TEST_F(TreeFileRefusalTest, PropertiesMustBeAnObject) {
  EXPECT_EQ(
      refusalOf(R"({"nodes": [{"type": "SlotNode", "properties": [1]}]})"),
      refused("/nodes/0/properties: expected an object, found an array"));
}

TEST_F(TreeFileRefusalTest, UnknownPropertyNameIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropColour": "red"}}]})"),
            refused("/nodes/0/properties/PropColour: unknown property name"));
}

TEST_F(TreeFileRefusalTest, NodeNameInPropertiesIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropNodeName": "S"}}]})"),
            refused("/nodes/0/properties/PropNodeName: not allowed in "
                    "properties; the node's name is given by \"name\""));
}

TEST_F(TreeFileRefusalTest, BooleanPropertyValueIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropSlotNumber": true}}]})"),
            refused("/nodes/0/properties/PropSlotNumber: expected a string or "
                    "an integer from 0 to 4294967295, found true"));
}

TEST_F(TreeFileRefusalTest, NegativePropertyValueIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropSlotNumber": -3}}]})"),
            refused("/nodes/0/properties/PropSlotNumber: expected a string or "
                    "an integer from 0 to 4294967295, found -3"));
}

TEST_F(TreeFileRefusalTest, PropertyValueAbove32BitsIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropSpeed": 10000000000}}]})"),
            refused("/nodes/0/properties/PropSpeed: expected a string or an "
                    "integer from 0 to 4294967295, found 10000000000"));
}

TEST_F(TreeFileRefusalTest, FractionalPropertyValueIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropSlotNumber": 0.5}}]})"),
            refused("/nodes/0/properties/PropSlotNumber: expected a string or "
                    "an integer from 0 to 4294967295, found 0.5"));
}

TEST_F(TreeFileRefusalTest, NullOrContainerPropertyValueIsRefused) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropModel": null}}]})"),
            refused("/nodes/0/properties/PropModel: expected a string or an "
                    "integer from 0 to 4294967295, found null"));
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"PropModel": {"a": 1}}}]})"),
            refused("/nodes/0/properties/PropModel: expected a string or an "
                    "integer from 0 to 4294967295, found an object"));
}

TEST_F(TreeFileRefusalTest, PointerLeadsThroughChildrenToTheProperty) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "ChassisNode", "children": [
    {"type": "SlotNode"}, {"type": "SlotNode"},
    {"type": "SlotNode", "properties": {"PropSlotNumber": "3", "PropType": -1}}
  ]}]})"),
            refused("/nodes/0/children/2/properties/PropType: expected a "
                    "string or an integer from 0 to 4294967295, found -1"));
}

TEST_F(TreeFileRefusalTest, PointerEscapesSlashAndTildeInKeys) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode",
    "properties": {"Prop/Odd~": 1}}]})"),
            refused("/nodes/0/properties/Prop~1Odd~0: unknown property name"));
}

TEST_F(TreeFileRefusalTest, ChildrenMustBeAnArray) {
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "children": {}}]})"),
            refused("/nodes/0/children: expected an array, found an object"));
}

TEST_F(TreeFileRefusalTest, SystemNameMustBeANonEmptyString) {
  EXPECT_EQ(refusalOf(R"({"nodes": [], "systemName": 12})"),
            refused("/systemName: expected a non-empty string, found 12"));
  EXPECT_EQ(refusalOf(R"({"nodes": [], "systemName": ""})"),
            refused("/systemName: expected a non-empty string, found \"\""));
}

TEST_F(TreeFileRefusalTest, FaultsMustBeAnObjectOfKnownKeys) {
  EXPECT_EQ(refusalOf(R"({"nodes": [], "faults": ["SlotNode"]})"),
            refused("/faults: expected an object, found an array"));
  EXPECT_EQ(refusalOf(R"({"nodes": [], "faults": {"throwOnSelection": []}})"),
            refused("/faults/throwOnSelection: unknown key"));
}

TEST_F(TreeFileRefusalTest, ThrowOnSelectMustListKnownNodeTypes) {
  EXPECT_EQ(refusalOf(R"({"nodes": [], "faults": {"throwOnSelect": "SlotNode"}})"),
            refused("/faults/throwOnSelect: expected an array, found "
                    "\"SlotNode\""));
  EXPECT_EQ(refusalOf(R"({"nodes": [],
    "faults": {"throwOnSelect": ["SlotNode", "GizmoNode"]}})"),
            refused("/faults/throwOnSelect/1: unknown node type "
                    "\"GizmoNode\""));
}

TEST_F(TreeFileRefusalTest, LongFoundTextIsShortened) {
  const std::string longName(200, 'x');
  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": ")" + longName + R"("}]})"),
            refused("/nodes/0/type: unknown node type \"" +
                    std::string(59, 'x') + "...\""));
}

TEST_F(TreeFileRefusalTest, ParseErrorGivesLineAndColumn) {
  EXPECT_THAT(refusalOf("{\"nodes\": [\n  {\"type\": \"SlotNode\",}\n]}"),
              StartsWith(Path + ": parse error at line 2, column 23: "));
}

TEST_F(TreeFileRefusalTest, ParseErrorOmitsTheLibraryExceptionId) {
  EXPECT_THAT(refusalOf("{\"nodes\": [}"),
              ::testing::Not(HasSubstr("json.exception")));
}

TEST_F(TreeFileRefusalTest, EmptyFileIsAParseError) {
  EXPECT_THAT(refusalOf(""),
              StartsWith(Path + ": parse error at line 1, column 1: "));
}

TEST_F(TreeFileRefusalTest, TrailingTextIsAParseError) {
  EXPECT_THAT(refusalOf("{\"nodes\": []} {}"),
              StartsWith(Path + ": parse error at line 1, column 15: "));
}

TEST_F(TreeFileRefusalTest, InvalidUtf8IsAParseError) {
  EXPECT_THAT(refusalOf("{\"nodes\": [{\"type\": \"SlotNode\", \"name\": \"\xff\"}]}"),
              StartsWith(Path + ": parse error at line 1, column "));
}

TEST_F(TreeFileRefusalTest, MissingFileNamesTheFileAndTheSystemError) {
  const std::string missing = Scratch.pathOf("absent.json");

  EXPECT_EQ(HX::checkHardwareTree(missing),
            missing + ": cannot read: No such file or directory");
}

TEST_F(TreeFileRefusalTest, MissingFileMakesSelectNodeThrow) {
  const std::string missing = Scratch.pathOf("absent.json");
  HX::useHardwareTree(missing);
  HX::Instrumentation cursor;

  try {
    cursor.selectNode(SlotNode);
    ADD_FAILURE() << "selectNode read a missing file";
  } catch (const HX::InstrumentationError &error) {
    EXPECT_EQ(std::string(error.what()),
              missing + ": cannot read: No such file or directory");
  }
}

TEST_F(TreeFileRefusalTest, DirectoryIsRefusedAsUnreadable) {
  const std::string directory = Scratch.pathOf("");

  EXPECT_EQ(HX::checkHardwareTree(directory),
            directory + ": cannot read: Is a directory");
}

/// Nodes nested \p levels deep, each a single child of the one above.
std::string nestedNodes(unsigned levels) {
  std::string json = R"({"nodes": [)";
  for (unsigned level = 1; level <= levels; ++level)
    json += level == levels ? R"({"type": "SlotNode"})"
                            : R"({"type": "SlotNode", "children": [)";
  for (unsigned level = 1; level < levels; ++level)
    json += "]}";
  return json + "]}";
}

TEST_F(TreeFileRefusalTest, SixtyFourLevelsOfNodesAreAccepted) {
  EXPECT_EQ(refusalOf(nestedNodes(64)), "accepted");
}

TEST_F(TreeFileRefusalTest, SixtyFiveLevelsOfNodesAreRefusedAtTheDeepestNode) {
  std::string pointer = "/nodes/0";
  for (int level = 2; level <= 65; ++level)
    pointer += "/children/0";

  EXPECT_EQ(refusalOf(nestedNodes(65)),
            refused(pointer + ": nodes nested deeper than 64 levels"));
}

TEST_F(TreeFileRefusalTest, HostileNodeNestingIsRefusedWithoutExhaustingTheStack) {
  EXPECT_THAT(refusalOf(nestedNodes(200000)),
              HasSubstr(": nodes nested deeper than 64 levels"));
}

TEST_F(TreeFileRefusalTest, HostileArrayNestingIsRefusedWithoutExhaustingTheStack) {
  const std::string deep =
      std::string(1000000, '[') + std::string(1000000, ']');

  EXPECT_EQ(refusalOf(R"({"nodes": [{"type": "SlotNode", "description": )" +
                      deep + "}]}"),
            refused("/nodes/0/description: expected a string, found an array"));
}

} // namespace
