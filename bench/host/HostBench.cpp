// Command runner and inventory queries, measured in a scratch root on the
// built-in demo host:
//   tulk-host-bench [--benchmark_filter=...]
// The runner cases spawn a trivial program and wait for its captured exit,
// or kill one at its time limit; the inventory cases run one query each.

#include <benchmark/benchmark.h>
#include <stdlib.h>
#include <unistd.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

#include "ScratchFolder.h"
#include "host/CommandRunner.h"
#include "host/HardwareInventory.h"
#include "host/ManagementNetwork.h"
#include "host/NetworkInventory.h"

namespace {

namespace fs = std::filesystem;

void RunTrivial(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(
        Tulk::RunCommand("/bin/true", {"true"}, nullptr, nullptr, nullptr, nullptr, nullptr, 0, 0));
  }
}
BENCHMARK(RunTrivial)->Unit(benchmark::kMicrosecond)->UseRealTime();

void RunCapturedWithTimeout(benchmark::State& state) {
  char output[Tulk::kCaptureBufferSize];
  char error[Tulk::kCaptureBufferSize];
  for (auto _ : state) {
    std::int32_t outputLength = sizeof output;
    std::int32_t errorLength = sizeof error;
    int rc = Tulk::RunCommand("/bin/echo", {"echo", "captured"}, output, &outputLength, error,
                              &errorLength, "input", 5, 5);
    if (rc != 0 || outputLength != 9) {
      state.SkipWithError("unexpected result");
    }
  }
}
BENCHMARK(RunCapturedWithTimeout)->Unit(benchmark::kMicrosecond)->UseRealTime();

// A command that outlives its time limit of one second: the time from the
// limit to the captured exit of the killed child ("past_limit_ms"). The
// runner polls the child, so a late poll shows here.
void KillAtTimeLimit(benchmark::State& state) {
  double pastLimit = 0;
  for (auto _ : state) {
    const auto start = std::chrono::steady_clock::now();
    int rc = Tulk::RunCommand("/bin/sh", {"sh", "-c", "sleep 5"}, nullptr, nullptr, nullptr,
                              nullptr, nullptr, 0, 1);
    pastLimit += std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() -
                                                           start - std::chrono::seconds(1))
                     .count();
    if (rc != -1) {
      state.SkipWithError("the command was not killed");
    }
  }
  state.counters["past_limit_ms"] =
      benchmark::Counter(pastLimit, benchmark::Counter::kAvgIterations);
}
BENCHMARK(KillAtTimeLimit)->Iterations(3)->Unit(benchmark::kMillisecond)->UseRealTime();

void RunShellLine(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(Tulk::RunShellCommand("exit 0"));
  }
}
BENCHMARK(RunShellLine)->Unit(benchmark::kMicrosecond)->UseRealTime();

template <typename Record, bool (*Query)(std::vector<Record>&)>
void ListQuery(benchmark::State& state) {
  for (auto _ : state) {
    std::vector<Record> rows;
    if (!Query(rows)) {
      state.SkipWithError("query failed");
    }
    benchmark::DoNotOptimize(rows);
  }
}
BENCHMARK(ListQuery<Tulk::HykNicInfo, Tulk::GetKernelNicList>)->Name("GetKernelNicList");
BENCHMARK(ListQuery<Tulk::PortGroupInfo, Tulk::GetPortGroupList>)->Name("GetPortGroupList");
BENCHMARK(ListQuery<Tulk::SwitchSummary, Tulk::ScanVirtualSwitches>)->Name("ScanVirtualSwitches");
BENCHMARK(ListQuery<Tulk::SwitchSummary, Tulk::GetStandardSwitchList>)
    ->Name("GetStandardSwitchList");

void GetPhysicalNicList(benchmark::State& state) {
  std::vector<Tulk::SwitchSummary> switches;
  Tulk::ScanVirtualSwitches(switches);
  Tulk::PnicUsage usage = Tulk::BuildPnicUsage(switches);
  for (auto _ : state) {
    std::vector<Tulk::PnicRow> rows;
    if (!Tulk::GetPhysicalNicList(rows, usage)) {
      state.SkipWithError("query failed");
    }
    benchmark::DoNotOptimize(rows);
  }
}
BENCHMARK(GetPhysicalNicList);

template <auto Query>
void TextQuery(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(Query());
  }
}
BENCHMARK(TextQuery<Tulk::GetManagementInterface>)->Name("GetManagementInterface");
BENCHMARK(TextQuery<Tulk::GetManagementIpv4Address>)->Name("GetManagementIpv4Address");
BENCHMARK(TextQuery<Tulk::GetHostFqdn>)->Name("GetHostFqdn");
BENCHMARK(TextQuery<Tulk::FormatMemorySize>)->Name("FormatMemorySize");
BENCHMARK(TextQuery<Tulk::IsManagementOnDistributedSwitch>)
    ->Name("IsManagementOnDistributedSwitch");

void GetVersionString(benchmark::State& state) {
  for (auto _ : state) {
    benchmark::DoNotOptimize(Tulk::GetVersionString(static_cast<int>(state.range(0))));
  }
}
BENCHMARK(GetVersionString)->DenseRange(1, 4);

// A scratch root whose /bin holds the few real programs the runner cases
// start, so nothing of the real machine is run or changed.
void PrepareRoot(const fs::path& root) {
  fs::create_directories(root / "bin");
  fs::create_directories(root / "sbin");
  for (const char* program : {"true", "echo", "sh", "sleep"}) {
    for (const char* folder : {"/usr/bin", "/bin"}) {
      fs::path real = fs::path(folder) / program;
      if (access(real.c_str(), X_OK) == 0) {
        fs::create_symlink(real, root / "bin" / program);
        break;
      }
    }
  }
}

}  // namespace

int main(int argc, char** argv) {
  TulkBench::ScratchFolder root("tulk-host-bench");
  if (root.Path().empty()) {
    return 1;
  }
  PrepareRoot(root.Path());
  setenv("TULK_ROOT", root.Path().c_str(), 1);
  unsetenv("TULK_HOST_STATE");
  return TulkBench::RunBenchmarks(argc, argv);
}
