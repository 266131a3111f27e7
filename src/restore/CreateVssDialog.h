#pragma once
/// "Create Standard Switch": a new standard switch by name, with an
/// optional uplink from the physical NICs no switch uses.
///
/// 70 x 17, header 7 rows, footer "<Up/Down> Select  <Space> Mark Selected
/// ... <Enter> OK  <Esc> Cancel". Items: "Switch Name: " (31 characters at
/// most: letters, digits, "-", "_", "."), then "Uplink:" with the radio
/// buttons "No adapter" (marked at first) and one per free physical NIC
/// ("hynic3 (Disconnected)").
///
/// Enter checks, in this order, and at the first problem shows the message
/// and keeps the form open with the cursor on the field:
/// - an invalid name: "Invalid Argument" / "Please enter a valid standard
///   switch name.";
/// - an uplink that another switch took meanwhile: "Invalid Argument" /
///   "Uplink is already in use".
/// Then the switch is created (CreateStandardSwitch()): "Operation
/// Succeeded" / "Successfully created standard virtual switch: <name>" and
/// the form closes with 1; or "Operation Failed" with the host's message and
/// "Please check the syslog for more information.", and the form stays
/// open. Esc returns 0 and creates nothing.
///
/// Decisions of this implementation: everything above; the dialog is not
/// described further than the restore menu's entry. After a host failure
/// the form stays open with the values, so the operator can change them or
/// leave with Esc. A name already taken is left to the host to refuse (its
/// message names the switch). The "Uplink:" heading is the dialog's own
/// text.

#include <string>
#include <vector>

#include "host/PnicRow.h"
#include "toolkit/FormDialog.h"
#include "toolkit/RadioGroup.h"

namespace Tulk {

class CreateVssDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 17;
  static constexpr int kHeaderHeight = 7;

  /// The form above `owner` (the restore menu), listing the free NICs.
  explicit CreateVssDialog(Frame* owner);
  ~CreateVssDialog() override;

 protected:
  bool Accept() override;

 private:
  InputItem* name_ = nullptr;
  RadioGroup uplinks_;
  std::vector<RadioItem*> radios_;
  std::vector<PnicRow> freeNics_;
};

}  // namespace Tulk
