#include "runtime/Console.h"

#include <curses.h>
#include <fcntl.h>
#include <syslog.h>
#include <term.h>
#include <unistd.h>
#include <clocale>
#include <cstdlib>

#include "runtime/CaseTables.h"
#include "runtime/KeyInput.h"
#include "runtime/KeyTable.h"
#include "runtime/Palette.h"
#include "runtime/PidFile.h"
#include "runtime/SignalThread.h"
#include "runtime/SystemLog.h"
#include "runtime/Terminal.h"
#include "runtime/TerminalOutput.h"

namespace Tulk {
namespace {

void SilenceStandardError() {
  int fd = open("/dev/null", O_WRONLY | O_CLOEXEC);
  if (fd < 0) {
    return;
  }
  dup2(fd, 2);
  close(fd);
}

void SetLocale() {
  // en_US.UTF-8 is missing on a fresh machine; C.UTF-8 still gives the
  // line drawing and block characters.
  if (std::setlocale(LC_ALL, "en_US.UTF-8") == nullptr) {
    std::setlocale(LC_ALL, "C.UTF-8");
  }
}

// Every exit() restores the terminal; after the normal teardown curses has
// already ended and nothing more may follow the palette reset.
void EndWindowAtExit() {
  if (stdscr != nullptr && !isendwin()) {
    endwin();
  }
}

[[noreturn]] void TerminalUnusable() {
  const char* term = std::getenv("TERM");
  Log(LOG_ERR, "Error opening terminal: %s.", term != nullptr ? term : "");
  std::exit(1);
}

// An unknown or empty TERM: curses cannot start, and its own message would
// go to the silenced standard error. The type is tried on its own first: a
// failed newterm() loses memory that a failed setupterm() does not.
void StartCurses() {
  int error = 0;
  if (setupterm(nullptr, STDOUT_FILENO, &error) != OK) {
    TerminalUnusable();
  }
  del_curterm(cur_term);
  if (newterm(nullptr, OpenCursesOutput(), stdin) == nullptr) {
    TerminalUnusable();
  }
  start_color();
  ChooseOutputFilter();
  std::atexit(EndWindowAtExit);
  curs_set(0);
  cbreak();
  noecho();
  keypad(stdscr, TRUE);
  set_escdelay(EscapeDelay(std::getenv("ESCDELAY")));
  DisableFlowControl();
}

}  // namespace

int ConsoleMain(int argc, char** argv, const ConsoleHooks& hooks) {
  InitCaseTables();
  if (hooks.preferenceInit) {
    hooks.preferenceInit();
  }

  std::optional<int> vt;
  if (argc > 1) {
    vt = ParseVtArgument(argv[1]);
    if (!vt) {
      Log(LOG_ERR, "Invalid VT specified for TULK: %s", argv[1]);
    }
  }

  StartSignalThread();

  SetIdleTimeoutReader(hooks.readIdleTimeout);
  SetSmartCardCheck(hooks.smartCardCheck);
  ReloadIdleTimeout();

  SilenceStandardError();
  SaveTerminalAttributes();
  ApplyTerminalType(IsLinuxConsole());

  if (hooks.initProductLogging) {
    hooks.initProductLogging();
  }
  OpenSystemLog();
  Log(LOG_INFO, "Starting TULK");

  WritePidFile();

  if (vt) {
    SwitchToVt(*vt);
    DisableSuspendCharacter();
  }

  SetLocale();
  StartCurses();
  InitColors();
  DefineKeys();
  RefreshTerminal();

  if (hooks.afterStartup) {
    hooks.afterStartup();
  }
  if (hooks.runWelcome) {
    hooks.runWelcome();
  }

  erase();
  RefreshTerminal();
  endwin();
  static const char kPaletteReset[] = "\x1b]R";
  ssize_t written = write(1, kPaletteReset, 3);
  (void)written;
  return 0;
}

}  // namespace Tulk
