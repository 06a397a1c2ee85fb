// The parts of the window that brings in a series.

#include <QFileDialog>
#include <QHeaderView>
#include <QSplitter>
#include <QVBoxLayout>

#include "shell/import/series_import.h"

namespace gridbay::shell {

QLabel* SeriesImport::makeText(QWidget* parent) {
  auto* label = new QLabel(parent);
  label->setWordWrap(true);
  label->setTextFormat(Qt::PlainText);
  label->setTextInteractionFlags(Qt::TextSelectableByMouse);
  return label;
}

QWidget* SeriesImport::buildSource() {
  auto* row = new QWidget(body_);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins(0, 0, 0, 0);
  auto* open = new QPushButton(tr("&Open table..."), row);
  auto* paste = new QPushButton(tr("&Paste"), row);
  paste->setToolTip(tr("Takes the cells that were copied from a spreadsheet (Ctrl+V)"));
  for (QPushButton* button : {open, paste}) {
    button->setAutoDefault(false);
    layout->addWidget(button);
  }
  sourceText_ = new QLabel(tr("Open a table, drop one here, or paste one (Ctrl+V)."), row);
  sourceText_->setTextFormat(Qt::PlainText);
  layout->addWidget(sourceText_, 1);
  connect(open, &QPushButton::clicked, this, &SeriesImport::browse);
  connect(paste, &QPushButton::clicked, this, &SeriesImport::pasteTable);
  return row;
}

// The columns and the lines of the table beside the plot.
QWidget* SeriesImport::buildMiddle() {
  auto* middle = new QSplitter(Qt::Horizontal, body_);
  columns_ = new ColumnRows(body_);
  preview_ = new TablePreview(this);
  previewView_ = new QTableView(body_);
  previewView_->setModel(preview_);
  previewView_->setWordWrap(false);
  previewView_->verticalHeader()->setDefaultSectionSize(previewView_->fontMetrics().height() + 6);
  previewView_->setAccessibleName(tr("Lines of the table"));
  previewView_->setTabKeyNavigation(false);
  auto* left = new QSplitter(Qt::Vertical, middle);
  left->addWidget(columns_);
  left->addWidget(previewView_);
  constexpr int kColumnsHeight = 220;
  left->setSizes({kColumnsHeight, height() - kColumnsHeight});
  auto* right = new QWidget(middle);
  auto* layout = new QVBoxLayout(right);
  layout->setContentsMargins(0, 0, 0, 0);
  plot_ = new ImportPlot(right);
  coverage_ = makeText(right);
  layout->addWidget(plot_, 1);
  layout->addWidget(coverage_);
  middle->setStretchFactor(0, 1);
  middle->setStretchFactor(1, 1);
  return middle;
}

QWidget* SeriesImport::buildResult() {
  auto* row = new QWidget(body_);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins(0, 0, 0, 0);
  auto* label = new QLabel(tr("Time series to &write:"), row);
  result_ = new QLineEdit(row);
  label->setBuddy(result_);
  choose_ = new QPushButton("...", row);
  choose_->setAccessibleName(tr("Browse for the time series to write"));
  choose_->setAutoDefault(false);
  layout->addWidget(label);
  layout->addWidget(result_, 1);
  layout->addWidget(choose_);
  connect(result_, &QLineEdit::textChanged, this, &SeriesImport::showVerdict);
  connect(choose_, &QPushButton::clicked, this, [this] {
    const QString path = QFileDialog::getSaveFileName(this, {}, result_->text(), tr("Time series (*.tsb0)"),
                                                      nullptr, QFileDialog::DontConfirmOverwrite);
    if (!path.isEmpty()) result_->setText(path);
  });
  return row;
}

QWidget* SeriesImport::buildButtons() {
  auto* row = new QWidget(this);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins({});
  progress_ = new QProgressBar(row);
  QSizePolicy stays = progress_->sizePolicy();
  stays.setRetainSizeWhenHidden(true);
  progress_->setSizePolicy(stays);
  cancel_ = new QPushButton(tr("&Cancel"), row);
  cancel_->setObjectName("cancel");
  import_ = new QPushButton(tr("&Import"), row);
  help_ = new QPushButton(tr("Help"), row);
  help_->setObjectName("help");
  close_ = new QPushButton(tr("Close"), row);
  close_->setObjectName("close");
  layout->addWidget(progress_, 1);
  for (QPushButton* button : {cancel_, import_, help_, close_}) {
    button->setAutoDefault(false);
    layout->addWidget(button);
  }
  connect(cancel_, &QPushButton::clicked, this, &SeriesImport::cancel);
  // By its key it is pressed with the focus in an edit, which tells what was typed once it is left.
  connect(import_, &QPushButton::clicked, this, [this] {
    import_->setFocus();
    startImport();
  });
  connect(help_, &QPushButton::clicked, this, &SeriesImport::helpWanted);
  connect(close_, &QPushButton::clicked, this, &QDialog::reject);
  return row;
}

// As the window reads; the rows of the columns are new each time.
void SeriesImport::orderTabs() {
  QWidget* last = &fields_->timeUnit();
  const auto goOn = [&last](QWidget* next) {
    setTabOrder(last, next);
    last = next;
  };
  for (const ColumnRows::Row& row : columns_->rows()) {
    for (QWidget* each : std::initializer_list<QWidget*>{row.role, row.name, row.type, row.unit}) goOn(each);
  }
  for (QWidget* each : std::initializer_list<QWidget*>{previewView_, plot_, result_, choose_}) goOn(each);
  for (QWidget* each : uses_->inputs()) goOn(each);
  for (QWidget* each : {cancel_, import_, help_, close_}) goOn(each);
}

}  // namespace gridbay::shell
