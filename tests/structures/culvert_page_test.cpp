#include "structures/culvert_page.h"

#include <gmock/gmock.h>

#include "structures/culvert.h"
#include "tests/support/shapes.h"

namespace gridbay {
namespace structures_culvert_page_test {

using ::testing::ElementsAre;

class CulvertPage : public test::ShapeTest {
 protected:
  CulvertPage() {
    root().nhdCulvert->SetCount(2);
    PageTest::open("CNHdCulvertDlg");
  }
  CV27SetupGridWnd& place() { return grid("Culverts"); }
  CV27SetupGridWnd& data() { return grid("Culvert data"); }
  CNhdCulvertObjectKvs& culvert() { return root().nhdCulvert->at(2); }
  static constexpr int kRow = 3;  // of the second culvert
  static Labels headersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int col = 1; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColHeader(col));
    return all;
  }
};

TEST_F(CulvertPage, ACountAndTwoGrids) {
  EXPECT_EQ(labels(), (Labels{"Number of culverts", "Culverts", "Culvert data"}));
  EXPECT_EQ(page->pageId(), PageId::culverts);
  EXPECT_EQ(page->templateId(), 18709);
  EXPECT_EQ(text("Number of culverts"), "2");
  EXPECT_EQ(place().GetRowCount(), 3);
  EXPECT_EQ(data().GetRowCount(), 3);
  EXPECT_TRUE(styleIn(data(), 1, 1).isHeader);
  edit("Number of culverts", "4");
  EXPECT_EQ(data().GetRowCount(), 5);
  edit("Number of culverts", "1001");
  EXPECT_EQ(root().nhdCulvert->GetCount(), 4);
  edit("Number of culverts", "-5");
  EXPECT_EQ(root().nhdCulvert->GetCount(), 0);
  EXPECT_EQ(place().GetRowCount(), 1);
}

TEST_F(CulvertPage, ColumnsOfPlaceAndLosses) {
  EXPECT_EQ(headersOf(place()), (Labels{"Name", "Location", "Projection", "Valve", "Alpha zero",
                                        "Head loss factors", "", "", "", "", "", "", ""}));
  EXPECT_EQ(rowOf(place(), 1), (Labels{"", "", "", "", "", "In flow+", "Out flow+", "Free flow+", "Bends+",
                                       "In flow-", "Out flow-", "Free flow-", "Bends-"}));
  EXPECT_EQ(place().GetHeaderSpan(5), 1);
  EXPECT_EQ(place().GetHeaderSpan(6), 8);
  EXPECT_EQ(place().GetHeaderSpan(13), 0);
  EXPECT_EQ(rowOf(place(), kRow),
            (Labels{"", "...", "Local Coordinates", "None", "0.010000", "0.500000", "1.000000", "1.000000",
                    "0.000000", "0.500000", "1.000000", "1.000000", "0.000000"}));
  EXPECT_EQ(usableOf(place(), kRow), "xxxxxxxxxxxxx");
  EXPECT_EQ(styleIn(place(), kRow, 4).choices,
            (Labels{"None", "Only negative flow", "Only positive flow", "No flow"}));
  EXPECT_EQ(styleIn(place(), kRow, 5).toolTip, "Water level [m]");
  EXPECT_EQ(styleIn(place(), kRow, 6).toolTip, "");
}

TEST_F(CulvertPage, EachColumnOfPlaceAndLossesIsStored) {
  const auto store = [this](int col, std::string_view text) {
    EXPECT_EQ(place().StoreStyleRowCol(kRow, col, text), 1) << col;
  };
  store(1, "Pipe");
  EXPECT_EQ(culvert().name, "Pipe");
  EXPECT_TRUE(document.IsModified());
  place().OnStartEditing(kRow, 3);
  place().OnModifyCell("UTM-33");
  EXPECT_EQ(place().OnEndEditing(kRow, 3), 1);
  EXPECT_EQ(culvert().coordinateType, "UTM-33");
  store(4, "No flow");
  EXPECT_EQ(culvert().valve, 3);
  store(5, "0.25");
  EXPECT_EQ(culvert().alphaZero, 0.25);
  for (int n = 0; n < 8; ++n) {
    store(6 + n, std::to_string(n + 2));
    EXPECT_EQ(culvert().headLoss[static_cast<std::size_t>(n)], n + 2);
  }
  EXPECT_EQ(place().StoreStyleRowCol(kRow, 13, "x"), 0);
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of points"), 1);
    return true;
  };
  place().OnClickedButtonRowCol(kRow, 2);
  EXPECT_THAT(culvert().x, ElementsAre(0));
  EXPECT_THAT(culvert().y, ElementsAre(0));
}

TEST_F(CulvertPage, ColumnsOfTheSection) {
  EXPECT_EQ(headersOf(data()),
            (Labels{"Geometry Type", "Geometry", "Section Type", "Circular", "Rectangular", "",
                    "Upstream invert", "Downstream invert", "Length", "Mannings n", "No of culverts"}));
  EXPECT_EQ(rowOf(data(), 1), (Labels{"", "", "", "Diameter", "Width", "Height", "", "", "", "", ""}));
  EXPECT_EQ(rowOf(data(), kRow), (Labels{"Rectangular", "...", "Closed", "1.000000", "1.000000", "1.000000",
                                         "0.000000", "0.000000", "1.000000", "0.013000", "1"}));
  EXPECT_EQ(styleIn(data(), kRow, 1).choices, (Labels{"Rectangular", "Circular", "Irregular, level-width"}));
  EXPECT_EQ(styleIn(data(), kRow, 3).choices, (Labels{"Closed", "Open"}));
  for (const int col : {4, 5, 6, 7, 8, 9}) EXPECT_EQ(styleIn(data(), kRow, col).toolTip, "Level [m]") << col;
  for (const int col : {10, 11}) EXPECT_EQ(styleIn(data(), kRow, col).toolTip, "") << col;
}

TEST_F(CulvertPage, TheGeometrySaysWhatCanBeEdited) {
  EXPECT_EQ(usableOf(data(), kRow), "x.x.xxxxxxx");
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 1, "Circular"), 1);
  EXPECT_EQ(usableOf(data(), kRow), "x..x..xxxxx");
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 1, "Irregular, level-width"), 1);
  EXPECT_EQ(usableOf(data(), kRow), "xxx...xxxxx");
  culvert().geometryType = 8;
  EXPECT_EQ(usableOf(data(), kRow), "x.x...xxxxx");
  EXPECT_EQ(textIn(data(), kRow, 1), "");
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 9, "3"), 1);
  EXPECT_EQ(culvert().geometryType, 8);
}

TEST_F(CulvertPage, EachColumnOfTheSectionIsStored) {
  using Culvert = CNhdCulvertObjectKvs;
  const auto stored = [this](int col, double Culvert::*value) {
    EXPECT_EQ(data().StoreStyleRowCol(kRow, col, std::to_string(col + 10)), 1) << col;
    EXPECT_EQ(culvert().*value, col + 10) << col;
  };
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 3, "Open"), 1);
  EXPECT_EQ(culvert().sectionType, 1);
  stored(5, &Culvert::sectionWidth);
  stored(6, &Culvert::sectionHeight);
  stored(7, &Culvert::upstreamInvert);
  stored(8, &Culvert::downstreamInvert);
  stored(9, &Culvert::length);
  stored(10, &Culvert::manningN);
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 11, "4"), 1);
  EXPECT_EQ(culvert().numberOfCulverts, 4);
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 11, "some"), 0);
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 1, "Circular"), 1);
  stored(4, &Culvert::diameter);
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 3, "Closed"), 0);
  EXPECT_EQ(culvert().sectionWidth, 15);  // of the other shape, kept
  EXPECT_EQ(data().StoreStyleRowCol(kRow, 1, "Irregular, level-width"), 1);
  host.fillForm = [](Form& form) {
    form.spin(*form.find("Number of measures"), 1);
    return true;
  };
  data().OnClickedButtonRowCol(kRow, 2);
  EXPECT_EQ(host.titles, Labels{"Level-width"});
  EXPECT_THAT(culvert().width, ElementsAre(0));
}

}  // namespace structures_culvert_page_test
}  // namespace gridbay
