#pragma once

#include <set>

#include "platform/tsb/tsb_file.h"
#include "shell/viewers/plot_widget.h"

namespace gridbay::shell {

// Curves of a data file without a map: items against time, or along a profile at a time step.
class SeriesPlot final : public PlotWidget {
  Q_OBJECT
 public:
  SeriesPlot(const TsbFile& file, QWidget* parent);

  void showValues(std::size_t item, std::size_t step) override;
  void fit() override;
  // Which items (from 1) have a curve.
  void setItems(const std::set<std::size_t>& items);

 private:
  bool isProfile() const { return !file_.definition().axes.empty(); }
  QCPGraph* curve(std::size_t item);
  QString textAt(double x);
  void rebuild();

  const TsbFile& file_;
  std::set<std::size_t> items_{1};
  std::size_t step_ = 0;
};

}  // namespace gridbay::shell
