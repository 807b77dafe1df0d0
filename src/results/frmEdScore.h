#pragma once

#include <string>

#include "results/score_boxes.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// One player's figures put right from the weekly table. Whose they are comes in `qzEdScor.qz3`;
/// whoever opened it is told when they are saved.
struct frmEdScore : Screen {
  frmEdScore(Screens& screens, const Context& context);

  // Whose figures; these are only shown.
  TextBox txtGrade{*this, "txtGrade", "Grade:"};
  TextBox txtTeam{*this, "txtTeam", "Team:"};
  TextBox txtOpp{*this, "txtOpp", "Opposition:"};
  TextBox txtDate{*this, "txtDate", "Date:"};
  TextBox txtPlayer{*this, "txtPlayer", "Player:"};

  ScoreBoxes scores;
  CheckBox chkFF{*this, "chkFF", "Register a Forfeit Only"};
  Command cmdSave{*this, "cmdSave", "Save"};
  Command Command2{*this, "Command2", "Cancel"};
  Command Command3{*this, "Command3", "Help"};

  void Load() override;

  void WhichBoxes();
  void ClearResults();
  void EnableBoxes();
  /// Puts the saved figures back, where there is a record.
  void GetOldScores();
  void txtAgg_LostFocus();
  /// Leaves Flag at 1 when a rule is broken, else at 0.
  void CheckCenturies();
  void cmdSave_Click();

 private:
  void ReadHandOver();
  [[nodiscard]] bool FindPlayer();
  void FindRecord();
  void ReadRecord();
  void WriteRecord();

  const Context& context_;
  ResultRecord record_;  ///< number EditRecord of the results file, from load to save
};

}  // namespace marlowbeck
