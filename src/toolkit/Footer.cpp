#include "toolkit/Footer.h"

namespace Tulk::Footer {

std::string MenuAction(std::string_view action, std::string_view exit) {
  std::string text = "{color:white}<Enter>{/color}{color:light-grey} ";
  text += action;
  text += "{/color}{align:right}{color:white}<Esc>{/color}{color:light-grey} ";
  text += exit;
  text += "{/color}{/align}";
  return text;
}

std::string MenuRestoreAction(std::string_view action) {
  std::string text = "{color:white}<Enter>{/color} {color:light-grey}";
  text += action;
  text += "{align:right}{color:white}<Esc>{/color} {color:light-grey}Exit{/color}{/align}";
  return text;
}

}  // namespace Tulk::Footer
