#pragma once
/// Helpers the simulated host-control classes share: operation entry
/// points with fault checks, and typed access to the state document.

#include <functional>
#include <nlohmann/json.hpp>
#include <string>
#include <string_view>

#include "platform/api/IpConfig.h"

namespace Sim {

using nlohmann::json;

/// Starts a query: throws the operation's fault if any, returns the state.
const json& Query(std::string_view operation);

/// Runs a change: throws the operation's fault if any, then applies
/// `change` as one locked read-modify-write of the state.
void Change(std::string_view operation, const std::function<void(json&)>& change);

/// Throws HostMgr::Lib::HostMgrException with `message`.
[[noreturn]] void Fail(const std::string& message);

/// `object[key]`, or an empty object/array/string when absent.
const json& ObjectAt(const json& object, const char* key);
const json& ArrayAt(const json& object, const char* key);
std::string StringAt(const json& object, const char* key, const std::string& fallback = "");
/// `object[key]`, created as an object or array when absent.
json& ObjectFor(json& object, const char* key);
json& ArrayFor(json& object, const char* key);

/// The element of `array` whose "name" is `name`, or null.
const json* FindByName(const json& array, std::string_view name);
json* FindByName(json& array, std::string_view name);

/// Sections of the network state; each throws "... not found" when the
/// named element does not exist.
const json& RequireKernelNic(const json& state, std::string_view name);
json& RequireKernelNic(json& state, std::string_view name);
const json& RequirePnic(const json& state, std::string_view name);
const json& RequireSwitch(const json& state, std::string_view name);
json& RequireSwitch(json& state, std::string_view name);
const json& RequirePortGroup(const json& state, std::string_view name);
json& RequirePortGroup(json& state, std::string_view name);
/// Throws "Unknown TCP/IP stack <name>" for any stack but the default.
void RequireStack(const std::string& stack);

/// The switch that uses `pnic` as an uplink; empty when none.
std::string SwitchOfUplink(const json& state, std::string_view pnic);

/// Whether two address texts name the same address, compared by value
/// with any "%zone" ignored ("fe80::01%hyk0" and "fe80::1" match); texts
/// that are not addresses compare as they are.
bool SameIpAddress(const std::string& a, const std::string& b);

/// Whether `address` is in the state's "network.reachable" list.
bool IsReachable(const json& state, const std::string& address);

/// The port `id` of the distributed switch `vswitch` (an element of
/// "network.switches"), or null.
const json* FindDvsPort(const json& vswitch, std::string_view id);

/// Whether traffic of kernel NIC `name` reaches the physical network: the
/// NIC exists and is in service, and it is attached to a portgroup, an
/// opaque network, or a distributed-switch port that is not blocked and
/// uses at least one of the switch's uplinks whose link is up.
bool KernelNicCarriesTraffic(const json& state, std::string_view name);

/// A kernel NIC's IP configuration as the API presents it.
HostMgr::Network::IpConfig ReadIpConfig(const json& nic);
/// Writes `config` into a kernel NIC's state (see HykNicImpl::SetIpConfig).
/// `dhcpOffer` is the network's DHCP offer (null when it has no server).
void WriteIpConfig(json& nic, const HostMgr::Network::IpConfig& config, const json& dhcpOffer);

/// Appends one JSON line to "<root>/var/log/tulk-sim/<file>", creating the
/// folder. Returns false when it cannot be written.
bool AppendRecord(const std::string& file, const json& record);
/// The current time as "2026-11-21T15:19:37.123Z".
std::string TimeStamp();

}  // namespace Sim
