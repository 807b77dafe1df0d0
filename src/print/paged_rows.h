#pragma once

#include <string>
#include <vector>

#include "print/print_job.h"
#include "print/table_layout.h"

namespace marlowbeck {

/// Boxed rows below a heading row, on as many pages as they take, and how that is gone about. It
/// refers to what it is made of.
struct PagedRows {
  enum class Heading { FirstPage, EveryPage };
  enum class Ask { AtEveryFoot, OnceACopy };
  enum class Full { AtTheFoot, PastTheFoot };

  PagedRows(const TableLayout& with_layout, const std::vector<std::string>& with_headings,
            const std::vector<std::vector<std::string>>& with_rows)
      : layout(with_layout), headings(with_headings), rows(with_rows) {}

  const TableLayout& layout;
  const std::vector<std::string>& headings;
  const std::vector<std::vector<std::string>>& rows;

  Heading heading_on = Heading::FirstPage;
  bool bold_heading = true;  ///< also in a font that is not
  Ask ask = Ask::AtEveryFoot;
  Full full = Full::PastTheFoot;  ///< where a row has to end for its page to be full
  double first_line = 400;        ///< of further pages, in twips
};

/// Prints the rows from the page's present height on. Where a page is full and rows remain it is
/// asked whether another one may be used; answers false, and the document has been thrown away,
/// when it may not.
[[nodiscard]] bool PrintPagedRows(const Context& context, PrintJob& job, const PagedRows& rows);

}  // namespace marlowbeck
