#include "network/DNSConfigurationDialog.h"

#include "network/NetworkValidation.h"
#include "render/TextId.h"
#include "toolkit/InputItem.h"
#include "toolkit/RadioItem.h"

namespace Tulk {
namespace {

constexpr int kServerWidth = 36;
constexpr std::size_t kServerLength = 64;
constexpr std::size_t kHostnameLength = 255;

}  // namespace

DNSConfigurationDialog::DNSConfigurationDialog(Frame* owner, bool automatic, std::string primary,
                                               std::string alternate, std::string hostname)
    : FormDialog(owner, 70, 15, 6),
      automatic_(automatic),
      primary_(std::move(primary)),
      alternate_(std::move(alternate)),
      hostname_(std::move(hostname)) {
  SetTitle(Text(TextId::kDnsTitle));
  SetText(Text(TextId::kDnsText));
  SetFooter(Footer::kSelectMarkOkCancel);
  AddRadio(mode_, Text(TextId::kDnsAutomatic));
  RadioItem& manual = AddRadio(mode_, Text(TextId::kDnsManual));
  primaryInput_ =
      &AddInput(Text(TextId::kPrimaryDnsLabel), primary_, kServerWidth, kDnsServer, kServerLength);
  alternateInput_ = &AddInput(Text(SecondServerInputLabel(primary_, alternate_)), alternate_,
                              kServerWidth, kDnsServer, kServerLength);
  hostnameInput_ =
      &AddInput(Text(TextId::kHostnameLabel), hostname_, kServerWidth, kHostName, kHostnameLength);
  mode_.SetDependents(&manual, {primaryInput_, alternateInput_, hostnameInput_});
  mode_.SelectIndex(automatic_ ? 0 : 1);
}

void DNSConfigurationDialog::Edited(InputItem& field) {
  if (&field == alternateInput_) {
    alternateInput_->SetLabel(
        Text(SecondServerInputLabel(primaryInput_->Value(), alternateInput_->Value())));
  }
}

bool DNSConfigurationDialog::Accept() {
  automatic_ = mode_.SelectedIndex() == 0;
  if (automatic_) {
    return true;
  }
  if (!IsDnsServerText(primaryInput_->Value())) {
    return Reject(*primaryInput_, TextId::kInvalidDnsServerTitle, TextId::kInvalidDnsServer);
  }
  if (!IsDnsServerText(alternateInput_->Value())) {
    return Reject(*alternateInput_, TextId::kInvalidDnsServerTitle, TextId::kInvalidDnsServer);
  }
  primary_ = CanonicalServerText(primaryInput_->Value());
  alternate_ = CanonicalServerText(alternateInput_->Value());
  hostname_ = hostnameInput_->Value();
  return true;
}

}  // namespace Tulk
