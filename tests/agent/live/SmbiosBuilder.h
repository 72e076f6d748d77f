//===- SmbiosBuilder.h - Hand-built SMBIOS tables for recorded machines ---===//
//
// Builds SMBIOS entry points and tables byte by byte, laid out as the SMBIOS
// reference lays them out, so that tests can write the very files the kernel
// exports: well-formed ones for the recorded machines, and broken ones (bad
// lengths, missing terminators, huge counts) to show the reader survives them.
//
//===----------------------------------------------------------------------===//

#ifndef HX_TESTS_LIVE_SMBIOSBUILDER_H
#define HX_TESTS_LIVE_SMBIOSBUILDER_H

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace hxlive {

/// One structure: header, fields, strings.
class SmbiosStructure {
public:
  SmbiosStructure(std::uint8_t type, std::uint16_t handle)
      : Type(type), Handle(handle) {}

  SmbiosStructure &byte(unsigned value) {
    Fields.push_back(static_cast<char>(value & 0xFF));
    return *this;
  }
  SmbiosStructure &word(unsigned value) { return byte(value).byte(value >> 8); }
  SmbiosStructure &dword(std::uint32_t value) {
    return word(value & 0xFFFF).word(value >> 16);
  }
  SmbiosStructure &bytes(const std::string &raw) {
    Fields += raw;
    return *this;
  }
  /// A string field: refers to \p text as the next string, or holds 0 (no
  /// string) when \p text is empty.
  SmbiosStructure &text(const std::string &value) {
    if (value.empty())
      return byte(0);
    Strings.push_back(value);
    return byte(static_cast<unsigned>(Strings.size()));
  }
  /// A string field that refers to string \p number whatever strings exist.
  SmbiosStructure &stringNumber(unsigned number) { return byte(number); }

  /// Writes \p length as the length byte instead of the true one.
  SmbiosStructure &claimLength(unsigned length) {
    ClaimedLength = length;
    return *this;
  }
  /// Leaves out the empty string that ends the string set.
  SmbiosStructure &withoutTerminator() {
    Terminated = false;
    return *this;
  }

  std::string encode() const {
    std::string out;
    out += static_cast<char>(Type);
    out +=
        static_cast<char>(ClaimedLength ? *ClaimedLength : 4 + Fields.size());
    out += static_cast<char>(Handle & 0xFF);
    out += static_cast<char>(Handle >> 8);
    out += Fields;
    for (const std::string &value : Strings) {
      out += value;
      out += '\0';
    }
    if (Strings.empty())
      out += '\0';
    if (Terminated)
      out += '\0';
    else
      out.pop_back();
    return out;
  }

private:
  std::uint8_t Type;
  std::uint16_t Handle;
  std::string Fields;
  std::vector<std::string> Strings;
  std::optional<unsigned> ClaimedLength;
  bool Terminated = true;
};

/// Type 1, SMBIOS 2.8 layout.
struct SystemInformation {
  std::string manufacturer;
  std::string productName;
  std::string version;
  std::string serialNumber;
  std::array<std::uint8_t, 16> uuid{};
  std::string sku;
  std::string family;
  std::uint16_t handle = 0x0100;

  SmbiosStructure structure() const {
    SmbiosStructure s(1, handle);
    s.text(manufacturer).text(productName).text(version).text(serialNumber);
    for (std::uint8_t b : uuid)
      s.byte(b);
    return s.byte(0x06 /* power switch */).text(sku).text(family);
  }
};

/// Type 3, SMBIOS 2.7+ layout (with the SKU number after the contained
/// elements).
struct ChassisInformation {
  unsigned type = 0x17; // Rack Mount Chassis
  std::string manufacturer;
  std::string version;
  std::string serialNumber;
  std::string assetTag;
  unsigned bootUpState = 0x03; // Safe
  unsigned powerSupplyState = 0x03;
  unsigned thermalState = 0x03;
  unsigned containedCount = 0;
  unsigned containedRecordLength = 3;
  /// Contained element bytes actually written (may differ from the count
  /// times the record length for broken tables).
  std::string containedElements;
  std::string sku;
  bool withSkuField = true;
  std::uint16_t handle = 0x0300;

  SmbiosStructure structure() const {
    SmbiosStructure s(3, handle);
    s.text(manufacturer)
        .byte(type)
        .text(version)
        .text(serialNumber)
        .text(assetTag)
        .byte(bootUpState)
        .byte(powerSupplyState)
        .byte(thermalState)
        .byte(0x03 /* security: none */)
        .dword(0)
        .byte(0x02 /* height */)
        .byte(0x02 /* power cords */)
        .byte(containedCount)
        .byte(containedRecordLength)
        .bytes(containedElements);
    if (withSkuField)
      s.text(sku);
    return s;
  }
};

/// Type 8.
struct PortConnector {
  std::string internalDesignator;
  unsigned internalType = 0x00;
  std::string externalDesignator;
  unsigned externalType = 0x12; // Access Bus (USB)
  unsigned portType = 0x10;     // USB
  std::uint16_t handle = 0x0800;

  SmbiosStructure structure() const {
    SmbiosStructure s(8, handle);
    return s.text(internalDesignator)
        .byte(internalType)
        .text(externalDesignator)
        .byte(externalType)
        .byte(portType);
  }
};

/// Type 9, SMBIOS 2.6 layout (segment, bus, device/function).
struct SystemSlot {
  std::string designation;
  unsigned slotType = 0xB6;     // PCI Express Gen 3 x16
  unsigned dataBusWidth = 0x0D; // x16
  unsigned currentUsage = 0x03; // Available
  unsigned slotLength = 0x04;   // Long
  unsigned slotId = 1;
  unsigned segment = 0x0000;
  unsigned bus = 0xFF;
  unsigned deviceFunction = 0xFF;
  std::uint16_t handle = 0x0900;

  SmbiosStructure structure() const {
    SmbiosStructure s(9, handle);
    return s.text(designation)
        .byte(slotType)
        .byte(dataBusWidth)
        .byte(currentUsage)
        .byte(slotLength)
        .word(slotId)
        .byte(0x0C /* 3.3 V, shared */)
        .byte(0x01 /* PME */)
        .word(segment)
        .byte(bus)
        .byte(deviceFunction);
  }
};

inline SmbiosStructure endOfTable(std::uint16_t handle = 0xFEFF) {
  return SmbiosStructure(127, handle);
}

/// Structures in table order.
class SmbiosTable {
public:
  SmbiosTable &add(const SmbiosStructure &structure) {
    Bytes += structure.encode();
    ++Count;
    return *this;
  }
  SmbiosTable &add(const SystemInformation &s) { return add(s.structure()); }
  SmbiosTable &add(const ChassisInformation &s) { return add(s.structure()); }
  SmbiosTable &add(const PortConnector &s) { return add(s.structure()); }
  SmbiosTable &add(const SystemSlot &s) { return add(s.structure()); }
  /// Appends raw bytes (a cut-off structure, garbage).
  SmbiosTable &raw(const std::string &bytes) {
    Bytes += bytes;
    return *this;
  }

  const std::string &bytes() const { return Bytes; }
  unsigned count() const { return Count; }

private:
  std::string Bytes;
  unsigned Count = 0;
};

namespace detail {
inline void fixChecksum(std::string &bytes, std::size_t at, std::size_t from,
                        std::size_t length) {
  unsigned sum = 0;
  for (std::size_t i = from; i < from + length; ++i)
    if (i != at)
      sum += static_cast<unsigned char>(bytes[i]);
  bytes[at] = static_cast<char>((256 - (sum & 0xFF)) & 0xFF);
}
inline void putWord(std::string &bytes, std::size_t at, unsigned value) {
  bytes[at] = static_cast<char>(value & 0xFF);
  bytes[at + 1] = static_cast<char>((value >> 8) & 0xFF);
}
inline void putDword(std::string &bytes, std::size_t at, std::uint32_t value) {
  putWord(bytes, at, value & 0xFFFF);
  putWord(bytes, at + 2, value >> 16);
}
} // namespace detail

/// A 64-bit ("_SM3_") entry point.
inline std::string entryPoint3(unsigned major, unsigned minor,
                               std::uint32_t tableSize) {
  std::string ep(0x18, '\0');
  ep.replace(0, 5, "_SM3_");
  ep[6] = 0x18;
  ep[7] = static_cast<char>(major);
  ep[8] = static_cast<char>(minor);
  ep[0x0A] = 0x01;
  detail::putDword(ep, 0x0C, tableSize);
  detail::putDword(ep, 0x10, 0x000E0000);
  detail::fixChecksum(ep, 0x05, 0, 0x18);
  return ep;
}

/// A 32-bit ("_SM_" with "_DMI_") entry point.
inline std::string entryPoint2(unsigned major, unsigned minor,
                               unsigned tableLength, unsigned count) {
  std::string ep(0x1F, '\0');
  ep.replace(0, 4, "_SM_");
  ep[5] = 0x1F;
  ep[6] = static_cast<char>(major);
  ep[7] = static_cast<char>(minor);
  detail::putWord(ep, 0x08, 0x0200);
  ep.replace(0x10, 5, "_DMI_");
  detail::putWord(ep, 0x16, tableLength);
  detail::putDword(ep, 0x18, 0x000E0000);
  detail::putWord(ep, 0x1C, count);
  ep[0x1E] = static_cast<char>((major << 4) | (minor & 0x0F));
  detail::fixChecksum(ep, 0x15, 0x10, 0x0F);
  detail::fixChecksum(ep, 0x04, 0, 0x1F);
  return ep;
}

/// A legacy ("_DMI_" alone) entry point.
inline std::string legacyEntryPoint(unsigned bcdRevision, unsigned tableLength,
                                    unsigned count) {
  std::string ep(0x0F, '\0');
  ep.replace(0, 5, "_DMI_");
  detail::putWord(ep, 0x06, tableLength);
  detail::putDword(ep, 0x08, 0x000E0000);
  detail::putWord(ep, 0x0C, count);
  ep[0x0E] = static_cast<char>(bcdRevision);
  detail::fixChecksum(ep, 0x05, 0, 0x0F);
  return ep;
}

} // namespace hxlive

#endif // HX_TESTS_LIVE_SMBIOSBUILDER_H
