// A table of text becomes a time series on the desktop: opened or pasted, changed by keys, written, read
// back.

#include "shell/import/series_import.h"

#include <QClipboard>
#include <QDir>
#include <QMenuBar>
#include <QSignalSpy>
#include <QStatusBar>
#include <cmath>

#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"
#include "shell/appearance.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/shell/real_keys.h"

namespace gridbay::shell {

class SeriesImportTest final : public DesktopFixture {
  Q_OBJECT

  std::unique_ptr<SeriesImport> dialog_;

  static Period periodOf(std::array<std::int32_t, 6> begin, std::array<std::int32_t, 6> end) {
    return {DateTime::of(begin), DateTime::of(end)};
  }
  void showDialog(std::optional<Period> period = {}) {
    dialog_ = std::make_unique<SeriesImport>(period, folder_->path(), nullptr);
    dialog_->show();
    dialog_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(dialog_.get()));
  }
  void open(const QByteArray& text) {
    write(file("table.csv"), text);
    QVERIFY(dialog_->openTable(file("table.csv")));
    QTRY_VERIFY(!dialog_->isReading());
  }
  void paste(const QString& text) {
    QApplication::clipboard()->setText(text);
    focus(&dialog_->preview());
    pressKey(Qt::Key_V, Qt::ControlModifier);
    QTRY_VERIFY(!dialog_->isReading());
  }
  // On this platform the window is not active again once a list or a box has closed.
  void focus(QWidget* widget) {
    dialog_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(dialog_.get()));
    widget->setFocus();
  }
  // Types over what an edit holds, and leaves it by Tab.
  void fill(QLineEdit* edit, const QString& text) {
    focus(edit);
    edit->selectAll();
    typeKeys(text);
    if (QApplication::activePopupWidget() != nullptr) pressKey(Qt::Key_Escape);
    focus(edit);
    pressKey(Qt::Key_Tab);
  }
  QString verdict() { return dialog_->verdict()->text(); }
  const ColumnRows::Row& row(std::size_t n) { return dialog_->columns().rows().at(n - 1); }
  static std::vector<double> valuesOf(const TsbFile& file, std::size_t item) {
    std::vector<double> values(file.definition().time.count);
    for (std::size_t step = 0; step < values.size(); ++step)
      if (!file.read(item, step, std::span<double>(&values[step], 1))) qFatal("unread");
    return values;
  }
  TsbFile result(const QString& name) {
    Result<TsbFile> opened = TsbFile::open(file(name).toStdString());
    if (!opened) qFatal("%s", opened.error().c_str());
    return std::move(*opened);
  }
  QStringList folderFiles() {
    return QDir(folder_->path()).entryList({"*tsb0*"}, QDir::Files | QDir::Hidden);
  }

 private slots:
  void initTestCase() { makeFolder(); }
  void init() {
    for (const QString& name : folderFiles()) QFile::remove(file(name));
  }
  void cleanup() {
    dialog_.reset();
    window_.reset();
    setAppearance(Appearance::desktop);
  }

  void whatIsRecognisedIsShown() {
    showDialog(periodOf({2020, 2, 1, 0, 0, 0}, {2020, 2, 1, 2, 0, 0}));
    open("Datum;Pegel (m);Q [m3/s];note\n01.02.2020 00:00;1,25;10;a\n01.02.2020 02:00;1,5;-9999;b\n");
    QCOMPARE(dialog_->separator()->currentText(), QString("Semicolon"));
    QCOMPARE(dialog_->decimals()->currentText(), QString("Comma"));
    QCOMPARE(dialog_->headings()->value(), 1);
    QCOMPARE(dialog_->dates()->currentText(), QString("Day first"));
    QCOMPARE(row(1).role->currentText(), QString("Date"));
    QCOMPARE(row(2).name->text(), QString("Pegel"));
    QCOMPARE(row(2).type->currentText(), QString("Water level"));
    QCOMPARE(row(2).unit->text(), QString("m"));
    QCOMPARE(row(3).type->currentText(), QString("Discharge"));
    QCOMPARE(row(4).role->currentText(), QString("Left out"));
    QVERIFY(!row(4).name->isEnabled() && !dialog_->start()->isEnabled());
    QCOMPARE(dialog_->doubts()->text(),
             QString("-9999 stands once for a value: it is taken for a missing one."));
    QCOMPARE(verdict(), QString("2 lines are read."));
    QCOMPARE(dialog_->lines().rowCount(), 3);
    QCOMPARE(dialog_->lines().index(1, 1).data().toString(), QString("1,25"));
    // The plot has both, with the simulation shaded.
    QCOMPARE(dialog_->plot().graphCount(), 2);
    QCOMPARE(dialog_->plot().graph(0)->name(), QString("Pegel [m]"));
    QVERIFY(std::isnan(dialog_->plot().graph(1)->data()->at(1)->value));
    QCOMPARE(dialog_->plot().shade()->topLeft->coords().x(), dialog_->plot().graph(0)->data()->at(0)->key);
    QCOMPARE(dialog_->plot().shade()->bottomRight->coords().x(),
             dialog_->plot().graph(0)->data()->at(1)->key);
    QCOMPARE(dialog_->coverage()->text(),
             QString("The series covers the simulation period, 2020-02-01 00:00:00 to 2020-02-01 02:00:00."));
  }

  void aSpreadsheetIsPasted() {
    showDialog();
    paste("Date\tLevel\r\n2020-01-31 00:00\t1.5\r\n2020-01-31 00:30\t1.75\r\n2020-01-31 01:00\t\r\n");
    QCOMPARE(dialog_->separator()->currentText(), QString("Tab"));
    QCOMPARE(dialog_->result()->text(), file("pasted.tsb0"));
    QSignalSpy spy(dialog_.get(), &SeriesImport::imported);
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    QCOMPARE(spy.size(), 1);
    QVERIFY(!dialog_->isVisible());
    const TsbFile made = result("pasted.tsb0");
    QCOMPARE(made.definition().items[0].name, std::string("Level"));
    QCOMPARE(made.definition().items[0].type, item::kWaterLevel);
    QCOMPARE(made.definition().time.step, 1800.0);
    QCOMPARE(made.definition().time.start[2], 31);
    QCOMPARE(valuesOf(made, 1), (std::vector<double>{1.5, 1.75, made.definition().items[0].deleteValue}));
  }

  void whatIsChangedIsWritten() {
    showDialog();
    open("t [h],level [cm],what,Q\n0,100,1,5\n1,200,2,6\n2,300,3,7\n");
    QCOMPARE(row(1).role->currentText(), QString("Time since start"));
    QVERIFY(verdict().contains("no moment of the form"));
    QVERIFY(!dialog_->importButton()->isEnabled());
    fill(dialog_->start(), "2021-05-01 06:00:00");
    QTRY_COMPARE(verdict(), QString("What \"what\" holds is not known: it needs an item type."));
    // An item type is typed by its name, a unit that is none of it is told.
    fill(row(3).type->lineEdit(), "Salinity");
    QTRY_COMPARE(verdict(), QString("3 lines are read."));
    fill(row(2).unit, "s");
    QTRY_COMPARE(verdict(), QString("\"s\" is no unit of Water level, the item type of \"level\"."));
    QVERIFY(!dialog_->importButton()->isEnabled());
    fill(row(2).unit, "mm");
    fill(row(2).name, "Gauge 7");
    // A column is left out.
    focus(row(4).role);
    pressKey(Qt::Key_Down);
    QCOMPARE(row(4).role->currentText(), QString("Left out"));
    fill(dialog_->result(), file("changed"));
    QTRY_VERIFY(!dialog_->isReading());
    QCOMPARE(dialog_->plot().graphCount(), 2);
    QVERIFY(dialog_->importTable());
    const TsbFile made = result("changed.tsb0");
    QCOMPARE(made.definition().items.size(), std::size_t{2});
    QCOMPARE(made.definition().items[0].name, std::string("Gauge 7"));
    QCOMPARE(made.definition().items[1].type, item::kSalinity);
    QCOMPARE(made.definition().time.unit, std::string("h"));
    QCOMPARE(made.definition().time.start[1], 5);
    QCOMPARE(valuesOf(made, 1), (std::vector<double>{0.1, 0.2, 0.3}));
  }

  void whatIsTypedLastCountsAtOnce() {
    showDialog();
    open("d,Q\n2020-01-01,5\n2020-01-02,6\n");
    fill(row(2).unit, "l/s");
    QVERIFY(dialog_->isReading());
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    QTRY_VERIFY(!dialog_->isVisible());
    const std::vector<double> values = valuesOf(result("table.tsb0"), 1);
    QVERIFY(std::abs(values.at(0) - 0.005) < 1e-12 && std::abs(values.at(1) - 0.006) < 1e-12);
  }

  void anOrderThatIsOpenIsSaidAndChosen() {
    showDialog(periodOf({2020, 1, 2, 0, 0, 0}, {2020, 6, 1, 0, 0, 0}));
    open("d,Q\n1/2/2020,1\n2/2/2020,2\n");
    QVERIFY(dialog_->doubts()->text().contains("may be day/month/year or month/day/year"));
    QCOMPARE(
        dialog_->coverage()->text(),
        QString(
            "The series does not cover the simulation period, 2020-01-02 00:00:00 to 2020-06-01 00:00:00."));
    const double before = dialog_->plot().graph(0)->data()->at(0)->key;
    focus(dialog_->dates());
    pressKey(Qt::Key_Down);
    QCOMPARE(dialog_->dates()->currentText(), QString("Month first"));
    QTRY_COMPARE(before - dialog_->plot().graph(0)->data()->at(0)->key, 30 * 86400.0);
    // The shade is in view with the series.
    QVERIFY(dialog_->plot().xAxis->range().upper >= dialog_->plot().shade()->bottomRight->coords().x());
  }

  void linesThatDoNotReadAreRedAndCounted() {
    showDialog();
    QByteArray text = "d,Q\n";
    for (int i = 0; i < 400; ++i)
      text += QDate(2020, 1, 1).addDays(i).toString(Qt::ISODate).toUtf8() +
              (i == 9 || i == 350 ? ",x\n" : ",1\n");
    open(text);
    QCOMPARE(
        verdict(),
        QString("398 lines are read. 2 lines can't be read and are left out; line 11: \"x\" is no number."));
    // The first lines, and behind them the one further on.
    TablePreview& lines = dialog_->lines();
    QCOMPARE(lines.rowCount(), 201);
    QCOMPARE(lines.headerData(200, Qt::Vertical, Qt::DisplayRole).toInt(), 352);
    for (const int bad : {10, 200}) {
      QCOMPARE(lines.faultOf(bad), QString("\"x\" is no number"));
      QCOMPARE(lines.index(bad, 0).data(Qt::ToolTipRole).toString(), QString("\"x\" is no number"));
      QVERIFY(lines.index(bad, 0).data(Qt::ForegroundRole) != lines.index(5, 0).data(Qt::ForegroundRole));
    }
    QVERIFY(dialog_->importTable());
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{398});
  }

  void whatIsNoTableIsToldAndNotWritten() {
    showDialog();
    paste("words and nothing else\nmore words");
    QCOMPARE(verdict(), QString("A table of times and values is expected, line by line"));
    QVERIFY(!dialog_->importButton()->isEnabled() && !dialog_->importTable());
    QApplication::clipboard()->clear();
    focus(&dialog_->preview());
    pressKey(Qt::Key_V, Qt::ControlModifier);
    QCOMPARE(verdict(), QString("There is no text to paste."));
    const QStringList texts =
        answers({QMessageBox::Ok}, [this] { QVERIFY(!dialog_->openTable(file("away.csv"))); });
    QVERIFY(texts.size() == 1 && texts[0].contains("away.csv"));
    // The separator can be said, too.
    open("d;Q\n2020-01-01;1\n2020-01-02;2\n");
    focus(dialog_->separator());
    pressKey(Qt::Key_Down);
    QTRY_COMPARE(verdict(), QString("A table of times and values is expected, line by line"));
    pressKey(Qt::Key_Up);
    QTRY_COMPARE(verdict(), QString("2 lines are read."));
    QVERIFY(folderFiles().isEmpty());
  }

  void aFileThatIsThereIsReplacedOnlyWhenAsked() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    write(file("table.tsb0"), "of old");
    QStringList texts = answers({QMessageBox::No}, [this] { QVERIFY(!dialog_->importTable()); });
    QVERIFY(texts.size() == 1 && texts[0].contains("is there already. Replace it?"));
    QCOMPARE(textOf(file("table.tsb0")), QString("of old"));
    // Nor is the table itself.
    QFile::rename(file("table.csv"), file("in.tsb0"));
    QVERIFY(dialog_->openTable(file("in.tsb0")));
    QTRY_VERIFY(!dialog_->isReading());
    texts = answers({QMessageBox::Ok}, [this] { QVERIFY(!dialog_->importTable()); });
    QVERIFY(texts.size() == 1 && texts[0].contains("is a file that is read here"));
    fill(dialog_->result(), file("table.tsb0"));
    answers({QMessageBox::Yes}, [this] { QVERIFY(dialog_->importTable()); });
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{2});
  }

  void whereNothingCanBeWrittenThatIsTold() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    fill(dialog_->result(), file("table.csv/x.tsb0"));
    const QStringList texts = answers({QMessageBox::Ok}, [this] { QVERIFY(!dialog_->importTable()); });
    QVERIFY(texts.size() == 1 && texts[0].contains("x.tsb0"));
    QVERIFY(dialog_->isVisible() && dialog_->importButton()->isEnabled());
    QVERIFY(folderFiles().isEmpty());
  }

  void aLongImportIsStopped() {
    showDialog();
    QByteArray text = "Time,Q\n";
    for (int i = 0; i < 400'000; ++i) text += QByteArray::number(43831 + i / 1440.0, 'f', 6) + ",1.5\n";
    open(text);
    QCOMPARE(verdict(), QString("400000 lines are read."));
    QTimer::singleShot(40, dialog_.get(), [this] {
      QVERIFY(!dialog_->columns().isEnabled());
      QTest::keyClick(dialog_.get(), Qt::Key_Escape);
    });
    QVERIFY(!dialog_->importTable());
    QCOMPARE(verdict(), QString("The conversion was stopped; nothing is written"));
    QVERIFY(folderFiles().isEmpty());
    // It can be made after all, and while it is read the window can go.
    QVERIFY(dialog_->isVisible() && dialog_->columns().isEnabled());
    QVERIFY(dialog_->importTable());
    showDialog();
    QVERIFY(dialog_->openTable(file("table.csv")));
    QVERIFY(dialog_->isReading());
    pressKey(Qt::Key_Escape);
    QVERIFY(!dialog_->isVisible());
  }

  void tabGoesAsTheWindowReads() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    focus(dialog_->separator());
    QStringList names;
    for (int i = 0; i < 13; ++i) {
      pressKey(Qt::Key_Tab);
      names << QApplication::focusWidget()->accessibleName();
    }
    names.removeAll(QString());
    QCOMPARE(names, (QStringList{"What column 1 holds", "What column 2 holds", "Name of column 2",
                                 "Item type of column 2", "Unit of column 2", "Lines of the table",
                                 "Browse for the time series to write"}));
  }

  void theMenuBringsItWithTheSimulationShaded() {
    makeWindow();
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    QTest::keyClick(window_.get(), Qt::Key_I, Qt::ControlModifier | Qt::ShiftModifier);
    auto* dialog = window_->findChild<SeriesImport*>();
    QVERIFY(dialog != nullptr && dialog->isVisible());
    const Period period = window_->currentDocument()->editor().summary().period;
    QVERIFY(period[0].valid() && dialog->plot().shade() != nullptr);
    QApplication::clipboard()->setText("1/2/1990\t1\n2/2/1990\t2\n");
    QTest::keyClick(dialog, Qt::Key_V, Qt::ControlModifier);
    QTRY_VERIFY(!dialog->isReading());
    QVERIFY(dialog->coverage()->text().contains("does not cover the simulation period"));
    QComboBox* type = dialog->columns().rows().at(1).type;
    dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(dialog));
    type->setFocus();
    type->lineEdit()->selectAll();
    typeKeys("discharge");
    if (QApplication::activePopupWidget() != nullptr) pressKey(Qt::Key_Escape);
    dialog->activateWindow();
    type->setFocus();
    pressKey(Qt::Key_Tab);
    QTRY_VERIFY2(!dialog->isReading() && dialog->importButton()->isEnabled(),
                 qPrintable(dialog->verdict()->text()));
    QTest::mouseClick(dialog->importButton(), Qt::LeftButton);
    QTRY_VERIFY(window_->statusBar()->currentMessage().contains("pasted.tsb0: Column 2 of 2 time steps"));
    QCOMPARE(result("pasted.tsb0").definition().items[0].type, item::kDischarge);
  }

  void picturesAreTaken() {
    const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES");
    if (folder.isEmpty()) QSKIP("GRIDBAY_PICTURES names no folder");
    for (const bool dark : {false, true}) {
      setAppearance(dark ? Appearance::dark : Appearance::light);
      showDialog(periodOf({2020, 2, 3, 0, 0, 0}, {2020, 2, 10, 0, 0, 0}));
      QByteArray text = "Date;Stage (m);Q [m3/s];flag\n";
      for (int i = 0; i < 240; ++i) {
        text += QDateTime(QDate(2020, 2, 1), QTime(), Qt::UTC)
                    .addSecs(i * 3600)
                    .toString("dd.MM.yyyy hh:mm")
                    .toUtf8();
        text += i == 5 ? ";x;y;a\n"
                       : ";" + QByteArray::number(std::sin(i / 8.0), 'f', 2).replace('.', ',') + ";" +
                             QByteArray::number(3 + std::cos(i / 30.0), 'f', 2).replace('.', ',') + ";a\n";
      }
      open(text);
      dialog_->result()->setText("gauge.tsb0");
      dialog_->grab().save(folder + (dark ? "/import-dark.png" : "/import.png"));
    }
  }
};

}  // namespace gridbay::shell

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QCoreApplication::setOrganizationName("test");
  QCoreApplication::setApplicationName("series-import-test");
  gridbay::shell::SeriesImportTest test;
  return QTest::qExec(&test, argc, argv);
}

#include "series_import_test.moc"
