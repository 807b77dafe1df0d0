#pragma once

#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

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

// A disk may hold names with characters that the code page has no place for, and names that are no
// UTF-8. So that each of them is a text of its own, such a character stands in it as an escape: a
// byte that the page leaves open and six hexadecimal digits. Escapes are the same in capitals.

/// The text that stands for a name of the disk; TextOfName and NameOfText undo each other.
[[nodiscard]] std::string TextOfName(std::string_view name);
[[nodiscard]] std::string NameOfText(std::string_view text);

/// A text as people see it, in UTF-8: an escape as its character.
[[nodiscard]] std::string ShownText(std::string_view text);

/// A text with "?" for every escape, as records and boxes hold it.
[[nodiscard]] std::string WithoutEscapes(std::string_view text);

/// The characters of a text one by one, an escape being one.
[[nodiscard]] std::vector<std::string_view> CharactersOf(std::string_view text);

}  // namespace marlowbeck
