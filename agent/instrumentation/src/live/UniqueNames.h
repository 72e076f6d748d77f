//===- UniqueNames.h - Names and segments that siblings do not share ------===//
//
/// \file
/// Firmware designations repeat: two slots both called "PCIe Slot", two
/// connectors whose designators were both placeholders. Node names and path
/// segments must be unique among siblings and the same at every reading, so
/// the first of equal texts keeps its text and each later one gets " (2)",
/// " (3)", ...: the smallest number that gives a text no other has. The
/// outcome depends only on the texts and their order, which the firmware
/// table fixes.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_UNIQUENAMES_H
#define HX_SRC_LIVE_UNIQUENAMES_H

#include <optional>
#include <string>
#include <unordered_set>
#include <vector>

namespace HX {
namespace detail {
namespace live {

/// Makes the present texts of \p texts unique among themselves and against
/// \p taken, and adds them to \p taken. Absent texts stay absent.
void makeUnique(std::vector<std::optional<std::string>> &texts,
                std::unordered_set<std::string> &taken);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_UNIQUENAMES_H
