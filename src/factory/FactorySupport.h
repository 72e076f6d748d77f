// Steps every factory function of the module takes the same way.
#pragma once

#include <cmpift.h>

#include <map>
#include <string>

namespace HX::PhysicalAssetProvider {

/// Copies a request's property list into a map from each name to itself.
/// The map narrows nothing: every property of a class is always set. The
/// list ends at its first null entry; its index is 16 bits wide.
std::map<std::string, std::string> requestedProperties(const char** properties);

} // namespace HX::PhysicalAssetProvider
