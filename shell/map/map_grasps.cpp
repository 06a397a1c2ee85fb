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

  void moveTo(MapPoint place) override { pointer_ = place; }
  bool click(MapPoint place) override {
    pointer_ = place;
    if (points_.empty() || points_.back() != place) points_.push_back(place);
    return points_.size() == most_;
  }
  bool finish() override { return points_.size() >= least_; }
  bool stepBack() override {
    if (!points_.empty()) points_.pop_back();
    return !points_.empty();
  }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    if (points_.empty()) return;
    std::vector<MapPoint> points = points_;
    points.push_back(pointer_);
    const QPolygonF line = onScreen(frame, points);
    setPens(painter, false);
    kind_ == MapKind::massBudget ? painter.drawPolygon(line) : painter.drawPolyline(line);
    paintPoints(painter, onScreen(frame, points_));
  }
  QString text() const override {
    const std::optional<MapPick> pick = editor_.pick(pointer_);
    return pick ? QString::fromStdString(pointText(pick->point)) : QString();
  }
  std::string commit() override { return editor_.addFeature(kind_, points_, page_); }

 private:
  MapEditor& editor_;
  MapKind kind_;
  std::size_t least_;
  std::size_t most_;
  std::int32_t page_;
  std::vector<MapPoint> points_;
  MapPoint pointer_;
};

class RectangleGrasp final : public MapGrasp {
 public:
  RectangleGrasp(MapEditor& editor, MapKind kind, MapPoint corner, std::int32_t page)
      : editor_(editor), kind_(kind), page_(page), corner_(corner), opposite_(corner) {}

  void moveTo(MapPoint place) override { opposite_ = place; }
  void paint(QPainter& painter, const MapFrame& frame) const override {
    setPens(painter, false);
    painter.drawRect(QRectF(frame.toScreen(corner_), frame.toScreen(opposite_)).normalized());
  }
  std::string commit() override {
    return corner_ == opposite_ ? std::string() : editor_.addFeature(kind_, {corner_, opposite_}, page_);
  }

 private:
  MapEditor& editor_;
  MapKind kind_;
  std::int32_t page_;
  MapPoint corner_;
  MapPoint opposite_;
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

std::unique_ptr<MapGrasp> graspNestedArea(MapEditor& editor, MapPoint corner,
                                          std::function<void(MapPoint, MapPoint)> wanted) {
  return std::make_unique<NestedAreaGrasp>(editor, corner, std::move(wanted));
}

}  // namespace gridbay::shell
