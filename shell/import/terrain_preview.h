#pragma once

#include <QImage>
#include <QRectF>
#include <QWidget>
#include <optional>

#include "conversion/raster_preview.h"

namespace gridbay::shell {

// The colour of a height: water by its depth below the land value, land by its height above it. The ends of
// the scale are those of the terrain.
class TerrainTint {
 public:
  TerrainTint() = default;
  TerrainTint(float least, float greatest, std::optional<float> land)
      : least_(least), greatest_(greatest), land_(land) {}

  QRgb of(float height) const;
  float least() const { return least_; }
  float greatest() const { return greatest_; }

 private:
  float least_ = 0;
  float greatest_ = 1;
  std::optional<float> land_;
};

// The picture of a raster that is to be imported, with the window that is drawn on it.
class TerrainPreview final : public QWidget {
  Q_OBJECT
 public:
  explicit TerrainPreview(QWidget* parent);

  // Without one there is a text in its place.
  void showPreview(const RasterPreview* preview, const QString& text);
  void setTint(const TerrainTint& tint);
  // Along the axes of the preview.
  void setWindow(const QRectF& window);
  const QRectF& window() const { return window_; }
  // Where a place on the axes is shown.
  QPointF toScreen(QPointF place) const;

  QSize sizeHint() const override { return {420, 420}; }
  QSize minimumSizeHint() const override { return {200, 200}; }

 signals:
  // A rectangle that was drawn; an empty one, by a click, for all of the raster.
  void windowDrawn(const QRectF& window);
  // What lies under the pointer; empty beside the picture.
  void pointed(const QString& text);

 protected:
  void paintEvent(QPaintEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void leaveEvent(QEvent* event) override;

 private:
  QRectF picture() const;  // on the screen
  QPointF toPlace(QPointF screen) const;
  QRectF drawn(QPointF to) const;
  QString textAt(QPointF place) const;
  void paintImage();

  const RasterPreview* preview_ = nullptr;
  QString text_;
  TerrainTint tint_;
  QImage image_;
  bool isStale_ = true;  // the image
  QRectF window_;
  std::optional<QPointF> grasp_;  // where the pointer was pressed, on the screen
  QPointF pointer_;
};

}  // namespace gridbay::shell
