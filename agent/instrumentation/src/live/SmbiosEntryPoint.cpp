//===- SmbiosEntryPoint.cpp - The SMBIOS entry point structure ------------===//

#include "live/SmbiosEntryPoint.h"

#include "live/LittleEndian.h"

#include <algorithm>

namespace HX {
namespace detail {
namespace live {
namespace {

/// Sizes and offsets of the three entry point layouts (DSP0134, 5.2).
constexpr std::size_t Length64 = 0x18;
constexpr std::size_t Length32 = 0x1F;
constexpr std::size_t ShortestLength32 = 0x1E; // some 2.1 firmware says 0x1E
constexpr std::size_t LengthLegacy = 0x0F;
constexpr std::size_t Intermediate32 = 0x10;

bool sumsToZero(std::string_view bytes) {
  unsigned sum = 0;
  for (char c : bytes)
    sum += static_cast<unsigned char>(c);
  return (sum & 0xFFu) == 0;
}

std::string cutShort(const char *kind, std::size_t have, std::size_t need) {
  return std::string(kind) + " entry point is " + std::to_string(have) +
         " bytes long, shorter than its " + std::to_string(need);
}

EntryPointReading parse64(std::string_view bytes) {
  EntryPointReading reading;
  if (bytes.size() < Length64) {
    reading.problems.push_back(cutShort("the 64-bit", bytes.size(), Length64));
    return reading;
  }
  std::size_t declared = byteAt(bytes, 0x06);
  if (declared < Length64 || declared > bytes.size())
    declared = Length64;
  if (!sumsToZero(bytes.substr(0, declared)))
    reading.problems.push_back("the 64-bit entry point's checksum is wrong");
  SmbiosEntryPoint entryPoint;
  entryPoint.major = byteAt(bytes, 0x07);
  entryPoint.minor = byteAt(bytes, 0x08);
  entryPoint.tableSize = dwordAt(bytes, 0x0C);
  reading.entryPoint = entryPoint;
  return reading;
}

EntryPointReading parse32(std::string_view bytes) {
  EntryPointReading reading;
  if (bytes.size() < ShortestLength32) {
    reading.problems.push_back(cutShort("the 32-bit", bytes.size(), Length32));
    return reading;
  }
  std::size_t declared = byteAt(bytes, 0x05);
  if (declared < ShortestLength32 || declared > bytes.size())
    declared = std::min(bytes.size(), Length32);
  if (!sumsToZero(bytes.substr(0, declared)))
    reading.problems.push_back("the 32-bit entry point's checksum is wrong");
  if (bytes.substr(Intermediate32, 5) != "_DMI_")
    reading.problems.push_back(
        "the 32-bit entry point lacks its \"_DMI_\" anchor at offset 0x10");
  else if (!sumsToZero(bytes.substr(Intermediate32, declared - Intermediate32)))
    reading.problems.push_back(
        "the 32-bit entry point's intermediate checksum is wrong");
  SmbiosEntryPoint entryPoint;
  entryPoint.major = byteAt(bytes, 0x06);
  entryPoint.minor = byteAt(bytes, 0x07);
  entryPoint.tableSize = wordAt(bytes, 0x16);
  entryPoint.structureCount = wordAt(bytes, 0x1C);
  reading.entryPoint = entryPoint;
  return reading;
}

EntryPointReading parseLegacy(std::string_view bytes) {
  EntryPointReading reading;
  if (bytes.size() < LengthLegacy) {
    reading.problems.push_back(
        cutShort("the legacy", bytes.size(), LengthLegacy));
    return reading;
  }
  if (!sumsToZero(bytes.substr(0, LengthLegacy)))
    reading.problems.push_back("the legacy entry point's checksum is wrong");
  SmbiosEntryPoint entryPoint;
  const unsigned revision = byteAt(bytes, 0x0E);
  entryPoint.major = revision >> 4;
  entryPoint.minor = revision & 0x0Fu;
  entryPoint.tableSize = wordAt(bytes, 0x06);
  entryPoint.structureCount = wordAt(bytes, 0x0C);
  reading.entryPoint = entryPoint;
  return reading;
}

} // namespace

EntryPointReading parseSmbiosEntryPoint(std::string_view bytes) {
  if (bytes.substr(0, 5) == "_SM3_")
    return parse64(bytes);
  if (bytes.substr(0, 4) == "_SM_")
    return parse32(bytes);
  if (bytes.substr(0, 5) == "_DMI_")
    return parseLegacy(bytes);
  EntryPointReading reading;
  reading.problems.push_back(
      "not an SMBIOS entry point (no \"_SM3_\", \"_SM_\" or \"_DMI_\" anchor)");
  return reading;
}

} // namespace live
} // namespace detail
} // namespace HX
