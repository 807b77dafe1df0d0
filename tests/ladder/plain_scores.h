#pragma once

#include <algorithm>
#include <string>
#include <vector>

#include "ladder/ladder_league.h"
#include "ladder/plain_ladder.h"

namespace marlowbeck {

/// The Scores tab in plain texts: what is on file, and what stands on the entry panel.
struct PlainScores {
  using TextList = std::vector<std::string>;

  TextList teams;
  std::vector<LadderRecord> matches;
  int day = 3;  ///< of March, the work date

  // On the panel.
  TextList left;
  TextList done;
  std::string prompt;
  std::string home, away, home_score, away_score;
  bool list_enabled = true;

  static Date March(int day) { return *DateFromCivil({2004, 3, day}); }

  void Fill() {
    std::stable_sort(matches.begin(), matches.end(), [](const auto& a, const auto& b) {
      return a.GameDate.days < b.GameDate.days;
    });
    left = teams;
    done.clear();
    for (const LadderRecord& match : matches) {
      if (match.GameDate != March(day)) continue;
      done.push_back(LineOnFile(match));
      for (const std::string& team : {match.HomeTeam, match.AwayTeam}) {
        if (!Trim(team).empty()) std::erase(left, Trim(team));
      }
    }
    home = away = home_score = away_score = {};
    prompt = left.empty() ? "No Teams to Enter" : "Select HOME TEAM";
    list_enabled = true;
  }

  static std::string LineOnFile(const LadderRecord& match) {
    const std::string home = Trim(match.HomeTeam) + " (" + std::to_string(match.HomeScore) + ")";
    const std::string away = Trim(match.AwayTeam) + " (" + std::to_string(match.AwayScore) + ")";
    if (match.HomeScore > match.AwayScore) return home + " defeated  " + away + "  ";
    return away + (match.HomeScore < match.AwayScore ? " defeated  " : " drew with  ") + home +
           "  ";
  }

  void Pick(std::size_t line) {
    const bool is_home = home.empty() && prompt == "Select HOME TEAM";
    const bool is_away = !is_home && away.empty() && prompt == "Select AWAY TEAM";
    if (!is_home && !is_away) return;
    (is_home ? home : away) = left[line];
    left.erase(left.begin() + static_cast<std::ptrdiff_t>(line));
    prompt = is_home ? "Select AWAY TEAM" : "Select HOME TEAM";
    if ((home.empty() || away.empty()) && !left.empty()) return;
    prompt = {};
    list_enabled = false;
  }

  void HomeBack() {
    left.push_back(home);
    home = home_score = {};
    if (away.empty()) away_score = {};
    prompt = "Select HOME TEAM";
    list_enabled = true;
  }

  void AwayBack() {
    left.push_back(away);
    away = away_score = {};
    if (home.empty()) home_score = {};
    prompt = home.empty() ? "Select HOME TEAM" : "Select AWAY TEAM";
    list_enabled = true;
  }

  [[nodiscard]] bool CanRecord() const {
    if (home.empty() || home_score.empty()) return false;
    if (!away.empty() && !away_score.empty()) return true;
    return away.empty() && away_score.empty() && (home_score == "B" || home_score == "b");
  }

  void Record(double home_games, double away_games) {
    const std::string home_side = home + " (" + home_score + ")";
    const std::string away_side = away + " (" + away_score + ")";
    if (home_games == away_games) done.push_back(home_side + " drew  " + away_side + "  ");
    if (home_games > away_games) done.push_back(home_side + " defeated  " + away_side + "  ");
    if (home_games < away_games) done.push_back(away_side + " defeated  " + home_side + "  ");
    matches.push_back(MatchOn(day, home, RoundedEven(home_games), away, RoundedEven(away_games)));
    std::stable_sort(matches.begin(), matches.end(), [](const auto& a, const auto& b) {
      return a.GameDate.days < b.GameDate.days;
    });
    home = away = home_score = away_score = {};
    prompt = left.empty() ? "No Teams to Enter" : "Select HOME TEAM";
    list_enabled = left.size() != 1;
  }

  /// The match that a line of `done` opens: the last of the date whose home team stands in it.
  [[nodiscard]] LadderRecord* Opened(const std::string& line) {
    LadderRecord* opened = nullptr;
    for (LadderRecord& match : matches) {
      const bool named = line.find(Trim(match.HomeTeam)) != std::string::npos;
      if (match.GameDate == March(day) && named) opened = &match;
    }
    return opened;
  }

  [[nodiscard]] bool IsInTheWay(const std::string& home_team, int new_day) const {
    return new_day != day && std::any_of(matches.begin(), matches.end(), [&](const auto& match) {
             return match.GameDate == March(new_day) &&
                    (Trim(match.HomeTeam) == home_team || Trim(match.AwayTeam) == home_team);
           });
  }
};

}  // namespace marlowbeck
