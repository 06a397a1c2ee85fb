#include "shell/import/column_rows.h"

#include <QCompleter>
#include <QLabel>

#include "conversion/table_headings.h"
#include "platform/units/units.h"

namespace gridbay::shell {
namespace {

using Role = TableColumn::Role;

// An item type by its name: typed in part, or chosen.
QComboBox* makeTypes(QWidget* parent) {
  auto* types = new QComboBox(parent);
  types->setEditable(true);
  types->setInsertPolicy(QComboBox::NoInsert);
  for (const QunItem& quantity : qunItems())
    types->addItem(QString::fromUtf8(quantity.name.data(), static_cast<int>(quantity.name.size())),
                   quantity.code);
  types->completer()->setFilterMode(Qt::MatchContains);
  types->completer()->setCompletionMode(QCompleter::PopupCompletion);
  types->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  constexpr int kLetters = 18;
  types->setMinimumContentsLength(kLetters);
  return types;
}

}  // namespace

ColumnRows::ColumnRows(QWidget* parent) : QScrollArea(parent) {
  setWidgetResizable(true);
  setFrameShape(QFrame::NoFrame);
  setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
}

ColumnRows::~ColumnRows() {
  forgetRows();
}

// An edit that goes with the focus in it tells that it was left, and there is nobody any more to hear that.
void ColumnRows::forgetRows() {
  for (const Row& row : rows_) {
    for (QObject* each :
         std::initializer_list<QObject*>{row.role, row.name, row.type, row.type->lineEdit(), row.unit})
      disconnect(each, nullptr, this, nullptr);
  }
  rows_.clear();
}

void ColumnRows::showColumns(const std::vector<TableColumn>& columns) {
  columns_ = columns;
  forgetRows();
  auto* body = new QWidget(this);
  auto* grid = new QGridLayout(body);
  grid->setContentsMargins(0, 0, 6, 0);
  const QStringList titles{tr("Column"), tr("Name"), tr("Item type"), tr("Unit")};
  for (int i = 0; i < titles.size(); ++i) grid->addWidget(new QLabel(titles[i], body), 0, i);
  for (const TableColumn& column : columns_) rows_.push_back(makeRow(column, *grid));
  grid->setColumnStretch(1, 1);
  grid->setRowStretch(grid->rowCount(), 1);
  setWidget(body);
  setMinimumWidth(body->sizeHint().width());
  for (std::size_t i = 0; i < rows_.size(); ++i) enable(i);
}

ColumnRows::Row ColumnRows::makeRow(const TableColumn& column, QGridLayout& grid) {
  QWidget* body = grid.parentWidget();
  const Row row{new QComboBox(body), new QLineEdit(body), makeTypes(body), new QLineEdit(body)};
  const std::size_t place = rows_.size();
  const int line = static_cast<int>(place) + 1;
  // What is dropped on the window is a file.
  for (QLineEdit* edit : {row.name, row.type->lineEdit(), row.unit}) edit->setAcceptDrops(false);
  row.role->addItems(
      {tr("Item"), tr("Left out"), tr("Date"), tr("Time of day"), tr("Day number"), tr("Time since start")});
  row.role->setCurrentIndex(static_cast<int>(column.role));
  row.name->setText(QString::fromStdString(column.name));
  const int type = row.type->findData(column.itemType);
  row.type->setCurrentIndex(type);
  if (type < 0) row.type->clearEditText();
  row.unit->setText(QString::fromStdString(column.unit));
  constexpr int kUnitWidth = 70;
  row.unit->setFixedWidth(kUnitWidth);
  const QString which = tr("column %1").arg(line);
  row.role->setAccessibleName(tr("What %1 holds").arg(which));
  row.name->setAccessibleName(tr("Name of %1").arg(which));
  row.type->setAccessibleName(tr("Item type of %1").arg(which));
  row.unit->setAccessibleName(tr("Unit of %1").arg(which));
  grid.addWidget(row.role, line, 0);
  grid.addWidget(row.name, line, 1);
  grid.addWidget(row.type, line, 2);
  grid.addWidget(row.unit, line, 3);
  connect(row.role, &QComboBox::activated, this, [this, place] { take(place); });
  connect(row.type, &QComboBox::activated, this, [this, place] { take(place); });
  connect(row.type->lineEdit(), &QLineEdit::editingFinished, this, [this, place] { take(place); });
  connect(row.name, &QLineEdit::editingFinished, this, [this, place] { take(place); });
  connect(row.unit, &QLineEdit::editingFinished, this, [this, place] { take(place); });
  return row;
}

void ColumnRows::take(std::size_t place) {
  const Row& row = rows_[place];
  TableColumn& column = columns_[place];
  const TableColumn before = column;
  column.role = static_cast<Role>(row.role->currentIndex());
  column.name = row.name->text().trimmed().toStdString();
  const int type = row.type->findText(row.type->currentText().trimmed(), Qt::MatchFixedString);
  column.itemType = type < 0 ? 0 : row.type->itemData(type).toInt();
  const std::string unit = row.unit->text().trimmed().toStdString();
  const std::string known = unitOfHeading(unit);
  column.unit = known.empty() ? unit : known;
  enable(place);
  if (column != before) emit changed();
}

void ColumnRows::enable(std::size_t place) {
  const Row& row = rows_[place];
  const bool isItem = columns_[place].role == Role::item;
  for (QWidget* each : std::initializer_list<QWidget*>{row.name, row.type, row.unit})
    each->setEnabled(isItem);
  const QunUnit* base = isItem ? qunBaseUnit(columns_[place].itemType) : nullptr;
  row.unit->setPlaceholderText(
      base == nullptr ? QString()
                      : QString::fromUtf8(base->symbol.data(), static_cast<int>(base->symbol.size())));
}

}  // namespace gridbay::shell
