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
                         QWidget* parent)
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
  list_->setRootIsDecorated(false);
  list_->setAccessibleName(tr("Conflicts"));
  for (std::size_t i = 0; i < questions.size(); ++i) {
    MergeQuestion& question = questions[i];
    auto* item = new QTreeWidgetItem(list_, {QString::fromStdString(question.thing), textOf(question.base),
                                             textOf(question.own), textOf(question.other)});
    for (int column = 0; column < kChoiceColumn; ++column) item->setToolTip(column, item->text(column));
    auto* choice = new QComboBox(list_);
    choice->addItems({own, other});
    choice->setCurrentIndex(question.takesOther ? 1 : 0);
    choice->setAccessibleName(tr("Take for %1").arg(item->text(0)));
    list_->setItemWidget(item, kChoiceColumn, choice);
    connect(choice, &QComboBox::currentIndexChanged, this,
            [this, i](int index) { questions_[i].takesOther = index == 1; });
  }
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
  layout->addWidget(buttons);
}

QComboBox& MergeDialog::choice(int place) {
  return *static_cast<QComboBox*>(list_->itemWidget(list_->topLevelItem(place), kChoiceColumn));
}

void MergeDialog::chooseAll(int side) {
  for (int i = 0; i < list_->topLevelItemCount(); ++i) choice(i).setCurrentIndex(side);
}

}  // namespace gridbay::shell
