#pragma once

#include <array>
#include <memory>
#include <optional>

#include "conversion/series_table.h"
#include "core/date_time.h"
#include "shell/viewers/plot_widget.h"

namespace gridbay::shell {

using Period = std::array<DateTime, 2>;

// The items of a table that is about to become a series, with the simulation period shaded.
class ImportPlot final : public PlotWidget {
  Q_OBJECT
 public:
  explicit ImportPlot(QWidget* parent);

  // The period that is shaded; none where it has no moments.
  void setPeriod(const std::optional<Period>& period);

  void showTable(const SeriesTable& table);
  // Shows one item alone (from 1), or all of them (0).
  void showValues(std::size_t item, std::size_t step) override;
  void fit() override;
  // Null where no period is shaded.
  QCPItemRect* shade() { return shade_; }

  // Whether the series lasts from the begin of a period to its end.
  static bool covers(const SeriesTable& table, const Period& period);

 protected:
  void takeColours() override;

 private:
  QCPItemRect* shade_ = nullptr;
};

}  // namespace gridbay::shell
