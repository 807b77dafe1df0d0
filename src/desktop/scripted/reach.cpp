#include "desktop/scripted/reach.h"

#include <functional>

#include <QAbstractItemView>
#include <QCheckBox>
#include <QDateEdit>
#include <QScrollArea>
#include <QStyleOption>

#include "desktop/scripted/gestures.h"
#include "desktop/windows.h"

namespace marlowbeck {
namespace {

void ScrollIntoView(QWidget& widget) {
  for (QWidget* holder = widget.parentWidget(); holder != nullptr;
       holder = holder->parentWidget()) {
    if (auto* const area = qobject_cast<QScrollArea*>(holder)) area->ensureWidgetVisible(&widget);
  }
}

/// A box with a caption answers on those two only.
QRect AreaOfBox(const QAbstractButton& box) {
  QStyleOptionButton option;
  option.initFrom(&box);
  option.text = box.text();
  const auto area = qobject_cast<const QCheckBox*>(&box) != nullptr
                        ? QStyle::SE_CheckBoxClickRect
                        : QStyle::SE_RadioButtonClickRect;
  return box.style()->subElementRect(area, &option, &box);
}

/// Where a widget answers to a click as the control that it shows.
QRect AnsweringArea(const QWidget& widget) {
  const auto* const button = qobject_cast<const QAbstractButton*>(&widget);
  if (button != nullptr && button->isCheckable()) return AreaOfBox(*button);
  // The other half drops the calendar down.
  if (qobject_cast<const QDateEdit*>(&widget) != nullptr) {
    return {0, 0, widget.width() / 2, widget.height()};
  }
  return widget.rect();
}

/// The first point of an area at which the control lies on top and that `suits`.
std::optional<Place> FirstPlace(View& view, const ScreenWindow& window, const QRect& area,
                                const std::function<bool(const Place&)>& suits) {
  constexpr int kStep = 6;
  QWidget& widget = *view.Widget();
  QWidget& outer = *widget.window();
  const auto place_at = [&](QPoint at) -> std::optional<Place> {
    QWidget* const hit = outer.childAt(widget.mapTo(&outer, at));
    if (hit == nullptr || window.ViewAt(hit) != &view) return std::nullopt;
    const Place place{hit, hit->mapFrom(&outer, widget.mapTo(&outer, at))};
    return suits(place) ? std::optional(place) : std::nullopt;
  };
  if (auto centre = place_at(area.center())) return centre;
  for (int y = area.bottom() - kStep / 2; y >= area.top(); y -= kStep) {
    for (int x = area.left() + kStep / 2; x <= area.right(); x += kStep) {
      if (auto place = place_at({x, y})) return place;
    }
  }
  // A list that is full of lines still has an edge.
  return place_at(area.topLeft());
}

void BringIntoReach(View& view) {
  ScrollIntoView(*view.Widget());
  SettleEvents();
}

}  // namespace

std::optional<Place> PlaceOn(View& view, const ScreenWindow& window) {
  BringIntoReach(view);
  return FirstPlace(view, window, AnsweringArea(*view.Widget()), [](const Place&) { return true; });
}

std::optional<Place> PlaceBesideLines(View& view, const ScreenWindow& window) {
  const auto* const list = qobject_cast<QAbstractItemView*>(view.Widget());
  if (list == nullptr) return PlaceOn(view, window);
  BringIntoReach(view);
  return FirstPlace(view, window, list->rect(), [list](const Place& place) {
    return place.widget == list ||
           (place.widget == list->viewport() && !list->indexAt(place.at).isValid());
  });
}

QLineEdit* EntryOf(const View& view) {
  if (auto* const combo = qobject_cast<QComboBox*>(view.Widget())) return combo->lineEdit();
  auto* const box = qobject_cast<QLineEdit*>(view.Widget());
  return box == nullptr || box->isReadOnly() ? nullptr : box;
}

QPoint ArrowOf(const QComboBox& combo) {
  QStyleOptionComboBox option;
  option.initFrom(&combo);
  option.editable = combo.isEditable();
  return combo.style()
      ->subControlRect(QStyle::CC_ComboBox, &option, QStyle::SC_ComboBoxArrow, &combo)
      .center();
}

}  // namespace marlowbeck
