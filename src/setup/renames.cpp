#include "setup/renames.h"

#include "data/competition.h"
#include "data/record_rewriting.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr Field kGradeOfPlayer = FieldNamed(kPlayerFields, "Grade");
constexpr Field kTeamOfPlayer = FieldNamed(kPlayerFields, "Team");
constexpr Field kTeamOfResult = FieldNamed(kResultFields, "Team");
constexpr Field kOpposition = FieldNamed(kResultFields, "Opposition");
constexpr Field kHomeTeam = FieldNamed(kLadderFields, "HomeTeam");
constexpr Field kAwayTeam = FieldNamed(kLadderFields, "AwayTeam");

/// Gives a field the new name when it holds the old one. Answers whether it does.
bool Rename(std::span<std::byte> record, const Field& field, const Renaming& name) {
  if (Trimmed(ReadText(record, field.offset, field.width)) != name.from) return false;
  WriteText(record, field, name.to);
  return true;
}

/// The same for two fields of every record in the file of a channel.
void RenameBoth(Channels& channels, Channel channel, const Field& first, const Field& second,
                const Renaming& name) {
  ChangeRecords(channels, channel, [&](std::span<std::byte> record) {
    const bool in_first = Rename(record, first, name);
    const bool in_second = Rename(record, second, name);
    return in_first || in_second;
  });
}

}  // namespace

std::string_view AsGrade(std::string_view name) { return name.substr(0, kGradeOfPlayer.width); }
std::string_view AsTeam(std::string_view name) { return name.substr(0, kTeamOfPlayer.width); }

void RenameGradeOfPlayers(Channels& channels, const Renaming& grade) {
  ChangeRecords(channels, Channel::Players,
                [&](std::span<std::byte> player) { return Rename(player, kGradeOfPlayer, grade); });
}

void RenameTeamOfPlayers(Channels& channels, std::string_view grade, const Renaming& team) {
  ChangeRecords(channels, Channel::Players, [&](std::span<std::byte> player) {
    return PlayerView(player).Grade() == grade && Rename(player, kTeamOfPlayer, team);
  });
}

void RenameTeamInResults(Channels& channels, const Renaming& team) {
  RenameBoth(channels, Channel::Results, kTeamOfResult, kOpposition, team);
}

void RenameTeamInMatches(Channels& channels, const Renaming& team) {
  RenameBoth(channels, Channel::Ladder, kHomeTeam, kAwayTeam, team);
}

void RenameGradeFiles(FileSystem& files, std::string_view player_file, const Renaming& grade) {
  for (const char* extension : {".qzr", ".qzl", ".qzi", ".qzs"}) {
    files.Rename(GradeFileName(player_file, grade.from, extension),
                 GradeFileName(player_file, AsGrade(grade.to), extension));
  }
}

}  // namespace marlowbeck
