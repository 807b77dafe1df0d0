#include "desktop/theme.h"

#include <algorithm>
#include <array>
#include <chrono>

#include <QDateEdit>
#include <QPainter>
#include <QPalette>
#include <QProxyStyle>
#include <QStyleFactory>
#include <QStyleOption>
#include <QTimer>

#include "desktop/printer_font.h"

namespace marlowbeck {
namespace {

constexpr QRgb kGreen = 0xff1f5c3f;
constexpr QRgb kCream = 0xfffaf6ec;
constexpr QRgb kWhite = 0xffffffff;
constexpr QRgb kShade = 0xfff3efe3;
constexpr QRgb kInk = 0xff22261f;
constexpr QRgb kWire = 0xffc9c4b4;
constexpr QRgb kRed = 0xffb3261e;
constexpr QRgb kGrey = 0xff8a877c;
constexpr QRgb kButton = 0xfff1ecdd;

constexpr int kWorkPoints = 11;
constexpr int kHeadingPoints = 15;
constexpr int kHintPoints = 10;
constexpr int kFigurePoints = 14;
constexpr int kBigPoints = 20;
constexpr double kChartPoints = 8.25;

constexpr int kButtonHeight = 32;
constexpr int kButtonWidth = 96;
constexpr int kButtonMargin = 16;
constexpr int kMenuMargin = 8;
constexpr int kEntryHeight = 30;
constexpr int kLineHeight = 24;
constexpr int kLineAir = 6;
constexpr int kChartAir = 4;
constexpr int kCardTitleIndent = 24;
constexpr int kCardTitleAir = 8;  ///< above and below

constexpr std::chrono::milliseconds kIconDelay{200};

bool Plays(const QWidget* widget, const char* role) {
  return widget != nullptr && widget->property("role") == role;
}

bool IsCard(const QWidget* widget) { return Plays(widget, "card"); }

bool IsHeld(const QWidget* widget) { return widget != nullptr && widget->property(kHeld).toBool(); }

/// Fusion with our measures and our icons.
class Style : public QProxyStyle {
 public:
  Style() : QProxyStyle(QStyleFactory::create("Fusion")) {}

  QSize sizeFromContents(ContentsType type, const QStyleOption* option, const QSize& contents,
                         const QWidget* widget) const override {
    const QSize size = QProxyStyle::sizeFromContents(type, option, contents, widget);
    switch (type) {
      case CT_PushButton:
        return (size + QSize(kButtonMargin, 0)).expandedTo({kButtonWidth, kButtonHeight});
      case CT_MenuBarItem:
        return size + QSize(0, kMenuMargin);
      case CT_LineEdit:
      case CT_ComboBox:
      case CT_SpinBox:
        // A date asks for more than other entries of the same type.
        if (qobject_cast<const QDateEdit*>(widget) != nullptr) {
          return {size.width(), std::max(contents.height(), kEntryHeight)};
        }
        return size.expandedTo({0, kEntryHeight});
      case CT_ItemViewItem:
        if (Plays(widget, "fixed")) return size + QSize(0, kChartAir);
        // Some air tells a line that is broken in two from two lines.
        return (size + QSize(0, kLineAir)).expandedTo({0, kLineHeight});
      default:
        return size;
    }
  }

  void drawComplexControl(ComplexControl control, const QStyleOptionComplex* option,
                          QPainter* painter, const QWidget* widget) const override {
    if (control == CC_ComboBox && IsHeld(widget)) return DrawHeld(painter, *widget);
    const auto* const group = qstyleoption_cast<const QStyleOptionGroupBox*>(option);
    if (group == nullptr) {
      return QProxyStyle::drawComplexControl(control, option, painter, widget);
    }
    QStyleOptionGroupBox own = *group;
    if (IsCard(widget)) DrawCard(own, painter, widget);
    if (widget != nullptr && widget->isEnabled()) {
      const auto meaning = static_cast<Meaning>(widget->property(kMeaning).toInt());
      own.palette.setColor(QPalette::WindowText, ColorOf(meaning));
    }
    QProxyStyle::drawComplexControl(control, &own, painter, widget);
  }

  /// A panel that is clicked looks like what is clicked elsewhere.
  void drawControl(ControlElement element, const QStyleOption* option, QPainter* painter,
                   const QWidget* widget) const override {
    if (element != CE_ShapedFrame || !Plays(widget, "button")) {
      return QProxyStyle::drawControl(element, option, painter, widget);
    }
    QStyleOptionButton button;
    button.QStyleOption::operator=(*option);
    button.state |= State_Raised;
    drawPrimitive(PE_PanelButtonCommand, &button, painter, widget);
  }

  QIcon standardIcon(StandardPixmap icon, const QStyleOption* option,
                     const QWidget* widget) const override {
    switch (icon) {
      case SP_MessageBoxInformation:
        return IconNamed("box-information");
      case SP_MessageBoxWarning:
        return IconNamed("box-warning");
      case SP_MessageBoxCritical:
        return IconNamed("box-stop");
      case SP_MessageBoxQuestion:
        return IconNamed("box-question");
      case SP_ToolBarHorizontalExtensionButton:
        // Every menu bar asks for it and none is narrow enough to need it; looking for it in the
        // toolkit's pictures takes longer than making the whole bar.
        return {};
      default:
        return QProxyStyle::standardIcon(icon, option, widget);
    }
  }

  QRect subControlRect(ComplexControl control, const QStyleOptionComplex* option, SubControl part,
                       const QWidget* widget) const override {
    const QRect place = QProxyStyle::subControlRect(control, option, part, widget);
    if (control != CC_GroupBox || !IsCard(widget)) return place;
    if (part == SC_GroupBoxLabel) return place.translated(kCardTitleIndent, kCardTitleAir);
    return part == SC_GroupBoxContents ? place.adjusted(0, 2 * kCardTitleAir, 0, 0) : place;
  }

  int styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                QStyleHintReturn* data) const override {
    switch (hint) {
      case SH_DialogButtonBox_ButtonsHaveIcons:
      case SH_EtchDisabledText:
      case SH_MessageBox_CenterButtons:
        return 0;
      default:
        return QProxyStyle::styleHint(hint, option, widget, data);
    }
  }

 private:
  /// A combo that is held looks like a box that cannot be typed into: it has nothing to drop down.
  void DrawHeld(QPainter* painter, const QWidget& widget) const {
    QStyleOptionFrame frame;
    frame.initFrom(&widget);
    frame.lineWidth = 1;
    frame.state |= State_Sunken;
    frame.palette.setColor(QPalette::Base, frame.palette.color(QPalette::Window));
    drawPrimitive(PE_PanelLineEdit, &frame, painter, &widget);
  }

  /// A card is a panel that stands over others: filled, framed all round, its title in a line of
  /// its own.
  void DrawCard(QStyleOptionGroupBox& group, QPainter* painter, const QWidget* widget) const {
    const QRect title = subControlRect(CC_GroupBox, &group, SC_GroupBoxLabel, widget);
    const int rule = title.bottom() + kCardTitleAir;
    painter->fillRect(group.rect, QColor(kCream));
    painter->setPen(QColor(kWire));
    painter->drawLine(group.rect.left(), rule, group.rect.right(), rule);
    painter->setPen(QColor(kGreen));
    painter->drawRect(group.rect.adjusted(0, 0, -1, -1));
    group.subControls &= ~SC_GroupBoxFrame;
  }
};

QPalette OurPalette() {
  QPalette palette{QColor(kButton), QColor(kCream)};
  const std::array<std::pair<QPalette::ColorRole, QRgb>, 14> colors = {{
      {QPalette::Window, kCream},
      {QPalette::WindowText, kInk},
      {QPalette::Base, kWhite},
      {QPalette::AlternateBase, kShade},
      {QPalette::Text, kInk},
      {QPalette::PlaceholderText, kInk},
      {QPalette::Button, kButton},
      {QPalette::ButtonText, kInk},
      {QPalette::Highlight, kGreen},
      {QPalette::HighlightedText, kWhite},
      {QPalette::ToolTipBase, kWhite},
      {QPalette::ToolTipText, kInk},
      {QPalette::Link, kGreen},
      {QPalette::BrightText, kRed},
  }};
  for (const auto& [role, color] : colors) palette.setColor(role, QColor(color));
  for (const auto role : {QPalette::WindowText, QPalette::Text, QPalette::ButtonText,
                          QPalette::PlaceholderText, QPalette::HighlightedText}) {
    palette.setColor(QPalette::Disabled, role, QColor(kGrey));
  }
  palette.setColor(QPalette::Disabled, QPalette::Base, QColor(kCream));
  palette.setColor(QPalette::Disabled, QPalette::Highlight, QColor(kWire));
  return palette;
}

QFont WorkFont() {
  QFont font = QApplication::font();
  font.setFamilies({"Liberation Sans", "Segoe UI", "Arial", font.family()});
  font.setPointSize(kWorkPoints);
  return font;
}

struct Role {
  const char* name;
  int points;
  bool bold;
};

constexpr std::array<Role, 4> kRoles = {{{"heading", kHeadingPoints, true},
                                         {"hint", kHintPoints, false},
                                         {"figure", kFigurePoints, false},
                                         {"big", kBigPoints, true}}};

void Dress(QWidget& widget, const Role& role) {
  QFont font = widget.font();
  font.setPointSize(role.points);
  font.setBold(role.bold);
  widget.setFont(font);
  if (!role.bold) return;
  QPalette palette = widget.palette();
  for (const auto group : {QPalette::Active, QPalette::Inactive}) {
    palette.setColor(group, QPalette::WindowText, QColor(kGreen));
  }
  widget.setPalette(palette);
}

QFont ChartFont() {
  QFont font;
  font.setFamilies(FixedPitchFamilies());
  font.setPointSizeF(kChartPoints);
  return font;
}

/// What comes and goes leaves its place empty, so that nothing else moves.
void KeepRoom(QWidget& widget) {
  QSizePolicy policy = widget.sizePolicy();
  policy.setRetainSizeWhenHidden(true);
  widget.setSizePolicy(policy);
}

}  // namespace

void ApplyTheme() {
  QApplication::setStyle(new Style);  // taken over by the application
  QApplication::setPalette(OurPalette());
  QApplication::setFont(WorkFont());
  QApplication::setEffectEnabled(Qt::UI_AnimateCombo, false);
  QApplication::setQuitOnLastWindowClosed(false);
  // Drawn in many sizes, which the first window has not to wait for.
  QTimer::singleShot(kIconDelay, qApp, [] { QApplication::setWindowIcon(IconNamed("app")); });
}

void ApplyRoles(QWidget& window) {
  for (QWidget* widget : window.findChildren<QWidget*>()) {
    if (widget->property("keepsRoom").toBool()) KeepRoom(*widget);
    const QVariant value = widget->property("role");
    if (!value.isValid()) continue;
    for (const Role& role : kRoles) {
      if (value.toString() == role.name) Dress(*widget, role);
    }
    if (value.toString() == "fixed") widget->setFont(ChartFont());
  }
}

QColor ColorOf(Meaning meaning) {
  switch (meaning) {
    case Meaning::Red:
      return QColor(kRed);
    case Meaning::Green:
      return QColor(kGreen);
    default:
      return QColor(kInk);
  }
}

Meaning MeaningOf(const QColor& color) {
  if (color == QColor(kRed)) return Meaning::Red;
  if (color == QColor(kGreen)) return Meaning::Green;
  return Meaning::Black;
}

QIcon IconNamed(const QString& name) { return QIcon(":/icons/" + name + ".svg"); }

}  // namespace marlowbeck
