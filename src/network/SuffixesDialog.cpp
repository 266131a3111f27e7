#include "network/SuffixesDialog.h"

#include "render/TextId.h"
#include "toolkit/InputItem.h"

namespace Tulk {
namespace {

constexpr int kFieldWidth = 48;
constexpr std::size_t kMaxLength = 1024;

}  // namespace

SuffixesDialog::SuffixesDialog(Frame* owner, const std::string& suffixes)
    : FormDialog(owner, 70, 13, 8) {
  SetTitle(Text(TextId::kCustomDnsSuffixes));
  SetText(Text(TextId::kSuffixesText));
  SetFooter(Footer::kOkCancel);
  SetCursorAlways(true);
  input_ = &AddInput(Text(TextId::kSuffixesLabel), suffixes, kFieldWidth, kSuffixes, kMaxLength);
}

const std::string& SuffixesDialog::Suffixes() const {
  return input_->Value();
}

}  // namespace Tulk
