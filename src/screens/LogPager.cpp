#include "screens/LogPager.h"

#include <curses.h>
#include <sys/stat.h>
#include <syslog.h>
#include <term.h>
#include <termios.h>
#include <unistd.h>

#include <cstdio>

#include "include/ProcessFlags.h"
#include "runtime/ChildProcess.h"
#include "runtime/ForegroundProgram.h"
#include "runtime/HostPath.h"
#include "runtime/KeyInput.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/SystemLog.h"
#include "runtime/Terminal.h"
#include "runtime/TerminalOutput.h"
#include "screens/EnvironmentOverride.h"
#include "toolkit/Window.h"

namespace Tulk {
namespace {

constexpr char kPager[] = "/bin/less";
constexpr char kPrompt[] = "<Q> Quit </> RegExp Search <H> Help";

// The environment of every child (runtime/ChildProcess.h) without the
// pager's own variables but LESSSECURE; then LESSHISTFILE=- and
// LESSCHARSET=ascii.
std::vector<std::string> PagerEnvironment() {
  std::vector<std::string> entries = ChildEnvironment();
  std::erase_if(entries, [](const std::string& entry) {
    return entry.starts_with("LESS") && !entry.starts_with(std::string(kLessSecure) + "=");
  });
  entries.push_back(std::string(kLessHistoryFile) + "=-");
  entries.push_back(std::string(kLessCharacterSet) + "=ascii");
  return entries;
}

// The attributes saved at start-up, with the suspend key and flow control
// off: as in the console itself, Ctrl-S must not freeze the screen (the
// pager would block on its output and stop reading keys).
void GiveStartupAttributes() {
  if (const auto& startup = SavedTerminalAttributes(); startup) {
    termios attributes = *startup;
    attributes.c_cc[VSUSP] = _POSIX_VDISABLE;
    attributes.c_iflag &= ~static_cast<tcflag_t>(IXON | IXOFF);
    tcsetattr(STDOUT_FILENO, TCSANOW, &attributes);
  }
}

void TakeTerminalBack(const termios* consoleAttributes) {
  // The pager left the terminal's attributes as it pleased.
  ForgetTerminalAttributes();
  if (consoleAttributes != nullptr) {
    tcsetattr(STDOUT_FILENO, TCSANOW, consoleAttributes);
  }
  keypad(stdscr, FALSE);
  keypad(stdscr, TRUE);
  if (enter_ca_mode != nullptr) {
    // Some terminals keep the cursor's visibility with the state saved on
    // entering the alternate screen and bring it back on leaving it: the
    // cursor is shown first, as it was when curses entered it at start-up,
    // so that the console's exit does not leave it hidden. putp() writes
    // through standard output's buffer: flushed now, the sequences cannot
    // reach the terminal after curses has left the alternate screen at
    // exit.
    if (cursor_normal != nullptr) {
      (void)putp(cursor_normal);
    }
    (void)putp(enter_ca_mode);
    (void)std::fflush(stdout);
  }
  const bool visible = Window::CursorVisible();
  curs_set(visible ? 0 : 1);
  curs_set(visible ? 1 : 0);
}

}  // namespace

std::vector<std::string> PagerArguments(const std::string& path) {
  return {"less", "-cfP", kPrompt, path};
}

bool PageableFile(const std::string& hostPath) {
  struct stat status {};
  return stat(hostPath.c_str(), &status) != 0 || S_ISREG(status.st_mode);
}

void ShowLogInPager(RuntimeFrame* screen, const std::string& path) {
  const std::string file = HostPath(path);
  if (!PageableFile(file)) {
    Log(LOG_WARNING, "Not showing %s: not a regular file", path.c_str());
    return;
  }
  termios consoleAttributes{};
  const bool haveAttributes = tcgetattr(STDOUT_FILENO, &consoleAttributes) == 0;
  GiveStartupAttributes();
  // The pager gets the terminal as a program started from a shell would:
  // cursor shown. A pager ended by a signal cannot restore what it saved
  // on entering the alternate screen, and the console's exit then leaves
  // the terminal with the cursor as it stood when the pager started.
  curs_set(1);
  clear();
  RefreshTerminal();
  RuntimeFrame* current = currentWindow;
  currentWindow = nullptr;

  ForegroundEnd end;
  {
    EnvironmentOverride secure(kLessSecure, "1");
    end = RunInForeground(HostPath(kPager), PagerArguments(file), PagerEnvironment(), true);
  }

  TakeTerminalBack(haveAttributes ? &consoleAttributes : nullptr);
  ExitIfResizedMeanwhile();
  clearok(curscr, TRUE);
  if (end == ForegroundEnd::kIdleTimeout) {
    throw TulkTimeout{};
  }
  currentWindow = current;
  if (screen != nullptr) {
    screen->Redraw(true);
  }
}

}  // namespace Tulk
