#include "shell/viewers/plot_widget.h"

#include <QDateTime>
#include <array>

#include "platform/units/units.h"

namespace gridbay::shell {

PlotWidget::PlotWidget(QWidget* parent) : QCustomPlot(parent) {
  setInteractions(QCP::iRangeDrag | QCP::iRangeZoom);
  setFocusPolicy(Qt::StrongFocus);
  setNoAntialiasingOnDrag(true);
  PlotWidget::takeColours();
}

// A theme of the desktop that changes while the plot is open.
void PlotWidget::changeEvent(QEvent* event) {
  QCustomPlot::changeEvent(event);
  if (event->type() != QEvent::PaletteChange) return;
  takeColours();
  replot(QCustomPlot::rpQueuedReplot);
}

void PlotWidget::takeColours() {
  const QColor text = palette().color(QPalette::Text);
  QColor faint = text;
  faint.setAlpha(50);
  setBackground(palette().brush(QPalette::Base));
  for (QCPAxis* axis : {xAxis, yAxis, xAxis2, yAxis2}) {
    colour(*axis);
    axis->grid()->setPen(QPen(faint, 0, Qt::DotLine));
    axis->grid()->setZeroLinePen(QPen(faint, 0));
  }
}

void PlotWidget::colour(QCPAxis& axis) const {
  const QColor text = palette().color(QPalette::Text);
  axis.setBasePen(text);
  axis.setTickPen(text);
  axis.setSubTickPen(text);
  axis.setTickLabelColor(text);
  axis.setLabelColor(text);
}

QColor curveColour(std::size_t place) {
  // Told apart on a light and on a dark ground, and by most eyes.
  constexpr std::array<QRgb, 6> kColours{0x0072B2, 0xD55E00, 0x009E73, 0xCC79A7, 0xE69F00, 0x56B4E9};
  return kColours[place % kColours.size()];
}

QString itemTitle(const TsbItem& item) {
  return QString("%1 [%2]").arg(QString::fromStdString(item.name), QString::fromStdString(item.unit));
}

double stepValue(const TsbTimeAxis& time, std::size_t step) {
  if (!time.isCalendar()) return time.at(step);
  const auto& at = time.start;
  const QDateTime start(QDate(at[0], at[1], at[2]), QTime(at[3], at[4], at[5]), Qt::UTC);
  return static_cast<double>(start.toSecsSinceEpoch()) +
         CVdUnitConverter(time.unit, "s").Convert(time.at(step));
}

QString stepText(const TsbTimeAxis& time, std::size_t step) {
  const double value = stepValue(time, step);
  if (!time.isCalendar()) return QString("%1 %2").arg(value).arg(QString::fromStdString(time.unit));
  return QDateTime::fromMSecsSinceEpoch(static_cast<qint64>(value * 1000), Qt::UTC)
      .toString("yyyy-MM-dd hh:mm:ss");
}

}  // namespace gridbay::shell
