#include "runtime/Terminal.h"

#include <curses.h>
#include <fcntl.h>
#include <linux/kd.h>
#include <linux/vt.h>
#include <sys/ioctl.h>
#include <unistd.h>

#include <cstdlib>
#include <cstring>

#include "include/Constants.h"
#include "include/ProcessFlags.h"
#include "runtime/HostPath.h"

namespace Tulk {
namespace {

std::optional<termios> g_saved;

}  // namespace

std::optional<int> ParseVtArgument(const char* text) {
  long value = std::strtol(text, nullptr, 10);
  if (value >= 1 && value <= 63) {
    return static_cast<int>(value);
  }
  return std::nullopt;
}

bool IsLinuxConsole() {
  char type = 0;
  return ioctl(1, KDGKBTYPE, &type) == 0;
}

void ApplyTerminalType(bool linuxConsole) {
  if (linuxConsole) {
    localConsole = true;
    setenv("TERM", "linux", 1);
  } else if (const char* term = std::getenv("TERM"); term != nullptr) {
    if (std::strcmp(term, "linux") == 0) {
      setenv("TERM", "vt102", 1);
    } else if (std::strcmp(term, "xterm") == 0 && std::getenv("SSH_CLIENT") == nullptr) {
      localConsole = true;
    }
  }
  setenv("TERMINFO", "/usr/share/terminfo", 0);
  setenv("TERM", "vt102", 0);
}

void SaveTerminalAttributes() {
  termios attributes{};
  if (tcgetattr(1, &attributes) == 0) {
    g_saved = attributes;
  }
}

const std::optional<termios>& SavedTerminalAttributes() {
  return g_saved;
}

void SwitchToVt(int vt) {
  int fd = open(HostPath(kConsoleDevicePath).c_str(), O_RDWR | O_CLOEXEC);
  if (fd < 0) {
    return;
  }
  if (ioctl(fd, VT_ACTIVATE, vt) != 0) {
    ioctl(fd, VT_WAITACTIVE, vt);
  }
  close(fd);
}

void DisableFlowControl() {
  termios attributes{};
  if (tcgetattr(0, &attributes) != 0) {
    return;
  }
  attributes.c_iflag &= ~static_cast<tcflag_t>(IXON | IXOFF);
  if (tcsetattr(0, TCSANOW, &attributes) == 0) {
    def_prog_mode();
  }
}

void DisableSuspendCharacter() {
  if (!g_saved) {
    return;
  }
  g_saved->c_cc[VSUSP] = 0;
  tcsetattr(1, TCSANOW, &*g_saved);
}

}  // namespace Tulk
