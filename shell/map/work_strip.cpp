#include "shell/map/work_strip.h"

#include <QHBoxLayout>

namespace gridbay::shell {
namespace {

constexpr int kParts = 1000;

}  // namespace

WorkStrip::WorkStrip(QWidget* parent)
    : QFrame(parent),
      text_(new QLabel(this)),
      progress_(new QProgressBar(this)),
      cancel_(new QToolButton(this)) {
  text_->setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
  progress_->setRange(0, kParts);
  progress_->setAccessibleName(tr("Progress"));
  cancel_->setText(tr("Cancel"));
  cancel_->setFocusPolicy(Qt::StrongFocus);
  connect(cancel_, &QToolButton::clicked, this, &WorkStrip::cancelled);
  auto* layout = new QHBoxLayout(this);
  layout->setContentsMargins(2, 0, 2, 0);
  layout->addWidget(text_, 1);
  layout->addWidget(progress_, 1);
  layout->addWidget(cancel_);
  hide();
}

void WorkStrip::showWork(const QString& text, double done) {
  text_->setText(text);
  progress_->setValue(static_cast<int>(done * kParts));
  show();
}

}  // namespace gridbay::shell
