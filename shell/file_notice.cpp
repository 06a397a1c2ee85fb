#include "shell/file_notice.h"

#include <QFileInfo>
#include <QHBoxLayout>
#include <QTimer>
#include <utility>

namespace gridbay::shell {

FileNotice::FileNotice(Words words, QWidget* parent)
    : QFrame(parent),
      words_(std::move(words)),
      text_(new QLabel(this)),
      again_(new QPushButton(words_.again, this)) {
  setFrameShape(QFrame::StyledPanel);
  setVisible(false);
  text_->setWordWrap(true);
  text_->setTextFormat(Qt::PlainText);
  auto* keep = new QPushButton(words_.keep, this);
  again_->setObjectName("reload");
  keep->setObjectName("keep");
  auto* layout = new QHBoxLayout(this);
  layout->addWidget(text_, 1);
  layout->addWidget(again_);
  layout->addWidget(keep);
  connect(again_, &QPushButton::clicked, this, &FileNotice::readAgain);
  connect(keep, &QPushButton::clicked, this, &QWidget::hide);
  // A program that replaces the file is given the moment that this takes.
  constexpr int kMoment = 200;
  const auto later = [this] { QTimer::singleShot(kMoment, this, &FileNotice::look); };
  connect(&watcher_, &QFileSystemWatcher::fileChanged, this, later);
  connect(&watcher_, &QFileSystemWatcher::directoryChanged, this, later);
}

void FileNotice::watch(const QString& path) {
  watch(path, fileStamp(path.toStdString()));
}

void FileNotice::watch(const QString& path, const std::optional<FileStamp>& then) {
  path_ = path;
  stamp_ = then;
  hide();
  if (const QStringList old = watcher_.files() + watcher_.directories(); !old.isEmpty())
    watcher_.removePaths(old);
  if (!path.isEmpty() && QFileInfo::exists(path)) watcher_.addPath(path);
  if (fileStamp(path.toStdString()) != then) look();
}

bool FileNotice::isChanged() const {
  const std::optional<FileStamp> now = fileStamp(path_.toStdString());
  return stamp_ && now && !now->isOfSameContent(*stamp_);
}

void FileNotice::look() {
  if (path_.isEmpty()) return;
  const QFileInfo file(path_);
  const bool isGone = !file.exists();
  // What is gone may come again.
  const QString folder = file.absolutePath();
  if (isGone) {
    if (QFileInfo::exists(folder)) watcher_.addPath(folder);
  } else {
    if (!watcher_.files().contains(path_)) watcher_.addPath(path_);
    watcher_.removePath(folder);
  }
  again_->setEnabled(!isGone);
  text_->setText((isGone ? words_.gone : words_.changed).arg(path_));
  setVisible(isGone || isChanged());
}

}  // namespace gridbay::shell
