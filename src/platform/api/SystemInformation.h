#pragma once
/// The host kernel's system-information nodes.

#include <cstddef>

enum HSI_Node {
  /// The system version record (HSI_SystemVersion).
  HSI_NODE_system_version = 1,
  /// The boot option: first byte 1 when the host runs in audit mode.
  HSI_NODE_system_bootOption = 2,
};

/// The system version record: four NUL-terminated text fields and room the
/// console does not read.
struct HSI_SystemVersion {
  char productName[64];
  char version[64];
  char kernelRelease[64];
  char build[64];
  char reserved[80];
};
static_assert(sizeof(HSI_SystemVersion) == 336);

/// Reads `node` into `buffer` (at most `size` bytes). Returns 0 on success,
/// a non-zero status when the node cannot be read. Throws
/// HostMgr::Lib::HostMgrException when the library itself fails.
int HSI_Get(HSI_Node node, void* buffer, std::size_t size);
