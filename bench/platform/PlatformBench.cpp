// Queries of the simulated host as the console makes them, on the demo
// host in a scratch state file.

#include <benchmark/benchmark.h>
#include <stdlib.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>

#include "ScratchFolder.h"
#include "platform/api/AdvancedOption.h"
#include "platform/api/DnsConfigImpl.h"
#include "platform/api/HykernelNicInfoImpl.h"
#include "platform/api/MemoryInfoImpl.h"
#include "platform/api/NetworkInfoImpl.h"
#include "platform/api/PnicImpl.h"
#include "platform/api/SystemInfoImpl.h"
#include "platform/api/SystemInformation.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "platform/sim/DemoHost.h"
#include "platform/sim/SimHost.h"

namespace {

using namespace HykCtl::Network;

// Welcome screen: the management NIC's IP configuration.
void ManagementAddress(benchmark::State& state) {
  for (auto _ : state) {
    NetworkInfoImpl network;
    network.UpdateManagementInterface();
    auto nic = network.GetManagementInterface();
    if (nic->IsStale()) {
      nic->Refresh();
    }
    benchmark::DoNotOptimize(nic->GetIpConfig().GetIpv4Address().GetStringAddress());
  }
}
BENCHMARK(ManagementAddress);

// Adapter dialog: every physical NIC's row.
void PhysicalNicRows(benchmark::State& state) {
  for (auto _ : state) {
    for (const std::string& name : NetworkInfoImpl().GetPnics()) {
      PnicImpl pnic(name);
      benchmark::DoNotOptimize(pnic.GetPciDevice().description);
      benchmark::DoNotOptimize(pnic.GetMacAddress().GetStringAddress());
      benchmark::DoNotOptimize(pnic.IsLinkUp());
    }
  }
}
BENCHMARK(PhysicalNicRows);

// Switch scan: standard and distributed switches with their lists.
void SwitchScan(benchmark::State& state) {
  for (auto _ : state) {
    VirtualSwitchInfoImpl info;
    std::vector<PortsetImpl> switches = info.GetVirtualSwitches();
    for (PortsetImpl& dvs : info.GetDVSwitches()) {
      switches.push_back(dvs);
    }
    {
      for (PortsetImpl& vswitch : switches) {
        benchmark::DoNotOptimize(vswitch.GetUplinks());
        benchmark::DoNotOptimize(vswitch.GetPortGroups());
        benchmark::DoNotOptimize(vswitch.GetNumPorts() + vswitch.GetUsedPorts() +
                                 vswitch.GetConfiguredPorts());
      }
    }
  }
}
BENCHMARK(SwitchScan);

// Kernel NIC list with connection points.
void KernelNicRows(benchmark::State& state) {
  for (auto _ : state) {
    for (HykNicImpl& nic : HykernelNicInfoImpl().GetHykernelNics(0)) {
      benchmark::DoNotOptimize(nic.GetConnectionPoint());
      benchmark::DoNotOptimize(nic.GetMacAddress().GetStringAddress());
    }
  }
}
BENCHMARK(KernelNicRows);

// Single values: host name, memory, an option, the version node, the
// welcome message.
void SmallQueries(benchmark::State& state) {
  for (auto _ : state) {
    DnsConfigImpl dns;
    benchmark::DoNotOptimize(dns.GetHostname() + "." + dns.GetDomain());
    HykCtl::Hardware::MemoryInfoImpl memory;
    benchmark::DoNotOptimize(memory.GetTotalPages() * memory.GetPageSize());
    benchmark::DoNotOptimize(
        HykCtl::Adv::UserAdvancedOptionImpl().GetUserOption("/UserVars/TulkTimeOut"));
    HSI_SystemVersion version;
    benchmark::DoNotOptimize(HSI_Get(HSI_NODE_system_version, &version, sizeof version));
    benchmark::DoNotOptimize(HykCtl::System::SystemInfoImpl().GetWelcomeMessage());
  }
}
BENCHMARK(SmallQueries);

// A query right after another process replaced the state file.
void QueryAfterExternalChange(benchmark::State& state) {
  const std::string path = Sim::SimHost::Instance().Path();
  const std::string text = Sim::DemoHostState().dump(2);
  for (auto _ : state) {
    state.PauseTiming();
    Sim::WriteFileAtomically(path, text);
    state.ResumeTiming();
    benchmark::DoNotOptimize(DnsConfigImpl().GetHostname());
  }
}
BENCHMARK(QueryAfterExternalChange);

// A change: lock, write a temporary file, fsync, rename.
void Change(benchmark::State& state) {
  PortGroupImpl group("Management Network");
  int vlan = 0;
  for (auto _ : state) {
    group.SetVlanId(vlan++ % 4000);
  }
}
BENCHMARK(Change)->Unit(benchmark::kMillisecond);

#ifdef TULK_BENCH_HOSTTOOL
// Laying the simulated tools out in a root that already holds them (every
// screen test does it once for a fresh root, then again when asked).
void InstallToolsAgain(benchmark::State& state) {
  TulkBench::ScratchFolder root("tulk-bench-install");
  const std::string install =
      std::string(TULK_BENCH_HOSTTOOL) + " --install " + root.Path().string();
  if (root.Path().empty() || std::system(install.c_str()) != 0) {
    state.SkipWithError("install failed");
    return;
  }
  for (auto _ : state) {
    if (std::system(install.c_str()) != 0) {
      state.SkipWithError("install failed");
    }
  }
}
BENCHMARK(InstallToolsAgain)->Unit(benchmark::kMillisecond)->UseRealTime();
#endif

}  // namespace

int main(int argc, char** argv) {
  TulkBench::ScratchFolder scratch("tulk-bench");
  if (scratch.Path().empty()) {
    return 1;
  }
  const std::filesystem::path& folder = scratch.Path();
  std::filesystem::create_directories(folder / "root");
  std::ofstream(folder / "host-state.json") << Sim::DemoHostState().dump(2);
  setenv("TULK_ROOT", (folder / "root").c_str(), 1);
  setenv("TULK_HOST_STATE", (folder / "host-state.json").c_str(), 1);
  Sim::SimHost::Instance().Load();
  return TulkBench::RunBenchmarks(argc, argv);
}
