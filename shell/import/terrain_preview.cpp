#include "shell/import/terrain_preview.h"

#include <QMouseEvent>
#include <QPainter>
#include <algorithm>
#include <cmath>

#include "shell/import/terrain_plan.h"
#include "shell/map/terrain_picture.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr int kMargin = 6;      // pixels
constexpr double kClick = 4.0;  // pixels that a click may move

}  // namespace

QRgb TerrainTint::of(float height) const {
  if (land_ && height >= *land_) {
    const double part = (height - *land_) / std::max(greatest_ - *land_, 1e-6F);
    return blend(QColor(landColour()), QColor(112, 84, 52), std::clamp(part, 0.0, 1.0)).rgb();
  }
  const float top = land_ ? std::min(*land_, greatest_) : greatest_;
  const double part = (height - least_) / std::max(top - least_, 1e-6F);
  return terrainColour(TerrainColours::sea, std::clamp(part, 0.0, 1.0));
}

TerrainPreview::TerrainPreview(QWidget* parent) : QWidget(parent) {
  setMouseTracking(true);
  setCursor(Qt::CrossCursor);
  setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Expanding);
}

void TerrainPreview::showPreview(const RasterPreview* preview, const QString& text) {
  preview_ = preview;
  text_ = text;
  grasp_.reset();
  isStale_ = true;
  update();
}

void TerrainPreview::setTint(const TerrainTint& tint) {
  tint_ = tint;
  isStale_ = true;
  update();
}

void TerrainPreview::setWindow(const QRectF& window) {
  window_ = window;
  update();
}

QRectF TerrainPreview::picture() const {
  const QRectF room = QRectF(rect()).adjusted(kMargin, kMargin, -kMargin, -kMargin);
  const QRectF extent = extentOf(*preview_);
  const double scale = std::min(room.width() / extent.width(), room.height() / extent.height());
  QRectF shown(QPointF(), extent.size() * scale);
  shown.moveCenter(room.center());
  return shown;
}

// Northings rise upwards.
QPointF TerrainPreview::toScreen(QPointF place) const {
  const QRectF shown = picture();
  const QRectF extent = extentOf(*preview_);
  return {shown.left() + (place.x() - extent.left()) / extent.width() * shown.width(),
          shown.bottom() - (place.y() - extent.top()) / extent.height() * shown.height()};
}

QPointF TerrainPreview::toPlace(QPointF screen) const {
  const QRectF shown = picture();
  const QRectF extent = extentOf(*preview_);
  return {extent.left() + (screen.x() - shown.left()) / shown.width() * extent.width(),
          extent.top() + (shown.bottom() - screen.y()) / shown.height() * extent.height()};
}

QRectF TerrainPreview::drawn(QPointF to) const {
  return QRectF(toPlace(*grasp_), toPlace(to)).normalized() & extentOf(*preview_);
}

QString TerrainPreview::textAt(QPointF place) const {
  const QRectF extent = extentOf(*preview_);
  if (!extent.contains(place)) return {};
  const auto part = [](double at, double first, double size, int count) {
    return static_cast<std::size_t>(std::clamp(static_cast<int>((at - first) / size * count), 0, count - 1));
  };
  const std::size_t column = part(place.x(), extent.left(), extent.width(), preview_->columns);
  const std::size_t row = part(place.y(), extent.top(), extent.height(), preview_->rows);
  const float value = preview_->values[row * static_cast<std::size_t>(preview_->columns) + column];
  const int digits = preview_->unit.empty() ? 1 : 5;
  return QString("%1, %2: %3")
      .arg(place.x(), 0, 'f', digits)
      .arg(place.y(), 0, 'f', digits)
      .arg(std::isnan(value) ? tr("missing") : QString::number(value, 'g', 5));
}

void TerrainPreview::paintImage() {
  isStale_ = false;
  image_ = QImage(preview_->columns, preview_->rows, QImage::Format_ARGB32_Premultiplied);
  const auto columns = static_cast<std::size_t>(preview_->columns);
  for (int row = 0; row < preview_->rows; ++row) {
    auto* pixels = reinterpret_cast<QRgb*>(image_.scanLine(preview_->rows - 1 - row));
    const float* values = preview_->values.data() + static_cast<std::size_t>(row) * columns;
    std::transform(values, values + columns, pixels,
                   [this](float value) { return std::isnan(value) ? QRgb{0} : tint_.of(value); });
  }
}

void TerrainPreview::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), palette().brush(QPalette::Base));
  if (preview_ == nullptr || preview_->values.empty()) {
    painter.setPen(quietText(palette()));
    painter.drawText(rect().adjusted(kMargin, kMargin, -kMargin, -kMargin),
                     Qt::AlignCenter | Qt::TextWordWrap, text_);
    return;
  }
  if (isStale_) paintImage();
  const QRectF shown = picture();
  // What is missing shows as hatching.
  painter.fillRect(shown, QBrush(lineColour(palette()), Qt::BDiagPattern));
  painter.setRenderHint(QPainter::SmoothPixmapTransform, shown.width() < image_.width());
  painter.drawImage(shown, image_);
  painter.setPen(lineColour(palette()));
  painter.drawRect(shown);
  const QRectF window = grasp_ ? drawn(pointer_) : window_;
  const QRectF frame = QRectF(toScreen(window.topLeft()), toScreen(window.bottomRight())).normalized();
  if (frame.contains(shown.adjusted(1, 1, -1, -1))) return;
  QPainterPath outside;
  outside.addRect(shown);
  outside.addRect(frame & shown);
  painter.fillPath(outside, QColor(0, 0, 0, 110));
  painter.setPen(QPen(Qt::black, 3));
  painter.drawRect(frame);
  painter.setPen(QPen(Qt::white, 1));
  painter.drawRect(frame);
}

void TerrainPreview::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton || preview_ == nullptr || preview_->values.empty()) return;
  grasp_ = event->position();
  pointer_ = event->position();
}

void TerrainPreview::mouseMoveEvent(QMouseEvent* event) {
  if (preview_ == nullptr || preview_->values.empty()) return;
  pointer_ = event->position();
  emit pointed(textAt(toPlace(pointer_)));
  if (grasp_) update();
}

void TerrainPreview::mouseReleaseEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton || !grasp_) return;
  const QPointF moved = event->position() - *grasp_;
  const bool isClick = std::abs(moved.x()) < kClick || std::abs(moved.y()) < kClick;
  const QRectF window = isClick ? QRectF() : drawn(event->position());
  grasp_.reset();
  update();
  emit windowDrawn(window);
}

void TerrainPreview::leaveEvent(QEvent*) {
  emit pointed({});
}

}  // namespace gridbay::shell
