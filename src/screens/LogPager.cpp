#include "screens/LogPager.h"

#include <curses.h>
#include <signal.h>
#include <sys/wait.h>
#include <term.h>
#include <termios.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

#include "include/ProcessFlags.h"
#include "runtime/HostPath.h"
#include "runtime/RuntimeFrame.h"
#include "runtime/Terminal.h"
#include "screens/EnvironmentOverride.h"
#include "toolkit/Window.h"

extern char** environ;

namespace Tulk {
namespace {

constexpr char kPager[] = "/bin/less";
constexpr char kPrompt[] = "<Q> Quit </> RegExp Search <H> Help";
constexpr int kTerminal = STDIN_FILENO;

// A background process group may only take the terminal back with SIGTTOU
// blocked; otherwise the call stops the whole console.
class TerminalOwnerChange {
 public:
  TerminalOwnerChange() {
    sigset_t ttou;
    sigemptyset(&ttou);
    sigaddset(&ttou, SIGTTOU);
    pthread_sigmask(SIG_BLOCK, &ttou, &saved_);
  }
  ~TerminalOwnerChange() { pthread_sigmask(SIG_SETMASK, &saved_, nullptr); }
  TerminalOwnerChange(const TerminalOwnerChange&) = delete;
  TerminalOwnerChange& operator=(const TerminalOwnerChange&) = delete;

  void GiveTo(pid_t group) {
    if (isatty(kTerminal)) {
      tcsetpgrp(kTerminal, group);
    }
  }

 private:
  sigset_t saved_;
};

std::vector<std::string> ChildEnvironment() {
  std::vector<std::string> entries;
  for (char** entry = environ; *entry != nullptr; ++entry) {
    if (!HostRootConfined() || std::strncmp(*entry, "PATH=", 5) != 0) {
      entries.emplace_back(*entry);
    }
  }
  if (HostRootConfined()) {
    entries.push_back("PATH=" + ProgramSearchPath());
  }
  return entries;
}

std::vector<char*> Pointers(std::vector<std::string>& strings) {
  std::vector<char*> pointers;
  pointers.reserve(strings.size() + 1);
  for (std::string& text : strings) {
    pointers.push_back(text.data());
  }
  pointers.push_back(nullptr);
  return pointers;
}

// Only async-signal-safe calls between fork and exec: the console has
// other threads.
[[noreturn]] void ExecPager(const char* program, char* const* argv, char* const* envp) {
  setpgid(0, 0);
  sigset_t ttou;
  sigemptyset(&ttou);
  sigaddset(&ttou, SIGTTOU);
  sigprocmask(SIG_BLOCK, &ttou, nullptr);
  if (isatty(kTerminal)) {
    tcsetpgrp(kTerminal, getpid());
  }
  struct sigaction defaults {};
  defaults.sa_handler = SIG_DFL;
  for (int signal : {SIGHUP, SIGINT, SIGQUIT, SIGPIPE, SIGTERM, SIGCHLD, SIGTSTP, SIGTTIN, SIGTTOU,
                     SIGUSR1, SIGUSR2, SIGWINCH}) {
    sigaction(signal, &defaults, nullptr);
  }
  sigset_t none;
  sigemptyset(&none);
  sigprocmask(SIG_SETMASK, &none, nullptr);
  close_range(3, ~0U, 0);
  execve(program, argv, envp);
  _exit(127);
}

void RunPagerInForeground(const std::string& path) {
  const std::string program = HostPath(kPager);
  std::vector<std::string> arguments = PagerArguments(path);
  std::vector<std::string> environment = ChildEnvironment();
  std::vector<char*> argv = Pointers(arguments);
  std::vector<char*> envp = Pointers(environment);

  TerminalOwnerChange owner;
  const pid_t pid = fork();
  if (pid == 0) {
    ExecPager(program.c_str(), argv.data(), envp.data());
  }
  if (pid < 0) {
    return;
  }
  setpgid(pid, pid);
  owner.GiveTo(pid);
  for (;;) {
    int status = 0;
    const pid_t done = waitpid(pid, &status, WUNTRACED);
    if (done < 0 && errno == EINTR) {
      continue;
    }
    if (done == pid && WIFSTOPPED(status)) {
      owner.GiveTo(pid);
      kill(-pid, SIGCONT);
      continue;
    }
    break;
  }
  owner.GiveTo(getpgrp());
}

void TakeTerminalBack(const termios* consoleAttributes) {
  if (consoleAttributes != nullptr) {
    tcsetattr(STDOUT_FILENO, TCSANOW, consoleAttributes);
  }
  keypad(stdscr, FALSE);
  keypad(stdscr, TRUE);
  if (enter_ca_mode != nullptr) {
    putp(enter_ca_mode);
  }
  const bool visible = Window::CursorVisible();
  curs_set(visible ? 0 : 1);
  curs_set(visible ? 1 : 0);
}

}  // namespace

std::vector<std::string> PagerArguments(const std::string& path) {
  return {"less", "-cfP", kPrompt, path};
}

void ShowLogInPager(RuntimeFrame* screen, const std::string& path) {
  termios consoleAttributes{};
  const bool haveAttributes = tcgetattr(STDOUT_FILENO, &consoleAttributes) == 0;
  if (const auto& startup = SavedTerminalAttributes(); startup) {
    tcsetattr(STDOUT_FILENO, TCSANOW, &*startup);
  }
  clear();
  refresh();
  RuntimeFrame* current = currentWindow;
  currentWindow = nullptr;

  {
    EnvironmentOverride secure(kLessSecure, "1");
    RunPagerInForeground(HostPath(path));
  }

  TakeTerminalBack(haveAttributes ? &consoleAttributes : nullptr);
  currentWindow = current;
  clearok(curscr, TRUE);
  if (screen != nullptr) {
    screen->Redraw(true);
  }
}

}  // namespace Tulk
