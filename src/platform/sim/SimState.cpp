#include "platform/sim/SimState.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <cstdio>
#include <ctime>

#include "platform/api/HostMgrException.h"
#include "platform/api/IpAddress.h"
#include "platform/sim/SimHost.h"

namespace Sim {
namespace {

using HostMgr::Network::IpConfig;
using HostMgr::Network::Ipv4Address;
using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;

const json& Empty(json::value_t type) {
  static const json object = json::object();
  static const json array = json::array();
  return type == json::value_t::array ? array : object;
}

template <typename Json>
Json& RequireNamed(Json& state, const char* list, std::string_view name, const char* what) {
  auto network = state.find("network");
  if (network != state.end()) {
    auto items = network->find(list);
    if (items != network->end()) {
      for (auto& item : *items) {
        if (item.value("name", "") == name) {
          return item;
        }
      }
    }
  }
  Fail(std::string(what) + " " + std::string(name) + " not found");
}

Ipv4Address Ipv4At(const json& object, const char* key) {
  auto found = object.find(key);
  return found == object.end() ? Ipv4Address() : Ipv4Address(found->get<std::string>());
}

}  // namespace

const json& Query(std::string_view operation) {
  const json& state = SimHost::Instance().State();
  SimHost::CheckFault(state, operation);
  return state;
}

void Change(std::string_view operation, const std::function<void(json&)>& change) {
  SimHost& host = SimHost::Instance();
  host.CheckFault(operation);
  host.Modify(change);
}

void Fail(const std::string& message) {
  throw HostMgr::Lib::HostMgrException(message);
}

const json& ObjectAt(const json& object, const char* key) {
  auto found = object.find(key);
  return found != object.end() && found->is_object() ? *found : Empty(json::value_t::object);
}

const json& ArrayAt(const json& object, const char* key) {
  auto found = object.find(key);
  return found != object.end() && found->is_array() ? *found : Empty(json::value_t::array);
}

std::string StringAt(const json& object, const char* key, const std::string& fallback) {
  auto found = object.find(key);
  return found != object.end() && found->is_string() ? found->get<std::string>() : fallback;
}

json& ObjectFor(json& object, const char* key) {
  json& value = object[key];
  if (!value.is_object()) {
    value = json::object();
  }
  return value;
}

json& ArrayFor(json& object, const char* key) {
  json& value = object[key];
  if (!value.is_array()) {
    value = json::array();
  }
  return value;
}

const json* FindByName(const json& array, std::string_view name) {
  for (const json& item : array) {
    if (item.value("name", "") == name) {
      return &item;
    }
  }
  return nullptr;
}

json* FindByName(json& array, std::string_view name) {
  for (json& item : array) {
    if (item.value("name", "") == name) {
      return &item;
    }
  }
  return nullptr;
}

const json& RequireKernelNic(const json& state, std::string_view name) {
  return RequireNamed(state, "hykernelNics", name, "Hykernel NIC");
}
json& RequireKernelNic(json& state, std::string_view name) {
  return RequireNamed(state, "hykernelNics", name, "Hykernel NIC");
}
const json& RequirePnic(const json& state, std::string_view name) {
  return RequireNamed(state, "pnics", name, "Physical NIC");
}
const json& RequireSwitch(const json& state, std::string_view name) {
  return RequireNamed(state, "switches", name, "Virtual switch");
}
json& RequireSwitch(json& state, std::string_view name) {
  return RequireNamed(state, "switches", name, "Virtual switch");
}
const json& RequirePortGroup(const json& state, std::string_view name) {
  return RequireNamed(state, "portGroups", name, "Portgroup");
}
json& RequirePortGroup(json& state, std::string_view name) {
  return RequireNamed(state, "portGroups", name, "Portgroup");
}

void RequireStack(const std::string& stack) {
  if (stack != "defaultTcpipStack") {
    Fail("Unknown TCP/IP stack " + stack);
  }
}

std::string SwitchOfUplink(const json& state, std::string_view pnic) {
  for (const json& vswitch : ArrayAt(ObjectAt(state, "network"), "switches")) {
    for (const json& uplink : ArrayAt(vswitch, "uplinks")) {
      if (uplink.get<std::string>() == pnic) {
        return vswitch.value("name", "");
      }
    }
  }
  return "";
}

bool SameIpAddress(const std::string& a, const std::string& b) {
  const std::string x = a.substr(0, a.find('%'));
  const std::string y = b.substr(0, b.find('%'));
  auto first = HostMgr::Network::IpAddress::Parse(x);
  auto second = HostMgr::Network::IpAddress::Parse(y);
  return first != nullptr && second != nullptr ? *first == *second : x == y;
}

bool IsReachable(const json& state, const std::string& address) {
  for (const json& known : ArrayAt(ObjectAt(state, "network"), "reachable")) {
    if (known.is_string() && SameIpAddress(known.get<std::string>(), address)) {
      return true;
    }
  }
  return false;
}

const json* FindDvsPort(const json& vswitch, std::string_view id) {
  for (const json& port : ArrayAt(vswitch, "ports")) {
    if (StringAt(port, "id") == id) {
      return &port;
    }
  }
  return nullptr;
}

bool KernelNicCarriesTraffic(const json& state, std::string_view name) {
  const json& network = ObjectAt(state, "network");
  const json* nic = FindByName(ArrayAt(network, "hykernelNics"), name);
  if (nic == nullptr || !nic->value("enabled", true)) {
    return false;
  }
  const json& connection = ObjectAt(*nic, "connection");
  const std::string type = StringAt(connection, "type");
  if (type == "portgroup" || type == "opaqueNetwork") {
    return true;
  }
  if (type != "dvsPort") {
    return false;
  }
  const json* vswitch = FindByName(ArrayAt(network, "switches"), StringAt(connection, "switch"));
  const json* port =
      vswitch != nullptr ? FindDvsPort(*vswitch, StringAt(connection, "portId")) : nullptr;
  if (port == nullptr || port->value("blocked", false)) {
    return false;
  }
  for (const json& uplink : ArrayAt(*port, "uplinks")) {
    const std::string pnic = uplink.get<std::string>();
    const json* card = FindByName(ArrayAt(network, "pnics"), pnic);
    if (card != nullptr && card->value("linkUp", false) &&
        SwitchOfUplink(state, pnic) == StringAt(*vswitch, "name")) {
      return true;
    }
  }
  return false;
}

IpConfig ReadIpConfig(const json& nic) {
  IpConfig config;
  const json& ipv4 = ObjectAt(nic, "ipv4");
  const std::string mode = StringAt(ipv4, "mode", "static");
  config.SetIpv4Address(Ipv4At(ipv4, "address"));
  config.SetIpv4Netmask(Ipv4At(ipv4, "netmask"));
  config.SetIpv4Gateway(Ipv4At(ipv4, "gateway"));
  if (mode == "dhcp") {
    config.SetDhcp(true);
    const json& lease = ObjectAt(nic, "dhcpLease");
    const bool bound = lease.value("bound", false);
    config.SetIpv4Address(bound ? Ipv4At(lease, "address") : Ipv4Address());
    config.SetIpv4Netmask(bound ? Ipv4At(lease, "netmask") : Ipv4Address());
    config.SetIpv4Gateway(bound ? Ipv4At(lease, "gateway") : Ipv4Address());
  } else if (mode == "none") {
    config.SetIpv4UseNone(true);
  }
  const json& ipv6 = ObjectAt(nic, "ipv6");
  config.SetIpv6Enabled(ipv6.value("enabled", false));
  config.SetDhcpv6(ipv6.value("dhcpv6", false));
  config.SetRouterAdvertisement(ipv6.value("routerAdvertisement", false));
  for (const json& network : ArrayAt(ipv6, "networks")) {
    config.AddIpv6Network(Ipv6Network(Ipv6Address(network["address"].get<std::string>()),
                                      network["prefix"].get<int>(),
                                      network.value("type", Ipv6Network::kTypeStatic),
                                      network.value("scope", Ipv6Network::kScopeGlobal)));
  }
  if (auto gateway = ipv6.find("gateway"); gateway != ipv6.end()) {
    config.SetIpv6Gateway(Ipv6Address(gateway->get<std::string>()));
  }
  config.SetDnsFromDhcp(nic.value("dnsFromDhcp", false));
  return config;
}

void WriteIpConfig(json& nic, const IpConfig& config, const json& dhcpOffer) {
  if (config.IsIpv4Static()) {
    if (!config.GetIpv4Netmask().IsValidNetmask()) {
      Fail("Invalid netmask " + config.GetIpv4Netmask().GetStringAddress());
    }
    if (config.GetIpv4Address().IsZero()) {
      Fail("Invalid IPv4 address 0.0.0.0");
    }
  }
  json& ipv4 = ObjectFor(nic, "ipv4");
  const std::string oldMode = StringAt(ipv4, "mode", "static");
  const std::string mode = config.GetDhcp() ? "dhcp" : config.GetIpv4UseNone() ? "none" : "static";
  ipv4["mode"] = mode;
  if (mode == "static") {
    ipv4["address"] = config.GetIpv4Address().GetStringAddress();
    ipv4["netmask"] = config.GetIpv4Netmask().GetStringAddress();
    ipv4["gateway"] = config.GetIpv4Gateway().GetStringAddress();
  }
  if (mode == "dhcp" && oldMode != "dhcp") {
    // A new DHCP client is bound at once when the network has a DHCP
    // server (the state's "dhcpOffer"), and waits without a lease otherwise.
    if (dhcpOffer.is_object() && !dhcpOffer.empty()) {
      json lease = dhcpOffer;
      lease["bound"] = true;
      nic["dhcpLease"] = std::move(lease);
    } else {
      nic["dhcpLease"] = nullptr;
    }
  } else if (mode != "dhcp") {
    nic.erase("dhcpLease");
  }

  json& ipv6 = ObjectFor(nic, "ipv6");
  const bool dhcpv6 = config.GetDhcpv6();
  const bool autoconf = config.GetRouterAdvertisement();
  ipv6["enabled"] = config.GetIpv6Enabled();
  ipv6["dhcpv6"] = dhcpv6;
  ipv6["routerAdvertisement"] = autoconf;
  json networks = json::array();
  for (const json& network : ArrayAt(ipv6, "networks")) {
    const int type = network.value("type", Ipv6Network::kTypeStatic);
    if ((type == Ipv6Network::kTypeDhcp && !dhcpv6) ||
        (type == Ipv6Network::kTypeAutoconf && !autoconf) || type == Ipv6Network::kTypeStatic) {
      continue;
    }
    networks.push_back(network);
  }
  for (const Ipv6Network& network : config.GetIpv6Networks()) {
    if (network.GetAddressType() != Ipv6Network::kTypeStatic) {
      continue;
    }
    networks.push_back({{"address", network.GetStringAddress()},
                        {"prefix", network.GetPrefixLength()},
                        {"type", network.GetAddressType()},
                        {"scope", network.GetScope()}});
  }
  ipv6["networks"] = std::move(networks);
  if (config.GetIpv6Gateway().IsZero()) {
    ipv6.erase("gateway");
  } else {
    ipv6["gateway"] = config.GetIpv6Gateway().GetScopedStringAddress();
  }
  nic["dnsFromDhcp"] = config.GetDnsFromDhcp();
}

bool AppendRecord(const std::string& file, const json& record) {
  const std::string folder = RootPath("/var/log/tulk-sim");
  mkdir(RootPath("/var").c_str(), 0755);
  mkdir(RootPath("/var/log").c_str(), 0755);
  mkdir(folder.c_str(), 0755);
  const std::string path = folder + "/" + file;
  int fd = open(path.c_str(), O_WRONLY | O_CREAT | O_APPEND | O_CLOEXEC, 0644);
  if (fd < 0) {
    return false;
  }
  const std::string line = record.dump() + "\n";
  // One write with O_APPEND keeps concurrent writers' lines whole.
  const bool ok = write(fd, line.data(), line.size()) == static_cast<ssize_t>(line.size());
  close(fd);
  return ok;
}

std::string TimeStamp() {
  const auto now = std::chrono::system_clock::now();
  const std::time_t seconds = std::chrono::system_clock::to_time_t(now);
  const auto millis =
      std::chrono::duration_cast<std::chrono::milliseconds>(now.time_since_epoch()).count() % 1000;
  std::tm utc{};
  gmtime_r(&seconds, &utc);
  char text[96];
  std::snprintf(text, sizeof text, "%04d-%02d-%02dT%02d:%02d:%02d.%03dZ", utc.tm_year + 1900,
                utc.tm_mon + 1, utc.tm_mday, utc.tm_hour, utc.tm_min, utc.tm_sec,
                static_cast<int>(millis));
  return text;
}

}  // namespace Sim
