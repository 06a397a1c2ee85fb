#include "shell/import/series_import.h"

#include <QApplication>
#include <QClipboard>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QFileDialog>
#include <QFileInfo>
#include <QFormLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMessageBox>
#include <QSplitter>
#include <utility>

#include "platform/files/may_write.h"
#include "platform/files/read_file.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

using Role = TableColumn::Role;

constexpr QSize kSize(1120, 760);
constexpr const char* kSeparators = "\t;, ";
constexpr int kMoment = 120;  // milliseconds from a change to a new look

// Tells the bar, lets the window live, and asks whether the user has stopped.
class WindowHost final : public ConversionHost {
 public:
  WindowHost(QProgressBar& bar, const bool& isStopped) : bar_(bar), isStopped_(isStopped) { last_.start(); }

  bool reached(std::size_t done, std::size_t total) override {
    constexpr int kSlice = 30;  // milliseconds
    if (last_.elapsed() < kSlice) return !isStopped_;
    bar_.setValue(static_cast<int>(static_cast<double>(done) / static_cast<double>(total) * bar_.maximum()));
    QCoreApplication::processEvents();
    last_.restart();
    return !isStopped_;
  }
  std::string option(std::string_view name, std::string_view) const override { return std::string(name); }
  std::string itemTypeList() const override { return {}; }

 private:
  QProgressBar& bar_;
  const bool& isStopped_;
  QElapsedTimer last_;
};

QString textOf(const std::string& text) {
  return QString::fromStdString(text);
}

QLabel* makeText(QWidget* parent) {
  auto* label = new QLabel(parent);
  label->setWordWrap(true);
  label->setTextFormat(Qt::PlainText);
  label->setTextInteractionFlags(Qt::TextSelectableByMouse);
  return label;
}

}  // namespace

SeriesImport::SeriesImport(std::optional<Period> period, QString folder, QWidget* parent)
    : QDialog(parent), period_(period), folder_(std::move(folder)), job_(new TableJob(this)) {
  setWindowTitle(tr("Import Series"));
  resize(kSize);
  body_ = new QWidget(this);
  auto* body = new QVBoxLayout(body_);
  body->setContentsMargins(0, 0, 0, 0);
  columns_ = new ColumnRows(body_);
  preview_ = new TablePreview(this);
  previewView_ = new QTableView(body_);
  previewView_->setModel(preview_);
  previewView_->setWordWrap(false);
  previewView_->verticalHeader()->setDefaultSectionSize(previewView_->fontMetrics().height() + 6);
  previewView_->setAccessibleName(tr("Lines of the table"));
  previewView_->setTabKeyNavigation(false);
  plot_ = new ImportPlot(period_, body_);
  doubts_ = makeText(body_);
  coverage_ = makeText(body_);
  verdict_ = makeText(this);

  body->addWidget(buildSource());
  body->addWidget(buildReading());
  auto* left = new QSplitter(Qt::Vertical, body_);
  left->addWidget(columns_);
  left->addWidget(previewView_);
  constexpr int kColumnsHeight = 220;
  left->setSizes({kColumnsHeight, kSize.height() - kColumnsHeight});
  auto* right = new QWidget(body_);
  auto* rightLayout = new QVBoxLayout(right);
  rightLayout->setContentsMargins(0, 0, 0, 0);
  rightLayout->addWidget(plot_, 1);
  rightLayout->addWidget(coverage_);
  auto* middle = new QSplitter(Qt::Horizontal, body_);
  middle->addWidget(left);
  middle->addWidget(right);
  middle->setStretchFactor(0, 1);
  middle->setStretchFactor(1, 1);
  body->addWidget(middle, 1);
  body->addWidget(doubts_);
  body->addWidget(buildResult());

  progress_ = new QProgressBar(this);
  constexpr int kParts = 1000;
  progress_->setRange(0, kParts);
  progress_->hide();
  auto* buttons = new QDialogButtonBox(QDialogButtonBox::Cancel, this);
  import_ = buttons->addButton(tr("&Import"), QDialogButtonBox::AcceptRole);
  for (QAbstractButton* button : buttons->buttons()) static_cast<QPushButton*>(button)->setAutoDefault(false);
  auto* layout = new QVBoxLayout(this);
  layout->addWidget(body_, 1);
  layout->addWidget(verdict_);
  layout->addWidget(progress_);
  layout->addWidget(buttons);
  // What was typed last is read first.
  connect(import_, &QPushButton::clicked, this, &SeriesImport::importTable);
  connect(buttons, &QDialogButtonBox::rejected, this, &SeriesImport::reject);
  connect(columns_, &ColumnRows::changed, this, [this] {
    isWanted_ = false;
    form_.columns = columns_->columns();
    rereading_.start();
  });
  connect(job_, &TableJob::finished, this, &SeriesImport::showRead);
  connect(job_, &TableJob::reached, this, [this](double done) {
    progress_->show();
    progress_->setValue(static_cast<int>(done * progress_->maximum()));
  });
  rereading_.setSingleShot(true);
  rereading_.setInterval(kMoment);
  connect(&rereading_, &QTimer::timeout, this, &SeriesImport::reread);
  showForm();
  showVerdict();
  previewView_->setFocus();
}

// An edit that goes with the focus in it tells that it was left.
SeriesImport::~SeriesImport() {
  for (QWidget* each : findChildren<QWidget*>()) disconnect(each, nullptr, this, nullptr);
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
  sourceText_ = new QLabel(tr("Open a table, or paste one (Ctrl+V)."), row);
  layout->addWidget(sourceText_, 1);
  connect(open, &QPushButton::clicked, this, &SeriesImport::browse);
  connect(paste, &QPushButton::clicked, this, &SeriesImport::pasteTable);
  return row;
}

QWidget* SeriesImport::buildReading() {
  auto* row = new QWidget(body_);
  auto* layout = new QHBoxLayout(row);
  layout->setContentsMargins(0, 0, 0, 0);
  const auto add = [row, layout](const QString& text, QWidget* input) {
    auto* label = new QLabel(text, row);
    label->setBuddy(input);
    layout->addWidget(label);
    layout->addWidget(input);
  };
  const auto list = [row](const QStringList& texts) {
    auto* made = new QComboBox(row);
    made->addItems(texts);
    return made;
  };
  separator_ = list({tr("Tab"), tr("Semicolon"), tr("Comma"), tr("Blanks")});
  decimals_ = list({tr("Point"), tr("Comma")});
  headings_ = new QSpinBox(row);
  constexpr int kMostHeadings = 10'000;
  headings_->setRange(0, kMostHeadings);
  dates_ = list({tr("Year first"), tr("Day first"), tr("Month first")});
  missing_ = new QLineEdit(row);
  missing_->setToolTip(tr("Numbers that stand for missing values, with blanks between"));
  start_ = new QLineEdit(row);
  start_->setPlaceholderText("YYYY-MM-DD hh:mm:ss");
  constexpr int kAround = 16;
  start_->setMinimumWidth(start_->fontMetrics().horizontalAdvance(start_->placeholderText()) + kAround);
  timeUnit_ = list({"s", "min", "h", "d"});
  add(tr("&Separator:"), separator_);
  add(tr("&Decimals:"), decimals_);
  add(tr("&Heading lines:"), headings_);
  add(tr("Da&tes:"), dates_);
  add(tr("&Missing:"), missing_);
  add(tr("Time &0:"), start_);
  add(tr("&Unit of time:"), timeUnit_);
  layout->addStretch();
  // What parts lines and fields leads to another look at all of it.
  connect(separator_, &QComboBox::activated, this, &SeriesImport::guess);
  connect(headings_, &QSpinBox::valueChanged, this, &SeriesImport::guess);
  for (QComboBox* each : {decimals_, dates_, timeUnit_})
    connect(each, &QComboBox::activated, this, &SeriesImport::takeForm);
  for (QLineEdit* each : {missing_, start_})
    connect(each, &QLineEdit::editingFinished, this, &SeriesImport::takeForm);
  return row;
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

void SeriesImport::browse() {
  const QString path = QFileDialog::getOpenFileName(
      this, {}, folder_, tr("Tables (*.csv *.txt *.dat *.tsv *.prn);;All files (*)"));
  if (!path.isEmpty()) openTable(path);
}

bool SeriesImport::openTable(const QString& path) {
  const Result<FileText> text = readFile(path.toStdString());
  if (!text) {
    QMessageBox::warning(this, windowTitle(), textOf(text.error()));
    return false;
  }
  source_ = path;
  const QFileInfo file(path);
  result_->setText(file.absolutePath() + '/' + file.completeBaseName() + ".tsb0");
  showTable(std::make_shared<const std::string>(text->view()), file.fileName());
  return true;
}

bool SeriesImport::pasteTable() {
  const QString text = QApplication::clipboard()->text();
  if (text.trimmed().isEmpty()) {
    verdict_->setText(tr("There is no text to paste."));
    return false;
  }
  source_.clear();
  result_->setText((folder_.isEmpty() ? QString() : folder_ + '/') + "pasted.tsb0");
  showTable(std::make_shared<const std::string>(text.toStdString()), tr("Pasted table"));
  return true;
}

void SeriesImport::keyPressEvent(QKeyEvent* event) {
  if (event->matches(QKeySequence::Paste)) {
    pasteTable();
  } else {
    QDialog::keyPressEvent(event);
  }
}

void SeriesImport::showTable(std::shared_ptr<const std::string> text, const QString& title) {
  isWanted_ = false;
  text_ = std::move(text);
  title_ = title;
  sourceText_->setText(title);
  // Times that are numbers most likely count from where the simulation begins.
  if (form_.start.empty() && period_) form_.start = dateTimeText((*period_)[0]);
  takeGuess(guessTable(*text_));
  reread();
}

void SeriesImport::takeGuess(TableGuess guess) {
  guess.form.start = form_.start;
  form_ = std::move(guess.form);
  QStringList doubts;
  for (const std::string& doubt : guess.doubts) doubts << textOf(doubt) + '.';
  if (!guess.dateOrderDoubt.empty()) doubts << textOf(guess.dateOrderDoubt) + '.';
  doubts_->setText(doubts.join('\n'));
  doubts_->setVisible(!doubts.isEmpty());
  showForm();
}

// The user has said how lines and fields are parted.
void SeriesImport::guess() {
  if (text_ == nullptr) return;
  takeGuess(guessTable(*text_, kSeparators[separator_->currentIndex()], headings_->value()));
  rereading_.start();
}

void SeriesImport::showForm() {
  const QSignalBlocker quiet(headings_);
  separator_->setCurrentIndex(static_cast<int>(std::string_view(kSeparators).find(form_.separator)));
  decimals_->setCurrentIndex(form_.decimalComma ? 1 : 0);
  headings_->setValue(form_.headerLines);
  dates_->setCurrentIndex(static_cast<int>(form_.dateOrder));
  QStringList missing;
  for (const double number : form_.missing) missing << QString::number(number);
  missing_->setText(missing.join(' '));
  start_->setText(textOf(form_.start));
  timeUnit_->setCurrentText(textOf(form_.timeUnit));
  columns_->showColumns(form_.columns);
  orderTabs();
}

// As the window reads; the rows of the columns are new each time.
void SeriesImport::orderTabs() {
  QWidget* last = timeUnit_;
  const auto goOn = [&last](QWidget* next) {
    setTabOrder(last, next);
    last = next;
  };
  for (const ColumnRows::Row& row : columns_->rows()) {
    for (QWidget* each : std::initializer_list<QWidget*>{row.role, row.name, row.type, row.unit}) goOn(each);
  }
  for (QWidget* each : std::initializer_list<QWidget*>{previewView_, plot_, result_, choose_, import_})
    goOn(each);
}

void SeriesImport::takeForm() {
  if (text_ == nullptr) return;
  isWanted_ = false;
  form_.decimalComma = decimals_->currentIndex() == 1;
  form_.dateOrder = static_cast<DateOrder>(dates_->currentIndex());
  form_.start = start_->text().trimmed().toStdString();
  form_.timeUnit = timeUnit_->currentText().toStdString();
  form_.missing.clear();
  for (const QString& number : missing_->text().split(' ', Qt::SkipEmptyParts)) {
    bool isNumber = false;
    const double value = number.toDouble(&isNumber);
    if (isNumber) form_.missing.push_back(value);
  }
  rereading_.start();
}

void SeriesImport::reread() {
  rereading_.stop();
  if (text_ == nullptr) return;
  read_.reset();
  const bool isNumeric = form_.hasRole(Role::time);
  start_->setEnabled(isNumeric);
  timeUnit_->setEnabled(isNumeric);
  dates_->setEnabled(form_.hasRole(Role::date));
  preview_->show(*text_, form_);
  previewView_->resizeColumnsToContents();
  if (faultOf(form_).empty()) {
    job_->read(text_, form_);
  } else {
    job_->stop();
    plot_->showTable({});
    coverage_->clear();
  }
  showVerdict();
}

void SeriesImport::showRead(const std::shared_ptr<const ReadTable>& read) {
  progress_->hide();
  read_ = read;
  preview_->showFaults(read->table.faults);
  plot_->showTable(read->table);
  coverage_->clear();
  if (period_ && !read->table.times.empty()) {
    const bool covers = ImportPlot::covers(read->table, *period_);
    const QString period =
        tr("%1 to %2").arg(textOf(dateTimeText((*period_)[0])), textOf(dateTimeText((*period_)[1])));
    coverage_->setText(covers ? tr("The series covers the simulation period, %1.").arg(period)
                              : tr("The series does not cover the simulation period, %1.").arg(period));
    QPalette colours;
    if (!covers) colours.setColor(QPalette::WindowText, faultColour(palette()));
    coverage_->setPalette(colours);
  }
  showVerdict();
  if (std::exchange(isWanted_, false)) importTable();
}

// What stands in the way of an import; empty for nothing that is known.
QString SeriesImport::obstacle() const {
  if (const std::string why = faultOf(form_); !why.empty()) return textOf(why);
  if (read_ == nullptr) return {};
  if (!read_->error.isEmpty()) return read_->error;
  if (read_->table.times.empty()) return tr("No line can be read; %1").arg(firstFault());
  if (const std::string why = faultOfItems(form_); !why.empty()) return textOf(why) + '.';
  return result_->text().trimmed().isEmpty() ? tr("A name for the time series is missing.") : QString();
}

QString SeriesImport::firstFault() const {
  const TableFault& fault = read_->table.faults.front();
  return tr("line %1: %2.").arg(fault.line).arg(textOf(fault.why));
}

void SeriesImport::showVerdict() {
  const QString fault = text_ == nullptr ? QString() : obstacle();
  QString told;
  bool isBad = !fault.isEmpty();
  if (text_ != nullptr && read_ == nullptr) {
    told = tr("Reading...");
  } else if (read_ != nullptr) {
    const std::size_t bad = read_->table.faultCount;
    told = tr("%1 lines are read.").arg(read_->table.times.size());
    if (bad == 1) told += ' ' + tr("1 line can't be read and is left out; %1").arg(firstFault());
    if (bad > 1) told += ' ' + tr("%1 lines can't be read and are left out; %2").arg(bad).arg(firstFault());
    isBad = isBad || bad > 0;
  }
  verdict_->setText(fault.isEmpty() ? told : fault);
  QPalette colours;
  if (isBad) colours.setColor(QPalette::WindowText, faultColour(palette()));
  verdict_->setPalette(colours);
  import_->setEnabled(text_ != nullptr && fault.isEmpty() && !isWriting_);
}

bool SeriesImport::mayReplace(const QString& path) {
  if (!QFileInfo::exists(path)) return true;
  return QMessageBox::question(this, windowTitle(), tr("%1 is there already. Replace it?").arg(path)) ==
         QMessageBox::Yes;
}

void SeriesImport::setAtWork(bool atWork) {
  isWriting_ = atWork;
  isStopped_ = false;
  body_->setEnabled(!atWork);
  progress_->setVisible(atWork);
  progress_->setValue(0);
  showVerdict();
}

// The table was read in a thread of its own. The data file library serves one thread alone, this one; so the
// writing lets the window live in between.
bool SeriesImport::importTable() {
  if (rereading_.isActive()) reread();
  isWanted_ = job_->isAtWork();
  if (isWanted_ || !import_->isEnabled()) return false;
  QString path =
      QFileInfo(folder_.isEmpty() ? QDir() : QDir(folder_), result_->text().trimmed()).absoluteFilePath();
  if (!path.endsWith(".tsb0")) path += ".tsb0";
  const std::string source = source_.toStdString();
  const Outcome free = mayWrite(path.toStdString(), true, {&source, source_.isEmpty() ? 0U : 1U}, {});
  if (!free) {
    QMessageBox::warning(this, windowTitle(), textOf(free.error()));
    return false;
  }
  if (!mayReplace(path)) return false;
  SeriesTable table = read_->table;
  std::size_t item = 0;
  for (const TableColumn& column : form_.columns) {
    if (column.role == Role::item) table.items[item++] = column;
  }
  setAtWork(true);
  WindowHost host(*progress_, isStopped_);
  const Result<ConvertedSeries> made =
      writeSeriesTable(table,
                       {.out = path.toStdString(),
                        .title = QFileInfo(title_).completeBaseName().toStdString(),
                        .history = tr("Import Series (%1)").arg(title_).toStdString()},
                       host);
  setAtWork(false);
  if (!made) {
    verdict_->setText(textOf(made.error()));
    if (made.error() != kConversionStopped) QMessageBox::warning(this, windowTitle(), textOf(made.error()));
    return false;
  }
  emit imported(path, textOf(made->summary).trimmed());
  accept();
  return true;
}

// While it writes, that is what is stopped.
void SeriesImport::reject() {
  if (isWriting_) {
    isStopped_ = true;
    return;
  }
  job_->stop();
  QDialog::reject();
}

}  // namespace gridbay::shell
