#pragma once

#include "ui/context.h"
#include "ui/controls.h"
#include "ui/screen.h"

namespace marlowbeck {

/// The season's title of each grade, which stands on the reports.
struct frmSeason : Screen {
  frmSeason(Screens& screens, const Context& context);

  Panel fraGrade{*this, "fraGrade", "Select Grade to change Season Description"};
  ComboBox cboGrades{fraGrade, "cboGrades", "Grade"};
  Command cmdCancel{fraGrade, "cmdCancel", "Exit"};
  Command cmdHlp{fraGrade, "cmdHlp", "Help"};

  Panel fraEdit{*this, "fraEdit"};
  Label lblGradeName{fraEdit, "lblGradeName"};
  Label Label1{fraEdit, "Label1", "Current Season Description"};
  Label lblOldSeason{fraEdit, "lblOldSeason"};
  Label Label3{fraEdit, "Label3", "Enter New Season Description"};
  TextBox txtNewSeason{fraEdit, "txtNewSeason"};
  Command SSCommand1{fraEdit, "SSCommand1", "Paste Current"};
  Command cmdLicSave{fraEdit, "cmdLicSave", "Save"};
  Command cmdGrade{fraEdit, "cmdGrade", "Change Grade"};
  Command cmdLicCancel{fraEdit, "cmdLicCancel", "Exit"};
  Command SSCommand2{fraEdit, "SSCommand2", "Help"};

  void Load() override;
  void Unload() override;

  void cboGrades_Click();
  void cmdLicSave_Click();
  void cmdGrade_Click();
  void FileNames();
  void GetSeason();

 private:
  void ListGrades();
  void Leave();

  const Context& context_;
  Session& session_;
  bool filling_ = false;  ///< the list is being filled: what it selects is no pick
};

}  // namespace marlowbeck
