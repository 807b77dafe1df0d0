#pragma once

#include <random>
#include <string>
#include <vector>

#include "support/club.h"
#include "support/season_model.h"

namespace marlowbeck {

/// A made-up competition, corrections of it drawn at random and worked on the screens, and a plain
/// model that is told of each. Every box is compared with what the model says, and so is what the
/// screens list. MARLOWBECK_SEED plays a run again.
class RandomCorrections : public ::testing::Test, protected Club {
 protected:
  RandomCorrections();

  /// Three grades of four teams whose nights are in any order.
  void MakeCompetition();
  /// Carries out one correction of any kind.
  void CorrectAnything();
  /// Back at the main menu, from wherever the last correction ended.
  void LeaveTheScreens();

  SeasonModel model;

 private:
  using Names = std::vector<std::string>;
  struct Correction {
    int weight;  ///< how often it is to come
    void (RandomCorrections::*carry_out)();
  };
  static std::vector<Correction> Corrections();

  void AddMadeUp(const std::string& grade, const std::string& team, int code);
  void MakeNight(const std::string& grade, int day);
  ResultRecord MadeUpResult(std::int32_t id, const std::string& team, const std::string& opposition,
                            int day);

  // Names, on the setup screen.
  void OpenSetup();
  void PickATeam();
  std::string PickAPlayer();
  void RenameATeam();
  void RenameAGrade();
  void DeleteAPlayer();
  void EditAPlayer();
  void AddAPlayer();

  // A team's night, on the score sheets.
  bool OpenSheets();
  void LeaveSheets();
  void SwapAnOpposition();
  void DeleteAResult();
  void AddAPlayerFromSheets();

  // A team's night, from the weekly table.
  bool OpenWeekly();
  void LeaveWeekly();
  bool PickADate();
  Figures DrawFigures();
  void TypeFigures(const std::string& row, const Figures& figures);
  void CorrectAScore();
  void ChangeADate();

  int Below(int end) { return std::uniform_int_distribution<int>(0, end - 1)(chance_); }
  bool OneIn(int n) { return Below(n) == 0; }
  template <typename Item>
  Item OneOf(const std::vector<Item>& items) {
    return items[static_cast<std::size_t>(Below(static_cast<int>(items.size())))];
  }
  /// Does a line of code page 1252.
  void Do8(const std::string& line);
  /// What is in hand, for the words of a failure.
  void Say(const std::string& what);
  void ExpectBoxes(const SeasonModel::Boxes& expected);
  void ExpectBoxes(const std::vector<std::string>& actual, const SeasonModel::Boxes& expected);
  void ExpectLines(std::vector<std::string> actual, const Names& expected);

  unsigned long seed_;
  std::mt19937 chance_;
  bool in_setup_ = false;
  TeamNight at_;      ///< grade and team in hand, and a date where there is one
  std::string told_;  ///< the correction in hand
};

}  // namespace marlowbeck
