#pragma once

#include "results/date_change.h"
#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// Moves a match that was saved under a wrong date. Grade, team and opposition are those in hand,
/// the date is that of `WkDate.qz3`; whoever opened it is told when the match has moved.
struct frmChangeDate : Screen {
  frmChangeDate(Screens& screens, const Context& context);

  Panel Frame1{*this, "Frame1"};
  Label lblTeamS{Frame1, "lblTeamS"};
  DatePicker OldCal{Frame1, "OldCal", "From ..."};
  TextBox txtOldDay{Frame1, "txtOldDay"};
  DatePicker NewCal{Frame1, "NewCal", "To ..."};
  TextBox txtNewDay{Frame1, "txtNewDay"};
  Command cmdOK{*this, "cmdOK", "&OK"};
  Command cmdCancel{*this, "cmdCancel", "&Cancel"};
  Command cmdNewDateHelp{*this, "cmdNewDateHelp", "&Help"};

  void Load() override;

  void cmdOK_Click();
  void NewCal_Change();

 private:
  [[nodiscard]] DateChange Wanted() const;
  /// The team has played on the new date already.
  [[nodiscard]] bool IsInTheWay(const DateChange& change);
  void Move(const DateChange& change);

  const Context& context_;
};

}  // namespace marlowbeck
