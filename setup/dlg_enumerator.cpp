#include "setup/dlg_enumerator.h"

#include <algorithm>

#include "core/edition.h"

namespace gridbay {
namespace {

constexpr std::int32_t kHelpTopicBase = 131072;

// Ids 33, 36, 69 and 144 are out of use.
constexpr PageEntry kPages[] = {
    {9, "Boundary", "CNadBoundaryDlg", 18717, "CNadBoundaryGrid, CNadBoundaryConstantsGrid"},
    {10, "Box Summation", "CNadBoxSummationDlg", 18719, "CNadBoxSummationGrid"},
    {11, "Component", "CNadComponentDlg", 18720, "CNadComponentGrid"},
    {12, "Decay Specification", "CNadDecaySpecificationDlg", 18721, "CNadDecaySpecificationGrid"},
    {13, "Deposition Concentration", "CNadDepositionConcentrationDlg", 18722,
     "CNadSurfaceDepositionGrid, CNadSoilDepositionGrid"},
    {14, "Dispersion Coefficients", "CNadDispersionCoefDlg", 18723, "CNadDispersionCoefGrid"},
    {15, "Evaporation Concentrations", "CNadEvaporationDlg", 18724, "CNadEvaporationGrid"},
    {16, "Feedback", "CNadFeedbackDlg", 18725},
    {17, "Heat Dissipation", "CNadHeatDissipationDlg", 18727, "CNadHeatDissipationGrid"},
    {18, "Heat Exchange", "CNadHeatExchangeDlg", 18726},
    {19, "Initial Concentrations", "CNadInitialConcentrationDlg", 18729, "CNadInitialConcentrationGrid"},
    {20, "Line Discharge", "CNadLineDischargeDlg", 18731, "CNadLineDischargeGrid"},
    {21, "Mass Budget", "CNadMassBudgetDlg", 18733, "CNadMassBudgetGrid"},
    {22, "Precipitation Concentrations", "CNadPrecipitationDlg", 18734, "CNadPrecipitationGrid"},
    {23, "Result", "CNadResultDlg", 18735, "CNadResultGrid, CNadResultHotStartGrid"},
    {24, "Source and Sink", "CNadSourceSinkDlg", 18736, "CNadSourceSinkGrid"},
    {25, "Starting Conditions", "CNadStartingConditionsDlg", 18737, "CNadHotStartGrid"},
    {26, "Flood and Dry", "CAreaDescriptionDlg", 18702},
    {27, "Bathymetry", "CBathymetryDlg", 18703, "CBathymetryGrid"},
    {28, "Boundary", "CBoundaryDlg", 18704, "CBoundaryGrid"},
    {29, "Boundary", "CNhdBoundaryDlg", 18705, "CNhdBoundaryGrid"},
    {30, "Culverts", "CNHdCulvertDlg", 18709, "CCulvertGrid, CCulvertDataGrid"},
    {31, "Dikes", "CNHdDikeDlg", 18710, "CDikeGrid, CPointGrid"},
    {32, "Eddy Viscosity", "CNhdEddyViscosityDlg", 18706,
     "CNhdEddyViscosityConstGrid, CNhdEddyViscosityFromFileGrid, CNhdEddyViscositySmagorinskyGrid"},
    {34, "Mass Budget", "CMassBudgetDlg", 18715, "CMassBudgetGrid"},
    {35, "Module Selection", "CModuleSelectionDlg", 18716},
    {37, "Resistance", "CNhdResistanceDlg", 18923, "CNhdResistanceGrid"},
    {38, "Results", "CResultDlg", 18921, "CResultGrid, CHotStartGrid"},
    {39, "Simulation Period", "CSimulationPeriodDlg", 18926},
    {40, "Source and Sink", "CSourceSinkDlg", 18929, "CSourceSinkGrid"},
    {41, "Source and Sink", "CNhdSourceSinkDlg", 18930, "CNhdSourceSinkGrid"},
    {42, "Structures", "", 0},
    {43, "Initial Surface Elevation", "CNhdSurfaceElevationDlg", 18931, "CNhdSurfaceElevationGrid"},
    {44, "Wave Radiation", "CNhdWaveRadiationDlg", 18933, "CNhdWaveRadiationGrid"},
    {45, "Weirs", "CNHdWeirDlg", 18713, "CWeirGrid, CWeirDataGrid"},
    {46, "Wind Conditions", "CWindConditionsDlg", 18934},
    {47, "Bed Roughness", "CNmtBedRoughnessDlg", 18807, "CNmtBedRoughnessGrid"},
    {48, "Boundary", "CNmtBoundaryDlg", 18808, "CNmtBoundaryGrid, CNmtBoundaryConstantsGrid"},
    {49, "Box Summation", "CNmtBoxSummationDlg", 18810, "CNmtBoxSummationGrid"},
    {50, "Consolidation Within Layers", "CNmtConsolidationDlg", 18811},
    {51, "Constant Friction Coefficient", "CNmtConstantSlidingDlg", 18812,
     "CNmtConstantSlidingGrid1, CNmtConstantSlidingGrid2"},
    {52, "Dispersion", "CNmtDispersionCoefDlg", 18814, "CNmtDispersionCoefGrid"},
    {53, "Critical Shear Stress", "CNmtErosionForEachLayerCriticalDlg", 18831,
     "CNmtErosionForEachLayerCriticalGrid1, CNmtErosionForEachLayerCriticalGrid2"},
    {54, "Density of Bed Layer", "CNmtErosionForEachLayerDensityDlg", 18813,
     "CNmtErosionForEachLayerDensityGrid1, CNmtErosionForEachLayerDensityGrid2"},
    {55, "Erosion Coefficient Factor", "CNmtErosionForEachLayerFactorDlg", 18815,
     "CNmtErosionForEachLayerFactorGrid1, CNmtErosionForEachLayerFactorGrid2"},
    {56, "Erosion Coefficient Factor 1", "CNmtErosionForEachLayerFactor1Dlg", 18816,
     "CNmtErosionForEachLayerFactor1Grid1, CNmtErosionForEachLayerFactor1Grid2"},
    {57, "Erosion Coefficient Factor 2", "CNmtErosionForEachLayerFactor2Dlg", 18817,
     "CNmtErosionForEachLayerFactor2Grid1, CNmtErosionForEachLayerFactor2Grid2"},
    {58, "Erosion Coefficient Power/Alpha", "CNmtErosionForEachLayerPowerDlg", 18818,
     "CNmtErosionForEachLayerPowerGrid1, CNmtErosionForEachLayerPowerGrid2"},
    {59, "Erosion Characteristics for each layer", "CNmtErosionLayerDlg", 18819, "CNmtErosionLayerGrid"},
    {60, "Density of Bed Layer", "CNmtExpBedDensityDlg", 18843, "CNmtExpBedDensityGrid"},
    {61, "Bed Parameters", "", 0},
    {62, "Bed Roughness", "CNmtExpBedRoughnessDlg", 18839, "CNmtExpBedRoughnessGrid"},
    {63, "Boundary", "CNmtExpBoundaryDlg", 18840, "CNmtExpBoundaryGrid, CNmtExpBoundaryExtGrid"},
    {64, "Constant Waves", "CNmtExpConstantWavesDlg", 18868},
    {65, "Constant Friction Coefficient", "CNmtExpConstFrictionCoefDlg", 18841,
     "CNmtExpConstFrictionCoefGrid"},
    {66, "Critical Shear Stress", "CNmtExpCriticalShearStressDlg", 18842, "CNmtExpCriticalShearStressGrid"},
    {67, "Deposition", "CNmtExpDepositionDlg", 18844, "CNmtExpShearStressGrid"},
    {68, "Dispersion", "CNmtExpDispersionCoefDlg", 18845, "CNmtExpDispersionCoefGrid"},
    {70, "Dredging", "CNmtExpDredgingsDlg", 18846, "CNmtExpDredgingGrid"},
    {71, "Erosion Coefficient", "CNmtExpErosionCoefficientDlg", 18848, "CNmtExpErosionCoefficientGrid"},
    {72, "Erosion", "CNmtExpErosionLayer", 18847, "CNmtExpErosionDescriptionGrid"},
    {73, "Forcings", "CNmtExpForcingsDlg", 18849},
    {74, "Initial Conditions", "CNmtExpInitialConditionsDlg", 18850,
     "CNmtExpInitialConcentrationsGrid, CNmtExpInitialBedThicknessGrid, CNmtExpBedDistributionGrid"},
    {75, "Line Discharge", "CNmtExpLineDischargeDlg", 18851, "CNmtExpLineDischargeGrid"},
    {76, "Mass Budget Calculations", "CNmtExpMassBudgetDlg", 18853},
    {77, "Morphology", "CNmtExpMorphologyDlg", 18854},
    {78, "Power Of Erosion", "CNmtExpPowerOfErosionDlg", 18855, "CNmtExpPowerOfErosionGrid"},
    {79, "Results", "CNmtExpResultDlg", 18856, "CNmtExpResultHotStartGrid"},
    {80, "Sand Fractions", "CNmtExpSandFractionsDlg", 18857, "CNmtExpSandFractionValueGrid"},
    {81, "Settling Parameters", "CNmtExpSettlingParDlg", 18859,
     "CNmtExpFallVelocityGrid, CNmtExpSettlingParGrid"},
    {82, "Settling", "CNmtExpSettlingsDlg", 18858},
    {83, "Sliding", "CNmtExpSlidingDlg", 18860},
    {84, "Sources", "CNmtExpSourcesDlg", 18861, "CNmtExpSourcesGrid"},
    {85, "Starting Conditions", "CNmtExpStartingConditionsDlg", 18862, "CNmtExpHotStartGrid"},
    {86, "Parameter Selection", "CNmtExpTaskSelectionDlg", 18863},
    {87, "Transition Between Layers", "CNmtExpTransitionDlg", 18864, "CNmtExpTransitionGrid"},
    {88, "Time and Space Varying Waves", "CNmtExpTSVWaves", 18865},
    {89, "Variable Friction Coefficient", "CNmtExpVarFrictionCoefDlg", 18866, "CNmtExpVarFrictionCoefGrid"},
    {90, "Water Column Parameters", "CNmtExpWaterColParametersDlg", 18867, "CNmtExpSandFractionGrid"},
    {91, "Wave Database", "CNmtExpWaveDatabaseDlg", 18869, "CNmtExpWaveDatabaseGrid"},
    {92, "Waves", "CNmtExpWavesDlg", 18870},
    {93, "Initial Conditions", "CNmtInitialConcentrationDlg", 18820, "CNmtInitialConcentrationGrid"},
    {94, "Line Discharge", "CNmtLineDischargeDlg", 18822, "CNmtLineDischargeGrid"},
    {95, "Erosion Characteristics", "CNmtMfErosionCharacteristicsDlg", 18824},
    {96, "Settling and Deposition", "CNmtMfSettlingAndDepositionDlg", 18825,
     "CNmtMfSettlingAndDepositionGrid"},
    {97, "Erosion Characteristics", "CNmtMlErosionCharacteristicsDlg", 18828},
    {98, "Settling and Deposition", "CNmtMlSettlingAndDepositionDlg", 18829, "CNmtMlShearStressGrid"},
    {99, "Results", "CNmtResultDlg", 18830, "CNmtResultGrid, CNmtResultHotStartGrid"},
    {100, "Initial Bed Composition", "CNmtSettlingAndDespositionBedCompositionDlg", 18826,
     "CNmtSettlingAndDespositionBedCompositionGrid1, CNmtSettlingAndDespositionBedCompositionGrid2"},
    {101, "Erosion", "CNmtSettlingAndDespositionErosionDlg", 18827,
     "CNmtSettlingAndDespositionErosionGrid1, CNmtSettlingAndDespositionErosionGrid2"},
    {102, "Sliding", "CNmtSlidingDlg", 18832},
    {103, "Source Sink", "CNmtSourceSinkDlg", 18833, "CNmtSourceSinkGrid"},
    {104, "Starting Conditions", "CNmtStartingConditionsDlg", 18834, "CNmtHotStartGrid"},
    {105, "Task Selection", "CNmtTaskSelectionDlg", 18835},
    {106, "Transition Between Layers", "CNmtTransitionBetweenLayersDlg", 18836,
     "CNmtTransitionBetweenLayersGrid1, CNmtTransitionBetweenLayersGrid2"},
    {107, "Variable Friction Coefficient", "CNmtVariableSlidingDlg", 18837, "CNmtVariableSlidingGrid"},
    {108, "Wave Data", "CNmtWaveDataDlg", 18838},
    {109, "Boundary", "CWQSADBoundaryDlg", 18936, "CWQSADBoundaryGridDlg"},
    {110, "Deposition", "CWQSADDepositionDlg", 18937, "CWQSADDepositionGridDlg"},
    {111, "Dispersion", "CWQSADDispersionDlg", 18938, "CWQSADDispersionGridDlg"},
    {112, "Evaporation", "CWQSADEvaporationDlg", 18939, "CWQSADEvaporationGridDlg"},
    {113, "Precipitation", "CWQSADPrecipitationDlg", 18940, "CWQSADPrecipitationGridDlg"},
    {114, "Source and Sink", "CWQSADSourceSinkDlg", 18941, "CWQSADSourceSinkGridDlg"},
    {115, "AD Transport Parameters", "", 0},
    {116, "Constants", "CWQSConstantsDlg", 18943, "CWQSConstantsGridDlg"},
    {117, "Forcings", "CWQSForcingsDlg", 18944, "CWQSForcingsGridDlg"},
    {118, "Initial Conditions", "CWQSInitialConditionsDlg", 18945, "CWQSInitialConditionsGridDlg"},
    {119, "Mass Budget", "CWQSMassBudgetDlg", 18946, "CWQSMassBudgetGridDlg"},
    {120, "Model Definition", "CWQSModelDefinitionDlg", 18947},
    {121, "Results", "CWQSResultsDlg", 18948, "CWQSResultsGridDlg, CWQSResultsHotStartGridDlg"},
    {122, "Starting Conditions", "CWQSStartingConditionsDlg", 18949, "CWQSStartingConditionsGridDlg"},
    {123, "State Variables", "CWQSStateVariablesDlg", 18950},
    {124, "Adsorption rate", "", 0},
    {125, "Bio Concentration", "", 0},
    {126, "Bio Degradation", "", 0},
    {127, "Boundary Concentrations", "", 0},
    {128, "Desorption rate", "", 0},
    {129, "Dispersion", "", 0},
    {130, "Forcing functions", "", 0},
    {131, "Hydrolysis", "", 0},
    {132, "Initial Concentrations", "", 0},
    {133, "Partition coefficient", "", 0},
    {134, "Partition coefficient relationship", "", 0},
    {135, "Photolysis", "", 0},
    {136, "Reactions", "", 0},
    {137, "Results", "", 0},
    {138, "Sediment parameters", "", 0},
    {139, "Source and Sink", "", 0},
    {140, "Starting Conditions", "", 0},
    {141, "Volatilisation", "", 0},
    {142, "Waves", "CNhdResistanceWaveDlg", 19655},
    {143, "Infiltration", "CHDInfiltrationDlg", 19656},
    {145, "Infiltration Concentrations", "CNadInfiltrationDlg", 18724, "CNadInfiltrationGrid"},
    {146, "Infiltration", "CWQSADInfiltrationDlg", 18939, "CWQSADInfiltrationGridDlg"},
};

// Help of an item without a page: the topic and the local page, of the Flow Model and of the Wetland Sweep
// Kit.
struct HelpEntry {
  std::int32_t id;
  std::string_view topic;
  std::string_view sweepTopic;
  std::string_view local;
  std::string_view sweepLocal;
};

constexpr HelpEntry kDefaultHelp{0, "/V27Nested/index.htm", "/v27wsk/index.htm",
                                 "res://V27Nested.dll/default.htm", "res://V27NestedWSK.dll/default.htm"};

// An item with one set of paths has it in both editions.
constexpr HelpEntry both(std::int32_t id, std::string_view topic, std::string_view local) {
  return {id, topic, topic, local, local};
}

constexpr HelpEntry kHelp[] = {
    {1, "/V27Nested/V27Nested/Cover/VANE_27_Flow_Model.htm",
     "/v27wsk/V27WSK_Online/Cover_WSK_Online/VANE_27_Wetland_Sweep_Kit.htm",
     "res://V27Nested.dll/VANE_27_Flow_Model.htm", "res://V27NestedWSK.dll/VANE_27_Wetland_Sweep_Kit.htm"},
    {2, "/V27Nested/V27Nested/V27Basic_CHP/Basic_Parameters.htm",
     "/v27wsk/V27WSK_Online/V27Basic_CHP/Basic_Parameters.htm", "res://V27Nested.dll/Basic_Parameters.htm",
     "res://V27NestedWSK.dll/Basic_Parameters_WSK.htm"},
    both(3, "/V27Nested/V27Nested/V27AD_CHP/Advection-Dispersion_Parameters.htm",
         "res://V27Nested.dll/Advection-Dispersion_Parameters.htm"),
    {4, "/V27Nested/V27Nested/V27HD_CHP/Hydrodynamic_Parameters.htm",
     "/v27wsk/V27WSK_Online/V27HD_CHP/Hydrodynamic_Parameters.htm",
     "res://V27Nested.dll/Hydrodynamic_Parameters.htm", "res://V27NestedWSK.dll/Hydrodynamic_Parameters.htm"},
    both(5, "/V27Nested/V27Nested/V27MT/Mud_Transport_Parameters.htm",
         "res://V27Nested.dll/Mud_Transport_Parameters.htm"),
    both(6, "/V27Nested/V27Nested/V27MT/Mud_Transport_Parameters.htm",
         "res://V27Nested.dll/Mud_Transport_Parameters.htm"),
    both(7, "/V27Nested/V27Nested/wqlabintroduction/BIO_Rig_Parameters.htm",
         "res://V27Nested.dll/BIO_Rig_Parameters.htm"),
    {42, "/V27Nested/V27Nested/v27hd_dialogs/Structures.htm",
     "/v27wsk/V27WSK_Online/v27hd_dialogs/Structures.htm", "res://V27Nested.dll/Structures.htm",
     "res://V27NestedWSK.dll/Structures.htm"},
    both(61, "/V27Nested/V27Nested/v27mt_dialogs/Bed_Parameters.htm",
         "res://V27Nested.dll/Bed_Parameters.htm"),
    both(115, "/v27nested/V27Nested/V27DialogOverviewB/AD_Transport_Parameters.htm",
         "res://V27Nested.dll/v27dialogoverviewb.htm"),
};

const HelpEntry& helpOf(std::int32_t id) {
  const auto* found = std::ranges::find(kHelp, id, &HelpEntry::id);
  return found != std::end(kHelp) ? *found : kDefaultHelp;
}

}  // namespace

std::span<const PageEntry> CDlgEnumerator::pages() const {
  return kPages;
}

const PageEntry* CDlgEnumerator::find(std::int32_t id) const {
  const auto* found = std::ranges::lower_bound(kPages, id, {}, &PageEntry::id);
  return found != std::end(kPages) && found->id == id ? found : nullptr;
}

std::string_view CDlgEnumerator::GetCaption(std::int32_t id) const {
  const PageEntry* page = find(id);
  return page == nullptr ? std::string_view() : page->caption;
}

std::string_view CDlgEnumerator::GetPageClass(std::int32_t id, std::string* helpTopic,
                                              std::string* localPage) const {
  helpTopic->clear();
  localPage->clear();
  const PageEntry* page = find(id);
  if (page != nullptr && !page->pageClass.empty()) return page->pageClass;
  const HelpEntry& help = helpOf(id);
  *helpTopic = theEdition.wetlandSweepKit ? help.sweepTopic : help.topic;
  *localPage = theEdition.wetlandSweepKit ? help.sweepLocal : help.local;
  return {};
}

std::int32_t CDlgEnumerator::GetHelpTopicNumber(std::int32_t id) const {
  const PageEntry* page = find(id);
  return page == nullptr || page->templateId == 0 ? 0 : kHelpTopicBase + page->templateId;
}

}  // namespace gridbay
