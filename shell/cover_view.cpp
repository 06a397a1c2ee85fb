#include "shell/cover_view.h"

#include <QVBoxLayout>

#include "shell/cover_picture.h"

namespace gridbay::shell {
namespace {

constexpr int kMargin = 16;
constexpr int kPictureHeight = 150;
constexpr qreal kTitleSize = 1.6;  // of the text's

}  // namespace

class CoverView::Picture final : public QWidget {
 public:
  explicit Picture(QWidget* parent) : QWidget(parent) { setFixedHeight(kPictureHeight); }
  void show(const QString& name) {
    name_ = name;
    update();
  }

 protected:
  void paintEvent(QPaintEvent*) override {
    QPainter painter(this);
    drawCoverPicture(painter, rect(), name_, palette().window().color().lightness() < 128);
  }

 private:
  QString name_;
};

CoverView::CoverView(QWidget* parent) : QScrollArea(parent) {
  setWidgetResizable(true);
  setFrameShape(QFrame::NoFrame);
  auto* page = new QWidget(this);
  picture_ = new Picture(page);
  title_ = new QLabel(page);
  QFont font = title_->font();
  font.setPointSizeF(font.pointSizeF() * kTitleSize);
  font.setBold(true);
  title_->setFont(font);
  text_ = new QLabel(page);
  text_->setWordWrap(true);
  text_->setTextFormat(Qt::MarkdownText);
  text_->setTextInteractionFlags(Qt::TextBrowserInteraction);
  auto* words = new QVBoxLayout();
  words->setContentsMargins(kMargin, kMargin, kMargin, kMargin);
  words->addWidget(title_);
  words->addWidget(text_);
  auto* layout = new QVBoxLayout(page);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->addWidget(picture_);
  layout->addLayout(words);
  layout->addStretch();
  setWidget(page);
}

void CoverView::showCover(const SetupEditor::Cover& cover) {
  picture_->show(QString::fromStdString(cover.picture));
  title_->setText(QString::fromStdString(cover.title));
  text_->setText(QString::fromStdString(cover.text));
  ensureVisible(0, 0);
}

}  // namespace gridbay::shell
