#include "network/TestDialog.h"

#include "network/RunTestDialog.h"
#include "render/TextId.h"
#include "toolkit/Footer.h"
#include "toolkit/InputItem.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

// The longest IPv6 text (45 bytes with an embedded IPv4 tail) and a zone.
constexpr std::size_t kAddressMaxLength = 64;
constexpr std::size_t kHostNameMaxLength = 255;

}  // namespace

TestDialog::TestDialog(Frame* owner)
    : FormDialog(owner, kWidth, kHeight, kHeaderHeight), defaults_(ReadNetworkTestDefaults()) {
  SetTitle(Text(TextId::kTestNetworkTitle));
  SetText(Text(TextId::kTestNetworkText));
  SetFooter(Footer::kSelectOkCancel);
  for (std::size_t i = 0; i < kPingTargetCount; ++i) {
    const std::string label =
        std::string(Text(TextId::kPingAddressLabel)) + " #" + std::to_string(i + 1) + ":";
    const std::string value = i < defaults_.pingTargets.size() ? defaults_.pingTargets[i] : "";
    addresses_[i] = &AddInput(label, value, kInputWidth, kPingAddress, kAddressMaxLength);
  }
  hostName_ = &AddInput(Text(TextId::kResolveHostnameLabel), defaults_.hostName, kInputWidth,
                        kHostName, kHostNameMaxLength);
}

bool TestDialog::Accept() {
  for (InputItem* address : addresses_) {
    if (!address->Value().empty() && !ParsePingTarget(address->Value())) {
      return Reject(*address, TextId::kInvalidIpAddressTitle, TextId::kInvalidIpOrIpv6);
    }
  }
  return true;
}

int TestDialog::Run() {
  if (FormDialog::Run() != 1) {
    return 0;
  }
  std::array<std::string, kPingTargetCount> targets;
  for (std::size_t i = 0; i < kPingTargetCount; ++i) {
    targets[i] = addresses_[i]->Value();
  }
  RunTestDialog test(this, targets, hostName_->Value(), defaults_.interfaceName);
  RunFrame(&test);
  return 1;
}

}  // namespace Tulk
