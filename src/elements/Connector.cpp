#include "Connector.h"

#include "ViewFilter.h"

namespace HX::PhysicalAssetProvider {

using HX::NodeLexicon::ConnectorNode;
using HX::NodeLexicon::PropNodeName;

namespace {
// The layout every connector publishes: "Other", as the hardware tells no
// layout of its connectors.
constexpr unsigned short kConnectorLayoutOther = 1;
} // namespace

Connector::Connector() : filterActive(false) {
  try {
    cursor.selectNode(ConnectorNode);
  } catch (...) {
  }
}

Connector::~Connector() = default;

Connector::operator bool() const { return static_cast<bool>(cursor); }

void Connector::operator++() { stepToNextPassingNode(cursor, filterActive, filters); }

void Connector::setFilter(FilterType type, const std::string& value) {
  addFilter(cursor, filterActive, filters, Filter{type, value});
}

bool Connector::getElementName(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool Connector::getTag(std::string& text) { return cursor.getProperty(PropNodeName, text); }

bool Connector::getConnectorLayout(unsigned short& value) {
  value = kConnectorLayoutOther;
  return true;
}

bool Connector::getCreationClassName(std::string& text) {
  text = "TVRHX_Connector";
  return true;
}

} // namespace HX::PhysicalAssetProvider
