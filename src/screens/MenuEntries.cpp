#include "screens/MenuEntries.h"

#include "host/HostTools.h"
#include "host/ManagementNetwork.h"
#include "host/SystemSettings.h"

namespace Tulk {

MenuHostState ReadMenuHostState() {
  MenuHostState state;
  state.lockdownEnabled = OskCmdGetFlag("osksvc/auth/lockdown_is_enabled");
  if (!state.lockdownEnabled) {
    state.lockdownPossible = OskCmdGetFlag("osksvc/auth/lockdown_is_possible");
  }
  state.managementNicUp = IsManagementInterfaceUp();
  state.networkBoot = HasNetworkBootOption();
  return state;
}

std::vector<MenuRow> BuildMenuRows(const MenuHostState& state, bool localConsole) {
  const bool network = state.managementNicUp;
  std::vector<MenuRow> entries = {
      {kEntryPassword, true},
      {kEntryLockdown, state.lockdownEnabled || state.lockdownPossible},
      {kEntrySeparator, false},
      {kEntryManagementNetwork, network},
      {kEntryRestartNetwork, network},
      {kEntryTestNetwork, network},
      {kEntryNetworkRestore, true},
      {kEntrySeparator, false},
  };
  if (localConsole) {
    entries.push_back({kEntryKeyboard, true});
  }
  entries.insert(entries.end(), {
                                    {kEntryTroubleshooting, true},
                                    {kEntrySeparator, false},
                                    {kEntrySystemLogs, true},
                                    {kEntrySeparator, false},
                                    {kEntrySupportInformation, true},
                                    {kEntrySeparator, false},
                                    {kEntryResetConfiguration, !state.networkBoot},
                                });
  return entries;
}

}  // namespace Tulk
