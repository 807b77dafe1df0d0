#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "data/channels.h"
#include "data/session.h"

namespace marlowbeck {

/// `<base>_<grade><extension>`: the file of a grade beside a player file. `grade` is trimmed.
[[nodiscard]] std::string GradeFileName(std::string_view player_file, std::string_view grade,
                                        std::string_view extension);

/// A path with its last four characters, whatever they are, replaced by an extension.
[[nodiscard]] std::string WithExtension(std::string_view path, std::string_view extension);

/// Sets ResultsFile, LadderFile, LadderConfigFile, SeasonFile and SeasonReportFile from PlayerFile
/// and Grade.
void NameGradeFiles(Session& session);

/// Opens the player file on its channel and counts its records; does nothing while none is named.
void OpenFile(Session& session, Channels& channels);

/// Opens the results file of the grade in hand and counts its records; nothing while none is named.
void OpenResultSFile(Session& session, Channels& channels);

/// Closes all, opens the ladder file of the grade in hand and counts its records.
void OpenLadderFile(Session& session, Channels& channels);

/// The trimmed grade of every player in record order, from the open player file. Throws
/// SubscriptOutOfRange for 1000 players or more: the list of grades has 1000 places.
[[nodiscard]] std::vector<std::string> GradesInFile(Channels& channels);

/// The trimmed team of every player of `grade` in record order, from the open player file; bounds
/// as GradesInFile.
[[nodiscard]] std::vector<std::string> TeamsInFile(Channels& channels, std::string_view grade);

/// Distinct names in ascending order of their bytes.
[[nodiscard]] std::vector<std::string> SortedDistinct(const std::vector<std::string>& names);

/// Reads the date of `WkDate.qz3` in the working folder; throws when it cannot be read.
[[nodiscard]] Date ReadWorkDate(Channels& channels);
void WriteWorkDate(Channels& channels, Date date);

/// Reads the one string of a side file in quoted form; throws when it cannot be read.
[[nodiscard]] std::string ReadOneString(Channels& channels, const std::string& path);
void WriteOneString(Channels& channels, const std::string& path, std::string_view text);

}  // namespace marlowbeck
