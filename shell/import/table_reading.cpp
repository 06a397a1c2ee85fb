#include "shell/import/table_reading.h"

#include <algorithm>
#include <string_view>

#include "shell/work_results.h"

namespace gridbay::shell {
namespace {

constexpr int kMoment = 120;  // milliseconds from a change to a new look
constexpr std::size_t kFirstLines = 2000;

std::string_view firstLines(std::string_view text) {
  std::size_t end = 0;
  for (std::size_t n = 0; n < kFirstLines; ++n) {
    end = text.find('\n', end);
    if (end == text.npos) return text;
    ++end;
  }
  return text.substr(0, end);
}

void add(const std::vector<double>& numbers, std::vector<double>& all) {
  for (const double number : numbers) {
    if (std::ranges::find(all, number) == all.end()) all.push_back(number);
  }
}

}  // namespace

TableReading::TableReading(QObject* parent) : QObject(parent) {
  changed_.setSingleShot(true);
  changed_.setInterval(kMoment);
  connect(&changed_, &QTimer::timeout, this, &TableReading::begin);
  connect(&work_, &BackgroundWork::progressed, this, &TableReading::progressed);
  connect(&work_, &BackgroundWork::ended, this, &TableReading::takeWork);
}

void TableReading::show(std::shared_ptr<const std::string> text) {
  typed_ = text_ == nullptr ? form_.missing : std::vector<double>();
  text_ = std::move(text);
  recognise(0, -1);
}

void TableReading::showParted(char separator, int headerLines) {
  typed_.clear();
  recognise(separator, headerLines);
}

void TableReading::recognise(char separator, int headerLines) {
  stop();
  const std::string_view first = firstLines(*text_);
  guess_ = guessTable(first, separator, headerLines);
  add(typed_, guess_.form.missing);
  guess_.form.start = form_.start;
  form_ = guess_.form;
  isOfFirst_ = false;
  if (first.size() < text_->size()) {
    table_.reset();
    stage_ = Stage::recognising;
    work_.begin([this, separator, headerLines](const WorkApart::Progress&) {
      return packed(guessTable(*text_, separator, headerLines));
    });
  }
  emit recognised();
  begin();
}

void TableReading::takeWork(const std::optional<std::string>& bytes) {
  if (stage_ == Stage::recognising) {
    stage_ = Stage::idle;
    isOfFirst_ = !bytes;
    if (bytes) takeWhole(unpackedGuess(*bytes));
    emit recognised();
    begin();
    return;
  }
  stage_ = Stage::idle;
  table_ =
      bytes ? unpackedTable(*bytes) : Failure{"The table can't be read: its reader came to a sudden end"};
  emit read();
}

// What the user has changed meanwhile stays.
void TableReading::takeWhole(TableGuess whole) {
  add(typed_, whole.form.missing);
  const auto take = [&](auto member) {
    if (form_.*member == guess_.form.*member) form_.*member = whole.form.*member;
  };
  take(&TableForm::decimalComma);
  take(&TableForm::dateOrder);
  take(&TableForm::timeUnit);
  take(&TableForm::missing);
  take(&TableForm::columns);
  guess_ = std::move(whole);
}

void TableReading::stopRecognising() {
  if (!isRecognising()) return;
  work_.stop();
  takeWork(std::nullopt);
}

void TableReading::stop() {
  changed_.stop();
  work_.stop();
  stage_ = Stage::idle;
}

QStringList TableReading::doubts() const {
  QStringList doubts;
  for (const std::vector<std::string>& said :
       {guess_.doubts, guess_.missingDoubts, std::vector<std::string>{guess_.dateOrderDoubt}}) {
    for (const std::string& doubt : said) {
      if (!doubt.empty()) doubts << QString::fromStdString(doubt) + '.';
    }
  }
  if (isOfFirst_) doubts << tr("Only the first %1 lines were looked at for this.").arg(kFirstLines);
  return doubts;
}

void TableReading::readSoon() {
  if (text_ != nullptr) changed_.start();
}

void TableReading::readChanged() {
  if (changed_.isActive()) begin();
}

void TableReading::begin() {
  changed_.stop();
  table_.reset();
  if (isRecognising()) {
    emit changed();
    return;
  }
  work_.stop();
  const bool canBeRead = faultOf(form_).empty();
  stage_ = canBeRead ? Stage::reading : Stage::idle;
  emit changed();
  if (!canBeRead) return;
  work_.begin([this](const WorkApart::Progress& progress) {
    return packed(readSeriesTable(*text_, form_, progress));
  });
}

}  // namespace gridbay::shell
