#pragma once

#include <QObject>
#include <QStringList>
#include <QTimer>
#include <memory>
#include <optional>
#include <vector>

#include "conversion/series_table.h"
#include "conversion/table_guess.h"
#include "shell/background_work.h"

namespace gridbay::shell {

// A table of text on its way to a series: how it is meant is recognised from its first lines at once, and
// from all of it in a copy of the process, where it is read then; and read again after each change.
class TableReading final : public QObject {
  Q_OBJECT
 public:
  explicit TableReading(QObject* parent);

  // Another table. The moment of time 0 stays, as do missing values that were typed before there was any.
  void show(std::shared_ptr<const std::string> text);
  // The user has said how fields are parted and how many heading lines there are.
  void showParted(char separator, int headerLines);

  // Null where there is none.
  const std::shared_ptr<const std::string>& text() const { return text_; }
  // As it was recognised, and as the user has it; who changes it has it read.
  TableForm& form() { return form_; }
  const TableForm& form() const { return form_; }
  // What the table leaves open, a sentence each.
  QStringList doubts() const;
  // What was read; nothing until it is.
  const std::optional<Result<SeriesTable>>& table() const { return table_; }

  // Reads it a moment after the last change, or at once where that moment is not over.
  void readSoon();
  void readChanged();
  bool isBusy() const { return changed_.isActive() || stage_ != Stage::idle; }
  // While all lines are recognised. That can be cancelled: what the first lines say is left then.
  bool isRecognising() const { return stage_ == Stage::recognising; }
  void stopRecognising();
  void stop();

 signals:
  // How it is meant is known, or better known.
  void recognised();
  // It is going to be read by another form, and has been.
  void changed();
  void progressed(double done);
  void read();

 private:
  enum class Stage { idle, recognising, reading };

  void recognise(char separator, int headerLines);
  void takeWork(const std::optional<std::string>& bytes);
  void takeWhole(TableGuess whole);
  void begin();

  std::shared_ptr<const std::string> text_;
  TableForm form_;
  TableGuess guess_;           // of the first lines or of all, as what the user changes is told apart by
  bool isOfFirst_ = false;     // and no more will come
  std::vector<double> typed_;  // before there was a table
  std::optional<Result<SeriesTable>> table_;
  Stage stage_ = Stage::idle;
  QTimer changed_;
  BackgroundWork work_{this};
};

}  // namespace gridbay::shell
