#include "platform/api/Authentication.h"

#include "platform/api/HostMgrException.h"

namespace HostMgr::Authentication {

void StoreUserAccountsToCs() {
  throw HostMgr::Lib::HostMgrException("StoreUserAccountsToCs is not implemented yet");
}

std::vector<SmartCardToken> LookupSmartCardTokens() {
  throw HostMgr::Lib::HostMgrException("LookupSmartCardTokens is not implemented yet");
}

}  // namespace HostMgr::Authentication
