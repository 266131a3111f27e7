#include "platform/api/Authentication.h"

#include "platform/sim/SimState.h"

namespace HostMgr::Authentication {

void StoreUserAccountsToCs() {
  Sim::Change("HostMgr::Authentication::StoreUserAccountsToCs", [](Sim::json& state) {
    Sim::json& users = Sim::ObjectFor(state, "users");
    users["configStoreSaves"] = users.value("configStoreSaves", 0) + 1;
    users["lastConfigStoreSave"] = Sim::TimeStamp();
  });
}

std::vector<SmartCardToken> LookupSmartCardTokens() {
  const Sim::json& state = Sim::Query("HostMgr::Authentication::LookupSmartCardTokens");
  std::vector<SmartCardToken> tokens;
  for (const Sim::json& card : Sim::ArrayAt(state, "smartCards")) {
    tokens.push_back({Sim::StringAt(card, "userId"), card.value("valid", true)});
  }
  return tokens;
}

}  // namespace HostMgr::Authentication
