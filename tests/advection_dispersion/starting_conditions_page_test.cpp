#include "advection_dispersion/starting_conditions_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_starting_conditions_page_test {

class AdStartPage : public test::PageTest {
 protected:
  AdStartPage() { open("CNadStartingConditionsDlg"); }
  CNadStartingConditionsKvs& start() { return *root().nadStartingConditions; }
  test::TemporaryFolder folder;
};

TEST_F(AdStartPage, ControlsAndColumns) {
  EXPECT_EQ(labels(),
            (Labels{"Simulation Period", "Time step range:", "First:", "Last:", "Type", "Hot start files"}));
  EXPECT_EQ(page->templateId(), 18737);
  EXPECT_EQ(static_cast<int>(page->pageId()), 25);
  EXPECT_EQ(control("Type").choices, (Labels{"Cold start", "Hot start"}));
  EXPECT_EQ(control("Type").index, 0);
  EXPECT_EQ(text("First:"), "0");
  EXPECT_EQ(text("Last:"), "100");
  EXPECT_EQ(headers(), (Labels{"", "Hot Start File", "", ""}));
  EXPECT_EQ(widths(), (std::vector<int>{30, 230, 30, 45}));
  EXPECT_EQ(grid().GetRowCount(), 1);
  EXPECT_EQ(grid().GetRowHeader(1), "1");
  EXPECT_EQ(cell(1, 2), "...");
  EXPECT_EQ(cell(1, 3), "View...");
}

TEST_F(AdStartPage, TheTimeSteps) {
  edit("First:", "5");
  edit("Last:", "-1");
  EXPECT_EQ(start().firstStep, 5);
  EXPECT_EQ(start().lastStep, -1);
  edit("First:", "5.5");
  EXPECT_EQ(start().firstStep, 5);
  EXPECT_NE(control("First:").fault, "");
}

TEST_F(AdStartPage, ARowForEachArea) {
  root().bathymetry->SetNoAreas(3);
  page->SetData();
  EXPECT_EQ(grid().GetRowCount(), 3);
}

TEST_F(AdStartPage, TheTypeEnablesTheButtons) {
  start().GetItem(1)->file = folder.write("hot.tsb2", "");
  EXPECT_TRUE(style(1, 1).editable());
  EXPECT_FALSE(style(1, 2).enabled);
  EXPECT_FALSE(style(1, 3).enabled);
  choose("Type", 1);
  EXPECT_TRUE(start().hotStart);
  EXPECT_TRUE(document.IsModified());
  EXPECT_TRUE(style(1, 1).editable());
  EXPECT_TRUE(style(1, 2).enabled);
  EXPECT_TRUE(style(1, 3).enabled);
  EXPECT_EQ(store(1, 1, "  none.tsb2 "), 1);
  EXPECT_EQ(start().GetItem(1)->file.text(), "none.tsb2");
  EXPECT_TRUE(style(1, 2).enabled);
  EXPECT_FALSE(style(1, 3).enabled);
  choose("Type", 0);
  EXPECT_FALSE(start().hotStart);
  EXPECT_FALSE(style(1, 2).enabled);
}

TEST_F(AdStartPage, AFileIsChosenAndViewed) {
  choose("Type", 1);
  host.chosenFile = folder.write("hot.tsb2", "");
  document.SetModifiedFlag(false);
  grid().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters, Labels{"HotStart files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(start().GetItem(1)->file.text(), *host.chosenFile);
  EXPECT_TRUE(document.IsModified());
  grid().OnClickedButtonRowCol(1, 3);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  host.chosenFile.reset();
  grid().OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters.size(), 2U);
  EXPECT_NE(start().GetItem(1)->file.text(), "");
}

TEST_F(AdStartPage, TheComponentsAreThenReadOnly) {
  choose("Type", 1);
  open("CNadComponentDlg");
  EXPECT_TRUE(style(1, 1).readOnly);
  EXPECT_FALSE(control("Number of Components").enabled);
}

TEST_F(AdStartPage, TheTypeCanBeTakenBack) {
  choose("Type", 1);
  EXPECT_EQ(document.UndoStep()->name, "Type");
  document.Undo();
  EXPECT_EQ(control("Type").index, 0);
  EXPECT_FALSE(start().hotStart);
}

}  // namespace advection_dispersion_starting_conditions_page_test
}  // namespace gridbay
