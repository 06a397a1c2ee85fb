// What the map shows.

#include "shell/map/map_canvas.h"

#include <QElapsedTimer>
#include <QHelpEvent>
#include <QPainter>
#include <QToolTip>
#include <algorithm>
#include <cmath>

#include "map/map_names.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr double kMargin = 0.06;  // of the picture around the whole map
constexpr double kTooCoarse = 6;  // a picture is drawn so much larger at most
constexpr double kSameScale = 1e-9;

// The whole map in a picture of a size, beside the scale of colours.
std::optional<MapFrame> wholeMap(const MapScene& scene, QSizeF size) {
  const std::optional<QRectF> extent = extentOf(scene);
  if (!extent || size.isEmpty()) return std::nullopt;
  constexpr double kScale = 70;        // pixels
  constexpr double kMostScale = 0.15;  // of the width
  const double left = kMargin * size.width();
  const double right = std::max(left, std::min(kScale, kMostScale * size.width()));
  const QSizeF inside(size.width() - left - right, size.height() * (1 - 2 * kMargin));
  const double metres =
      std::max({extent->width() / inside.width(), extent->height() / inside.height(), 1e-3});
  return MapFrame{{extent->center().x() + (right - left) / 2 * metres, extent->center().y()}, metres, size};
}

QString textOf(std::string_view name) {
  return QString::fromUtf8(name.data(), static_cast<qsizetype>(name.size()));
}

bool isSame(const std::vector<TerrainArea>& a, const std::vector<TerrainArea>& b) {
  return std::ranges::equal(a, b, [](const TerrainArea& x, const TerrainArea& y) {
    return x.values == y.values && x.grid == y.grid && x.landValue == y.landValue;
  });
}

}  // namespace

MapCanvas::MapCanvas(QWidget* parent)
    : QWidget(parent), worker_(new TerrainWorker(this)), backgrounds_(new MapBackgrounds(this)) {
  setFocusPolicy(Qt::StrongFocus);
  setMouseTracking(true);
  setAccessibleName(tr("Map"));
  setAttribute(Qt::WA_OpaquePaintEvent);
  frame_.size = size();
  connect(worker_, &TerrainWorker::painted, this, &MapCanvas::takePicture);
  connect(backgrounds_, &MapBackgrounds::painted, this, qOverload<>(&QWidget::update));
  constexpr int kMoment = 80;  // milliseconds
  standStill_.setSingleShot(true);
  standStill_.setInterval(kMoment);
  connect(&standStill_, &QTimer::timeout, this, qOverload<>(&QWidget::update));
}

void MapCanvas::forgetPlaced() {
  placed_ = QPixmap();
  update();
}

void MapCanvas::paintPlaced(QPainter& painter) {
  constexpr double kSlow = 8;  // milliseconds
  const bool isCurrent = !placed_.isNull() && placedFrame_ == frame_;
  const bool isMoving = !placed_.isNull() && placedCost_ > kSlow && standStill_.isActive();
  if (!isCurrent && !isMoving) {
    QElapsedTimer timer;
    timer.start();
    placed_ = QPixmap(size() * devicePixelRatio());
    placed_.setDevicePixelRatio(devicePixelRatio());
    placed_.fill(Qt::transparent);
    QPainter onPicture(&placed_);
    drawing_.paint(onPicture, frame_);
    placedFrame_ = frame_;
    placedCost_ = static_cast<double>(timer.nsecsElapsed()) * 1e-6;
  }
  if (placedFrame_ == frame_) {
    painter.drawPixmap(0, 0, placed_);
  } else if (placedFrame_.metresPerPixel == frame_.metresPerPixel) {
    painter.drawPixmap(placedFrame_.in(frame_).topLeft().toPoint(), placed_);
  } else {
    painter.drawPixmap(placedFrame_.in(frame_), placed_, QRectF(placed_.rect()));
  }
}

void MapCanvas::showMap(MapEditor* editor, const std::optional<MapFrame>& frame) {
  // The editor that was shown may be gone.
  setTool(MapTool::select);
  editor_ = editor;
  drawing_.selection = {};
  drawing_.setScene({});
  terrain_.clear();
  scale_.reset();
  base_.reset();
  coarse_.reset();
  fine_.reset();
  ++version_;
  isFitted_ = !frame;
  if (frame) {
    frame_ = *frame;
    frame_.size = size();
  }
  refresh();
  update();
}

void MapCanvas::refresh() {
  // A press that has entered what was typed on the page still begins a drag.
  const bool isFresh = isPressed_ && !isDragged_ && !isPanning_ && editor_ != nullptr;
  if (isPressed_ && !isFresh) drop();
  forgetPlaced();
  if (editor_ == nullptr) return emit sceneChanged();
  drawing_.setScene(editor_->scene());
  if (isFresh && !placesByClicks()) startDrag(pressed_);
  std::vector<TerrainArea> terrain = store_.find(scene());
  if (isFitted_) {
    if (const std::optional<MapFrame> whole = wholeMap(scene(), size())) frame_ = *whole;
  }
  if (!isSame(terrain, terrain_)) {
    terrain_ = std::move(terrain);
    ++version_;
    if (terrain_.empty()) {
      for (std::optional<TerrainPicture>* each : {&base_, &coarse_, &fine_}) each->reset();
      scale_ = style_.scale;
    }
    requestBase();
  }
  requestTerrain();
  update();
  emit sceneChanged();
}

void MapCanvas::fit() {
  isFitted_ = true;
  if (const std::optional<MapFrame> whole = wholeMap(scene(), size())) frame_ = *whole;
  requestTerrain();
  update();
}

void MapCanvas::zoom(double factor) {
  MapFrame frame = frame_;
  frame.zoom(factor, QRectF(rect()).center());
  setFrame(frame);
}

void MapCanvas::setFrame(const MapFrame& frame) {
  isFitted_ = false;
  frame_ = frame;
  frame_.size = size();
  standStill_.start();
  requestTerrain();
  update();
}

void MapCanvas::selectFeature(const std::optional<MapFeatureId>& id, std::int32_t area) {
  const std::optional<std::size_t> vertex =
      id && drawing_.selection.feature == id ? drawing_.selection.vertex : std::nullopt;
  const MapSelection chosen{id, vertex, area};
  if (chosen == drawing_.selection) return;
  drawing_.selection = chosen;
  forgetPlaced();
}

void MapCanvas::setMarks(std::vector<AdviceMark> marks) {
  if (marks == drawing_.marks) return;
  drawing_.marks = std::move(marks);
  forgetPlaced();
  update();
}

void MapCanvas::setLayer(MapLayer layer, bool on) {
  drawing_.layers.set(placeOf(layer), on);
  forgetPlaced();
  requestTerrain();
}

void MapCanvas::setStyle(const TerrainStyle& style) {
  if (style == style_) return;
  const bool wasFixed = style_.scale.has_value();
  style_ = style;
  ++version_;
  if (style_.scale) scale_ = style_.scale;
  if (wasFixed && !style_.scale) scale_.reset();
  requestBase();
  requestTerrain();
  emit scaleChanged();
}

void MapCanvas::requestBase() {
  const double ratio = devicePixelRatio();
  std::optional<MapFrame> frame = wholeMap(scene(), QSizeF(size()) * ratio);
  if (!frame || terrain_.empty()) return;
  TerrainRequest request{terrain_, *frame, style_, true, version_};
  worker_->paint(std::move(request));
}

void MapCanvas::requestTerrain() {
  if (editor_ != nullptr) backgrounds_->request(frame_, scene().projectionText);
  if (terrain_.empty() || !drawing_.layers.test(placeOf(MapLayer::terrain)) || size().isEmpty()) return;
  const double ratio = devicePixelRatio();
  MapFrame frame = frame_;
  frame.size *= ratio;
  frame.metresPerPixel /= ratio;
  if (fine_ && fine_->version == version_ && fine_->frame == frame) return;
  TerrainRequest request{terrain_, frame, style_, false, version_};
  if (!request.style.scale) request.style.scale = scale_;
  worker_->paint(std::move(request));
}

void MapCanvas::takePicture(const TerrainPicture& picture) {
  if (picture.version != version_) return;
  for (std::optional<TerrainPicture>* each : {&base_, &coarse_, &fine_}) {
    if (*each && (*each)->version != version_) each->reset();
  }
  const bool isNewScale = picture.isBase && !style_.scale && scale_ != picture.scale;
  if (isNewScale || !scale_) {
    scale_ = picture.scale;
    emit scaleChanged();
  }
  (picture.isBase ? base_ : picture.isFinal ? fine_ : coarse_) = picture;
  if (!picture.isBase && picture.isFinal) coarse_.reset();
  if (isNewScale) {
    fine_.reset();
    requestTerrain();
  }
  update();
}

bool MapCanvas::isSettled() const {
  const bool movesAlong = standStill_.isActive() && !placed_.isNull() && placedFrame_ != frame_;
  if (!backgrounds_->isSettled() || movesAlong) return false;
  if (terrain_.empty() || !drawing_.layers.test(placeOf(MapLayer::terrain))) return true;
  const double ratio = devicePixelRatio();
  return fine_ && fine_->version == version_ && worker_->isIdle() && fine_->frame.centre == frame_.centre &&
         std::abs(fine_->frame.metresPerPixel * ratio - frame_.metresPerPixel) < kSameScale;
}

void MapCanvas::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.fillRect(rect(), blend(palette().color(QPalette::Base), palette().color(QPalette::Text), 0.08));
  if (editor_ == nullptr || !extentOf(scene())) {
    painter.setPen(quietText(palette()));
    painter.drawText(
        rect(), Qt::AlignCenter | Qt::TextWordWrap,
        editor_ == nullptr ? tr("No setup is open.") : tr("No area has a grid with a place yet."));
    return;
  }
  backgrounds_->paint(painter, frame_, false);
  if (drawing_.layers.test(placeOf(MapLayer::terrain))) paintTerrain(painter);
  backgrounds_->paint(painter, frame_, true);
  paintPlaced(painter);
  if (grasp_) grasp_->paint(painter, frame_);
  drawing_.paintLegend(painter, frame_, style_, terrain_.empty() ? std::nullopt : scale_);
  if (isByKeys_) paintCross(painter);
  paintHeldText(painter);
  paintFaults(painter);
}

// The place that keys point at.
void MapCanvas::paintCross(QPainter& painter) {
  constexpr double kArm = 9;
  const QPointF middle = QRectF(rect()).center();
  for (const QPen& pen : {QPen(Qt::white, 4), QPen(Qt::black, 1.5)}) {
    painter.setPen(pen);
    painter.drawLine(middle - QPointF(kArm, 0), middle + QPointF(kArm, 0));
    painter.drawLine(middle - QPointF(0, kArm), middle + QPointF(0, kArm));
  }
}

// What can't be shown, and why, on a ground of its own.
void MapCanvas::paintFaults(QPainter& painter) {
  QStringList lines = store_.faults();
  for (const MapArea& area : scene().areas) {
    const QString fault = QString::fromStdString(area.fault);
    if (!area.isPlaced && !lines.contains(fault)) lines << fault;
  }
  for (const MapBackground& each : backgrounds_->all()) {
    const QString told = MapBackgrounds::told(each);
    if (each.isShown && !told.isEmpty()) lines << told;
  }
  if (lines.isEmpty()) return;
  constexpr int kRoom = 60;  // for the arrow and the scale
  const int flags = Qt::AlignTop | Qt::AlignLeft | Qt::TextWordWrap;
  const QRect room = rect().adjusted(10, 8, -kRoom, -8);
  const QString text = lines.join('\n');
  painter.fillRect(painter.boundingRect(room, flags, text).adjusted(-6, -3, 6, 3),
                   palette().color(QPalette::Base));
  painter.setPen(faultColour(palette()));
  painter.drawText(room, flags, text);
}

// From the coarsest to the finest; what is covered is left out.
void MapCanvas::paintTerrain(QPainter& painter) {
  const QRectF all(rect());
  const auto covers = [&](const std::optional<TerrainPicture>& picture) {
    return picture && picture->frame.in(frame_).adjusted(-1, -1, 1, 1).contains(all);
  };
  const auto draw = [&](const std::optional<TerrainPicture>& picture) {
    if (!picture) return;
    const QRectF place = picture->frame.in(frame_);
    if (!place.intersects(all)) return;
    if (std::abs(place.width() - picture->image.width()) < 0.5) {
      painter.drawImage(place.topLeft().toPoint(), picture->image);
      return;
    }
    // No more of it than what is in view.
    const QRectF shown = place.intersected(all.adjusted(-1, -1, 1, 1));
    const double scale = picture->image.width() / place.width();
    const QRectF source((shown.topLeft() - place.topLeft()) * scale, shown.size() * scale);
    painter.drawImage(shown, picture->image, source);
  };
  const bool isFineUsable =
      fine_ && fine_->frame.metresPerPixel * devicePixelRatio() < kTooCoarse * frame_.metresPerPixel;
  const bool isFineAll = isFineUsable && covers(fine_);
  const bool isCoarseAll = covers(coarse_);
  if (!isFineAll && !isCoarseAll) draw(base_);
  if (!isFineAll) draw(coarse_);
  if (isFineUsable) draw(fine_);
  if (!fine_ && !coarse_) draw(base_);
}

void MapCanvas::paintHeldText(QPainter& painter) {
  if (!grasp_) return;
  const QString fault = grasp_->fault();
  const QString text = fault.isEmpty() ? grasp_->text() : fault;
  if (text.isEmpty()) return;
  const double half = painter.fontMetrics().horizontalAdvance(text) / 2.0 + 8;
  const QPointF middle(std::clamp(last_.x(), half, std::max(half, width() - half)),
                       std::max(20.0, last_.y() - 24));
  paintBadge(painter, middle, text, fault.isEmpty() ? QColor(0x30, 0x30, 0x30) : QColor(0xD3, 0x1C, 0x1C));
}

void MapCanvas::resizeEvent(QResizeEvent*) {
  frame_.size = size();
  if (isFitted_) {
    fit();
  } else {
    requestTerrain();
  }
  if (!base_) requestBase();
}

bool MapCanvas::event(QEvent* event) {
  if (event->type() == QEvent::ToolTip) {
    const auto* help = static_cast<QHelpEvent*>(event);
    const QString tip = tipAt(help->pos());
    if (tip.isEmpty()) {
      QToolTip::hideText();
    } else {
      QToolTip::showText(help->globalPos(), tip, this);
    }
    return true;
  }
  return QWidget::event(event);
}

QString MapCanvas::tipAt(QPointF at) const {
  const MapHit hit = drawing_.hit(frame_, at);
  if (hit.mark) return drawing_.marks[*hit.mark].tip;
  QStringList lines;
  if (const MapFeature* feature = hit.feature ? drawing_.feature(*hit.feature) : nullptr) {
    lines << tr("%1 %2").arg(textOf(kindName(feature->id.kind))).arg(feature->id.number);
    if (const QString drive = textOf(driveName(feature->drive)); !drive.isEmpty())
      lines.back() += ": " + drive;
    if (!feature->fault.empty()) lines << QString::fromStdString(feature->fault);
  } else if (const MapArea* area = hit.isBorder ? scene().area(hit.area) : nullptr) {
    lines << tr("Area %1: %2 x %3 points").arg(area->number).arg(area->nx).arg(area->ny);
    if (area->offBy && *area->offBy >= 0.01)
      lines << tr("its file's own coordinates are %1 m from here").arg(*area->offBy, 0, 'f', 2);
    if (!area->fault.empty()) lines << QString::fromStdString(area->fault);
  }
  return lines.join('\n');
}

QString MapCanvas::textAt(MapPoint place) const {
  if (editor_ == nullptr) return {};
  QString text = tr("E %1  N %2").arg(place.east, 0, 'f', 1).arg(place.north, 0, 'f', 1);
  if (const auto geographic = editor_->geographic(place))
    text += tr("   lon %1°  lat %2°").arg((*geographic)[0], 0, 'f', 5).arg((*geographic)[1], 0, 'f', 5);
  const std::optional<MapPick> pick = editor_->pick(place);
  const MapArea* area = pick ? scene().area(pick->area) : nullptr;
  if (area == nullptr) return text;
  text += tr("   area %1 %2").arg(area->number).arg(QString::fromStdString(pointText(pick->point)));
  const std::optional<float> value = store_.valueAt(*area, pick->point);
  if (!value) return text + tr("   no value");
  text += tr("   %1 m").arg(*value);
  return *value >= area->landValue ? text + tr(" (land)") : text;
}

}  // namespace gridbay::shell
