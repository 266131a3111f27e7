#include "screens/KeyboardDialog.h"

#include <curses.h>
#include <syslog.h>

#include "include/Keys.h"
#include "platform/api/HostMgrException.h"
#include "platform/api/SystemInfoImpl.h"
#include "runtime/SystemLog.h"
#include "toolkit/ItemList.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RadioItem.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kListRows = 8;

}  // namespace

KeyboardDialog::KeyboardDialog(Frame* owner) : Dialog(owner, 60, kListRows + 11, 7) {
  try {
    HykCtl::System::SystemInfoImpl system;
    layouts_ = system.GetKeyboardLayouts();
    configured_ = system.GetKeyboardLayout();
  } catch (const HostMgr::Lib::HostMgrException& error) {
    layouts_.clear();
    readError_ = error.what();
  }
  if (Content() != nullptr) {
    list_ = new ItemList(Content(), 0, 0, Content()->Width(), Content()->Height());
  }
  std::vector<Item*> items;
  std::size_t current = 0;
  for (std::size_t i = 0; i < layouts_.size(); ++i) {
    const bool configured = layouts_[i] == configured_;
    items_.push_back(std::make_unique<RadioItem>(layouts_[i], configured));
    items.push_back(items_.back().get());
    if (configured) {
      current = i;
    }
  }
  if (list_ != nullptr) {
    list_->SetItems(items);
    list_->SelectByOrdinal(static_cast<int>(current));
  }
  Fill();
}

KeyboardDialog::~KeyboardDialog() = default;

void KeyboardDialog::Fill() {
  DrawBatch batch;
  SetTitle(Text(15));
  SetText(Text(257));
  SetFooter(Footer::kOkCancel);
  if (list_ != nullptr) {
    list_->Draw();
  }
}

void KeyboardDialog::Select(std::size_t index) {
  for (std::size_t i = 0; i < items_.size(); ++i) {
    items_[i]->SetSelected(i == index);
  }
  list_->Draw();
}

int KeyboardDialog::Fail(const std::string& logLine) {
  Log(LOG_ERR, "%s", logLine.c_str());
  MessageDialog message(this, 276, Text(280));
  RunFrame(&message);
  return 0;
}

int KeyboardDialog::Run() {
  Fill();
  if (!readError_.empty()) {
    return Fail("Getting keyboard layouts failed: " + readError_);
  }
  for (;;) {
    const int key = WaitKey();
    if (key == kKeyEsc) {
      return 0;
    }
    if (list_ == nullptr || list_->CurrentIndex() < 0) {
      continue;
    }
    if (key == KEY_DOWN) {
      list_->MoveDown();
    } else if (key == KEY_UP) {
      list_->MoveUp();
    } else if (key == kKeySpace) {
      Select(static_cast<std::size_t>(list_->CurrentIndex()));
    } else if (key == kKeyEnter) {
      break;
    }
  }
  const std::size_t index = static_cast<std::size_t>(list_->CurrentIndex());
  Select(index);
  const std::string& chosen = layouts_[index];
  if (chosen == configured_) {
    return 1;
  }
  try {
    HykCtl::System::SystemInfoImpl().SetKeyboardLayout(chosen);
  } catch (const HostMgr::Lib::HostMgrException& error) {
    return Fail(std::string("Setting keyboard layout failed: ") + error.what());
  }
  Log(LOG_INFO, "Keyboard layout changed to %s", chosen.c_str());
  configured_ = chosen;
  return 1;
}

}  // namespace Tulk
