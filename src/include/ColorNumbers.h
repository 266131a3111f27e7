#pragma once
/// The six curses colour numbers the console draws with.
///
/// 2, 3 and 6 are redefined by InitColors() (runtime/Palette.h) to light
/// grey, amber and dark grey; 4 and 5 are never used.

namespace Tulk {

inline constexpr int kBlack = 0;
inline constexpr int kRed = 1;
inline constexpr int kLightGrey = 2;
inline constexpr int kYellow = 3;
inline constexpr int kDarkGrey = 6;
inline constexpr int kWhite = 7;

}  // namespace Tulk
