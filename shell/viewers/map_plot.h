#pragma once

#include <QTimer>
#include <optional>
#include <vector>

#include "platform/cartography/cartography.h"
#include "shell/viewers/map_sample.h"
#include "shell/viewers/plot_widget.h"

namespace gridbay::shell {

// A map in colours. What is in view is read anew at the resolution of the screen, whatever the grid's size.
class MapPlot final : public PlotWidget {
  Q_OBJECT
 public:
  MapPlot(const TsbFile& file, QWidget* parent);

  void showValues(std::size_t item, std::size_t step) override;
  void fit() override;
  void setMapCoordinates(bool on) override;

  const MapSample& sample() const { return sample_; }
  // What is said of a place on the axes.
  QString textAt(double x, double y);

 protected:
  void resizeEvent(QResizeEvent* event) override;
  void takeColours() override;

 private:
  struct Axis {
    double first;
    double spacing;
    std::size_t points;

    double coordinate(double index) const { return first + index * spacing; }
    std::size_t index(double coordinate) const;
  };
  Axis axis(std::size_t direction) const;
  void placeOnMap();
  void resample(bool newColours);
  void keepSquare();
  std::optional<float> valueAt(std::size_t j, std::size_t k);

  const TsbFile& file_;
  QCPColorMap* map_;
  QCPColorScale* scale_;
  MapSample sample_;
  std::size_t item_ = 1;
  std::size_t step_ = 0;
  bool mapCoordinates_ = false;
  double east_ = 0;  // of the first point, where the file has a place on the map
  double north_ = 0;
  std::optional<CVdCartography> place_;
  std::vector<float> row_;  // the row under the pointer
  std::optional<std::size_t> rowNumber_;
  QTimer resampling_;
};

}  // namespace gridbay::shell
