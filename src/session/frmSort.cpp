#include "session/frmSort.h"

#include "data/competition.h"
#include "data/text.h"
#include "session/sort_pass.h"
#include "ui/screens.h"

namespace marlowbeck {
namespace {

constexpr int kSparePlaces = 10;         // of the table of dates
constexpr int kRecordsPerGlance = 2048;  // between two looks at the bar

}  // namespace

frmSort::frmSort(Screens& screens, const Context& context)
    : Screen(screens, "frmSort", "[Marlowbeck]  Sorting Files ... Please wait !"),
      context_(context) {}

void frmSort::Activate() {
  try {
    Sort();
  } catch (const RunTimeError&) {
    // Nothing on this screen could lead the user back.
    context_.channels.AbandonAll();
    InScreens().Unload(*this);
    throw;
  }
  pbWait.SetValue(pbWait.Min());
  InScreens().Unload(*this);
}

void frmSort::Sort() {
  Session& session = context_.session;
  context_.GoToWorkingFolder();
  session.ResultsFile = Trim(ReadOneString(context_.channels, "resfile.qz3"));
  context_.channels.CloseAll();
  OpenResultSFile(session, context_.channels);
  pbWait.SetRange(1, session.ResultCount + kSparePlaces);
  SortResults(context_.channels, session.ResultsFile, WithExtension(session.ResultsFile, ".qz3"),
              [this](int record) { ShowProgress(record); });
}

void frmSort::ShowProgress(int record) {
  pbWait.SetValue(record);
  if (record % kRecordsPerGlance == 0) context_.platform.display.Refresh();
}

void frmSort::Unload() { InScreens().Show("frmDB"); }

}  // namespace marlowbeck
