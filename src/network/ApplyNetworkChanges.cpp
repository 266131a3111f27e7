#include "network/ApplyNetworkChanges.h"

#include <syslog.h>

#include <algorithm>

#include "host/HostTools.h"
#include "host/ManagementNetworkWrites.h"
#include "host/ManagementSwitch.h"
#include "network/NetworkChanges.h"
#include "network/SearchSuffixes.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

using HostMgr::Network::IpConfig;

constexpr char kAgentRefresh[] = "internalsvc/refresh";

bool Contains(const std::vector<std::string>& names, const std::string& name) {
  return std::find(names.begin(), names.end(), name) != names.end();
}

void LogFailure(const char* words, const NetworkWrite& write) {
  Log(LOG_ERR, "%s%s", words, write.error.c_str());
}

}  // namespace

ApplyNetworkChanges::ApplyNetworkChanges(const ManagementSettings& entry,
                                         const ManagementSettings& pending, ShowError showIpv6Error)
    : entry_(entry), pending_(pending), showIpv6Error_(std::move(showIpv6Error)) {
}

void ApplyNetworkChanges::Run() {
  if (!pending_.distributedSwitch) {
    Adapters();
    Vlan();
  }
  target_ = pending_.ip;
  Ipv4();
  Ipv6();
  HandOver();
  RenewLease();
  Ipv4Gateway();
  Ipv6Gateway();
  RestartAfterVlan();
  Dns();
  Suffixes();
  RunOskCommand(kAgentRefresh);
}

void ApplyNetworkChanges::Adapters() {
  const std::vector<std::string>& pending = pending_.adapters;
  std::string names;
  for (const std::string& name : pending) {
    names += " " + name;
  }
  Log(LOG_INFO, "Setting adapters to%s", names.c_str());
  std::vector<std::string> current;
  if (!GetMgmtUplinks(pending_.nic, current)) {
    return;
  }
  for (const std::string& uplink : current) {
    if (!Contains(pending, uplink)) {
      RemoveMgmtUplink(pending_.nic, uplink);
    }
  }
  for (const std::string& adapter : pending) {
    if (!Contains(current, adapter)) {
      AddMgmtUplink(pending_.nic, adapter);
    }
  }
  if (!pending.empty()) {
    SetMgmtUplinkOrder(pending_.nic, pending);
  }
  if (!pending.empty() && (current.empty() || current.front() != pending.front())) {
    if (NetworkWrite write = TakeMacFromPnic(pending_.nic, pending.front()); !write) {
      LogFailure("Setting mac address of hynic failed: ", write);
    }
  }
}

void ApplyNetworkChanges::Vlan() {
  std::uint16_t current = 0;
  if (GetMgmtVlanId(pending_.nic, current) && current != pending_.vlanId) {
    vlanChanged_ = SetMgmtVlanId(pending_.nic, pending_.vlanId);
  }
}

void ApplyNetworkChanges::Ipv4() {
  const char* nic = pending_.nic.c_str();
  if (NetworkWrite read = ReadNicIpConfig(pending_.nic, current_); read) {
    haveCurrent_ = true;
  } else {
    LogFailure("Setting ip configuration failed: ", read);
  }
  if (target_.GetDhcp()) {
    if (!haveCurrent_ || !current_.GetDhcp()) {
      Log(LOG_INFO, "Switching to DHCP on %s", nic);
      ipv4Switched_ = true;
    }
  } else if (target_.GetIpv4UseNone()) {
    if (!haveCurrent_ || !current_.GetIpv4UseNone()) {
      Log(LOG_INFO, "Setting ipv4 configuration to none on %s", nic);
      ipv4Switched_ = true;
    }
  } else if (!haveCurrent_ || !current_.IsIpv4Static() ||
             current_.GetIpv4Address() != target_.GetIpv4Address() ||
             current_.GetIpv4Netmask() != target_.GetIpv4Netmask()) {
    Log(LOG_INFO, "Setting ipv4 configuration to %s %s on %s",
        target_.GetIpv4Address().GetStringAddress().c_str(),
        target_.GetIpv4Netmask().GetStringAddress().c_str(), nic);
    ipv4Switched_ = !haveCurrent_ || !current_.IsIpv4Static();
  }
}

void ApplyNetworkChanges::Ipv6() {
  if (pending_.ipv6Enabled != entry_.ipv6Enabled) {
    if (NetworkWrite write = WriteKernelIpv6Enabled(pending_.ipv6Enabled); write) {
      ipv6FlagWritten_ = true;
    } else {
      LogFailure("Setting ipv6 configuration failed: ", write);
      if (showIpv6Error_) {
        showIpv6Error_("Setting ipv6 configuration failed: " + write.error);
      }
    }
  }
  if (pending_.ipv6Enabled) {
    Log(LOG_INFO, "Setting ipv6 configuration");
    target_.SetIpv6Enabled(true);
  }
}

void ApplyNetworkChanges::HandOver() {
  target_.SetDnsFromDhcp(target_.GetDnsFromDhcp() &&
                         DnsFromDhcpAllowed(target_, pending_.ipv6Enabled));
  if (haveCurrent_ && target_ == current_) {
    return;
  }
  if (NetworkWrite write = WriteNicIpConfig(pending_.nic, target_); !write) {
    LogFailure("Setting ip/ipv6 configuration failed: ", write);
  }
}

void ApplyNetworkChanges::RenewLease() {
  if (!target_.GetDhcp()) {
    return;
  }
  bool bound = false;
  NetworkWrite write = IsNicLeaseBound(pending_.nic, bound);
  if (write && bound) {
    Log(LOG_INFO, "Renew DHCP lease on %s", pending_.nic.c_str());
    write = RenewNicLease(pending_.nic);
  }
  if (!write) {
    LogFailure("Renew DHCP lease failed: ", write);
  }
}

void ApplyNetworkChanges::Ipv4Gateway() {
  if (target_.GetDhcp()) {
    return;
  }
  HostMgr::Network::Ipv4Address current;
  NetworkWrite write = ReadIpv4DefaultGateway(current);
  const HostMgr::Network::Ipv4Address& gateway = target_.GetIpv4Gateway();
  if (write && (current != gateway || ipv4Switched_)) {
    Log(LOG_INFO, "Setting default gateway to %s", gateway.GetStringAddress().c_str());
    write = WriteIpv4DefaultGateway(gateway);
  }
  if (!write) {
    LogFailure("Setting default gateway failed: ", write);
  }
}

void ApplyNetworkChanges::Ipv6Gateway() {
  const HostMgr::Network::Ipv6Address& gateway = pending_.ip.GetIpv6Gateway();
  if (!pending_.ipv6Enabled || gateway == entry_.ip.GetIpv6Gateway()) {
    return;
  }
  Log(LOG_INFO, "Setting default ipv6 gateway to %s", gateway.GetScopedStringAddress().c_str());
  if (NetworkWrite write = WriteIpv6DefaultGateway(gateway); !write) {
    LogFailure("Setting default ipv6 gateway failed: ", write);
  }
}

void ApplyNetworkChanges::RestartAfterVlan() {
  if (!vlanChanged_) {
    return;
  }
  Log(LOG_INFO, "Changed vlan, restarting management interface");
  if (NetworkWrite write = RestartNicInterface(pending_.nic); !write) {
    LogFailure("Restarting management interface failed: ", write);
  }
}

void ApplyNetworkChanges::Dns() {
  if (target_.GetDnsFromDhcp()) {
    return;
  }
  Log(LOG_INFO, "Setting hostname to %s", pending_.hostname.c_str());
  if (NetworkWrite write = WriteHostName(pending_.hostname); !write) {
    LogFailure("Setting DNS failed: ", write);
  }
  Log(LOG_INFO, "Setting nameservers to %s %s", pending_.primaryDns.c_str(),
      pending_.alternateDns.c_str());
  if (NetworkWrite write = ReplaceNameServers({pending_.primaryDns, pending_.alternateDns});
      !write) {
    LogFailure("Setting DNS failed: ", write);
  }
}

void ApplyNetworkChanges::Suffixes() {
  const std::vector<std::string> names = SplitSuffixes(pending_.suffixes);
  Log(LOG_INFO, "Setting suffixes to %s", JoinSuffixes(names).c_str());
  if (NetworkWrite write = ResetSearchDomains(names); !write) {
    LogFailure("Setting DNS failed: ", write);
  }
}

}  // namespace Tulk
