#pragma once

#include <initializer_list>
#include <string>
#include <string_view>

namespace marlowbeck {

// Text inside the program is single bytes of Windows code page 1252. A line break is one "\r".

/// Without the blanks (0x20) at both ends.
[[nodiscard]] std::string_view Trimmed(std::string_view text);
[[nodiscard]] std::string Trim(std::string_view text);

/// Upper-cases the letters of code page 1252; others stay.
[[nodiscard]] std::string UpperCase(std::string_view text);

/// True when both are the same letters in any case, by code page 1252.
[[nodiscard]] bool EqualsIgnoringCase(std::string_view a, std::string_view b);

/// Whether a name stands before another one in a list, without regard to case; names that differ
/// in case alone stand by their bytes.
[[nodiscard]] bool ComesBefore(std::string_view a, std::string_view b);

/// Exactly `width` bytes: cut when longer, filled with blanks when shorter.
[[nodiscard]] std::string FixedWidth(std::string_view text, std::size_t width);

/// Everything but the last `count` bytes; empty when there are no more.
[[nodiscard]] std::string WithoutLast(std::string_view text, std::size_t count);

/// Lines of a box with a line break between each two of them.
[[nodiscard]] std::string Lines(std::initializer_list<std::string_view> lines);

/// Bytes of code page 1252 as UTF-8. The five bytes that the page leaves open map to the control
/// characters of the same number, so that every byte comes back by Cp1252FromUtf8.
[[nodiscard]] std::string Utf8FromCp1252(std::string_view text);

/// UTF-8 as bytes of code page 1252; what has no place there, and garbled UTF-8, becomes "?".
[[nodiscard]] std::string Cp1252FromUtf8(std::string_view text);

}  // namespace marlowbeck
