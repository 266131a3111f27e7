#pragma once
/// The host's user-account store and smart-card tokens.

#include <string>
#include <vector>

namespace HostMgr::Authentication {

/// Copies the host's user accounts (and their password hashes) into the
/// persistent configuration store, so that a password change survives a
/// reboot. Throws HostMgr::Lib::HostMgrException when the store cannot be
/// written; the accounts themselves stay as they are.
void StoreUserAccountsToCs();

/// A smart card present in a reader of the host.
struct SmartCardToken {
  /// The login id the card's certificate maps to.
  std::string userId;
  /// True while the card can be used to log in (inserted, certificate
  /// valid).
  bool valid = true;
};

/// The smart cards present now, in reader order (empty when none).
/// Throws HostMgr::Lib::HostMgrException when the readers cannot be
/// queried.
std::vector<SmartCardToken> LookupSmartCardTokens();

}  // namespace HostMgr::Authentication
