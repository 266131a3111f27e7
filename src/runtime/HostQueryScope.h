#pragma once
/// Marks a stretch of code that only reads the host: the commands it runs
/// do not send the screen to the terminal first (runtime/ScreenFlush.h).
///
///   bool OskCmdGetFlag(const std::string& path) {
///     HostQueryScope query;
///     ...run "osk-cmd get"...
///   }
///
/// A query announces nothing, and it often runs while a screen is being
/// built (the System Customization menu reads the lockdown state before it
/// is drawn), when the terminal must not get the half-drawn picture.
/// Scopes nest; each thread has its own.

namespace Tulk {

class HostQueryScope {
 public:
  HostQueryScope();
  ~HostQueryScope();
  HostQueryScope(const HostQueryScope&) = delete;
  HostQueryScope& operator=(const HostQueryScope&) = delete;

  /// A scope is open on the calling thread.
  static bool Open();
};

}  // namespace Tulk
