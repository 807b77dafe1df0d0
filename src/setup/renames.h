#pragma once

#include <string>
#include <string_view>

#include "data/channels.h"

namespace marlowbeck {

// A grade and a team are no more than text in records and, for a grade, in file names: another name
// is walked through all the places where the old one stands. Each file is rewritten in one step, so
// that a failure leaves whole files renamed and the others as they were.

/// A name, trimmed, and the one that takes its place, as it stands; it is cut to a field's width.
struct Renaming {
  std::string_view from;
  std::string_view to;
};

/// What a grade's, and a team's, field can hold of a name.
[[nodiscard]] std::string_view AsGrade(std::string_view name);
[[nodiscard]] std::string_view AsTeam(std::string_view name);

// Each works on the file that is open on its channel, and closes all.

/// The grade of every player of it.
///
/// KEPT: the grade in the results stays the old one, since nothing reads it; a repair would walk
/// through the results of the grade too.
void RenameGradeOfPlayers(Channels& channels, const Renaming& grade);
/// The team of every player of it in a grade.
void RenameTeamOfPlayers(Channels& channels, std::string_view grade, const Renaming& team);
/// Team and opposition of every result.
void RenameTeamInResults(Channels& channels, const Renaming& team);
/// Home and away team of every match.
void RenameTeamInMatches(Channels& channels, const Renaming& team);

/// Renames the files of a grade: its results, its ladder, the ladder's configuration, its season
/// description. No file is overwritten.
///
/// KEPT: the first that cannot be renamed, or is not there, ends the chain, and those behind it
/// keep the old name for good; a repair would try each.
void RenameGradeFiles(FileSystem& files, std::string_view player_file, const Renaming& grade);

}  // namespace marlowbeck
