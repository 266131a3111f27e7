#pragma once
/// The extra escape sequences of the terminals the console meets (serial
/// consoles, remote terminals, the Linux console), taught to curses with
/// define_key() at start-up.

#include <span>

namespace Tulk {

struct KeySequence {
  const char* sequence;
  int key;
};

/// The sequences in registration order. In the ESC O group ESC O Y is F12
/// and there is no sequence for F10 or F11; the gap is deliberate.
std::span<const KeySequence> KeySequences();

/// Registers every sequence of KeySequences() with curses, in order.
void DefineKeys();

/// How long curses waits after a lone Esc for the rest of a sequence, in
/// milliseconds. Long enough for a sequence sent over a 9600-baud line
/// (about one millisecond a byte), short enough that Esc acts at once.
inline constexpr int kEscDelayMs = 25;

/// Longest escape delay taken from the environment, in milliseconds.
inline constexpr int kMaxEscDelayMs = 60000;

/// The escape delay to use, given the value of ESCDELAY in the environment
/// (null when unset): that value when it is a whole number of milliseconds
/// from 0 to kMaxEscDelayMs, so that a slow remote line that splits escape
/// sequences can be given more time; kEscDelayMs otherwise.
int EscapeDelay(const char* environmentValue);

}  // namespace Tulk
