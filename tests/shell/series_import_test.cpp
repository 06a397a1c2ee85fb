// A table of text becomes a time series on the desktop: opened or pasted, changed by keys, written, read
// back.

#include "shell/import/series_import.h"

#include <sys/resource.h>

#include <QClipboard>
#include <QDir>
#include <QMenuBar>
#include <QSignalSpy>
#include <QStatusBar>
#include <QStringEncoder>
#include <cmath>
#include <csignal>

#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"
#include "shell/appearance.h"
#include "shell/grid_view.h"
#include "shell/shades.h"
#include "tests/shell/desktop_fixture.h"
#include "tests/shell/held_work.h"
#include "tests/shell/import_checks.h"
#include "tests/shell/real_keys.h"

namespace gridbay::shell {

class SeriesImportTest final : public DesktopFixture {
  Q_OBJECT

  static constexpr int kLong = 60'000;  // milliseconds

  std::unique_ptr<SeriesImport> dialog_;

  static Period periodOf(std::array<std::int32_t, 6> begin, std::array<std::int32_t, 6> end) {
    return {DateTime::of(begin), DateTime::of(end)};
  }
  void showDialog(std::optional<Period> period = {}) {
    dialog_ = std::make_unique<SeriesImport>(
        [this, period] {
          return SeriesImport::Setup{period, folder_->path()};
        },
        [](const QString&) {
          return UseStrip::Offer{{}, "nothing is open"};
        },
        nullptr);
    dialog_->show();
    dialog_->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(dialog_.get()));
  }
  void open(const QByteArray& text) {
    write(file("table.csv"), text);
    QVERIFY(dialog_->openTable(file("table.csv")));
    settle();
  }
  void settle() { QTRY_VERIFY_WITH_TIMEOUT(!dialog_->isReading(), kLong); }
  void paste(const QString& text) {
    QApplication::clipboard()->setText(text);
    focus(&dialog_->preview());
    pressKey(Qt::Key_V, Qt::ControlModifier);
    settle();
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
  // Presses Import; whether the series was written.
  bool import() {
    const QSignalSpy spy(dialog_.get(), &SeriesImport::imported);
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    return QTest::qWaitFor([this] { return !dialog_->isImporting(); }, kLong) && spy.size() == 1;
  }
  template <class Widget>
  Widget& part(const char* name) {
    return *dialog_->findChild<Widget*>(name);
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
  static QByteArray longTable(int lines) {
    QByteArray text = "Time,Q\n";
    for (int i = 0; i < lines; ++i) text += QByteArray::number(43831 + i / 1440.0, 'f', 6) + ",1.5\n";
    return text;
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
    QCOMPARE(dialog_->form().separator().currentText(), QString("Semicolon"));
    QCOMPARE(dialog_->form().decimals().currentText(), QString("Comma"));
    QCOMPARE(dialog_->form().headings().value(), 1);
    QCOMPARE(dialog_->form().dates().currentText(), QString("Day first"));
    QCOMPARE(row(1).role->currentText(), QString("Date"));
    QCOMPARE(row(2).name->text(), QString("Pegel"));
    QCOMPARE(row(2).type->currentText(), QString("Water level"));
    QCOMPARE(row(2).unit->text(), QString("m"));
    QCOMPARE(row(3).type->currentText(), QString("Discharge"));
    QCOMPARE(row(4).role->currentText(), QString("Left out"));
    QVERIFY(!row(4).name->isEnabled() && !dialog_->form().start().isEnabled());
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
    QCOMPARE(dialog_->form().separator().currentText(), QString("Tab"));
    QCOMPARE(dialog_->result()->text(), file("pasted.tsb0"));
    QVERIFY(import());
    QVERIFY(verdict().contains("pasted.tsb0: Level of 3 time steps, 1800 s apart"));
    QCOMPARE(part<QLabel>("why").text(), QString("nothing is open"));
    QVERIFY(!part<QWidget>("act").isVisible() && part<QWidget>("view").isVisible());
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
    fill(&dialog_->form().start(), "2021-05-01 06:00:00");
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
    settle();
    QCOMPARE(dialog_->plot().graphCount(), 2);
    QVERIFY(import());
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
    QVERIFY(import());
    const std::vector<double> values = valuesOf(result("table.tsb0"), 1);
    QVERIFY(std::abs(values.at(0) - 0.005) < 1e-12 && std::abs(values.at(1) - 0.006) < 1e-12);
    // And so it does where Import is pressed by its key.
    fill(dialog_->result(), file("again"));
    focus(row(2).name);
    row(2).name->selectAll();
    typeKeys("Inflow");
    const QSignalSpy spy(dialog_.get(), &SeriesImport::imported);
    pressKey(Qt::Key_I, Qt::AltModifier);
    QTRY_COMPARE(spy.size(), 1);
    QCOMPARE(result("again.tsb0").definition().items[0].name, std::string("Inflow"));
  }

  void anImportThatWaitsIsOfItsTableAlone() {
    showDialog();
    write(file("long.csv"), longTable(200'000));
    QVERIFY(dialog_->openTable(file("long.csv")));
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    QVERIFY(dialog_->isImporting());
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    QVERIFY(!dialog_->isImporting());
    QCOMPARE(verdict(), QString("2 lines are read."));
    QVERIFY(folderFiles().isEmpty());
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
    focus(&dialog_->form().dates());
    pressKey(Qt::Key_Down);
    QCOMPARE(dialog_->form().dates().currentText(), QString("Month first"));
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
    QVERIFY(import());
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{398});
  }

  void whatIsNoTableIsToldAndNotWritten() {
    showDialog();
    paste("words and nothing else\nmore words");
    QCOMPARE(verdict(), QString("A table of times and values is expected, line by line"));
    QVERIFY(!dialog_->importButton()->isEnabled() && !import());
    QApplication::clipboard()->clear();
    focus(&dialog_->preview());
    pressKey(Qt::Key_V, Qt::ControlModifier);
    QCOMPARE(verdict(), QString("There is no text to paste."));
    const QStringList texts =
        answers({QMessageBox::Ok}, [this] { QVERIFY(!dialog_->openTable(file("away.csv"))); });
    QVERIFY(texts.size() == 1 && texts[0].contains("away.csv"));
    // The separator can be said, too.
    open("d;Q\n2020-01-01;1\n2020-01-02;2\n");
    focus(&dialog_->form().separator());
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
    QStringList texts = answers({QMessageBox::No}, [this] { QVERIFY(!import()); });
    QVERIFY(texts.size() == 1 && texts[0].contains("is there already. Replace it?"));
    QCOMPARE(textOf(file("table.tsb0")), QString("of old"));
    // Nor is the table itself.
    QFile::rename(file("table.csv"), file("in.tsb0"));
    QVERIFY(dialog_->openTable(file("in.tsb0")));
    settle();
    QVERIFY(!import());
    QVERIFY(verdict().contains("is a file that is read here"));
    fill(dialog_->result(), file("table.tsb0"));
    answers({QMessageBox::Yes}, [this] { QVERIFY(import()); });
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{2});
  }

  void whereNothingCanBeWrittenThatIsTold() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    for (const QString& path : {file("table.csv/x.tsb0"), file("no/x.tsb0"), QString("/proc/x.tsb0")}) {
      fill(dialog_->result(), path);
      QVERIFY(!import());
      QVERIFY2(verdict().contains("x.tsb0"), qPrintable(verdict()));
      QVERIFY(dialog_->isVisible() && dialog_->importButton()->isEnabled());
    }
    // A disk that is full.
    fill(dialog_->result(), file("x.tsb0"));
    rlimit before{};
    getrlimit(RLIMIT_FSIZE, &before);
    const auto handler = signal(SIGXFSZ, SIG_IGN);
    const rlimit little{4096, before.rlim_max};
    setrlimit(RLIMIT_FSIZE, &little);
    const bool isWritten = import();
    setrlimit(RLIMIT_FSIZE, &before);
    signal(SIGXFSZ, handler);
    QVERIFY(!isWritten);
    QVERIFY2(verdict().contains("the disk is full"), qPrintable(verdict()));
    QVERIFY(folderFiles().isEmpty());
  }

  void aLongImportIsStopped() {
    showDialog();
    open(longTable(400'000));
    QCOMPARE(verdict(), QString("400000 lines are read."));
    const auto begin = [this] {
      QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
      QVERIFY(dialog_->isImporting() && !dialog_->columns().isEnabled());
    };
    begin();
    QTest::keyClick(dialog_.get(), Qt::Key_Escape);
    QCOMPARE(verdict(), QString("The import was stopped; nothing is written."));
    QVERIFY(folderFiles().isEmpty());
    begin();
    QTest::mouseClick(&part<QPushButton>("cancel"), Qt::LeftButton);
    QVERIFY(folderFiles().isEmpty());
    // What is killed leaves nothing either.
    begin();
    for (const QString& copy :
         textOf(QString("/proc/%1/task/%1/children").arg(getpid())).split(' ', Qt::SkipEmptyParts))
      kill(copy.toInt(), SIGKILL);
    QTRY_COMPARE(verdict(), QString("The import came to a sudden end; nothing is written"));
    QVERIFY(folderFiles().isEmpty());
    // It can be made after all, and while it is read or written the window can go.
    QVERIFY(dialog_->isVisible() && dialog_->columns().isEnabled());
    QVERIFY(import());
    QCOMPARE(folderFiles(), QStringList("table.tsb0"));
    QVERIFY(dialog_->openTable(file("table.csv")));
    QVERIFY(dialog_->isReading());
    pressKey(Qt::Key_Escape);
    QVERIFY(!dialog_->isVisible());
  }

  void theWindowLivesWhileAMillionLinesAreRead() {
    showDialog();
    write(file("table.csv"), longTable(1'000'000));
    QVERIFY(dialog_->openTable(file("table.csv")));
    QTimer ticks;
    int count = 0;
    connect(&ticks, &QTimer::timeout, [&count] { ++count; });
    ticks.start(10);
    QTRY_VERIFY_WITH_TIMEOUT(!dialog_->isReading(), kLong);
    QCOMPARE(verdict(), QString("1000000 lines are read."));
    const int whileRead = count;
    QVERIFY(import());
    QVERIFY2(whileRead > 0 && count > whileRead, qPrintable(QString("%1 %2").arg(whileRead).arg(count)));
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{1'000'000});
  }

  // A long table is recognised from its first lines at once, and from all of them beside the window.
  void aLongTableIsRecognisedBesideTheWindow() {
    showDialog();
    QByteArray text = "Date,Q [m3/s],water level [m]\n";
    for (int i = 0; i < 6000; ++i)
      text += QByteArray::number(i % 12 + 1) + "/" + (i < 5000 ? "1" : "25") + "/" +
              QByteArray::number(1500 + i / 12) + (i == 4000 ? ",-9999,2\n" : ",1.5,2\n");
    write(file("table.csv"), text);
    const auto openSignalled = [this](int signal) {
      signalCopy(1, signal);
      return dialog_->openTable(file("table.csv"));
    };
    // The first lines are seen, and can be worked at.
    QVERIFY(openSignalled(SIGSTOP));
    QCOMPARE(dialog_->preview().model()->rowCount(), 200);
    QCOMPARE(dialog_->form().dates().currentText(), QString("Day first"));
    QCOMPARE(dialog_->form().missing().text(), QString());
    QVERIFY(part<QPushButton>("cancel").isVisible() && dialog_->isReading());
    fill(row(2).name, "Flow");
    QTRY_COMPARE(dialog_->lines().headerData(1, Qt::Horizontal, Qt::DisplayRole).toString(), QString("Flow"));
    // What all lines tell is added to what was changed meanwhile.
    releaseCopies();
    settle();
    QCOMPARE(dialog_->form().dates().currentText(), QString("Month first"));
    QCOMPARE(dialog_->form().missing().text(), QString("-9999"));
    QCOMPARE(row(2).name->text(), QString("Flow"));
    QCOMPARE(verdict(), QString("6000 lines are read."));
    QVERIFY(!part<QPushButton>("cancel").isVisible());
    // Cancelled, or ended by a fault of its own: the first lines have to do, which is said.
    for (const bool isCancelled : {true, false}) {
      QVERIFY(openSignalled(isCancelled ? SIGSTOP : SIGKILL));
      if (isCancelled) QTest::mouseClick(&part<QPushButton>("cancel"), Qt::LeftButton);
      settle();
      QVERIFY(dialog_->doubts()->text().contains("Only the first 2000 lines were looked at"));
      QCOMPARE(dialog_->form().dates().currentText(), QString("Day first"));
      QVERIFY2(verdict().contains("can't be read and are left out"), qPrintable(verdict()));
    }
    // What parts the fields is another look at all; an import waits for it.
    focus(&dialog_->form().separator());
    pressKey(Qt::Key_Up);
    pressKey(Qt::Key_Down);
    settle();
    QCOMPARE(dialog_->form().missing().text(), QString("-9999"));
    QVERIFY(!dialog_->doubts()->text().contains("Only the first"));
    // What is being typed when the look is at its end stays.
    QVERIFY(openSignalled(SIGSTOP));
    focus(&dialog_->form().missing());
    typeKeys("7");
    releaseCopies();
    settle();
    QCOMPARE(dialog_->form().missing().text(), QString("7"));
    pressKey(Qt::Key_Tab);
    // Cancelled, the look takes the import that waits for it along.
    QVERIFY(openSignalled(SIGSTOP));
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    QTest::mouseClick(&part<QPushButton>("cancel"), Qt::LeftButton);
    settle();
    QVERIFY(!dialog_->isImporting() && folderFiles().isEmpty());
    QVERIFY(openSignalled(SIGSTOP));
    QVERIFY(dialog_->importButton()->isEnabled());
    QTest::mouseClick(dialog_->importButton(), Qt::LeftButton);
    QVERIFY(dialog_->isImporting() && folderFiles().isEmpty());
    releaseCopies();
    QTRY_COMPARE_WITH_TIMEOUT(folderFiles(), QStringList("table.tsb0"), kLong);
    QTRY_VERIFY_WITH_TIMEOUT(!dialog_->isImporting(), kLong);
    QCOMPARE(result("table.tsb0").definition().time.count, std::size_t{6000});
  }

  void whatIsNoMissingValueIsRefusedAtItsField() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,-777.25\n2020-01-03,3\n");
    auto& why = part<QLabel>("missingFault");
    focus(&dialog_->form().missing());
    typeKeys("-777.25 none");
    QVERIFY(why.isVisible() && why.text().startsWith("Missing: \"none\" is no number."));
    QVERIFY(!dialog_->importButton()->isEnabled() && verdict() == why.text());
    QCOMPARE(dialog_->form().missing().palette().color(QPalette::Text), faultColour(dialog_->palette()));
    // It stays as it was typed, with what is wrong, once it is left and all is read again.
    const QString typed = dialog_->form().missing().text();
    pressKey(Qt::Key_Tab);
    settle();
    QCOMPARE(dialog_->form().missing().text(), typed);
    QVERIFY(why.isVisible() && verdict() == why.text() && !dialog_->importButton()->isEnabled());
    fill(&dialog_->form().missing(), "-777.25; 4,5");
    settle();
    QCOMPARE(verdict(), QString("3 lines are read."));
    QVERIFY(!why.isVisible());
    QVERIFY(std::isnan(dialog_->plot().graph(0)->data()->at(1)->value));
    // They are shown with all of their digits.
    QCOMPARE(dialog_->form().missing().text(), QString("-777.25 4.5"));
  }

  void tablesOfAllSorts() {
    showDialog();
    const QByteArray plain = "d,Q\n2020-01-01,1.5\n2020-01-02,2.5\n";
    const QString text = QString::fromUtf8(plain);
    QStringEncoder little(QStringEncoder::Utf16LE);
    QStringEncoder big(QStringEncoder::Utf16BE, QStringEncoder::Flag::WriteBom);
    struct Case {
      QByteArray text;
      QString says;
    };
    for (const Case& each :
         {Case{"\xef\xbb\xbf" + plain, "2 lines are read."},
          {"\xef\xbb\xbf" + plain.mid(4), "2 lines are read."},  // with no heading
          {little(text), "2 lines are read."},
          {big(text), "2 lines are read."},
          {"d,Q [m\xb3/s]\r2020-01-01,1.5\r2020-01-02,2.5\r", "2 lines are read."},
          {"", "A table of times and values is expected, line by line"},
          {"2020-01-01,1\n", "1 lines are read."},
          {"d,Q\n", "A table of times and values is expected, line by line"},
          {"d,Q\n2020-01-01,1\n2020-01-03,2\n2020-01-02,3\n2020-01-04,3\n",
           "3 lines are read. 1 line can't be read and is left out; line 4: the time does not rise."},
          {"d,Q\n2020-01-01,1\n2020-01-01,2\n2020-01-02,3\n",
           "2 lines are read. 1 line can't be read and is left out; line 3: the time does not rise."},
          {"d;Q\n2020-01-01;1\n2020-01-02;2\n2020-01-03,3\n",
           "2 lines are read. 1 line can't be read and is left out; line 4: 1 fields, where the lines before "
           "have 2."},
          {"d;Q\n2020-01-01;1,5\n2020-01-02;2,25\n", "2 lines are read."}}) {
      open(each.text);
      if (each.says.startsWith("1 lines") || each.says.startsWith("2 lines")) {
        fill(row(2).type->lineEdit(), "Discharge");
        settle();
      }
      QVERIFY2(verdict() == each.says, qPrintable(verdict() + each.text));
    }
    // What is no text at all.
    write(file("table.csv"), QByteArray("\x7f"
                                        "ELF\0\1\2\0\0\0\3",
                                        12));
    const QStringList texts =
        answers({QMessageBox::Ok}, [this] { QVERIFY(!dialog_->openTable(file("table.csv"))); });
    QVERIFY(texts.size() == 1 && texts[0].contains("it is no text"));
  }

  void aFileIsDropped() {
    showDialog();
    write(file("dropped.csv"), "d,Q\n2020-01-01,1\n2020-01-02,2\n");
    drop(*dialog_, {QUrl("https://somewhere.org/a.csv")}, false);
    drop(*dialog_, {QUrl::fromLocalFile(file("dropped.csv"))}, true);
    QTRY_COMPARE(verdict(), QString("2 lines are read."));
    QCOMPARE(dialog_->result()->text(), file("dropped.tsb0"));
    for (const QLineEdit* edit : dialog_->findChildren<QLineEdit*>()) QVERIFY(!edit->acceptDrops());
  }

  void tabGoesAsTheWindowReads() {
    showDialog();
    open("d,Q\n2020-01-01,1\n2020-01-02,2\n");
    focus(&dialog_->form().separator());
    QStringList names;
    for (int i = 0; i < 13; ++i) {
      pressKey(Qt::Key_Tab);
      names << QApplication::focusWidget()->accessibleName();
    }
    names.removeAll(QString());
    QCOMPARE(names, (QStringList{"What column 1 holds", "What column 2 holds", "Name of column 2",
                                 "Item type of column 2", "Unit of column 2", "Lines of the table",
                                 "Browse for the time series to write"}));
    checkAccelerators(*dialog_);
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
    // Nothing asks for a discharge; what to do about it is said. The help is there meanwhile.
    const QString why = dialog->findChild<QLabel*>("why")->text();
    QVERIFY2(why.startsWith("s.v27 has no place that takes such a series."), qPrintable(why));
    QTest::keyClick(dialog, Qt::Key_F1);
    QVERIFY(window_->help().browser().toPlainText().startsWith("Import Series"));
    QCOMPARE(result("pasted.tsb0").definition().items[0].type, item::kDischarge);
  }

  // Rain of a file, an item of several; and the wind, which wants two.
  void aSeriesIsPutToUseWhereItIsAskedFor() {
    const QString rain = "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/PrecipitationType=0";
    const QString wind = "HYDRODYNAMIC_MODULE/WIND_CONDITIONS/Data_Format=2";
    makeWindow();
    run("v27setup", {"set", "s.v27", rain, wind});
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    write(file("rain.csv"),
          "d,A rain [mm/d],B rain [mm/d],speed [m/s],direction "
          "[deg]\n1990-01-01,1,2,3,4\n1990-01-02,5,6,7,8\n");
    window_->importSeries();
    SeriesImport& dialog = *window_->seriesImport();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(dialog.openTable(file("rain.csv")));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isReading(), kLong);
    const std::array types{"", "Evaporation and precipitation", "Evaporation and precipitation", "Wind speed",
                           "Wind direction"};
    for (std::size_t i = 1; i < types.size(); ++i) {
      QComboBox* type = dialog.columns().rows().at(i).type;
      type->setFocus();
      type->lineEdit()->selectAll();
      typeKeys(types[i]);
      if (QApplication::activePopupWidget() != nullptr) pressKey(Qt::Key_Escape);
      pressKey(Qt::Key_Tab);
    }
    QTRY_VERIFY2_WITH_TIMEOUT(!dialog.isReading() && dialog.importButton()->isEnabled(),
                              qPrintable(dialog.verdict()->text()), kLong);
    QTest::mouseClick(dialog.importButton(), Qt::LeftButton);
    auto* use = dialog.findChild<QComboBox*>("use");
    QTRY_VERIFY2_WITH_TIMEOUT(use->isVisible(), qPrintable(dialog.verdict()->text()), kLong);
    QStringList offered;
    for (int i = 0; i < use->count(); ++i) offered << use->itemText(i);
    QCOMPARE(
        offered,
        (QStringList{"Hydrodynamic Parameters, Source and Sink: Precipitation, File name of s.v27 (A rain)",
                     "Hydrodynamic Parameters, Source and Sink: Precipitation, File name of s.v27 (B rain)",
                     "Hydrodynamic Parameters, Wind Conditions: Wind, Data file of s.v27"}));
    // The second rain: the file and its item in one step.
    const auto rainFile = [this] {
      QWidget* shown = tab().pane().widgetOf("File name", 2);
      if (shown->focusProxy() != nullptr) shown = shown->focusProxy();
      return qobject_cast<QLineEdit*>(shown)->text();
    };
    use->setCurrentIndex(1);
    SetupEditor& editor = window_->currentDocument()->editor();
    const std::uint64_t before = editor.modelState();
    QTest::mouseClick(dialog.findChild<QPushButton*>("act"), Qt::LeftButton);
    QVERIFY(rainFile().endsWith("rain.tsb0"));
    QCOMPARE(editor.undoable()->name, std::string("File name"));
    QVERIFY(window_->saveDocument(file("s.v27")));
    QVERIFY(textOf(file("s.v27"))
                .contains(QRegularExpression(
                    "Precipitation \\{\\s+File_Name \\(file\\)\"[^\"]*rain.tsb0\"\\s+Item_Numbers 2\\s")));
    window_->currentDocument()->undo();
    QCOMPARE(editor.modelState(), before);
    // On the page that is open it is seen too.
    QCOMPARE(rainFile(), QString());
    QTest::mouseClick(dialog.findChild<QPushButton*>("act"), Qt::LeftButton);
    QVERIFY(rainFile().endsWith("rain.tsb0"));
    // One that does not reach as far as the simulation is taken when the user agrees.
    const SeriesPlaces places = editor.seriesPlaces(file("rain.tsb0").toStdString());
    QVERIFY(places.places.size() == 3 && places.places[0].doubt.empty());
    write(file("short.csv"), "d,rain\n1990-01-01 12:00,1\n1990-01-01 12:10,2\n");
    run("v27setup", {"convert", "series", "short.csv", "short.tsb0", "--item-type", "100088"});
    const SeriesPlaces doubtful = editor.seriesPlaces(file("short.tsb0").toStdString());
    QVERIFY(doubtful.places.size() == 1 && !doubtful.places[0].doubt.empty());
    QCOMPARE(doubtful.others.at(0),
             std::string("Hydrodynamic Parameters, Wind Conditions: Wind, Wind speed"));
    QCOMPARE(editor.useSeries(file("short.tsb0").toStdString(), doubtful.places[0]), std::string());
    // A place that is gone meanwhile is told.
    SeriesPlace gone = doubtful.places[0];
    gone.page = 1;
    QVERIFY(!editor.useSeries(file("short.tsb0").toStdString(), gone).empty());
  }

  // What is constant today is offered with the format that it takes, which is switched in the same step: a
  // list of the page for the rain, and one in the row of a table for a source.
  void aConstantPlaceGetsTheSeriesWithItsFormat() {
    makeWindow();
    run("v27setup", {"set", "s.v27", "NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/Number_Of_Sources=3"});
    QVERIFY(window_->openDocument(file("s.v27")) != nullptr);
    write(file("both.csv"),
          "d,rain [mm/d],discharge [m3/s],flow velocity [m/s],water level "
          "[m]\n1980-01-01,1,2,3,4\n2000-01-02,5,6,7,8\n");
    window_->importSeries();
    SeriesImport& dialog = *window_->seriesImport();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    QVERIFY(dialog.openTable(file("both.csv")));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isReading() && dialog.importButton()->isEnabled(), kLong);
    QTest::mouseClick(dialog.importButton(), Qt::LeftButton);
    auto* use = dialog.findChild<QComboBox*>("use");
    QTRY_VERIFY2_WITH_TIMEOUT(use->isVisible(), qPrintable(dialog.verdict()->text()), kLong);
    QStringList offered;
    for (int i = 0; i < use->count(); ++i) offered << use->itemText(i);
    const QString flow = "Hydrodynamic Parameters, ";
    QVERIFY2(
        offered.contains(flow + "Source and Sink: Precipitation, File name of s.v27, given as \"Type 0\""),
        qPrintable(offered.join("\n")));
    const QString source = flow + "Source and Sink: file, row 2: (0,0)-> of s.v27, given as \"From file\"";
    QVERIFY2(offered.contains(source), qPrintable(offered.join("\n")));
    const QString boundary = flow + "Boundary: Boundary 1, data of s.v27, given as \"Type 0 data file\"";
    QVERIFY2(offered.contains(boundary), qPrintable(offered.join("\n")));
    SetupEditor& editor = window_->currentDocument()->editor();
    const std::uint64_t before = editor.modelState();
    const auto take = [&](const QString& place) {
      use->setCurrentIndex(use->findText(place));
      QTest::mouseClick(dialog.findChild<QPushButton*>("act"), Qt::LeftButton);
      QVERIFY(window_->saveDocument(file("s.v27")));
    };
    take(source);
    QVERIFY(textOf(file("s.v27"))
                .contains(QRegularExpression(
                    "SOURCE_SINK_2 \\{[^}]*Data_Format 1[^}]*both.tsb0\"\\s+Item_Numbers 2 3")));
    QCOMPARE(tab().pane().tableAt(1)->model()->index(1, 0).data().toString(), QString("From file"));
    window_->currentDocument()->undo();
    QCOMPARE(editor.modelState(), before);
    QCOMPARE(tab().pane().tableAt(1)->model()->index(1, 0).data().toString(), QString("Constant value"));
    take(boundary);
    QVERIFY(textOf(file("s.v27")).contains(QRegularExpression("both.tsb0\"\\s+Item_Numbers 4")));
    window_->currentDocument()->undo();
    QCOMPARE(editor.modelState(), before);
    // The format may have been chosen meanwhile, or be none any more.
    const std::string series = file("both.tsb0").toStdString();
    const SeriesPlaces places = editor.seriesPlaces(series);
    const auto rain = std::ranges::find(places.places, std::string("Type 0"),
                                        [](const SeriesPlace& place) { return place.format.choice; });
    QVERIFY(rain != places.places.end());
    SeriesPlace wrong = *rain;
    wrong.format.choice = "Type 9";
    QVERIFY(!editor.useSeries(series, wrong).empty());
    QCOMPARE(editor.useSeries(series, *rain), std::string());
    QCOMPARE(editor.useSeries(series, *rain), std::string());
    // It asks for a series as it is now.
    QVERIFY(editor.seriesPlaces(series).places.front().format.choice.empty());
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
