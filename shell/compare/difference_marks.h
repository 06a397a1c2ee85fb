#pragma once

#include <QPointer>
#include <QWidget>
#include <vector>

#include "compare/setup_comparison.h"
#include "shell/page_pane.h"

namespace gridbay::shell {

// Frames around the fields and cells of a page that differ from another setup's, over the page. The mouse
// goes through.
class DifferenceMarks final : public QWidget {
  Q_OBJECT
 public:
  // Over the page that the pane shows now, with which it goes.
  explicit DifferenceMarks(PagePane& pane);

  // The differences of the page, with the place of the one that stands out, or -1.
  void mark(std::vector<Difference> differences, int current);
  // What is marked, in its own coordinates: empty where it is not seen.
  std::vector<QRect> rects() const;
  // Scrolls to what a difference is of; with the focus on it where that is wanted.
  static void show(PagePane& pane, const Difference& difference, bool withFocus);

 protected:
  void paintEvent(QPaintEvent* event) override;
  bool eventFilter(QObject* watched, QEvent* event) override;

 private:
  QRect rectOf(const Difference& difference) const;

  PagePane& pane_;
  std::vector<Difference> differences_;
  int current_ = -1;
};

}  // namespace gridbay::shell
