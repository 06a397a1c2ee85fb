#include "shell/start_view.h"

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QLabel>
#include <QPushButton>
#include <QStyleOptionButton>
#include <QStylePainter>

namespace gridbay::shell {
namespace {

constexpr int kPathRole = Qt::UserRole;
constexpr int kMargin = 32;
constexpr int kGap = 40;
constexpr int kBeginWidth = 320;
constexpr int kIcon = 24;
constexpr int kPadding = 10;

QLabel* heading(const QString& text, qreal size, QWidget* parent) {
  auto* label = new QLabel(text, parent);
  QFont font = label->font();
  font.setPointSizeF(font.pointSizeF() * size);
  font.setBold(true);
  label->setFont(font);
  return label;
}

// A flat button with a picture, a name and a line that says what it leads to. Enter and the blank press it.
class BeginButton final : public QPushButton {
 public:
  BeginButton(const QAction& action, const QString& description, QWidget* parent)
      : QPushButton(action.icon(), action.iconText(), parent), description_(description) {
    setFlat(true);
    setAutoDefault(true);
    setToolTip(action.toolTip());
    setAccessibleDescription(description);
    setAttribute(Qt::WA_Hover);
    setFixedSize(kBeginWidth, 2 * fontMetrics().height() + 2 * kPadding);
  }

 protected:
  void paintEvent(QPaintEvent*) override {
    QStylePainter painter(this);
    QStyleOptionButton option;
    initStyleOption(&option);
    option.text.clear();
    option.icon = {};
    if (option.state.testFlag(QStyle::State_MouseOver)) option.features &= ~QStyleOptionButton::Flat;
    painter.drawControl(QStyle::CE_PushButton, option);
    icon().paint(&painter, QRect(kPadding, (height() - kIcon) / 2, kIcon, kIcon));
    const QRect words = rect().adjusted(2 * kPadding + kIcon, kPadding, -kPadding, -kPadding);
    painter.setPen(palette().color(QPalette::ButtonText));
    painter.drawText(words, Qt::AlignLeft | Qt::AlignBottom, description_);
    QFont bold = font();
    bold.setBold(true);
    painter.setFont(bold);
    painter.drawText(words, Qt::AlignLeft | Qt::AlignTop, text());
  }

 private:
  QString description_;
};

}  // namespace

StartView::StartView(QWidget* parent)
    : QWidget(parent),
      begin_(new QVBoxLayout()),
      recent_(new QListWidget(this)),
      recentBlock_(new QWidget(this)) {
  begin_->setSpacing(kPadding / 2);
  begin_->addWidget(heading(tr("Begin"), 1.2, this));
  auto* hint = new QLabel(tr("Setups and data files can also be dropped here."), this);
  begin_->addWidget(hint);
  begin_->addStretch(1);

  recent_->setFrameShape(QFrame::NoFrame);
  recent_->setAccessibleName(tr("Recent setups"));
  recent_->setTextElideMode(Qt::ElideMiddle);
  recent_->viewport()->setCursor(Qt::PointingHandCursor);
  recent_->viewport()->setAutoFillBackground(false);
  recent_->setSpacing(2);
  auto* last = new QVBoxLayout(recentBlock_);
  last->setContentsMargins(0, 0, 0, 0);
  last->addWidget(heading(tr("Recent setups"), 1.2, recentBlock_));
  last->addWidget(recent_);

  auto* columns = new QHBoxLayout();
  columns->setSpacing(kGap);
  columns->addLayout(begin_);
  columns->addWidget(recentBlock_, 1);
  auto* layout = new QVBoxLayout(this);
  layout->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  layout->addWidget(heading(QApplication::applicationDisplayName(), 2, this));
  layout->addWidget(
      new QLabel(tr("The setup editor of a two-dimensional free-surface flow model on nested grids."), this));
  layout->addSpacing(kMargin / 2);
  layout->addLayout(columns, 1);

  const auto choose = [this](const QListWidgetItem* item) {
    // The list may be filled anew before the setup is open.
    const QString path = item->data(kPathRole).toString();
    emit recentChosen(path);
  };
  connect(recent_, &QListWidget::itemClicked, this, choose);
  connect(recent_, &QListWidget::itemActivated, this, choose);
}

void StartView::addBeginning(QAction* action, const QString& description) {
  auto* button = new BeginButton(*action, description, this);
  connect(button, &QPushButton::clicked, action, &QAction::trigger);
  begin_->insertWidget(begin_->count() - 2, button);  // before the hint and what is left free
  QWidget::setTabOrder(button, recent_);
  if (focusProxy() == nullptr) setFocusProxy(button);
}

void StartView::showRecent(const QStringList& paths) {
  recent_->clear();
  for (const QString& path : paths) {
    const QFileInfo file(path);
    auto* item =
        new QListWidgetItem(file.fileName() + "\n" + QDir::toNativeSeparators(file.absolutePath()), recent_);
    item->setData(kPathRole, path);
    item->setToolTip(QDir::toNativeSeparators(path));
    item->setData(Qt::AccessibleTextRole, tr("%1 in %2").arg(file.fileName(), file.absolutePath()));
  }
  if (!paths.isEmpty()) recent_->setCurrentRow(0, QItemSelectionModel::Current);
  recentBlock_->setVisible(!paths.isEmpty());
}

}  // namespace gridbay::shell
