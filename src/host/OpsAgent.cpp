#include "host/OpsAgent.h"

#include <syslog.h>
#include <unistd.h>

#include "host/CommandRunner.h"
#include "runtime/HostPath.h"
#include "runtime/HostQueryScope.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

constexpr char kInitScript[] = "/etc/init.d/zyo-opsagent";

// The tool is named without a folder so that it is found through the
// child's PATH, which a confined root limits to its own bin and sbin.
constexpr char kVersionCommand[] =
    "tavcli --formatter=keyvalue software vib get -n zyo-opsagent | "
    "awk -F= '!found && $1 ~ /(^|[.])Version([.]|$)/ "
    "{ found = 1; split($2, part, \".\"); major = part[1] + 0 } "
    "END { exit !(major >= 3) }'";

int RunInitScript(const char* action) {
  return RunLoggedCommand(kInitScript, {kInitScript, action});
}

}  // namespace

bool StartOpsAgent() {
  Log(LOG_INFO, "Starting zyo-opsagent.");
  if (RunInitScript("start") != 0) {
    Log(LOG_ERR, "Failed to start zyo-opsagent.");
    return false;
  }
  return true;
}

bool StopOpsAgent() {
  Log(LOG_INFO, "Stopping zyo-opsagent.");
  if (RunInitScript("stop") != 0) {
    Log(LOG_ERR, "Failed to stop zyo-opsagent.");
    return false;
  }
  Log(LOG_INFO, "zyo-opsagent has been successfully stopped.");
  return true;
}

bool IsOpsAgentPresent() {
  HostQueryScope query;
  bool present = access(HostPath(kInitScript).c_str(), F_OK) == 0 &&
                 RunCommand(kInitScript, {kInitScript, "status"}, nullptr, nullptr, nullptr,
                            nullptr, nullptr, 0, kQueryTimeoutSeconds) == 0;
  Log(LOG_INFO, "zyo-opsagent is %spresent on the system.", present ? "" : "not ");
  return present;
}

bool StartOpsAgentIfPresent() {
  if (!IsOpsAgentPresent()) {
    Log(LOG_INFO, "Skipping zyo-opsagent start.");
    return false;
  }
  return StartOpsAgent();
}

bool IsOpsAgentVersion3OrLater() {
  HostQueryScope query;
  Log(LOG_INFO, "Running: %s", kVersionCommand);
  if (RunShellCommand(kVersionCommand, kPackageQueryTimeoutSeconds) != 0) {
    return false;
  }
  Log(LOG_INFO, "zyo-opsagent version >= 3 detected");
  return true;
}

bool HasOpsAgentVersion3OrLater() {
  return IsOpsAgentPresent() && IsOpsAgentVersion3OrLater();
}

const char* OpsAgentVersionCommand() {
  return kVersionCommand;
}

}  // namespace Tulk
