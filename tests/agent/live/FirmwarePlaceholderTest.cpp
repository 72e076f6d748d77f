//===- FirmwarePlaceholderTest.cpp - Firmware fillers count as absent -----===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

/// The serial number a chassis with serial string \p serial reads as.
std::optional<std::string> chassisSerialReadFrom(const std::string &serial) {
  RecordedMachine machine;
  ChassisInformation chassis;
  chassis.serialNumber = serial;
  machine.writeSmbios(SmbiosTable().add(chassis).add(endOfTable()));
  HX::useLiveMachine(machine.root());
  return nodesOf(ChassisNode).at(0).text(PropSerialNumber);
}

class FirmwarePlaceholder : public ::testing::TestWithParam<const char *> {};

TEST_P(FirmwarePlaceholder, CountsAsAbsent) {
  EXPECT_EQ(chassisSerialReadFrom(GetParam()), std::nullopt);
}

INSTANTIATE_TEST_SUITE_P(
    Fillers, FirmwarePlaceholder,
    ::testing::Values("To Be Filled By O.E.M.", "To be filled by O.E.M.",
                      "Default string", "Not Specified", "NOT SPECIFIED",
                      "Not Applicable", "Not Available", "None", "N/A",
                      "Unknown", "System Serial Number",
                      "Chassis Serial Number", "Base Board Serial Number",
                      "0123456789", "OEM", "   ", "\t \t", "0", "00000000",
                      "XXXXXXXXXX", "xxxxxx", "..........", "----", "FFFFFFFF",
                      "  To Be Filled By O.E.M.  ", "\xFF\xFF\xFF\xFF"));

TEST(FirmwareText, RealValueIsKeptWithoutSurroundingBlanks) {
  EXPECT_EQ(chassisSerialReadFrom("  CZJ7Q2481 "), "CZJ7Q2481");
}

TEST(FirmwareText, ValueThatMerelyContainsAFillerIsKept) {
  EXPECT_EQ(chassisSerialReadFrom("Default string 2"), "Default string 2");
  EXPECT_EQ(chassisSerialReadFrom("00000001"), "00000001");
}

TEST(FirmwareText, ValidUtf8IsKept) {
  EXPECT_EQ(chassisSerialReadFrom("Gehäuse-Ø7"), "Gehäuse-Ø7");
}

TEST(FirmwareText, BytesThatAreNotTextReadAsReplacementCharacters) {
  EXPECT_EQ(chassisSerialReadFrom("CZ\xFFJ7\x01Q"),
            "CZ\xEF\xBF\xBDJ7\xEF\xBF\xBDQ");
}

TEST(FirmwareText, OverlongAndSurrogateSequencesAreNotText) {
  EXPECT_EQ(chassisSerialReadFrom("A\xC0\xAF"
                                  "B\xED\xA0\x80"
                                  "C"),
            "A\xEF\xBF\xBD\xEF\xBF\xBD"
            "B\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD"
            "C");
}

TEST(FirmwareText, OddBytesAreLoggedOnceAt6000) {
  RecordedMachine machine;
  ChassisInformation chassis;
  chassis.serialNumber = "CZ\xFFJ7";
  machine.writeSmbios(SmbiosTable().add(chassis).add(endOfTable()));
  LoggedProblems problems;
  HX::useLiveMachine(machine.root());

  for (int i = 0; i < 3; ++i)
    nodesOf(ChassisNode);

  ASSERT_EQ(problems.texts().size(), 1u);
  EXPECT_EQ(problems.texts()[0],
            machine.path("/sys/firmware/dmi/tables/DMI") +
                ": string 1 of the structure (type 3, handle 0x0300) holds "
                "bytes that are not text; they read as U+FFFD");
  EXPECT_EQ(problems.levels()[0], 6000);
}

TEST(FirmwareText, PlaceholdersOfTheLaptopAreAbsent) {
  RecordedMachine machine;
  recordLaptop(machine);
  HX::useLiveMachine(machine.root());

  const SeenNode system = nodesOf(SystemNode).at(0);
  const SeenNode chassis = nodesOf(ChassisNode).at(0);

  EXPECT_FALSE(system.has(PropSerialNumber));
  EXPECT_FALSE(system.has(PropVersion));
  EXPECT_EQ(system.text(PropManufacturer), "Korvane");
  EXPECT_FALSE(chassis.has(PropModel));
  EXPECT_FALSE(chassis.has(PropSerialNumber));
  EXPECT_FALSE(chassis.has(PropAssetTag));
}

TEST(FirmwareText, DmiAttributePlaceholdersAreAbsent) {
  RecordedMachine machine;
  machine.writeDmiAttribute("product_serial", "System Serial Number");
  machine.writeDmiAttribute("sys_vendor", "Korvane");
  HX::useLiveMachine(machine.root());

  const SeenNode system = nodesOf(SystemNode).at(0);

  EXPECT_FALSE(system.has(PropSerialNumber));
  EXPECT_EQ(system.text(PropManufacturer), "Korvane");
}

} // namespace
