#include "platform/api/PnicImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Network {

PnicImpl::PnicImpl(const std::string& name) : name_(name) {
}

PnicImpl::~PnicImpl() {
}

PnicImpl::PnicImpl(const PnicImpl&) {
}

PnicImpl& PnicImpl::operator=(const PnicImpl&) {
  return *this;
}

PnicImpl::PnicImpl(PnicImpl&&) noexcept {
}

PnicImpl& PnicImpl::operator=(PnicImpl&&) noexcept {
  return *this;
}

bool PnicImpl::IsStale() const {
  throw HostMgr::Lib::HostMgrException("HykCtl::Network::PnicImpl::IsStale is not implemented yet");
}

void PnicImpl::Refresh() {
  throw HostMgr::Lib::HostMgrException("HykCtl::Network::PnicImpl::Refresh is not implemented yet");
}

std::string PnicImpl::GetName() const {
  throw HostMgr::Lib::HostMgrException("HykCtl::Network::PnicImpl::GetName is not implemented yet");
}

PciDevice PnicImpl::GetPciDevice() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PnicImpl::GetPciDevice is not implemented yet");
}

HostMgr::Network::MacAddress PnicImpl::GetMacAddress() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PnicImpl::GetMacAddress is not implemented yet");
}

bool PnicImpl::IsLinkUp() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PnicImpl::IsLinkUp is not implemented yet");
}

int PnicImpl::GetLinkSpeed() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PnicImpl::GetLinkSpeed is not implemented yet");
}

std::string PnicImpl::GetDriver() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Network::PnicImpl::GetDriver is not implemented yet");
}

}  // namespace HykCtl::Network
