#include "platform/api/HykNicImpl.h"

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace HykCtl::Network {

// NOLINTNEXTLINE(bugprone-exception-escape): json's own moves and destructor do not throw
struct HykNicImpl::Snapshot {
  Sim::json nic;
  std::uint64_t generation = 0;
};

namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::HykNicImpl::") + method;
}

}  // namespace

HykNicImpl::HykNicImpl(const std::string& name) : name_(name) {
  Sim::Query(Op("HykNicImpl"));
  Refresh();
}

HykNicImpl::~HykNicImpl() = default;
HykNicImpl::HykNicImpl(const HykNicImpl&) = default;
HykNicImpl& HykNicImpl::operator=(const HykNicImpl&) = default;
HykNicImpl::HykNicImpl(HykNicImpl&&) noexcept = default;
HykNicImpl& HykNicImpl::operator=(HykNicImpl&&) noexcept = default;

const HykNicImpl::Snapshot& HykNicImpl::Current() const {
  return *snapshot_;
}

bool HykNicImpl::IsStale() const {
  Sim::Query(Op("IsStale"));
  return Sim::SimHost::Instance().Generation() != snapshot_->generation;
}

void HykNicImpl::Refresh() {
  const Sim::json& state = Sim::Query(Op("Refresh"));
  auto snapshot = std::make_shared<Snapshot>();
  snapshot->nic = Sim::RequireKernelNic(state, name_);
  snapshot->generation = Sim::SimHost::PinnedGeneration();
  snapshot_ = std::move(snapshot);
}

std::string HykNicImpl::GetName() const {
  Sim::Query(Op("GetName"));
  return name_;
}

HostMgr::Network::MacAddress HykNicImpl::GetMacAddress() const {
  Sim::Query(Op("GetMacAddress"));
  return HostMgr::Network::MacAddress::FromString(
      Sim::StringAt(Current().nic, "mac", "00:00:00:00:00:00"));
}

std::optional<ConnectionPoint> HykNicImpl::GetConnectionPoint() const {
  Sim::Query(Op("GetConnectionPoint"));
  auto connection = Current().nic.find("connection");
  if (connection == Current().nic.end() || !connection->is_object()) {
    return std::nullopt;
  }
  const std::string type = Sim::StringAt(*connection, "type");
  if (type == "portgroup") {
    return ConnectionPoint(ConnectionPoint::kPortGroup, Sim::StringAt(*connection, "switch"),
                           Sim::StringAt(*connection, "portGroup"), "");
  }
  if (type == "dvsPort") {
    return ConnectionPoint(ConnectionPoint::kDvsPort, Sim::StringAt(*connection, "switch"), "",
                           Sim::StringAt(*connection, "portId"));
  }
  return ConnectionPoint(ConnectionPoint::kOpaqueNetwork, Sim::StringAt(*connection, "name"), "",
                         "");
}

bool HykNicImpl::IsEnabled() const {
  Sim::Query(Op("IsEnabled"));
  return Current().nic.value("enabled", true);
}

HostMgr::Network::IpConfig HykNicImpl::GetIpConfig() const {
  Sim::Query(Op("GetIpConfig"));
  return Sim::ReadIpConfig(Current().nic);
}

void HykNicImpl::SetIpConfig(const HostMgr::Network::IpConfig& config) {
  Sim::Change(Op("SetIpConfig"), [&](Sim::json& state) {
    Sim::json& nic = Sim::RequireKernelNic(state, name_);
    Sim::WriteIpConfig(nic, config, Sim::ObjectAt(state["network"], "dhcpOffer"));
  });
  Refresh();
}

bool HykNicImpl::IsDhcpLeaseBound() const {
  Sim::Query(Op("IsDhcpLeaseBound"));
  const Sim::json& nic = Current().nic;
  return Sim::StringAt(Sim::ObjectAt(nic, "ipv4"), "mode") == "dhcp" &&
         Sim::ObjectAt(nic, "dhcpLease").value("bound", false);
}

void HykNicImpl::RenewDhcpLease() {
  Sim::Change(Op("RenewDhcpLease"), [&](Sim::json& state) {
    Sim::json& nic = Sim::RequireKernelNic(state, name_);
    if (Sim::StringAt(Sim::ObjectAt(nic, "ipv4"), "mode") != "dhcp") {
      Sim::Fail("Hykernel NIC " + name_ + " does not use DHCP");
    }
    Sim::json lease = nic.contains("dhcpLease") && nic["dhcpLease"].is_object()
                          ? nic["dhcpLease"]
                          : Sim::json::object();
    const Sim::json& offer = Sim::ObjectAt(state["network"], "dhcpOffer");
    if (!offer.empty()) {
      for (const auto& [key, value] : offer.items()) {
        lease[key] = value;
      }
      lease["bound"] = true;
    }
    lease["renewals"] = lease.value("renewals", 0) + 1;
    nic["dhcpLease"] = std::move(lease);
  });
  Refresh();
}

void HykNicImpl::SetMacAddressFromPnic(const std::string& pnicName) {
  Sim::Change(Op("SetMacAddressFromPnic"), [&](Sim::json& state) {
    const std::string mac = Sim::StringAt(Sim::RequirePnic(state, pnicName), "mac");
    Sim::RequireKernelNic(state, name_)["mac"] = mac;
  });
  Refresh();
}

void HykNicImpl::ConnectToPortGroup(const std::string& portGroup) {
  Sim::Change(Op("ConnectToPortGroup"), [&](Sim::json& state) {
    const Sim::json& group = Sim::RequirePortGroup(state, portGroup);
    Sim::RequireKernelNic(state, name_)["connection"] = {
        {"type", "portgroup"}, {"switch", group["switch"]}, {"portGroup", portGroup}};
  });
  Refresh();
}

void HykNicImpl::ConnectToDvsPort(const std::string& dvsName, const std::string& portId) {
  Sim::Change(Op("ConnectToDvsPort"), [&](Sim::json& state) {
    const Sim::json& vswitch = Sim::RequireSwitch(state, dvsName);
    if (Sim::StringAt(vswitch, "type", "standard") != "distributed") {
      Sim::Fail("Not a distributed switch " + dvsName);
    }
    if (Sim::FindDvsPort(vswitch, portId) == nullptr) {
      Sim::Fail("Port " + portId + " not found on " + dvsName);
    }
    Sim::RequireKernelNic(state, name_)["connection"] = {
        {"type", "dvsPort"}, {"switch", dvsName}, {"portId", portId}};
  });
  Refresh();
}

void HykNicImpl::Disable() {
  Sim::Change(Op("Disable"),
              [&](Sim::json& state) { Sim::RequireKernelNic(state, name_)["enabled"] = false; });
  Refresh();
}

void HykNicImpl::Enable() {
  Sim::Change(Op("Enable"),
              [&](Sim::json& state) { Sim::RequireKernelNic(state, name_)["enabled"] = true; });
  Refresh();
}

void HykNicImpl::Restart() {
  Sim::Change(Op("Restart"), [&](Sim::json& state) {
    Sim::json& nic = Sim::RequireKernelNic(state, name_);
    nic["enabled"] = true;
    nic["restarts"] = nic.value("restarts", 0) + 1;
    if (Sim::StringAt(Sim::ObjectAt(nic, "ipv4"), "mode") == "dhcp") {
      // The DHCP client starts over: bound again when the network has a
      // DHCP server, waiting without a lease otherwise.
      const Sim::json& offer = Sim::ObjectAt(state["network"], "dhcpOffer");
      if (offer.empty()) {
        nic["dhcpLease"] = nullptr;
      } else {
        Sim::json lease = offer;
        lease["bound"] = true;
        lease["renewals"] = Sim::ObjectAt(nic, "dhcpLease").value("renewals", 0);
        nic["dhcpLease"] = std::move(lease);
      }
    }
  });
  Refresh();
}

}  // namespace HykCtl::Network
