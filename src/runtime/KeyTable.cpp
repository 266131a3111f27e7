#include "runtime/KeyTable.h"

#include <curses.h>

namespace Tulk {
namespace {

#define ESC "\x1b"

const KeySequence kSequences[] = {
    {ESC "R", KEY_RESIZE},   {ESC "[11~", KEY_F(1)},  {ESC "[12~", KEY_F(2)},
    {ESC "[13~", KEY_F(3)},  {ESC "[14~", KEY_F(4)},  {ESC "[15~", KEY_F(5)},
    {ESC "[17~", KEY_F(6)},  {ESC "[18~", KEY_F(7)},  {ESC "[19~", KEY_F(8)},
    {ESC "[20~", KEY_F(9)},  {ESC "[21~", KEY_F(10)}, {ESC "[23~", KEY_F(11)},
    {ESC "[24~", KEY_F(12)}, {ESC "1", KEY_F(1)},     {ESC "2", KEY_F(2)},
    {ESC "3", KEY_F(3)},     {ESC "4", KEY_F(4)},     {ESC "5", KEY_F(5)},
    {ESC "6", KEY_F(6)},     {ESC "7", KEY_F(7)},     {ESC "8", KEY_F(8)},
    {ESC "9", KEY_F(9)},     {ESC "0", KEY_F(10)},    {ESC "!", KEY_F(11)},
    {ESC "@", KEY_F(12)},    {ESC "h", KEY_HOME},     {ESC "k", KEY_END},
    {ESC "+", KEY_IC},       {ESC "-", KEY_DC},       {ESC "?", KEY_PPAGE},
    {ESC "/", KEY_NPAGE},    {ESC "[M", KEY_F(1)},    {ESC "[N", KEY_F(2)},
    {ESC "[O", KEY_F(3)},    {ESC "[P", KEY_F(4)},    {ESC "[Q", KEY_F(5)},
    {ESC "[R", KEY_F(6)},    {ESC "[S", KEY_F(7)},    {ESC "[T", KEY_F(8)},
    {ESC "[U", KEY_F(9)},    {ESC "[V", KEY_F(10)},   {ESC "[W", KEY_F(11)},
    {ESC "[X", KEY_F(12)},   {ESC "OP", KEY_F(1)},    {ESC "OQ", KEY_F(2)},
    {ESC "OR", KEY_F(3)},    {ESC "OS", KEY_F(4)},    {ESC "OT", KEY_F(5)},
    {ESC "OU", KEY_F(6)},    {ESC "OV", KEY_F(7)},    {ESC "OW", KEY_F(8)},
    {ESC "OX", KEY_F(9)},    {ESC "OY", KEY_F(12)},   {ESC "OA", KEY_UP},
    {ESC "OB", KEY_DOWN},    {ESC "OC", KEY_RIGHT},   {ESC "OD", KEY_LEFT},
    {ESC "[A", KEY_UP},      {ESC "[B", KEY_DOWN},    {ESC "[C", KEY_RIGHT},
    {ESC "[D", KEY_LEFT},    {ESC "[2~", KEY_IC},     {ESC "[3~", KEY_DC},
    {ESC "[1~", KEY_HOME},   {ESC "[4~", KEY_END},    {ESC "[5~", KEY_PPAGE},
    {ESC "[6~", KEY_NPAGE},  {"\x7f", KEY_BACKSPACE},
};

#undef ESC

}  // namespace

std::span<const KeySequence> KeySequences() {
  return kSequences;
}

void DefineKeys() {
  for (const KeySequence& entry : kSequences) {
    define_key(entry.sequence, entry.key);
  }
}

int EscapeDelay(const char* environmentValue) {
  if (environmentValue == nullptr || *environmentValue == '\0') {
    return kEscDelayMs;
  }
  long value = 0;
  for (const char* digit = environmentValue; *digit != '\0'; ++digit) {
    if (*digit < '0' || *digit > '9') {
      return kEscDelayMs;
    }
    value = value * 10 + (*digit - '0');
    if (value > kMaxEscDelayMs) {
      return kEscDelayMs;
    }
  }
  return static_cast<int>(value);
}

}  // namespace Tulk
