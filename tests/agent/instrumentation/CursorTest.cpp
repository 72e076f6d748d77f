//===- CursorTest.cpp - How HX::Instrumentation walks a hardware tree -----===//

#include "HX/HardwareSource.h"
#include "HX/Instrumentation.h"

#include "ScratchDirectory.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using namespace HX::NodeLexicon;
using HX::Instrumentation;

class CursorTest : public ::testing::Test {
protected:
  void useTree(const std::string &json) {
    HX::useHardwareTree(Scratch.write("tree.json", json));
  }

  /// The readable path of every node of \p type, in walking order.
  static std::vector<std::string> walk(NodeType type) {
    std::vector<std::string> paths;
    Instrumentation cursor;
    for (cursor.selectNode(type); cursor; ++cursor)
      paths.push_back(cursor.convertPathToString(cursor.getPathToNode()));
    return paths;
  }

  hxtest::ScratchDirectory Scratch;
};

using Paths = std::vector<std::string>;

TEST_F(CursorTest, NewCursorStandsOnNoNodeAndReadsNothing) {
  Instrumentation cursor;
  std::string text = "untouched";
  unsigned number = 7;

  EXPECT_FALSE(cursor);
  EXPECT_FALSE(cursor.getProperty(PropNodeName, text));
  EXPECT_FALSE(cursor.getProperty(PropSlotNumber, number));
  EXPECT_EQ(text, "untouched");
  EXPECT_EQ(number, 7u);
  EXPECT_EQ(cursor.getPathToNode(), "");
  EXPECT_EQ(cursor.getNodeStatus(), 0u);
  EXPECT_EQ(cursor.getNodeDescription(), "");
  ++cursor;
  EXPECT_FALSE(cursor);
}

TEST_F(CursorTest, SelectionWalksNodesOfTheTypeDepthFirstParentsBeforeChildren) {
  useTree(R"({"nodes": [
    {"type": "ChassisNode", "name": "A", "children": [
      {"type": "BaseboardNode", "name": "Board", "children": [
        {"type": "SlotNode", "name": "A1"}]},
      {"type": "SlotNode", "name": "A2", "children": [
        {"type": "SlotNode", "name": "A2a"}]}]},
    {"type": "ChassisNode", "name": "B", "children": [
      {"type": "SlotNode", "name": "B1"}]},
    {"type": "SlotNode", "name": "R"}]})");

  EXPECT_EQ(walk(SlotNode),
            (Paths{"/A/Board/A1", "/A/A2", "/A/A2/A2a", "/B/B1", "/R"}));
  EXPECT_EQ(walk(ChassisNode), (Paths{"/A", "/B"}));
}

TEST_F(CursorTest, SelectingATypeTheTreeLacksStandsOnNoNode) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "A"}]})");
  Instrumentation cursor;

  cursor.selectNode(NetworkCardNode);

  EXPECT_FALSE(cursor);
  EXPECT_EQ(cursor.getPathToNode(), "");
}

TEST_F(CursorTest, SelectingAValueThatIsNoNodeTypeStandsOnNoNode) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "A"}]})");
  Instrumentation cursor;

  cursor.selectNode(static_cast<NodeType>(999999));

  EXPECT_FALSE(cursor);
}

TEST_F(CursorTest, PathTextIsSlashAndSegmentsFromTheRoot) {
  useTree(R"({"nodes": [{"type": "SystemNode", "name": "System", "children": [
    {"type": "ChassisNode", "name": "Chassis 1", "children": [
      {"type": "SlotNode", "name": "PCIe Slot 3"}]}]}]})");

  EXPECT_EQ(walk(SlotNode), (Paths{"/System/Chassis 1/PCIe Slot 3"}));
}

TEST_F(CursorTest, SegmentReplacesTheNameInThePathButNotAsTheName) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Chassis 1",
    "segment": "chassis1", "children": [
      {"type": "SlotNode", "name": "PCIe Slot 3", "segment": "slot3"}]}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  std::string name;

  ASSERT_TRUE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "PCIe Slot 3");
  EXPECT_EQ(cursor.convertPathToString(cursor.getPathToNode()),
            "/chassis1/slot3");
}

TEST_F(CursorTest, UnnamedNodeSegmentIsTypeAndOrdinalAmongSameTypedSiblings) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "C", "children": [
    {"type": "SlotNode"},
    {"type": "ConnectorNode"},
    {"type": "SlotNode", "name": "Named"},
    {"type": "SlotNode"},
    {"type": "ConnectorNode", "segment": "back"},
    {"type": "ConnectorNode"}]}]})");

  EXPECT_EQ(walk(SlotNode),
            (Paths{"/C/SlotNode#0", "/C/Named", "/C/SlotNode#2"}));
  EXPECT_EQ(walk(ConnectorNode),
            (Paths{"/C/ConnectorNode#0", "/C/back", "/C/ConnectorNode#2"}));
}

TEST_F(CursorTest, OrdinalsStartAgainUnderEachParentAndAmongRoots) {
  useTree(R"({"nodes": [
    {"type": "ChassisNode", "children": [{"type": "SlotNode"}]},
    {"type": "ChassisNode", "children": [{"type": "SlotNode"}]}]})");

  EXPECT_EQ(walk(ChassisNode), (Paths{"/ChassisNode#0", "/ChassisNode#1"}));
  EXPECT_EQ(walk(SlotNode),
            (Paths{"/ChassisNode#0/SlotNode#0", "/ChassisNode#1/SlotNode#0"}));
}

TEST_F(CursorTest, NodesMayShareAPathTextAndStayDistinctNodes) {
  useTree(R"({"nodes": [{"type": "NetworkCardNode", "name": "Card", "children": [
    {"type": "ConnectorNode", "name": "Port", "properties": {"PropPortType": 1}},
    {"type": "ConnectorNode", "name": "Port", "properties": {"PropPortType": 2}}]}]})");
  Instrumentation cursor;
  cursor.selectNode(ConnectorNode);
  Instrumentation second = cursor;
  ++second;
  unsigned firstType = 0, secondType = 0;

  ASSERT_TRUE(second);
  EXPECT_EQ(cursor.convertPathToString(cursor.getPathToNode()), "/Card/Port");
  EXPECT_EQ(second.convertPathToString(second.getPathToNode()), "/Card/Port");
  EXPECT_NE(cursor.getPathToNode(), second.getPathToNode());
  ASSERT_TRUE(cursor.getProperty(PropPortType, firstType));
  ASSERT_TRUE(second.getProperty(PropPortType, secondType));
  EXPECT_EQ(firstType, 1u);
  EXPECT_EQ(secondType, 2u);
}

TEST_F(CursorTest, ConvertingANodePathGivesTheSameTextEveryTime) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "Chassis 1"}]})");
  Instrumentation cursor;
  cursor.selectNode(ChassisNode);
  const std::string path = cursor.getPathToNode();
  Instrumentation elsewhere;
  elsewhere.selectNode(ChassisNode);

  EXPECT_EQ(cursor.convertPathToString(path), "/Chassis 1");
  EXPECT_EQ(cursor.convertPathToString(path), "/Chassis 1");
  EXPECT_EQ(elsewhere.getPathToNode(), path);
  EXPECT_EQ(Instrumentation().convertPathToString(path), "/Chassis 1");
}

TEST_F(CursorTest, ConvertingTextThatIsNoInternalPathReturnsItUnchanged) {
  Instrumentation cursor;

  EXPECT_EQ(cursor.convertPathToString("/System/Chassis 1"), "/System/Chassis 1");
  EXPECT_EQ(cursor.convertPathToString(""), "");
  EXPECT_EQ(cursor.convertPathToString("hxpath:"), "hxpath:");
  EXPECT_EQ(cursor.convertPathToString("hxpath:0:"), "hxpath:0:");
  EXPECT_EQ(cursor.convertPathToString("hxpath:x:/A"), "hxpath:x:/A");
  EXPECT_EQ(cursor.convertPathToString("hxpath:1..2:/A"), "hxpath:1..2:/A");
  EXPECT_EQ(cursor.convertPathToString("hxpath:1.:/A"), "hxpath:1.:/A");
  EXPECT_EQ(cursor.convertPathToString("hxpath:1:A"), "hxpath:1:A");
}

TEST_F(CursorTest, StatusAndDescriptionDefaultToZeroAndEmpty) {
  useTree(R"({"nodes": [
    {"type": "SlotNode", "name": "Plain"},
    {"type": "SlotNode", "name": "Told", "status": 4294967295,
     "description": "Riser slot, x16"}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);

  EXPECT_EQ(cursor.getNodeStatus(), 0u);
  EXPECT_EQ(cursor.getNodeDescription(), "");
  ++cursor;
  EXPECT_EQ(cursor.getNodeStatus(), 4294967295u);
  EXPECT_EQ(cursor.getNodeDescription(), "Riser slot, x16");
}

TEST_F(CursorTest, StringPropertyReadsOnlyThroughTheStringOverload) {
  useTree(R"({"nodes": [{"type": "ChassisNode",
    "properties": {"PropManufacturer": "Acme", "PropSerialNumber": "42"}}]})");
  Instrumentation cursor;
  cursor.selectNode(ChassisNode);
  std::string text;
  unsigned number = 9;

  ASSERT_TRUE(cursor.getProperty(PropManufacturer, text));
  EXPECT_EQ(text, "Acme");
  EXPECT_FALSE(cursor.getProperty(PropSerialNumber, number));
  EXPECT_EQ(number, 9u);
}

TEST_F(CursorTest, NumericPropertyReadsOnlyThroughTheUnsignedOverload) {
  useTree(R"({"nodes": [{"type": "ChassisNode",
    "properties": {"PropChassisType": 23, "PropFormFactor": 4294967295}}]})");
  Instrumentation cursor;
  cursor.selectNode(ChassisNode);
  unsigned number = 0;
  std::string text = "untouched";

  ASSERT_TRUE(cursor.getProperty(PropChassisType, number));
  EXPECT_EQ(number, 23u);
  ASSERT_TRUE(cursor.getProperty(PropFormFactor, number));
  EXPECT_EQ(number, 4294967295u);
  EXPECT_FALSE(cursor.getProperty(PropChassisType, text));
  EXPECT_EQ(text, "untouched");
}

TEST_F(CursorTest, AbsentPropertyLeavesTheOutputUntouched) {
  useTree(R"({"nodes": [{"type": "ChassisNode",
    "properties": {"PropModel": "X1"}}]})");
  Instrumentation cursor;
  cursor.selectNode(ChassisNode);
  std::string text = "untouched";
  unsigned number = 5;

  EXPECT_FALSE(cursor.getProperty(PropSerialNumber, text));
  EXPECT_FALSE(cursor.getProperty(PropChassisType, number));
  EXPECT_EQ(text, "untouched");
  EXPECT_EQ(number, 5u);
}

TEST_F(CursorTest, NameIsTheNodeNamePropertyAndAbsentWithoutName) {
  useTree(R"({"nodes": [
    {"type": "SlotNode", "name": "Slot 1"},
    {"type": "SlotNode"}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  std::string name;

  ASSERT_TRUE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "Slot 1");
  ++cursor;
  name = "untouched";
  EXPECT_FALSE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "untouched");
}

TEST_F(CursorTest, PastTheLastNodeTheCursorStaysOffAndReadsNothing) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "Only",
    "status": 3, "description": "d", "properties": {"PropSlotNumber": 1}}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  ASSERT_TRUE(cursor);

  ++cursor;
  ++cursor;

  unsigned number = 77;
  std::string text = "untouched";
  EXPECT_FALSE(cursor);
  EXPECT_FALSE(cursor.getProperty(PropSlotNumber, number));
  EXPECT_FALSE(cursor.getProperty(PropNodeName, text));
  EXPECT_EQ(number, 77u);
  EXPECT_EQ(text, "untouched");
  EXPECT_EQ(cursor.getPathToNode(), "");
  EXPECT_EQ(cursor.getNodeStatus(), 0u);
  EXPECT_EQ(cursor.getNodeDescription(), "");
}

TEST_F(CursorTest, CopyStandsOnTheSameNodeAndMovesIndependently) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "S0"},
    {"type": "SlotNode", "name": "S1"}, {"type": "SlotNode", "name": "S2"}]})");
  Instrumentation original;
  original.selectNode(SlotNode);
  ++original;

  Instrumentation copy(original);
  EXPECT_EQ(copy.getPathToNode(), original.getPathToNode());
  ++copy;

  std::string name;
  ASSERT_TRUE(original.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "S1");
  ASSERT_TRUE(copy.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "S2");
  ++copy;
  EXPECT_FALSE(copy);
  EXPECT_TRUE(original);
}

TEST_F(CursorTest, CopyAssignmentStandsOnTheSameNode) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "S0"},
    {"type": "SlotNode", "name": "S1"}]})");
  Instrumentation original;
  original.selectNode(SlotNode);
  ++original;
  Instrumentation assigned;

  assigned = original;

  std::string name;
  ASSERT_TRUE(assigned.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "S1");
}

TEST_F(CursorTest, MovedFromCursorStandsOnNoNode) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "S0"}]})");
  Instrumentation original;
  original.selectNode(SlotNode);

  Instrumentation moved(std::move(original));
  Instrumentation assigned;
  assigned = std::move(moved);

  std::string name;
  EXPECT_FALSE(original); // NOLINT(bugprone-use-after-move): pinned on purpose
  EXPECT_FALSE(moved);    // NOLINT(bugprone-use-after-move)
  ASSERT_TRUE(assigned.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "S0");
}

TEST_F(CursorTest, CopyKeepsReadingItsSnapshotAfterTheFileChanges) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "Before"}]})");
  Instrumentation before;
  before.selectNode(SlotNode);
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "After, longer"}]})");
  Instrumentation copy = before;
  Instrumentation after;
  after.selectNode(SlotNode);

  std::string name;
  ASSERT_TRUE(copy.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "Before");
  ASSERT_TRUE(after.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "After, longer");
}

TEST_F(CursorTest, SelectingAgainStartsOverAtTheFirstNode) {
  useTree(R"({"nodes": [{"type": "ChassisNode", "name": "C", "children": [
    {"type": "SlotNode", "name": "S0"}, {"type": "SlotNode", "name": "S1"}]}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  ++cursor;
  ++cursor;
  ASSERT_FALSE(cursor);

  cursor.selectNode(SlotNode);
  std::string name;
  ASSERT_TRUE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "S0");

  cursor.selectNode(ChassisNode);
  ASSERT_TRUE(cursor.getProperty(PropNodeName, name));
  EXPECT_EQ(name, "C");
}

TEST_F(CursorTest, FaultListedTypeThrowsOnSelectAndLeavesTheCursorOff) {
  useTree(R"({"faults": {"throwOnSelect": ["SlotNode"]}, "nodes": [
    {"type": "ChassisNode", "name": "C", "children": [
      {"type": "SlotNode", "name": "S"}]}]})");
  Instrumentation cursor;
  cursor.selectNode(ChassisNode);
  ASSERT_TRUE(cursor);

  EXPECT_THROW(cursor.selectNode(SlotNode), HX::InstrumentationError);
  EXPECT_FALSE(cursor);
  EXPECT_EQ(cursor.getPathToNode(), "");
  cursor.selectNode(ChassisNode);
  EXPECT_TRUE(cursor);
}

TEST_F(CursorTest, InstrumentationErrorIsARuntimeError) {
  useTree(R"({"faults": {"throwOnSelect": ["ConnectorNode"]}, "nodes": []})");
  Instrumentation cursor;

  EXPECT_THROW(cursor.selectNode(ConnectorNode), std::runtime_error);
}

TEST_F(CursorTest, RefusedTreeThrowsOnSelectAndLeavesTheCursorOff) {
  useTree(R"({"nodes": [{"type": "SlotNode", "name": "S"}]})");
  Instrumentation cursor;
  cursor.selectNode(SlotNode);
  ASSERT_TRUE(cursor);
  useTree(R"({"nodes": [{"type": "SlotNode", "nmae": "S"}]})");

  EXPECT_THROW(cursor.selectNode(SlotNode), HX::InstrumentationError);
  EXPECT_FALSE(cursor);
  ++cursor;
  EXPECT_FALSE(cursor);
}

TEST_F(CursorTest, DescribesTheTreeFileInUse) {
  const std::string path = Scratch.write("lab.json", R"({"nodes": []})");
  HX::useHardwareTree(path);

  EXPECT_EQ(HX::describeHardwareSource(), "tree file " + path);
}

TEST_F(CursorTest, LiveMachineIsDescribedWithItsRoot) {
  HX::useLiveMachine("/srv/machines/m7");

  EXPECT_EQ(HX::describeHardwareSource(), "live machine at /srv/machines/m7");
}

} // namespace
