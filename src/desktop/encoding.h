#pragma once

#include <string>
#include <string_view>

#include <QDate>
#include <QString>

#include "data/date.h"

namespace marlowbeck {

// Between the program's texts, code page 1252 with "\r" for a line break, and the toolkit's.

[[nodiscard]] QString ToQt(std::string_view text);
[[nodiscard]] std::string FromQt(const QString& text);
/// The same with escapes for what the code page has no place for: what names on show stand for.
[[nodiscard]] std::string NameFromQt(const QString& text);

/// A caption for a widget that reads "&" as the mark of a mnemonic: one that marks none is doubled.
[[nodiscard]] QString ToMnemonicText(std::string_view caption);
/// The caption that such a text was made from.
[[nodiscard]] std::string FromMnemonicText(const QString& text);
/// A caption as it is read aloud: without marks and the colon at its end.
[[nodiscard]] QString Spoken(std::string_view caption);

/// The nearest date that can be shown, for one outside the years 100 to 9999.
[[nodiscard]] QDate ToQt(Date date);
[[nodiscard]] Date FromQt(QDate date);

}  // namespace marlowbeck
