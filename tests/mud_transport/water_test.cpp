// What the water has: initial conditions, boundaries, sources, dispersion; lines, boxes and results.

#include <gmock/gmock.h>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "hydrodynamic/result.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/result.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/task_selection.h"
#include "platform/units/units.h"
#include "tests/support/grids.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace mud_transport_water_test {

using test::savedText;
using Texts = std::vector<std::string>;
using Floats = std::vector<float>;

class MudWater : public ::testing::Test {
 protected:
  // The texts of an object's check, all of one page.
  static Texts faults(CKvsBase& object, PageId page, int deep = 1) {
    const ValidationList messages = test::messagesOf(object, deep);
    for (const CMessage& message : messages) {
      EXPECT_EQ(message.page, page);
      EXPECT_EQ(message.severity, Severity::fault);
    }
    return test::textsOf(messages);
  }
  static std::string notValid(const std::string& name) {
    return "Data file  \" " + name + "\"  is not valid";
  }
  bool access(CKvsBase& object, PathAccess::What what, std::string_view path, std::string_view text,
              KvsFile* out = nullptr) {
    const KvsHandle file = test::fileOf(text);
    const std::string documentPath = "/case/setup.v27";
    PathAccess access{what, out, &file->tree().root(), &documentPath};
    return object.AccessPath(path, access);
  }
  std::string shown(CKvsBase& object, std::string_view path) {
    const KvsHandle out = kvsCreate();
    EXPECT_TRUE(access(object, PathAccess::What::write, path, "", out.get())) << path;
    return *out->text();
  }
  bool set(CKvsBase& object, std::string_view section, std::string_view text) {
    const std::string keyword(text.substr(0, text.find(' ')));
    return access(object, PathAccess::What::set, std::string(section) + "/" + keyword, text);
  }
  void setExtent(int area, int noJ, int noK) {
    CBathymetryObjectKvs& held = *root.bathymetry->GetArea(area);
    held.noJ = noJ;
    held.noK = noK;
    held.dx = held.dy = 30;
  }

  test::TemporaryFolder folder;
  test::Model model;
  CGlobalKvs& root = model.root;
  CNmtTaskSelectionKvs& task = *root.nmtTaskSelection;
};

class MudInitial : public MudWater {
 protected:
  CNmtInitialConcentrationKvs& initial = *root.nmtInitialConcentration;
};

constexpr const char* kValueOfFraction =
    "            Data_Format 0\n"
    "            Constant_Value 0.0\n"
    "            File_Name (file)\"\"\n"
    "            Item_Numbers 1\n";

TEST_F(MudInitial, FractionsHaveAComponentEach) {
  task.SetFractions(2);
  std::string text = "INITIAL_CONCENTRATIONS {\n";
  for (const char* component : {"1", "2"})
    text += std::string("    COMPONENT_") + component + " {\n        AREA_1 {\n" + kValueOfFraction +
            "        }\n    }\n";
  EXPECT_EQ(savedText(initial), text + "}\n");
  task.SetSalinity(true);  // one more, at the head
  initial.at(1).at(1).value = 35;
  EXPECT_THAT(savedText(initial), ::testing::HasSubstr("COMPONENT_3"));
  EXPECT_THAT(savedText(initial), ::testing::Not(::testing::HasSubstr("SALINITY")));
  EXPECT_EQ(shown(initial, "INITIAL_CONCENTRATIONS/COMPONENT_1/AREA_1/Constant_Value"),
            "Constant_Value 35.0\n");
}

// Two layers below salinity and fraction, in two areas; the whole text.
const std::string kOfLayers =
    "INITIAL_CONCENTRATIONS {\n"
    "    SALINITY_COMPONENT {\n"
    "        AREA_1 {\n"
    "            Data_Format 0\n"
    "            Constant_Value 35.0\n"
    "            File_Name (file)\"\"\n"
    "            Item_Numbers 1\n"
    "        }\n"
    "        AREA_2 {\n"
    "            Data_Format 1\n"
    "            Constant_Value 30.0\n"
    "            File_Name (file)\"s.tsb2\"\n"
    "            Item_Numbers 2\n"
    "        }\n"
    "    }\n"
    "    COMPONENT_1 {\n"
    "        AREA_1 {\n"
    "            Data_Format 0\n"
    "            Constant_Value 0.5\n"
    "            File_Name (file)\"\"\n"
    "            Item_Numbers 1\n"
    "        }\n"
    "        AREA_2 {\n"
    "            Data_Format 0\n"
    "            Constant_Value 0.25\n"
    "            File_Name (file)\"\"\n"
    "            Item_Numbers 1\n"
    "        }\n"
    "    }\n"
    "    BED_THICKNESS {\n"
    "        LAYER_1 {\n"
    "            Data_Format 0\n"
    "            Constant_Value 1.5\n"
    "            AREA_1 {\n"
    "                File_Name (file)\"\"\n"
    "                Item_Numbers 1\n"
    "            }\n"
    "            AREA_2 {\n"
    "                File_Name (file)\"\"\n"
    "                Item_Numbers 1\n"
    "            }\n"
    "        }\n"
    "        LAYER_2 {\n"
    "            Data_Format 1\n"
    "            Constant_Value 2.5\n"
    "            AREA_1 {\n"
    "                File_Name (file)\"t1.tsb2\"\n"
    "                Item_Numbers 1\n"
    "            }\n"
    "            AREA_2 {\n"
    "                File_Name (file)\"t2.tsb2\"\n"
    "                Item_Numbers 3\n"
    "            }\n"
    "        }\n"
    "    }\n"
    "}\n";

class MudInitialOfLayers : public MudInitial {
 protected:
  MudInitialOfLayers() {
    root.bathymetry->SetNoAreas(2);
    task.SetLayers(2);
    task.SetSalinity(true);
  }
};

TEST_F(MudInitialOfLayers, AreReadAndWritten) {
  test::load(initial, kOfLayers);
  EXPECT_EQ(savedText(initial), kOfLayers);
  // Into area 1 alone.
  EXPECT_EQ(initial.at(3).at(1).value, 1.5F);
  EXPECT_EQ(initial.at(3).at(2).value, 0.0F);
  EXPECT_EQ(initial.at(4).at(1).format, 1);
  EXPECT_EQ(initial.at(4).at(2).format, 0);
  EXPECT_EQ(initial.at(4).at(2).file.fileName.text(), "t2.tsb2");
  EXPECT_TRUE(model.host.texts.empty());
  CNmtInitialConcentrationKvs copy(&root);
  copy.CopyFrom(initial);
  EXPECT_EQ(savedText(copy), kOfLayers);
  EXPECT_TRUE(copy.SameState(initial));
}

TEST_F(MudInitialOfLayers, WithoutSalinityItHasNoSection) {
  task.SetSalinity(false);
  task.SetLayers(1);
  root.bathymetry->SetNoAreas(1);
  EXPECT_EQ(savedText(initial), std::string("INITIAL_CONCENTRATIONS {\n"
                                            "    COMPONENT_1 {\n"
                                            "        AREA_1 {\n") +
                                    kValueOfFraction +
                                    "        }\n"
                                    "    }\n"
                                    "    BED_THICKNESS {\n"
                                    "        LAYER_1 {\n"
                                    "            Data_Format 0\n"
                                    "            Constant_Value 0.0\n"
                                    "            AREA_1 {\n"
                                    "                File_Name (file)\"\"\n"
                                    "                Item_Numbers 1\n"
                                    "            }\n"
                                    "        }\n"
                                    "    }\n"
                                    "}\n");
  task.SetLayers(0);
  EXPECT_THAT(savedText(initial), ::testing::HasSubstr("    BED_THICKNESS {}\n"));
}

TEST_F(MudInitialOfLayers, WhatTheFileLacksStays) {
  test::load(initial, kOfLayers);
  test::load(initial,
             "INITIAL_CONCENTRATIONS { COMPONENT_2 { AREA_1 { Constant_Value 9.0 } }\n"
             " BED_THICKNESS { LAYER_2 { AREA_2 {} }; LAYER_3 { Constant_Value 8.0 } } }");
  test::load(initial, "INITIAL_CONCENTRATIONS { LAYER_1 { Constant_Value 7.0 } }");
  test::load(initial, "OTHER {}");
  EXPECT_EQ(savedText(initial), kOfLayers);
  EXPECT_TRUE(model.host.texts.empty());
}

TEST_F(MudInitialOfLayers, ByPath) {
  test::load(initial, kOfLayers);
  const std::string top = "INITIAL_CONCENTRATIONS";
  EXPECT_EQ(shown(initial, top), kOfLayers);
  EXPECT_EQ(shown(initial, top + "/BED_THICKNESS/LAYER_2/Constant_Value"), "Constant_Value 2.5\n");
  EXPECT_EQ(shown(initial, top + "/bed_thickness/layer_2/AREA_2"),
            "AREA_2 {\n    File_Name (file)\"t2.tsb2\"\n    Item_Numbers 3\n}\n");
  EXPECT_EQ(shown(initial, top + "/SALINITY_COMPONENT/AREA_2/Constant_Value"), "Constant_Value 30.0\n");
  EXPECT_EQ(shown(initial, top + "/COMPONENT_1/AREA_1/Constant_Value"), "Constant_Value 0.5\n");
  EXPECT_EQ(shown(initial, top + "/COMPONENT_1/AREA_1").substr(0, 8), "AREA_1 {");
  for (const char* section : {"/SALINITY_COMPONENT", "/COMPONENT_1", "/BED_THICKNESS"})
    EXPECT_NE(kOfLayers.find(shown(initial, top + section).substr(0, 12)), std::string::npos) << section;
  EXPECT_THAT(shown(initial, top + "/BED_THICKNESS/LAYER_1"), ::testing::StartsWith("LAYER_1 {\n"));
  EXPECT_TRUE(set(initial, top + "/BED_THICKNESS/LAYER_1", "Constant_Value 4.0"));
  EXPECT_EQ(initial.at(3).at(1).value, 4.0F);
  EXPECT_TRUE(set(initial, top + "/BED_THICKNESS/LAYER_1/AREA_2", "File_Name (file)\"x.tsb2\""));
  EXPECT_EQ(initial.at(3).at(2).file.fileName.text(), "x.tsb2");
  for (const char* section :
       {"/COMPONENT_2/AREA_1", "/COMPONENT_0/AREA_1", "/BED_THICKNESS/LAYER_3", "/BED_THICKNESS/LAYER_0",
        "/BED_THICKNESS/LAYER_1/AREA_1", "/BED_THICKNESS", "/LAYER_1"})
    EXPECT_FALSE(set(initial, top + section, "Constant_Value 4.0")) << section;
  task.SetFractions(2);
  EXPECT_FALSE(set(initial, top + "/SALINITY_COMPONENT/AREA_1", "Constant_Value 4.0"));
  EXPECT_FALSE(set(initial, top + "/BED_THICKNESS/LAYER_1", "Constant_Value 4.0"));
  EXPECT_TRUE(set(initial, top + "/COMPONENT_3/AREA_1", "Constant_Value 4.0"));
  EXPECT_EQ(initial.at(3).at(1).value, 4.0F);
}

TEST_F(MudInitialOfLayers, MapsAreChecked) {
  const auto check = [this](int deep = 1) { return faults(initial, PageId::mtInitialConcentration, deep); };
  setExtent(1, 10, 8);
  setExtent(2, 5, 5);
  EXPECT_EQ(check(), Texts{});
  initial.at(2).at(2).format = 1;
  initial.at(2).at(2).file.fileName = "c.tsb2";
  EXPECT_EQ(check(), Texts{notValid("c.tsb2")});
  EXPECT_EQ(check(0), Texts{});
  initial.at(2).at(2).format = 0;
  // The format of area 1 holds for a layer in all areas.
  initial.at(3).at(2).format = 1;
  EXPECT_EQ(check(), Texts{});
  initial.at(3).at(1).format = 1;
  const std::string first = folder.file("t1.tsb2");
  const std::string second = folder.file("t2.tsb2");
  initial.at(3).at(1).file.fileName = first;
  initial.at(3).at(2).file.fileName = second;
  EXPECT_EQ(check(), (Texts{notValid(first), notValid(second)}));
  test::writeGrid(first, {.itemType = item::kLayerThickness});
  test::writeGrid(second, {.noJ = 5, .noK = 5});  // of what quantity is not asked
  EXPECT_EQ(check(), Texts{});
  test::writeGrid(second, {.noJ = 5, .noK = 6});
  EXPECT_EQ(check(), Texts{notValid(second)});
  test::writeGrid(second, {.noJ = 5, .noK = 5, .steps = 2});  // varies, and is too short
  EXPECT_EQ(check(), Texts{notValid(second)});
  CVdFileSelectorDlg selector;
  initial.at(3).at(1).RequestDataFile(selector, 3, 1);
  initial.at(1).at(1).RequestDataFile(selector, 1, 1);
  EXPECT_EQ(selector.requests()[0]->description(), "Thickness layer no. 1");
  EXPECT_EQ(selector.requests()[1]->description(), "Initial Conditions");
}

class MudPlaces : public MudWater {
 protected:
  MudPlaces() {
    root.boundary->SetNoBoundaries(2);
    root.boundary->GetItem(1)->Set(0, 5, 0, 9);
    root.sourceSink->SetNoSources(1);
    root.bathymetry->GetArea(1)->dy = 30;
  }
  // A file that covers the simulation.
  void write(int items, std::vector<TsbGridAxis> axes = {}, std::size_t steps = 2) {
    TsbDefinition definition;
    definition.time.step = 3000;
    definition.time.count = steps;
    definition.axes = std::move(axes);
    const std::string unit(qunBaseUnit(item::kSuspendedSediment)->text);
    for (int i = 0; i < items; ++i) definition.items.push_back({"Item", item::kSuspendedSediment, unit});
    test::writeFile(path, definition);
  }
  CNmtBoundaryKvs& boundaries = *root.nmtBoundary;
  CNmtSourceSinkKvs& sources = *root.nmtSourceSink;
  std::string path = folder.file("data.tsb0");
};

TEST_F(MudPlaces, BoundariesKeepTheOrderOfTheList) {
  task.SetFractions(1);
  task.SetSalinity(true);
  boundaries.at(2).format = 2;
  boundaries.at(2).constants = {35, 0.5F};
  boundaries.at(2).file = "/case/b.tsb1";
  const std::string text =
      "BOUNDARY_CONCENTRATIONS {\n"
      "    BOUNDARY_1 {\n"
      "        Data_Format 0\n"
      "        Constant_Value_1 0.0\n"
      "        Constant_Value_2 0.0\n"
      "        FILE_NAME (file)\"\"\n"
      "    }\n"
      "    BOUNDARY_2 {\n"
      "        Data_Format 2\n"
      "        Constant_Value_1 35.0\n"
      "        Constant_Value_2 0.5\n"
      "        FILE_NAME (file)\"b.tsb1\"\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(boundaries), text);
  boundaries.at(2).constants = {1, 1};
  test::load(boundaries, text);
  EXPECT_EQ(boundaries.at(2).constants, (Floats{35, 0.5F}));
}

// A new source takes what is transported when it is made, a load makes it before the task is known.
TEST_F(MudPlaces, NoConstantOfASourceIsLostOnFile) {
  const auto reloaded = [this](int fractions, int layers) {
    root.sourceSink->SetNoSources(0);
    if (layers > 0) task.SetLayers(layers);
    task.SetSalinity(true);
    root.sourceSink->SetNoSources(1);
    Floats& constants = sources.at(1).constants;
    for (std::size_t i = 0; i < constants.size(); ++i) constants[i] = 30.0F - static_cast<float>(i);
    const std::string saved = savedText(sources);
    test::Model other;
    other.root.sourceSink->SetNoSources(1);
    if (layers > 0) other.root.nmtTaskSelection->SetLayers(layers);
    if (fractions > 0) other.root.nmtTaskSelection->SetFractions(fractions);
    other.root.nmtTaskSelection->SetSalinity(true);
    test::load(*other.root.nmtSourceSink, saved);
    task.SetSalinity(false);
    return other.root.nmtSourceSink->at(1).constants;
  };
  EXPECT_EQ(reloaded(3, 0), (Floats{30, 29, 28, 27}));
  EXPECT_EQ(reloaded(0, 2), (Floats{30, 29, 0}));
}

TEST_F(MudPlaces, SourcesHaveSalinityLastOnFile) {
  sources.at(1).constants = {1, 2, 3};
  const auto text = [](const char* first, const char* second, const char* third) {
    return std::string(
               "SOURCE_CONCENTRATIONS {\n"
               "    SOURCE_SINK_1 {\n"
               "        Data_Format 0\n"
               "        Constant_Value_1 ") +
           first + "\n        Constant_Value_2 " + second + "\n        Constant_Value_3 " + third +
           "\n        FILE_NAME (file)\"\"\n    }\n}\n";
  };
  EXPECT_EQ(savedText(sources), text("1.0", "2.0", "3.0"));
  task.SetSalinity(true);  // the constants stay as they are
  EXPECT_EQ(savedText(sources), text("2.0", "3.0", "1.0"));
  test::load(sources, text("0.5", "0.25", "35.0"));
  EXPECT_EQ(sources.at(1).constants, (Floats{35, 0.5F, 0.25F}));
  EXPECT_TRUE(set(sources, "SOURCE_CONCENTRATIONS/SOURCE_SINK_1", "Constant_Value_3 30.0"));
  EXPECT_EQ(sources.at(1).constants[0], 30.0F);
  EXPECT_FALSE(set(sources, "SOURCE_CONCENTRATIONS/SOURCE_SINK_1", "Constant_Value_4 30.0"));
  CNmtSourceSinkKvs copy(&root);
  copy.CopyFrom(sources);
  EXPECT_EQ(savedText(copy), savedText(sources));
}

TEST_F(MudPlaces, SectionsThatAreMissing) {
  test::load(boundaries, "BOUNDARY_CONCENTRATIONS {}");
  test::load(sources, "SOURCE_CONCENTRATIONS {}");
  test::load(*root.nmtDispersionCoef, "DISPERSION_CONDITIONS { X_DIRECTION_COEFFICIENTS {} }");
  const std::string boundary =
      "Error in the KVS-FILE\nThe number of MT Boundary sections does not correspond to the number of "
      "Boundaries";
  EXPECT_EQ(model.host.texts,
            (Texts{boundary, boundary,
                   "Error in the KVS-FILE\nThe number of MT Source Sink sections does not correspond to the "
                   "number of Boundaries",
                   "Error in the KVS-FILE\nThe number of MT Dispertion coefficient sections does not "
                   "correspond to the number of sub domaines"}));
}

TEST_F(MudPlaces, AFileHasAnItemForEachFractionAndNoneForSalinity) {
  task.SetFractions(2);
  task.SetSalinity(true);
  boundaries.at(1).format = 1;
  boundaries.at(1).file = path;
  sources.at(1).format = 1;
  sources.at(1).file = path;
  const auto check = [this] {
    const Texts told = faults(boundaries, PageId::mtBoundary);
    EXPECT_EQ(faults(sources, PageId::mtSourceSink), told);
    return told;
  };
  const Texts invalid{notValid(path)};
  EXPECT_EQ(check(), invalid);
  write(2);
  EXPECT_EQ(check(), Texts{});
  for (const int items : {1, 3}) {
    write(items);
    EXPECT_EQ(check(), invalid) << items;
  }
  write(2, {}, 1);  // too short
  EXPECT_EQ(check(), invalid);
  write(2, {{5, 0, 30, "m"}});
  EXPECT_EQ(check(), invalid);
  task.SetLayers(4);
  write(1);
  EXPECT_EQ(check(), Texts{});
  boundaries.at(1).format = 2;
  EXPECT_EQ(faults(boundaries, PageId::mtBoundary), invalid);
  write(1, {{5, 0, 30, "m"}});
  EXPECT_EQ(faults(boundaries, PageId::mtBoundary), Texts{});
  write(1, {{6, 0, 30, "m"}});
  EXPECT_EQ(faults(boundaries, PageId::mtBoundary), invalid);
  EXPECT_EQ(faults(boundaries, PageId::mtBoundary, 0), Texts{});
  boundaries.at(1).format = 0;
  sources.at(1).format = 0;
  EXPECT_EQ(check(), Texts{});
}

TEST_F(MudWater, Dispersion) {
  CNmtDispersionCoefKvs& dispersion = *root.nmtDispersionCoef;
  const std::string direction =
      "        Data_Format 0\n"
      "        Constant_Value 0.0\n"
      "        AREA_1 {\n"
      "            File_Name (file)\"\"\n"
      "            Item_Numbers 1\n"
      "        }\n"
      "    }\n";
  EXPECT_EQ(savedText(dispersion),
            "DISPERSION_CONDITIONS {\n"
            "    Dispersion_Prop_to_Current 0\n"
            "    Proportionality_Factor_Xdir 1.0\n"
            "    Proportionality_Factor_Ydir 1.0\n"
            "    Min_Dispersion_Coefficient 0.0\n"
            "    Max_Dispersion_Coefficient 0.0\n"
            "    X_DIRECTION_COEFFICIENTS {\n" +
                direction + "    Y_DIRECTION_COEFFICIENTS {\n" + direction + "}\n");
  const auto check = [&](int deep = 1) { return faults(dispersion, PageId::mtDispersionCoef, deep); };
  setExtent(1, 10, 8);
  root.simulationPeriod->timeStepInterval = 300;
  dispersion.proportional = 1;
  dispersion.minimum = 2;
  EXPECT_EQ(check(), (Texts{"Dispersion Coefficients : Too much Dispersion",
                            "Maximum value must be larger than minimum value"}));
  dispersion.proportional = 0;
  dispersion.formatX = 1;
  dispersion.filesX.at(1).file.fileName = "x.tsb2";
  EXPECT_EQ(check(), Texts{notValid("x.tsb2")});
  EXPECT_EQ(check(0), Texts{});
}

// Lines and boxes: the same but for sections, pages and checks.
template <class List>
struct MudLineOrBox : MudWater {};
struct Lines {
  static auto& list(CGlobalKvs& root) { return *root.nmtLineDischarge; }
  static constexpr const char* kSection = "MT_LINE_DISCHARGE_CALCULATIONS";
  static constexpr const char* kCount = "No_Of_MT_Discharge_Lines";
  static constexpr const char* kItem = "MT_DISCHARGE_LINE_1";
  static constexpr PageId kPage = PageId::mtLineDischarge;
  static constexpr const char* kNoArea = "Line is not embedded in a valid area";
  static constexpr const char* kTooMany =
      "Illegal number of line discharge lines, should be between 0 and 10";
};
struct Boxes {
  static auto& list(CGlobalKvs& root) { return *root.nmtBoxSummation; }
  static constexpr const char* kSection = "BOXES_FOR_MASS_SUMMATION";
  static constexpr const char* kCount = "No_Of_MT_Mass_Boxes";
  static constexpr const char* kItem = "MT_MASS_BOX_1";
  static constexpr PageId kPage = PageId::mtBoxSummation;
  static constexpr const char* kNoArea = "Box is not embedded in a valid area";
  static constexpr const char* kTooMany = "Illegal number of box summation boxes, should be between 0 and 10";
};
using LinesAndBoxes = ::testing::Types<Lines, Boxes>;
TYPED_TEST_SUITE(MudLineOrBox, LinesAndBoxes);

TYPED_TEST(MudLineOrBox, InFileOrderWithAPeriodThatIsNotReadBack) {
  auto& list = TypeParam::list(this->root);
  const std::string section = TypeParam::kSection;
  EXPECT_EQ(savedText(list), section + " {\n    " + TypeParam::kCount + " 0\n}\n");
  list.SetCount(1);
  EXPECT_EQ(list.at(1).entries, (EntryFlags{1, 1, 1}));
  LineOrBox& item = list.at(1);
  item = {1, {1, 2}, {3, 4}, {5, 6, 1}, item.file, "north", {1, 0, 1}};
  item.file.Set("out/l.tsb0", "/case/setup.v27");
  const std::string text = section + " {\n    " + TypeParam::kCount + " 1\n    " + TypeParam::kItem +
                           " {\n"
                           "        Area_Number 1\n"
                           "        Start_Coordinate 1 2\n"
                           "        End_Coordinate 3 4\n"
                           "        Start_Time_Step 5\n"
                           "        End_Time_Step 6\n"
                           "        File_Name (result)\"out/l.tsb0\"\n"
                           "        Title \"north\"\n"
                           "        Component_Numbers 1 3\n"
                           "        No_of_Components_in_Calc 2\n"
                           "    }\n"
                           "}\n";
  EXPECT_EQ(savedText(list), text);
  test::Model other;
  auto& read = TypeParam::list(other.root);
  test::load(read, text);
  EXPECT_EQ(read.at(1).title, "north");
  EXPECT_EQ(read.at(1).steps, (USubLine{0, 100, 1}));
  EXPECT_EQ(read.at(1).entries, (EntryFlags{1, 0, 1}));
  test::load(read, section + " { " + TypeParam::kCount + " 1; " + TypeParam::kItem +
                       " { First_Time_Step 7; Last_Time_Step 8 } }");
  EXPECT_EQ(read.at(1).steps, (USubLine{7, 8, 1}));
  // The flags do not follow layers and salinity, only the fractions.
  this->task.SetLayers(2);
  this->task.SetSalinity(true);
  EXPECT_EQ(list.at(1).entries.size(), 3U);
  EXPECT_EQ(list.entryNames(), (Texts{"Salinity", "Fraction"}));
}

TYPED_TEST(MudLineOrBox, Checks) {
  auto& list = TypeParam::list(this->root);
  list.SetCount(11);
  for (int number = 1; number <= 11; ++number) {
    list.at(number).areaNumber = 9;
    list.at(number).file = "l.tsb0";
  }
  list.at(2).steps = {6, 5, 1};
  list.at(3).file = "";
  ValidationList messages;
  list.Validate(messages, 1);
  ASSERT_EQ(messages.size(), 14U);
  EXPECT_EQ(messages[0], (CMessage{PageId::mtResult, TypeParam::kTooMany, Severity::fault}));
  EXPECT_EQ(messages[1], (CMessage{PageId::mtLineDischarge, TypeParam::kNoArea, Severity::fault}));
  EXPECT_EQ(messages[3],
            (CMessage{TypeParam::kPage, "The first time step is greater than the last", Severity::fault}));
  const bool isLine = list.kind().isLine;  // whose file is checked first
  EXPECT_EQ(messages[isLine ? 4 : 5], (CMessage{TypeParam::kPage, MudWater::notValid(""), Severity::fault}));
}

class MudResult : public MudWater {
 protected:
  MudResult() {
    setExtent(1, 12, 10);
    root.bathymetry->GetArea(1)->grid = CVdArray2D<float>(12, 10);
  }
  CNmtResultKvs& results = *root.nmtResult;
};

TEST_F(MudResult, InFileOrder) {
  results.outputs.SetCount(1);
  results.outputs.at(1).title = "bay";
  results.outputs.at(1).file.Set("bay.tsb2", "/case/setup.v27");
  results.includeLayers = 0;
  results.netSedimentationInMm = 0;
  results.generateHotStart = true;
  EXPECT_THAT(savedText(results), ::testing::HasSubstr("Generate_Hotstart #false"));
  root.nhdResult->generateHotStart = true;
  results.hotStarts.at(1).file.Set("h.tsb2", "/case/setup.v27");
  const std::string whole =
      "OUTPUT_SPECIFICATION {\n"
      "    Number_Of_Output_areas 1\n"
      "    Include_Layers_In_Output_File 0\n"
      "    NetSedimentation_in_mm 0\n"
      "    NetSedimentation_in_gm2 1\n"
      "    OUTPUT_AREA_1 {\n"
      "        X_Range_And_Interval 0 11 1\n"
      "        Y_Range_And_Interval 0 9 1\n"
      "        Area_no 1\n"
      "        First_Time_Step 0\n"
      "        Last_Time_Step 100\n"
      "        Time_Step_Interval 1\n"
      "        Title \"bay\"\n"
      "        File_Name (result)\"bay.tsb2\"\n"
      "    }\n"
      "    Generate_Hotstart #true\n"
      "    HOTSTART_FILES {\n"
      "        AREA_1 {\n"
      "            Title \"\"\n"
      "            File_Name (result)\"h.tsb2\"\n"
      "        }\n"
      "    }\n"
      "}\n";
  EXPECT_EQ(savedText(results), whole);
  test::Model other;
  other.root.nhdResult->generateHotStart = true;
  test::load(*other.root.nmtResult, whole);
  EXPECT_EQ(savedText(*other.root.nmtResult), whole);
  other.root.nmtResult->CopyFrom(results);
  EXPECT_EQ(savedText(*other.root.nmtResult), whole);
}

TEST_F(MudResult, TheOtherUnitIsNotReadBack) {
  test::load(results, "OUTPUT_SPECIFICATION { NetSedimentation_in_gm2 1 }");
  EXPECT_EQ(results.netSedimentationInMm, 1);
  test::load(results, "OUTPUT_SPECIFICATION { NetSedimentation_in_mm 0; NetSedimentation_in_gm2 0 }");
  EXPECT_EQ(results.netSedimentationInMm, 0);
  EXPECT_THAT(savedText(results), ::testing::HasSubstr("NetSedimentation_in_gm2 1\n"));
}

TEST_F(MudResult, Sizes) {
  results.outputs.SetCount(1);
  const auto sizeOf = [](int values) {
    return static_cast<float>(12 * 10 * (101 * values + 1) * 4 / 1048576.0);
  };
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), sizeOf(3));
  task.SetSalinity(true);
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), sizeOf(4));
  task.SetLayers(5);
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), sizeOf(7));
  results.includeLayers = 0;
  EXPECT_FLOAT_EQ(results.OutputSizeMB(), sizeOf(2));
  EXPECT_EQ(results.hotStartItems(), 0);
  results.generateHotStart = true;
  EXPECT_EQ(results.hotStartItems(), 7);
}

TEST_F(MudResult, CountsIntoAllThatAModelWrites) {
  results.outputs.SetCount(1);
  const double alone = root.nhdResult->TotalSizeMB();
  root.moduleSelection->simulationType = module::kMudTransport;
  EXPECT_DOUBLE_EQ(root.nhdResult->TotalSizeMB(), alone + double{results.OutputSizeMB()});
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 0);
  results.generateHotStart = true;
  task.SetFractions(4);
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 4 + 3);
  task.SetSalinity(true);
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 4 + 3 + 1);
  task.SetLayers(5);
  EXPECT_EQ(root.OutputOfModule().hotStartItems, 1 + 5 + 1);
}

TEST_F(MudResult, Checks) {
  results.outputs.SetCount(17);
  for (int number = 1; number <= 17; ++number) results.outputs.at(number).file = "r.tsb2";
  results.outputs.at(2).steps = {0, 101, 1};
  results.generateHotStart = true;
  EXPECT_EQ(faults(results, PageId::mtResult),
            (Texts{"Illegal number of output areas, should be between 0 and 18", "Last timestep out of range",
                   "Filename:  is not valid"}));
}

}  // namespace mud_transport_water_test
}  // namespace gridbay
