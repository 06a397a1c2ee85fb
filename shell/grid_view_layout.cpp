// The widths, heights and sizes of a grid's widget.

#include <QScrollBar>
#include <algorithm>
#include <cmath>

#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

// Widths of columns are told in pixels of a font whose letters are this wide.
constexpr int kCharWidth = 5;
// Columns of text are those that are told to be at least this wide; they take the width that is left.
constexpr int kTextWidth = 100;
constexpr double kLeastText = 0.6;  // of the width that they want
// A grid with no columns of text grows so far.
constexpr double kMostGrowth = 1.5;
constexpr int kSampledRows = 12;
constexpr int kLongestSample = 32;  // letters
constexpr int kRowsAtLeast = 5;
constexpr int kLettersOfText = 40;  // of the least width
constexpr int kLettersOfNumbers = 60;
constexpr int kManyRows = 10;

}  // namespace

void GridView::setStretches(bool stretches) {
  stretches_ = stretches;
  setSizePolicy(stretches && hasText_ ? QSizePolicy::Expanding : QSizePolicy::Preferred,
                QSizePolicy::Preferred);
}

// Follows what the grid says of itself. Widths stay as they are while the columns are the same ones.
void GridView::layOutGrid() {
  QStringList headers;
  for (int column = 0; column < model_->columnCount(); ++column)
    headers << model_->headerData(column, Qt::Horizontal, Qt::DisplayRole).toString();
  bool isOther = headers != shownHeaders_;
  for (int column = 0; column < headers.size() && !isOther; ++column)
    isOther = isColumnHidden(column) == model_->grid().OnTrackColWidth(column + 1);
  if (isOther || (shownRows_ == 0 && model_->rowCount() > 0)) measureColumns();
  layOutRows();
  fitSize();
  followCurrentRow();
  const bool isEnabled = model_->grid().IsEnabled();
  const Qt::FocusPolicy policy = isEnabled ? Qt::StrongFocus : Qt::NoFocus;
  if (focusPolicy() != policy) setFocusPolicy(policy);
}

// The width that a column wants: what it is told, and no less than its header's longest word and what stands
// in its first rows.
int GridView::measured(int column) const {
  const QFontMetrics metrics = fontMetrics();
  CV27SetupGridWnd& grid = model_->grid();
  int width = grid.GetColWidth(column + 1) * metrics.averageCharWidth() / kCharWidth;
  if (grid.ShowsHeaders() && grid.GetHeaderSpan(column + 1) == 1) {
    const QString header = model_->headerData(column, Qt::Horizontal, Qt::DisplayRole).toString();
    for (const QString& word : header.split(' ', Qt::SkipEmptyParts))
      width = std::max(width, metrics.horizontalAdvance(word) + 2 * metrics.averageCharWidth());
  }
  for (int row = 0; row < std::min(kSampledRows, model_->rowCount()); ++row) {
    const CellStyle cell = model_->style(model_->index(row, column));
    if (cell.isHeading || cell.isHeader || cell.span > 1) continue;
    int text = metrics.horizontalAdvance(shownText(cell).trimmed().left(kLongestSample));
    for (const std::string& choice : cell.choices) {
      if (cell.kind == CellKind::dropDown)
        text = std::max(text, metrics.horizontalAdvance(QString::fromStdString(choice).left(kLongestSample)));
    }
    width = std::max(width, text + CellDelegate::aroundText(cell.kind, metrics));
  }
  return width;
}

// Whether a column holds text that is typed, by its first rows: that may be long.
bool GridView::isTextColumn(int column) const {
  if (model_->grid().GetColWidth(column + 1) < kTextWidth) return false;
  for (int row = 0; row < std::min(kSampledRows, model_->rowCount()); ++row) {
    const CellStyle cell = model_->style(model_->index(row, column));
    const bool isTyped = cell.kind == CellKind::plain || cell.kind == CellKind::resultFile ||
                         cell.kind == CellKind::multiChoice;
    if (isTyped && !cell.isHeader && !cell.isHeading && !cell.readOnly && cell.align == CellAlign::left)
      return true;
  }
  return false;
}

void GridView::measureColumns() {
  CV27SetupGridWnd& grid = model_->grid();
  shownHeaders_.clear();
  columns_.assign(static_cast<std::size_t>(model_->columnCount()), {});
  for (int i = 0; i < model_->columnCount(); ++i) {
    shownHeaders_ << model_->headerData(i, Qt::Horizontal, Qt::DisplayRole).toString();
    setColumnHidden(i, !grid.OnTrackColWidth(i + 1));
    if (isColumnHidden(i)) continue;
    Column& column = columns_[static_cast<std::size_t>(i)];
    column.natural = measured(i);
    column.least = column.natural;
    if (!isTextColumn(i)) continue;
    column.growth = grid.GetColWidth(i + 1);
    column.least = static_cast<int>(column.natural * kLeastText);
  }
  const bool hasText = std::ranges::any_of(columns_, [](const Column& column) { return column.growth > 0; });
  hasText_ = hasText;
  setStretches(stretches_);
  int rowHeader = grid.GetColWidth(0) * fontMetrics().averageCharWidth() / kCharWidth;
  for (int row = 0; row < std::min(kSampledRows, model_->rowCount()); ++row) {
    const QString text = model_->headerData(row, Qt::Vertical, Qt::DisplayRole).toString().trimmed();
    rowHeader = std::max(rowHeader, fontMetrics().horizontalAdvance(text.left(2 * kLongestSample)) +
                                        CellDelegate::aroundText(CellKind::plain, fontMetrics()));
  }
  rowHeader_->setExtent(rowHeader);
  shareWidth();
}

int GridView::naturalWidth() const {
  int width = 2 * frameWidth() + (rowHeader_->isHidden() ? 0 : rowHeader_->sizeHint().width());
  for (const Column& column : columns_) width += column.natural;
  return width;
}

// Gives the columns the width that there is. What is beyond their wishes goes to those of text, or a part to
// each; what is missing is taken from those of text.
void GridView::shareWidth() {
  isSharing_ = true;
  int left = viewport()->width();
  int growth = 0;
  int natural = 0;
  int slack = 0;
  for (std::size_t i = 0; i < columns_.size(); ++i) {
    const Column& column = columns_[i];
    left -= column.isUserSized ? columnWidth(static_cast<int>(i)) : column.natural;
    if (column.isUserSized) continue;
    growth += column.growth;
    natural += column.natural;
    slack += column.natural - column.least;
  }
  left = std::max(left, -slack);
  const auto weight = [&](const Column& column) {
    return left < 0 ? column.natural - column.least : growth > 0 ? column.growth : column.natural;
  };
  const int whole = left < 0 ? slack : growth > 0 ? growth : natural;
  int given = 0;
  int weights = 0;
  for (std::size_t i = 0; i < columns_.size(); ++i) {
    const Column& column = columns_[i];
    if (column.isUserSized || column.natural == 0) continue;
    weights += weight(column);
    const int upTo = whole == 0 ? 0 : static_cast<int>(std::lround(1.0 * left * weights / whole));
    const int width = column.natural + upTo - given;
    given = upTo;
    if (columnWidth(static_cast<int>(i)) != width) setColumnWidth(static_cast<int>(i), width);
  }
  isSharing_ = false;
  if (!columnHeader_->isHidden()) columnHeader_->setExtent(columnHeader_->neededHeight());
}

void GridView::layOutRows() {
  const int usual = rowHeader_->defaultSectionSize();
  for (int row = 0; row < model_->rowCount(); ++row) {
    const int height = static_cast<int>(std::lround(model_->grid().GetRowLook(row + 1).height * usual));
    if (rowHeight(row) != height) setRowHeight(row, height);
  }
  shownRows_ = model_->rowCount();
}

int GridView::rowsHeight() const {
  const int header = columnHeader_->isHidden() ? 0 : columnHeader_->sizeHint().height();
  int slack = 0;
  for (const Column& column : columns_) slack += column.natural - column.least;
  const bool scrolls = naturalWidth() - slack > width() && testAttribute(Qt::WA_Resized);
  return header + rowHeader_->length() + 2 * frameWidth() +
         (scrolls ? horizontalScrollBar()->sizeHint().height() : 0);
}

// With no rows there is still room for one, so that a grid is seen to be one.
QSize GridView::sizeHint() const {
  const int least = shownRows_ == 0 ? rowHeader_->defaultSectionSize() : 0;
  // Many rows are scrolled through.
  const int scroll = shownRows_ > kManyRows ? verticalScrollBar()->sizeHint().width() : 0;
  return {naturalWidth() + scroll, rowsHeight() + least};
}

QSize GridView::minimumSizeHint() const {
  // Text may be cut; what is short and holds none is seen whole.
  const int letters = hasText_ ? kLettersOfText : kLettersOfNumbers;
  const int rows = std::max(0, shownRows_ - kRowsAtLeast) * rowHeader_->defaultSectionSize();
  const QSize wanted = sizeHint();
  return {std::min(wanted.width(), letters * fontMetrics().averageCharWidth()),
          std::max(wanted.height() - rows, 0)};
}

void GridView::fitSize() {
  const bool hasText = sizePolicy().horizontalPolicy() == QSizePolicy::Expanding;
  const QSize most(hasText ? QWIDGETSIZE_MAX : static_cast<int>(sizeHint().width() * kMostGrowth),
                   sizeHint().height());
  if (maximumSize() != most) setMaximumSize(most);
  updateGeometry();
}

void GridView::resizeEvent(QResizeEvent* event) {
  QTableView::resizeEvent(event);
  shareWidth();
  fitSize();
}

}  // namespace gridbay::shell
