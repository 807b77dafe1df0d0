#include "stats/print_list.h"

#include "data/text.h"
#include "print/paged_rows.h"
#include "session/season.h"

namespace marlowbeck {
namespace {

constexpr double kFirstLine = 400;  // twips from the top
constexpr std::size_t kColumnsWithGames = 5;

std::vector<std::string> RowOf(const Grid& grid, int row) {
  std::vector<std::string> cells;
  cells.reserve(static_cast<std::size_t>(grid.Cols()));
  for (int col = 0; col < grid.Cols(); ++col) cells.push_back(grid.Cell(row, col));
  return cells;
}

class ListPrint {
 public:
  ListPrint(const Context& context, PrintJob& job, const ListOnPaper& list)
      : context_(context), job_(job), page_(job.OnPage()), list_(list) {}

  /// A list that is too wide is refused before anything is asked about its title.
  void Print() {
    page_.SetFont();
    const TableLayout layout = Measured();
    if (!job_.FitsAcross(layout.Width())) return;
    GetSeason(context_);
    job_.PrintCopies([&] { return Compose(layout); }, PrintJob::PageTurns::BetweenCopies);
  }

 private:
  [[nodiscard]] double MeasuredWidth(std::size_t column) const {
    std::vector<std::string> cells;
    for (const auto& row : list_.rows) cells.push_back(Trim(row.at(column)));
    return page_.WidestOf(cells) + kRoomFactor * page_.WidthOf("88");
  }

  /// Number, player, team, value or grade; then games, and one as wide as the value.
  [[nodiscard]] TableLayout Measured() const {
    const double narrow = kRoomFactor * page_.WidthOf("8888");
    const double inset = page_.WidthOf("8");
    const double value = MeasuredWidth(3);
    std::vector<ColumnLayout> columns = {{narrow},
                                         {MeasuredWidth(1), Stand::FromLeft, inset},
                                         {MeasuredWidth(2), Stand::FromLeft, inset},
                                         {value}};
    if (list_.headings.size() >= kColumnsWithGames) columns.push_back({narrow});
    if (list_.headings.size() > kColumnsWithGames) columns.push_back({value});
    return {columns, kRoomFactor * page_.TextHeight()};
  }

  bool Compose(const TableLayout& layout) {
    page_.MoveTo(kFirstLine);
    PrintLine(context_.session.AssociationName);
    PrintLine(context_.session.SeasonDescription);
    page_.SetBold(true);
    PrintLine(list_.title);
    page_.RestoreBold();
    PrintLine(list_.subtitle);
    PagedRows rows(layout, list_.headings, list_.rows);
    rows.heading_on = PagedRows::Heading::EveryPage;
    rows.ask = PagedRows::Ask::OnceACopy;
    rows.first_line = kFirstLine;
    return PrintPagedRows(context_, job_, rows);
  }

  void PrintLine(const std::string& line) {
    if (Trimmed(line).empty()) return;
    page_.PrintCentred(Trim(line));
    page_.MoveDown(page_.TextHeight() / 2);
  }

  const Context& context_;
  PrintJob& job_;
  Page& page_;
  const ListOnPaper& list_;
};

}  // namespace

ListOnPaper PrintedList(const Grid& grid, int amount, const std::string& title,
                        const std::string& subtitle) {
  ListOnPaper list{title, subtitle, RowOf(grid, 0), {}};
  for (int row = 1; row <= amount; ++row) list.rows.push_back(RowOf(grid, row));
  return list;
}

void PrintList(const Context& context, const PrintOptions& options, const ListOnPaper& list) {
  PrintJob::Run(context, options, [&](PrintJob& job) { ListPrint(context, job, list).Print(); });
}

}  // namespace marlowbeck
