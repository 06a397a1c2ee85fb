#include "shell/viewers/series_plot.h"

#include <vector>

namespace gridbay::shell {
SeriesPlot::SeriesPlot(const TsbFile& file, QWidget* parent) : PlotWidget(parent), file_(file) {
  const TsbDefinition& definition = file.definition();
  if (isProfile()) {
    xAxis->setLabel(tr("Along the profile [%1]").arg(QString::fromStdString(definition.axes[0].unit)));
  } else if (definition.time.isCalendar()) {
    auto ticker = QSharedPointer<QCPAxisTickerDateTime>::create();
    ticker->setDateTimeSpec(Qt::UTC);
    ticker->setDateTimeFormat("yyyy-MM-dd\nhh:mm:ss");
    xAxis->setTicker(ticker);
  } else {
    xAxis->setLabel(QString("[%1]").arg(QString::fromStdString(definition.time.unit)));
  }
  connect(this, &QCustomPlot::mouseMove, this, [this](const QMouseEvent* event) {
    emit pointed(textAt(xAxis->pixelToCoord(event->position().x())));
  });
}

void SeriesPlot::setItems(const std::set<std::size_t>& items) {
  items_ = items;
  rebuild();
  fit();
}

void SeriesPlot::showValues(std::size_t item, std::size_t step) {
  items_.insert(item);
  step_ = step;
  rebuild();
  replot();
}

QCPGraph* SeriesPlot::curve(std::size_t item) {
  const TsbDefinition& definition = file_.definition();
  const std::size_t count = isProfile() ? definition.axes[0].points : definition.time.count;
  std::vector<float> values(count);
  const Outcome read = isProfile() ? file_.readSteps(item, step_, values) : file_.readSteps(item, 0, values);
  if (!read) {
    emit failed(QString::fromStdString(read.error()));
    return nullptr;
  }
  const TsbItem& description = definition.items[item - 1];
  QCPGraph* graph = addGraph();
  graph->setPen(QPen(curveColour(item - 1), 1.5));
  graph->setName(itemTitle(description));
  QVector<QCPGraphData> points;
  points.reserve(static_cast<qsizetype>(count));
  for (std::size_t i = 0; i < count; ++i) {
    const double x = isProfile()
                         ? definition.axes[0].first + static_cast<double>(i) * definition.axes[0].spacing
                         : stepValue(definition.time, i);
    const bool missing = values[i] == static_cast<float>(description.deleteValue);
    points.append({x, missing ? qQNaN() : double{values[i]}});
  }
  graph->data()->set(points);
  return graph;
}

void SeriesPlot::rebuild() {
  clearGraphs();
  for (const std::size_t item : items_) curve(item);
  const bool one = graphCount() == 1;
  yAxis->setLabel(one ? graph(0)->name() : QString());
  legend->setVisible(graphCount() > 1);
  legend->setBrush(palette().brush(QPalette::Base));
  legend->setTextColor(palette().color(QPalette::Text));
}

void SeriesPlot::fit() {
  rescaleAxes();
  replot();
}

QString SeriesPlot::textAt(double x) {
  QStringList parts;
  for (int i = 0; i < graphCount(); ++i) {
    const auto found = graph(i)->data()->findBegin(x);
    if (found == graph(i)->data()->constEnd()) continue;
    if (parts.isEmpty()) {
      const TsbTimeAxis& time = file_.definition().time;
      parts << (isProfile() || !time.isCalendar()
                    ? QString::number(found->key)
                    : stepText(time, static_cast<std::size_t>(found - graph(i)->data()->constBegin())));
    }
    parts << QString("%1: %2").arg(graph(i)->name()).arg(found->value);
  }
  return parts.join("   ");
}

}  // namespace gridbay::shell
