#include "shell/map/map_drawing.h"

#include <QFontMetricsF>
#include <QPainterPath>
#include <algorithm>
#include <cmath>
#include <limits>
#include <span>

#include "shell/tool_icons.h"

namespace gridbay::shell {
namespace {

const QColor kFault(0xD3, 0x1C, 0x1C);
const QColor kLit(0xFF, 0xC4, 0x00);
const QColor kHalo(255, 255, 255, 200);
constexpr double kNear = 7;       // pixels
constexpr double kLeastCell = 8;  // pixels, from where on the cells of a grid are told apart
constexpr std::size_t kLongLine = 256;

double distance(QPointF a, QPointF b) {
  return std::hypot(a.x() - b.x(), a.y() - b.y());
}

double distanceToSegment(QPointF at, QPointF a, QPointF b) {
  const QPointF along = b - a;
  const double length = QPointF::dotProduct(along, along);
  const double part = length > 0 ? std::clamp(QPointF::dotProduct(at - a, along) / length, 0.0, 1.0) : 0;
  return distance(at, a + part * along);
}

QRectF coverOf(std::span<const MapPoint> points) {
  double west = std::numeric_limits<double>::max();
  double south = west;
  double east = std::numeric_limits<double>::lowest();
  double north = east;
  for (const MapPoint& point : points) {
    west = std::min(west, point.east);
    east = std::max(east, point.east);
    south = std::min(south, point.north);
    north = std::max(north, point.north);
  }
  return {west, south, east - west, north - south};
}

// Where a mark stands: above its place, which stays free to be grasped.
constexpr double kMarkSize = 20;
QRectF boxOfMark(QPointF place) {
  constexpr double kStalk = 12;
  return {place.x() - kMarkSize / 2, place.y() - kStalk - kMarkSize, kMarkSize, kMarkSize};
}

QRectF boxOfBadge(const QPainter& painter, QPointF middle, const QString& text) {
  const QFontMetricsF metrics(painter.font());
  const double height = metrics.height() + 2;
  const double width = std::max(height, metrics.horizontalAdvance(text) + 8);
  return {middle.x() - width / 2, middle.y() - height / 2, width, height};
}

constexpr std::size_t kRun = 64;  // points

// Of each run of points with the next point, at the end of a closed line the first one.
std::vector<QRectF> runsOf(const MapFeature& feature) {
  const std::span<const MapPoint> points(*feature.points);
  std::vector<QRectF> runs;
  for (std::size_t first = 0; first < points.size(); first += kRun) {
    runs.push_back(coverOf(points.subspan(first, std::min(kRun + 1, points.size() - first))));
    if (first + kRun < points.size()) continue;
    const std::array ends{points.front(), points.back()};
    if (feature.closed) runs.back() |= coverOf(ends).adjusted(-1e-9, -1e-9, 1e-9, 1e-9);
  }
  return runs;
}

// An arrow's head at the end of a line.
QPolygonF arrowHead(QPointF from, QPointF to, double size) {
  const QPointF way = to - from;
  const double length = std::hypot(way.x(), way.y());
  if (length < 1) return {};
  const QPointF ahead = way / length * size;
  const QPointF aside(-ahead.y() * 0.45, ahead.x() * 0.45);
  return {{to, to - ahead + aside, to - ahead - aside}};
}

// The round number at or below another one: 1, 2 or 5 with noughts.
double roundBelow(double value) {
  const double power = std::pow(10, std::floor(std::log10(value)));
  const double digit = value / power;
  return (digit >= 5 ? 5 : digit >= 2 ? 2 : 1) * power;
}

QString lengthText(double metres) {
  return metres >= 1000 ? QString("%1 km").arg(metres / 1000) : QString("%1 m").arg(metres);
}

void paintLegendText(QPainter& painter, QPointF at, const QString& text, Qt::Alignment alignment) {
  const QFontMetricsF metrics(painter.font());
  const double width = metrics.horizontalAdvance(text);
  QRectF box(at.x(), at.y() - metrics.height() / 2, width, metrics.height());
  if (alignment & Qt::AlignRight) box.translate(-width, 0);
  if (alignment & Qt::AlignHCenter) box.translate(-width / 2, 0);
  painter.setPen(Qt::NoPen);
  painter.setBrush(kHalo);
  painter.drawRoundedRect(box.adjusted(-3, -1, 3, 1), 3, 3);
  painter.setPen(Qt::black);
  painter.drawText(box, Qt::AlignCenter | Qt::TextDontClip, text);
}

}  // namespace

QPolygonF onScreen(const MapFrame& frame, const std::vector<MapPoint>& points) {
  QPolygonF line;
  if (points.size() <= kLongLine) line.reserve(static_cast<qsizetype>(points.size()));
  for (std::size_t i = 0; i < points.size(); ++i) {
    const QPointF at = frame.toScreen(points[i]);
    const bool isInner = points.size() > kLongLine && i > 0 && i + 1 < points.size();
    if (isInner && (at - line.back()).manhattanLength() < 1) continue;
    line << at;
  }
  return line;
}

QPolygonF outlineOf(const MapFrame& frame, const std::array<MapPoint, 4>& corners) {
  QPolygonF line;
  for (const MapPoint& corner : corners) line << frame.toScreen(corner);
  return line;
}

void paintBadge(QPainter& painter, QPointF middle, const QString& text, const QColor& ground) {
  const QRectF box = boxOfBadge(painter, middle, text);
  painter.setPen(QPen(Qt::white, 1));
  painter.setBrush(ground);
  painter.drawRoundedRect(box, box.height() / 2, box.height() / 2);
  painter.drawText(box, Qt::AlignCenter | Qt::TextDontClip, text);
}

QPointF badgeOf(const QPolygonF& outline) {
  QPointF corner = outline.front();
  for (const QPointF& each : outline) {
    if (each.x() + each.y() < corner.x() + corner.y()) corner = each;
  }
  return corner + QPointF(16, 14);
}

void MapDrawing::setScene(MapScene scene) {
  scene_ = std::move(scene);
  placed_.clear();
  for (const MapFeature& feature : scene_.features)
    placed_.push_back({&feature, coverOf(*feature.points), runsOf(feature)});
  std::ranges::stable_sort(placed_, {}, [](const Placed& each) { return layerOf(each.feature->id.kind); });
  if (selection.feature && feature(*selection.feature) == nullptr) selection = {};
}

const MapFeature* MapDrawing::feature(const MapFeatureId& id) const {
  const auto found = std::ranges::find(scene_.features, id, &MapFeature::id);
  return found == scene_.features.end() ? nullptr : &*found;
}

void MapDrawing::paint(QPainter& painter, const MapFrame& frame) const {
  painter.setRenderHint(QPainter::Antialiasing);
  if (shows(MapLayer::gridLines)) paintGridLines(painter, frame);
  Labels labels;
  if (shows(MapLayer::outlines)) paintAreas(painter, frame, labels);
  const MapPoint low = frame.toMap({-40, frame.size.height() + 40});
  const MapPoint high = frame.toMap({frame.size.width() + 40, -40});
  const auto isInView = [&](const QRectF& cover) {
    return cover.left() <= high.east && cover.right() >= low.east && cover.top() <= high.north &&
           cover.bottom() >= low.north;
  };
  const MapFeature* lit = nullptr;
  for (const auto& [feature, cover, runs] : placed_) {
    if (feature->points->empty() || !shows(layerOf(feature->id.kind)) || !isInView(cover)) continue;
    if (selection.feature == feature->id) {
      lit = feature;
    } else {
      paintFeature(painter, frame, *feature, labels);
    }
  }
  if (lit != nullptr) paintFeature(painter, frame, *lit, labels);
  paintLabels(painter, frame, labels);
  if (shows(MapLayer::advice)) paintAdvice(painter, frame);
}

void MapDrawing::paintAdvice(QPainter& painter, const MapFrame& frame) const {
  constexpr int kInside = 3;
  const QColor ground = layerColour(MapLayer::advice);
  for (const AdviceMark& mark : marks) {
    const QPointF place = frame.toScreen(mark.place);
    const QRectF box = boxOfMark(place);
    painter.setPen(QPen(ground, 2));
    painter.drawLine(QPointF(place.x(), box.bottom()), place);
    painter.setBrush(Qt::white);
    painter.drawEllipse(box);
    toolIcon(Tool::advice).paint(&painter, box.toRect().adjusted(kInside, kInside, -kInside, -kInside));
    if (mark.advice.size() > 1)
      paintBadge(painter, box.topRight(), QString::number(mark.advice.size()), ground);
  }
}

void MapDrawing::paintAreas(QPainter& painter, const MapFrame& frame, Labels& labels) const {
  for (const MapArea& area : scene_.areas) {
    if (!area.isPlaced) continue;
    const QPolygonF outline = outlineOf(frame, area.corners);
    const bool isLit = selection.area == area.number;
    const bool isWrong = !area.fault.empty();
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(isLit ? kLit : kHalo, isLit ? 6 : 4));
    painter.drawPolygon(outline);
    painter.setPen(QPen(isWrong ? kFault : layerColour(MapLayer::outlines), isLit ? 2.5 : 1.5,
                        isWrong ? Qt::DashLine : Qt::SolidLine));
    painter.drawPolygon(outline);
    const QString number = QString::number(area.number);
    paintBadge(painter, badgeOf(outline), number, isWrong ? kFault : layerColour(MapLayer::outlines));
    labels.room.take(boxOfBadge(painter, badgeOf(outline), number));
  }
}

// The borders of the cells, of the grid that is on top.
void MapDrawing::paintGridLines(QPainter& painter, const MapFrame& frame) const {
  for (const MapArea& area : scene_.areas) {
    if (!area.isPlaced) continue;
    const double cell = std::min(std::hypot(area.grid.stepJ.east, area.grid.stepJ.north),
                                 std::hypot(area.grid.stepK.east, area.grid.stepK.north));
    if (cell / frame.metresPerPixel < kLeastCell) continue;
    std::array<double, 2> low{static_cast<double>(area.nx), static_cast<double>(area.ny)};
    std::array<double, 2> high{0, 0};
    for (const QPointF& corner :
         {QPointF(0, 0), QPointF(frame.size.width(), 0), QPointF(0, frame.size.height()),
          QPointF(frame.size.width(), frame.size.height())}) {
      const auto point = area.grid.pointOf(frame.toMap(corner));
      for (std::size_t i = 0; i < 2; ++i) {
        low[i] = std::min(low[i], std::floor(point[i]));
        high[i] = std::max(high[i], std::ceil(point[i]) + 1);
      }
    }
    low = {std::max(low[0], 0.0), std::max(low[1], 0.0)};
    high = {std::min(high[0], static_cast<double>(area.nx)), std::min(high[1], static_cast<double>(area.ny))};
    if (low[0] > high[0] || low[1] > high[1]) continue;
    QPainterPath free;
    free.addRect(QRectF({0, 0}, frame.size));
    for (const MapArea& inner : scene_.areas) {
      if (!inner.isPlaced || inner.level <= area.level) continue;
      QPainterPath covered;
      covered.addPolygon(outlineOf(frame, inner.corners));
      free -= covered;
    }
    painter.save();
    painter.setClipPath(free);
    painter.setRenderHint(QPainter::Antialiasing, false);
    painter.setPen(QColor(0, 0, 0, 70));
    for (double j = low[0]; j <= high[0]; ++j)
      painter.drawLine(frame.toScreen(area.grid.at(j - 0.5, low[1] - 0.5)),
                       frame.toScreen(area.grid.at(j - 0.5, high[1] - 0.5)));
    for (double k = low[1]; k <= high[1]; ++k)
      painter.drawLine(frame.toScreen(area.grid.at(low[0] - 0.5, k - 0.5)),
                       frame.toScreen(area.grid.at(high[0] - 0.5, k - 0.5)));
    painter.restore();
  }
}

void MapDrawing::paintFeature(QPainter& painter, const MapFrame& frame, const MapFeature& feature,
                              Labels& labels) const {
  const QPolygonF line = onScreen(frame, *feature.points);
  const bool isLit = selection.feature == feature.id;
  const bool isWrong = !feature.fault.empty();
  const QColor colour = isWrong ? kFault : featureColour(feature);
  const double width = feature.id.kind == MapKind::boundary ? 5 : 2;
  const auto drawLine = [&] {
    painter.setBrush(Qt::NoBrush);
    feature.closed ? painter.drawPolygon(line) : painter.drawPolyline(line);
  };
  if (feature.joined && line.size() > 1) {
    painter.setPen(QPen(isLit ? kLit : kHalo, width + (isLit ? 5 : 2), Qt::SolidLine, Qt::RoundCap));
    drawLine();
    if (feature.closed) {
      QColor inside = colour;
      inside.setAlpha(36);
      painter.setPen(Qt::NoPen);
      painter.setBrush(inside);
      painter.drawPolygon(line);
    }
    painter.setPen(QPen(colour, width, isWrong ? Qt::DashLine : Qt::SolidLine, Qt::FlatCap));
    drawLine();
  }
  paintMarks(painter, feature, line, colour);
  addLabel(frame, feature, line, colour, labels);
  if (isLit) paintHandles(painter, frame, *feature.points);
}

// The marks of points and arrows.
void MapDrawing::paintMarks(QPainter& painter, const MapFeature& feature, const QPolygonF& line,
                            const QColor& colour) const {
  constexpr double kRadius = 4.5;
  constexpr double kArrow = 9;
  const bool isLit = selection.feature == feature.id;
  painter.setPen(QPen(isLit ? kLit : Qt::white, isLit ? 3 : 1.5));
  painter.setBrush(colour);
  switch (feature.id.kind) {
    case MapKind::source: {
      // Into the water from above, and out of it upwards.
      const auto arrow = [&](QPointF point, bool isSink) {
        const QPointF above = point - QPointF(0, 3 * kArrow);
        const QPointF from = isSink ? point - QPointF(0, kRadius) : above;
        const QPointF to = isSink ? above : point - QPointF(0, kRadius);
        painter.drawEllipse(point, kRadius, kRadius);
        painter.save();
        painter.setPen(QPen(colour, 2.5));
        painter.drawLine(from, to);
        painter.drawPolygon(arrowHead(from, to, kArrow));
        painter.restore();
      };
      arrow(line.front(), feature.drive == MapDrive::sink);
      if (line.size() > 1) {
        arrow(line.back(), true);
        painter.drawPolygon(arrowHead(line.back(), (line.front() + line.back()) / 2, kArrow));
      }
      break;
    }
    case MapKind::outputPoints:
      for (const QPointF& point : line) painter.drawRect(QRectF(point.x() - 4, point.y() - 4, 8, 8));
      break;
    case MapKind::culvert:
      for (const QPointF& point : {line.front(), line.back()})
        painter.drawRect(QRectF(point.x() - 3, point.y() - 3, 6, 6));
      break;
    default:
      if (line.size() == 1 || !feature.joined)
        for (const QPointF& point : line) painter.drawEllipse(point, 3, 3);
  }
}

QRect MapDrawing::Room::squaresOf(const QRectF& box) {
  constexpr double kSquare = 64;  // pixels
  const auto square = [](double at) { return static_cast<int>(std::floor(at / kSquare)); };
  return {QPoint(square(box.left()), square(box.top())), QPoint(square(box.right()), square(box.bottom()))};
}

void MapDrawing::Room::take(const QRectF& box) {
  const QRect squares = squaresOf(box);
  for (int x = squares.left(); x <= squares.right(); ++x) {
    for (int y = squares.top(); y <= squares.bottom(); ++y) taken_[{x, y}] << box;
  }
}

bool MapDrawing::Room::isFree(const QRectF& box) const {
  const QRect squares = squaresOf(box);
  for (int x = squares.left(); x <= squares.right(); ++x) {
    for (int y = squares.top(); y <= squares.bottom(); ++y) {
      const auto found = taken_.find({x, y});
      if (found != taken_.end() &&
          std::ranges::any_of(*found, [&](const QRectF& each) { return each.intersects(box); }))
        return false;
    }
  }
  return true;
}

void MapDrawing::addLabel(const MapFrame& frame, const MapFeature& feature, const QPolygonF& line,
                          const QColor& colour, Labels& labels) const {
  constexpr double kLabelled = 40;  // pixels
  constexpr double kMark = 6;
  const bool isLit = selection.feature == feature.id;
  const bool isOfPoints = feature.id.kind == MapKind::source || feature.id.kind == MapKind::outputPoints;
  if (isOfPoints) {
    const QRectF view({0, 0}, frame.size);
    for (const QPointF& point : line) {
      const QRectF mark(point.x() - kMark, point.y() - kMark, 2 * kMark, 2 * kMark);
      if (mark.intersects(view)) labels.room.take(mark);
    }
  }
  const bool isWide = line.boundingRect().width() + line.boundingRect().height() > kLabelled;
  const bool isKept = feature.id.kind == MapKind::boundary;
  if (feature.label.empty() || !(isWide || isLit || isKept || line.size() == 1)) return;
  QPointF place = line.size() == 2 ? (line.front() + line.back()) / 2 : line[line.size() / 2];
  if (isOfPoints) place = line.front();
  if (feature.closed) place = line.boundingRect().center();
  labels.all.push_back({place, QString::fromStdString(feature.label), colour, isOfPoints, isLit, isKept});
}

// Where a label may stand, from its place on, the nearest first; one that is kept also further away.
std::vector<QPointF> MapDrawing::shiftsOf(const Label& label, QSizeF size) {
  constexpr double kApart = 10;
  constexpr int kFarthest = 12;  // sizes of the label
  const QPointF aside(size.width() / 2 + kApart, 0);
  const QPointF above(0, -(label.isBeside ? 2 : 1) * size.height());
  std::vector<QPointF> shifts{QPointF(), above, -above, aside, -aside};
  if (label.isBeside) shifts = {aside, -aside, above, -above, aside + above};
  for (int ring = 1; label.isKept && ring <= kFarthest; ++ring) {
    for (const auto& [across, up] :
         {std::pair{1, 0}, {-1, 0}, {0, 1}, {0, -1}, {1, 1}, {-1, -1}, {1, -1}, {-1, 1}})
      shifts.emplace_back(ring * across * size.width(), ring * up * size.height());
  }
  return shifts;
}

// The one that is lit up first, then those that are kept. What else has no room but on another one is left
// out, until one looks closer.
void MapDrawing::paintLabels(QPainter& painter, const MapFrame& frame, Labels& labels) {
  const QRectF all({0, 0}, frame.size);
  std::ranges::stable_sort(labels.all, {}, [](const Label& label) {
    return label.isLit ? 0 : label.isKept ? 1 : 2;
  });
  for (const Label& label : labels.all) {
    const QRectF box = boxOfBadge(painter, label.place, label.text);
    if (!box.intersects(all)) continue;
    const std::vector<QPointF> shifts = shiftsOf(label, box.size());
    const auto free = std::ranges::find_if(shifts, [&](QPointF shift) {
      const QRectF there = box.translated(shift);
      return (!label.isKept || all.contains(there)) && labels.room.isFree(there);
    });
    if (free == shifts.end() && !label.isLit && !label.isKept) continue;
    const QPointF shift = free == shifts.end() ? shifts.front() : *free;
    if (std::hypot(shift.x(), shift.y()) > box.width() + box.height()) {
      painter.setPen(QPen(label.colour, 1));
      painter.drawLine(label.place, label.place + shift);
    }
    paintBadge(painter, label.place + shift, label.text, label.colour);
    labels.room.take(box.translated(shift));
  }
}

// What can be grasped of the feature that is lit up; of a long one only a point that is chosen.
void MapDrawing::paintHandles(QPainter& painter, const MapFrame& frame,
                              const std::vector<MapPoint>& points) const {
  for (std::size_t i = 0; i < points.size(); ++i) {
    const bool isChosen = selection.vertex == i;
    if (points.size() > kLongLine && !isChosen) continue;
    const QPointF point = frame.toScreen(points[i]);
    painter.setPen(QPen(Qt::black, 1));
    painter.setBrush(isChosen ? kLit : QColor(Qt::white));
    painter.drawRect(QRectF(point.x() - 3.5, point.y() - 3.5, 7, 7));
  }
}

void MapDrawing::paintLegend(QPainter& painter, const MapFrame& frame, const TerrainStyle& style,
                             const std::optional<TerrainScale>& scale) const {
  if (!shows(MapLayer::legend)) return;
  constexpr double kMargin = 14;
  const double right = frame.size.width() - kMargin;
  const double bottom = frame.size.height() - kMargin;
  painter.setRenderHint(QPainter::Antialiasing);

  const double metres = roundBelow(frame.size.width() / 4 * frame.metresPerPixel);
  const double length = metres / frame.metresPerPixel;
  constexpr int kParts = 4;  // black and white in turn, which are seen on any ground
  for (int i = 0; i < kParts; ++i) {
    painter.setPen(QPen(Qt::black, 1));
    painter.setBrush(i % 2 == 0 ? Qt::black : Qt::white);
    painter.drawRect(QRectF(kMargin + length * i / kParts, bottom - 3, length / kParts, 6));
  }
  painter.setPen(QPen(kHalo, 1));
  painter.setBrush(Qt::NoBrush);
  painter.drawRect(QRectF(kMargin, bottom - 3, length, 6).adjusted(-1, -1, 1, 1));
  paintLegendText(painter, {kMargin + length / 2, bottom - 14}, lengthText(metres), Qt::AlignHCenter);
  paintLegendText(painter, {right, bottom}, QString::fromStdString(scene_.projection), Qt::AlignRight);

  const QPointF top(right - 10, kMargin);
  painter.setPen(QPen(Qt::white, 1));
  painter.setBrush(Qt::black);
  painter.drawPolygon(QPolygonF{{top, top + QPointF(8, 28), top + QPointF(0, 21), top + QPointF(-8, 28)}});
  paintLegendText(painter, top + QPointF(0, 38), "N", Qt::AlignHCenter);

  if (!scale || !shows(MapLayer::terrain)) return;
  constexpr int kBar = 130;
  const QRectF bar(right - 14, kMargin + 74, 14, kBar);
  if (bar.bottom() <= bottom - 30) paintScale(painter, bar, style.colours, *scale);
}

// With round numbers beside it.
void MapDrawing::paintScale(QPainter& painter, const QRectF& bar, TerrainColours colours,
                            const TerrainScale& scale) {
  for (int y = 0; y < bar.height(); ++y)
    painter.fillRect(QRectF(bar.left(), bar.top() + y, bar.width(), 1.5),
                     QColor(terrainColour(colours, 1 - y / (bar.height() - 1))));
  painter.setPen(Qt::black);
  painter.setBrush(Qt::NoBrush);
  painter.drawRect(bar);
  paintLegendText(painter, {bar.right(), bar.top() - 13}, "m", Qt::AlignRight);
  constexpr double kTicks = 3;  // at least
  const double least = scale.least;
  const double range = scale.greatest - least;
  if (!(range > 0)) return;
  const double step = roundBelow(range / kTicks);
  const int digits = std::max(0, -static_cast<int>(std::floor(std::log10(step))));
  for (double n = std::ceil(least / step); n * step <= scale.greatest; ++n) {
    const double y = bar.bottom() - bar.height() * (n * step - least) / range;
    painter.setPen(QPen(Qt::black, 1));
    painter.drawLine(QPointF(bar.left() - 3, y), QPointF(bar.left(), y));
    paintLegendText(painter, {bar.left() - 8, y}, QString::number(n == 0 ? 0 : n * step, 'f', digits),
                    Qt::AlignRight);
  }
}

MapDrawing::Nearest MapDrawing::nearestOf(const Placed& placed, const MapFrame& frame, QPointF at) {
  const MapPoint low = frame.toMap(at + QPointF(-kNear, kNear));
  const MapPoint high = frame.toMap(at + QPointF(kNear, -kNear));
  const auto isNear = [&](const QRectF& cover) {
    return cover.left() <= high.east && cover.right() >= low.east && cover.top() <= high.north &&
           cover.bottom() >= low.north;
  };
  Nearest nearest;
  if (!isNear(placed.cover)) return nearest;
  const MapFeature& feature = *placed.feature;
  const std::vector<MapPoint>& points = *feature.points;
  const std::size_t segments =
      feature.joined && points.size() > 1 ? points.size() - (feature.closed ? 0 : 1) : 0;
  double leastToVertex = kNear;
  double leastToSegment = kNear;
  for (std::size_t run = 0; run < placed.runs.size(); ++run) {
    if (!isNear(placed.runs[run])) continue;
    for (std::size_t i = run * kRun; i < std::min((run + 1) * kRun, points.size()); ++i) {
      const QPointF point = frame.toScreen(points[i]);
      if (const double far = distance(at, point); far <= leastToVertex) {
        nearest.vertex = i;
        leastToVertex = far;
      }
      if (i >= segments) continue;
      const double far = distanceToSegment(at, point, frame.toScreen(points[(i + 1) % points.size()]));
      if (far > leastToSegment) continue;
      nearest.segment = i;
      leastToSegment = far;
    }
  }
  return nearest;
}

MapHit MapDrawing::hit(const MapFrame& frame, QPointF at) const {
  MapHit hit;
  for (std::size_t i = marks.size(); shows(MapLayer::advice) && i-- > 0;) {
    if (!boxOfMark(frame.toScreen(marks[i].place)).contains(at)) continue;
    hit.mark = i;
    return hit;
  }
  const auto find = [&](const Placed& placed) {
    if (!shows(layerOf(placed.feature->id.kind))) return false;
    const Nearest nearest = nearestOf(placed, frame, at);
    hit.vertex = nearest.vertex;
    hit.segment = nearest.segment;
    if (!hit.vertex && !hit.segment) return false;
    hit.feature = placed.feature->id;
    return true;
  };
  for (const MapArea& area : scene_.areas) {
    if (area.isPlaced && outlineOf(frame, area.corners).containsPoint(at, Qt::OddEvenFill) &&
        (hit.area == 0 || area.level >= scene_.area(hit.area)->level))
      hit.area = area.number;
  }
  const auto lit = std::ranges::find_if(
      placed_, [this](const Placed& placed) { return selection.feature == placed.feature->id; });
  if (lit != placed_.end() && find(*lit)) return hit;
  for (auto each = placed_.rbegin(); each != placed_.rend(); ++each) {
    if (find(*each)) return hit;
  }
  if (!shows(MapLayer::outlines)) return hit;
  for (auto area = scene_.areas.rbegin(); area != scene_.areas.rend(); ++area) {
    if (!area->isPlaced) continue;
    const QPolygonF outline = outlineOf(frame, area->corners);
    bool isNear = distance(at, badgeOf(outline)) < 2 * kNear;
    for (qsizetype i = 0; i < outline.size(); ++i)
      isNear = isNear || distanceToSegment(at, outline[i], outline[(i + 1) % outline.size()]) < kNear;
    if (!isNear) continue;
    hit.area = area->number;
    hit.isBorder = true;
    return hit;
  }
  return hit;
}

}  // namespace gridbay::shell
