#pragma once

#include <QWidget>
#include <optional>
#include <vector>

#include "shell/import/terrain_preview.h"

namespace gridbay::shell {

// How often the heights of a raster come, with the land value as a line that is dragged, or moved by the keys
// up and down.
class HeightHistogram final : public QWidget {
  Q_OBJECT
 public:
  explicit HeightHistogram(QWidget* parent);

  // The values; not-a-number does not count.
  void showHeights(const std::vector<float>& heights);
  // From the least height to the greatest; the axis reaches somewhat further.
  float least() const { return least_; }
  float greatest() const { return greatest_; }
  void setLand(std::optional<float> land);
  // Where a height is shown, in pixels from the top.
  double toScreen(double height) const;

  QSize sizeHint() const override { return {150, 420}; }
  QSize minimumSizeHint() const override { return {110, 160}; }

 signals:
  void landDragged(double land);

 protected:
  void paintEvent(QPaintEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;

 private:
  // The ends of the axis: those of the heights, and the land value as long as it is not dragged.
  void fitAxis();
  void moveLand(double land);
  double stepOfAxis() const;

  std::vector<std::size_t> counts_;
  float least_ = 0;
  float greatest_ = 1;
  double bottom_ = 0;
  double top_ = 1;
  std::optional<float> land_;
  bool isDragged_ = false;
};

}  // namespace gridbay::shell
