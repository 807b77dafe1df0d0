#include "season/print_ratios.h"

#include "data/text.h"
#include "print/table_layout.h"
#include "session/messages.h"

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
        layout_(Measured()) {}

  void Print() {
    if (!job_.FitsAcross(layout_.Width())) return;
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
    layout_.PrintRow(page_, {"Num", "Player", "Team", "Legs", "Pegs", "Ratio"});
    for (std::size_t row = 0; row < rows_.size(); ++row) {
      const auto cells = RatioCells(static_cast<int>(row) + 1, rows_[row]);
      layout_.PrintRow(page_, {cells.begin(), cells.end()});
      const bool at_foot = page_.Y() >= job_.Foot(layout_.Pitch());
      if (at_foot && row + 1 < rows_.size() && !GoOn(row + 1)) return false;
    }
    return true;
  }

  /// Asks for another page, and goes to it.
  bool GoOn(std::size_t done) {
    const int answer = WarningYesNo(
        context_, Lines({"Only " + std::to_string(done) + " players of " +
                             std::to_string(rows_.size()) + " will fit on one page.   ",
                         "Do you wish to use another page ?    ", "",
                         "By selecting NO, printing will be cancelled,    ",
                         "allowing you to select a smaller font.    "}));
    if (answer == kAnswerNo) {
      context_.platform.printer.KillDoc();
      return false;
    }
    page_.NewPage();
    page_.MoveTo(kFirstLine);
    return true;
  }

  const Context& context_;
  PrintJob& job_;
  Page& page_;
  const std::vector<std::string>& heading_;
  const std::vector<RatioRow>& rows_;
  TableLayout layout_;
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
