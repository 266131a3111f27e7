#include "network/VlanDialog.h"

#include <string>

#include "host/VlanInput.h"
#include "render/TextId.h"
#include "toolkit/InputItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kFieldWidth = 6;
constexpr std::size_t kMaxDigits = 5;

}  // namespace

VlanDialog::VlanDialog(Frame* owner, std::uint16_t vlanId)
    : FormDialog(owner, 70, 13, 7), vlanId_(vlanId) {
  SetTitle(Text(TextId::kVlanOptional));
  SetText(Text(TextId::kVlanText));
  SetFooter(Footer::kOkCancel);
  input_ = &AddInput(Text(TextId::kVlanLabel), vlanId == 0 ? "" : std::to_string(vlanId),
                     kFieldWidth, kDigits, kMaxDigits);
}

bool VlanDialog::Accept() {
  const VlanInput input = VlanInput::Parse(input_->Value());
  switch (input.kind) {
    case VlanInput::Kind::kInvalid:
      return Reject(*input_, TextId::kInvalidVlanTitle, TextId::kInvalidVlan);
    case VlanInput::Kind::kAllVlans: {
      MessageDialog warning(this, TextId::kWarningTitle, Text(TextId::kVlan4095Warning), 60, 14,
                            10);
      RunFrame(&warning);
      break;
    }
    case VlanInput::Kind::kNone:
    case VlanInput::Kind::kVlan:
      break;
  }
  vlanId_ = input.id;
  return true;
}

}  // namespace Tulk
