//===- NodePath.h - The library's internal form of a node path ------------===//
//
/// \file
/// A node's internal path names it uniquely within one reading of the
/// hardware, even where two nodes share the same readable path text (two
/// siblings with the same name), and it carries that readable text, so it
/// converts back without the snapshot it came from:
///
///   hxpath:<position>[.<position>...]:<readable text>
///
/// Each position counts a node among all its siblings from 0, from the root
/// down; the readable text is "/" followed by the segments from the root to
/// the node joined by "/". Example: "hxpath:0.2:/System/PCIe Slot 3".
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_NODEPATH_H
#define HX_SRC_NODEPATH_H

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace HX {
namespace detail {
namespace NodePath {

/// The internal path of a root node at \p position with \p segment.
std::string forRoot(std::uint32_t position, std::string_view segment);

/// The internal path of the child at \p position with \p segment below the
/// node whose internal path is \p parent (a value made by this module).
std::string forChild(std::string_view parent, std::uint32_t position,
                     std::string_view segment);

/// The readable text an internal path carries, or nullopt when \p path is
/// not an internal path.
std::optional<std::string_view> readableText(std::string_view path);

} // namespace NodePath
} // namespace detail
} // namespace HX

#endif // HX_SRC_NODEPATH_H
