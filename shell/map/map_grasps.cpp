#include "shell/map/map_grasps.h"

#include <QCoreApplication>
#include <algorithm>

#include "shell/map/map_drawing.h"

namespace gridbay::shell {
namespace {

const QColor kHeld(0xFF, 0xC4, 0x00);
const QColor kWrong(0xD3, 0x1C, 0x1C);

void setPens(QPainter& painter, bool isWrong) {
  painter.setRenderHint(QPainter::Antialiasing);
  painter.setPen(QPen(isWrong ? kWrong : kHeld, 2.5, Qt::DashLine));
  QColor inside = isWrong ? kWrong : kHeld;
  inside.setAlpha(40);
  painter.setBrush(inside);
}

void paintPoints(QPainter& painter, const QPolygonF& points) {
  painter.setPen(QPen(Qt::black, 1));
  painter.setBrush(kHeld);
  for (const QPointF& point : points) painter.drawRect(QRectF(point.x() - 3.5, point.y() - 3.5, 7, 7));
}

class AreaGrasp final : public MapGrasp {
 public:
  AreaGrasp(MapEditor& editor, const MapArea& area, MapPoint held)
      : editor_(editor), number_(area.number), first_(area.grid.first), held_(held), wanted_(first_) {}

  void moveTo(MapPoint place) override {
    wanted_ = {first_.east + place.east - held_.east, first_.north + place.north - held_.north};
    place_ = editor_.previewMoveArea(number_, wanted_);
  }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    if (!place_) return;
    setPens(painter, !place_->fault.empty());
    painter.drawPolygon(outlineOf(frame, place_->corners));
  }
  QString text() const override {
    return place_ ? QCoreApplication::translate("Map", "Area %1 at %2")
                        .arg(number_)
                        .arg(QString::fromStdString(pointText(place_->origin)))
                  : QString();
  }
  QString fault() const override { return place_ ? QString::fromStdString(place_->fault) : QString(); }
  std::string commit() override { return place_ ? editor_.moveArea(number_, wanted_) : std::string(); }

 private:
  MapEditor& editor_;
  std::int32_t number_;
  MapPoint first_;
  MapPoint held_;
  MapPoint wanted_;
  std::optional<AreaPlace> place_;
};

class VertexGrasp final : public MapGrasp {
 public:
  VertexGrasp(MapEditor& editor, const MapFeature& feature, std::size_t vertex)
      : editor_(editor),
        id_(feature.id),
        points_(*feature.points),
        closed_(feature.closed),
        joined_(feature.joined),
        vertex_(vertex) {}

  void moveTo(MapPoint place) override {
    wanted_ = place;
    place_ = editor_.previewVertex(id_, vertex_, place);
    points_[vertex_] = place_->place;
  }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    if (!place_) return;
    const QPolygonF line = onScreen(frame, points_);
    setPens(painter, !place_->fault.empty());
    if (closed_) {
      painter.drawPolygon(line);
    } else if (joined_) {
      painter.drawPolyline(line);
    }
    paintPoints(painter, {{frame.toScreen(points_[vertex_])}});
  }
  QString text() const override {
    return place_ && place_->point ? QString::fromStdString(pointText(*place_->point)) : QString();
  }
  QString fault() const override { return place_ ? QString::fromStdString(place_->fault) : QString(); }
  std::string commit() override { return place_ ? editor_.moveVertex(id_, vertex_, wanted_) : std::string(); }

 private:
  MapEditor& editor_;
  MapFeatureId id_;
  std::vector<MapPoint> points_;
  bool closed_;
  bool joined_;
  std::size_t vertex_;
  MapPoint wanted_;
  std::optional<VertexPlace> place_;
};

class NewFeatureGrasp final : public MapGrasp {
 public:
  NewFeatureGrasp(MapEditor& editor, MapKind kind, std::size_t least, std::size_t most, std::int32_t page)
      : editor_(editor), kind_(kind), least_(least), most_(most), page_(page) {}

  void moveTo(MapPoint place) override {
    pointer_ = place;
    lead();
  }
  // A place where it can't be is not taken.
  bool click(MapPoint place) override {
    moveTo(place);
    const bool isOther = points_.empty() || points_.back() != place;
    if (isOther && place_.fault.empty()) points_.push_back(place);
    return points_.size() == most_;
  }
  bool finish() override { return points_.size() >= least_; }
  bool stepBack() override {
    if (!points_.empty()) points_.pop_back();
    if (!points_.empty()) lead();
    return !points_.empty();
  }
  std::size_t clicks() const override { return points_.size(); }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    const QPolygonF line = onScreen(frame, place_.points);
    setPens(painter, !place_.fault.empty());
    kind_ == MapKind::massBudget ? painter.drawPolygon(line) : painter.drawPolyline(line);
    paintPoints(painter, line);
  }
  QString text() const override {
    return place_.point ? QString::fromStdString(pointText(*place_.point)) : QString();
  }
  QString fault() const override { return QString::fromStdString(place_.fault); }
  std::string commit() override { return editor_.addFeature(kind_, points_, page_); }

 private:
  // The next point would be where the pointer is.
  void lead() {
    std::vector<MapPoint> points = points_;
    if (points.empty() || points.back() != pointer_) points.push_back(pointer_);
    place_ = editor_.previewFeature(kind_, points, page_);
  }

  MapEditor& editor_;
  MapKind kind_;
  std::size_t least_;
  std::size_t most_;
  std::int32_t page_;
  std::vector<MapPoint> points_;
  MapPoint pointer_;
  FeaturePlace place_;
};

// What the cell holds now is shown by rings.
class PickGrasp final : public MapGrasp {
 public:
  PickGrasp(MapEditor& editor, const CellPick& cell,
            std::function<void(const std::vector<PickedPlace>&)> picked)
      : editor_(editor), cell_(cell), picked_(std::move(picked)) {
    for (const PickedPlace& held : cell.held) {
      if (const std::optional<MapPoint> place = editor.placeOf(cell, held)) held_.push_back(*place);
    }
  }

  void moveTo(MapPoint place) override {
    pointer_ = place;
    place_ = editor_.placeFor(cell_, place);
    hasPointer_ = true;
  }
  bool click(MapPoint place) override {
    moveTo(place);
    if (place_ && (places_.empty() || clicked_.back() != place)) {
      places_.push_back(*place_);
      clicked_.push_back(place);
    }
    return places_.size() == cell_.most;
  }
  bool finish() override { return !places_.empty() && places_.size() >= cell_.least; }
  bool stepBack() override {
    if (!places_.empty()) {
      places_.pop_back();
      clicked_.pop_back();
    }
    return true;
  }
  std::size_t clicks() const override { return places_.size(); }

  void paint(QPainter& painter, const MapFrame& frame) const override {
    using Shape = CellPick::Shape;
    painter.setRenderHint(QPainter::Antialiasing);
    const QPolygonF held = onScreen(frame, held_);
    paintRings(painter, held);
    if (!hasPointer_) return;
    // The point as it would be stored, where it is one of a grid.
    const std::optional<MapPoint> snapped = place_ ? editor_.placeOf(cell_, *place_) : std::nullopt;
    std::vector<MapPoint> points;
    for (const PickedPlace& place : places_) {
      if (const auto there = editor_.placeOf(cell_, place)) points.push_back(*there);
    }
    const std::size_t made = points.size();
    points.push_back(snapped.value_or(pointer_));
    const QPolygonF line = onScreen(frame, points);
    setPens(painter, !place_.has_value());
    if (cell_.shape == Shape::part && made > 0) {
      painter.drawRect(QRectF(line.front(), line.back()).normalized());
    } else if (cell_.shape == Shape::line && made > 0) {
      painter.drawPolyline(line);
    } else if (cell_.most == 1 && held.size() == 1) {
      painter.drawLine(held.front(), line.back());
    }
    if (place_) paintPoints(painter, line);
  }
  QString text() const override {
    const QString name = QString::fromStdString(cell_.name);
    if (!place_ || cell_.of == CellPick::Of::coordinates) return name;
    return QString("%1: %2").arg(name, QString::fromStdString(pointText(place_->point)));
  }
  QString fault() const override {
    if (!hasPointer_ || place_) return {};
    switch (cell_.of) {
      case CellPick::Of::area:
      case CellPick::Of::border:
        return QCoreApplication::translate("Map", "There is no point of area %1.").arg(cell_.area);
      case CellPick::Of::finest:
        return QCoreApplication::translate("Map", "There is no area.");
      case CellPick::Of::coordinates:
        break;
    }
    return QCoreApplication::translate("Map", "The projection of the cell does not reach there.");
  }
  std::string commit() override {
    picked_(places_);
    return {};
  }

 private:
  static void paintRings(QPainter& painter, const QPolygonF& points) {
    constexpr double kRadius = 8;
    painter.setBrush(Qt::NoBrush);
    for (const auto& [colour, width] : {std::pair(QColor(Qt::black), 4.0), {kHeld, 2.0}}) {
      painter.setPen(QPen(colour, width));
      for (const QPointF& point : points) painter.drawEllipse(point, kRadius, kRadius);
    }
  }

  MapEditor& editor_;
  CellPick cell_;
  std::function<void(const std::vector<PickedPlace>&)> picked_;
  std::vector<MapPoint> held_;
  std::vector<PickedPlace> places_;
  std::vector<MapPoint> clicked_;
  MapPoint pointer_;
  std::optional<PickedPlace> place_;
  bool hasPointer_ = false;
};

class RectangleGrasp final : public MapGrasp {
 public:
  RectangleGrasp(MapEditor& editor, MapKind kind, MapPoint corner, std::int32_t page)
      : editor_(editor), kind_(kind), page_(page), corner_(corner), opposite_(corner) {}

  void moveTo(MapPoint place) override {
    opposite_ = place;
    place_ = editor_.previewFeature(kind_, {corner_, opposite_}, page_);
  }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    if (corner_ == opposite_) return;
    setPens(painter, !place_.fault.empty());
    if (place_.points.size() == 4) {
      painter.drawPolygon(onScreen(frame, place_.points));
    } else {
      painter.drawRect(QRectF(frame.toScreen(corner_), frame.toScreen(opposite_)).normalized());
    }
  }
  QString text() const override {
    return place_.point ? QString::fromStdString(pointText(*place_.point)) : QString();
  }
  QString fault() const override { return QString::fromStdString(place_.fault); }
  std::string commit() override {
    return corner_ == opposite_ ? std::string() : editor_.addFeature(kind_, {corner_, opposite_}, page_);
  }

 private:
  MapEditor& editor_;
  MapKind kind_;
  std::int32_t page_;
  MapPoint corner_;
  MapPoint opposite_;
  FeaturePlace place_;
};

class NestedAreaGrasp final : public MapGrasp {
 public:
  NestedAreaGrasp(MapEditor& editor, MapPoint corner, std::function<void(MapPoint, MapPoint)> wanted)
      : editor_(editor), wanted_(std::move(wanted)), corner_(corner), opposite_(corner) {}

  void moveTo(MapPoint place) override {
    opposite_ = place;
    place_ = editor_.previewNestedArea(corner_, opposite_);
  }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    if (!place_) return;
    setPens(painter, !place_->fault.empty());
    painter.drawPolygon(outlineOf(frame, place_->corners));
    painter.setBrush(Qt::NoBrush);
    painter.setPen(QPen(Qt::white, 1, Qt::DotLine));
    painter.drawRect(QRectF(frame.toScreen(corner_), frame.toScreen(opposite_)).normalized());
  }
  QString text() const override {
    return place_ ? QCoreApplication::translate("Map", "%1 x %2 points at %3 of area %4")
                        .arg(place_->nx)
                        .arg(place_->ny)
                        .arg(QString::fromStdString(pointText(place_->origin)))
                        .arg(place_->enclosing)
                  : QString();
  }
  QString fault() const override { return place_ ? QString::fromStdString(place_->fault) : QString(); }
  std::string commit() override {
    if (!place_) return {};
    if (!place_->fault.empty()) return place_->fault;
    wanted_(corner_, opposite_);
    return {};
  }

 private:
  MapEditor& editor_;
  std::function<void(MapPoint, MapPoint)> wanted_;
  MapPoint corner_;
  MapPoint opposite_;
  std::optional<AreaPlace> place_;
};

}  // namespace

std::unique_ptr<MapGrasp> graspArea(MapEditor& editor, const MapArea& area, MapPoint held) {
  return std::make_unique<AreaGrasp>(editor, area, held);
}

std::unique_ptr<MapGrasp> graspVertex(MapEditor& editor, const MapFeature& feature, std::size_t vertex) {
  return std::make_unique<VertexGrasp>(editor, feature, vertex);
}

std::unique_ptr<MapGrasp> graspNewFeature(MapEditor& editor, MapKind kind, std::size_t least,
                                          std::size_t most, std::int32_t page) {
  return std::make_unique<NewFeatureGrasp>(editor, kind, least, most, page);
}

std::unique_ptr<MapGrasp> graspRectangle(MapEditor& editor, MapKind kind, MapPoint corner,
                                         std::int32_t page) {
  return std::make_unique<RectangleGrasp>(editor, kind, corner, page);
}

std::unique_ptr<MapGrasp> graspPick(MapEditor& editor, const CellPick& cell,
                                    std::function<void(const std::vector<PickedPlace>&)> picked) {
  return std::make_unique<PickGrasp>(editor, cell, std::move(picked));
}

std::unique_ptr<MapGrasp> graspNestedArea(MapEditor& editor, MapPoint corner,
                                          std::function<void(MapPoint, MapPoint)> wanted) {
  return std::make_unique<NestedAreaGrasp>(editor, corner, std::move(wanted));
}

}  // namespace gridbay::shell
