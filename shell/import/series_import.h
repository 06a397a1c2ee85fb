#pragma once

#include <QDialog>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QTableView>
#include <cstdint>
#include <memory>
#include <optional>
#include <utility>

#include "platform/files/file_stamp.h"
#include "shell/background_work.h"
#include "shell/import/column_rows.h"
#include "shell/import/import_plot.h"
#include "shell/import/series_form.h"
#include "shell/import/table_preview.h"
#include "shell/import/table_reading.h"
#include "shell/import/use_strip.h"

namespace gridbay::shell {

// Brings a table of text in as a time series: from a file, or what is pasted. How it is read is recognised
// and shown, can be changed, and is seen at once in the preview and the plot; nothing is written before
// Import. It is recognised, read and written in a copy of the process, so that the window never waits.
class SeriesImport final : public QDialog {
  Q_OBJECT
 public:
  // Of the setup that is open: its simulation, and the folder that its files are in; either may be none.
  struct Setup {
    std::optional<Period> period = {};
    QString folder = {};
    // Which one, and in which state: while that is the same the uses are not looked for again.
    std::optional<std::pair<const void*, std::uint64_t>> state = {};
  };

  // `setup` is asked for whenever the window is turned to, as is `uses`, after a change of the setup, for a
  // series that has been written.
  SeriesImport(std::function<Setup()> setup, std::function<UseStrip::Offer(const QString& series)> uses,
               QWidget* parent);
  ~SeriesImport() override;

  // Shows a table file; false, which is then said, when it can't be read.
  bool openTable(const QString& path);
  // Shows what the clipboard has; false when that is no text.
  bool pasteTable();

  SeriesForm& form() { return *fields_; }
  ColumnRows& columns() { return *columns_; }
  QTableView& preview() { return *previewView_; }
  TablePreview& lines() { return *preview_; }
  ImportPlot& plot() { return *plot_; }
  QLineEdit* result() { return result_; }
  QLabel* doubts() { return doubts_; }
  QLabel* verdict() { return verdict_; }
  QLabel* coverage() { return coverage_; }
  QPushButton* importButton() { return import_; }
  bool isReading() const { return reading_.isBusy() && !isImporting(); }
  // It is being written, or is going to be once all is read.
  bool isImporting() const { return work_.isRunning() || isWanted_; }

 signals:
  void imported(const QString& summary);
  void viewWanted(const QString& series);
  void helpWanted();

 protected:
  void keyPressEvent(QKeyEvent* event) override;
  void changeEvent(QEvent* event) override;
  void done(int result) override;

 private:
  static QLabel* makeText(QWidget* parent);
  QWidget* buildSource();
  QWidget* buildMiddle();
  QWidget* buildResult();
  QWidget* buildButtons();
  void browse();
  void showTable(std::shared_ptr<const std::string> text, const QString& title);
  void showForm();
  void orderTabs();
  void formChanged();
  void readSoon();
  void showChanged();
  void showRead();
  void takeSetup();
  void showCoverage();
  const SeriesTable* table() const;
  QString obstacle() const;
  QString firstFault() const;
  void showVerdict();
  void tell(const QString& text, bool isFault);
  void startImport();
  void write(const QString& path);
  void takeImport(const std::optional<std::string>& bytes);
  void cancel();
  void showProgress(double done);
  void showStage();
  bool mayReplace(const QString& path);

  std::function<Setup()> findSetup_;
  Setup setup_;
  QString source_;  // the path of the table; empty for one that is pasted
  QString title_;
  TableReading reading_{this};
  bool isWanted_ = false;            // the import, once all is read
  QString made_;                     // the series that is being made, or was
  std::optional<FileStamp> before_;  // what was there before it
  BackgroundWork work_{this};        // that writes it

  QWidget* body_;
  QLabel* sourceText_ = nullptr;
  SeriesForm* fields_;
  ColumnRows* columns_;
  TablePreview* preview_;
  QTableView* previewView_;
  ImportPlot* plot_;
  QLabel* doubts_;
  QLabel* coverage_;
  QLabel* verdict_;
  QLineEdit* result_ = nullptr;
  QPushButton* choose_ = nullptr;
  UseStrip* uses_;
  QProgressBar* progress_ = nullptr;
  QPushButton* cancel_ = nullptr;
  QPushButton* import_ = nullptr;
  QPushButton* help_ = nullptr;
  QPushButton* close_ = nullptr;
};

}  // namespace gridbay::shell
