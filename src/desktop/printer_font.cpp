#include "desktop/printer_font.h"

#include <algorithm>

#include <QStringList>

#include "desktop/encoding.h"

namespace marlowbeck {
namespace {

constexpr int kTwipsPerPoint = 20;

QFont Drawn(const PrinterFont& font) {
  QStringList families = {"Liberation Sans", "Arial"};
  if (!HasStandIn(font.name)) families.prepend(ToQt(font.name));
  QFont drawn;
  drawn.setFamilies(families);
  drawn.setBold(font.bold);
  drawn.setItalic(font.italic);
  drawn.setUnderline(font.underline);
  return drawn;
}

}  // namespace

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
