#include "shell/import/use_strip.h"

#include <QHBoxLayout>

namespace gridbay::shell {

UseStrip::UseStrip(const QString& question, std::function<Offer(const QString& file)> seek, QWidget* parent)
    : QWidget(parent),
      seek_(std::move(seek)),
      label_(new QLabel(question, this)),
      why_(new QLabel(this)),
      use_(new QComboBox(this)),
      act_(new QPushButton(tr("Use it"), this)),
      view_(new QPushButton(tr("View"), this)) {
  use_->setObjectName("use");
  use_->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
  act_->setObjectName("act");
  view_->setObjectName("view");
  why_->setObjectName("why");
  why_->setWordWrap(true);
  for (QPushButton* button : {act_, view_}) button->setAutoDefault(false);
  label_->setBuddy(use_);
  auto* layout = new QHBoxLayout(this);
  layout->setContentsMargins({});
  layout->addWidget(label_);
  layout->addWidget(use_, 1);
  layout->addWidget(why_, 1);
  layout->addWidget(act_);
  layout->addWidget(view_);
  hide();
  connect(act_, &QPushButton::clicked, this, [this] {
    const auto place = static_cast<std::size_t>(use_->currentIndex());
    // What is done may lead to another offer.
    if (place < offer_.uses.size()) std::function(offer_.uses[place].act)(file_);
  });
  connect(view_, &QPushButton::clicked, this, [this] { emit viewWanted(file_); });
}

void UseStrip::offer(const QString& file) {
  file_ = file;
  show();
  seekAgain();
  (offer_.uses.empty() ? static_cast<QWidget*>(view_) : use_)->setFocus();
}

void UseStrip::seekAgain() {
  if (isHidden()) return;
  const QString chosen = use_->currentText();
  offer_ = seek_(file_);
  use_->clear();
  for (const Use& use : offer_.uses) use_->addItem(use.text);
  use_->setCurrentIndex(std::max(use_->findText(chosen), offer_.uses.empty() ? -1 : 0));
  why_->setText(offer_.why);
  for (QWidget* each : std::initializer_list<QWidget*>{label_, use_, act_})
    each->setVisible(!offer_.uses.empty());
  why_->setVisible(offer_.uses.empty());
}

}  // namespace gridbay::shell
