#include "shell/import/terrain_plan.h"

#include <QLocale>
#include <QObject>
#include <algorithm>
#include <cmath>

#include "conversion/raster_layout.h"

namespace gridbay::shell {
namespace {

// Values of the grid's bytes in memory and in the file.
constexpr double kBytesPerPoint = sizeof(float);

int countOf(const std::array<int, 2>& ends) {
  return std::max(ends[1] - ends[0] + 1, 0);
}

QString sizeText(double bytes) {
  return QLocale().formattedDataSize(static_cast<qint64>(bytes), 1, QLocale::DataSizeTraditionalFormat);
}

QString countText(std::size_t count) {
  return QLocale().toString(static_cast<qulonglong>(count));
}

}  // namespace

QRectF extentOf(const RasterPreview& preview) {
  const auto [dx, dy] = preview.spacing;
  return {preview.first[0] - dx / 2, preview.first[1] - dy / 2, preview.points[0] * dx,
          preview.points[1] * dy};
}

std::array<int, 2> pointsIn(const RasterPreview& preview, const QRectF& window) {
  return {countOf(pointsBetween(window.left(), window.right(), preview.first[0], preview.spacing[0],
                                preview.points[0])),
          countOf(pointsBetween(window.top(), window.bottom(), preview.first[1], preview.spacing[1],
                                preview.points[1]))};
}

WetDry countWetDry(const RasterPreview& preview, const QRectF& window, std::optional<float> land) {
  const QRectF all = extentOf(preview);
  // The middles of the picture's points.
  const double dx = all.width() / preview.columns;
  const double dy = all.height() / preview.rows;
  const auto [j0, j1] =
      pointsBetween(window.left(), window.right(), all.left() + dx / 2, dx, preview.columns);
  const auto [k0, k1] = pointsBetween(window.top(), window.bottom(), all.top() + dy / 2, dy, preview.rows);
  WetDry counts;
  for (int row = k0; row <= k1; ++row) {
    for (int column = j0; column <= j1; ++column) {
      const float value =
          preview.values[static_cast<std::size_t>(row) * static_cast<std::size_t>(preview.columns) +
                         static_cast<std::size_t>(column)];
      ++(std::isnan(value) ? counts.missing : land && value >= *land ? counts.dry : counts.wet);
    }
  }
  counts.isExact = preview.isWhole();
  if (counts.isExact || counts.all() == 0) return counts;
  const auto [nx, ny] = pointsIn(preview, window);
  const double scale = static_cast<double>(nx) * ny / static_cast<double>(counts.all());
  for (std::size_t* count : {&counts.wet, &counts.dry, &counts.missing})
    *count = static_cast<std::size_t>(std::llround(static_cast<double>(*count) * scale));
  return counts;
}

float landAbove(const RasterPreview& preview) {
  float greatest = 0;
  for (const float value : preview.values) {
    if (std::isfinite(value)) greatest = std::max(greatest, value);
  }
  // Of two digits, and no less than 10.
  const double digit = std::max(std::pow(10, std::floor(std::log10(std::max(greatest, 1.0F)))), 10.0);
  return static_cast<float>((std::floor(greatest / digit) + 1) * digit);
}

QString zoneOf(const RasterPreview& preview) {
  if (!preview.middle) return {};
  const auto [longitude, latitude] = *preview.middle;
  const int zone = std::clamp(static_cast<int>(std::floor((longitude + 180) / 6)) + 1, 1, 60);
  return QString("UTM-%1%2").arg(zone).arg(latitude < 0 ? "S" : "");
}

QString summaryOf(const RasterPreview& preview, const QRectF& window, std::optional<float> land) {
  const auto [nx, ny] = pointsIn(preview, window);
  if (nx == 0 || ny == 0) return QObject::tr("The window holds no point.");
  const auto [dx, dy] = preview.spacing;
  const WetDry counts = countWetDry(preview, window, land);
  const QString unit = preview.unit.empty() ? "m" : QString::fromStdString(preview.unit);
  const QString about = counts.isExact ? "" : QObject::tr("about ");
  QString text = QObject::tr("%1 x %2 points, %3 x %4 %5 apart (%6 x %7 %5)\n%8 in memory and on disk\n")
                     .arg(QLocale().toString(nx), QLocale().toString(ny))
                     .arg(dx, 0, 'g', 6)
                     .arg(dy, 0, 'g', 6)
                     .arg(unit)
                     .arg((nx - 1) * dx, 0, 'g', 6)
                     .arg((ny - 1) * dy, 0, 'g', 6)
                     .arg(sizeText(kBytesPerPoint * nx * ny));
  text += QObject::tr("%1%2 wet, %3 dry").arg(about, countText(counts.wet), countText(counts.dry));
  if (counts.missing > 0) text += QObject::tr(", %1 missing").arg(countText(counts.missing));
  return text;
}

}  // namespace gridbay::shell
