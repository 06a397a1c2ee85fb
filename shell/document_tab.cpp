#include "shell/document_tab.h"

#include <QApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QFileInfo>
#include <QInputDialog>
#include <QMessageBox>
#include <QTreeWidgetItemIterator>
#include <QVBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kIdRole = Qt::UserRole;
constexpr const char* kUntitled = "Untitled";

// "Grids (*.tsb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||" as the toolkit writes it.
QString toolkitFilter(std::string_view filter) {
  const QStringList parts =
      QString::fromUtf8(filter.data(), static_cast<qsizetype>(filter.size())).split('|', Qt::SkipEmptyParts);
  QStringList filters;
  for (qsizetype i = 0; i + 1 < parts.size(); i += 2) {
    filters << QString("%1 (%2)").arg(parts[i].section(" (", 0, 0), QString(parts[i + 1]).replace(';', ' '));
  }
  return filters.join(";;");
}

}  // namespace

DocumentTab::DocumentTab(std::function<std::unique_ptr<SetupEditor>(SetupHost&)> make,
                         WindowServices services, QWidget* parent)
    : QSplitter(parent), services_(std::move(services)) {
  auto* side = new QWidget(this);
  auto* layout = new QVBoxLayout(side);
  layout->setContentsMargins(0, 0, 0, 0);
  filter_ = new QLineEdit(side);
  filter_->setPlaceholderText(tr("Find a page"));
  filter_->setClearButtonEnabled(true);
  tree_ = new QTreeWidget(side);
  tree_->setHeaderHidden(true);
  layout->addWidget(filter_);
  layout->addWidget(tree_);
  pane_ = new PagePane(this);
  addWidget(side);
  addWidget(pane_);
  setStretchFactor(1, 1);
  setSizes({260, 700});

  editor_ = make(*this);
  editor_->onChange([this] {
    applyVisibility();
    emit documentChanged();
  });
  fillTree();
  connect(filter_, &QLineEdit::textChanged, this, [this] { applyVisibility(); });
  connect(tree_, &QTreeWidget::currentItemChanged, this, [this] { showCurrentPage(); });
  goToPage(1);
}

DocumentTab::~DocumentTab() = default;

void DocumentTab::fillTree() {
  tree_->clear();
  std::vector<QTreeWidgetItem*> path;
  for (const SetupEditor::Item& item : editor_->items()) {
    path.resize(static_cast<std::size_t>(item.depth));
    auto* node = path.empty() ? new QTreeWidgetItem(tree_) : new QTreeWidgetItem(path.back());
    node->setText(0, QString::fromStdString(item.caption));
    node->setData(0, kIdRole, item.id);
    path.push_back(node);
  }
  applyVisibility();
  for (int i = 0; i < tree_->topLevelItemCount(); ++i) tree_->topLevelItem(i)->setExpanded(true);
}

// An item is seen when the rules show it and the filter finds it or something below it.
void DocumentTab::applyVisibility() {
  const QString wanted = filter_->text();
  for (const SetupEditor::Item& item : editor_->items()) {
    if (QTreeWidgetItem* node = itemOf(item.id)) node->setHidden(!item.visible || !wanted.isEmpty());
  }
  if (wanted.isEmpty()) return;
  for (const SetupEditor::Item& item : editor_->items()) {
    if (!item.visible || !QString::fromStdString(item.caption).contains(wanted, Qt::CaseInsensitive))
      continue;
    for (QTreeWidgetItem* node = itemOf(item.id); node != nullptr; node = node->parent())
      node->setHidden(false);
  }
}

QTreeWidgetItem* DocumentTab::itemOf(std::int32_t id) const {
  for (QTreeWidgetItemIterator it(tree_); *it != nullptr; ++it) {
    if ((*it)->data(0, kIdRole).toInt() == id) return *it;
  }
  return nullptr;
}

bool DocumentTab::goToPage(std::int32_t id) {
  QTreeWidgetItem* node = itemOf(id);
  if (node == nullptr || node->isHidden()) return false;
  tree_->setCurrentItem(node);
  return true;
}

void DocumentTab::goToNeighbour(int direction) {
  QTreeWidgetItem* node = tree_->currentItem();
  node = direction > 0 ? tree_->itemBelow(node) : tree_->itemAbove(node);
  if (node != nullptr) tree_->setCurrentItem(node);
}

void DocumentTab::showCurrentPage() {
  const QTreeWidgetItem* node = tree_->currentItem();
  if (node == nullptr) return;
  const int id = node->data(0, kIdRole).toInt();
  // The old page's widgets go before the form that they show.
  pane_->showText(node->text(0), QString::fromStdString(editor_->cover(id)));
  if (Form* form = editor_->openPage(id)) pane_->showForm(node->text(0), *form);
}

QString DocumentTab::title() const {
  const QString path = QString::fromStdString(editor_->path());
  return (path.isEmpty() ? QString(kUntitled) : QFileInfo(path).fileName()) +
         (editor_->isModified() ? " *" : "");
}

void DocumentTab::show(const std::string& text) {
  QMessageBox::information(this, QApplication::applicationDisplayName(), QString::fromStdString(text));
}

bool DocumentTab::askYesNo(const std::string& question) {
  return QMessageBox::question(this, QApplication::applicationDisplayName(),
                               QString::fromStdString(question)) == QMessageBox::Yes;
}

bool DocumentTab::chooseFile(std::string_view filter, std::string_view extension, std::string* name) {
  QFileDialog dialog(this, {}, QString::fromStdString(*name), toolkitFilter(filter));
  dialog.setDefaultSuffix(QString::fromUtf8(extension.data(), static_cast<qsizetype>(extension.size())));
  if (dialog.exec() != QDialog::Accepted) return false;
  *name = dialog.selectedFiles().value(0).toStdString();
  return true;
}

// Picks the file, and an item for each request where the file has more than one; a file that does not meet
// the request is told why.
bool DocumentTab::choose(CVdFileSelectorDlg& selector) {
  std::string name = selector.fileName();
  if (!chooseFile(selector.filter(), selector.kind(), &name)) return false;
  selector.SetFileName(name);
  std::vector<std::uint32_t> items;
  QStringList names;
  for (int n = 1; !selector.GetNameOfItem(n).empty(); ++n) {
    names << QString("%1 %2").arg(n).arg(QString::fromStdString(selector.GetNameOfItem(n)));
  }
  for (std::size_t i = 0; i < selector.GetSelectedItems().size(); ++i) {
    bool chosen = names.size() <= 1;
    const QString item =
        chosen ? names.value(0)
               : QInputDialog::getItem(this, tr("Item"),
                                       QString::fromStdString(selector.requests().at(i)->description()),
                                       names, 0, false, &chosen);
    if (!chosen) return false;
    items.push_back(static_cast<std::uint32_t>(names.indexOf(item)) + 1);
  }
  selector.SetSelectedItems(items);
  std::string why;
  const bool valid =
      items.empty() ? selector.IsTsbFileValid(name, &why) : selector.IsTsbFileValid(name, items, &why);
  return valid || askYesNo(why + "\n\nTake the file all the same?");
}

bool DocumentTab::editForm(std::string_view title, Form& form) {
  QDialog dialog(this);
  dialog.setWindowTitle(QString::fromUtf8(title.data(), static_cast<qsizetype>(title.size())));
  auto* layout = new QVBoxLayout(&dialog);
  auto* pane = new PagePane(&dialog);
  pane->showForm(dialog.windowTitle(), form);
  auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, &dialog);
  connect(buttons, &QDialogButtonBox::accepted, &dialog, &QDialog::accept);
  connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
  layout->addWidget(pane);
  layout->addWidget(buttons);
  return dialog.exec() == QDialog::Accepted;
}

bool DocumentTab::isShiftHeld() {
  return QApplication::keyboardModifiers().testFlag(Qt::ShiftModifier);
}

}  // namespace gridbay::shell
