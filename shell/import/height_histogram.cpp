#include "shell/import/height_histogram.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <algorithm>
#include <cmath>

#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr std::size_t kBins = 100;
constexpr int kMargin = 10;  // pixels above and below the axis
constexpr int kTicks = 8;    // about so many

}  // namespace

HeightHistogram::HeightHistogram(QWidget* parent) : QWidget(parent) {
  setFocusPolicy(Qt::StrongFocus);
  setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Expanding);
  setAccessibleName(tr("Histogram of heights with the land value"));
}

void HeightHistogram::showHeights(const std::vector<float>& heights) {
  counts_.clear();
  bool hasAny = false;
  for (const float height : heights) {
    if (!std::isfinite(height)) continue;
    least_ = hasAny ? std::min(least_, height) : height;
    greatest_ = hasAny ? std::max(greatest_, height) : height;
    hasAny = true;
  }
  if (hasAny) {
    counts_.resize(kBins);
    const double width = std::max<double>(greatest_ - least_, 1e-6) / kBins;
    for (const float height : heights) {
      if (std::isfinite(height))
        ++counts_[std::min(static_cast<std::size_t>((height - least_) / width), kBins - 1)];
    }
  }
  fitAxis();
  update();
}

void HeightHistogram::setLand(std::optional<float> land) {
  land_ = land;
  fitAxis();
  update();
}

// A land value that is far off would leave no room for the heights.
void HeightHistogram::fitAxis() {
  if (isDragged_) return;
  const double span = std::max<double>(greatest_ - least_, 1e-3);
  bottom_ = least_ - span / 20;
  top_ = greatest_ + span / 5;
  if (land_ && *land_ <= greatest_ + 2 * span) top_ = std::max(top_, *land_ + span / 20);
  if (land_ && *land_ >= least_ - 2 * span) bottom_ = std::min(bottom_, *land_ - span / 20);
}

double HeightHistogram::toScreen(double height) const {
  return kMargin + (top_ - height) / (top_ - bottom_) * (this->height() - 2 * kMargin);
}

// The round distance of its ticks.
double HeightHistogram::stepOfAxis() const {
  const double rough = (top_ - bottom_) / kTicks;
  const double unit = std::pow(10, std::floor(std::log10(rough)));
  for (const double digit : {1.0, 2.0, 5.0}) {
    if (rough <= digit * unit) return digit * unit;
  }
  return 10 * unit;
}

void HeightHistogram::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), palette().brush(QPalette::Base));
  if (counts_.empty()) return;
  const double step = stepOfAxis();
  const int digits = std::max(0, static_cast<int>(-std::floor(std::log10(step))));
  const auto labelOf = [digits](double height) { return QString::number(height, 'f', digits); };
  const int labels = std::max(fontMetrics().horizontalAdvance(labelOf(bottom_)),
                              fontMetrics().horizontalAdvance(labelOf(top_))) +
                     kMargin;
  const QRectF room(labels + kMargin / 2, 0, width() - labels - kMargin, height());
  painter.setPen(palette().color(QPalette::Text));
  for (double height = std::ceil(bottom_ / step) * step; height <= top_; height += step) {
    const double y = toScreen(height);
    painter.drawText(QRectF(0, y - 20, labels - kMargin / 2, 40), Qt::AlignRight | Qt::AlignVCenter,
                     labelOf(std::abs(height) < step / 2 ? 0.0 : height));
    painter.drawLine(QPointF(labels - 2, y), QPointF(labels + 2, y));
  }
  const TerrainTint tint(least_, greatest_, land_);
  // The square root, so that what is rare is seen beside what is frequent.
  const double most = std::sqrt(static_cast<double>(*std::ranges::max_element(counts_)));
  const double binHeight = (greatest_ - least_) / static_cast<double>(kBins);
  for (std::size_t bin = 0; bin < kBins; ++bin) {
    if (counts_[bin] == 0) continue;
    const double from = least_ + binHeight * static_cast<double>(bin);
    const double length = std::sqrt(static_cast<double>(counts_[bin])) / most * room.width();
    const double y = toScreen(from + binHeight);
    painter.fillRect(QRectF(room.left(), y, std::max(length, 1.0), std::max(toScreen(from) - y, 1.0)),
                     QColor(tint.of(static_cast<float>(from + binHeight / 2))));
  }
  if (!land_) return;
  const double y = std::clamp(toScreen(*land_), 1.0, height() - 2.0);
  painter.setPen(QPen(faultColour(palette()), hasFocus() ? 3 : 2));
  painter.drawLine(QPointF(labels, y), QPointF(width(), y));
  painter.drawText(QRectF(labels, y < 24 ? y + 2 : y - 20, width() - labels - 4, 18), Qt::AlignRight,
                   tr("land"));
}

void HeightHistogram::moveLand(double land) {
  const double step = stepOfAxis() / 20;
  // Round, and no land value is below 0.
  const double round = std::max(std::round(std::clamp(land, bottom_, top_) / step) * step, 0.0);
  emit landDragged(round);
}

void HeightHistogram::mousePressEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton || counts_.empty()) return;
  isDragged_ = true;
  mouseMoveEvent(event);
}

void HeightHistogram::mouseMoveEvent(QMouseEvent* event) {
  if (!isDragged_) return;
  const double part = (event->position().y() - kMargin) / (height() - 2 * kMargin);
  moveLand(top_ - part * (top_ - bottom_));
}

void HeightHistogram::mouseReleaseEvent(QMouseEvent* event) {
  if (event->button() != Qt::LeftButton) return;
  isDragged_ = false;
}

void HeightHistogram::keyPressEvent(QKeyEvent* event) {
  const bool isUp = event->key() == Qt::Key_Up;
  if (counts_.empty() || !(isUp || event->key() == Qt::Key_Down)) {
    QWidget::keyPressEvent(event);
    return;
  }
  moveLand(land_.value_or(greatest_) + (isUp ? 1 : -1) * stepOfAxis() / 20);
}

}  // namespace gridbay::shell
