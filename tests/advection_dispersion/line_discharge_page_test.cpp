#include "advection_dispersion/line_discharge_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_line_discharge_page_test {

class AdLineDischargePage : public test::ShapeTest {
 protected:
  AdLineDischargePage() {
    root().bathymetry->GetArea(1)->noJ = 12;
    root().bathymetry->GetArea(1)->noK = 10;
    root().nadComponent->SetCount(2);
    root().nadComponent->at(1).name = "Salt";
    list.SetCount(1);
    PageTest::open("CNadLineDischargeDlg");
  }
  LineOrBox& line() { return *list.GetItem(1); }
  CNadLineDischargeKvs& list = *root().nadLineDischarge;
  test::TemporaryFolder folder;
};

TEST_F(AdLineDischargePage, ARowForEachLine) {
  EXPECT_EQ(labels(), (Labels{"Number of Lines", "Output Size", "Lines"}));
  EXPECT_EQ(headers(),
            (Labels{"", "Area", "", "First", "Last", "Period", "File name", "...", "", "Title", ""}));
  using Row = std::vector<std::string>;
  EXPECT_EQ(rowOf(grid("Lines"), 1),
            (Row{"1", "...", "(0,0)", "(11,9)", "0-100", "", "...", "View...", "", "Items..."}));
  EXPECT_EQ(usableOf(grid("Lines"), 1), "xxxxxxx.xx");
  EXPECT_EQ(page->pageId(), PageId::adLineDischarge);
  EXPECT_EQ(page->templateId(), 18731);
}

TEST_F(AdLineDischargePage, UpToTenLines) {
  edit("Number of Lines", "10");
  EXPECT_EQ(list.GetCount(), 10);
  spin("Number of Lines", 1);
  edit("Number of Lines", "11");
  EXPECT_EQ(list.GetCount(), 10);
  edit("Number of Lines", "1");
  spin("Number of Lines", -1);
  EXPECT_EQ(list.GetCount(), 0);
  EXPECT_EQ(grid("Lines").GetRowCount(), 0);
  EXPECT_EQ(text("Output Size"), "0.00 MB");
}

TEST_F(AdLineDischargePage, EditsReachTheModelAndTheSize) {
  EXPECT_EQ(store(1, 1, "3"), 1);
  EXPECT_EQ(line().areaNumber, 3);
  EXPECT_EQ(store(1, 3, "(2,3)"), 1);
  EXPECT_EQ(line().first, (GridPoint{2, 3}));
  EXPECT_EQ(store(1, 4, "7,8"), 1);
  EXPECT_EQ(line().last, (GridPoint{7, 8}));
  EXPECT_EQ(store(1, 4, "7"), 0);
  EXPECT_EQ(store(1, 5, "0-30000000"), 1);
  EXPECT_EQ(line().steps, (USubLine{0, 30000000, 1}));
  EXPECT_EQ(text("Output Size"), "15.26 MB");
  EXPECT_EQ(store(1, 6, "l.tsb0"), 1);
  EXPECT_EQ(line().file.text(), "l.tsb0");
  EXPECT_EQ(store(1, 9, "north"), 1);
  EXPECT_EQ(line().title, "north");
}

TEST_F(AdLineDischargePage, TheFile) {
  host.chosenFile = folder.write("l.tsb0", "");
  grid("Lines").OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(line().file.text(), *host.chosenFile);
  EXPECT_EQ(host.extensions, Labels{"tsb0"});
  grid("Lines").OnClickedButtonRowCol(1, 8);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

TEST_F(AdLineDischargePage, PlaceAndPeriodInADialog) {
  host.fillForm = [](Form& form) {
    Labels labels;
    for (const Control& control : form.controls()) labels.push_back(control.label);
    EXPECT_EQ(labels, (Labels{"First point:", "J", "K", "Last point:", "J", "K", "Calculation Period",
                              "First time step:", "Last time step:"}));
    form.controls()[1].text = "4";
    form.controls()[5].text = "5";
    form.find("Last time step:")->text = "50";
    return true;
  };
  grid("Lines").OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.titles, Labels{"Line for Discharge Calculations"});
  EXPECT_EQ(line().first, (GridPoint{4, 0}));
  EXPECT_EQ(line().last, (GridPoint{11, 5}));
  EXPECT_EQ(line().steps, (USubLine{0, 50, 1}));
  EXPECT_TRUE(document.IsModified());
  host.fillForm = [](Form& form) {
    form.controls()[1].text = "9";
    return false;
  };
  grid("Lines").OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(line().first, (GridPoint{4, 0}));
}

TEST_F(AdLineDischargePage, ItemsInADialog) {
  host.fillForm = [this](Form& form) {
    EXPECT_EQ(form.find("Items for:")->text, "Line 1");
    CV27SetupGridWnd& items = *form.find("Items")->grid;
    EXPECT_EQ(rowOf(items, 1), (Labels{"Salt", "1"}));
    EXPECT_EQ(rowOf(items, 2), (Labels{"Component 2", "1"}));
    EXPECT_EQ(usableOf(items, 1), ".x");
    EXPECT_EQ(items.StoreStyleRowCol(1, 2, "0"), 1);
    return true;
  };
  grid("Lines").OnClickedButtonRowCol(1, 10);
  EXPECT_EQ(host.titles, Labels{"Items Selection"});
  EXPECT_EQ(line().entries, (EntryFlags{0, 1}));
  host.fillForm = [](Form& form) {
    form.find("Items")->grid->StoreStyleRowCol(2, 2, "0");
    return false;
  };
  grid("Lines").OnClickedButtonRowCol(1, 10);
  EXPECT_EQ(line().entries, (EntryFlags{0, 1}));
}

}  // namespace advection_dispersion_line_discharge_page_test
}  // namespace gridbay
