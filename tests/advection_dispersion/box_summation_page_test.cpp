#include "advection_dispersion/box_summation_page.h"

#include <gtest/gtest.h>

#include "tests/support/shapes.h"

namespace gridbay {
namespace advection_dispersion_box_summation_page_test {

class AdBoxSummationPage : public test::ShapeTest {
 protected:
  AdBoxSummationPage() {
    list.SetCount(1);
    PageTest::open("CNadBoxSummationDlg");
  }
  CNadBoxSummationKvs& list = *root().nadBoxSummation;
};

TEST_F(AdBoxSummationPage, ARowForEachBox) {
  EXPECT_EQ(labels(), (Labels{"Number of Boxes", "Output Size", "Boxes"}));
  EXPECT_EQ(headers(),
            (Labels{"", "Area", "", "First", "Last", "Period", "File name", "...", "", "Title", ""}));
  edit("Number of Boxes", "10");
  spin("Number of Boxes", 1);
  EXPECT_EQ(list.GetCount(), 10);
  EXPECT_EQ(page->pageId(), PageId::adBoxSummation);
  EXPECT_EQ(page->templateId(), 18719);
}

TEST_F(AdBoxSummationPage, PlaceAndPeriodInADialog) {
  host.fillForm = [](Form& form) {
    EXPECT_NE(form.find("Lower-left point:"), nullptr);
    EXPECT_NE(form.find("Upper-right point:"), nullptr);
    form.controls()[2].text = "4";
    form.find("First time step:")->text = "x";
    return true;
  };
  grid("Boxes").OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(host.titles, Labels{"Box for Summation Calculations"});
  EXPECT_EQ(host.formFault, "First time step: \"x\" is not a number");
  EXPECT_EQ(list.GetItem(1)->first, (GridPoint{0, 0}));
  host.fillForm = [](Form& form) {
    form.controls()[2].text = "4";
    return true;
  };
  grid("Boxes").OnClickedButtonRowCol(1, 2);
  EXPECT_EQ(list.GetItem(1)->first, (GridPoint{0, 4}));
}

TEST_F(AdBoxSummationPage, ItemsInADialog) {
  host.fillForm = [](Form& form) {
    EXPECT_EQ(form.find("Items for:")->text, "Box 1");
    return form.find("Items")->grid->StoreStyleRowCol(1, 2, "0") == 1;
  };
  grid("Boxes").OnClickedButtonRowCol(1, 10);
  EXPECT_EQ(list.GetItem(1)->entries, EntryFlags{0});
}

}  // namespace advection_dispersion_box_summation_page_test
}  // namespace gridbay
