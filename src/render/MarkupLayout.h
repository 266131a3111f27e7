#pragma once
/// The layout pass of the markup renderer: word-wraps marked-up text to a
/// width and resolves alignment and host variables.
///
/// Markup is a byte string; one byte is one column. "{" opens a tag and the
/// next "}" closes it (there is no escape). The pass keeps colour tags and
/// unknown tags in its output for the paint pass (MarkupPainter.h); they
/// take no room. It removes the "align" tags, replacing them by blanks:
///
/// - "{align:right}...{/align}": the segment ends at the right edge;
/// - "{align:center}...{/align}": the segment is moved right by half the
///   room left on the line, and the room becomes that half;
/// - "{align:padding:N}...{/align}": a field of exactly N columns, cut after
///   N bytes and filled with blanks to N (N: leading decimal digits, none
///   gives 0);
/// - any other "align" value (such as "left"): written as it stands.
///
/// An "align" tag inside an open segment is ignored; the first "{/align}"
/// ends the segment. A tag naming a host variable is replaced by its value,
/// which is broken hard (never word-wrapped) at the line's end. An opening
/// brace that is never closed hides the rest of the text.
///
/// Decisions beyond the rules above:
/// - When a line breaks inside an open right or centre segment (the segment
///   is wider than the room left), the segment's start moves to the new
///   line: the lines before stay as wrapped and the segment's last line is
///   aligned.
/// - A newline inside a variable's value breaks the line like a newline in
///   the text.
/// - A width below 1 puts every visible byte on a line of its own.

#include <functional>
#include <string>
#include <string_view>

namespace Tulk {

/// Resolves a host variable: when `name` is a variable, fills `value` and
/// returns true; otherwise returns false (the tag is then kept as an
/// unknown tag).
using VariableLookup = std::function<bool(std::string_view name, std::string& value)>;

/// Lays out `text` for a window `width` columns wide. `variables` may be
/// empty (no tag is a variable then).
std::string LayOutMarkup(std::string_view text, int width, const VariableLookup& variables);

}  // namespace Tulk
