#include "shell/compare/tab_comparison.h"

#include <QFileInfo>
#include <QScrollBar>
#include <QVBoxLayout>
#include <algorithm>

#include "shell/compare/work_beside.h"
#include "shell/grid_view.h"

namespace gridbay::shell {
namespace {

constexpr int kDelay = 250;  // milliseconds after an edit

}  // namespace

TabComparison* TabComparison::of(DocumentTab* tab) {
  return tab == nullptr ? nullptr : tab->findChild<TabComparison*>(QString(), Qt::FindDirectChildrenOnly);
}

bool TabComparison::begin(DocumentTab& tab, const QString& path, QString& fault) {
  tab.commit();
  SetupComparison& setups = tab.editor().comparison();
  const QString name = QFileInfo(path).fileName();
  bool isCancelled = false;
  const std::optional<FileStamp> before = fileStamp(path.toStdString());
  const std::optional<std::string> read = workBeside(
      [&setups, file = path.toStdString()](const WorkApart::Progress&) { return setups.read(file); },
      tr("Reading %1...").arg(name), &tab, isCancelled);
  if (isCancelled) return false;
  TabComparison* comparison = of(&tab);
  if (comparison != nullptr) comparison->pane_->clear();
  fault = read ? QString::fromStdString(setups.open(path.toStdString(), *read))
               : tr("%1 could not be read: its reader came to a sudden end.").arg(name);
  if (fault.isEmpty()) {
    if (comparison == nullptr) comparison = new TabComparison(tab);
    comparison->notice_->watch(path, before);
    comparison->differences_.clear();
    comparison->current_ = -1;
    comparison->showFound();
    comparison->compare();
  }
  if (comparison != nullptr) comparison->showPage();
  return fault.isEmpty();
}

TabComparison::TabComparison(DocumentTab& tab)
    : QObject(&tab),
      tab_(tab),
      side_(new QWidget(&tab.pages())),
      notice_(new FileNotice({tr("%1 was changed by another program since it was read for comparing."),
                              tr("%1 is no longer on disk. What was read of it is still compared."),
                              tr("Read Again"), tr("Leave It")},
                             side_)),
      pane_(new PagePane(side_)) {
  pane_->setReadOnly(true);
  auto* layout = new QVBoxLayout(side_);
  layout->setContentsMargins(0, 0, 0, 0);
  layout->addWidget(notice_);
  layout->addWidget(pane_, 1);
  tab.pages().addWidget(side_);
  tab.pages().setSizes({1000, 1000});
  timer_.setSingleShot(true);
  timer_.setInterval(kDelay);
  connect(&timer_, &QTimer::timeout, this, &TabComparison::compare);
  connect(&work_, &BackgroundWork::ended, this, &TabComparison::takeFound);
  connect(&tab, &DocumentTab::documentChanged, &timer_, qOverload<>(&QTimer::start));
  connect(&tab, &DocumentTab::pageShown, this, &TabComparison::showPage);
  connect(&tab, &DocumentTab::cellChosen, this, [this] {
    const int row = tab_.pane().currentCell().row;
    if (row > 0) pane_->goTo({.entries = {{row, 0}}});
    markPage();
  });
  connect(notice_, &FileNotice::readAgain, this, [this] {
    const QString path = QString::fromStdString(comparison().otherPath());
    QString fault;
    begin(tab_, path, fault);
    if (!fault.isEmpty()) emit failed(fault);
  });
  // The widgets go before the form that they show.
  connect(&tab, &DocumentTab::closing, this, [this] {
    work_.stop();
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
  work_.stop();
  delete marks_;
  comparison().close();
  tab_.markPages({});
  side_->hide();
  side_->deleteLater();
  setParent(nullptr);
  differences_.clear();
  emit changed();
  deleteLater();
}

QString TabComparison::otherName() const {
  const QString path = QString::fromStdString(comparison().otherPath());
  const QString name = QFileInfo(path).fileName();
  return name == tab_.name() ? path : name;
}

void TabComparison::compare() {
  timer_.stop();
  work_.stop();
  if (comparison().isCurrent()) return showFound();
  work_.begin([&setups = comparison()](const WorkApart::Progress&) { return setups.compare(); });
  emit atWork();
}

// What is of a setup that has been edited since is dropped: it is compared again in a moment.
void TabComparison::takeFound(const std::optional<std::string>& found) {
  if (found && comparison().take(*found)) {
    showFound();
  } else if (!timer_.isActive()) {
    emit failed(tr("%1 and %2 could not be compared.").arg(tab_.name(), otherName()));
  }
  emit atWork();
}

void TabComparison::showFound() {
  const std::optional<Difference> shown =
      current_ < 0 ? std::nullopt : std::optional(differences_[static_cast<std::size_t>(current_)]);
  differences_ = comparison().differences();
  current_ = shown ? placeOf(*shown) : -1;
  // In other units it shows the same.
  pane_->refresh();
  markTree();
  markPage();
  emit changed();
}

bool TabComparison::finish() {
  if (comparison().isCurrent()) return true;
  if (!work_.isRunning() || timer_.isActive()) compare();
  const bool isDone = waitFor(work_, tr("Comparing %1 and %2...").arg(tab_.name(), otherName()), &tab_);
  // It goes on beside the window.
  if (!isDone) compare();
  return comparison().isCurrent();
}

// By what it is of: what the setups hold there may have become something else.
int TabComparison::placeOf(const Difference& wanted) const {
  const auto found = std::ranges::find_if(differences_, [&](const Difference& each) {
    return each.page == wanted.page && each.thing == wanted.thing && each.table == wanted.table &&
           each.row == wanted.row && each.column == wanted.column && each.currentRow == wanted.currentRow;
  });
  return found == differences_.end() ? -1 : static_cast<int>(found - differences_.begin());
}

void TabComparison::showPage() {
  pane_->clear();
  const std::int32_t page = tab_.currentPage();
  side_->setVisible(page != 0);
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

void TabComparison::take(const std::function<std::string(SetupComparison&, int current)>& act) {
  tab_.commit();
  // What was just entered may have changed what there is to take.
  if (!finish()) return;
  showFound();
  const std::string fault = act(comparison(), current_);
  tab_.editor().refreshPage();
  tab_.pane().refresh();
  if (!fault.empty()) emit failed(QString::fromStdString(fault));
  compare();
}

void TabComparison::takeOver() {
  if (current_ < 0) return;
  take([](SetupComparison& comparison, int current) {
    return current < 0 ? std::string() : comparison.takeOver(static_cast<std::size_t>(current));
  });
}

void TabComparison::takeOverPage() {
  const std::int32_t page =
      current_ < 0 ? tab_.currentPage() : differences_[static_cast<std::size_t>(current_)].page;
  take([page](SetupComparison& comparison, int) { return comparison.takeOverPage(page); });
}

void TabComparison::takeOverAll() {
  take([](SetupComparison& comparison, int) { return comparison.takeOverAll(); });
}

}  // namespace gridbay::shell
