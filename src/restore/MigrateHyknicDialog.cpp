#include "restore/MigrateHyknicDialog.h"

#include <algorithm>
#include <memory>
#include <string>
#include <vector>

#include "host/NetworkInventory.h"
#include "host/SwitchCreation.h"
#include "render/TextId.h"
#include "toolkit/Footer.h"
#include "toolkit/MessageDialog.h"

namespace Tulk {
namespace {

// The kernel NICs, the management NIC first.
std::vector<HykNicInfo> ReadKernelNics() {
  std::vector<HykNicInfo> nics;
  GetKernelNicList(nics);
  const std::string management = ReadManagementInterfaceName();
  std::stable_partition(nics.begin(), nics.end(),
                        [&](const HykNicInfo& nic) { return nic.Name() == management; });
  return nics;
}

std::vector<PortGroupInfo> ReadPortGroups() {
  std::vector<PortGroupInfo> groups;
  GetPortGroupList(groups);
  return groups;
}

}  // namespace

MigrateHyknicDialog::MigrateHyknicDialog(Frame* owner)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight) {
  SetTitle(Text(TextId::kMigrateHyknic));
  SetText(Text(TextId::kMigrateHyknicText));
  SetFooter(Footer::kChangeDetailsOkCancel);
  AddLabel(HykNicInfo("", "", "", "").Heading());
  nics_ = static_cast<NicCarousel*>(&AddItem(std::make_unique<NicCarousel>(ReadKernelNics())));
  AddLabel("");
  AddLabel(PortGroupInfo("", "", "", "").Heading());
  portGroups_ = static_cast<PortGroupCarousel*>(
      &AddItem(std::make_unique<PortGroupCarousel>(ReadPortGroups())));
}

bool MigrateHyknicDialog::OnKey(int key) {
  const bool handled = (Current() == nics_ && nics_->HandleKey(key, this)) ||
                       (Current() == portGroups_ && portGroups_->HandleKey(key, this));
  if (handled) {
    Redisplay();
  }
  return handled;
}

bool MigrateHyknicDialog::Accept() {
  const HykNicInfo* nic = nics_->Current();
  if (nic == nullptr) {
    return Reject(*nics_, TextId::kInvalidArgument, TextId::kMigrateHyknicText);
  }
  const PortGroupInfo* group = portGroups_->Current();
  if (group == nullptr) {
    return Reject(*portGroups_, TextId::kInvalidArgument, TextId::kInvalidPortGroupName);
  }
  const HostOutcome outcome = MigrateKernelNic(nic->Name(), group->Name());
  if (!outcome.ok) {
    MessageDialog::Show(this, TextId::kOperationFailed,
                        outcome.error + "\n" + Text(TextId::kCheckSyslog));
    return false;
  }
  MessageDialog::Show(this, TextId::kOperationSucceeded,
                      nic->NameLine() + "\n" + Text(TextId::kPortGroupNameLabel) + group->Name());
  return true;
}

}  // namespace Tulk
