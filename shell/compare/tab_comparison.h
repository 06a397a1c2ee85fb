#pragma once

#include <QPointer>
#include <QTimer>
#include <vector>

#include "shell/background_work.h"
#include "shell/compare/difference_marks.h"
#include "shell/document_tab.h"

namespace gridbay::shell {

// Another setup beside an open one: its page beside that of the document, read only and scrolled with it,
// what differs marked on both and in the tree. It compares again a moment after each edit, in a copy of the
// process; until that is done what was found last is shown.
class TabComparison final : public QObject {
  Q_OBJECT
 public:
  // That of a document; null where it has none.
  static TabComparison* of(DocumentTab* tab);
  // Begins one, or goes on with another setup, which is read beside the window. False where the user has
  // cancelled that, or else with what is wrong.
  static bool begin(DocumentTab& tab, const QString& path, QString& fault);
  ~TabComparison() override;

  // The comparison goes, and with it all that it shows.
  void end();

  QString otherName() const;
  const std::vector<Difference>& differences() const { return differences_; }
  // Whether the setups are being compared, or will be in a moment.
  bool isAtWork() const { return work_.isRunning() || timer_.isActive(); }
  // Whether the differences are those of the setups as they are now.
  bool isCurrent() const { return comparison().isCurrent(); }
  // Waits until they are, with the progress of it shown; false where that is cancelled or can't be done.
  bool finish();
  // The difference that stands out, by its place; -1 for none.
  int current() const { return current_; }
  // Shows a difference on its page; with the focus on its field or cell where that is wanted.
  void goTo(int place, bool withFocus);
  // The next one, or the one before, round and round.
  void step(int by);
  // Each is one step of the history.
  void takeOver();
  void takeOverPage();
  void takeOverAll();

  PagePane& otherPane() { return *pane_; }
  // Seen when the other file was changed or removed.
  FileNotice& notice() { return *notice_; }
  // Marks of the document's page and of the other one; null where there is none.
  DifferenceMarks* marks() { return marks_; }
  DifferenceMarks* otherMarks() { return otherMarks_; }

 signals:
  void changed();
  void currentChanged(int place);
  // Work was begun, or is at its end.
  void atWork();
  void failed(const QString& text);

 private:
  explicit TabComparison(DocumentTab& tab);

  // Compares now, and not in a moment.
  void compare();
  void takeFound(const std::optional<std::string>& found);
  void showFound();
  void showPage();
  void markPage();
  void markTree();
  void joinScrolling();
  void scrollTogether(QScrollBar* a, QScrollBar* b);
  // With the difference that stands out, where it is still there, by its place; else -1.
  void take(const std::function<std::string(SetupComparison&, int current)>& act);
  int placeOf(const Difference& wanted) const;
  SetupComparison& comparison() const { return tab_.editor().comparison(); }

  DocumentTab& tab_;
  QWidget* side_;
  FileNotice* notice_;
  PagePane* pane_;
  QPointer<DifferenceMarks> marks_;
  QPointer<DifferenceMarks> otherMarks_;
  QTimer timer_;
  BackgroundWork work_{this};
  std::vector<Difference> differences_;
  int current_ = -1;
  bool isScrolling_ = false;
};

}  // namespace gridbay::shell
