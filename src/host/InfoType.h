#pragma once
/// A list entry that has a details view: its row in a list, the list's
/// column heading, and the title, name line, footer and text of its
/// details dialog (InfoDialog).

#include <string>

namespace Tulk {

class InfoType {
 public:
  virtual ~InfoType() = default;

  /// The column heading line of the list (markup).
  virtual std::string Heading() const = 0;
  /// The entry's row in the list (markup, same columns as the heading).
  virtual std::string Row() const = 0;
  /// The title of the details dialog.
  virtual std::string DetailsTitle() const = 0;
  /// A one-line label naming the entry.
  virtual std::string NameLine() const = 0;
  /// The details dialog's footer, the same for every kind of entry.
  virtual std::string DetailsFooter() const;
  /// The body of the details dialog.
  virtual std::string DetailsText() const = 0;

  /// Shortens a row value so that it never fills its field to the edge:
  /// longer than `limit` bytes, it is cut to limit - 3 bytes plus "...".
  static std::string Shorten(const std::string& value, std::size_t limit);
};

}  // namespace Tulk
