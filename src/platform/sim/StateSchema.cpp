#include "platform/sim/StateSchema.h"

#include <initializer_list>
#include <string>

#include "platform/api/IpAddress.h"
#include "platform/api/MacAddress.h"
#include "platform/sim/SimHost.h"

namespace Sim {
namespace {

using nlohmann::json;

enum class Type { kString, kInteger, kBoolean, kObject, kArray, kMac, kIpv4, kIpv6, kIp, kAny };

struct FieldRule {
  const char* key;
  Type type;
  bool required = false;
};

[[noreturn]] void Fail(const std::string& message) {
  throw StateError(message);
}

const char* Describe(Type type) {
  switch (type) {
    case Type::kString:
      return "a string";
    case Type::kInteger:
      return "an integer";
    case Type::kBoolean:
      return "a boolean";
    case Type::kObject:
      return "an object";
    case Type::kArray:
      return "an array";
    case Type::kMac:
      return "a MAC address text";
    case Type::kIpv4:
      return "an IPv4 address text";
    case Type::kIpv6:
      return "an IPv6 address text";
    case Type::kIp:
      return "an IP address text";
    case Type::kAny:
      break;
  }
  return "a value";
}

void Expect(const json& value, const std::string& path, Type type) {
  bool ok = true;
  switch (type) {
    case Type::kString:
      ok = value.is_string();
      break;
    case Type::kInteger:
      ok = value.is_number_integer();
      break;
    case Type::kBoolean:
      ok = value.is_boolean();
      break;
    case Type::kObject:
      ok = value.is_object();
      break;
    case Type::kArray:
      ok = value.is_array();
      break;
    case Type::kMac:
      ok = value.is_string() &&
           HostMgr::Network::MacAddress::IsValidAddress(value.get<std::string>());
      break;
    case Type::kIpv4:
      ok = value.is_string() &&
           HostMgr::Network::Ipv4Address::IsValidAddress(value.get<std::string>());
      break;
    case Type::kIpv6:
      ok = value.is_string() &&
           HostMgr::Network::Ipv6Address::IsValidAddress(value.get<std::string>());
      break;
    case Type::kIp:
      ok = value.is_string() &&
           HostMgr::Network::IpAddress::Parse(value.get<std::string>()) != nullptr;
      break;
    case Type::kAny:
      break;
  }
  if (!ok) {
    Fail(path + " must be " + Describe(type));
  }
}

std::string Join(const std::string& path, const char* key) {
  return path.empty() ? std::string(key) : path + "." + key;
}

// Checks the listed fields of `object`; returns false when `object` is
// absent (null pointer).
bool Fields(const json* object, const std::string& path, std::initializer_list<FieldRule> rules) {
  if (object == nullptr) {
    return false;
  }
  Expect(*object, path, Type::kObject);
  for (const FieldRule& rule : rules) {
    auto found = object->find(rule.key);
    if (found == object->end()) {
      if (rule.required) {
        Fail(Join(path, rule.key) + " is missing");
      }
      continue;
    }
    Expect(*found, Join(path, rule.key), rule.type);
  }
  return true;
}

const json* Member(const json* object, const char* key) {
  if (object == nullptr || !object->is_object()) {
    return nullptr;
  }
  auto found = object->find(key);
  return found == object->end() ? nullptr : &*found;
}

// Calls `each` for every element of the array `key` of `object`.
template <typename Each>
void Elements(const json* object, const std::string& path, const char* key, Type type, Each each) {
  const json* array = Member(object, key);
  if (array == nullptr) {
    return;
  }
  const std::string arrayPath = Join(path, key);
  Expect(*array, arrayPath, Type::kArray);
  for (std::size_t i = 0; i < array->size(); ++i) {
    const std::string itemPath = arrayPath + "[" + std::to_string(i) + "]";
    Expect((*array)[i], itemPath, type);
    each((*array)[i], itemPath);
  }
}

// Checks every value of the object `key` of `object` (a map by name).
template <typename Each>
void Values(const json* object, const std::string& path, const char* key, Type type, Each each) {
  const json* map = Member(object, key);
  if (map == nullptr) {
    return;
  }
  const std::string mapPath = Join(path, key);
  Expect(*map, mapPath, Type::kObject);
  for (const auto& [name, value] : map->items()) {
    const std::string itemPath = mapPath + "[\"" + name + "\"]";
    Expect(value, itemPath, type);
    each(value, itemPath);
  }
}

void Nothing(const json&, const std::string&) {
}

void CheckHardware(const json* hardware) {
  if (!Fields(hardware, "hardware",
              {{"vendor", Type::kString},
               {"product", Type::kString},
               {"serialNumber", Type::kString},
               {"serviceTag", Type::kString},
               {"assetTag", Type::kString},
               {"bios", Type::kObject},
               {"firmware", Type::kObject},
               {"cpu", Type::kObject},
               {"memory", Type::kObject}})) {
    return;
  }
  Fields(Member(hardware, "bios"), "hardware.bios",
         {{"vendor", Type::kString},
          {"version", Type::kString},
          {"majorRelease", Type::kInteger},
          {"minorRelease", Type::kInteger},
          {"releaseDate", Type::kString}});
  Fields(Member(hardware, "firmware"), "hardware.firmware",
         {{"bmc", Type::kString}, {"cpld", Type::kString}, {"plsa", Type::kString}});
  Fields(Member(hardware, "cpu"), "hardware.cpu",
         {{"packages", Type::kInteger},
          {"cores", Type::kInteger},
          {"threads", Type::kInteger},
          {"model", Type::kString}});
  Fields(Member(hardware, "memory"), "hardware.memory",
         {{"totalPages", Type::kInteger}, {"pageSize", Type::kInteger}});
}

void CheckIpv6(const json* ipv6, const std::string& path) {
  if (!Fields(ipv6, path,
              {{"enabled", Type::kBoolean},
               {"dhcpv6", Type::kBoolean},
               {"routerAdvertisement", Type::kBoolean},
               {"gateway", Type::kIpv6},
               {"networks", Type::kArray}})) {
    return;
  }
  Elements(ipv6, path, "networks", Type::kObject, [](const json& network, const std::string& at) {
    Fields(&network, at,
           {{"address", Type::kIpv6, true},
            {"prefix", Type::kInteger, true},
            {"type", Type::kInteger},
            {"scope", Type::kInteger}});
  });
}

void CheckKernelNic(const json& nic, const std::string& path) {
  Fields(&nic, path,
         {{"name", Type::kString, true},
          {"mac", Type::kMac},
          {"enabled", Type::kBoolean},
          {"ipv4", Type::kObject},
          {"dhcpLease", Type::kAny},
          {"ipv6", Type::kObject},
          {"dnsFromDhcp", Type::kBoolean},
          {"connection", Type::kAny},
          {"restarts", Type::kInteger}});
  if (const json* connection = Member(&nic, "connection"); connection && !connection->is_null()) {
    Fields(connection, path + ".connection",
           {{"type", Type::kString, true},
            {"switch", Type::kString},
            {"portGroup", Type::kString},
            {"portId", Type::kString},
            {"name", Type::kString}});
    const std::string type = (*connection)["type"].get<std::string>();
    if (type != "portgroup" && type != "dvsPort" && type != "opaqueNetwork") {
      Fail(path + ".connection.type must be \"portgroup\", \"dvsPort\" or \"opaqueNetwork\"");
    }
  }
  if (Fields(Member(&nic, "ipv4"), path + ".ipv4",
             {{"mode", Type::kString},
              {"address", Type::kIpv4},
              {"netmask", Type::kIpv4},
              {"gateway", Type::kIpv4}})) {
    if (const json* mode = Member(Member(&nic, "ipv4"), "mode")) {
      const std::string text = mode->get<std::string>();
      if (text != "static" && text != "dhcp" && text != "none") {
        Fail(path + ".ipv4.mode must be \"static\", \"dhcp\" or \"none\"");
      }
    }
  }
  if (const json* lease = Member(&nic, "dhcpLease"); lease && !lease->is_null()) {
    Fields(lease, path + ".dhcpLease",
           {{"address", Type::kIpv4},
            {"netmask", Type::kIpv4},
            {"gateway", Type::kIpv4},
            {"bound", Type::kBoolean},
            {"renewals", Type::kInteger}});
  }
  CheckIpv6(Member(&nic, "ipv6"), path + ".ipv6");
}

void CheckTeaming(const json* teaming, const std::string& path) {
  if (Fields(teaming, path, {{"uplinkOrder", Type::kArray}, {"maxActive", Type::kInteger}})) {
    Elements(teaming, path, "uplinkOrder", Type::kString, Nothing);
  }
}

void CheckNetwork(const json* network) {
  const std::string at = "network";
  if (!Fields(network, at,
              {{"ipv6Enabled", Type::kBoolean},
               {"ipv6EnabledNextBoot", Type::kBoolean},
               {"managementInterface", Type::kString},
               {"netDumper", Type::kObject},
               {"pnics", Type::kArray},
               {"switches", Type::kArray},
               {"portGroups", Type::kArray},
               {"hykernelNics", Type::kArray},
               {"dns", Type::kObject},
               {"routing", Type::kObject},
               {"reachable", Type::kArray},
               {"dhcpOffer", Type::kObject},
               {"dnsRecords", Type::kObject},
               {"resolverDelayMs", Type::kInteger}})) {
    return;
  }
  Fields(Member(network, "dhcpOffer"), at + ".dhcpOffer",
         {{"address", Type::kIpv4, true},
          {"netmask", Type::kIpv4},
          {"gateway", Type::kIpv4},
          {"nameServers", Type::kArray}});
  Fields(Member(network, "netDumper"), at + ".netDumper", {{"enabled", Type::kBoolean}});
  Elements(network, at, "pnics", Type::kObject, [](const json& pnic, const std::string& path) {
    Fields(&pnic, path,
           {{"name", Type::kString, true},
            {"mac", Type::kMac},
            {"linkUp", Type::kBoolean},
            {"speedMbps", Type::kInteger},
            {"driver", Type::kString},
            {"pci", Type::kObject}});
    Fields(Member(&pnic, "pci"), path + ".pci",
           {{"address", Type::kString},
            {"vendorName", Type::kString},
            {"deviceName", Type::kString},
            {"description", Type::kString}});
  });
  Elements(network, at, "switches", Type::kObject,
           [](const json& vswitch, const std::string& path) {
             Fields(&vswitch, path,
                    {{"name", Type::kString, true},
                     {"type", Type::kString},
                     {"numPorts", Type::kInteger},
                     {"configuredPorts", Type::kInteger},
                     {"mtu", Type::kInteger},
                     {"uplinks", Type::kArray},
                     {"teaming", Type::kObject},
                     {"portGroups", Type::kArray},
                     {"thirdParty", Type::kBoolean},
                     {"ports", Type::kArray}});
             if (const json* type = Member(&vswitch, "type")) {
               if (*type != "standard" && *type != "distributed") {
                 Fail(path + ".type must be \"standard\" or \"distributed\"");
               }
             }
             Elements(&vswitch, path, "uplinks", Type::kString, Nothing);
             Elements(&vswitch, path, "portGroups", Type::kString, Nothing);
             Elements(&vswitch, path, "ports", Type::kObject,
                      [](const json& port, const std::string& portPath) {
                        Fields(&port, portPath,
                               {{"id", Type::kString, true},
                                {"vlanId", Type::kInteger},
                                {"uplinks", Type::kArray},
                                {"blocked", Type::kBoolean},
                                {"hostLocal", Type::kBoolean}});
                        Elements(&port, portPath, "uplinks", Type::kString, Nothing);
                      });
             CheckTeaming(Member(&vswitch, "teaming"), path + ".teaming");
           });
  Elements(network, at, "portGroups", Type::kObject,
           [](const json& group, const std::string& path) {
             Fields(&group, path,
                    {{"name", Type::kString, true},
                     {"switch", Type::kString, true},
                     {"vlanId", Type::kInteger},
                     {"vmClients", Type::kInteger},
                     {"teaming", Type::kObject}});
             CheckTeaming(Member(&group, "teaming"), path + ".teaming");
           });
  Elements(network, at, "hykernelNics", Type::kObject, CheckKernelNic);
  const json* dns = Member(network, "dns");
  if (Fields(dns, at + ".dns",
             {{"hostname", Type::kString},
              {"domain", Type::kString},
              {"nameServers", Type::kArray},
              {"dhcpNameServers", Type::kArray},
              {"searchDomains", Type::kArray},
              {"saves", Type::kInteger}})) {
    Elements(dns, at + ".dns", "nameServers", Type::kIp, Nothing);
    Elements(dns, at + ".dns", "dhcpNameServers", Type::kIp, Nothing);
    Elements(dns, at + ".dns", "searchDomains", Type::kString, Nothing);
  }
  Fields(Member(network, "routing"), at + ".routing",
         {{"ipv4Gateway", Type::kIpv4}, {"ipv6Gateway", Type::kIpv6}});
  Elements(network, at, "reachable", Type::kString, Nothing);
  Values(network, at, "dnsRecords", Type::kArray,
         [](const json& addresses, const std::string& path) {
           for (std::size_t i = 0; i < addresses.size(); ++i) {
             Expect(addresses[i], path + "[" + std::to_string(i) + "]", Type::kIp);
           }
         });
}

void CheckSystem(const json* system) {
  if (!Fields(system, "system",
              {{"keyboardLayout", Type::kString},
               {"keyboardLayouts", Type::kArray},
               {"welcomeMessage", Type::kString},
               {"alerts", Type::kArray},
               {"bootOption", Type::kInteger},
               {"firewall", Type::kObject}})) {
    return;
  }
  Elements(system, "system", "keyboardLayouts", Type::kString, Nothing);
  Elements(system, "system", "alerts", Type::kString, Nothing);
  Values(system, "system", "firewall", Type::kObject,
         [](const json& ruleset, const std::string& path) {
           Fields(&ruleset, path,
                  {{"enabled", Type::kBoolean}, {"managedWithService", Type::kBoolean}});
         });
}

void CheckRest(const json& state) {
  Fields(Member(&state, "product"), "product",
         {{"name", Type::kString},
          {"version", Type::kString},
          {"build", Type::kString},
          {"kernelRelease", Type::kString},
          {"compilationOption", Type::kString},
          {"uuid", Type::kString}});
  if (Fields(Member(&state, "storage"), "storage", {{"adapters", Type::kArray}})) {
    Elements(Member(&state, "storage"), "storage", "adapters", Type::kObject,
             [](const json& adapter, const std::string& path) {
               Fields(&adapter, path,
                      {{"name", Type::kString, true},
                       {"driver", Type::kString},
                       {"version", Type::kString},
                       {"description", Type::kString}});
             });
  }
  Elements(&state, "", "vms", Type::kObject, [](const json& vm, const std::string& path) {
    Fields(&vm, path,
           {{"name", Type::kString, true},
            {"state", Type::kString},
            {"autostart", Type::kBoolean},
            {"lastPowerOff", Type::kString}});
  });
  Values(&state, "", "services", Type::kObject, [](const json& service, const std::string& path) {
    Fields(&service, path,
           {{"running", Type::kBoolean},
            {"enabled", Type::kBoolean},
            {"installed", Type::kBoolean},
            {"restarts", Type::kInteger}});
  });
  Values(&state, "", "packages", Type::kObject, [](const json& package, const std::string& path) {
    Fields(&package, path, {{"version", Type::kString, true}});
    for (const auto& [key, value] : package.items()) {
      Expect(value, path + "." + key, Type::kString);
    }
  });
  Fields(Member(&state, "lockdown"), "lockdown",
         {{"enabled", Type::kBoolean}, {"possible", Type::kBoolean}});
  const json* users = Member(&state, "users");
  if (Fields(users, "users",
             {{"accounts", Type::kArray},
              {"configStoreSaves", Type::kInteger},
              {"lastConfigStoreSave", Type::kString}})) {
    Elements(
        users, "users", "accounts", Type::kObject,
        [](const json& account, const std::string& path) {
          Fields(
              &account, path,
              {{"name", Type::kString, true}, {"uid", Type::kInteger}, {"oskCmd", Type::kBoolean}});
        });
  }
  Elements(&state, "", "smartCards", Type::kObject, [](const json& card, const std::string& path) {
    Fields(&card, path, {{"userId", Type::kString, true}, {"valid", Type::kBoolean}});
  });
  if (const json* power = Member(&state, "power")) {
    Expect(*power, "power", Type::kString);
  }
  Values(&state, "", "advancedOptions", Type::kInteger, Nothing);
  Values(&state, "", "commands", Type::kObject, [](const json& command, const std::string& path) {
    Fields(&command, path,
           {{"exitCode", Type::kInteger},
            {"stdout", Type::kString},
            {"stderr", Type::kString},
            {"delayMs", Type::kInteger}});
  });
  Values(&state, "", "faults", Type::kString, Nothing);
}

}  // namespace

void ValidateState(const json& state) {
  if (!state.is_object()) {
    throw StateError("the document must be a JSON object");
  }
  CheckHardware(Member(&state, "hardware"));
  CheckNetwork(Member(&state, "network"));
  CheckSystem(Member(&state, "system"));
  CheckRest(state);
}

}  // namespace Sim
