#pragma once
/// "IPv6 Configuration": IPv6 on or off (a change needs a restart of the
/// host), automatic configuration by router advertisement or DHCPv6, or up
/// to three static addresses and a default gateway.
///
/// A form 70 x 20 with a header of 8 rows. Items, in order: the check box
/// "Disable IPv6 (restart required)"; the radio "Use dynamic IPv6 address
/// and network configuration"; the check box "Use DHCPv6" (indented); the
/// radio "Set static IPv6 address and network configuration"; three inputs
/// "Static address 1" to "3"; the input "Default gateway". Footer
/// "<Up/Down> Select  <Space> Mark Selected ... <Enter> OK  <Esc> Cancel".
///
/// The mode follows from the two flags: router advertisement (DHCPv6 off),
/// DHCPv6 (router advertisement off), static (both off). Space:
/// - on "Disable IPv6": flips the IPv6 flag;
/// - on the dynamic radio: router advertisement, or DHCPv6 when "Use
///   DHCPv6" is marked;
/// - on "Use DHCPv6": flips between the two dynamic kinds (from the static
///   mode it chooses DHCPv6);
/// - on the static radio: both flags off.
/// After every Space the marks are drawn from the flags, the two radios
/// and "Use DHCPv6" are enabled only while IPv6 is on, and the four inputs
/// only while IPv6 is on and the mode is static.
///
/// Enter: with IPv6 off or a dynamic mode the dialog is done at once.
/// Static: each non-empty address input must be "address/prefix" ("Invalid
/// IP address") and not link-local ("Invalid scope"), from the first down;
/// then the gateway, when not empty, an IPv6 address ("Invalid gateway
/// address"); the first failure puts the cursor in its input. All valid:
/// the static entries of the configuration are replaced by the non-empty
/// inputs (type static, scope global); an empty gateway clears it, the
/// gateway's own text leaves it, other text sets it.
///
/// Decisions of this implementation:
/// - The static inputs are pre-filled with the configuration's static
///   entries ("address/prefix", at most three) and the gateway input with
///   the gateway (with its zone); a static entry left out of the inputs is
///   removed, so entries are replaced, never duplicated.
/// - The inputs take the hexadecimal digits, ":", "/", "." and the editing
///   keys.
/// - The static radio follows the same rule as the dynamic one: it cannot
///   be chosen while IPv6 is off.
/// - Switching to a dynamic mode keeps the static entries; clearing the
///   inputs in the static mode removes them.

#include <array>

#include "network/NetworkValidation.h"
#include "platform/api/IpConfig.h"
#include "toolkit/FormDialog.h"
#include "toolkit/RadioGroup.h"

namespace Tulk {

class IPv6ConfigurationDialog : public FormDialog {
 public:
  /// The dialog above `owner` for the pending IPv6 flag `enabled` and a
  /// copy of the pending configuration `ip`.
  IPv6ConfigurationDialog(Frame* owner, bool enabled, const HostMgr::Network::IpConfig& ip);

  /// After Enter: the IPv6 flag and the new configuration.
  bool Ipv6Enabled() const { return enabled_; }
  const HostMgr::Network::IpConfig& Config() const { return ip_; }

 protected:
  void Marked(Item& item) override;
  bool Accept() override;

 private:
  void Sync();

  bool enabled_;
  bool dhcpv6_;
  bool routerAdvertisement_;
  HostMgr::Network::IpConfig ip_;
  RadioGroup mode_;
  CheckItem* disable_;
  RadioItem* dynamic_;
  CheckItem* useDhcpv6_;
  RadioItem* static_;
  std::array<InputItem*, kStaticIpv6Inputs> addresses_{};
  InputItem* gateway_;
};

}  // namespace Tulk
