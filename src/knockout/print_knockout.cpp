#include "knockout/print_knockout.h"

#include "data/integer.h"
#include "data/text.h"
#include "print/table_layout.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

constexpr double kFirstLine = 400;     // twips from the top
constexpr double kFootMargin = 400;    // twips
constexpr double kLeastBesides = 300;  // twips of the width that no table takes
constexpr double kRowFactor = 1.15;    // of a line's height

/// A knock-out on its way to paper.
class DrawPrint {
 public:
  DrawPrint(const Context& context, const KnockOutPrint& print)
      : context_(context), printer_(context.platform.printer), print_(print), page_(context) {}

  bool Print(double copies) {
    page_.SetFont();
    Measure();
    if (layout_.Width() > page_.Width() - kLeastBesides) {
      Warning(context_, "Font is too large, please re-select.", Beep::First);
      printer_.KillDoc();
      return false;
    }
    const int count = Integer::Narrow(copies);
    for (int copy = 1; copy <= count; ++copy) {
      if (!PrintCopy()) return false;
    }
    printer_.EndDoc();
    return true;
  }

 private:
  void Measure() {
    // KEPT: the words of a bye take no part in the measuring, so that in a table of short names
    // they stand across the rule; a repair would measure them too.
    std::vector<std::string> names = {print_.heads[1]};
    std::vector<std::string> grades = {print_.heads[2]};
    for (const Entrant& entrant : print_.entrants) {
      names.push_back(entrant.name);
      grades.push_back(entrant.grade);
    }
    const double digit = page_.WidthOf("8");
    const double room = kRoomFactor * page_.WidthOf("88");
    std::vector<ColumnLayout> columns = {
        {kRoomFactor * page_.WidthOf("8888"), Stand::FromRight, digit},
        {page_.WidestOf(names) + room, Stand::FromLeft, room / 2}};
    if (print_.with_grades) {
      columns.push_back({page_.WidestOf(grades) + room, Stand::FromLeft, room / 2});
    }
    layout_ = {columns, kRowFactor * page_.TextHeight()};
    heads_layout_ = layout_.AllCentred();
  }

  bool PrintCopy() {
    page_.SetFont();
    page_.MoveTo(kFirstLine);
    PrintHeading();
    PrintHeads();
    int number = 0;
    for (const Entrant& entrant : print_.entrants) {
      if (!PrintPlace(++number, entrant)) return false;
    }
    if (print_.with_bye && !PrintPlace(++number, {kByeWords, ""})) return false;
    page_.NewPage();
    return true;
  }

  void PrintHeading() {
    page_.SetBold(true);
    for (const std::string& line : print_.heading) page_.PrintCentred(Trim(line));
    page_.RestoreBold();
    page_.MoveDown(page_.TextHeight() / 2);
  }

  void PrintHeads() {
    page_.SetBold(true);
    heads_layout_.PrintRow(page_, {print_.heads.begin(), print_.heads.end()});
    page_.RestoreBold();
  }

  bool PrintPlace(int number, const Entrant& entrant) {
    const bool has_room = page_.Y() + layout_.Pitch() <= page_.Height() - kFootMargin;
    if (!has_room && !TurnPage(number - 1)) return false;
    layout_.PrintRow(page_, {std::to_string(number), entrant.name, entrant.grade});
    return true;
  }

  /// Goes on at the top of another page, when that is wanted.
  bool TurnPage(int printed) {
    if (!may_turn_ && !AskForPage(printed)) {
      printer_.KillDoc();
      return false;
    }
    may_turn_ = true;
    page_.NewPage();
    page_.MoveTo(kFirstLine);
    PrintHeads();
    return true;
  }

  [[nodiscard]] bool AskForPage(int printed) const {
    const std::string words = "Only " + std::to_string(printed) + " players of " +
                              std::to_string(print_.entrants.size()) + " will fit on one page.";
    const int answer = WarningYesNo(context_,
                                    Lines({words, "Do you wish to use another page ?", "",
                                           "By selecting NO, printing will be cancelled,",
                                           "allowing you to select a smaller font."}),
                                    Beep::First);
    return answer != kAnswerNo;
  }

  const Context& context_;
  Printer& printer_;
  const KnockOutPrint& print_;
  Page page_;
  TableLayout layout_{{}, 0};
  TableLayout heads_layout_{{}, 0};
  bool may_turn_ = false;
};

}  // namespace

bool PrintKnockOut(const Context& context, double copies, const KnockOutPrint& print) {
  try {
    return DrawPrint(context, print).Print(copies);
  } catch (const RunTimeError&) {
    context.platform.printer.KillDoc();
    throw;
  }
}

}  // namespace marlowbeck
