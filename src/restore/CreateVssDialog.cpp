#include "restore/CreateVssDialog.h"

#include <algorithm>

#include "host/SwitchCreation.h"
#include "render/TextId.h"
#include "restore/RestoreInput.h"
#include "toolkit/Footer.h"
#include "toolkit/InputItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RadioItem.h"

namespace Tulk {

CreateVssDialog::CreateVssDialog(Frame* owner)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight), freeNics_(ReadFreePhysicalNics()) {
  SetTitle(Text(TextId::kCreateStandardSwitch));
  SetText(Text(TextId::kCreateStandardSwitchText));
  SetFooter(Footer::kSelectMarkOkCancel);
  name_ = &AddInput(Text(TextId::kSwitchNameLabel), "", 32, kSwitchName, kSwitchNameMaxLength);
  AddLabel("");
  AddLabel("Uplink:");
  radios_.push_back(&AddRadio(uplinks_, Text(TextId::kNoAdapter)));
  for (const PnicRow& nic : freeNics_) {
    radios_.push_back(&AddRadio(uplinks_, nic.name + " (" + nic.linkState + ")"));
  }
  uplinks_.SelectIndex(0);
}

CreateVssDialog::~CreateVssDialog() = default;

bool CreateVssDialog::Accept() {
  const std::string& name = name_->Value();
  if (!IsValidSwitchName(name)) {
    return Reject(*name_, TextId::kInvalidArgument, TextId::kInvalidSwitchName);
  }
  const std::size_t choice = uplinks_.SelectedIndex();
  std::string uplink;
  if (choice > 0 && choice <= freeNics_.size()) {
    uplink = freeNics_[choice - 1].name;
    const std::vector<PnicRow> stillFree = ReadFreePhysicalNics();
    if (std::none_of(stillFree.begin(), stillFree.end(),
                     [&](const PnicRow& nic) { return nic.name == uplink; })) {
      return Reject(*radios_[choice], TextId::kInvalidArgument, TextId::kUplinkInUse);
    }
  }
  const HostOutcome outcome = CreateStandardSwitch(name, uplink);
  if (!outcome.ok) {
    MessageDialog::Show(this, TextId::kOperationFailed,
                        outcome.error + "\n" + Text(TextId::kCheckSyslog));
    return false;
  }
  MessageDialog::Show(this, TextId::kOperationSucceeded, Text(TextId::kSwitchCreated) + name);
  return true;
}

}  // namespace Tulk
