// What `info` tells of the modules that carry something with the water.

#include <gmock/gmock.h>

#include <nlohmann/json.hpp>

#include "core/edition.h"
#include "tests/support/programs.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace cli_info_transport_test {

using test::runTool;

class InfoTransport : public ::testing::Test {
 protected:
  // Components of each type, one open boundary and one source, in a model where it rains.
  std::string setupWith(const std::string& module) {
    return folder.write(
        "s.v27",
        "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { MODULE_SELECTION { Simulation_Type 2; AD_Scheme 1 }\n"
        " OPEN_BOUNDARY { Number_Of_Boundaries 1; Default_Position 0; BOUNDARY_1 { First_Point 0 1; "
        "Last_Point 0 "
        "9 } }\n"
        " SOURCE_AND_SINK { Number_Of_Sources 1; SOURCE_SINK_1 { Type 0; Source_Point 3 4 } }\n"
        " MASS_BUDGET { NoOfPolygons 1 } }\n"
        " HYDRODYNAMIC_MODULE { SOURCE_AND_SINK { Precipitation 12.5 } }\n"
        " ADVECTION_DISPERSION_MODULE { COMPONENT_SPECIFICATIONS { No_Of_Components 4\n"
        "  COMPONENT_1 { Component_Name Salt; Component_Description 0 }\n"
        "  COMPONENT_2 { Component_Name Coli; Component_Description 1 }\n"
        "  COMPONENT_3 { Component_Name Heat; Component_Description 2 }\n"
        "  COMPONENT_4 { Component_Name Odd; Component_Description 9 } }\n" +
            module + " } }");
  }
  // The lines behind those of the flow calculation.
  std::string told(const std::string& module) {
    const std::string text = runTool({"info", setupWith(module)}).out;
    const std::size_t start = text.find("\n\n");
    return start == text.npos ? text : text.substr(start + 2);
  }
  nlohmann::ordered_json json(const std::string& module) {
    return nlohmann::ordered_json::parse(
        runTool({"info", setupWith(module), "--json"}).out)["advection_dispersion"];
  }
  test::TemporaryFolder folder;
};

TEST_F(InfoTransport, Defaults) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has no such module";
  EXPECT_EQ(told(""),
            "Component 1      Salt, conservative\n"
            "Component 2      Coli, decaying at 0 /d\n"
            "Component 3      Heat, heat dissipating at 0\n"
            "Component 4      Odd, type 9, which is none\n"
            "Initially        Salt 0 mg/l in area 1\n"
            "Initially        Coli 0 mg/l in area 1\n"
            "Initially        Heat 0 °C in area 1\n"
            "Initially        Odd 0 °C in area 1\n"
            "Dispersion       0 m²/s along x, 0 m²/s along y\n"
            "At boundary 1    Salt 0 mg/l, Coli 0 mg/l, Heat 0 °C, Odd 0 °C\n"
            "From source 1    Salt 0 mg/l, Coli 0 mg/l, Heat 0 °C, Odd 0 °C\n"
            "In the rain      Salt 0 mg/l, Coli 0 mg/l, Heat 0 °C, Odd 0 °C\n");
}

constexpr const char* kFilled =
    "DECAY_COEFFICIENTS { COMPONENT_2 { Data_Format 0; Constant_Value 0.8 } }\n"
    "HEAT_DISSIPATION { COMPONENT_3 { Data_Format 1; File_Name (file)\"loss.tsb0\"; Item_Numbers 2 } }\n"
    "INITIAL_CONCENTRATIONS { COMPONENT_1 { AREA_1 { Data_Format 1; File_Name (file)\"salt.tsb2\"; "
    "Item_Numbers 1 } }\n"
    " COMPONENT_2 { AREA_1 { Constant_Value 5.5 } } }\n"
    "DISPERSION_CONDITIONS { X_DIRECTION_COEFFICIENTS { Data_Format 1; AREA_1 { File_Name (file)\"d.tsb2\" } "
    "}\n"
    " Y_DIRECTION_COEFFICIENTS { Constant_Value 2.5 } }\n"
    "BOUNDARY_CONCENTRATIONS { BOUNDARY_1 { Data_Format 2; FILE_NAME (file)\"sea.tsb1\" } }\n"
    "SOURCE_CONCENTRATIONS { SOURCE_SINK_1 { Constant_Value_1 200.0 } }\n"
    "PRECIPITATION_CONCENTRATIONS { Data_Format 0; FILE_NAME (file)\"rain.tsb0\" }\n"
    "DEPOSITION_CONCENTRATIONS { IncludeSurfaceDeposition #true\n"
    " SurfaceDeposition { COMPONENT_1 { AREA_1 { Constant_Value 3.0 } } } }\n"
    "AD_FEED_BACK_ON_HD_CALCULATIONS { Include_AD_Feed_Back #true }\n"
    "AD_LINE_DISCHARGE_CALCULATIONS { No_Of_AD_Discharge_Lines 1; AD_DISCHARGE_LINE_1 { Area_Number 1\n"
    " Start_Coordinate 1 2; End_Coordinate 1 8; File_Name (result)\"line.tsb0\"; Title Inlet\n"
    " Component_Numbers 2; No_of_Components_in_Calc 1 } }\n"
    "BOXES_FOR_MASS_SUMMATION { No_Of_AD_Mass_Boxes 1; AD_MASS_BOX_1 { Start_Coordinate 0 0 } }\n"
    "MASS_BUDGET { NoOfMassFiles 1; MASS_FILE_1 { FILE_NAME (result)\"mass.tsb0\" } }\n"
    "OUTPUT_SPECIFICATION { Number_Of_Output_areas 1; OUTPUT_AREA_1 { File_Name (result)\"out.tsb2\"; Title "
    "Maps } }";

TEST_F(InfoTransport, Filled) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has no such module";
  EXPECT_EQ(
      told(kFilled),
      "Component 1      Salt, conservative\n"
      "Component 2      Coli, decaying at 0.8 /d\n"
      "Component 3      Heat, heat dissipating as in loss.tsb0, item 2\n"
      "Component 4      Odd, type 9, which is none\n"
      "Feedback         salinity and temperature change the density of the water\n"
      "Initially        Salt map salt.tsb2, item 1 in area 1\n"
      "Initially        Coli 5.5 mg/l in area 1\n"
      "Initially        Heat 0 °C in area 1\n"
      "Initially        Odd 0 °C in area 1\n"
      "Dispersion       map d.tsb2, item 1 in area 1 along x, 2.5 m²/s along y\n"
      "At boundary 1    profile in sea.tsb1\n"
      "From source 1    Salt 200 mg/l, Coli 0 mg/l, Heat 0 °C, Odd 0 °C\n"
      "In the rain      time series in rain.tsb0\n"
      "Onto the water   Salt 3 g/m²/d in area 1\n"
      "Onto the water   Coli 0 g/m²/d in area 1\n"
      "Onto the water   Heat 0 g/m²/d in area 1\n"
      "Onto the water   Odd 0 g/m²/d in area 1\n"
      "Line 1           (1,2) - (1,8) of area 1, time steps 0 to 100 of Coli, to line.tsb0 (Inlet)\n"
      "Box 1            (0,0) - (-1,-1) of area 1, time steps 0 to 100 of nothing, to a file that is not "
      "named\n"
      "Mass budget 1    polygon 1, time steps 0 to 100 by 1 of Salt, to mass.tsb0\n"
      "Output 1         area 1, J 0 to -1 by 1, K 0 to -1 by 1, time steps 0 to 100 by 1, to out.tsb2 "
      "(Maps)\n");
  EXPECT_EQ(json(kFilled)["components"].dump(),
            R"_([{"name":"Salt","type":"conservative"},)_"
            R"_({"name":"Coli","type":"decaying","rate":{"value":{"value":0.8,"unit":"/d"}}},)_"
            R"_({"name":"Heat","type":"heat dissipating","rate":{"file":"loss.tsb0","items":[2]}},)_"
            R"_({"name":"Odd","type":"type 9, which is none"}])_");
  EXPECT_EQ(json(kFilled)["boundaries"].dump(), R"_([{"given_as":"profile","file":"sea.tsb1"}])_");
  EXPECT_EQ(json(kFilled)["mass_budgets"].dump(),
            R"_([{"polygon":1,"steps":[0,100,1],"of":["Salt"],"title":"","file":"mass.tsb0"}])_");
}

// The Wetland Sweep Kit has hydrodynamics alone.
TEST_F(InfoTransport, OfTheModuleThatRunsAlone) {
  const std::string text = runTool({"info", setupWith("")}).out;
  EXPECT_THAT(text, ::testing::HasSubstr(theEdition.wetlandSweepKit
                                             ? "module code 0 (hydrodynamics alone)"
                                             : "module code 2 (hydrodynamics and advection-dispersion)"));
}

// What is told of the module of a whole setup.
std::string toldOf(const std::string& name) {
  const std::string text = runTool({"info", std::string(GRIDBAY_TESTS) + "/main_job/setups/" + name}).out;
  const std::size_t start = text.find("\n\n");
  return start == text.npos ? text : text.substr(start + 2);
}

TEST_F(InfoTransport, MudOfLayers) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has no such module";
  EXPECT_EQ(toldOf("mud_layers.v27"),
            "Mud              multi layer task: 1 fraction over 3 layers, with salinity\n"
            "Initially        Salinity 30 PSU in area 1; 0 PSU in area 2\n"
            "Initially        Fraction 0 mg/l in area 1; 0 mg/l in area 2\n"
            "Initially        Thickness layer no. 1 0 m in area 1; 0 m in area 2\n"
            "Initially        Thickness layer no. 2 0.3 m in area 1; 0.3 m in area 2\n"
            "Initially        Thickness layer no. 3 0 m in area 1; 0 m in area 2\n"
            "Dispersion       0 m²/s along x, 0 m²/s along y\n"
            "At boundary 1    Salinity 0 PSU, Fraction 0 mg/l\n"
            "At boundary 2    Salinity 0 PSU, Fraction 0 mg/l\n"
            "At boundary 3    Salinity 0 PSU, Fraction 0 mg/l\n"
            "At boundary 4    Salinity 0 PSU, Fraction 0 mg/l\n"
            "From source 1    Salinity 0 PSU, Fraction 0 mg/l\n"
            "Eroding from     0.1 N/m² in layer 1; 0.4 N/m² in layer 2; 0.1 N/m² in layer 3\n"
            "Density of bed   150000 g/m³ in layer 1; 150000 g/m³ in layer 2; 150000 g/m³ in layer 3\n"
            "Sliding          the bed slides\n"
            "Waves            1 m high, 5 s long, from 180°\n");
}

TEST_F(InfoTransport, ExpandedMud) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has no such module";
  const std::string text = toldOf("expanded_mud.v27");
  EXPECT_THAT(text, ::testing::StartsWith("Mud              2 fractions over 3 layers\n"));
  EXPECT_THAT(text, ::testing::HasSubstr(
                        "Bed layer 2      thick 0.05 m in area 1; 0.05 m in area 2; dense 300 kg/m³ in "
                        "area 1; 300 kg/m³ in area 2; fractions 50, 50 %\n"));
  EXPECT_THAT(text,
              ::testing::HasSubstr("At boundary 3    Fraction no. 1 0.3 kg/m³, Fraction no. 2 0.1 kg/m³\n"));
  EXPECT_THAT(text, ::testing::HasSubstr("Waves            0.8 m high, 5 s long, from 280°\n"));
}

TEST_F(InfoTransport, Ecology) {
  if (theEdition.wetlandSweepKit) GTEST_SKIP() << "this edition has no such module";
  const std::string text = toldOf("oxygen.v27");
  EXPECT_THAT(text, ::testing::HasSubstr(": 5 state variables, 5 constants, 2 forcings, 5 processes\n"));
  EXPECT_THAT(text, ::testing::HasSubstr("Initially        NO3 0.5 g/m3 in area 1; 0.5 g/m3 in area 2\n"));
  EXPECT_THAT(text, ::testing::HasSubstr("Constant         ka: 1 m/d\n"));
  EXPECT_THAT(text, ::testing::HasSubstr("Forcing          temp: 15 °C\nForcing          depth: built in\n"));
  EXPECT_THAT(text,
              ::testing::HasSubstr("From source 1    OXY 3 g/m3, BOD 60 g/m3, NH4 12 g/m3, NO3 0.5 g/m3\n"));
}

}  // namespace cli_info_transport_test
}  // namespace gridbay
