#pragma once
/// Where a kernel NIC is attached: a standard-switch portgroup, a port of a
/// distributed switch, or an opaque network.

#include <string>
#include <utility>

namespace HykCtl::Network {

/// The attachment of a kernel NIC (HykNicImpl::GetConnectionPoint); a
/// plain value.
class ConnectionPoint {
 public:
  /// A portgroup of a standard switch.
  static constexpr int kPortGroup = 1;
  /// A port of a distributed switch.
  static constexpr int kDvsPort = 2;
  /// A network managed outside the host (an overlay segment).
  static constexpr int kOpaqueNetwork = 3;

  ConnectionPoint(int type, std::string name, std::string portGroupName, std::string portId)
      : type_(type),
        name_(std::move(name)),
        portGroupName_(std::move(portGroupName)),
        portId_(std::move(portId)) {}

  /// kPortGroup, kDvsPort or kOpaqueNetwork.
  int GetType() const { return type_; }
  /// The switch the NIC is attached to (standard or distributed); for an
  /// opaque network, the network's name.
  const std::string& GetName() const { return name_; }
  /// The portgroup's name for kPortGroup; empty otherwise.
  const std::string& GetPortGroupName() const { return portGroupName_; }
  /// The distributed switch's port id for kDvsPort; empty otherwise.
  const std::string& GetPortId() const { return portId_; }

 private:
  int type_;
  std::string name_;
  std::string portGroupName_;
  std::string portId_;
};

}  // namespace HykCtl::Network
