#include "platform/tool/Tavcli.h"

#include <charconv>
#include <map>

#include "platform/api/HostMgrException.h"
#include "platform/api/PortGroupImpl.h"
#include "platform/api/Portset.h"
#include "platform/api/PortsetImpl.h"
#include "platform/api/VirtualSwitchInfoImpl.h"
#include "platform/sim/SimHost.h"
#include "platform/sim/SimState.h"

namespace Sim::Tools {
namespace {

// The words of a command and its options ("-o X", "--option=X",
// "--option X"), with the global "--formatter" taken out.
struct Command {
  std::vector<std::string> words;
  std::map<std::string, std::string> options;
  std::string formatter;
};

const std::map<std::string, std::string> kLongOptions = {
    {"--option", "-o"},       {"--int-value", "-i"},     {"--vibname", "-n"},
    {"--vswitch-name", "-v"}, {"--uplink-name", "-u"},   {"--portgroup-name", "-p"},
    {"--ports", "-P"},        {"--vlan-id", "--vlan-id"}};

Command Parse(const std::vector<std::string>& args) {
  Command command;
  for (std::size_t i = 0; i < args.size(); ++i) {
    std::string arg = args[i];
    std::string value;
    bool hasValue = false;
    if (arg.rfind("--", 0) == 0) {
      if (auto equals = arg.find('='); equals != std::string::npos) {
        value = arg.substr(equals + 1);
        arg = arg.substr(0, equals);
        hasValue = true;
      }
      if (arg == "--formatter") {
        command.formatter = hasValue ? value : (i + 1 < args.size() ? args[++i] : "");
        continue;
      }
      auto known = kLongOptions.find(arg);
      if (known != kLongOptions.end()) {
        arg = known->second;
      }
    }
    if (arg.size() > 1 && arg[0] == '-') {
      command.options[arg] = hasValue ? value : (i + 1 < args.size() ? args[++i] : "");
    } else {
      command.words.push_back(arg);
    }
  }
  return command;
}

bool Is(const Command& command, std::initializer_list<const char*> words) {
  if (command.words.size() != words.size()) {
    return false;
  }
  std::size_t i = 0;
  for (const char* word : words) {
    if (command.words[i++] != word) {
      return false;
    }
  }
  return true;
}

std::string Option(const Command& command, const char* name) {
  auto found = command.options.find(name);
  if (found == command.options.end() || found->second.empty()) {
    Fail(std::string("Missing required parameter ") + name);
  }
  return found->second;
}

int Integer(const std::string& text, const char* what) {
  int value = 0;
  auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
  if (error != std::errc() || end != text.data() + text.size()) {
    Fail(std::string("Invalid value for ") + what + ": " + text);
  }
  return value;
}

int AdvancedSet(const Command& command) {
  const std::string path = Option(command, "-o");
  const int value = Integer(Option(command, "-i"), "--int-value");
  SimHost::Instance().Modify(
      [&](json& state) { ObjectFor(state, "advancedOptions")[path] = value; });
  return 0;
}

int AdvancedList(ToolRun& run, const Command& command) {
  const std::string path = Option(command, "-o");
  const json& options = ObjectAt(SimHost::Instance().State(), "advancedOptions");
  auto found = options.find(path);
  if (found == options.end()) {
    Fail("Unable to find option " + path);
  }
  run.Out("   Path: " + path +
          "\n   Type: integer\n   Int Value: " + std::to_string(found->get<std::int64_t>()) + "\n");
  return 0;
}

int PackageGet(ToolRun& run, const Command& command) {
  const std::string name = Option(command, "-n");
  const json& packages = ObjectAt(SimHost::Instance().State(), "packages");
  auto found = packages.find(name);
  if (found == packages.end()) {
    run.Err("[NoMatch] No installed package matches the name '" + name + "'\n");
    return 1;
  }
  static const std::pair<const char*, const char*> kFields[] = {
      {"Name", nullptr},
      {"Version", "version"},
      {"Vendor", "vendor"},
      {"Summary", "summary"},
      {"AcceptanceLevel", "acceptanceLevel"},
      {"InstallDate", "installDate"}};
  const bool keyValue = command.formatter == "keyvalue";
  if (!keyValue) {
    run.Out(name + "\n");
  }
  for (const auto& [label, key] : kFields) {
    const std::string value = key == nullptr ? name : StringAt(*found, key);
    run.Out(keyValue ? "SoftwarePackage." + std::string(label) + ".string=" + value + "\n"
                     : "   " + std::string(label) + ": " + value + "\n");
  }
  return 0;
}

int Vswitch(ToolRun& run, const Command& command) {
  using HykCtl::Network::PortsetImpl;
  const std::vector<std::string>& w = command.words;
  const std::string sub = w.size() > 3 ? w[3] : "";
  const std::string action = w.size() > 4 ? w[4] : "";
  if (sub == "list" && w.size() == 4) {
    for (PortsetImpl& vswitch : HykCtl::Network::VirtualSwitchInfoImpl().GetVirtualSwitches()) {
      std::string uplinks;
      for (const std::string& uplink : vswitch.GetUplinks()) {
        uplinks += (uplinks.empty() ? "" : ", ") + uplink;
      }
      run.Out(vswitch.GetName() + "\n   Num Ports: " + std::to_string(vswitch.GetNumPorts()) +
              "\n   Uplinks: " + uplinks + "\n");
    }
    return 0;
  }
  if (sub == "add" && w.size() == 4) {
    const auto ports = command.options.count("-P") ? Integer(Option(command, "-P"), "--ports")
                                                   : HostMgr::Network::Portset::DEF_NUM_PORTS;
    HykCtl::Network::VirtualSwitchInfoImpl().AddVirtualSwitch(Option(command, "-v"), ports);
  } else if (sub == "remove" && w.size() == 4) {
    HykCtl::Network::VirtualSwitchInfoImpl().RemoveVirtualSwitch(Option(command, "-v"));
  } else if (sub == "uplink" && (action == "add" || action == "remove") && w.size() == 5) {
    PortsetImpl vswitch(Option(command, "-v"));
    const std::string uplink = Option(command, "-u");
    HostMgr::Network::NicTeamingPolicy policy = vswitch.GetTeamingPolicy();
    std::vector<std::string> order = policy.GetUplinkOrder();
    if (action == "add") {
      vswitch.AddUplink(uplink);
      order.push_back(uplink);
      policy.SetMaxActiveUplinks(policy.GetMaxActiveUplinks() + 1);
    } else {
      vswitch.RemoveUplink(uplink);
      std::erase(order, uplink);
      policy.SetMaxActiveUplinks(std::max(0, policy.GetMaxActiveUplinks() - 1));
    }
    policy.SetUplinkOrder(order);
    vswitch.SetTeamingPolicy(policy);
  } else if (sub == "portgroup" && action == "add" && w.size() == 5) {
    PortsetImpl(Option(command, "-v")).AddPortGroup(Option(command, "-p"));
  } else if (sub == "portgroup" && action == "remove" && w.size() == 5) {
    PortsetImpl(Option(command, "-v")).RemovePortGroup(Option(command, "-p"));
  } else if (sub == "portgroup" && action == "set" && w.size() == 5) {
    HykCtl::Network::PortGroupImpl(Option(command, "-p"))
        .SetVlanId(Integer(Option(command, "--vlan-id"), "--vlan-id"));
  } else {
    return -1;
  }
  return 0;
}

}  // namespace

int Tavcli(ToolRun& run) {
  const Command command = Parse(run.Args());
  try {
    int status = -1;
    if (Is(command, {"system", "settings", "advanced", "set"})) {
      status = AdvancedSet(command);
    } else if (Is(command, {"system", "settings", "advanced", "list"})) {
      status = AdvancedList(run, command);
    } else if (Is(command, {"software", "vib", "get"})) {
      status = PackageGet(run, command);
    } else if (command.words.size() >= 4 && command.words[0] == "network" &&
               command.words[1] == "vswitch" && command.words[2] == "standard") {
      status = Vswitch(run, command);
    }
    if (status < 0) {
      std::string words;
      for (const std::string& word : command.words) {
        words += " " + word;
      }
      run.Err("Error: Unknown command or namespace" + words + "\n");
      return 1;
    }
    return status;
  } catch (const HostMgr::Lib::HostMgrException& error) {
    run.Err(std::string("Error: ") + error.what() + "\n");
    return 1;
  }
}

}  // namespace Sim::Tools
