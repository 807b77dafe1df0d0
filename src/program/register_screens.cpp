#include "program/register_screens.h"

#include <memory>

#include "filecopy/frmBackup.h"
#include "fixtures/frmFixtures.h"
#include "knockout/frmKnockOut.h"
#include "ladder/frmLadder.h"
#include "results/frmChangeDate.h"
#include "results/frmEdScore.h"
#include "results/frmResults.h"
#include "season/frmAnnual.h"
#include "season/frmPegRatio.h"
#include "season/frmPlayersLists.h"
#include "season/frmSearchPlayer.h"
#include "session/frmAbout.h"
#include "session/frmBuend.h"
#include "session/frmDB.h"
#include "session/frmErrors.h"
#include "session/frmSort.h"
#include "setup/frmGameNames.h"
#include "setup/frmNames.h"
#include "setup/frmSeason.h"
#include "stats/frmPMenu.h"

namespace marlowbeck {
namespace {

template <typename S>
void Register(Screens& screens, const char* name, const Context& context) {
  screens.Register(name, [&context](Screens& in) { return std::make_unique<S>(in, context); });
}

}  // namespace

void RegisterScreens(Screens& screens, const Context& context) {
  Register<frmDB>(screens, "frmDB", context);
  Register<frmBuend>(screens, "frmBuend", context);
  Register<frmSort>(screens, "frmSort", context);
  Register<frmAbout>(screens, "frmAbout", context);
  Register<frmNames>(screens, "frmNames", context);
  Register<frmGameNames>(screens, "frmGameNames", context);
  Register<frmSeason>(screens, "frmSeason", context);
  Register<frmLadder>(screens, "frmLadder", context);
  Register<frmResults>(screens, "frmResults", context);
  Register<frmEdScore>(screens, "frmEdScore", context);
  Register<frmChangeDate>(screens, "frmChangeDate", context);
  Register<frmPMenu>(screens, "frmPMenu", context);
  Register<frmAnnual>(screens, "frmAnnual", context);
  Register<frmPegRatio>(screens, "frmPegRatio", context);
  Register<frmPlayersLists>(screens, "frmPlayersLists", context);
  Register<frmSearchPlayer>(screens, "frmSearchPlayer", context);
  Register<frmKnockOut>(screens, "frmKnockOut", context);
  Register<frmFixtures>(screens, "frmFixtures", context);
  Register<frmBackup>(screens, "frmBackup", context);
  Register<frmErrors>(screens, "frmErrors", context);
}

}  // namespace marlowbeck
