#include "ProcessProbe.h"

#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

namespace TulkBench {
namespace {

std::uint64_t StatusField(const std::filesystem::path& status, const std::string& field) {
  std::ifstream in(status);
  std::string line;
  while (std::getline(in, line)) {
    if (line.compare(0, field.size(), field) == 0) {
      return std::stoull(line.substr(field.size()));
    }
  }
  return 0;
}

}  // namespace

ProcessUsage ReadUsage(pid_t pid) {
  ProcessUsage usage;
  std::filesystem::path proc = "/proc/" + std::to_string(pid);
  std::ifstream stat(proc / "stat");
  std::string text;
  std::getline(stat, text);
  auto close = text.rfind(')');
  if (close != std::string::npos) {
    std::istringstream fields(text.substr(close + 2));
    std::string field;
    unsigned long utime = 0, stime = 0;
    for (int index = 3; fields >> field; ++index) {
      if (index == 14) {
        utime = std::stoul(field);
      } else if (index == 15) {
        stime = std::stoul(field);
        break;
      }
    }
    usage.cpuMillis =
        static_cast<double>(utime + stime) * 1000.0 / static_cast<double>(sysconf(_SC_CLK_TCK));
  }
  usage.peakResidentKiB = StatusField(proc / "status", "VmHWM:");
  std::error_code error;
  for (const auto& task : std::filesystem::directory_iterator(proc / "task", error)) {
    usage.contextSwitches += StatusField(task.path() / "status", "voluntary_ctxt_switches:");
    usage.contextSwitches += StatusField(task.path() / "status", "nonvoluntary_ctxt_switches:");
  }
  return usage;
}

}  // namespace TulkBench
