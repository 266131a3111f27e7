#include "platform/api/PnicImpl.h"

#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace HykCtl::Network {

// NOLINTNEXTLINE(bugprone-exception-escape): json's own moves and destructor do not throw
struct PnicImpl::Snapshot {
  Sim::json pnic;
  std::uint64_t generation = 0;
};

namespace {

std::string Op(const char* method) {
  return std::string("HykCtl::Network::PnicImpl::") + method;
}

}  // namespace

PnicImpl::PnicImpl(const std::string& name) : name_(name) {
  Sim::Query(Op("PnicImpl"));
  Refresh();
}

PnicImpl::~PnicImpl() = default;
PnicImpl::PnicImpl(const PnicImpl&) = default;
PnicImpl& PnicImpl::operator=(const PnicImpl&) = default;
PnicImpl::PnicImpl(PnicImpl&&) noexcept = default;
PnicImpl& PnicImpl::operator=(PnicImpl&&) noexcept = default;

const PnicImpl::Snapshot& PnicImpl::Current() const {
  return *snapshot_;
}

bool PnicImpl::IsStale() const {
  Sim::Query(Op("IsStale"));
  return Sim::SimHost::Instance().Generation() != snapshot_->generation;
}

void PnicImpl::Refresh() {
  const Sim::json& state = Sim::Query(Op("Refresh"));
  auto snapshot = std::make_shared<Snapshot>();
  snapshot->pnic = Sim::RequirePnic(state, name_);
  snapshot->generation = Sim::SimHost::PinnedGeneration();
  snapshot_ = std::move(snapshot);
}

std::string PnicImpl::GetName() const {
  Sim::Query(Op("GetName"));
  return name_;
}

PciDevice PnicImpl::GetPciDevice() const {
  Sim::Query(Op("GetPciDevice"));
  const Sim::json& pci = Sim::ObjectAt(Current().pnic, "pci");
  return PciDevice{Sim::StringAt(pci, "address"), Sim::StringAt(pci, "vendorName"),
                   Sim::StringAt(pci, "deviceName"), Sim::StringAt(pci, "description")};
}

HostMgr::Network::MacAddress PnicImpl::GetMacAddress() const {
  Sim::Query(Op("GetMacAddress"));
  return HostMgr::Network::MacAddress::FromString(
      Sim::StringAt(Current().pnic, "mac", "00:00:00:00:00:00"));
}

bool PnicImpl::IsLinkUp() const {
  Sim::Query(Op("IsLinkUp"));
  return Current().pnic.value("linkUp", false);
}

int PnicImpl::GetLinkSpeed() const {
  Sim::Query(Op("GetLinkSpeed"));
  return Current().pnic.value("linkUp", false) ? Current().pnic.value("speedMbps", 0) : 0;
}

std::string PnicImpl::GetDriver() const {
  Sim::Query(Op("GetDriver"));
  return Sim::StringAt(Current().pnic, "driver");
}

}  // namespace HykCtl::Network
