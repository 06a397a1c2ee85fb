#include "shell/import/table_job.h"

namespace gridbay::shell {

TableJob::TableJob(QObject* parent) : QObject(parent) {}

TableJob::~TableJob() = default;

void TableJob::stop() {
  ++number_;
  isAtWork_ = false;
  thread_ = {};  // asks it to end, and waits
}

void TableJob::read(std::shared_ptr<const std::string> text, const TableForm& form) {
  stop();
  isAtWork_ = true;
  thread_ =
      std::jthread([this, text = std::move(text), form, number = number_](const std::stop_token& token) {
        // What is told of a request that is over is dropped.
        const auto tell = [this, number](auto&& told) {
          QMetaObject::invokeMethod(
              this,
              [this, number, told] {
                if (number == number_) told();
              },
              Qt::QueuedConnection);
        };
        auto read = std::make_shared<ReadTable>();
        Result<SeriesTable> table = readSeriesTable(*text, form, [&](double done) {
          tell([this, done] { emit reached(done); });
          return !token.stop_requested();
        });
        if (table) {
          read->table = std::move(*table);
        } else {
          read->error = QString::fromStdString(table.error());
        }
        tell([this, read] {
          isAtWork_ = false;
          emit finished(read);
        });
      });
}

}  // namespace gridbay::shell
