#include "season/print_annual.h"

#include <algorithm>
#include <array>

#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr double kFirstLine = 400;  // twips from the top

/// How wide a column is, by a sample or by its own widest text, and where its texts stand.
struct Column {
  const char* sample;  ///< null for the widest text
  bool from_left = false;
};

constexpr std::array<Column, 11> kGameColumns = {{{"88/88/8888", true},
                                                  {nullptr, true},
                                                  {"888888"},
                                                  {"8888"},
                                                  {"888"},
                                                  {"888"},
                                                  {"8888"},
                                                  {nullptr},
                                                  {nullptr},
                                                  {nullptr},
                                                  {"888888"}}};
constexpr std::array<Column, 12> kTotalsColumns = {{{"88888"},
                                                    {"888888"},
                                                    {"88888"},
                                                    {"8888"},
                                                    {"8888"},
                                                    {"88888"},
                                                    {nullptr},
                                                    {nullptr},
                                                    {nullptr},
                                                    {"8888"},
                                                    {"88888"},
                                                    {"888888"}}};

using Rows = std::vector<std::vector<std::string>>;

/// A table without lines: columns that stand side by side with some room between them.
class Columns {
 public:
  template <std::size_t N>
  Columns(const Page& page, const std::array<Column, N>& columns, const Rows& rows) {
    for (std::size_t i = 0; i < N; ++i) {
      std::vector<std::string> texts;
      for (const auto& row : rows) texts.push_back(Trim(row.at(i)));
      if (columns[i].sample != nullptr) texts.emplace_back(columns[i].sample);
      widths_.push_back(page.WidestOf(texts) * kRoomFactor);
      from_left_.push_back(columns[i].from_left);
    }
  }

  [[nodiscard]] double Width() const {
    double width = 0;
    for (const double column : widths_) width += column;
    return width;
  }

  void PrintRow(Page& page, const std::vector<std::string>& cells) const {
    double left = page.Middle() - Width() / 2;
    for (std::size_t i = 0; i < widths_.size(); ++i) {
      const std::string text = Trim(cells.at(i));
      const double inset = from_left_[i] ? 0 : widths_[i] - page.WidthOf(text);
      if (!text.empty()) page.PrintAt(left + inset, page.Y(), text);
      left += widths_[i];
    }
    page.MoveDown(page.TextHeight() * kRoomFactor);
  }

 private:
  std::vector<double> widths_;
  std::vector<bool> from_left_;
};

/// One player's season on its way to paper.
class SeasonPrint {
 public:
  SeasonPrint(PrintJob& job, const AnnualPrint& season)
      : job_(job),
        page_(job.OnPage()),
        season_(season),
        games_(page_, kGameColumns, season.games),
        totals_(page_, kTotalsColumns, season.totals) {}

  void Print() {
    if (!job_.FitsAcross(std::max(games_.Width(), totals_.Width()))) return;
    job_.PrintCopies([this] { return Compose(); });
  }

 private:
  bool Compose() {
    page_.MoveTo(kFirstLine);
    page_.SetBold(true);
    page_.PrintCentred(season_.grade_line);
    page_.PrintCentred(season_.player_line);
    page_.RestoreBold();
    page_.MoveDown(page_.TextHeight());
    if (!PrintRows(games_, season_.games)) return false;
    page_.MoveDown(page_.TextHeight());
    page_.SetBold(true);
    page_.PrintCentred("SEASON TOTALS");
    page_.RestoreBold();
    return PrintRows(totals_, season_.totals);
  }

  /// The first of the rows is the heading.
  bool PrintRows(const Columns& columns, const Rows& rows) {
    page_.SetBold(true);
    for (const auto& row : rows) {
      columns.PrintRow(page_, row);
      page_.RestoreBold();
      if (page_.Y() <= job_.Foot(page_.TextHeight() * kRoomFactor)) continue;
      job_.RefuseForOnePage();
      return false;
    }
    return true;
  }

  PrintJob& job_;
  Page& page_;
  const AnnualPrint& season_;
  Columns games_;
  Columns totals_;
};

}  // namespace

void PrintAnnual(const Context& context, double copies, const AnnualPrint& season) {
  PrintOptions options;
  options.copies = copies;
  PrintJob::Run(context, options, [&](PrintJob& job) {
    if (job.Begin()) SeasonPrint(job, season).Print();
  });
}

}  // namespace marlowbeck
