#include "hydrodynamic/surface_elevation_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/surface_elevation.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_surface_elevation_page_test {

class SurfaceElevationPage : public test::ShapeTest {
 protected:
  SurfaceElevationPage() {
    root().bathymetry->SetNoAreas(2);
    PageTest::open("CNhdSurfaceElevationDlg");
  }
  CNhdSurfaceElevationObjectKvs& entry(int number) { return root().nhdSurfaceElevation->at(number); }
  CV27SetupGridWnd& cells() { return PageTest::grid(); }
  test::TemporaryFolder folder;
};

TEST_F(SurfaceElevationPage, ARowForEachArea) {
  EXPECT_EQ(page->templateId(), 18931);
  EXPECT_EQ(page->pageId(), PageId::surfaceElevation);
  EXPECT_EQ(headers(), (Labels{"Area", "Given as:", "Value", "File name", "", ""}));
  EXPECT_EQ(cells().GetRowCount(), 2);
  EXPECT_EQ(cells().GetRowHeader(2), "2");
  EXPECT_EQ(rowOf(cells(), 1), (Labels{"Constant value", "0.000000", "", "   ...   ", "View..."}));
  EXPECT_EQ(style(1, 1).choices, (Labels{"Constant value", "From file"}));
  EXPECT_EQ(style(1, 2).toolTip, "Surface elevation [m]");
  root().bathymetry->SetNoAreas(3);
  page->OnUpdate();
  EXPECT_EQ(cells().GetRowCount(), 3);
}

TEST_F(SurfaceElevationPage, TheTypeDecidesBetweenValueAndFile) {
  EXPECT_EQ(usableOf(cells(), 2), "xx...");
  EXPECT_EQ(store(2, 1, "From file"), 1);
  EXPECT_EQ(entry(2).type, 2);
  EXPECT_EQ(usableOf(cells(), 2), "x.xx.");
  EXPECT_EQ(usableOf(cells(), 1), "xx...");
  EXPECT_EQ(store(2, 1, "Constant value"), 1);
  EXPECT_EQ(entry(2).type, 1);
  entry(1).type = 0;  // as only a file can say
  EXPECT_EQ(cell(1, 1), "");
  EXPECT_EQ(usableOf(cells(), 1), "xxxx.");
}

TEST_F(SurfaceElevationPage, AValueIsConverted) {
  EXPECT_EQ(store(1, 2, "1.5"), 1);
  EXPECT_EQ(entry(1).constantValue, 1.5F);
  document.units().setSystem(UnitSystem::us);
  EXPECT_EQ(store(1, 2, "10"), 1);
  EXPECT_EQ(entry(1).constantValue, 3.048F);
  for (const char* bad : {"high", "", "nan", "1e60"}) EXPECT_EQ(store(1, 2, bad), 0) << bad;
  EXPECT_EQ(entry(1).constantValue, 3.048F);
}

TEST_F(SurfaceElevationPage, AMapIsChosen) {
  store(2, 1, "From file");
  host.chosenFile = folder.write("m.tsb2", "");
  host.chosenItems = {2};
  cells().OnClickedButtonRowCol(2, 4);
  EXPECT_EQ(host.filters, Labels{"Surface Elevation Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(entry(2).map.fileName.text(), *host.chosenFile);
  EXPECT_EQ(entry(2).map.items, std::vector<std::uint32_t>{2});
  EXPECT_EQ(usableOf(cells(), 2), "x.xxx");
  cells().OnClickedButtonRowCol(2, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  EXPECT_EQ(store(2, 3, "none.tsb2"), 1);
  EXPECT_EQ(usableOf(cells(), 2), "x.xx.");
}

}  // namespace hydrodynamic_surface_elevation_page_test
}  // namespace gridbay
