//===- ConcurrentSelectionTest.cpp - Cursors on several threads at once ---===//

#include "LiveSourceTesting.h"
#include "RecordedMachines.h"

#include <gtest/gtest.h>

#include <thread>

namespace {

using namespace hxlive;

using Reading = std::vector<std::pair<std::string, std::optional<std::string>>>;

Reading readEveryType() {
  Reading reading;
  for (NodeType type : {SystemNode, ChassisNode, SlotNode, ConnectorNode,
                        NetworkCardNode, StorageControllerNode})
    for (const SeenNode &node : nodesOf(type))
      reading.emplace_back(node.path, node.name());
  return reading;
}

TEST(ConcurrentSelection, ThreadsReadingOneSourceFromItsStartSeeTheSame) {
  RecordedMachine machine;
  recordRackServer(machine);
  HX::useLiveMachine(machine.root());

  // The first selections of a source fill what it keeps (PCI ids, names,
  // links); they race here on purpose.
  constexpr int Threads = 4;
  std::vector<Reading> readings(Threads);
  std::vector<std::thread> threads;
  for (int i = 0; i < Threads; ++i)
    threads.emplace_back([&readings, i] {
      for (int round = 0; round < 20; ++round)
        readings[i] = readEveryType();
    });
  for (std::thread &thread : threads)
    thread.join();

  const Reading alone = readEveryType();
  EXPECT_EQ(alone.size(), 17u);
  for (const Reading &reading : readings)
    EXPECT_EQ(reading, alone);
}

} // namespace
