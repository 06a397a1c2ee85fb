#include "shell/import/series_form.h"

#include <QHBoxLayout>
#include <QLocale>
#include <QRegularExpression>
#include <QVBoxLayout>
#include <cmath>
#include <string_view>

#include "core/number_text.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

using Role = TableColumn::Role;

constexpr std::string_view kSeparators = "\t;, ";

QComboBox* listOf(const QStringList& texts, QWidget* parent) {
  auto* made = new QComboBox(parent);
  made->addItems(texts);
  return made;
}

std::optional<double> numberOf(QString text) {
  const std::optional<double> number = doubleOfText(text.replace(',', '.').toStdString());
  return number && std::isfinite(*number) ? number : std::nullopt;
}

QStringList wordsOf(const QString& text) {
  static const QRegularExpression between("[\\s;]+");
  return text.split(between, Qt::SkipEmptyParts);
}

}  // namespace

SeriesForm::SeriesForm(QWidget* parent)
    : QWidget(parent),
      separator_(listOf({tr("Tab"), tr("Semicolon"), tr("Comma"), tr("Blanks")}, this)),
      decimals_(listOf({tr("Point"), tr("Comma")}, this)),
      headings_(new QSpinBox(this)),
      dates_(listOf({tr("Year first"), tr("Day first"), tr("Month first")}, this)),
      missing_(new QLineEdit(this)),
      start_(new QLineEdit(this)),
      timeUnit_(listOf({"s", "min", "h", "d"}, this)),
      fault_(new QLabel(this)) {
  auto* layout = new QVBoxLayout(this);
  layout->setContentsMargins({});
  auto* row = new QHBoxLayout;
  layout->addLayout(row);
  layout->addWidget(fault_);
  const auto add = [this, row](const QString& text, QWidget* input) {
    auto* label = new QLabel(text, this);
    label->setBuddy(input);
    row->addWidget(label);
    row->addWidget(input);
  };
  constexpr int kMostHeadings = 10'000;
  headings_->setRange(0, kMostHeadings);
  missing_->setObjectName("missing");
  missing_->setToolTip(tr("Numbers that stand for missing values, with blanks between"));
  start_->setPlaceholderText("YYYY-MM-DD hh:mm:ss");
  constexpr int kAround = 16;
  start_->setMinimumWidth(start_->fontMetrics().horizontalAdvance(start_->placeholderText()) + kAround);
  add(tr("&Separator:"), separator_);
  add(tr("&Decimals:"), decimals_);
  add(tr("&Heading lines:"), headings_);
  add(tr("Da&tes:"), dates_);
  add(tr("&Missing:"), missing_);
  add(tr("Time &0:"), start_);
  add(tr("&Unit of time:"), timeUnit_);
  row->addStretch();
  fault_->setObjectName("missingFault");
  fault_->setAlignment(Qt::AlignHCenter);
  fault_->hide();
  connect(separator_, &QComboBox::activated, this, &SeriesForm::partsChanged);
  connect(headings_, &QSpinBox::valueChanged, this, &SeriesForm::partsChanged);
  for (QComboBox* each : {decimals_, dates_, timeUnit_})
    connect(each, &QComboBox::activated, this, &SeriesForm::changed);
  // Not when it is only left.
  for (QLineEdit* each : {missing_, start_}) {
    connect(each, &QLineEdit::editingFinished, this, [this, each] {
      if (!each->isModified()) return;
      each->setModified(false);
      emit changed();
    });
  }
  connect(missing_, &QLineEdit::textChanged, this, [this] {
    showFault();
    emit typed();
  });
}

char SeriesForm::separatorChosen() const {
  return kSeparators[static_cast<std::size_t>(separator_->currentIndex())];
}

void SeriesForm::showForm(const TableForm& form) {
  const QSignalBlocker quiet(this);
  const QSignalBlocker still(headings_);
  separator_->setCurrentIndex(static_cast<int>(kSeparators.find(form.separator)));
  decimals_->setCurrentIndex(form.decimalComma ? 1 : 0);
  headings_->setValue(form.headerLines);
  dates_->setCurrentIndex(static_cast<int>(form.dateOrder));
  QStringList missing;
  for (const double number : form.missing)
    missing << QString::number(number, 'g', QLocale::FloatingPointShortest);
  // What is being typed stays.
  if (!missing_->isModified()) missing_->setText(missing.join(' '));
  if (!start_->isModified()) start_->setText(QString::fromStdString(form.start));
  timeUnit_->setCurrentText(QString::fromStdString(form.timeUnit));
  enable(form);
}

void SeriesForm::enable(const TableForm& form) {
  const bool isNumeric = form.hasRole(Role::time);
  start_->setEnabled(isNumeric);
  timeUnit_->setEnabled(isNumeric);
  dates_->setEnabled(form.hasRole(Role::date));
}

void SeriesForm::takeInto(TableForm& form) const {
  form.decimalComma = decimals_->currentIndex() == 1;
  form.dateOrder = static_cast<DateOrder>(dates_->currentIndex());
  form.start = start_->text().trimmed().toStdString();
  form.timeUnit = timeUnit_->currentText().toStdString();
  if (const auto numbers = missingNumbers()) form.missing = *numbers;
}

std::optional<std::vector<double>> SeriesForm::missingNumbers() const {
  std::vector<double> numbers;
  for (const QString& word : wordsOf(missing_->text())) {
    const std::optional<double> number = numberOf(word);
    if (!number) return std::nullopt;
    numbers.push_back(*number);
  }
  return numbers;
}

QString SeriesForm::fault() const {
  for (const QString& word : wordsOf(missing_->text())) {
    if (!numberOf(word))
      return tr("Missing: \"%1\" is no number. Empty fields, NaN and the like are missing by themselves.")
          .arg(word);
  }
  return {};
}

void SeriesForm::showFault() {
  const QString why = fault();
  QPalette colours;
  if (!why.isEmpty()) {
    const QColor red = faultColour(palette());
    colours.setColor(QPalette::Text, red);
    colours.setColor(QPalette::WindowText, red);
  }
  missing_->setPalette(colours);
  fault_->setPalette(colours);
  fault_->setText(why);
  fault_->setVisible(!why.isEmpty());
}

}  // namespace gridbay::shell
