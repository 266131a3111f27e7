#pragma once
/// "Create Port Group": a new portgroup by name on a chosen standard
/// switch, with an optional VLAN.
///
/// 70 x 15, header 7 rows, footer "<Left/Right> Change  <D> Details ...
/// <Enter> OK  <Esc> Cancel". Items: "Portgroup Name: ", the standard
/// switches as a carousel under their column heading (Left/Right step, D
/// shows "Standard Switch Details"), and the VLAN id with the shared rule
/// (VlanInput.h: empty for none, 1-4094, 4095 for all VLANs).
///
/// Enter checks, in this order, and at the first problem shows the message
/// and keeps the form open with the cursor on the field:
/// - an invalid name: "Invalid Argument" / "Please enter a valid port group
///   name.";
/// - no standard switch to add it to: "Invalid Argument" / "Please enter a
///   valid standard switch name.";
/// - an invalid VLAN id: "Invalid VLAN ID" / "Please reenter a valid VLAN ID
///   (1-4095).".
/// Then the portgroup is created (CreatePortGroup()): "Operation
/// Succeeded" / "Successfully created portgroup: <name>" and the form
/// closes with 1; or "Operation Failed" with the host's message (a name
/// already taken, say) and "Please check the syslog for more information.",
/// and the form stays open. Esc returns 0 and creates nothing.
///
/// Decisions of this implementation: everything above; the dialog is not
/// described further than the restore menu's entry. The switch is chosen
/// from the host's standard switches rather than typed, so that only an
/// existing one can be named; a refused value stays in its field to be
/// corrected.

#include "host/StandardSwitchInfo.h"
#include "toolkit/CarouselRadioItem.h"
#include "toolkit/FormDialog.h"
#include "toolkit/InfoDialog.h"

namespace Tulk {

class CreatePortGroupDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 15;
  static constexpr int kHeaderHeight = 7;

  /// The form above `owner` (the restore menu), listing the standard
  /// switches.
  explicit CreatePortGroupDialog(Frame* owner);

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  using SwitchCarousel = CarouselRadioItem<StandardSwitchInfo, InfoDialog>;

  InputItem* name_ = nullptr;
  SwitchCarousel* switches_ = nullptr;
  InputItem* vlan_ = nullptr;
};

}  // namespace Tulk
