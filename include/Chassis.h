// The chassis view: a forward walk over the chassis nodes of the machine.
#pragma once

#include <HX/Instrumentation.h>

#include <string>
#include <vector>

namespace HX::PhysicalAssetProvider {

/// Walks the ChassisNode nodes and reads what a TVRHX_Chassis instance
/// publishes. Copying a view copies its cursor, standing on the same node.
class Chassis {
public:
  /// Selects the chassis nodes. A cursor that cannot select leaves the view
  /// empty; nothing is thrown.
  Chassis();
  ~Chassis();
  Chassis(const Chassis&) = default;
  Chassis& operator=(const Chassis&) = default;

  /// True while the view stands on a node.
  explicit operator bool() const;
  /// Steps to the next chassis node.
  void operator++();

  /// The node's chassis type, as the hardware reports it.
  bool getChassisPackageType(unsigned& value);
  /// The CIM package type. A chassis of type 18 (expansion) gets the package
  /// type of getPackageTypeForExpansion and answers false.
  bool getPackageType(unsigned& value);
  /// 17 (blade expansion) when the machine has a chassis of type 17 with
  /// package type 16 (blade), else 3 (chassis/frame). Reads all chassis
  /// nodes with a cursor of its own; a failing read leaves 3.
  void getPackageTypeForExpansion(unsigned& value);
  /// Both read the node name.
  bool getDescription(std::string& text);
  bool getCaption(std::string& text);
  /// These four always answer true; an absent property leaves `text` as it was.
  bool getPartNumber(std::string& text);
  bool getSerialNumber(std::string& text);
  bool getModel(std::string& text);
  bool getManufacturer(std::string& text);
  bool getCreationClassName(std::string& text);
  /// The node status as a text: "OK", "Pred Fail", "Degraded" or "Unknown".
  bool getCStatus(std::string& text);
  /// "Chassis-" followed by the node's path text.
  bool getSKU(std::string& text);
  /// The node's path text.
  bool getElementName(std::string& text);
  /// The node's path text, the key of the instance.
  bool getTag(std::string& text);
  /// Appends "TVR:" followed by the element name.
  bool getVendorCompatSring(std::vector<std::string>& strings);

private:
  std::string pathText() const;

  std::string name; // kept in the view's layout; nothing reads or writes it
  HX::Instrumentation cursor;
};

/// Maps a hardware package code to a CIM package type; see the table in the
/// implementation. Values without a mapping leave `out` untouched.
void mapPackageType(unsigned value, unsigned short& out, bool flag);

} // namespace HX::PhysicalAssetProvider
