#include "toolkit/InputField.h"

#include <curses.h>

#include <algorithm>

#include "include/Keys.h"

namespace Tulk {
namespace {

bool Printable(int key) {
  return key >= 0x20 && key <= 0x7e;
}

void Clear(InputField& state) {
  state.value.clear();
  state.cursor = 0;
}

}  // namespace

InputField InputField::WithValue(std::string value) {
  InputField state;
  state.value = std::move(value);
  state.cursor = state.value.size();
  return state;
}

InputField InputField::HandleKey(InputField state, int key) {
  const bool wasPristine = state.pristine;
  state.pristine = false;
  state.cursor = std::min(state.cursor, state.value.size());
  switch (key) {
    case KEY_HOME:
      state.cursor = 0;
      break;
    case KEY_LEFT:
      if (state.cursor == 0) {
        break;
      }
      if (state.cursor == state.scroll) {
        --state.scroll;
      }
      --state.cursor;
      break;
    case KEY_RIGHT:
      if (state.cursor < state.value.size()) {
        ++state.cursor;
      }
      break;
    case KEY_END:
      if (!state.value.empty()) {
        state.cursor = state.value.size();
      }
      break;
    case KEY_DC:
      if (wasPristine) {
        Clear(state);
      } else if (state.cursor < state.value.size()) {
        state.value.erase(state.cursor, 1);
      }
      break;
    case KEY_BACKSPACE:
    case kKeyCtrlH:
      if (wasPristine) {
        Clear(state);
      } else if (state.cursor > 0) {
        state.value.erase(state.cursor - 1, 1);
        --state.cursor;
        if (state.cursor < state.scroll) {
          state.scroll = 0;
          state.cursor = state.value.size();
        }
      }
      break;
    default:
      if (wasPristine) {
        Clear(state);
      }
      if (Printable(key) && (state.maxLength == 0 || state.value.size() < state.maxLength)) {
        state.value.insert(state.cursor, 1, static_cast<char>(key));
        ++state.cursor;
      }
      break;
  }
  return state;
}

int InputField::ResolveWidth(int width, int rowWidth) {
  return width == -1 ? rowWidth / 2 - 1 : width;
}

InputField::Row InputField::FormatRow(const InputField& state, std::string_view label, int rowWidth,
                                      int fieldWidth, bool focused, bool masked) {
  const long width = ResolveWidth(fieldWidth, rowWidth);
  const long length = static_cast<long>(state.value.size());
  const long cursor = std::min(static_cast<long>(state.cursor), length);
  long scroll = static_cast<long>(state.scroll);
  if (width <= length) {
    if (cursor - scroll > width) {
      scroll = cursor - width;
    }
  } else {
    scroll = width < cursor ? cursor - width : 0;
  }
  scroll = std::clamp(std::min(scroll, cursor), 0L, length);

  std::string shown = state.value.substr(static_cast<std::size_t>(scroll),
                                         static_cast<std::size_t>(std::max(width, 0L)));
  if (masked) {
    shown.assign(shown.size(), '*');
  }
  const long shownLength = static_cast<long>(shown.size());

  Row row;
  row.text.reserve(static_cast<std::size_t>(std::max(rowWidth, 0)) + 64);
  row.text += label;
  long gap = rowWidth - 5 - width - static_cast<long>(label.size());
  row.text.append(static_cast<std::size_t>(std::max(gap, 0L)), ' ');
  row.text += " [ ";
  if (focused) {
    row.text += state.pristine ? "{bgcolor:white}{color:black}" : "{bgcolor:black}{color:white}";
  }
  row.text += shown;
  if (focused) {
    row.text += "{/color}{/bgcolor}";
  }
  row.text.append(static_cast<std::size_t>(std::max(width - shownLength, 0L)), ' ');
  row.text += " ]";
  row.cursorColumn = static_cast<int>(rowWidth + cursor - 2 - scroll - width);
  row.scroll = static_cast<std::size_t>(scroll);
  return row;
}

}  // namespace Tulk
