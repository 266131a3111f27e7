#pragma once
/// "Restore DVS": repairs the management network's distributed-switch
/// port. A new host-local port is made from the management NIC's port with
/// the VLAN and uplinks entered here (every other property is copied), and
/// the management NIC is moved onto it (RepairManagementDvsPort()).
///
/// RunRestoreDvs() first reads the management NIC's port, and shows a
/// message instead of the form when
/// - the port cannot be read (no management NIC, not on a distributed
///   switch, a host failure): "Restore DVS: Error" / "Unable to restore
///   DVS. Check logs for details.";
/// - the switch is another vendor's: "Restore DVS: Error" / "Unable to
///   restore DVS. Restore DVS operation cannot be performed on 3rd party
///   DVS.";
/// - the switch has no uplinks on this host: "No DVS Uplinks: Error" / "No
///   uplinks are configured on the host for this DVS.".
///
/// The form, 70 x 15, header 7 rows, footer "<Up/Down> Select  <Space>
/// Toggle ... <Enter> OK  <Esc> Cancel":
/// - "VLAN (optional)": the port's VLAN, empty for none; 1 to 4094;
/// - "[ ] Restore to default blocked setting (unblocked) ": ticked, the new
///   port is unblocked; unticked, it keeps the old port's setting;
/// - "Select DVS uplinks": Enter or Space opens DvsUplinksDialog;
/// - "DVS Uplinks: <names>": the current choice (at first the old port's
///   uplinks), "None" when empty.
/// Enter elsewhere checks the VLAN ("Invalid VLAN ID" / "Please enter a
/// valid VLAN ID (1-4094)." keeps the form open) and repairs: "Operation
/// Succeeded" and the form closes with 1; a host failure shows "Restore
/// DVS: Error" / "Unable to restore DVS. Check logs for details." and the
/// form stays open. Esc returns 0 and changes nothing.
///
/// Decisions of this implementation:
/// - The VLAN trunk id 4095 is refused: a host-local port carries one VLAN
///   or none.
/// - The repair needs no separate F11 confirmation: the form itself is the
///   operator's deliberate choice of the new port's settings.
/// - The success message is the dialog's own text, "The management network
///   now uses a new DVS host local port.", under "Operation Succeeded".

#include <string>
#include <vector>

#include "host/DvsRepair.h"
#include "toolkit/FormDialog.h"

namespace Tulk {

class RestoreDVSDialog : public FormDialog {
 public:
  static constexpr int kWidth = 70;
  static constexpr int kHeight = 15;
  static constexpr int kHeaderHeight = 7;

  /// The form above `owner` (the restore menu) for the management NIC's
  /// port `port`, which the host can repair (see RunRestoreDvs()).
  RestoreDVSDialog(Frame* owner, ManagementDvsPort port);

 protected:
  bool OnKey(int key) override;
  bool Accept() override;

 private:
  void ShowChosen();

  ManagementDvsPort port_;
  std::vector<std::string> chosen_;
  InputItem* vlan_ = nullptr;
  CheckItem* unblock_ = nullptr;
  LabelItem* select_ = nullptr;
  LabelItem* shown_ = nullptr;
};

/// "Restore DVS" from the restore menu: reads the management NIC's port
/// and runs the message that says why it cannot be repaired, or the form.
/// Returns 1 when the port was repaired.
int RunRestoreDvs(Frame* owner);

}  // namespace Tulk
