#include "FactorySupport.h"

namespace HX::PhysicalAssetProvider {

std::map<std::string, std::string> requestedProperties(const char** properties) {
  std::map<std::string, std::string> names;
  if (!properties) return names;
  for (unsigned short index = 0; properties[index] != nullptr; ++index)
    names[properties[index]] = properties[index];
  return names;
}

} // namespace HX::PhysicalAssetProvider
