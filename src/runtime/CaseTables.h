#pragma once
/// The C library's character-class and case-mapping tables, copied once at
/// start-up for the case-insensitive string helpers.

#include <string_view>

namespace Tulk {

/// Copies the table pointers of the C library (start-up step 1).
void InitCaseTables();

/// Lower-case form of one byte through the copied table.
int ToLowerByte(unsigned char c);

/// Case-insensitive comparison of two byte strings.
bool EqualsIgnoreCase(std::string_view a, std::string_view b);

}  // namespace Tulk
