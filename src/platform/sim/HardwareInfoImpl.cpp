#include "platform/api/HardwareInfoImpl.h"

#include "platform/api/HostMgrException.h"

#pragma GCC diagnostic ignored "-Wunused-parameter"

namespace HykCtl::Hardware {

std::string HardwareInfoImpl::GetVendorName() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetVendorName is not implemented yet");
}

std::string HardwareInfoImpl::GetProductName() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetProductName is not implemented yet");
}

std::string HardwareInfoImpl::GetSerialNumber() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetSerialNumber is not implemented yet");
}

std::string HardwareInfoImpl::GetServiceTag() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetServiceTag is not implemented yet");
}

std::string HardwareInfoImpl::GetAssetTag() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetAssetTag is not implemented yet");
}

std::string HardwareInfoImpl::GetBiosVersion() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetBiosVersion is not implemented yet");
}

std::string HardwareInfoImpl::GetBmcVersion() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetBmcVersion is not implemented yet");
}

std::string HardwareInfoImpl::GetCpldVersion() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetCpldVersion is not implemented yet");
}

std::string HardwareInfoImpl::GetPlsaVersion() const {
  throw HostMgr::Lib::HostMgrException(
      "HykCtl::Hardware::HardwareInfoImpl::GetPlsaVersion is not implemented yet");
}

}  // namespace HykCtl::Hardware
