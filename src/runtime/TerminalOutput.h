#pragma once
/// How curses' output reaches the terminal.
///
/// Curses writes to a descriptor of its own, a duplicate of standard
/// output. Where the terminal's description suits the AttributeFilter (its
/// attribute, colour and line-drawing controls are all ECMA-48 SGR,
/// character-set designations or shifts), an update goes through it:
/// while curses composes the update (doupdate()), its descriptor points at
/// an in-memory file; the update is then read back, filtered, and written
/// to the terminal in one go, before the console waits. Curses sets the
/// terminal's modes through the same descriptor, but never during an
/// update except the first one after endwin(); that one, and every update
/// where the filter is not used or cannot be set up, goes to the terminal
/// directly and the filter forgets the terminal's state.
///
/// Everything runs on the main thread, which owns curses.

#include <cstdio>

namespace Tulk {

/// The stream to give newterm(): a close-on-exec duplicate of standard
/// output, or standard output itself when it cannot be duplicated.
FILE* OpenCursesOutput();

/// After newterm() and start_color(): decides from the terminal's
/// description whether updates go through the filter.
void ChooseOutputFilter();

/// The loaded terminal description (setupterm()) suits the filter: every
/// attribute, colour and line-drawing control curses may send is one it
/// reads. `defaultColours` tells whether "op" is SGR 39;49.
bool DescriptionSuitsFilter(bool& defaultColours);

/// Sends curses' pending update (doupdate()), filtered where it is used.
void UpdateTerminal();

/// The whole screen's pending changes (wnoutrefresh(stdscr)), then
/// UpdateTerminal(): what refresh() does, through the filter.
void RefreshTerminal();

/// Something other than an update wrote to the terminal (a program run in
/// the foreground): the filter no longer knows its attributes.
void ForgetTerminalAttributes();

}  // namespace Tulk
