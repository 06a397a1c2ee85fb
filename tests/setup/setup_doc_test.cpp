#include "setup/setup_doc.h"

#include <gmock/gmock.h>

#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace setup_setup_doc_test {

using ::testing::HasSubstr;

class SetupDoc : public ::testing::Test {
 protected:
  test::TemporaryFolder folder;
  test::TestHost host;
  CV27SetupDoc document{host};
};

TEST_F(SetupDoc, SavesAndOpens) {
  document.root().areaDescription->dryingDepth = 0.5F;
  document.SetModifiedFlag();
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(document.path(), folder.file("s.v27"));
  EXPECT_EQ(document.getAbsoluteFilepath("grids/a.tsb2"), folder.file("grids/a.tsb2"));
  CV27SetupDoc other(host);
  ASSERT_TRUE(other.OnOpenDocument(folder.file("s.v27")));
  EXPECT_EQ(other.root().areaDescription->dryingDepth, 0.5F);
  ASSERT_TRUE(other.OnNewDocument());
  EXPECT_EQ(other.root().areaDescription->dryingDepth, 0.02F);
  EXPECT_EQ(other.path(), "");
}

TEST_F(SetupDoc, AFileThatCannotBeReadLeavesTheDocument) {
  document.root().areaDescription->dryingDepth = 0.5F;
  EXPECT_FALSE(document.OnOpenDocument(folder.write("bad.v27", "A {")));
  ASSERT_EQ(host.texts.size(), 1U);
  EXPECT_THAT(host.texts[0], HasSubstr("line 1, column 4"));
  EXPECT_EQ(document.root().areaDescription->dryingDepth, 0.5F);
  EXPECT_EQ(document.path(), "");
  EXPECT_FALSE(document.OnSaveDocument(folder.file("no/s.v27")));
  EXPECT_THAT(host.texts[1], HasSubstr("cannot save"));
}

TEST_F(SetupDoc, TheEnginesOptionsComeThroughASave) {
  const std::string path =
      folder.write("s.v27", "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { OPTION_PARAMETERS { Speed 3 } } }");
  ASSERT_TRUE(document.OnOpenDocument(path));
  ASSERT_TRUE(document.OnSaveDocument(path));
  EXPECT_THAT(test::textOf(path), HasSubstr("Speed 3\n"));
}

TEST_F(SetupDoc, WhatASaveWouldLeaveOutIsAskedAbout) {
  const std::string text =
      "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { STRUCTURES { WEIR_1 { Width 3 } } }; MY_OWN { A 1 } }";
  const std::string path = folder.write("s.v27", text);
  ASSERT_TRUE(document.OnOpenDocument(path));
  host.answer = false;
  EXPECT_FALSE(document.OnSaveDocument(path));
  EXPECT_EQ(test::textOf(path), text);
  EXPECT_THAT(host.questions.at(0), HasSubstr("HYDRODYNAMIC_MODULE/STRUCTURES/WEIR_1"));
  EXPECT_THAT(host.questions.at(0), HasSubstr("MY_OWN"));
  host.answer = true;
  EXPECT_TRUE(document.OnSaveDocument(path));
  EXPECT_NE(test::textOf(path), text);
  EXPECT_TRUE(document.OnSaveDocument(path));
  EXPECT_EQ(host.questions.size(), 2U);  // once agreed, not asked again
  ASSERT_TRUE(document.OnOpenDocument(path));
  EXPECT_TRUE(document.OnSaveDocument(path));
  EXPECT_EQ(host.questions.size(), 2U);  // nothing is left to lose
}

TEST_F(SetupDoc, SectionsOfANameBeyondThoseThatAreReadAreAskedAbout) {
  const std::string path =
      folder.write("s.v27",
                   "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE { STRUCTURE_MODULE { WEIR { number_of_weirs 2\n"
                   " weir_data { delhs 1.0 }; WEIR_DATA { delhs 2.0 }; weir_data { delhs 3.0 } } } } }");
  ASSERT_TRUE(document.OnOpenDocument(path));
  host.answer = false;
  EXPECT_FALSE(document.OnSaveDocument(path));
  EXPECT_THAT(host.questions.at(0),
              HasSubstr(":\n\nHYDRODYNAMIC_MODULE/STRUCTURE_MODULE/WEIR/weir_data[3]\n\nSave"));
}

TEST_F(SetupDoc, ViewsAreToldOfChangesButForTheirOwn) {
  int first = 0;
  int second = 0;
  document.AddView(&first, [&first] { ++first; });
  document.AddView(&second, [&] {
    ++second;
    document.RemoveView(&second);
  });
  document.UpdateAllViews(&first);
  document.UpdateAllViews(nullptr);
  EXPECT_EQ(first, 1);
  EXPECT_EQ(second, 1);
}

TEST_F(SetupDoc, APageFollowsTheModelWhileItIsOpen) {
  auto page = makePage("CAreaDescriptionDlg", document);
  auto other = makePage("CAreaDescriptionDlg", document);
  page->form().find("Drying depth:")->text = "0.03";
  page->UpdateDoc();
  EXPECT_EQ(other->form().find("Drying depth:")->text, "0.03");
  other.reset();
  page->UpdateDoc();
  EXPECT_EQ(makePage("CNowhereDlg", document), nullptr);
}

TEST_F(SetupDoc, AnExceptionInAnEditIsToldAndTheModelStays) {
  document.root().areaDescription->dryingDepth = 0.5F;
  document.RecordEdit(PageId::floodAndDry, "before");
  EXPECT_FALSE(document.Attempt([this] {
    document.root().areaDescription->dryingDepth = 0.7F;
    document.root().sourceSink->SetNoSources(3);
    throw std::invalid_argument("There is no item 4");
  }));
  EXPECT_EQ(document.root().areaDescription->dryingDepth, 0.5F);
  EXPECT_EQ(document.root().sourceSink->GetCount(), 0);
  ASSERT_EQ(host.texts.size(), 1U);
  EXPECT_NE(host.texts.front().find("There is no item 4"), std::string::npos);
  EXPECT_EQ(document.UndoStep()->name, "before");
}

TEST_F(SetupDoc, WhatAHotStartFileChangesIsAStepOfItsOwn) {
  test::GridSpec spec;
  spec.dataType = 11;
  spec.items = 2;
  spec.time.type = TsbTimeAxisType::calendarEquidistant;
  spec.time.start = {2001, 2, 3, 4, 5, 6};
  spec.time.step = 12;
  test::writeHotStart(folder.file("hot.tsb2"), spec, test::flat, 0, 3, 3);
  document.root().bathymetry->hotStart = 1;
  document.root().bathymetry->GetArea(1)->fileName = folder.file("hot.tsb2");
  document.RecordEdit(PageId::bathymetry, "before");
  const DateTime before = document.root().simulationPeriod->start;
  int updates = 0;
  document.AddView(this, [&updates] { ++updates; });
  ValidationList messages;
  document.ValidateData(messages);
  ASSERT_NE(document.root().simulationPeriod->start, before)
      << ::testing::PrintToString(test::textsOf(messages));
  EXPECT_TRUE(document.IsModified());
  EXPECT_EQ(updates, 1);
  ASSERT_NE(document.UndoStep(), nullptr);
  EXPECT_EQ(document.UndoStep()->name, "Validation");
  document.Undo();
  EXPECT_EQ(document.root().simulationPeriod->start, before);
  EXPECT_EQ(document.UndoStep()->name, "before");
  document.RemoveView(this);
}

TEST_F(SetupDoc, ReadingGridsIsNoEdit) {
  test::writeGrid(folder.file("grid.tsb2"), {});
  document.root().bathymetry->GetArea(1)->fileName = folder.file("grid.tsb2");
  ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27")));
  ValidationList messages;
  document.ValidateData(messages);
  EXPECT_GT(document.root().bathymetry->GetArea(1)->noJ, 0);
  EXPECT_FALSE(document.IsModified());
  EXPECT_EQ(document.UndoStep(), nullptr);
}

}  // namespace setup_setup_doc_test
}  // namespace gridbay
