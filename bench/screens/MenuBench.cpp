// What the System Customization menu asks of the host, measured in a
// scratch root with the simulated tools on the built-in demo host:
//   tulk-menu-bench [--benchmark_filter=...]
// MenuHostState is the work of building the menu (osk-cmd queries, the
// management NIC, the network-boot option); the support values are what
// one draw of a support page with that key costs.

#include <benchmark/benchmark.h>
#include <stdlib.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "ScratchFolder.h"
#include "screens/LogTable.h"
#include "screens/MenuEntries.h"
#include "screens/SupportValues.h"

namespace {

namespace fs = std::filesystem;

void MenuHostState(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(Tulk::ReadMenuHostState());
  }
}
BENCHMARK(MenuHostState)->Unit(benchmark::kMillisecond)->UseRealTime();

void Thumbprint(benchmark::State& state) {
  for (auto _ : state) {
    if (Tulk::CertificateThumbprint(static_cast<unsigned>(state.range(0))).empty()) {
      state.SkipWithError("no thumbprint");
    }
  }
}
BENCHMARK(Thumbprint)->Arg(1)->Arg(256)->Arg(512)->Unit(benchmark::kMillisecond)->UseRealTime();

void HostKeyFingerprint(benchmark::State& state) {
  for (auto _ : state) {
    if (Tulk::HostKeyFingerprint(Tulk::kRsaHostKeyPath).empty()) {
      state.SkipWithError("no fingerprint");
    }
  }
}
BENCHMARK(HostKeyFingerprint)->Unit(benchmark::kMillisecond)->UseRealTime();

void DescribeLogs(benchmark::State& state) {
  Tulk::LogTable table;
  for (auto _ : state) {
    benchmark::DoNotOptimize(table.Describe());
  }
}
BENCHMARK(DescribeLogs)->Unit(benchmark::kMicrosecond);

// Installs the simulated host's tools, a certificate, an SSH host key and a
// log into `root`; false when a step failed.
bool PrepareRoot(const fs::path& root) {
#ifdef TULK_BENCH_HOSTTOOL
  const std::string install = std::string(TULK_BENCH_HOSTTOOL) + " --install " + root.string();
  if (std::system(install.c_str()) != 0) {
    return false;
  }
#endif
  const std::string ssl = (root / "etc/brimlo/ssl").string();
  const std::string ssh = (root / "etc/ssh").string();
  const std::string keys =
      "mkdir -p " + ssl + " " + ssh +
      " && openssl req -x509 -newkey rsa:2048 -nodes -subj /CN=bench -days 2 -keyout " + ssl +
      "/host.key -out " + ssl + "/host.crt 2>/dev/null && ssh-keygen -q -t rsa -b 3072 -N '' -f " +
      ssh + "/ssh_host_rsa_key";
  if (std::system(keys.c_str()) != 0) {
    return false;
  }
  fs::create_directories(root / "var/log");
  std::ofstream(root / "var/log/syslog.log") << "log\n";
  return true;
}

}  // namespace

int main(int argc, char** argv) {
  TulkBench::ScratchFolder root("tulk-menu-bench");
  if (root.Path().empty() || !PrepareRoot(root.Path())) {
    return 1;
  }
  setenv("TULK_ROOT", root.Path().c_str(), 1);
  unsetenv("TULK_HOST_STATE");
  return TulkBench::RunBenchmarks(argc, argv);
}
