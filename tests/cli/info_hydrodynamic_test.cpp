// What `info` tells of the flow calculation.

#include <gmock/gmock.h>

#include <nlohmann/json.hpp>

#include "core/edition.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_info_hydrodynamic_test {

using test::runTool;
using ::testing::EndsWith;
using ::testing::HasSubstr;

class InfoHydrodynamic : public ::testing::Test {
 protected:
  // Three locations, and what a test says of them.
  std::string setupWith(const std::string& module) {
    return folder.write("s.v27",
                        "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { SOURCE_AND_SINK { Number_Of_Sources 3\n"
                        " SOURCE_SINK_1 { Type 0; Source_Point 3 4 }\n"
                        " SOURCE_SINK_2 { Type 1; Sink_Point 5 6 }\n"
                        " SOURCE_SINK_3 { Type 2; Source_Point 1 1; Sink_Point 2 2 } } }\n"
                        " HYDRODYNAMIC_MODULE { " +
                            module + " } }");
  }
  // The lines of the water that comes and goes.
  std::string told(const std::string& module) {
    const std::string text = runTool({"info", setupWith(module)}).out;
    const std::size_t start = text.find("Rain  ");
    return start == text.npos ? text : text.substr(start, text.find("Initial level") - start);
  }
  nlohmann::ordered_json json(const std::string& module) {
    return nlohmann::ordered_json::parse(runTool({"info", setupWith(module), "--json"}).out)["hydrodynamics"];
  }
  test::TemporaryFolder folder;
};

constexpr const char* kConstants =
    "SOURCE_AND_SINK { Evaporation 0.1; Precipitation 12.5; RainOnDryLand #false\n"
    " SOURCE_SINK_1 { Outlet_Dir 45.0; Constant_Magnitude 2.5; Constant_Velocity 0.3 }\n"
    " SOURCE_SINK_2 { Constant_Magnitude -1.0 }\n"
    " SOURCE_SINK_3 { Outlet_Dir 270.0; Constant_Magnitude 7.0; Constant_Velocity 1.0 } }";

constexpr const char* kFiles =
    "SOURCE_AND_SINK { EvaporationType 0; Evaporation { File_Name (file)\"e.tsb0\"; Item_Numbers 3 }\n"
    " PrecipitationType 2; Precipitation { File_Name (file)\"maps/rain.tsb2\"; Item_Numbers 1 }\n"
    " SOURCE_SINK_1 { Data_Format 1; Outlet_Dir 10.0; File_Name (file)\"q.tsb0\"; Item_Numbers 4 2\n"
    "  Item_Magnitude \"Gate\"; Item_Velocity \"Jet\" }\n"
    " SOURCE_SINK_2 { Data_Format 1; File_Name (file)\"q.tsb0\"; Item_Numbers 5; Item_Magnitude \"Intake\" "
    "}\n"
    " SOURCE_SINK_3 { Data_Format 1 } }\n"
    "INFILTRATION { InfiltrationType 2; GroundwaterDepthType 2; InitialVolumeType 2\n"
    " File_Name (file)\"soil.tsb2\"; Item_Numbers 1 2 3 4 5 }";

TEST_F(InfoHydrodynamic, Constants) {
  EXPECT_EQ(told(kConstants),
            "Rain             12.5 mm/d, not on dry land\n"
            "Evaporation      0.1 mm/d\n"
            "Source 1         (3,4)->  2.5 m³/s at 0.3 m/s towards 45°\n"
            "Source 2         ->(5,6)  -1 m³/s\n"
            "Source 3         (1,1)->(2,2)   7 m³/s at 1 m/s towards 270°\n"
            "Infiltration     none\n");
  const auto report = json(kConstants);
  EXPECT_EQ(
      report["precipitation"].dump(),
      R"_({"given_as":"constant","rate":{"value":12.5,"unit":"mm/d"},"net":false,"on_dry_land":false})_");
  EXPECT_EQ(report["evaporation"].dump(), R"_({"given_as":"constant","rate":{"value":0.1,"unit":"mm/d"}})_");
  EXPECT_EQ(report["sources"][0].dump(),
            R"_({"number":1,"location":"(3,4)->","given_as":"constant",)_"
            R"_("discharge":{"value":2.5,"unit":"m³/s"},"velocity":{"value":0.3,"unit":"m/s"},)_"
            R"_("direction":{"value":45.0,"unit":"°"}})_");
  EXPECT_EQ(report["sources"][1].dump(), R"_({"number":2,"location":"->(5,6)","given_as":"constant",)_"
                                         R"_("discharge":{"value":-1.0,"unit":"m³/s"}})_");
  EXPECT_EQ(report["sources"].size(), 3U);
  EXPECT_EQ(report["infiltration"].dump(), R"_({"type":"none"})_");
}

TEST_F(InfoHydrodynamic, Files) {
  EXPECT_EQ(
      told(kFiles),
      "Rain             maps in maps/rain.tsb2, item 1, on dry land too\n"
      "Evaporation      time series in e.tsb0, item 3\n"
      "Source 1         (3,4)->  time series in q.tsb0, items 4, 2 towards 10°\n"
      "Source 2         ->(5,6)  time series in q.tsb0, item 5\n"
      "Source 3         (1,1)->(2,2)   time series in a file that is not named, items 1, 2 towards 0°\n"
      "Infiltration     constant rate with capacity, maps in soil.tsb2, items 1, 2, 3, 4, 5; groundwater "
      "by its level, initial volume by its water content\n");
  const auto report = json(kFiles);
  EXPECT_EQ(report["precipitation"].dump(),
            R"_({"given_as":"maps","file":"maps/rain.tsb2","items":[1],"net":false,"on_dry_land":true})_");
  EXPECT_EQ(report["sources"][0].dump(),
            R"_({"number":1,"location":"(3,4)->","given_as":"time series","file":"q.tsb0","items":[4,2],)_"
            R"_("item_names":["Gate","Jet"],"direction":{"value":10.0,"unit":"°"}})_");
  EXPECT_EQ(report["sources"][1]["item_names"].dump(), R"_(["Intake"])_");
  EXPECT_EQ(
      report["infiltration"].dump(),
      R"_({"type":"constant rate with capacity","groundwater":"level","initial_volume":"water content",)_"
      R"_("file":"soil.tsb2","items":[1,2,3,4,5]})_");
}

TEST_F(InfoHydrodynamic, NetPrecipitation) {
  const std::string module = "SOURCE_AND_SINK { Evaporation 3.0; NetPrecipitation #true; Precipitation ";
  EXPECT_THAT(told(module + "2.0 }"), HasSubstr("Rain             2 mm/d, less evaporation, on dry land too\n"
                                                "Evaporation      in the rain already\n"));
  EXPECT_EQ(json(module + "2.0 }")["evaporation"].dump(), R"_({"given_as":"part of net precipitation"})_");
  EXPECT_THAT(told(module + "0.0 }"), HasSubstr("Rain             none\nEvaporation      3 mm/d\n"));
}

TEST_F(InfoHydrodynamic, ANetRateOfInfiltration) {
  const std::string module =
      "INFILTRATION { InfiltrationType 1; File_Name (file)\"rate.tsb2\"; Item_Numbers 2";
  EXPECT_THAT(told(module + " }"),
              EndsWith("Infiltration     net rate, constant in time, maps in rate.tsb2, item 2\n"));
  EXPECT_THAT(told(module + "; InfiltrationFormat 3 }"),
              EndsWith("Infiltration     net rate, varying in time, maps in rate.tsb2, item 2\n"));
  EXPECT_EQ(json(module + " }")["infiltration"].dump(),
            R"_({"type":"net rate","varies_in_time":false,"file":"rate.tsb2","items":[2]})_");
}

// The keyword of a constant has the name of the section with its file.
TEST_F(InfoHydrodynamic, ConstantAndFileOfOneName) {
  const std::string setup = setupWith(kConstants);
  const std::string place = "HYDRODYNAMIC_MODULE/SOURCE_AND_SINK/";
  const test::ProgramRun run =
      runTool({"set", setup, place + "Evaporation=2.5", place + "Evaporation/File_Name=e.tsb0",
               place + "EvaporationType=0", place + "SOURCE_SINK_3/Item_Velocity=Jet"});
  EXPECT_EQ(run.status, 0);
  EXPECT_EQ(run.err, "");
  EXPECT_EQ(runTool({"get", setup, place + "Evaporation"}).out, "2.5\n");
  EXPECT_EQ(runTool({"get", setup, place + "Evaporation/File_Name"}).out, "e.tsb0\n");
  EXPECT_EQ(runTool({"get", setup, place + "EvaporationType"}).out, "0\n");
  EXPECT_THAT(runTool({"info", setup}).out, HasSubstr("Evaporation      time series in e.tsb0, item 1\n"));
  EXPECT_EQ(runTool({"set", setup, place + "EvaporationType=1"}).status, 2);
}

TEST_F(InfoHydrodynamic, KeywordsOfInfiltrationFollowItsType) {
  const std::string setup = setupWith("");
  const std::string place = "HYDRODYNAMIC_MODULE/INFILTRATION/";
  EXPECT_EQ(runTool({"set", setup, place + "InfiltrationFormat=3"}).status, 2);
  EXPECT_EQ(runTool({"set", setup, place + "File_Name=rate.tsb2"}).status, 2);
  EXPECT_EQ(runTool({"set", setup, place + "InfiltrationType=1", place + "InfiltrationFormat=3",
                     place + "File_Name=rate.tsb2"})
                .status,
            0);
  EXPECT_EQ(runTool({"get", setup, place + "InfiltrationFormat"}).out, "3\n");
  EXPECT_EQ(runTool({"set", setup, place + "InfiltrationType=2"}).status, 0);
  EXPECT_EQ(runTool({"get", setup, place + "InfiltrationFormat"}).out, "2\n");
  EXPECT_EQ(runTool({"get", setup, place + "Item_Numbers"}).out, "1 2 3 4 5\n");
}

class InfoConditions : public InfoHydrodynamic {
 protected:
  // The lines behind those of the water, of a module with one boundary.
  std::string conditions(const std::string& module) {
    const std::string setup = folder.write(
        "c.v27",
        "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { OPEN_BOUNDARY { Number_Of_Boundaries 1 } }\n"
        " HYDRODYNAMIC_MODULE { " +
            module + " } }");
    report = nlohmann::ordered_json::parse(runTool({"info", setup, "--json"}).out)["hydrodynamics"];
    const std::string text = runTool({"info", setup}).out;
    const std::size_t start = text.find("At boundary 1");
    return start == text.npos ? text : text.substr(start);
  }
  nlohmann::ordered_json report;
};

TEST_F(InfoConditions, Defaults) {
  EXPECT_EQ(conditions(""),
            "At boundary 1    level, 0 m\n"
            "Initial level    0 m in area 1\n"
            "Wind             none\n"
            "Eddy viscosity   none\n"
            "Resistance       Manning number, 32 m^⅓/s in area 1\n"
            "Hot start        not written\n");
  EXPECT_EQ(report["wind"].dump(), R"_({"given_as":"none"})_");
  EXPECT_TRUE(report["dikes"].empty());
  EXPECT_EQ(report["hot_start"]["written"], false);
}

TEST_F(InfoConditions, FilesStructuresAndOutputs) {
  const std::string text = conditions(
      "OPEN_BOUNDARY { BOUNDARY_1 { Formulation 2; Data_Format 3; File_Name (file)\"q.tsb0\"; Item_Numbers 2 "
      "} }\n"
      "SURFACE_ELEVATION { AREA_1 { Type 2; File_Name (file)\"l.tsb2\"; Item_Numbers 1 } }\n"
      "RESISTANCE { Formulation 1; AREA_1 { Data_Format 2; File_Name (file)\"r.tsb2\"; Item_Numbers 1 } }\n"
      "STRUCTURE_MODULE { WEIR { number_of_weirs 6\n weir_data { Location \"\" -1e-155 \"Mill\" \"TopoID\"\n"
      " number_of_points 2; x 1.0 2.0; y 3.0 4.0 } }; CULVERTS { number_of_Culverts 1; Culvert_data {\n"
      " Location \"\" -1e-155 \"Pipe\" \"TopoID\" } } }\n"
      "STRUCTURES { DIKES { DIKE_1 { name \"North\"; POINT_1 { x 1.0 } } } }\n"
      "OUTPUT_SPECIFICATION { Number_Of_Output_areas 2\n"
      " OUTPUT_AREA_1 { Type 2; X_Range_And_Interval 0 10 2; Y_Range_And_Interval 0 5 1; First_Time_Step 0\n"
      "  Last_Time_Step 100; Time_Step_interval 10; Output_item 1; ITEM_NUMBERS 4; Title \"Maps\"\n"
      "  File_Name (result)\"m.tsb2\" }\n"
      " OUTPUT_AREA_2 { Type 0; X_Range_And_Interval 1.0 2.0; Y_Range_And_Interval 3.0 4.0\n"
      "  Last_Time_Step 100; File_Name (result)\"p.tsb0\" }\n"
      " Generate_Hotstart #true; HOTSTART_FILES { AREA_1 { File_Name (result)\"h.tsb2\" } } }");
  EXPECT_EQ(
      text,
      "At boundary 1    flux from q.tsb0, item 2\n"
      "Initial level    map l.tsb2, item 1 in area 1\n"
      "Wind             none\n"
      "Eddy viscosity   none\n"
      "Resistance       Chezy number, map r.tsb2, item 1 in area 1\n"
      "Dikes            1: North of 1 point\n"
      "Weirs            6: Mill of 2 points, Weir 2 of 0 points, Weir 3 of 0 points, Weir 4 of 0 points, "
      "Weir 5 of 0 points, ...\n"
      "Culverts         1: Pipe of 0 points\n"
      "Output 1         J 0 to 10 by 2, K 0 to 5 by 1, time steps 0 to 100 by 10, 1 item, to m.tsb2 "
      "(Maps)\n"
      "Output 2         2 points, time steps 0 to 100 by 1, 3 items, to p.tsb0\n"
      "Hot start        written to h.tsb2\n");
  EXPECT_EQ(report["outputs"][0]["j"].dump(), "[0,10,2]");
  EXPECT_EQ(report["outputs"][1]["points"], 2);
  EXPECT_EQ(report["weirs"].size(), 6U);
  EXPECT_EQ(report["resistance"]["areas"][0]["file"], "r.tsb2");
}

TEST_F(InfoConditions, WindAndViscosityOfTheFlowModel) {
  const std::string text = conditions(
      "OPEN_BOUNDARY { BOUNDARY_1 { Data_Format 2; SINUSOIDAL_BOUNDARY { Reference_Level 0.5; Range 2.0\n"
      " Period 44714.0 } } }\n"
      "WIND_CONDITIONS { Data_Format 1; Constant_Wind_Speed 12.0; Constant_Wind_Direction 270.0 }\n"
      "EDDY_VISCOSITY { Data_Format 3 }");
  EXPECT_THAT(text, HasSubstr("At boundary 1    level, a sine of range 2 m about 0.5 m, period 44714 s\n"));
  const bool isPinned = theEdition.wetlandSweepKit;
  EXPECT_THAT(text, HasSubstr(isPinned ? "Wind             none\n" : "Wind             12 m/s from 270°\n"));
  EXPECT_THAT(text, HasSubstr(isPinned ? "Eddy viscosity   none\n"
                                       : "Eddy viscosity   Smagorinsky formula, 0.5 in area 1\n"));
}

}  // namespace cli_info_hydrodynamic_test
}  // namespace gridbay
