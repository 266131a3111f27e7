#pragma once
/// Openers of the screens that the System Customization menu reaches in
/// other folders (network, restore, troubleshooting).
///
/// The menu sits below those folders and cannot build their frames itself.
/// Each folder registers an opener at start-up; the menu calls it on Enter:
///
///   ScreenRegistry::Register(ScreenId::ManagementNetwork, [](Frame* owner) {
///     NetworkWindow window(owner);  // on the stack: the idle timeout
///     return RunFrame(&window);     // unwinds through the opener
///   });
///
/// An entry whose screen has no opener yet does nothing on Enter beyond
/// what the menu itself does first (for "Restart Management Network" the
/// message shown when the management interface is missing). Main thread
/// only.

#include <functional>

namespace Tulk {

class Frame;

/// The screens the menu opens through the registry.
enum class ScreenId {
  /// "Configure Management Network": the management network window.
  ManagementNetwork,
  /// "Restart Management Network": the restart confirmation dialog.
  RestartManagementNetwork,
  /// "Test Management Network": the network test dialog.
  TestManagementNetwork,
  /// "Network Restore Options": the network restore window.
  NetworkRestore,
  /// "Troubleshooting Options": the troubleshooting window.
  Troubleshooting,
};

class ScreenRegistry {
 public:
  /// Builds the screen above `owner`, runs it with RunFrame, deletes it and
  /// returns its result.
  using Opener = std::function<int(Frame* owner)>;

  /// Registers (or replaces) the opener of `screen`; an empty opener
  /// removes it.
  static void Register(ScreenId screen, Opener opener);

  /// Whether `screen` has an opener.
  static bool Has(ScreenId screen);

  /// Runs the opener of `screen` above `owner` and returns its result; 0
  /// when none is registered.
  static int Open(ScreenId screen, Frame* owner);
};

}  // namespace Tulk
