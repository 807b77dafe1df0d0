#pragma once

#include <cstddef>
#include <span>
#include <string_view>

namespace marlowbeck::fuzz {

using Input = std::span<const std::byte>;

// Each takes any bytes as a file that the program reads, and ends the process when what must hold
// does not. A run-time error is an answer like any other.

/// A side file, read as each kind of item, and what was read written and read again.
void SideFile(Input input);
/// A player file and a results file, through the lists, the score sheet's findings and the sort.
void Records(Input input);
/// A ladder file and the rules of its table, through the table, its plain model and the sort.
void Ladder(Input input);
/// The list file of a knock-out, through its reader, the draw and its writer.
void KnockOut(Input input);
/// A player file and a results file through the lists of the highest, and the bytes as the side
/// files of those.
void Lists(Input input);
/// A text typed or read: as a number, a date, and between the code page and Unicode.
void Words(Input input);

}  // namespace marlowbeck::fuzz
