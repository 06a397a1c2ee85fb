#include "shell/import/import_plot.h"

#include <QDateTime>
#include <cmath>
#include <utility>

#include "platform/units/units.h"

namespace gridbay::shell {
namespace {

// Seconds since 1970, as the axis counts.
double secondsOf(const DateTime& moment) {
  constexpr double kSecondsPerDay = 86400;
  constexpr double kFirstDay = 25569;  // 1970-01-01
  return (moment.linear() - kFirstDay) * kSecondsPerDay;
}

// Of a time of the table.
std::vector<double> momentsOf(const SeriesTable& table) {
  const double start = secondsOf(DateTime::of(table.start));
  const CVdUnitConverter converter(table.timeUnit, "s");
  std::vector<double> moments;
  moments.reserve(table.times.size());
  for (const double time : table.times) moments.push_back(start + converter.Convert(time));
  return moments;
}

}  // namespace

ImportPlot::ImportPlot(QWidget* parent) : PlotWidget(parent) {
  auto ticker = QSharedPointer<QCPAxisTickerDateTime>::create();
  ticker->setDateTimeSpec(Qt::UTC);
  ticker->setDateTimeFormat("yyyy-MM-dd\nhh:mm");
  xAxis->setTicker(ticker);
  setMinimumSize(280, 180);
  takeColours();
}

void ImportPlot::setPeriod(const std::optional<Period>& period) {
  if (shade_ != nullptr) removeItem(std::exchange(shade_, nullptr));
  if (period && (*period)[0].valid() && (*period)[1].valid()) {
    shade_ = new QCPItemRect(this);
    for (QCPItemPosition* corner : {shade_->topLeft, shade_->bottomRight}) {
      corner->setTypeX(QCPItemPosition::ptPlotCoords);
      corner->setTypeY(QCPItemPosition::ptAxisRectRatio);
    }
    shade_->topLeft->setCoords(secondsOf((*period)[0]), 0);
    shade_->bottomRight->setCoords(secondsOf((*period)[1]), 1);
    takeColours();
  }
  fit();
}

void ImportPlot::takeColours() {
  PlotWidget::takeColours();
  if (shade_ == nullptr) return;
  constexpr int kFaint = 50;
  QColor shade = palette().color(QPalette::Highlight);
  shade_->setPen(QPen(shade, 1, Qt::DashLine));
  shade.setAlpha(kFaint);
  shade_->setBrush(shade);
}

void ImportPlot::showTable(const SeriesTable& table) {
  clearGraphs();
  const std::vector<double> moments = momentsOf(table);
  for (std::size_t i = 0; i < table.items.size(); ++i) {
    QCPGraph* curve = addGraph();
    curve->setPen(QPen(curveColour(i), 1.5));
    const QunUnit* base = qunBaseUnit(table.items[i].itemType);
    const std::string unit =
        !table.items[i].unit.empty() || base == nullptr ? table.items[i].unit : std::string(base->symbol);
    const QString name = QString::fromStdString(table.items[i].name);
    curve->setName(unit.empty() ? name : QString("%1 [%2]").arg(name, QString::fromStdString(unit)));
    QVector<QCPGraphData> points;
    points.reserve(static_cast<qsizetype>(moments.size()));
    for (std::size_t step = 0; step < moments.size(); ++step)
      points.append({moments[step], table.values[i][step]});
    curve->data()->set(points, true);
  }
  const bool isOne = graphCount() == 1;
  yAxis->setLabel(isOne ? graph(0)->name() : QString());
  legend->setVisible(graphCount() > 1);
  legend->setBrush(palette().brush(QPalette::Base));
  legend->setTextColor(palette().color(QPalette::Text));
  fit();
}

void ImportPlot::showValues(std::size_t item, std::size_t) {
  for (int i = 0; i < graphCount(); ++i) graph(i)->setVisible(item == 0 || i + 1 == static_cast<int>(item));
  replot();
}

// The series and the simulation.
void ImportPlot::fit() {
  rescaleAxes(true);
  if (shade_ != nullptr && graphCount() > 0) {
    xAxis->setRange(std::min(xAxis->range().lower, shade_->topLeft->coords().x()),
                    std::max(xAxis->range().upper, shade_->bottomRight->coords().x()));
  }
  replot();
}

bool ImportPlot::covers(const SeriesTable& table, const Period& period) {
  if (table.times.empty()) return false;
  const CVdUnitConverter converter(table.timeUnit, "s");
  const double start = secondsOf(DateTime::of(table.start));
  constexpr double kTolerance = 0.5;  // seconds
  return start + converter.Convert(table.times.front()) <= secondsOf(period[0]) + kTolerance &&
         start + converter.Convert(table.times.back()) >= secondsOf(period[1]) - kTolerance;
}

}  // namespace gridbay::shell
