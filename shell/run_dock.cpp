#include "shell/run_dock.h"

#include <QApplication>
#include <QFileInfo>
#include <QHBoxLayout>
#include <QRegularExpression>
#include <QStandardPaths>
#include <QTime>
#include <QVBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kMostLines = 100000;
constexpr int kTick = 1000;      // milliseconds
constexpr int kPatience = 5000;  // milliseconds until a stop is enforced
constexpr const char* kVariable = "GRIDBAY_ENGINE";

}  // namespace

RunDock::RunDock(QWidget* parent)
    : QDockWidget(tr("Run"), parent),
      output_(new QPlainTextEdit(this)),
      progress_(new QProgressBar(this)),
      state_(new QLabel(tr("Not started"), this)),
      stop_(new QPushButton(tr("S&top"), this)),
      engine_(new QProcess(this)) {
  setObjectName("run");
  auto* content = new QWidget(this);
  auto* layout = new QVBoxLayout(content);
  layout->setContentsMargins(0, 0, 0, 0);
  auto* bar = new QHBoxLayout();
  bar->addWidget(state_);
  bar->addWidget(progress_, 1);
  bar->addWidget(stop_);
  layout->addLayout(bar);
  layout->addWidget(output_);
  setWidget(content);
  output_->setReadOnly(true);
  output_->setMaximumBlockCount(kMostLines);
  output_->setAccessibleName(tr("Output of the engine"));
  progress_->setVisible(false);
  stop_->setEnabled(false);

  engine_->setProcessChannelMode(QProcess::MergedChannels);
  connect(engine_, &QProcess::readyReadStandardOutput, this, [this] { readOutput(); });
  connect(engine_, &QProcess::finished, this,
          [this](int status, QProcess::ExitStatus how) { finish(status, how); });
  connect(engine_, &QProcess::errorOccurred, this, [this](QProcess::ProcessError error) {
    if (error != QProcess::FailedToStart) return;
    output_->appendPlainText(tr("The engine could not be started: %1").arg(engine_->errorString()));
    finish(-1, QProcess::CrashExit);
  });
  connect(stop_, &QPushButton::clicked, this, [this] { stop(); });
  tick_.setInterval(kTick);
  connect(&tick_, &QTimer::timeout, this, [this] { showTime(); });
}

RunDock::~RunDock() {
  engine_->disconnect(this);
  if (!isRunning()) return;
  engine_->terminate();
  if (!engine_->waitForFinished(kPatience)) engine_->kill();
}

QString RunDock::findEngine(const QString& name, QString* error) {
  const QString named = qEnvironmentVariable(kVariable);
  if (!named.isEmpty()) {
    const QFileInfo program(named);
    if (program.isFile() && program.isExecutable()) return named;
    *error = tr("There is no engine \"%1\" that can be run; %2 names it.").arg(named, kVariable);
    return {};
  }
  const QString beside = QApplication::applicationDirPath();
  for (const QStringList& folders : {QStringList{beside}, QStringList{}}) {
    for (const QString& candidate : {name, QFileInfo(name).completeBaseName()}) {
      const QString found = QStandardPaths::findExecutable(candidate, folders);
      if (!found.isEmpty()) return found;
    }
  }
  *error = tr("There is no engine %1: it was looked for in %2, and on the PATH. %3 can name one.")
               .arg(name, beside, kVariable);
  return {};
}

bool RunDock::start(const EngineStart& start, QString* error) {
  if (isRunning()) {
    *error = tr("The engine is running. Stop it first, or wait for its end.");
    return false;
  }
  const QString program = findEngine(QString::fromStdString(start.engine), error);
  if (program.isEmpty()) return false;
  output_->clear();
  unfinished_.clear();
  stopped_ = false;
  progress_->setRange(0, 0);  // busy until the engine says how far it is
  progress_->setVisible(true);
  stop_->setEnabled(true);
  started_.start();
  tick_.start();
  const QFileInfo input(QString::fromStdString(start.input));
  engine_->setWorkingDirectory(input.absolutePath());
  engine_->start(program, {input.absoluteFilePath()});
  showTime();
  return true;
}

void RunDock::stop() {
  if (!isRunning()) return;
  stopped_ = true;
  engine_->terminate();
  QTimer::singleShot(kPatience, engine_, [this] {
    if (isRunning()) engine_->kill();
  });
}

void RunDock::readOutput() {
  unfinished_ += engine_->readAllStandardOutput();
  const qsizetype end = unfinished_.lastIndexOf('\n');
  if (end < 0) return;
  const QString text = QString::fromUtf8(unfinished_.first(end));
  unfinished_.remove(0, end + 1);
  output_->appendPlainText(text);

  static const QRegularExpression percent(R"((\d{1,3}(?:\.\d+)?) ?%)");
  QRegularExpressionMatch last;
  for (auto match = percent.globalMatch(text); match.hasNext();) last = match.next();
  if (!last.hasMatch()) return;
  progress_->setRange(0, 100);
  progress_->setValue(qBound(0, static_cast<int>(last.captured(1).toDouble()), 100));
}

void RunDock::finish(int status, QProcess::ExitStatus how) {
  unfinished_ += engine_->readAllStandardOutput();
  if (!unfinished_.isEmpty()) output_->appendPlainText(QString::fromUtf8(unfinished_));
  unfinished_.clear();
  tick_.stop();
  progress_->setVisible(false);
  stop_->setEnabled(false);
  const QString time =
      QTime::fromMSecsSinceStartOfDay(static_cast<int>(started_.elapsed())).toString("hh:mm:ss");
  state_->setText(stopped_                     ? tr("Stopped after %1").arg(time)
                  : how == QProcess::CrashExit ? tr("Ended abnormally after %1").arg(time)
                                               : tr("Ended with status %1 after %2").arg(status).arg(time));
  emit ended(status);
}

void RunDock::showTime() {
  state_->setText(
      tr("Running, %1")
          .arg(QTime::fromMSecsSinceStartOfDay(static_cast<int>(started_.elapsed())).toString("hh:mm:ss")));
}

}  // namespace gridbay::shell
