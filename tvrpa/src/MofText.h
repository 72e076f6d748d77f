// Instances as MOF instance declarations, the way CIM tools write them:
//
//   instance of TVRHX_Chassis
//   {
//       Tag = "/System/Blade Chassis";
//       VendorCompatibilityStrings = {"TVR:/System/Blade Chassis"};
//   };
#pragma once

#include "tvr/broker/Value.h"

#include <string>

namespace tvrpa {

/// One value as a MOF initializer: strings quoted with MOF escapes, char16
/// in single quotes, booleans TRUE/FALSE, arrays in braces, references as
/// their object path in a string, NULL for a null value.
std::string mofValue(const tvr::broker::Value& value);

/// The instance declaration, ending with "};" and a newline. Properties
/// appear in the instance's own order.
std::string instanceMof(const tvr::broker::Instance& instance);

} // namespace tvrpa
