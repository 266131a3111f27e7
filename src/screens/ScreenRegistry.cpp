#include "screens/ScreenRegistry.h"

#include <map>

namespace Tulk {
namespace {

std::map<ScreenId, ScreenRegistry::Opener>& Openers() {
  static std::map<ScreenId, ScreenRegistry::Opener> openers;
  return openers;
}

}  // namespace

void ScreenRegistry::Register(ScreenId screen, Opener opener) {
  if (opener) {
    Openers()[screen] = std::move(opener);
  } else {
    Openers().erase(screen);
  }
}

bool ScreenRegistry::Has(ScreenId screen) {
  return Openers().count(screen) != 0;
}

int ScreenRegistry::Open(ScreenId screen, Frame* owner) {
  auto found = Openers().find(screen);
  if (found == Openers().end()) {
    return 0;
  }
  // A copy: the opener may register screens itself.
  Opener opener = found->second;
  return opener(owner);
}

}  // namespace Tulk
