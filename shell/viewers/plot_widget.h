#pragma once

#include <qcustomplot.h>

#include <QString>

#include "platform/tsb/tsb_types.h"

namespace gridbay::shell {

// A view of a data file's values: what the window around it needs of any kind.
class PlotWidget : public QCustomPlot {
  Q_OBJECT
 public:
  explicit PlotWidget(QWidget* parent);

  // Shows an item (from 1) at a time step (from 0).
  virtual void showValues(std::size_t item, std::size_t step) = 0;
  // All of the data in view again.
  virtual void fit() = 0;
  // Coordinates of the map along the axes, or else numbers of grid points.
  virtual void setMapCoordinates(bool) {}

 signals:
  // What lies under the pointer.
  void pointed(const QString& text);
  void failed(const QString& text);

 protected:
  void changeEvent(QEvent* event) override;
  virtual void takeColours();
  void colour(QCPAxis& axis) const;
};

// The colour of a curve by its place (from 0).
QColor curveColour(std::size_t place);
// "Water level [m]"
QString itemTitle(const TsbItem& item);
// The time of a step as people write it.
QString stepText(const TsbTimeAxis& time, std::size_t step);
// Seconds since 1970 of a step of a calendar axis; else the axis's own value.
double stepValue(const TsbTimeAxis& time, std::size_t step);

}  // namespace gridbay::shell
