#include "NetworkCard.h"

#include "ViewFilter.h"

namespace HX::PhysicalAssetProvider {

using HX::NodeLexicon::NetworkCardNode;
using HX::NodeLexicon::PropAdapterSerial;
using HX::NodeLexicon::PropAdapterStatus;
using HX::NodeLexicon::PropNodeName;

namespace {
constexpr unsigned kAdapterUp = 1;
constexpr unsigned kAdapterNoLink = 12;
constexpr unsigned kAdapterDown = 16;
constexpr unsigned kNodeStatusOk = 1;

// CIM OperationalStatus values.
constexpr unsigned short kOperationalOk = 2;
constexpr unsigned short kOperationalStopped = 10;
constexpr unsigned short kOperationalLostCommunication = 13;

// CIM PackageType "Module/Card".
constexpr unsigned short kPackageModuleCard = 9;
} // namespace

NetworkCard::NetworkCard() : filterActive(false) {
  try {
    cursor.selectNode(NetworkCardNode);
  } catch (...) {
  }
}

NetworkCard::~NetworkCard() = default;

NetworkCard::operator bool() const { return static_cast<bool>(cursor); }

void NetworkCard::operator++() { stepToNextPassingNode(cursor, filterActive, filters); }

void NetworkCard::setFilter(FilterType type, const std::string& value) {
  addFilter(cursor, filterActive, filters, Filter{type, value});
}

bool NetworkCard::getElementName(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool NetworkCard::getTag(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool NetworkCard::getCreationClassName(std::string& text) {
  text = "TVRHX_NetworkCard";
  return true;
}

bool NetworkCard::getDescription(std::string& text) {
  text = cursor.getNodeDescription();
  return true;
}

bool NetworkCard::getStatus(std::string& text) {
  unsigned status = 0;
  if (!cursor.getProperty(PropAdapterStatus, status)) return false;
  text = status == kAdapterUp ? "OK" : "Stopped";
  return true;
}

// ---- Physical-element getters -----------------------------------------------

bool NetworkCard::getCaption(std::string&) { return false; }

bool NetworkCard::getInstallDate(std::string&) { return false; }

bool NetworkCard::getName(std::string& text) { return cursor.getProperty(PropNodeName, text); }

// Adapter status 12 keeps a case of its own beside the catch-all, which
// gives the same value, so that each reported status stays visible here.
bool NetworkCard::getOperationalStatus(std::vector<unsigned short>& values) {
  unsigned status = 0;
  if (!cursor.getProperty(PropAdapterStatus, status)) return false;
  if (status == kAdapterUp) values.push_back(kOperationalOk);
  else if (status == kAdapterNoLink) values.push_back(kOperationalLostCommunication);
  else if (status == kAdapterDown) values.push_back(kOperationalStopped);
  else values.push_back(kOperationalLostCommunication);
  return true;
}

bool NetworkCard::getStatusDescriptions(std::vector<std::string>&) { return false; }

bool NetworkCard::getHealthState(unsigned short&) { return false; }

bool NetworkCard::getPrimaryStatus(unsigned short&) { return false; }

bool NetworkCard::getDetailedStatus(unsigned short&) { return false; }

bool NetworkCard::getOperatingStatus(unsigned short&) { return false; }

bool NetworkCard::getCommunicationStatus(unsigned short&) { return false; }

bool NetworkCard::getManufacturer(std::string&) { return false; }

bool NetworkCard::getModel(std::string&) { return false; }

bool NetworkCard::getSKU(std::string&) { return false; }

bool NetworkCard::getSerialNumber(std::string& text) { return cursor.getProperty(PropAdapterSerial, text); }

bool NetworkCard::getVersion(std::string&) { return false; }

bool NetworkCard::getPartNumber(std::string&) { return false; }

bool NetworkCard::getOtherIdentifyingInfo(std::string&) { return false; }

bool NetworkCard::getManufactureDate(std::string&) { return false; }

bool NetworkCard::getVendorEquipmentType(std::string&) { return false; }

bool NetworkCard::getUserTracking(std::string&) { return false; }

bool NetworkCard::isPoweredOn(bool& poweredOn) {
  poweredOn = cursor.getNodeStatus() == kNodeStatusOk;
  return true;
}

bool NetworkCard::canBeFRUed(bool&) { return false; }

bool NetworkCard::getRemovalConditions(unsigned short&) { return false; }

bool NetworkCard::getRemovable(bool&) { return false; }

bool NetworkCard::getHeight(float&) { return false; }

bool NetworkCard::getDepth(float&) { return false; }

bool NetworkCard::getWidth(float&) { return false; }

bool NetworkCard::getWeight(float&) { return false; }

bool NetworkCard::getPackageType(unsigned short& value) {
  value = kPackageModuleCard;
  return true;
}

bool NetworkCard::getOtherPackageType(std::string&) { return false; }

bool NetworkCard::getVendorCompatibilityStrings(std::vector<std::string>&) { return false; }

bool NetworkCard::isHostingBoard(bool&) { return false; }

bool NetworkCard::getSlotLayout(std::string&) { return false; }

bool NetworkCard::requiresDaughterBoard(bool&) { return false; }

bool NetworkCard::hasSpecialRequirements(bool&) { return false; }

bool NetworkCard::getRequirementsDescription(std::string&) { return false; }

bool NetworkCard::getOperatingVoltages(std::vector<short>&) { return false; }

} // namespace HX::PhysicalAssetProvider
