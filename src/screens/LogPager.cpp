#include "screens/LogPager.h"

#include <curses.h>
#include <sys/stat.h>
#include <syslog.h>
#include <term.h>
#include <termios.h>
#include <unistd.h>

#include <cstdio>
#include <cstring>

#include "include/ProcessFlags.h"
#include "runtime/ForegroundProgram.h"
#include "runtime/HostPath.h"
#include "runtime/KeyInput.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/SystemLog.h"
#include "runtime/Terminal.h"
#include "screens/EnvironmentOverride.h"
#include "toolkit/Window.h"

extern char** environ;

namespace Tulk {
namespace {

constexpr char kPager[] = "/bin/less";
constexpr char kPrompt[] = "<Q> Quit </> RegExp Search <H> Help";

std::vector<std::string> ChildEnvironment() {
  std::vector<std::string> entries;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    const bool path = std::strncmp(*entry, "PATH=", 5) == 0;
    const bool history = std::strncmp(*entry, "LESSHISTFILE=", 13) == 0;
    if (!history && !(path && HostRootConfined())) {
      entries.emplace_back(*entry);
    }
  }
  if (HostRootConfined()) {
    entries.push_back("PATH=" + ProgramSearchPath());
  }
  entries.push_back(std::string(kLessHistoryFile) + "=-");
  return entries;
}

// The attributes saved at start-up, with the suspend key off.
void GiveStartupAttributes() {
  if (const auto& startup = SavedTerminalAttributes(); startup) {
    termios attributes = *startup;
    attributes.c_cc[VSUSP] = _POSIX_VDISABLE;
    tcsetattr(STDOUT_FILENO, TCSANOW, &attributes);
  }
}

void TakeTerminalBack(const termios* consoleAttributes) {
  if (consoleAttributes != nullptr) {
    tcsetattr(STDOUT_FILENO, TCSANOW, consoleAttributes);
  }
  keypad(stdscr, FALSE);
  keypad(stdscr, TRUE);
  if (enter_ca_mode != nullptr) {
    // putp() writes through standard output's buffer: flushed now, the
    // sequence cannot reach the terminal after curses has left the
    // alternate screen at exit.
    putp(enter_ca_mode);
    std::fflush(stdout);
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
  clear();
  refresh();
  RuntimeFrame* current = currentWindow;
  currentWindow = nullptr;

  ForegroundEnd end;
  {
    EnvironmentOverride secure(kLessSecure, "1");
    end = RunInForeground(HostPath(kPager), PagerArguments(file), ChildEnvironment(), true);
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
