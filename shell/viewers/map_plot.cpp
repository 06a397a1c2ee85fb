#include "shell/viewers/map_plot.h"

#include <algorithm>
#include <cmath>

namespace gridbay::shell {
namespace {

constexpr double kNoRotation = 1e-6;  // degrees
const QColor kLand(0xC9, 0xB9, 0x8F);

// Even steps of brightness, so that equal differences look equal.
QCPColorGradient colours() {
  QCPColorGradient gradient;
  gradient.clearColorStops();
  gradient.setColorStops({{0.0, QColor(0x44, 0x01, 0x54)},
                          {0.25, QColor(0x3B, 0x52, 0x8B)},
                          {0.5, QColor(0x21, 0x91, 0x8C)},
                          {0.75, QColor(0x5E, 0xC9, 0x62)},
                          {1.0, QColor(0xFD, 0xE7, 0x25)}});
  gradient.setNanHandling(QCPColorGradient::nhNanColor);
  gradient.setNanColor(kLand);
  return gradient;
}

}  // namespace

std::size_t MapPlot::Axis::index(double coordinate) const {
  const double index = std::round((coordinate - first) / spacing);
  return static_cast<std::size_t>(std::clamp(index, 0.0, static_cast<double>(points - 1)));
}

MapPlot::MapPlot(const TsbFile& file, QWidget* parent)
    : PlotWidget(parent),
      file_(file),
      map_(new QCPColorMap(xAxis, yAxis)),
      scale_(new QCPColorScale(this)),
      row_(file.definition().axes[0].points) {
  plotLayout()->addElement(0, 1, scale_);
  map_->setColorScale(scale_);
  map_->setGradient(colours());
  map_->setInterpolate(false);
  auto* margins = new QCPMarginGroup(this);
  axisRect()->setMarginGroup(QCP::msBottom | QCP::msTop, margins);
  scale_->setMarginGroup(QCP::msBottom | QCP::msTop, margins);
  placeOnMap();
  takeColours();

  resampling_.setSingleShot(true);
  connect(&resampling_, &QTimer::timeout, this, [this] {
    resample(false);
    replot();
  });
  const auto moved = [this] {
    if (!resampling_.isActive()) resampling_.start(0);
  };
  connect(xAxis, qOverload<const QCPRange&>(&QCPAxis::rangeChanged), this, moved);
  connect(yAxis, qOverload<const QCPRange&>(&QCPAxis::rangeChanged), this, moved);
  connect(this, &QCustomPlot::mouseMove, this, [this](const QMouseEvent* event) {
    emit pointed(
        textAt(xAxis->pixelToCoord(event->position().x()), yAxis->pixelToCoord(event->position().y())));
  });
}

void MapPlot::takeColours() {
  PlotWidget::takeColours();
  colour(*scale_->axis());
}

void MapPlot::placeOnMap() {
  const std::optional<TsbGeography>& place = file_.definition().geography;
  if (!place) return;
  const CVdMapProjection projection(place->projection);
  if (!projection.IsValid() || projection.IsLocal()) return;
  if (!projection.Geo2Proj(place->longitude, place->latitude, &east_, &north_)) return;
  place_.emplace(place->projection, east_, north_, place->rotation);
}

// Along a grid that is rotated the map's own coordinates can't stand; then it is metres from the first point.
MapPlot::Axis MapPlot::axis(std::size_t direction) const {
  const TsbGridAxis& grid = file_.definition().axes[direction];
  if (!mapCoordinates_) return {0, 1, grid.points};
  const bool north = place_ && std::abs(file_.definition().geography->rotation) < kNoRotation;
  const double origin = direction == 0 ? east_ : north_;
  return {north ? origin : grid.first, grid.spacing, grid.points};
}

void MapPlot::showValues(std::size_t item, std::size_t step) {
  const bool newColours = item != item_ || sample_.values.empty();
  item_ = item;
  step_ = step;
  rowNumber_.reset();
  resample(newColours);
  scale_->setLabel(itemTitle(file_.definition().items[item - 1]));
  replot();
}

void MapPlot::fit() {
  const Axis x = axis(0);
  const Axis y = axis(1);
  xAxis->setRange(x.coordinate(-0.5), x.coordinate(static_cast<double>(x.points) - 0.5));
  yAxis->setRange(y.coordinate(-0.5), y.coordinate(static_cast<double>(y.points) - 0.5));
  keepSquare();
  resample(true);
  replot();
}

void MapPlot::setMapCoordinates(bool on) {
  mapCoordinates_ = on;
  const QString unit = QString::fromStdString(file_.definition().axes[0].unit);
  const bool north = place_ && std::abs(file_.definition().geography->rotation) < kNoRotation;
  xAxis->setLabel(!on ? tr("J") : north ? tr("Easting [m]") : tr("Along the grid [%1]").arg(unit));
  yAxis->setLabel(!on ? tr("K") : north ? tr("Northing [m]") : tr("Across the grid [%1]").arg(unit));
  for (QCPAxis* each : {xAxis, yAxis}) each->setNumberFormat("f");
  for (QCPAxis* each : {xAxis, yAxis}) each->setNumberPrecision(0);
  fit();
}

// A metre is as long upwards as it is across; more than the grid may come into view.
void MapPlot::keepSquare() {
  const QSize size = axisRect()->size();
  if (size.width() < 1 || size.height() < 1) return;
  const double ratio = axis(0).spacing / axis(1).spacing;
  const double perPixelX = xAxis->range().size() / size.width();
  const double perPixelY = yAxis->range().size() / size.height() * (mapCoordinates_ ? 1 : 1 / ratio);
  if (perPixelX < perPixelY) {
    xAxis->setRange(xAxis->range().center(), xAxis->range().size() * perPixelY / perPixelX, Qt::AlignCenter);
  } else {
    yAxis->setRange(yAxis->range().center(), yAxis->range().size() * perPixelX / perPixelY, Qt::AlignCenter);
  }
}

void MapPlot::resizeEvent(QResizeEvent* event) {
  QCustomPlot::resizeEvent(event);
  plotLayout()->update(QCPLayoutElement::upLayout);
  fit();
}

void MapPlot::resample(bool newColours) {
  const Axis x = axis(0);
  const Axis y = axis(1);
  const MapWindow window{x.index(xAxis->range().lower), x.index(xAxis->range().upper),
                         y.index(yAxis->range().lower), y.index(yAxis->range().upper)};
  const int pixels = std::max({axisRect()->width(), axisRect()->height(), 1});
  const auto most = static_cast<std::size_t>(pixels * devicePixelRatio());
  Result<MapSample> sample = sampleMap(file_, item_, step_, window, most);
  if (!sample) {
    emit failed(QString::fromStdString(sample.error()));
    return;
  }
  sample_ = std::move(*sample);
  map_->data()->setSize(static_cast<int>(sample_.columns), static_cast<int>(sample_.rows));
  const auto last = [this](std::size_t first, std::size_t count) {
    return static_cast<double>(first + (count - 1) * sample_.stride);
  };
  map_->data()->setRange(QCPRange(x.coordinate(static_cast<double>(sample_.firstJ)),
                                  x.coordinate(last(sample_.firstJ, sample_.columns))),
                         QCPRange(y.coordinate(static_cast<double>(sample_.firstK)),
                                  y.coordinate(last(sample_.firstK, sample_.rows))));
  for (std::size_t row = 0; row < sample_.rows; ++row) {
    for (std::size_t column = 0; column < sample_.columns; ++column)
      map_->data()->setCell(static_cast<int>(column), static_cast<int>(row), sample_.at(column, row));
  }
  double least = 0;
  double greatest = 1;
  if (newColours && sample_.range(&least, &greatest))
    scale_->setDataRange(QCPRange(least, greatest > least ? greatest : least + 1));
}

std::optional<float> MapPlot::valueAt(std::size_t j, std::size_t k) {
  if (rowNumber_ != k) {
    rowNumber_.reset();
    if (!file_.readRows(item_, step_, k, row_)) return std::nullopt;
    rowNumber_ = k;
  }
  return row_[j];
}

QString MapPlot::textAt(double x, double y) {
  const Axis across = axis(0);
  const Axis along = axis(1);
  const auto inside = [](const Axis& grid, double at) {
    return at >= grid.coordinate(-0.5) && at <= grid.coordinate(static_cast<double>(grid.points) - 0.5);
  };
  if (!inside(across, x) || !inside(along, y)) return {};
  const std::size_t j = across.index(x);
  const std::size_t k = along.index(y);
  const std::optional<float> value = valueAt(j, k);
  const TsbItem& item = file_.definition().items[item_ - 1];
  QString text = QString("(%1,%2)").arg(j).arg(k);
  if (place_) {
    double east = 0;
    double north = 0;
    place_->Xy2Proj(static_cast<double>(j) * file_.definition().axes[0].spacing,
                    static_cast<double>(k) * file_.definition().axes[1].spacing, &east, &north);
    text += QString("   E %1  N %2").arg(east, 0, 'f', 1).arg(north, 0, 'f', 1);
  }
  if (!value) return text;
  const bool missing = *value == static_cast<float>(item.deleteValue);
  text +=
      missing ? tr("   no value") : QString("   %1 %2").arg(*value).arg(QString::fromStdString(item.unit));
  if (!missing && *value >= landLimitOf(file_.definition(), item_)) text += tr("  (land)");
  return text;
}

}  // namespace gridbay::shell
