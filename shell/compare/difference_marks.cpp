#include "shell/compare/difference_marks.h"

#include <QEvent>
#include <QHeaderView>
#include <QPainter>
#include <QScrollBar>

#include "shell/grid_view.h"

namespace gridbay::shell {

DifferenceMarks::DifferenceMarks(PagePane& pane) : QWidget(pane.widget()), pane_(pane) {
  setAttribute(Qt::WA_TransparentForMouseEvents);
  setFocusPolicy(Qt::NoFocus);
  const auto again = qOverload<>(&QWidget::update);
  for (int n = 1; GridView* table = pane.tableAt(n); ++n) {
    connect(table->verticalScrollBar(), &QScrollBar::valueChanged, this, again);
    connect(table->horizontalScrollBar(), &QScrollBar::valueChanged, this, again);
    connect(table->horizontalHeader(), &QHeaderView::sectionResized, this, again);
    connect(&table->cells(), &GridModel::refreshed, this, again);
    table->installEventFilter(this);
  }
  pane.widget()->installEventFilter(this);
  resize(pane.widget()->size());
  raise();
  QWidget::show();
}

void DifferenceMarks::mark(std::vector<Difference> differences, int current) {
  differences_ = std::move(differences);
  current_ = current;
  for (const Difference& difference : differences_) {
    // What it covers may move as the page is laid out.
    QWidget* input = pane_.widgetOf(QString::fromStdString(difference.label), difference.labelNumber);
    if (difference.table == 0 && input != nullptr) input->installEventFilter(this);
  }
  raise();
  update();
}

QRect DifferenceMarks::rectOf(const Difference& difference) const {
  constexpr int kAround = 2;
  if (difference.table == 0) {
    const QWidget* input = pane_.widgetOf(QString::fromStdString(difference.label), difference.labelNumber);
    if (input == nullptr || !input->isVisible()) return {};
    return QRect(input->mapTo(parentWidget(), QPoint()), input->size())
        .adjusted(-kAround, -kAround, kAround, kAround);
  }
  const GridView* table = pane_.tableAt(difference.table);
  if (table == nullptr || !table->isVisible()) return {};
  const QAbstractItemModel& cells = *table->model();
  const int row = difference.row - 1;
  if (row >= cells.rowCount()) return {};
  QRect rect = table->visualRect(cells.index(row, std::max(difference.column - 1, 0)));
  if (difference.column == 0) rect = {0, rect.top(), table->viewport()->width(), rect.height()};
  rect = rect.intersected(table->viewport()->rect());
  return rect.isEmpty() ? QRect() : rect.translated(table->viewport()->mapTo(parentWidget(), QPoint()));
}

std::vector<QRect> DifferenceMarks::rects() const {
  std::vector<QRect> rects;
  for (const Difference& difference : differences_) rects.push_back(rectOf(difference));
  return rects;
}

void DifferenceMarks::show(PagePane& pane, const Difference& difference, bool withFocus) {
  if (difference.currentRow > 0) pane.goTo({.entries = {{difference.currentRow, 0}}});
  GridView* table = difference.table > 0 ? pane.tableAt(difference.table) : nullptr;
  QWidget* input = table != nullptr
                       ? table
                       : pane.widgetOf(QString::fromStdString(difference.label), difference.labelNumber);
  if (input == nullptr) return;
  if (table != nullptr && difference.row <= table->model()->rowCount())
    table->goToCell(difference.row - 1, std::max(difference.column - 1, 0));
  pane.ensureWidgetVisible(input);
  if (withFocus) input->setFocus(Qt::OtherFocusReason);
}

void DifferenceMarks::paintEvent(QPaintEvent*) {
  QPainter painter(this);
  painter.setRenderHint(QPainter::Antialiasing);
  constexpr int kFill = 28;
  constexpr int kCurrentFill = 70;
  constexpr qreal kRound = 3;
  for (std::size_t i = 0; i < differences_.size(); ++i) {
    const QRect rect = rectOf(differences_[i]);
    if (rect.isEmpty()) continue;
    const bool isCurrent = static_cast<int>(i) == current_;
    QColor colour = palette().color(QPalette::Active, QPalette::Link);
    painter.setPen(QPen(colour, isCurrent ? 2.5 : 1.5));
    colour.setAlpha(isCurrent ? kCurrentFill : kFill);
    painter.setBrush(colour);
    painter.drawRoundedRect(QRectF(rect).adjusted(1, 1, -1, -1), kRound, kRound);
  }
}

bool DifferenceMarks::eventFilter(QObject* watched, QEvent* event) {
  switch (event->type()) {
    case QEvent::Resize:
    case QEvent::Move:
    case QEvent::Show:
    case QEvent::Hide:
    case QEvent::LayoutRequest:
      if (size() != parentWidget()->size()) resize(parentWidget()->size());
      update();
      break;
    default:
      break;
  }
  return QWidget::eventFilter(watched, event);
}

}  // namespace gridbay::shell
