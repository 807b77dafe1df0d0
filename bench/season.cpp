#include "bench/season.h"

#include <cstdlib>
#include <iomanip>
#include <memory>
#include <span>
#include <sstream>
#include <system_error>
#include <vector>

#include "data/competition.h"
#include "data/real_file_system.h"
#include "data/records.h"

namespace marlowbeck::bench {
namespace {

constexpr std::size_t kBlock = std::size_t{64} * 1024;

std::string Numbered(const std::string& word, int number, int digits) {
  std::ostringstream text;
  text << word << ' ' << std::setfill('0') << std::setw(digits) << number;
  return text.str();
}

std::string TeamName(int index) { return Numbered("Team", index % kTeams + 1, 2); }

PlayerRecord Player(int index) {
  PlayerRecord player;
  player.ID = index + 1;
  player.Surname = Numbered("Surname", index + 1, 3);
  player.FirstName = Numbered("First", 999 - index, 3);
  player.Team = TeamName(index);
  player.Grade = kGrade;
  player.BestOfThree = 330;
  return player;
}

ResultRecord Result(int index, int night) {
  const int player = index % kPlayers;
  ResultRecord result;
  result.ID = player + 1;
  result.Team = TeamName(player);
  result.Opposition = TeamName((player % kTeams) ^ 1);
  result.GameDate = Season::GameDate(night);
  if (index % 100 == 99) {
    result.Forfeit.assign(1, 'F');
    return result;
  }
  const auto part = [index](int of, int from) {
    return static_cast<std::int16_t>(from + index * 7919 % of);
  };
  result.Legs = 6;
  result.Aggregate = part(1500, 600);
  result.Shots = part(40, 40);
  result.HighScore = part(120, 60);
  result.Centuries = part(5, 0);
  result.Scores180 = part(2, 0);
  result.Pegs = {part(60, 2), 0, part(30, 0), 0, 0, part(40, 0)};
  return result;
}

LadderRecord Match(int index) {
  LadderRecord match;
  match.HomeTeam = TeamName(index);
  match.AwayTeam = TeamName(index ^ 1);
  match.HomeScore = static_cast<std::int16_t>(index % 12);
  match.AwayScore = static_cast<std::int16_t>(11 - index % 12);
  match.GameDate = Season::GameDate(index * kDates / kMatches);
  return match;
}

template <typename Encoded>
void Append(std::vector<std::byte>& bytes, const Encoded& record) {
  bytes.insert(bytes.end(), record.begin(), record.end());
}

void WriteFile(const std::string& path, const std::vector<std::byte>& bytes) {
  RealFileSystem files;
  const auto file = files.Open(path, OpenMode::Truncate);
  file->WriteAt(0, bytes);
  file->Close();
}

std::filesystem::path NewFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "marlowbeck-XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) std::abort();
  return pattern;
}

}  // namespace

Season::Season(Entry entry) : folder_(NewFolder()) {
  std::vector<std::byte> players;
  for (int index = 0; index < kPlayers; ++index) Append(players, Encode(Player(index)));
  WriteFile(PlayerFile(), players);

  std::vector<std::byte> results;
  for (int index = 0; index < kResults; ++index) {
    const int night = entry == Entry::Shuffled ? index % kDates : index * kDates / kResults;
    Append(results, Encode(Result(index, night)));
  }
  WriteFile(ResultsFile(), results);

  std::vector<std::byte> matches;
  for (int index = 0; index < kMatches; ++index) Append(matches, Encode(Match(index)));
  WriteFile(LadderFile(), matches);
}

Season::~Season() {
  std::error_code ignored;
  std::filesystem::remove_all(folder_, ignored);
}

Session Season::OpenSession() const {
  Session session;
  session.PlayerFile = PlayerFile();
  session.Grade = kGrade;
  NameGradeFiles(session);
  return session;
}

Date Season::GameDate(int night) { return Date{DateFromCivil({2004, 1, 7})->days + 7.0 * night}; }

std::uint64_t PlainRead(const std::string& path) {
  RealFileSystem files;
  const auto file = files.Open(path, OpenMode::Read);
  std::vector<std::byte> block(kBlock);
  std::uint64_t sum = 0;
  for (std::uint64_t place = 0;;) {
    const std::size_t count = file->ReadAt(place, block);
    if (count == 0) return sum;
    place += count;
    for (const std::byte byte : std::span(block).first(count)) {
      sum += std::to_integer<std::uint64_t>(byte);
    }
  }
}

void PlainCopy(const std::string& from, const std::string& to) {
  RealFileSystem files;
  const auto source = files.Open(from, OpenMode::Read);
  const auto target = files.Open(to, OpenMode::Truncate);
  std::vector<std::byte> block(kBlock);
  for (std::uint64_t place = 0;;) {
    const std::size_t count = source->ReadAt(place, block);
    if (count == 0) break;
    target->WriteAt(place, std::span(block).first(count));
    place += count;
  }
  target->Sync();
  target->Close();
}

}  // namespace marlowbeck::bench
