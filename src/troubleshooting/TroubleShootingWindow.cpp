#include "troubleshooting/TroubleShootingWindow.h"

#include <syslog.h>

#include <iterator>
#include <utility>
#include <vector>

#include "host/HostTools.h"
#include "host/RepairServices.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/Footer.h"
#include "toolkit/RunFrame.h"
#include "troubleshooting/RestartAgentsDialog.h"
#include "troubleshooting/ShellTimeoutDialog.h"
#include "troubleshooting/TulkTimeoutDialog.h"

namespace Tulk {
namespace {

constexpr std::size_t kShellPosition = 0;
constexpr std::size_t kSshPosition = 1;
constexpr std::size_t kShellTimeoutsPosition = 2;
constexpr std::size_t kTulkTimeoutPosition = 3;
constexpr std::size_t kRestartAgentsPosition = 4;

// Frames opened from the window live on the stack, so that the idle timeout
// unwinding through them deletes them too.
template <typename DialogType>
void RunDialog(Frame* owner) {
  DialogType dialog(owner);
  RunFrame(&dialog);
}

}  // namespace

TroubleShootingWindow::TroubleShootingWindow(Frame* owner)
    : MenuWindow(owner),
      shellEnabled_(IsServiceRunning(kTaviShellService)),
      sshEnabled_(IsServiceRunning(kSshService)) {
  SetMenuTitle(Text(TextId::kTroubleshootingTitle));
  SetRefreshFooters(Footer::kMenuSelectSpaced, Footer::kMenuChangeExit);
  SetKeepSelection(true);
  BuildEntries();
}

TroubleShootingWindow::~TroubleShootingWindow() = default;

void TroubleShootingWindow::BuildEntries() {
  struct Row {
    std::uint32_t label;
    std::uint32_t title;
    const char* action;
  };
  const Row rows[] = {
      {shellEnabled_ ? TextId::kDisableShell : TextId::kEnableShell, TextId::kShellTitle, "Change"},
      {sshEnabled_ ? TextId::kDisableSsh : TextId::kEnableSsh, TextId::kSshTitle, "Change"},
      {TextId::kShellTimeouts, TextId::kShellTimeouts, "Change"},
      {TextId::kTulkTimeout, TextId::kTulkTimeout, "Change"},
      {TextId::kRestartAgents, TextId::kRestartAgents, "Restart"},
  };
  std::vector<MenuEntry> entries;
  for (std::size_t position = 0; position < std::size(rows); ++position) {
    MenuEntry entry;
    entry.id = rows[position].title;
    entry.label = Text(rows[position].label);
    entry.title = Text(rows[position].title);
    entry.describe = [this, position] { return Describe(position); };
    entry.footer = Footer::MenuAction(rows[position].action, "Exit");
    entry.action = [this, position] { return Open(position); };
    entries.push_back(std::move(entry));
  }
  SetEntries(std::move(entries));
  UpdateTimeoutsEntry();
}

std::string TroubleShootingWindow::Describe(std::size_t position) const {
  switch (position) {
    case kShellPosition:
      return std::string("{/color}{color:white}") +
             Text(shellEnabled_ ? TextId::kShellIsEnabled : TextId::kShellIsDisabled) +
             "{/color}\n\n{color:light-grey}" + Text(TextId::kShellDescription) + "{/color}";
    case kSshPosition:
      // Here the blank line stands inside the white span; the shell's
      // description has always differed in this.
      return std::string("{/color}{color:white}") +
             Text(sshEnabled_ ? TextId::kSshIsEnabled : TextId::kSshIsDisabled) +
             "\n\n{/color}{color:light-grey}" + Text(TextId::kSshDescription) + "{/color}";
    case kShellTimeoutsPosition:
      return std::string("{color:light-grey}") + Text(TextId::kShellTimeoutsDescription) +
             "{/color}";
    case kTulkTimeoutPosition:
      return std::string("{color:light-grey}") + Text(TextId::kTulkTimeoutDescription) + "{/color}";
    case kRestartAgentsPosition:
      return std::string("{color:light-grey}") + Text(TextId::kRestartAgentsDescription) +
             "{/color}";
    default:
      return {};
  }
}

bool TroubleShootingWindow::Open(std::size_t position) {
  switch (position) {
    case kShellPosition:
      ToggleShell();
      return true;
    case kSshPosition:
      ToggleSsh();
      return true;
    case kShellTimeoutsPosition:
      RunDialog<ShellTimeoutDialog>(this);
      return false;
    case kTulkTimeoutPosition:
      RunDialog<TulkTimeoutDialog>(this);
      return false;
    case kRestartAgentsPosition:
      RunDialog<RestartAgentsDialog>(this);
      return false;
    default:
      return false;
  }
}

void TroubleShootingWindow::ToggleShell() {
  SwitchService(kTaviShellService, shellEnabled_);
  shellEnabled_ = !shellEnabled_;
  const std::string user = ConsoleUser();
  if (shellEnabled_) {
    Log(LOG_INFO, "User %s enabled Tavi Shell", user.c_str());
  } else {
    Log(LOG_INFO, "User %s disabled Tavi Shell", user.c_str());
  }
  SetLabel(kShellPosition, Text(shellEnabled_ ? TextId::kDisableShell : TextId::kEnableShell));
  UpdateTimeoutsEntry();
}

void TroubleShootingWindow::ToggleSsh() {
  SwitchService(kSshService, sshEnabled_);
  sshEnabled_ = !sshEnabled_;
  const std::string user = ConsoleUser();
  if (sshEnabled_) {
    Log(LOG_INFO, "User %s enabled SSH", user.c_str());
  } else {
    Log(LOG_INFO, "User %s disabled SSH", user.c_str());
  }
  SetLabel(kSshPosition, Text(sshEnabled_ ? TextId::kDisableSsh : TextId::kEnableSsh));
  UpdateTimeoutsEntry();
}

void TroubleShootingWindow::UpdateTimeoutsEntry() {
  SetEnabled(kShellTimeoutsPosition, !shellEnabled_ && !sshEnabled_);
}

}  // namespace Tulk
