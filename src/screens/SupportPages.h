#pragma once
/// The support information pages shown by "View Support Information".
///
/// The host keeps them in "/etc/brimlo/support", a text file of marked-up
/// lines (render/MarkupLayout.h) that may name the host values, for
/// example "{ssl-thumbprint-sha-256}" (SupportValues.h):
/// - a line that begins with "#" is a comment and is skipped;
/// - a line that begins with "$" ends the current page (the rest of that
///   line is ignored);
/// - every other line is added to the current page, followed by a
///   newline.
/// At the end of the file the text gathered since the last page break
/// becomes the last page, so a file always gives at least one page (a file
/// of comments only gives one empty page) and k page breaks give k + 1
/// pages.

#include <istream>
#include <string>
#include <vector>

namespace Tulk {

/// The host path of the support file.
inline constexpr char kSupportFilePath[] = "/etc/brimlo/support";

/// The pages of a support file's text.
std::vector<std::string> ParseSupportPages(std::istream& input);

/// The pages of the support file under the host root; none when it is
/// missing or cannot be read.
std::vector<std::string> ReadSupportPages();

}  // namespace Tulk
