#include "restore/CreatePortGroupDialog.h"

#include <memory>
#include <vector>

#include "host/NetworkInventory.h"
#include "host/SwitchCreation.h"
#include "host/VlanInput.h"
#include "render/TextId.h"
#include "restore/RestoreInput.h"
#include "toolkit/Footer.h"
#include "toolkit/InputItem.h"
#include "toolkit/MessageDialog.h"

namespace Tulk {
namespace {

std::vector<StandardSwitchInfo> ReadStandardSwitches() {
  std::vector<SwitchSummary> summaries;
  GetStandardSwitchList(summaries);
  std::vector<StandardSwitchInfo> switches;
  switches.reserve(summaries.size());
  for (SwitchSummary& summary : summaries) {
    switches.emplace_back(std::move(summary));
  }
  return switches;
}

}  // namespace

CreatePortGroupDialog::CreatePortGroupDialog(Frame* owner)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight) {
  SetTitle(Text(TextId::kCreatePortGroup));
  SetText(Text(TextId::kCreatePortGroupText));
  SetFooter(Footer::kChangeDetailsOkCancel);
  name_ = &AddInput(Text(TextId::kPortGroupNameLabel), "", 32, kAnyText, kPortGroupNameMaxLength);
  AddLabel(StandardSwitchInfo(SwitchSummary()).Heading());
  switches_ = static_cast<SwitchCarousel*>(
      &AddItem(std::make_unique<SwitchCarousel>(ReadStandardSwitches())));
  vlan_ = &AddInput(Text(TextId::kVlanLabel), "", 5, kDigits, 4);
}

bool CreatePortGroupDialog::OnKey(int key) {
  if (Current() == switches_ && switches_->HandleKey(key, this)) {
    Redisplay();
    return true;
  }
  return false;
}

bool CreatePortGroupDialog::Accept() {
  const std::string& name = name_->Value();
  if (!IsValidPortGroupName(name)) {
    return Reject(*name_, TextId::kInvalidArgument, TextId::kInvalidPortGroupName);
  }
  const StandardSwitchInfo* target = switches_->Current();
  if (target == nullptr) {
    return Reject(*switches_, TextId::kInvalidArgument, TextId::kInvalidSwitchName);
  }
  const VlanInput vlan = VlanInput::Parse(vlan_->Value());
  if (vlan.kind == VlanInput::Kind::kInvalid) {
    return Reject(*vlan_, TextId::kInvalidVlanTitle, TextId::kInvalidVlan);
  }
  const HostOutcome outcome = CreatePortGroup(name, target->Name(), vlan.id);
  if (!outcome.ok) {
    MessageDialog::Show(this, TextId::kOperationFailed,
                        outcome.error + "\n" + Text(TextId::kCheckSyslog));
    return false;
  }
  MessageDialog::Show(this, TextId::kOperationSucceeded, Text(TextId::kPortGroupCreated) + name);
  return true;
}

}  // namespace Tulk
