#include "drive/workbench.h"

#include <utility>

#include "session/frmErrors.h"

namespace marlowbeck {
namespace {

/// Stands where the program looks for its main menu, and lets the workbench come up instead.
struct Door : Screen {
  explicit Door(Screens& screens) : Screen(screens, "frmDB", "Door") {}
  void Activate() override {
    InScreens().HideQuietly(*this);
    InScreens().Show("frmBench");
  }
};

}  // namespace

Workbench::Workbench(Screens& screens, const Context& in)
    : Screen(screens, "frmBench", "Workbench"), context(in) {
  for (const char* line : {"first", "second", "third"}) {
    for (LineHolder* list :
         std::initializer_list<LineHolder*>{&lstOne, &lstMany, &cboLocked, &cboFree}) {
      list->AddLine(line);
    }
  }
  lstMany.SetMulti(true);
  filFiles.SetMulti(true);
  drvDrives.Refresh();
  dirFolders.SetPath(context.working_folder);
  filFiles.SetPath(context.working_folder);
  grdTable.SetSize(2, 3);
  grdTable.SetCell(0, 0, "Name");
  grdTable.SetCell(1, 2, "17.89");
  txtLocked.SetText("as it is");
  txtLocked.SetLocked(true);
  dtpDay.SetValue(*DateFromCivil({2004, 3, 31}));
  prgBar.SetRange(0, 40);
  prgBar.SetValue(10);
  Helps = {&cmdHelp};
  Cancels = {&cmdEnd};
}

Program::Registration WithWorkbench(BenchWork prepare) {
  return [prepare = std::move(prepare)](Screens& screens, const Context& context) {
    screens.Register("frmDB", [](Screens& in) { return std::make_unique<Door>(in); });
    screens.Register("frmBench", [&context, prepare](Screens& in) {
      auto bench = std::make_unique<Workbench>(in, context);
      prepare(*bench);
      return bench;
    });
    screens.Register("frmShelf", [](Screens& in) { return std::make_unique<Shelf>(in); });
    screens.Register("frmErrors",
                     [&context](Screens& in) { return std::make_unique<frmErrors>(in, context); });
  };
}

WorkbenchTest::WorkbenchTest() {
  registration = WithWorkbench([this](Workbench& bench) { SetUpBench(bench); });
}

void WorkbenchTest::SetUpBench(Workbench& bench) {
  if (prepare) prepare(bench);
  bench.cmdDo.Click = [this, &bench, otherwise = bench.cmdDo.Click] {
    if (do_) return do_(bench);
    if (otherwise) otherwise();
  };
  bench.lblChange.Click = [this, &bench] { change_(bench); };
}

void WorkbenchTest::OnDo(BenchWork work) { do_ = std::move(work); }

void WorkbenchTest::Change(const BenchWork& change, Here here) {
  change_ = change;
  Do("click frmBench.lblChange", here);
}

std::string WorkbenchTest::ToldBy(std::string_view line, Here here) {
  const auto told_before = Caption("frmBench.lblTold", here).size();
  Do(line, here);
  return Caption("frmBench.lblTold", here).substr(told_before);
}

}  // namespace marlowbeck
