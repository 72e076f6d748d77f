//===- HardwareTreeGenerator.h - Large hardware trees for benchmarks -*- C++ -*-===//
//
/// \file
/// Writes hardware-tree files of machines of any size, so that requests can
/// be timed on 10, 1,000 or 10,000 nodes of one type, and the inventory on a
/// machine of 65,535 nodes.
///
/// Every generated machine has the same frame: a `SystemNode` "System" with a
/// UUID (the computer system of the companion provider), a main chassis
/// "Main Chassis" of chassis type 17 below it, and the counted nodes below the
/// main chassis. Names are unique, so every element's `Tag` is too, and they
/// carry the marker words the associations look for:
///
///  - slots are "Slot <n>"; the expansion chassis' slots are "PXU Slot <n>";
///  - connectors are "Compute Connector <n>", except the last one, which is
///    "PXU Uplink Connector": the one cable of the machine then runs from the
///    first connector to the last, the longest walk there is;
///  - network cards are "eth<n>", with an adapter serial and status;
///  - storage controllers are "0000:<bus>:00.0" in IDE mode (they have
///    `PropOtherIdentifyingInfo`, so they are published under every
///    controller class).
//
//===----------------------------------------------------------------------===//

#ifndef TVR_BENCHMARKS_HARDWARETREEGENERATOR_H
#define TVR_BENCHMARKS_HARDWARETREEGENERATOR_H

#include <cstddef>
#include <string>

namespace tvr::bench {

/// How many nodes of each kind a generated machine has.
struct MachinePlan {
  /// Chassis of type 17 beside the main chassis (the main one is always
  /// there and not counted here).
  std::size_t extraChassis = 0;
  /// Chassis of type 18 (expansion units), each holding one "PXU" slot.
  std::size_t expansionChassis = 0;
  std::size_t slots = 0;
  std::size_t connectors = 0;
  std::size_t networkCards = 0;
  std::size_t storageControllers = 0;
  /// Structural nodes no provider reads (processors, memory, fans, disks):
  /// they make the tree larger without making any answer larger.
  std::size_t structural = 0;

  /// Nodes in the tree: the counts above plus the system and main chassis.
  std::size_t nodeCount() const;
};

/// The JSON text of the machine \p plan describes, in the hardware-tree
/// file format.
std::string hardwareTreeJson(const MachinePlan &plan);

/// Writes hardwareTreeJson(plan) to \p path (beside it first, then renamed,
/// so a reader never sees half a file). Throws std::runtime_error when the
/// file cannot be written.
void writeHardwareTree(const MachinePlan &plan, const std::string &path);

/// A machine of exactly \p nodes nodes (at least 2) as an administrator of a
/// large rack system would have it: a few hundred network cards and storage
/// controllers, a few thousand connectors and slots, and the rest structural
/// nodes. Its answers are large but no association's pairing dominates.
MachinePlan largeMachine(std::size_t nodes);

} // namespace tvr::bench

#endif // TVR_BENCHMARKS_HARDWARETREEGENERATOR_H
