#include "season/print_ratios.h"

#include "data/text.h"
#include "print/paged_rows.h"

namespace marlowbeck {
namespace {

constexpr double kFirstLine = 400;      // twips from the top
constexpr double kBetweenLines = 0.25;  // of a line's height

/// A list on its way to paper.
class RatioPrint {
 public:
  RatioPrint(const Context& context, PrintJob& job, const std::vector<std::string>& heading,
             const std::vector<RatioRow>& rows)
      : context_(context),
        job_(job),
        page_(job.OnPage()),
        heading_(heading),
        rows_(rows),
        layout_(Measured()) {
    int number = 0;
    for (const RatioRow& row : rows) {
      const auto cells = RatioCells(++number, row);
      cells_.emplace_back(cells.begin(), cells.end());
    }
  }

  void Print() {
    if (!job_.FitsAcross(layout_.Width(), PrintJob::Exactly::IsTooWide)) return;
    job_.PrintCopies([this] { return Compose(); });
  }

 private:
  [[nodiscard]] TableLayout Measured() const {
    std::vector<std::string> names;
    std::vector<std::string> teams;
    for (const RatioRow& row : rows_) {
      names.push_back(row.name);
      teams.push_back(row.team);
    }
    const double room = kRoomFactor * page_.WidthOf("88");
    const double inset = page_.WidthOf("8");
    const double figures = kRoomFactor * page_.WidthOf("88888");
    return {{{kRoomFactor * page_.WidthOf("Num")},
             {page_.WidestOf(names) + room, Stand::FromLeft, inset},
             {page_.WidestOf(teams) + room, Stand::FromLeft, inset},
             {figures},
             {figures},
             {kRoomFactor * page_.WidthOf("8888888")}},
            kRoomFactor * page_.TextHeight()};
  }

  bool Compose() {
    page_.MoveTo(kFirstLine);
    for (const std::string& line : heading_) {
      if (Trimmed(line).empty()) continue;
      page_.PrintCentred(Trim(line));
      page_.MoveDown(kBetweenLines * page_.TextHeight());
    }
    PagedRows rows(layout_, headings_, cells_);
    rows.bold_heading = false;
    rows.full = PagedRows::Full::AtTheFoot;
    rows.first_line = kFirstLine;
    return PrintPagedRows(context_, job_, rows);
  }

  const Context& context_;
  PrintJob& job_;
  Page& page_;
  const std::vector<std::string>& heading_;
  const std::vector<RatioRow>& rows_;
  TableLayout layout_;
  const std::vector<std::string> headings_ = {"Num", "Player", "Team", "Legs", "Pegs", "Ratio"};
  std::vector<std::vector<std::string>> cells_;
};

}  // namespace

void PrintRatios(const Context& context, double copies, const std::vector<std::string>& heading,
                 const std::vector<RatioRow>& rows) {
  PrintOptions options;
  options.copies = copies;
  PrintJob::Run(context, options, [&](PrintJob& job) {
    if (job.Begin()) RatioPrint(context, job, heading, rows).Print();
  });
}

}  // namespace marlowbeck
