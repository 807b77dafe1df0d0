#pragma once

#include <cstdlib>

#include <QEvent>
#include <QTimer>
#include <QWidget>

namespace marlowbeck::bench {

/// Ends the process once a window has been painted.
class EndAfterFirstPaint : public QObject {
 public:
  bool eventFilter(QObject* object, QEvent* event) override {
    const auto* widget = qobject_cast<QWidget*>(object);
    if (event->type() == QEvent::Paint && widget != nullptr && widget->window()->isVisible()) {
      QTimer::singleShot(0, [] { std::_Exit(0); });
    }
    return false;
  }
};

}  // namespace marlowbeck::bench
