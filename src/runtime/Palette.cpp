#include "runtime/Palette.h"

#include "include/ColorNumbers.h"
#include "include/ProcessFlags.h"

namespace Tulk {
namespace {

bool g_changeable = false;

constexpr int kPairOrder[] = {kWhite, kBlack, kYellow, kLightGrey, kDarkGrey, kRed};

}  // namespace

bool PaletteChangeable() {
  return g_changeable;
}

int ColorPairNumber(int background, int foreground) {
  return foreground + COLORS * background + 1;
}

void InitColors() {
  use_default_colors();
  if (!can_change_color()) {
    monochrome = true;
    return;
  }
  g_changeable = true;
  init_extended_color(kYellow, 1000, 800, 0);
  init_extended_color(kDarkGrey, 334, 334, 334);
  init_extended_color(kLightGrey, 667, 667, 667);
  init_extended_color(kWhite, 1000, 1000, 1000);
  init_extended_color(kRed, 1000, 0, 0);
  for (int background : kPairOrder) {
    for (int foreground : kPairOrder) {
      init_extended_pair(ColorPairNumber(background, foreground), foreground, background);
    }
  }
}

ColorAttribute ColorAttr(int background, int foreground) {
  if (monochrome) {
    bool dark = background == kBlack || background == kDarkGrey;
    return ColorAttribute{dark ? A_STANDOUT : A_NORMAL, 0};
  }
  return ColorAttribute{A_NORMAL, ColorPairNumber(background, foreground)};
}

void SetWindowBackground(WINDOW* window, ColorAttribute attribute) {
  cchar_t blank;
  int pair = attribute.pair;
  setcchar(&blank, L" ", attribute.attrs, static_cast<short>(pair), &pair);
  wbkgrnd(window, &blank);
}

void SetWindowAttribute(WINDOW* window, ColorAttribute attribute) {
  int pair = attribute.pair;
  wattr_set(window, attribute.attrs, static_cast<short>(pair), &pair);
}

}  // namespace Tulk
