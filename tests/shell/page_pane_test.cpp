// The renderer of pages: forms of the tests' own, with real widgets, key presses and clicks.

#include "shell/page_pane.h"

#include <QAccessible>
#include <QApplication>
#include <QCalendarWidget>
#include <QCheckBox>
#include <QComboBox>
#include <QGroupBox>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollBar>
#include <QTest>
#include <QToolButton>
#include <QTreeWidget>
#include <QVBoxLayout>
#include <QWheelEvent>

#include "shell/appearance.h"
#include "shell/fields/value_edit.h"
#include "shell/grid_view.h"
#include "shell/projection_search.h"
#include "tests/shell/real_keys.h"
#include "tests/shell/test_forms.h"

namespace gridbay::shell {

using test::checked;
using test::FreeGrid;

class PagePaneTest : public QObject {
  Q_OBJECT

 private:
  QWidget* window_ = nullptr;
  PagePane* pane_ = nullptr;

  // The window goes before the form and the grids that it shows.
  struct WindowEnd {
    void operator()(PagePaneTest* test) const { delete std::exchange(test->window_, nullptr); }
  };
  using Shown = std::unique_ptr<PagePaneTest, WindowEnd>;

  Shown show(Form& form, QSize size = {900, 600}) {
    form.show({});
    window_->resize(size);
    pane_->showForm("Page", form);
    window_->show();
    window_->activateWindow();
    if (!QTest::qWaitForWindowActive(window_)) qFatal("the window is not active");
    QCoreApplication::processEvents();
    return Shown(this);
  }
  template <class Widget = QLineEdit>
  Widget* input(const char* label, int n = 1) {
    return qobject_cast<Widget*>(pane_->widgetOf(label, n));
  }
  // Where a widget stands in the pane.
  QRect at(const QWidget* widget) { return {widget->mapTo(pane_->widget(), QPoint(0, 0)), widget->size()}; }
  QRect at(const char* label, int n = 1) { return at(pane_->widgetOf(label, n)); }
  QLabel* text(const QString& shown) {
    for (auto* label : pane_->findChildren<QLabel*>()) {
      if (label->text().remove('&') == shown && label->isVisible()) return label;
    }
    return nullptr;
  }
  void type(QLineEdit* edit, const QString& typed) {
    QTest::mouseClick(edit, Qt::LeftButton);
    edit->selectAll();
    QTest::keyClicks(edit, typed);
  }

  double a_ = 1;
  double b_ = 2;
  double c_ = 3;
  std::int32_t count_ = 5;
  std::int32_t flag_ = 0;
  std::string name_ = "long.tsb2";

 private slots:
  void init() {
    a_ = 1, b_ = 2, c_ = 3, count_ = 5, flag_ = 0, name_ = "long.tsb2";
    window_ = new QWidget();
    auto* layout = new QVBoxLayout(window_);
    layout->setContentsMargins(0, 0, 0, 0);
    pane_ = new PagePane(window_);
    layout->addWidget(pane_);
  }
  void cleanup() { delete window_; }

  void framesHoldTheirControls() {
    Form form;
    form.Group("Outer", [&] {
      form.DDX_VDedit("A:", a_, 0);
      form.Group("Inner", [&] { form.DDX_VDedit("B:", b_, 0); });
    });
    form.Group("Right", [&] { form.DDX_VDedit("C:", c_, 0); }).Beside();
    const auto shown = show(form);
    auto* outer = input<QGroupBox>("Outer");
    auto* inner = input<QGroupBox>("Inner");
    QVERIFY(outer != nullptr && inner != nullptr);
    QCOMPARE(outer->title(), QString("Outer"));
    QVERIFY(outer->isAncestorOf(input("A:")) && outer->isAncestorOf(inner) &&
            inner->isAncestorOf(input("B:")));
    QVERIFY(!outer->isAncestorOf(input("C:")));
    QVERIFY(at("Right").left() > at("Outer").right());
    QCOMPARE(at("Right").top(), at("Outer").top());
    QCOMPARE(at("Right").height(), at("Outer").height());
    QVERIFY(at("Outer").contains(at("Inner")) && at("Inner").contains(at("B:")));
  }

  void framesBelowEachOtherAreAsWide() {
    Form form;
    form.Group("Narrow", [&] { form.DDX_VDedit("A:", a_, 0); });
    form.Group("Wide", [&] { form.DDX_VDedit("A longer label in front:", b_, 0); });
    const auto shown = show(form);
    QCOMPARE(at("Narrow").width(), at("Wide").width());
    QVERIFY(at("Wide").width() < 600);
  }

  void labelsStandInAColumn() {
    Form form;
    form.DDX_VDedit("Short:", a_, 0);
    form.DDX_VDedit("A much longer label:", b_, 0);
    form.DDX_Text("File:", name_);
    const auto shown = show(form);
    QCOMPARE(at("Short:").left(), at("A much longer label:").left());
    QCOMPARE(at("File:").left(), at("Short:").left());
    QCOMPARE(at(text("Short:")).left(), at(text("File:")).left());
    QVERIFY(at(text("A much longer label:")).right() < at("Short:").left());
  }

  void shortFieldsStayShortAndTextsStretch() {
    Form form;
    form.DDX_VDedit("Depth:", a_, 100280);
    form.DDX_Text("File:", name_).isFile = true;
    form.Button("...", [] {}).Beside();
    form.Button("View...", [] {}).Beside();
    const auto shown = show(form);
    const int number = at("Depth:").width();
    const int letter = input("Depth:")->fontMetrics().horizontalAdvance('0');
    QVERIFY(number >= 10 * letter && number <= 16 * letter);
    QVERIFY(at("File:").width() > 500);
    QCOMPARE(at("...").center().y(), at("File:").center().y());
    QVERIFY(at("File:").right() < at("...").left() && at("...").right() < at("View...").left());
    QVERIFY(at("View...").right() > 860);
    window_->resize(1300, 600);
    QTRY_VERIFY(at("File:").width() > 900);
    QCOMPARE(at("Depth:").width(), number);
    // The unit stands behind the number, and is in its name.
    const QLabel* unit = text("m");
    QVERIFY(unit != nullptr);
    QVERIFY(at(unit).left() > at("Depth:").right() && at(unit).left() < at("Depth:").right() + 20);
    QCOMPARE(input("Depth:")->accessibleName(), QString("Depth, m"));
  }

  void aListIsAsWideAsItsTexts() {
    std::int32_t choice = 0;
    Form form;
    form.DDX_CBIndex("Given as:", {"Constant", "File"}, choice);
    const auto shown = show(form);
    QVERIFY(at("Given as:").width() < 200);
  }

  void aPageThatIsTooHighScrolls() {
    Form form;
    std::deque<double> values(60, 1.5);
    for (double& value : values) form.DDX_VDedit("Value:", value, 0);
    const auto shown = show(form, {500, 300});
    QVERIFY(pane_->verticalScrollBar()->maximum() > 500);
    QCOMPARE(at("Value:", 60).left(), at("Value:", 1).left());
    QVERIFY(at("Value:", 60).top() > at("Value:", 59).bottom());
  }

  void tabFollowsTheOrderOfTheControls() {
    std::int32_t choice = 0;
    std::int32_t radio = 0;
    Form form;
    form.Group("Left", [&] {
      form.DDX_VDedit("A:", a_, 0);
      form.DDX_Text("N:", count_).Spin(0, 9, [](int) {});
    });
    form.Group("Right",
               [&] {
                 form.DDX_CBIndex("List:", {"x", "y"}, choice);
                 form.DDX_Radio("Radio", {"One", "Two"}, radio);
               })
        .Beside();
    form.DDX_Text("File:", name_);
    form.Button("...", [] {}).Beside();
    const auto shown = show(form);
    input("A:")->setFocus();
    QTest::keyClick(input("A:"), Qt::Key_Tab);
    QVERIFY(input("N:")->hasFocus());
    QTest::keyClick(input("N:"), Qt::Key_Tab);
    QVERIFY(input<QComboBox>("List:")->hasFocus());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QVERIFY(input<QWidget>("Radio")->isAncestorOf(QApplication::focusWidget()));
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QVERIFY(input("File:")->hasFocus());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QVERIFY(input<QPushButton>("...")->hasFocus());
  }

  void aWrongTextIsMarkedAndExplained() {
    Form form;
    checked(form.DDX_VDedit("Depth:", a_, 0));
    checked(form.DDX_VDedit("Width:", b_, 0));
    const auto shown = show(form);
    type(input("Depth:"), "deep");
    QTest::keyClick(input("Depth:"), Qt::Key_Return);
    QCOMPARE(input("Depth:")->text(), QString("deep"));
    QVERIFY(input("Depth:")->hasFocus());
    const QString why = "Depth: \"deep\" is not a number";
    const QLabel* line = text(why);
    QVERIFY(line != nullptr);
    QVERIFY(at(line).top() >= at("Depth:").bottom() && at(line).bottom() <= at("Width:").top());
    QCOMPARE(input("Depth:")->accessibleDescription(), why);
    QCOMPARE(input("Depth:")->toolTip(), why);
    QVERIFY(static_cast<ValueEdit*>(input("Depth:"))->fault() == why);
    // The edge is seen to be another.
    const QImage wrong = input("Depth:")->grab().toImage();
    type(input("Depth:"), "2.5");
    QTest::keyClick(input("Depth:"), Qt::Key_Return);
    QVERIFY(text(why) == nullptr);
    QCOMPARE(input("Depth:")->accessibleDescription(), QString());
    QVERIFY(wrong.pixelColor(1, wrong.height() / 2) !=
            input("Depth:")->grab().toImage().pixelColor(1, wrong.height() / 2));
  }

  void tabStaysOnceAtAWrongText() {
    Form form;
    checked(form.DDX_VDedit("Depth:", a_, 0));
    checked(form.DDX_VDedit("Width:", b_, 0));
    const auto shown = show(form);
    type(input("Depth:"), "deep");
    QTest::keyClick(input("Depth:"), Qt::Key_Tab);
    QVERIFY(input("Depth:")->hasFocus());
    // What is typed next goes to where the user is.
    QTest::keyClicks(QApplication::focusWidget(), "er");
    QCOMPARE(input("Depth:")->text(), QString("deeper"));
    QTest::keyClick(input("Depth:"), Qt::Key_Tab);
    QCoreApplication::processEvents();
    QVERIFY(input("Width:")->hasFocus());
    QCOMPARE(input("Depth:")->text(), QString("deeper"));
    QVERIFY(text("Depth: \"deeper\" is not a number") != nullptr);
  }

  void aClickElsewhereComesBackOnce() {
    Form form;
    checked(form.DDX_VDedit("Depth:", a_, 0));
    checked(form.DDX_VDedit("Width:", b_, 0));
    const auto shown = show(form);
    type(input("Depth:"), "deep");
    QTest::mouseClick(input("Width:"), Qt::LeftButton);
    QTRY_VERIFY(input("Depth:")->hasFocus());
    QCOMPARE(input("Depth:")->text(), QString("deep"));
    QTest::mouseClick(input("Width:"), Qt::LeftButton);
    QCoreApplication::processEvents();
    QVERIFY(input("Width:")->hasFocus());
    type(input("Width:"), "7");
    QTest::keyClick(input("Width:"), Qt::Key_Return);
    QCOMPARE(test::of(form, &b_).text, std::string("7"));
    QCOMPARE(input("Depth:")->text(), QString("deep"));
  }

  void outOfThePageTheUserMayGo() {
    auto* tree = new QTreeWidget(window_);
    window_->layout()->addWidget(tree);
    Form form;
    checked(form.DDX_VDedit("Depth:", a_, 0));
    const auto shown = show(form);
    type(input("Depth:"), "deep");
    tree->setFocus(Qt::MouseFocusReason);
    QCoreApplication::processEvents();
    QVERIFY(tree->hasFocus());
    QCOMPARE(test::of(form, &a_).text, std::string("deep"));
  }

  void escBringsTheValueBack() {
    Form form;
    checked(form.DDX_VDedit("Depth:", a_, 0));
    const auto shown = show(form);
    type(input("Depth:"), "deep");
    QTest::keyClick(input("Depth:"), Qt::Key_Return);
    QTest::keyClick(input("Depth:"), Qt::Key_Escape);
    QCOMPARE(input("Depth:")->text(), QString("1"));
    QCOMPARE(test::of(form, &a_).fault, std::string());
    type(input("Depth:"), "12");
    QTest::keyClick(input("Depth:"), Qt::Key_Escape);
    QCOMPARE(input("Depth:")->text(), QString("1"));
  }

  void aRefreshLeavesWhatIsTyped() {
    Form form;
    form.DDX_VDedit("Depth:", a_, 0);
    form.DDX_VDedit("Width:", b_, 0);
    const auto shown = show(form);
    type(input("Depth:"), "12345");
    QTest::keyClick(input("Depth:"), Qt::Key_Left);
    input("Depth:")->setSelection(1, 2);
    test::of(form, &b_).text = "9";
    pane_->refresh();
    QCOMPARE(input("Depth:")->text(), QString("12345"));
    QCOMPARE(input("Depth:")->selectedText(), QString("23"));
    QVERIFY(input("Depth:")->hasFocus());
    QCOMPARE(input("Width:")->text(), QString("9"));
    // What is typed and not entered counts when the page goes.
    pane_->clear();
    QCOMPARE(test::of(form, &a_).text, std::string("12345"));
  }

  void aRefreshLeavesTheScrollAndTheList() {
    Form form;
    std::deque<double> values(60, 1.5);
    std::int32_t choice = 1;
    form.DDX_CBIndex("List:", {"x", "y"}, choice);
    for (double& value : values) form.DDX_VDedit("Value:", value, 0);
    const auto shown = show(form, {500, 300});
    auto* list = input<QComboBox>("List:");
    list->setItemData(0, "kept");
    pane_->verticalScrollBar()->setValue(200);
    pane_->refresh();
    QCOMPARE(pane_->verticalScrollBar()->value(), 200);
    QCOMPARE(list->itemData(0).toString(), QString("kept"));
    test::of(form, &choice).choices = {"x", "y", "z"};
    test::of(form, &choice).index = 2;
    pane_->refresh();
    QCOMPARE(list->count(), 3);
    QCOMPARE(list->currentText(), QString("z"));
  }

  void aRefreshShowsWhatHasChanged() {
    std::int32_t radio = 0;
    Form form;
    Control& outer = form.Group("Outer", [&] {
      form.Group("Inner", [&] { form.DDX_VDedit("A:", a_, 100280); });
      form.DDX_VDedit("B:", b_, 0);
    });
    form.DDX_Radio("Radio", {"One", "Two"}, radio);
    form.DDX_Check("Flag", flag_);
    const auto shown = show(form);
    Control& a = test::of(form, &a_);
    a.label = "Depth of A:";
    a.unit = "ft";
    outer.label = "Sediment";
    test::of(form, &radio).choices = {"One", "Two", "Three"};
    test::of(form, &radio).choiceEnabled = {true, true, false};
    test::of(form, &radio).index = 1;
    test::of(form, &flag_).index = 1;
    test::of(form, &b_).enabled = false;
    pane_->refresh();
    QVERIFY(text("Depth of A:") != nullptr && text("A:") == nullptr && text("ft") != nullptr);
    QCOMPARE(input<QGroupBox>("Sediment")->title(), QString("Sediment"));
    QCOMPARE(pane_->findChildren<QRadioButton*>().size(), 3);
    QVERIFY(pane_->findChildren<QRadioButton*>()[1]->isChecked());
    QVERIFY(!pane_->findChildren<QRadioButton*>()[2]->isEnabled());
    QVERIFY(input<QCheckBox>("Flag")->isChecked());
    QVERIFY(!input("B:")->isEnabled());
    test::of(form, &radio).index = -1;
    pane_->refresh();
    for (const auto* button : pane_->findChildren<QRadioButton*>()) QVERIFY(!button->isChecked());

    // A frame whose controls are all hidden is hidden, and one that is hidden hides all in it.
    a.visible = false;
    pane_->refresh();
    QVERIFY(!input<QGroupBox>("Inner")->isVisible() && input("B:")->isVisible());
    a.visible = true;
    outer.visible = false;
    pane_->refresh();
    QVERIFY(!input("Depth of A:")->isVisible() && !input("B:")->isVisible());
    outer.visible = true;
    pane_->refresh();
    QVERIFY(input("Depth of A:")->isVisible() && input<QGroupBox>("Inner")->isVisible());
  }

  void readOnlyAndDisabledAreToldApart() {
    Form form;
    form.DDX_VDedit("A:", a_, 0);
    form.DDX_VDedit("B:", b_, 0).ReadOnly();
    form.DDX_VDedit("C:", c_, 0).enabled = false;
    const auto shown = show(form);
    const auto ground = [this](const char* label) {
      const QImage image = input(label)->grab().toImage();
      return image.pixelColor(image.width() - 8, image.height() / 2);
    };
    for (const auto appearance : {Appearance::light, Appearance::dark}) {
      setAppearance(appearance);
      QVERIFY(ground("A:") != ground("B:") && ground("B:") != ground("C:") && ground("A:") != ground("C:"));
    }
    setAppearance(Appearance::light);
  }

  void aCountIsStepped() {
    Form form;
    form.DDX_Text("Count:", count_).Spin(0, 9, [&](int delta) {
      test::of(form, &count_).text = std::to_string(std::stoi(test::of(form, &count_).text) + delta);
    });
    const auto shown = show(form);
    QLineEdit* edit = input("Count:");
    edit->setFocus();
    QTest::keyClick(edit, Qt::Key_Up);
    QCOMPARE(edit->text(), QString("6"));
    // A step goes on from what is typed.
    edit->selectAll();
    QTest::keyClicks(edit, "3");
    QTest::keyClick(edit, Qt::Key_Down);
    QCOMPARE(edit->text(), QString("2"));
    QTest::mouseClick(edit->findChild<QToolButton*>("up"), Qt::LeftButton);
    QCOMPARE(edit->text(), QString("3"));
    const auto wheel = [edit] {
      QWheelEvent event(QPointF(5, 5), edit->mapToGlobal(QPointF(5, 5)), {}, QPoint(0, 120), Qt::NoButton,
                        Qt::NoModifier, Qt::NoScrollPhase, false);
      QApplication::sendEvent(edit, &event);
    };
    wheel();
    QCOMPARE(edit->text(), QString("4"));
    edit->clearFocus();
    wheel();
    QCOMPARE(edit->text(), QString("4"));
  }

  void aDateIsTypedOrPicked() {
    std::string start = "2026-03-21 06:30:00";
    Form form;
    Control& date = form.DDX_Text("Start:", start);
    date.kind = ControlKind::dateTime;
    date.Changed([&] { date.fault = date.text.size() == 19 ? "" : "Start is no date"; });
    const auto shown = show(form);
    auto* edit = qobject_cast<DateTimeEdit*>(input("Start:"));
    QVERIFY(edit != nullptr);
    type(edit, "tomorrow");
    QTest::keyClick(edit, Qt::Key_Return);
    QCOMPARE(edit->text(), QString("tomorrow"));
    QVERIFY(text("Start is no date") != nullptr);
    type(edit, "2026-04-02 07:00:00");
    QTest::keyClick(edit, Qt::Key_Return);
    QCOMPARE(date.text, std::string("2026-04-02 07:00:00"));
    QTest::mouseClick(edit->findChild<QToolButton*>("calendar"), Qt::LeftButton);
    auto* calendar = edit->findChild<QCalendarWidget*>();
    QVERIFY(calendar != nullptr && calendar->isVisible());
    QCOMPARE(calendar->selectedDate(), QDate(2026, 4, 2));
    QTest::keyClick(calendar->findChild<QWidget*>("qt_calendar_calendarview"), Qt::Key_Right);
    QTest::keyClick(calendar->findChild<QWidget*>("qt_calendar_calendarview"), Qt::Key_Return);
    QCOMPARE(date.text, std::string("2026-04-03 07:00:00"));
    QCOMPARE(edit->text(), QString("2026-04-03 07:00:00"));
    QVERIFY(text("Start is no date") == nullptr);
  }

  void theWheelPassesListsBy() {
    std::int32_t choice = 0;
    Form form;
    form.DDX_VDedit("A:", a_, 0);
    form.DDX_CBIndex("List:", {"x", "y"}, choice);
    const auto shown = show(form);
    input("A:")->setFocus();
    auto* list = input<QComboBox>("List:");
    QWheelEvent event(QPointF(5, 5), list->mapToGlobal(QPointF(5, 5)), {}, QPoint(0, -120), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(list, &event);
    QCOMPARE(list->currentIndex(), 0);
  }

  void gridsTakeTheRoomTheyNeed() {
    FreeGrid few({{"Value", 60}}, 2);
    FreeGrid many({{"Value", 60}, {"File name", 160}}, 100);
    Form form;
    form.DDX_Control("Few", few);
    form.DDX_Control("Many", many);
    const auto shown = show(form);
    auto* first = input<GridView>("Few");
    auto* second = input<GridView>("Many");
    // All rows are seen where there is room; the rest of the page is for the one with more.
    QCOMPARE(first->verticalScrollBar()->maximum(), 0);
    QVERIFY(first->height() < 120);
    QVERIFY(second->height() > 350);
    QVERIFY(second->verticalScrollBar()->maximum() > 0);
    QCOMPARE(pane_->verticalScrollBar()->maximum(), 0);
    QVERIFY(at(second).bottom() > 560);
    QVERIFY(second->width() > 850);
    few.setRows(100);
    pane_->refresh();
    QTRY_VERIFY(std::abs(first->height() - second->height()) < 30);
    QCOMPARE(pane_->verticalScrollBar()->maximum(), 0);
    many.setRows(1);
    few.setRows(0);
    pane_->refresh();
    QTRY_VERIFY(second->height() < 100);
    QVERIFY(first->height() < 100);
  }

  void gridsStandSideBySide() {
    FreeGrid left({{"File name", 160}}, 3);
    FreeGrid right({{"File name", 160}}, 5);
    Form form;
    form.DDX_Control("Left", left);
    form.DDX_Control("Right", right).Beside();
    const auto shown = show(form);
    QCOMPARE(at("Left").top(), at("Right").top());
    QVERIFY(at("Left").right() < at("Right").left());
    QVERIFY(std::abs(at("Left").width() - at("Right").width()) < 4);
    QVERIFY(at("Right").right() > 860);
  }

  void aCellThatIsEditedRefreshesThePage() {
    FreeGrid grid({{"Value", 60}}, 1);
    Form form;
    form.DDX_Control("Grid", grid);
    form.DDX_VDedit("A:", a_, 0).ReadOnly();
    grid.accepts = [&](int, int, std::string_view text) {
      test::of(form, &a_).text = text;
      return true;
    };
    const auto shown = show(form);
    QVERIFY(input<GridView>("Grid")->cells().setData(input<GridView>("Grid")->cells().index(0, 0), "8",
                                                     Qt::EditRole));
    QCOMPARE(input("A:")->text(), QString("8"));
  }

  void aCellThatTakesItsOwnRowAway() {
    FreeGrid grid({{"Value", 60}, {"More", 60}}, 4);
    Form form;
    form.DDX_Control("Grid", grid);
    form.DDX_VDedit("A:", a_, 0);
    grid.accepts = [&](int, int, std::string_view) {
      grid.setRows(1);
      return false;
    };
    const auto shown = show(form);
    auto* view = input<GridView>("Grid");
    QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier,
                      view->visualRect(view->cells().index(3, 1)).center());
    QTest::keyClicks(QApplication::focusWidget(), "5");
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QCoreApplication::processEvents();
    QCOMPARE(view->cells().rowCount(), 1);
    QCOMPARE(grid.currentRows.back(), 1);
  }

  void aDialogIsAsLargeAsItsForm() {
    FreeGrid grid({{"Value", 60}, {"File name", 160}, {"Title", 160}}, 12);
    Form form;
    form.DDX_Control("Grid", grid);
    const auto shown = show(form);
    const QSize wanted = pane_->sizeHint();
    const QSize room = pane_->screen()->availableSize();
    QVERIFY(wanted.height() > std::min(300, room.height() / 2));
    QVERIFY(wanted.width() > std::min(400, room.width() / 2));
    grid.setRows(1000);
    pane_->refresh();
    QVERIFY(pane_->sizeHint().height() <= pane_->screen()->availableSize().height());
  }

  void aListOfProjectionsIsSearched() {
    Form form;
    std::int32_t place = 0;
    std::int32_t other = 0;
    form.DDX_CBIndex("Map projection:", {"UTM-32", "Local Coordinates", "UTM-1"}, place);
    form.DDX_CBIndex("Kind:", {"A", "B"}, other);
    const auto shown = show(form);
    auto* list = input<QComboBox>("Map projection:");
    QVERIFY(list->isEditable() && !input<QComboBox>("Kind:")->isEditable());
    QCOMPARE(list->count(), 3);
    auto* found = list->findChild<ProjectionCompleter*>()->popup();
    const auto& control = test::of(form, &place);
    const auto typeIn = [list](const QString& typed) {
      list->setFocus();
      list->lineEdit()->selectAll();
      typeKeys(typed);
    };
    typeIn("gda2020 mga 56");
    QVERIFY(found->isVisible());
    pressKey(Qt::Key_Return);
    QCOMPARE(control.index, 3);
    QVERIFY(QString::fromStdString(control.choices.back()).startsWith("PROJCS[\"GDA2020_MGA_Zone_56\""));
    // A full text is shown by its name.
    QCOMPARE(list->currentText(), QString("GDA2020 / MGA zone 56"));
    QCOMPARE(list->currentIndex(), 3);
    // A code that is typed, and one of the list's own.
    typeIn("32601");
    pressKey(Qt::Key_Escape);
    pressKey(Qt::Key_Return);
    QCOMPARE(control.index, 2);
    QCOMPARE(list->currentText(), QString("UTM-1"));
    // What names none stays with its reason, and the value too; Esc brings it back.
    typeIn("nowhere");
    pressKey(Qt::Key_Tab);
    QCOMPARE(control.index, 2);
    QCOMPARE(list->currentText(), QString("nowhere"));
    QVERIFY(text("\"nowhere\" is no projection that is known") != nullptr);
    QTRY_VERIFY(list->hasFocus());
    pressKey(Qt::Key_Escape);
    QCOMPARE(list->currentText(), QString("UTM-1"));
    QVERIFY(text("\"nowhere\" is no projection that is known") == nullptr);
    // By the list itself.
    list->setFocus();
    pressKey(Qt::Key_Up);
    QCOMPARE(control.index, 1);
    QCOMPARE(list->currentText(), QString("Local Coordinates"));
  }

  void aProjectionIsSearchedOrTyped() {
    ProjectionSearch search;
    search.setText("EPSG:28356");
    search.show();
    search.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&search));
    QStringList chosen;
    connect(&search, &ProjectionSearch::chosen, this, [&chosen](const QString& text) { chosen << text; });
    QVERIFY(search.isValid());
    QLineEdit& edit = search.edit();
    const auto typeIn = [&edit](const QString& typed) {
      edit.setFocus();
      edit.selectAll();
      typeKeys(typed);
    };
    QAbstractItemView* found = search.completer().popup();
    typeIn("utm 32");
    QVERIFY(found->isVisible());
    QCOMPARE(found->currentIndex().data().toString(), QString("WGS 84 / UTM zone 32N"));
    QCOMPARE(found->currentIndex().siblingAtColumn(1).data().toString(), QString("EPSG:32632"));
    QVERIFY(found->currentIndex().siblingAtColumn(2).data().toString().contains("Denmark"));
    QVERIFY(chosen.isEmpty());
    pressKey(Qt::Key_Return);
    QCOMPARE(chosen, QStringList{"UTM-32"});
    QCOMPARE(search.text(), QString("UTM-32"));
    QCOMPARE(edit.text(), QString("WGS 84 / UTM zone 32N"));
    // Typed and left.
    typeIn("28992");
    pressKey(Qt::Key_Escape);
    pressKey(Qt::Key_Return);
    QCOMPARE(chosen.size(), 2);
    QVERIFY(search.text().startsWith("PROJCS[") && search.isValid());
    QCOMPARE(edit.text(), QString("Amersfoort / RD New"));
    // By the mouse.
    typeIn("british national grid");
    QTest::mouseClick(found->viewport(), Qt::LeftButton, {},
                      found->visualRect(found->model()->index(0, 0)).center());
    QCOMPARE(chosen.size(), 3);
    QCOMPARE(edit.text(), QString("OSGB36 / British National Grid"));
    // What names none is told by what it is.
    typeIn("nowhere");
    pressKey(Qt::Key_Return);
    QCOMPARE(search.text(), QString("nowhere"));
    QVERIFY(!search.isValid());
    search.setText(QString());
    QVERIFY(!search.isValid() && edit.text().isEmpty());
  }

  // Pictures to look at, on request.
  void picturesAreTaken() {
    const QString folder = qEnvironmentVariable("GRIDBAY_PICTURES");
    if (folder.isEmpty()) QSKIP("GRIDBAY_PICTURES names no folder");
    test::ShowcaseForm showcase;
    test::BandedGrid banded(4, 3);
    Form grids;
    grids.DDX_Control("Banded", banded);
    FreeGrid numbers({{"J", 45, {.value = "12", .align = CellAlign::right}},
                      {"K", 45, {.value = "7", .align = CellAlign::right}}},
                     3);
    grids.DDX_Control("Numbers", numbers);
    const std::string at = qEnvironmentVariable("QT_SCALE_FACTOR", "1").toStdString();
    for (const auto& [name, appearance] :
         {std::pair{"light", Appearance::light}, std::pair{"dark", Appearance::dark}}) {
      setAppearance(appearance);
      const auto save = [&, named = name](const char* what) {
        QTest::qWait(50);
        window_->grab().save(QString("%1/%2-%3-%4.png").arg(folder, what, named, at.c_str()));
      };
      window_->resize(1000, 860);
      window_->show();
      pane_->showForm("Showcase", showcase.form);
      save("showcase");
      grids.show({});
      pane_->showForm("Grids", grids);
      save("grids");
      test::GridOfAllKinds kinds;
      kinds.accepts = [](int, int, std::string_view) { return false; };
      Form cells;
      cells.DDX_Control("Cells", kinds);
      std::string start = "2026-03-21 06:00:00";
      cells.DDX_Text("Start:", start).kind = ControlKind::dateTime;
      cells.show({});
      pane_->showForm("Cells", cells);
      window_->activateWindow();
      QTest::qWait(50);
      auto* view = input<GridView>("Cells");
      const auto click = [view](int col) {
        QTest::mouseClick(view->viewport(), Qt::LeftButton, Qt::NoModifier,
                          view->visualRect(view->cells().index(0, col - 1)).center());
      };
      click(test::GridOfAllKinds::kItems);
      QTest::qWait(50);
      const auto savePopup = [&, named = name](const char* what) {
        if (QWidget* popup = QApplication::activePopupWidget()) {
          popup->grab().save(QString("%1/%2-%3-%4.png").arg(folder, what, named, at.c_str()));
          popup->close();
        }
      };
      savePopup("choices");
      click(test::GridOfAllKinds::kType);
      QTest::qWait(50);
      savePopup("list");
      qobject_cast<DateTimeEdit*>(input("Start:"))->openCalendar();
      QTest::qWait(50);
      savePopup("calendar");
      click(1);
      QTest::keyClicks(QApplication::focusWidget(), "nowhere");
      QTest::keyClick(QApplication::focusWidget(), Qt::Key_Return);
      save("refused");
      pane_->clear();
    }
  }
};

}  // namespace gridbay::shell

QTEST_MAIN(gridbay::shell::PagePaneTest)

#include "page_pane_test.moc"
