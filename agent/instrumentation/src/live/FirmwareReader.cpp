//===- FirmwareReader.cpp - Reading what the firmware says of the machine -===//

#include "live/FirmwareReader.h"

#include "live/FirmwareText.h"
#include "live/SmbiosDecoding.h"
#include "live/SmbiosEntryPoint.h"
#include "live/SmbiosTable.h"

#include <sys/stat.h>

namespace HX {
namespace detail {
namespace live {
namespace {

constexpr std::string_view EntryPointFile =
    "/sys/firmware/dmi/tables/smbios_entry_point";
constexpr std::string_view TableFile = "/sys/firmware/dmi/tables/DMI";
constexpr std::string_view DmiAttributesDirectory = "/sys/class/dmi/id";

/// Entry points are at most 32 bytes; tables are at most tens of KiB on
/// real machines. The limits only guard against a file that is no table.
constexpr std::size_t EntryPointLimit = 256;
constexpr std::size_t TableLimit = 16u << 20;

/// Reads one of the two SMBIOS files; nullopt when it cannot be had. A file
/// that is not there is normal (no SMBIOS); any other failure is logged.
std::optional<std::string> readSmbiosFile(const std::string &path,
                                          std::size_t limit, ProblemLog &log) {
  FileText file = readFileText(path, limit);
  if (!file.ok()) {
    if (!isGone(file.error))
      log.report(path + ": cannot read: " + errorText(file.error) +
                 "; the firmware facts are taken from " +
                 std::string(DmiAttributesDirectory) + " instead");
    return std::nullopt;
  }
  if (file.cut)
    log.report(path + ": longer than " + std::to_string(limit) +
               " bytes; only those are read");
  return std::move(file.contents);
}

std::optional<FirmwareInventory> readSmbiosTable(const FileSystemRoot &root,
                                                 ProblemLog &log) {
  const std::string entryPointPath = root.path(EntryPointFile);
  const std::string tablePath = root.path(TableFile);
  std::optional<std::string> entryPointBytes =
      readSmbiosFile(entryPointPath, EntryPointLimit, log);
  if (!entryPointBytes)
    return std::nullopt;
  std::optional<std::string> table = readSmbiosFile(tablePath, TableLimit, log);
  if (!table)
    return std::nullopt;

  EntryPointReading entryPoint = parseSmbiosEntryPoint(*entryPointBytes);
  for (const std::string &problem : entryPoint.problems)
    log.report(entryPointPath + ": " + problem);
  std::optional<unsigned> announcedCount;
  // Without a readable entry point the table is taken as a current one:
  // little-endian UUID fields, ended by its end-of-table structure.
  bool uuidFieldsLittleEndian = true;
  if (entryPoint.entryPoint) {
    announcedCount = entryPoint.entryPoint->structureCount;
    uuidFieldsLittleEndian = entryPoint.entryPoint->isAtLeast(2, 6);
  }

  SmbiosTableWalk walk = walkSmbiosTable(*table, announcedCount);
  std::vector<std::string> problems = std::move(walk.problems);
  if (walk.structures.empty()) {
    for (const std::string &problem : problems)
      log.report(tablePath + ": " + problem);
    log.report(tablePath +
               ": holds no whole structure; the firmware facts "
               "are taken from " +
               std::string(DmiAttributesDirectory) + " instead");
    return std::nullopt;
  }
  FirmwareInventory inventory =
      decodeSmbios(walk, uuidFieldsLittleEndian, problems);
  for (const std::string &problem : problems)
    log.report(tablePath + ": " + problem);
  return inventory;
}

class DmiAttributeReader {
public:
  DmiAttributeReader(const FileSystemRoot &root, ProblemLog &log)
      : Directory(root.path(DmiAttributesDirectory)), Log(log) {}

  bool exists() const {
    struct stat status {};
    return ::stat(Directory.c_str(), &status) == 0 && S_ISDIR(status.st_mode);
  }

  /// The attribute's raw value; nullopt when it is not there or unreadable
  /// (serial numbers and the UUID are for root only).
  std::optional<std::string> raw(const char *name) {
    const std::string path = Directory + "/" + name;
    FileText file = readFileText(path);
    if (!file.ok()) {
      if (!isGone(file.error))
        Log.report(path + ": cannot read: " + errorText(file.error));
      return std::nullopt;
    }
    return std::string(attributeValue(file.contents));
  }

  OptionalText text(const char *name) {
    std::optional<std::string> value = raw(name);
    if (!value)
      return std::nullopt;
    bool odd = false;
    OptionalText text = meaningfulText(*value, odd);
    if (odd)
      Log.report(Directory + "/" + name +
                 ": holds bytes that are not text; they read as U+FFFD");
    return text;
  }

  /// The UUID as the kernel prints it, checked and in lower case.
  OptionalText uuid() {
    std::optional<std::string> value = raw("product_uuid");
    if (!value || value->size() != 36)
      return std::nullopt;
    std::string lower;
    bool allZero = true, allOnes = true;
    for (std::size_t i = 0; i < value->size(); ++i) {
      char c = (*value)[i];
      const bool dash = i == 8 || i == 13 || i == 18 || i == 23;
      if (dash != (c == '-'))
        return std::nullopt;
      if (!dash) {
        if (c >= 'A' && c <= 'F')
          c = static_cast<char>(c - 'A' + 'a');
        if (!((c >= '0' && c <= '9') || (c >= 'a' && c <= 'f')))
          return std::nullopt;
        allZero = allZero && c == '0';
        allOnes = allOnes && c == 'f';
      }
      lower += c;
    }
    if (allZero || allOnes)
      return std::nullopt;
    return lower;
  }

private:
  std::string Directory;
  ProblemLog &Log;
};

} // namespace

std::optional<FirmwareInventory> readDmiAttributes(const FileSystemRoot &root,
                                                   ProblemLog &log) {
  DmiAttributeReader attributes(root, log);
  if (!attributes.exists())
    return std::nullopt;
  FirmwareInventory inventory;
  inventory.source = FirmwareSource::DmiAttributes;
  SystemRecord system;
  system.manufacturer = attributes.text("sys_vendor");
  system.productName = attributes.text("product_name");
  system.version = attributes.text("product_version");
  system.serialNumber = attributes.text("product_serial");
  system.uuid = attributes.uuid();
  system.sku = attributes.text("product_sku");
  system.family = attributes.text("product_family");
  inventory.system = system;

  ChassisRecord chassis;
  if (std::optional<std::string> type = attributes.raw("chassis_type"))
    if (std::optional<std::uint32_t> code = parseDecimal(*type))
      chassis.chassisType = *code & 0x7Fu;
  chassis.manufacturer = attributes.text("chassis_vendor");
  chassis.version = attributes.text("chassis_version");
  chassis.serialNumber = attributes.text("chassis_serial");
  chassis.assetTag = attributes.text("chassis_asset_tag");
  inventory.chassis.push_back(chassis);
  return inventory;
}

FirmwareInventory readFirmwareInventory(const FileSystemRoot &root,
                                        ProblemLog &log) {
  if (std::optional<FirmwareInventory> table = readSmbiosTable(root, log))
    return std::move(*table);
  if (std::optional<FirmwareInventory> attributes =
          readDmiAttributes(root, log))
    return std::move(*attributes);
  return FirmwareInventory();
}

} // namespace live
} // namespace detail
} // namespace HX
