#pragma once
/// The field both timeout dialogs use, and their layout.
///
/// A timeout field shows its minutes in decimal in a box five columns wide,
/// takes digits and the editing keys only (kDigits) and at most five
/// characters: a sixth digit is not taken, although input fields otherwise
/// scroll.

#include <cstdint>
#include <string>

namespace Tulk {

class FormDialog;
class InputItem;

/// Header heights: the heading texts fill them, the fields the client
/// area below.
inline constexpr int kShellTimeoutHeaderHeight = 15;
inline constexpr int kTulkTimeoutHeaderHeight = 9;

/// Adds a timeout field labelled `label` holding `minutes` to `form`.
InputItem& AddTimeoutField(FormDialog& form, std::string label, std::uint32_t minutes);

}  // namespace Tulk
