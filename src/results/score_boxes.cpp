#include "results/score_boxes.h"

#include "data/numbers.h"

namespace marlowbeck {
namespace {

void FillAboveZero(TextBox& box, int value) {
  if (value > 0) box.SetText(NumberText(value));
}

std::int16_t Figure(const TextBox& box) {
  return static_cast<std::int16_t>(int{Integer::Narrow(Val(box.Text()))});
}

}  // namespace

ScoreBoxes::ScoreBoxes(const Owner& owner, const Context& context)
    : txtAgg(owner, "txtAgg", "Aggregate:"),
      txtShots(owner, "txtShots", "Shots:"),
      txtAvg(owner, "txtAvg", "Average:"),
      txtHS(owner, "txtHS", "Highest Score:"),
      txtCent(owner, "txtCent", "Total Centuries:"),
      txtHowMany180s(owner, "txtHowMany180s", "Total 180's:"),
      lblP{Label{owner, "lblP1"}, Label{owner, "lblP2"}, Label{owner, "lblP3"},
           Label{owner, "lblP4"}, Label{owner, "lblP5"}, Label{owner, "lblP6"}},
      txtP{TextBox{owner, "txtP1"}, TextBox{owner, "txtP2"}, TextBox{owner, "txtP3"},
           TextBox{owner, "txtP4"}, TextBox{owner, "txtP5"}, TextBox{owner, "txtP6"}},
      lblLegs(owner, "lblLegs", "Total Legs played:"),
      txtLegs(owner, "txtLegs"),
      context_(context) {
  txtAvg.SetLocked(true);
  txtAvg.SetTabStop(false);
}

std::array<TextBox*, 13> ScoreBoxes::All() {
  return {&txtAgg,  &txtShots, &txtAvg,  &txtHS,   &txtCent, &txtHowMany180s, &txtP[0],
          &txtP[1], &txtP[2],  &txtP[3], &txtP[4], &txtP[5], &txtLegs};
}

void ScoreBoxes::Enable() {
  for (TextBox* box : All()) box->Enable();
}

void ScoreBoxes::Disable() {
  for (TextBox* box : All()) box->Disable();
}

void ScoreBoxes::Blank() {
  for (TextBox* box : All()) box->SetText("");
}

void ScoreBoxes::ShowPegBoxes(int best_of_three, const std::array<std::string, 6>& game_names) {
  const PegBoxes boxes = PegBoxesFor(best_of_three, game_names);
  for (std::size_t i = 0; i < txtP.size(); ++i) {
    lblP[i].SetCaption(boxes.captions[i]);
    lblP[i].SetVisible(boxes.shown[i]);
    txtP[i].SetVisible(boxes.shown[i]);
  }
}

void ScoreBoxes::Fill(const ResultRecord& saved) {
  txtAgg.SetText(NumberText(saved.Aggregate));
  txtShots.SetText(NumberText(saved.Shots));
  ShowAverage();
  FillScores(saved);
  FillAboveZero(txtLegs, saved.Legs);
}

void ScoreBoxes::Restore(const ResultRecord& saved) {
  txtAgg.SetText(NumberText(saved.Aggregate));
  txtShots.SetText(NumberText(saved.Shots));
  // KEPT: a restored average stands as a plain number, 47.5 for 47.50; a repair would give it two
  // places.
  const bool has_average = saved.Aggregate > 0 && saved.Shots > 0;
  txtAvg.SetText(has_average ? NumberText(SheetAverage(saved.Aggregate, saved.Shots)) : "");
  // KEPT: the legs are not restored with the other figures; a repair would fill txtLegs too.
  FillScores(saved);
}

/// Those that are filled only where there is something. Old pegs go into hidden boxes too, so that
/// they are still there after the next save.
void ScoreBoxes::FillScores(const ResultRecord& saved) {
  FillAboveZero(txtHS, saved.HighScore);
  FillAboveZero(txtCent, saved.Centuries);
  FillAboveZero(txtHowMany180s, saved.Scores180);
  for (std::size_t i = 0; i < txtP.size(); ++i) FillAboveZero(txtP[i], saved.Pegs[i]);
}

void ScoreBoxes::MoveInto(ResultRecord& record) const {
  record.Legs = Figure(txtLegs);
  record.Aggregate = Figure(txtAgg);
  record.Shots = NarrowToLong(Val(txtShots.Text()));
  record.HighScore = Figure(txtHS);
  record.Centuries = Figure(txtCent);
  record.Scores180 = Figure(txtHowMany180s);
  for (std::size_t i = 0; i < txtP.size(); ++i) record.Pegs[i] = Figure(txtP[i]);
}

}  // namespace marlowbeck
