//===- generate_hardware_tree.cpp - Writes a large hardware-tree file -----===//
//
// generate_hardware_tree NODES FILE [NETWORK_CARDS]
//
// Writes the tree of a large machine of exactly NODES nodes (see
// tvr::bench::largeMachine) to FILE and prints how many nodes of each kind
// it holds. NETWORK_CARDS, when given, replaces the machine's number of
// network cards (structural nodes make up the difference): the association
// of ports and cards grows with the square of it.
//
//===----------------------------------------------------------------------===//

#include "HardwareTreeGenerator.h"

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <string>

int main(int argc, char **argv) {
  if (argc != 3 && argc != 4) {
    std::fprintf(stderr, "usage: %s NODES FILE [NETWORK_CARDS]\n", argv[0]);
    return 1;
  }
  char *end = nullptr;
  const unsigned long long nodes = std::strtoull(argv[1], &end, 10);
  if (!end || *end || nodes < 2 || nodes > 1000000) {
    std::fprintf(stderr, "%s: NODES must be a number from 2 to 1000000\n", argv[0]);
    return 1;
  }
  tvr::bench::MachinePlan plan = tvr::bench::largeMachine(nodes);
  if (argc == 4) {
    const unsigned long long cards = std::strtoull(argv[3], &end, 10);
    const std::size_t available = plan.networkCards + plan.structural;
    if (!end || *end || cards > available) {
      std::fprintf(stderr, "%s: NETWORK_CARDS must be a number from 0 to %zu\n", argv[0], available);
      return 1;
    }
    plan.structural = available - cards;
    plan.networkCards = cards;
  }
  try {
    tvr::bench::writeHardwareTree(plan, argv[2]);
  } catch (const std::exception &e) {
    std::fprintf(stderr, "%s: %s\n", argv[0], e.what());
    return 1;
  }
  std::printf("%s: %zu nodes: %zu slots, %zu connectors, %zu network cards, %zu storage controllers, "
              "%zu chassis, %zu structural\n",
              argv[2], plan.nodeCount(), plan.slots, plan.connectors, plan.networkCards,
              plan.storageControllers, 1 + plan.extraChassis, plan.structural + 1);
  return 0;
}
