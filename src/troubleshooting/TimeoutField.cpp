#include "troubleshooting/TimeoutField.h"

#include "toolkit/FormDialog.h"
#include "toolkit/InputItem.h"

namespace Tulk {
namespace {

constexpr int kFieldWidth = 5;
constexpr std::size_t kFieldLength = 5;

}  // namespace

InputItem& AddTimeoutField(FormDialog& form, std::string label, std::uint32_t minutes) {
  return form.AddInput(std::move(label), std::to_string(minutes), kFieldWidth, kDigits,
                       kFieldLength);
}

}  // namespace Tulk
