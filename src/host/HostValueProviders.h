#pragma once
/// The host values of the markup renderer (render/HostValues.h), served by
/// the inventory queries.

#include <string>

namespace Tulk {

/// Registers the value providers and the version-line source:
/// | Key | Value |
/// |---|---|
/// | "ip" | GetManagementIpv4Address() |
/// | "hostname" | GetHostFqdn() |
/// | "tavproduct", "tavversion" | product name and version of the host's system-version record |
/// | "memory" | FormatMemorySize() |
/// | "servicetag", "assettag" | GetServiceTag(), GetAssetTag() |
/// | "BIOSversion", "BMCversion" | GetVersionString(3), GetVersionString(2) |
/// | "CPLDversion", "PLSAversion" | GetCpldVersion(), GetPlsaVersion() |
/// Every provider answers "N/A" when the host cannot be asked. Call once at
/// start-up, before the first frame is drawn.
void RegisterHostValueProviders();

/// Catalogue text 2: "%s %s (HyKernel %s Build %s)" from the first four
/// fields of the system-version record (HSI_Get, 336 bytes): product name,
/// version, kernel release, build. Returns false, leaving `line` alone,
/// when the record cannot be read or the host-control exception is thrown.
bool BuildVersionLine(std::string& line);

}  // namespace Tulk
