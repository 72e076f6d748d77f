//===- RecordedMachines.h - The four machines the live source is tried on -===//
//
// - a two-socket rack server: rack-mount chassis, system slots, port
//   connectors, four network functions on two cards, a RAID controller
//   behind a bridge, SATA and NVMe;
// - a blade: a main server chassis (type 17) and an expansion chassis
//   (type 18) with slots and connectors marked for the expansion unit;
// - a laptop: an older SMBIOS with firmware placeholders, Wi-Fi switched off,
//   Ethernet without a cable;
// - a virtual machine without SMBIOS: virtio network and block devices only,
//   as the machine the agent is developed on.
//
// Each writes its own small PCI ID database, so names never depend on the
// database of the machine the tests run on.
//
//===----------------------------------------------------------------------===//

#ifndef HX_TESTS_LIVE_RECORDEDMACHINES_H
#define HX_TESTS_LIVE_RECORDEDMACHINES_H

#include "RecordedMachine.h"

namespace hxlive {

/// The names the recorded machines' PCI ID database gives.
inline const char *const RecordedPciIds =
    "# PCI ID database of the recorded machines\n"
    "1000  Broadcom / LSI\n"
    "\t0016  MegaRAID Tri-Mode SAS3508\n"
    "10ec  Realtek Semiconductor Co., Ltd.\n"
    "\t8168  RTL8111/8168/8411 PCI Express Gigabit Ethernet Controller\n"
    "144d  Samsung Electronics Co Ltd\n"
    "\ta808  NVMe SSD Controller SM981/PM981/PM983\n"
    "14e4  Broadcom Inc. and subsidiaries\n"
    "\t16d8  BCM57416 NetXtreme-E Dual-Media 10G RDMA Ethernet Controller\n"
    "1af4  Red Hat, Inc.\n"
    "\t1041  Virtio 1.0 network device\n"
    "\t1042  Virtio 1.0 block device\n"
    "\t1045  Virtio 1.0 balloon\n"
    "8086  Intel Corporation\n"
    "\t0d57  Host bridge\n"
    "\t1572  Ethernet Controller X710 for 10GbE SFP+\n"
    "\t\t8086 0007  Ethernet Converged Network Adapter X710-2\n"
    "\t2020  Sky Lake-E DMI3 Registers\n"
    "\t2030  Sky Lake-E PCI Express Root Port A\n"
    "\t2723  Wi-Fi 6 AX200\n"
    "\t7010  82371SB PIIX3 IDE [Natoma/Triton II]\n"
    "\ta182  C620 Series Chipset Family SATA Controller [AHCI mode]\n"
    "\ta353  Cannon Lake Mobile PCH SATA AHCI Controller\n"
    "C 01  Mass storage controller\n"
    "\t00  SCSI storage controller\n"
    "\t01  IDE interface\n"
    "\t04  RAID bus controller\n"
    "\t06  SATA controller\n"
    "\t\t01  AHCI 1.0\n"
    "\t07  Serial Attached SCSI controller\n"
    "\t08  Non-Volatile memory controller\n"
    "\t80  Mass storage controller\n"
    "C 02  Network controller\n"
    "\t00  Ethernet controller\n"
    "\t80  Network controller\n"
    "C 06  Bridge\n"
    "\t00  Host bridge\n"
    "\t04  PCI bridge\n";

/// A UUID whose first three fields read the same in both byte orders is no
/// test of the order; this one does not.
inline std::array<std::uint8_t, 16> rackServerUuid() {
  return {0x44, 0x45, 0x4c, 0x4c, 0x4b, 0x00, 0x10, 0x58,
          0x80, 0x4a, 0xb4, 0xc0, 0x4f, 0x4b, 0x32, 0x31};
}

inline void recordRackServer(RecordedMachine &machine) {
  SystemInformation system;
  system.manufacturer = "Korvane";
  system.productName = "Tarvos R2";
  system.version = "1.0";
  system.serialNumber = "KRV7Q2481";
  system.uuid = rackServerUuid();
  system.sku = "TR2-2U-8SFF";
  system.family = "Tarvos";

  ChassisInformation chassis;
  chassis.type = 0x17; // Rack Mount Chassis
  chassis.manufacturer = "Korvane";
  chassis.version = "2U-8SFF Rev B";
  chassis.serialNumber = "CZJ7Q2481";
  chassis.assetTag = "DC3-R12-U14";
  chassis.containedCount = 2;
  chassis.containedRecordLength = 3;
  chassis.containedElements = std::string("\x02\x01\x01\x87\x01\x02", 6);
  chassis.sku = "874321-B21";

  SystemSlot slot1;
  slot1.designation = "PCIe Slot 1";
  slot1.slotType = 0xB6;     // Gen 3 x16
  slot1.currentUsage = 0x04; // In use
  slot1.slotId = 1;
  slot1.bus = 0x3b;
  slot1.deviceFunction = 0x00;
  slot1.handle = 0x0901;
  SystemSlot slot2;
  slot2.designation = "PCIe Slot 2";
  slot2.slotType = 0xB5; // Gen 3 x8
  slot2.dataBusWidth = 0x0B;
  slot2.slotId = 2;
  slot2.handle = 0x0902;
  SystemSlot slot3;
  slot3.designation = "PCIe Slot 3";
  slot3.slotType = 0xB1;     // Gen 3, width in the bus width field
  slot3.dataBusWidth = 0x0B; // x8
  slot3.slotId = 3;
  slot3.handle = 0x0903;
  SystemSlot ocp;
  ocp.designation = "OCP NIC 3.0 Slot";
  ocp.slotType = 0x26;     // OCP NIC 3.0 SFF
  ocp.dataBusWidth = 0x0D; // x16
  ocp.currentUsage = 0x04;
  ocp.slotId = 4;
  ocp.bus = 0x5e;
  ocp.deviceFunction = 0x00;
  ocp.handle = 0x0904;

  PortConnector usb1{"J1A1", 0x00, "USB 1", 0x12, 0x10, 0x0801};
  PortConnector usb2{"J1A2", 0x00, "USB 2", 0x12, 0x10, 0x0802};
  PortConnector video{"J5", 0x00, "VGA", 0x07, 0x1C, 0x0803};
  PortConnector management{"J9", 0x00, "iLO", 0x0B, 0x1F, 0x0804};

  machine.writeSmbios(SmbiosTable()
                          .add(system)
                          .add(chassis)
                          .add(slot1)
                          .add(slot2)
                          .add(slot3)
                          .add(ocp)
                          .add(usb1)
                          .add(usb2)
                          .add(video)
                          .add(management)
                          .add(endOfTable()));

  machine.pciFunction("0000:00:00.0", 0x060000, 0x8086, 0x2020, 0x8086, 0x0000);
  machine.pciFunction("0000:00:1f.2", 0x010601, 0x8086, 0xa182, 0x8086, 0x7270);
  machine.bindDriver("0000:00:1f.2", "ahci");
  machine.blockDevice("0000:00:1f.2", "sr0", "ata1/host1/target1:0:0/1:0:0:0");

  machine.pciFunction("0000:17:00.0", 0x060400, 0x8086, 0x2030, 0x8086, 0x0000);
  machine.pciFunction("0000:18:00.0", 0x010400, 0x1000, 0x0016, 0x1000, 0x9460,
                      "0000:17:00.0");
  machine.bindDriver("0000:18:00.0", "megaraid_sas");
  for (int disk = 0; disk < 4; ++disk) {
    const std::string target = "0:2:" + std::to_string(disk);
    machine.blockDevice("0000:18:00.0", std::string("sd") + char('a' + disk),
                        "host0/target" + target + "/" + target + ":0");
  }

  // A dual-port card in PCIe Slot 1; both functions carry the card's VPD.
  const std::string vpd = std::string("\x82\x0a\x00", 3) + "X710-2 NIC" +
                          std::string("\x90\x16\x00", 3) + "PN\x06" + "X710DA" +
                          "SN\x0a" + "MYX7Q20931" + std::string("\x78", 1);
  for (const char *function : {"0000:3b:00.0", "0000:3b:00.1"}) {
    machine.pciFunction(function, 0x020000, 0x8086, 0x1572, 0x8086, 0x0007);
    machine.bindDriver(function, "i40e");
    machine.writeVpd(function, vpd);
  }
  machine.netInterface("0000:3b:00.0", "ens1f0");
  machine.netInterface("0000:3b:00.1", "ens1f1",
                       {true, false, "3c:fd:fe:9e:11:a1", 0, ""});

  // The OCP card: no VPD, a Device Serial Number in its extended
  // configuration space.
  std::string config(0x1000, '\0');
  const std::string dsnCapability(
      "\x03\x00\x01\x00\xb0\x9f\x8e\xff\xff\x21\x1b\x00", 12);
  config.replace(0x100, dsnCapability.size(), dsnCapability);
  for (const char *function : {"0000:5e:00.0", "0000:5e:00.1"}) {
    machine.pciFunction(function, 0x020000, 0x14e4, 0x16d8, 0x14e4, 0x4163);
    machine.bindDriver(function, "bnxt_en");
    machine.writeConfigSpace(function, config);
  }
  machine.netInterface("0000:5e:00.0", "eno1");
  machine.netInterface("0000:5e:00.1", "eno2",
                       {false, false, "b0:26:28:a1:00:02", 0, ""});

  machine.pciFunction("0000:d7:00.0", 0x060400, 0x8086, 0x2030, 0x8086, 0x0000);
  machine.pciFunction("0000:d8:00.0", 0x010802, 0x144d, 0xa808, 0x144d, 0xa801,
                      "0000:d7:00.0");
  machine.bindDriver("0000:d8:00.0", "nvme");
  machine.blockDevice("0000:d8:00.0", "nvme0n1", "nvme/nvme0");

  machine.virtualNetInterface("lo");
  machine.virtualNetInterface("docker0");
  machine.virtualBlockDevice("loop0");
  // The kernel knows a slot too; the firmware's slots take precedence.
  machine.pciSlot("1", "0000:3b:00", "8.0 GT/s PCIe");
  machine.writePciIds(RecordedPciIds);
}

inline void recordBlade(RecordedMachine &machine) {
  SystemInformation system;
  system.manufacturer = "Korvane";
  system.productName = "Tarvos B6 Compute Module";
  system.serialNumber = "KRVB60042";
  system.uuid = {0x10, 0x20, 0x30, 0x40, 0x50, 0x60, 0x70, 0x80,
                 0x90, 0xa0, 0xb0, 0xc0, 0xd0, 0xe0, 0xf0, 0x01};

  ChassisInformation blade;
  blade.type = 0x11; // Main Server Chassis
  blade.manufacturer = "Korvane";
  blade.version = "B6";
  blade.serialNumber = "BLD0042";
  blade.sku = "B6-CM";
  blade.handle = 0x0300;
  ChassisInformation expansion;
  expansion.type = 0x12; // Expansion Chassis
  expansion.manufacturer = "Korvane";
  expansion.version = "PXU-8";
  expansion.serialNumber = "PXU0007";
  expansion.handle = 0x0301;

  SystemSlot mezzanine;
  mezzanine.designation = "Mezzanine Slot 1";
  mezzanine.slotType = 0xA5;     // PCI Express
  mezzanine.dataBusWidth = 0x0B; // x8
  mezzanine.slotId = 1;
  mezzanine.currentUsage = 0x04;
  mezzanine.handle = 0x0901;
  SystemSlot pxu1;
  pxu1.designation = "PXU Slot 1";
  pxu1.slotId = 11;
  pxu1.handle = 0x0902;
  SystemSlot pxu2;
  pxu2.designation = "PXU Slot 2";
  pxu2.slotId = 12;
  pxu2.handle = 0x0903;

  PortConnector compute{"", 0x00, "Compute Module Port 1", 0x0B, 0x1F, 0x0801};
  PortConnector expansionPort{"", 0x00, "PEN Port 1", 0x0B, 0x1F, 0x0802};

  machine.writeSmbios(SmbiosTable()
                          .add(system)
                          .add(blade)
                          .add(expansion)
                          .add(mezzanine)
                          .add(pxu1)
                          .add(pxu2)
                          .add(compute)
                          .add(expansionPort)
                          .add(endOfTable()));

  machine.pciFunction("0000:00:17.0", 0x010601, 0x8086, 0xa182, 0x8086, 0x7270);
  machine.blockDevice("0000:00:17.0", "sda", "ata1/host0/target0:0:0/0:0:0:0");
  machine.pciFunction("0000:01:00.0", 0x020000, 0x8086, 0x1572, 0x8086, 0x0007);
  machine.netInterface("0000:01:00.0", "ens2f0",
                       {true, true, "3c:fd:fe:00:b6:01", 0, ""});
  machine.writePciIds(RecordedPciIds);
}

inline void recordLaptop(RecordedMachine &machine) {
  SystemInformation system;
  system.manufacturer = "Korvane";
  system.productName = "Lumo 14";
  system.version = "System Version";
  system.serialNumber = "To Be Filled By O.E.M.";
  system.uuid = {0x03, 0x00, 0x02, 0x00, 0x04, 0x00, 0x05, 0x00,
                 0x00, 0x06, 0x00, 0x07, 0x00, 0x08, 0x00, 0x09};

  ChassisInformation notebook;
  notebook.type = 0x80 | 0x0A; // Notebook, with a lock
  notebook.manufacturer = "Korvane";
  notebook.version = "Default string";
  notebook.serialNumber = "        ";
  notebook.assetTag = "No Asset Tag";
  notebook.withSkuField = false; // SMBIOS 2.6: no SKU number

  SystemSlot m2;
  m2.designation = "M.2 Slot";
  m2.slotType = 0x17;     // M.2 Socket 3 (key M)
  m2.dataBusWidth = 0x0A; // x4
  m2.slotId = 0;

  PortConnector unnamed1{"Not Specified", 0x00, "Not Specified", 0x12, 0x10,
                         0x0801};
  PortConnector unnamed2{"Not Specified", 0x00, "Not Specified", 0x12, 0x10,
                         0x0802};
  PortConnector usbC{"JUSBC1", 0x00, "USB-C", 0xFF, 0x10, 0x0803};
  PortConnector headphones{"JAUD1", 0x1F, "", 0x00, 0x00, 0x0804};

  const SmbiosTable table = SmbiosTable()
                                .add(system)
                                .add(notebook)
                                .add(m2)
                                .add(unnamed1)
                                .add(unnamed2)
                                .add(usbC)
                                .add(headphones)
                                .add(endOfTable());
  machine.writeSmbios(entryPoint2(2, 6,
                                  static_cast<unsigned>(table.bytes().size()),
                                  table.count()),
                      table.bytes());

  machine.pciFunction("0000:00:17.0", 0x010601, 0x8086, 0xa353, 0x1025, 0x1297);
  machine.blockDevice("0000:00:17.0", "sda", "ata2/host1/target1:0:0/1:0:0:0");
  machine.pciFunction("0000:02:00.0", 0x028000, 0x8086, 0x2723, 0x8086, 0x0084);
  machine.netInterface("0000:02:00.0", "wlp2s0",
                       {false, false, "a4:c3:f0:12:34:56", 0, ""});
  machine.pciFunction("0000:03:00.0", 0x020000, 0x10ec, 0x8168, 0x1025, 0x1297);
  machine.netInterface("0000:03:00.0", "enp3s0",
                       {true, false, "98:28:a6:00:11:22", 0, ""});
  machine.virtualNetInterface("lo");
  machine.writePciIds(RecordedPciIds);
}

inline void recordVirtualMachine(RecordedMachine &machine) {
  machine.pciFunction("0000:00:00.0", 0x060000, 0x8086, 0x0d57, 0x0000, 0x0000);
  machine.pciFunction("0000:00:01.0", 0xffff00, 0x1af4, 0x1045, 0x1af4, 0x1045);
  machine.pciFunction("0000:00:02.0", 0x018000, 0x1af4, 0x1042, 0x1af4, 0x1042);
  machine.bindDriver("0000:00:02.0", "virtio-pci");
  machine.blockDevice("0000:00:02.0", "vda", "virtio1");
  machine.pciFunction("0000:00:03.0", 0x020000, 0x1af4, 0x1041, 0x1af4, 0x1041);
  machine.bindDriver("0000:00:03.0", "virtio-pci");
  machine.netInterface("0000:00:03.0", "eth0",
                       {true, true, "02:fc:00:00:00:01", 0, "virtio2"});
  machine.virtualNetInterface("lo");
  machine.virtualNetInterface("ifb0",
                              {false, false, "de:ad:be:ef:00:01", 1, ""});
  for (const char *name : {"loop0", "loop1", "zram0"})
    machine.virtualBlockDevice(name);
  machine.makeDirectory("/sys/bus/pci/slots");
  machine.writePciIds(RecordedPciIds);
}

} // namespace hxlive

#endif // HX_TESTS_LIVE_RECORDEDMACHINES_H
