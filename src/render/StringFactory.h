#pragma once
/// The catalogue of the console's texts, looked up by number.
///
/// Titles of menus and dialogs, the descriptions of the menu windows and
/// the longer explanations and warnings live here; texts that belong to one
/// screen are literals in that screen. Numbers run from 0 to 291; several
/// numbers share one text (the same pointer), number 3 is the empty text,
/// and any higher number gives the empty text. Texts may hold newlines and
/// markup (MarkupLayout.h).
///
///   const char* title = GetStringFactory("en_US")->GetString(4);
///
/// Every frame asks for the "en_US" catalogue when it is built and keeps
/// it for its lookups.

#include <cstdint>
#include <string_view>

namespace Tulk {

class StringFactory {
 public:
  /// The text with number `id`: a NUL-terminated string that stays valid
  /// for the whole run; callers never free it. Numbers above 291 give the
  /// empty text.
  virtual const char* GetString(std::uint32_t id) = 0;

 protected:
  StringFactory() = default;
  StringFactory(const StringFactory&) = default;
  StringFactory& operator=(const StringFactory&) = default;
  // The one instance lives for the whole run and is never deleted through
  // this base.
  ~StringFactory() = default;
};

/// The process-wide catalogue. The first call with "en_US" creates it;
/// every later call returns that same catalogue whatever locale it names.
/// A call with any other locale before that returns null and creates
/// nothing.
StringFactory* GetStringFactory(std::string_view locale);

}  // namespace Tulk
