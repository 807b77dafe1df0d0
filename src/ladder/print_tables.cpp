#include "ladder/print_tables.h"

#include <algorithm>

#include "data/numbers.h"
#include "data/text.h"
#include "print/table_layout.h"

namespace marlowbeck {
namespace {

constexpr double kTeamInset = 20;  // twips
constexpr std::size_t kAdjust = 9;

const std::vector<std::string> kHeads = {"Team", "P", "W", "L", "D", "F", "A", "%", "Pts", "Adj"};
/// The texts that fix the widths of the columns behind the team's.
const std::vector<std::string> kEights = {"888",  "888",     "888",  "888", "8888",
                                          "8888", "8888888", "8888", "888"};

/// The column of adjustments is there when any team has one.
std::size_t LadderColumns(const TextRows& ladder) {
  const bool any = std::any_of(ladder.begin(), ladder.end(),
                               [](const auto& row) { return Val(row.at(kAdjust)) != 0; });
  return any ? kAdjust + 1 : kAdjust;
}

std::vector<std::string> FirstOf(const std::vector<std::string>& cells, std::size_t count) {
  return {cells.begin(), cells.begin() + static_cast<std::ptrdiff_t>(count)};
}

std::string LadderCell(const std::string& cell) {
  const std::string text = Trim(cell);
  return text == "0" ? "-" : text;
}

std::vector<std::string> LadderCells(const std::vector<std::string>& row, std::size_t columns) {
  std::vector<std::string> cells;
  for (std::size_t i = 0; i < columns; ++i) cells.push_back(LadderCell(row.at(i)));
  return cells;
}

std::string ResultWord(const std::string& word) {
  return word == " def " ? "defeated" : Trim(word);
}

/// The widths that both tables are made of, in the printer's font.
struct Measures {
  Measures(const Page& page, const std::vector<std::string>& teams)
      : team(page.WidestOf(teams) * kRoomFactor), pitch(page.TextHeight() * kRoomFactor) {
    for (const std::string& eights : kEights) figures.push_back(page.WidthOf(eights) * kRoomFactor);
    score = figures.front();
    word = page.WidthOf(" Defeated ") * kRoomFactor;
  }

  double team;
  double pitch;
  std::vector<double> figures;
  double score = 0;
  double word = 0;
};

ColumnLayout TeamColumn(const Measures& measures) {
  return {measures.team, Stand::FromLeft, kTeamInset};
}

TableLayout ResultsLayout(const Measures& measures) {
  return {{TeamColumn(measures),
           {measures.score},
           {measures.word},
           TeamColumn(measures),
           {measures.score}},
          measures.pitch};
}

TableLayout LadderLayout(const Measures& measures, std::size_t column_count) {
  std::vector<ColumnLayout> columns = {TeamColumn(measures)};
  for (std::size_t i = 1; i < column_count; ++i) columns.push_back({measures.figures[i - 1]});
  return {columns, measures.pitch};
}

/// One printout of the tab.
class Printout {
 public:
  Printout(const Context& context, PrintJob& job, LadderPrintout what, const LadderTab& tab)
      : session_(context.session),
        job_(job),
        page_(job.OnPage()),
        tab_(tab),
        results_wanted_(what != LadderPrintout::Ladder),
        ladder_wanted_(what != LadderPrintout::Results),
        column_count_(LadderColumns(tab.ladder)) {}

  void Print() {
    if (!job_.Begin()) return;
    const Measures measures(page_, Trimmed(tab_.teams));
    const TableLayout results = ResultsLayout(measures);
    const TableLayout ladder = LadderLayout(measures, column_count_);
    if (!job_.FitsAcross((results_wanted_ ? results : ladder).Width())) return;
    job_.PrintCopies([&] { return Compose(results, ladder); });
  }

 private:
  static std::vector<std::string> Trimmed(std::vector<std::string> names) {
    for (std::string& name : names) name = Trim(name);
    return names;
  }

  bool Compose(const TableLayout& results, const TableLayout& ladder) {
    PrintHeading();
    if (results_wanted_) PrintResults(results);
    if (results_wanted_ && ladder_wanted_) {
      if (!job_.FitsAcross(ladder.Width())) return false;
      page_.MoveDown(page_.TextHeight() / 2);
    }
    if (ladder_wanted_) PrintLadder(ladder);
    return EndsOnPage(results.Pitch());
  }

  /// All that stands above the first title.
  void PrintHeading() {
    page_.MoveTo(job_.Top());
    if (job_.WithHeading()) {
      PrintHeadingLine(session_.AssociationName);
      PrintHeadingLine(session_.SeasonDescription);
    }
    page_.SetBold(true);
    PrintHeadingLine(tab_.grade);
  }

  /// The next one stands a quarter of a line below it.
  void PrintHeadingLine(const std::string& line) {
    if (marlowbeck::Trimmed(line).empty()) return;
    page_.PrintCentred(line);
    page_.MoveDown(page_.TextHeight() / 4);
  }

  // KEPT: below its title a table is never bold, its heads and a bold font's rows included; a
  // repair would print heads in bold and rows as the font is.
  void PrintTitle(const std::string& title) {
    page_.SetBold(true);
    page_.PrintCentred(title);
    page_.SetBold(false);
    page_.MoveDown(page_.TextHeight() / 2);
  }

  void PrintResults(const TableLayout& layout) {
    PrintTitle(tab_.game_details);
    for (std::vector<std::string> row : tab_.results) {
      row.at(2) = ResultWord(row.at(2));
      layout.PrintRow(page_, row);
    }
  }

  void PrintLadder(const TableLayout& layout) {
    PrintTitle(tab_.ladder_title);
    layout.AllCentred().PrintRow(page_, FirstOf(kHeads, column_count_));
    for (const auto& row : tab_.ladder) layout.PrintRow(page_, LadderCells(row, column_count_));
  }

  bool EndsOnPage(double pitch) {
    if (page_.Y() < job_.Foot(pitch)) return true;
    job_.Refuse(Lines(
        {"Your selections will not fit on one page.   ", "Printing will now be cancelled.    ",
         "<<WARNING>> This may take some time    ", "depending on printer status.    ", "",
         "Note: Choose a smaller font to fit more   ", "onto a page.    "}));
    return false;
  }

  const Session& session_;
  PrintJob& job_;
  Page& page_;
  const LadderTab& tab_;
  bool results_wanted_;
  bool ladder_wanted_;
  std::size_t column_count_;
};

}  // namespace

void PrintLadderTab(const Context& context, const PrintOptions& options, LadderPrintout what,
                    const LadderTab& tab) {
  PrintJob::Run(context, options,
                [&](PrintJob& job) { Printout(context, job, what, tab).Print(); });
}

}  // namespace marlowbeck
