#include "SASPortController.h"

#include "ViewFilter.h"

namespace HX::PhysicalAssetProvider {

SASPortController::SASPortController() {
  try {
    cursor.selectNode(HX::NodeLexicon::StorageControllerNode);
  } catch (...) {
  }
}

SASPortController::~SASPortController() = default;

SASPortController::operator bool() const { return static_cast<bool>(cursor); }

void SASPortController::operator++() { stepToNextPassingNode(cursor, filterActive, filters); }

void SASPortController::setFilter(FilterType type, const std::string& value) {
  addFilter(cursor, filterActive, filters, Filter{type, value});
}

bool SASPortController::getSystemCreationClassName(std::string& text) {
  text = "TVRHX_ComputerSystem";
  return true;
}

bool SASPortController::getCreationClassName(std::string& text) {
  text = "TVRHX_SASPortController";
  return true;
}

bool SASPortController::getDeviceID(std::string& text) {
  const std::string path = cursor.getPathToNode();
  text = cursor.convertPathToString(path);
  return true;
}

} // namespace HX::PhysicalAssetProvider
