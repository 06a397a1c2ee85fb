#include "advection_dispersion/result_page.h"

#include <gmock/gmock.h>

#include "advection_dispersion/component.h"
#include "basic/bathymetry.h"
#include "tests/support/shapes.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace advection_dispersion_result_page_test {

class AdResultPage : public test::ShapeTest {
 protected:
  AdResultPage() {
    root().bathymetry->GetArea(1)->noJ = 121;
    root().bathymetry->GetArea(1)->noK = 91;
    root().bathymetry->GetArea(1)->grid = CVdArray2D<float>(121, 91);
    results.outputs.SetCount(1);
    PageTest::open("CNadResultDlg");
  }
  TransportOutput& output() { return results.outputs.at(1); }
  CV27SetupGridWnd& outputs() { return grid("Output areas"); }
  CV27SetupGridWnd& hotStarts() { return grid("Hot start files"); }
  CNadResultKvs& results = *root().nadResult;
  test::TemporaryFolder folder;
};

TEST_F(AdResultPage, Controls) {
  EXPECT_EQ(labels(), (Labels{"Number of Output Areas", "Size of AD output", "Output areas",
                              "Generate Hot Start", "Generate hot start", "Hot start files"}));
  EXPECT_EQ(text("Number of Output Areas"), "1");
  EXPECT_EQ(text("Size of AD output"), "4.28 MB");
  EXPECT_EQ(page->pageId(), PageId::adResult);
  EXPECT_EQ(page->templateId(), 18735);
}

TEST_F(AdResultPage, ColumnsOfTheOutputs) {
  EXPECT_EQ(headers(), (Labels{"", "Area", "J", "K", "Time", "", "Data File", "...", "", "Title"}));
  EXPECT_EQ(rowOf(outputs(), 1),
            (Labels{"1", "0-120,1", "0-90,1", "0-100,1", "...", "", "...", "View...", ""}));
  EXPECT_EQ(usableOf(outputs(), 1), "xxxxxxx.x");
}

TEST_F(AdResultPage, EditsReachTheModelAndTheSize) {
  EXPECT_EQ(store(1, 1, "2"), 1);
  EXPECT_EQ(output().areaNumber, 2);
  EXPECT_EQ(store(1, 1, "x"), 0);
  EXPECT_EQ(store(1, 2, "5-50,5"), 1);
  EXPECT_EQ(output().part.x, (USubLine{5, 50, 5}));
  EXPECT_EQ(text("Size of AD output"), "0.35 MB");
  EXPECT_EQ(store(1, 3, "1-9"), 1);
  EXPECT_EQ(output().part.y, (USubLine{1, 9, 1}));
  EXPECT_EQ(store(1, 3, "9"), 0);
  EXPECT_EQ(store(1, 4, "0-20,10"), 1);
  EXPECT_EQ(output().steps, (USubLine{0, 20, 10}));
  EXPECT_EQ(store(1, 6, " r.tsb2 "), 1);
  EXPECT_EQ(output().file.text(), "r.tsb2");
  EXPECT_EQ(store(1, 9, "bay"), 1);
  EXPECT_EQ(output().title, "bay");
}

TEST_F(AdResultPage, TheSubsetIsChosenInADialog) {
  host.fillForm = [](Form& form) {
    form.controls()[1].text = "7";
    return true;
  };
  outputs().OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(output().part.x, (USubLine{7, 120, 1}));
  output().areaNumber = 2;  // the limits stay those of the first area
  outputs().OnClickedButtonRowCol(1, 5);
  EXPECT_TRUE(host.texts.empty());
  root().bathymetry->SetNoAreas(0);
  outputs().OnClickedButtonRowCol(1, 5);
  EXPECT_EQ(host.texts, Labels{"Error: Associated area is invalid!"});
}

TEST_F(AdResultPage, TheFileDialogFollowsTheExtent) {
  host.chosenFile = folder.write("r.tsb2", "");
  outputs().OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(output().file.text(), *host.chosenFile);
  outputs().OnClickedButtonRowCol(1, 8);
  EXPECT_EQ(host.opened, Labels{*host.chosenFile});
  store(1, 2, "5-5,1");
  outputs().OnClickedButtonRowCol(1, 7);
  store(1, 3, "3-3,1");
  outputs().OnClickedButtonRowCol(1, 7);
  EXPECT_EQ(host.extensions, (Labels{"tsb2", "tsb1", "tsb0"}));
  EXPECT_EQ(host.filters,
            (Labels{"Result files(*.tsb2)|*.tsb2|Result files (*.tb2)|*.tb2|All Files (*.*)|*.*||",
                    "Profile (*.tsb1)|*.tsb1|Profile (*.tb1)|*.tb1|All Files (*.*)|*.*||",
                    "Time series (*.tsb0)|*.tsb0|Time series (*.tb0)|*.tb0|All Files (*.*)|*.*||"}));
}

TEST_F(AdResultPage, UpToEighteenOutputs) {
  edit("Number of Output Areas", "18");
  EXPECT_EQ(results.outputs.GetCount(), 18);
  edit("Number of Output Areas", "19");
  EXPECT_EQ(results.outputs.GetCount(), 18);
  edit("Number of Output Areas", "17");
  spin("Number of Output Areas", -1);
  EXPECT_EQ(results.outputs.GetCount(), 16);
  EXPECT_EQ(outputs().GetRowCount(), 16);
  edit("Number of Output Areas", "0");
  spin("Number of Output Areas", -1);
  EXPECT_EQ(results.outputs.GetCount(), 0);
}

TEST_F(AdResultPage, HotStartFiles) {
  EXPECT_EQ(hotStarts().GetRowCount(), 1);
  EXPECT_EQ(usableOf(hotStarts(), 1), "....");
  root().nadComponent->SetCount(2);
  choose("Generate Hot Start", 1);
  EXPECT_TRUE(results.generateHotStart);
  EXPECT_EQ(usableOf(hotStarts(), 1), "xxx.");
  EXPECT_THAT(labels(), ::testing::Contains("Generate hot start (size of output: 0.09 MB)"));
  EXPECT_EQ(hotStarts().StoreStyleRowCol(1, 1, "h.tsb2"), 1);
  EXPECT_EQ(results.hotStarts.at(1).file.text(), "h.tsb2");
  EXPECT_EQ(hotStarts().StoreStyleRowCol(1, 3, "begin"), 1);
  EXPECT_EQ(results.hotStarts.at(1).title, "begin");
}

}  // namespace advection_dispersion_result_page_test
}  // namespace gridbay
