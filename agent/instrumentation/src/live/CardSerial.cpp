//===- CardSerial.cpp - The serial number a PCI card carries --------------===//

#include "live/CardSerial.h"

#include "live/FirmwareText.h"
#include "live/LittleEndian.h"

#include <cstdio>
#include <unordered_set>

namespace HX {
namespace detail {
namespace live {
namespace {

/// PCI Local Bus 3.0, section 6.4 and appendix I: resource tags.
constexpr unsigned LargeResource = 0x80;
constexpr unsigned ReadOnlySection = 0x10; // large tag 0x90
constexpr unsigned EndTag = 0x0F;          // small tag 0x78
/// The VPD address register has 15 bits.
constexpr std::uint64_t VpdSize = 0x8000;
/// Bounds the walk over a VPD whose tags point in circles or nowhere.
constexpr int MostResources = 16;

std::optional<std::string> serialKeyword(std::string_view section) {
  std::size_t position = 0;
  while (position + 3 <= section.size()) {
    std::string_view keyword = section.substr(position, 2);
    const std::size_t length = byteAt(section, position + 2);
    std::string_view value = section.substr(position + 3, length);
    if (keyword == "SN") {
      bool odd = false;
      return meaningfulText(value, odd);
    }
    if (keyword == "RV")
      break;
    position += 3 + length;
  }
  return std::nullopt;
}

/// PCI Express Base, section 7.9.3: extended capabilities start at 0x100.
constexpr std::uint64_t ExtendedCapabilities = 0x100;
constexpr std::uint64_t ExtendedConfigurationSize = 0x1000;
constexpr unsigned DeviceSerialNumberId = 0x0003;
constexpr int MostCapabilities = 64;

} // namespace

std::optional<std::string> vpdSerialNumber(const RandomAccessFile &vpd) {
  std::uint64_t offset = 0;
  for (int resource = 0; resource < MostResources && offset < VpdSize;
       ++resource) {
    std::string tag = vpd.readAt(offset, 1);
    if (tag.empty())
      return std::nullopt;
    const unsigned tagByte = byteAt(tag, 0);
    if ((tagByte & LargeResource) == 0) {
      if (((tagByte >> 3) & 0x0Fu) == EndTag)
        return std::nullopt;
      offset += 1 + (tagByte & 0x07u);
      continue;
    }
    std::string header = vpd.readAt(offset, 3);
    if (header.size() < 3)
      return std::nullopt;
    const std::size_t length = wordAt(header, 1);
    if ((tagByte & 0x7Fu) == ReadOnlySection)
      return serialKeyword(vpd.readAt(offset + 3, length));
    offset += 3 + length;
  }
  return std::nullopt;
}

std::optional<std::string> deviceSerialNumber(const RandomAccessFile &config) {
  std::uint64_t offset = ExtendedCapabilities;
  std::unordered_set<std::uint64_t> visited;
  for (int step = 0; step < MostCapabilities; ++step) {
    if (offset < ExtendedCapabilities || offset >= ExtendedConfigurationSize ||
        offset % 4 != 0 || !visited.insert(offset).second)
      return std::nullopt;
    std::string header = config.readAt(offset, 4);
    if (header.size() < 4)
      return std::nullopt;
    const std::uint32_t word = dwordAt(header, 0);
    if (word == 0 || word == 0xFFFFFFFFu)
      return std::nullopt;
    if ((word & 0xFFFFu) == DeviceSerialNumberId) {
      std::string serial = config.readAt(offset + 4, 8);
      if (serial.size() < 8)
        return std::nullopt;
      const std::uint32_t low = dwordAt(serial, 0);
      const std::uint32_t high = dwordAt(serial, 4);
      if ((low == 0 && high == 0) ||
          (low == 0xFFFFFFFFu && high == 0xFFFFFFFFu))
        return std::nullopt;
      char text[32];
      std::snprintf(
          text, sizeof text, "%02x-%02x-%02x-%02x-%02x-%02x-%02x-%02x",
          high >> 24, (high >> 16) & 0xFFu, (high >> 8) & 0xFFu, high & 0xFFu,
          low >> 24, (low >> 16) & 0xFFu, (low >> 8) & 0xFFu, low & 0xFFu);
      return std::string(text);
    }
    offset = word >> 20;
  }
  return std::nullopt;
}

} // namespace live
} // namespace detail
} // namespace HX
