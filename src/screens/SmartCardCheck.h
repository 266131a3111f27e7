#pragma once
/// The smart-card check: which smart card is inserted while nobody is
/// logged in, and whether the card of a smart-card session is still there.
///
/// Run when the login dialog is built and on every SIGUSR1 (registered as
/// the console's smart-card hook in src/main.cpp).

namespace Tulk {

/// - Nobody logged in: asks the host for its smart-card tokens and puts the
///   user id of the first valid one into `smartCardUser` (empty when there
///   is none), logging "Found smart card with user id '%s'" at info level
///   when one is found.
/// - A smart-card session is open (a login in PIN mode): when no valid
///   card of the logged-in user is present any more, logs "Logging out
///   user id '%s'" at info level and ends the process with status 0.
/// - A failed token query logs "Error trying to lookup smart card tokens."
///   at error level and changes nothing (an open session stays open).
void RunSmartCardCheck();

/// Records whether the current login was made with a smart card (PIN
/// mode). Set by the login dialog at every successful login.
void SetSmartCardSession(bool smartCard);

/// Whether the current login was made with a smart card.
bool SmartCardSession();

}  // namespace Tulk
