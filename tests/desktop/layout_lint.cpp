#include "tests/desktop/layout_lint.h"

#include <QAbstractItemView>
#include <QAbstractSpinBox>
#include <QCheckBox>
#include <QComboBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollBar>
#include <QStyleOptionComboBox>

namespace marlowbeck {
namespace {

/// Without the marks of mnemonics, and without blanks that only fill a field up.
QString Words(QString text) {
  text.replace("&&", "\x01").remove('&').replace('\x01', '&');
  while (text.endsWith(' ')) text.chop(1);
  return text;
}

QSize SizeOf(const QWidget& widget, const QString& text) {
  return widget.fontMetrics().size(Qt::TextShowMnemonic, Words(text));
}

int WidthOf(const QWidget& widget, const QString& text) { return SizeOf(widget, text).width(); }

bool IsCut(const QLabel& label) {
  const QRect room = label.contentsRect();
  if (!label.wordWrap()) {
    const QSize words = SizeOf(label, label.text());
    return words.width() > room.width() || words.height() > room.height();
  }
  const QRect words = label.fontMetrics().boundingRect(QRect(0, 0, room.width(), 10000),
                                                       Qt::TextWordWrap, Words(label.text()));
  return words.height() > room.height() || words.width() > room.width();
}

bool IsCut(const QComboBox& combo) {
  if (combo.isEditable()) return false;  // its text moves under the cursor
  QStyleOptionComboBox option;
  option.initFrom(&combo);
  const QRect room = combo.style()->subControlRect(QStyle::CC_ComboBox, &option,
                                                   QStyle::SC_ComboBoxEditField, &combo);
  return WidthOf(combo, combo.currentText()) > room.width();
}

bool IsCut(const QAbstractButton& button) {
  const bool has_mark = qobject_cast<const QCheckBox*>(&button) != nullptr ||
                        qobject_cast<const QRadioButton*>(&button) != nullptr;
  if (has_mark) return button.width() < button.sizeHint().width();
  return qobject_cast<const QPushButton*>(&button) != nullptr &&
         WidthOf(button, button.text()) + 8 > button.width();
}

bool WordsAreCut(const QWidget& widget) {
  if (const auto* label = qobject_cast<const QLabel*>(&widget)) return IsCut(*label);
  if (const auto* combo = qobject_cast<const QComboBox*>(&widget)) return IsCut(*combo);
  if (const auto* button = qobject_cast<const QAbstractButton*>(&widget)) return IsCut(*button);
  if (const auto* group = qobject_cast<const QGroupBox*>(&widget)) {
    return WidthOf(*group, group->title()) > group->width();
  }
  return false;
}

bool ScrollsSideways(const QWidget& widget) {
  const auto* const view = qobject_cast<const QAbstractItemView*>(&widget);
  return view != nullptr && view->horizontalScrollBar()->maximum() > 0;
}

/// What a person works: the widgets of controls, without the parts that these are made of.
bool IsWorked(const QWidget& widget) {
  const bool of_a_kind = qobject_cast<const QAbstractButton*>(&widget) != nullptr ||
                         qobject_cast<const QLineEdit*>(&widget) != nullptr ||
                         qobject_cast<const QComboBox*>(&widget) != nullptr ||
                         qobject_cast<const QAbstractSpinBox*>(&widget) != nullptr ||
                         qobject_cast<const QAbstractItemView*>(&widget) != nullptr;
  return of_a_kind && !widget.objectName().isEmpty() && !widget.objectName().startsWith("qt_");
}

/// Whether the pointer finds the widget at a place in it.
bool IsFoundAt(const QWidget& widget, QPoint place) {
  const QWidget* const hit = widget.window()->childAt(widget.mapTo(widget.window(), place));
  return hit != nullptr && (hit == &widget || widget.isAncestorOf(hit));
}

bool IsOutOfReach(const QWidget& widget) {
  constexpr int kInset = 3;  // rounded corners
  const QRect inner = widget.rect().adjusted(kInset, kInset, -kInset, -kInset);
  for (const QPoint place : {inner.topLeft(), inner.topRight(), inner.center(), inner.bottomLeft(),
                             inner.bottomRight()}) {
    if (!IsFoundAt(widget, place)) return true;
  }
  return false;
}

bool IsBeyondTheWindow(const QWidget& widget) {
  const QRect place(widget.mapTo(widget.window(), QPoint()), widget.size());
  return !widget.window()->rect().contains(place);
}

}  // namespace

QStringList LayoutFaults(const QWidget& window) {
  QStringList faults;
  for (const QWidget* widget : window.findChildren<QWidget*>()) {
    if (!widget->isVisible() || widget->objectName().isEmpty()) continue;
    const QString name = window.objectName() + "." + widget->objectName();
    if (WordsAreCut(*widget)) faults.append(name + " cuts its words");
    if (ScrollsSideways(*widget)) faults.append(name + " scrolls sideways");
    if (!IsWorked(*widget)) continue;
    if (IsBeyondTheWindow(*widget)) faults.append(name + " does not lie within the window");
    if (widget->isEnabled() && IsOutOfReach(*widget)) faults.append(name + " is covered");
  }
  return faults;
}

QStringList SizeFaults(const QWidget& window, QSize room) {
  if (window.width() <= room.width() && window.height() <= room.height()) return {};
  return {QString("%1 will not be made smaller than %2 x %3")
              .arg(window.objectName())
              .arg(window.width())
              .arg(window.height())};
}

}  // namespace marlowbeck
