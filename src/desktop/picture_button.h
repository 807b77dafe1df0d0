#pragma once

#include <QAbstractButton>
#include <QPixmap>
#include <QString>
#include <QSvgRenderer>

namespace marlowbeck {

/// A command that is a picture: an SVG of the resources, named by `icon` without its folder and
/// ending. A frame shows the focus, and the mark that the pointer is over it.
class PictureButton : public QAbstractButton {
  Q_OBJECT
  Q_PROPERTY(QString icon READ IconName WRITE setIcon)
  Q_PROPERTY(bool bordered READ Bordered WRITE SetBordered)

 public:
  explicit PictureButton(QWidget* parent = nullptr);

  [[nodiscard]] QString IconName() const { return icon_name_; }
  void setIcon(const QString& name);  // NOLINT(readability-identifier-naming): called by forms
  [[nodiscard]] bool Bordered() const { return bordered_; }
  void SetBordered(bool bordered);

  [[nodiscard]] QSize sizeHint() const override;
  [[nodiscard]] QSize minimumSizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;

 private:
  [[nodiscard]] QRectF PictureArea() const;
  void PaintPicture(QPainter& painter);
  const QPixmap& Drawn();
  void PaintFrame(QPainter& painter) const;

  QString icon_name_;
  QSvgRenderer picture_;
  QPixmap drawn_;  ///< for the present size, once it has been needed
  bool bordered_ = false;
};

}  // namespace marlowbeck

// Forms name the class without its namespace.
using PictureButton = marlowbeck::PictureButton;
