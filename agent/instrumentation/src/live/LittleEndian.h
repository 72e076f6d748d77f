//===- LittleEndian.h - Reading little-endian firmware fields -------------===//
//
/// \file
/// SMBIOS and PCI structures store numbers little-endian. The readers take
/// an offset that the caller has checked to lie inside \p bytes.
//
//===----------------------------------------------------------------------===//

#ifndef HX_SRC_LIVE_LITTLEENDIAN_H
#define HX_SRC_LIVE_LITTLEENDIAN_H

#include <cstddef>
#include <cstdint>
#include <string_view>

namespace HX {
namespace detail {
namespace live {

inline std::uint8_t byteAt(std::string_view bytes, std::size_t offset) {
  return static_cast<std::uint8_t>(bytes[offset]);
}

inline std::uint16_t wordAt(std::string_view bytes, std::size_t offset) {
  return static_cast<std::uint16_t>(byteAt(bytes, offset) |
                                    (byteAt(bytes, offset + 1) << 8));
}

inline std::uint32_t dwordAt(std::string_view bytes, std::size_t offset) {
  return static_cast<std::uint32_t>(wordAt(bytes, offset)) |
         (static_cast<std::uint32_t>(wordAt(bytes, offset + 2)) << 16);
}

} // namespace live
} // namespace detail
} // namespace HX

#endif // HX_SRC_LIVE_LITTLEENDIAN_H
