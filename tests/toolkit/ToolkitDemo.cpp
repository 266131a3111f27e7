// Test-only program: the real console start-up (palette, key table, key
// loop) with a home frame that opens one toolkit scene. The toolkit's
// screen tests drive it in a pseudo-terminal.
//
// TULK_DEMO_SCENE chooses the scene:
//   dialog    a 60 x 9 dialog with a header of 6 rows (Enter 1, Esc 0)
//   message   a message dialog
//   menu      a root window with a menu (a separator, a disabled entry)
//   input     a dialog with a login name and a masked password field
//   carousel  a dialog with a carousel over portgroups
//   form      a form with two radio buttons and a digits-only VLAN field
//   confirm   an F11 question with a check box; yesno: a Y/N/Esc question
//   progress  a report whose step is a worker thread reading a FIFO
// The home frame shows "result: N" after the scene (or that the idle
// timeout ended it) and "key: K" for every key it receives; "o" opens the
// scene again, "q" ends the program.

#include <curses.h>

#include <cstdlib>
#include <fstream>
#include <memory>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include "host/PortGroupInfo.h"
#include "host/VlanInput.h"
#include "include/ColorNumbers.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "render/HostValues.h"
#include "render/TextId.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "runtime/WorkerResult.h"
#include "toolkit/CarouselRadioItem.h"
#include "toolkit/CheckItem.h"
#include "toolkit/ConfirmDialog.h"
#include "toolkit/Dialog.h"
#include "toolkit/FormDialog.h"
#include "toolkit/InfoDialog.h"
#include "toolkit/InputItem.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MenuWindow.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/ProgressDialog.h"
#include "toolkit/RadioGroup.h"
#include "toolkit/RadioItem.h"
#include "toolkit/RootWindow.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"

namespace {

using namespace Tulk;

class DemoMenu : public MenuWindow {
 public:
  explicit DemoMenu(Frame* owner) : MenuWindow(owner) {
    SetMenuTitle("Demo Menu");
    const std::pair<const char*, bool> rows[] = {{"Configure Password", true},
                                                 {"Configure Lockdown Mode", true},
                                                 {"", false},
                                                 {"Restart Management Network", false},
                                                 {"View System Logs", true}};
    std::vector<MenuEntry> entries;
    for (const auto& [label, enabled] : rows) {
      MenuEntry entry;
      entry.label = label;
      entry.enabled = enabled;
      entry.describe = [text = std::string(label)] {
        return "{color:white}Set{/color}\n\nDescription of " + text;
      };
      entry.footer = Footer::MenuAction("Change", "Log Out");
      entry.action = [this, text = std::string(label)] {
        MessageDialog opened(this, TextId::kOperationSucceeded, "Opened " + text);
        RunFrame(&opened);
        return true;
      };
      entries.push_back(std::move(entry));
    }
    SetEntries(std::move(entries));
  }
};

class InputDemo : public FormDialog {
 public:
  explicit InputDemo(Frame* owner) : FormDialog(owner, 60, 13, 6) {
    SetTitle("Authentication Required");
    SetText("Enter an authorized login name and password for demo.");
    SetFooter(Footer::kOkCancel);
    name_ = &AddInput("Login Name:", "root", 30);
    password_ = &AddInput("Password:", "", 30);
    password_->SetMasked(true);
    PlaceList(0, 0, Content()->Width(), 2);
  }

  std::string Values() const { return name_->Value() + "/" + password_->Value(); }

 private:
  InputItem* name_;
  InputItem* password_;
};

// A VLAN form: the id is taken only in manual mode, digits only, at most
// four; Enter checks it with the shared rule.
class FormDemo : public FormDialog {
 public:
  explicit FormDemo(Frame* owner) : FormDialog(owner, 70, 14, 6) {
    SetTitle(Text(TextId::kVlanOptional));
    SetText(Text(TextId::kVlanText));
    SetFooter(Footer::kSelectMarkOkCancel);
    AddRadio(mode_, "No VLAN");
    auto& manual = AddRadio(mode_, "This VLAN:");
    vlan_ = &AddInput(Text(TextId::kVlanLabel), "", 6, kDigits, 4);
    mode_.SetDependents(&manual, {vlan_});
  }

  std::string Values() const {
    return std::string(mode_.SelectedIndex() == 0 ? "none" : "vlan ") +
           (mode_.SelectedIndex() == 0 ? "" : vlan_->Value());
  }

 protected:
  bool Accept() override {
    if (mode_.SelectedIndex() == 1 &&
        VlanInput::Parse(vlan_->Value()).kind == VlanInput::Kind::kInvalid) {
      return Reject(*vlan_, TextId::kInvalidVlanTitle, TextId::kInvalidVlan);
    }
    return true;
  }

 private:
  RadioGroup mode_;
  InputItem* vlan_;
};

// A progress report whose one step is a worker: the worker reads its
// outcome from the FIFO <TULK_ROOT>/tmp/worker ("0" succeeds).
class ProgressDemo : public ProgressDialog {
 public:
  explicit ProgressDemo(Frame* owner) : ProgressDialog(owner, 60, 12, 7) {
    SetTitle("Demo Progress");
    SetText("Please wait.");
    SetFooter(Footer::kCancel);
  }

  int Run() override {
    Append("Waiting for the worker. ");
    auto result = WorkerResult::Create();
    const char* root = std::getenv("TULK_ROOT");
    std::thread([result, path = std::string(root != nullptr ? root : "") + "/tmp/worker"] {
      std::ifstream in(path);
      int value = 1;
      in >> value;
      result->Set(value);
    }).detach();
    for (;;) {
      const int key = WaitKeyOrResult(*result);
      if (key == kKeyEsc) {
        return 0;
      }
      if (key == kKeyResultReady) {
        break;
      }
    }
    AppendOutcome(result->Get() == 0);
    return Finish(Footer::kProgressOk);
  }
};

using PortGroupCarousel = CarouselRadioItem<PortGroupInfo, InfoDialog>;

class CarouselDemo : public Dialog {
 public:
  explicit CarouselDemo(Frame* owner)
      : Dialog(owner, 70, 13, 6),
        heading_(PortGroupInfo("", "", "", "").Heading(), false),
        carousel_({PortGroupInfo("Management Network", "vSwitch0", "1", "0"),
                   PortGroupInfo("VM Network", "vSwitch1", "3", "20")}) {
    SetTitle("Portgroups");
    SetFooter(
        "{color:black}<D>{/color} {color:dark-grey}View Details{/color}  {color:black}"
        "<Left/Right>{/color} {color:dark-grey}Change{/color}");
    list_ = new ItemList(Content(), 0, 0, Content()->Width(), 3);
    list_->SetItems({&heading_, &carousel_});
  }

  int Run() override {
    list_->Draw();
    for (;;) {
      int key = WaitKey();
      if (key == kKeyEnter) {
        return 1;
      }
      if (key == kKeyEsc) {
        return 0;
      }
      if (carousel_.HandleKey(key, this)) {
        list_->Draw();
      }
    }
  }

 private:
  LabelItem heading_;
  PortGroupCarousel carousel_;
  ItemList* list_;
};

class DemoHome : public Frame {
 public:
  DemoHome() : Frame(nullptr, 0, 0, COLS, LINES, kBlack, kWhite) {
    Box();
    PutText(2, 1, "TOOLKIT DEMO");
  }

  int Run() override {
    RunSceneUntilTimeout();
    for (;;) {
      int key = WaitForKey(this, false);
      if (key == 'q') {
        return 0;
      }
      if (key == 'o') {
        RunSceneUntilTimeout();
        continue;
      }
      const char* name = keyname(key);
      PutText(2, 4, std::string("key: ") + (name != nullptr ? name : "?") + "     ");
      Update();
    }
  }

 private:
  // The idle timeout unwinds the scene back to here, as it does to the
  // welcome screen.
  void RunSceneUntilTimeout() {
    try {
      RunScene();
    } catch (const TulkTimeout&) {
      PutText(2, 3,
              std::string("timed out, current window ") +
                  (currentWindow == nullptr ? "cleared" : "set"));
      Redraw(true);
      currentWindow = this;
    }
  }

  void RunScene() {
    const char* scene = std::getenv("TULK_DEMO_SCENE");
    std::string name = scene != nullptr ? scene : "dialog";
    int result = 0;
    std::string detail;
    if (name == "message") {
      MessageDialog dialog(this, TextId::kPasswordErrorTitle,
                           "The new password and the confirmed password do not match.");
      result = RunFrame(&dialog);
    } else if (name == "menu") {
      DemoMenu menu(this);
      result = RunFrame(&menu);
    } else if (name == "input") {
      InputDemo dialog(this);
      result = RunFrame(&dialog);
      detail = " values: " + dialog.Values();
    } else if (name == "form") {
      FormDemo dialog(this);
      result = RunFrame(&dialog);
      detail = " values: " + dialog.Values();
    } else if (name == "confirm" || name == "yesno") {
      const bool f11 = name == "confirm";
      ConfirmDialog dialog(this, 60, 14, 6, f11 ? ConfirmKeys::kF11 : ConfirmKeys::kYesNo);
      dialog.SetTitle("Demo Question");
      dialog.SetQuestion("Go ahead?");
      dialog.SetFooter(f11 ? Footer::kF11OkCancel : Footer::kYesNoCancel);
      if (f11) {
        dialog.AddCheck("Collect extra information", 0, 2, 40);
      }
      result = RunFrame(&dialog);
      if (dialog.Check() != nullptr) {
        detail = dialog.Check()->Checked() ? " checked" : " unchecked";
      }
    } else if (name == "progress") {
      ProgressDemo dialog(this);
      result = RunFrame(&dialog);
    } else if (name == "carousel") {
      CarouselDemo dialog(this);
      result = RunFrame(&dialog);
    } else {
      Dialog dialog(this, 60, 9, 6);
      dialog.SetTitle("Demo Dialog");
      dialog.SetText("Header text of the demo");
      dialog.SetFooter(Footer::kOkCancel);
      result = RunFrame(&dialog);
    }
    PutText(2, 3, "result: " + std::to_string(result) + detail);
    Update();
  }
};

}  // namespace

int main(int argc, char** argv) {
  ConsoleHooks hooks;
  hooks.afterStartup = [] {
    SetVersionLineSource([](std::string& line) {
      line = "Demo Hypervisor 8.0.1 (HyKernel 8.0.1 Build 1234)";
      return true;
    });
  };
  hooks.runWelcome = [] {
    DemoHome home;
    RunFrame(&home);
  };
  return ConsoleMain(argc, argv, hooks);
}
