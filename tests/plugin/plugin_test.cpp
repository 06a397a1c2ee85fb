#include <dlfcn.h>
#include <gmock/gmock.h>

#include "basic/area_description.h"
#include "core/edition.h"
#include "plugin/entry_points.h"
#include "plugin/launch_records.h"
#include "setup/graphical_view.h"
#include "setup/gridbay_doc.h"
#include "tests/support/pages.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace plugin_plugin_test {

using ::testing::HasSubstr;

// Each edition's library, loaded as a host does it, whatever edition the test itself is linked with.
class Plugin : public ::testing::TestWithParam<bool> {
 protected:
  Plugin()
      : library(::dlopen(test::programPath(GetParam() ? "v27nestedwsk.so" : "v27nested.so").c_str(),
                         RTLD_NOW | RTLD_LOCAL)) {}
  ~Plugin() override {
    if (library != nullptr) ::dlclose(library);
  }
  template <class Function>
  Function* entry(const char* name) {
    void* found = library == nullptr ? nullptr : ::dlsym(library, name);
    EXPECT_NE(found, nullptr) << name;
    return reinterpret_cast<Function*>(found);
  }
  void* library;
};

TEST_P(Plugin, EntryPoints) {
  ASSERT_NE(library, nullptr) << ::dlerror();
  EXPECT_EQ(entry<int()>("VdGetNumDocTemplates")(), 1);
  std::string name;
  EXPECT_EQ(entry<int(std::string*)>("VdGetEditorString")(nullptr), 0);
  EXPECT_EQ(entry<int(std::string*)>("VdGetEditorString")(&name), 1);
  EXPECT_EQ(name, GetParam() ? "Wetland Sweep Kit" : "Flow Model");
  for (const char* none : {"VdGetBitmapId", "VdGetNumToolbars", "VdGetToolbarString", "VdInitToolbar"}) {
    EXPECT_EQ(entry<int()>(none)(), 0);
  }
}

TEST_P(Plugin, TheDocumentTemplate) {
  ASSERT_NE(library, nullptr) << ::dlerror();
  const auto make = entry<CVdDocTemplate*(int)>("VdGetDocTemplatePtr");
  EXPECT_EQ(make(1), nullptr);
  EXPECT_EQ(make(-1), nullptr);
  const std::unique_ptr<CVdDocTemplate> docTemplate(make(0));
  ASSERT_NE(docTemplate, nullptr);
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kHelpFile),
            GetParam() ? "V27WSK.chm" : "V27Nested.chm");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kDefaultName), "Untitled");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kNewFileName),
            GetParam() ? "VANE 27 Wetland Sweep Kit" : "VANE 27 Flow model");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kFilterLabel),
            GetParam() ? "VANE 27 Wetland Sweep Kit (*.v27wsk)" : "VANE 27 Flow Model (*.v27)");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kExtension), GetParam() ? ".v27wsk" : ".v27");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kTypeId),
            GetParam() ? "VANE27FlowModelWSK.Document" : "VANE27FlowModel.Document");
  EXPECT_EQ(docTemplate->GetDocString(CVdDocTemplate::kTypeName),
            GetParam() ? "Wetland Sweep Kit" : "Flow Model");
  EXPECT_EQ(docTemplate->GetStringId(), GetParam() ? 19200 : 18951);
  EXPECT_EQ(docTemplate->GetDocumentClass(), "CGridbayDoc");
  const std::unique_ptr<CV27SetupChildFrame> frame = docTemplate->CreateFrame();
  EXPECT_EQ(frame->navigationClass(), "CNavigationView");
  EXPECT_EQ(frame->firstViewClass(), "CGraphicalView");
  EXPECT_EQ(frame->OnMouseActivate(), 3);
  test::TestHost host;
  EXPECT_EQ(docTemplate->CreateNewDocument(host)->fileKind(), GetParam() ? "v27wsk" : "v27");
}

INSTANTIATE_TEST_SUITE_P(Editions, Plugin, ::testing::Bool(),
                         [](const auto& edition) { return edition.param ? "WetlandSweepKit" : "FlowModel"; });

class Document : public ::testing::Test {
 protected:
  void save() { ASSERT_TRUE(document.OnSaveDocument(folder.file("s.v27"))); }
  test::TemporaryFolder folder;
  test::TestHost host;
  CGridbayDoc document{host};
};

TEST_F(Document, StartsWithAWholeModelAndItsEngine) {
  EXPECT_EQ(document.engine(), "gridbay.exe");
  EXPECT_EQ(document.fileKind(), theEdition.fileKind);
  EXPECT_EQ(document.root().areaDescription->dryingDepth, 0.02F);
  EXPECT_EQ(CGridbayDoc::kCommands[0].text, "&Automatic Validation");
  EXPECT_EQ(CGridbayDoc::kCommands[1].id, 46019);
  EXPECT_FALSE(document.OnCommand(1));
}

TEST_F(Document, AutomaticValidationFlips) {
  EXPECT_FALSE(document.IsChecked(46017));
  EXPECT_TRUE(document.OnCommand(46017));
  EXPECT_EQ(document.automaticValidation(), 1);
  EXPECT_TRUE(document.IsChecked(46017));
  EXPECT_FALSE(document.IsChecked(46019));
  document.OnCommand(46017);
  EXPECT_EQ(document.automaticValidation(), 0);
  document.SetAutomaticValidation(7);
  EXPECT_FALSE(document.IsChecked(46017));
  document.OnCommand(46017);
  EXPECT_EQ(document.automaticValidation(), 1);
}

TEST_F(Document, ValidateShowsTheMessages) {
  document.OnCommand(46019);
  ASSERT_EQ(host.shown.size(), 1U);
  EXPECT_EQ(host.shown[0].text, "Data file  \" \"  is not valid");
  EXPECT_EQ(host.shownFaults, 1U);
}

TEST_F(Document, StartingPassesTheShiftKeyOn) {
  save();
  document.OnCommand(46018);
  host.shift = true;
  document.OnCommand(46018);
  ASSERT_EQ(host.starts.size(), 2U);
  EXPECT_EQ(host.starts[0].engine, "gridbay.exe");
  EXPECT_EQ(host.starts[0].input, folder.file("s.v27"));
  EXPECT_EQ(host.starts[0].flag, 1);
  EXPECT_EQ(host.starts[0].text, "");
  EXPECT_EQ(host.starts[0].further, (std::array<int, 3>{1, 1, 0}));
  EXPECT_EQ(host.starts[1].flag, 0);
}

TEST_F(Document, OnlyASavedFileIsRun) {
  document.OnCommand(46018);
  EXPECT_TRUE(host.starts.empty());
  EXPECT_THAT(host.texts.at(0), HasSubstr("must be saved"));
  save();
  document.SetModifiedFlag();
  host.answer = false;
  document.OnCommand(46018);
  EXPECT_TRUE(host.starts.empty());
  EXPECT_THAT(host.questions.at(0), HasSubstr("not saved"));
  host.answer = true;
  document.OnCommand(46018);
  EXPECT_EQ(host.starts.size(), 1U);
  EXPECT_FALSE(document.IsModified());
}

TEST_F(Document, WithAutomaticValidationFaultsPreventAStart) {
  save();
  document.OnCommand(46017);
  document.OnCommand(46018);
  EXPECT_TRUE(host.starts.empty());
  EXPECT_EQ(host.shownFaults, 1U);
}

TEST(GraphicalView, TheTextStandsInForThePicture) {
  CGraphicalView view;
  view.OnInitialUpdate();
  EXPECT_FALSE(view.picture());
  EXPECT_EQ(CGraphicalView::kText, "Here should be the bathymetry");
  for (const int hint : {1, 3, 4}) EXPECT_FALSE(CGraphicalView::OnUpdate(hint));
  for (const int hint : {0, 2, 5}) EXPECT_TRUE(CGraphicalView::OnUpdate(hint));
}

TEST(LaunchRecords, Accessors) {
  CVdSimpleLaunch launch;
  EXPECT_EQ(launch.GetExitCode(), 0);
  launch.SetEngine("gridbay.exe");
  launch.SetInput("s.v27");
  launch.SetOptions("-x");
  launch.SetEMailAddress("a@b");
  launch.SetSMSAddress("123");
  launch.SetRefreshInterval(5);
  launch.SetProcessID(7);
  launch.SetCheckUseGPU(1);
  launch.SetNoOfSubdomains(2);
  launch.SetUseGPUList({0, 1});
  EXPECT_STREQ(launch.GetEngine(), "gridbay.exe");
  EXPECT_STREQ(launch.GetInput(), "s.v27");
  EXPECT_STREQ(launch.GetEMailAddress(), "a@b");
  EXPECT_EQ(launch.GetSMSAddress(), "123");
  EXPECT_EQ(launch.GetRefreshInterval(), 5U);
  EXPECT_EQ(CVdFileMonitor().GetPath(), "");
  EXPECT_EQ(CVdFileMonitor("x").GetPath(), "x");
  EXPECT_FALSE(CVdFileMonitor("x").IsActive());
}

}  // namespace plugin_plugin_test
}  // namespace gridbay
