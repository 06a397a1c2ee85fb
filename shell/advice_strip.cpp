#include "shell/advice_strip.h"

#include <QLabel>
#include <QToolButton>
#include <algorithm>

#include "shell/tool_icons.h"

namespace gridbay::shell {

QString adviceTip(const Advice& advice) {
  return QString::fromStdString(advice.doubt + "\n" + advice.reason);
}

AdviceStrip::AdviceStrip(QWidget* parent) : QFrame(parent), lines_(new QVBoxLayout(this)) {
  setFrameShape(QFrame::StyledPanel);
  lines_->setContentsMargins(8, 4, 8, 4);
  lines_->setSpacing(2);
  hide();
}

void AdviceStrip::showAdvice(const std::vector<Advice>& advice, const std::vector<int>& places) {
  constexpr std::size_t kMost = 3;
  while (QLayoutItem* item = lines_->takeAt(0)) {
    // Not at once: a press of its button may be what has changed the advice.
    if (item->widget() != nullptr) {
      item->widget()->hide();
      item->widget()->deleteLater();
    }
    delete item;
  }
  for (std::size_t i = 0; i < std::min(kMost, places.size()); ++i)
    addLine(advice[static_cast<std::size_t>(places[i])], places[i]);
  if (places.size() > kMost)
    lines_->addWidget(new QLabel(tr("%1 more in the messages").arg(places.size() - kMost), this));
  setVisible(!places.empty());
}

void AdviceStrip::addLine(const Advice& advice, int place) {
  auto* line = new QWidget(this);
  auto* layout = new QHBoxLayout(line);
  layout->setContentsMargins(0, 0, 0, 0);
  auto* show = new QToolButton(line);
  show->setIcon(toolIcon(Tool::advice));
  show->setAutoRaise(true);
  show->setToolTip(tr("Go to what it speaks of"));
  show->setAccessibleName(show->toolTip());
  auto* text = new QLabel(QString::fromStdString(advice.doubt), line);
  text->setTextFormat(Qt::PlainText);
  text->setWordWrap(true);
  text->setToolTip(adviceTip(advice));
  layout->addWidget(show);
  layout->addWidget(text, 1);
  connect(show, &QToolButton::clicked, this, [this, place] { emit chosen(place); });
  auto* fix = new QToolButton(line);
  fix->setObjectName("fix");
  fix->setText(tr("Fix"));
  fix->setToolTip(QString::fromStdString(advice.fix.name));
  fix->setAccessibleName(tr("Fix: %1").arg(fix->toolTip()));
  fix->setFocusPolicy(Qt::StrongFocus);
  layout->addWidget(fix);
  connect(fix, &QToolButton::clicked, this, [this, place] { emit fixWanted(place); });
  lines_->addWidget(line);
}

}  // namespace gridbay::shell
