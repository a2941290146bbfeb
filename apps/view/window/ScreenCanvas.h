#pragma once

#include <QPixmap>
#include <QSvgRenderer>
#include <QWidget>
#include <functional>
#include <map>
#include <optional>

#include "apps/view/model/ScreenModel.h"
#include "apps/view/window/Picture.h"

namespace ax::view {

// Shows the picture of a screen with the texts of its items, the focused one outlined.
class ScreenCanvas : public QWidget {
 public:
  explicit ScreenCanvas(ScreenModel& model);

  // The SVG document to show. Its view box tells the part of the screen that it shows, in points.
  void setPicture(const std::string& svg, const PictureColours& colours);
  // Pixels for one point.
  void setZoom(double zoom);
  double zoom() const { return zoom_; }
  // Marks a point of the screen, such as a value in a line; nothing takes the mark away.
  void setMark(std::optional<Point> mark);

  // Between the screen's points and the canvas's pixels.
  QRectF rectOf(const Rect& rect) const;
  Point pointOf(QPointF pixel) const;

  std::function<void()> onFocusIn;
  std::function<void(ItemId)> onTouch;

  QSize sizeHint() const override;

 protected:
  void paintEvent(QPaintEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void focusInEvent(QFocusEvent* event) override;
  bool focusNextPrevChild(bool next) override;

 private:
  void paintPicture(QPainter& painter, const QRect& exposed);
  const QPixmap& band(int number);
  void paintTexts(QPainter& painter, const QRectF& exposed);
  void paintText(QPainter& painter, const QRectF& room, const Item& item);
  void paintFocus(QPainter& painter);
  void paintMark(QPainter& painter);

  ScreenModel& model_;
  QSvgRenderer picture_;
  PictureColours colours_;
  std::map<int, QPixmap> bands_;  // parts of the picture as they were last drawn, from top to bottom
  double zoom_ = 1;
  std::optional<Point> mark_;
};

}  // namespace ax::view
