#pragma once

#include <functional>
#include <string_view>

#include "print/page.h"

namespace marlowbeck {

/// What is chosen on a print panel.
struct PrintOptions {
  double centimetres = 1;  ///< from the top of the page
  double copies = 1;       ///< rounded half to even
};

/// One printout on its way: what every one of them asks, refuses and does before and between its
/// copies. Only what Finish is called for comes out of the printer.
class PrintJob {
 public:
  /// Runs `work` with a new job. A failure of any kind in it throws the document away and says so.
  static void Run(const Context& context, const PrintOptions& options,
                  const std::function<void(PrintJob& job)>& work);

  /// Reads the season's title, prepares the printer and, where printing is to start further down
  /// than one centimetre, asks whether the heading is wanted. Answers false when it is all called
  /// off, and the document is thrown away then.
  [[nodiscard]] bool Begin();

  [[nodiscard]] Page& OnPage() { return page_; }
  /// Where the first line stands, in twips.
  [[nodiscard]] double Top() const { return options_.centimetres * kTwipsPerCentimetre; }
  /// The association's name and the season's title are wanted.
  [[nodiscard]] bool WithHeading() const { return with_heading_; }

  /// What becomes of a table that leaves just as much beside it as has to stay free.
  enum class Exactly { Fits, IsTooWide };
  /// Whether a table of this width has room on the page. Where it has not, that is told and the
  /// document thrown away.
  [[nodiscard]] bool FitsAcross(double table_width, Exactly exactly = Exactly::Fits);
  /// How far down the last row of a page may reach.
  [[nodiscard]] double Foot(double pitch) const { return page_.Height() - (pitch + 400); }
  /// Refuses what has no room on one page, in the words of all reports.
  void RefuseForOnePage();
  /// Throws the document away and warns.
  void Refuse(std::string_view message);

  /// Where the page is turned once a copy is there.
  enum class PageTurns { AfterEachCopy, BetweenCopies };

  /// Composes each copy on a page of its own, which begins with the printer prepared anew, and
  /// sends the document once all are there. `compose` answers false when it has given up.
  void PrintCopies(const std::function<bool()>& compose,
                   PageTurns turns = PageTurns::AfterEachCopy);

 private:
  PrintJob(const Context& context, const PrintOptions& options)
      : context_(context), options_(options), page_(context) {}

  [[nodiscard]] bool AskHeading();

  const Context& context_;
  PrintOptions options_;
  Page page_;
  bool with_heading_ = true;
};

}  // namespace marlowbeck
