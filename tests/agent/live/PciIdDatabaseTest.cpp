//===- PciIdDatabaseTest.cpp - Names from the PCI ID database -------------===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

namespace {

using namespace hxlive;

void recordCard(RecordedMachine &machine) {
  machine.pciFunction("0000:01:00.0", 0x020000, 0x8086, 0x1572, 0x8086, 0x0007);
}

TEST(PciIdDatabase, NamesComeFromTheDatabaseBelowTheRoot) {
  RecordedMachine machine;
  recordCard(machine);
  machine.writePciIds("8086  Korvane Test Vendor\n"
                      "\t1572  Korvane Test Card\n");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).description,
            "Korvane Test Vendor Korvane Test Card");
}

TEST(PciIdDatabase, DatabaseInTheHwdataPlaceIsFoundToo) {
  RecordedMachine machine;
  recordCard(machine);
  machine.writeFile("/usr/share/hwdata/pci.ids", "8086  Hwdata Vendor\n");
  HX::useLiveMachine(machine.root());

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).description,
            "Hwdata Vendor Device 1572");
}

TEST(PciIdDatabase, MalformedDatabaseIsLoggedOnceAndNamesFallBackToNumbers) {
  RecordedMachine machine;
  recordCard(machine);
  machine.writePciIds("8086  Intel Corporation\n"
                      "zzzz this line is no entry\n");
  LoggedProblems problems;
  HX::useLiveMachine(machine.root());

  for (int i = 0; i < 3; ++i)
    nodesOf(NetworkCardNode);

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).description,
            "Vendor 8086 Device 1572");
  ASSERT_EQ(problems.texts().size(), 1u);
  EXPECT_NE(
      problems.texts()[0].find(machine.path("/usr/share/misc/pci.ids") + ": "),
      std::string::npos)
      << problems.texts()[0];
  EXPECT_NE(problems.texts()[0].find("PCI devices are named by their numeric "
                                     "ids"),
            std::string::npos)
      << problems.texts()[0];
}

TEST(PciIdDatabase, NamesAreReadOnceAndKeptWhileTheSourceIsInUse) {
  RecordedMachine machine;
  recordCard(machine);
  machine.writePciIds("8086  First Name\n");
  HX::useLiveMachine(machine.root());
  ASSERT_EQ(nodesOf(NetworkCardNode).at(0).text(PropManufacturer),
            "First Name");

  machine.writePciIds("8086  Second Name\n");

  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).text(PropManufacturer),
            "First Name");
  HX::useLiveMachine(machine.root());
  EXPECT_EQ(nodesOf(NetworkCardNode).at(0).text(PropManufacturer),
            "Second Name");
}

} // namespace
