#pragma once
/// The footer legends of the console's screens (markup): keys in black and
/// their actions in dark grey on dialogs, keys in white and actions in light
/// grey on the right half of full-screen menus, two blanks between legends.
///
/// Screens take their footers from here. Several literals differ from the
/// regular pattern in a blank or a missing "{/color}"; each is the text its
/// screen has always shown and is kept exactly as it stands.

#include <string>
#include <string_view>

namespace Tulk::Footer {

// clang-format off
// Dialogs.
/// "<Enter> OK".
inline constexpr char kOk[] =
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}{/align}";
/// "<Enter> OK" of the progress reports, the blank inside the action's colour.
inline constexpr char kProgressOk[] =
    "{align:right}{color:black}<Enter>{/color}{color:dark-grey} OK{/color}{/align}";
/// "<Enter> OK  <Esc> Cancel".
inline constexpr char kOkCancel[] =
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Esc> Cancel" (a running test).
inline constexpr char kCancel[] =
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<F11> OK  <Esc> Cancel": disruptive actions.
inline constexpr char kF11OkCancel[] =
    "{align:right}{color:black}<F11>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<F11> Yes, Reset ... <Esc> Cancel": the factory network restore.
inline constexpr char kF11YesResetCancel[] =
    "{color:black}<F11>{/color} {color:dark-grey}Yes, Reset{/color}"
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Enter> Confirm ... <Esc> Cancel".
inline constexpr char kConfirmCancel[] =
    "{color:black}<Enter>{/color} {color:dark-grey}Confirm{/color}"
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Y> Yes  <N> No ... <Esc> Cancel".
inline constexpr char kYesNoCancel[] =
    "{color:black}<Y>{/color} {color:dark-grey}Yes{/color}  "
    "{color:black}<N>{/color} {color:dark-grey}No{/color}"
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Up/Down> Select ... <Enter> OK  <Esc> Cancel": forms of inputs.
inline constexpr char kSelectOkCancel[] =
    "{color:black}<Up/Down>{/color} {color:dark-grey}Select{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Up/Down> Select  <Space> Mark Selected ... <Enter> OK  <Esc> Cancel":
/// forms with radio buttons.
inline constexpr char kSelectMarkOkCancel[] =
    "{color:black}<Up/Down>{/color} {color:dark-grey}Select{/color}  "
    "{color:black}<Space>{/color} {color:dark-grey}Mark Selected{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Space> Toggle ... <Enter> OK  <Esc> Cancel".
inline constexpr char kToggleOkCancel[] =
    "{color:black}<Space>{/color} {color:dark-grey}Toggle{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<D> View Details  <Space> Toggle Selected ... <Enter> OK  <Esc> Cancel".
inline constexpr char kDetailsToggleOkCancel[] =
    "{color:black}<D>{/color} {color:dark-grey}View Details{/color}  "
    "{color:black}<Space>{/color} {color:dark-grey}Toggle Selected{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<F2> Shut Down  <F11> Restart ... <Esc> Cancel".
inline constexpr char kShutdownRestartCancel[] =
    "{color:black}<F2>{/color} {color:dark-grey}Shut Down{/color}  "
    "{color:black}<F11>{/color} {color:dark-grey}Restart{/color}"
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Enter> Restart Host": after the system configuration was reset.
inline constexpr char kRestartHost[] =
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}Restart Host{/color}{/align}";
/// The login's smart-card footer; the stray ">" of its first colour tag is
/// part of the text.
inline constexpr char kPinLogin[] =
    "{align:left}{color:black>}<F3>{/color} {color:dark-grey}Switch PIN/Password "
    "Login{/color}{/align}{align:right}{color:black}<Enter>{/color} "
    "{color:dark-grey}OK{/color}  {color:black}<Esc>{/color} "
    "{color:dark-grey}Cancel{/color}{/align}";
/// The footer of the details dialogs of list entries, with two trailing
/// blanks.
inline constexpr char kDetailsOk[] =
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}{/align}  ";
/// "<F11> Restart Now ... <Esc> Restart Later": a restart the host needs.
inline constexpr char kRestartNowLater[] =
    "{color:black}<F11>{/color} {color:dark-grey}Restart Now{/color}"
    "{align:right}{color:black}<Esc>{/color} {color:dark-grey}Restart Later{/color}{/align}";

/// "<Left/Right> Change  <D> Details ... <Enter> OK  <Esc> Cancel": forms
/// whose choices are carousels of list entries.
inline constexpr char kChangeDetailsOkCancel[] =
    "{color:black}<Left/Right>{/color} {color:dark-grey}Change{/color}  "
    "{color:black}<D>{/color} {color:dark-grey}Details{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";
/// "<Up/Down> Select  <Space> Toggle ... <Enter> OK  <Esc> Cancel": forms
/// with check boxes.
inline constexpr char kSelectToggleOkCancel[] =
    "{color:black}<Up/Down>{/color} {color:dark-grey}Select{/color}  "
    "{color:black}<Space>{/color} {color:dark-grey}Toggle{/color}"
    "{align:right}{color:black}<Enter>{/color} {color:dark-grey}OK{/color}  "
    "{color:black}<Esc>{/color} {color:dark-grey}Cancel{/color}{/align}";

// Full-screen menus.
/// The left footer of every menu.
inline constexpr char kMenuSelect[] =
    "{color:black}<Up/Down>{/color}{color:dark-grey} Select{/color}";
/// The left footer the network, restore and troubleshooting menus set on a
/// refresh.
inline constexpr char kMenuSelectSpaced[] =
    "{color:black}<Up/Down>{/color} {color:dark-grey}Select{/color}";
/// The right footer those menus show right after a refresh, with a blank
/// after "<Esc>".
inline constexpr char kMenuChangeExit[] =
    "{color:white}<Enter>{/color}{color:light-grey} Change{/color}{align:right}"
    "{color:white}<Esc> {/color}{color:light-grey}Exit{/color}{/align}";
/// The lockdown entry's footer: no "{/color}" after "<Enter>".
inline constexpr char kMenuLockdown[] =
    "{color:white}<Enter>{color:light-grey} Change{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
/// "<Esc> Log Out" alone.
inline constexpr char kMenuLogOut[] =
    "{align:right}{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
/// The support pages' hints, then "<Esc> Log Out".
inline constexpr char kMenuSupportPages[] =
    "{color:light-grey}<Page Up> <Page Down>{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
/// The restore menu's "Restore" entries.
inline constexpr char kMenuRestoreExit[] =
    "{color:white}<Enter>{/color} {color:light-grey}Restore{/color}{align:right}"
    "{color:white}<Esc>{/color} {color:light-grey}Exit{/color}{/align}";
// clang-format on

/// The regular right footer of a menu entry: "<Enter>" and `action`, then
/// "<Esc>" and `exit` right-aligned ("{color:white}<Enter>{/color}{color:light-grey}
/// Change{/color}{align:right}{color:white}<Esc>{/color}{color:light-grey} Exit{/color}{/align}").
std::string MenuAction(std::string_view action, std::string_view exit);

/// The restore menu's footer for `action` ("Create", "Migrate", "Restart"):
/// the action's colour stays open up to the alignment.
std::string MenuRestoreAction(std::string_view action);

}  // namespace Tulk::Footer
