#include "Chassis.h"

namespace HX::PhysicalAssetProvider {

using HX::NodeLexicon::ChassisNode;
using HX::NodeLexicon::PropChassisType;
using HX::NodeLexicon::PropManufacturer;
using HX::NodeLexicon::PropModel;
using HX::NodeLexicon::PropNodeName;
using HX::NodeLexicon::PropPackageType;
using HX::NodeLexicon::PropPartNumber;
using HX::NodeLexicon::PropSerialNumber;

namespace {
constexpr unsigned kExpansionChassis = 18;
constexpr unsigned kBladeChassis = 17;
constexpr unsigned kBladePackage = 16;
constexpr unsigned kBladeExpansionPackage = 17;
constexpr unsigned kChassisFramePackage = 3;
} // namespace

Chassis::Chassis() {
  try {
    cursor.selectNode(ChassisNode);
  } catch (...) {
  }
}

Chassis::~Chassis() = default;

Chassis::operator bool() const { return static_cast<bool>(cursor); }

void Chassis::operator++() { ++cursor; }

std::string Chassis::pathText() const { return cursor.convertPathToString(cursor.getPathToNode()); }

bool Chassis::getChassisPackageType(unsigned& value) { return cursor.getProperty(PropChassisType, value); }

bool Chassis::getPackageType(unsigned& value) {
  unsigned chassisType = 0;
  cursor.getProperty(PropChassisType, chassisType);
  if (chassisType == kExpansionChassis) {
    getPackageTypeForExpansion(value);
    return false;
  }
  return cursor.getProperty(PropPackageType, value);
}

void Chassis::getPackageTypeForExpansion(unsigned& value) {
  HX::Instrumentation all;
  value = kChassisFramePackage;
  try {
    for (all.selectNode(ChassisNode); all; ++all) {
      unsigned chassisType = 0;
      unsigned packageType = 0;
      all.getProperty(PropChassisType, chassisType);
      all.getProperty(PropPackageType, packageType);
      if (chassisType == kBladeChassis && packageType == kBladePackage) {
        value = kBladeExpansionPackage;
        break;
      }
    }
  } catch (...) {
  }
}

bool Chassis::getDescription(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool Chassis::getCaption(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool Chassis::getPartNumber(std::string& text) {
  cursor.getProperty(PropPartNumber, text);
  return true;
}

bool Chassis::getSerialNumber(std::string& text) {
  cursor.getProperty(PropSerialNumber, text);
  return true;
}

bool Chassis::getModel(std::string& text) {
  cursor.getProperty(PropModel, text);
  return true;
}

bool Chassis::getManufacturer(std::string& text) {
  cursor.getProperty(PropManufacturer, text);
  return true;
}

bool Chassis::getCreationClassName(std::string& text) {
  text = "TVRHX_Chassis";
  return true;
}

bool Chassis::getCStatus(std::string& text) {
  const unsigned status = cursor.getNodeStatus();
  if (status == 1) text = "OK";
  else if (status == 20) text = "Pred Fail";
  else if (status >= 21 && status <= 26) text = "Degraded";
  else text = "Unknown";
  return true;
}

bool Chassis::getSKU(std::string& text) {
  text = "Chassis-" + pathText();
  return true;
}

bool Chassis::getElementName(std::string& text) {
  text = pathText();
  return true;
}

bool Chassis::getTag(std::string& text) {
  text = pathText();
  return true;
}

bool Chassis::getVendorCompatSring(std::vector<std::string>& strings) {
  std::string elementName;
  getElementName(elementName);
  strings.push_back(std::string("TVR") + ":" + elementName);
  return true;
}

// Hardware package codes and the CIM package types they stand for; the
// flag picks the blade reading of codes 2, 3 and 6.
void mapPackageType(unsigned value, unsigned short& out, bool flag) {
  switch (value) {
  case 0: out = 0; break;
  case 1: out = 3; break;
  case 2: out = flag ? 2 : 1; break;
  case 3: out = flag ? 16 : 28; break;
  case 6: out = flag ? 12 : 1; break;
  default: break;
  }
}

} // namespace HX::PhysicalAssetProvider
