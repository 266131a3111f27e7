#include "NetworkTestSupport.h"

namespace TulkTest {

::testing::AssertionResult OpenWindow(TestConsole& console) {
  if (auto menu = OpenMenuEntry(console, "Configure Management Network"); !menu) {
    return menu;
  }
  console.Key("Enter");
  if (auto window = Settled(console, "Custom DNS Suffixes"); !window) {
    return window;
  }
  return console.WaitUntil([&] { return RightTitle(console) != "Configure Management Network"; },
                           "the window's first entry");
}

::testing::AssertionResult OpenDialog(TestConsole& console, const std::string& label,
                                      const std::string& title) {
  if (auto selected = SelectEntry(console, label); !selected) {
    return selected;
  }
  console.Key("Enter");
  return Settled(console, title);
}

::testing::AssertionResult CloseDialog(TestConsole& console, const std::string& key,
                                       const std::string& title) {
  console.Key(key);
  return Gone(console, title);
}

::testing::AssertionResult ApplyChanges(TestConsole& console) {
  console.Key("Esc");
  if (auto asked = Settled(console, "Configure Management Network: Confirm"); !asked) {
    return asked;
  }
  console.Type("y");
  if (auto applied = console.WaitForLog("Network settings changed."); !applied) {
    return applied;
  }
  return Settled(console, "System Customization");
}

}  // namespace TulkTest
