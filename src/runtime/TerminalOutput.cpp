#include "runtime/TerminalOutput.h"

#include <curses.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <term.h>
#include <unistd.h>

#include <algorithm>
#include <cerrno>
#include <memory>
#include <string>

#include "runtime/AttributeFilter.h"
#include "runtime/WriteAll.h"

namespace Tulk {
namespace {

int g_cursesFd = -1;    // what curses writes to: the terminal between updates
int g_terminalFd = -1;  // the terminal, to point curses' descriptor back at
int g_captureFd = -1;   // the in-memory file an update is composed in
std::unique_ptr<AttributeFilter> g_filter;
std::string g_update;

const char* Capability(const char* name) {
  char* value = tigetstr(name);
  // terminfo marks a name that is not a string capability with (char*) -1.
  const auto notString = reinterpret_cast<char*>(-1);  // NOLINT(performance-no-int-to-ptr)
  return value == notString ? nullptr : value;
}

bool Suits(const char* controls) {
  return controls == nullptr || AttributeFilter::Understands(controls);
}

}  // namespace

bool DescriptionSuitsFilter(bool& defaultColours) {
  const char* reset = Capability("sgr0");
  if (reset == nullptr || !AttributeFilter::Understands(reset)) {
    return false;
  }
  for (const char* name : {"smacs", "rmacs", "bold", "dim", "blink", "rev", "invis", "smul", "rmul",
                           "smso", "rmso", "sitm", "ritm"}) {
    if (!Suits(Capability(name))) {
      return false;
    }
  }
  if (const char* combined = Capability("sgr"); combined != nullptr) {
    // No attribute, each of the nine on its own, all of them.
    for (int on = 0; on <= 10; ++on) {
      int p[9] = {};
      for (int i = 0; i < 9; ++i) {
        p[i] = (on == i + 1 || on == 10) ? 1 : 0;
      }
      if (!Suits(tiparm(combined, p[0], p[1], p[2], p[3], p[4], p[5], p[6], p[7], p[8]))) {
        return false;
      }
    }
  }
  defaultColours = false;
  const int colours = tigetnum("colors");
  if (colours > 0) {
    const char* foreground = Capability("setaf");
    const char* background = Capability("setab");
    if (foreground == nullptr || background == nullptr) {
      return false;
    }
    for (int colour : {0, std::min(colours, 8) - 1, std::min(colours, 256) - 1}) {
      if (!Suits(tiparm(foreground, colour)) || !Suits(tiparm(background, colour))) {
        return false;
      }
    }
    const char* original = Capability("op");
    if (!Suits(original)) {
      return false;
    }
    defaultColours = original != nullptr && AttributeFilter::SetsDefaultColours(original);
  }
  return true;
}

namespace {

// Points curses' descriptor at `fd`; false if it could not.
bool PointCursesAt(int fd) {
  while (dup3(fd, g_cursesFd, O_CLOEXEC) < 0) {
    if (errno != EINTR && errno != EBUSY) {
      return false;
    }
  }
  return true;
}

// The update composed in the in-memory file; empties the file.
void ReadUpdate() {
  const off_t size = lseek(g_captureFd, 0, SEEK_CUR);
  g_update.resize(size > 0 ? static_cast<std::size_t>(size) : 0);
  std::size_t done = 0;
  while (done < g_update.size()) {
    const ssize_t got = pread(g_captureFd, g_update.data() + done, g_update.size() - done,
                              static_cast<off_t>(done));
    if (got <= 0) {
      if (got < 0 && errno == EINTR) {
        continue;
      }
      break;
    }
    done += static_cast<std::size_t>(got);
  }
  g_update.resize(done);
  (void)ftruncate(g_captureFd, 0);
  (void)lseek(g_captureFd, 0, SEEK_SET);
}

}  // namespace

FILE* OpenCursesOutput() {
  const int fd = fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 3);
  if (fd < 0) {
    return stdout;
  }
  FILE* stream = fdopen(fd, "w");
  if (stream == nullptr) {
    close(fd);
    return stdout;
  }
  g_cursesFd = fd;
  return stream;
}

void ChooseOutputFilter() {
  bool defaultColours = false;
  if (g_cursesFd < 0 || !DescriptionSuitsFilter(defaultColours)) {
    return;
  }
  const int capture = memfd_create("tulk-update", MFD_CLOEXEC);
  if (capture < 0) {
    return;
  }
  const int terminal = fcntl(g_cursesFd, F_DUPFD_CLOEXEC, 3);
  if (terminal < 0) {
    close(capture);
    return;
  }
  g_captureFd = capture;
  g_terminalFd = terminal;
  g_filter = std::make_unique<AttributeFilter>(defaultColours);
}

void UpdateTerminal() {
  // Coming back from endwin(), curses sets the terminal's modes in the
  // update: that one goes to the terminal directly.
  if (g_filter == nullptr || isendwin() || !PointCursesAt(g_captureFd)) {
    doupdate();
    ForgetTerminalAttributes();
    return;
  }
  doupdate();
  // Only a broken descriptor table keeps curses' descriptor on the
  // in-memory file; the update still reaches the terminal, and every later
  // update tries to point it back.
  const bool back = PointCursesAt(g_terminalFd);
  ReadUpdate();
  (void)WriteAll(back ? g_cursesFd : g_terminalFd, g_filter->Filter(g_update));
}

void RefreshTerminal() {
  wnoutrefresh(stdscr);
  UpdateTerminal();
}

void ForgetTerminalAttributes() {
  if (g_filter != nullptr) {
    g_filter->Forget();
  }
}

}  // namespace Tulk
