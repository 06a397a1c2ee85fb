#include "shell/projection_search.h"

#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QTreeView>

#include "platform/cartography/cartography.h"
#include "platform/projection_search.h"

namespace gridbay::shell {
namespace {

constexpr std::size_t kMost = 50;  // that are listed
constexpr int kRows = 12;          // that are seen at a time

}  // namespace

QString shownProjection(const QString& text) {
  constexpr int kLong = 40;
  if (text.size() < kLong) return text;
  const QString name = QString::fromStdString(CVdMapProjection(text.toStdString()).Name());
  return name.isEmpty() ? text : name;
}

ProjectionCompleter::ProjectionCompleter(QLineEdit* edit) : QCompleter(edit), edit_(edit) {
  auto* list = new QTreeView;
  list->setRootIsDecorated(false);
  list->setUniformRowHeights(true);
  list->setAllColumnsShowFocus(true);
  list->setMinimumWidth(list->fontMetrics().averageCharWidth() * 90);
  setModel(&found_);
  setPopup(list);
  list->header()->hide();
  setCompletionMode(QCompleter::UnfilteredPopupCompletion);
  setMaxVisibleItems(kRows);
  setWidget(edit);
  connect(edit, &QLineEdit::textEdited, this, [this](const QString& text) {
    search(text);
    openList();
  });
  connect(this, QOverload<const QModelIndex&>::of(&QCompleter::activated), this, &ProjectionCompleter::take);
}

ProjectionCompleter::ProjectionCompleter(QComboBox& list, QLineEdit* edit) : ProjectionCompleter(edit) {
  list_ = &list;
  const QString text = list.currentText();
  list.setLineEdit(edit);
  list.setCompleter(nullptr);
  list.setInsertPolicy(QComboBox::NoInsert);
  list.setCurrentText(text);
  list.view()->installEventFilter(this);
  edit->setPlaceholderText(tr("Name, EPSG code or area of use"));
}

// Typing while the list of the choices is open goes to the edit.
bool ProjectionCompleter::eventFilter(QObject* watched, QEvent* event) {
  if (list_ == nullptr || watched != list_->view()) return QCompleter::eventFilter(watched, event);
  if (event->type() != QEvent::KeyPress) return false;
  const QString typed = static_cast<QKeyEvent*>(event)->text();
  if (typed.isEmpty() || !typed[0].isPrint() || typed[0].isSpace()) return false;
  list_->hidePopup();
  edit_->setFocus();
  edit_->selectAll();
  QCoreApplication::sendEvent(edit_, event);
  return true;
}

void ProjectionCompleter::search(const QString& words) {
  found_.setRowCount(0);
  for (const KnownProjection& known : findProjections(words.toStdString(), kMost)) {
    QList<QStandardItem*> row;
    for (const std::string& text : {known.name, known.code, known.area}) {
      row << new QStandardItem(QString::fromStdString(text));
      row.back()->setToolTip(row.back()->text());
    }
    found_.appendRow(row);
  }
}

void ProjectionCompleter::openList() {
  if (found_.rowCount() == 0) {
    popup()->hide();
    return;
  }
  complete();
  auto* list = static_cast<QTreeView*>(popup());
  for (const int column : {0, 1}) list->resizeColumnToContents(column);
  list->setCurrentIndex(completionModel()->index(0, 0));
}

void ProjectionCompleter::take(const QModelIndex& index) {
  const QModelIndex row = index.siblingAtColumn(0);
  const QString name = row.data().toString();
  const Result<std::string> text = projectionText(row.siblingAtColumn(1).data().toString().toStdString());
  if (text) emit chosen(QString::fromStdString(*text), name);
}

ProjectionSearch::ProjectionSearch(QWidget* parent)
    : QWidget(parent), edit_(new QLineEdit(this)), completer_(new ProjectionCompleter(edit_)) {
  auto* layout = new QHBoxLayout(this);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->addWidget(edit_);
  setFocusProxy(edit_);
  edit_->setClearButtonEnabled(true);
  edit_->setPlaceholderText(tr("Name, EPSG code or area of use"));
  connect(completer_, &ProjectionCompleter::chosen, this, &ProjectionSearch::choose);
  connect(edit_, &QLineEdit::editingFinished, this, &ProjectionSearch::takeTyped);
}

void ProjectionSearch::setText(const QString& text) {
  text_ = text;
  shown_ = shownProjection(text);
  edit_->setText(shown_);
  edit_->setCursorPosition(0);
}

bool ProjectionSearch::isValid() const {
  return !text_.isEmpty() && CVdMapProjection(text_.toStdString()).IsValid();
}

// What was typed and not chosen from the list.
void ProjectionSearch::takeTyped() {
  const QString typed = edit_->text().trimmed();
  if (completer_->popup()->isVisible() || typed == shown_) return;
  const Result<std::string> text = projectionText(typed.toStdString());
  const QString taken = text ? QString::fromStdString(*text) : typed;
  choose(taken, shownProjection(taken));
}

void ProjectionSearch::choose(const QString& text, const QString& shown) {
  const bool isOther = text != text_;
  text_ = text;
  shown_ = shown;
  edit_->setText(shown);
  edit_->setCursorPosition(0);
  if (isOther) emit chosen(text);
}

}  // namespace gridbay::shell
