#include "network/IPConfigurationDialog.h"

#include <string>

#include "network/NetworkValidation.h"
#include "render/TextId.h"
#include "toolkit/InputItem.h"
#include "toolkit/RadioItem.h"

namespace Tulk {
namespace {

using HostMgr::Network::Ipv4Address;

constexpr int kFieldWidth = 16;
constexpr std::size_t kMaxLength = 15;
constexpr std::size_t kNone = 0;
constexpr std::size_t kDhcp = 1;
constexpr std::size_t kStatic = 2;

std::string Dotted(const Ipv4Address& address) {
  return address.IsZero() ? std::string() : address.GetStringAddress();
}

}  // namespace

IPConfigurationDialog::IPConfigurationDialog(Frame* owner, const HostMgr::Network::IpConfig& ip)
    : FormDialog(owner, 70, 17, 7), ip_(ip) {
  SetTitle(Text(TextId::kIpv4Title));
  SetText(Text(TextId::kIpv4Text));
  SetFooter(Footer::kSelectMarkOkCancel);
  AddRadio(mode_, Text(TextId::kIpv4Disable));
  AddRadio(mode_, Text(TextId::kIpv4Dynamic));
  RadioItem& fixed = AddRadio(mode_, Text(TextId::kIpv4Static));
  address_ = &AddInput(Text(TextId::kIpv4AddressLabel), Dotted(ip.GetIpv4Address()), kFieldWidth,
                       kIpv4, kMaxLength);
  netmask_ = &AddInput(Text(TextId::kSubnetMaskLabel), Dotted(ip.GetIpv4Netmask()), kFieldWidth,
                       kIpv4, kMaxLength);
  gateway_ = &AddInput(Text(TextId::kDefaultGatewayLabel), Dotted(ip.GetIpv4Gateway()), kFieldWidth,
                       kIpv4, kMaxLength);
  mode_.SetDependents(&fixed, {address_, netmask_, gateway_});
  mode_.SelectIndex(ip.GetDhcp() ? kDhcp : ip.GetIpv4UseNone() ? kNone : kStatic);
}

bool IPConfigurationDialog::Accept() {
  const std::size_t mode = mode_.SelectedIndex();
  ip_.SetDhcp(mode == kDhcp);
  ip_.SetIpv4UseNone(mode == kNone);
  if (mode != kStatic) {
    ip_.SetIpv4Gateway(Ipv4Address());
    return true;
  }
  const std::optional<Ipv4Field> invalid =
      FirstInvalidIpv4(address_->Value(), netmask_->Value(), gateway_->Value());
  if (invalid == Ipv4Field::kAddress) {
    return Reject(*address_, TextId::kInvalidIpAddressTitle, TextId::kInvalidIpv4Address);
  }
  if (invalid == Ipv4Field::kNetmask) {
    return Reject(*netmask_, TextId::kInvalidSubnetTitle, TextId::kInvalidSubnet);
  }
  if (invalid == Ipv4Field::kGateway) {
    return Reject(*gateway_, TextId::kInvalidGatewayTitle, TextId::kInvalidIpv4Gateway);
  }
  ip_.SetIpv4Address(Ipv4Address(address_->Value()));
  ip_.SetIpv4Netmask(Ipv4Address(netmask_->Value()));
  ip_.SetIpv4Gateway(Ipv4Address(gateway_->Value()));
  return true;
}

}  // namespace Tulk
