// Another setup beside the one that is open, as a user has it: real widgets, real keys and clicks, real
// files, with no display.

#include <QFileDialog>
#include <QFileInfo>
#include <QLabel>
#include <QProgressDialog>
#include <QPushButton>
#include <QScrollBar>
#include <QStatusBar>
#include <QToolButton>

#include "shell/compare/merge_dialog.h"
#include "shell/compare/merge_files_dialog.h"
#include "shell/grid_view.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/shell/held_work.h"

namespace gridbay::shell {

class CompareTest final : public DesktopFixture {
  Q_OBJECT

  static constexpr int kFloodAndDry = 26;
  static constexpr int kAreas = 27;
  static constexpr int kPeriod = 39;
  static constexpr const char* kDepth = "Drying depth:";

  TabComparison& comparison() { return *TabComparison::of(&tab()); }
  CompareDock& dock() { return window_->differences(); }
  QTreeWidgetItem* itemOf(const QString& caption) {
    for (QTreeWidgetItem* item : tab().tree().findItems(caption, Qt::MatchExactly | Qt::MatchRecursive))
      return item;
    return nullptr;
  }
  bool isMarked(const QString& caption) {
    return tab().tree().columnCount() == 2 && !itemOf(caption)->icon(1).isNull();
  }
  // The things that differ, as the list has them.
  QStringList listed() {
    QStringList things;
    for (QTreeWidgetItemIterator item(&dock().list()); *item != nullptr; ++item) {
      if ((*item)->childCount() == 0)
        things << QString("%1: %2 | %3").arg((*item)->text(0), (*item)->text(1), (*item)->text(2));
    }
    return things;
  }
  void click(QAction* action) {
    QWidget* button = dock().tools().widgetForAction(action);
    QVERIFY(button->isVisible());
    QTest::mouseClick(button, Qt::LeftButton);
    QCoreApplication::processEvents();
  }
  QString undoName() {
    const auto edit = tab().editor().undoable();
    return edit ? QString::fromStdString(edit->name) : QString();
  }
  QLineEdit& otherEdit(const QString& label) {
    QWidget* widget = comparison().otherPane().widgetOf(label);
    return *qobject_cast<QLineEdit*>(widget->focusProxy() != nullptr ? widget->focusProxy() : widget);
  }
  // Puts a setup beside the one that is open, and waits until the two have been compared.
  bool compareWith(const QString& name) { return window_->compareWith(file(name)) && comparison().finish(); }
  // A copy of the setup with other values.
  void makeOther(const QString& name, const QStringList& settings) {
    QFile::remove(file(name));
    QVERIFY(QFile::copy(file("s.v27"), file(name)));
    if (!settings.isEmpty()) run("v27setup", QStringList{"set", name} + settings);
  }

  static QStringList rowOf(MergeDialog& dialog) {
    const QTreeWidgetItem& row = *dialog.list().topLevelItem(0)->child(0);
    return {row.text(0), row.text(1), row.text(2), row.text(3)};
  }
  // Does something with the dialog of a type that comes up while the window is at something.
  template <class Dialog>
  static bool with(const std::function<void(Dialog&)>& act, const std::function<void()>& begin) {
    QTimer poll;
    bool isShown = false;
    connect(&poll, &QTimer::timeout, qApp, [&] {
      auto* dialog = qobject_cast<Dialog*>(QApplication::activeModalWidget());
      if (dialog == nullptr) return;
      poll.stop();
      isShown = true;
      act(*dialog);
    });
    poll.start(10);
    begin();
    return isShown;
  }

  // Cancels the n-th work beside the window, which is held; whether it was there.
  static bool cancels(int nth, const std::function<void()>& begin) {
    signalCopy(nth, SIGSTOP);
    return with<QProgressDialog>(
        [](QProgressDialog& dialog) { QTest::mouseClick(dialog.findChild<QPushButton*>(), Qt::LeftButton); },
        begin);
  }

 private slots:
  void initTestCase() { makeFolder(); }
  void init() {
    makeWindow();
    window_->resize(1500, 900);
    makeOther("o.v27", {"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.05",
                        "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin=37,33",
                        "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Warm_Up_Period=7"});
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
  }
  void cleanup() { window_.reset(); }

  void theSetupIsChosenByItsFile() {
    auto* poll = new QTimer(qApp);
    connect(poll, &QTimer::timeout, qApp, [poll, this] {
      auto* files = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
      if (files == nullptr) return;
      poll->deleteLater();
      files->findChild<QLineEdit*>()->setText(file("o.v27"));
      QMetaObject::invokeMethod(files, "accept");
    });
    poll->start(20);
    QTest::keyClick(window_.get(), Qt::Key_D, Qt::ControlModifier | Qt::ShiftModifier);
    QTRY_VERIFY(TabComparison::of(&tab()) != nullptr);
    QVERIFY(dock().isVisible());
    QTRY_COMPARE(dock().note().text(), QString("s.v27 and o.v27: 3 differences"));
  }

  void differingPagesAreListedAndMarked() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(dock().isVisible());
    const QStringList things = listed();
    QCOMPARE(things.size(), 3);
    QVERIFY2(things.contains("Drying depth: 0.02 m | 0.05 m"), qPrintable(things.join("\n")));
    QVERIFY(isMarked("Flood and Dry"));
    QVERIFY(isMarked("Bathymetry"));
    QVERIFY(!isMarked("Boundary"));
    QCOMPARE(itemOf("Flood and Dry")->toolTip(1), QString("Flood and Dry: 1 difference from o.v27"));
  }

  void thePagesStandSideBySide() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(!comparison().otherPane().isVisible());
    QVERIFY(tab().goToPage(kFloodAndDry));
    QCoreApplication::processEvents();
    QVERIFY(comparison().otherPane().isVisible());
    QCOMPARE(comparison().otherPane().findChild<QLabel*>()->text(), QString("Flood and Dry in o.v27"));
    QCOMPARE(edit(kDepth).text(), QString("0.02"));
    QCOMPARE(otherEdit(kDepth).text(), QString("0.05"));
    QVERIFY(otherEdit(kDepth).isReadOnly());
    // What differs has a frame around it on both.
    const std::vector<QRect> own = comparison().marks()->rects();
    QCOMPARE(own.size(), std::size_t{1});
    const QPoint middle =
        edit(kDepth).mapTo(comparison().marks()->parentWidget(), edit(kDepth).rect().center());
    QVERIFY(own[0].contains(middle));
    QCOMPARE(comparison().otherMarks()->rects().size(), std::size_t{1});
    const QImage picture = comparison().marks()->parentWidget()->grab().toImage();
    const QColor frame = tab().palette().color(QPalette::Active, QPalette::Link);
    bool isPainted = false;
    for (int y = own[0].top(); y <= own[0].top() + 3; ++y) {
      const QColor at = picture.pixelColor(own[0].center().x(), y);
      isPainted =
          isPainted || (std::abs(at.red() - frame.red()) < 60 && std::abs(at.blue() - frame.blue()) < 60);
    }
    QVERIFY(isPainted);
    // A page without differences has none.
    QVERIFY(tab().goToPage(40));
    QVERIFY(comparison().marks()->rects().empty());
  }

  void cellsAreMarkedAndReadOnly() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kAreas));
    QCoreApplication::processEvents();
    GridView& table = *tab().pane().tableAt(1);
    GridView& other = *comparison().otherPane().tableAt(1);
    const Difference& difference = *std::ranges::find(comparison().differences(), kAreas, &Difference::page);
    const QModelIndex cell = table.model()->index(difference.row - 1, difference.column - 1);
    QCOMPARE(cell.data().toString(), QString("(36,33)"));
    const QModelIndex otherCell = other.model()->index(cell.row(), cell.column());
    QCOMPARE(otherCell.data().toString(), QString("(37,33)"));
    QVERIFY(!otherCell.flags().testFlag(Qt::ItemIsEditable));
    QVERIFY(!other.model()->setData(otherCell, "(1,1)", Qt::EditRole));
    QTest::mouseClick(other.viewport(), Qt::LeftButton, {}, other.visualRect(otherCell).center());
    QVERIFY(other.viewport()->findChild<QLineEdit*>() == nullptr);
    const QRect mark = comparison().marks()->rects().at(0);
    QVERIFY(mark.contains(
        table.viewport()->mapTo(comparison().marks()->parentWidget(), table.visualRect(cell).center())));
  }

  void keysGoFromDifferenceToDifference() {
    QVERIFY(compareWith("o.v27"));
    std::vector<int> pages;
    for (int i = 0; i < 4; ++i) {
      QTest::keyClick(window_.get(), Qt::Key_F8);
      QCOMPARE(comparison().current(), i % 3);
      pages.push_back(tab().currentPage());
    }
    QCOMPARE(pages, (std::vector<int>{kAreas, kPeriod, kFloodAndDry, kAreas}));
    QVERIFY(tab().pane().tableAt(1)->hasFocus());
    QTest::keyClick(window_.get(), Qt::Key_F8, Qt::ShiftModifier);
    QCOMPARE(tab().currentPage(), kFloodAndDry);
    QVERIFY(edit(kDepth).hasFocus());
    QCOMPARE(dock().list().currentItem()->text(0), QString("Drying depth"));
  }

  void theListLeadsToThePage() {
    QVERIFY(compareWith("o.v27"));
    QTreeWidget& list = dock().list();
    QTreeWidgetItem* item = list.findItems("Drying depth", Qt::MatchExactly | Qt::MatchRecursive).at(0);
    list.scrollToItem(item);
    QTest::mouseClick(list.viewport(), Qt::LeftButton, {}, list.visualItemRect(item).center());
    QCOMPARE(tab().currentPage(), kFloodAndDry);
    QVERIFY(comparison().marks()->rects().size() == 1);
  }

  void aDifferenceIsTakenOverAndBack() {
    QVERIFY(compareWith("o.v27"));
    QTest::keyClick(window_.get(), Qt::Key_F8, Qt::ShiftModifier);
    QCOMPARE(edit(kDepth).text(), QString("0.02"));
    click(dock().takeAction());
    QCOMPARE(edit(kDepth).text(), QString("0.05"));
    QCOMPARE(undoName(), QString("Take over Drying depth"));
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Take over Drying depth"));
    QTRY_COMPARE(listed().size(), 2);
    QVERIFY(!isMarked("Flood and Dry"));
    QVERIFY(comparison().marks()->rects().empty());
    window_->undoAction()->trigger();
    QCOMPARE(edit(kDepth).text(), QString("0.02"));
    QTRY_COMPARE(listed().size(), 3);
    QVERIFY(isMarked("Flood and Dry"));
    // By its key.
    QTest::keyClick(window_.get(), Qt::Key_F8, Qt::ShiftModifier);
    QTest::keyClick(window_.get(), Qt::Key_Left, Qt::AltModifier);
    QCOMPARE(undoName(), QString("Take over Drying depth"));
  }

  void aPageAndAllAreTakenOver() {
    QVERIFY(compareWith("o.v27"));
    // No page is shown yet.
    QVERIFY(dock().takeAllAction()->isEnabled() && !dock().takePageAction()->isEnabled());
    QVERIFY(tab().goToPage(kAreas));
    click(dock().takePageAction());
    QCOMPARE(undoName(), QString("Take over Basic Parameters, Bathymetry"));
    QTRY_COMPARE(listed().size(), 2);
    click(dock().takeAllAction());
    QCOMPARE(undoName(), QString("Take over all"));
    QTRY_COMPARE(dock().note().text(), QString("s.v27 and o.v27 are the same."));
    QVERIFY(listed().isEmpty());
    QVERIFY(!dock().takeAllAction()->isEnabled());
    QVERIFY(window_->saveDocument());
    QCOMPARE(textOf(file("s.v27")), textOf(file("o.v27")));
  }

  void itFollowsEachEdit() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    enter(kDepth, "0.05");
    QTRY_COMPARE(listed().size(), 2);
    QVERIFY(!isMarked("Flood and Dry"));
    enter("Flooding depth:", "0.9");
    QTRY_COMPARE(listed().size(), 3);
    QCOMPARE(comparison().marks()->rects().size(), std::size_t{1});
  }

  void bothPagesScrollTogether() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(29));
    window_->resize(900, 420);
    QCoreApplication::processEvents();
    QScrollBar& own = *tab().pane().verticalScrollBar();
    QScrollBar& other = *comparison().otherPane().verticalScrollBar();
    const int most = std::min(own.maximum(), other.maximum());
    if (most > 0) {
      own.setValue(most);
      QCOMPARE(other.value(), most);
      other.setValue(0);
      QCOMPARE(own.value(), 0);
    }
    GridView& table = *tab().pane().tableAt(1);
    GridView& beside = *comparison().otherPane().tableAt(1);
    const int wide =
        std::min(table.horizontalScrollBar()->maximum(), beside.horizontalScrollBar()->maximum());
    QVERIFY(most > 0 || wide > 0);
    table.horizontalScrollBar()->setValue(wide);
    QCOMPARE(beside.horizontalScrollBar()->value(), wide);
  }

  void unitsAreThoseOfTheDocument() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    UnitChoices us;
    us.setSystem(UnitSystem::us);
    tab().setUnits(us);
    QTRY_VERIFY(listed().filter("Drying depth").value(0).contains("ft"));
    QVERIFY(otherEdit(kDepth).text().startsWith("0.164"));
  }

  void itEnds() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    click(dock().endAction());
    QVERIFY(TabComparison::of(&tab()) == nullptr);
    QCOMPARE(tab().tree().columnCount(), 1);
    QVERIFY(tab().pane().findChild<DifferenceMarks*>() == nullptr);
    QVERIFY(listed().isEmpty());
    QVERIFY(!dock().nextAction()->isEnabled());
    // And begins again; the document goes with it.
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    QTest::keySequence(window_.get(), QKeySequence(QKeySequence::Close));
    QVERIFY(window_->currentDocument() == nullptr);
    QVERIFY(listed().isEmpty());
  }

  void eachDocumentHasItsOwn() {
    QVERIFY(compareWith("o.v27"));
    makeOther("p.v27", {});
    QVERIFY(window_->openDocument(file("p.v27")) != nullptr);
    QVERIFY(listed().isEmpty());
    QVERIFY(!dock().takeAllAction()->isEnabled());
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    QCOMPARE(listed().size(), 3);
  }

  void whatCannotBeReadIsTold() {
    write(file("no.v27"), "OTHER {}\n");
    for (const QString name : {"none.v27", "no.v27"}) {
      bool isDone = true;
      const QStringList told = answers({QMessageBox::Ok}, [&] { isDone = window_->compareWith(file(name)); });
      QVERIFY(!isDone);
      QCOMPARE(told.size(), 1);
      QVERIFY2(told[0].contains(name), qPrintable(told[0]));
      QVERIFY(TabComparison::of(&tab()) == nullptr);
    }
  }

  void aMergeIsOneStep() {
    makeOther("base.v27", {});
    QVERIFY(tab().goToPage(kFloodAndDry));
    enter("Flooding depth:", "0.9");
    QVERIFY(window_->merge(file("base.v27"), {}, file("o.v27")));
    QCOMPARE(edit(kDepth).text(), QString("0.05"));
    QCOMPARE(edit("Flooding depth:").text(), QString("0.9"));
    QCOMPARE(undoName(), QString("Merge"));
    window_->undoAction()->trigger();
    QCOMPARE(edit(kDepth).text(), QString("0.02"));
  }

  void conflictsHaveAChoiceEach() {
    makeOther("base.v27", {});
    QVERIFY(tab().goToPage(kFloodAndDry));
    enter(kDepth, "0.01");
    const auto merge = [this](bool takesOther, bool accepts) {
      QTimer poll;
      bool isShown = false;
      connect(&poll, &QTimer::timeout, qApp, [&] {
        auto* dialog = qobject_cast<MergeDialog*>(QApplication::activeModalWidget());
        if (dialog == nullptr) return;
        poll.stop();
        isShown = dialog->list().topLevelItemCount() == 1 &&
                  dialog->list().topLevelItem(0)->text(0) == "Basic Parameters, Flood and Dry" &&
                  rowOf(*dialog) == QStringList{"Drying depth", "0.02 m", "0.01 m", "0.05 m"};
        dialog->choice(0).setFocus();
        if (takesOther) QTest::keyClick(&dialog->choice(0), Qt::Key_Down);
        accepts ? dialog->accept() : dialog->reject();
      });
      poll.start(10);
      const bool isDone = window_->merge(file("base.v27"), {}, file("o.v27"));
      return isShown && isDone == accepts;
    };
    QVERIFY(merge(true, false));
    QCOMPARE(edit(kDepth).text(), QString("0.01"));
    QVERIFY(merge(false, true));
    QCOMPARE(edit(kDepth).text(), QString("0.01"));
    window_->undoAction()->trigger();
    QVERIFY(tab().goToPage(kFloodAndDry));
    QVERIFY(merge(true, true));
    QVERIFY(tab().goToPage(kFloodAndDry));
    QCOMPARE(edit(kDepth).text(), QString("0.05"));
  }

  // Of both kinds of merge: with something to choose, and without.
  void whatAMergeLeavesOutIsToldBefore() {
    makeOther("base.v27", {});
    QByteArray text = textOf(file("o.v27")).toUtf8();
    text.insert(text.indexOf("MODULE_SELECTION {"), "LATER_PART {\na 1\n}\n");
    write(file("o.v27"), text);
    const auto merge = [this] { return window_->merge(file("base.v27"), {}, file("o.v27")); };
    for (const auto answer : {QMessageBox::No, QMessageBox::Yes}) {
      bool isDone = false;
      const QStringList told = answers({answer}, [&] { isDone = merge(); });
      QCOMPARE(told.size(), 1);
      QVERIFY2(told[0].contains("NESTED_MODEL_GLOBALS/LATER_PART of o.v27"), qPrintable(told[0]));
      QCOMPARE(isDone, answer == QMessageBox::Yes);
      QCOMPARE(undoName(), QString(isDone ? "Merge" : ""));
    }
    window_->undoAction()->trigger();
    QVERIFY(tab().goToPage(kFloodAndDry));
    enter(kDepth, "0.01");
    QString warning;
    const auto read = [&](MergeDialog& dialog) {
      warning = dialog.findChild<QLabel*>("warning")->text();
      dialog.reject();
    };
    QVERIFY(with<MergeDialog>(read, [&] { QVERIFY(!merge()); }));
    QVERIFY2(warning.contains("LATER_PART"), qPrintable(warning));
  }

  // Reading and merging go beside the window: when either is cancelled or comes to a sudden end, nothing has
  // changed.
  void readingAndMergingEndEarly() {
    makeOther("base.v27", {});
    const std::uint64_t before = tab().editor().modelState();
    bool isDone = true;
    const auto compare = [&] { isDone = window_->compareWith(file("o.v27")); };
    const auto merge = [&] { isDone = window_->merge(file("base.v27"), {}, file("o.v27")); };
    QVERIFY(cancels(1, compare));
    QVERIFY(!isDone && TabComparison::of(&tab()) == nullptr);
    for (const int step : {1, 2}) {
      isDone = true;
      QVERIFY(cancels(step, merge));
      QVERIFY(!isDone);
    }
    for (const auto& [step, act] :
         {std::pair<int, std::function<void()>>{1, compare}, {1, merge}, {2, merge}}) {
      isDone = true;
      signalCopy(step, SIGKILL);
      const QStringList told = answers({QMessageBox::Ok}, act);
      QVERIFY(!isDone);
      QVERIFY2(told.size() == 1 && told[0].contains("came to a sudden end"), qPrintable(told.join("\n")));
    }
    QCOMPARE(tab().editor().modelState(), before);
    QVERIFY(window_->merge(file("base.v27"), {}, file("o.v27")));
    QVERIFY(compareWith("o.v27"));
  }

  // The window goes on while a long comparison is at work, whose result is not that of the setup as it is by
  // then: what is seen in the end is.
  void theWindowGoesOnMeanwhile() {
    run("v27setup", {"set", "o.v27", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=1500"});
    QVERIFY(window_->compareWith(file("o.v27")));
    QVERIFY(comparison().isAtWork());
    QVERIFY(tab().goToPage(kFloodAndDry));
    int beats = 0;
    QTimer beat;
    connect(&beat, &QTimer::timeout, this, [&] { ++beats; });
    beat.start(5);
    enter("Flooding depth:", "0.9");
    QTRY_VERIFY_WITH_TIMEOUT(!comparison().isAtWork(), 30000);
    QVERIFY2(beats > 10, qPrintable(QString::number(beats)));
    QVERIFY(comparison().isCurrent());
    QVERIFY2(listed().filter("Flooding depth").value(0).contains("0.9 m"), qPrintable(listed().join("\n")));
    // What is typed is compared before something is taken over.
    enter("Flooding depth:", "0.8");
    click(dock().takeAllAction());
    QCOMPARE(undoName(), QString("Take over all"));
    QTRY_VERIFY_WITH_TIMEOUT(!comparison().isAtWork(), 30000);
    QVERIFY(listed().isEmpty());
  }

  void theOtherFileIsReadAgain() {
    QVERIFY(compareWith("o.v27"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    QVERIFY(!comparison().notice().isVisible());
    run("v27setup", {"set", "o.v27", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.07"});
    QTRY_VERIFY(comparison().notice().isVisible());
    QCOMPARE(otherEdit(kDepth).text(), QString("0.05"));
    auto* again = comparison().notice().findChild<QPushButton*>("reload");
    QTest::mouseClick(again, Qt::LeftButton);
    QVERIFY(!comparison().notice().isVisible());
    QTRY_VERIFY(listed().contains("Drying depth: 0.02 m | 0.07 m"));
    QCOMPARE(otherEdit(kDepth).text(), QString("0.07"));
    // What is gone is still compared, and can be read when it is there again.
    QVERIFY(QFile::rename(file("o.v27"), file("away.v27")));
    QTRY_VERIFY(comparison().notice().isVisible());
    QVERIFY(comparison().notice().findChild<QLabel*>()->text().contains("no longer on disk"));
    QVERIFY(!again->isEnabled());
    QCOMPARE(listed().size(), 3);
    run("v27setup", {"set", "away.v27", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.06"});
    QVERIFY(QFile::rename(file("away.v27"), file("o.v27")));
    QTRY_VERIFY(again->isEnabled());
    QTest::mouseClick(again, Qt::LeftButton);
    QTRY_VERIFY(listed().contains("Drying depth: 0.02 m | 0.06 m"));
    // One that is none any more is told, and what was read stays.
    write(file("o.v27"), "OTHER {}\n");
    QTRY_VERIFY(comparison().notice().isVisible());
    again->click();
    QVERIFY2(window_->statusBar()->currentMessage().contains("is not a setup"),
             qPrintable(window_->statusBar()->currentMessage()));
    QCOMPARE(otherEdit(kDepth).text(), QString("0.06"));
    QVERIFY(comparison().notice().isVisible());
  }

  void aChangeOfTheOtherFileWhileItIsReadIsSeen() {
    QVERIFY(tab().goToPage(kFloodAndDry));
    signalCopy(1, SIGSTOP);
    QTimer::singleShot(100, this, [this] {
      run("v27setup", {"set", "o.v27", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.07"});
      releaseCopies();
    });
    QVERIFY(compareWith("o.v27"));
    QVERIFY(comparison().notice().isVisible());
  }

  void threeFilesAreMergedIntoANewDocument() {
    makeOther("base.v27", {});
    makeOther("a.v27", {"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.01",
                        "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Warm_Up_Period=5"});
    QVERIFY(tab().goToPage(kFloodAndDry));
    const auto fill = [this](MergeFilesDialog& dialog) {
      dialog.baseEdit().setText(file("base.v27"));
      QTest::keyClicks(&dialog.ownEdit(), file("a.v27"));
      dialog.otherEdit().setText(file("o.v27"));
      QTimer::singleShot(0, &dialog, &QDialog::accept);
    };
    const auto settle = [](MergeDialog& dialog) {
      QCOMPARE(dialog.list().topLevelItemCount(), 2);
      // All of a page, and one of another.
      const bool isFirst = dialog.list().topLevelItem(0)->text(0).contains("Flood");
      QTest::keyClick(&dialog.pageChoice(isFirst ? 0 : 1), Qt::Key_Down);
      QTimer::singleShot(0, &dialog, &QDialog::accept);
    };
    QAction* action = nullptr;
    for (QAction* each : window_->findChildren<QAction*>()) {
      if (each->text() == "&Merge...") action = each;
    }
    QVERIFY(action != nullptr);
    bool isSettled = false;
    QVERIFY(with<MergeFilesDialog>(
        fill, [&] { isSettled = with<MergeDialog>(settle, [&] { action->trigger(); }); }));
    QVERIFY(isSettled);
    QVERIFY(tab().editor().path().empty());
    QVERIFY(tab().editor().isModified());
    QCOMPARE(undoName(), QString("Merge"));
    QVERIFY(tab().goToPage(kFloodAndDry));
    QCOMPARE(edit(kDepth).text(), QString("0.05"));
    QVERIFY(window_->saveDocument(file("merged.v27")));
    makeOther("wanted.v27", {"NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.05",
                             "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin=37,33",
                             "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Warm_Up_Period=5"});
    QCOMPARE(textOf(file("merged.v27")), textOf(file("wanted.v27")));
    // What can't be read leaves nothing behind.
    const QStringList told = answers(
        {QMessageBox::Ok}, [&] { QVERIFY(!window_->merge(file("none.v27"), file("a.v27"), file("o.v27"))); });
    QCOMPARE(told.size(), 1);
    QCOMPARE(tab().name(), QString("merged.v27"));
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("compare-test");
  gridbay::shell::CompareTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "compare_test.moc"
