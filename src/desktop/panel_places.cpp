#include "desktop/panel_places.h"

#include <algorithm>

#include <QBoxLayout>
#include <QGridLayout>
#include <QGroupBox>

namespace marlowbeck {
namespace {

constexpr const char* kAside = "aside";

/// A frame without words is no panel itself: what stands in it counts.
bool CanBeWorked(const QWidget* panel) {
  if (panel == nullptr || panel->isHidden() || !panel->isEnabled()) return false;
  if (qobject_cast<const QGroupBox*>(panel) != nullptr) return true;
  const auto within = panel->findChildren<QGroupBox*>(Qt::FindDirectChildrenOnly);
  return std::any_of(within.begin(), within.end(), CanBeWorked);
}

bool HasLivePanel(const QLayout& column, const QWidget& besides) {
  for (int i = 0; i < column.count(); ++i) {
    const QWidget* const panel = column.itemAt(i)->widget();
    if (panel != &besides && CanBeWorked(panel)) return true;
  }
  return false;
}

/// Whether a panel over the whole grid would cover what can be worked.
bool WouldCover(const QGridLayout& grid, const QWidget& panel) {
  for (int i = 0; i < grid.count(); ++i) {
    const QLayout* const column = grid.itemAt(i)->layout();
    if (column != nullptr && HasLivePanel(*column, panel)) return true;
  }
  return false;
}

QGridLayout* GridAround(const QWidget& window, const QLayout& column) {
  for (QGridLayout* const grid : window.findChildren<QGridLayout*>()) {
    for (int i = 0; i < grid->count(); ++i) {
      if (grid->itemAt(i)->layout() == &column) return grid;
    }
  }
  return nullptr;
}

void Place(const QWidget& window, QGroupBox& panel) {
  auto* const aside = window.findChild<QVBoxLayout*>(panel.property(kAside).toString());
  QGridLayout* const grid = aside == nullptr ? nullptr : GridAround(window, *aside);
  if (grid == nullptr || panel.isHidden()) return;
  const bool is_aside = aside->indexOf(&panel) >= 0;
  if (WouldCover(*grid, panel) == is_aside) return;
  if (is_aside) {
    aside->removeWidget(&panel);
    grid->addWidget(&panel, 0, 0, grid->rowCount(), grid->columnCount(), Qt::AlignCenter);
  } else {
    grid->removeWidget(&panel);
    aside->insertWidget(0, &panel, 0, Qt::AlignCenter);
  }
}

}  // namespace

OneStep::OneStep(QWidget& window) : window_(window), layout_(window.layout()) {
  if (layout_ != nullptr) layout_->setEnabled(false);
}

OneStep::~OneStep() {
  if (layout_ == nullptr) return;
  const QList<QWidget*> inner = window_.findChildren<QWidget*>();
  for (QWidget* const widget : inner) {
    auto* const panel = qobject_cast<QGroupBox*>(widget);
    if (panel != nullptr && panel->property(kAside).isValid()) Place(window_, *panel);
  }
  // What lies within first, or the window would reckon with the room that it had.
  for (auto widget = inner.rbegin(); widget != inner.rend(); ++widget) {
    if (QLayout* const layout = (*widget)->layout()) layout->activate();
  }
  layout_->setEnabled(true);
  layout_->activate();
}

}  // namespace marlowbeck
