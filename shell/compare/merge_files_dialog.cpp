#include "shell/compare/merge_files_dialog.h"

#include <QFileDialog>
#include <QFileInfo>
#include <QFormLayout>
#include <QPushButton>

namespace gridbay::shell {

MergeFilesDialog::MergeFilesDialog(const QString& open, const QString& filter, QWidget* parent)
    : QDialog(parent), hasOpen_(!open.isEmpty()) {
  setWindowTitle(tr("Merge"));
  auto* layout = new QFormLayout(this);
  layout->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
  constexpr int kWide = 560;
  setMinimumWidth(kWide);
  base_ = makeEdit(tr("&Base:"), tr("The setup that both come from"), filter);
  own_ = makeEdit(tr("&First:"), tr("A setup that comes from the base"), filter);
  other_ = makeEdit(tr("&Second:"), tr("Another setup that comes from the base"), filter);
  if (hasOpen_) own_->setPlaceholderText(tr("%1, as it is open").arg(open));
  outcome_ = new QLabel(this);
  outcome_->setWordWrap(true);
  layout->addRow(outcome_);
  buttons_ = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel, this);
  buttons_->button(QDialogButtonBox::Ok)->setText(tr("&Merge"));
  layout->addRow(buttons_);
  connect(buttons_, &QDialogButtonBox::accepted, this, &QDialog::accept);
  connect(buttons_, &QDialogButtonBox::rejected, this, &QDialog::reject);
  showOutcome();
}

QLineEdit* MergeFilesDialog::makeEdit(const QString& label, const QString& tip, const QString& filter) {
  auto* edit = new QLineEdit(this);
  edit->setToolTip(tip);
  edit->setAccessibleName(tip);
  auto* browse = new QPushButton(tr("..."), this);
  browse->setAutoDefault(false);
  browse->setAccessibleName(tr("Choose: %1").arg(tip));
  auto* row = new QHBoxLayout();
  row->addWidget(edit, 1);
  row->addWidget(browse);
  auto* form = static_cast<QFormLayout*>(layout());
  form->addRow(label, row);
  static_cast<QLabel*>(form->labelForField(row))->setBuddy(edit);
  connect(browse, &QPushButton::clicked, this, [this, edit, tip, filter] {
    const QString from = edit->text().isEmpty() ? QFileInfo(base()).absolutePath() : edit->text();
    const QString path = QFileDialog::getOpenFileName(this, tip, from, filter);
    if (!path.isEmpty()) edit->setText(path);
  });
  connect(edit, &QLineEdit::textChanged, this, &MergeFilesDialog::showOutcome);
  return edit;
}

void MergeFilesDialog::showOutcome() {
  if (buttons_ == nullptr) return;
  outcome_->setText(
      own().isEmpty() && hasOpen_
          ? tr("The open setup gets what the second has changed, as one edit that Undo takes back.")
          : tr("What both have changed becomes a new setup, which is not saved yet."));
  buttons_->button(QDialogButtonBox::Ok)
      ->setEnabled(!base().isEmpty() && !other().isEmpty() && (hasOpen_ || !own().isEmpty()));
}

}  // namespace gridbay::shell
