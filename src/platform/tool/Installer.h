#pragma once
/// "tulk-hosttool --install <root>": lays out a host root for the
/// simulated host.

#include <string>

namespace Sim::Tools {

/// Creates the root's folders (bin, sbin, etc/init.d, etc/ssh,
/// etc/brimlo/ssl, var/run/brimlo, var/log/tulk-sim, var/lib/tulk-sim,
/// tmp, usr/lib/brimlo/openssh/bin), links every tool name to `tool`,
/// writes the service scripts (small shell scripts that run `tool` under
/// the script's name, so that "sh /etc/init.d/SSH status" works), and
/// links the real sh, less, openssl, awk, ssh-keygen and the basic
/// programs shell lines need. Idempotent: existing links and scripts are
/// replaced. A root that is "/" or resolves to it (through "..", "." or
/// symbolic links) is refused. Returns an error text, empty on success.
std::string InstallRoot(const std::string& root, const std::string& tool);

}  // namespace Sim::Tools
