#include "platform/api/Host.h"

#include "platform/sim/SimState.h"

namespace HostMgr {
namespace {

std::string Op(const char* method) {
  return std::string("HostMgr::Host::") + method;
}

class SimulatedHost final : public Host {
 public:
  HardwareInfo GetHardwareInfo() const override {
    const Sim::json& hardware = Sim::ObjectAt(Sim::Query(Op("GetHardwareInfo")), "hardware");
    const Sim::json& bios = Sim::ObjectAt(hardware, "bios");
    const Sim::json& firmware = Sim::ObjectAt(hardware, "firmware");
    HardwareInfo info;
    info.vendor = Sim::StringAt(hardware, "vendor");
    info.model = Sim::StringAt(hardware, "product");
    info.serialNumber = Sim::StringAt(hardware, "serialNumber");
    info.serviceTag = Sim::StringAt(hardware, "serviceTag");
    info.assetTag = Sim::StringAt(hardware, "assetTag");
    info.biosVendor = Sim::StringAt(bios, "vendor");
    info.biosVersion = Sim::StringAt(bios, "version");
    info.biosMajorRelease = bios.value("majorRelease", 0);
    info.biosMinorRelease = bios.value("minorRelease", 0);
    info.biosReleaseDate = Sim::StringAt(bios, "releaseDate");
    info.bmcVersion = Sim::StringAt(firmware, "bmc");
    info.cpldVersion = Sim::StringAt(firmware, "cpld");
    info.plsaVersion = Sim::StringAt(firmware, "plsa");
    return info;
  }

  StorageInfo GetStorageInfo() const override {
    const Sim::json& storage = Sim::ObjectAt(Sim::Query(Op("GetStorageInfo")), "storage");
    StorageInfo info;
    for (const Sim::json& adapter : Sim::ArrayAt(storage, "adapters")) {
      info.adapters.push_back({Sim::StringAt(adapter, "name"), Sim::StringAt(adapter, "driver"),
                               Sim::StringAt(adapter, "version"),
                               Sim::StringAt(adapter, "description")});
    }
    return info;
  }

  SystemInfo GetSystemInfo() const override {
    const Sim::json& product = Sim::ObjectAt(Sim::Query(Op("GetSystemInfo")), "product");
    SystemInfo info;
    info.productName = Sim::StringAt(product, "name");
    info.version = Sim::StringAt(product, "version");
    info.build = Sim::StringAt(product, "build");
    info.kernelRelease = Sim::StringAt(product, "kernelRelease");
    info.fullName = info.productName + " " + info.version + " build-" + info.build;
    info.uuid = Sim::StringAt(product, "uuid");
    return info;
  }
};

}  // namespace

const StorageAdapter* StorageInfo::FindAdapter(const std::string& name) const {
  for (const StorageAdapter& adapter : adapters) {
    if (adapter.name == name) {
      return &adapter;
    }
  }
  return nullptr;
}

std::unique_ptr<Host> HostFactory::GetHost() {
  Sim::Query("HostMgr::HostFactory::GetHost");
  return std::make_unique<SimulatedHost>();
}

}  // namespace HostMgr
