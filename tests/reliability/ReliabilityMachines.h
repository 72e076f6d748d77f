// The machines the reliability tests put the providers under: a blade with a
// PCIe expansion unit on which every class of the registration has instances,
// and a second reading of the same blade after a card was swapped and a slot
// emptied, for tests that change the machine between or during requests.
// Both name the system the same, so that paths built from the system name do
// not change with the tree.
#pragma once

namespace tvr::reliability {

inline const char* const kBladeMachine = R"({
  "systemName": "blade-07.lab.example.com",
  "nodes": [
    { "type": "SystemNode", "name": "System", "status": 1,
      "properties": { "PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132" },
      "children": [
        { "type": "ChassisNode", "name": "Blade Chassis", "status": 1,
          "properties": { "PropChassisType": 17, "PropPackageType": 16, "PropManufacturer": "Northwind Systems",
                          "PropModel": "BX-920", "PropSerialNumber": "NW9200042", "PropPartNumber": "920-0042-01" },
          "children": [
            { "type": "SlotNode", "name": "Mezzanine Slot 1", "status": 1,
              "properties": { "PropSlotNumber": 1, "PropType": 73 } },
            { "type": "SlotNode", "name": "Mezzanine Slot 2", "status": 1,
              "properties": { "PropSlotNumber": 2, "PropType": 73 } },
            { "type": "ConnectorNode", "name": "Compute Module Midplane Connector", "status": 1 },
            { "type": "ConnectorNode", "name": "PME Front USB Port", "status": 1 },
            { "type": "NetworkCardNode", "name": "eth0", "status": 1, "description": "NW-X710 10GbE Mezzanine",
              "properties": { "PropAdapterSerial": "3c:fd:fe:a0:11:20", "PropAdapterStatus": 1 } },
            { "type": "NetworkCardNode", "name": "eth1", "status": 20, "description": "NW-X710 10GbE Mezzanine",
              "properties": { "PropAdapterSerial": "3c:fd:fe:a0:11:21", "PropAdapterStatus": 12 } },
            { "type": "StorageControllerNode", "name": "0000:00:1f.2", "status": 1,
              "description": "Chipset SATA controller in IDE mode",
              "properties": { "PropManufacturer": "Northwind Semiconductor", "PropModel": "C620 SATA",
                              "PropType": "IDE interface", "PropOtherIdentifyingInfo": "IDE mode",
                              "PropNumControlled": 2, "PropPortType": 36, "PropFormFactor": 0 } },
            { "type": "StorageControllerNode", "name": "0000:18:00.0", "status": 1,
              "description": "Northwind RAID 9440-8i SAS controller",
              "properties": { "PropManufacturer": "Northwind Storage", "PropModel": "RAID 9440-8i",
                              "PropType": "RAID bus controller", "PropNumControlled": 4, "PropPortType": 94 } }
          ] },
        { "type": "ChassisNode", "name": "PCIe Expansion Unit", "status": 1,
          "properties": { "PropChassisType": 18, "PropPackageType": 17, "PropModel": "PXU-4" },
          "children": [
            { "type": "SlotNode", "name": "PXU Slot 1", "status": 1,
              "properties": { "PropSlotNumber": 1, "PropType": 100 } },
            { "type": "SlotNode", "name": "PEN Slot 2", "status": 1,
              "properties": { "PropSlotNumber": 2, "PropType": 100 } },
            { "type": "ConnectorNode", "name": "PXU Uplink Connector", "status": 1 },
            { "type": "NetworkCardNode", "name": "eth2", "status": 1, "description": "NW-E810 25GbE in PXU Slot 1",
              "properties": { "PropAdapterSerial": "b4:96:91:7c:02:10", "PropAdapterStatus": 16 } }
          ] }
      ] }
  ]
})";

inline const char* const kBladeMachineAfterSwap = R"({
  "systemName": "blade-07.lab.example.com",
  "nodes": [
    { "type": "SystemNode", "name": "System", "status": 1,
      "properties": { "PropUUID": "4c4c4544-0042-3510-8051-b7c04f4e3132" },
      "children": [
        { "type": "ChassisNode", "name": "Blade Chassis", "status": 1,
          "properties": { "PropChassisType": 17, "PropPackageType": 16, "PropManufacturer": "Northwind Systems",
                          "PropModel": "BX-920", "PropSerialNumber": "NW9200042", "PropPartNumber": "920-0042-01" },
          "children": [
            { "type": "SlotNode", "name": "Mezzanine Slot 1", "status": 1,
              "properties": { "PropSlotNumber": 1, "PropType": 73 } },
            { "type": "ConnectorNode", "name": "Compute Module Midplane Connector", "status": 1 },
            { "type": "NetworkCardNode", "name": "eth0", "status": 1, "description": "NW-E830 100GbE Mezzanine",
              "properties": { "PropAdapterSerial": "6c:fe:54:00:aa:01", "PropAdapterStatus": 1 } },
            { "type": "StorageControllerNode", "name": "0000:18:00.0", "status": 1,
              "description": "Northwind RAID 9440-8i SAS controller",
              "properties": { "PropManufacturer": "Northwind Storage", "PropModel": "RAID 9440-8i",
                              "PropType": "RAID bus controller", "PropNumControlled": 3, "PropPortType": 94 } }
          ] },
        { "type": "ChassisNode", "name": "PCIe Expansion Unit", "status": 21,
          "properties": { "PropChassisType": 18, "PropPackageType": 17, "PropModel": "PXU-4" },
          "children": [
            { "type": "SlotNode", "name": "PXU Slot 1", "status": 1,
              "properties": { "PropSlotNumber": 1, "PropType": 100 } },
            { "type": "ConnectorNode", "name": "PXU Uplink Connector", "status": 1 }
          ] }
      ] }
  ]
})";

} // namespace tvr::reliability
