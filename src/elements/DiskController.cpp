#include "DiskController.h"

#include "ViewFilter.h"

namespace HX::PhysicalAssetProvider {

using HX::NodeLexicon::PropFormFactor;
using HX::NodeLexicon::PropManufacturer;
using HX::NodeLexicon::PropModel;
using HX::NodeLexicon::PropNumControlled;
using HX::NodeLexicon::PropOtherIdentifyingInfo;
using HX::NodeLexicon::PropPortType;
using HX::NodeLexicon::PropType;
using HX::NodeLexicon::StorageControllerNode;

namespace {
// CIM package type of a storage controller.
constexpr unsigned short kStorageControllerPackage = 15;
} // namespace

DiskController::DiskController() {
  try {
    cursor.selectNode(StorageControllerNode);
  } catch (...) {
  }
}

DiskController::~DiskController() = default;

DiskController::operator bool() const { return static_cast<bool>(cursor); }

void DiskController::operator++() { stepToNextPassingNode(cursor, filterActive, filters); }

void DiskController::setFilter(FilterType type, const std::string& value) {
  addFilter(cursor, filterActive, filters, Filter{type, value});
}

std::string DiskController::pathText() const { return cursor.convertPathToString(cursor.getPathToNode()); }

bool DiskController::getTag(std::string& text) {
  text = pathText();
  return true;
}

bool DiskController::getElementName(std::string& text) {
  text = pathText();
  text = "DiskController-" + text;
  return true;
}

bool DiskController::getCreationClassName(std::string& text) {
  text = "TVRHX_DiskController";
  return true;
}

bool DiskController::getDescription(std::string& text) {
  text = cursor.getNodeDescription();
  return true;
}

bool DiskController::getNumControlled(unsigned& value) { return cursor.getProperty(PropNumControlled, value); }

bool DiskController::getPortType(unsigned& value) { return cursor.getProperty(PropPortType, value); }

bool DiskController::getFormFactor(unsigned& value) { return cursor.getProperty(PropFormFactor, value); }

// ---- Getters of a physical element -------------------------------------

bool DiskController::getCaption(std::string& text) { return cursor.getProperty(PropType, text); }

bool DiskController::getInstallDate(std::string&) { return false; }

bool DiskController::getName(std::string&) { return false; }

bool DiskController::getOperationalStatus(std::vector<unsigned short>&) { return false; }

bool DiskController::getStatusDescriptions(std::vector<std::string>&) { return false; }

bool DiskController::getHealthState(unsigned short& value) {
  value = static_cast<unsigned short>(cursor.getNodeStatus());
  return true;
}

bool DiskController::getPrimaryStatus(unsigned short&) { return false; }

bool DiskController::getDetailedStatus(unsigned short&) { return false; }

bool DiskController::getOperatingStatus(unsigned short&) { return false; }

bool DiskController::getCommunicationStatus(unsigned short&) { return false; }

bool DiskController::getManufacturer(std::string& text) { return cursor.getProperty(PropManufacturer, text); }

bool DiskController::getModel(std::string& text) { return cursor.getProperty(PropModel, text); }

bool DiskController::getSKU(std::string&) { return false; }

bool DiskController::getSerialNumber(std::string&) { return false; }

bool DiskController::getVersion(std::string&) { return false; }

bool DiskController::getPartNumber(std::string&) { return false; }

bool DiskController::getOtherIdentifyingInfo(std::string& text) {
  return cursor.getProperty(PropOtherIdentifyingInfo, text);
}

bool DiskController::getManufactureDate(std::string&) { return false; }

bool DiskController::getVendorEquipmentType(std::string&) { return false; }

bool DiskController::getUserTracking(std::string&) { return false; }

bool DiskController::isPoweredOn(bool&) { return false; }

bool DiskController::canBeFRUed(bool&) { return false; }

bool DiskController::getRemovalConditions(unsigned short&) { return false; }

bool DiskController::getRemovable(bool&) { return false; }

bool DiskController::getHeight(float&) { return false; }

bool DiskController::getDepth(float&) { return false; }

bool DiskController::getWidth(float&) { return false; }

bool DiskController::getWeight(float&) { return false; }

bool DiskController::getPackageType(unsigned short& value) {
  value = kStorageControllerPackage;
  return true;
}

bool DiskController::getOtherPackageType(std::string&) { return false; }

bool DiskController::getVendorCompatibilityStrings(std::vector<std::string>&) { return false; }

bool DiskController::isHostingBoard(bool&) { return false; }

bool DiskController::getSlotLayout(std::string&) { return false; }

bool DiskController::requiresDaughterBoard(bool&) { return false; }

bool DiskController::hasSpecialRequirements(bool&) { return false; }

bool DiskController::getRequirementsDescription(std::string&) { return false; }

bool DiskController::getOperatingVoltages(std::vector<short>&) { return false; }

} // namespace HX::PhysicalAssetProvider
