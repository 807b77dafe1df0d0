#pragma once

#include "drive/script_answers.h"

namespace marlowbeck {

/// File, font and set-up dialogs answered by the script, whatever the face.
class ScriptDialogs : public Dialogs {
 public:
  ScriptDialogs(ScriptAnswers& answers, EventLog& log) : answers_(answers), log_(log) {}

  std::optional<std::string> File(const FileDialogRequest& request) override;
  std::optional<FontChoice> Font(const FontChoice& present) override;
  std::optional<Orientation> PrinterSetup(Orientation present) override;

 private:
  ScriptAnswers& answers_;
  EventLog& log_;
};

/// "Portrait" or "Landscape".
[[nodiscard]] const char* WordOf(Orientation orientation);

}  // namespace marlowbeck
