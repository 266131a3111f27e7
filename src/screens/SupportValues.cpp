#include "screens/SupportValues.h"

#include <syslog.h>

#include <cstdio>
#include <functional>
#include <memory>
#include <sstream>

#include "host/CommandRunner.h"
#include "render/HostValues.h"
#include "runtime/HostPath.h"
#include "runtime/HostQueryScope.h"
#include "runtime/SystemLog.h"
#include "screens/FileValueCache.h"

namespace Tulk {
namespace {

constexpr char kOpenssl[] = "/bin/openssl";
constexpr char kSshKeygen[] = "/usr/lib/brimlo/openssh/bin/ssh-keygen";

std::string WithoutTrailingSpace(std::string text) {
  while (!text.empty() && (text.back() == '\n' || text.back() == '\r' || text.back() == ' ' ||
                           text.back() == '\t')) {
    text.pop_back();
  }
  return text;
}

}  // namespace

std::string ParseThumbprint(const std::string& output) {
  unsigned digestBits = 0;
  char value[256] = {};
  if (std::sscanf(output.c_str(), "SHA%u Fingerprint=%255s", &digestBits, value) != 2) {
    return {};
  }
  return value;
}

std::string SecondWord(const std::string& output) {
  std::istringstream words(output);
  std::string word;
  words >> word;
  word.clear();
  words >> word;
  return word;
}

std::string CertificateThumbprint(unsigned bits) {
  HostQueryScope query;
  char option[16];
  std::snprintf(option, sizeof option, "-SHA%u", bits);
  char output[kCaptureBufferSize] = {};
  char error[kCaptureBufferSize] = {};
  std::int32_t outputLength = kCaptureBufferSize;
  std::int32_t errorLength = kCaptureBufferSize;
  const int rc = RunCommand(
      kOpenssl,
      {"openssl", "x509", "-in", HostPath(kHostCertificatePath), "-noout", "-fingerprint", option},
      output, &outputLength, error, &errorLength, nullptr, 0, kQueryTimeoutSeconds);
  std::string thumbprint;
  if (rc == 0) {
    thumbprint = ParseThumbprint(std::string(output, static_cast<std::size_t>(outputLength)));
  }
  if (thumbprint.empty()) {
    Log(LOG_ERR, "Failed to generate the host's %s SSL thumbprint", option + 1);
  }
  return thumbprint;
}

std::string HostKeyFingerprint(const std::string& keyPath) {
  HostQueryScope query;
  char output[kCaptureBufferSize] = {};
  char error[kCaptureBufferSize] = {};
  std::int32_t outputLength = kCaptureBufferSize;
  std::int32_t errorLength = kCaptureBufferSize;
  const int rc = RunCommand(kSshKeygen, {"ssh-keygen", "-l", "-f", HostPath(keyPath)}, output,
                            &outputLength, error, &errorLength, nullptr, 0, kQueryTimeoutSeconds);
  if (rc != 0) {
    Log(LOG_ERR, "SSH Key Fingerprint generation failed: %s",
        WithoutTrailingSpace(std::string(error, static_cast<std::size_t>(errorLength))).c_str());
    return {};
  }
  return SecondWord(std::string(output, static_cast<std::size_t>(outputLength)));
}

namespace {

// Registers `key` with a value computed from `path` and kept until that
// file changes.
void RegisterFileValue(const char* key, const char* path, std::function<std::string()> compute) {
  auto cache = std::make_shared<FileValueCache>(HostPath(path), std::move(compute));
  RegisterValueProvider(key, [cache] { return cache->Get(); });
}

}  // namespace

void RegisterSupportValueProviders() {
  RegisterFileValue("ssl-thumbprint-sha-1", kHostCertificatePath,
                    [] { return CertificateThumbprint(1); });
  RegisterFileValue("ssl-thumbprint-sha-256", kHostCertificatePath,
                    [] { return CertificateThumbprint(256); });
  RegisterFileValue("ssl-thumbprint-sha-512", kHostCertificatePath,
                    [] { return CertificateThumbprint(512); });
  RegisterFileValue("ssh-dsa-fingerprint", kDsaHostKeyPath,
                    [] { return HostKeyFingerprint(kDsaHostKeyPath); });
  RegisterFileValue("ssh-rsa-fingerprint", kRsaHostKeyPath,
                    [] { return HostKeyFingerprint(kRsaHostKeyPath); });
}

}  // namespace Tulk
