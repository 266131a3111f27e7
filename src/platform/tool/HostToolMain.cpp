// tulk-hosttool: the simulated host's command-line tools in one program,
// chosen by the name it runs under (or "--as <name>"); also lays out a
// host root ("--install <root>") and prints the demo host
// ("--demo-state"). See docs/simulated-host.md.

#include <unistd.h>

#include <climits>
#include <cstdio>
#include <cstdlib>
#include <map>
#include <string>
#include <vector>

#include "platform/api/HostMgrException.h"
#include "platform/sim/DemoHost.h"
#include "platform/sim/SimHost.h"
#include "platform/tool/Installer.h"
#include "platform/tool/Maintenance.h"
#include "platform/tool/OskCmd.h"
#include "platform/tool/Power.h"
#include "platform/tool/Services.h"
#include "platform/tool/Tavcli.h"
#include "platform/tool/ToolRun.h"

namespace {

using Tool = int (*)(Sim::Tools::ToolRun&);

const std::map<std::string, Tool>& Tools() {
  static const std::map<std::string, Tool> tools = {
      {"tavcli", Sim::Tools::Tavcli},
      {"localcli", Sim::Tools::Tavcli},
      {"osk-cmd", Sim::Tools::OskCmd},
      {"powerOffVms", Sim::Tools::PowerOffVms},
      {"poweroff", Sim::Tools::PowerOff},
      {"reboot", Sim::Tools::Reboot},
      {"TavShell", Sim::Tools::InitScript},
      {"SSH", Sim::Tools::InitScript},
      {"zyo-opsagent", Sim::Tools::InitScript},
      {"services.sh", Sim::Tools::ServicesScript},
      {"hykping", Sim::Tools::Ping},
      {"hykbacktrace", Sim::Tools::Backtrace},
      {"firmwareConfig.py", Sim::Tools::FirmwareConfig},
      {"backup.sh", Sim::Tools::Backup},
  };
  return tools;
}

std::string SelfPath(const char* argv0) {
  char buffer[PATH_MAX];
  const ssize_t length = readlink("/proc/self/exe", buffer, sizeof buffer - 1);
  if (length > 0) {
    return std::string(buffer, static_cast<std::size_t>(length));
  }
  char* resolved = realpath(argv0, nullptr);
  std::string path = resolved != nullptr ? resolved : argv0;
  std::free(resolved);
  return path;
}

int Usage() {
  std::fprintf(stderr,
               "usage: tulk-hosttool --install <root> | --demo-state [dvs] | --as <tool> [args]\n"
               "       or run under a tool's name (tavcli, osk-cmd, reboot, ...)\n");
  return 2;
}

// The state must be named explicitly: a tool never invents a host.
bool StateNamed() {
  const char* path = std::getenv("TULK_HOST_STATE");
  if (path != nullptr && *path != '\0') {
    return true;
  }
  const std::string rootFile = Sim::RootStateFile();
  return std::getenv("TULK_ROOT") != nullptr && access(rootFile.c_str(), F_OK) == 0;
}

// A root that is named but is not a scratch root (it resolves to "/" or
// does not exist): the tool's records and files would land on the machine.
bool RootUnsafe() {
  const char* root = std::getenv("TULK_ROOT");
  return root != nullptr && *root != '\0' && Sim::ResolvedScratchRoot().empty();
}

}  // namespace

int main(int argc, char** argv) {
  std::vector<std::string> args(argv + 1, argv + argc);
  std::string name = argv[0];
  name = name.substr(name.rfind('/') + 1);
  if (name == "tulk-hosttool") {
    if (args.size() == 2 && args[0] == "--install") {
      const std::string error = Sim::Tools::InstallRoot(args[1], SelfPath(argv[0]));
      if (!error.empty()) {
        std::fprintf(stderr, "tulk-hosttool: %s\n", error.c_str());
        return 1;
      }
      return 0;
    }
    if (args.size() == 1 && args[0] == "--demo-state") {
      std::printf("%s\n", Sim::DemoHostState().dump(2).c_str());
      return 0;
    }
    if (args.size() == 2 && args[0] == "--demo-state" && args[1] == "dvs") {
      std::printf("%s\n", Sim::DistributedSwitchDemoHostState().dump(2).c_str());
      return 0;
    }
    if (args.size() >= 2 && args[0] == "--as") {
      name = args[1];
      args.erase(args.begin(), args.begin() + 2);
    } else {
      return Usage();
    }
  }
  auto tool = Tools().find(name);
  if (tool == Tools().end()) {
    std::fprintf(stderr, "tulk-hosttool: unknown tool %s\n", name.c_str());
    return Usage();
  }
  if (!StateNamed()) {
    std::fprintf(stderr, "%s: no host state (set TULK_HOST_STATE)\n", name.c_str());
    return 1;
  }
  if (RootUnsafe()) {
    std::fprintf(stderr, "%s: refusing to act on the real root (TULK_ROOT resolves to /)\n",
                 name.c_str());
    return 1;
  }
  try {
    Sim::SimHost::Instance().Load();
    Sim::Tools::ToolRun run(name, args);
    run.Delay();
    int status = 0;
    if (!run.Suppressed()) {
      try {
        status = tool->second(run);
      } catch (const HostMgr::Lib::HostMgrException& error) {
        run.Err(name + ": " + error.what() + "\n");
        status = 1;
      }
    }
    return run.Finish(status);
  } catch (const Sim::StateError& error) {
    std::fprintf(stderr, "%s: %s\n", name.c_str(), error.what());
    return 1;
  } catch (const HostMgr::Lib::HostMgrException& error) {
    std::fprintf(stderr, "%s: %s\n", name.c_str(), error.what());
    return 1;
  }
}
