#pragma once

#include <QSize>
#include <QStringList>
#include <QWidget>

namespace marlowbeck {

/// What is wrong with how a window lies, as a person sees it: words that are cut, controls that are
/// covered or out of the window, lists and tables that would have to be scrolled sideways. Each
/// fault names its widget.
[[nodiscard]] QStringList LayoutFaults(const QWidget& window);

/// The same for a window that cannot be made as small as it should be.
[[nodiscard]] QStringList SizeFaults(const QWidget& window, QSize room);

}  // namespace marlowbeck
