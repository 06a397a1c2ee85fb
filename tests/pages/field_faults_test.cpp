// A text in a field that is no value: what it holds up, and what it doesn't.

#include <gmock/gmock.h>

#include "basic/area_description.h"
#include "basic/boundary.h"
#include "tests/support/pages.h"

namespace gridbay {
namespace pages_field_faults_test {

class FieldFault : public test::PageTest {
 protected:
  FieldFault() { open("CAreaDescriptionDlg"); }
  CAreaDescriptionKvs& area() { return *root().areaDescription; }
};

TEST_F(FieldFault, TheTextStaysAsItWasTypedWithWhatIsWrong) {
  edit("Drying depth:", "deep");
  EXPECT_EQ(text("Drying depth:"), "deep");
  EXPECT_EQ(control("Drying depth:").fault, "\"deep\" is not a number");
  EXPECT_EQ(host.texts, Labels{"Drying depth: \"deep\" is not a number"});
  EXPECT_EQ(area().dryingDepth, 0.02F);
}

TEST_F(FieldFault, ARightValueInAnotherFieldIsStoredAllTheSame) {
  edit("Drying depth:", "deep");
  edit("Flooding depth:", "0.5");
  EXPECT_EQ(area().floodingDepth, 0.5F);
  EXPECT_EQ(text("Flooding depth:"), "0.5");
  EXPECT_EQ(document.UndoStep()->name, "Flooding depth");
  EXPECT_EQ(text("Drying depth:"), "deep");
  EXPECT_NE(control("Drying depth:").fault, "");
  EXPECT_EQ(host.texts.size(), 1U);  // told once
}

TEST_F(FieldFault, ItIsMendedByARightValue) {
  edit("Drying depth:", "deep");
  edit("Drying depth:", "0.03");
  EXPECT_EQ(control("Drying depth:").fault, "");
  EXPECT_EQ(area().dryingDepth, 0.03F);
}

TEST_F(FieldFault, APageThatIsLoadedAnewHasNone) {
  edit("Flooding depth:", "0.5");
  edit("Drying depth:", "deep");
  document.Undo();
  EXPECT_EQ(control("Drying depth:").fault, "");
  EXPECT_EQ(text("Drying depth:"), "0.02");
  edit("Drying depth:", "deep");
  page->SetData();
  EXPECT_EQ(text("Drying depth:"), "0.02");
}

TEST_F(FieldFault, AHandOverLeavesTheModelAsItWas) {
  control("Flooding depth:").text = "0.5";
  control("Drying depth:").text = "deep";
  EXPECT_EQ(page->GetData(), 0);
  EXPECT_EQ(page->UpdateDoc(), 0);
  EXPECT_EQ(area().floodingDepth, 0.05F);
  EXPECT_FALSE(document.IsModified());
}

TEST_F(FieldFault, AFieldThatGoesOutOfUseHoldsNothingUp) {
  edit("Drying depth:", "deep");
  area().enableFloodAndDryChecking = 0;
  page->Refresh();
  EXPECT_EQ(page->UpdateDoc(), 1);
  EXPECT_EQ(control("Drying depth:").fault, "");
  EXPECT_EQ(text("Drying depth:"), "0.02");
}

TEST_F(FieldFault, ACellIsStoredAllTheSame) {
  open("CBoundaryDlg");
  choose("Default position", 0);
  edit("Number of boundaries", "1");
  document.SetModifiedFlag(false);
  edit("Number of boundaries", "many");
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(store(1, 1, "3,4"), 1);
  EXPECT_EQ(root().boundary->GetItem(1)->first, (GridPoint{3, 4}));
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(document.UndoStep()->name, "First point, row 1");
  EXPECT_EQ(text("Number of boundaries"), "many");
  spin("Number of boundaries", 1);
  EXPECT_EQ(control("Number of boundaries").fault, "");
  EXPECT_EQ(text("Number of boundaries"), "2");
}

}  // namespace pages_field_faults_test
}  // namespace gridbay
