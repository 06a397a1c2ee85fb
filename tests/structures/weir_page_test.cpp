#include "structures/weir_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "structures/weir.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace structures_weir_page_test {

using ::testing::ElementsAre;
using ::testing::HasSubstr;

class WeirPage : public test::ShapeTest {
 protected:
  WeirPage() {
    root().nhdWeir->SetCount(2);
    root().nhdWeir->at(2).coordinateType = "UTM-32";
    PageTest::open("CNHdWeirDlg");
  }
  CV27SetupGridWnd& place() { return grid("Weirs"); }
  CV27SetupGridWnd& data() { return grid("Weir data"); }
  CNhdWeirObjectKvs& weir() { return root().nhdWeir->at(2); }
  static constexpr int kRow = 3;  // of the second weir
  static std::vector<int> widthsOf(CV27SetupGridWnd& grid) {
    std::vector<int> all;
    for (int col = 0; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColWidth(col));
    return all;
  }
  static Labels headersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int col = 1; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColHeader(col));
    return all;
  }
};

TEST_F(WeirPage, ACountAndTwoGrids) {
  EXPECT_EQ(labels(), (Labels{"Number of weirs", "Weirs", "Weir data"}));
  EXPECT_EQ(text("Number of weirs"), "2");
  EXPECT_EQ(page->pageId(), PageId::weirs);
  EXPECT_EQ(page->templateId(), 18713);
  for (CV27SetupGridWnd* it : {&place(), &data()}) {
    EXPECT_EQ(it->GetRowCount(), 3);
    EXPECT_EQ(it->GetRowHeader(1), "");
    EXPECT_EQ(it->GetRowHeader(2), "1");
    EXPECT_EQ(it->GetRowHeader(3), "2");
    EXPECT_TRUE(styleIn(*it, 1, 1).isHeader);
  }
}

TEST_F(WeirPage, ColumnsOfPlaceTypeAndLosses) {
  EXPECT_EQ(headersOf(place()), (Labels{"Name", "Location", "Projection", "Type", "Valve", "Alpha zero",
                                        "Head  loss factors", "", "", "", "", ""}));
  EXPECT_EQ(rowOf(place(), 1), (Labels{"", "", "", "", "", "", "In flow+", "Out flow+", "Free flow+",
                                       "In flow-", "Out flow-", "Free flow-"}));
  EXPECT_EQ(place().GetHeaderSpan(6), 1);
  EXPECT_EQ(place().GetHeaderSpan(7), 6);
  EXPECT_EQ(place().GetHeaderSpan(12), 0);
  EXPECT_EQ(widthsOf(place()), (std::vector<int>{20, 90, 60, 90, 130, 120, 60, 65, 65, 65, 65, 65, 65}));
  EXPECT_EQ(rowOf(place(), kRow),
            (Labels{"Weir 2", "...", "UTM-32", "Broad crested weir", "None", "0.010000", "0.500000",
                    "1.000000", "1.000000", "0.500000", "1.000000", "1.000000"}));
  EXPECT_EQ(usableOf(place(), kRow), "xxxxxxxxxxxx");
  EXPECT_EQ(styleIn(place(), kRow, 4).choices,
            (Labels{"Broad crested weir", "Weir formula 1", "Weir formula 2 (Honma)"}));
  EXPECT_EQ(styleIn(place(), kRow, 5).choices,
            (Labels{"None", "Only negative flow", "Only positive flow", "No flow"}));
  EXPECT_EQ(styleIn(place(), kRow, 3).kind, CellKind::mapProjection);
  EXPECT_EQ(styleIn(place(), kRow, 3).toolTip, "UTM-32");
  EXPECT_EQ(styleIn(place(), kRow, 6).toolTip, "Water level [m]");
  EXPECT_EQ(styleIn(place(), kRow, 7).toolTip, "");
}

TEST_F(WeirPage, EachColumnOfPlaceTypeAndLossesIsStored) {
  const auto store = [this](int col, std::string_view text) {
    return place().StoreStyleRowCol(kRow, col, text);
  };
  EXPECT_EQ(store(1, "Old mill"), 1);
  EXPECT_EQ(weir().name, "Old mill");
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(store(4, "Weir formula 1"), 1);
  EXPECT_EQ(weir().type, 2);
  EXPECT_EQ(store(4, "Weir formula 2 (Honma)"), 1);
  EXPECT_EQ(weir().type, 3);
  EXPECT_EQ(store(4, "Broad crested weir"), 1);
  EXPECT_EQ(weir().type, 0);
  EXPECT_EQ(store(5, "Only positive flow"), 1);
  EXPECT_EQ(weir().valve, 2);
  EXPECT_EQ(store(5, "Both"), 0);
  EXPECT_EQ(store(6, "0.5"), 1);
  EXPECT_EQ(weir().alphaZero, 0.5);
  for (int n = 0; n < 6; ++n) {
    EXPECT_EQ(store(7 + n, std::to_string(n + 2)), 1);
    EXPECT_EQ(weir().headLoss[static_cast<std::size_t>(n)], n + 2);
  }
  EXPECT_EQ(store(12, "much"), 0);
  EXPECT_EQ(weir().headLoss[5], 7);
  EXPECT_EQ(root().nhdWeir->at(1).headLoss[0], 0.5);
}

TEST_F(WeirPage, AProjectionIsStoredAtTheEndOfItsEditing) {
  EXPECT_THAT(place().OnStartEditing(kRow, 3), ::testing::Contains("UTM-40"));
  place().OnModifyCell("UTM-33");
  EXPECT_EQ(weir().coordinateType, "UTM-32");
  EXPECT_EQ(place().OnEndEditing(kRow, 3), 1);
  EXPECT_EQ(weir().coordinateType, "UTM-33");
}

TEST_F(WeirPage, ALevelDifferenceIsInTheUsersUnit) {
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(styleIn(place(), kRow, 6).toolTip, "Water level [ft]");
  EXPECT_EQ(place().StoreStyleRowCol(kRow, 6, "10"), 1);
  EXPECT_DOUBLE_EQ(weir().alphaZero, 3.048);
  EXPECT_EQ(place().StoreStyleRowCol(kRow, 7, "10"), 1);
  EXPECT_EQ(weir().headLoss[0], 10);
}

TEST_F(WeirPage, ATypeThatIsNoneIsKeptUntilOneIsStored) {
  weir().type = 1;
  weir().valve = 9;
  EXPECT_EQ(textIn(place(), kRow, 4), "Broad crested weir");
  EXPECT_EQ(textIn(place(), kRow, 5), "");
  EXPECT_EQ(usableOf(data(), kRow), "..........");
  EXPECT_EQ(place().StoreStyleRowCol(kRow, 1, "A"), 1);
  EXPECT_EQ(weir().type, 1);
  EXPECT_EQ(weir().valve, 9);
  EXPECT_EQ(place().StoreStyleRowCol(kRow, 4, "Broad crested weir"), 1);
  EXPECT_EQ(weir().type, 0);
}

TEST_F(WeirPage, ColumnsOfTheParameters) {
  EXPECT_EQ(headersOf(data()), (Labels{"Broad crested weir", "", "Weir formula 1", "", "", "", "",
                                       "Weir formula 2 (Honma)", "", ""}));
  EXPECT_EQ(rowOf(data(), 1), (Labels{"Datum", "Geometry", "Width", "Height", "Weir coeff.", " Weir exp.",
                                      "Invert level", "Width", "Crest level", "Weir coeff."}));
  EXPECT_EQ((std::vector{data().GetHeaderSpan(1), data().GetHeaderSpan(3), data().GetHeaderSpan(8)}),
            (std::vector{2, 5, 3}));
  EXPECT_EQ(rowOf(data(), kRow), (Labels{"0.000000", "...", "1.000000", "1.000000", "1.838000", "1.500000",
                                         "1.000000", "1.000000", "1.000000", "1.838000"}));
  Labels tips;
  for (int col = 1; col <= 10; ++col) tips.push_back(styleIn(data(), kRow, col).toolTip);
  const std::string level = "Level [m]";
  const std::string chezy = "Chezy number [m^½/s]";
  EXPECT_EQ(tips, (Labels{level, "", level, level, chezy, "", level, level, level, chezy}));
}

TEST_F(WeirPage, TheTypeSaysWhichParametersCanBeEdited) {
  EXPECT_EQ(usableOf(data(), kRow), "xx........");
  place().StoreStyleRowCol(kRow, 4, "Weir formula 1");
  EXPECT_EQ(usableOf(data(), kRow), "..xxxxx...");
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 1, "3"), 0);
  place().StoreStyleRowCol(kRow, 4, "Weir formula 2 (Honma)");
  EXPECT_EQ(usableOf(data(), kRow), ".......xxx");
  EXPECT_EQ(usableOf(data(), 2), "xx........");
}

TEST_F(WeirPage, EachParameterIsStored) {
  using Weir = CNhdWeirObjectKvs;
  const auto stored = [this](int col, double Weir::*value) {
    EXPECT_EQ(data().StoreStyleRowCol(kRow, col, std::to_string(col + 10)), 1) << col;
    EXPECT_EQ(weir().*value, col + 10) << col;
  };
  stored(1, &Weir::datum);
  weir().type = Weir::kFormula1;
  stored(3, &Weir::width1);
  stored(4, &Weir::height1);
  stored(5, &Weir::coefficient1);
  stored(6, &Weir::exponent1);
  stored(7, &Weir::invertLevel1);
  weir().type = Weir::kFormula2;
  stored(8, &Weir::width2);
  stored(9, &Weir::crestLevel2);
  stored(10, &Weir::coefficient2);
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 9, "10"), 1);
  EXPECT_DOUBLE_EQ(weir().crestLevel2, 3.048);
}

TEST_F(WeirPage, PointsAreEditedInADialog) {
  weir().x = {1, 2};
  weir().y = {3, 4};
  document.RecordEdit(PageId::weirs, "before");
  host.fillForm = [](Form& form) {
    EXPECT_EQ(rowOf(*form.find("Points")->grid, 2), (Labels{"2.000000", "4.000000"}));
    form.find("Points")->grid->StoreStyleRowCol(1, 1, "9");
    return false;
  };
  place().OnClickedButtonRowCol(kRow, 2);
  EXPECT_THAT(weir().x, ElementsAre(1, 2));
  EXPECT_FALSE(document.IsModified());
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of points"), -1);
    form.find("Points")->grid->StoreStyleRowCol(1, 1, "9");
    return true;
  };
  place().OnClickedButtonRowCol(kRow, 2);
  EXPECT_EQ(host.titles, (Labels{"Point Selection", "Point Selection"}));
  EXPECT_THAT(weir().x, ElementsAre(9));
  EXPECT_THAT(weir().y, ElementsAre(3));
  EXPECT_TRUE(document.IsModified());
  document.Undo();
  EXPECT_THAT(weir().x, ElementsAre(1, 2));
}

TEST_F(WeirPage, TheTableIsEditedInADialogWhereTheTypeHasOne) {
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of measures"), 1);
    form.find("Measures")->grid->StoreStyleRowCol(1, 2, "4.5");
    return true;
  };
  data().OnClickedButtonRowCol(kRow, 2);
  EXPECT_EQ(host.titles, Labels{"Level-width"});
  EXPECT_THAT(weir().level, ElementsAre(0));
  EXPECT_THAT(weir().width, ElementsAre(4.5F));
  weir().type = CNhdWeirObjectKvs::kFormula1;
  data().OnClickedButtonRowCol(kRow, 2);
  EXPECT_EQ(host.titles.size(), 1U);
}

TEST_F(WeirPage, TheCountIsThatOfTheList) {
  edit("Number of weirs", "3");
  EXPECT_EQ(root().nhdWeir->GetCount(), 3);
  EXPECT_EQ(place().GetRowCount(), 4);
  EXPECT_EQ(data().GetRowCount(), 4);
  EXPECT_EQ(textIn(place(), 4, 1), "Weir 3");
  spin("Number of weirs", -1);
  EXPECT_EQ(root().nhdWeir->GetCount(), 2);
  edit("Number of weirs", "1001");
  EXPECT_EQ(root().nhdWeir->GetCount(), 2);
  edit("Number of weirs", "1000");
  spin("Number of weirs", 1);
  EXPECT_EQ(root().nhdWeir->GetCount(), 1000);
  edit("Number of weirs", "-1");
  EXPECT_EQ(root().nhdWeir->GetCount(), 0);
  EXPECT_EQ(text("Number of weirs"), "0");
  spin("Number of weirs", -1);
  EXPECT_EQ(root().nhdWeir->GetCount(), 0);
  EXPECT_EQ(place().GetRowCount(), 1);
  document.Undo();
  EXPECT_EQ(root().nhdWeir->GetCount(), 1000);
}

TEST_F(WeirPage, EditsHaveTheNameOfTheirColumn) {
  place().StoreStyleRowCol(kRow, 8, "0.25");
  EXPECT_EQ(document.UndoStep()->name, "Out flow+, row 2");
  place().StoreStyleRowCol(kRow, 1, "Mill");
  EXPECT_EQ(document.UndoStep()->name, "Name, row 2");
}

}  // namespace structures_weir_page_test
}  // namespace gridbay
