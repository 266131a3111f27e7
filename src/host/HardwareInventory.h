#pragma once
/// Queries of the host's hardware: the memory size text, the firmware and
/// driver version strings and the hardware tags. Nothing here throws; a
/// missing or unreadable value is "N/A".

#include <cstdint>
#include <string>

namespace Tulk {

/// The size text of `bytes` of memory: rounded up to a multiple of
/// 256 MiB, in the largest unit of M, G, T and P (1 MiB, ×1024 each) that
/// does not exceed it, as "%lu %cB" or, when a remainder is left, "%lu.%lu
/// %cB" with one truncated decimal. 8 GiB gives "8 GB", 6 GiB less one byte
/// "6 GB", 2.75 GiB "2.7 GB", 512 MiB "512 MB", 1 GiB and one byte "1.2 GB".
/// Sizes of 1024 PiB and more stay in P (the unit table ends there).
std::string FormatMemoryBytes(std::uint64_t bytes);

/// The host's installed memory (total pages × page size) as
/// FormatMemoryBytes() text. A host-control failure logs "Getting memory
/// size failed: %s" at error level and gives "N/A".
std::string FormatMemorySize();

/// A version string of the host by id:
/// - 1: the driver version of the storage adapter "hyhba0";
/// - 2: the firmware version of the baseboard management controller (from
///   the hardware information);
/// - 3: the BIOS line "%s (%d.%d) %s": BIOS version text (the vendor when
///   the version is empty), major and minor release numbers, release date;
/// - 4: the hypervisor's full name, version and build (from the system
///   information).
/// A failure, or an adapter that does not exist, logs "Get %s version
/// string failed, err=%s" at error level (with "hyhba0", "BMC", "BIOS" or
/// "system") and gives "N/A", as does an empty value. Any other id logs
/// "Invalid version id: %d requested" at error level and gives "N/A".
std::string GetVersionString(int id);

/// The hardware's service tag, asset tag and the CPLD and PLSA firmware
/// versions ("N/A" when empty). A host-control failure logs "Getting
/// hardware information failed: %s" at error level and gives "N/A".
std::string GetServiceTag();
std::string GetAssetTag();
std::string GetCpldVersion();
std::string GetPlsaVersion();

}  // namespace Tulk
