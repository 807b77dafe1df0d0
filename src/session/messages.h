#pragma once

#include <string_view>

#include "ui/context.h"

namespace marlowbeck {

// All that the program says goes through these. Each leaves its text in MessageText and its answer,
// the number of the button, in MessageAnswer, and answers it too.

enum class Beep { No, First };

int Warning(const Context& context, std::string_view text, Beep beep = Beep::No);
int GoodMessage(const Context& context, std::string_view text);
int WarningYesNo(const Context& context, std::string_view text, Beep beep = Beep::No);
int WarningYesNoCancel(const Context& context, std::string_view text);
/// OK or Cancel to something that deletes.
int Confirm(const Context& context, std::string_view text);
/// Yes or No to something that deletes.
int DangerYN(const Context& context, std::string_view text);
/// The error box: the words for ErrorNumber, upper-cased.
void GetMessage(const Context& context);

/// Makes the confirmation sound ready; once, at the start.
void SetWave(const Context& context);
/// Plays the confirmation after a save and waits for its end. Never fails.
void OKSound(const Context& context);

}  // namespace marlowbeck
