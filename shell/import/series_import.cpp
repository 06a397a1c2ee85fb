#include "shell/import/series_import.h"

#include <QApplication>
#include <QClipboard>
#include <QFileDialog>
#include <QFileInfo>
#include <QKeyEvent>
#include <QMessageBox>
#include <QVBoxLayout>
#include <cmath>
#include <utility>

#include "conversion/table_text.h"
#include "platform/files/read_file.h"
#include "shell/import/file_drop.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr QSize kSize(1120, 760);

QString textOf(const std::string& text) {
  return QString::fromStdString(text);
}

void colourText(QWidget* text, bool isFault) {
  QPalette colours;
  if (isFault) colours.setColor(QPalette::WindowText, faultColour(colours));
  text->setPalette(colours);
}

}  // namespace

SeriesImport::SeriesImport(std::function<Setup()> setup,
                           std::function<UseStrip::Offer(const QString& series)> uses, QWidget* parent)
    : QDialog(parent), findSetup_(std::move(setup)) {
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
  connect(fields_, &SeriesForm::partsChanged, this, [this] {
    isWanted_ = false;
    if (reading_.text() != nullptr)
      reading_.showParted(fields_->separatorChosen(), fields_->headings().value());
  });
  connect(fields_, &SeriesForm::changed, this, &SeriesImport::formChanged);
  connect(fields_, &SeriesForm::typed, this, &SeriesImport::showVerdict);
  connect(columns_, &ColumnRows::changed, this, [this] {
    reading_.form().columns = columns_->columns();
    readSoon();
  });
  connect(&reading_, &TableReading::recognised, this, &SeriesImport::showForm);
  connect(&reading_, &TableReading::changed, this, &SeriesImport::showChanged);
  connect(&reading_, &TableReading::read, this, &SeriesImport::showRead);
  connect(uses_, &UseStrip::viewWanted, this, &SeriesImport::viewWanted);
  connect(&work_, &BackgroundWork::progressed, this, &SeriesImport::showProgress);
  connect(&reading_, &TableReading::progressed, this, &SeriesImport::showProgress);
  connect(&work_, &BackgroundWork::ended, this, &SeriesImport::takeImport);
  new FileDrop(*this, [this](const QString& path) {
    if (!work_.isRunning()) openTable(path);
  });
  takeSetup();
  showForm();
  showStage();
  previewView_->setFocus();
}

// An edit that goes with the focus in it tells that it was left.
SeriesImport::~SeriesImport() {
  for (QWidget* each : findChildren<QWidget*>()) disconnect(each, nullptr, this, nullptr);
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
  if (!text || text->find_first_not_of(" \t\r\n") == std::string::npos) {
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
  if (event->matches(QKeySequence::Paste) && !work_.isRunning()) {
    pasteTable();
  } else if (event->key() == Qt::Key_F1) {
    emit helpWanted();
  } else if (event->key() == Qt::Key_Escape && work_.isRunning()) {
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
  reading_.stop();
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
  title_ = title;
  sourceText_->setText(title);
  // Times that are numbers most likely count from where the simulation begins.
  std::string& start = reading_.form().start;
  if (start.empty() && setup_.period) start = dateTimeText((*setup_.period)[0]);
  reading_.show(std::move(text));
}

void SeriesImport::showForm() {
  const QStringList doubts = reading_.doubts();
  doubts_->setText(doubts.join('\n'));
  doubts_->setVisible(!doubts.isEmpty());
  fields_->showForm(reading_.form());
  // What is being edited there goes on.
  if (columns_->columns() != reading_.form().columns) columns_->showColumns(reading_.form().columns);
  orderTabs();
}

void SeriesImport::formChanged() {
  fields_->takeInto(reading_.form());
  if (reading_.text() == nullptr) return;
  // What is wrong stays to be seen.
  if (fields_->fault().isEmpty()) fields_->showForm(reading_.form());
  readSoon();
}

void SeriesImport::readSoon() {
  isWanted_ = false;
  uses_->hide();
  reading_.readSoon();
  showVerdict();
}

// Another form, by which the table is not read yet.
void SeriesImport::showChanged() {
  const TableForm& form = reading_.form();
  uses_->hide();
  fields_->enable(form);
  preview_->show(*reading_.text(), form);
  previewView_->resizeColumnsToContents();
  if (!faultOf(form).empty()) {
    isWanted_ = false;
    plot_->showTable({});
    coverage_->clear();
  }
  showStage();
}

void SeriesImport::showRead() {
  const Result<SeriesTable>& table = *reading_.table();
  if (table) preview_->showFaults(table->faults);
  plot_->showTable(table ? *table : SeriesTable());
  showCoverage();
  showStage();
  if (std::exchange(isWanted_, false)) startImport();
}

void SeriesImport::showCoverage() {
  coverage_->clear();
  if (!setup_.period || table() == nullptr || table()->times.empty()) return;
  const bool covers = ImportPlot::covers(*table(), *setup_.period);
  const QString period =
      tr("%1 to %2")
          .arg(textOf(dateTimeText((*setup_.period)[0])), textOf(dateTimeText((*setup_.period)[1])));
  coverage_->setText(covers ? tr("The series covers the simulation period, %1.").arg(period)
                            : tr("The series does not cover the simulation period, %1.").arg(period));
  colourText(coverage_, !covers);
}

// What was read; null for nothing.
const SeriesTable* SeriesImport::table() const {
  const std::optional<Result<SeriesTable>>& table = reading_.table();
  return table && *table ? &**table : nullptr;
}

// What stands in the way of an import; empty for nothing that is known.
QString SeriesImport::obstacle() const {
  const TableForm& form = reading_.form();
  if (const QString why = fields_->fault(); !why.isEmpty()) return why;
  if (const std::string why = faultOf(form); !why.empty()) return textOf(why);
  if (!reading_.table()) return {};
  if (table() == nullptr) return textOf(reading_.table()->error());
  if (table()->times.empty()) return tr("No line can be read; %1").arg(firstFault());
  if (const std::string why = faultOfItems(form); !why.empty()) return textOf(why) + '.';
  return result_->text().trimmed().isEmpty() ? tr("A name for the time series is missing.") : QString();
}

QString SeriesImport::firstFault() const {
  const TableFault& fault = table()->faults.front();
  return tr("line %1: %2.").arg(fault.line).arg(textOf(fault.why));
}

void SeriesImport::tell(const QString& text, bool isFault) {
  verdict_->setText(text);
  colourText(verdict_, isFault);
}

void SeriesImport::showVerdict() {
  if (work_.isRunning()) {
    tell(tr("Importing..."), false);
    import_->setEnabled(false);
    return;
  }
  const bool isThere = reading_.text() != nullptr;
  const QString fault = isThere ? obstacle() : QString();
  QString told;
  std::size_t bad = 0;
  if (reading_.isRecognising()) {
    told = tr("Looking at all lines...");
  } else if (isThere && !reading_.table()) {
    told = tr("Reading...");
  } else if (table() != nullptr) {
    bad = table()->faultCount;
    told = tr("%1 lines are read.").arg(table()->times.size());
    if (bad == 1) told += ' ' + tr("1 line can't be read and is left out; %1").arg(firstFault());
    if (bad > 1) told += ' ' + tr("%1 lines can't be read and are left out; %2").arg(bad).arg(firstFault());
  }
  tell(fault.isEmpty() ? told : fault, !fault.isEmpty() || bad > 0);
  import_->setEnabled(isThere && fault.isEmpty());
}

void SeriesImport::showProgress(double done) {
  constexpr int kParts = 1000;
  progress_->setRange(0, kParts);
  progress_->setValue(static_cast<int>(std::lround(done * kParts)));
  progress_->show();
}

// What can be used while something is at work beside the window. How far a look at all lines is isn't known.
void SeriesImport::showStage() {
  const bool isWriting = work_.isRunning();
  body_->setEnabled(!isWriting);
  const bool canBeCancelled = isWriting || reading_.isRecognising();
  if (isWriting) showProgress(0);
  if (!isWriting) progress_->setRange(0, 0);
  progress_->setVisible(canBeCancelled);
  cancel_->setVisible(canBeCancelled);
  showVerdict();
}

}  // namespace gridbay::shell
