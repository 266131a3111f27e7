#pragma once
/// Writes the management network's pending settings to the host, in one
/// fixed sequence. Every step catches its own failure, logs it in the
/// step's words and goes on; a step that succeeded is never undone.
///
/// Steps (log lines at informational level unless marked error):
/// 1. Adapters, unless on a distributed switch: "Setting adapters to" and
///    " <name>" per pending adapter; the switch's uplinks that are no
///    longer pending are removed, then the pending ones that are not yet
///    uplinks are added (host/ManagementSwitch.h, which logs its own
///    failures), and the uplink order follows the pending order. When the
///    first pending adapter is not the first current uplink, the NIC takes
///    its MAC address; error "Setting mac address of hynic failed: %s".
/// 2. VLAN, unless on a distributed switch: when the switch's id differs
///    from the pending one it is set, and the VLAN counts as changed.
/// 3. IPv4, against the NIC's configuration as it is now: "Switching to
///    DHCP on %s" when the NIC is not yet on DHCP; "Setting ipv4
///    configuration to none on %s" when its IPv4 is not yet off; "Setting
///    ipv4 configuration to %s %s on %s" (address, netmask, interface) when
///    it is not static yet or address or netmask differ. An unchanged
///    static address and netmask are neither logged nor written. Reading
///    the NIC's configuration fails with error "Setting ip configuration
///    failed: %s".
/// 4. IPv6: the kernel's flag is written when it differs from the value
///    read on entry; its failure is error "Setting ipv6 configuration
///    failed: %s" and the message dialog (the only one of the sequence).
///    While IPv6 is to be on: "Setting ipv6 configuration", and the
///    configuration carries IPv6 on with the pending DHCPv6 and
///    router-advertisement flags and static addresses.
/// 5. DNS from DHCP is kept only when the IP configuration is automatic
///    (IPv4 DHCP, or DHCPv6 with IPv6 on), otherwise cleared; the
///    configuration is then handed to the NIC unless it equals the NIC's
///    own. Error "Setting ip/ipv6 configuration failed: %s".
/// 6. On DHCP with a bound lease: "Renew DHCP lease on %s" and the renewal;
///    error "Renew DHCP lease failed: %s".
/// 7. Not on DHCP: when the pending IPv4 gateway differs from the kernel's
///    default gateway, or IPv4 was just switched to another mode: "Setting
///    default gateway to %s" and it is set; error "Setting default gateway
///    failed: %s".
/// 8. IPv6 on and its gateway changed since entry: "Setting default ipv6
///    gateway to %s" and it is set; error "Setting default ipv6 gateway
///    failed: %s".
/// 9. VLAN changed: "Changed vlan, restarting management interface" and
///    the interface restart; error "Restarting management interface failed:
///    %s".
/// 10. DNS not from DHCP: "Setting hostname to %s"; a name with "." is set
///    as a qualified name, another as the bare host name.
/// 11. DNS not from DHCP: "Setting nameservers to %s %s" (primary, second;
///    empty text for a missing one); the user name servers are removed,
///    then the primary and the second are added, each only when present
///    and not all-zero.
/// 12. Always: "Setting suffixes to %s" (the names joined with ", "); the
///    search list is reset to the host's domain, each name is added, and
///    the DNS configuration is saved. Steps 10 to 12 fail with error
///    "Setting DNS failed: %s".
/// 13. Always: the management agent refreshes its view of the host
///    ("osk-cmd ... internalsvc/refresh", logged by the runner). The
///    restart the IPv6 flag needs is not asked here: RestartRequired()
///    tells the window, which asks last (NetworkWindow.h).
///
/// Decisions of this implementation:
/// - Written on every apply even when unchanged: the step 1 line (its
///   removals and additions act on differences only), "Setting ipv6
///   configuration" while IPv6 is on, and step 12 (reset, additions,
///   save). Steps 10 and 11 are written on every apply while DNS does not
///   come from DHCP; while it does, the host takes name and servers from
///   DHCP and both steps are skipped, leaving the configured servers for a
///   later return to manual settings.
/// - The kernel's IPv6 flag is written only when the operator changed it,
///   so that a change still waiting for the next boot is not undone by a
///   later apply of other settings.
/// - The IPv6 gateway counts as changed when the pending gateway (with its
///   zone) differs from the one read on entry.
/// - Steps 3 and 4 build one configuration that step 5 hands to the NIC in
///   a single write; so an IPv4 or IPv6 change that the NIC refuses is
///   reported by step 5 ("Setting ip/ipv6 configuration failed").
/// - Like DHCP and static, the "none" line is written only when the NIC's
///   IPv4 is not already off.
/// - The failure lines of steps 6 and 9 ("Renew DHCP lease failed: %s",
///   "Restarting management interface failed: %s") and the uplink order
///   of step 1 are this sequence's own additions.

#include <functional>
#include <string>

#include "host/ManagementSettings.h"

namespace Tulk {

class ApplyNetworkChanges {
 public:
  /// Shows the IPv6 step's failure to the operator ("Enable Management
  /// Network: Error" with `message`).
  using ShowError = std::function<void(const std::string& message)>;

  /// The sequence for `pending` against the settings read on `entry`.
  ApplyNetworkChanges(const ManagementSettings& entry, const ManagementSettings& pending,
                      ShowError showIpv6Error);

  /// Steps 1 to 13.
  void Run();

  /// After Run(): the kernel's IPv6 flag was changed, and the host must
  /// restart before the change takes effect (false when writing the flag
  /// failed: a restart would change nothing).
  bool RestartRequired() const { return ipv6FlagWritten_; }

 private:
  void Adapters();
  void Vlan();
  void Ipv4();
  void Ipv6();
  void HandOver();
  void RenewLease();
  void Ipv4Gateway();
  void Ipv6Gateway();
  void RestartAfterVlan();
  void Dns();
  void Suffixes();

  const ManagementSettings& entry_;
  const ManagementSettings& pending_;
  ShowError showIpv6Error_;
  /// The configuration steps 3 to 5 build and hand to the NIC.
  HostMgr::Network::IpConfig target_;
  /// The NIC's configuration before the apply (when it could be read).
  HostMgr::Network::IpConfig current_;
  bool haveCurrent_ = false;
  bool ipv4Switched_ = false;
  bool vlanChanged_ = false;
  bool ipv6FlagWritten_ = false;
};

}  // namespace Tulk
