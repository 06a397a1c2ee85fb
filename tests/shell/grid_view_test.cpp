// The widget of a grid, with grids of the tests' own: real key presses and clicks.

#include "shell/grid_view.h"

#include <QApplication>
#include <QClipboard>
#include <QComboBox>
#include <QLineEdit>
#include <QScrollBar>
#include <QTest>
#include <QVBoxLayout>

#include "shell/appearance.h"
#include "shell/cell_editors.h"
#include "shell/projection_search.h"
#include "tests/shell/real_keys.h"
#include "tests/shell/test_forms.h"

namespace gridbay::shell {

using test::FreeGrid;
using test::GridOfAllKinds;

class GridViewTest : public QObject {
  Q_OBJECT

 private:
  QWidget* window_ = nullptr;
  GridView* view_ = nullptr;
  QLineEdit* other_ = nullptr;

  // The window goes before the grid that it shows.
  struct WindowEnd {
    void operator()(GridViewTest* test) const { delete std::exchange(test->window_, nullptr); }
  };
  using Shown = std::unique_ptr<GridViewTest, WindowEnd>;

  Shown show(CV27SetupGridWnd& grid, QSize size = {1000, 500}) {
    window_ = new QWidget();
    auto* layout = new QVBoxLayout(window_);
    view_ = new GridView(grid, window_);
    other_ = new QLineEdit(window_);
    layout->addWidget(view_);
    layout->addWidget(other_);
    layout->addStretch();
    window_->resize(size);
    window_->show();
    window_->activateWindow();
    if (!QTest::qWaitForWindowActive(window_)) qFatal("the window is not active");
    return Shown(this);
  }
  // As the headers count, from 1.
  QModelIndex at(int row, int col) { return view_->cells().index(row - 1, col - 1); }
  void click(int row, int col) {
    QTest::mouseClick(view_->viewport(), Qt::LeftButton, Qt::NoModifier,
                      view_->visualRect(at(row, col)).center());
  }
  CellEdit* editor() {
    return qobject_cast<CellEdit*>(static_cast<CellDelegate*>(view_->itemDelegate())->editor());
  }
  QColor ground(int row, int col) {
    const QRect rect = view_->visualRect(at(row, col));
    return view_->viewport()->grab(rect).toImage().pixelColor(4, 4);
  }
  void key(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier) {
    QTest::keyClick(QApplication::focusWidget(), key, modifiers);
  }

 private slots:
  void aClickOpensTheEditor() {
    FreeGrid grid({{"A", 60, {.value = "1"}}, {"B", 60, {.value = "2"}}}, 3);
    const auto shown = show(grid);
    click(1, 1);
    QVERIFY(editor() != nullptr && editor()->hasFocus());
    QTest::keyClicks(editor(), "5");
    key(Qt::Key_Return);
    QTRY_COMPARE(grid.at(1, 1).value, std::string("5"));
    // Return goes on to the cell below, and typing fills it in.
    QTRY_COMPARE(view_->currentIndex(), at(2, 1));
    QTRY_VERIFY(view_->hasFocus());
    key(Qt::Key_7);
    QVERIFY(editor() != nullptr);
    key(Qt::Key_Tab);
    QCOMPARE(grid.at(2, 1).value, std::string("7"));
    QCOMPARE(view_->currentIndex(), at(2, 2));
  }

  void arrowsPassCellsWithoutOpeningThem() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    view_->setFocus();
    view_->selectionModel()->setCurrentIndex(at(1, 2), QItemSelectionModel::NoUpdate);
    key(Qt::Key_Escape);
    key(Qt::Key_Right);
    QCOMPARE(view_->currentIndex(), at(1, GridOfAllKinds::kType));
    QVERIFY(view_->findChild<QComboBox*>() == nullptr);
    key(Qt::Key_Down);
    QCOMPARE(grid.at(1, GridOfAllKinds::kType).value, std::string("Constant"));
    key(Qt::Key_Up);
    key(Qt::Key_Space);
    auto* list = view_->findChild<QComboBox*>();
    QVERIFY(list != nullptr && list->view()->isVisible());
    QTest::keyClick(list->view(), Qt::Key_Down);
    QTest::keyClick(list->view(), Qt::Key_Return);
    QTRY_COMPARE(grid.at(1, GridOfAllKinds::kType).value, std::string("From file"));
  }

  void aRefusedTextStays() {
    FreeGrid grid({{"Origin", 60, {.value = "(3,4)"}}, {"B", 60, {.value = "2"}}}, 3);
    grid.accepts = [](int, int, std::string_view text) { return text.find(',') != text.npos; };
    const auto shown = show(grid);
    click(1, 1);
    QTest::keyClicks(editor(), "nowhere");
    key(Qt::Key_Return);
    QTRY_COMPARE(grid.stores, 1);
    QVERIFY(editor() != nullptr && editor()->hasFocus());
    QCOMPARE(editor()->text(), QString("nowhere"));
    QVERIFY(editor()->isRefused());
    const QString tip = editor()->toolTip();
    QVERIFY2(tip.contains("\"nowhere\"") && tip.contains("Origin") && tip.contains("(3,4)"), qPrintable(tip));
    QCOMPARE(editor()->accessibleDescription(), tip);
    // A refresh while it is open leaves it as it is.
    view_->cells().refresh();
    QCOMPARE(editor()->text(), QString("nowhere"));
    key(Qt::Key_Tab);
    QVERIFY(editor() != nullptr && editor()->hasFocus());
    editor()->selectAll();
    QTest::keyClicks(editor(), "5,6");
    key(Qt::Key_Return);
    QTRY_COMPARE(grid.at(1, 1).value, std::string("5,6"));
    QTRY_VERIFY(editor() == nullptr);
  }

  void escBringsTheValueBack() {
    FreeGrid grid({{"Origin", 60, {.value = "(3,4)"}}}, 2);
    grid.accepts = [](int, int, std::string_view) { return false; };
    const auto shown = show(grid);
    click(1, 1);
    QTest::keyClicks(editor(), "nowhere");
    key(Qt::Key_Return);
    QTRY_VERIFY(editor() != nullptr && editor()->isRefused());
    key(Qt::Key_Escape);
    QTRY_VERIFY(editor() == nullptr);
    QCOMPARE(at(1, 1).data().toString(), QString("(3,4)"));
    QVERIFY(view_->hasFocus());
  }

  void aClickElsewhereComesBackToARefusedTextOnce() {
    FreeGrid grid({{"A", 60, {.value = "1"}}, {"B", 60, {.value = "2"}}}, 3);
    grid.accepts = [](int, int, std::string_view text) { return test::isNumber(text); };
    const auto shown = show(grid);
    click(1, 1);
    QTest::keyClicks(editor(), "x");
    click(2, 2);
    QTRY_VERIFY(editor() != nullptr && editor()->hasFocus());
    QCOMPARE(editor()->text(), QString("x"));
    QCOMPARE(view_->currentIndex(), at(1, 1));
    click(2, 2);
    QTRY_COMPARE(view_->currentIndex(), at(2, 2));
    QTRY_COMPARE(editor() == nullptr ? QString() : editor()->text(), QString("2"));
    QCOMPARE(grid.at(1, 1).value, std::string("1"));
    // The same by way of another field.
    click(1, 1);
    QTest::keyClicks(editor(), "y");
    other_->setFocus(Qt::MouseFocusReason);
    QTRY_VERIFY(editor() != nullptr && editor()->hasFocus());
    other_->setFocus(Qt::MouseFocusReason);
    QCoreApplication::processEvents();
    QVERIFY(other_->hasFocus());
    QTRY_VERIFY(editor() == nullptr);
  }

  void theCurrentRowIsTold() {
    FreeGrid grid({{"A", 60, {.readOnly = true}}, {"B", 60, {.readOnly = true}}}, 3);
    const auto shown = show(grid);
    grid.currentRows.clear();
    int edits = 0;
    connect(view_, &GridView::edited, this, [&edits] { ++edits; });
    click(2, 1);
    click(2, 2);
    click(3, 2);
    QCOMPARE(grid.currentRows, (std::vector<int>{2, 3}));
    QCOMPARE(edits, 2);
    grid.setRows(1);
    view_->cells().refresh();
    QCOMPARE(grid.currentRows.back(), 1);
    grid.setRows(0);
    view_->cells().refresh();
    QCOMPARE(grid.currentRows.back(), 0);
  }

  void theGridMaySayWhichRowIsCurrent() {
    class Grid final : public FreeGrid {
     public:
      using FreeGrid::FreeGrid;
      std::optional<int> CurrentRow() override { return current; }
      void OnCurrentRow(int row) override { current = row; }
      int current = 0;
    };
    Grid grid({{"A", 60, {.value = "1"}}}, 3);
    const auto shown = show(grid);
    click(2, 1);
    QCOMPARE(grid.current, 2);
    QVERIFY(editor() != nullptr);
    grid.current = 0;
    view_->cells().refresh();
    QVERIFY(!view_->currentIndex().isValid());
    QVERIFY(editor() == nullptr);
    QCOMPARE(grid.current, 0);
    click(2, 1);
    QCOMPARE(grid.current, 2);
    grid.current = 3;
    view_->cells().refresh();
    QCOMPARE(view_->currentIndex(), at(3, 1));
    QCOMPARE(grid.current, 3);
  }

  void aColumnComesAndGoes() {
    class Grid final : public FreeGrid {
     public:
      using FreeGrid::FreeGrid;
      int GetColWidth(int col) override { return col == 2 ? width : FreeGrid::GetColWidth(col); }
      int width = 0;
    };
    Grid grid({{"A", 60, {.value = "1"}}, {"B", 60, {.value = "2"}}}, 3);
    const auto shown = show(grid);
    QVERIFY(view_->isColumnHidden(1));
    grid.width = 60;
    view_->cells().refresh();
    QVERIFY(!view_->isColumnHidden(1));
    QVERIFY(view_->columnWidth(1) > 0);
    grid.width = 0;
    view_->cells().refresh();
    QVERIFY(view_->isColumnHidden(1));
  }

  void aRefreshLeavesCursorSelectionAndScroll() {
    FreeGrid grid({{"A", 60, {.value = "1", .readOnly = true}}, {"B", 60, {.value = "2"}}}, 100);
    const auto shown = show(grid, {400, 300});
    view_->verticalScrollBar()->setValue(400);
    const int scrolled = view_->verticalScrollBar()->value();
    QVERIFY(scrolled > 0);
    view_->selectionModel()->setCurrentIndex(at(30, 1), QItemSelectionModel::NoUpdate);
    view_->selectionModel()->select(QItemSelection(at(20, 1), at(22, 1)),
                                    QItemSelectionModel::ClearAndSelect);
    view_->verticalScrollBar()->setValue(scrolled);
    grid.setRows(120);
    view_->cells().refresh();
    QCoreApplication::processEvents();
    QCOMPARE(view_->currentIndex(), at(30, 1));
    QCOMPARE(view_->selectionModel()->selectedIndexes().size(), 3);
    QCOMPARE(view_->verticalScrollBar()->value(), scrolled);
    grid.setRows(90);
    view_->cells().refresh();
    QCoreApplication::processEvents();
    QCOMPARE(view_->currentIndex(), at(30, 1));
    QCOMPARE(view_->verticalScrollBar()->value(), scrolled);
    // What is typed in a cell stays, too.
    click(20, 2);
    QTest::keyClicks(editor(), "123");
    view_->cells().refresh();
    QCOMPARE(editor()->text(), QString("123"));
  }

  void onlyPaintedCellsAreAskedFor() {
    FreeGrid grid({{"A", 60, {.value = "1"}}, {"B", 160, {.value = "2"}}}, 1000);
    const auto shown = show(grid, {400, 300});
    QCoreApplication::processEvents();
    const int rows = view_->rowAt(view_->viewport()->height() - 1) + 1;
    QVERIFY(rows > 0 && rows < 30);
    // A few more rows tell how wide the columns are to be.
    QVERIFY2(grid.lastAsked <= 12, qPrintable(QString::number(grid.lastAsked)));
    grid.lastAsked = 0;
    grid.asked = 0;
    view_->cells().refresh();
    view_->viewport()->grab();
    QVERIFY2(grid.asked < 40 * rows, qPrintable(QString::number(grid.asked)));
    QVERIFY(grid.lastAsked <= rows + 1);
  }

  void aGridThatDoesNotApplyTakesNothing() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    const QColor usual = ground(1, 1);
    grid.enabled = false;
    view_->cells().refresh();
    QCOMPARE(ground(1, 1), ground(3, 1));
    QVERIFY(ground(1, 1) != usual);
    click(1, 1);
    QVERIFY(editor() == nullptr);
    click(1, GridOfAllKinds::kOn);
    click(1, GridOfAllKinds::kView);
    QVERIFY(!view_->cells().setData(at(1, 1), "x", Qt::EditRole));
    QCOMPARE(grid.stores, 0);
    QVERIFY(grid.pressed.empty());
    QCOMPARE(view_->focusPolicy(), Qt::NoFocus);
    grid.enabled = true;
    view_->cells().refresh();
    click(1, 1);
    QVERIFY(editor() != nullptr);
  }

  void kindsOfCellsAreToldApart() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    for (const auto appearance : {Appearance::dark, Appearance::light}) {
      setAppearance(appearance);
      view_->clearSelection();
      QVERIFY(ground(1, 1) != ground(2, 1) && ground(2, 1) != ground(3, 1) && ground(1, 1) != ground(3, 1));
    }
    QVERIFY(!view_->cells().flags(at(2, 1)).testFlag(Qt::ItemIsEditable));
    QVERIFY(view_->cells().flags(at(2, 1)).testFlag(Qt::ItemIsEnabled));
    QVERIFY(!view_->cells().flags(at(3, 1)).testFlag(Qt::ItemIsEnabled));
  }

  void checkBoxesAreSetByClickAndSpace() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    click(1, GridOfAllKinds::kOn);
    QCOMPARE(grid.at(1, GridOfAllKinds::kOn).value, std::string("0"));
    QVERIFY(editor() == nullptr);
    key(Qt::Key_Space);
    QCOMPARE(grid.at(1, GridOfAllKinds::kOn).value, std::string("1"));
    click(2, GridOfAllKinds::kOn);
    click(3, GridOfAllKinds::kOn);
    QCOMPARE(grid.at(2, GridOfAllKinds::kOn).value, std::string("1"));
    QCOMPARE(grid.at(3, GridOfAllKinds::kOn).value, std::string("1"));
  }

  void buttonsArePressedByClickAndKey() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    click(1, GridOfAllKinds::kView);
    key(Qt::Key_Space);
    key(Qt::Key_Return);
    click(3, GridOfAllKinds::kView);
    const std::pair<int, int> first{1, GridOfAllKinds::kView};
    QCOMPARE(grid.pressed, (std::vector<std::pair<int, int>>{first, first, first}));
  }

  void multipleChoicesAreMarkedInAList() {
    GridOfAllKinds grid;
    constexpr int kItems = GridOfAllKinds::kItems;
    grid.at(1, kItems).value = "5";
    const auto shown = show(grid);
    QCOMPARE(at(1, kItems).data().toString(), QString("Water level, Flux in K"));
    QCOMPARE(at(3, kItems).data().toString(), QString("None"));
    QCOMPARE(at(1, kItems).data(Qt::ToolTipRole).toString(), QString("Water level\nFlux in K"));
    click(1, kItems);
    auto* choice = view_->findChild<MultiChoiceEditor*>();
    QVERIFY(choice != nullptr && choice->list().isVisible());
    QCOMPARE(choice->list().count(), 5);
    QCOMPARE(choice->list().item(2)->checkState(), Qt::Checked);
    QTest::mouseClick(choice->list().viewport(), Qt::LeftButton, Qt::NoModifier,
                      choice->list().visualItemRect(choice->list().item(1)).center());
    QCOMPARE(choice->list().item(1)->checkState(), Qt::Checked);
    QTest::keyClick(&choice->list(), Qt::Key_Down);
    QTest::keyClick(&choice->list(), Qt::Key_Down);
    QTest::keyClick(&choice->list(), Qt::Key_Space);
    QTest::keyClick(&choice->list(), Qt::Key_Return);
    QCOMPARE(grid.at(1, kItems).value, std::string("15"));
    QCOMPARE(at(1, kItems).data().toString(), QString("4 of 5"));
    QTRY_VERIFY(view_->findChild<MultiChoiceEditor*>() == nullptr);
    QVERIFY(view_->hasFocus());
    // Esc leaves what there was.
    key(Qt::Key_Space);
    choice = view_->findChild<MultiChoiceEditor*>();
    QVERIFY(choice != nullptr);
    QTest::keyClick(&choice->list(), Qt::Key_Space);
    QTest::keyClick(&choice->list(), Qt::Key_Escape);
    QCOMPARE(grid.at(1, kItems).value, std::string("15"));
  }

  void titlesAndHeadersCoverColumns() {
    test::BandedGrid grid(2, 3);
    const auto shown = show(grid);
    QCOMPARE(view_->columnSpan(0, 4), 2);
    QCOMPARE(view_->columnSpan(1, 0), 6);
    QCOMPARE(view_->columnSpan(2, 0), 1);
    QVERIFY(view_->rowHeight(0) > view_->rowHeight(2));
    QVERIFY(!view_->cells().flags(at(1, 2)).testFlag(Qt::ItemIsEnabled));
    // The merged header is one: no line where its columns meet.
    const QImage header = view_->horizontalHeader()->viewport()->grab().toImage();
    const auto lineAt = [&](int column) {
      const double scale = header.devicePixelRatio();
      const int x = static_cast<int>(scale * view_->horizontalHeader()->sectionViewportPosition(column)) - 1;
      return header.pixelColor(x, 3) != header.pixelColor(x - 3, 3);
    };
    QVERIFY(lineAt(1) && !lineAt(2) && !lineAt(3) && lineAt(4));
    // A title that moves takes its columns with it.
    std::swap(grid.cells[1], grid.cells[2]);
    view_->cells().refresh();
    view_->viewport()->grab();
    QCOMPARE(view_->columnSpan(1, 0), 1);
    QCOMPARE(view_->columnSpan(2, 0), 6);
  }

  void columnsOfTextShareTheWidth() {
    FreeGrid grid({{"Value", 60, {.value = "1"}}, {"File name", 160}, {"Title", 120}}, 3);
    const auto shown = show(grid);
    QCOMPARE(view_->horizontalHeader()->length(), view_->viewport()->width());
    QVERIFY(view_->columnWidth(1) > 2 * view_->columnWidth(0));
    QVERIFY(view_->columnWidth(1) > view_->columnWidth(2));
    const int value = view_->columnWidth(0);
    window_->resize(1400, 500);
    QTRY_COMPARE(view_->horizontalHeader()->length(), view_->viewport()->width());
    QCOMPARE(view_->columnWidth(0), value);
  }

  void aGridOfNumbersStaysNarrow() {
    FreeGrid grid({{"J", 45, {.value = "1"}}, {"K", 45, {.value = "1"}}}, 3);
    const auto shown = show(grid);
    QVERIFY(view_->width() < 400);
  }

  void columnsAreAsWideAsWhatTheyHold() {
    FreeGrid grid({{"A", 20, {.value = "a text that is longer"}}, {"Longheaderword", 20}}, 2);
    const auto shown = show(grid);
    QVERIFY(view_->columnWidth(0) > view_->fontMetrics().horizontalAdvance("a text that is longer"));
    QVERIFY(view_->columnWidth(1) > view_->fontMetrics().horizontalAdvance("Longheaderword"));
  }

  void cellsAreCopiedAndPasted() {
    FreeGrid grid({{"A", 60, {.value = "1"}}, {"B", 60, {.value = "2"}}}, 2);
    const auto shown = show(grid);
    view_->setFocus();
    key(Qt::Key_Right);
    view_->selectAll();
    key(Qt::Key_C, Qt::ControlModifier);
    QCOMPARE(QApplication::clipboard()->text(), QString("1\t2\n1\t2"));
    QApplication::clipboard()->setText("7\t8\n9\t10");
    view_->selectionModel()->setCurrentIndex(at(1, 1), QItemSelectionModel::NoUpdate);
    key(Qt::Key_Escape);
    key(Qt::Key_V, Qt::ControlModifier);
    QCOMPARE(grid.at(2, 2).value, std::string("10"));
    QCOMPARE(grid.at(1, 1).value, std::string("7"));
  }

  // Typing in the cell of a projection searches all there are; its own list stays.
  void aProjectionIsSearchedInItsCell() {
    GridOfAllKinds grid;
    const auto shown = show(grid);
    const auto value = [&grid] {
      return QString::fromStdString(grid.at(1, GridOfAllKinds::kProjection).value);
    };
    const auto list = [this] {
      return qobject_cast<QComboBox*>(static_cast<CellDelegate*>(view_->itemDelegate())->editor());
    };
    const auto found = [&list] { return list()->findChild<ProjectionCompleter*>()->popup(); };
    // On this platform the window is not active again once a list has closed.
    const auto backToTheCell = [this] {
      view_->goToCell(0, GridOfAllKinds::kProjection - 1);
      window_->activateWindow();
      view_->setFocus();
      QVERIFY(QTest::qWaitForWindowActive(window_));
    };
    click(1, GridOfAllKinds::kProjection);
    QVERIFY(list() != nullptr && list()->view()->isVisible());
    QCOMPARE(list()->count(), 61);
    // While the list is open, too.
    typeKeys("mga 94 56");
    QVERIFY(!list()->view()->isVisible());
    QCOMPARE(list()->currentText(), QString("mga 94 56"));
    QVERIFY(found()->isVisible());
    pressKey(Qt::Key_Return);
    QTRY_VERIFY2(value().startsWith("PROJCS[\"GDA_1994_MGA_Zone_56\""), qPrintable(value()));
    QTRY_VERIFY(list() == nullptr);

    // A code that is typed and entered with the list closed; the arrows light another projection.
    backToTheCell();
    typeKeys("EPSG:32633");
    pressKey(Qt::Key_Escape);
    QVERIFY(!found()->isVisible());
    QCOMPARE(list()->currentText(), QString("EPSG:32633"));
    pressKey(Qt::Key_Return);
    QTRY_COMPARE(value(), QString("UTM-33"));
    QTRY_VERIFY(list() == nullptr);
    backToTheCell();
    typeKeys("WGS84 UTM 56");
    pressKey(Qt::Key_Down);
    pressKey(Qt::Key_Return);
    QTRY_VERIFY2(value().startsWith("PROJCS[\"WGS_1984_UTM_Zone_56S\""), qPrintable(value()));

    // What names none is refused, and Esc brings the value back.
    const QString before = value();
    backToTheCell();
    typeKeys("nowhere");
    QVERIFY(!found()->isVisible());
    pressKey(Qt::Key_Return);
    QTRY_VERIFY(list() != nullptr && editOf(list())->isRefused());
    QVERIFY(editOf(list())->toolTip().contains("\"nowhere\""));
    QCOMPARE(value(), before);
    pressKey(Qt::Key_Escape);
    QTRY_VERIFY(list() == nullptr);
    QCOMPARE(value(), before);
  }
};

}  // namespace gridbay::shell

QTEST_MAIN(gridbay::shell::GridViewTest)

#include "grid_view_test.moc"
