//===- OddSmbiosTableTest.cpp - Broken tables never crash, are logged once ===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <fstream>
#include <iterator>
#include <random>

namespace {

using namespace hxlive;

ChassisInformation chassisOfType(unsigned type) {
  ChassisInformation chassis;
  chassis.type = type;
  return chassis;
}

SystemSlot slotNamed(const std::string &designation) {
  SystemSlot slot;
  slot.designation = designation;
  return slot;
}

class OddSmbiosTable : public ::testing::Test {
protected:
  /// Selects every node type a few times, as providers do.
  void selectRepeatedly() {
    for (int i = 0; i < 3; ++i)
      for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode})
        nodesOf(type);
  }
  std::string tablePath() const {
    return Machine.path("/sys/firmware/dmi/tables/DMI");
  }

  RecordedMachine Machine;
  LoggedProblems Problems;
};

TEST_F(OddSmbiosTable,
       LengthShorterThanTheHeaderEndsTheWalkKeepingWhatCameFirst) {
  const SmbiosTable before =
      SmbiosTable().add(chassisOfType(23)).add(slotNamed("Slot A"));
  SmbiosTable table = before;
  table.add(slotNamed("Slot B").structure().claimLength(2))
      .add(slotNamed("Slot C"))
      .add(endOfTable());
  Machine.writeSmbios(table);
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(namesOf(SlotNode),
            std::vector<std::optional<std::string>>{"Slot A"});
  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 23u);
  char offset[8];
  std::snprintf(offset, sizeof offset, "0x%04zx", before.bytes().size());
  EXPECT_EQ(Problems.texts(),
            std::vector<std::string>{
                tablePath() + ": the structure at offset " + offset +
                " (type 9, handle 0x0900) gives its length as 2, shorter "
                "than its header; the rest of the table is ignored"});
}

TEST_F(OddSmbiosTable, StructureRunningPastTheEndIsLeftOut) {
  Machine.writeSmbios(
      SmbiosTable()
          .add(chassisOfType(23))
          .add(slotNamed("Slot A").structure().claimLength(200)));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_TRUE(nodesOf(SlotNode).empty());
  EXPECT_EQ(nodesOf(ChassisNode).size(), 1u);
  EXPECT_EQ(Problems.mentioning("is 200 bytes long and runs past the end of "
                                "the table"),
            1);
}

TEST_F(OddSmbiosTable, StringsWithoutTerminatorKeepTheWholeStrings) {
  SmbiosStructure slot = slotNamed("Slot A").structure();
  Machine.writeSmbios(
      SmbiosTable().add(chassisOfType(23)).add(slot.withoutTerminator()));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(SlotNode).size(), 1u);
  EXPECT_EQ(Problems.mentioning("strings of the structure"), 1);
  EXPECT_EQ(Problems.mentioning("run past the end of the table"), 1);
}

TEST_F(OddSmbiosTable, TableEndingInAPartialHeaderKeepsTheStructuresBefore) {
  Machine.writeSmbios(SmbiosTable().add(chassisOfType(10)).raw("\x09\x11"));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 10u);
  EXPECT_EQ(Problems.mentioning("ends in the middle of a structure header"), 1);
}

TEST_F(OddSmbiosTable, HugeAnnouncedStructureCountIsLoggedOnce) {
  const SmbiosTable table =
      SmbiosTable().add(chassisOfType(23)).add(slotNamed("Slot A"));
  Machine.writeSmbios(
      entryPoint2(2, 8, static_cast<unsigned>(table.bytes().size()), 65535),
      table.bytes());
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(SlotNode).size(), 1u);
  EXPECT_EQ(Problems.texts(),
            std::vector<std::string>{
                tablePath() + ": the entry point announces 65535 structures, "
                              "but the table ends after 2"});
}

TEST_F(OddSmbiosTable, AnnouncedCountEndsTheWalk) {
  const SmbiosTable table = SmbiosTable()
                                .add(chassisOfType(23))
                                .add(slotNamed("Slot A"))
                                .add(slotNamed("Slot B"));
  Machine.writeSmbios(
      entryPoint2(2, 8, static_cast<unsigned>(table.bytes().size()), 2),
      table.bytes());
  HX::useLiveMachine(Machine.root());

  EXPECT_EQ(namesOf(SlotNode),
            std::vector<std::optional<std::string>>{"Slot A"});
  EXPECT_TRUE(Problems.texts().empty());
}

TEST_F(OddSmbiosTable, HugeContainedElementCountLeavesTheSkuOut) {
  ChassisInformation chassis = chassisOfType(23);
  chassis.containedCount = 255;
  chassis.containedRecordLength = 255;
  chassis.sku = "SKU";
  Machine.writeSmbios(SmbiosTable().add(chassis).add(endOfTable()));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_FALSE(nodesOf(ChassisNode).at(0).has(PropPartNumber));
  EXPECT_EQ(Problems.mentioning("announces 255 contained elements of 255 "
                                "bytes, more than its 22 bytes hold"),
            1);
}

TEST_F(OddSmbiosTable, StringNumberBeyondTheStringsIsAbsent) {
  SmbiosStructure chassis(3, 0x0300);
  chassis.text("Korvane").byte(23).stringNumber(7);
  Machine.writeSmbios(SmbiosTable().add(chassis).add(endOfTable()));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  const SeenNode node = nodesOf(ChassisNode).at(0);
  EXPECT_EQ(node.text(PropManufacturer), "Korvane");
  EXPECT_FALSE(node.has(PropModel));
  EXPECT_EQ(Problems.mentioning("refers to string 7 but has 1"), 1);
}

TEST_F(OddSmbiosTable, StructureShorterThanItsTypeGivesWhatItHolds) {
  SmbiosStructure slot(9, 0x0900);
  slot.text("Short Slot").byte(0xB6);
  Machine.writeSmbios(SmbiosTable().add(slot).add(endOfTable()));
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  const SeenNode node = nodesOf(SlotNode).at(0);
  EXPECT_EQ(node.name(), "Short Slot");
  EXPECT_EQ(node.number(PropType), 23u);
  EXPECT_FALSE(node.has(PropSlotNumber));
  EXPECT_EQ(Problems.mentioning("is 6 bytes long, shorter than the 12 its "
                                "type needs"),
            1);
}

TEST_F(OddSmbiosTable, TableWithoutAWholeStructureFallsBackToDmiAttributes) {
  Machine.writeSmbios(entryPoint3(3, 3, 3), "\x03\x02\x00");
  Machine.writeDmiAttribute("chassis_type", "9");
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 9u);
  EXPECT_EQ(Problems.mentioning("holds no whole structure"), 1);
}

TEST_F(OddSmbiosTable, EntryPointWithAWrongChecksumIsLoggedAndStillRead) {
  std::string entryPoint = entryPoint3(3, 3, 100);
  entryPoint[5] = static_cast<char>(entryPoint[5] + 1);
  Machine.writeSmbios(
      entryPoint,
      SmbiosTable().add(chassisOfType(23)).add(endOfTable()).bytes());
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 23u);
  EXPECT_EQ(Problems.texts(),
            std::vector<std::string>{
                Machine.path("/sys/firmware/dmi/tables/smbios_entry_point") +
                ": the 64-bit entry point's checksum is wrong"});
}

TEST_F(OddSmbiosTable, GarbageEntryPointStillLetsTheTableBeRead) {
  Machine.writeSmbios(
      "garbage",
      SmbiosTable().add(chassisOfType(23)).add(endOfTable()).bytes());
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 23u);
  EXPECT_EQ(Problems.mentioning("not an SMBIOS entry point"), 1);
}

TEST_F(OddSmbiosTable, CutShortEntryPointIsLogged) {
  Machine.writeSmbios(
      entryPoint3(3, 3, 100).substr(0, 10),
      SmbiosTable().add(chassisOfType(23)).add(endOfTable()).bytes());
  HX::useLiveMachine(Machine.root());

  selectRepeatedly();

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 23u);
  EXPECT_EQ(Problems.mentioning("64-bit entry point is 10 bytes long, shorter "
                                "than its 24"),
            1);
}

TEST_F(OddSmbiosTable, LegacyEntryPointIsUnderstood) {
  const SmbiosTable table = SmbiosTable().add(chassisOfType(3));
  Machine.writeSmbios(
      legacyEntryPoint(0x21, static_cast<unsigned>(table.bytes().size()), 1),
      table.bytes());
  HX::useLiveMachine(Machine.root());

  EXPECT_EQ(nodesOf(ChassisNode).at(0).number(PropChassisType), 3u);
  EXPECT_TRUE(Problems.texts().empty());
}

TEST_F(OddSmbiosTable,
       EveryTruncationOfARealTableGivesAChassisWithoutCrashing) {
  RecordedMachine full;
  recordRackServer(full);
  std::string bytes;
  {
    std::ifstream in(full.path("/sys/firmware/dmi/tables/DMI"),
                     std::ios::binary);
    bytes.assign(std::istreambuf_iterator<char>(in), {});
  }
  ASSERT_GT(bytes.size(), 300u);
  for (std::size_t length = 0; length <= bytes.size(); ++length) {
    Machine.writeSmbios(entryPoint3(3, 3, static_cast<std::uint32_t>(length)),
                        bytes.substr(0, length));
    HX::useLiveMachine(Machine.root());
    for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode}) {
      HX::Instrumentation cursor;
      cursor.selectNode(type);
      if (type == ChassisNode) {
        EXPECT_TRUE(cursor) << "table cut at " << length;
      }
    }
  }
}

TEST_F(OddSmbiosTable, RandomBytesNeverCrashTheReader) {
  std::mt19937 random(20240611);
  for (int round = 0; round < 300; ++round) {
    std::string bytes(random() % 600, '\0');
    for (char &byte : bytes)
      byte = static_cast<char>(random() % 256);
    // Bias towards the structure types the reader decodes.
    for (std::size_t at = 0; at + 1 < bytes.size(); at += 1 + random() % 40)
      bytes[at] = static_cast<char>("\x01\x03\x08\x09\x7f"[random() % 5]);
    Machine.writeSmbios(
        entryPoint3(3, 3, static_cast<std::uint32_t>(bytes.size())), bytes);
    HX::useLiveMachine(Machine.root());
    HX::Instrumentation cursor;
    for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode})
      cursor.selectNode(type);
    cursor.selectNode(ChassisNode);
    EXPECT_TRUE(cursor) << "round " << round;
  }
}

} // namespace
