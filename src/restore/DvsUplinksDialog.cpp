#include "restore/DvsUplinksDialog.h"

#include <algorithm>

#include "render/TextId.h"
#include "toolkit/CheckItem.h"
#include "toolkit/ConfirmDialog.h"
#include "toolkit/Footer.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

// The warning's size: 60 x 11 with a header of 5 rows leaves one row for
// the question.
constexpr int kWarningWidth = 60;
constexpr int kWarningHeight = 11;
constexpr int kWarningHeaderHeight = 5;

}  // namespace

DvsUplinksDialog::DvsUplinksDialog(Frame* owner, std::vector<std::string> uplinks,
                                   const std::vector<std::string>& chosen)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight), uplinks_(std::move(uplinks)) {
  SetTitle(Text(TextId::kDvsUplinksTitle));
  SetText(Text(TextId::kDvsUplinksText));
  SetFooter(Footer::kSelectToggleOkCancel);
  for (const std::string& uplink : uplinks_) {
    const bool ticked = std::find(chosen.begin(), chosen.end(), uplink) != chosen.end();
    boxes_.push_back(&AddCheck(uplink, ticked));
  }
}

std::vector<std::string> DvsUplinksDialog::Chosen() const {
  std::vector<std::string> chosen;
  for (std::size_t i = 0; i < boxes_.size(); ++i) {
    if (boxes_[i]->Checked()) {
      chosen.push_back(uplinks_[i]);
    }
  }
  return chosen;
}

bool DvsUplinksDialog::Accept() {
  if (!Chosen().empty()) {
    return true;
  }
  ConfirmDialog warning(this, kWarningWidth, kWarningHeight, kWarningHeaderHeight,
                        ConfirmKeys::kYesNo);
  warning.SetTitle(Text(TextId::kDvsUplinksWarningTitle));
  warning.SetText(Text(TextId::kNoUplinksSelected));
  warning.SetQuestion(Text(TextId::kContinueQuestion));
  warning.SetFooter(Footer::kYesNoCancel);
  return RunFrame(&warning) == static_cast<int>(Answer::kYes);
}

}  // namespace Tulk
