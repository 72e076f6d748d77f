#include "Slot.h"

#include "ViewFilter.h"

namespace HX::PhysicalAssetProvider {

using HX::NodeLexicon::PropNodeName;
using HX::NodeLexicon::PropSlotNumber;
using HX::NodeLexicon::PropType;
using HX::NodeLexicon::SlotNode;

Slot::Slot() : filterActive(false) {
  try {
    cursor.selectNode(SlotNode);
  } catch (...) {
  }
}

Slot::~Slot() = default;

Slot::operator bool() const { return static_cast<bool>(cursor); }

void Slot::operator++() { stepToNextPassingNode(cursor, filterActive, filters); }

void Slot::setFilter(FilterType type, const std::string& value) {
  addFilter(cursor, filterActive, filters, Filter{type, value});
}

bool Slot::getElementName(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool Slot::getTag(std::string& text) { return cursor.getProperty(PropNodeName, text); }

// The number goes out whether or not the node has one, so a node without
// one reads as 0.
bool Slot::getNumber(unsigned short& value) {
  unsigned number = 0;
  const bool found = cursor.getProperty(PropSlotNumber, number);
  value = static_cast<unsigned short>(number);
  return found;
}

bool Slot::getConnectorLayout(unsigned short& value) {
  unsigned layout = 0;
  const bool found = cursor.getProperty(PropType, layout);
  value = static_cast<unsigned short>(layout);
  return found;
}

bool Slot::getCreationClassName(std::string& text) {
  text = "TVRHX_Slot";
  return true;
}

bool Slot::getVendorCompatSring(std::vector<std::string>& strings) {
  std::string elementName;
  getElementName(elementName);
  strings.push_back(std::string("TVR") + ":" + elementName);
  return true;
}

} // namespace HX::PhysicalAssetProvider
