#pragma once
/// Process-wide state shared between the subsystems.
///
/// All of it is touched by the main thread only. The storage lives in
/// runtime/ProcessFlags.cpp.

#include <string>

namespace Tulk {

class RuntimeFrame;

/// The console runs on a keyboard console whose layout the operator may
/// change (set at start-up from the terminal type).
extern bool localConsole;
/// The palette cannot be changed: colours are replaced by standout.
extern bool monochrome;
/// An operator session is open.
extern bool loggedIn;
/// SIGUSR2 arrived during a session: exit as soon as it ends.
extern bool exitPending;
/// The frame that currently receives keys (null between frames).
extern RuntimeFrame* currentWindow;
/// Login name of the last successful login.
extern std::string currentUser;
/// User id read from an inserted smart card, empty when there is none.
extern std::string smartCardUser;
/// The password (or PIN) of the last successful login was empty.
extern bool passwordWasEmpty;

}  // namespace Tulk
