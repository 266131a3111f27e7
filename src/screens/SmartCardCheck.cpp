#include "screens/SmartCardCheck.h"

#include <syslog.h>

#include <cstdlib>
#include <optional>
#include <string>

#include "host/SystemSettings.h"
#include "include/ProcessFlags.h"
#include "runtime/SystemLog.h"

namespace Tulk {
namespace {

bool g_smartCardSession = false;

}  // namespace

void RunSmartCardCheck() {
  if (loggedIn && !g_smartCardSession) {
    return;
  }
  if (loggedIn) {
    const std::optional<bool> present = SmartCardPresentFor(currentUser);
    if (!present) {
      Log(LOG_ERR, "Error trying to lookup smart card tokens.");
      return;
    }
    if (*present) {
      return;
    }
    Log(LOG_INFO, "Logging out user id '%s'", currentUser.c_str());
    std::exit(0);
  }
  const std::optional<std::string> user = FindSmartCardUser();
  if (!user) {
    Log(LOG_ERR, "Error trying to lookup smart card tokens.");
    return;
  }
  smartCardUser = *user;
  if (!smartCardUser.empty()) {
    Log(LOG_INFO, "Found smart card with user id '%s'", smartCardUser.c_str());
  }
}

void SetSmartCardSession(bool smartCard) {
  g_smartCardSession = smartCard;
}

bool SmartCardSession() {
  return g_smartCardSession;
}

}  // namespace Tulk
