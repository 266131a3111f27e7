#include "platform/sim/DemoHost.h"

namespace Sim {

nlohmann::json DemoHostState() {
  return nlohmann::json::parse(R"json(
{
  "product": {
    "name": "Brimlo Tavi",
    "version": "8.1.0",
    "build": "24519031",
    "kernelRelease": "8.1.0",
    "compilationOption": "release",
    "uuid": "6a3f0c2e-41d7-4b8e-9c55-2f7e1d0b8a41"
  },
  "hardware": {
    "vendor": "Kestrel Computing",
    "product": "KX2200 Rack Server",
    "serialNumber": "KX22-7F3Q91-A",
    "serviceTag": "7F3Q91A",
    "assetTag": "IT-004217",
    "bios": {
      "vendor": "Kestrel Computing",
      "version": "2.14.1",
      "majorRelease": 2,
      "minorRelease": 14,
      "releaseDate": "09/30/2025"
    },
    "firmware": { "bmc": "5.10.50.00", "cpld": "1.0.9", "plsa": "3.2.0" },
    "cpu": {
      "packages": 2,
      "cores": 32,
      "threads": 64,
      "model": "Helix H6-4316 16-Core Processor   @ 2.30GHz"
    },
    "memory": { "totalPages": 16777216, "pageSize": 4096 }
  },
  "storage": {
    "adapters": [
      { "name": "hyhba0", "driver": "ksata", "version": "2.0.11-1",
        "description": "Kestrel Computing KS-600 SATA Controller" },
      { "name": "hyhba1", "driver": "kraid", "version": "7.719.02.00-1",
        "description": "Kestrel Computing KR-940 12Gb/s RAID Controller" }
    ]
  },
  "system": {
    "keyboardLayout": "US Default",
    "keyboardLayouts": [
      "Belgian", "Danish", "French", "German", "Italian", "Japanese", "Norwegian",
      "Spanish", "Swedish", "Swiss German", "United Kingdom", "US Default", "US Dvorak"
    ],
    "welcomeMessage": "",
    "alerts": [],
    "bootOption": 0,
    "firewall": {
      "sshServer": { "enabled": false, "managedWithService": true },
      "sshClient": { "enabled": false, "managedWithService": false },
      "webAccess": { "enabled": true, "managedWithService": false },
      "dhcpClient": { "enabled": true, "managedWithService": false },
      "dnsClient": { "enabled": true, "managedWithService": false }
    }
  },
  "network": {
    "ipv6Enabled": true,
    "managementInterface": "hyk0",
    "netDumper": { "enabled": true },
    "dhcpOffer": { "address": "10.20.30.141", "netmask": "255.255.255.0",
                   "gateway": "10.20.30.1" },
    "pnics": [
      { "name": "hynic0", "mac": "02:6b:4e:10:20:01", "linkUp": true, "speedMbps": 10000,
        "driver": "kxgbe",
        "pci": { "address": "0000:3b:00.0", "vendorName": "Kestrel Networks",
                 "deviceName": "KN-X540 10GbE SFP+ Adapter",
                 "description": "Kestrel Networks KN-X540 10GbE SFP+ Adapter" } },
      { "name": "hynic1", "mac": "02:6b:4e:10:20:02", "linkUp": true, "speedMbps": 10000,
        "driver": "kxgbe",
        "pci": { "address": "0000:3b:00.1", "vendorName": "Kestrel Networks",
                 "deviceName": "KN-X540 10GbE SFP+ Adapter",
                 "description": "Kestrel Networks KN-X540 10GbE SFP+ Adapter" } },
      { "name": "hynic2", "mac": "02:6b:4e:10:30:01", "linkUp": false, "speedMbps": 1000,
        "driver": "kgbe",
        "pci": { "address": "0000:18:00.0", "vendorName": "Kestrel Networks",
                 "deviceName": "KN-I350 Gigabit Network Connection",
                 "description": "Kestrel Networks KN-I350 Gigabit Network Connection" } },
      { "name": "hynic3", "mac": "02:6b:4e:10:30:02", "linkUp": false, "speedMbps": 1000,
        "driver": "kgbe",
        "pci": { "address": "0000:18:00.1", "vendorName": "Kestrel Networks",
                 "deviceName": "KN-I350 Gigabit Network Connection",
                 "description": "Kestrel Networks KN-I350 Gigabit Network Connection" } }
    ],
    "switches": [
      { "name": "vSwitch0", "type": "standard", "numPorts": 128, "configuredPorts": 128,
        "mtu": 1500, "uplinks": ["hynic0", "hynic1"],
        "teaming": { "uplinkOrder": ["hynic0", "hynic1"], "maxActive": 2 } },
      { "name": "vSwitch1", "type": "standard", "numPorts": 128, "configuredPorts": 128,
        "mtu": 1500, "uplinks": ["hynic2"],
        "teaming": { "uplinkOrder": ["hynic2"], "maxActive": 1 } }
    ],
    "portGroups": [
      { "name": "Management Network", "switch": "vSwitch0", "vlanId": 0 },
      { "name": "VM Network", "switch": "vSwitch1", "vlanId": 0, "vmClients": 1 }
    ],
    "hykernelNics": [
      { "name": "hyk0", "mac": "02:6b:4e:10:20:01", "enabled": true,
        "connection": { "type": "portgroup", "switch": "vSwitch0",
                        "portGroup": "Management Network" },
        "ipv4": { "mode": "static", "address": "10.20.30.41", "netmask": "255.255.255.0",
                  "gateway": "10.20.30.1" },
        "ipv6": {
          "enabled": true, "dhcpv6": false, "routerAdvertisement": true,
          "gateway": "fe80::1%hyk0",
          "networks": [
            { "address": "fe80::6b:4eff:fe10:2001", "prefix": 64, "type": 1, "scope": 1 },
            { "address": "2001:db8:20:30::41", "prefix": 64, "type": 0, "scope": 3 },
            { "address": "2001:db8:20:30:6b:4eff:fe10:2001", "prefix": 64, "type": 7,
              "scope": 3 }
          ]
        },
        "dnsFromDhcp": false }
    ],
    "dns": {
      "hostname": "tavi-01",
      "domain": "lab.example.net",
      "nameServers": ["10.20.30.2", "10.20.30.3"],
      "dhcpNameServers": ["10.20.30.2"],
      "searchDomains": ["lab.example.net", "example.net"]
    },
    "routing": { "ipv4Gateway": "10.20.30.1", "ipv6Gateway": "fe80::1%hyk0" },
    "reachable": ["10.20.30.1", "10.20.30.2", "10.20.30.3", "fe80::1"],
    "dnsRecords": {
      "tavi-01.lab.example.net": ["10.20.30.41", "2001:db8:20:30::41"],
      "helmsman.lab.example.net": ["10.20.30.5"],
      "gateway.lab.example.net": ["10.20.30.1"]
    }
  },
  "vms": [
    { "name": "build-agent-01", "state": "running", "autostart": true },
    { "name": "jump-host-02", "state": "poweredOff", "autostart": false }
  ],
  "services": {
    "TavShell": { "running": false, "enabled": false },
    "SSH": { "running": false, "enabled": false },
    "zyo-opsagent": { "installed": true, "running": true },
    "mgmtd": { "running": true },
    "hlma": { "running": true }
  },
  "packages": {
    "zyo-opsagent": {
      "version": "3.2.1-0.24519031",
      "vendor": "Brimlo",
      "summary": "Operations agent for the network overlay",
      "acceptanceLevel": "BrimloCertified",
      "installDate": "2026-03-14"
    }
  },
  "lockdown": { "enabled": false, "possible": true },
  "users": {
    "accounts": [
      { "name": "root", "uid": 0, "oskCmd": true },
      { "name": "operator", "uid": 1001, "oskCmd": false }
    ],
    "configStoreSaves": 0
  },
  "smartCards": [],
  "power": "on",
  "advancedOptions": {
    "/UserVars/TulkTimeOut": 600,
    "/UserVars/TaviShellTimeOut": 0,
    "/UserVars/TaviShellInteractiveTimeOut": 0
  },
  "commands": {},
  "faults": {}
}
)json");
}

nlohmann::json DistributedSwitchDemoHostState() {
  nlohmann::json state = DemoHostState();
  nlohmann::json& network = state["network"];
  network["switches"] = nlohmann::json::parse(R"json([
    { "name": "vSwitch1", "type": "standard", "numPorts": 128, "configuredPorts": 128,
      "mtu": 1500, "uplinks": ["hynic2"],
      "teaming": { "uplinkOrder": ["hynic2"], "maxActive": 1 } },
    { "name": "DSwitch-Lab", "type": "distributed", "numPorts": 512, "configuredPorts": 512,
      "mtu": 1500, "uplinks": ["hynic0", "hynic1", "hynic3"],
      "portGroups": ["DPG-Management", "DPG-Workloads"],
      "ports": [
        { "id": "12", "vlanId": 30, "uplinks": ["hynic3"], "blocked": false,
          "hostLocal": false },
        { "id": "13", "vlanId": 40, "uplinks": ["hynic0", "hynic1"], "blocked": false,
          "hostLocal": false }
      ] }
  ])json");
  network["portGroups"] = nlohmann::json::parse(R"json([
    { "name": "VM Network", "switch": "vSwitch1", "vlanId": 0, "vmClients": 1 }
  ])json");
  network["hykernelNics"][0]["connection"] = {
      {"type", "dvsPort"}, {"switch", "DSwitch-Lab"}, {"portId", "12"}};
  return state;
}

}  // namespace Sim
