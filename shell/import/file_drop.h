#pragma once

#include <QObject>
#include <QWidget>
#include <functional>

namespace gridbay::shell {

// Takes a file that is dropped on a window, wherever that is; texts can't be dropped into its edits then.
class FileDrop final : public QObject {
  Q_OBJECT
 public:
  FileDrop(QWidget& window, std::function<void(const QString& path)> take);

 protected:
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  std::function<void(const QString&)> take_;
};

}  // namespace gridbay::shell
