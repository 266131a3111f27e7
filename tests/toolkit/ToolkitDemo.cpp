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
// The home frame shows "result: N" after the scene (or that the idle
// timeout ended it) and "key: K" for every key it receives; "o" opens the
// scene again, "q" ends the program.

#include <curses.h>

#include <cstdlib>
#include <memory>
#include <string>
#include <vector>

#include "host/PortGroupInfo.h"
#include "include/ColorNumbers.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "render/HostValues.h"
#include "runtime/Console.h"
#include "runtime/KeyInput.h"
#include "toolkit/CarouselRadioItem.h"
#include "toolkit/Dialog.h"
#include "toolkit/InfoDialog.h"
#include "toolkit/InputItem.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RootWindow.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"

namespace {

using namespace Tulk;

class DemoMenu : public RootWindow {
 public:
  explicit DemoMenu(Frame* owner) : RootWindow(owner) {
    const char* labels[] = {"Configure Password", "Configure Lockdown Mode", "",
                            "Restart Management Network", "View System Logs"};
    for (const char* label : labels) {
      entries_.push_back(std::make_unique<LabelItem>(label));
    }
    entries_[2]->SetEnabled(false);
    entries_[3]->SetEnabled(false);
    entries_[3]->SetText("{color:dark-grey}Restart Management Network{/color}");
  }

  void Populate() override {
    SetLeftTitle("Demo Menu");
    std::vector<Item*> items;
    for (auto& entry : entries_) {
      items.push_back(entry.get());
    }
    Menu().SetItems(items);
    Menu().Draw();
    ShowDescription();
  }

  int Run() override {
    Show();
    for (;;) {
      int key = WaitForKey(this, true);
      if (key == KEY_DOWN || key == KEY_UP) {
        if (key == KEY_DOWN ? Menu().MoveDown() : Menu().MoveUp()) {
          ShowDescription();
        }
      } else if (key == kKeyEsc) {
        return 1;
      }
    }
  }

 private:
  void ShowDescription() {
    auto* current = static_cast<LabelItem*>(Menu().Current());
    SetRightTitle(current->Label());
    Description().SetText("{color:white}Set{/color}\n\nDescription of " + current->Label());
    SetRightFooter(
        "{color:white}<Enter>{/color}{color:light-grey} Change{/color}{align:right}"
        "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}");
  }

  std::vector<std::unique_ptr<LabelItem>> entries_;
};

class InputDemo : public Dialog {
 public:
  explicit InputDemo(Frame* owner)
      : Dialog(owner, 60, 13, 6), name_("Login Name:", "root", 30), password_("Password:", "", 30) {
    SetTitle("Authentication Required");
    SetText("Enter an authorized login name and password for demo.");
    SetFooter(Footer::kOkCancel);
    password_.SetMasked(true);
    list_ = new ItemList(Content(), 0, 0, Content()->Width(), 2);
    list_->SetItems({&name_, &password_});
  }

  int Run() override {
    ShowCursor(true);
    list_->Draw();
    int result = 0;
    for (;;) {
      int key = WaitKey();
      if (key == kKeyEnter || key == kKeyEsc) {
        result = key == kKeyEnter ? 1 : 0;
        break;
      }
      if (key == KEY_DOWN) {
        list_->MoveDown();
      } else if (key == KEY_UP) {
        list_->MoveUp();
      } else {
        static_cast<InputItem*>(list_->Current())->HandleKey(key);
        list_->Draw();
      }
    }
    ShowCursor(false);
    return result;
  }

  std::string Values() const { return name_.Value() + "/" + password_.Value(); }

 private:
  InputItem name_;
  InputItem password_;
  ItemList* list_;
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
      MessageDialog dialog(this, 162, "The new password and the confirmed password do not match.");
      result = RunFrame(&dialog);
    } else if (name == "menu") {
      DemoMenu menu(this);
      result = RunFrame(&menu);
    } else if (name == "input") {
      InputDemo dialog(this);
      result = RunFrame(&dialog);
      detail = " values: " + dialog.Values();
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
