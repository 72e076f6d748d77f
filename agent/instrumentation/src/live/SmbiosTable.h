//===- SmbiosTable.h - Walking the structures of an SMBIOS table ----------===//
//
/// \file
/// An SMBIOS table is a run of structures, each a formatted area (type,
/// length, handle, then fields) followed by a set of strings that ends with
/// an empty string. Firmware gets this wrong in every way one can think of,
/// so the walk trusts nothing: a length shorter than the header, a structure
/// or string set that runs past the end, or an entry point that announces
/// more structures than the table holds end the walk with a problem noted,
/// and whatever was whole before it is kept.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_SMBIOSTABLE_H
#define HX_SRC_LIVE_SMBIOSTABLE_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace HX {
namespace detail {
namespace live {

/// One structure; the views point into the table it was read from.
struct SmbiosStructure {
  std::uint8_t type = 0;
  std::uint16_t handle = 0;
  /// Where the structure starts in the table.
  std::size_t offset = 0;
  /// The formatted area, header included; its size is the length byte.
  std::string_view formatted;
  /// The strings, raw; string number n (counting from 1) is strings[n - 1].
  std::vector<std::string_view> strings;

  /// The byte, word or double word at \p field, or nullopt when the
  /// formatted area is too short to hold it.
  std::optional<std::uint8_t> byteField(std::size_t field) const;
  std::optional<std::uint16_t> wordField(std::size_t field) const;
  std::optional<std::uint32_t> dwordField(std::size_t field) const;

  /// "type 9, handle 0x0902": names the structure in problem reports.
  std::string label() const;
};

struct SmbiosTableWalk {
  std::vector<SmbiosStructure> structures;
  /// What ended the walk early, or what else is wrong with the table; each
  /// a sentence without the file name.
  std::vector<std::string> problems;
};

/// Walks \p table up to and including the end-of-table structure (type
/// 127), the end of the bytes, or \p announcedCount structures, whichever
/// comes first.
SmbiosTableWalk walkSmbiosTable(std::string_view table,
                                std::optional<unsigned> announcedCount);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_SMBIOSTABLE_H
