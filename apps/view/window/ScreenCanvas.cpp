#include "apps/view/window/ScreenCanvas.h"

#include <QMouseEvent>
#include <QPainter>
#include <QTextLayout>
#include <algorithm>

namespace ax::view {

namespace {

constexpr QRectF emptyScreen(0, 0, 320, 200);
constexpr double outlineWidth = 4;
constexpr int bandHeight = 2048;  // pixels
constexpr std::size_t mostBands = 4;
constexpr float veilStrength = 0.75F;
// In points of the screen.
constexpr double typeSize = 13, roomForNumber = 28, textMargin = 3, narrowestText = 80;

// A text in lines of this many pixels, the last of which tells where something is left out.
QString brokenText(const QString& text, const QFont& type, double width, double height) {
  const QFontMetricsF metrics(type);
  const auto most = std::max(qsizetype(1), qsizetype(height / metrics.lineSpacing()));
  QTextLayout layout(text, type);
  layout.beginLayout();
  QStringList lines;
  for (QTextLine line = layout.createLine(); line.isValid(); line = layout.createLine()) {
    line.setLineWidth(width);
    const bool isLast = lines.size() + 1 == most;
    const QString rest = text.mid(line.textStart(), isLast ? -1 : line.textLength()).trimmed();
    lines << (isLast ? metrics.elidedText(rest, Qt::ElideRight, width) : rest);
    if (isLast) break;
  }
  layout.endLayout();
  return lines.join('\n');
}

}  // namespace

ScreenCanvas::ScreenCanvas(ScreenModel& model) : model_(model) {
  setFocusPolicy(Qt::StrongFocus);
}

void ScreenCanvas::setPicture(const std::string& svg, const PictureColours& colours) {
  colours_ = colours;
  picture_.load(QByteArray::fromStdString(svg));
  setZoom(zoom_);
}

void ScreenCanvas::setZoom(double zoom) {
  zoom_ = zoom;
  bands_.clear();
  setFixedSize(sizeHint());
  update();
}

void ScreenCanvas::setMark(std::optional<Point> mark) {
  mark_ = mark;
  update();
}

QSize ScreenCanvas::sizeHint() const {
  const QRectF box = picture_.isValid() ? picture_.viewBoxF() : emptyScreen;
  return (box.size() * zoom_).toSize();
}

QRectF ScreenCanvas::rectOf(const Rect& rect) const {
  const QPointF origin = picture_.isValid() ? picture_.viewBoxF().topLeft() : QPointF();
  return {(rect.x - origin.x()) * zoom_, (rect.y - origin.y()) * zoom_, rect.width * zoom_,
          rect.height * zoom_};
}

Point ScreenCanvas::pointOf(QPointF pixel) const {
  const QPointF origin = picture_.isValid() ? picture_.viewBoxF().topLeft() : QPointF();
  return {pixel.x() / zoom_ + origin.x(), pixel.y() / zoom_ + origin.y()};
}

void ScreenCanvas::paintEvent(QPaintEvent* event) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  if (picture_.isValid()) paintPicture(painter, event->rect());
  paintTexts(painter, event->rect());
  paintFocus(painter);
  paintMark(painter);
}

// Drawing takes as long as the whole picture is, however little of it is seen, and the focus moves often.
void ScreenCanvas::paintPicture(QPainter& painter, const QRect& exposed) {
  for (int number = exposed.top() / bandHeight; number * bandHeight <= exposed.bottom(); ++number) {
    painter.drawPixmap(0, number * bandHeight, band(number));
  }
}

const QPixmap& ScreenCanvas::band(int number) {
  const auto known = bands_.find(number);
  const double density = devicePixelRatioF();
  if (known != bands_.end() && known->second.devicePixelRatio() == density) return known->second;
  if (bands_.size() >= mostBands) bands_.clear();
  QPixmap drawn((QSizeF(width(), bandHeight) * density).toSize());
  drawn.setDevicePixelRatio(density);
  drawn.fill(colours_.ground);
  QPainter painter(&drawn);
  painter.setRenderHint(QPainter::Antialiasing);
  painter.translate(0, -number * bandHeight);
  picture_.render(&painter, QRectF(rect()));
  return bands_.insert_or_assign(number, drawn).first->second;
}

// Beside the numbers, which stand in the corners where reading begins.
void ScreenCanvas::paintTexts(QPainter& painter, const QRectF& exposed) {
  QFont type = font();
  type.setPixelSize(int(typeSize * zoom_));
  painter.setFont(type);
  painter.setPen(colours_.ink);
  const double besides = roomForNumber * zoom_, rim = textMargin * zoom_;
  const bool fromTheRight = layoutDirection() == Qt::RightToLeft;
  for (const ItemId id : model_.readingOrder()) {
    const Item& item = *model_.find(id);
    QRectF room = rectOf(item.node.frame);
    if (!room.intersects(exposed) || item.node.frame.width < narrowestText) continue;
    const double above = std::clamp((room.height() - painter.fontMetrics().lineSpacing()) / 2, 0.0, rim);
    room.adjust(fromTheRight ? rim : besides, above, fromTheRight ? -besides : -rim, -above);
    painter.setClipRect(room);
    paintText(painter, room, item);
  }
  painter.setClipping(false);
}

// Charts have their name at the top, on ground that their lines still show through.
void ScreenCanvas::paintText(QPainter& painter, const QRectF& room, const Item& item) {
  const QString text =
      brokenText(QString::fromStdString(item.name), painter.font(), room.width(), room.height());
  const bool isChart = item.node.series.has_value();
  const int flags = int(Qt::AlignLeading | (isChart ? Qt::AlignTop : Qt::AlignVCenter));
  if (isChart) {
    QColor veil = colours_.ground;
    veil.setAlphaF(veilStrength);
    painter.fillRect(painter.boundingRect(room, flags, text), veil);
  }
  painter.drawText(room, flags, text);
}

// Around the element, not on its number. What has no place of its own, such as a title, belongs to the whole.
// Two colours, so that one of them stands out from any ground.
void ScreenCanvas::paintFocus(QPainter& painter) {
  const Item* item = model_.find(model_.focus());
  if (item == nullptr) return;
  const double around = outlineWidth, inside = outlineWidth / 2 + 2;
  const bool hasPlace = !item->node.frame.isEmpty();
  const QRectF frame = hasPlace ? rectOf(item->node.frame).adjusted(-around, -around, around, around)
                                : QRectF(rect()).adjusted(inside, inside, -inside, -inside);
  painter.setPen(QPen(colours_.ground, outlineWidth + 4));
  painter.drawRoundedRect(frame, outlineWidth, outlineWidth);
  painter.setPen(QPen(palette().color(QPalette::Highlight), outlineWidth));
  painter.drawRoundedRect(frame, outlineWidth, outlineWidth);
}

void ScreenCanvas::paintMark(QPainter& painter) {
  if (!mark_) return;
  const QPointF centre = rectOf({mark_->x, mark_->y, 0, 0}).topLeft();
  painter.setPen(QPen(colours_.ground, outlineWidth / 2));
  painter.setBrush(palette().color(QPalette::Highlight));
  painter.drawEllipse(centre, 2 * outlineWidth, 2 * outlineWidth);
}

void ScreenCanvas::mousePressEvent(QMouseEvent* event) {
  if (onTouch) onTouch(model_.itemAt(pointOf(event->position())));
}

void ScreenCanvas::focusInEvent(QFocusEvent* event) {
  QWidget::focusInEvent(event);
  if (onFocusIn) onFocusIn();
}

// Tab steps through the screen.
bool ScreenCanvas::focusNextPrevChild(bool) {
  return false;
}

}  // namespace ax::view
