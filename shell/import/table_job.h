#pragma once

#include <QObject>
#include <memory>
#include <thread>

#include "conversion/series_table.h"

namespace gridbay::shell {

// What was read from a table, or why nothing could be.
struct ReadTable {
  SeriesTable table;
  QString error;
};

// Reads a table in a thread of its own. A newer request ends the one that is at work.
class TableJob final : public QObject {
  Q_OBJECT
 public:
  explicit TableJob(QObject* parent);
  ~TableJob() override;

  void read(std::shared_ptr<const std::string> text, const TableForm& form);
  void stop();
  bool isAtWork() const { return isAtWork_; }

 signals:
  // How much is read, 0 to 1.
  void reached(double done);
  void finished(std::shared_ptr<const gridbay::shell::ReadTable> read);

 private:
  int number_ = 0;  // of the request
  bool isAtWork_ = false;
  std::jthread thread_;
};

}  // namespace gridbay::shell
