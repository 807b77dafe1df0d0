// The ladder file and its rules, through everything that reads them.

#include <algorithm>
#include <cmath>
#include <set>
#include <string>
#include <vector>

#include "data/competition.h"
#include "data/text.h"
#include "fuzz/checks.h"
#include "fuzz/memory_file_system.h"
#include "fuzz/targets.h"
#include "ladder/ladder_rows.h"
#include "ladder/ladder_rules.h"
#include "ladder/match_lines.h"
#include "session/sort_pass.h"

namespace marlowbeck::fuzz {
namespace {

constexpr const char* kMatches = "a_.qzl";
constexpr const char* kRules = "a_.qzi";

std::vector<int> NumbersOf(const LadderRules& rules) {
  return {rules.WinPoints, rules.LossPoints, rules.DrawPoints, rules.FinalsTeams,
          rules.GamesPerMatch};
}

/// The rules of the file, or the usual ones where it holds none.
LadderRules RulesOfFile(Channels& channels) {
  LadderRules rules;
  if (!Try([&] { rules = ReadLadderRules(channels, kRules); })) return {};
  WriteLadderRules(channels, kRules, rules);
  Must(NumbersOf(ReadLadderRules(channels, kRules)) == NumbersOf(rules), "rules read back");
  return rules;
}

std::vector<LadderRecord> MatchesOf(const std::vector<std::byte>& bytes) {
  std::vector<LadderRecord> matches;
  const std::span<const std::byte> all(bytes);
  for (std::size_t place = 0; place + kLadderLength <= bytes.size(); place += kLadderLength) {
    matches.push_back(DecodeLadder(all.subspan(place, kLadderLength)));
  }
  return matches;
}

/// Every second name, so that there are teams that nobody knows, and a blank one.
std::vector<std::string> SomeTeams(const std::vector<LadderRecord>& matches) {
  std::set<std::string> names = {""};
  for (std::size_t i = 0; i < matches.size(); ++i) {
    names.insert(Trim(i % 2 == 0 ? matches[i].HomeTeam : matches[i].AwayTeam));
  }
  return {names.begin(), names.end()};
}

/// A team's figures by the plain loop, or nothing where one of them leaves 16 bits on the way.
class PlainTeam {
 public:
  PlainTeam(std::string name, const LadderRules& rules) : name_(std::move(name)), rules_(rules) {}

  void Play(const LadderRecord& match) {
    if (name_.empty()) return;
    if (Trim(match.HomeTeam) == name_) {
      Count(match.HomeScore, match.AwayScore, match.HomePenalty);
    }
    if (Trim(match.AwayTeam) == name_) {
      Count(match.AwayScore, match.HomeScore, match.AwayPenalty);
    }
  }

  [[nodiscard]] bool Overflows() const { return overflows_; }
  [[nodiscard]] bool Is(const LadderRow& row) const {
    return row.Team == name_ && row.Played == won_ + lost_ + draw_ && row.Won == won_ &&
           row.Lost == lost_ && row.Draw == draw_ && row.For == for_ && row.Against == against_ &&
           row.Adjust == adjust_ && row.Points == points_ && row.Percent == percent_;
  }

 private:
  void Keep16(long number) { overflows_ = overflows_ || number < INT16_MIN || number > INT16_MAX; }

  void Count(int own, int other, int penalty) {
    won_ += own > other ? 1 : 0;
    lost_ += own < other ? 1 : 0;
    draw_ += own == other ? 1 : 0;
    for_ += own;
    against_ += other;
    adjust_ += penalty;
    points_ = won_ * rules_.WinPoints;
    Keep16(points_);
    Add(lost_ * rules_.LossPoints);
    Add(draw_ * rules_.DrawPoints);
    Add(adjust_);
    for (const long sum : {won_ + lost_ + draw_, for_, against_, adjust_, for_ * 100}) Keep16(sum);
    // The nearest, of two equally near ones the even number: how doubles are rounded by default.
    percent_ = std::lrint(double(for_) * 100 / double(std::max(against_, 1L)));
  }

  void Add(long part) {
    Keep16(part);
    points_ += part;
    Keep16(points_);
  }

  std::string name_;
  LadderRules rules_;
  bool overflows_ = false;
  long won_ = 0, lost_ = 0, draw_ = 0, for_ = 0, against_ = 0, adjust_ = 0, points_ = 0;
  long percent_ = 0;
};

void CompareWithPlainLoops(const std::vector<LadderRecord>& matches, const LadderRules& rules,
                           Date up_to) {
  const std::vector<std::string> teams = SomeTeams(matches);
  std::vector<PlainTeam> plain;
  plain.reserve(teams.size());
  for (const std::string& team : teams) plain.emplace_back(team, rules);
  for (const LadderRecord& match : matches) {
    for (PlainTeam& team : plain) {
      if (match.GameDate <= up_to) team.Play(match);
    }
  }
  LadderRows rows;
  const bool counted = Try([&] {
    LadderTally tally(teams, rules, up_to);
    for (const LadderRecord& match : matches) tally.Add(LadderView(Encode(match)));
    rows = tally.Rows();
  });
  const bool overflows = std::any_of(plain.begin(), plain.end(),
                                     [](const PlainTeam& team) { return team.Overflows(); });
  Must(counted != overflows, "the table overflows where the plain loops do");
  if (!counted) return;
  for (std::size_t i = 0; i < rows.size(); ++i) Must(plain[i].Is(rows[i]), "each figure is plain");
  SortLadder(rows);
  Must(std::is_sorted(rows.begin(), rows.end(),
                      [](const LadderRow& a, const LadderRow& b) {
                        return a.Points != b.Points ? a.Points > b.Points : a.Percent > b.Percent;
                      }),
       "points descend, and percentages within them");
}

void ReadEveryLine(const std::vector<LadderRecord>& matches) {
  for (const LadderRecord& match : matches) {
    const LadderBytes bytes = Encode(match);
    const LadderView view(bytes);
    const std::string line = LineOfRecord(view);
    for (const std::string_view team : {view.HomeTeam(), view.AwayTeam()}) {
      Must(line.find(team) != std::string::npos, "a match is found by its teams");
    }
    (void)ResultCells(view);
    (void)PercentText(view.HomeScore(), view.AwayScore());
    Try([&] { (void)LongDate(view.GameDate()); });
  }
}

void SortMatches(MemoryFileSystem& files, Channels& channels) {
  constexpr Field kGameDate = FieldNamed(kLadderFields, "GameDate");
  const auto before = files.Bytes(kMatches);
  const bool sorted = Try([&] {
    SortByDate(channels, {kMatches, kLadderLength, kGameDate.offset}, "dates.qz3", [](int) {});
  });
  channels.AbandonAll();
  const auto after = files.Bytes(kMatches);
  if (!sorted) return Must(before == after, "a failed sort leaves the file as it was");
  std::vector<std::vector<std::byte>> records = RecordsOf(before, kLadderLength);
  std::stable_sort(records.begin(), records.end(), [](const auto& a, const auto& b) {
    return LadderView(a).GameDate() < LadderView(b).GameDate();
  });
  Must(records == RecordsOf(after, kLadderLength), "the sort keeps the order within a date");
}

}  // namespace

void Ladder(Input input) {
  MemoryFileSystem files;
  const std::size_t rules_length =
      input.empty() ? 0 : std::min(input.size() - 1, std::to_integer<std::size_t>(input[0]));
  const Input rest = input.subspan(input.empty() ? 0 : 1);
  const Input rules_bytes = rest.first(rules_length);
  const Input match_bytes = rest.subspan(rules_length);
  files.Bytes(kRules).assign(rules_bytes.begin(), rules_bytes.end());
  files.Bytes(kMatches).assign(match_bytes.begin(), match_bytes.end());

  Channels channels(files);
  const LadderRules rules = RulesOfFile(channels);
  channels.AbandonAll();
  const std::vector<LadderRecord> matches = MatchesOf(files.Bytes(kMatches));
  ReadEveryLine(matches);
  if (!matches.empty()) CompareWithPlainLoops(matches, rules, matches.back().GameDate);
  CompareWithPlainLoops(matches, rules, Date{1e9});
  SortMatches(files, channels);
}

}  // namespace marlowbeck::fuzz
