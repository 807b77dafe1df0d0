#include "season/annual.h"

#include <algorithm>

#include "data/numbers.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "stats/weekly_results.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kMostGames = 5000;
// KEPT: a figure of 1 counts as none, in the row and in the totals, as a forfeit was once saved
// with ones; a repair would count it.
constexpr int kLeastFigure = 2;

template <typename Number>
Number FigureOrNone(Number figure) {
  return figure >= kLeastFigure ? figure : Number{0};
}

std::int16_t AboveZero(std::int16_t figure) { return std::max<std::int16_t>(figure, 0); }

AnnualGame GameOf(const ResultView& result) {
  AnnualGame game;
  game.date = result.GameDate();
  game.opposition = result.OppositionAsStored();
  game.aggregate = FigureOrNone(result.Aggregate());
  game.shots = FigureOrNone(result.Shots());
  game.high_score = result.HighScore();
  game.scores_180 = AboveZero(result.Scores180());
  game.centuries = AboveZero(result.Centuries());
  for (std::size_t peg = 0; peg < game.pegs.size(); ++peg) game.pegs[peg] = result.Peg(peg);
  return game;
}

std::string TextUnlessNone(double figure) {
  return figure == 0 ? std::string() : NumberText(figure);
}

std::string AverageText(double aggregate, double shots) {
  if (aggregate <= 0 || shots <= 0) return {};
  return TwoPlaces(AverageQuotientFirst(aggregate, shots));
}

/// Those above 1 of a pair, parted by a comma.
std::string PegPair(int first, int second) {
  // KEPT: a peg of 1 is not shown, though it is counted, and the weekly table shows it; a repair
  // would show it here too.
  if (first >= kLeastFigure && second >= kLeastFigure) {
    return NumberText(first) + ", " + NumberText(second);
  }
  return TextUnlessNone(FigureOrNone(first >= kLeastFigure ? first : second));
}

}  // namespace

void AnnualReport::Add(const ResultView& result) {
  if (games_.size() == kMostGames) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
  games_.push_back(GameOf(result));
  Count(games_.back());
}

void AnnualReport::Count(const AnnualGame& game) {
  totals_.aggregate += game.aggregate;
  totals_.shots += game.shots;
  totals_.high_score = std::max(totals_.high_score, game.high_score);
  totals_.scores_180 += game.scores_180;
  totals_.centuries += game.centuries;
  for (std::size_t peg = 0; peg < game.pegs.size(); ++peg) {
    totals_.high_peg = std::max(totals_.high_peg, game.pegs[peg]);
    if (game.pegs[peg] <= 0) continue;
    ++totals_.pegs_by_game[peg / 2];
    ++totals_.pegs;
  }
}

void WriteAnnual(SideFileWriter& writer, std::string_view name, const AnnualReport& report) {
  const auto figure_or_nothing = [&](double figure) {
    if (figure == 0) {
      writer.Nothing();
    } else {
      writer.Number(figure);
    }
  };
  writer.Text(name).EndLine();
  int number = 0;
  for (const AnnualGame& game : report.Games()) {
    writer.Day(game.date).Number(++number).Text(game.opposition).EndLine();
    figure_or_nothing(game.aggregate);
    figure_or_nothing(game.shots);
    writer.Number(game.high_score).Number(game.scores_180).Number(game.centuries).EndLine();
    for (const std::int16_t peg : game.pegs) writer.Number(peg);
    writer.EndLine();
  }
  const AnnualTotals& totals = report.Totals();
  writer.Number(static_cast<double>(totals.aggregate)).Number(static_cast<double>(totals.shots));
  writer.Number(totals.high_score).Number(static_cast<double>(totals.scores_180));
  writer.Number(static_cast<double>(totals.centuries));
  for (const std::int32_t pegs : totals.pegs_by_game) writer.Number(pegs);
  writer.Number(totals.pegs).Number(totals.high_peg).EndLine();
}

std::array<std::string, 11> AnnualCells(const AnnualGame& game) {
  std::string against = Trim(game.opposition);
  if (game.IsForfeit()) against += " *";
  // KEPT: a row is known for a forfeit by the star at the end of the opposition, so that a night
  // against a team whose own name ends with one shows as a forfeit; a repair would hand the mark
  // over by itself.
  const bool forfeit = against.ends_with('*');
  return {ShortDate(game.date),
          against,
          forfeit ? "Forfeit" : TextUnlessNone(game.aggregate),
          forfeit ? "Win" : TextUnlessNone(game.shots),
          FigureAboveZero(game.scores_180),
          FigureAboveZero(game.centuries),
          FigureAboveZero(game.high_score),
          PegPair(game.pegs[0], game.pegs[1]),
          PegPair(game.pegs[2], game.pegs[3]),
          PegPair(game.pegs[4], game.pegs[5]),
          AverageText(game.aggregate, game.shots)};
}

bool IsForfeitRow(const std::array<std::string, 11>& cells) { return cells[1].ends_with('*'); }

std::array<std::string, 12> TotalsCells(const AnnualTotals& totals, int games) {
  const auto aggregate = static_cast<double>(totals.aggregate);
  const auto shots = static_cast<double>(totals.shots);
  return {NumberText(games),
          NumberText(aggregate),
          NumberText(shots),
          NumberText(static_cast<double>(totals.scores_180)),
          NumberText(static_cast<double>(totals.centuries)),
          NumberText(totals.high_score),
          NumberText(totals.pegs_by_game[0]),
          NumberText(totals.pegs_by_game[1]),
          NumberText(totals.pegs_by_game[2]),
          NumberText(totals.pegs),
          NumberText(totals.high_peg),
          AverageText(aggregate, shots)};
}

}  // namespace marlowbeck
