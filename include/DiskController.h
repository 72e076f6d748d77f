// The disk controller view: a forward walk over the storage controller nodes
// of the machine.
//
// One view serves three CIM classes. TVRHX_DiskController,
// TVRHX_IDEController and TVRHX_ChipIDECont are presentations of the same
// nodes: the factory function of each class reads the getters it wants and
// writes the keys and properties of its class. Nothing here tells one kind
// of controller from another.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Walks the StorageControllerNode nodes and reads what the storage
/// controller classes publish. Copying a view copies its cursor, standing on
/// the same node, and its filters.
///
/// Besides its own getters the view declares the getters of a physical
/// element (caption through operating voltages), the same set that
/// NetworkCard declares. Most of them are placeholders for properties a
/// later version may publish: they answer false, leave their argument as it
/// was and read nothing.
class DiskController {
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
  DiskController();
  ~DiskController();
  DiskController(const DiskController&) = default;
  DiskController& operator=(const DiskController&) = default;

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

  /// The node's path text: the key of TVRHX_DiskController (Tag) and of
  /// TVRHX_IDEController (DeviceID). Always true.
  bool getTag(std::string& text);
  /// "DiskController-" followed by the node's path text. Always true.
  bool getElementName(std::string& text);
  /// "TVRHX_DiskController". Always true.
  bool getCreationClassName(std::string& text);
  /// The node's description. Always true.
  bool getDescription(std::string& text);
  /// The number of devices the controller drives; false when the node
  /// does not say.
  bool getNumControlled(unsigned& value);
  /// The node's port type code; false when the node has none.
  bool getPortType(unsigned& value);
  /// The node's form factor code; false when the node has none.
  bool getFormFactor(unsigned& value);

  // ---- Getters of a physical element ----------------------------------
  // Those with a body say so; every other one answers false and leaves its
  // argument untouched.

  /// The node's type text (PropType); false when the node has none.
  bool getCaption(std::string& text);
  bool getInstallDate(std::string& text);
  bool getName(std::string& text);
  bool getOperationalStatus(std::vector<unsigned short>& values);
  bool getStatusDescriptions(std::vector<std::string>& texts);
  /// The low 16 bits of the node status, unmapped. Always true.
  bool getHealthState(unsigned short& value);
  bool getPrimaryStatus(unsigned short& value);
  bool getDetailedStatus(unsigned short& value);
  bool getOperatingStatus(unsigned short& value);
  bool getCommunicationStatus(unsigned short& value);
  /// The node's manufacturer; false when the node has none.
  bool getManufacturer(std::string& text);
  /// The node's model; false when the node has none.
  bool getModel(std::string& text);
  bool getSKU(std::string& text);
  bool getSerialNumber(std::string& text);
  bool getVersion(std::string& text);
  bool getPartNumber(std::string& text);
  /// The node's other identifying information; false when the node has
  /// none. Its presence is what makes a node an IDE controller.
  bool getOtherIdentifyingInfo(std::string& text);
  bool getManufactureDate(std::string& text);
  bool getVendorEquipmentType(std::string& text);
  bool getUserTracking(std::string& text);
  bool isPoweredOn(bool& value);
  bool canBeFRUed(bool& value);
  bool getRemovalConditions(unsigned short& value);
  bool getRemovable(bool& value);
  bool getHeight(float& value);
  bool getDepth(float& value);
  bool getWidth(float& value);
  bool getWeight(float& value);
  /// 15, the CIM package type of a storage controller. Always true.
  bool getPackageType(unsigned short& value);
  bool getOtherPackageType(std::string& text);
  bool getVendorCompatibilityStrings(std::vector<std::string>& texts);
  bool isHostingBoard(bool& value);
  bool getSlotLayout(std::string& text);
  bool requiresDaughterBoard(bool& value);
  bool hasSpecialRequirements(bool& value);
  bool getRequirementsDescription(std::string& text);
  bool getOperatingVoltages(std::vector<short>& values);

private:
  std::string pathText() const;

  bool filterActive = false;
  std::vector<Filter> filters;
  HX::Instrumentation cursor;
};

} // namespace HX::PhysicalAssetProvider
