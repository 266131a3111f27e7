#pragma once
/// "IPv4 Configuration": IPv4 off, by DHCP, or static with address, subnet
/// mask and default gateway.
///
/// A form 70 x 17 with a header of 7 rows. Items, in order: the radios
/// "Disable IPv4 configuration for management network", "Use dynamic IPv4
/// address and network configuration", "Set static IPv4 address and
/// network configuration:", then the inputs "IPv4 Address", "Subnet Mask",
/// "Default Gateway", pre-filled with the pending values (0.0.0.0 shows as
/// an empty field) and enabled only while the static radio is marked. The
/// inputs take the digits, "." and the editing keys; the cursor shows only
/// on them. Footer "<Up/Down> Select  <Space> Mark Selected ... <Enter> OK
/// <Esc> Cancel".
///
/// Enter:
/// 1. the working copy takes the mode: DHCP, off ("none"), or static;
///    choosing DHCP or static turns a switched-off IPv4 back on;
/// 2. not static: the gateway is cleared, address and netmask keep their
///    old values, and the dialog is done;
/// 3. static: address, then mask (a valid address and a contiguous
///    netmask), then gateway (empty is invalid) are checked; the first
///    failure shows "Invalid IP address", "Invalid subnet" or "Invalid
///    gateway address" with its text and puts the cursor in that input;
/// 4. all valid: address, netmask and gateway are stored.
/// Esc leaves the pending configuration untouched.
///
/// Decisions of this implementation:
/// - A value of 0.0.0.0 (no address) shows as an empty input, so that a
///   host without a gateway is asked for one rather than offered 0.0.0.0.
/// - Choosing DHCP or static on a host whose IPv4 is switched off turns it
///   back on (the "none" flag is cleared).

#include "platform/api/IpConfig.h"
#include "toolkit/FormDialog.h"
#include "toolkit/RadioGroup.h"

namespace Tulk {

class IPConfigurationDialog : public FormDialog {
 public:
  /// The dialog above `owner` on a copy of the pending configuration `ip`.
  IPConfigurationDialog(Frame* owner, const HostMgr::Network::IpConfig& ip);

  /// The working copy: after Enter, the new IPv4 settings.
  const HostMgr::Network::IpConfig& Config() const { return ip_; }

 protected:
  bool Accept() override;

 private:
  HostMgr::Network::IpConfig ip_;
  RadioGroup mode_;
  InputItem* address_;
  InputItem* netmask_;
  InputItem* gateway_;
};

}  // namespace Tulk
