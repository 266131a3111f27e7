#include "render/en_US_Factory.h"

#include <iterator>
#include <set>
#include <string>

#include "render/HostValues.h"

namespace Tulk {
namespace {

constexpr char kEmpty[] = "";

// Texts that several numbers share: one storage each.
constexpr char kText1_170[] = "Shut Down/Restart";
constexpr char kText5_157[] = "Configure Password";
constexpr char kText6_254[] = "Configure Lockdown Mode";
constexpr char kText7_46[] = "Configure Management Network";
constexpr char kText8_133[] = "Restart Management Network";
constexpr char kText9_217[] = "Test Management Network";
constexpr char kText10_64[] = "Network Restore Options";
constexpr char kText14_182[] = "Reset System Configuration";
constexpr char kText47_77[] = "Network Adapters";
constexpr char kText49_101[] = "IPv4 Configuration";
constexpr char kText50_106[] = "IPv6 Configuration";
constexpr char kText53_124[] = "DNS Configuration";
constexpr char kText68_209[] = "Restore Network Settings";
constexpr char kText69_138[] = "Restore Standard Switch";
constexpr char kText70_197[] = "Restore DVS";

// Indexed by text number. Text 2 is built at each lookup.
constexpr const char* kTexts[] = {
    /* 0 */ "Customize System/View Logs",
    /* 1 */ kText1_170,
    /* 2 */ kEmpty,
    /* 3 */ kEmpty,
    /* 4 */ "System Customization",
    /* 5 */ kText5_157,
    /* 6 */ kText6_254,
    /* 7 */ kText7_46,
    /* 8 */ kText8_133,
    /* 9 */ kText9_217,
    /* 10 */ kText10_64,
    /* 11 */ "View Support Information",
    /* 12 */ "View System Logs",
    /* 13 */ "Troubleshooting Options",
    /* 14 */ kText14_182,
    /* 15 */ "Configure Keyboard",
    /* 16 */ "Restart Management Network: Error",
    /* 17 */ "Enable Management Network: Error",
    /* 18 */ "Disable Management Network: Error",
    /* 19 */ "Management network interface cannot be found.",
    /* 20 */ "Operation on the management network interface failed.",
    /* 21 */ "Reset System Configuration: Error",
    /* 22 */
    // NOLINTNEXTLINE(bugprone-suspicious-missing-comma): one text in two pieces
    "Failed to reset system configuration. Note that this operation cannot be performed when a "
    "managed DPU is present.",
    /* 23 */ "To prevent unauthorized access to this system, set the password for the user.",
    /* 24 */
    "When enabled, lockdown mode prevents users from logging directly into this host. The host "
    "will only be accessible through this local console or an authorized centralized management "
    "application.",
    /* 25 */ "To view or modify this host's management network settings in detail, press <Enter>.",
    /* 26 */
    "Restarting the management network interface may be required to restore networking or to renew "
    "a DHCP lease.\n\nRestarting the management network will result in a brief network outage that "
    "may temporarily affect running virtual machines.\n\nNote: If a renewed DHCP lease results in "
    "a new network identity (e.g., IP address or hostname), remote management software will be "
    "disconnected.",
    /* 27 */
    "To perform a brief network test, press <Enter>.\n\nBy default, this test will attempt to ping "
    "the configured default gateway, ping the configured primary and alternate DNS servers, and "
    "resolve the configured hostname.",
    /* 28 */
    "To view various network restore options like full network restore, move Management network "
    "from misconfigured DVS to standard switch or correct misconfigured DVS Management network "
    "port properties.",
    /* 29 */ "Press the corresponding key to view a log.\nPress <Q> to return to this screen.",
    /* 30 */
    "To view various troubleshooting mode options like Enable Tavi Shell, Enable SSH and Restart "
    "Agents.",
    /* 31 */
    "Warning!\n\nAll system parameters will be reverted to their software defaults, including any "
    "parameters customized by the hardware manufacturer. The root password will be reset to "
    "nothing, which may allow unauthorized access to your system. All virtual machines will be "
    "unregistered.\n\nThis operation requires a restart of the host. It is recommended to "
    "previously shut down or migrate running virtual machines off this host.",
    /* 32 */
    "Warning!\n\nAll custom extensions will be removed.\n\nThis operation requires a restart of "
    "the host. It is recommended to previously shut down or migrate running virtual machines off "
    "this host.",
    /* 33 */ "Network identity acquired from DHCP server",
    /* 34 */ "To select the layout type for the keyboard of this host, press <Enter>.",
    /* 35 */ "Change default password to prevent unauthorized access",
    /* 36 */ "Unknown",
    /* 37 */ "IPv4 Address",
    /* 38 */ "IPv6 Addresses",
    /* 39 */ "Attributed addresses",
    /* 40 */ "Default Gateway",
    /* 41 */ "Subnet Mask",
    /* 42 */ "Hostname",
    /* 43 */ "Primary DNS Server",
    /* 44 */ "Alternate DNS Server",
    /* 45 */ "IPv6 DNS Server",
    /* 46 */ kText7_46,
    /* 47 */ kText47_77,
    /* 48 */ "VLAN (optional)",
    /* 49 */ kText49_101,
    /* 50 */ kText50_106,
    /* 51 */ "IPv6 is enabled.",
    /* 52 */ "IPv6 is disabled.",
    /* 53 */ kText53_124,
    /* 54 */ "Custom DNS Suffixes",
    /* 55 */
    "The adapters listed here provide the default network connection to and from this host. When "
    "two or more adapters are used, connections will be fault-tolerant and outgoing traffic will "
    "be load-balanced.",
    /* 56 */
    "A VLAN is a virtual network within a physical network. Because several VLANs can co-exist on "
    "the same physical network segment, VLAN configuration and partitioning is often more "
    "flexible, better isolated, and less expensive than flat networks based on traditional "
    "physical topology.\n\nIf you are unsure how to configure or use a VLAN, it is safe to leave "
    "this option unset.",
    /* 57 */
    "This host can obtain an IPv4 address and other networking parameters automatically if your "
    "network includes a DHCP server. If not, ask your network administrator for the appropriate "
    "settings.",
    /* 58 */
    "This host can obtain IPv6 addresses and other networking parameters automatically if your "
    "network includes a DHCPv6 server or supports Router Advertisement.",
    /* 59 */
    "This host can be configured to support IPv6. A restart of the host will be required to enable "
    "or disable IPv6.",
    /* 60 */ "The support for IPv6 will be enabled after the next reboot.",
    /* 61 */
    "If this host is configured using DHCP, DNS server addresses and other DNS parameters can be "
    "obtained automatically. If not, ask your network administrator for the appropriate settings.",
    /* 62 */
    "When using short, unqualified names, DNS queries will attempt to locate the specified host by "
    "appending the suffixes listed here in the order shown until a match is found or the list is "
    "exhausted.\n\nIf no suffixes are specified here, a default suffix list is derived from the "
    "local domain name.",
    /* 63 */ "Network Configuration Error",
    /* 64 */ kText10_64,
    /* 65 */ "Create Standard Switch",
    /* 66 */ "Create Port Group",
    /* 67 */ "Migrate Hykernel NIC to Standard Switch",
    /* 68 */ kText68_209,
    /* 69 */ kText69_138,
    /* 70 */ kText70_197,
    /* 71 */ "Create a new standard virtual switch by name and an uplink to be added.",
    /* 72 */
    "Create a new port group by name and standard virtual switch to which the port group should be "
    "added.",
    /* 73 */ "Migrate a hyknic to the standard virtual switch of a chosen portgroup.",
    /* 74 */
    "Restoring the network settings will revert all network configuration and will automatically "
    "configure the network with defaults.\n\nRestoring the network settings will stop all the "
    "running virtual machines on the host.",
    /* 75 */
    "All management network and associated uplinks can be moved onto a new vSwitch in order to "
    "restore network connectivity to Helmsman. All interfaces apart from management interface will "
    "be disabled.\nTry Restore DVS option to manually repair misconfigured DVS.",
    /* 76 */
    "Reconfigure properties of misconfigured DVS Management network port.\n\nA new DVS host local "
    "port will be created with the reconfigured properties and the management network will be "
    "moved to this new port. All other properties will be cloned from original DVS port. This "
    "operation is available only for BrimLo DVS",
    /* 77 */ kText47_77,
    /* 78 */
    "Select the adapters for this host's default management network connection. Use two or more "
    "adapters for fault-tolerance and load-balancing.",
    /* 79 */ "Network Adapters: Warning",
    /* 80 */ "One or more of the selected adapters are already used for other connections.",
    /* 81 */ "Remove these adapters from their current connections?",
    /* 82 */ "Invalid IP address",
    /* 83 */ "Please reenter a valid IPv4 address (x.x.x.x).",
    /* 84 */ "Please reenter a valid IPv6 network address (x:x:x/x).",
    /* 85 */ "Invalid IP or IPv6 address.",
    /* 86 */ "Invalid subnet",
    /* 87 */ "Please reenter a valid subnet (x.x.x.x).",
    /* 88 */ "Invalid scope",
    /* 89 */ "Cannot add a link-local address as static address.",
    /* 90 */ "Invalid gateway address",
    /* 91 */ "Please reenter a valid gateway address (x.x.x.x).",
    /* 92 */ "Please reenter a valid IPv6 gateway address (x:x:x).",
    /* 93 */ "Link-local addresses are not supported as default gateway.",
    /* 94 */ "Invalid DNS server address",
    /* 95 */ "Please reenter a valid DNS server address (IP or IPv6).",
    /* 96 */ "Invalid VLAN ID",
    /* 97 */ "Please reenter a valid VLAN ID (1-4095).",
    /* 98 */
    "You entered a VLAN ID of 4095. This host will receive all VLAN-tagged frames and be able to "
    "send any VLAN-tagged frame.\n\nUnless this is specifically intended, it is best not to "
    "configure a VLAN ID of 4095.",
    /* 99 */
    "If you are unsure how to configure or use a VLAN, it is safe to leave this option unset.",
    /* 100 */ "VLAN ID (1-4094, or 4095 to access all VLANs):",
    /* 101 */ kText49_101,
    /* 102 */
    "This host can obtain network settings automatically if your network includes a DHCP server. "
    "If it does not, the following settings must be specified:",
    /* 103 */ "Disable IPv4 configuration for management network",
    /* 104 */ "Use dynamic IPv4 address and network configuration",
    /* 105 */ "Set static IPv4 address and network configuration:",
    /* 106 */ kText50_106,
    /* 107 */
    "This host can obtain network settings automatically if your network supports Stateless "
    "Address Autoconfiguration (SLAAC) or includes a DHCPv6 server. If it does not, static "
    "settings must be specified:",
    /* 108 */ "Disable IPv6 (restart required)",
    /* 109 */ "Use dynamic IPv6 address and network configuration",
    /* 110 */ "Use DHCPv6",
    /* 111 */ "Set static IPv6 address and network configuration",
    /* 112 */ "Static address",
    /* 113 */ "Default gateway",
    /* 114 */ "Warning",
    /* 115 */ "No adapter",
    /* 116 */ "Automatic",
    /* 117 */ "None",
    /* 118 */ "Manual",
    /* 119 */ "Set",
    /* 120 */ "Not set",
    /* 121 */ "Enabled",
    /* 122 */ "Disabled",
    /* 123 */ "Done.",
    /* 124 */ kText53_124,
    /* 125 */
    "This host can only obtain DNS settings automatically if it also obtains its IP configuration "
    "automatically.",
    /* 126 */ "Obtain DNS server addresses and a hostname automatically",
    /* 127 */ "Use the following DNS server addresses and hostname:",
    /* 128 */
    "DNS queries will attempt to locate hosts by appending the suffixes specified here to short, "
    "unqualified names.\n\nUse spaces or commas to separate multiple entries.",
    /* 129 */ "Suffixes:",
    /* 130 */ "Restart Management Network: Confirm",
    /* 131 */
    "Restarting the management network will result in a brief network outage. It may disconnect "
    "remote management software and affect running virtual machines.",
    /* 132 */ "Restart management network now?",
    /* 133 */ kText8_133,
    /* 134 */ "Please wait while the management network restarts.",
    /* 135 */ "Stopping management network.",
    /* 136 */ "Starting management network.",
    /* 137 */ "IP address is ",
    /* 138 */ kText69_138,
    /* 139 */
    "All management network and associated uplinks can be moved onto a new vSwitch in order to "
    "restore network connectivity to Helmsman.",
    /* 140 */ "Move the management network onto a standard switch?",
    /* 141 */ "To manage this host, go to:",
    /* 142 */
    "Warning: DHCP lookup failed. You may be unable to access this system until you customize its "
    "network configuration.",
    /* 143 */
    "Warning: Host is running in audit mode. Your configuration will not be persistent across "
    "reboots. Please contact support.",
    /* 144 */ "Authentication Required",
    /* 145 */ "Enter an authorized login name and password for ",
    /* 146 */ "Enter the smart card login PIN for ",
    /* 147 */ "Authentication Denied",
    /* 148 */ "Direct console access has been disabled by the administrator for ",
    /* 149 */ "Login Name:",
    /* 150 */ "Login Id:",
    /* 151 */ "Password:",
    /* 152 */ "PIN:",
    /* 153 */ "Authentication failed",
    /* 154 */ "Invalid login or password.",
    /* 155 */ "User does not have permission to login to TULK.",
    /* 156 */
    "Password has expired.\nYou will be prompted to set a new password and then login again.",
    /* 157 */ kText5_157,
    /* 158 */ "Setting the password will prevent unauthorized access to this host.",
    /* 159 */ "Old Password:",
    /* 160 */ "New Password:",
    /* 161 */ "Confirm Password:",
    /* 162 */ "Configure Password: Error",
    /* 163 */ "Configure Password: Warning",
    /* 164 */ "The old password you entered is incorrect",
    /* 165 */ "The new password and the confirmed password do not match.",
    /* 166 */ "Empty passwords are not allowed.",
    /* 167 */ "New password is same as old password. Are you sure?",
    /* 168 */
    "The password change operation failed.\nPlease ensure that your password meets the complexity "
    "criteria set by the system.",
    /* 169 */
    "Error while storing user account information to persistent storage. The new information may "
    "not be available after reboot.",
    /* 170 */ kText1_170,
    /* 171 */
    "Remote management software is recommended to safely shut down or restart this host.\n\nBy "
    "default, running virtual machines will be powered off, suspended, or shut down according to "
    "the current system shutdown policy.\nIf this host is part of an HA cluster, then HA will not "
    "restart these VMs unless they are forcefully terminated.",
    /* 172 */ "Forcefully terminate running VMs, if any ...",
    /* 173 */ "Shut Down Host",
    /* 174 */ "Shutdown in progress...",
    /* 175 */ "Warning: VMs running on the host",
    /* 176 */
    "Host has VMs running. Are you sure you want to shutdown/restart the host or restore the "
    "network.",
    /* 177 */ "Restart Host",
    /* 178 */ "Restart in progress...",
    /* 179 */ "Reset System Configuration: Confirm",
    /* 180 */
    "Warning! All system parameters will be reverted to their software defaults, and host "
    "configuration will be lost.",
    /* 181 */ "Reset System Configuration now?",
    /* 182 */ kText14_182,
    /* 183 */ "Please wait while the default settings are restored.",
    /* 184 */ "Default settings are restored. Press <Enter> to restart your host.",
    /* 185 */ "Remove Custom Extensions: Confirm",
    /* 186 */ "Warning! All custom extensions will be removed.",
    /* 187 */ "Remove custom extensions now?",
    /* 188 */ "Remove Custom Extensions",
    /* 189 */ "Please wait while the custom extensions are removed.",
    /* 190 */ "Custom extensions have been removed. Press <Enter> to restart your host.",
    /* 191 */ "Restore Network Factory Settings",
    /* 192 */ "This option will reset the host network configuration to its default setting.",
    /* 193 */ "Are you sure you want to reset the host network configuration?",
    /* 194 */ "Restore to default blocked setting (unblocked) ",
    /* 195 */ "Select DVS uplinks",
    /* 196 */ "Please enter a valid VLAN ID (1-4094).",
    /* 197 */ kText70_197,
    /* 198 */
    "Enter the properties for new DVS host local port that will be created.\nAll other properties "
    "will be taken as default.",
    /* 199 */ "Restore DVS: Error",
    /* 200 */ "Unable to restore DVS. Check logs for details.",
    /* 201 */ "Unable to restore DVS. Restore DVS operation cannot be performed on 3rd party DVS.",
    /* 202 */ "DVS Uplinks",
    /* 203 */ "Select the DVS Uplinks (one or more) to be used by management hyknic",
    /* 204 */ "DVS Uplinks: Warning",
    /* 205 */ "No uplinks were selected.",
    /* 206 */ "Do you want to continue?",
    /* 207 */ "No DVS Uplinks: Error",
    /* 208 */ "No uplinks are configured on the host for this DVS.",
    /* 209 */ kText68_209,
    /* 210 */ "Please wait while the factory network settings are restored.",
    /* 211 */ "Powering Off VMs.",
    /* 212 */ "Auto-configuring network.",
    /* 213 */ "Configure Management Network: Confirm",
    /* 214 */
    "You have made changes to the host's management network.\nApplying these changes may result in "
    "a brief network outage, disconnect remote management software and affect running virtual "
    "machines. In case IPv6 has been enabled or disabled this will restart your host.",
    /* 215 */ "Apply changes and restart management network?",
    /* 216 */ "Apply changes and reboot host?",
    /* 217 */ kText9_217,
    /* 218 */
    "By default, this test will attempt to ping your default gateway and DNS servers, and resolve "
    "your hostname.",
    /* 219 */ "Ping Address",
    /* 220 */ "Resolve Hostname",
    /* 221 */ "Testing Management Network",
    /* 222 */ "You may interrupt the test at any time.",
    /* 223 */ "Pinging address",
    /* 224 */ "Resolving hostname",
    /* 225 */ "Failed.",
    /* 226 */ "OK.",
    /* 227 */ "Troubleshooting Mode Options",
    /* 228 */ "Enable Tavi Shell",
    /* 229 */ "Disable Tavi Shell",
    /* 230 */ "Enable SSH",
    /* 231 */ "Disable SSH",
    /* 232 */ "Tavi Shell",
    /* 233 */ "SSH Support",
    /* 234 */ "Modify Tavi Shell and SSH timeouts",
    /* 235 */ "Modify TULK idle timeout",
    /* 236 */ "Restart Management Agents",
    /* 237 */ "Change current state of the Tavi Shell",
    /* 238 */ "Change current state of SSH",
    /* 239 */ "Tavi Shell is Enabled",
    /* 240 */ "Tavi Shell is Disabled",
    /* 241 */ "SSH is Enabled",
    /* 242 */ "SSH is Disabled",
    /* 243 */
    "The management agents are the programs that allow remote management software to monitor and "
    "control this host.\n\nRestarting the management agents will disconnect all remote management "
    "software and will affect all running services.",
    /* 244 */
    "Modify the number of minutes that can elapse before you must log in after Tavi Shell access "
    "is enabled and the idle timeout for interactive sessions.",
    /* 245 */
    "Modify the number of idle minutes that can elapse before you must log in again in TULK.",
    /* 246 */ "Restart Management Agents: Confirm",
    /* 247 */
    "{color:red}Warning! Restarting the management agents will disconnect all remote management "
    "software. This will affect all running services.\nCollection of extra troubleshooting "
    "information can take a noticeable amount of time.{/color}",
    /* 248 */ "Restart management agents now?",
    /* 249 */ "Stopping management agents.",
    /* 250 */ "Starting management agents.",
    /* 251 */ "Collect extra troubleshooting information",
    /* 252 */ "Collecting host agent live core information.",
    /* 253 */ "Please, wait ...",
    /* 254 */ kText6_254,
    /* 255 */ "When enabled, lockdown mode prevents users from logging directly into this host.",
    /* 256 */ "Enable lockdown mode",
    /* 257 */
    "If you are having difficulty using your keyboard, choose a layout that matches your keyboard "
    "from the options below.",
    /* 258 */ "Enable IPv6: Restart Required",
    /* 259 */ "This host must be restarted before IPv6 will be enabled.",
    /* 260 */ "Disable IPv6: Restart Required",
    /* 261 */ "This host must be restarted before IPv6 will be disabled.",
    /* 262 */ "Router advertised",
    /* 263 */ "DHCP",
    /* 264 */ "STATIC",
    /* 265 */ "AUTOCONF",
    /* 266 */ "Waiting for DHCP...",
    /* 267 */ "Set the timeouts for Tavi Shell access (local and remote)",
    /* 268 */
    "Set the number of minutes that can elapse before you must log in after Tavi Shell is enabled "
    "(the availability timeout) and the timeout for idle interactive sessions.\n\nAfter the "
    "availability timeout expires any running shell instances will remain, but new sessions will "
    "not be allowed.  Changes to idle timeout will apply on next login, but will not affect any "
    "existing sessions.\n\nValues are in minutes. Use zero to disable timeouts. Maximum value is "
    "1440 minutes.",
    /* 269 */ "Availability timeout",
    /* 270 */ "Idle timeout",
    /* 271 */ "Invalid timeout value",
    /* 272 */ "Timeout value must be between 0 (disabled) and 1440 minutes",
    /* 273 */ "Set idle timeout for TULK access",
    /* 274 */
    "Set the number of idle minutes that can elapse before you must log in again in TULK.\n\nValue "
    "is in minutes. Use zero to disable the timeout. Maximum value is 1440 minutes.",
    /* 275 */ "TULK idle timeout",
    /* 276 */ "Operation Failed",
    /* 277 */ "Operation Succeeded",
    /* 278 */ "Operation Cancelled",
    /* 279 */
    "Enter the properties for the new port group that will be created.\nAll other properties will "
    "be taken as default.",
    /* 280 */ "Please check the syslog for more information.",
    /* 281 */ "Invalid Argument",
    /* 282 */ "Please enter a valid port group name.",
    /* 283 */ "Standard Switch Details",
    /* 284 */ "Switch Name: ",
    /* 285 */ "Successfully created portgroup: ",
    /* 286 */ "Portgroup Name: ",
    /* 287 */ "Uplink is already in use",
    /* 288 */ "Please enter a valid standard switch name.",
    /* 289 */ "Successfully created standard virtual switch: ",
    /* 290 */
    "Enter the properties for new standard vSwitch that will be created.\nAll other properties "
    "will be taken as default.",
    /* 291 */ "Please choose which Hykernel NIC should be migrated to which portgroup/switch.",
};

static_assert(std::size(kTexts) == en_US_Factory::kLastId + 1);

}  // namespace

const char* en_US_Factory::GetString(std::uint32_t id) {
  if (id == 2) {
    return VersionLine();
  }
  return id <= kLastId ? kTexts[id] : kEmpty;
}

const char* en_US_Factory::VersionLine() {
  // Every line handed out stays valid: a caller may keep the pointer
  // across later lookups, and the version changes only a few times.
  static std::set<std::string> lines;
  static const char* current = kEmpty;
  const VersionLineSource& source = GetVersionLineSource();
  std::string line;
  if (source && source(line)) {
    current = lines.insert(std::move(line)).first->c_str();
  }
  return current;
}

StringFactory* GetStringFactory(std::string_view locale) {
  static en_US_Factory* instance = nullptr;
  if (instance == nullptr && locale == "en_US") {
    instance = new en_US_Factory();
  }
  return instance;
}

}  // namespace Tulk
