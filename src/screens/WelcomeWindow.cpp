#include "screens/WelcomeWindow.h"

#include <curses.h>
#include <syslog.h>

#include <cstdlib>

#include "host/AuditLog.h"
#include "host/SystemSettings.h"
#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"
#include "render/TextId.h"
#include "runtime/KeyInput.h"
#include "runtime/Palette.h"
#include "runtime/SystemLog.h"
#include "screens/ConsoleLogin.h"
#include "screens/GeneralWindow.h"
#include "screens/LoginDialog.h"
#include "screens/LoginDisabledDialog.h"
#include "screens/ShutdownDialog.h"
#include "screens/WelcomeSummary.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

// The no-adapter alert goes to the host once per process.
bool g_noAdapterAlertSent = false;

}  // namespace

WelcomeWindow::WelcomeWindow() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
}

WelcomeWindow::~WelcomeWindow() = default;

void WelcomeWindow::ReloadHostInfo() {
  DrawSummary();
}

void WelcomeWindow::DrawSummary() {
  DrawBatch batch;
  const std::string message = ReadWelcomeMessage();
  if (!message.empty()) {
    ShowCustomMessage(message);
  } else {
    if (customMessage_ != nullptr) {
      delete customMessage_;
      customMessage_ = nullptr;
    }
    if (upperPanel_ == nullptr) {
      CreatePanels();
    }
    FillSummary();
  }
  Redraw(Active());
  Update();
}

void WelcomeWindow::ShowCustomMessage(const std::string& message) {
  DestroyPanels();
  if (customMessage_ == nullptr) {
    Erase();
    Box();
    customMessage_ = new TextArea(this, 2, 2, Width() - 4, Height() - 4, -1, kWhite);
  }
  customMessage_->SetText(message);
}

void WelcomeWindow::CreatePanels() {
  const int cols = Width();
  const int upperHeight = Height() / 2;
  const int lowerHeight = Height() - upperHeight;
  Erase();
  upperPanel_ = new Window(this, 0, 0, cols, upperHeight, kDarkGrey, kWhite);
  // The lower panel's own cells are blank: they take the colour of the
  // text beside them, so that the terminal is not told to change colour
  // for cells where no colour shows.
  lowerPanel_ = new Window(this, 0, upperHeight, cols, lowerHeight, kYellow, kBlack);
  Box();
  versionLine_ = new TextArea(upperPanel_, 8, 5, cols - 16, 1);
  hardwareLine_ = new TextArea(upperPanel_, 8, 7, cols - 16, 1);
  processorMemory_ = new TextArea(upperPanel_, 8, 9, cols - 16, 2);
  addressBlock_ = new TextArea(lowerPanel_, 8, 1, cols - 16, 7, -1, kBlack);
  warningArea_ = new TextArea(lowerPanel_, 16, 9, cols - 32, 6, -1, kDarkGrey);
  footer_ = new TextArea(lowerPanel_, 2, lowerHeight - 2, cols - 4, 1, -1, kBlack);
  footer_->SetText(WelcomeSummary::Footer(*Strings()));
}

void WelcomeWindow::DestroyPanels() {
  delete upperPanel_;
  delete lowerPanel_;
  upperPanel_ = nullptr;
  lowerPanel_ = nullptr;
  versionLine_ = nullptr;
  hardwareLine_ = nullptr;
  processorMemory_ = nullptr;
  addressBlock_ = nullptr;
  warningArea_ = nullptr;
  footer_ = nullptr;
}

void WelcomeWindow::FillSummary() {
  StringFactory& strings = *Strings();
  const WelcomeFacts facts = ReadWelcomeFacts();
  warningArea_->SetText(WelcomeSummary::Warning(facts, strings));
  if (!facts.hasPhysicalNics && !g_noAdapterAlertSent) {
    g_noAdapterAlertSent = RaiseSystemAlert(WelcomeSummary::kNoAdapterAlert);
  }
  addressBlock_->SetText(WelcomeSummary::AddressBlock(facts, strings));
  versionLine_->SetText(Text(TextId::kVersionLine));
  hardwareLine_->SetText(WelcomeSummary::HardwareLine(facts.vendor, facts.product));
  processorMemory_->SetText(WelcomeSummary::ProcessorAndMemory(facts));
}

int WelcomeWindow::Run() {
  DrawSummary();
  for (;;) {
    const int key = WaitForKey(this, false);
    if (key == KEY_F(4) && PaletteChangeable()) {
      monochrome = !monochrome;
      DrawSummary();
    } else if (key == KEY_F(2) || key == KEY_F(12)) {
      RunLogin(key == KEY_F(12));
    } else {
      clearok(curscr, TRUE);
      DrawSummary();
    }
    EndRound();
  }
}

void WelcomeWindow::RunLogin(bool shutdown) {
  try {
    std::unique_ptr<Dialog> login;
    if (IsConsoleLoginAllowed()) {
      login = std::make_unique<LoginDialog>(this);
    } else {
      login = std::make_unique<LoginDisabledDialog>(this);
    }
    if (RunFrame(login.get()) == 0) {
      return;
    }
    if (shutdown) {
      auto dialog = std::make_unique<ShutdownDialog>(this);
      RunFrame(dialog.get());
      DrawSummary();
      return;
    }
    SetLoggedIn(true);
    auto menu = std::make_unique<GeneralWindow>(this);
    RunFrame(menu.get());
    SetLoggedIn(false);
    Log(LOG_INFO, "User %s logged out", currentUser.c_str());
    WriteAuditRecord(kAuditLogout, currentUser, true, {{"reason", "Session closed"}});
    DrawSummary();
  } catch (const TulkTimeout&) {
    Log(LOG_INFO, "User %s logged out due to time out", currentUser.c_str());
    WriteAuditRecord(kAuditLogout, currentUser, true, {{"reason", "Time out"}});
    DrawBatch batch;
    Redraw(true);
    DrawSummary();
    currentWindow = this;
  }
}

void WelcomeWindow::EndRound() {
  SetLoggedIn(false);
  if (exitPending) {
    std::exit(0);
  }
}

}  // namespace Tulk
