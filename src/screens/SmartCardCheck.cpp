#include "screens/SmartCardCheck.h"

#include <syslog.h>

#include <cstdlib>
#include <vector>

#include "include/ProcessFlags.h"
#include "platform/api/Authentication.h"
#include "platform/api/HostMgrException.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

bool g_smartCardSession = false;

}  // namespace

void RunSmartCardCheck() {
  if (loggedIn && !g_smartCardSession) {
    return;
  }
  std::vector<HostMgr::Authentication::SmartCardToken> tokens;
  try {
    tokens = HostMgr::Authentication::LookupSmartCardTokens();
  } catch (const HostMgr::Lib::HostMgrException&) {
    Log(LOG_ERR, "Error trying to lookup smart card tokens.");
    return;
  }
  if (loggedIn) {
    for (const auto& token : tokens) {
      if (token.valid && token.userId == currentUser) {
        return;
      }
    }
    Log(LOG_INFO, "Logging out user id '%s'", currentUser.c_str());
    std::exit(0);
  }
  smartCardUser.clear();
  for (const auto& token : tokens) {
    if (token.valid && !token.userId.empty()) {
      smartCardUser = token.userId;
      Log(LOG_INFO, "Found smart card with user id '%s'", smartCardUser.c_str());
      return;
    }
  }
}

void SetSmartCardSession(bool smartCard) {
  g_smartCardSession = smartCard;
}

bool SmartCardSession() {
  return g_smartCardSession;
}

}  // namespace Tulk
