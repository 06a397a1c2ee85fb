#include "setup/global_kvs.h"

#include <gmock/gmock.h>

#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/result.h"
#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "core/edition.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "hydrodynamic/wind_conditions.h"
#include "setup/setup_file.h"
#include "tests/support/model.h"
#include "tests/support/temporary_folder.h"

namespace gridbay {
namespace setup_global_kvs_test {

using test::Model;
using test::savedText;
using ::testing::HasSubstr;
using ::testing::Not;

// A new model as it is saved, with the sections of a module's own data given.
std::string newModelText(const std::string& selection, const std::string& advection = "",
                         const std::string& mud = "", const std::string& expanded = "",
                         const std::string& ecology = "") {
  return "VANE27_NESTED_MODEL {\n"
         "    NESTED_MODEL_GLOBALS {\n"
         "        OPTION_PARAMETERS {}\n"
         "        MODULE_SELECTION {\n" +
         selection +
         "        }\n"
         "        BATHYMETRY_SELECTION {\n"
         "            Projection \"\"\n"
         "            CoriolisForce #false\n"
         "            Land_Slides #false\n"
         "            Overland_Solver #false\n"
         "            Overland_Filename (file)\"\"\n"
         "            No_Of_Areas 1\n"
         "            Hot_Start 0\n"
         "            AREA_1 {\n"
         "                DATA_FILE {\n"
         "                    FILE_NAME (file)\"\"\n"
         "                }\n"
         "                Origin 3 3\n"
         "                Enclosing_Area 0\n"
         "            }\n"
         "        }\n"
         "        OPEN_BOUNDARY {\n"
         "            Number_Of_Boundaries 0\n"
         "            Default_Position 1\n"
         "        }\n"
         "        SOURCE_AND_SINK {\n"
         "            Number_Of_Sources 0\n"
         "        }\n"
         "        FLOOD_AND_DRY {\n"
         "            Enable_Flood_And_Dry_Checking 1\n"
         "            Drying_Depth 0.02\n"
         "            Flooding_Depth 0.05\n"
         "        }\n"
         "        SIMULATION_PERIOD {\n"
         "            Number_Of_Timesteps 100\n"
         "            Time_Step_Interval 30.0\n"
         "            Warm_Up_Period 0\n"
         "            Start_Time 1990 1 1 12 0 0\n"
         "        }\n"
         "        MASS_BUDGET {\n"
         "            NoOfPolygons 0\n"
         "        }\n"
         "    }\n"
         "    HYDRODYNAMIC_MODULE {\n"
         "        OPTION_PARAMETERS {}\n"
         "        OPEN_BOUNDARY {}\n"
         "        SOURCE_AND_SINK {\n"
         "            EvaporationType -1\n"
         "            Evaporation 0.0\n"
         "            Evaporation {\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "            }\n"
         "            NetPrecipitation #false\n"
         "            PrecipitationType -1\n"
         "            Precipitation 0.0\n"
         "            Precipitation {\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "            }\n"
         "            RainOnDryLand #true\n"
         "        }\n"
         "        INFILTRATION {\n"
         "            InfiltrationType 0\n"
         "            GroundwaterDepthType 1\n"
         "            InitialVolumeType 1\n"
         "        }\n"
         "        WIND_CONDITIONS {\n"
         "            Data_Format 0\n"
         "            Constant_Wind_Direction 270.0\n"
         "            Constant_Wind_Speed 10.0\n"
         "            Neutral_Pressure 1013.0\n"
         "            IncludeAirPressureCorrections #false\n"
         "            File_Name (file)\"\"\n"
         "            Item_Numbers\n"
         "            Type_Of_Wind_Friction 0\n"
         "            Constant_Friction 0.0026\n"
         "            Linear_Friction_1 0.0016\n"
         "            Linear_Friction_2 0.0026\n"
         "            Linear_Speed_1 0.0\n"
         "            Linear_Speed_2 24.0\n"
         "        }\n"
         "        EDDY_VISCOSITY {\n"
         "            Data_Format 0\n"
         "            Formulation 1\n"
         "            AREA_1 {\n"
         "                Constant_Value 0.0\n"
         "                Smagorinsky_Format 0.5\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "            }\n"
         "        }\n"
         "        WAVE_RADIATION {\n"
         "            AREA_1 {\n"
         "                Included #false\n"
         "                FILE_TIME_DESCR 0\n"
         "                DATA_FILE {\n"
         "                    FILE_NAME (file)\"\"\n"
         "                }\n"
         "            }\n"
         "        }\n"
         "        SURFACE_ELEVATION {\n"
         "            AREA_1 {\n"
         "                Type 1\n"
         "                Constant_Value 0.0\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "            }\n"
         "        }\n"
         "        RESISTANCE {\n"
         "            Formulation 0\n"
         "            AREA_1 {\n"
         "                Data_Format 1\n"
         "                Constant_Value 32.0\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "                Include_Pier #false\n"
         "                PIER {\n"
         "                    File_Name (file)\"\"\n"
         "                    Item_Numbers 1\n"
         "                }\n"
         "            }\n"
         "            SEDIMENT_DATA {\n"
         "                Grain_Format 0\n"
         "                Constant_Grain_Size 0.2\n"
         "                Relative_Density 2.65\n"
         "                File_Name (file)\"\"\n"
         "                Item_Numbers 1\n"
         "            }\n"
         "            Type_Of_Roughness 0\n"
         "            Include_Wave_Height_Correction 1\n"
         "            Wave_Height_Over_Depth_Limit 0.85\n"
         "            Update_Frequency 1\n"
         "        }\n"
         "        WAVES {\n"
         "            \"Type_Of_Wave_Height \" 0\n"
         "            \"Type_Of_Wave_Period \" 0\n"
         "            Wave_Format 3\n"
         "            Constant_Wave_Height 1.0\n"
         "            Constant_Wave_Period 3.0\n"
         "            Constant_Wave_Direction 180.0\n"
         "            File_Name (file)\"\"\n"
         "            Item_Numbers 1 2 3\n"
         "        }\n"
         "        STRUCTURE_MODULE {\n"
         "            Structure_Version 1 1\n"
         "            CROSSSECTIONS {\n"
         "                CrossSectionDataBridge \"xns11\"\n"
         "                CrossSectionFile (file)\"\"\n"
         "            }\n"
         "            WEIR {\n"
         "                number_of_weirs 0\n"
         "            }\n"
         "            CULVERTS {\n"
         "                number_of_Culverts 0\n"
         "            }\n"
         "        }\n"
         "        STRUCTURES {\n"
         "            DIKES {\n"
         "                number_of_dikes 0\n"
         "            }\n"
         "        }\n"
         "        OUTPUT_SPECIFICATION {\n"
         "            Number_Of_Output_areas 0\n"
         "            Generate_Hotstart #false\n"
         "            HOTSTART_FILES {\n"
         "                AREA_1 {\n"
         "                    Title \"\"\n"
         "                    File_Name (result)\"\"\n"
         "                }\n"
         "            }\n"
         "            INUNDATION_STATISTICS {\n"
         "                IncludeInundationStatistics #false\n"
         "                InundationFileName (result)\"\"\n"
         "                InundationFileStoreStep 0\n"
         "                DurationAboveThreshold #false\n"
         "                ThresholdHeight 0.0\n"
         "            }\n"
         "        }\n"
         "    }\n"
         "    ADVECTION_DISPERSION_MODULE {\n"
         "        OPTION_PARAMETERS {}\n" +
         advection +
         "    }\n"
         "    MUD_TRANSPORT_MODULE {\n"
         "        OPTION_PARAMETERS {}\n" +
         mud +
         "    }\n"
         "    MUD_TRANSPORT_EXPANDED_MODULE {\n"
         "        OPTION_PARAMETERS {}\n" +
         expanded +
         "    }\n"
         "    BIO_RIG_MODULE {\n"
         "        OPTION_PARAMETERS {}\n" +
         ecology +
         "    }\n"
         "}\n";
}

// A new module of mud transport: three fractions over one layer, in one area.
std::string newMudText() {
  const auto components = [](const std::string& indent, const std::string& rest) {
    std::string all;
    for (const char* number : {"1", "2", "3"}) all += indent + "COMPONENT_" + number + " {\n" + rest;
    return all;
  };
  return std::string(
             "        STARTING_CONDITIONS {\n"
             "            Hot_Start #false\n"
             "            Start_MT_at_HD_Time_Step 0\n"
             "            End_MT_at_HD_Time_Step 100\n"
             "            Integration_period_start 0\n"
             "            Integration_period_end 100\n"
             "            AREA_1 {\n"
             "                DATA_FILE {\n"
             "                    File_Name (file)\"\"\n"
             "                }\n"
             "            }\n"
             "        }\n"
             "        CALCULATION_METHOD {\n"
             "            Max_rel_decrease_in_conc_pr_step 0.1\n"
             "        }\n"
             "        TASK_SELECTION {\n"
             "            Multifraction #true\n"
             "            MultiLayer #false\n"
             "            Number_of_layers 1\n"
             "            Number_of_fractions 3\n"
             "            Include_salinity_component_for_flocculation #false\n"
             "        }\n"
             "        INITIAL_CONCENTRATIONS {\n") +
         components("            ",
                    "                AREA_1 {\n"
                    "                    Data_Format 0\n"
                    "                    Constant_Value 0.0\n"
                    "                    File_Name (file)\"\"\n"
                    "                    Item_Numbers 1\n"
                    "                }\n"
                    "            }\n") +
         "        }\n"
         "        DISPERSION_CONDITIONS {\n"
         "            Dispersion_Prop_to_Current 0\n"
         "            Proportionality_Factor_Xdir 1.0\n"
         "            Proportionality_Factor_Ydir 1.0\n"
         "            Min_Dispersion_Coefficient 0.0\n"
         "            Max_Dispersion_Coefficient 0.0\n"
         "            X_DIRECTION_COEFFICIENTS {\n"
         "                Data_Format 0\n"
         "                Constant_Value 0.0\n"
         "                AREA_1 {\n"
         "                    File_Name (file)\"\"\n"
         "                    Item_Numbers 1\n"
         "                }\n"
         "            }\n"
         "            Y_DIRECTION_COEFFICIENTS {\n"
         "                Data_Format 0\n"
         "                Constant_Value 0.0\n"
         "                AREA_1 {\n"
         "                    File_Name (file)\"\"\n"
         "                    Item_Numbers 1\n"
         "                }\n"
         "            }\n"
         "        }\n"
         "        BOUNDARY_CONCENTRATIONS {}\n"
         "        SOURCE_CONCENTRATIONS {}\n"
         "        MT_PARAMETERS {\n"
         "            SETTLING_AND_DEPOSITION {\n" +
         components("                ",
                    "                    Critical_Velocity_For_Deposition 0.1\n"
                    "                    Critical_Velocity_For_Erosion 0.3\n"
                    "                    Relative_Height_Of_Centroid 0.3\n"
                    "                    Mean_Settling_Velocity 0.0005\n"
                    "                    Initial_bed_composition {\n"
                    "                        Data_Format 0\n"
                    "                        Constant_Value 1.0\n"
                    "                        AREA_1 {\n"
                    "                            File_Name (file)\"\"\n"
                    "                            Item_Numbers 1\n"
                    "                        }\n"
                    "                    }\n"
                    "                    EROSION_COEFFICIENTS {\n"
                    "                        Data_Format 0\n"
                    "                        Constant_Value 0.005\n"
                    "                        AREA_1 {\n"
                    "                            File_Name (file)\"\"\n"
                    "                            Item_Numbers 1\n"
                    "                        }\n"
                    "                    }\n"
                    "                }\n") +
         "            }\n"
         "            EROSION_CHARACTERISTICS {\n"
         "                SETTINGS {\n"
         "                    Bed_Is_Erodible 1\n"
         "                    Deposited_Sediment_Erodible 1\n"
         "                }\n"
         "                CALCULATION_METHOD {\n"
         "                    Only_cohesive_sediment 1\n"
         "                    Cohesive_and_non_cohesive_sediment 0\n"
         "                    Scale_factor 1.0\n"
         "                }\n"
         "            }\n"
         "        }\n"
         "        MT_LINE_DISCHARGE_CALCULATIONS {\n"
         "            No_Of_MT_Discharge_Lines 0\n"
         "        }\n"
         "        BOXES_FOR_MASS_SUMMATION {\n"
         "            No_Of_MT_Mass_Boxes 0\n"
         "        }\n"
         "        OUTPUT_SPECIFICATION {\n"
         "            Number_Of_Output_areas 0\n"
         "            Include_Layers_In_Output_File 1\n"
         "            NetSedimentation_in_mm 1\n"
         "            NetSedimentation_in_gm2 0\n"
         "            Generate_Hotstart #false\n"
         "            HOTSTART_FILES {\n"
         "                AREA_1 {\n"
         "                    Title \"\"\n"
         "                    File_Name (result)\"\"\n"
         "                }\n"
         "            }\n"
         "        }\n";
}

std::string selectionText(int code) {
  const bool pinned = theEdition.wetlandSweepKit;
  return "            Simulation_Type " + std::to_string(pinned ? 0 : code) +
         "\n            AD_Scheme 1\n            hydrodynamic_features " + (pinned ? "0" : "1") + "\n";
}

TEST(GlobalKvs, ANewModelIsWholeAndHasOneArea) {
  Model model;
  EXPECT_EQ(model.root.bathymetry->GetCount(), 1);
  EXPECT_EQ(model.root.boundary->GetCount(), 0);
  EXPECT_EQ(model.root.GetParent(), nullptr);
  EXPECT_EQ(savedText(model.root), newModelText(selectionText(0)));
}

// One fraction over one layer.
constexpr const char* kNewExpandedMud = R"text(        STARTING_CONDITIONS {
            Hot_Start #false
            Start_MT_at_HD_Time_Step 0
            End_MT_at_HD_Time_Step 100
            Integration_period_start 0
            Integration_period_end 100
            AREA_1 {
                DATA_FILE {
                    File_Name (file)""
                }
            }
        }
        TASK_SELECTION {
            Number_of_layers 1
            Number_of_fractions 1
            Include_salinity #false
            Include_xenobiotics #false
        }
        INITIAL_CONCENTRATIONS {
            SEDIMENT_FRACTION_1 {
                AREA_1 {
                    Data_Format 0
                    Constant_Value 0.0
                    File_Name (file)""
                    Item_Numbers 1
                }
            }
        }
        INITIAL_BED_THICKNESS {
            BED_LAYER_1 {
                Data_Format 0
                Constant_Value 0.0
                AREA_1 {
                    File_Name (file)""
                    Item_Numbers 1
                }
            }
        }
        INITIAL_BED_SEDIMENT_DISTRIBUTION {
            BED_LAYER_1 {
                Fraction_Distribution 100
            }
        }
        DISPERSION_CONDITIONS {
            Dispersion_Prop_to_Current 0
            Proportionality_Factor_Xdir 1.0
            Proportionality_Factor_Ydir 1.0
            Min_Dispersion_Coefficient 0.0
            Max_Dispersion_Coefficient 0.0
            X_DIRECTION_COEFFICIENTS {
                Data_Format 0
                Constant_Value 0.0
                AREA_1 {
                    File_Name (file)""
                    Item_Numbers 1
                }
            }
            Y_DIRECTION_COEFFICIENTS {
                Data_Format 0
                Constant_Value 0.0
                AREA_1 {
                    File_Name (file)""
                    Item_Numbers 1
                }
            }
        }
        SOURCE_CONCENTRATIONS {}
        BOUNDARY_CONCENTRATIONS {}
        FORCING_FUNCTIONS {
            WAVE_DATA {
                Type_of_Wave_variation 0
                Shearstress_Formulation 0
                Include_Liquefaction 0
                Do_Combined_Wave_Current_Shearstress_Calculations #true
                Liquefaction_factor 1.0
                Minimum_waterdepth_for_including_waves 0.0
                TWOD_Wavefields {
                    File_Name (file)""
                    Item_Numbers 1
                }
                Constant_Wave_Data {
                    Constant_Wave_Height 0.3
                    Constant_Wave_Period 3.0
                    Constant_Wave_Direction 0.0
                }
                WAVE_DATABASE_PARAMETERS {
                    WIND_SPEED {
                        Starting_value_of_windspeed 5.0
                        Increment_value_of_windspeed 5.0
                        Number_of_windspeeds 1
                    }
                    WIND_DIRECTION {
                        Starting_value_of_wind_direction 90.0
                        Increment_value_of_wind_direction 90.0
                        Number_of_wind_directions 1
                    }
                    WATER_LEVEL {
                        Starting_value_of_water_level 0.0
                        Increment_value_of_water_level 1.0
                        Number_of_water_levels 1
                    }
                    Data_Base_File_Name_1_1_1 (file)""
                }
            }
            Include_dredging 0
            DREDGING {
                Number_of_active_dredgers 0
                Update_bed #false
            }
        }
        Watercoloumn_Parameters {
            VISCOSITY_PARAMETERS {}
            FALL_VELOCITY_PARAMETERS {
                Flocculation_Description 0
                Hindered_Settling_Description 0
                RhoSed 2650.0
                GelPoint 50.0
                CHinder 10.0
                C1Salt -0.33
                C2Salt 0.01
                Cfloc 0.0
                SEDIMENT_FRACTION_1 {
                    Gamma 1.0
                    Wsn 1.0
                    AREA_1 {
                        Data_Format 0
                        Constant_Value 0.0005
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
            }
            DEPOSITION_PARAMETERS {
                Sediment_Profile_Description 1
                CentroidHeight 0.3
                CRITICAL_SHEAR_STRESS_DEPOSITION {
                    SEDIMENT_FRACTION_1 {
                        AREA_1 {
                            Data_Format 0
                            Constant_Value 0.07
                            File_Name (file)""
                            Item_Numbers 1
                        }
                    }
                }
            }
            SAND_FRACTIONS {
                Sand_Fraction_Description 0
                Sand_fraction_1 1
                Mean_Fall_Velocity_Fraction_1 0.001
            }
        }
        BED_PARAMETERS {
            EROSION_COEFFICIENTS {
                CMax 50.0
                BED_LAYER_1 {
                    Erosion_Description 1
                    Em 1.0
                    AREA_1 {
                        Data_Format 0
                        Constant_Value 5e-05
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
            }
            CRITICAL_SHEAR_STRESS_EROSION {
                BED_LAYER_1 {
                    AREA_1 {
                        Data_Format 0
                        Constant_Value 0.1
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
            }
            DENSITY_OF_BED_MATERIAL {
                BED_LAYER_1 {
                    AREA_1 {
                        Data_Format 0
                        Constant_Value 180.0
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
            }
            SLIDING {
                Include_sliding 0
                Include_variable_sliding_coefficient 0
                Variable_sliding_coefficient {
                    Solid_Density 2650.0
                    AREA_1 {
                        Data_Format 0
                        Constant_Value 0.0001
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
                Constant_sliding_coefficient {
                    BED_LAYER_1 {
                        AREA_1 {
                            Data_Format 0
                            Constant_Value 0.0001
                            File_Name (file)""
                            Item_Numbers 1
                        }
                    }
                }
            }
            MORPHOLOGY {
                Include_Morphology 0
                Include_Speedup_Factor 0
                Speedup_Factor 1.0
            }
            BED_ROUGHNESS {
                AREA_1 {
                    Data_Format 0
                    Constant_Value 0.001
                    File_Name (file)""
                    Item_Numbers 1
                }
            }
            TRANSITION_OF_MUD_BETWEEN_LAYERS {
                Include_transition_of_mud_within_layers 0
            }
        }
        MASS_BUDGET {
            NoOfMassFiles 0
        }
        MT_LINE_DISCHARGE_CALCULATIONS {
            No_Of_MT_Discharge_Lines 0
        }
        OUTPUT_SPECIFICATION {
            Number_Of_Output_areas 0
            Generate_Hotstart #false
            HOTSTART_FILES {
                AREA_1 {
                    Title ""
                    File_Name (result)""
                }
            }
        }
        XENOBIOTIC_MODULE {
            OPTION_PARAMETERS {}
        }
)text";

// Without a model definition.
constexpr const char* kNewEcology = R"text(        MODEL_DEFINITION {
            Model_Definition_File (file)""
            Integration_Method 1
            Update_Frequency 1
            Disable_Processes #false
        }
        STATE_VARIABLES {
            NoOfComponents 0
        }
        STARTING_CONDITIONS {
            Hot_Start #false
            AREA_1 {
                DATA_FILE {
                    File_Name (file)""
                }
            }
        }
        INITIAL_CONDITIONS {}
        AD_TRANSPORT_PARAMETERS {
            AD_BOUNDARY {}
            AD_DISPERSION {
                Dispersion_Prop_to_Current 0
                Proportionality_Factor_Xdir 1.0
                Proportionality_Factor_Ydir 1.0
                Min_Dispersion_Coefficient 0.0
                Max_Dispersion_Coefficient 0.0
                X_DIRECTION_COEFFICIENTS {
                    Data_Format 0
                    Constant_Value 0.0
                    AREA_1 {
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
                Y_DIRECTION_COEFFICIENTS {
                    Data_Format 0
                    Constant_Value 0.0
                    AREA_1 {
                        File_Name (file)""
                        Item_Numbers 1
                    }
                }
            }
            AD_SOURCESINK {}
            PRECIPITATION {
                Data_Format -1
                File_Name (file)""
                Item_Numbers
            }
            EVAPORATION {
                Data_Format -1
                File_Name (file)""
                Item_Numbers
            }
            INFILTRATION {
                Data_Format -3
                File_Name (file)""
                Item_Numbers
            }
            AD_DEPOSITION {
                IncludeSurfaceDeposition #false
                SurfaceDeposition {}
                IncludeSoilDeposition #false
                SoilDeposition {}
            }
        }
        CONSTANTS {
            No_Of_Constants 0
        }
        FORCINGS {
            No_Of_Forcings 0
        }
        MASS_BUDGET {
            No_Of_Mass_Files 0
        }
        OUTPUT_SPECIFICATION {
            ADDITIONAL_OPTIONAL_OUTPUT {
                No_Of_Items 0
            }
            Number_Of_Output_areas 0
            Generate_Hotstart #false
            HOTSTART_FILES {
                AREA_1 {
                    Title ""
                    File_Name (result)""
                }
            }
        }
)text";

TEST(GlobalKvs, TheSectionsOfTheSelectedModuleAreWritten) {
  Model model;
  const auto textFor = [&model](int code) {
    model.root.moduleSelection->simulationType = code;
    return savedText(model.root);
  };
  EXPECT_EQ(textFor(2), newModelText(selectionText(2),
                                     "        Cohesive_Sediment_Conditions {\n"
                                     "            No_of_Sediment_Fractions 0\n"
                                     "        }\n"
                                     "        STARTING_CONDITIONS {\n"
                                     "            Hot_Start #false\n"
                                     "            Start_AD_at_HD_Time_Step 0\n"
                                     "            End_AD_at_HD_Time_Step 100\n"
                                     "            AREA_1 {\n"
                                     "                DATA_FILE {\n"
                                     "                    File_Name (file)\"\"\n"
                                     "                }\n"
                                     "            }\n"
                                     "        }\n"
                                     "        COMPONENT_SPECIFICATIONS {\n"
                                     "            No_Of_Components 1\n"
                                     "            COMPONENT_1 {\n"
                                     "                Component_Name \"Component 1\"\n"
                                     "                Component_Description 0\n"
                                     "            }\n"
                                     "        }\n"
                                     "        INITIAL_CONCENTRATIONS {\n"
                                     "            COMPONENT_1 {\n"
                                     "                AREA_1 {\n"
                                     "                    Data_Format 0\n"
                                     "                    Constant_Value 0.0\n"
                                     "                    File_Name (file)\"\"\n"
                                     "                    Item_Numbers 1\n"
                                     "                }\n"
                                     "            }\n"
                                     "        }\n"
                                     "        DISPERSION_CONDITIONS {\n"
                                     "            Dispersion_Prop_to_Current 0\n"
                                     "            Proportionality_Factor_Xdir 1.0\n"
                                     "            Proportionality_Factor_Ydir 1.0\n"
                                     "            Min_Dispersion_Coefficient 0.0\n"
                                     "            Max_Dispersion_Coefficient 0.0\n"
                                     "            X_DIRECTION_COEFFICIENTS {\n"
                                     "                Data_Format 0\n"
                                     "                Constant_Value 0.0\n"
                                     "                AREA_1 {\n"
                                     "                    File_Name (file)\"\"\n"
                                     "                    Item_Numbers 1\n"
                                     "                }\n"
                                     "            }\n"
                                     "            Y_DIRECTION_COEFFICIENTS {\n"
                                     "                Data_Format 0\n"
                                     "                Constant_Value 0.0\n"
                                     "                AREA_1 {\n"
                                     "                    File_Name (file)\"\"\n"
                                     "                    Item_Numbers 1\n"
                                     "                }\n"
                                     "            }\n"
                                     "        }\n"
                                     "        DECAY_COEFFICIENTS {\n"
                                     "            COMPONENT_1 {\n"
                                     "                Data_Format 0\n"
                                     "                Constant_Value 0.0\n"
                                     "                File_Name (file)\"\"\n"
                                     "                Item_Numbers 1\n"
                                     "            }\n"
                                     "        }\n"
                                     "        HEAT_DISSIPATION {\n"
                                     "            COMPONENT_1 {\n"
                                     "                Data_Format 0\n"
                                     "                Constant_Value 0.0\n"
                                     "                File_Name (file)\"\"\n"
                                     "                Item_Numbers 1\n"
                                     "            }\n"
                                     "        }\n"
                                     "        BOUNDARY_CONCENTRATIONS {}\n"
                                     "        SOURCE_CONCENTRATIONS {}\n"
                                     "        DEPOSITION_CONCENTRATIONS {\n"
                                     "            IncludeSurfaceDeposition #false\n"
                                     "            SurfaceDeposition {\n"
                                     "                COMPONENT_1 {\n"
                                     "                    AREA_1 {\n"
                                     "                        Data_Format -1\n"
                                     "                        Constant_Value 0.0\n"
                                     "                        File_Name (file)\"\"\n"
                                     "                        Item_Numbers 1\n"
                                     "                    }\n"
                                     "                }\n"
                                     "            }\n"
                                     "            IncludeSoilDeposition #false\n"
                                     "            SoilDeposition {\n"
                                     "                COMPONENT_1 {\n"
                                     "                    AREA_1 {\n"
                                     "                        Data_Format -1\n"
                                     "                        Constant_Value 0.0\n"
                                     "                        File_Name (file)\"\"\n"
                                     "                        Item_Numbers 1\n"
                                     "                    }\n"
                                     "                }\n"
                                     "            }\n"
                                     "        }\n"
                                     "        HEAT_EXCHANGE {\n"
                                     "            RKorder 1\n"
                                     "            EvapPrecipTemp #false\n"
                                     "            AngstromsLawA 0.295\n"
                                     "            AngstromsLawB 0.371\n"
                                     "            DaltonsLawA 0.5\n"
                                     "            DaltonsLawB 0.9\n"
                                     "            RelativeHumidity 88\n"
                                     "            StandardMeridian 0.0\n"
                                     "            DisplacementHours 0.0\n"
                                     "            AirFormat -1\n"
                                     "            AirConstantValue 20.0\n"
                                     "            ClearnessFormat -1\n"
                                     "            HumidityFormat -1\n"
                                     "            Clearness 70\n"
                                     "            AIR_FILE {\n"
                                     "                File_Name (file)\"\"\n"
                                     "                Item_Numbers 1\n"
                                     "            }\n"
                                     "            HUMIDITY_FILE {\n"
                                     "                File_Name (file)\"\"\n"
                                     "                Item_Numbers 1\n"
                                     "            }\n"
                                     "            CLEARNESS_FILE {\n"
                                     "                File_Name (file)\"\"\n"
                                     "                Item_Numbers 1\n"
                                     "            }\n"
                                     "        }\n"
                                     "        PRECIPITATION_CONCENTRATIONS {\n"
                                     "            Data_Format -1\n"
                                     "            Constant_Value_1 0.0\n"
                                     "            FILE_NAME (file)\"\"\n"
                                     "        }\n"
                                     "        EVAPORATION_CONCENTRATIONS {\n"
                                     "            Data_Format -1\n"
                                     "            Constant_Value_1 0.0\n"
                                     "            FILE_NAME (file)\"\"\n"
                                     "        }\n"
                                     "        INFILTRATION_CONCENTRATIONS {\n"
                                     "            Data_Format -3\n"
                                     "            Constant_Value_1 0.0\n"
                                     "            FILE_NAME (file)\"\"\n"
                                     "        }\n"
                                     "        AD_FEED_BACK_ON_HD_CALCULATIONS {\n"
                                     "            Include_AD_Feed_Back #false\n"
                                     "            Salinity_Description 1\n"
                                     "            Constant_Salinity 7.0\n"
                                     "            Salinity_Item_Number 1\n"
                                     "            Temperature_Description 0\n"
                                     "            Constant_Temperature 10.0\n"
                                     "            Temperature_Item_Number 1\n"
                                     "        }\n"
                                     "        AD_LINE_DISCHARGE_CALCULATIONS {\n"
                                     "            No_Of_AD_Discharge_Lines 0\n"
                                     "        }\n"
                                     "        BOXES_FOR_MASS_SUMMATION {\n"
                                     "            No_Of_AD_Mass_Boxes 0\n"
                                     "        }\n"
                                     "        MASS_BUDGET {\n"
                                     "            NoOfMassFiles 0\n"
                                     "        }\n"
                                     "        OUTPUT_SPECIFICATION {\n"
                                     "            Number_Of_Output_areas 0\n"
                                     "            Generate_Hotstart #false\n"
                                     "            HOTSTART_FILES {\n"
                                     "                AREA_1 {\n"
                                     "                    Title \"\"\n"
                                     "                    File_Name (result)\"\"\n"
                                     "                }\n"
                                     "            }\n"
                                     "        }\n"));
  EXPECT_EQ(textFor(3), newModelText(selectionText(3), "", newMudText()));
  EXPECT_EQ(textFor(8), newModelText(selectionText(8), "", "", kNewExpandedMud));
  EXPECT_EQ(textFor(9), newModelText(selectionText(9), "", "", "", kNewEcology));
  EXPECT_EQ(textFor(11), newModelText(selectionText(11)));
}

// A setup with options in every module section, loaded with its file as the source.
struct Loaded {
  explicit Loaded(std::string_view text) : file(test::fileOf(text)), root(&host) {
    root.Load(&file->tree().root(), "/case/setup.v27");
    root.SetSourceFile(file.get());
  }
  CollectingMessageHost host;
  KvsHandle file;
  CGlobalKvs root;
};

constexpr std::string_view kWithOptions =
    "VANE27_NESTED_MODEL {\n"
    " NESTED_MODEL_GLOBALS { OPTION_PARAMETERS { G 1 }; MODULE_SELECTION { Simulation_Type 8 } }\n"
    " HYDRODYNAMIC_MODULE { OPTION_PARAMETERS { H 2.5; Deep { X \"y\"; X \"z\" } } }\n"
    " ADVECTION_DISPERSION_MODULE { OPTION_PARAMETERS { A (file)\"f\" }; COMPONENT_SPECIFICATIONS { Number 4 "
    "} }\n"
    " MUD_TRANSPORT_MODULE { OPTION_PARAMETERS { M #true } }\n"
    " MUD_TRANSPORT_EXPANDED_MODULE { OPTION_PARAMETERS { E 5 }\n"
    "  XENOBIOTIC_MODULE { OPTION_PARAMETERS { Nested 6 } } }\n"
    " XENOBIOTIC_MODULE { OPTION_PARAMETERS { Top 7 } }\n"
    " BIO_RIG_MODULE { OPTION_PARAMETERS { B 8 } }\n"
    "}\n";

TEST(GlobalKvs, OptionsOfEveryModuleComeThroughWhateverIsSelected) {
  Loaded loaded(kWithOptions);
  for (const int code : {0, 2, 3, 8, 9}) {
    loaded.root.moduleSelection->simulationType = code;
    const std::string text = savedText(loaded.root);
    EXPECT_THAT(text, HasSubstr("OPTION_PARAMETERS {\n            G 1\n        }\n"));
    EXPECT_THAT(
        text,
        HasSubstr("OPTION_PARAMETERS {\n            H 2.5\n            Deep {\n                X \"y\"\n"
                  "                X \"z\"\n            }\n        }\n"));
    EXPECT_THAT(text, HasSubstr("A (file)\"f\"\n"));
    EXPECT_THAT(text, HasSubstr("M #true\n"));
    EXPECT_THAT(text, HasSubstr("E 5\n"));
    EXPECT_THAT(text, HasSubstr("B 8\n"));
    EXPECT_EQ(text.find("COMPONENT_SPECIFICATIONS") != text.npos, code == 2);
  }
}

TEST(GlobalKvs, OptionsOfXenobioticsAreLookedForAtTheTopAndLostFromInside) {
  Loaded loaded(kWithOptions);
  loaded.root.moduleSelection->simulationType = 8;
  const std::string text = savedText(loaded.root);
  EXPECT_THAT(
      text,
      HasSubstr("        XENOBIOTIC_MODULE {\n            OPTION_PARAMETERS {\n                Top 7\n"));
  EXPECT_THAT(text, Not(HasSubstr("Nested 6")));
}

TEST(GlobalKvs, WithoutASourceTheOptionsAreEmpty) {
  Loaded loaded(kWithOptions);
  loaded.root.SetSourceFile(nullptr);
  EXPECT_THAT(savedText(loaded.root), Not(HasSubstr("G 1")));
}

TEST(GlobalKvs, TheModuleCodeIsPinnedInTheWetlandSweepKit) {
  Loaded loaded(
      "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { MODULE_SELECTION { Simulation_Type 2; AD_Scheme 5 } }\n"
      " ADVECTION_DISPERSION_MODULE { COMPONENT_SPECIFICATIONS { Number 3 } } }");
  EXPECT_EQ(loaded.root.moduleSelection->simulationType, theEdition.wetlandSweepKit ? 0 : 2);
  EXPECT_THAT(savedText(loaded.root),
              HasSubstr(theEdition.wetlandSweepKit ? "AD_Scheme 1\n" : "AD_Scheme 5\n"));
}

TEST(GlobalKvs, DataOfAModuleThatIsNotSelectedAreEmptiedBySaving) {
  Loaded loaded(
      "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS {}\n"
      " ADVECTION_DISPERSION_MODULE { OPTION_PARAMETERS { K 1 }; COMPONENT_SPECIFICATIONS { Number 3 } } }");
  EXPECT_THAT(savedText(loaded.root), HasSubstr("    ADVECTION_DISPERSION_MODULE {\n"
                                                "        OPTION_PARAMETERS {\n"
                                                "            K 1\n"
                                                "        }\n"
                                                "    }\n"));
}

TEST(GlobalKvs, SectionsThatAreMissingKeepTheDefaults) {
  for (const char* text :
       {"", "OTHER {}", "VANE27_NESTED_MODEL {}", "VANE27_NESTED_MODEL { HYDRODYNAMIC_MODULE {} }"}) {
    Loaded loaded(text);
    EXPECT_EQ(loaded.root.simulationPeriod->noPointsInTime, 101) << text;
    EXPECT_EQ(loaded.root.areaDescription->dryingDepth, 0.02F) << text;
    EXPECT_TRUE(loaded.host.texts.empty());
  }
}

TEST(GlobalKvs, ALoadedModelIsSavedAgainByteForByte) {
  Model model;
  model.root.boundary->SetNoBoundaries(2);
  model.root.boundary->GetItem(2)->Set(1, 2, 1, 9);
  model.root.sourceSink->SetNoSources(1);
  model.root.bathymetry->GetArea(1)->fileName = "/case/grids/a.tsb2";
  model.root.simulationPeriod->start = DateTime::of({2007, 6, 8, 1, 2, 3});
  const std::string text = savedText(model.root);
  Loaded loaded(text);
  EXPECT_EQ(savedText(loaded.root), text);
}

TEST(GlobalKvs, CheckingWithoutDepthDoesNothing) {
  Model model;
  model.root.areaDescription->dryingDepth = -1;
  ValidationList messages;
  EXPECT_EQ(model.root.Validate(messages, 0), 0U);
  EXPECT_TRUE(messages.empty());
}

TEST(GlobalKvs, TheCheckRunsInItsOrder) {
  Model model;
  model.root.massBudget->SetNoPolygons(1);
  model.root.massBudget->GetItem(1)->corners.clear();
  model.root.sourceSink->SetNoSources(1);
  model.root.boundary->SetNoBoundaries(1);
  model.root.boundary->GetItem(1)->Set(-1, 0, -1, 0);
  model.root.simulationPeriod->timeStepInterval = 0;
  model.root.areaDescription->dryingDepth = 0;
  ValidationList messages;
  EXPECT_EQ(model.root.Validate(messages, 1), 7U);
  EXPECT_EQ(messages,
            (ValidationList{
                {PageId::bathymetry, "Data file  \" \"  is not valid", Severity::dependedUpon},
                {PageId::floodAndDry, "Drying depth must be positive", Severity::fault},
                {PageId::simulationPeriod, "Time step interval must be at least 0.01", Severity::fault},
                {PageId::boundary, "First point coordinates can not be negative", Severity::fault},
                {PageId::boundary, "Last point coordinates can not be negative", Severity::fault},
                {PageId::sourceAndSink, "Source no.1 is outside of grid", Severity::fault},
                {PageId::massBudget, "To few corner points in polygon", Severity::fault},
            }));
}

TEST(GlobalKvs, TheCheckOfTheFlowRunsInItsOrder) {
  Model model;
  model.root.boundary->SetNoBoundaries(1);
  model.root.nhdBoundary->at(1).dataFormat = CNhdBoundaryObjectKvs::kType0File;
  model.root.nhdResistance->at(1).constantValue = -1;
  model.root.nhdSurfaceElevation->at(1).type = 0;
  model.root.nhdWaveRadiation->at(1).included = 1;
  model.root.nhdEddyViscosity->dataFormat = CNhdEddyViscosityKvs::kConstant;
  model.root.nhdEddyViscosity->at(1).constantValue = -1;
  model.root.windConditions->constantSpeed = -1;
  ValidationList messages;
  model.root.Validate(messages, 1);
  std::vector<PageId> pages;
  for (const CMessage& message : messages) pages.push_back(message.page);
  EXPECT_EQ(pages, (std::vector<PageId>{PageId::bathymetry, PageId::windConditions, PageId::eddyViscosity,
                                        PageId::waveRadiation, PageId::surfaceElevation, PageId::resistance,
                                        PageId::hdBoundary}));
}

TEST(GlobalKvs, TheCheckOfTransportOutputsRunsInItsOrder) {
  Model model;
  model.root.moduleSelection->simulationType = 2;
  model.root.nadLineDischarge->SetCount(1);
  model.root.nadBoxSummation->SetCount(1);
  model.root.nadMassBudget->SetCount(1);
  model.root.nadResult->generateHotStart = true;
  ValidationList messages;
  model.root.Validate(messages, 1);
  std::vector<PageId> pages;
  for (const CMessage& message : messages) {
    if (pages.empty() || pages.back() != message.page) pages.push_back(message.page);
  }
  EXPECT_EQ(pages, (std::vector<PageId>{PageId::bathymetry, PageId::adLineDischarge, PageId::adBoxSummation,
                                        PageId::adMassBudget, PageId::adResult}));
}

TEST(GlobalKvs, ThePagesOfTheMessages) {
  EXPECT_EQ(static_cast<int>(PageId::adBoxSummation), 10);
  EXPECT_EQ(static_cast<int>(PageId::adLineDischarge), 20);
  EXPECT_EQ(static_cast<int>(PageId::adMassBudget), 21);
  EXPECT_EQ(static_cast<int>(PageId::adResult), 23);
  EXPECT_EQ(static_cast<int>(PageId::floodAndDry), 26);
  EXPECT_EQ(static_cast<int>(PageId::bathymetry), 27);
  EXPECT_EQ(static_cast<int>(PageId::boundary), 28);
  EXPECT_EQ(static_cast<int>(PageId::hdBoundary), 29);
  EXPECT_EQ(static_cast<int>(PageId::dikes), 31);
  EXPECT_EQ(static_cast<int>(PageId::eddyViscosity), 32);
  EXPECT_EQ(static_cast<int>(PageId::massBudget), 34);
  EXPECT_EQ(static_cast<int>(PageId::moduleSelection), 35);
  EXPECT_EQ(static_cast<int>(PageId::resistance), 37);
  EXPECT_EQ(static_cast<int>(PageId::simulationPeriod), 39);
  EXPECT_EQ(static_cast<int>(PageId::sourceAndSink), 40);
  EXPECT_EQ(static_cast<int>(PageId::surfaceElevation), 43);
  EXPECT_EQ(static_cast<int>(PageId::waveRadiation), 44);
  EXPECT_EQ(static_cast<int>(PageId::windConditions), 46);
  EXPECT_EQ(static_cast<int>(PageId::waves), 142);
}

TEST(SetupFile, KeepsTheSourceForLaterSaves) {
  const test::TemporaryFolder folder;
  const std::string path = folder.write("s.v27", kWithOptions);
  CollectingMessageHost host;
  Result<SetupFile> setup = SetupFile::open(path, &host);
  ASSERT_TRUE(setup) << setup.error();
  ASSERT_TRUE(setup->save(path));
  ASSERT_TRUE(setup->save(path));
  EXPECT_THAT(test::textOf(path), HasSubstr("H 2.5\n"));
}

TEST(SetupFile, AFileThatIsNoSetupIsRefused) {
  const test::TemporaryFolder folder;
  CollectingMessageHost host;
  EXPECT_THAT(SetupFile::open(folder.write("a", ""), &host).error(),
              HasSubstr("it has no section VANE27_NESTED_MODEL"));
  EXPECT_THAT(SetupFile::open(folder.write("b", "X {}"), &host).error(), HasSubstr("is not a setup"));
  EXPECT_THAT(SetupFile::open(folder.write("c", "VANE27_NESTED_MODEL {"), &host).error(),
              HasSubstr("line 1, column 22"));
  EXPECT_THAT(SetupFile::open(folder.file("none"), &host).error(), HasSubstr("No such file"));
}

TEST(SetupFile, TellsWhatASaveLeavesOutUnawares) {
  const test::TemporaryFolder folder;
  const std::string path = folder.write(
      "s.v27",
      "VANE27_NESTED_MODEL { NESTED_MODEL_GLOBALS { FUTURE { A 1 } }\n HYDRODYNAMIC_MODULE { STRANGE {} }\n"
      " BIO_RIG_MODULE { CONSTANTS { A 1 } } }");
  CollectingMessageHost host;
  Result<SetupFile> setup = SetupFile::open(path, &host);
  ASSERT_TRUE(setup);
  EXPECT_EQ(setup->unknownSections(),
            (std::vector<std::string>{"NESTED_MODEL_GLOBALS/FUTURE", "HYDRODYNAMIC_MODULE/STRANGE"}));
}

}  // namespace setup_global_kvs_test
}  // namespace gridbay
