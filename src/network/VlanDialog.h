#pragma once
/// "VLAN (optional)": the VLAN id of the management portgroup.
///
/// A form 70 x 13 with a header of 7 rows: title "VLAN (optional)", text
/// "If you are unsure how to configure or use a VLAN, it is safe to leave
/// this option unset.", one input "VLAN ID (1-4094, or 4095 to access all
/// VLANs):" showing the pending id (empty for 0), footer "<Enter> OK  <Esc>
/// Cancel". The input takes the digits and the editing keys only.
///
/// Enter: an empty field means no VLAN (0); 1 to 4094 is taken; 4095 is
/// taken after the "Warning" message about receiving every VLAN-tagged
/// frame; anything else (0, above 4095) shows "Invalid VLAN ID" and the
/// dialog stays. Esc leaves the pending id alone.

#include <cstdint>

#include "toolkit/FormDialog.h"

namespace Tulk {

class VlanDialog : public FormDialog {
 public:
  /// The dialog above `owner` for the pending id `vlanId`.
  VlanDialog(Frame* owner, std::uint16_t vlanId);

  /// The id taken on Enter (the pending id until then).
  std::uint16_t VlanId() const { return vlanId_; }

 protected:
  bool Accept() override;

 private:
  std::uint16_t vlanId_;
  InputItem* input_;
};

}  // namespace Tulk
