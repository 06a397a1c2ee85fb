// What the user does on the map.

#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMenu>
#include <QMouseEvent>
#include <algorithm>
#include <cmath>
#include <utility>

#include "core/page_id.h"
#include "shell/map/map_canvas.h"

namespace gridbay::shell {
namespace {

constexpr double kDragged = 4;  // pixels that a click may slip
constexpr double kWheelStep = 1.2;
constexpr double kKeyZoom = 1.5;
constexpr double kKeyPan = 60;     // pixels
constexpr double kKeyFinePan = 2;  // with Shift

}  // namespace

// The page of what the tool makes, where there are several; else 0.
std::int32_t MapCanvas::pageOfTool() const {
  switch (tool_) {
    case MapTool::outputPoint:
    case MapTool::outputLine:
    case MapTool::outputArea:
      return static_cast<std::int32_t>(PageId::hdResult);
    case MapTool::moduleOutputPoint:
    case MapTool::moduleOutputLine:
    case MapTool::moduleOutputArea:
      return scene().moduleOutputs;
    default:
      return 0;
  }
}

MapClicks MapCanvas::clicks() const {
  if (tool_ == MapTool::pick) return {pick_.least, pick_.most};
  const PlacingTool* tool = placingTool(tool_);
  return tool == nullptr ? MapClicks{} : tool->clicks;
}

void MapCanvas::setTool(MapTool tool) {
  tool_ = tool;
  drop();
  setCursor(tool == MapTool::select ? Qt::ArrowCursor : Qt::CrossCursor);
  emit toolChanged();
}

void MapCanvas::startPick(const CellPick& cell) {
  pick_ = cell;
  setTool(MapTool::pick);
}

QString MapCanvas::hint() const {
  const std::size_t made = grasp_ ? grasp_->clicks() : 0;
  if (const PlacingTool* tool = placingTool(tool_)) return hintOf(*tool, made);
  if (tool_ != MapTool::pick) return tr("Click to choose; drag points, borders of areas, or the map.");
  using Shape = CellPick::Shape;
  const QString action = pick_.most == 1 ? tr("click on the point")
                         : pick_.shape == Shape::part
                             ? (made == 0 ? tr("click on one corner") : tr("click on the opposite corner"))
                         : made == 0 ? tr("click on the first point")
                                     : tr("click on the next point");
  return hintOf(QString::fromStdString(pick_.name), action, clicks(), made);
}

// What a pick is for is shown from its beginning.
void MapCanvas::drop() {
  grasp_.reset();
  if (tool_ == MapTool::pick && editor_ != nullptr)
    grasp_ =
        graspPick(*editor_, pick_, [this](const std::vector<PickedPlace>& places) { emit picked(places); });
  isPressed_ = false;
  isPanning_ = false;
  isDragged_ = false;
  update();
}

void MapCanvas::mousePressEvent(QMouseEvent* event) {
  last_ = event->position();
  if (editor_ == nullptr) return;
  if (event->button() != Qt::LeftButton && event->button() != Qt::MiddleButton) return;
  // A second button does nothing while the first one is held.
  if (isPressed_ && event->button() != button_ && event->buttons().testFlag(button_)) return;
  pressed_ = event->position();
  button_ = event->button();
  isPressed_ = true;
  isDragged_ = false;
  isPanning_ = event->button() == Qt::MiddleButton;
  if (!isPanning_) startDrag(event->position());
}

// What is under the pointer is held from now on, where it can be dragged.
void MapCanvas::startDrag(QPointF at) {
  const MapPoint place = frame_.toMap(at);
  if (!placesByClicks()) grasp_.reset();
  const PlacingTool* placing = placingTool(tool_);
  if (tool_ == MapTool::nestedArea) {
    grasp_ = graspNestedArea(*editor_, place, [this](MapPoint corner, MapPoint opposite) {
      emit nestedAreaWanted(corner, opposite);
    });
  } else if (placing != nullptr && !placesByClicks()) {
    grasp_ = graspRectangle(*editor_, *placing->kind, place, pageOfTool());
  } else if (tool_ == MapTool::select) {
    const MapHit hit = drawing_.hit(frame_, at);
    if (hit.feature && hit.vertex && hit.feature == drawing_.selection.feature) {
      const MapFeature& feature = *drawing_.feature(*hit.feature);
      drawing_.selection.vertex = hit.vertex;
      forgetPlaced();
      if (feature.isComplete) grasp_ = graspVertex(*editor_, feature, *hit.vertex);
    } else if (!hit.feature && hit.isBorder && hit.area > 1) {
      grasp_ = graspArea(*editor_, *scene().area(hit.area), place);
    }
  }
  update();
}

void MapCanvas::mouseMoveEvent(QMouseEvent* event) {
  const QPointF at = event->position();
  if (std::exchange(isByKeys_, false)) update();
  const QPointF way = at - last_;
  last_ = at;
  emit pointed(textAt(frame_.toMap(at)));
  if (isPressed_ && !isDragged_) isDragged_ = (at - pressed_).manhattanLength() > kDragged;
  const bool isByClicks = placesByClicks();
  if (grasp_ && !isPanning_ && (isDragged_ || isByClicks)) {
    if (!isPressed_ || !isByClicks) {
      grasp_->moveTo(frame_.toMap(at));
      return update();
    }
  }
  if (!isPressed_) return showCursor(at);
  if (!isDragged_) return;
  if (!isPanning_) frame_.pan(at - pressed_ - way);
  isPanning_ = true;
  isFitted_ = false;
  frame_.pan(way);
  standStill_.start();
  setCursor(Qt::ClosedHandCursor);
  requestTerrain();
  update();
}

void MapCanvas::showCursor(QPointF at) {
  if (tool_ != MapTool::select || editor_ == nullptr) return;
  const MapHit hit = drawing_.hit(frame_, at);
  const bool isHeld = (hit.vertex && hit.feature == drawing_.selection.feature) ||
                      (!hit.feature && hit.isBorder && hit.area > 1);
  setCursor(isHeld ? Qt::SizeAllCursor : hit.feature || hit.mark ? Qt::PointingHandCursor : Qt::ArrowCursor);
}

void MapCanvas::mouseReleaseEvent(QMouseEvent* event) {
  if (!isPressed_ || event->button() != button_) return;
  const bool wasPanning = isPanning_;
  const bool wasDragged = isDragged_;
  isPressed_ = false;
  isPanning_ = false;
  isDragged_ = false;
  setCursor(tool_ == MapTool::select ? Qt::ArrowCursor : Qt::CrossCursor);
  if (wasPanning) return update();
  if (grasp_ && !placesByClicks()) {
    if (wasDragged) {
      grasp_->moveTo(frame_.toMap(event->position()));
      return complete();
    }
    grasp_.reset();
  }
  click(event->position());
}

void MapCanvas::click(QPointF at) {
  const MapPoint place = frame_.toMap(at);
  if (tool_ == MapTool::select) return chooseAt(at);
  if (!placesByClicks()) return;
  if (const PlacingTool* tool = placingTool(tool_); tool != nullptr && !grasp_)
    grasp_ = graspNewFeature(*editor_, *tool->kind, tool->clicks.least, tool->clicks.most, pageOfTool());
  if (!grasp_) return;
  const bool isDone = grasp_->click(place);
  if (isDone) {
    complete();
  } else if (const QString fault = grasp_->fault(); !fault.isEmpty()) {
    emit failed(fault);
  }
  emit toolChanged();
  update();
}

// Lights up what lies there, and leads to its page.
void MapCanvas::chooseAt(QPointF at) {
  const MapHit hit = drawing_.hit(frame_, at);
  emit adviceChosen(hit.mark ? drawing_.marks[*hit.mark].advice : std::vector<int>());
  if (hit.mark) return;
  forgetPlaced();
  if (const MapFeature* feature = hit.feature ? drawing_.feature(*hit.feature) : nullptr) {
    drawing_.selection = {hit.feature, hit.vertex, 0};
    // The signal may bring another scene.
    const MapFeature chosen = *feature;
    emit featureChosen(chosen);
    return;
  }
  const std::int32_t area = hit.isBorder ? hit.area : 0;
  drawing_.selection = {std::nullopt, std::nullopt, area};
  if (area > 0) emit areaChosen(area);
}

void MapCanvas::complete() {
  const std::unique_ptr<MapGrasp> grasp = std::move(grasp_);
  const PlacingTool* tool = placingTool(tool_);
  if (tool_ == MapTool::pick) setTool(MapTool::select);
  const std::vector<MapFeature> before = scene().features;
  const bool isMade = edit([&grasp] { return grasp->commit(); });
  if (tool != nullptr && tool->kind && isMade) chooseMade(*tool->kind, before);
}

// The one that is not as any was before.
void MapCanvas::chooseMade(MapKind kind, const std::vector<MapFeature>& before) {
  const auto wasThere = [&before](const MapFeature& feature) {
    return std::ranges::any_of(before, [&feature](const MapFeature& each) {
      return each.id == feature.id && *each.points == *feature.points;
    });
  };
  const auto isMade = [&](const MapFeature& feature) {
    return feature.id.kind == kind && !wasThere(feature);
  };
  const auto found = std::ranges::find_if(scene().features, isMade);
  if (found == scene().features.end()) return;
  const MapFeature made = *found;
  selectFeature(made.id);
  emit featureMade(made);
}

bool MapCanvas::edit(const std::function<std::string()>& change) {
  emit editing();
  const std::string fault = change();
  if (!fault.empty()) emit failed(QString::fromStdString(fault));
  emit edited();
  refresh();
  return fault.empty();
}

bool MapCanvas::hasAllPoints(const MapFeature& feature) {
  if (!feature.isComplete) emit failed(tr("Not all of its points have a place here: edit them on its page."));
  return feature.isComplete;
}

bool MapCanvas::isPolyline(const MapFeature& feature) const {
  switch (feature.id.kind) {
    case MapKind::massBudget:
    case MapKind::dike:
    case MapKind::weir:
    case MapKind::culvert:
    case MapKind::outputPoints:
      return true;
    default:
      return false;
  }
}

void MapCanvas::mouseDoubleClickEvent(QMouseEvent* event) {
  if (editor_ == nullptr || event->button() != Qt::LeftButton) return;
  if (placesByClicks()) {
    if (grasp_ && grasp_->finish()) complete();
    emit toolChanged();
    return;
  }
  const MapHit hit = drawing_.hit(frame_, event->position());
  const MapFeature* feature = hit.feature ? drawing_.feature(*hit.feature) : nullptr;
  if (tool_ != MapTool::select || feature == nullptr || !isPolyline(*feature) || hit.vertex || !hit.segment)
    return;
  if (!hasAllPoints(*feature)) return;
  const MapPoint place = frame_.toMap(event->position());
  if (!edit([&, id = feature->id] { return editor_->insertVertex(id, *hit.segment + 1, place); })) return;
  drawing_.selection.vertex = *hit.segment + 1;
  forgetPlaced();
}

void MapCanvas::wheelEvent(QWheelEvent* event) {
  constexpr double kNotch = 120;
  if (editor_ == nullptr || event->angleDelta().y() == 0) return;
  MapFrame frame = frame_;
  frame.zoom(std::pow(kWheelStep, event->angleDelta().y() / kNotch), event->position());
  setFrame(frame);
  event->accept();
}

// What is held moves along with the middle of the map.
void MapCanvas::pointByKeys() {
  const QPointF middle = QRectF(rect()).center();
  isByKeys_ = true;
  last_ = middle;
  if (grasp_) grasp_->moveTo(frame_.toMap(middle));
  emit pointed(textAt(frame_.toMap(middle)));
  update();
}

void MapCanvas::pressMiddle() {
  if (editor_ == nullptr || isPressed_) return;
  const QPointF middle = QRectF(rect()).center();
  const MapPoint place = frame_.toMap(middle);
  isByKeys_ = true;
  last_ = middle;
  if (grasp_ && !placesByClicks()) {
    if (place.east != heldAt_.east || place.north != heldAt_.north) return complete();
    drop();  // where it was taken: that is a click
    return click(middle);
  }
  startDrag(middle);
  heldAt_ = place;
  if (!grasp_ || placesByClicks()) click(middle);
}

void MapCanvas::keyPressEvent(QKeyEvent* event) {
  MapFrame frame = frame_;
  const double pan = event->modifiers().testFlag(Qt::ShiftModifier) ? kKeyFinePan : kKeyPan;
  switch (event->key()) {
    case Qt::Key_Escape:
      if (grasp_ && (isPressed_ || grasp_->clicks() > 0)) {
        drop();
        emit toolChanged();
      } else {
        setTool(MapTool::select);
      }
      return;
    case Qt::Key_Return:
    case Qt::Key_Enter:
      if (grasp_ && placesByClicks() && grasp_->finish()) complete();
      emit toolChanged();
      return;
    case Qt::Key_Backspace:
      if (grasp_ && placesByClicks()) {
        if (!grasp_->stepBack()) grasp_.reset();
        emit toolChanged();
        return update();
      }
      [[fallthrough]];
    case Qt::Key_Delete:
      if (!grasp_) removeChosen();
      return;
    case Qt::Key_Plus:
    case Qt::Key_Equal:
      zoom(kKeyZoom);
      return pointByKeys();
    case Qt::Key_Minus:
      zoom(1 / kKeyZoom);
      return pointByKeys();
    case Qt::Key_Home:
      fit();
      return pointByKeys();
    case Qt::Key_Space:  // held down it counts once
      if (!event->isAutoRepeat()) pressMiddle();
      return;
    case Qt::Key_Left:
      frame.pan({pan, 0});
      break;
    case Qt::Key_Right:
      frame.pan({-pan, 0});
      break;
    case Qt::Key_Up:
      frame.pan({0, pan});
      break;
    case Qt::Key_Down:
      frame.pan({0, -pan});
      break;
    default:
      return QWidget::keyPressEvent(event);
  }
  setFrame(frame);
  pointByKeys();
}

void MapCanvas::removeChosen() {
  const MapSelection chosen = drawing_.selection;
  const MapFeature* feature = chosen.feature ? drawing_.feature(*chosen.feature) : nullptr;
  if (editor_ == nullptr || feature == nullptr) return;
  const bool isPoint = chosen.vertex && isPolyline(*feature);
  if (isPoint && !hasAllPoints(*feature)) return;
  drawing_.selection.vertex.reset();
  edit([&] {
    return isPoint ? editor_->removeVertex(*chosen.feature, *chosen.vertex)
                   : editor_->removeFeature(*chosen.feature);
  });
}

void MapCanvas::contextMenuEvent(QContextMenuEvent* event) {
  if (editor_ == nullptr || grasp_) return;
  chooseAt(event->pos());
  if (drawing_.hit(frame_, event->pos()).mark) return;
  QMenu menu(this);
  menu.addAction(tr("Whole map"), this, &MapCanvas::fit);
  if (drawing_.selection.feature) {
    const MapFeature* feature = drawing_.feature(*drawing_.selection.feature);
    const bool isPoint = drawing_.selection.vertex && feature != nullptr && isPolyline(*feature);
    menu.addAction(isPoint ? tr("Remove point") : tr("Remove"), this, &MapCanvas::removeChosen);
  }
  menu.exec(event->globalPos());
}

void MapCanvas::leaveEvent(QEvent*) {
  emit pointed({});
}

void MapCanvas::focusOutEvent(QFocusEvent* event) {
  if (std::exchange(isByKeys_, false)) update();
  QWidget::focusOutEvent(event);
}

}  // namespace gridbay::shell
