#pragma once
/// The host identity values of the support information: the thumbprints
/// of the host's TLS certificate and the fingerprints of its SSH host
/// keys, computed on demand by the host's own tools.
///
/// | Value key                | Value                                              |
/// |--------------------------|----------------------------------------------------|
/// | "ssl-thumbprint-sha-1"   | CertificateThumbprint(1)                           |
/// | "ssl-thumbprint-sha-256" | CertificateThumbprint(256)                         |
/// | "ssl-thumbprint-sha-512" | CertificateThumbprint(512)                         |
/// | "ssh-dsa-fingerprint"    | HostKeyFingerprint("/etc/ssh/ssh_host_dsa_key")    |
/// | "ssh-rsa-fingerprint"    | HostKeyFingerprint("/etc/ssh/ssh_host_rsa_key")    |
///
/// A value that cannot be computed is empty (the text then shows nothing
/// in its place) and leaves one line in the system log. Every program and
/// file path is resolved under the host root (runtime/HostPath.h); the
/// programs run through the command runner (host/CommandRunner.h) with up
/// to 255 bytes of output and of error captured, each within
/// kQueryTimeoutSeconds (a program killed by it counts as failed).

#include <string>

namespace Tulk {

inline constexpr char kHostCertificatePath[] = "/etc/brimlo/ssl/host.crt";
inline constexpr char kDsaHostKeyPath[] = "/etc/ssh/ssh_host_dsa_key";
inline constexpr char kRsaHostKeyPath[] = "/etc/ssh/ssh_host_rsa_key";

/// The thumbprint of the host certificate in the `bits` digest (1, 256 or
/// 512): runs "/bin/openssl" with "openssl", "x509", "-in", the
/// certificate, "-noout", "-fingerprint", "-SHA<bits>" and returns what
/// follows "SHA<bits> Fingerprint=" (colon-separated upper-case pairs).
/// When the command fails or prints something else it logs "Failed to
/// generate the host's SHA<bits> SSL thumbprint" at error priority and
/// returns the empty string.
std::string CertificateThumbprint(unsigned bits);

/// The fingerprint of the SSH host key at `keyPath` (a host path): runs
/// "/usr/lib/brimlo/openssh/bin/ssh-keygen" with "ssh-keygen", "-l", "-f"
/// and the key, and returns the second word of its output (the first is
/// the key size). When the command fails it logs "SSH Key Fingerprint
/// generation failed: %s" at error priority with the captured error
/// output (trailing white space removed, so the log line stays one line)
/// and returns the empty string.
std::string HostKeyFingerprint(const std::string& keyPath);

/// The thumbprint in the output of "openssl x509 -fingerprint": the text
/// after "SHA<number> Fingerprint=" up to the first white space (at most
/// 255 bytes), or the empty string when the output does not have both the
/// number and the text.
std::string ParseThumbprint(const std::string& output);

/// The second white-space separated word of `output` (empty when there is
/// none).
std::string SecondWord(const std::string& output);

/// Registers the five value keys above with the markup renderer
/// (render/HostValues.h). Each value is computed when first shown and again
/// only when its file changed (FileValueCache), so a redraw of the support
/// page runs no program. Called once at start-up, before the first frame is
/// drawn.
void RegisterSupportValueProviders();

}  // namespace Tulk
