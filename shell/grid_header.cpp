#include "shell/grid_header.h"

#include <QPainter>
#include <algorithm>

#include "shell/grid_model.h"
#include "shell/shades.h"

namespace gridbay::shell {
namespace {

constexpr int kPadding = 5;

}  // namespace

GridHeader::GridHeader(GridModel& model, Qt::Orientation orientation, QWidget* parent)
    : QHeaderView(orientation, parent), model_(model) {
  setSectionsClickable(true);
  setHighlightSections(true);
  setMinimumSectionSize(8);
}

void GridHeader::setExtent(int extent) {
  if (extent == extent_) return;
  extent_ = extent;
  updateGeometry();
  emit geometriesChanged();
}

QSize GridHeader::sizeHint() const {
  return orientation() == Qt::Horizontal ? QSize(0, extent_) : QSize(extent_, 0);
}

std::pair<int, int> GridHeader::covered(int logical) const {
  int first = logical;
  while (first > 0 && model_.grid().GetHeaderSpan(first + 1) == 0) --first;
  const int span = std::clamp(model_.grid().GetHeaderSpan(first + 1), 1, count() - first);
  if (first + span <= logical) return {logical, 1};
  return {first, span};
}

int GridHeader::neededHeight() const {
  int lines = fontMetrics().height();
  for (int column = 0; column < count(); ++column) {
    const auto [first, span] = covered(column);
    if (first != column) continue;
    int width = 0;
    for (int i = first; i < first + span; ++i) width += sectionSize(i);
    if (width == 0) continue;
    const QString text = model_.headerData(column, Qt::Horizontal, Qt::DisplayRole).toString().trimmed();
    const QRect room(0, 0, std::max(1, width - 2 * kPadding), 1000);
    lines = std::max(lines, fontMetrics().boundingRect(room, Qt::TextWordWrap, text).height());
  }
  return lines + 2 * kPadding;
}

void GridHeader::paintSection(QPainter* painter, const QRect& rect, int logical) const {
  if (!rect.isValid()) return;
  const bool isRow = orientation() == Qt::Vertical;
  QRect whole = rect;
  int first = logical;
  int span = 1;
  if (!isRow) {
    std::tie(first, span) = covered(logical);
    whole.setLeft(sectionViewportPosition(first));
    int width = 0;
    for (int i = first; i < first + span; ++i) width += sectionSize(i);
    whole.setWidth(width);
  }
  const bool enabled = model_.grid().IsEnabled();
  const QColor line = lineColour(palette());
  QColor ground = headerGround(palette());
  const auto* view = qobject_cast<const QAbstractItemView*>(parentWidget());
  const QModelIndex current = view != nullptr ? view->currentIndex() : QModelIndex();
  const int at = isRow ? current.row() : current.column();
  if (current.isValid() && view->hasFocus() && at >= first && at < first + span)
    ground = blend(ground, palette().color(QPalette::Highlight), 0.22);
  painter->save();
  painter->setClipRect(whole);
  painter->fillRect(whole, ground);
  painter->fillRect(QRect(whole.right(), whole.top(), 1, whole.height()), line);
  painter->fillRect(QRect(whole.left(), whole.bottom(), whole.width(), 1), line);
  if (isRow && model_.grid().GetRowLook(logical + 1).lineBelow)
    painter->fillRect(QRect(whole.left(), whole.bottom() - 1, whole.width(), 2),
                      blend(line, palette().color(QPalette::Text), 0.45));
  painter->setPen(palette().color(enabled ? QPalette::Active : QPalette::Disabled, QPalette::WindowText));
  const QString text = model_.headerData(first, orientation(), Qt::DisplayRole).toString().trimmed();
  const QRect room = whole.adjusted(kPadding, 0, -kPadding, 0);
  if (isRow) {
    const bool isNumber = std::all_of(text.begin(), text.end(), [](QChar c) { return c.isDigit(); });
    painter->drawText(room, static_cast<int>(isNumber ? Qt::AlignCenter : Qt::AlignLeft | Qt::AlignVCenter),
                      fontMetrics().elidedText(text, Qt::ElideRight, room.width()));
  } else {
    painter->drawText(room, Qt::AlignCenter | Qt::TextWordWrap, text);
  }
  painter->restore();
}

}  // namespace gridbay::shell
