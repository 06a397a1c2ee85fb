#pragma once

#include <QListWidget>
#include <QVBoxLayout>
#include <QWidget>

namespace gridbay::shell {

// What the window shows while no setup is open: the ways to begin, and the setups opened last.
class StartView final : public QWidget {
  Q_OBJECT
 public:
  explicit StartView(QWidget* parent);

  // Adds a way to begin, which triggers the action.
  void addBeginning(QAction* action, const QString& description);
  // The setups opened last, newest first, by their paths.
  void showRecent(const QStringList& paths);

  QListWidget& recent() { return *recent_; }

 signals:
  void recentChosen(const QString& path);

 private:
  QVBoxLayout* begin_;
  QListWidget* recent_;
  QWidget* recentBlock_;
};

}  // namespace gridbay::shell
