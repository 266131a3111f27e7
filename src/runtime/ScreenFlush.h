#pragma once
/// When the console's drawing reaches the terminal.
///
/// Drawing only changes curses' picture of the screen (wnoutrefresh); the
/// terminal gets the changes when the console is about to wait:
/// - before the key read blocks (PollInput()), so that a key's handling
///   reaches the terminal as one update: a frame that the same key paints
///   over (a dialog's owner drawn active and then dimmed again, an empty
///   frame before its content) is never sent;
/// - before a command is run and waited for (the command runner calls
///   FlushScreen()), so that a line such as "Stopping management
///   network." is on the screen before the command it announces runs.
///   Commands that only read the host run inside a HostQueryScope and
///   leave the screen as it is: they announce nothing, and a screen half
///   way through its redraw must not be sent.
///
/// On a 9,600-baud serial line 1,000 bytes take a second; one update per
/// key also lets curses send only the cells that really changed.
///
/// The terminal cursor is sent with the screen: shown at its place, or
/// hidden and left wherever drawing ended (fewer bytes than moving it).
/// Keys typed ahead while a window changed state are dropped as the new
/// state is sent, so that a key pressed after the operator saw it is kept.
///
/// Curses belongs to the main thread: on any other thread (a worker that
/// runs a command), and while curses is suspended (the log pager),
/// FlushScreen() does nothing.

namespace Tulk {

/// The terminal cursor as the screen is to show it.
struct ScreenCursorState {
  bool visible = false;
  /// Screen column and row (used while visible).
  int column = 0;
  int row = 0;
};

/// Where the cursor is to be after the next flush.
void SetScreenCursor(const ScreenCursorState& cursor);

/// The cursor as last set.
ScreenCursorState ScreenCursor();

/// Drops the keys typed ahead when the screen is next sent.
void DropTypeaheadAtFlush();

/// Sends the pending changes and the cursor to the terminal now.
void FlushScreen();

/// The command runner's flush: FlushScreen(), unless a HostQueryScope is
/// open on this thread.
void FlushBeforeCommand();

}  // namespace Tulk
