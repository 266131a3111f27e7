#pragma once
/// The welcome screen: the host's summary (or the administrator's welcome
/// message) while nobody is logged in, and the console's session loop.
///
/// The one frame that lives for the whole run (src/main.cpp builds it and
/// runs it with RunFrame). Layout of the standard summary, COLS x LINES the
/// screen, integer division:
///
/// | Element              | Parent      | Column, row   | Size               | Colours |
/// |----------------------|-------------|---------------|--------------------|---------|
/// | frame (boxed)        | screen      | 0, 0          | COLS x LINES       | black, white |
/// | upper panel          | frame       | 0, 0          | COLS x LINES/2     | dark grey, white |
/// | lower panel          | frame       | 0, LINES/2    | COLS x (LINES-LINES/2) | yellow, white |
/// | version line         | upper panel | 8, 5          | (COLS-16) x 1      | text white |
/// | hardware line        | upper panel | 8, 7          | (COLS-16) x 1      | text white |
/// | processor and memory | upper panel | 8, 9          | (COLS-16) x 2      | text white |
/// | address block        | lower panel | 8, 1          | (COLS-16) x 7      | text black |
/// | warning area         | lower panel | 16, 9         | (COLS-32) x 6      | text dark grey |
/// | footer               | lower panel | 2, lower height-2 | (COLS-4) x 1   | text black |
///
/// The warning area is created before the footer, so where the two overlap
/// (on a screen of 25 rows the warning's third line falls on the footer's
/// row) the footer is drawn above it. A custom welcome message replaces
/// the panels: the frame is erased and boxed and the message shown in one
/// text area at 2, 2, (COLS-4) x (LINES-4), in white.
///
/// Session loop (Run):
/// - F4, when the terminal can change its colours: toggles `monochrome`
///   and draws the summary again.
/// - F2 or F12: the login dialog (LoginDialog), or, when console login is
///   disabled, LoginDisabledDialog, which never logs in. After a login F2
///   opens the System Customization menu (GeneralWindow) as a session:
///   `loggedIn` set (the idle timeout re-read), and when the menu returns
///   "User %s logged out" and the audit record "tulk.logout" (reason
///   "Session closed"). F12 opens the shutdown dialog (ShutdownDialog).
/// - An idle timeout anywhere in the login, menu or shutdown dialog logs
///   "User %s logged out due to time out" (with the last user that logged
///   in) and writes "tulk.logout" with reason "Time out".
/// - Every other key repaints the whole screen.
/// - After every round the session is marked closed, and a SIGUSR2 that
///   arrived during the session (`exitPending`) ends the process.
///
/// SIGUSR1 (ReloadHostInfo) draws the summary again with fresh host data.
/// A host-control failure while the summary is read passes out of Run as
/// HostMgr::Lib::HostMgrException (the caller logs it and ends the run).

#include <memory>

#include "toolkit/Frame.h"

namespace Tulk {

class TextArea;

class WelcomeWindow : public Frame {
 public:
  /// The full-screen frame (COLS x LINES, black and white), no owner.
  WelcomeWindow();
  /// Deletes the panels or the message area with the frame.
  ~WelcomeWindow() override;

  /// The session loop; returns only when the run is to end normally (it
  /// does not, in practice: the process ends through exit(0)).
  int Run() override;

  /// SIGUSR1: draws the summary again (DrawSummary()).
  void ReloadHostInfo() override;

  /// Draws the standard summary with fresh host data, or the custom
  /// welcome message when the host has one, and refreshes the screen.
  void DrawSummary();

 private:
  void FillSummary();
  void CreatePanels();
  void DestroyPanels();
  void ShowCustomMessage(const std::string& message);
  void RunLogin(bool shutdown);
  void EndRound();

  Window* upperPanel_ = nullptr;
  Window* lowerPanel_ = nullptr;
  TextArea* versionLine_ = nullptr;
  TextArea* hardwareLine_ = nullptr;
  TextArea* processorMemory_ = nullptr;
  TextArea* addressBlock_ = nullptr;
  TextArea* warningArea_ = nullptr;
  TextArea* footer_ = nullptr;
  TextArea* customMessage_ = nullptr;
};

}  // namespace Tulk
