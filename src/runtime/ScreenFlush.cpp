#include "runtime/ScreenFlush.h"

#include <curses.h>
#include <unistd.h>

#include "runtime/HostQueryScope.h"
#include "runtime/TerminalOutput.h"

namespace Tulk {
namespace {

ScreenCursorState g_cursor;
bool g_dropTypeahead = false;

// Curses is used by the main thread only; its thread id is the process id.
bool OnScreenThread() {
  return gettid() == getpid();
}

}  // namespace

void SetScreenCursor(const ScreenCursorState& cursor) {
  g_cursor = cursor;
}

ScreenCursorState ScreenCursor() {
  return g_cursor;
}

void DropTypeaheadAtFlush() {
  g_dropTypeahead = true;
}

void FlushScreen() {
  if (!OnScreenThread() || newscr == nullptr || isendwin()) {
    return;
  }
  if (g_dropTypeahead) {
    g_dropTypeahead = false;
    flushinp();
  }
  // A hidden cursor is left where drawing ends instead of being moved
  // back. It is hidden before the update and shown after it, so that it
  // never wanders over the screen while the update is drawn.
  leaveok(newscr, g_cursor.visible ? FALSE : TRUE);
  if (g_cursor.visible) {
    wmove(newscr, g_cursor.row, g_cursor.column);
  } else {
    curs_set(0);
  }
  UpdateTerminal();
  if (g_cursor.visible) {
    curs_set(1);
  }
}

void FlushBeforeCommand() {
  if (!HostQueryScope::Open()) {
    FlushScreen();
  }
}

}  // namespace Tulk
