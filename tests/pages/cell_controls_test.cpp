#include "pages/cell_controls.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <set>
#include <typeindex>

#include "pages/result_subset.h"
#include "platform/units/units.h"
#include "setup/dlg_enumerator.h"
#include "setup/page_factory.h"
#include "tests/support/cells.h"
#include "tests/support/pages.h"

namespace gridbay {
namespace pages_cell_controls_test {

using test::CellsOfAllKinds;
using test::OnePage;

class ChoosingHost final : public test::TestHost {
 public:
  bool chooseFile(std::string_view filter, std::string_view extension, std::string* name) override {
    asked = std::string(filter) + " " + std::string(extension) + " " + *name;
    if (choice.empty()) return false;
    *name = choice;
    return true;
  }
  std::string asked;
  std::string choice;
};

class Cells : public ::testing::Test {
 protected:
  Cells() { page.OnInitialUpdate(); }
  ChoosingHost host;
  CV27SetupDoc document{host};
  OnePage page{document};
};

TEST_F(Cells, CtrlDBrowsesForAResultFile) {
  host.choice = "results/depth";
  EXPECT_TRUE(page.cells.ProcessKeys(GridKey::browse, 1, CellsOfAllKinds::kResultFile));
  EXPECT_EQ(host.asked, "Maps (*.tsb2)|*.tsb2|| tsb2 old");
  EXPECT_EQ(page.cells.file, "results/depth.tsb2");
  EXPECT_TRUE(document.IsModified());
}

TEST_F(Cells, LeavingTheDialogKeepsTheName) {
  EXPECT_TRUE(page.cells.ProcessKeys(GridKey::browse, 1, CellsOfAllKinds::kResultFile));
  EXPECT_EQ(page.cells.file, "old");
  EXPECT_FALSE(document.IsModified());
}

TEST_F(Cells, OtherKeysAndCellsAreLeftAlone) {
  EXPECT_FALSE(page.cells.ProcessKeys(GridKey::other, 1, CellsOfAllKinds::kResultFile));
  EXPECT_FALSE(page.cells.ProcessKeys(GridKey::browse, 1, CellsOfAllKinds::kProjection));
  EXPECT_FALSE(page.cells.ProcessKeys(GridKey::browse, 2, CellsOfAllKinds::kResultFile));
  page.cells.enabled = false;
  EXPECT_FALSE(page.cells.ProcessKeys(GridKey::browse, 1, CellsOfAllKinds::kResultFile));
  EXPECT_EQ(host.asked, "");
}

TEST_F(Cells, TheExtensionIsAdjusted) {
  CVdGridResultFileEditCtrl control(host);
  control.SetDialogPara("", "tsb2");
  EXPECT_EQ(control.AdjustFileExtension("a"), "a.tsb2");
  EXPECT_EQ(control.AdjustFileExtension("a.tsb0"), "a.tsb2");
  EXPECT_EQ(control.AdjustFileExtension("a.b/c"), "a.b/c.tsb2");
  EXPECT_EQ(control.AdjustFileExtension("../c.d.e"), "../c.d.tsb2");
  EXPECT_EQ(control.AdjustFileExtension(".hidden"), ".hidden.tsb2");
  EXPECT_EQ(control.AdjustFileExtension(""), "");
}

TEST_F(Cells, AProjectionIsEditedFromItsList) {
  const std::vector<std::string> list = page.cells.OnStartEditing(1, CellsOfAllKinds::kProjection);
  ASSERT_EQ(list.size(), 61U);
  EXPECT_EQ(list[0], "UTM-40");
  EXPECT_EQ(list[1], "Local Coordinates");
  EXPECT_EQ(list[2], "UTM-1");
  page.cells.OnModifyCell("UTM-33");
  EXPECT_EQ(page.cells.OnEndEditing(1, CellsOfAllKinds::kProjection), 1);
  EXPECT_EQ(page.cells.projection, "UTM-33");
  EXPECT_TRUE(page.cells.OnStartEditing(1, CellsOfAllKinds::kCheckBox).empty());
}

TEST_F(Cells, AHiddenColumnStaysHidden) {
  EXPECT_TRUE(page.cells.OnTrackColWidth(CellsOfAllKinds::kCheckBox));
  EXPECT_FALSE(page.cells.OnTrackColWidth(CellsOfAllKinds::kHidden));
}

TEST_F(Cells, LongValuesHaveToolTips) {
  CellStyle style;
  page.cells.file = std::string(150, 'x');
  page.cells.GetStyleRowCol(1, CellsOfAllKinds::kResultFile, style);
  EXPECT_EQ(style.toolTip, "");
  CV27SetupDoc::EnableGXMultiToolTips(page.cells, CellsOfAllKinds::kResultFile);
  page.cells.GetStyleRowCol(1, CellsOfAllKinds::kResultFile, style);
  EXPECT_EQ(style.toolTip, std::string(100, 'x') + "\n" + std::string(50, 'x'));
  CV27SetupDoc::EnableMultiToolTips(page, "&Cells:", "What there is");
  EXPECT_EQ(page.form().find("&Cells:")->toolTip, "What there is");
  EXPECT_EQ(page.form().find("&Cells:")->name(), "Cells");
}

TEST_F(Cells, ARebuildGivesAndTakesNothing) {
  CellStyle style;
  page.cells.SetRebuilding(true);
  EXPECT_EQ(page.cells.GetStyleRowCol(1, 1, style), 0);
  EXPECT_EQ(page.cells.StoreStyleRowCol(1, 1, "new"), 0);
  page.cells.SetRebuilding(false);
  EXPECT_EQ(page.cells.GetStyleRowCol(1, 1, style), 1);
  EXPECT_EQ(page.cells.GetStyleRowCol(0, 1, style), 1);
  EXPECT_EQ(page.cells.StoreStyleRowCol(0, 1, "header"), 1);
  EXPECT_EQ(page.cells.file, "old");
}

// Grids of which the table names no class, or one class for two.
constexpr std::pair<std::string_view, int> kGridsBeyondTheTable[] = {
    {"CNmtExpMassBudgetDlg", 1}, {"CNmtExpResultDlg", 1},      {"CWQSADBoundaryDlg", 1},
    {"CWQSADDepositionDlg", 1},  {"CWQSStateVariablesDlg", 1},
};

TEST_F(Cells, EachPageHasTheGridsOfTheTable) {
  int pages = 0;
  for (const PageEntry& entry : CDlgEnumerator().pages()) {
    const std::unique_ptr<CV27SetupFormView> built = makePage(entry.pageClass, document);
    if (built == nullptr) continue;
    // A page may have two grids of a class.
    std::set<std::type_index> classes;
    for (const Control& control : built->form().controls()) {
      if (control.grid != nullptr) classes.insert(typeid(*control.grid));
    }
    auto named = entry.grids.empty() ? 0 : 1 + std::ranges::count(entry.grids, ',');
    for (const auto& [pageClass, more] : kGridsBeyondTheTable)
      named += pageClass == entry.pageClass ? more : 0;
    EXPECT_EQ(static_cast<std::ptrdiff_t>(classes.size()), named) << entry.pageClass;
    ++pages;
  }
  EXPECT_EQ(pages, 113);
}

TEST(FormTest, AnIntegerWithAUnitIsShownInItAndKeptInBaseUnits) {
  Form form;
  std::int32_t depth = 3;
  form.DDX_VdText("Depth:", depth, item::kFloodDepth);
  UnitChoices feet;
  feet.setSystem(UnitSystem::us);
  form.show(feet);
  EXPECT_EQ(form.find("Depth:")->text, "9.84252");
  EXPECT_EQ(form.store(feet), "");
  EXPECT_EQ(depth, 3);
  form.find("Depth:")->text = "100";
  EXPECT_EQ(form.store(feet), "");
  EXPECT_EQ(depth, 30);
  form.find("Depth:")->text = "1e300";
  EXPECT_EQ(form.store(feet), "");
  EXPECT_EQ(depth, 2147483647);
  form.find("Depth:")->text = "deep";
  EXPECT_EQ(form.store(feet), "Depth: \"deep\" is not a number");
  float real = 1;
  double wide = 1;
  form.DDX_VdText("Real:", real, item::kFloodDepth);
  form.DDX_VdText("Wide:", wide, item::kFloodDepth);
  form.show(feet);
  EXPECT_EQ(form.find("Real:")->text, form.find("Wide:")->text);
}

class ResultSubset : public ::testing::Test {
 protected:
  int run(const std::vector<std::string>& texts) {
    host.fillForm = [&texts](Form& form) {
      std::size_t n = 0;
      for (Control& control : form.controls()) {
        if (control.kind == ControlKind::text) control.text = texts[n++];
      }
      return true;
    };
    return dialog.DoModal(host);
  }
  test::TestHost host;
  CV27SetupResultSubsetDialog::Range range{0, 100, 1, 0, 80, 1, 0, 500, 10};
  CV27SetupResultSubsetDialog dialog{range, 120, 90, 999};
};

TEST_F(ResultSubset, OKCopiesTheNineIntegers) {
  EXPECT_EQ(run({"10", "120", "2", "5", "90", "3", "0", "999", "4"}), 1);
  EXPECT_EQ(dialog.range(), (CV27SetupResultSubsetDialog::Range{10, 120, 2, 5, 90, 3, 0, 999, 4}));
  USubArea area;
  USubLine steps;
  CV27SetupResultSubsetDialog::copyBack(dialog.range(), area, steps);
  EXPECT_EQ(area, (USubArea{{10, 120, 2}, {5, 90, 3}}));
  EXPECT_EQ(steps, (USubLine{0, 999, 4}));
  EXPECT_EQ(CV27SetupResultSubsetDialog::rangeOf(area, steps), dialog.range());
}

TEST_F(ResultSubset, CancelChangesNothing) {
  host.fillForm = [](Form& form) {
    form.controls()[1].text = "7";
    return false;
  };
  EXPECT_EQ(dialog.DoModal(host), 0);
  EXPECT_EQ(dialog.range(), range);
}

TEST_F(ResultSubset, WhatIsOutOfTheLimitsIsTold) {
  EXPECT_EQ(run({"0", "121", "1", "0", "90", "1", "0", "999", "1"}), 0);
  EXPECT_EQ(host.formFault, "X direction: 0 to 121 is not a part of 0 to 120");
  EXPECT_EQ(run({"0", "1", "1", "5", "4", "1", "0", "999", "1"}), 0);
  EXPECT_EQ(host.formFault, "Y direction: 5 to 4 is not a part of 0 to 90");
  EXPECT_EQ(run({"0", "1", "1", "0", "4", "1", "-1", "999", "1"}), 0);
  EXPECT_EQ(host.formFault, "Time steps: -1 to 999 is not a part of 0 to 999");
  EXPECT_EQ(run({"0", "1", "0", "0", "4", "1", "0", "999", "1"}), 0);
  EXPECT_EQ(host.formFault, "X direction: the interval 0 is below 1");
  EXPECT_EQ(run({"0", "x", "1", "0", "4", "1", "0", "999", "1"}), 0);
  EXPECT_EQ(host.formFault, "Last: \"x\" is not a number");
  EXPECT_EQ(dialog.range(), range);
}

}  // namespace pages_cell_controls_test
}  // namespace gridbay
