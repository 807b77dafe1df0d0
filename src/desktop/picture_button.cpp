#include "desktop/picture_button.h"

#include <QPainter>

namespace marlowbeck {
namespace {

constexpr int kFrame = 6;  ///< room for the frame, in pixels
constexpr double kFrameWidth = 3;
constexpr double kRadius = 8;
constexpr double kFaded = 0.35;
constexpr double kLineShape = 4;  ///< so many times as wide as high, a picture is a line of a menu

}  // namespace

PictureButton::PictureButton(QWidget* parent) : QAbstractButton(parent) {
  QSizePolicy policy(QSizePolicy::Expanding, QSizePolicy::Expanding);
  setSizePolicy(policy);
}

void PictureButton::setIcon(const QString& name) {
  icon_name_ = name;
  picture_.load(":/icons/" + name + ".svg");
  drawn_ = {};
  updateGeometry();
  update();
}

void PictureButton::SetBordered(bool bordered) {
  if (bordered_ == bordered) return;
  bordered_ = bordered;
  update();
}

QSize PictureButton::sizeHint() const {
  return picture_.defaultSize() + QSize(2 * kFrame, 2 * kFrame);
}

QSize PictureButton::minimumSizeHint() const { return sizeHint() / 2; }

QRectF PictureButton::PictureArea() const {
  const QRectF room = QRectF(rect()).adjusted(kFrame, kFrame, -kFrame, -kFrame);
  QSizeF size = picture_.defaultSize();
  size.scale(room.size(), Qt::KeepAspectRatio);
  QRectF area(QPointF(0, 0), size);
  area.moveCenter(room.center());
  // The words of a line stand below those of the line above, whatever its height.
  if (size.width() > kLineShape * size.height()) area.moveLeft(room.left());
  return area;
}

void PictureButton::paintEvent(QPaintEvent* /*event*/) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  PaintPicture(painter);
  PaintFrame(painter);
}

/// A disabled picture fades as a whole: part by part, what lies behind would shine through.
void PictureButton::PaintPicture(QPainter& painter) {
  if (!isEnabled()) painter.setOpacity(kFaded);
  painter.drawPixmap(isDown() ? QPoint(1, 1) : QPoint(0, 0), Drawn());
  painter.setOpacity(1);
}

/// The picture as it lies in the button. It is drawn anew for another size only: a menu of them
/// takes longer to draw than most screens that come up over it.
const QPixmap& PictureButton::Drawn() {
  const QSize dots = size() * devicePixelRatioF();
  if (drawn_.size() == dots) return drawn_;
  drawn_ = QPixmap(dots);
  drawn_.setDevicePixelRatio(devicePixelRatioF());
  drawn_.fill(Qt::transparent);
  QPainter on(&drawn_);
  picture_.render(&on, PictureArea());
  return drawn_;
}

/// The pointer's frame is full, the focus's is a thin one: the two may stand on one picture.
void PictureButton::PaintFrame(QPainter& painter) const {
  if (!bordered_ && !hasFocus()) return;
  const QColor color = palette().color(QPalette::Highlight);
  painter.setPen(bordered_ ? QPen(color, kFrameWidth) : QPen(color, 2, Qt::DashLine));
  const double inset = kFrameWidth / 2;
  painter.drawRoundedRect(PictureArea()
                              .adjusted(-kFrame, -kFrame, kFrame, kFrame)
                              .adjusted(inset, inset, -inset, -inset),
                          kRadius, kRadius);
}

}  // namespace marlowbeck
