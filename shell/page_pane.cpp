#include "shell/page_pane.h"

#include <QApplication>
#include <QContextMenuEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QMetaMethod>
#include <QScreen>
#include <QStyle>
#include <QVBoxLayout>
#include <algorithm>
#include <unordered_map>
#include <unordered_set>

#include "shell/fields/frame.h"
#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

constexpr int kMargin = 16;
constexpr QMargins kFrameMargins(12, 10, 12, 12);

QLabel* makeCaption(const QString& text, QWidget* parent) {
  auto* caption = new QLabel(text, parent);
  QFont font = caption->font();
  font.setPointSizeF(font.pointSizeF() * 1.4);
  font.setBold(true);
  caption->setFont(font);
  caption->setTextFormat(Qt::PlainText);
  return caption;
}

QLabel* makeHeading(QWidget* parent) {
  auto* heading = new QLabel(parent);
  QFont font = heading->font();
  font.setWeight(QFont::DemiBold);
  heading->setFont(font);
  heading->setTextFormat(Qt::PlainText);
  return heading;
}

bool holds(const FieldPick& pick, const Control& control) {
  return std::ranges::find(pick.fields, &control) != pick.fields.end();
}

class Picture final : public QLabel {
 public:
  Picture(const QString& path, const QString& text, QWidget* parent) : QLabel(text, parent), picture_(path) {
    setAlignment(Qt::AlignCenter);
  }

 protected:
  void resizeEvent(QResizeEvent* event) override {
    QLabel::resizeEvent(event);
    if (!picture_.isNull()) setPixmap(picture_.scaled(size()));
  }

 private:
  QPixmap picture_;
};

}  // namespace

PagePane::PagePane(QWidget* parent) : QScrollArea(parent) {
  setWidgetResizable(true);
  setFrameShape(QFrame::NoFrame);
}

void PagePane::clear() {
  if (form_ != nullptr) commit();
  parts_.clear();
  form_ = nullptr;
  picks_ = {};
  lastFields_ = nullptr;
  keys_ = {};
  delete takeWidget();
}

QWidget* PagePane::startPage(const QString& caption) {
  clear();
  auto* page = new QWidget(this);
  auto* layout = new QVBoxLayout(page);
  layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  layout->setSpacing(kMargin - 4);
  if (!caption.isEmpty()) layout->addWidget(makeCaption(caption, page));
  return page;
}

void PagePane::showText(const QString& caption, const QString& text) {
  QWidget* page = startPage(caption);
  auto* body = new QLabel(text, page);
  body->setWordWrap(true);
  body->setTextFormat(Qt::MarkdownText);
  body->setTextInteractionFlags(Qt::TextBrowserInteraction);
  auto* layout = static_cast<QVBoxLayout*>(page->layout());
  layout->addWidget(body);
  layout->addStretch();
  setWidget(page);
}

void PagePane::showPicture(const QString& path, const QString& text) {
  clear();
  setWidget(new Picture(path, text, this));
}

void PagePane::showForm(const QString& caption, Form& form, std::span<const FieldPick> picks) {
  QWidget* page = startPage(caption);
  form_ = &form;
  picks_ = picks;
  lastFields_ = picks.empty() ? nullptr : picks.data();
  auto* body = new QWidget(page);
  auto* bodyLayout = new FieldLayout(body);
  bodyLayout->setContentsMargins(0, 0, 0, 0);
  static_cast<QVBoxLayout*>(page->layout())->addWidget(body, 1);

  std::unordered_set<const Control*> bodies;
  for (const Control& control : form.controls()) bodies.insert(control.group);
  std::unordered_map<const Control*, QWidget*> insides{{nullptr, body}};
  for (Control& control : form.controls()) {
    QWidget* inside = insides[control.group];
    parts_.push_back(makePart(control, inside, bodies.contains(&control)));
    const Part& part = parts_.back();
    auto& layout = static_cast<FieldLayout&>(*inside->layout());
    place(part, layout, control.beside);
    if (part.field != nullptr) connectField(*part.field, layout);
    if (bodies.contains(&control)) {
      auto* frameLayout = new FieldLayout(part.widget);
      frameLayout->setContentsMargins(kFrameMargins);
      insides[&control] = part.widget;
    }
  }
  setTabOrder();
  refresh();
  setWidget(page);
}

PagePane::Part PagePane::makePart(Control& control, QWidget* parent, bool hasBody) {
  if (control.kind == ControlKind::group) {
    if (!hasBody) return {&control, makeHeading(parent)};
    auto* frame = new Frame(parent);
    if (control.alignRight)
      frame->setSizePolicy(QSizePolicy::Expanding, frame->sizePolicy().verticalPolicy());
    return {&control, frame};
  }
  if (control.kind == ControlKind::grid) {
    auto* grid = new GridView(*control.grid, parent);
    grid->setStretches(control.alignRight);
    grid->cells().setReadOnly(readOnly_);
    // What a cell changes may show in other controls.
    connect(grid, &GridView::edited, this, &PagePane::refresh);
    connect(grid, &GridView::cellChosen, this, [this, grid] {
      lastGrid_ = grid;
      lastFields_ = nullptr;
      emit cellChosen();
    });
    grid->setContextMenuPolicy(Qt::CustomContextMenu);
    connect(grid, &QWidget::customContextMenuRequested, this,
            [this, grid](QPoint at) { offerPick(*grid, at); });
    return {&control, grid, nullptr, grid};
  }
  Part part{&control, nullptr, makeField(control, keys_, parent)};
  part.widget = part.field->input();
  if (std::ranges::any_of(picks_, [&](const FieldPick& pick) { return holds(pick, control); }))
    part.widget->installEventFilter(this);
  return part;
}

void PagePane::place(const Part& part, FieldLayout& layout, bool beside) {
  using Kind = FieldLayout::Kind;
  if (part.field == nullptr) {
    const bool isHeading = qobject_cast<QLabel*>(part.widget) != nullptr;
    return layout.addField(isHeading ? Kind::free : Kind::block, nullptr, part.widget, nullptr, beside);
  }
  const ControlKind kind = part.control->kind;
  const bool isFree =
      kind == ControlKind::check || kind == ControlKind::button ||
      ((kind == ControlKind::radio || kind == ControlKind::label) && nameOf(*part.control).isEmpty());
  layout.addField(isFree ? Kind::free : Kind::labelled, part.field->label(), part.widget, part.field->unit(),
                  beside);
}

void PagePane::connectField(Field& field, FieldLayout& layout) {
  connect(&field, &Field::changed, this, [this, &field] { changed(field.control()); });
  connect(&field, &Field::stepped, this, [this, &field](int delta) {
    if (!readOnly_) form_->spin(field.control(), delta);
    refresh();
  });
  connect(&field, &Field::explained, this,
          [&layout, &field](QLabel* text) { layout.addMessage(field.input(), text); });
  connect(&field, &Field::returnWanted, this, [this, input = field.input()] {
    // Not at once: the focus is on its way to where the user has clicked. Out of the page he may go.
    QMetaObject::invokeMethod(
        input,
        [this, input] {
          const QWidget* now = QApplication::focusWidget();
          if (now == nullptr || !isAncestorOf(now)) return;
          input->setFocus(Qt::OtherFocusReason);
          ensureWidgetVisible(input);
        },
        Qt::QueuedConnection);
  });
}

void PagePane::setTabOrder() {
  QWidget* last = nullptr;
  for (const Part& part : parts_) {
    for (QWidget* input : part.control->kind == ControlKind::radio
                              ? part.widget->findChildren<QWidget*>(Qt::FindDirectChildrenOnly)
                              : QList<QWidget*>{part.widget}) {
      if (input->focusPolicy() == Qt::NoFocus) continue;
      if (last != nullptr) QWidget::setTabOrder(last, input);
      last = input;
    }
  }
}

void PagePane::commit() {
  QWidget* focused = QApplication::focusWidget();
  if (focused == nullptr || !isAncestorOf(focused)) return;
  for (const Part& part : parts_) {
    if (part.field != nullptr && part.widget == focused) {
      part.field->commit();
      return;
    }
    if (part.grid != nullptr && part.grid->isAncestorOf(focused)) return part.grid->commitEdit();
  }
}

void PagePane::changed(Control& control) {
  if (refreshing_) return;
  if (!readOnly_) form_->act(control);
  refresh();
}

// A frame is seen while anything in it is.
void PagePane::refresh() {
  if (refreshing_ || form_ == nullptr) return;
  refreshing_ = true;
  std::unordered_set<const Control*> filled;
  for (auto part = parts_.rbegin(); part != parts_.rend(); ++part) {
    const Control& control = *part->control;
    const bool isFrame = qobject_cast<Frame*>(part->widget) != nullptr;
    const bool isShown = control.visible && (!isFrame || filled.contains(&control));
    if (isShown) filled.insert(control.group);
    if (part->field == nullptr) refreshGroup(*part, isShown);
  }
  for (const Part& part : parts_) {
    if (part.field != nullptr) part.field->refresh();
  }
  refreshing_ = false;
}

// A frame, heading or table.
void PagePane::refreshGroup(const Part& part, bool isShown) {
  const Control& control = *part.control;
  const QString caption = QString::fromStdString(control.label).trimmed();
  if (auto* frame = qobject_cast<Frame*>(part.widget)) {
    if (frame->title() != caption) frame->setTitle(caption);
  } else if (auto* heading = qobject_cast<QLabel*>(part.widget)) {
    if (heading->text() != caption) heading->setText(caption);
  }
  if (part.widget->isHidden() == isShown) part.widget->setVisible(isShown);
  part.widget->setEnabled(control.enabled);
  const QString tip = QString::fromStdString(control.toolTip);
  if (part.widget->toolTip() != tip) part.widget->setToolTip(tip);
  const QString name = nameOf(control);
  if (part.widget->accessibleName() != name) part.widget->setAccessibleName(name);
  if (part.grid != nullptr) part.grid->cells().refresh();
}

QWidget* PagePane::goTo(const PagePlace& place) {
  QWidget* found = widgetAt(place);
  if (found != nullptr) ensureWidgetVisible(found);
  return found;
}

// Of a place in a table the table that has its cell, or else its row; a control of the label, or else one
// that holds the value.
QWidget* PagePane::widgetAt(const PagePlace& place) const {
  for (const bool exactly : {true, false}) {
    for (const Part& part : parts_) {
      if (place.isInTable() && part.grid != nullptr && part.control->visible &&
          part.grid->goTo(place, exactly))
        return part.grid;
    }
  }
  // What is shown once its layer is chosen: the row of that.
  if (place.entries.size() > 1 && place.field.empty()) {
    PagePlace outer = place;
    outer.entries.resize(1);
    return widgetAt(outer);
  }
  if (place.isInTable() && place.field.empty()) return nullptr;
  if (!place.field.empty()) return widgetOf(QString::fromStdString(place.field), place.fieldNumber);
  const auto holds = [&](const Part& part) {
    return part.field != nullptr && part.control->visible && part.control->text == place.value;
  };
  const auto found = place.value.empty() ? parts_.end() : std::ranges::find_if(parts_, holds);
  return found == parts_.end() ? nullptr : found->widget;
}

PagePane::Cell PagePane::currentCell() const {
  Cell cell;
  if (lastGrid_ == nullptr || !lastGrid_->currentIndex().isValid()) return cell;
  for (const Part& part : parts_) {
    if (part.grid != nullptr) ++cell.table;
    if (part.grid == lastGrid_) break;
  }
  const int headers = lastGrid_->cells().headerRows();
  cell.row = std::max(lastGrid_->currentIndex().row() + 1 - headers, 0);
  cell.column = lastGrid_->currentIndex().column() + 1;
  cell.rows = lastGrid_->cells().rowCount() - headers;
  return cell;
}

std::optional<PagePane::PointPlace> PagePane::pointPlace() const {
  PointPlace place{.fields = lastFields_};
  if (lastFields_ == nullptr && lastGrid_ != nullptr) place.cell = lastGrid_->currentIndex();
  return pick(place) ? std::optional(place) : std::nullopt;
}

bool PagePane::hasPoints() const {
  return !picks_.empty() || std::ranges::any_of(parts_, [](const Part& part) {
    return part.grid != nullptr && part.grid->cells().hasPicks();
  });
}

std::optional<CellPick> PagePane::pick(const PointPlace& place) const {
  if (place.fields != nullptr && !readOnly_) {
    const auto found =
        std::ranges::find_if(picks_, [&](const FieldPick& each) { return &each == place.fields; });
    return found == picks_.end() ? std::nullopt : std::optional(found->wanted());
  }
  const auto* cells = static_cast<const GridModel*>(place.cell.model());
  return cells == nullptr ? std::nullopt : cells->pick(place.cell);
}

bool PagePane::storePick(const PointPlace& place, std::span<const PickedPlace> places) {
  if (!pick(place)) return false;
  if (place.fields == nullptr)
    return const_cast<GridModel*>(static_cast<const GridModel*>(place.cell.model()))
        ->storePick(place.cell, places);
  const bool isStored = gridbay::storePick(*place.fields, places);
  refresh();
  return isStored;
}

bool PagePane::isPickHeard() const {
  return isSignalConnected(QMetaMethod::fromSignal(&PagePane::pickWanted));
}

// Of fields that hold points: which are at work, and their menu.
bool PagePane::eventFilter(QObject* watched, QEvent* event) {
  if (event->type() != QEvent::FocusIn && event->type() != QEvent::ContextMenu)
    return QScrollArea::eventFilter(watched, event);
  const auto part = std::ranges::find(parts_, watched, &Part::widget);
  if (part == parts_.end()) return QScrollArea::eventFilter(watched, event);
  const auto pick =
      std::ranges::find_if(picks_, [&](const FieldPick& each) { return holds(each, *part->control); });
  if (pick == picks_.end()) return QScrollArea::eventFilter(watched, event);
  lastFields_ = &*pick;
  emit cellChosen();
  auto* edit = qobject_cast<QLineEdit*>(watched);
  if (event->type() == QEvent::FocusIn || edit == nullptr || !isPickHeard())
    return QScrollArea::eventFilter(watched, event);
  offerPick(*edit, static_cast<QContextMenuEvent*>(event)->globalPos());
  return true;
}

void PagePane::offerPick(QLineEdit& edit, QPoint at) {
  const std::unique_ptr<QMenu> menu(edit.createStandardContextMenu());
  menu->addSeparator();
  menu->addAction(tr("Pick on the map"), this, &PagePane::pickWanted);
  menu->exec(at);
}

void PagePane::offerPick(GridView& grid, QPoint at) {
  const QModelIndex index = grid.indexAt(at);
  if (!isPickHeard() || !grid.cells().pick(index)) return;
  grid.goToCell(index.row(), index.column());
  QMenu menu(this);
  menu.addAction(tr("Pick on the map"), this, &PagePane::pickWanted);
  menu.exec(grid.viewport()->mapToGlobal(at));
}

QSize PagePane::sizeHint() const {
  if (widget() == nullptr) return QScrollArea::sizeHint();
  const int scroll = style()->pixelMetric(QStyle::PM_ScrollBarExtent);
  return (widget()->sizeHint() + QSize(scroll, 0)).boundedTo(screen()->availableSize() * 0.75);
}

QWidget* PagePane::widgetOf(const QString& label, int n) const {
  for (const Part& part : parts_) {
    if (QString::fromStdString(part.control->label) == label && --n == 0) return part.widget;
  }
  return nullptr;
}

GridView* PagePane::tableAt(int n) const {
  for (const Part& part : parts_) {
    if (part.grid != nullptr && --n == 0) return part.grid;
  }
  return nullptr;
}

}  // namespace gridbay::shell
