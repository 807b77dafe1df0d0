#include "desktop/encoding.h"

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {

QString ToQt(std::string_view text) {
  QString result = QString::fromStdString(ShownText(text));
  return result.replace('\r', '\n');
}

std::string FromQt(const QString& text) {
  QString copy = text;
  return Cp1252FromUtf8(copy.replace('\n', '\r').toStdString());
}

std::string NameFromQt(const QString& text) {
  QString copy = text;
  return TextOfName(copy.replace('\n', '\r').toStdString());
}

QString ToMnemonicText(std::string_view caption) {
  QString text = ToQt(caption);
  for (qsizetype i = text.indexOf('&'); i >= 0; i = text.indexOf('&', i + 2)) {
    if (i + 1 == text.size() || text[i + 1] == ' ') text.insert(i, '&');
  }
  return text;
}

std::string FromMnemonicText(const QString& text) {
  QString caption = text;
  for (qsizetype i = caption.indexOf("&&"); i >= 0; i = caption.indexOf("&&", i + 1)) {
    if (i + 2 == caption.size() || caption[i + 2] == ' ') caption.remove(i, 1);
  }
  return FromQt(caption);
}

QString Spoken(std::string_view caption) {
  QString text = ToMnemonicText(caption);
  text.replace("&&", "\x01").remove('&').replace('\x01', '&');
  text = text.simplified();
  if (text.endsWith(':')) text.chop(1);
  return text;
}

QDate ToQt(Date date) {
  static const QDate kFirst(100, 1, 1);
  static const QDate kLast(9999, 12, 31);
  try {
    const CivilDate civil = CivilFromDate(date);
    return {civil.year, civil.month, civil.day};
  } catch (const RunTimeError&) {
    return date.days > 0 ? kLast : kFirst;
  }
}

Date FromQt(QDate date) {
  return DateFromCivil({date.year(), date.month(), date.day()}).value_or(Date{});
}

}  // namespace marlowbeck
