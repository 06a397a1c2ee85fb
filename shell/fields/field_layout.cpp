#include "shell/fields/field_layout.h"

#include <QWidget>
#include <algorithm>
#include <numeric>

namespace gridbay::shell {
namespace {

constexpr int kLabelGap = 10;
constexpr int kUnitGap = 6;
constexpr int kButtonGap = 6;
constexpr int kFieldGap = 20;
constexpr int kBlockGap = 12;
constexpr int kRowGap = 7;
constexpr int kMessageGap = 2;

bool isShownItem(const QLayoutItem* item) {
  return item != nullptr && !item->isEmpty();
}
int hintWidth(const QLayoutItem* item) {
  return isShownItem(item) ? item->sizeHint().width() : 0;
}
int hintHeight(const QLayoutItem* item) {
  return isShownItem(item) ? item->sizeHint().height() : 0;
}

void place(QLayoutItem* item, int x, int y, int width, int lineHeight) {
  const int height = std::min(hintHeight(item), lineHeight);
  item->setGeometry(QRect(x, y + (lineHeight - height) / 2, width, height));
}

}  // namespace

FieldLayout::FieldLayout(QWidget* parent) : QLayout(parent) {}

FieldLayout::~FieldLayout() {
  for (const QLayoutItem* item : items_) delete item;
}

QLayoutItem* FieldLayout::add(QWidget* widget) {
  if (widget == nullptr) return nullptr;
  addChildWidget(widget);
  items_.push_back(new QWidgetItem(widget));
  return items_.back();
}

void FieldLayout::addItem(QLayoutItem* item) {
  items_.push_back(item);
  rows_.push_back({{Kind::free, nullptr, item, nullptr, {}}});
}

void FieldLayout::addField(Kind kind, QWidget* label, QWidget* input, QWidget* unit, bool beside) {
  if (!beside || rows_.empty()) rows_.emplace_back();
  rows_.back().push_back({kind, add(label), add(input), add(unit), {}});
  invalidate();
}

void FieldLayout::addMessage(const QWidget* input, QWidget* message) {
  for (Row& row : rows_) {
    for (Cell& cell : row) {
      if (cell.input == nullptr || cell.input->widget() != input) continue;
      cell.messages.push_back(add(message));
      invalidate();
    }
  }
}

QLayoutItem* FieldLayout::itemAt(int index) const {
  return index >= 0 && index < count() ? items_[static_cast<std::size_t>(index)] : nullptr;
}

QLayoutItem* FieldLayout::takeAt(int index) {
  if (index < 0 || index >= count()) return nullptr;
  QLayoutItem* item = items_[static_cast<std::size_t>(index)];
  items_.erase(items_.begin() + index);
  for (Row& row : rows_) {
    for (Cell& cell : row) {
      for (QLayoutItem** part : {&cell.label, &cell.input, &cell.unit}) {
        if (*part == item) *part = nullptr;
      }
      std::erase(cell.messages, item);
    }
  }
  invalidate();
  return item;
}

void FieldLayout::invalidate() {
  isMeasured_ = false;
  QLayout::invalidate();
}

bool FieldLayout::isShown(const Cell& cell) {
  return isShownItem(cell.input);
}

bool FieldLayout::isBlockRow(const Row& row) {
  return std::ranges::any_of(row, [](const Cell& cell) { return cell.kind == Kind::block && isShown(cell); });
}

bool FieldLayout::stretches(const Cell& cell) {
  return isShown(cell) && cell.input->expandingDirections().testFlag(Qt::Horizontal);
}

// Whether a cell stands in a column with those of other rows: one behind a field that takes all the width
// there is can't.
bool FieldLayout::isAligned(const Row& row, std::size_t cell) const {
  if (row[cell].kind != Kind::labelled || (cell > 0 && !isShownItem(row[cell].label))) return false;
  return std::none_of(row.begin(), row.begin() + static_cast<std::ptrdiff_t>(cell), stretches);
}

FieldLayout::Extent FieldLayout::widthOf(const Cell& cell, int labelWidth) {
  if (!isShown(cell)) return {};
  int around = isShownItem(cell.unit) ? kUnitGap + hintWidth(cell.unit) : 0;
  const int label = cell.kind == Kind::labelled ? std::max(labelWidth, hintWidth(cell.label)) : 0;
  if (label > 0) around += label + kLabelGap;
  return {around + cell.input->minimumSize().width(), around + hintWidth(cell.input),
          around + std::max(cell.input->maximumSize().width(), hintWidth(cell.input))};
}

FieldLayout::Extent FieldLayout::heightOf(const Row& row) {
  Extent extent;
  for (const Cell& cell : row) {
    if (!isShown(cell)) continue;
    int below = 0;
    for (const QLayoutItem* message : cell.messages) {
      if (isShownItem(message)) below += kMessageGap + hintHeight(message);
    }
    const int line = std::max({hintHeight(cell.label), hintHeight(cell.input), hintHeight(cell.unit)});
    const int least = cell.kind == Kind::block ? cell.input->minimumSize().height() : line;
    extent.least = std::max(extent.least, least + below);
    extent.wanted = std::max(extent.wanted, line + below);
  }
  extent.most = extent.wanted;
  return extent;
}

const FieldLayout::Measures& FieldLayout::measures() const {
  if (isMeasured_) return measures_;
  measures_ = {};
  std::size_t cells = 0;
  for (const Row& row : rows_) {
    measures_.heights.push_back(heightOf(row));
    cells = std::max(cells, row.size());
  }
  measures_.columns.assign(cells, 0);
  measures_.labelWidths.assign(cells, 0);
  std::vector<Extent> ends(rows_.size());
  const auto gap = [](const Cell& cell) {
    return cell.kind == Kind::block ? kBlockGap : isShownItem(cell.label) ? kFieldGap : kButtonGap;
  };
  for (std::size_t k = 0; k < cells; ++k) {
    const auto eachShown = [&](const auto& visit) {
      for (std::size_t r = 0; r < rows_.size(); ++r) {
        if (k < rows_[r].size() && isShown(rows_[r][k])) visit(rows_[r], ends[r]);
      }
    };
    eachShown([&](const Row& row, const Extent& end) {
      if (isBlockRow(row) || !isAligned(row, k)) return;
      measures_.labelWidths[k] = std::max(measures_.labelWidths[k], hintWidth(row[k].label));
      if (k > 0) measures_.columns[k] = std::max(measures_.columns[k], end.wanted + gap(row[k]));
    });
    eachShown([&](const Row& row, Extent& end) {
      const bool aligned = !isBlockRow(row) && isAligned(row, k);
      const int from = end.wanted > 0 ? gap(row[k]) : 0;
      const Extent width = widthOf(row[k], aligned ? measures_.labelWidths[k] : 0);
      end.least += from + width.least;
      end.wanted = std::max(end.wanted + from, aligned ? measures_.columns[k] : 0) + width.wanted;
      for (const QLayoutItem* message : row[k].messages)
        measures_.width.wanted = std::max(measures_.width.wanted, hintWidth(message));
      measures_.expands = measures_.expands || stretches(row[k]);
    });
  }
  for (const Extent& end : ends) {
    measures_.width.least = std::max(measures_.width.least, end.least);
    measures_.width.wanted = std::max(measures_.width.wanted, end.wanted);
  }
  isMeasured_ = true;
  return measures_;
}

int FieldLayout::gapBefore(std::size_t row) const {
  if (measures_.heights[row].wanted == 0) return 0;
  for (std::size_t before = row; before-- > 0;) {
    if (measures_.heights[before].wanted == 0) continue;
    return isBlockRow(rows_[row]) || isBlockRow(rows_[before]) ? kBlockGap : kRowGap;
  }
  return 0;
}

QSize FieldLayout::sizeHint() const {
  const Measures& all = measures();
  int height = 0;
  for (std::size_t r = 0; r < rows_.size(); ++r) height += gapBefore(r) + all.heights[r].wanted;
  const QMargins margins = contentsMargins();
  return {all.width.wanted + margins.left() + margins.right(), height + margins.top() + margins.bottom()};
}

QSize FieldLayout::minimumSize() const {
  const Measures& all = measures();
  int height = 0;
  for (std::size_t r = 0; r < rows_.size(); ++r) height += gapBefore(r) + all.heights[r].least;
  const QMargins margins = contentsMargins();
  return {all.width.least + margins.left() + margins.right(), height + margins.top() + margins.bottom()};
}

Qt::Orientations FieldLayout::expandingDirections() const {
  return measures().expands ? Qt::Horizontal : Qt::Orientations();
}

std::vector<int> FieldLayout::shared(const std::vector<Extent>& extents, int room) {
  std::vector<int> sizes;
  for (const Extent& extent : extents) sizes.push_back(extent.wanted);
  int left = room - std::accumulate(sizes.begin(), sizes.end(), 0);
  if (left < 0) {
    // The highest level that all can be cut down to.
    const auto cut = [&](int level) {
      for (std::size_t i = 0; i < sizes.size(); ++i)
        sizes[i] = std::clamp(level, std::min(extents[i].least, extents[i].wanted), extents[i].wanted);
      return std::accumulate(sizes.begin(), sizes.end(), 0);
    };
    int low = 0;
    int high = room;
    while (low < high) {
      const int level = (low + high + 1) / 2;
      if (cut(level) <= room) {
        low = level;
      } else {
        high = level - 1;
      }
    }
    cut(low);
    return sizes;
  }
  while (left > 0) {
    std::vector<std::size_t> growing;
    for (std::size_t i = 0; i < sizes.size(); ++i) {
      if (sizes[i] < extents[i].most) growing.push_back(i);
    }
    if (growing.empty()) break;
    const int part = std::max(1, left / static_cast<int>(growing.size()));
    for (const std::size_t i : growing) {
      const int more = std::min({part, left, extents[i].most - sizes[i]});
      sizes[i] += more;
      left -= more;
    }
  }
  return sizes;
}

void FieldLayout::placeCell(const Cell& cell, const QRect& room, const QRect& bounds, int labelWidth,
                            int lineHeight) {
  int x = room.left();
  int width = room.width();
  if (cell.kind == Kind::labelled && labelWidth > 0) {
    if (isShownItem(cell.label)) {
      // Beside a tall input a label stands at its first line.
      const bool isTall = hintHeight(cell.input) > 2 * hintHeight(cell.label);
      place(cell.label, x, room.top(), labelWidth, isTall ? hintHeight(cell.label) + 4 : lineHeight);
    }
    x += labelWidth + kLabelGap;
    width -= labelWidth + kLabelGap;
  }
  // Where the field begins, or further left where the frame ends too soon.
  int messageTop = room.top() + lineHeight;
  for (QLayoutItem* message : cell.messages) {
    if (!isShownItem(message)) continue;
    messageTop += kMessageGap;
    const int wanted = std::min(hintWidth(message), bounds.width());
    const int left = std::max(bounds.left(), std::min(x, bounds.right() + 1 - wanted));
    message->setGeometry(QRect(left, messageTop, wanted, hintHeight(message)));
    messageTop += hintHeight(message);
  }
  const int unit = isShownItem(cell.unit) ? kUnitGap + hintWidth(cell.unit) : 0;
  place(cell.input, x, room.top(), width - unit, lineHeight);
  if (unit > 0)
    place(cell.unit, x + width - hintWidth(cell.unit), room.top(), hintWidth(cell.unit), lineHeight);
}

void FieldLayout::placeFields(const Row& row, QRect room) const {
  // The width that is left over, or missing, is that of the cells that stretch.
  int used = 0;
  int least = 0;
  int growing = 0;
  const auto labelWidthOf = [&](std::size_t k) {
    return isAligned(row, k) ? measures_.labelWidths[k] : hintWidth(row[k].label);
  };
  const auto first = static_cast<std::size_t>(std::ranges::find_if(row, isShown) - row.begin());
  const auto startOf = [&](std::size_t k, int end) {
    const int gap = k == first ? 0 : isShownItem(row[k].label) ? kFieldGap : kButtonGap;
    return std::max(end + gap, isAligned(row, k) ? measures_.columns[k] : 0);
  };
  int line = 0;
  for (std::size_t k = 0; k < row.size(); ++k) {
    if (!isShown(row[k])) continue;
    const Extent width = widthOf(row[k], labelWidthOf(k));
    const bool grows = stretches(row[k]);
    used = startOf(k, used) + (grows ? 0 : width.wanted);
    if (grows) {
      ++growing;
      least += width.least;
    }
    line = std::max({line, hintHeight(row[k].label), hintHeight(row[k].input), hintHeight(row[k].unit)});
  }
  const int share = growing == 0 ? 0 : std::max(room.width() - used, least) / growing;
  int end = 0;
  for (std::size_t k = 0; k < row.size(); ++k) {
    if (!isShown(row[k])) continue;
    const int labelWidth = labelWidthOf(k);
    const Extent width = widthOf(row[k], labelWidth);
    const int start = startOf(k, end);
    const int taken = stretches(row[k]) ? std::max(share, width.least) : width.wanted;
    placeCell(row[k], QRect(room.left() + start, room.top(), taken, room.height()), room, labelWidth, line);
    end = start + taken;
  }
}

void FieldLayout::placeBlocks(const Row& row, QRect room) const {
  const bool expands = std::ranges::any_of(row, stretches);
  std::vector<Extent> widths;
  int gaps = -kBlockGap;
  for (const Cell& cell : row) {
    if (!isShown(cell)) continue;
    Extent width = widthOf(cell, 0);
    if (cell.kind != Kind::block || (expands && !stretches(cell))) width.most = width.wanted;
    widths.push_back(width);
    gaps += kBlockGap;
  }
  const std::vector<int> taken = shared(widths, room.width() - gaps);
  int x = room.left();
  std::size_t i = 0;
  for (const Cell& cell : row) {
    if (!isShown(cell)) continue;
    const int width = taken[i++];
    if (cell.kind == Kind::block) {
      const QSize most = cell.input->maximumSize();
      cell.input->setGeometry(QRect(x, room.top(), width, std::min(room.height(), most.height())));
    } else {
      const int line = std::max({hintHeight(cell.label), hintHeight(cell.input), hintHeight(cell.unit)});
      placeCell(cell, QRect(x, room.top(), width, room.height()), room, hintWidth(cell.label), line);
    }
    x += width + kBlockGap;
  }
}

void FieldLayout::setGeometry(const QRect& rect) {
  QLayout::setGeometry(rect);
  const Measures& all = measures();
  QRect inside = rect.marginsRemoved(contentsMargins());
  std::vector<Extent> heights = all.heights;
  int gaps = 0;
  for (std::size_t r = 0; r < rows_.size(); ++r) gaps += gapBefore(r);
  const std::vector<int> taken = shared(heights, inside.height() - gaps);
  // Frames below each other end at the same width.
  const int blocks = all.expands ? inside.width() : std::min(inside.width(), all.width.wanted);
  int y = inside.top();
  for (std::size_t r = 0; r < rows_.size(); ++r) {
    if (all.heights[r].wanted == 0) continue;
    y += gapBefore(r);
    if (isBlockRow(rows_[r])) {
      placeBlocks(rows_[r], QRect(inside.left(), y, blocks, taken[r]));
    } else {
      placeFields(rows_[r], QRect(inside.left(), y, inside.width(), taken[r]));
    }
    y += taken[r];
  }
}

}  // namespace gridbay::shell
