#pragma once
/// Named constant strings shared by every source file: option names,
/// mode words and the configuration-store paths of the network settings.

namespace Tulk {

/// Advanced options of the host (values in seconds, 0 = off).
inline constexpr const char kTulkTimeOutOption[] = "/UserVars/TulkTimeOut";
inline constexpr const char kShellTimeOutOption[] = "/UserVars/TaviShellTimeOut";
inline constexpr const char kShellInteractiveTimeOutOption[] =
    "/UserVars/TaviShellInteractiveTimeOut";
/// Present when the host was booted from the network.
inline constexpr const char kPxeBootOption[] = "PXEBootEnabled";

/// Idle timeout used when "/UserVars/TulkTimeOut" cannot be read.
inline constexpr unsigned kDefaultTulkTimeOutSeconds = 600;

/// The TCP/IP stack every network query addresses.
inline constexpr const char kDefaultTcpipStack[] = "defaultTcpipStack";

/// Words of the host's network configuration.
inline constexpr const char kCongestionControlNewReno[] = "newreno";
inline constexpr const char kEnabled[] = "enabled";
inline constexpr const char kModeDown[] = "down";
inline constexpr const char kModeListen[] = "listen";
inline constexpr const char kModeAdvertise[] = "advertise";
inline constexpr const char kModeBoth[] = "both";

/// Configuration-store paths of the management network settings.
inline constexpr const char kConfigStoreNetIpv4[] = "/net/tcpip/defaultTcpipStack/ipv4";
inline constexpr const char kConfigStoreNetIpv6[] = "/net/tcpip/defaultTcpipStack/ipv6";
inline constexpr const char kConfigStoreNetDns[] = "/net/tcpip/defaultTcpipStack/dns";
inline constexpr const char kConfigStoreNetRoutes[] = "/net/tcpip/defaultTcpipStack/routes";
inline constexpr const char kConfigStoreNetVswitch[] = "/net/vswitch";

/// Fixed host files and programs (resolved under the host root, see
/// runtime/HostPath.h).
inline constexpr const char kPidFilePath[] = "/var/run/tulk.pid";
inline constexpr const char kConsoleDevicePath[] = "/dev/console";

}  // namespace Tulk
