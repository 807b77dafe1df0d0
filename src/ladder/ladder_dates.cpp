// The ladder file in date order, and the walk along its dates.

#include "data/competition.h"
#include "data/date_steps.h"
#include "ladder/frmLadder.h"
#include "session/sort_pass.h"

namespace marlowbeck {
namespace {

constexpr const char* kSortFile = "dates.qz3";

}  // namespace

void frmLadder::SortLadderFile() {
  constexpr Field kGameDate = FieldNamed(kLadderFields, "GameDate");
  Channels& channels = context_.channels;
  context_.GoToWorkingFolder();
  OpenLadderFile(session_, channels);
  channels.CloseAll();
  try {
    SortByDate(channels, {session_.LadderFile, kLadderLength, kGameDate.offset}, kSortFile,
               [](int) {});
  } catch (const RunTimeError&) {
    // What it holds would end up behind the matches of the next ladder that is sorted.
    channels.AbandonAll();
    channels.DeleteQuietly(kSortFile);
    throw;
  }
}

void frmLadder::GetDates() {
  session_.DateCount = 0;
  session_.DateList.clear();
  std::vector<Date> dates;
  OpenLadderFile(session_, context_.channels);
  context_.channels.ForEachRecord(
      Channel::Ladder, [&](Bytes bytes, int) { dates.push_back(LadderView(bytes).GameDate()); });
  context_.channels.CloseAll();
  session_.DateList = WithoutRepeats(dates);
  session_.DateCount = static_cast<int>(session_.DateList.size());
}

void frmLadder::GoToDate(Date date) {
  EmptyPanel();
  session_.WorkDate = date;
  ShowWorkDate();
  EdCal.SetValue(date);
  EnterScores();
}

void frmLadder::cmdFirst_Click() {
  context_.platform.sound.Beep();
  if (session_.DateList.empty()) return;
  GoToDate(session_.DateList.front());
}

void frmLadder::cmdLast_Click() {
  context_.platform.sound.Beep();
  if (session_.DateList.empty() || session_.WorkDate == session_.DateList.back()) return;
  GoToDate(session_.DateList.back());
}

void frmLadder::cmdNextDate_Click() {
  const auto step = StepForward(session_.DateList, session_.WorkDate);
  if (!step) return;
  if (step->at_end) context_.platform.sound.Beep();
  GoToDate(step->date);
}

void frmLadder::cmdPrevDate_Click() {
  const auto step = StepBack(session_.DateList, session_.WorkDate);
  if (!step) return;
  if (step->at_end) context_.platform.sound.Beep();
  GoToDate(step->date);
}

}  // namespace marlowbeck
