#include "desktop/printer_font.h"

#include <algorithm>

#include <QFontDatabase>

#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

/// What stands behind a font is of its kind: columns of characters stay columns.
QStringList FamiliesFor(const PrinterFont& font) {
  const QString name = ToQt(font.name);
  if (name.startsWith("courier", Qt::CaseInsensitive)) return FixedPitchFamilies();
  QStringList families = {"Liberation Sans", "Arial"};
  if (!HasStandIn(font.name)) families.prepend(name);
  return families;
}

QFont Drawn(const PrinterFont& font) {
  QFont drawn;
  drawn.setFamilies(FamiliesFor(font));
  drawn.setBold(font.bold);
  drawn.setItalic(font.italic);
  drawn.setUnderline(font.underline);
  return drawn;
}

}  // namespace

QStringList FixedPitchFamilies() {
  return {"Courier New", "Liberation Mono", "DejaVu Sans Mono", "Consolas",
          QFontDatabase::systemFont(QFontDatabase::FixedFont).family()};
}

bool HasStandIn(const std::string& name) { return name == "MS Sans Serif"; }

QFont FontInTwips(const PrinterFont& font) {
  QFont drawn = Drawn(font);
  drawn.setPixelSize(std::max(font.size, 1) * kTwipsPerPoint);
  drawn.setHintingPreference(QFont::PreferNoHinting);
  return drawn;
}

QFont FontOnScreen(const PrinterFont& font) {
  QFont drawn = Drawn(font);
  drawn.setPointSize(std::max(font.size, 1));
  return drawn;
}

}  // namespace marlowbeck
