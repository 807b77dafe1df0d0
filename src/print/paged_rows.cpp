#include "print/paged_rows.h"

#include "data/text.h"
#include "session/messages.h"

namespace marlowbeck {
namespace {

void PrintHeading(Page& page, const PagedRows& rows) {
  if (rows.bold_heading) page.SetBold(true);
  rows.layout.PrintRow(page, rows.headings);
  if (rows.bold_heading) page.RestoreBold();
}

bool IsFull(PrintJob& job, const PagedRows& rows) {
  const double y = job.OnPage().Y();
  const double foot = job.Foot(rows.layout.Pitch());
  return rows.full == PagedRows::Full::AtTheFoot ? y >= foot : y > foot;
}

bool AnotherPageIsWanted(const Context& context, std::size_t done, std::size_t of) {
  return WarningYesNo(context, Lines({"Only " + std::to_string(done) + " players of " +
                                          std::to_string(of) + " will fit on one page.   ",
                                      "Do you wish to use another page ?    ", "",
                                      "By selecting NO, printing will be cancelled,    ",
                                      "allowing you to select a smaller font.    "})) != kAnswerNo;
}

void BeginAnotherPage(Page& page, const PagedRows& rows) {
  page.NewPage();
  page.MoveTo(rows.first_line);
  if (rows.heading_on == PagedRows::Heading::EveryPage) PrintHeading(page, rows);
}

}  // namespace

bool PrintPagedRows(const Context& context, PrintJob& job, const PagedRows& rows) {
  Page& page = job.OnPage();
  const std::size_t count = rows.rows.size();
  bool ask = true;
  PrintHeading(page, rows);
  for (std::size_t done = 1; done <= count; ++done) {
    rows.layout.PrintRow(page, rows.rows[done - 1]);
    if (done == count || !IsFull(job, rows)) continue;
    if (ask && !AnotherPageIsWanted(context, done, count)) {
      context.platform.printer.KillDoc();
      return false;
    }
    ask = rows.ask == PagedRows::Ask::AtEveryFoot;
    BeginAnotherPage(page, rows);
  }
  return true;
}

}  // namespace marlowbeck
