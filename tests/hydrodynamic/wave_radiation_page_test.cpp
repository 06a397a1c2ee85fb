#include "hydrodynamic/wave_radiation_page.h"

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "hydrodynamic/wave_radiation.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace hydrodynamic_wave_radiation_page_test {

class WaveRadiationPage : public test::ShapeTest {
 protected:
  WaveRadiationPage() {
    root().bathymetry->SetNoAreas(2);
    PageTest::open("CNhdWaveRadiationDlg");
  }
  CNhdWaveRadiationObjectKvs& entry(int number) { return root().nhdWaveRadiation->at(number); }
  CV27SetupGridWnd& cells() { return PageTest::grid(); }
  test::TemporaryFolder folder;
};

TEST_F(WaveRadiationPage, ARowForEachArea) {
  EXPECT_EQ(page->templateId(), 18933);
  EXPECT_EQ(page->pageId(), PageId::waveRadiation);
  EXPECT_EQ(headers(), (Labels{"Area", "Included", "Time descr.", "Filename", "", ""}));
  EXPECT_EQ(cells().GetRowCount(), 2);
  EXPECT_EQ(rowOf(cells(), 1), (Labels{"0", "Stationary", "", "   ...   ", "View..."}));
  EXPECT_EQ(style(1, 1).kind, CellKind::checkBox);
  EXPECT_EQ(style(1, 2).choices, (Labels{"Stationary", "Quasi Stationary"}));
  EXPECT_EQ(usableOf(cells(), 1), "xxxx.");
}

TEST_F(WaveRadiationPage, EveryCellReachesTheModel) {
  EXPECT_EQ(store(2, 1, "1"), 1);
  EXPECT_EQ(store(2, 2, "Quasi Stationary"), 1);
  EXPECT_EQ(store(2, 3, "r.tsb2"), 1);
  EXPECT_EQ(entry(2).included, 1);
  EXPECT_EQ(entry(2).timeDescription, 1);
  EXPECT_EQ(entry(2).fileName.text(), "r.tsb2");
  EXPECT_EQ(entry(1).included, 0);
  EXPECT_EQ(store(2, 2, "Never"), 0);
}

TEST_F(WaveRadiationPage, AFileIsChosenAndLookedAt) {
  host.chosenFile = folder.write("r.tsb2", "");
  cells().OnClickedButtonRowCol(1, 4);
  EXPECT_EQ(host.filters, Labels{"Wave Radiation Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"});
  EXPECT_EQ(entry(1).fileName.text(), *host.chosenFile);
  EXPECT_EQ(usableOf(cells(), 1), "xxxxx");
  cells().OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
}

}  // namespace hydrodynamic_wave_radiation_page_test
}  // namespace gridbay
