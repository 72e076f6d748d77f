// Fuzz target: the live source's readers of the system files below a root:
// the attributes and links of PCI functions (class, ids, driver, virtual
// function, VPD, configuration space), network interfaces and disks, the
// kernel's PCI slots, the DMI attributes, the SMBIOS files and the PCI ID
// database. Each input lays out a small machine below a scratch root whose
// files hold what the input says, some missing, some cut short, some
// unreadable, and the machine is read as the cursor reads it for each node
// type, twice, so that what the readers keep between readings is used too.
//
// Nothing is written outside the scratch root: every name that comes from
// the input is cleaned into one path segment first. Links may point
// anywhere; they are only read.
#include "FuzzCheck.h"

#include "HardwareSnapshot.h"
#include "live/LiveMachineReader.h"

#include <KVLog/KVLogConfig.h>
#include <fuzzer/FuzzedDataProvider.h>

#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

namespace {

namespace fs = std::filesystem;
using HX::detail::HardwareSnapshot;

/// The scratch root every input's machine is written below.
const std::string& scratchRoot() {
  static const std::string root = [] {
    const char* base = std::getenv("TMPDIR");
    std::string pattern = std::string(base && *base ? base : "/dev/shm") + "/tvr-fuzz-sysfs-XXXXXX";
    if (!::mkdtemp(pattern.data())) std::abort();
    return pattern;
  }();
  return root;
}

/// Lays out one machine below the scratch root as the input dictates.
class MachineWriter {
public:
  explicit MachineWriter(FuzzedDataProvider& input) : input_(input), root_(scratchRoot()) {
    std::error_code ignored;
    fs::remove_all(root_ + "/sys", ignored);
    fs::remove_all(root_ + "/usr", ignored);
  }

  void writeMachine() {
    writePciIdDatabase();
    writeFirmware();
    std::vector<std::string> addresses;
    const int functions = input_.ConsumeIntegralInRange(0, 4);
    for (int i = 0; i < functions; ++i) addresses.push_back(writePciFunction());
    const int interfaces = input_.ConsumeIntegralInRange(0, 3);
    for (int i = 0; i < interfaces; ++i) writeNetworkInterface(addresses);
    const int disks = input_.ConsumeIntegralInRange(0, 3);
    for (int i = 0; i < disks; ++i) writeBlockDevice(addresses);
    const int slots = input_.ConsumeIntegralInRange(0, 3);
    for (int i = 0; i < slots; ++i) writeKernelSlot(addresses);
  }

  const std::string& root() const { return root_; }

private:
  /// \p name made into one path segment.
  static std::string asSegment(std::string name) {
    for (char& c : name)
      if (c == '/' || c == '\0') c = '_';
    if (name.empty() || name == "." || name == "..") name = "n" + name;
    return name;
  }

  /// A name from the input made into one path segment.
  std::string segment(std::size_t maxLength) { return asSegment(input_.ConsumeRandomLengthString(maxLength)); }

  /// One of a few realistic choices, or text from the input.
  std::string oneOf(std::initializer_list<const char*> choices, std::size_t maxLength) {
    const std::size_t pick = input_.ConsumeIntegralInRange<std::size_t>(0, choices.size());
    if (pick < choices.size()) return *(choices.begin() + pick);
    return input_.ConsumeRandomLengthString(maxLength);
  }

  void file(const std::string& absolute, const std::string& contents) {
    const fs::path path = root_ + absolute;
    std::error_code ignored;
    fs::create_directories(path.parent_path(), ignored);
    std::ofstream(path, std::ios::binary | std::ios::trunc) << contents;
  }

  /// The file with the contents, left out, or a directory in its place (a
  /// file that is there but cannot be read).
  void attribute(const std::string& absolute, const std::string& contents) {
    switch (input_.ConsumeIntegralInRange(0, 5)) {
    case 0: return;
    case 1: {
      std::error_code ignored;
      fs::create_directories(root_ + absolute, ignored);
      return;
    }
    default: file(absolute, contents);
    }
  }

  void link(const std::string& absolute, const std::string& target) {
    const fs::path path = root_ + absolute;
    std::error_code ignored;
    fs::create_directories(path.parent_path(), ignored);
    fs::remove(path, ignored);
    fs::create_symlink(target.empty() ? "." : target, path, ignored);
  }

  void writePciIdDatabase() {
    // Always there, so that the database of the machine the fuzzer runs on
    // is never parsed in its place.
    file("/usr/share/misc/pci.ids",
         oneOf({"8086  Intel Corporation\n\t1572  Ethernet Controller X710\nC 02  Network controller\n\t00  Ethernet"
                " controller\n",
                "# empty\n"},
               256));
  }

  void writeFirmware() {
    if (input_.ConsumeBool()) {
      attribute("/sys/firmware/dmi/tables/smbios_entry_point", input_.ConsumeRandomLengthString(40));
      attribute("/sys/firmware/dmi/tables/DMI", input_.ConsumeRandomLengthString(600));
    }
    if (input_.ConsumeBool())
      for (const char* name : {"sys_vendor", "product_name", "product_serial", "product_uuid", "chassis_type",
                               "chassis_vendor", "chassis_serial", "chassis_asset_tag"})
        attribute(std::string("/sys/class/dmi/id/") + name, input_.ConsumeRandomLengthString(48));
  }

  std::string writePciFunction() {
    const std::string address =
        asSegment(oneOf({"0000:00:1f.2", "0000:3b:00.0", "0000:3b:00.1", "0000:5e:00.0", "10000:ff:1f.7"}, 16));
    const std::string device = "/sys/devices/pci0000:00/" + address;
    link("/sys/bus/pci/devices/" + address, "../../.." + device.substr(4));
    attribute(device + "/class", oneOf({"0x020000\n", "0x010601\n", "0x010802\n", "0x018000\n"}, 12));
    for (const char* id : {"vendor", "device", "subsystem_vendor", "subsystem_device"})
      attribute(device + "/" + id, oneOf({"0x8086\n", "0x1572\n", "0x0007\n"}, 12));
    if (input_.ConsumeBool()) link(device + "/physfn", "../" + segment(16));
    if (input_.ConsumeBool()) link(device + "/driver", "../../../bus/pci/drivers/" + segment(16));
    if (input_.ConsumeBool()) attribute(device + "/vpd", input_.ConsumeRandomLengthString(300));
    if (input_.ConsumeBool()) attribute(device + "/config", input_.ConsumeRandomLengthString(4400));
    return address;
  }

  std::string deviceBelow(const std::vector<std::string>& addresses) {
    if (addresses.empty() || input_.ConsumeBool()) return input_.ConsumeRandomLengthString(80);
    const std::string& address =
        addresses[input_.ConsumeIntegralInRange<std::size_t>(0, addresses.size() - 1)];
    return "devices/pci0000:00/" + address + "/" + segment(24);
  }

  void writeNetworkInterface(const std::vector<std::string>& addresses) {
    const std::string name = segment(16);
    if (input_.ConsumeBool()) {
      // An interface whose files are there: below a directory of its own.
      const std::string directory = "/sys/devices/virtual/net/" + name;
      link("/sys/class/net/" + name, "../.." + directory.substr(4));
      attribute(directory + "/flags", oneOf({"0x1003\n", "0x1002\n"}, 12));
      attribute(directory + "/carrier", oneOf({"1\n", "0\n"}, 4));
      attribute(directory + "/address", oneOf({"52:54:00:12:34:56\n", "00:00:00:00:00:00\n"}, 24));
      attribute(directory + "/addr_assign_type", oneOf({"0\n", "3\n"}, 4));
    } else {
      link("/sys/class/net/" + name, "../../" + deviceBelow(addresses) + "/net/" + name);
    }
  }

  void writeBlockDevice(const std::vector<std::string>& addresses) {
    const std::string name = segment(16);
    link("/sys/block/" + name, "../" + deviceBelow(addresses) + "/block/" + name);
  }

  void writeKernelSlot(const std::vector<std::string>& addresses) {
    const std::string directory = "/sys/bus/pci/slots/" + segment(12);
    const std::string address = addresses.empty() || input_.ConsumeBool()
                                    ? input_.ConsumeRandomLengthString(16)
                                    : addresses.front().substr(0, 10);
    attribute(directory + "/address", address + "\n");
    attribute(directory + "/max_bus_speed", oneOf({"8.0 GT/s PCIe\n", "Unknown\n", "33 MHz PCI\n"}, 24));
  }

  FuzzedDataProvider& input_;
  const std::string root_;
};

void checkReading(const std::shared_ptr<const HardwareSnapshot>& reading, HX::NodeLexicon::NodeType wanted) {
  tvr::fuzz::require(reading != nullptr, "every reading gives a snapshot");
  tvr::fuzz::require(!reading->nodesOfType(HX::NodeLexicon::ChassisNode).empty(),
                     "every reading holds the main chassis");
  for (HardwareSnapshot::NodeIndex index : reading->nodesOfType(wanted))
    tvr::fuzz::require(index < reading->size() && reading->node(index).type == wanted,
                       "the type index points at nodes of its type");
}

} // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  // Problems of the machine are logged; nobody needs to read them here.
  KVLog::configureSink(KVLog::Channel::Log, {KVLog::SinkSettings::Destination::Off, "", 0});
  KVLog::configureSink(KVLog::Channel::Trace, {KVLog::SinkSettings::Destination::Off, "", 0});
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  FuzzedDataProvider input(data, size);
  MachineWriter machine(input);
  machine.writeMachine();
  HX::detail::live::LiveMachineReader reader(machine.root());
  for (int reading = 0; reading < 2; ++reading) {
    checkReading(reader.firmwareReading(true), HX::NodeLexicon::SlotNode);
    checkReading(reader.networkCardReading(), HX::NodeLexicon::NetworkCardNode);
    checkReading(reader.storageControllerReading(), HX::NodeLexicon::StorageControllerNode);
  }
  return 0;
}
