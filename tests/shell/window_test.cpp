// What the window does around the pages: tools, start view, first view, messages, saves, recovery.

#include <QDir>
#include <QJsonDocument>
#include <QJsonObject>
#include <QMenuBar>
#include <QPainter>
#include <QStandardPaths>
#include <QStatusBar>

#include "shell/appearance.h"
#include "shell/grid_view.h"
#include "shell/tool_icons.h"
#include "tests/shell/desktop_fixture.h"

namespace gridbay::shell {

class WindowTest final : public DesktopFixture {
  Q_OBJECT

  bool open() { return window_->openDocument(file("s.v27")) != nullptr; }
  MessagesDock& messages() { return window_->messagesDock(); }
  static QStringList linesOf(SummaryView& summary) {
    QStringList lines;
    for (int i = 0; i < summary.lines().topLevelItemCount(); ++i)
      lines << summary.lines().topLevelItem(i)->text(0).trimmed() + ": " +
                   summary.lines().topLevelItem(i)->text(1);
    return lines;
  }
  bool messagesStandBack() {
    return messages().list().topLevelItem(0)->foreground(0).color() ==
           messages().palette().color(QPalette::Disabled, QPalette::Text);
  }
  // The place of the first advice with a text in the list; -1 for none.
  int adviceOf(const QString& text) {
    for (std::size_t i = 0; i < tab().advice().size(); ++i) {
      if (QString::fromStdString(tab().advice()[i].doubt).contains(text)) return static_cast<int>(i);
    }
    return -1;
  }
  QTreeWidgetItem* adviceItem(const QString& text) {
    return messages().list().topLevelItem(messages().messageCount() + adviceOf(text));
  }
  // The setup with faults and doubts of many kinds.
  void makeDoubtful() {
    const QString globals = "NESTED_MODEL_GLOBALS/";
    run("v27setup",
        {"set", "s.v27", globals + "BATHYMETRY_SELECTION/AREA_2/Origin=35,33",
         globals + "FLOOD_AND_DRY/Flooding_Depth=0.5", globals + "FLOOD_AND_DRY/Drying_Depth=0.01",
         globals + "OPEN_BOUNDARY/BOUNDARY_2/First_Point=-1,90",
         globals + "SIMULATION_PERIOD/Warm_Up_Period=99999999",
         "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/Data_Format=3",
         "HYDRODYNAMIC_MODULE/OPEN_BOUNDARY/BOUNDARY_3/File_Name=gone.tsb0",
         "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Data_Format=2",
         "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/File_Name=/elsewhere/wind.tsb0"});
  }
  // By its key, which differs with the desktop.
  void closeTab() { QTest::keySequence(window_.get(), QKeySequence(QKeySequence::Close)); }
  static QString redoKey() { return QKeySequence(QKeySequence::Redo).toString(QKeySequence::NativeText); }
  int tabCount() { return window_->findChild<QTabWidget*>()->count(); }

  // Edits of a setup that a run which ended suddenly has left behind.
  QString leaveEdits(const QString& path, const QByteArray& dryingDepth) {
    const QString run = QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + "/recovery/left";
    QDir().mkpath(run);
    QString text = textOf(file("s.v27"));
    text.replace("Drying_Depth 0.02", "Drying_Depth " + dryingDepth);
    write(run + "/1.setup", text.toUtf8());
    write(run + "/1.json", QJsonDocument(QJsonObject{{"path", path}, {"extension", ".v27"}}).toJson());
    return run + "/1.setup";
  }
  static int copiesKept() {
    const QDir folder(QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + "/recovery");
    int copies = 0;
    for (const QString& run : folder.entryList(QDir::Dirs | QDir::NoDotAndDotDot))
      copies += static_cast<int>(QDir(folder.filePath(run)).entryList({"*.setup"}).size());
    return copies;
  }

 private slots:
  void initTestCase() { makeFolder(); }
  void init() { makeWindow(); }
  void cleanup() {
    window_.reset();
    setAppearance(Appearance::desktop);
    QDir(QStandardPaths::writableLocation(QStandardPaths::AppDataLocation) + "/recovery").removeRecursively();
  }

  void theToolsAreTheActionsOfTheMenus() {
    QVERIFY(open());
    QList<QAction*> inMenus;
    for (QMenu* menu : window_->menuBar()->findChildren<QMenu*>()) inMenus << menu->actions();
    for (QMenu* menu : window_->findChildren<QMenu*>()) inMenus << menu->actions();
    int tools = 0;
    QStringList tips;
    for (QAction* action : window_->tools().actions()) {
      if (action->isSeparator()) continue;
      ++tools;
      QVERIFY2(inMenus.contains(action), qPrintable(action->text()));
      QVERIFY(!action->icon().isNull());
      QVERIFY(window_->tools().widgetForAction(action) != nullptr);
      tips << action->toolTip();
    }
    QCOMPARE(tools, 9);
    QCOMPARE(tips, QStringList({"New VANE 27 Flow model (Ctrl+N)", "Open (Ctrl+O)", "Save (Ctrl+S)",
                                "Undo (Ctrl+Z)", QString("Redo (%1)").arg(redoKey()), "Validate (F7)",
                                "Start simulation (F5)", "Units that quantities are shown in",
                                "Help on this page (F1)"}));
  }

  void theToolsFollowTheDocument() {
    QAction* save = window_->tools().actions().at(2);
    QVERIFY(!save->isEnabled());
    QVERIFY(!window_->checkAction()->isEnabled());
    QVERIFY(open());
    QVERIFY(save->isEnabled());
    QVERIFY(window_->checkAction()->isEnabled());
    QVERIFY(!window_->undoAction()->isEnabled());
    QVERIFY(tab().goToPage(26));
    enter("Drying depth:", "0.01");
    QCOMPARE(window_->undoAction()->toolTip(), QString("Undo Drying depth (Ctrl+Z)"));
    QTest::mouseClick(window_->tools().widgetForAction(window_->undoAction()), Qt::LeftButton);
    QCOMPARE(edit("Drying depth:").text(), QString("0.02"));
    QCOMPARE(window_->redoAction()->toolTip(), QString("Redo Drying depth (%1)").arg(redoKey()));
    QCOMPARE(window_->undoAction()->toolTip(), QString("Undo (Ctrl+Z)"));
    QVERIFY(!window_->undoAction()->isEnabled());
  }

  void everyToolHasAPictureInTheColoursOfTheText() {
    const auto drawn = [](Tool tool, QIcon::Mode mode) {
      return toolIcon(tool).pixmap(QSize(24, 24), 2, mode).toImage();
    };
    const auto darkest = [](const QImage& image) {
      int least = 255;
      int inked = 0;
      for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
          if (image.pixelColor(x, y).alpha() < 200) continue;
          ++inked;
          least = qMin(least, image.pixelColor(x, y).lightness());
        }
      }
      return inked > 60 ? least : -1;
    };
    for (int tool = 0; tool <= static_cast<int>(Tool::advice); ++tool) {
      const Tool each = static_cast<Tool>(tool);
      setAppearance(Appearance::light);
      const QImage light = drawn(each, QIcon::Normal);
      QCOMPARE(light.size(), QSize(48, 48));  // crisp at scale 2
      const int onLight = darkest(light);
      QVERIFY2(onLight >= 0 && onLight < 110, qPrintable(QString("%1: %2").arg(tool).arg(onLight)));
      QVERIFY(drawn(each, QIcon::Disabled) != light);
      setAppearance(Appearance::dark);
      const int onDark = darkest(drawn(each, QIcon::Normal));
      QVERIFY2(onDark > 140, qPrintable(QString("%1: %2").arg(tool).arg(onDark)));
    }
  }

  void theDesktopsOwnPicturesGoWithItsColours() {
    QDir(folder_->path()).mkpath("icons/plain/24x24/actions");
    write(file("icons/plain/index.theme"),
          "[Icon Theme]\nName=plain\nDirectories=24x24/actions\n[24x24/actions]\nSize=24\nType=Scalable\n");
    QImage red(24, 24, QImage::Format_ARGB32);
    red.fill(Qt::red);
    QVERIFY(red.save(file("icons/plain/24x24/actions/document-save.png")));
    const QStringList paths = QIcon::themeSearchPaths();
    const QString name = QIcon::themeName();
    QIcon::setThemeSearchPaths({file("icons")});
    QIcon::setThemeName("plain");
    const auto middle = [](Tool tool) { return toolIcon(tool).pixmap(24, 24).toImage().pixelColor(3, 12); };
    QCOMPARE(middle(Tool::save), QColor(Qt::red));
    QCOMPARE(middle(Tool::open).alpha() > 0, true);  // ours, for the theme has none
    QVERIFY(middle(Tool::open) != QColor(Qt::red));
    setAppearance(Appearance::dark);
    QVERIFY(middle(Tool::save) != QColor(Qt::red));
    setAppearance(Appearance::desktop);
    QCOMPARE(middle(Tool::save), QColor(Qt::red));
    QIcon::setThemeSearchPaths(paths);
    QIcon::setThemeName(name);
  }

  void theStartViewOffersTheWaysToBegin() {
    StartView& start = window_->startView();
    QVERIFY(start.isVisible());
    QVERIFY(!start.recent().isVisible());  // there are none yet
    QStringList names;
    for (const auto* button : start.findChildren<QPushButton*>()) names << button->text();
    QCOMPARE(names, QStringList({"New VANE 27 Flow model", "New VANE 27 Wetland Sweep Kit", "Open", "Help"}));
    auto* sweep = start.findChildren<QPushButton*>().at(1);
    sweep->setFocus();
    QTest::keyClick(sweep, Qt::Key_Return);
    QCOMPARE(tabCount(), 1);
    QCOMPARE(tab().editor().fileKind(), std::string("v27wsk"));
    QVERIFY(!start.isVisible());
    closeTab();
    QCOMPARE(tabCount(), 0);
    QVERIFY(start.isVisible());
    QTest::mouseClick(start.findChildren<QPushButton*>().at(0), Qt::LeftButton);
    QCOMPARE(tab().editor().fileKind(), std::string("v27"));
  }

  void theStartViewIsUsedByKeys() {
    QVERIFY(open());
    closeTab();
    StartView& start = window_->startView();
    QVERIFY(start.recent().isVisible());
    QCOMPARE(start.recent().count(), 1);
    QCOMPARE(start.recent().item(0)->text().section('\n', 0, 0), QString("s.v27"));
    QList<QWidget*> order;
    auto* first = start.findChildren<QPushButton*>().at(0);
    QVERIFY(first->hasFocus());
    for (int i = 0; i < 5; ++i) {
      order << QApplication::focusWidget();
      QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    }
    const QList<QPushButton*> buttons = start.findChildren<QPushButton*>();
    for (int i = 0; i < 4; ++i) QCOMPARE(order[i], buttons[i]);
    QCOMPARE(order[4], &start.recent());
    start.recent().setFocus();
    QTest::keyClick(&start.recent(), Qt::Key_Return);
    QCOMPARE(tab().title(), QString("s.v27"));
  }

  void aRecentSetupThatIsGoneIsSaidAndDropped() {
    QVERIFY(QFile::copy(file("s.v27"), file("gone.v27")));
    QVERIFY(window_->openDocument(file("gone.v27")) != nullptr);
    closeTab();
    QVERIFY(QFile::remove(file("gone.v27")));
    QListWidget& recent = window_->startView().recent();
    QCOMPARE(recent.count(), 1);
    const QStringList told = answers({QMessageBox::Ok}, [&] {
      QTest::mouseClick(recent.viewport(), Qt::LeftButton, {},
                        recent.visualItemRect(recent.item(0)).center());
    });
    QCOMPARE(told.size(), 1);
    QVERIFY2(told[0].contains(file("gone.v27")), qPrintable(told[0]));
    QCOMPARE(recent.count(), 0);
    QVERIFY(window_->startView().isVisible());
  }

  void theFirstViewTellsTheSetup() {
    QVERIFY(open());
    SummaryView& summary = tab().summary();
    QVERIFY(summary.isVisible());
    QVERIFY(tab().pane().isVisible());
    QCOMPARE(
        linesOf(summary),
        QStringList({"Area 1: estuary.tsb2, not read yet",
                     "Area 2: inlet.tsb2, from (36,33) of Area 1, not read yet",
                     "Period: 1990-01-01 12:00:00 to 1990-01-01 12:50:00, 100 steps of 30 s",
                     "Greatest Courant number: not known until the grids are read",
                     "Open boundaries: 4, program detected: (0,0) - (0,90), (0,90) - (46,90), (120,41) - "
                     "(120,44) and 1 more",
                     "Sources and sinks: 0", "Check: not checked yet"}));
    QVERIFY(summary.checkButton().isVisible());
    QTest::mouseClick(&summary.checkButton(), Qt::LeftButton);
    const QStringList checked = linesOf(summary);
    QCOMPARE(checked[0], QString("Area 1: 121 x 91 points, 90 m apart, estuary.tsb2"));
    QCOMPARE(checked[1], QString("Area 2: 94 x 76 points, 30 m apart, from (36,33) of Area 1, inlet.tsb2"));
    QVERIFY2(checked[3].endsWith(" in Area 2") || checked[3].endsWith(" in Area 1"), qPrintable(checked[3]));
    QCOMPARE(checked[6], QString("Check: no faults"));
    QVERIFY(!summary.checkButton().isVisible());

    // Each line leads to its page.
    QTreeWidgetItem* boundaries = summary.lines().topLevelItem(4);
    QTest::mouseClick(summary.lines().viewport(), Qt::LeftButton, {},
                      summary.lines().visualItemRect(boundaries).center());
    QCOMPARE(tab().currentPage(), 28);
    QVERIFY(!summary.isVisible());
    QTest::keyClick(window_.get(), Qt::Key_Home, Qt::AltModifier);
    QCOMPARE(tab().currentPage(), 0);
    QVERIFY(summary.isVisible());
    summary.lines().setFocus();
    summary.lines().setCurrentItem(summary.lines().topLevelItem(2));
    QTest::keyClick(&summary.lines(), Qt::Key_Return);
    QCOMPARE(tab().currentPage(), 39);

    // And follows the model.
    enter("Time step interval:", "0");
    tab().showFirstView();
    QCOMPARE(linesOf(summary)[6], QString("Check: no faults before the last edit"));
    tab().runCommand(46019);
    QCOMPARE(linesOf(summary)[6], QString("Check: 1 fault"));
    QVERIFY(tab().goToPage(1));
    tab().showFirstView();
    QTest::mouseClick(summary.lines().viewport(), Qt::LeftButton, {},
                      summary.lines().visualItemRect(summary.lines().topLevelItem(6)).center());
    QCOMPARE(tab().currentPage(), 39);  // that of the fault
  }

  void aSaveBeforeARunIsTheTabsOwn() {
    write(file("engine"), "#!/bin/sh\nexit 0\n");
    QVERIFY(QFile(file("engine")).setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("GRIDBAY_ENGINE", file("engine").toUtf8());
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    enter("Drying depth:", "0.01");
    QTRY_COMPARE(copiesKept(), 1);
    QVERIFY(tab().title().endsWith("*"));
    const QStringList asked =
        answers({QMessageBox::Yes}, [this] { QTest::keyClick(window_.get(), Qt::Key_F5); });
    QCOMPARE(asked.size(), 1);
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.01\n"));
    QCOMPARE(tab().title(), QString("s.v27"));
    QCOMPARE(window_->findChild<QTabWidget*>()->tabText(0), QString("s.v27"));
    QCOMPARE(copiesKept(), 0);
    QTest::qWait(500);
    QVERIFY(!tab().notice().isVisible());
    QVERIFY(!tab().isChangedOnDisk());

    // Another program's changes are not written over unasked.
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
    enter("Drying depth:", "0.015");
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Flooding_Depth=0.25"});
    QTRY_VERIFY(tab().notice().isVisible());
    const QStringList both =
        answers({QMessageBox::Yes, QMessageBox::No}, [this] { QTest::keyClick(window_.get(), Qt::Key_F5); });
    QCOMPARE(both.size(), 2);
    QVERIFY2(both[1].contains("was changed by another program"), qPrintable(both[1]));
    QVERIFY(textOf(file("s.v27")).contains("Flooding_Depth 0.25\n"));
    QVERIFY(tab().title().endsWith("*"));
    qunsetenv("GRIDBAY_ENGINE");
  }

  void editsThatWereLeftBehindGoIntoTheOpenTab() {
    const QString copy = leaveEdits(file("s.v27"), "0.0325");
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    const QStringList told = answers({QMessageBox::Open}, [this] { window_->offerRecovery(); });
    QCOMPARE(told.size(), 1);
    QCOMPARE(tabCount(), 1);
    QCOMPARE(tab().title(), QString("s.v27 *"));
    QCOMPARE(tab().currentPage(), 26);
    QCOMPARE(edit("Drying depth:").text(), QString("0.0325"));
    QVERIFY(!QFile::exists(copy));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.0325\n"));
  }

  void ownEditsAreNotLostToThoseLeftBehind() {
    const QString copy = leaveEdits(file("s.v27"), "0.0325");
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    enter("Drying depth:", "0.0175");
    QStringList told = answers({QMessageBox::Open, QMessageBox::No}, [this] { window_->offerRecovery(); });
    QCOMPARE(told.size(), 2);
    QVERIFY2(told[1].contains("other edits"), qPrintable(told[1]));
    QCOMPARE(tabCount(), 1);
    QCOMPARE(edit("Drying depth:").text(), QString("0.0175"));
    QVERIFY(QFile::exists(copy));  // offered again
    told = answers({QMessageBox::Open, QMessageBox::Yes}, [this] { window_->offerRecovery(); });
    QCOMPARE(told.size(), 2);
    QCOMPARE(tabCount(), 1);
    QCOMPARE(edit("Drying depth:").text(), QString("0.0325"));
    QVERIFY(!QFile::exists(copy));
  }

  void editsOfAClosedSetupGetATabOfTheirOwn() {
    leaveEdits(file("s.v27"), "0.0325");
    answers({QMessageBox::Open}, [this] { window_->offerRecovery(); });
    QCOMPARE(tabCount(), 1);
    QCOMPARE(tab().title(), QString("s.v27 *"));
    QVERIFY(window_->openDocument(file("s.v27")) == &tab());
    QCOMPARE(tabCount(), 1);
  }

  void whatIsLeftBehindAndBrokenIsKept() {
    const QString copy = leaveEdits(file("s.v27"), "0.0325");
    write(copy, "VANE27_NESTED_MODEL {");
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    const QStringList told =
        answers({QMessageBox::Open, QMessageBox::Ok}, [this] { window_->offerRecovery(); });
    QCOMPARE(told.size(), 2);
    QVERIFY(QFile::exists(copy));
    QCOMPARE(tab().title(), QString("s.v27"));
    QCOMPARE(edit("Drying depth:").text(), QString("0.02"));
  }

  void noTwoTabsHoldOneFile() {
    QVERIFY(open());
    window_->newDocument(0);
    const QStringList told =
        answers({QMessageBox::Ok}, [this] { QVERIFY(!window_->saveDocument(file("s.v27"))); });
    QVERIFY2(told.value(0).contains("open in another tab"), qPrintable(told.value(0)));
    QVERIFY(window_->saveDocument(file("other.v27")));
  }

  void messagesStandBackAfterAnEdit() {
    QVERIFY(open());
    QCOMPARE(messages().note().text(), QString("s.v27 has not been checked yet."));
    QVERIFY(tab().goToPage(39));
    enter("Time step interval:", "0");
    QTest::keyClick(window_.get(), Qt::Key_F7);
    QCOMPARE(messages().messageCount(), 1);
    QCOMPARE(messages().note().text(), QString("s.v27: 1 fault"));
    QVERIFY(!messagesStandBack());
    enter("Time step interval:", "2");
    QCOMPARE(messages().messageCount(), 1);  // still there to work down
    QVERIFY(messagesStandBack());
    QCOMPARE(messages().note().text(),
             QString("s.v27: 1 fault before the last edit. Check again to see what holds now."));
    // A message leads to its page all the same.
    QVERIFY(tab().goToPage(1));
    emit messages().list().itemActivated(messages().list().topLevelItem(0), 0);
    QCOMPARE(tab().currentPage(), 39);
    // Once the edit has been taken back they hold again.
    window_->undoAction()->trigger();
    QVERIFY(!messagesStandBack());
    QCOMPARE(messages().note().text(), QString("s.v27: 1 fault"));
    window_->redoAction()->trigger();
    QVERIFY(messagesStandBack());
    auto* again = messages().findChild<QToolButton*>();
    for (auto* button : messages().findChildren<QToolButton*>()) {
      if (button->defaultAction() == window_->checkAction()) again = button;
    }
    QVERIFY(again->isVisible());
    QTest::mouseClick(again, Qt::LeftButton);
    QCOMPARE(messages().messageCount(), 0);
    QCOMPARE(messages().note().text(), QString("s.v27: no faults"));
    QVERIFY(!again->isVisible());
  }

  void messagesBelongToTheirSetup() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(39));
    enter("Time step interval:", "0");
    QTest::keyClick(window_.get(), Qt::Key_F7);
    DocumentTab* first = &tab();
    window_->newDocument(0);
    QCOMPARE(messages().messageCount(), 0);
    QCOMPARE(messages().note().text(), QString("Untitled has not been checked yet."));
    window_->openDocument(file("s.v27"));
    QCOMPARE(&tab(), first);
    QCOMPARE(messages().messageCount(), 1);
    // A setup that is read anew has not been checked.
    QVERIFY(window_->saveDocument());
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=5"});
    QTRY_VERIFY(tab().notice().isVisible());
    tab().notice().findChild<QPushButton*>("reload")->click();
    QCOMPARE(messages().messageCount(), 0);
    QCOMPARE(messages().note().text(), QString("s.v27 has not been checked yet."));
    QTest::keyClick(window_.get(), Qt::Key_F7);
    closeTab();
    closeTab();
    QCOMPARE(tabCount(), 0);
    QCOMPARE(messages().note().text(), QString("No setup is open."));
    QCOMPARE(messages().messageCount(), 0);
  }

  void adviceComesAMomentAfterAnEdit() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    QVERIFY(adviceOf("flooding depth") < 0);
    enter("Flooding depth:", "0.5");
    QVERIFY(adviceOf("flooding depth") < 0);  // not in the middle of the work
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
    const QTreeWidgetItem* line = adviceItem("flooding depth");
    QCOMPARE(line->text(1), QString("Flood and Dry"));
    QVERIFY(!line->icon(0).isNull());
    // It is counted among no faults, and comes behind them.
    QCOMPARE(messages().messageCount(), 0);
    QTest::keyClick(window_.get(), Qt::Key_F7);
    QCOMPARE(messages().note().text(), QString("s.v27: no faults"));
    QVERIFY(adviceOf("flooding depth") >= 0);
    // It marks the item of the tree and the page, and leads to its field.
    QTreeWidgetItem* item = tab().tree().currentItem();
    QVERIFY(!item->icon(0).isNull());
    QVERIFY(item->toolTip(0).contains("flooding depth"));
    QVERIFY(tab().adviceStrip().isVisible());
    QVERIFY(tab().goToPage(1));
    QVERIFY(!tab().adviceStrip().isVisible());
    emit messages().list().itemActivated(adviceItem("flooding depth"), 0);
    QCOMPARE(tab().currentPage(), 26);
    QVERIFY(edit("Flooding depth:").hasFocus());
    // Its fix is one step.
    QTest::mouseClick(tab().adviceStrip().findChild<QToolButton*>("fix"), Qt::LeftButton);
    QCOMPARE(edit("Flooding depth:").text(), QString("0.04"));
    QVERIFY(adviceOf("flooding depth") < 0);
    QVERIFY(item->icon(0).isNull());
    QVERIFY(!tab().adviceStrip().isVisible());
    QCOMPARE(window_->undoAction()->toolTip(), QString("Undo Flooding depth of 0.04 m (Ctrl+Z)"));
    window_->undoAction()->trigger();
    QCOMPARE(edit("Flooding depth:").text(), QString("0.5"));
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
  }

  void adviceLeadsToItsRowAndIsFixedFromTheList() {
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/BATHYMETRY_SELECTION/AREA_2/Origin=35,33",
                     "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD/Time_Step_Interval=3"});
    QVERIFY(open());
    QTRY_COMPARE(adviceOf("it belongs at (36,33)"), 0);  // once the grids are read
    QCOMPARE(tab().advice().size(), std::size_t{1});
    QCOMPARE(adviceItem("it belongs at")->text(1), QString("Bathymetry"));
    QCOMPARE(adviceItem("it belongs at")->text(2), QString("area 2"));
    emit messages().list().itemActivated(adviceItem("it belongs at"), 0);
    QCOMPARE(tab().currentPage(), 27);
    auto* grid = tab().pane().findChild<GridView*>();
    QVERIFY(grid->hasFocus());
    QCOMPARE(grid->currentIndex(), grid->model()->index(1, 2));
    const auto origin = [grid] {
      return grid->model()->index(1, 2).data().toString().remove('(').remove(')');
    };
    QCOMPARE(origin(), QString("35,33"));
    auto* fix = qobject_cast<QToolButton*>(messages().list().itemWidget(adviceItem("it belongs at"), 3));
    QVERIFY(fix != nullptr);
    QTest::mouseClick(fix, Qt::LeftButton);
    QTRY_COMPARE(origin(), QString("36,33"));
    QVERIFY(tab().advice().empty());
    window_->undoAction()->trigger();
    QCOMPARE(origin(), QString("35,33"));
    QTRY_COMPARE(tab().advice().size(), std::size_t{1});
    // The same by keys.
    messages().list().setFocus();
    messages().list().setCurrentItem(adviceItem("it belongs at"));
    QTest::keyClick(&messages().list(), Qt::Key_Period, Qt::ControlModifier);
    QCOMPARE(origin(), QString("36,33"));
  }

  void aStaleFixIsMadeAnewOrNotAtAll() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    const auto fix = [this] { tab().fixAdvice(static_cast<std::size_t>(adviceOf("flooding depth"))); };
    const auto flooding = [this] { return edit("Flooding depth:").text(); };
    enter("Flooding depth:", "0.5");
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
    // There is nothing to mend any more.
    enter("Flooding depth:", "0.03");
    QVERIFY(adviceOf("flooding depth") >= 0);
    fix();
    QCOMPARE(flooding(), QString("0.03"));
    QVERIFY(adviceOf("flooding depth") < 0);
    window_->undoAction()->trigger();
    QCOMPARE(flooding(), QString("0.5"));  // the entry was the last step
    // What it rests on is another value, entered or only typed.
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
    enter("Drying depth:", "0.03");
    fix();
    QCOMPARE(flooding(), QString("0.5"));  // the other value is offered first
    fix();
    QCOMPARE(flooding(), QString("0.06"));
    window_->undoAction()->trigger();
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
    type("Drying depth:", "0.04");
    QTest::mouseClick(tab().adviceStrip().findChild<QToolButton*>("fix"), Qt::LeftButton);
    QCOMPARE(flooding(), QString("0.5"));
    QCOMPARE(edit("Drying depth:").text(), QString("0.04"));
    fix();
    QCOMPARE(flooding(), QString("0.08"));
    // Another fix than the one that was offered is offered first.
    QVERIFY(tab().goToPage(39));
    enter("Time step interval:", "300");
    QTRY_VERIFY(adviceOf("would do") >= 0);
    const auto offered = [this] {
      return QString::fromStdString(tab().advice()[static_cast<std::size_t>(adviceOf("would do"))].fix.name);
    };
    const QString before = offered();
    enter("Time step interval:", "307");
    tab().fixAdvice(static_cast<std::size_t>(adviceOf("would do")));
    QCOMPARE(edit("Time step interval:").text(), QString("307"));
    QVERIFY(offered() != before);
    tab().fixAdvice(static_cast<std::size_t>(adviceOf("would do")));
    QVERIFY(adviceOf("would do") < 0);
    window_->undoAction()->trigger();
    QCOMPARE(edit("Time step interval:").text(), QString("307"));
    // A place that there is no more.
    tab().fixAdvice(1000);
    QCOMPARE(edit("Time step interval:").text(), QString("307"));
  }

  void aFixMakesAFileThatStaysWhenItIsTakenBack() {
    const QTemporaryDir outside;
    write(outside.filePath("wind.tsb0"), "wind");
    const QString name = QFileInfo(file("s.v27")).dir().relativeFilePath(outside.filePath("wind.tsb0"));
    run("v27setup", {"set", "s.v27", "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/File_Name=" + name});
    QVERIFY(open());
    const QString lies = "lies outside of the setup's folder";
    const auto fix = [&] { tab().fixAdvice(static_cast<std::size_t>(adviceOf(lies))); };
    QTRY_VERIFY(adviceOf(lies) >= 0);
    fix();
    QCOMPARE(textOf(file("wind.tsb0")), QString("wind"));
    QVERIFY(adviceOf(lies) < 0);
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Copy wind.tsb0 into the setup's folder"));
    window_->undoAction()->trigger();
    QCOMPARE(textOf(file("wind.tsb0")), QString("wind"));
    QTRY_VERIFY(adviceOf(lies) >= 0);
    fix();
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Take wind.tsb0 of the setup's folder"));
    QVERIFY(QFile::remove(file("wind.tsb0")));
  }

  void adviceLeavesWhoTypesAlone() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(26));
    enter("Flooding depth:", "0.5");
    type("Drying depth:", "0.0");
    edit("Drying depth:").setCursorPosition(1);
    QTRY_VERIFY(adviceOf("flooding depth") >= 0);
    QCOMPARE(edit("Drying depth:").text(), QString("0.0"));
    QVERIFY(edit("Drying depth:").hasFocus());
    QCOMPARE(edit("Drying depth:").cursorPosition(), 1);
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Flooding depth"));
  }

  void eachMessageAndAdviceLeadsByMouseAndKey() {
    makeDoubtful();
    QVERIFY(open());
    QTRY_VERIFY(adviceOf("it belongs at (36,33)") >= 0);
    QTest::keyClick(window_.get(), Qt::Key_F7);
    QTreeWidget& list = messages().list();
    QVERIFY2(messages().messageCount() >= 3, qPrintable(QString::number(messages().messageCount())));
    QVERIFY(list.topLevelItemCount() - messages().messageCount() >= 5);
    // The lines are made anew with each other advice.
    const auto leads = [&](int line, const std::function<void(QTreeWidgetItem*)>& act) {
      QVERIFY(tab().goToPage(1));
      list.setFocus();
      const QString text = list.topLevelItem(line)->text(0);
      const QString page = list.topLevelItem(line)->text(1);
      list.scrollToItem(list.topLevelItem(line));
      act(list.topLevelItem(line));
      QCOMPARE(tab().caption(tab().currentPage()), page);
      QWidget* at = QApplication::focusWidget();
      QVERIFY2(at != nullptr && tab().pane().isAncestorOf(at), qPrintable(text));
    };
    for (int line = 0; line < list.topLevelItemCount(); ++line) {
      leads(line, [&](QTreeWidgetItem* item) {
        const QRect row = list.visualItemRect(item);
        const QPoint place(row.left() + 30, row.center().y());
        QTest::mouseClick(list.viewport(), Qt::LeftButton, {}, place);
        QTest::mouseDClick(list.viewport(), Qt::LeftButton, {}, place);
      });
      leads(line, [&](QTreeWidgetItem* item) {
        list.setCurrentItem(item);
        QTest::keyClick(&list, Qt::Key_Return);
      });
      // Each advice has its fix, by name.
      const auto* fix = qobject_cast<QToolButton*>(list.itemWidget(list.topLevelItem(line), 3));
      QCOMPARE(fix != nullptr, line >= messages().messageCount());
      if (fix != nullptr) QVERIFY(!fix->toolTip().isEmpty());
    }
    // Of a block of rows the one with the file that is spoken of.
    const QList<QTreeWidgetItem*> found = list.findItems("gone.tsb0", Qt::MatchContains);
    QVERIFY(!found.isEmpty());
    emit list.itemActivated(found.front(), 0);
    auto* grid = tab().pane().findChild<GridView*>();
    QCOMPARE(grid->currentIndex().data().toString(), QString("gone.tsb0"));
  }

  // For the eye, where a folder is named: messages and advice, and below the page.
  void picturesOfMessages() {
    const QString pictures = qEnvironmentVariable("GRIDBAY_PICTURES");
    if (pictures.isEmpty()) QSKIP("no folder is named");
    makeDoubtful();
    window_->resize(1300, 850);
    for (const auto& [appearance, name] :
         {std::pair{Appearance::light, "light"}, std::pair{Appearance::dark, "dark"}}) {
      setAppearance(appearance);
      QVERIFY(open());
      QTRY_VERIFY(adviceOf("it belongs at (36,33)") >= 0);
      QTest::keyClick(window_.get(), Qt::Key_F7);
      window_->resizeDocks({&messages()}, {330}, Qt::Vertical);
      QVERIFY(tab().goToPage(46));
      QCoreApplication::processEvents();
      QVERIFY(window_->grab().save(pictures + "/messages-" + name + ".png"));
    }
    setAppearance(Appearance::desktop);
  }

  void messagesNameWhatTheySpeakOfAndLeadThere() {
    const QString source = "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_2/";
    run("v27setup",
        {"set", "s.v27", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=2",
         "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_1/Source_Point=30,20", source + "Type=1",
         source + "Sink_Point=5000,5000", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=-1",
         "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Data_Format=2",
         "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/File_Name=none.tsb0"});
    QVERIFY(open());
    QTest::keyClick(window_.get(), Qt::Key_F7);
    QTreeWidget& list = messages().list();
    const auto lineOf = [&](const QString& text) -> QTreeWidgetItem* {
      const QList<QTreeWidgetItem*> found = list.findItems(text, Qt::MatchContains);
      return found.isEmpty() ? nullptr : found.front();
    };
    const auto enter = [&](const QString& text) {
      list.setFocus();
      list.setCurrentItem(lineOf(text));
      QTest::keyClick(&list, Qt::Key_Return);
    };
    QTreeWidgetItem* line = lineOf("Sink no.2 is outside of grid");
    QVERIFY(line != nullptr);
    QCOMPARE(line->text(1), QString("Source and Sink"));
    QCOMPARE(line->text(2), QString("source 2"));
    list.scrollToItem(line);
    const QPoint place = list.visualItemRect(line).center();
    QTest::mouseClick(list.viewport(), Qt::LeftButton, {}, place);
    QTest::mouseDClick(list.viewport(), Qt::LeftButton, {}, place);
    QCOMPARE(tab().currentPage(), 40);
    auto* grid = tab().pane().findChild<GridView*>();
    QVERIFY(grid->hasFocus());
    const auto header = [grid] {
      return grid->model()->headerData(grid->currentIndex().column(), Qt::Horizontal).toString();
    };
    QCOMPARE(tab().currentRow(), 2);
    QCOMPARE(header(), QString("Sink"));
    // Help is on messages while they are at work.
    list.setFocus();
    QTest::keyClick(window_.get(), Qt::Key_F1);
    QVERIFY(window_->help().isVisible());
    QVERIFY(window_->help().browser().toPlainText().startsWith("Messages and advice"));
    // A field by its label, and one by the file that it holds.
    enter("Drying depth must be positive");
    QCOMPARE(tab().currentPage(), 26);
    QVERIFY(edit("Drying depth:").hasFocus());
    QCOMPARE(lineOf("Drying depth must be positive")->text(2), QString());
    enter("none.tsb0");
    QCOMPARE(tab().currentPage(), 46);
    auto* focused = qobject_cast<QLineEdit*>(QApplication::focusWidget());
    QVERIFY(focused != nullptr);
    QCOMPARE(focused->text(), QString("none.tsb0"));
  }

  void aSearchEndsWhereItHidesThePage() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(39));
    enter("Time step interval:", "0");
    QTest::keyClick(window_.get(), Qt::Key_F7);
    const auto search = [this](const QString& text) {
      tab().filter().setText(text);
      QVERIFY(tab().goToPage(26));
      QCOMPARE(tab().filter().text(), text);  // what it finds, it keeps
    };
    search("flood");
    emit messages().list().itemActivated(messages().list().topLevelItem(0), 0);
    QCOMPARE(tab().currentPage(), 39);
    QCOMPARE(tab().filter().text(), QString());
    search("flood");
    window_->undoAction()->trigger();
    QCOMPARE(tab().currentPage(), 39);
    search("flood");
    window_->redoAction()->trigger();
    QCOMPARE(tab().currentPage(), 39);
    QCOMPARE(edit("Time step interval:").text(), QString("0"));
    // A page that does not apply is not shown for that.
    tab().filter().setText("flood");
    QVERIFY(!tab().goToPage(11));
    QCOMPARE(tab().filter().text(), QString("flood"));
  }

  void aCheckShowsTheModelOnTheOpenPage() {
    QVERIFY(open());
    QVERIFY(tab().goToPage(39));
    const auto shown = [this](const QString& label) {
      return qobject_cast<QLabel*>(tab().pane().widgetOf(label))->text();
    };
    QCOMPARE(shown("Max Courant No:"), QString());
    type("Last:", "250");  // not entered yet
    QTest::keyClick(window_.get(), Qt::Key_F7);
    QVERIFY2(shown("Max Courant No:").toDouble() > 1, qPrintable(shown("Max Courant No:")));
    QCOMPARE(shown("Area:"), QString("2"));
    QCOMPARE(edit("Last:").text(), QString("250"));
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Last"));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Number_Of_Timesteps 250\n"));
  }

  void aCoverHasATitleAndAPicture() {
    for (const auto& [library, title] :
         {std::pair{0, "VANE 27 Flow Model"}, {1, "VANE 27 Wetland Sweep Kit"}}) {
      window_->newDocument(static_cast<std::size_t>(library));
      QVERIFY(tab().goToPage(1));
      QVERIFY(tab().cover().isVisible());
      QVERIFY(!tab().pane().isVisible());
      QVERIFY(!tab().summary().isVisible());
      QCOMPARE(tab().cover().title().text(), QString(title));
      const QImage top = tab().cover().grab(QRect(0, 0, 300, 140)).toImage();
      QSet<QRgb> colours;
      for (int x = 0; x < 300; x += 3) {
        for (int y = 0; y < 140; y += 3) colours.insert(top.pixel(x, y));
      }
      QVERIFY2(colours.size() > 20, qPrintable(QString::number(colours.size())));
      QVERIFY(tab().goToPage(26));
      QVERIFY(!tab().cover().isVisible());
      QVERIFY(tab().pane().isVisible());
    }
  }

  void aFileThatIsNoSetupOpensNothing() {
    write(file("other.v27"), "OTHER_MODEL { A 1 }\n");
    const QStringList told =
        answers({QMessageBox::Ok}, [this] { QVERIFY(window_->openDocument(file("other.v27")) == nullptr); });
    QCOMPARE(told, QStringList{"\"" + file("other.v27") +
                               "\" is not a setup: it has no section VANE27_NESTED_MODEL"});
    QCOMPARE(tabCount(), 0);
    QCOMPARE(textOf(file("other.v27")), QString("OTHER_MODEL { A 1 }\n"));
  }

  void picturesOfTheStartAndTheFirstViewAreTaken() {
    QProcess shell;
    shell.start(QCoreApplication::applicationDirPath() + "/vanedeck-shell",
                {"--screenshots", file("pictures"), file("s.v27")});
    QVERIFY(shell.waitForFinished());
    QCOMPARE(shell.exitCode(), 0);
    for (const QString name : {"start", "first-view", "page-1", "page-26"}) {
      const QImage picture(file("pictures/" + name + ".png"));
      QVERIFY2(picture.width() > 800, qPrintable(name));
    }
    QVERIFY(QImage(file("pictures/start.png")) != QImage(file("pictures/first-view.png")));
  }

  void picturesOfWhatCantBeOpenedEndWithAFault() {
    write(file("other.v27"), "OTHER_MODEL { A 1 }\n");
    write(file("damaged.tsb2"), "nothing of this kind");
    const QStringList wanted{"--screenshots", file("pictures")};
    for (const auto& [arguments, told] :
         {std::pair(wanted + QStringList{file("nosuch.v27")}, "nosuch.v27"),
          {wanted + QStringList{file("other.v27")}, "is not a setup"},
          {wanted + QStringList{file("s.v27"), file("damaged.tsb2")}, "damaged.tsb2"},
          {wanted + QStringList{file("s.v27"), "--compare", file("nosuch.v27")}, "nosuch.v27"},
          {QStringList{"--screenshots", file("s.v27"), file("s.v27")}, "Cannot write"},
          {QStringList{"--exit-when-shown", file("nosuch.v27")}, "nosuch.v27"}}) {
      QProcess shell;
      shell.start(QCoreApplication::applicationDirPath() + "/vanedeck-shell", arguments);
      QVERIFY2(shell.waitForFinished(), told);
      QCOMPARE(shell.exitStatus(), QProcess::NormalExit);
      QCOMPARE(shell.exitCode(), 2);
      const QString errors = QString::fromUtf8(shell.readAllStandardError());
      QVERIFY2(errors.contains(told), qPrintable(errors));
    }
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("window-test");
  gridbay::shell::WindowTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "window_test.moc"
