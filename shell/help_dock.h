#pragma once

#include <QDockWidget>
#include <QTextBrowser>

namespace gridbay::shell {

// The help of a page, by the number of its topic. The pages are Markdown files in the folder "help" of
// the installation, named by number and subject; page 0 is the overview.
class HelpDock final : public QDockWidget {
  Q_OBJECT
 public:
  // The topics of what is no page.
  static constexpr int kImportTerrain = 100;
  static constexpr int kImportSeries = 101;

  explicit HelpDock(QWidget* parent);

  // False, with what was looked for and where, when there is none.
  bool showTopic(int topic, const QString& caption, QString* error);
  void setFolder(const QString& folder) { folder_ = folder; }
  QTextBrowser& browser() { return *browser_; }

 private:
  QString folder_;
  QTextBrowser* browser_;
};

}  // namespace gridbay::shell
