#include "screens/KeyboardDialog.h"

#include <syslog.h>

#include "host/SystemSettings.h"
#include "render/TextId.h"
#include "runtime/SystemLog.h"
#include "toolkit/ItemList.h"
#include "toolkit/MessageDialog.h"
#include "toolkit/RunFrame.h"

namespace Tulk {
namespace {

constexpr int kListRows = 8;

}  // namespace

KeyboardDialog::KeyboardDialog(Frame* owner) : FormDialog(owner, 60, kListRows + 11, 7) {
  KeyboardLayouts read = ReadKeyboardLayouts();
  layouts_ = std::move(read.layouts);
  configured_ = std::move(read.configured);
  readError_ = std::move(read.error);
  std::size_t current = 0;
  for (std::size_t i = 0; i < layouts_.size(); ++i) {
    AddRadio(group_, layouts_[i]);
    if (layouts_[i] == configured_) {
      current = i;
    }
  }
  group_.SelectIndex(current);
  List().SelectByOrdinal(static_cast<int>(current));
  SetTitle(Text(TextId::kConfigureKeyboard));
  SetText(Text(TextId::kKeyboardText));
  SetFooter(Footer::kOkCancel);
}

KeyboardDialog::~KeyboardDialog() = default;

void KeyboardDialog::Fail(const std::string& logLine) {
  Log(LOG_ERR, "%s", logLine.c_str());
  MessageDialog message(this, TextId::kOperationFailed, Text(TextId::kCheckSyslog));
  RunFrame(&message);
}

int KeyboardDialog::Run() {
  if (!readError_.empty()) {
    Redisplay();
    Fail("Getting keyboard layouts failed: " + readError_);
    return 0;
  }
  return FormDialog::Run();
}

bool KeyboardDialog::Accept() {
  const int index = List().CurrentIndex();
  if (index < 0) {
    return false;
  }
  group_.SelectIndex(static_cast<std::size_t>(index));
  Redisplay();
  const std::string& chosen = layouts_[static_cast<std::size_t>(index)];
  if (chosen == configured_) {
    return true;
  }
  std::string error;
  if (!WriteKeyboardLayout(chosen, error)) {
    Fail("Setting keyboard layout failed: " + error);
    SetAcceptResult(0);
    return true;
  }
  Log(LOG_INFO, "Keyboard layout changed to %s", chosen.c_str());
  configured_ = chosen;
  return true;
}

}  // namespace Tulk
