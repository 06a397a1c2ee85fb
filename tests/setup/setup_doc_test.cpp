#include "setup/setup_doc.h"

#include <gmock/gmock.h>

#include "basic/area_description.h"
#include "tests/support/pages.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace {

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

}  // namespace
}  // namespace gridbay
