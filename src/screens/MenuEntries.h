#pragma once
/// The entries of the System Customization menu and the host state that
/// enables them.

#include <cstdint>
#include <string>
#include <vector>

namespace Tulk {

/// Catalogue ids of the menu entries (their labels).
inline constexpr std::uint32_t kEntrySeparator = 3;
inline constexpr std::uint32_t kEntryPassword = 5;
inline constexpr std::uint32_t kEntryLockdown = 6;
inline constexpr std::uint32_t kEntryManagementNetwork = 7;
inline constexpr std::uint32_t kEntryRestartNetwork = 8;
inline constexpr std::uint32_t kEntryTestNetwork = 9;
inline constexpr std::uint32_t kEntryNetworkRestore = 10;
inline constexpr std::uint32_t kEntrySupportInformation = 11;
inline constexpr std::uint32_t kEntrySystemLogs = 12;
inline constexpr std::uint32_t kEntryTroubleshooting = 13;
inline constexpr std::uint32_t kEntryResetConfiguration = 14;
inline constexpr std::uint32_t kEntryKeyboard = 15;

/// What the enabling rules need to know of the host.
struct MenuHostState {
  /// "osksvc/auth/lockdown_is_enabled" answered true.
  bool lockdownEnabled = false;
  /// "osksvc/auth/lockdown_is_possible" answered true (asked only when
  /// lockdown is not enabled).
  bool lockdownPossible = false;
  /// A management kernel NIC exists and is in service.
  bool managementNicUp = false;
  /// The "PXEBootEnabled" advanced option exists: the host was booted
  /// from the network.
  bool networkBoot = false;
};

/// One row of the menu.
struct MenuRow {
  std::uint32_t id;
  bool enabled;
};

/// Asks the host: the lockdown queries through osk-cmd (the "possible"
/// query only when lockdown is not enabled), the management NIC and its
/// state, and the network-boot option. A failing query counts as false.
MenuHostState ReadMenuHostState();

/// The rows of the menu in order, separators included; the keyboard row
/// only when `localConsole` is set.
std::vector<MenuRow> BuildMenuRows(const MenuHostState& state, bool localConsole);

}  // namespace Tulk
