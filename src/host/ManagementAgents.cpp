#include "host/ManagementAgents.h"

#include <syslog.h>

#include <exception>
#include <string>
#include <system_error>
#include <thread>

#include "platform/api/HostMgrException.h"
#include "platform/api/HykCtlExec.h"
#include "runtime/HostPath.h"
#include "runtime/ScreenFlush.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

// The flags HykCtl_Exec is given: no capture, wait for the end, no shell.
constexpr bool kCaptureOutput = false;
constexpr bool kWaitForExit = true;
constexpr bool kUseShell = false;

void RunServicesScript(const char* verb) {
  const std::string line = HostPath("/bin/sh") + " " + HostPath("/sbin/services.sh") + " " + verb;
  FlushBeforeCommand();  // the step it announces is on the screen first
  try {
    HykCtl::Util::HykCtl_Exec(line, kCaptureOutput, kWaitForExit, kUseShell);
  } catch (const HostMgr::Lib::HostMgrException& error) {
    Log(LOG_ERR, "%s", error.what());
  }
}

void CaptureLiveCore() noexcept {
  // The option named in the line is not the one the command uses; both
  // have always read so.
  Log(LOG_INFO, "Executing hykbacktrace -c against mgmtd");
  const std::string line =
      HostPath("/sbin/hykbacktrace") + " -w -n mgmtd -o mgmtd-restart% -d /var/log/";
  try {
    const HykCtl::Util::ExecResult result =
        HykCtl::Util::HykCtl_Exec(line, kCaptureOutput, kWaitForExit, kUseShell);
    if (result.status == 0) {
      Log(LOG_INFO, "Mgmtd core dump completed");
    } else {
      Log(LOG_ERR, "hykbacktrace failed, probably mgmtd was down");
    }
  } catch (const std::exception& error) {
    Log(LOG_ERR, "%s", error.what());
  }
}

}  // namespace

void StopManagementAgents() {
  RunServicesScript("stop");
}

void StartManagementAgents() {
  RunServicesScript("start");
}

bool StartLiveCoreCapture() {
  try {
    std::thread(CaptureLiveCore).detach();
    return true;
  } catch (const std::system_error& error) {
    Log(LOG_ERR, "Failed to create live core generation thread: %s",
        error.code().message().c_str());
    return false;
  }
}

}  // namespace Tulk
