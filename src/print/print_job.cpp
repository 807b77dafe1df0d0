#include "print/print_job.h"

#include "data/integer.h"
#include "data/numbers.h"
#include "data/runtime_error.h"
#include "data/text.h"
#include "session/messages.h"
#include "session/season.h"

namespace marlowbeck {
namespace {

constexpr double kLeastBesides = 300;  // twips of the width that no table takes

}  // namespace

void PrintJob::Run(const Context& context, const PrintOptions& options,
                   const std::function<void(PrintJob& job)>& work) {
  PrintJob job(context, options);
  try {
    work(job);
  } catch (const RunTimeError&) {
    context.channels.AbandonAll();
    job.Refuse("An unrecognised error occurred while trying to print.    ");
  }
}

bool PrintJob::Begin() {
  GetSeason(context_);
  page_.SetFont();
  if (Top() <= kTwipsPerCentimetre) return true;
  if (AskHeading()) return true;
  context_.platform.printer.KillDoc();
  return false;
}

bool PrintJob::AskHeading() {
  const std::string centimetres = NumberText(Top() / kTwipsPerCentimetre);
  const int answer = WarningYesNoCancel(
      context_,
      Lines({"Printing will start " + centimetres + " centimetres from the top of the page.    ",
             "", "Do you want to print the Association name and season description ?    ", "",
             "Selecting NO, will only print Grade and Date.    ",
             "Selecting CANCEL, will cancel printing.    "}));
  with_heading_ = answer != kAnswerNo;
  return answer != kAnswerCancel;
}

bool PrintJob::FitsAcross(double table_width, Exactly exactly) {
  const double room = page_.Width() - kLeastBesides;
  if (table_width < room || (table_width == room && exactly == Exactly::Fits)) return true;
  Warning(context_, "Font is too large, please re-select.    ");
  context_.platform.printer.KillDoc();
  return false;
}

void PrintJob::RefuseForOnePage() {
  Refuse(Lines(
      {"Your selections will not fit on one page.   ", "Printing will now be cancelled.    ",
       "<<WARNING>> This may take some time    ", "depending on printer status.    ", "",
       "Note: Choose a smaller font to fit more   ", "onto a page or limit your selections.    "}));
}

void PrintJob::Refuse(std::string_view message) {
  context_.platform.printer.KillDoc();
  Warning(context_, message);
}

void PrintJob::PrintCopies(const std::function<bool()>& compose, PageTurns turns) {
  const int copies = Integer::Narrow(options_.copies);
  for (int copy = 1; copy <= copies; ++copy) {
    page_.SetFont();
    if (!compose()) return;
    if (copy < copies || turns == PageTurns::AfterEachCopy) page_.NewPage();
  }
  context_.platform.printer.EndDoc();
}

}  // namespace marlowbeck
