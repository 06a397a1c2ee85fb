#include "shell/compare/merge_dialog.h"

#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kChoiceColumn = 4;

QString textOf(const std::optional<std::string>& value) {
  if (!value) return MergeDialog::tr("not there");
  return value->empty() ? MergeDialog::tr("nothing") : QString::fromStdString(*value);
}

}  // namespace

MergeDialog::MergeDialog(const QString& own, const QString& other, std::vector<MergeQuestion>& questions,
                         const QString& warning, QWidget* parent)
    : QDialog(parent), questions_(questions), list_(new QTreeWidget(this)) {
  setWindowTitle(tr("Merge"));
  resize(900, 420);
  auto* layout = new QVBoxLayout(this);
  auto* note = new QLabel(
      questions.size() == 1
          ? tr("One thing was changed in both setups. Choose what is to stand.")
          : tr("%1 things were changed in both setups. Choose what is to stand.").arg(questions.size()),
      this);
  list_->setHeaderLabels(
      {tr("Difference"), tr("Before"), tr("In %1").arg(own), tr("In %1").arg(other), tr("Take")});
  list_->setAccessibleName(tr("Conflicts"));
  fill(own, other);
  constexpr int kWidest = 360;
  for (int column = 0; column < kChoiceColumn; ++column) {
    list_->resizeColumnToContents(column);
    list_->setColumnWidth(column, std::min(list_->columnWidth(column) + 12, kWidest));
  }
  auto* buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
  buttons->button(QDialogButtonBox::Ok)->setText(tr("&Merge"));
  for (const int side : {0, 1}) {
    auto* all =
        buttons->addButton(tr("All of %1").arg(side == 0 ? own : other), QDialogButtonBox::ActionRole);
    all->setAutoDefault(false);
    connect(all, &QPushButton::clicked, this, [this, side] { chooseAll(side); });
  }
  connect(buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
  connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
  layout->addWidget(note);
  layout->addWidget(list_);
  if (!warning.isEmpty()) {
    auto* told = new QLabel(warning, this);
    told->setObjectName("warning");
    told->setWordWrap(true);
    told->setTextFormat(Qt::PlainText);
    layout->addWidget(told);
  }
  layout->addWidget(buttons);
}

QComboBox* MergeDialog::makeChoice(QTreeWidgetItem& item, const QString& own, const QString& other) {
  auto* choice = new QComboBox(list_);
  choice->addItems({own, other});
  choice->setAccessibleName(tr("Take for %1").arg(item.text(0)));
  list_->setItemWidget(&item, kChoiceColumn, choice);
  return choice;
}

// Questions of a page stand below it.
void MergeDialog::fill(const QString& own, const QString& other) {
  QHash<QString, QTreeWidgetItem*> pages;
  for (std::size_t i = 0; i < questions_.size(); ++i) {
    const MergeQuestion& question = questions_[i];
    const QString name = question.page == 0 ? tr("On no page") : QString::fromStdString(question.pageName);
    QTreeWidgetItem*& page = pages[name];
    if (page == nullptr) {
      page = new QTreeWidgetItem(list_, {name});
      QFont bold = page->font(0);
      bold.setBold(true);
      page->setFont(0, bold);
      page->setExpanded(true);
      QComboBox* all = makeChoice(*page, own, other);
      all->setPlaceholderText(tr("Both"));
      connect(all, &QComboBox::activated, this, [this, page](int side) {
        for (int row = 0; row < page->childCount(); ++row)
          static_cast<QComboBox*>(list_->itemWidget(page->child(row), kChoiceColumn))->setCurrentIndex(side);
      });
    }
    auto* item = new QTreeWidgetItem(page, {QString::fromStdString(question.thing), textOf(question.base),
                                            textOf(question.own), textOf(question.other)});
    for (int column = 0; column < kChoiceColumn; ++column) item->setToolTip(column, item->text(column));
    choices_.push_back(makeChoice(*item, own, other));
    choices_.back()->setCurrentIndex(question.takesOther ? 1 : 0);
    connect(choices_.back(), &QComboBox::currentIndexChanged, this, [this, i, page](int index) {
      questions_[i].takesOther = index == 1;
      showPageChoice(*page);
    });
  }
}

// What is chosen for all of its questions, or neither.
void MergeDialog::showPageChoice(QTreeWidgetItem& page) {
  int side = -1;
  for (int row = 0; row < page.childCount(); ++row) {
    const auto* choice = static_cast<QComboBox*>(list_->itemWidget(page.child(row), kChoiceColumn));
    if (row > 0 && choice->currentIndex() != side) {
      side = -1;
      break;
    }
    side = choice->currentIndex();
  }
  static_cast<QComboBox*>(list_->itemWidget(&page, kChoiceColumn))->setCurrentIndex(side);
}

QComboBox& MergeDialog::pageChoice(int place) {
  return *static_cast<QComboBox*>(list_->itemWidget(list_->topLevelItem(place), kChoiceColumn));
}

void MergeDialog::chooseAll(int side) {
  for (QComboBox* choice : choices_) choice->setCurrentIndex(side);
}

}  // namespace gridbay::shell
