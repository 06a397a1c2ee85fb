#include "shell/summary_view.h"

#include <QEvent>
#include <QHeaderView>
#include <QLabel>
#include <QVBoxLayout>

#include "shell/tool_icons.h"

namespace gridbay::shell {
namespace {

constexpr int kPageRole = Qt::UserRole;
constexpr int kKnownRole = Qt::UserRole + 1;
constexpr int kMargin = 16;
constexpr int kRowPadding = 8;

}  // namespace

SummaryView::SummaryView(QWidget* parent)
    : QWidget(parent),
      lines_(new QTreeWidget(this)),
      check_(new QPushButton(toolIcon(Tool::validate), tr("&Check the setup"), this)) {
  auto* heading = new QLabel(tr("This setup"), this);
  QFont font = heading->font();
  font.setBold(true);
  heading->setFont(font);
  check_->setToolTip(tr("Reads the grids, and lists what is missing or does not fit (F7)"));
  lines_->setColumnCount(2);
  lines_->setHeaderHidden(true);
  lines_->setRootIsDecorated(false);
  lines_->setUniformRowHeights(true);
  lines_->setFrameShape(QFrame::NoFrame);
  lines_->setAccessibleName(tr("Summary of the setup"));
  lines_->setAccessibleDescription(tr("Each line leads to its page"));
  lines_->viewport()->setCursor(Qt::PointingHandCursor);
  lines_->header()->setSectionResizeMode(0, QHeaderView::ResizeToContents);

  auto* top = new QHBoxLayout();
  top->addWidget(heading);
  top->addStretch();
  top->addWidget(check_);
  auto* layout = new QVBoxLayout(this);
  layout->setContentsMargins(kMargin, 0, kMargin, kMargin);
  layout->addLayout(top);
  layout->addWidget(lines_);
  setTabOrder(lines_, check_);

  connect(lines_, &QTreeWidget::itemClicked, this, &SummaryView::choose);
  connect(lines_, &QTreeWidget::itemActivated, this, &SummaryView::choose);
  connect(check_, &QPushButton::clicked, this, &SummaryView::checkWanted);
}

void SummaryView::showSummary(const SetupSummary& summary) {
  QTreeWidgetItem* current = lines_->currentItem();
  const int row = current == nullptr ? 0 : lines_->indexOfTopLevelItem(current);
  lines_->clear();
  for (const SetupSummary::Line& line : summary.lines) {
    auto* item = new QTreeWidgetItem(lines_);
    item->setText(0, QString::fromStdString(line.subject) + "  ");
    item->setText(1, QString::fromStdString(line.text));
    item->setSizeHint(1, QSize(0, fontMetrics().height() + kRowPadding));
    item->setToolTip(1, item->text(1));
    item->setData(0, kPageRole, line.page);
    item->setData(0, kKnownRole, line.isKnown);
  }
  lines_->setCurrentItem(lines_->topLevelItem(qMin(row, lines_->topLevelItemCount() - 1)), 0,
                         QItemSelectionModel::Current);
  colour();
}

// What is not known stands back.
void SummaryView::colour() {
  const QPalette& colours = palette();
  for (int i = 0; i < lines_->topLevelItemCount(); ++i) {
    QTreeWidgetItem* item = lines_->topLevelItem(i);
    const bool isKnown = item->data(0, kKnownRole).toBool();
    item->setForeground(0, colours.color(QPalette::Link));
    item->setForeground(1, isKnown ? colours.text() : colours.brush(QPalette::Disabled, QPalette::Text));
  }
}

void SummaryView::choose(const QTreeWidgetItem* item) {
  const int page = item->data(0, kPageRole).toInt();
  if (page == 0) {
    emit checkWanted();
  } else {
    emit pageChosen(page);
  }
}

void SummaryView::changeEvent(QEvent* event) {
  QWidget::changeEvent(event);
  if (event->type() == QEvent::PaletteChange) colour();
}

}  // namespace gridbay::shell
