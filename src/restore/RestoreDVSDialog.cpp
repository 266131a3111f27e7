#include "restore/RestoreDVSDialog.h"

#include <curses.h>

#include <algorithm>
#include <optional>
#include <utility>

#include "host/SwitchSummary.h"
#include "host/VlanInput.h"
#include "include/Keys.h"
#include "render/TextId.h"
#include "restore/DvsUplinksDialog.h"
#include "toolkit/CheckItem.h"
#include "toolkit/Footer.h"
#include "toolkit/InputItem.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {

RestoreDVSDialog::RestoreDVSDialog(Frame* owner, ManagementDvsPort port)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight), port_(std::move(port)) {
  SetTitle(Text(TextId::kRestoreDvsTitle));
  SetText(Text(TextId::kRestoreDvsText));
  SetFooter(Footer::kSelectToggleOkCancel);
  const std::string vlan = port_.vlanId != 0 ? std::to_string(port_.vlanId) : "";
  for (const std::string& uplink : port_.switchUplinks) {
    if (std::find(port_.portUplinks.begin(), port_.portUplinks.end(), uplink) !=
        port_.portUplinks.end()) {
      chosen_.push_back(uplink);
    }
  }
  vlan_ = &AddInput(Text(TextId::kVlanOptional), vlan, 5, kDigits, 4);
  unblock_ = &AddCheck(Text(TextId::kRestoreBlockedSetting));
  select_ = &AddLabel(Text(TextId::kSelectDvsUplinks), true);
  shown_ = &AddLabel("");
  ShowChosen();
}

void RestoreDVSDialog::ShowChosen() {
  shown_->SetText(std::string(Text(TextId::kDvsUplinksTitle)) + ": " + JoinNames(chosen_));
}

bool RestoreDVSDialog::OnKey(int key) {
  if (Current() != select_ || (key != kKeyEnter && key != kKeySpace)) {
    return false;
  }
  DvsUplinksDialog choice(this, port_.switchUplinks, chosen_);
  if (RunFrame(&choice) == 1) {
    chosen_ = choice.Chosen();
    ShowChosen();
  }
  Redisplay();
  return true;
}

bool RestoreDVSDialog::Accept() {
  const VlanInput vlan = VlanInput::Parse(vlan_->Value());
  if (vlan.kind == VlanInput::Kind::kInvalid || vlan.kind == VlanInput::Kind::kAllVlans) {
    return Reject(*vlan_, TextId::kInvalidVlanTitle, TextId::kInvalidDvsVlan);
  }
  DvsPortRepair repair;
  repair.vlanId = vlan.id;
  repair.uplinks = chosen_;
  repair.unblock = unblock_->Checked();
  if (!RepairManagementDvsPort(repair).ok) {
    MessageDialog::Show(this, TextId::kRestoreDvsErrorTitle, Text(TextId::kRestoreDvsFailed));
    return false;
  }
  MessageDialog::Show(this, TextId::kOperationSucceeded,
                      "The management network now uses a new DVS host local port.");
  return true;
}

int RunRestoreDvs(Frame* owner) {
  std::optional<ManagementDvsPort> port = ReadManagementDvsPort();
  if (!port) {
    MessageDialog::Show(owner, TextId::kRestoreDvsErrorTitle,
                        owner->Text(TextId::kRestoreDvsFailed));
    return 0;
  }
  if (port->thirdParty) {
    MessageDialog::Show(owner, TextId::kRestoreDvsErrorTitle,
                        owner->Text(TextId::kRestoreDvsThirdParty));
    return 0;
  }
  if (port->switchUplinks.empty()) {
    MessageDialog::Show(owner, TextId::kNoDvsUplinksTitle, owner->Text(TextId::kNoDvsUplinks));
    return 0;
  }
  RestoreDVSDialog dialog(owner, std::move(*port));
  return RunFrame(&dialog);
}

}  // namespace Tulk
