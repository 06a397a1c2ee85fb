#pragma once

#include <QFileSystemWatcher>
#include <QFrame>
#include <QLabel>
#include <QPushButton>
#include <optional>

#include "platform/files/file_stamp.h"

namespace gridbay::shell {

// Watches a file that was read, and is seen when another program has changed it or taken it away, with a way
// to read it again.
class FileNotice final : public QFrame {
  Q_OBJECT
 public:
  // What it says, with the file's path for %1, and on its buttons.
  struct Words {
    QString changed;
    QString gone;
    QString again;
    QString keep;
  };
  FileNotice(Words words, QWidget* parent);

  // The file was read or written here just now; none for an empty path.
  void watch(const QString& path);
  // It was read as it was then; what has been done to it since is seen at once.
  void watch(const QString& path, const std::optional<FileStamp>& then);
  // Whether another program has written to it since.
  bool isChanged() const;

 signals:
  void readAgain();

 private:
  void look();

  Words words_;
  QLabel* text_;
  QPushButton* again_;
  QString path_;
  QFileSystemWatcher watcher_;
  std::optional<FileStamp> stamp_;  // of the file when it was read or written here
};

}  // namespace gridbay::shell
