#pragma once

#include <string>
#include <string_view>

#include "data/date.h"
#include "data/runtime_error.h"

namespace marlowbeck {

/// Builds the text of a side file, a logical record to a line ended by CR LF.
class SideFileWriter {
 public:
  // The quoted form: items of a line separated by commas.
  SideFileWriter& Text(std::string_view text);  ///< "text", quotes within as they are
  SideFileWriter& Number(double number);
  SideFileWriter& Day(Date date);     ///< #2004-03-31#
  SideFileWriter& Truth(bool truth);  ///< #TRUE# or #FALSE#
  SideFileWriter& Nothing();          ///< an empty item
  SideFileWriter& EndLine();

  /// The plain form: one item on a line of its own, no quotes.
  SideFileWriter& PlainLine(std::string_view text);

  [[nodiscard]] const std::string& Content() const { return content_; }

 private:
  void Item(std::string_view written);

  std::string content_;
  bool line_begun_ = false;
};

/// Reads the items of a side file in either form: an item ends at a comma or a line end unless it
/// lies in double quotes. A quote within a text is part of it unless an item could end there.
/// Reading on past the last item throws InputPastEnd; an item that does not
/// hold what is asked for throws TypeMismatch.
class SideFileReader {
 public:
  explicit SideFileReader(std::string content) : content_(std::move(content)) {}

  [[nodiscard]] bool AtEnd() const;
  [[nodiscard]] std::string Text();
  /// As Text, but that a quoted text ends at the first quote there is.
  [[nodiscard]] std::string TextToFirstQuote();
  /// As Text, but that a quoted text ends at the last quote of its line, whatever it holds: for a
  /// line that has no other text.
  [[nodiscard]] std::string TextToLastQuote();
  [[nodiscard]] double Number();
  [[nodiscard]] Date Day();
  [[nodiscard]] bool Truth();

 private:
  enum class Quotes { WholeText, ToFirst, ToLast };
  std::string Item(Quotes quotes = Quotes::WholeText);
  [[nodiscard]] std::size_t ClosingQuote(Quotes quotes) const;
  void PassSeparator();

  std::string content_;
  std::size_t place_ = 0;
};

/// What was read is itself at fault: the file is missing, is cut short or holds something of
/// another type. A disk that fails for a moment is no reason to give up what is on it.
[[nodiscard]] bool SideFileIsAtFault(const RunTimeError& error);

}  // namespace marlowbeck
