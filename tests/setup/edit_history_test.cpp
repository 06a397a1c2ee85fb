#include "setup/edit_history.h"

#include <gmock/gmock.h>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "tests/support/grids.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace setup_edit_history_test {

class Undo : public test::PageTest {
 protected:
  std::string undoName() { return document.UndoStep() == nullptr ? "" : document.UndoStep()->name; }
  std::string redoName() { return document.RedoStep() == nullptr ? "" : document.RedoStep()->name; }
  std::string saved() {
    EXPECT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
    return test::textOf(folder.file("s.v27"));
  }
  test::TemporaryFolder folder;
};

TEST_F(Undo, AnEditIsTakenBackAndDoneAgainByName) {
  open("CAreaDescriptionDlg");
  EXPECT_EQ(document.UndoStep(), nullptr);
  edit("Drying depth:", "0.01");
  EXPECT_EQ(undoName(), "Drying depth");
  EXPECT_EQ(document.UndoStep()->page, PageId::floodAndDry);
  document.Undo();
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
  EXPECT_EQ(text("Drying depth:"), "0.02");
  EXPECT_EQ(undoName(), "");
  EXPECT_EQ(redoName(), "Drying depth");
  document.Redo();
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.01F);
  EXPECT_EQ(text("Drying depth:"), "0.01");
  document.Redo();
  document.Undo();
  document.Undo();
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
}

TEST_F(Undo, AnEditThatChangesNothingIsNoStep) {
  open("CAreaDescriptionDlg");
  edit("Drying depth:", "0.02");
  EXPECT_EQ(document.UndoStep(), nullptr);
}

TEST_F(Undo, ANewEditEndsWhatCouldBeRedone) {
  open("CAreaDescriptionDlg");
  edit("Drying depth:", "0.01");
  document.Undo();
  edit("Flooding depth:", "0.5");
  EXPECT_EQ(redoName(), "");
  document.Undo();
  EXPECT_EQ(root().areaDescription->floodingDepth, 0.05F);
  EXPECT_EQ(root().areaDescription->dryingDepth, 0.02F);
}

TEST_F(Undo, TheFileOnDiskIsRememberedAcrossSteps) {
  open("CAreaDescriptionDlg");
  edit("Drying depth:", "0.01");
  const std::string first = saved();
  EXPECT_FALSE(document.IsModified());
  edit("Drying depth:", "0.03");
  document.Undo();
  EXPECT_FALSE(document.IsModified());
  document.Undo();
  EXPECT_TRUE(document.IsModified());
  document.Redo();
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(saved(), first);
  document.Undo();
  edit("Drying depth:", "0.04");  // the saved state can't be reached any more
  document.Undo();
  EXPECT_TRUE(document.IsModified());
}

TEST_F(Undo, AllThatAnEditChangedComesBack) {
  root().boundary->SetNoBoundaries(2);
  root().nhdBoundary->GetItem(2)->value = 1.5F;
  document.RecordEdit(PageId::boundary, "before");
  open("CBoundaryDlg");
  choose("Default position", 0);
  edit("Number of boundaries", "1");
  EXPECT_EQ(root().nhdBoundary->GetCount(), 1);
  document.Undo();
  ASSERT_EQ(root().nhdBoundary->GetCount(), 2);
  EXPECT_EQ(root().nhdBoundary->GetItem(2)->value, 1.5F);
  document.Redo();
  EXPECT_EQ(root().nhdBoundary->GetCount(), 1);
}

TEST_F(Undo, ARunOfTheSpinButtonIsOneStep) {
  open("CSourceSinkDlg");
  edit("Number of source sink pairs", "1");
  for (int i = 0; i < 4; ++i) spin("Number of source sink pairs", 1);
  EXPECT_EQ(text("Number of source sink pairs"), "5");
  document.Undo();
  EXPECT_EQ(text("Number of source sink pairs"), "1");
  document.Redo();
  EXPECT_EQ(text("Number of source sink pairs"), "5");
  document.Undo();
  document.Undo();
  EXPECT_EQ(text("Number of source sink pairs"), "0");
}

TEST_F(Undo, TouchedPagesComeBackToo) {
  open("CAreaDescriptionDlg");
  EXPECT_FALSE(document.HasBeenTouched(PageId::floodAndDry));
  edit("Drying depth:", "0.01");
  EXPECT_TRUE(document.HasBeenTouched(PageId::floodAndDry));
  document.Undo();
  EXPECT_FALSE(document.HasBeenTouched(PageId::floodAndDry));
  document.Redo();
  EXPECT_TRUE(document.HasBeenTouched(PageId::floodAndDry));
}

TEST_F(Undo, CellsAreNamedByColumnAndRow) {
  open("CBathymetryDlg");
  root().bathymetry->SetNoAreas(theEdition.wetlandSweepKit ? 1 : 2);
  store(1, 1, "grid.tsb2");
  EXPECT_EQ(undoName(), "Bathymetry, row 1");
  root().boundary->SetNoBoundaries(1);
  open("CNhdBoundaryDlg");
  store(3, 2, "0.5");
  EXPECT_EQ(undoName(), "Boundary 1, data");
}

TEST_F(Undo, AButtonsDialogIsOneStep) {
  root().boundary->SetNoBoundaries(1);
  root().nhdBoundary->GetItem(1)->SetDataFormat(CNhdBoundaryObjectKvs::kSineSeries);
  document.RecordEdit(PageId::boundary, "before");
  open("CNhdBoundaryDlg");
  host.fillForm = [](Form& form) {
    form.find("Range")->text = "3";
    form.find("Phase")->text = "60";
    return true;
  };
  grid().OnClickedButtonRowCol(3, 3);
  EXPECT_EQ(root().nhdBoundary->GetItem(1)->range, 3);
  document.Undo();
  EXPECT_EQ(root().nhdBoundary->GetItem(1)->range, 1);
  EXPECT_EQ(root().nhdBoundary->GetItem(1)->phase, 0);
}

TEST_F(Undo, ASaveElsewhereKeepsFileNames) {
  test::writeGrid(folder.file("grid.tsb2"), {});
  open("CBathymetryDlg");
  store(1, 1, folder.file("grid.tsb2"));
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  ASSERT_TRUE(document.OnOpenDocument(folder.file("s.v27")));
  std::filesystem::create_directory(folder.path() / "sub");
  ASSERT_TRUE(document.OnSaveDocument(folder.file("sub/s.v27")));
  open("CBathymetryDlg");
  store(1, 1, "other.tsb2");
  document.Undo();
  EXPECT_EQ(root().bathymetry->GetArea(1)->fileName.absolute(), folder.file("grid.tsb2"));
}

TEST_F(Undo, ATypedNameStartsFromTheSetupsFolder) {
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  open("CBathymetryDlg");
  if (!theEdition.wetlandSweepKit) edit("Number of areas", "2");
  const int area = root().bathymetry->GetCount();
  store(area, 1, "new.tsb2");
  EXPECT_EQ(root().bathymetry->GetArea(area)->fileName.absolute(), folder.file("new.tsb2"));
}

TEST_F(Undo, OpeningForgetsTheSteps) {
  open("CAreaDescriptionDlg");
  edit("Drying depth:", "0.01");
  saved();
  ASSERT_TRUE(document.OnOpenDocument(folder.file("s.v27")));
  EXPECT_EQ(document.UndoStep(), nullptr);
}

TEST_F(Undo, ARecoveredDocumentStartsUnsavedWithItsOwnPath) {
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  open("CBathymetryDlg");
  store(1, 1, "grid.tsb2");
  root().areaDescription->dryingDepth = 0.04F;
  std::filesystem::create_directory(folder.path() / "aside");
  ASSERT_TRUE(document.WriteRecoveryCopy(folder.file("aside/1.setup")));
  EXPECT_NE(test::textOf(folder.file("s.v27")), test::textOf(folder.file("aside/1.setup")));

  CV27SetupDoc other(host);
  ASSERT_TRUE(other.OnRecoverDocument(folder.file("aside/1.setup"), folder.file("s.v27")));
  EXPECT_TRUE(other.IsModified());
  EXPECT_EQ(other.path(), folder.file("s.v27"));
  EXPECT_EQ(other.root().areaDescription->dryingDepth, 0.04F);
  EXPECT_EQ(other.root().bathymetry->GetArea(1)->fileName.absolute(), folder.file("grid.tsb2"));
  EXPECT_FALSE(other.OnRecoverDocument(folder.file("aside/none"), ""));
  EXPECT_EQ(other.path(), folder.file("s.v27"));
  const Outcome nowhere = document.WriteRecoveryCopy(folder.file("no/1.setup"));
  ASSERT_FALSE(nowhere);
  EXPECT_THAT(nowhere.error(), ::testing::HasSubstr("no/1.setup"));
}

}  // namespace setup_edit_history_test
}  // namespace gridbay
