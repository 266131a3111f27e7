#include "host/HostCommand.h"

#include <syslog.h>

#include "platform/api/HostMgrException.h"
#include "platform/api/HykCtlExec.h"
#include "runtime/HostPath.h"
#include "runtime/ScreenFlush.h"
#include "runtime/SystemLog.h"

namespace Tulk {

int RunHostCommandLine(const std::string& commandLine) noexcept {
  try {
    std::string line = commandLine;
    if (!line.empty() && line.front() == '/') {
      const std::size_t end = line.find(' ');
      line = HostPath(line.substr(0, end)) + (end == std::string::npos ? "" : line.substr(end));
    }
    FlushBeforeCommand();  // what the screen announces is shown first
    return HykCtl::Util::HykCtl_Exec(line, false, true, false).status;
  } catch (const HostMgr::Lib::HostMgrException& failure) {
    Log(LOG_ERR, "%s", failure.what());
    return -1;
  } catch (...) {
    return -1;
  }
}

}  // namespace Tulk
