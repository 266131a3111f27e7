#pragma once
/// The description pane of "Configure Management Network" in the System
/// Customization menu.

#include <string>

#include "host/ManagementNetworkView.h"

namespace Tulk {

class StringFactory;

/// The pane's text for the view (GeneralWindow.h describes the
/// arrangement), with the labels from `strings` ("Hostname", "IPv4
/// Address", "Not set", the DHCP line, "IPv6 Addresses") and ending with
/// the entry's description. Values are indented by two blanks when that
/// still fits in `width` columns (a long IPv6 address on a narrow screen
/// starts at the left edge instead of wrapping away from its indent).
std::string FormatManagementNetworkView(const ManagementNetworkView& view, StringFactory& strings,
                                        int width);

}  // namespace Tulk
