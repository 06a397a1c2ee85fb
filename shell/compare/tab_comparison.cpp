#include "shell/compare/tab_comparison.h"

#include <QElapsedTimer>
#include <QFileInfo>
#include <QScrollBar>
#include <algorithm>

#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

constexpr int kDelay = 250;  // milliseconds after an edit

}  // namespace

TabComparison* TabComparison::of(DocumentTab* tab) {
  return tab == nullptr ? nullptr : tab->findChild<TabComparison*>(QString(), Qt::FindDirectChildrenOnly);
}

QString TabComparison::begin(DocumentTab& tab, const QString& path) {
  tab.commit();
  if (TabComparison* before = of(&tab)) before->pane_->clear();
  const std::string fault = tab.editor().comparison().open(path.toStdString());
  TabComparison* comparison = of(&tab);
  if (fault.empty() && comparison == nullptr) comparison = new TabComparison(tab);
  if (comparison == nullptr) return QString::fromStdString(fault);
  comparison->current_ = -1;
  comparison->refresh();
  comparison->showPage();
  return QString::fromStdString(fault);
}

TabComparison::TabComparison(DocumentTab& tab) : QObject(&tab), tab_(tab), pane_(new PagePane(&tab.pages())) {
  pane_->setReadOnly(true);
  tab.pages().addWidget(pane_);
  tab.pages().setSizes({1000, 1000});
  timer_.setSingleShot(true);
  timer_.setInterval(kDelay);
  connect(&timer_, &QTimer::timeout, this, &TabComparison::refresh);
  connect(&tab, &DocumentTab::documentChanged, &timer_, qOverload<>(&QTimer::start));
  connect(&tab, &DocumentTab::pageShown, this, &TabComparison::showPage);
  connect(&tab, &DocumentTab::cellChosen, this, [this] {
    const int row = tab_.pane().currentCell().row;
    if (row > 0) pane_->goTo({.entries = {{row, 0}}});
    markPage();
  });
  // The widgets go before the form that they show.
  connect(&tab, &DocumentTab::closing, this, [this] {
    pane_->clear();
    disconnect(&tab_, nullptr, this, nullptr);
  });
  scrollTogether(tab.pane().verticalScrollBar(), pane_->verticalScrollBar());
}

// A shorter one does not hold the other back.
void TabComparison::scrollTogether(QScrollBar* a, QScrollBar* b) {
  for (const auto& [from, to] : {std::pair(a, b), std::pair(b, a)}) {
    connect(from, &QScrollBar::valueChanged, to, [this, other = to](int value) {
      if (isScrolling_) return;
      isScrolling_ = true;
      other->setValue(value);
      isScrolling_ = false;
    });
  }
}

TabComparison::~TabComparison() = default;

void TabComparison::end() {
  pane_->clear();
  disconnect(&tab_, nullptr, this, nullptr);
  timer_.stop();
  delete marks_;
  comparison().close();
  tab_.markPages({});
  pane_->hide();
  pane_->deleteLater();
  setParent(nullptr);
  differences_.clear();
  emit changed();
  deleteLater();
}

QString TabComparison::otherName() const {
  const QString path = QString::fromStdString(const_cast<TabComparison*>(this)->comparison().otherPath());
  const QString name = QFileInfo(path).fileName();
  return name == tab_.name() ? path : name;
}

void TabComparison::refresh() {
  timer_.stop();
  QElapsedTimer took;
  took.start();
  std::vector<Difference> found = comparison().differences();
  // Of large setups it takes a while: then it waits until nothing has been edited for longer.
  timer_.setInterval(std::max(kDelay, 10 * static_cast<int>(took.elapsed())));
  if (current_ >= 0 && (current_ >= static_cast<int>(found.size()) ||
                        found[static_cast<std::size_t>(current_)].thing !=
                            differences_[static_cast<std::size_t>(current_)].thing))
    current_ = -1;
  differences_ = std::move(found);
  // In other units it shows the same.
  pane_->refresh();
  markTree();
  markPage();
  emit changed();
}

void TabComparison::showPage() {
  pane_->clear();
  const std::int32_t page = tab_.currentPage();
  pane_->setVisible(page != 0);
  if (page == 0) return;
  if (Form* form = comparison().openPage(page)) {
    // The two headings tell the sides apart.
    pane_->showForm(tr("%1 in %2").arg(tab_.caption(page), otherName()), *form);
  } else {
    pane_->showText(tab_.caption(page), tr("%1 does not have this page.").arg(otherName()));
  }
  joinScrolling();
  markPage();
}

// Tables of both pages are scrolled together.
void TabComparison::joinScrolling() {
  for (int n = 1; tab_.pane().tableAt(n) != nullptr && pane_->tableAt(n) != nullptr; ++n) {
    GridView* own = tab_.pane().tableAt(n);
    GridView* other = pane_->tableAt(n);
    for (const auto bar :
         {&QAbstractScrollArea::verticalScrollBar, &QAbstractScrollArea::horizontalScrollBar}) {
      scrollTogether((own->*bar)(), (other->*bar)());
    }
  }
}

void TabComparison::markPage() {
  const std::int32_t page = tab_.currentPage();
  std::vector<Difference> here;
  int current = -1;
  for (std::size_t i = 0; i < differences_.size(); ++i) {
    const Difference& difference = differences_[i];
    const bool isShown = difference.currentRow == 0 || difference.currentRow == tab_.currentRow();
    if (page == 0 || difference.page != page || difference.thing.empty() || !isShown) continue;
    if (static_cast<int>(i) == current_) current = static_cast<int>(here.size());
    here.push_back(difference);
  }
  const auto show = [&](PagePane& pane, QPointer<DifferenceMarks>& marks) {
    if (pane.widget() == nullptr) return;
    if (marks == nullptr || marks->parentWidget() != pane.widget()) {
      delete marks;
      marks = new DifferenceMarks(pane);
    }
    marks->mark(here, current);
  };
  show(tab_.pane(), marks_);
  show(*pane_, otherMarks_);
}

void TabComparison::markTree() {
  QHash<std::int32_t, QString> tips;
  QHash<std::int32_t, int> counts;
  for (const Difference& difference : differences_) {
    if (difference.page != 0) ++counts[difference.page];
  }
  for (auto count = counts.cbegin(); count != counts.cend(); ++count) {
    tips[count.key()] =
        count.value() == 1 ? tr("%1: 1 difference from %2").arg(tab_.caption(count.key()), otherName())
                           : tr("%1: %2 differences from %3")
                                 .arg(tab_.caption(count.key()), QString::number(count.value()), otherName());
  }
  tab_.markPages(tips);
}

void TabComparison::goTo(int place, bool withFocus) {
  if (place < 0 || place >= static_cast<int>(differences_.size())) return;
  current_ = place;
  const Difference difference = differences_[static_cast<std::size_t>(place)];
  if (difference.page != 0 && difference.page != tab_.currentPage()) tab_.goToPage(difference.page);
  if (difference.page == tab_.currentPage()) {
    DifferenceMarks::show(tab_.pane(), difference, withFocus);
    DifferenceMarks::show(*pane_, difference, false);
  }
  markPage();
  emit currentChanged(place);
}

void TabComparison::step(int by) {
  const int count = static_cast<int>(differences_.size());
  if (count == 0) return;
  const int from = current_ < 0 && by < 0 ? count : current_;
  goTo((from + by + count) % count, true);
}

void TabComparison::take(const std::function<std::string(SetupComparison&)>& act) {
  tab_.commit();
  // What was just entered may have changed what there is to take.
  const std::vector<Difference> before = differences_;
  if (comparison().differences() != before) return refresh();
  const std::string fault = act(comparison());
  tab_.editor().refreshPage();
  tab_.pane().refresh();
  if (!fault.empty()) emit failed(QString::fromStdString(fault));
  refresh();
}

void TabComparison::takeOver() {
  if (current_ < 0) return;
  take([this](SetupComparison& comparison) {
    return comparison.takeOver(static_cast<std::size_t>(current_));
  });
}

void TabComparison::takeOverPage() {
  const std::int32_t page =
      current_ < 0 ? tab_.currentPage() : differences_[static_cast<std::size_t>(current_)].page;
  take([page](SetupComparison& comparison) { return comparison.takeOverPage(page); });
}

void TabComparison::takeOverAll() {
  take([](SetupComparison& comparison) { return comparison.takeOverAll(); });
}

}  // namespace gridbay::shell
