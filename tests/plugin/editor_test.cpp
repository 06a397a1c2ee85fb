// What a host finds in each edition's library, whatever edition the test itself is linked with: the summary
// and the cover pages of a document, its saves, and the launch records.

#include <dlfcn.h>
#include <gmock/gmock.h>

#include "plugin/entry_points.h"
#include "plugin/launch_records.h"
#include "tests/support/grids.h"
#include "tests/support/pages.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {

std::ostream& operator<<(std::ostream& out, const SetupSummary::Line& line) {
  return out << line.page << " " << line.subject << ": " << line.text << (line.isKnown ? "" : " (not known)");
}

namespace plugin_editor_test {

using ::testing::HasSubstr;
using Line = SetupSummary::Line;
using Lines = std::vector<Line>;

class EditorOf : public ::testing::TestWithParam<bool> {
 protected:
  EditorOf()
      : library(::dlopen(test::programPath(GetParam() ? "v27nestedwsk.so" : "v27nested.so").c_str(),
                         RTLD_NOW | RTLD_LOCAL)) {
    if (library == nullptr) throw std::runtime_error(::dlerror());
    const auto make = reinterpret_cast<CVdDocTemplate* (*)(int)>(::dlsym(library, "VdGetDocTemplatePtr"));
    docTemplate.reset(make(0));
    editor = docTemplate->CreateNewDocument(host);
  }
  ~EditorOf() override {
    editor.reset();
    docTemplate.reset();
    ::dlclose(library);
  }
  // Opens a setup that is made of a model's text.
  void open(const std::string& text) {
    ASSERT_TRUE(
        editor->open(folder.write("s.v27", "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS {" + text + "} }")));
  }
  void edit(std::int32_t page, std::string_view label, const std::string& text) {
    Form* form = editor->openPage(page);
    ASSERT_NE(form, nullptr);
    Control& control = *form->find(label);
    control.text = text;
    form->act(control);
  }

  void* library;
  test::TemporaryFolder folder;
  test::TestHost host;
  std::unique_ptr<CVdDocTemplate> docTemplate;
  std::unique_ptr<SetupEditor> editor;
};

TEST_P(EditorOf, ANewSetupInAFewLines) {
  const SetupSummary summary = editor->summary();
  EXPECT_FALSE(summary.gridsAreRead);
  EXPECT_EQ(summary.lines,
            (Lines{{27, "Area 1", "no file chosen", false},
                   {39, "Period", "1990-01-01 12:00:00 to 1990-01-01 12:50:00, 100 steps of 30 s", true},
                   {39, "Greatest Courant number", "not known until the grids are read", false},
                   {28, "Open boundaries", "0, program detected", true},
                   {40, "Sources and sinks", "0", true}}));
}

TEST_P(EditorOf, TheSummaryFollowsTheCheckAndTheEdits) {
  test::writeGrid(folder.file("a.tsb2"), {}, [](int, int) { return -10.0F; });
  const std::string text =
      "BATHYMETRY_SELECTION { No_Of_Areas 1; AREA_1 { DATA_FILE { FILE_NAME (file)\"a.tsb2\" } } };"
      "OPEN_BOUNDARY { Number_Of_Boundaries 5; Default_Position 0;"
      "BOUNDARY_1 { First_Point 0 1; Last_Point 0 2 }; BOUNDARY_2 { First_Point 0 4; Last_Point 0 5 };"
      "BOUNDARY_3 { First_Point 2 0; Last_Point 3 0 }; BOUNDARY_4 { First_Point 5 0; Last_Point 6 0 };"
      "BOUNDARY_5 { First_Point 8 0; Last_Point 9 0 } };"
      "SOURCE_AND_SINK { Number_Of_Sources 1; SOURCE_SINK_1 { Source_Point 3 4 } };"
      "SIMULATION_PERIOD { Number_Of_Timesteps 1; Time_Step_Interval 6.0 }";
  open(text);
  EXPECT_EQ(editor->summary().lines[0], (Line{27, "Area 1", "a.tsb2, not read yet", false}));
  EXPECT_FALSE(editor->summary().gridsAreRead);
  EXPECT_TRUE(editor->command(46019));
  EXPECT_TRUE(editor->summary().gridsAreRead);
  // 6 s x sqrt(9.82 m/s2 x 10 m) / 30 m
  EXPECT_EQ(editor->summary().lines,
            (Lines{{27, "Area 1", "10 x 8 points, 30 m apart, a.tsb2", true},
                   {39, "Period", "1990-01-01 12:00:00 to 1990-01-01 12:00:06, 1 step of 6 s", true},
                   {39, "Greatest Courant number", "1.98 in Area 1", true},
                   {28, "Open boundaries",
                    "5, user specified: (0,1) - (0,2), (0,4) - (0,5), (2,0) - (3,0) and 2 more", true},
                   {40, "Sources and sinks", "1: (3,4)->", true}}));
  edit(39, "Time step interval:", "3");
  EXPECT_EQ(editor->summary().lines[2].text, "0.991 in Area 1");
  editor->undo();
  EXPECT_EQ(editor->summary().lines[2].text, "1.98 in Area 1");
}

TEST_P(EditorOf, AnotherFileHasNotBeenRead) {
  test::writeGrid(folder.file("a.tsb2"));
  open(
      "BATHYMETRY_SELECTION { No_Of_Areas 1; AREA_1 { DATA_FILE { FILE_NAME (file)\"a.tsb2\" } } };"
      "OPEN_BOUNDARY { Number_Of_Boundaries 0; Default_Position 0 }");
  editor->command(46019);
  const Line read = editor->summary().lines[0];
  EXPECT_EQ(read.text, "10 x 8 points, 30 m apart, a.tsb2");
  CV27SetupGridWnd& areas = *editor->openPage(27)->find("Areas")->grid;
  ASSERT_EQ(areas.StoreStyleRowCol(1, 1, "b.tsb2"), 1);
  EXPECT_EQ(editor->summary().lines[0], (Line{27, "Area 1", "b.tsb2, not read yet", false}));
  EXPECT_FALSE(editor->summary().gridsAreRead);
  editor->undo();
  EXPECT_EQ(editor->summary().lines[0], read);
}

TEST_P(EditorOf, AnInnerAreaIsTold) {
  if (GetParam()) GTEST_SKIP() << "this edition has one area";
  open(
      "BATHYMETRY_SELECTION { No_Of_Areas 2; AREA_2 { DATA_FILE { FILE_NAME (file)\"b.tsb2\" }; Origin 4 5; "
      "Enclosing_Area 1 } }");
  EXPECT_EQ(editor->summary().lines[1],
            (Line{27, "Area 2", "b.tsb2, from (4,5) of Area 1, not read yet", false}));
}

TEST_P(EditorOf, StatesOfTheModelAreKnownAgain) {
  const std::uint64_t first = editor->modelState();
  edit(26, "Drying depth:", "0.01");
  const std::uint64_t second = editor->modelState();
  edit(26, "Drying depth:", "0.015");
  const std::uint64_t third = editor->modelState();
  EXPECT_NE(first, second);
  EXPECT_NE(second, third);
  editor->undo();
  EXPECT_EQ(editor->modelState(), second);
  edit(26, "Flooding depth:", "0.9");
  EXPECT_NE(editor->modelState(), third);
  editor->undo();
  editor->undo();
  EXPECT_EQ(editor->modelState(), first);
  editor->redo();
  EXPECT_EQ(editor->modelState(), second);
  open("");
  for (const std::uint64_t old : {first, second, third}) EXPECT_NE(editor->modelState(), old);
}

TEST_P(EditorOf, AStateIsKnownAgainWhereTheOldestEditsAreForgotten) {
  constexpr int kEdits = 1010;  // more than are kept
  std::vector<std::uint64_t> states;
  for (int i = 1; i <= kEdits; ++i) {
    edit(26, "Drying depth:", std::to_string(i * 0.001));
    states.push_back(editor->modelState());
  }
  int undone = 0;
  for (; editor->undoable(); ++undone) editor->undo();
  ASSERT_LT(undone, kEdits);
  EXPECT_EQ(editor->modelState(), states[static_cast<std::size_t>(kEdits - undone) - 1]);
}

TEST_P(EditorOf, EverySaveIsTold) {
  int saves = 0;
  editor->onSave([&saves] { ++saves; });
  EXPECT_FALSE(editor->save(folder.file("no/s.v27")));
  EXPECT_EQ(saves, 0);
  EXPECT_TRUE(editor->save(folder.file("s.v27")));
  EXPECT_EQ(saves, 1);
  edit(26, "Drying depth:", "0.01");
  EXPECT_TRUE(editor->command(46018));  // asks, saves and starts
  EXPECT_EQ(saves, 2);
  EXPECT_EQ(host.starts.size(), 1U);
  EXPECT_FALSE(editor->isModified());
}

TEST_P(EditorOf, AFileThatMayNotBeWrittenOverStays) {
  class Refusing final : public test::TestHost {
   public:
    bool mayWriteOver(const std::string& path) override {
      asked.push_back(path);
      return false;
    }
    std::vector<std::string> asked;
  };
  Refusing refusing;
  const std::unique_ptr<SetupEditor> other = docTemplate->CreateNewDocument(refusing);
  const std::string path = folder.write("s.v27", "VANE27_NESTED_MODEL {}");
  ASSERT_TRUE(other->open(path));
  EXPECT_FALSE(other->save(path));
  EXPECT_EQ(refusing.asked, std::vector<std::string>{path});
  EXPECT_EQ(test::textOf(path), "VANE27_NESTED_MODEL {}");
}

TEST_P(EditorOf, ACheckWithNoFaultsIsShownBeforeAStart) {
  test::writeGrid(folder.file("a.tsb2"), {}, [](int, int) { return -10.0F; });
  open("BATHYMETRY_SELECTION { No_Of_Areas 1; AREA_1 { DATA_FILE { FILE_NAME (file)\"a.tsb2\" } } }");
  host.shownFaults = 99;
  EXPECT_TRUE(editor->command(46017));
  EXPECT_TRUE(editor->command(46018));
  EXPECT_EQ(host.shownFaults, 0U);
  EXPECT_EQ(host.starts.size(), 1U);
}

TEST_P(EditorOf, TheOpenPageShowsTheModelAfterACheck) {
  test::writeGrid(folder.file("a.tsb2"), {}, [](int, int) { return -10.0F; });
  open(
      "BATHYMETRY_SELECTION { No_Of_Areas 1; AREA_1 { DATA_FILE { FILE_NAME (file)\"a.tsb2\" } } };"
      "SIMULATION_PERIOD { Time_Step_Interval 6.0 }");
  Form* form = editor->openPage(39);
  EXPECT_EQ(form->find("Max Courant No:")->text, "");
  editor->command(46019);
  EXPECT_EQ(form->find("Max Courant No:")->text.substr(0, 4), "1.98");
}

TEST_P(EditorOf, CoverPagesFitTheEdition) {
  const SetupEditor::Cover model = editor->cover(1);
  EXPECT_EQ(model.title, GetParam() ? "VANE 27 Wetland Sweep Kit" : "VANE 27 Flow Model");
  EXPECT_EQ(model.picture, GetParam() ? "wetland" : "nested-grids");
  EXPECT_EQ(editor->cover(2).title, "Basic Parameters");
  EXPECT_EQ(editor->cover(2).text.find("**Module Selection**") != std::string::npos, !GetParam());
  EXPECT_EQ(editor->cover(4).text.find("eddy viscosity") != std::string::npos, !GetParam());
  EXPECT_THAT(editor->cover(42).text, HasSubstr("**Weirs**"));
  EXPECT_EQ(editor->cover(42).text.find("wetland") != std::string::npos, GetParam());
  // One page serves both mud modules, and in both editions.
  EXPECT_EQ(editor->cover(5).text, editor->cover(6).text);
  EXPECT_EQ(editor->cover(5).title, "Mud Transport Parameters");
  EXPECT_EQ(editor->cover(61).title, "Bed Parameters");
  EXPECT_EQ(editor->cover(115).title, "AD Transport Parameters");
  // Those without a page of their own, and any number.
  for (const std::int32_t id : {8, 124, 141, 0, -1, 147, 33}) {
    EXPECT_EQ(editor->cover(id).title, model.title) << id;
    EXPECT_THAT(editor->cover(id).text, HasSubstr("nothing to fill in")) << id;
  }
  EXPECT_EQ(editor->cover(43).title, "Initial Surface Elevation");
  EXPECT_THAT(editor->cover(43).text, HasSubstr("not a part of this version"));
}

TEST_P(EditorOf, TheLaunchRecordsAreExported) {
  constexpr const char* kAccessors[] = {
      "_ZNK7gridbay15CVdSimpleLaunch11GetExitCodeEv",
      "_ZN7gridbay15CVdSimpleLaunch12SetProcessIDEj",
      "_ZN7gridbay15CVdSimpleLaunch9SetEngineEPKc",
      "_ZNK7gridbay15CVdSimpleLaunch9GetEngineEv",
      "_ZN7gridbay15CVdSimpleLaunch8SetInputEPKc",
      "_ZNK7gridbay15CVdSimpleLaunch8GetInputEv",
      "_ZN7gridbay15CVdSimpleLaunch10SetOptionsEPKc",
      "_ZN7gridbay15CVdSimpleLaunch15SetEMailAddressEPKc",
      "_ZNK7gridbay15CVdSimpleLaunch15GetEMailAddressEv",
      "_ZN7gridbay15CVdSimpleLaunch13SetSMSAddressERKNSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEE",
      "_ZNK7gridbay15CVdSimpleLaunch13GetSMSAddressB5cxx11Ev",
      "_ZN7gridbay15CVdSimpleLaunch18SetRefreshIntervalEj",
      "_ZNK7gridbay15CVdSimpleLaunch18GetRefreshIntervalEv",
      "_ZN7gridbay15CVdSimpleLaunch14SetCheckUseGPUEi",
      "_ZN7gridbay15CVdSimpleLaunch17SetNoOfSubdomainsEi",
      "_ZN7gridbay15CVdSimpleLaunch13SetUseGPUListESt6vectorIiSaIiEE",
      "_ZN7gridbay15CVdSimpleLaunchC1Ev",
      "_ZN7gridbay14CVdFileMonitorC1ENSt7__cxx1112basic_stringIcSt11char_traitsIcESaIcEEE",
      "_ZNK7gridbay14CVdFileMonitor7GetPathB5cxx11Ev",
      "_ZNK7gridbay14CVdFileMonitor8IsActiveEv",
  };
  for (const char* name : kAccessors) EXPECT_NE(::dlsym(library, name), nullptr) << name;
  // Those of the library work on a record of the host.
  CVdSimpleLaunch launch;
  const auto set = reinterpret_cast<void (*)(CVdSimpleLaunch*, const char*)>(
      ::dlsym(library, "_ZN7gridbay15CVdSimpleLaunch9SetEngineEPKc"));
  set(&launch, "gridbay.exe");
  EXPECT_STREQ(launch.GetEngine(), "gridbay.exe");
  // All else stays inside.
  EXPECT_EQ(::dlsym(library, "_ZN7gridbay12wholeLettersESt17basic_string_viewIcSt11char_traitsIcEEm"),
            nullptr);
}

INSTANTIATE_TEST_SUITE_P(Editions, EditorOf, ::testing::Bool(),
                         [](const auto& edition) { return edition.param ? "WetlandSweepKit" : "FlowModel"; });

TEST(LaunchRecords, ATextThatIsTooLongIsCutToFit) {
  CVdSimpleLaunch launch;
  launch.SetInput("s.v27");
  launch.SetEngine(std::string(511, 'x').c_str());
  EXPECT_EQ(std::string(launch.GetEngine()), std::string(511, 'x'));
  launch.SetEngine(std::string(100000, 'y').c_str());
  EXPECT_EQ(std::string(launch.GetEngine()), std::string(511, 'y'));
  EXPECT_STREQ(launch.GetInput(), "s.v27");  // the field behind it
  launch.SetEMailAddress((std::string(510, 'z') + "ø").c_str());
  EXPECT_EQ(std::string(launch.GetEMailAddress()), std::string(510, 'z'));
  launch.SetEngine("short");
  EXPECT_STREQ(launch.GetEngine(), "short");
  launch.SetEngine(nullptr);
  EXPECT_STREQ(launch.GetEngine(), "");
}

}  // namespace plugin_editor_test
}  // namespace gridbay
