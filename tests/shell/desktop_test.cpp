// The desktop as a user has it: real widgets, real clicks, real files, with no display.

#include <QComboBox>
#include <QFile>
#include <QLineEdit>
#include <QMessageBox>
#include <QMimeData>
#include <QProcess>
#include <QRadioButton>
#include <QSettings>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QTest>
#include <QTimer>

#include "shell/grid_view.h"
#include "shell/main_window.h"

namespace gridbay::shell {

class DesktopTest : public QObject {
  Q_OBJECT

 private:
  static std::vector<std::unique_ptr<EditorLibrary>> libraries() {
    std::vector<std::unique_ptr<EditorLibrary>> found;
    for (const char* name : {"v27nested", "v27nestedwsk"}) {
      QString error;
      found.push_back(EditorLibrary::load(name, &error));
      if (found.back() == nullptr) qFatal("%s", qPrintable(error));
    }
    return found;
  }

  // Runs the command-line tool or the terrain maker of this build.
  void run(const QString& program, const QStringList& arguments) {
    QProcess process;
    process.setWorkingDirectory(folder_->path());
    process.start(QCoreApplication::applicationDirPath() + "/" + program, arguments);
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitCode(), 0);
  }

  QString file(const QString& name) const { return folder_->filePath(name); }

  static QString textOf(const QString& path) {
    QFile opened(path);
    return opened.open(QFile::ReadOnly) ? QString::fromUtf8(opened.readAll()) : QString();
  }

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

  // Answers the next message box with a button.
  static void answer(QMessageBox::StandardButton button) {
    QTimer::singleShot(0, qApp, [button] {
      if (auto* box = qobject_cast<QMessageBox*>(QApplication::activeModalWidget()))
        box->button(button)->click();
    });
  }

  QTemporaryDir* folder_ = nullptr;
  MainWindow* window_ = nullptr;

 private slots:
  void initTestCase() {
    folder_ = new QTemporaryDir();
    QSettings::setDefaultFormat(QSettings::IniFormat);
    QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, folder_->path());
    QCoreApplication::setOrganizationName("test");
    run("make_terrain", {folder_->path()});
    run("v27setup", {"convert", "raster", "estuary.asc", "estuary.tsb2", "--land", "5", "--crs", "UTM-32"});
    run("v27setup", {"convert", "raster", "inlet.asc", "inlet.tsb2", "--land", "5", "--crs", "UTM-32"});
  }
  void cleanupTestCase() { delete folder_; }

  void init() {
    run("v27setup", {"new", "s.v27", "--force", "--area", "estuary.tsb2", "--area", "inlet.tsb2@36,33"});
    window_ = new MainWindow(libraries());
    window_->show();
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
  }
  void cleanup() { delete window_; }

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
      if (button->text() == "Hydrodynamic and Advection-Dispersion") button->click();
    }
    QVERIFY(tab->goToPage(3));
  }

  void theFilterFindsPages() {
    DocumentTab* tab = window_->currentDocument();
    auto* filter = tab->findChild<QLineEdit*>();
    QTest::keyClicks(filter, "flood");
    QVERIFY(tab->goToPage(26));
    QVERIFY(!tab->goToPage(27));
    filter->clear();
    QVERIFY(tab->goToPage(27));
  }

  void aMessageLeadsToItsPage() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(39));
    type("Time step interval:", "0");
    QVERIFY(tab->editor().command(46019));
    QCOMPARE(window_->messages().topLevelItemCount(), 1);
    QVERIFY(tab->goToPage(1));
    emit window_->messages().itemActivated(window_->messages().topLevelItem(0), 0);
    QCOMPARE(tab->tree().currentItem()->text(0), QString("Simulation Period"));
  }

  void unitsChangeWhatIsShown() {
    DocumentTab* tab = window_->currentDocument();
    QVERIFY(tab->goToPage(26));
    tab->editor().setUnitSystem(UnitSystem::us);
    tab->pane().refresh();
    type("Flooding depth:", "1");
    QVERIFY(window_->saveDocument());
    QVERIFY(textOf(file("s.v27")).contains("Flooding_Depth 0.3048\n"));
  }

  void theEngineRunsAndIsStopped() {
    QFile engine(file("engine"));
    QVERIFY(engine.open(QFile::WriteOnly));
    engine.write("#!/bin/sh\necho \"running $1\"\nexec sleep 60\n");
    engine.close();
    QVERIFY(engine.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    qputenv("GRIDBAY_ENGINE", file("engine").toUtf8());
    QSignalSpy finished(&window_->engine(), &QProcess::finished);
    QVERIFY(window_->currentDocument()->editor().command(46018));
    QTRY_VERIFY(window_->output().toPlainText().contains("running " + file("s.v27")));
    window_->engine().terminate();
    QVERIFY(finished.wait());
    qunsetenv("GRIDBAY_ENGINE");
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
    dropped.setUrls({QUrl::fromLocalFile(file("s.v27"))});
    QDragEnterEvent enter(QPoint(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(window_, &enter);
    QVERIFY(enter.isAccepted());
    QDropEvent drop(QPointF(5, 5), Qt::CopyAction, &dropped, Qt::LeftButton, Qt::NoModifier);
    DocumentTab* before = window_->currentDocument();
    QApplication::sendEvent(window_, &drop);
    QVERIFY(window_->currentDocument() != before);
    QCOMPARE(window_->currentDocument()->title(), QString("s.v27"));
    QCOMPARE(QSettings().value("recent").toStringList().value(0), file("s.v27"));
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

QTEST_MAIN(gridbay::shell::DesktopTest)
#include "desktop_test.moc"
