// The desktop as a user has it: real widgets, real clicks, real files, with no display.

#include <unistd.h>

#include <QCheckBox>
#include <QClipboard>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QFile>
#include <QFileDialog>
#include <QInputDialog>
#include <QLineEdit>
#include <QMessageBox>
#include <QMimeData>
#include <QProcess>
#include <QProgressDialog>
#include <QPushButton>
#include <QRadioButton>
#include <QSettings>
#include <QSignalSpy>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>
#include <csignal>

#include "platform/tsb/tsb_writer.h"
#include "platform/units/units.h"
#include "shell/grid_view.h"
#include "shell/main_window.h"
#include "shell/viewers/map_plot.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/support/cells.h"
#include "tests/support/pages.h"

namespace gridbay::shell {

class DesktopTest : public DesktopFixture {
  Q_OBJECT

 private:
  void type(const QString& label, const QString& text, int n = 1) {
    QWidget* widget = window_->currentDocument()->pane().widgetOf(label, n);
    auto* edit = qobject_cast<QLineEdit*>(widget->focusProxy() != nullptr ? widget->focusProxy() : widget);
    QVERIFY(edit != nullptr);
    edit->setFocus();
    edit->selectAll();
    QTest::keyClicks(edit, text);
    QTest::keyClick(edit, Qt::Key_Return);
  }

  GridModel& grid() { return window_->currentDocument()->pane().findChild<GridView*>()->cells(); }

  QLineEdit* edit(const QString& label, int n = 1) {
    QWidget* widget = window_->currentDocument()->pane().widgetOf(label, n);
    return qobject_cast<QLineEdit*>(widget->focusProxy() != nullptr ? widget->focusProxy() : widget);
  }
  QRadioButton* radio(const QString& text) {
    for (auto* button : window_->currentDocument()->pane().findChildren<QRadioButton*>()) {
      if (button->text().remove('&') == text) return button;
    }
    return nullptr;
  }
  void spin(const QString& label, int delta) {
    QTest::keyClick(edit(label), delta > 0 ? Qt::Key_Up : Qt::Key_Down);
  }
  void write(const QString& name, const QByteArray& text) {
    QFile made(file(name));
    QVERIFY(made.open(QFile::WriteOnly));
    made.write(text);
  }
  // A stand-in for the engine, as a script that is given the setup.
  void makeEngine(const QByteArray& script) {
    write("engine", "#!/bin/sh\n" + script + "\n");
    QVERIFY(QFile(file("engine")).setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("GRIDBAY_ENGINE", file("engine").toUtf8());
  }

  // Answers the message box that an action brings, and returns its text.
  static QString answer(QMessageBox::StandardButton button, const std::function<void()>& act) {
    QString text;
    QTimer::singleShot(0, qApp, [button, &text] {
      auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget());
      if (box == nullptr) return;
      text = box->text();
      box->button(button)->click();
    });
    act();
    QCoreApplication::processEvents();
    return text;
  }

  // Answers the next message box with a button.
  static void answer(QMessageBox::StandardButton button) {
    QTimer::singleShot(0, qApp, [button] {
      if (auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget()))
        box->button(button)->click();
    });
  }

  // Chooses the file in the next dialog, and the n-th unit of its last list; returns the name that it showed.
  void importPoints(const QString& name, int unit, QString* shown = nullptr) {
    QTimer::singleShot(0, qApp, [=, this] {
      auto* files = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
      QVERIFY(files != nullptr);
      QCOMPARE(files->windowTitle(), QString("Select XYZ Import File"));
      const auto lists = files->findChild<PagePane*>()->findChildren<QComboBox*>();
      QCOMPARE(lists.size(), 2);
      QVERIFY(lists[1]->isVisible());
      lists[1]->setCurrentIndex(unit);
      emit lists[1]->activated(unit);
      auto* edit = files->findChild<QLineEdit*>();
      if (shown != nullptr) *shown = edit->text();
      edit->setText(file(name));
      files->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Open)->click();
    });
    auto* button =
        qobject_cast<QAbstractButton*>(window_->currentDocument()->pane().widgetOf("Import from file..."));
    QVERIFY(button != nullptr && button->isEnabled());
    button->click();
  }

 private slots:
  void initTestCase() { makeFolder(); }
  void cleanupTestCase() { folder_.reset(); }

  void init() {
    run("v27setup", {"new", "s.v27", "--force", "--area", "estuary.tsb2", "--area", "inlet.tsb2@36,33"});
    window_ = std::make_unique<MainWindow>(libraries());
    window_->show();
    window_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(window_.get()));
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
  }
  void cleanup() { window_.reset(); }

  void everyVisiblePageOpens() {
    DocumentTab* tab = window_->currentDocument();
    int forms = 0;
    for (const SetupEditor::Item& item : tab->editor().items()) {
      QCOMPARE(tab->goToPage(item.id), item.visible);
      if (item.visible)
        forms +=
            tab->pane().findChild<QLineEdit*>() != nullptr || tab->pane().findChild<GridView*>() != nullptr;
    }
    QVERIFY(forms >= 6);
  }

  void anEditIsSeenInTheSavedFile() {
    QVERIFY(window_->currentDocument()->goToPage(26));
    type("Drying depth:", "0.125");
    QVERIFY(window_->currentDocument()->title().endsWith("*"));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.125\n"));
    QVERIFY(!window_->currentDocument()->title().endsWith("*"));
  }

  // A load leaves dredging off, so the page shows only when it is chosen. Its picture is taken on request.
  void dredgingIsShownOnceItIsChosen() {
    QVERIFY(QFile::copy(file("s.v27"), file("m.v27")));
    run("v27setup", {"set", "m.v27", "NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type=8"});
    DocumentTab* tab = window_->openDocument(file("m.v27"));
    QVERIFY(tab != nullptr && tab->goToPage(73));
    QVERIFY(!tab->goToPage(70));
    qobject_cast<QCheckBox*>(tab->pane().widgetOf("Include Dredging"))->click();
    QVERIFY(tab->goToPage(86));
    type("Number of grain size fractions:", "3");
    QVERIFY(tab->goToPage(70));
    QCOMPARE(grid().rowCount(), 0);
    type("Number of dredgers", "2");
    QCOMPARE(grid().rowCount(), 2);
    QCOMPARE(grid().columnCount(), 3 + 5);
    QVERIFY(grid().setData(grid().index(0, 4), "dredger.tsb0", Qt::EditRole));
    const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES");
    QTest::qWait(50);
    if (!folder.isEmpty()) window_->grab().save(folder + "/dredging.png");
  }

  void aTextThatIsNoNumberComesBack() {
    QVERIFY(window_->currentDocument()->goToPage(26));
    answer(QMessageBox::Ok);
    type("Drying depth:", "deep");
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.02\n"));
  }

  void cellsAreEdited() {
    QVERIFY(window_->currentDocument()->goToPage(27));
    QCOMPARE(grid().rowCount(), 2);
    const QModelIndex origin = grid().index(1, 2);
    QCOMPARE(origin.data().toString(), QString("(36,33)"));
    QVERIFY(grid().setData(origin, "30,31", Qt::EditRole));
    QCOMPARE(grid().index(1, 2).data().toString(), QString("(30,31)"));
    QVERIFY(!grid().setData(grid().index(1, 2), "nowhere", Qt::EditRole));
    QCOMPARE(grid().index(1, 2).data().toString(), QString("(30,31)"));
    QVERIFY(!grid().flags(grid().index(0, 2)).testFlag(Qt::ItemIsEditable));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Origin 30 31\n"));
  }

  void aDropDownCellIsEditedByItsList() {
    QVERIFY(window_->currentDocument()->goToPage(29));
    auto* view = window_->currentDocument()->pane().findChild<GridView*>();
    const QModelIndex formulation = grid().index(1, 1);
    view->setCurrentIndex(formulation);
    auto* list = view->findChild<QComboBox*>();
    QVERIFY(list != nullptr);
    QCOMPARE(list->count(), 2);
    QCOMPARE(list->currentText(), QString("Level"));
    QTest::keyClick(list, Qt::Key_Down);
    QCOMPARE(grid().index(1, 1).data().toString(), QString("Flux"));
  }

  void theModuleChangesTheTree() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(!tab->goToPage(3));
    QVERIFY(tab->goToPage(35));
    for (auto* button : tab->pane().findChildren<QRadioButton*>()) {
      if (button->text().remove('&') == "Hydrodynamic and Advection-Dispersion") button->click();
    }
    QVERIFY(tab->goToPage(3));
  }

  void theFilterFindsPages() {
    DocumentTab* tab = window_->currentDocument();
    auto* filter = tab->findChild<QLineEdit*>();
    const auto isFound = [tab](int page) {
      return !tab->tree()
                  .findItems(tab->caption(page), Qt::MatchExactly | Qt::MatchRecursive)
                  .value(0)
                  ->isHidden();
    };
    QTest::keyClicks(filter, "flood");
    QVERIFY(isFound(26));
    QVERIFY(!isFound(27));
    filter->clear();
    QVERIFY(isFound(27));
  }

  void aMessageLeadsToItsPage() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(39));
    type("Time step interval:", "0");
    QVERIFY(tab->editor().command(46019));
    QCOMPARE(window_->messagesDock().messageCount(), 1);
    QVERIFY(tab->goToPage(1));
    emit window_->messages().itemActivated(window_->messages().topLevelItem(0), 0);
    QCOMPARE(tab->tree().currentItem()->text(0), QString("Simulation Period"));
  }

  void unitsChangeWhatIsShown() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    window_->units().actions().at(1)->trigger();  // US for all
    type("Flooding depth:", "1");
    window_->units().actions().first()->trigger();
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Flooding_Depth 0.3048\n"));
  }

  void theEngineRunsAndIsStopped() {
    makeEngine("echo \"running $1\"; echo '42 % done'; exec sleep 60");
    QSignalSpy ended(&window_->run(), &RunDock::ended);
    QVERIFY(window_->currentDocument()->editor().command(46018));
    QTRY_VERIFY(window_->run().output().toPlainText().contains("running " + file("s.v27")));
    QTRY_COMPARE(window_->run().progress().value(), 42);
    QVERIFY(window_->run().state().text().startsWith("Running, 00:00:0"));
    QTest::mouseClick(&window_->run().stopButton(), Qt::LeftButton);
    QVERIFY(ended.wait());
    QVERIFY(window_->run().state().text().startsWith("Stopped after 00:00:0"));
    QVERIFY(!window_->run().stopButton().isEnabled());
    qunsetenv("GRIDBAY_ENGINE");
  }

  void theEnginesStatusIsShown() {
    makeEngine("printf 'no line end'; exit 3");
    QSignalSpy ended(&window_->run(), &RunDock::ended);
    QVERIFY(window_->currentDocument()->editor().command(46018));
    QVERIFY(ended.wait());
    QCOMPARE(ended.first().first().toInt(), 3);
    QVERIFY(window_->run().state().text().startsWith("Ended with status 3 after"));
    QCOMPARE(window_->run().output().toPlainText(), QString("no line end"));
    qunsetenv("GRIDBAY_ENGINE");
  }

  void aMissingEngineIsNamed() {
    qputenv("GRIDBAY_ENGINE", file("nowhere").toUtf8());
    const QString text =
        answer(QMessageBox::Ok, [this] { window_->currentDocument()->editor().command(46018); });
    QVERIFY2(text.contains(file("nowhere")) && text.contains("GRIDBAY_ENGINE"), qPrintable(text));
    qunsetenv("GRIDBAY_ENGINE");
    const QByteArray path = qgetenv("PATH");
    qputenv("PATH", "");
    const QString other =
        answer(QMessageBox::Ok, [this] { window_->currentDocument()->editor().command(46018); });
    qputenv("PATH", path);
    QVERIFY2(other.contains("gridbay.exe") && other.contains(QCoreApplication::applicationDirPath()),
             qPrintable(other));
  }

  void aMissingPluginIsNamed() {
    QString error;
    QVERIFY(EditorLibrary::load("v27none", &error) == nullptr);
    QVERIFY(error.contains(QCoreApplication::applicationDirPath() + "/v27none.so"));
  }

  void helpForEachPage() {
    DocumentTab* tab = window_->currentDocument();
    for (const int page : {26, 27, 28, 29, 30, 31, 32, 34, 35, 37, 38, 39, 40, 41, 43, 44, 45, 46, 143}) {
      QVERIFY(tab->goToPage(page));
      QTest::keyClick(window_.get(), Qt::Key_F1);
      QVERIFY(window_->help().isVisible());
      QString heading = window_->help().browser().toPlainText().section('\n', 0, 0);
      QVERIFY2(heading.startsWith(tab->caption(page)), qPrintable(heading));
    }
    QVERIFY(tab->goToPage(1));
    QTest::keyClick(window_.get(), Qt::Key_F1);
    QVERIFY(window_->help().browser().toPlainText().startsWith("The setup editor"));
    QVERIFY(tab->goToPage(35));
    radio("Hydrodynamic and Mud Transport")->click();
    for (const int page : {60, 62, 63, 67, 68, 72, 73, 74, 75, 79, 82, 84, 85, 86, 90}) {
      QVERIFY(tab->goToPage(page));
      QTest::keyClick(window_.get(), Qt::Key_F1);
      const QString heading = window_->help().browser().toPlainText().section('\n', 0, 0);
      QVERIFY2(heading.startsWith(tab->caption(page)), qPrintable(heading));
    }
  }

  void editsAreTakenBackByName() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(!window_->undoAction()->isEnabled());
    QVERIFY(tab->goToPage(26));
    type("Drying depth:", "0.01");
    QVERIFY(tab->goToPage(27));
    QVERIFY(grid().setData(grid().index(1, 2), "30,31", Qt::EditRole));
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Origin, row 2"));
    QVERIFY(tab->goToPage(1));
    window_->undoAction()->trigger();
    QCOMPARE(tab->currentPage(), 27);
    QCOMPARE(grid().index(1, 2).data().toString(), QString("(36,33)"));
    QCOMPARE(window_->undoAction()->text(), QString("&Undo Drying depth"));
    QCOMPARE(window_->redoAction()->text(), QString("&Redo Origin, row 2"));
    // In an edit with nothing typed the key is the document's.
    QVERIFY(tab->goToPage(26));
    edit("Flooding depth:")->setFocus();
    QTest::keyClick(edit("Flooding depth:"), Qt::Key_Z, Qt::ControlModifier);
    QCOMPARE(edit("Drying depth:")->text(), QString("0.02"));
    QVERIFY(!tab->title().endsWith("*"));
    window_->redoAction()->trigger();
    QCOMPARE(edit("Drying depth:")->text(), QString("0.01"));
    QVERIFY(tab->title().endsWith("*"));
  }

  void everyKindOfControlIsSavedAndTakenBack() {
    DocumentTab* tab = window_->currentDocument();
    const QString before = textOf(file("s.v27"));
    QVERIFY(tab->goToPage(35));
    radio("Hydrodynamic and Advection-Dispersion")->click();
    auto* list = qobject_cast<QComboBox*>(tab->pane().widgetOf("Select scheme:"));
    list->setFocus();
    QTest::keyClick(list, Qt::Key_Down);
    auto* box = qobject_cast<QCheckBox*>(tab->pane().widgetOf("Inland Flooding"));
    box->click();
    QVERIFY(tab->goToPage(39));
    type("Simulation start date:", "2027-01-02 03:04:05");
    QVERIFY(tab->goToPage(34));
    type("&Number of polygons:", "1");  // refused: the scheme has none
    QVERIFY(tab->goToPage(40));
    type("Number of source sink pairs", "1");
    spin("Number of source sink pairs", 1);
    QVERIFY(grid().setData(grid().index(1, 0), "Isolated Sink", Qt::EditRole));
    QVERIFY(grid().setData(grid().index(1, 3), "7,8", Qt::EditRole));
    QVERIFY(grid().setData(grid().index(1, 4), "1", Qt::EditRole));
    QVERIFY(window_->saveDocument());
    const QString after = textOf(file("s.v27"));
    for (const char* line : {"Simulation_Type 2\n", "AD_Scheme 5\n", "Start_Time 2027 1 2 3 4 5\n",
                             "Number_Of_Sources 2\n", "Type 1\n", "Sink_Point 7 8\n"})
      QVERIFY2(after.contains(line), line);
    while (window_->undoAction()->isEnabled()) window_->undoAction()->trigger();
    QVERIFY(tab->title().endsWith("*"));
    QVERIFY(window_->saveDocument());
    QCOMPARE(textOf(file("s.v27")), before);
    while (window_->redoAction()->isEnabled()) window_->redoAction()->trigger();
    QVERIFY(window_->saveDocument());
    QCOMPARE(textOf(file("s.v27")), after);
  }

  void aButtonInACellOpensTheData() {
    QVERIFY(window_->currentDocument()->goToPage(27));
    auto* view = window_->currentDocument()->pane().findChild<GridView*>();
    view->setFocus();
    view->setCurrentIndex(grid().index(0, 4));
    QTest::keyClick(view, Qt::Key_Space);
    auto* data = window_->findChild<DataWindow*>();
    QVERIFY(data != nullptr);
    QCOMPARE(data->windowTitle(), QString("estuary.tsb2"));
    auto* map = static_cast<MapPlot*>(&data->plot());
    QVERIFY2(map->textAt(480090, 6100180).startsWith("(1,2)   E 480090.0  N 6100180.0   -"),
             qPrintable(map->textAt(480090, 6100180)));
    QVERIFY(map->textAt(490000, 6108000).endsWith("(land)"));
    QCOMPARE(map->textAt(0, 0), QString());
    map->setMapCoordinates(false);
    QVERIFY(map->textAt(120, 90).startsWith("(120,90)"));
    QVERIFY(data->exportPng(file("map.png")));
    QCOMPARE(QImage(file("map.png")).width(), 2 * map->width());
    QVERIFY(!data->exportPng(file("nowhere/map.png")));
    QVERIFY(data->close());
  }

  void aDataFileAndItsItemAreChosen() {
    TsbDefinition levels;
    levels.time.step = 86400;
    levels.time.count = 2;
    levels.items = {{"flow", item::kDischarge, "m3 s-1"},
                    {"north", item::kWaterLevel, "m"},
                    {"south", item::kWaterLevel, "m"}};
    Result<TsbWriter> writer = TsbWriter::create(file("levels.tsb0").toStdString(), levels);
    QVERIFY(writer && writer->commit());
    QVERIFY(window_->currentDocument()->goToPage(29));
    constexpr int kDataRow = 2;
    QVERIFY(grid().setData(grid().index(kDataRow, 0), "Type 0 data file:", Qt::EditRole));

    QStringList items;
    QTimer::singleShot(0, qApp, [this, &items] {
      auto* files = qobject_cast<QFileDialog*>(QApplication::activeModalWidget());
      QVERIFY(files != nullptr);
      files->findChild<QLineEdit*>()->setText(file("levels.tsb0"));
      QTimer::singleShot(0, qApp, [&items] {
        auto* dialog = qobject_cast<QInputDialog*>(QApplication::activeModalWidget());
        QVERIFY(dialog != nullptr);
        items = dialog->comboBoxItems();
        QTest::keyClick(dialog->findChild<QComboBox*>(), Qt::Key_Down);
        QTest::keyClick(dialog, Qt::Key_Return);
      });
      files->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Open)->click();
    });
    auto* view = window_->currentDocument()->pane().findChild<GridView*>();
    view->setFocus();
    view->setCurrentIndex(grid().index(kDataRow, 2));
    QTest::keyClick(view, Qt::Key_Space);

    QCOMPARE(items, QStringList({"2 north", "3 south"}));
    QCOMPARE(grid().index(kDataRow, 1).data().toString(), file("levels.tsb0"));
    QVERIFY(window_->saveDocument());
    const QString saved = textOf(file("s.v27"));
    QVERIFY2(saved.contains("(file)\"levels.tsb0\""), qPrintable(saved));
    QVERIFY2(saved.contains("Item_Numbers 3"), qPrintable(saved));
  }

  void dikesAndTheirPoints() {
    PagePane& pane = window_->currentDocument()->pane();
    QVERIFY(window_->currentDocument()->goToPage(31));
    QLineEdit* count = edit("Number of dikes");
    count->setText("3");
    emit count->editingFinished();
    const auto grids = pane.findChildren<GridView*>();
    QCOMPARE(grids.size(), 2);
    GridView& dikes = *grids[0];
    GridView& points = *grids[1];
    QCOMPARE(dikes.cells().rowCount(), 3);
    QVERIFY(points.isColumnHidden(2));
    dikes.setCurrentIndex(dikes.cells().index(1, 0));
    QVERIFY(edit("Number of points")->isEnabled());
    QVERIFY(dikes.cells().setData(dikes.cells().index(1, 5), "In space", Qt::EditRole));
    QVERIFY(!points.isColumnHidden(2));

    write("line.xyz", "480000 6100000 1000\n480010 6100010 2000 end\n");
    constexpr int kMillimetre = 3;
    importPoints("line.xyz", kMillimetre);
    QCOMPARE(points.cells().rowCount(), 2);
    QCOMPARE(points.cells().index(1, 2).data().toString(), QString("2.000000"));
    QCOMPARE(edit("Number of points")->text(), QString("2"));
    QString last;
    importPoints("line.xyz", 0, &last);
    QCOMPARE(last, QString("line.xyz"));
    QCOMPARE(points.cells().rowCount(), 4);
    QCOMPARE(points.cells().index(3, 2).data().toString(), QString("2000.000000"));
    window_->currentDocument()->undo();
    QCOMPARE(points.cells().rowCount(), 2);

    count->setText("2");
    emit count->editingFinished();
    QVERIFY(!dikes.currentIndex().isValid());
    QVERIFY(!edit("Number of points")->isEnabled());
    QVERIFY(points.isColumnHidden(2));
    QCOMPARE(points.cells().rowCount(), 0);
    dikes.setCurrentIndex(dikes.cells().index(1, 0));
    QCOMPARE(points.cells().rowCount(), 2);
  }

  void longWorkIsShownAndStopped() {
    bool isStopped = false;
    QTimer poll;
    connect(&poll, &QTimer::timeout, qApp, [] {
      auto* dialog = qobject_cast<QProgressDialog*>(QApplication::activeModalWidget());
      if (dialog == nullptr) return;
      QCOMPARE(dialog->labelText(), QString("Importing points"));
      QCOMPARE(dialog->value(), 250);
      dialog->findChild<QPushButton*>()->click();
    });
    poll.start(5);
    window_->currentDocument()->doLongWork("Importing points", [&isStopped](const Progress& progress) {
      QElapsedTimer time;
      constexpr int kLimit = 20'000;
      for (time.start(); !isStopped && time.elapsed() < kLimit;) isStopped = !progress(0.25);
    });
    QVERIFY(isStopped);
    bool isDone = false;
    window_->currentDocument()->doLongWork(
        "Importing points", [&isDone](const Progress& progress) { isDone = progress(0.5) && progress(1); });
    QVERIFY(isDone);
    QVERIFY(QApplication::activeModalWidget() == nullptr);
  }

  void aViewerShowsTheItemThatIsAskedFor() {
    TsbDefinition levels;
    levels.time.count = 2;
    levels.items = {{"north", item::kWaterLevel, "m"}, {"south", item::kWaterLevel, "m"}};
    Result<TsbWriter> writer = TsbWriter::create(file("levels.tsb0").toStdString(), levels);
    QVERIFY(writer && writer->commit());
    window_->openFile(file("levels.tsb0"), 2);
    auto* data = window_->findChild<DataWindow*>();
    QVERIFY(data != nullptr);
    QCOMPARE(data->curves()->item(0)->checkState(), Qt::Unchecked);
    QCOMPARE(data->curves()->item(1)->checkState(), Qt::Checked);
    data->showItem(3);
    QCOMPARE(data->curves()->item(1)->checkState(), Qt::Checked);
    QVERIFY(data->close());
  }

  void dataThatCannotBeShownIsNamed() {
    QString text =
        answer(QMessageBox::Ok, [this] { QVERIFY(window_->openData(file("none.tsb2")) == nullptr); });
    QVERIFY2(text.contains(file("none.tsb2")) && text.contains("no such file"), qPrintable(text));
    write("broken.tsb2", "not a data file");
    text = answer(QMessageBox::Ok, [this] { QVERIFY(window_->openData(file("broken.tsb2")) == nullptr); });
    QVERIFY(text.contains("it is no data file"));
    text = answer(QMessageBox::Ok, [this] { window_->openFile(file("none.txt")); });
    QVERIFY(text.contains(file("none.txt")));
  }

  void aSeriesIsPlotted() {
    write("tide.csv", "time,level\n0,0.5\n3600,0.75\n7200,0.25\n");
    run("v27setup", {"convert", "series", "tide.csv", "tide.tsb0", "--item-type", "100000", "--start",
                     "2026-03-21 06:00:00", "--skip-lines", "1"});
    DataWindow* data = window_->openData(file("tide.tsb0"));
    QVERIFY(data != nullptr);
    QCOMPARE(data->plot().graphCount(), 1);
    QCOMPARE(data->plot().graph(0)->data()->at(1)->value, 0.75);
    data->curves()->item(0)->setCheckState(Qt::Unchecked);
    QCOMPARE(data->plot().graphCount(), 0);
    QVERIFY(data->exportPng(file("tide.png")));
    QVERIFY(data->close());
  }

  void aChangeByAnotherProgramIsTold() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    type("Flooding depth:", "0.4");
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/FLOOD_AND_DRY/Drying_Depth=0.25"});
    QTRY_VERIFY(tab->notice().isVisible());
    const QString text = answer(QMessageBox::No, [this] { QVERIFY(!window_->saveDocument()); });
    QVERIFY2(text.contains("was changed by another program"), qPrintable(text));
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.25\n"));
    tab->notice().findChild<QPushButton*>("reload")->click();
    QVERIFY(!tab->notice().isVisible());
    QCOMPARE(edit("Drying depth:")->text(), QString("0.25"));
    QCOMPARE(edit("Flooding depth:")->text(), QString("0.05"));
    QVERIFY(!tab->title().endsWith("*"));
    QVERIFY(window_->saveDocument());
    QVERIFY(QFile::remove(file("s.v27")));
    QTRY_VERIFY(tab->notice().isVisible());
    QVERIFY(window_->saveDocument());
    QVERIFY(QFile::exists(file("s.v27")));
  }

  // A page that writes when it is left doesn't write into what is read in place of its setup.
  void aReloadTakesNothingFromThePageThatWasOpen() {
    const QString start = "MUD_TRANSPORT_EXPANDED_MODULE/STARTING_CONDITIONS/Start_MT_at_HD_Time_Step=";
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(39));
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/MODULE_SELECTION/Simulation_Type=8", start + "7"});
    QTRY_VERIFY(tab->notice().isVisible());
    tab->notice().findChild<QPushButton*>("reload")->click();
    QVERIFY(!tab->title().endsWith("*"));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Start_MT_at_HD_Time_Step 7\n"));
    QVERIFY(tab->goToPage(26));  // left as usual it is written, which is an edit
    QVERIFY(tab->title().endsWith("*"));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Start_MT_at_HD_Time_Step 0\n"));
  }

  void editsOutliveASuddenEnd() {
    QProcess child;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert("GRIDBAY_TEST_CRASH", file("s.v27"));
    child.setProcessEnvironment(environment);
    child.setProcessChannelMode(QProcess::ForwardedChannels);
    child.start(QCoreApplication::applicationFilePath(), {});
    QVERIFY(child.waitForFinished());
    QCOMPARE(child.exitStatus(), QProcess::CrashExit);
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.02\n"));

    const QString text = answer(QMessageBox::Open, [this] { window_->offerRecovery(); });
    QVERIFY2(text.contains(file("s.v27")), qPrintable(text));
    DocumentTab* tab = window_->currentDocument();
    QCOMPARE(tab->title(), QString("s.v27 *"));
    QVERIFY(tab->goToPage(26));
    QCOMPARE(edit("Drying depth:")->text(), QString("0.0325"));
    QVERIFY(tab->goToPage(27));
    QCOMPARE(grid().index(0, 0).data().toString(), QString("estuary.tsb2"));
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Drying_Depth 0.0325\n"));
    window_->offerRecovery();  // there is nothing left
  }

  void aPageThatGoesOutIsLeft() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    type("Drying depth:", "0.01");
    QVERIFY(tab->goToPage(27));
    radio("Hot start")->click();
    QVERIFY(!tab->goToPage(26));
    window_->undoAction()->trigger();
    QVERIFY(tab->goToPage(26));
    window_->redoAction()->trigger();
    QTRY_COMPARE(tab->currentPage(), 27);
  }

  void theFirstViewComesBeforeAPage() {
    DocumentTab* tab = window_->newDocument(0);
    QCOMPARE(tab->currentPage(), 0);
    bool found = false;
    for (const auto* label : tab->pane().findChildren<QLabel*>())
      found = found || label->text() == "Here should be the bathymetry";
    QVERIFY(found);
  }

  void keysLeadThroughAPage() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    QTest::keyClick(window_.get(), Qt::Key_PageUp, Qt::ControlModifier);
    QCOMPARE(tab->currentPage(), 40);
    QTest::keyClick(window_.get(), Qt::Key_PageDown, Qt::ControlModifier);
    QCOMPARE(tab->currentPage(), 26);
    edit("Drying depth:")->setFocus();
    QTest::keyClick(edit("Drying depth:"), Qt::Key_Tab);
    QVERIFY(edit("Flooding depth:")->hasFocus());
    // Every control that takes typing or a choice has a letter of its own.
    for (const SetupEditor::Item& item : tab->editor().items()) {
      if (!tab->goToPage(item.id)) continue;
      QStringList letters;
      for (const auto* label : tab->pane().findChildren<QLabel*>()) {
        if (label->buddy() != nullptr && label->text().contains('&'))
          letters << label->text().section('&', 1).left(1).toUpper();
      }
      for (const auto* button : tab->pane().findChildren<QAbstractButton*>()) {
        if (button->text().contains('&')) letters << button->text().section('&', 1).left(1).toUpper();
      }
      QCOMPARE(QSet<QString>(letters.begin(), letters.end()).size(), letters.size());
      for (const char* menu : {"F", "E", "V", "R", "W", "H"}) QVERIFY(!letters.contains(menu));
    }
  }

  void aGridIsUsedByKeys() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(40));
    type("Number of source sink pairs", "2");
    auto* view = tab->pane().findChild<GridView*>();
    view->setFocus();
    view->setCurrentIndex(grid().index(1, 1));
    QApplication::clipboard()->setText("4,5\t1\n6,7\t2");
    view->paste();
    QCOMPARE(grid().index(1, 1).data().toString(), QString("(4,5)"));
    QCOMPARE(grid().index(2, 1).data().toString(), QString("(6,7)"));
    view->clearSelection();
    view->selectionModel()->select(QItemSelection(grid().index(1, 1), grid().index(2, 1)),
                                   QItemSelectionModel::Select);
    view->copy();
    QCOMPARE(QApplication::clipboard()->text(), QString("(4,5)\n(6,7)"));
    view->setCurrentIndex(grid().index(2, 2));  // those after it are for a sink
    QTest::keyClick(view, Qt::Key_Tab);
    QVERIFY(!view->hasFocus());
  }

  // The kinds of cell that the pages of this version have none of.
  void cellsOfAllKindsAreEdited() {
    class Host final : public test::TestHost {
     public:
      bool chooseFile(std::string_view, std::string_view, std::string* name) override {
        *name = "results/depth";
        return true;
      }
    };
    Host host;
    CV27SetupDoc document(host);
    test::OnePage page(document);
    page.OnInitialUpdate();
    PagePane pane(nullptr);
    pane.resize(600, 300);
    pane.showForm("Cells", page.form());
    pane.show();
    auto* view = pane.findChild<GridView*>();
    QVERIFY(view != nullptr);
    GridModel& cells = view->cells();
    const auto at = [&cells](int column) { return cells.index(0, column - 1); };

    QVERIFY(view->isColumnHidden(test::CellsOfAllKinds::kHidden - 1));
    view->setCurrentIndex(at(test::CellsOfAllKinds::kCheckBox));
    QTest::keyClick(view, Qt::Key_Space);
    QVERIFY(page.cells.flag);
    QCOMPARE(at(test::CellsOfAllKinds::kCheckBox).data(Qt::CheckStateRole).toInt(),
             static_cast<int>(Qt::Checked));

    view->setCurrentIndex(at(test::CellsOfAllKinds::kProjection));
    auto* list = view->findChild<QComboBox*>();
    QVERIFY(list != nullptr);
    QCOMPARE(list->count(), 61);
    QCOMPARE(list->currentText(), QString("UTM-40"));
    QTest::keyClick(list, Qt::Key_Down);
    QCOMPARE(page.cells.projection, std::string("Local Coordinates"));

    view->setCurrentIndex(at(test::CellsOfAllKinds::kResultFile));
    QTest::keyClick(view, Qt::Key_D, Qt::ControlModifier);
    QCOMPARE(page.cells.file, std::string("results/depth.tsb2"));
    page.cells.enabled = false;
    cells.refresh();
    QVERIFY(!cells.flags(at(test::CellsOfAllKinds::kResultFile)).testFlag(Qt::ItemIsEnabled));
  }

  void aUnitIsChosenForOneQuantity() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    QAction* feet = nullptr;
    for (auto* menu : window_->units().findChildren<QMenu*>()) {
      if (menu->title() != "Flooding and drying depth") continue;
      for (QAction* action : menu->actions()) {
        if (action->text() == "foot (ft)") feet = action;
      }
    }
    QVERIFY(feet != nullptr);
    feet->trigger();
    type("Flooding depth:", "1");
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Flooding_Depth 0.3048\n"));
    QVERIFY(tab->goToPage(39));
    window_->units().actions().first()->trigger();  // metric for all
    QVERIFY(tab->goToPage(26));
    QCOMPARE(edit("Flooding depth:")->text(), QString("0.3048"));
  }

  void aSetupThatCannotBeReadOpensNothing() {
    QFile broken(file("broken.v27"));
    QVERIFY(broken.open(QFile::WriteOnly));
    broken.write("VANE27_NESTED_MODEL {");
    broken.close();
    answer(QMessageBox::Ok);
    QVERIFY(window_->openDocument(file("broken.v27")) == nullptr);
    QCOMPARE(window_->currentDocument()->title(), QString("s.v27"));
    QCOMPARE(textOf(file("broken.v27")), QString("VANE27_NESTED_MODEL {"));
  }

  void setupsAreDroppedAndRemembered() {
    QMimeData dropped;
    QFile::remove(file("dropped.v27"));
    QVERIFY(QFile::copy(file("s.v27"), file("dropped.v27")));
    dropped.setUrls({QUrl::fromLocalFile(file("dropped.v27")), QUrl::fromLocalFile(file("s.v27"))});
    QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(window_.get(), &enter);
    QVERIFY(enter.isAccepted());
    QDropEvent drop(QPointF(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    DocumentTab* before = window_->currentDocument();
    QApplication::sendEvent(window_.get(), &drop);
    // What is open already is not opened twice.
    QVERIFY(window_->currentDocument() == before);
    QCOMPARE(QSettings().value("recent").toStringList().value(0), file("dropped.v27"));
  }

  void bothEditionsAreOpenAtOnce() {
    DocumentTab* sweep = window_->newDocument(1);
    QCOMPARE(sweep->editor().fileKind(), std::string("v27wsk"));
    QVERIFY(!sweep->goToPage(35));
    QVERIFY(sweep->goToPage(27));
    QVERIFY(window_->saveDocument(file("w.v27wsk")));
    QVERIFY(textOf(file("w.v27wsk")).contains("No_Of_Areas 1\n"));
  }

  void unsavedChangesAreAskedAbout() {
    QVERIFY(window_->currentDocument()->goToPage(26));
    type("Drying depth:", "0.3");
    answer(QMessageBox::Cancel);
    QVERIFY(!window_->close());
    answer(QMessageBox::Discard);
    QVERIFY(window_->close());
    QVERIFY(!textOf(file("s.v27")).contains("0.3\n"));
  }
};

}  // namespace gridbay::shell

namespace {

// A second process that edits the setup and is killed once its edits have been put aside.
int editAndDie(const QString& setup) {
  using namespace gridbay::shell;
  QString error;
  std::vector<std::unique_ptr<EditorLibrary>> libraries;
  libraries.push_back(EditorLibrary::load("v27nested", &error));
  MainWindow window(std::move(libraries));
  window.show();
  window.openDocument(setup)->goToPage(26);
  auto* edit = qobject_cast<QLineEdit*>(window.currentDocument()->pane().widgetOf("Drying depth:"));
  edit->setText("0.0325");
  emit edit->editingFinished();
  QTimer::singleShot(3000, [] { ::kill(::getpid(), SIGKILL); });
  return QApplication::exec();
}

}  // namespace

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("desktop-test");
  if (qEnvironmentVariableIsSet("GRIDBAY_TEST_CRASH"))
    return editAndDie(qEnvironmentVariable("GRIDBAY_TEST_CRASH"));
  gridbay::shell::DesktopTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "desktop_test.moc"
