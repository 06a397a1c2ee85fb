#pragma once

#include <QDialog>
#include <QLabel>
#include <QProgressBar>
#include <QPushButton>
#include <QSpinBox>
#include <QTableView>
#include <QTimer>

#include "conversion/table_guess.h"
#include "shell/import/column_rows.h"
#include "shell/import/import_plot.h"
#include "shell/import/table_job.h"
#include "shell/import/table_preview.h"

namespace gridbay::shell {

// Brings a table of text in as a time series: from a file, or what is pasted. How it is read is recognised
// and shown, can be changed, and is seen at once in the preview and the plot; nothing is written before
// Import.
class SeriesImport final : public QDialog {
  Q_OBJECT
 public:
  // The simulation of the setup that is open, and the folder that its files are in; either may be none.
  SeriesImport(std::optional<Period> period, QString folder, QWidget* parent);

  ~SeriesImport() override;

  // Shows a table file; false, which is then said, when it can't be read.
  bool openTable(const QString& path);
  // Shows what the clipboard has; false when that is no text.
  bool pasteTable();
  // Writes the series, once all is read; false when it was not, which is said where there is an error.
  bool importTable();

  ColumnRows& columns() { return *columns_; }
  QTableView& preview() { return *previewView_; }
  TablePreview& lines() { return *preview_; }
  ImportPlot& plot() { return *plot_; }
  QComboBox* separator() { return separator_; }
  QComboBox* decimals() { return decimals_; }
  QSpinBox* headings() { return headings_; }
  QComboBox* dates() { return dates_; }
  QLineEdit* start() { return start_; }
  QLineEdit* result() { return result_; }
  QLabel* doubts() { return doubts_; }
  QLabel* verdict() { return verdict_; }
  QLabel* coverage() { return coverage_; }
  QPushButton* importButton() { return import_; }
  bool isReading() const { return job_->isAtWork() || rereading_.isActive(); }

 signals:
  void imported(const QString& path, const QString& summary);

 public slots:
  void reject() override;

 protected:
  void keyPressEvent(QKeyEvent* event) override;

 private:
  QWidget* buildSource();
  QWidget* buildReading();
  QWidget* buildResult();
  void browse();
  void showTable(std::shared_ptr<const std::string> text, const QString& title);
  void guess();
  void takeGuess(TableGuess guess);
  void showForm();
  void orderTabs();
  void takeForm();
  void reread();
  void showRead(const std::shared_ptr<const ReadTable>& read);
  QString obstacle() const;
  QString firstFault() const;
  void showVerdict();
  void setAtWork(bool atWork);
  bool mayReplace(const QString& path);

  std::optional<Period> period_;
  QString folder_;
  QString source_;  // the path of the table; empty for one that is pasted
  QString title_;
  std::shared_ptr<const std::string> text_;
  TableForm form_;
  std::shared_ptr<const ReadTable> read_;
  bool isWanted_ = false;  // the import, once all is read
  bool isWriting_ = false;
  bool isStopped_ = false;
  QTimer rereading_;

  QWidget* body_;
  QLabel* sourceText_ = nullptr;
  QComboBox* separator_ = nullptr;
  QComboBox* decimals_ = nullptr;
  QSpinBox* headings_ = nullptr;
  QComboBox* dates_ = nullptr;
  QLineEdit* missing_ = nullptr;
  QLineEdit* start_ = nullptr;
  QComboBox* timeUnit_ = nullptr;
  ColumnRows* columns_;
  TablePreview* preview_;
  QTableView* previewView_;
  ImportPlot* plot_;
  QLabel* doubts_;
  QLabel* coverage_;
  QLabel* verdict_;
  QLineEdit* result_ = nullptr;
  QPushButton* choose_ = nullptr;
  QProgressBar* progress_;
  QPushButton* import_;
  TableJob* job_;
};

}  // namespace gridbay::shell
