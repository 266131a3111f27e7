#include "host/HostTools.h"

#include <syslog.h>

#include "host/CommandRunner.h"
#include "include/ProcessFlags.h"
#include "platform/api/AdvancedOption.h"
#include "platform/api/HostMgrException.h"
#include "runtime/HostQueryScope.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

constexpr int kOskUnusableUser = 255;
constexpr std::size_t kOskUserIndex = 2;

void LogOutcome(const std::vector<std::string>& arguments, int rc, const char* output) {
  std::string command = CommandText(arguments);
  if (rc != 0) {
    Log(LOG_ERR, "Command \"%s\" failed (rc=%d): %s", command.c_str(), rc, output);
  } else {
    Log(LOG_INFO, "Command \"%s\" succeeded", command.c_str());
  }
}

std::string Trimmed(const std::string& text) {
  const char* blanks = " \t\r\n";
  std::size_t first = text.find_first_not_of(blanks);
  if (first == std::string::npos) {
    return {};
  }
  return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

}  // namespace

std::string ConsoleUser() {
  return currentUser.empty() ? std::string(kOskFallbackUser) : currentUser;
}

int RunTavcli(const std::vector<std::string>& arguments, int timeoutSeconds) {
  char output[kCaptureBufferSize];
  std::int32_t outputLength = kCaptureBufferSize;
  int rc = RunCommand("/bin/tavcli", arguments, output, &outputLength, nullptr, nullptr, nullptr, 0,
                      timeoutSeconds);
  LogOutcome(arguments, rc, output);
  return rc;
}

int RunStandardSwitchCommand(const std::vector<std::string>& subcommandAndOptions) {
  std::vector<std::string> arguments = {"tavcli", "network", "vswitch", "standard"};
  arguments.insert(arguments.end(), subcommandAndOptions.begin(), subcommandAndOptions.end());
  return RunTavcli(arguments);
}

int RunOskCmd(std::vector<std::string> arguments, std::string* output, int timeoutSeconds) {
  char out[kCaptureBufferSize];
  char err[kCaptureBufferSize];
  std::int32_t outLength = kCaptureBufferSize;
  std::int32_t errLength = kCaptureBufferSize;
  int rc = RunCommand("/bin/osk-cmd", arguments, out, &outLength, err, &errLength, nullptr, 0,
                      timeoutSeconds);
  if (rc == kOskUnusableUser && arguments.size() > kOskUserIndex) {
    std::vector<std::string> command(arguments.begin() + kOskUserIndex + 1, arguments.end());
    Log(LOG_INFO, "Unable to execute command osk-cmd %s using user %s. Using user %s",
        CommandText(command).c_str(), arguments[kOskUserIndex].c_str(), kOskFallbackUser);
    arguments[kOskUserIndex] = kOskFallbackUser;
    outLength = kCaptureBufferSize;
    errLength = kCaptureBufferSize;
    rc = RunCommand("/bin/osk-cmd", arguments, out, &outLength, err, &errLength, nullptr, 0,
                    timeoutSeconds);
  }
  LogOutcome(arguments, rc, rc != 0 && outLength == 0 ? err : out);
  if (output != nullptr) {
    output->assign(out, static_cast<std::size_t>(outLength));
  }
  return rc;
}

int RunOskCommand(const std::string& command) {
  return RunOskCmd({"osk-cmd", "-U", ConsoleUser(), command});
}

int RunOskCmdGet(const std::string& path, std::string& value) {
  HostQueryScope query;
  Log(LOG_INFO, "osk-cmd invocation: get %s", path.c_str());
  std::string output;
  int rc = RunOskCmd({"osk-cmd", "-U", ConsoleUser(), "get", path}, &output, kQueryTimeoutSeconds);
  value = Trimmed(output);
  return rc;
}

bool OskCmdGetFlag(const std::string& path) {
  std::string value;
  return RunOskCmdGet(path, value) == 0 && value == "true";
}

int PowerOffVirtualMachines(bool graceful) {
  RunOskCmd({"osk-cmd", "-U", ConsoleUser(), "hostsvc/autostartmanager/autostop"}, nullptr,
            kPowerOffVmsTimeoutSeconds);
  std::vector<std::string> arguments = {"powerOffVms"};
  if (!graceful) {
    arguments.emplace_back("--terminate");
  }
  return RunLoggedCommand("/bin/powerOffVms", arguments, nullptr, kPowerOffVmsTimeoutSeconds);
}

bool SetAdvancedOption(const std::string& path, std::int64_t value) {
  std::vector<std::string> environment = {"TAV_USERNAME=" + ConsoleUser(),
                                          "TAV_AUDIT_IP=127.0.0.1"};
  std::vector<std::string> arguments = {"tavcli", "system", "settings", "advanced",           "set",
                                        "-o",     path,     "-i",       std::to_string(value)};
  if (RunLoggedCommand("/sbin/tavcli", arguments, &environment) == 0) {
    return true;
  }
  arguments[0] = "localcli";
  return RunLoggedCommand("/sbin/localcli", arguments, &environment) == 0;
}

std::int64_t ReadAdvancedOption(const std::string& path, std::int64_t defaultValue) {
  try {
    return HykCtl::Adv::UserAdvancedOptionImpl().GetUserOption(path);
  } catch (const HostMgr::Lib::HostMgrException&) {
    return defaultValue;
  }
}

}  // namespace Tulk
