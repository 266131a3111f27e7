#include "network/AdaptersDialog.h"

#include <algorithm>

#include "host/InfoType.h"
#include "host/NetworkInventory.h"
#include "network/AdapterInfoDialog.h"
#include "network/UsedAdaptersDialog.h"
#include "render/TextId.h"
#include "toolkit/CheckItem.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr char kHeading[] =
    "    {align:padding:13}Device Name{/align}{align:padding:30}Hardware Label (MAC "
    "Address){/align}Status";
constexpr std::size_t kNameColumn = 13;
constexpr std::size_t kLabelColumn = 30;

// The label and MAC address in one column, one blank to spare; a long
// label is cut so that the address stays whole.
std::string LabelWithMac(const PnicRow& pnic) {
  const std::string mac = " (" + pnic.mac + ")";
  const std::size_t room = kLabelColumn - 1;
  std::string label = pnic.hardwareLabel;
  if (label.size() + mac.size() > room && room > mac.size() + 3) {
    label = InfoType::Shorten(label, room - mac.size());
  }
  return label + mac;
}

}  // namespace

AdaptersDialog::AdaptersDialog(Frame* owner, std::vector<std::string> selected,
                               std::string managementSwitch)
    : FormDialog(owner, 70, 20, 7),
      selected_(std::move(selected)),
      managementSwitch_(std::move(managementSwitch)) {
  SetTitle(Text(TextId::kAdaptersTitle));
  SetText(Text(TextId::kAdaptersText));
  SetFooter(Footer::kDetailsToggleOkCancel);
  std::vector<SwitchSummary> switches;
  readOk_ = ScanVirtualSwitches(switches);
  readOk_ = GetPhysicalNicList(pnics_, BuildPnicUsage(switches)) && readOk_;
  AddLabel(kHeading);
  for (const PnicRow& pnic : pnics_) {
    const bool checked =
        std::find(selected_.begin(), selected_.end(), pnic.name) != selected_.end();
    checks_.push_back(&AddCheck(Caption(pnic), checked));
  }
}

std::string AdaptersDialog::Caption(const PnicRow& pnic) {
  return "{align:padding:" + std::to_string(kNameColumn) + "}" +
         InfoType::Shorten(pnic.name, kNameColumn - 1) +
         "{/align}{align:padding:" + std::to_string(kLabelColumn) + "}" + LabelWithMac(pnic) +
         "{/align}" + pnic.linkState;
}

int AdaptersDialog::Run() {
  const int result = FormDialog::Run();
  return readOk_ ? result : 0;
}

const PnicRow* AdaptersDialog::RowOf(const Item* item) const {
  for (std::size_t i = 0; i < checks_.size(); ++i) {
    if (checks_[i] == item) {
      return &pnics_[i];
    }
  }
  return nullptr;
}

bool AdaptersDialog::OnKey(int key) {
  if (key != 'd' && key != 'D') {
    return false;
  }
  if (const PnicRow* pnic = RowOf(Current()); pnic != nullptr) {
    AdapterInfoDialog details(this, *pnic);
    RunFrame(&details);
  }
  return true;
}

void AdaptersDialog::Marked(Item& item) {
  const PnicRow* pnic = RowOf(&item);
  if (pnic == nullptr) {
    return;
  }
  auto found = std::find(selected_.begin(), selected_.end(), pnic->name);
  if (static_cast<CheckItem&>(item).Checked()) {
    if (found == selected_.end()) {
      selected_.push_back(pnic->name);
    }
  } else if (found != selected_.end()) {
    selected_.erase(found);
  }
}

bool AdaptersDialog::Accept() {
  for (const std::string& name : selected_) {
    auto pnic = std::find_if(pnics_.begin(), pnics_.end(),
                             [&](const PnicRow& row) { return row.name == name; });
    if (pnic != pnics_.end() && !pnic->switchName.empty() &&
        pnic->switchName != managementSwitch_) {
      UsedAdaptersDialog question(this);
      return static_cast<Answer>(RunFrame(&question)) == Answer::kYes;
    }
  }
  return true;
}

}  // namespace Tulk
