#include "print/report.h"

#include "data/text.h"
#include "print/table_layout.h"

namespace marlowbeck {
namespace {

std::vector<std::string> CellsBelowHeading(const ReportTable& table, std::size_t column) {
  std::vector<std::string> cells;
  for (const auto& row : table.rows) cells.push_back(Trim(row.at(column)));
  return cells;
}

std::vector<std::string> Headings(const ReportTable& table) {
  std::vector<std::string> headings;
  for (const ReportColumn& column : table.columns) headings.push_back(column.heading);
  return headings;
}

/// The first column's texts stand from the left, all others in the middle.
TableLayout Measure(const Page& page, const ReportTable& table) {
  std::vector<ColumnLayout> columns;
  for (std::size_t i = 0; i < table.columns.size(); ++i) {
    const std::string& eights = table.columns[i].eights;
    const double widest =
        eights.empty() ? page.WidestOf(CellsBelowHeading(table, i)) : page.WidthOf(eights);
    columns.push_back({widest * kRoomFactor, Stand::Centred, 0});
  }
  columns.front().stand = Stand::FromLeft;
  columns.front().inset = page.TextHeight() / 2;
  return {columns, page.TextHeight() * kRoomFactor};
}

/// A printout of tables: their layouts are measured once, for all copies.
class Report {
 public:
  Report(const Context& context, PrintJob& job, const std::vector<ReportTable>& tables)
      : session_(context.session), job_(job), page_(job.OnPage()), tables_(tables) {}

  void Print() {
    if (!job_.Begin()) return;
    for (const ReportTable& table : tables_) layouts_.push_back(Measure(page_, table));
    if (!job_.FitsAcross(layouts_.front().Width())) return;
    job_.PrintCopies([this] { return Compose(); });
  }

 private:
  bool Compose() {
    page_.MoveTo(job_.Top());
    if (job_.WithHeading()) PrintHeading();
    for (std::size_t i = 0; i < tables_.size(); ++i) {
      // Only once the table before it stands is the next one looked at.
      if (i > 0 && !job_.FitsAcross(layouts_[i].Width())) return false;
      if (i > 0) page_.MoveDown(HalfALine());
      PrintTitle(tables_[i].title);
      if (!PrintRows(tables_[i], layouts_[i])) return false;
    }
    return true;
  }

  /// Leaves the page where the title stands.
  void PrintHeading() {
    for (const std::string& line : {session_.AssociationName, session_.SeasonDescription}) {
      if (Trimmed(line).empty()) continue;
      page_.PrintCentred(Trim(line));
      page_.MoveDown(HalfALine());
    }
  }

  void PrintTitle(const std::string& title) {
    page_.SetBold(true);
    page_.PrintCentred(Trim(title));
    page_.RestoreBold();
    page_.MoveDown(HalfALine());
  }

  bool PrintRows(const ReportTable& table, const TableLayout& layout) {
    page_.SetBold(true);
    layout.PrintRow(page_, Headings(table));
    page_.RestoreBold();
    if (!Fits(layout)) return false;
    for (const auto& row : table.rows) {
      layout.PrintRow(page_, row);
      if (!Fits(layout)) return false;
    }
    return true;
  }

  /// Looked at after each row.
  bool Fits(const TableLayout& layout) {
    if (page_.Y() <= job_.Foot(layout.Pitch())) return true;
    job_.RefuseForOnePage();
    return false;
  }

  [[nodiscard]] double HalfALine() const { return page_.TextHeight() / 2; }

  const Session& session_;
  PrintJob& job_;
  Page& page_;
  const std::vector<ReportTable>& tables_;
  std::vector<TableLayout> layouts_;
};

}  // namespace

void PrintReport(const Context& context, const PrintOptions& options,
                 const std::vector<ReportTable>& tables) {
  PrintJob::Run(context, options, [&](PrintJob& job) { Report(context, job, tables).Print(); });
}

}  // namespace marlowbeck
