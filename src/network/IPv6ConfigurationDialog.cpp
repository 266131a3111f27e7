#include "network/IPv6ConfigurationDialog.h"

#include <string>

#include "platform/api/Ipv6Network.h"
#include "render/TextId.h"
#include "toolkit/CheckItem.h"
#include "toolkit/InputItem.h"
#include "toolkit/RadioItem.h"

namespace Tulk {
namespace {

using HostMgr::Network::Ipv6Address;
using HostMgr::Network::Ipv6Network;

constexpr int kFieldWidth = 40;
constexpr std::size_t kMaxLength = 64;
constexpr int kCheckIndent = 4;

}  // namespace

IPv6ConfigurationDialog::IPv6ConfigurationDialog(Frame* owner, bool enabled,
                                                 const HostMgr::Network::IpConfig& ip)
    : FormDialog(owner, 70, 20, 8),
      enabled_(enabled),
      dhcpv6_(ip.GetDhcpv6()),
      routerAdvertisement_(ip.GetRouterAdvertisement() && !ip.GetDhcpv6()),
      ip_(ip) {
  SetTitle(Text(TextId::kIpv6Title));
  SetText(Text(TextId::kIpv6Text));
  SetFooter(Footer::kSelectMarkOkCancel);
  disable_ = &AddCheck(Text(TextId::kIpv6Disable));
  dynamic_ = &AddRadio(mode_, Text(TextId::kIpv6Dynamic));
  useDhcpv6_ = &AddCheck(Text(TextId::kUseDhcpv6), false, kCheckIndent);
  static_ = &AddRadio(mode_, Text(TextId::kIpv6Static));
  std::vector<std::string> statics;
  for (const Ipv6Network& network : ip.GetIpv6Networks()) {
    if (network.GetAddressType() == Ipv6Network::kTypeStatic) {
      statics.push_back(network.ToString());
    }
  }
  for (std::size_t i = 0; i < addresses_.size(); ++i) {
    addresses_[i] =
        &AddInput(std::string(Text(TextId::kStaticAddressLabel)) + " " + std::to_string(i + 1),
                  i < statics.size() ? statics[i] : "", kFieldWidth, kIpv6Network, kMaxLength);
  }
  const Ipv6Address& gateway = ip.GetIpv6Gateway();
  gateway_ = &AddInput(Text(TextId::kDefaultGatewayInputLabel),
                       gateway.IsZero() ? "" : gateway.GetScopedStringAddress(), kFieldWidth,
                       kIpv6Network, kMaxLength);
  Sync();
}

void IPv6ConfigurationDialog::Marked(Item& item) {
  if (&item == disable_) {
    enabled_ = !disable_->Checked();
  } else if (&item == dynamic_ || &item == useDhcpv6_) {
    const bool dhcpv6 = useDhcpv6_->Checked();
    dhcpv6_ = dhcpv6;
    routerAdvertisement_ = !dhcpv6;
  } else if (&item == static_) {
    dhcpv6_ = false;
    routerAdvertisement_ = false;
  }
  Sync();
}

void IPv6ConfigurationDialog::Sync() {
  const bool dynamic = dhcpv6_ || routerAdvertisement_;
  disable_->SetChecked(!enabled_);
  mode_.Select(dynamic ? static_cast<Item*>(dynamic_) : static_);
  useDhcpv6_->SetChecked(dhcpv6_);
  dynamic_->SetEnabled(enabled_);
  useDhcpv6_->SetEnabled(enabled_);
  static_->SetEnabled(enabled_);
  for (InputItem* input : addresses_) {
    input->SetEnabled(enabled_ && !dynamic);
  }
  gateway_->SetEnabled(enabled_ && !dynamic);
}

bool IPv6ConfigurationDialog::Accept() {
  ip_.SetDhcpv6(dhcpv6_);
  ip_.SetRouterAdvertisement(routerAdvertisement_);
  if (!enabled_ || dhcpv6_ || routerAdvertisement_) {
    return true;
  }
  std::array<std::string, kStaticIpv6Inputs> texts;
  for (std::size_t i = 0; i < texts.size(); ++i) {
    texts[i] = addresses_[i]->Value();
  }
  if (std::optional<Ipv6Problem> problem = FirstInvalidIpv6(texts, gateway_->Value()); problem) {
    switch (problem->kind) {
      case Ipv6Problem::Kind::kInvalidAddress:
        return Reject(*addresses_[problem->field], TextId::kInvalidIpAddressTitle,
                      TextId::kInvalidIpv6Network);
      case Ipv6Problem::Kind::kLinkLocal:
        return Reject(*addresses_[problem->field], TextId::kInvalidScopeTitle,
                      TextId::kLinkLocalNotStatic);
      case Ipv6Problem::Kind::kInvalidGateway:
        return Reject(*gateway_, TextId::kInvalidGatewayTitle, TextId::kInvalidIpv6Gateway);
    }
  }
  ip_.ClearStaticIpv6Networks();
  for (const std::string& text : texts) {
    if (!text.empty()) {
      Ipv6Network network = Ipv6Network::FromString(text);
      network.SetAddressType(Ipv6Network::kTypeStatic);
      network.SetScope(Ipv6Network::kScopeGlobal);
      ip_.AddIpv6Network(network);
    }
  }
  const std::string& gateway = gateway_->Value();
  if (gateway.empty()) {
    ip_.SetIpv6Gateway(Ipv6Address());
  } else if (gateway != ip_.GetIpv6Gateway().GetScopedStringAddress()) {
    ip_.SetIpv6Gateway(Ipv6Address(gateway));
  }
  return true;
}

}  // namespace Tulk
