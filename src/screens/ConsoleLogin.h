#pragma once
/// Whether the console offers a login at all, and the host part of the
/// login dialogs' texts.

#include <string>
#include <string_view>

namespace Tulk {

/// The marker file whose presence allows console logins.
inline constexpr char kShowLoginMarker[] = "/var/run/brimlo/show-tulk-login";

/// True when "/var/run/brimlo/show-tulk-login" exists under the host root
/// (access with F_OK). Asked afresh at every F2 or F12.
bool IsConsoleLoginAllowed();

/// `lead`, the host name, ".", the domain and "." (the format "%s%s.%s."):
/// "Enter an authorized login name and password for tavi-01.lab.example.net.".
/// An empty domain leaves two full stops; a host whose name cannot be read
/// gives "N/A." (the failure is logged by the host query).
std::string LoginHostText(std::string_view lead);

}  // namespace Tulk
