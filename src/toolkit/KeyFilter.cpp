#include "toolkit/KeyFilter.h"

#include <curses.h>

#include "include/Keys.h"

namespace Tulk {
namespace {

bool InRange(int key, int low, int high) {
  return key >= low && key <= high;
}

}  // namespace

bool KeyFilter::IsEditingKey(int key, Editing editing) {
  switch (key) {
    case KEY_LEFT:
    case KEY_RIGHT:
    case KEY_HOME:
    case KEY_END:
    case KEY_BACKSPACE:
      return true;
    case KEY_DC:
    case kKeyCtrlH:
      return editing == Editing::kFull;
    default:
      return false;
  }
}

bool KeyFilter::Accepts(int key) const {
  if (IsEditingKey(key, editing)) {
    return true;
  }
  if (!InRange(key, 0x20, 0x7e)) {
    return false;
  }
  if ((classes & kClassPrintable) != 0) {
    return true;
  }
  if ((classes & kClassDigits) != 0 && InRange(key, '0', '9')) {
    return true;
  }
  if ((classes & kClassLetters) != 0 && (InRange(key, 'a', 'z') || InRange(key, 'A', 'Z'))) {
    return true;
  }
  if ((classes & kClassHexLetters) != 0 && (InRange(key, 'a', 'f') || InRange(key, 'A', 'F'))) {
    return true;
  }
  return punctuation.find(static_cast<char>(key)) != std::string_view::npos;
}

}  // namespace Tulk
