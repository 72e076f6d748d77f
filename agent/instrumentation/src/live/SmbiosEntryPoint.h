//===- SmbiosEntryPoint.h - The SMBIOS entry point structure --------------===//
//
/// \file
/// The kernel exports the firmware's SMBIOS entry point as it found it: a
/// 64-bit one ("_SM3_", SMBIOS 3.x), a 32-bit one ("_SM_" with its "_DMI_"
/// part, SMBIOS 2.1 to 2.8), or a bare legacy "_DMI_" one. The table itself
/// is exported separately; from the entry point the reader needs the
/// version (it decides the UUID byte order) and what the entry point says
/// about the table's size.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_SMBIOSENTRYPOINT_H
#define HX_SRC_LIVE_SMBIOSENTRYPOINT_H

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace HX {
namespace detail {
namespace live {

struct SmbiosEntryPoint {
  unsigned major = 0;
  unsigned minor = 0;
  /// The number of structures a 2.x or legacy entry point announces (a 3.x
  /// one announces none: its table ends with the end-of-table structure).
  std::optional<unsigned> structureCount;
  /// The table length (2.x, legacy) or maximum table size (3.x) announced.
  std::uint32_t tableSize = 0;

  bool isAtLeast(unsigned wantedMajor, unsigned wantedMinor) const {
    return major > wantedMajor ||
           (major == wantedMajor && minor >= wantedMinor);
  }
};

struct EntryPointReading {
  /// Absent when \p bytes are no entry point at all or too short to say
  /// which version they describe.
  std::optional<SmbiosEntryPoint> entryPoint;
  /// What is wrong with the bytes (bad checksum, cut short, unknown anchor),
  /// each a sentence without the file name.
  std::vector<std::string> problems;
};

/// Reads the entry point in \p bytes.
EntryPointReading parseSmbiosEntryPoint(std::string_view bytes);

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_SMBIOSENTRYPOINT_H
