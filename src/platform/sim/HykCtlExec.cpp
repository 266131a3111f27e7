#include "platform/api/HykCtlExec.h"

#include "platform/api/HostMgrException.h"

namespace HykCtl::Util {

ExecResult HykCtl_Exec(const std::string& /*commandLine*/, bool /*captureOutput*/,
                       bool /*waitForExit*/, bool /*useShell*/) {
  throw HostMgr::Lib::HostMgrException("HykCtl_Exec is not implemented yet");
}

}  // namespace HykCtl::Util
