//===- RecordedMachine.h - A machine's system files in a temporary tree ---===//
//
// Writes what the live source reads of a machine, laid out as the kernel
// lays it out: the SMBIOS entry point and table under /sys/firmware,
// /sys/class/dmi/id, PCI functions under /sys/devices with the links of
// /sys/bus/pci/devices, network interfaces and disks below them with the
// links of /sys/class/net and /sys/block, /sys/bus/pci/slots, and a PCI ID
// database. The tree lives in a fresh temporary directory, removed with
// everything in it when the object goes.
//
// Usable without GoogleTest (the benchmark writes its machine with it):
// failures throw std::runtime_error.
//
//===----------------------------------------------------------------------===//

#ifndef HX_TESTS_LIVE_RECORDEDMACHINE_H
#define HX_TESTS_LIVE_RECORDEDMACHINE_H

#include "SmbiosBuilder.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <map>
#include <stdexcept>
#include <string>

#include <unistd.h>

namespace hxlive {

/// How an interface looks in /sys/class/net/<name>.
struct InterfaceFiles {
  bool up = true;
  bool carrier = true;
  std::string address = "52:54:00:12:34:56";
  /// 0 permanent, 1 random, 2 stolen, 3 set.
  unsigned addressAssignType = 0;
  /// A device between the function and "net", e.g. "virtio2".
  std::string via;
};

class RecordedMachine {
public:
  RecordedMachine() {
    std::string pattern = temporaryBase() + "/hx-live-XXXXXX";
    if (::mkdtemp(pattern.data()) == nullptr)
      throw std::runtime_error("cannot create a directory from " + pattern);
    Root = pattern;
  }
  RecordedMachine(const RecordedMachine &) = delete;
  RecordedMachine &operator=(const RecordedMachine &) = delete;
  ~RecordedMachine() {
    std::error_code ignored;
    std::filesystem::remove_all(Root, ignored);
  }

  /// The root to hand to HX::useLiveMachine.
  const std::string &root() const { return Root; }

  /// \p absolute ("/sys/...") below the root.
  std::string path(const std::string &absolute) const {
    return Root + absolute;
  }

  void writeFile(const std::string &absolute, const std::string &contents) {
    const std::filesystem::path file = path(absolute);
    std::filesystem::create_directories(file.parent_path());
    std::ofstream out(file, std::ios::binary | std::ios::trunc);
    out << contents;
    out.close();
    if (!out)
      throw std::runtime_error("cannot write " + file.string());
  }

  void makeDirectory(const std::string &absolute) {
    std::filesystem::create_directories(path(absolute));
  }

  /// A symbolic link at \p absolute with the text \p target. A link that
  /// replaces another gets an inode of its own, as a new device's entry
  /// does in sysfs (a file system may hand a freed inode number out again).
  void makeLink(const std::string &absolute, const std::string &target) {
    const std::filesystem::path link = path(absolute);
    std::filesystem::create_directories(link.parent_path());
    const std::filesystem::path fresh = link.string() + ".new";
    std::filesystem::create_symlink(target, fresh);
    std::filesystem::rename(fresh, link);
  }

  void remove(const std::string &absolute) {
    std::filesystem::remove_all(path(absolute));
  }

  // --- Firmware ------------------------------------------------------------

  void writeSmbios(const std::string &entryPoint, const std::string &table) {
    writeFile("/sys/firmware/dmi/tables/smbios_entry_point", entryPoint);
    writeFile("/sys/firmware/dmi/tables/DMI", table);
  }

  /// \p table with an SMBIOS 3.3 entry point.
  void writeSmbios(const SmbiosTable &table) {
    writeSmbios(
        entryPoint3(3, 3, static_cast<std::uint32_t>(table.bytes().size())),
        table.bytes());
  }

  void writeDmiAttribute(const std::string &name, const std::string &value) {
    writeFile("/sys/class/dmi/id/" + name, value + "\n");
  }

  // --- PCI -----------------------------------------------------------------

  /// A PCI function at \p address of class \p classCode (0xBBSSPP), below
  /// the bridge \p bridge when one is given (which must be recorded first).
  void pciFunction(const std::string &address, std::uint32_t classCode,
                   unsigned vendor, unsigned device, unsigned subsystemVendor,
                   unsigned subsystemDevice, const std::string &bridge = "") {
    const std::string devicePath =
        bridge.empty()
            ? "/sys/devices/pci" + address.substr(0, 7) + "/" + address
            : Devices.at(bridge) + "/" + address;
    Devices[address] = devicePath;
    writeFile(devicePath + "/class", hex(classCode, 6));
    writeFile(devicePath + "/vendor", hex(vendor, 4));
    writeFile(devicePath + "/device", hex(device, 4));
    writeFile(devicePath + "/subsystem_vendor", hex(subsystemVendor, 4));
    writeFile(devicePath + "/subsystem_device", hex(subsystemDevice, 4));
    makeLink("/sys/bus/pci/devices/" + address,
             "../../.." + devicePath.substr(4));
  }

  /// The device directory of a recorded PCI function ("/sys/devices/...").
  const std::string &devicePath(const std::string &address) const {
    return Devices.at(address);
  }

  void bindDriver(const std::string &address, const std::string &driver) {
    makeDirectory("/sys/bus/pci/drivers/" + driver);
    makeLink(devicePath(address) + "/driver",
             relativeToSys(devicePath(address)) + "bus/pci/drivers/" + driver);
  }

  /// Makes \p address an SR-IOV virtual function of \p physical.
  void makeVirtualFunction(const std::string &address,
                           const std::string &physical) {
    makeLink(devicePath(address) + "/physfn", "../" + physical);
  }

  void writeVpd(const std::string &address, const std::string &vpd) {
    writeFile(devicePath(address) + "/vpd", vpd);
  }

  void writeConfigSpace(const std::string &address, const std::string &bytes) {
    writeFile(devicePath(address) + "/config", bytes);
  }

  /// A network interface carried by the function at \p address.
  void netInterface(const std::string &address, const std::string &name,
                    const InterfaceFiles &files = {}) {
    const std::string below =
        devicePath(address) + (files.via.empty() ? "" : "/" + files.via);
    writeInterface(below + "/net/" + name, files);
    makeLink("/sys/class/net/" + name,
             "../.." + (below + "/net/" + name).substr(4));
  }

  /// An interface below no PCI function (loopback, bridges, containers).
  void virtualNetInterface(const std::string &name,
                           const InterfaceFiles &files = {}) {
    const std::string directory = "/sys/devices/virtual/net/" + name;
    writeInterface(directory, files);
    makeLink("/sys/class/net/" + name, "../.." + directory.substr(4));
  }

  /// A disk controlled by the function at \p address, found at \p below
  /// (e.g. "ata1/host0/target0:0:0/0:0:0:0") under it.
  void blockDevice(const std::string &address, const std::string &name,
                   const std::string &below) {
    const std::string directory =
        devicePath(address) + "/" + below + "/block/" + name;
    writeFile(directory + "/size", "1953525168\n");
    makeLink("/sys/block/" + name, ".." + directory.substr(4));
  }

  /// A disk below no PCI function (loop devices, RAM disks).
  void virtualBlockDevice(const std::string &name) {
    const std::string directory = "/sys/devices/virtual/block/" + name;
    writeFile(directory + "/size", "0\n");
    makeLink("/sys/block/" + name, ".." + directory.substr(4));
  }

  /// A slot in /sys/bus/pci/slots.
  void pciSlot(const std::string &name, const std::string &address,
               const std::string &maxBusSpeed = "") {
    writeFile("/sys/bus/pci/slots/" + name + "/address", address + "\n");
    if (!maxBusSpeed.empty())
      writeFile("/sys/bus/pci/slots/" + name + "/max_bus_speed",
                maxBusSpeed + "\n");
  }

  /// The PCI ID database of the recorded machine.
  void writePciIds(const std::string &text) {
    writeFile("/usr/share/misc/pci.ids", text);
  }

  static std::string hex(unsigned value, int digits) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%0*x\n", digits, value);
    return text;
  }

private:
  /// $TMPDIR when set; else memory-backed /dev/shm, where a machine of a
  /// hundred files is written a hundred times faster than on a disk; else
  /// /tmp.
  static std::string temporaryBase() {
    const char *base = std::getenv("TMPDIR");
    if (base && *base)
      return base;
    if (::access("/dev/shm", W_OK | X_OK) == 0)
      return "/dev/shm";
    return "/tmp";
  }

  /// "../../" from the directory of \p devicePath's entries up to /sys.
  static std::string relativeToSys(const std::string &devicePath) {
    std::string up;
    for (char c : devicePath.substr(5)) // below "/sys/"
      if (c == '/')
        up += "../";
    return up + "../";
  }

  void writeInterface(const std::string &directory,
                      const InterfaceFiles &files) {
    writeFile(directory + "/flags", files.up ? "0x1003\n" : "0x1002\n");
    if (files.up)
      writeFile(directory + "/carrier", files.carrier ? "1\n" : "0\n");
    writeFile(directory + "/address", files.address + "\n");
    writeFile(directory + "/addr_assign_type",
              std::to_string(files.addressAssignType) + "\n");
  }

  std::string Root;
  std::map<std::string, std::string> Devices;
};

} // namespace hxlive

#endif // HX_TESTS_LIVE_RECORDEDMACHINE_H
