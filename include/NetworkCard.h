// The network card view: a forward walk over the network card nodes of the
// machine.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Walks the NetworkCardNode nodes and reads what a TVRHX_NetworkCard
/// instance publishes.
///
/// The walk may be narrowed by name filters (see ViewFilter.h). Copying a
/// view copies its filters and its cursor, standing on the same node, so a
/// copy handed to makeNetworkCardInstance names the node the walk stands on
/// while the original goes on.
///
/// Besides its own getters the view carries the physical-element getters,
/// one for each property of a physical element, in a fixed order that
/// DiskController follows too. Each takes its output by reference and
/// answers whether it holds a value. Those a network card cannot answer are
/// placeholders that answer false and leave their argument as it was.
class NetworkCard {
public:
  /// What a filter compares. Only FilterByName looks at a node; every other
  /// value of the type is accepted and kept, and lets every node pass.
  enum FilterType : int {
    /// The node name (PropNodeName) must equal the filter's value exactly;
    /// a node without a name passes.
    FilterByName = 0,
  };

  /// One filter of the walk, kept in the order it was set.
  struct Filter {
    FilterType type;
    std::string value;
  };

  /// Selects the network card nodes. A cursor that cannot select leaves the
  /// view empty; nothing is thrown.
  NetworkCard();
  ~NetworkCard();
  NetworkCard(const NetworkCard&) = default;
  NetworkCard& operator=(const NetworkCard&) = default;

  /// True while the view stands on a node.
  explicit operator bool() const;
  /// Steps to the next node; with filters set, to the next node that passes
  /// them, or to the end.
  void operator++();
  /// Adds a filter to those already set and moves the view to the first
  /// passing node at or after where it stands. Nodes already passed are not
  /// seen again.
  void setFilter(FilterType type, const std::string& value);

  /// The node name. False, with `text` untouched, for a node without one.
  bool getElementName(std::string& text);
  /// The node name, the key of the instance; as getElementName.
  bool getTag(std::string& text);
  /// "TVRHX_NetworkCard"; always true.
  bool getCreationClassName(std::string& text);
  /// The node's description, empty when it has none; always true.
  bool getDescription(std::string& text);
  /// "OK" for adapter status 1, "Stopped" for any other. False, with `text`
  /// untouched, when the node has no adapter status.
  bool getStatus(std::string& text);

  // ---- Physical-element getters, in their fixed order ---------------------

  /// Placeholder: false, `text` untouched.
  bool getCaption(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getInstallDate(std::string& text);
  /// The node name. False, with `text` untouched, for a node without one.
  bool getName(std::string& text);
  /// Appends one CIM operational status for the adapter status: 2 (OK) for
  /// 1, 10 (Stopped) for 16, 13 (Lost Communication) for 12 and every other
  /// value. False, appending nothing, when the node has no adapter status.
  bool getOperationalStatus(std::vector<unsigned short>& values);
  /// Placeholder: false, `texts` untouched.
  bool getStatusDescriptions(std::vector<std::string>& texts);
  /// Placeholder: false, `value` untouched.
  bool getHealthState(unsigned short& value);
  /// Placeholder: false, `value` untouched.
  bool getPrimaryStatus(unsigned short& value);
  /// Placeholder: false, `value` untouched.
  bool getDetailedStatus(unsigned short& value);
  /// Placeholder: false, `value` untouched.
  bool getOperatingStatus(unsigned short& value);
  /// Placeholder: false, `value` untouched.
  bool getCommunicationStatus(unsigned short& value);
  /// Placeholder: false, `text` untouched.
  bool getManufacturer(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getModel(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getSKU(std::string& text);
  /// The adapter serial (PropAdapterSerial). False, with `text` untouched,
  /// for a node without one.
  bool getSerialNumber(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getVersion(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getPartNumber(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getOtherIdentifyingInfo(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getManufactureDate(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getVendorEquipmentType(std::string& text);
  /// Placeholder: false, `text` untouched.
  bool getUserTracking(std::string& text);
  /// Whether the node status is 1 (OK); always true.
  bool isPoweredOn(bool& poweredOn);
  /// Placeholder: false, `value` untouched.
  bool canBeFRUed(bool& value);
  /// Placeholder: false, `value` untouched.
  bool getRemovalConditions(unsigned short& value);
  /// Placeholder: false, `value` untouched.
  bool getRemovable(bool& value);
  /// Placeholder: false, `value` untouched.
  bool getHeight(float& value);
  /// Placeholder: false, `value` untouched.
  bool getDepth(float& value);
  /// Placeholder: false, `value` untouched.
  bool getWidth(float& value);
  /// Placeholder: false, `value` untouched.
  bool getWeight(float& value);
  /// 9 (Module/Card) for every card, whatever the node holds; always true.
  bool getPackageType(unsigned short& value);
  /// Placeholder: false, `text` untouched.
  bool getOtherPackageType(std::string& text);
  /// Placeholder: false, `texts` untouched.
  bool getVendorCompatibilityStrings(std::vector<std::string>& texts);
  /// Placeholder: false, `value` untouched.
  bool isHostingBoard(bool& value);
  /// Placeholder: false, `text` untouched.
  bool getSlotLayout(std::string& text);
  /// Placeholder: false, `value` untouched.
  bool requiresDaughterBoard(bool& value);
  /// Placeholder: false, `value` untouched.
  bool hasSpecialRequirements(bool& value);
  /// Placeholder: false, `text` untouched.
  bool getRequirementsDescription(std::string& text);
  /// Placeholder: false, `values` untouched.
  bool getOperatingVoltages(std::vector<short>& values);

  /// Set by the first setFilter, never cleared.
  bool filterActive;
  /// The filters in the order they were set.
  std::vector<Filter> filters;
  HX::Instrumentation cursor;
};

} // namespace HX::PhysicalAssetProvider
