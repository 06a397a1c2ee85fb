#pragma once

#include <QDockWidget>
#include <QElapsedTimer>
#include <QLabel>
#include <QPlainTextEdit>
#include <QProcess>
#include <QProgressBar>
#include <QPushButton>
#include <QTimer>

#include "pages/host.h"

namespace gridbay::shell {

// A run of the engine: what it prints, how far it is, how long it has taken, its end, and a way to stop it.
class RunDock final : public QDockWidget {
  Q_OBJECT
 public:
  explicit RunDock(QWidget* parent);
  ~RunDock() override;

  // Starts the engine that GRIDBAY_ENGINE names, or the one beside this program or on the PATH. When there is
  // none, or one is running, the reason is in `error`.
  bool start(const EngineStart& start, QString* error);
  // Asks the engine to end, and kills it when it does not within some seconds.
  void stop();
  bool isRunning() const { return engine_->state() != QProcess::NotRunning; }

  QPlainTextEdit& output() { return *output_; }
  QProgressBar& progress() { return *progress_; }
  QLabel& state() { return *state_; }
  QPushButton& stopButton() { return *stop_; }
  QProcess& engine() { return *engine_; }

 signals:
  void ended(int status);

 private:
  static QString findEngine(const QString& name, QString* error);
  void readOutput();
  void finish(int status, QProcess::ExitStatus how);
  void showTime();

  QPlainTextEdit* output_;
  QProgressBar* progress_;
  QLabel* state_;
  QPushButton* stop_;
  QProcess* engine_;
  QElapsedTimer started_;
  QTimer tick_;
  bool stopped_ = false;
  QByteArray unfinished_;  // a line that the engine has not ended yet
};

}  // namespace gridbay::shell
