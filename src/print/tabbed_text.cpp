#include "print/tabbed_text.h"

namespace marlowbeck {

TabbedText& TabbedText::Line(std::string_view line) {
  text_.append(line).append("\r\n");
  return *this;
}

TabbedText& TabbedText::Row(const std::vector<std::string>& cells, LastTab last_tab) {
  for (std::size_t i = 0; i < cells.size(); ++i) {
    text_ += cells[i];
    if (i + 1 < cells.size() || last_tab == LastTab::Yes) text_ += '\t';
  }
  return Line({});
}

}  // namespace marlowbeck
