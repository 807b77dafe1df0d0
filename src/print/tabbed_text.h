#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace marlowbeck {

/// A text for spreadsheets: lines ended by CR LF, the cells of a row parted by tabs.
class TabbedText {
 public:
  /// Whether a row ends with a tab behind its last cell, which a spreadsheet shows as an empty one.
  enum class LastTab { No, Yes };

  TabbedText& Line(std::string_view line);
  TabbedText& Row(const std::vector<std::string>& cells, LastTab last_tab);

  [[nodiscard]] const std::string& Text() const { return text_; }

 private:
  std::string text_;
};

}  // namespace marlowbeck
