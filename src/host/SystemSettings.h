#pragma once
/// The host's system settings the session screens read and change: the
/// keyboard layout, the welcome message and system alerts, the network-boot
/// option, the persistent user accounts and the smart-card tokens. Nothing
/// here throws: failures are logged and reported as described.

#include <optional>
#include <string>
#include <vector>

namespace Tulk {

/// The configured keyboard layout; "N/A" when it cannot be read (logged as
/// "Getting keyboard layout failed: %s" at error level).
std::string ReadKeyboardLayout();

/// The layouts the host offers and the configured one.
struct KeyboardLayouts {
  std::vector<std::string> layouts;
  std::string configured;
  /// The host-control failure text; empty when both were read.
  std::string error;
};

/// Reads the offered and the configured layout (nothing is logged: the
/// caller reports `error`).
KeyboardLayouts ReadKeyboardLayouts();

/// Sets the keyboard layout; on failure returns false with the host's text
/// in `error` (nothing is logged).
bool WriteKeyboardLayout(const std::string& layout, std::string& error);

/// The administrator's welcome message (empty for the standard summary).
/// A message that cannot be read is logged as "Getting welcome message
/// failed: %s" at error level and gives the empty text, so that the welcome
/// screen shows its standard summary.
std::string ReadWelcomeMessage();

/// Raises the system alert `text` once more on the host. Returns false when
/// the host refused it (logged as "Setting system alert failed: %s" at
/// error level).
bool RaiseSystemAlert(const std::string& text);

/// Whether the "PXEBootEnabled" advanced option exists (the host was booted
/// from the network); false when the question fails.
bool HasNetworkBootOption();

/// Stores the user accounts in the host's configuration store; on failure
/// returns false with the host's text in `error` (the caller logs).
bool StoreUserAccounts(std::string& error);

/// The user id of the first valid smart card present ("" when none), or
/// nullopt when the token lookup failed (nothing is logged).
std::optional<std::string> FindSmartCardUser();

/// Whether a valid smart card of `user` is present; nullopt when the lookup
/// failed.
std::optional<bool> SmartCardPresentFor(const std::string& user);

}  // namespace Tulk
