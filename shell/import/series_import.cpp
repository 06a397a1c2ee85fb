#include "shell/import/series_import.h"

#include <QApplication>
#include <QClipboard>
#include <QDir>
#include <QFileDialog>
#include <QFileInfo>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMessageBox>
#include <QSplitter>
#include <QVBoxLayout>
#include <algorithm>
#include <cmath>
#include <utility>

#include "conversion/table_text.h"
#include "platform/files/may_write.h"
#include "platform/files/read_file.h"
#include "shell/import/file_drop.h"
#include "shell/import/work_host.h"
#include "shell/import/work_results.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

using Role = TableColumn::Role;

constexpr QSize kSize(1120, 760);
constexpr int kMoment = 120;  // milliseconds from a change to a new look
constexpr int kParts = 1000;

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

void colourText(QWidget* text, bool isFault) {
  QPalette colours;
  if (isFault) colours.setColor(QPalette::WindowText, faultColour(colours));
  text->setPalette(colours);
}

// What a time series of the form holds, as the user has named it.
SeriesTable namedItems(SeriesTable table, const TableForm& form) {
  std::size_t item = 0;
  for (const TableColumn& column : form.columns) {
    if (column.role == Role::item) table.items[item++] = column;
  }
  return table;
}

}  // namespace

SeriesImport::SeriesImport(std::function<Setup()> setup,
                           std::function<UseStrip::Offer(const QString& series)> uses, QWidget* parent)
    : QDialog(parent), findSetup_(std::move(setup)), work_(nullptr) {
  setWindowTitle(tr("Import Series"));
  resize(kSize);
  body_ = new QWidget(this);
  auto* body = new QVBoxLayout(body_);
  body->setContentsMargins(0, 0, 0, 0);
  doubts_ = makeText(body_);
  verdict_ = makeText(this);
  uses_ = new UseStrip(tr("Use the series &as"), std::move(uses), this);
  body->addWidget(buildSource());
  fields_ = new SeriesForm(body_);
  body->addWidget(fields_);
  body->addWidget(buildMiddle(), 1);
  body->addWidget(doubts_);
  body->addWidget(buildResult());
  auto* layout = new QVBoxLayout(this);
  layout->addWidget(body_, 1);
  layout->addWidget(verdict_);
  layout->addWidget(uses_);
  layout->addWidget(buildButtons());

  // What parts lines and fields leads to another look at all of it.
  connect(fields_, &SeriesForm::partsChanged, this, &SeriesImport::guess);
  connect(fields_, &SeriesForm::changed, this, &SeriesImport::formChanged);
  connect(fields_, &SeriesForm::typed, this, &SeriesImport::showVerdict);
  connect(columns_, &ColumnRows::changed, this, [this] {
    form_.columns = columns_->columns();
    readSoon();
  });
  connect(uses_, &UseStrip::viewWanted, this, &SeriesImport::viewWanted);
  connect(&work_, &BackgroundWork::progressed, this, [this](double done) {
    progress_->show();
    progress_->setValue(static_cast<int>(std::lround(done * kParts)));
  });
  connect(&work_, &BackgroundWork::ended, this, [this](const std::optional<std::string>& bytes) {
    stage_ == Stage::importing ? takeImport(bytes) : takeRead(bytes);
  });
  rereading_.setSingleShot(true);
  rereading_.setInterval(kMoment);
  connect(&rereading_, &QTimer::timeout, this, &SeriesImport::reread);
  new FileDrop(*this, [this](const QString& path) {
    if (stage_ != Stage::importing) openTable(path);
  });
  takeSetup();
  showForm();
  enter(Stage::ready);
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
  left->setSizes({kColumnsHeight, kSize.height() - kColumnsHeight});
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
  progress_->setRange(0, kParts);
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

void SeriesImport::browse() {
  const QString path = QFileDialog::getOpenFileName(
      this, {}, setup_.folder, tr("Tables (*.csv *.txt *.dat *.tsv *.prn);;All files (*)"));
  if (!path.isEmpty()) openTable(path);
}

bool SeriesImport::openTable(const QString& path) {
  const Result<FileText> file = readFile(path.toStdString());
  Result<std::string> text = file ? tableText(file->view()) : Failure{file.error()};
  if (!text) {
    const QString why = textOf(text.error());
    QMessageBox::warning(this, windowTitle(), file ? tr("Cannot read \"%1\": %2").arg(path, why) : why);
    return false;
  }
  source_ = path;
  const QFileInfo info(path);
  result_->setText(info.absolutePath() + '/' + info.completeBaseName() + ".tsb0");
  showTable(std::make_shared<const std::string>(std::move(*text)), info.fileName());
  return true;
}

bool SeriesImport::pasteTable() {
  Result<std::string> text = tableText(QApplication::clipboard()->text().toStdString());
  if (!text || textOf(*text).trimmed().isEmpty()) {
    tell(tr("There is no text to paste."), true);
    return false;
  }
  source_.clear();
  result_->setText((setup_.folder.isEmpty() ? QString() : setup_.folder + '/') + "pasted.tsb0");
  showTable(std::make_shared<const std::string>(std::move(*text)), tr("Pasted table"));
  return true;
}

// Return in a field is no end of the dialog, and Esc ends first what is being written.
void SeriesImport::keyPressEvent(QKeyEvent* event) {
  if (event->matches(QKeySequence::Paste) && stage_ != Stage::importing) {
    pasteTable();
  } else if (event->key() == Qt::Key_F1) {
    emit helpWanted();
  } else if (event->key() == Qt::Key_Escape && stage_ == Stage::importing) {
    cancel();
  } else {
    QDialog::keyPressEvent(event);
  }
}

// The setup may have been changed meanwhile, or be another one.
void SeriesImport::changeEvent(QEvent* event) {
  QDialog::changeEvent(event);
  if (event->type() != QEvent::ActivationChange || !isActiveWindow()) return;
  const auto before = setup_.state;
  takeSetup();
  if (!setup_.state || setup_.state != before) uses_->seekAgain();
}

void SeriesImport::done(int result) {
  work_.stop();
  QDialog::done(result);
}

void SeriesImport::takeSetup() {
  const Setup before = std::exchange(setup_, findSetup_());
  const auto same = [](const std::optional<Period>& a, const std::optional<Period>& b) {
    return a.has_value() == b.has_value() &&
           (!a || ((*a)[0].linear() == (*b)[0].linear() && (*a)[1].linear() == (*b)[1].linear()));
  };
  if (same(before.period, setup_.period)) return;
  plot_->setPeriod(setup_.period);
  showCoverage();
}

void SeriesImport::showTable(std::shared_ptr<const std::string> text, const QString& title) {
  isWanted_ = false;
  // Those that were typed before there was a table.
  const std::vector<double> missing = text_ == nullptr ? form_.missing : std::vector<double>();
  text_ = std::move(text);
  title_ = title;
  sourceText_->setText(title);
  // Times that are numbers most likely count from where the simulation begins.
  if (form_.start.empty() && setup_.period) form_.start = dateTimeText((*setup_.period)[0]);
  TableGuess guess = guessTable(*text_);
  for (const double number : missing) {
    if (std::ranges::find(guess.form.missing, number) == guess.form.missing.end())
      guess.form.missing.push_back(number);
  }
  takeGuess(std::move(guess));
  reread();
}

void SeriesImport::takeGuess(TableGuess guess) {
  guess.form.start = form_.start;
  form_ = std::move(guess.form);
  QStringList doubts;
  for (const std::vector<std::string>& said :
       {guess.doubts, guess.missingDoubts, std::vector<std::string>{guess.dateOrderDoubt}}) {
    for (const std::string& doubt : said) {
      if (!doubt.empty()) doubts << textOf(doubt) + '.';
    }
  }
  doubts_->setText(doubts.join('\n'));
  doubts_->setVisible(!doubts.isEmpty());
  showForm();
}

// The user has said how lines and fields are parted.
void SeriesImport::guess() {
  if (text_ == nullptr) return;
  takeGuess(guessTable(*text_, fields_->separatorChosen(), fields_->headings().value()));
  readSoon();
}

void SeriesImport::showForm() {
  fields_->showForm(form_);
  columns_->showColumns(form_.columns);
  orderTabs();
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

void SeriesImport::formChanged() {
  fields_->takeInto(form_);
  if (text_ == nullptr) return;
  // What is wrong stays to be seen.
  if (fields_->fault().isEmpty()) fields_->showForm(form_);
  readSoon();
}

void SeriesImport::readSoon() {
  isWanted_ = false;
  uses_->hide();
  rereading_.start();
  showVerdict();
}

void SeriesImport::reread() {
  rereading_.stop();
  if (text_ == nullptr) return;
  work_.stop();
  uses_->hide();
  read_.reset();
  fields_->enable(form_);
  preview_->show(*text_, form_);
  previewView_->resizeColumnsToContents();
  if (faultOf(form_).empty()) {
    enter(Stage::reading);
    work_.begin([this](const WorkApart::Progress& progress) {
      return packed(readSeriesTable(*text_, form_, progress));
    });
  } else {
    plot_->showTable({});
    coverage_->clear();
    enter(Stage::ready);
  }
}

void SeriesImport::takeRead(const std::optional<std::string>& bytes) {
  read_ = bytes ? unpackedTable(*bytes) : Failure{"The table can't be read: its reader came to a sudden end"};
  if (*read_) {
    preview_->showFaults((*read_)->faults);
    plot_->showTable(**read_);
  } else {
    plot_->showTable({});
  }
  showCoverage();
  enter(Stage::ready);
  if (std::exchange(isWanted_, false)) startImport();
}

void SeriesImport::showCoverage() {
  coverage_->clear();
  if (!setup_.period || !read_ || !*read_ || (*read_)->times.empty()) return;
  const bool covers = ImportPlot::covers(**read_, *setup_.period);
  const QString period =
      tr("%1 to %2")
          .arg(textOf(dateTimeText((*setup_.period)[0])), textOf(dateTimeText((*setup_.period)[1])));
  coverage_->setText(covers ? tr("The series covers the simulation period, %1.").arg(period)
                            : tr("The series does not cover the simulation period, %1.").arg(period));
  colourText(coverage_, !covers);
}

// What stands in the way of an import; empty for nothing that is known.
QString SeriesImport::obstacle() const {
  if (const QString why = fields_->fault(); !why.isEmpty()) return why;
  if (const std::string why = faultOf(form_); !why.empty()) return textOf(why);
  if (!read_) return {};
  if (!*read_) return textOf(read_->error());
  if ((*read_)->times.empty()) return tr("No line can be read; %1").arg(firstFault());
  if (const std::string why = faultOfItems(form_); !why.empty()) return textOf(why) + '.';
  return result_->text().trimmed().isEmpty() ? tr("A name for the time series is missing.") : QString();
}

QString SeriesImport::firstFault() const {
  const TableFault& fault = (*read_)->faults.front();
  return tr("line %1: %2.").arg(fault.line).arg(textOf(fault.why));
}

void SeriesImport::tell(const QString& text, bool isFault) {
  verdict_->setText(text);
  colourText(verdict_, isFault);
}

void SeriesImport::showVerdict() {
  if (stage_ == Stage::importing) {
    tell(tr("Importing..."), false);
    import_->setEnabled(false);
    return;
  }
  const QString fault = text_ == nullptr ? QString() : obstacle();
  QString told;
  std::size_t bad = 0;
  if (text_ != nullptr && !read_) {
    told = tr("Reading...");
  } else if (read_ && *read_) {
    bad = (*read_)->faultCount;
    told = tr("%1 lines are read.").arg((*read_)->times.size());
    if (bad == 1) told += ' ' + tr("1 line can't be read and is left out; %1").arg(firstFault());
    if (bad > 1) told += ' ' + tr("%1 lines can't be read and are left out; %2").arg(bad).arg(firstFault());
  }
  tell(fault.isEmpty() ? told : fault, !fault.isEmpty() || bad > 0);
  import_->setEnabled(text_ != nullptr && fault.isEmpty());
}

void SeriesImport::enter(Stage stage) {
  stage_ = stage;
  body_->setEnabled(stage != Stage::importing);
  progress_->setVisible(stage == Stage::importing);
  progress_->setValue(0);
  cancel_->setVisible(stage == Stage::importing);
  showVerdict();
}

bool SeriesImport::mayReplace(const QString& path) {
  if (!QFileInfo::exists(path)) return true;
  return QMessageBox::question(this, windowTitle(), tr("%1 is there already. Replace it?").arg(path)) ==
         QMessageBox::Yes;
}

// What was typed last is read first.
void SeriesImport::startImport() {
  if (rereading_.isActive()) reread();
  isWanted_ = stage_ == Stage::reading;
  if (isWanted_ || stage_ != Stage::ready || !import_->isEnabled()) return;
  QString path = QFileInfo(setup_.folder.isEmpty() ? QDir() : QDir(setup_.folder), result_->text().trimmed())
                     .absoluteFilePath();
  if (!path.endsWith(".tsb0")) path += ".tsb0";
  const std::string source = source_.toStdString();
  const Outcome free = mayWrite(path.toStdString(), true, {&source, source_.isEmpty() ? 0U : 1U}, {});
  if (!free) {
    tell(textOf(free.error()), true);
    result_->setFocus();
    return;
  }
  if (mayReplace(path)) write(path);
}

void SeriesImport::write(const QString& path) {
  made_ = path;
  before_ = fileStamp(made_.toStdString());
  uses_->hide();
  enter(Stage::importing);
  const SeriesTarget target{.out = path.toStdString(),
                            .title = QFileInfo(title_).completeBaseName().toStdString(),
                            .history = tr("Import Series (%1)").arg(title_).toStdString()};
  work_.begin(
      [this, target](const WorkApart::Progress& progress) {
        WorkHost host(progress);
        return packed(writeSeriesTable(namedItems(**read_, form_), target, host));
      },
      made_);
}

void SeriesImport::takeImport(const std::optional<std::string>& bytes) {
  enter(Stage::ready);
  const Result<std::string> summary =
      bytes ? unpackedSummary(*bytes) : Failure{"The import came to a sudden end; nothing is written"};
  if (!summary) {
    tell(textOf(summary.error()), true);
    return;
  }
  const QString told = textOf(*summary).trimmed();
  tell(told, false);
  emit imported(told);
  takeSetup();
  uses_->offer(made_);
}

void SeriesImport::cancel() {
  work_.stop();
  enter(Stage::ready);
  tell(fileStamp(made_.toStdString()) == before_
           ? tr("The import was stopped; nothing is written.")
           : tr("%1 was written before the import could be stopped.").arg(made_),
       false);
}

}  // namespace gridbay::shell
