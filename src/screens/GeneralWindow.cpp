#include "screens/GeneralWindow.h"

#include <curses.h>

#include "host/HostTools.h"
#include "host/ManagementNetwork.h"
#include "include/Keys.h"
#include "include/ProcessFlags.h"
#include "runtime/KeyInput.h"
#include "screens/ChangePasswordDialog.h"
#include "screens/KeyboardDialog.h"
#include "screens/LockdownDialog.h"
#include "screens/LogPager.h"
#include "screens/ManagementNetworkView.h"
#include "screens/RestoreDialog.h"
#include "screens/ScreenRegistry.h"
#include "screens/SupportPages.h"
#include "toolkit/ItemList.h"
#include "toolkit/LabelItem.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"
#include "toolkit/TextArea.h"

namespace Tulk {
namespace {

constexpr char kLockdownQuery[] = "osksvc/auth/lockdown_is_enabled";

// The right-hand footers. The lockdown footer lacks the "{/color}" after
// "<Enter>" that the password footer has; both are kept as they are.
constexpr char kPasswordFooter[] =
    "{color:white}<Enter>{/color}{color:light-grey} Change{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kLockdownFooter[] =
    "{color:white}<Enter>{color:light-grey} Change{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kMoreFooter[] =
    "{color:white}<Enter>{/color}{color:light-grey} More{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kRestartFooter[] =
    "{color:white}<Enter>{/color}{color:light-grey} Restart{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kRunTestFooter[] =
    "{color:white}<Enter>{/color}{color:light-grey} Run Test{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kResetFooter[] =
    "{color:white}<Enter>{/color}{color:light-grey} Reset{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kSupportFooter[] =
    "{color:light-grey}<Page Up> <Page Down>{/color}{align:right}"
    "{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";
constexpr char kLogOutFooter[] =
    "{align:right}{color:white}<Esc>{/color}{color:light-grey} Log Out{/color}{/align}";

// Frames opened from the menu live on the stack, so that the idle timeout
// unwinding through them deletes them too.
void ShowMessage(Frame* owner, std::uint32_t titleId, std::uint32_t textId) {
  MessageDialog message(owner, titleId, owner->Text(textId));
  RunFrame(&message);
}

template <typename DialogType>
int RunDialog(Frame* owner) {
  DialogType dialog(owner);
  return RunFrame(&dialog);
}

}  // namespace

GeneralWindow::GeneralWindow(Frame* owner) : RootWindow(owner) {
  ReadHostState();
  BuildEntries();
  supportPages_ = ReadSupportPages();
  supportPage_ = 0;
}

GeneralWindow::~GeneralWindow() = default;

void GeneralWindow::ReadHostState() {
  hostState_ = ReadMenuHostState();
  lockdownEnabled_ = OskCmdGetFlag(kLockdownQuery);
}

void GeneralWindow::BuildEntries() {
  entryIds_.clear();
  items_.clear();
  for (const MenuEntry& entry : BuildMenuEntries(hostState_, localConsole)) {
    entryIds_.push_back(entry.id);
    auto item = std::make_unique<LabelItem>(EntryLabel(Text(entry.id), entry.enabled));
    item->SetEnabled(entry.enabled);
    items_.push_back(std::move(item));
  }
  // The menu must never point at the items just replaced.
  std::vector<Item*> items;
  for (auto& item : items_) {
    items.push_back(item.get());
  }
  Menu().SetItems(items);
}

void GeneralWindow::Populate() {
  DrawBatch batch;
  const std::uint32_t keep = selected_;
  SetLeftTitle(Text(4));
  SetLeftFooter(kSelectFooter);
  Menu().SetItems(Menu().Items());
  SelectId(keep);
  selected_ = SelectedId();
  Menu().Draw();
  ShowDescription();
}

void GeneralWindow::SelectId(std::uint32_t id) {
  for (std::size_t i = 0; i < entryIds_.size(); ++i) {
    if (entryIds_[i] == id && items_[i]->Enabled()) {
      Menu().SelectByOrdinal(static_cast<int>(i));
      return;
    }
  }
}

std::uint32_t GeneralWindow::SelectedId() const {
  const int index = Menu().CurrentIndex();
  if (index < 0 || static_cast<std::size_t>(index) >= entryIds_.size()) {
    return kEntrySeparator;
  }
  return entryIds_[static_cast<std::size_t>(index)];
}

void GeneralWindow::ShowDescription() {
  DrawBatch batch;
  const std::uint32_t id = SelectedId();
  std::string text;
  const char* footer = kLogOutFooter;
  switch (id) {
    case kEntryPassword:
      text = std::string("{color:white}") + Text(passwordWasEmpty ? 120 : 119) + "{/color}\n\n" +
             Text(23);
      footer = kPasswordFooter;
      break;
    case kEntryLockdown:
      text = std::string("{color:white}") + Text(lockdownEnabled_ ? 121 : 122) + "{/color}\n\n" +
             Text(24);
      footer = kLockdownFooter;
      break;
    case kEntryManagementNetwork:
      text = FormatManagementNetworkView(ReadManagementNetworkView(), *Strings(),
                                         Description().Width());
      footer = kMoreFooter;
      break;
    case kEntryRestartNetwork:
      text = Text(26);
      footer = kRestartFooter;
      break;
    case kEntryTestNetwork:
      text = Text(27);
      footer = kRunTestFooter;
      break;
    case kEntryNetworkRestore:
      text = Text(28);
      footer = kMoreFooter;
      break;
    case kEntrySupportInformation:
      if (supportPage_ < supportPages_.size()) {
        text = supportPages_[supportPage_];
      }
      footer = kSupportFooter;
      break;
    case kEntrySystemLogs:
      text = LogsDescription();
      break;
    case kEntryTroubleshooting:
      text = Text(30);
      footer = kMoreFooter;
      break;
    case kEntryResetConfiguration:
      text = Text(31);
      footer = kResetFooter;
      break;
    case kEntryKeyboard:
      text = Text(34);
      footer = kMoreFooter;
      break;
    default:
      break;
  }
  SetRightTitle(Text(id));
  Description().SetText(text);
  SetRightFooter(footer);
}

std::string GeneralWindow::LogsDescription() {
  const std::string list = logs_.Describe();
  return list.empty() ? std::string(Text(29)) : list + "\n" + Text(29);
}

int GeneralWindow::Run() {
  Show();
  for (;;) {
    const int key = WaitForKey(this, true);
    const std::uint32_t id = SelectedId();
    if (key == KEY_DOWN || key == KEY_UP) {
      Move(key == KEY_DOWN);
    } else if (key == KEY_NPAGE || key == KEY_PPAGE) {
      if (id == kEntrySupportInformation) {
        TurnSupportPage(key == KEY_NPAGE);
      }
    } else if (key >= '0' && key <= '9') {
      if (id == kEntrySystemLogs) {
        OpenLog(key - '0');
      }
    } else if (key == kKeyEsc) {
      return 1;
    } else if (key == kKeyEnter) {
      if (OpenSelected()) {
        Show();
      }
    }
  }
}

void GeneralWindow::Move(bool down) {
  if (SelectedId() == kEntrySupportInformation) {
    supportPage_ = 0;
  }
  DrawBatch batch;
  if (down ? Menu().MoveDown() : Menu().MoveUp()) {
    selected_ = SelectedId();
    ShowDescription();
  }
}

void GeneralWindow::TurnSupportPage(bool forward) {
  if (forward && supportPage_ + 1 < supportPages_.size()) {
    ++supportPage_;
  } else if (!forward && supportPage_ > 0) {
    --supportPage_;
  } else {
    return;
  }
  ShowDescription();
}

void GeneralWindow::OpenLog(int digit) {
  if (std::optional<std::size_t> row = logs_.RowForDigit(digit); row) {
    ShowLogInPager(this, logs_.Rows()[*row].path);
  }
}

bool GeneralWindow::OpenSelected() {
  switch (SelectedId()) {
    case kEntryPassword: {
      ChangePasswordDialog dialog(this, currentUser);
      RunFrame(&dialog);
      return true;
    }
    case kEntryLockdown:
      if (RunDialog<LockdownDialog>(this) != 0) {
        lockdownEnabled_ = OskCmdGetFlag(kLockdownQuery);
      }
      return true;
    case kEntryManagementNetwork:
      return OpenRegistered(ScreenId::ManagementNetwork);
    case kEntryRestartNetwork:
      if (!GetManagementInterface()) {
        ShowMessage(this, 16, 19);
        return true;
      }
      return OpenRegistered(ScreenId::RestartManagementNetwork);
    case kEntryTestNetwork:
      return OpenRegistered(ScreenId::TestManagementNetwork);
    case kEntryNetworkRestore:
      return OpenRegistered(ScreenId::NetworkRestore);
    case kEntryTroubleshooting:
      return OpenRegistered(ScreenId::Troubleshooting);
    case kEntryResetConfiguration:
      if (RunDialog<RestoreDialog>(this) == 0) {
        ShowMessage(this, 21, 22);
      }
      return true;
    case kEntryKeyboard:
      RunDialog<KeyboardDialog>(this);
      return true;
    default:
      return false;
  }
}

bool GeneralWindow::OpenRegistered(ScreenId screen) {
  if (!ScreenRegistry::Has(screen)) {
    return false;
  }
  ScreenRegistry::Open(screen, this);
  return true;
}

void GeneralWindow::ReloadHostInfo() {
  ReadHostState();
  BuildEntries();
  Show();
}

}  // namespace Tulk
