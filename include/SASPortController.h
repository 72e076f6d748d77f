// The SAS port controller view: a forward walk over the storage controller
// nodes of the machine, seen as logical devices of the computer system.
//
// It walks the same nodes as DiskController: each storage controller node
// is published once as a disk controller and once as a SAS port controller,
// whatever kind of controller it is.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Walks the StorageControllerNode nodes and reads the keys of a
/// TVRHX_SASPortController. Copying a view copies its cursor, standing on
/// the same node, and its filters.
class SASPortController {
public:
  /// Only FilterByName has an effect. Any other value is kept and lets every
  /// node pass.
  enum FilterType : int { FilterByName = 0 };

  struct Filter {
    FilterType type;
    std::string value;
  };

  /// Selects the storage controller nodes. A cursor that cannot select
  /// leaves the view empty; nothing is thrown.
  SASPortController();
  ~SASPortController();
  SASPortController(const SASPortController&) = default;
  SASPortController& operator=(const SASPortController&) = default;

  /// True while the view stands on a node.
  explicit operator bool() const;
  /// Steps to the next node; with filters set, to the next node that passes
  /// them, or to the end.
  void operator++();
  /// Adds a filter, which stays in force with those set before, and moves
  /// to the first passing node at or after where the view stands.
  /// FilterByName passes a node whose name equals `value` exactly, and a
  /// node without a name.
  void setFilter(FilterType type, const std::string& value);

  /// "TVRHX_ComputerSystem", the class of the system the device belongs
  /// to. Always true.
  bool getSystemCreationClassName(std::string& text);
  /// "TVRHX_SASPortController". Always true.
  bool getCreationClassName(std::string& text);
  /// The node's path text, the one key that tells controllers apart. It is
  /// the text DiskController::getTag gives for the same node. Always true.
  bool getDeviceID(std::string& text);

private:
  bool filterActive = false;
  std::vector<Filter> filters;
  HX::Instrumentation cursor;
};

} // namespace HX::PhysicalAssetProvider
