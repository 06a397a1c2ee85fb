#include "hydrodynamic/eddy_viscosity_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_eddy_viscosity_page_test {

class EddyViscosityPage : public test::ShapeTest {
 protected:
  EddyViscosityPage() {
    root().bathymetry->SetNoAreas(2);
    PageTest::open("CNhdEddyViscosityDlg");
  }
  CNhdEddyViscosityKvs& list() { return *root().nhdEddyViscosity; }
  // The grids that are seen.
  Labels shownGrids() {
    Labels shown;
    for (const Control& it : page->form().controls()) {
      if (it.grid != nullptr && it.visible) shown.push_back(it.label);
    }
    return shown;
  }
  static Labels headersOf(CV27SetupGridWnd& grid) {
    Labels all;
    for (int col = 0; col <= grid.GetColCount(); ++col) all.push_back(grid.GetColHeader(col));
    return all;
  }
  test::TemporaryFolder folder;
};

TEST_F(EddyViscosityPage, TheFormatChoosesTheGrid) {
  EXPECT_EQ(page->templateId(), 18706);
  EXPECT_EQ(page->pageId(), PageId::eddyViscosity);
  EXPECT_EQ(control("Given as").choices,
            (Labels{"No Viscosity", "Constant Value", "From File", "Smagorinsky Formula"}));
  EXPECT_EQ(control("Type of Formulation").choices, (Labels{"Flux based", "Velocity based"}));
  EXPECT_EQ(control("Given as").index, 0);
  EXPECT_EQ(control("Type of Formulation").index, 1);
  EXPECT_EQ(shownGrids(), Labels{"Viscosity"});
  choose("Given as", 1);
  EXPECT_EQ(shownGrids(), Labels{"Viscosity"});
  choose("Given as", 2);
  EXPECT_EQ(list().dataFormat, 2);
  EXPECT_EQ(shownGrids(), Labels{"Data files"});
  choose("Given as", 3);
  EXPECT_EQ(shownGrids(), Labels{"Smagorinsky constants"});
}

TEST_F(EddyViscosityPage, NoViscosityHasNoFormulationAndAGreyColumn) {
  CV27SetupGridWnd& cells = grid("Viscosity");
  EXPECT_FALSE(control("Type of Formulation").enabled);
  EXPECT_FALSE(cells.IsEnabled());
  EXPECT_TRUE(styleIn(cells, 1, 1).isGrey);
  EXPECT_EQ(cells.StoreStyleRowCol(1, 1, "5"), 0);
  choose("Given as", 1);
  EXPECT_TRUE(cells.IsEnabled());
  EXPECT_FALSE(styleIn(cells, 1, 1).isGrey);
  EXPECT_EQ(usableOf(cells, 2), "x");
  choose("Type of Formulation", 0);
  EXPECT_EQ(list().formulation, 0);
}

TEST_F(EddyViscosityPage, Constants) {
  choose("Given as", 1);
  CV27SetupGridWnd& cells = grid("Viscosity");
  EXPECT_EQ(headersOf(cells), (Labels{"Area", "Viscosity"}));
  EXPECT_EQ(cells.GetRowCount(), 2);
  EXPECT_EQ(styleIn(cells, 1, 1).toolTip, "Eddy viscosity [m²/s]");
  EXPECT_EQ(cells.StoreStyleRowCol(2, 1, "0.75"), 1);
  EXPECT_EQ(list().at(2).constantValue, 0.75F);
  EXPECT_EQ(textIn(cells, 2, 1), "0.750000");
  EXPECT_EQ(cells.StoreStyleRowCol(2, 1, "x"), 0);
}

TEST_F(EddyViscosityPage, Files) {
  choose("Given as", 2);
  CV27SetupGridWnd& cells = grid("Data files");
  EXPECT_EQ(headersOf(cells), (Labels{"Area", "Data File", "", ""}));
  EXPECT_EQ(rowOf(cells, 1), (Labels{"", "...", "View..."}));
  EXPECT_EQ(usableOf(cells, 1), "xx.");
  host.chosenFile = folder.write("m.tsb2", "");
  host.chosenItems = {3};
  cells.OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.filters, Labels{"Eddy viscosity map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(list().at(1).map.fileName.text(), *host.chosenFile);
  EXPECT_EQ(list().at(1).map.items, std::vector<std::uint32_t>{3});
  EXPECT_EQ(usableOf(cells, 1), "xxx");
}

TEST_F(EddyViscosityPage, SmagorinskyConstants) {
  choose("Given as", 3);
  CV27SetupGridWnd& cells = grid("Smagorinsky constants");
  EXPECT_EQ(headersOf(cells), (Labels{"Area", "Smagorinsky Constants"}));
  EXPECT_EQ(rowOf(cells, 2), Labels{"0.500000"});
  EXPECT_EQ(cells.StoreStyleRowCol(2, 1, "0.28"), 1);
  EXPECT_EQ(list().at(2).smagorinskyConstant, 0.28F);
}

TEST_F(EddyViscosityPage, EveryGridFollowsTheAreas) {
  root().bathymetry->SetNoAreas(4);
  page->OnUpdate();
  for (const char* label : {"Viscosity", "Data files", "Smagorinsky constants"})
    EXPECT_EQ(grid(label).GetRowCount(), 4) << label;
}

}  // namespace hydrodynamic_eddy_viscosity_page_test
}  // namespace gridbay
