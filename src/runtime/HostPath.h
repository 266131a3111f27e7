#pragma once
/// Every host path the console reads, writes or runs goes through
/// HostPath(), so that a test or demo can confine the console to a root.
///
/// Test seam: TULK_ROOT (default "/") names the root. When it is not "/",
/// HostPath("/etc/hosts") is "<root>/etc/hosts", and programs are started
/// with PATH confined to the root's bin and sbin folders, so that
/// "reboot", "poweroff" or a service script can never reach the real
/// machine. Device nodes other than the console ("/dev/null", "/dev/tty")
/// are not host state and are used as they are.

#include <string>
#include <string_view>

namespace Tulk {

/// The root ("/" on a real host); never ends in a slash except for "/".
const std::string& HostRoot();

/// True when the console is confined to a root other than "/".
bool HostRootConfined();

/// `path` (absolute) resolved under the root.
std::string HostPath(std::string_view path);

/// The PATH that programs run with: unchanged on a real host, the root's
/// "bin" and "sbin" folders when confined.
std::string ProgramSearchPath();

}  // namespace Tulk
