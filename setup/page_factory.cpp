#include "setup/page_factory.h"

#include "advection_dispersion/boundary_page.h"
#include "advection_dispersion/box_summation_page.h"
#include "advection_dispersion/component_page.h"
#include "advection_dispersion/decay_specification_page.h"
#include "advection_dispersion/deposition_concentration_page.h"
#include "advection_dispersion/dispersion_coef_page.h"
#include "advection_dispersion/evaporation_page.h"
#include "advection_dispersion/feedback_page.h"
#include "advection_dispersion/heat_dissipation_page.h"
#include "advection_dispersion/heat_exchange_page.h"
#include "advection_dispersion/infiltration_page.h"
#include "advection_dispersion/initial_concentration_page.h"
#include "advection_dispersion/line_discharge_page.h"
#include "advection_dispersion/mass_budget_page.h"
#include "advection_dispersion/precipitation_page.h"
#include "advection_dispersion/result_page.h"
#include "advection_dispersion/source_sink_page.h"
#include "advection_dispersion/starting_conditions_page.h"
#include "basic/area_description_page.h"
#include "basic/bathymetry_page.h"
#include "basic/boundary_page.h"
#include "basic/mass_budget_page.h"
#include "basic/module_selection_page.h"
#include "basic/simulation_period_page.h"
#include "basic/source_sink_page.h"
#include "ecology/boundary_page.h"
#include "ecology/constants_page.h"
#include "ecology/deposition_page.h"
#include "ecology/dispersion_page.h"
#include "ecology/evaporation_page.h"
#include "ecology/forcings_page.h"
#include "ecology/infiltration_page.h"
#include "ecology/initial_conditions_page.h"
#include "ecology/mass_budget_page.h"
#include "ecology/model_definition_page.h"
#include "ecology/precipitation_page.h"
#include "ecology/results_page.h"
#include "ecology/source_sink_page.h"
#include "ecology/starting_conditions_page.h"
#include "ecology/state_variables_page.h"
#include "hydrodynamic/boundary_page.h"
#include "hydrodynamic/eddy_viscosity_page.h"
#include "hydrodynamic/infiltration_page.h"
#include "hydrodynamic/resistance_page.h"
#include "hydrodynamic/result_page.h"
#include "hydrodynamic/source_sink_page.h"
#include "hydrodynamic/surface_elevation_page.h"
#include "hydrodynamic/wave_radiation_page.h"
#include "hydrodynamic/wind_conditions_page.h"
#include "mud_transport/bed_roughness_page.h"
#include "mud_transport/boundary_page.h"
#include "mud_transport/box_summation_page.h"
#include "mud_transport/consolidation_page.h"
#include "mud_transport/dispersion_coef_page.h"
#include "mud_transport/erosion_characteristics_page.h"
#include "mud_transport/erosion_for_each_layer_page.h"
#include "mud_transport/initial_concentration_page.h"
#include "mud_transport/line_discharge_page.h"
#include "mud_transport/ml_settling_and_deposition_page.h"
#include "mud_transport/result_page.h"
#include "mud_transport/settling_and_desposition_page.h"
#include "mud_transport/sliding_page.h"
#include "mud_transport/source_sink_page.h"
#include "mud_transport/starting_conditions_page.h"
#include "mud_transport/task_selection_page.h"
#include "mud_transport/transition_between_layers_page.h"
#include "mud_transport/wave_data_page.h"
#include "mud_transport_expanded/bed_density_page.h"
#include "mud_transport_expanded/bed_roughness_page.h"
#include "mud_transport_expanded/boundary_page.h"
#include "mud_transport_expanded/const_friction_coef_page.h"
#include "mud_transport_expanded/critical_shear_stress_page.h"
#include "mud_transport_expanded/deposition_page.h"
#include "mud_transport_expanded/dispersion_coef_page.h"
#include "mud_transport_expanded/dredgings_page.h"
#include "mud_transport_expanded/erosion_coefficient_page.h"
#include "mud_transport_expanded/erosion_layer_page.h"
#include "mud_transport_expanded/forcings_page.h"
#include "mud_transport_expanded/initial_conditions_page.h"
#include "mud_transport_expanded/line_discharge_page.h"
#include "mud_transport_expanded/mass_budget_page.h"
#include "mud_transport_expanded/morphology_page.h"
#include "mud_transport_expanded/power_of_erosion_page.h"
#include "mud_transport_expanded/result_page.h"
#include "mud_transport_expanded/sand_fractions_page.h"
#include "mud_transport_expanded/settling_par_page.h"
#include "mud_transport_expanded/settlings_page.h"
#include "mud_transport_expanded/sliding_page.h"
#include "mud_transport_expanded/sources_page.h"
#include "mud_transport_expanded/starting_conditions_page.h"
#include "mud_transport_expanded/task_selection_page.h"
#include "mud_transport_expanded/transition_page.h"
#include "mud_transport_expanded/var_friction_coef_page.h"
#include "mud_transport_expanded/water_col_parameters_page.h"
#include "mud_transport_expanded/wave_database_page.h"
#include "mud_transport_expanded/waves_page.h"
#include "structures/culvert_page.h"
#include "structures/dike_page.h"
#include "structures/weir_page.h"

namespace gridbay {
namespace {

template <class Page>
std::unique_ptr<CV27SetupFormView> make(CVdDoc& document) {
  return std::make_unique<Page>(document);
}

struct Entry {
  std::string_view pageClass;
  std::unique_ptr<CV27SetupFormView> (*make)(CVdDoc&);
};

constexpr Entry kPages[] = {
    {"CModuleSelectionDlg", make<CModuleSelectionDlg>},
    {"CBathymetryDlg", make<CBathymetryDlg>},
    {"CSimulationPeriodDlg", make<CSimulationPeriodDlg>},
    {"CBoundaryDlg", make<CBoundaryDlg>},
    {"CSourceSinkDlg", make<CSourceSinkDlg>},
    {"CAreaDescriptionDlg", make<CAreaDescriptionDlg>},
    {"CMassBudgetDlg", make<CMassBudgetDlg>},
    {"CNhdBoundaryDlg", make<CNhdBoundaryDlg>},
    {"CNhdSurfaceElevationDlg", make<CNhdSurfaceElevationDlg>},
    {"CWindConditionsDlg", make<CWindConditionsDlg>},
    {"CNhdEddyViscosityDlg", make<CNhdEddyViscosityDlg>},
    {"CNhdResistanceDlg", make<CNhdResistanceDlg>},
    {"CNhdResistanceWaveDlg", make<CNhdResistanceWaveDlg>},
    {"CNhdWaveRadiationDlg", make<CNhdWaveRadiationDlg>},
    {"CNhdSourceSinkDlg", make<CNhdSourceSinkDlg>},
    {"CHDInfiltrationDlg", make<CHDInfiltrationDlg>},
    {"CResultDlg", make<CResultDlg>},
    {"CNHdWeirDlg", make<CNHdWeirDlg>},
    {"CNHdCulvertDlg", make<CNHdCulvertDlg>},
    {"CNHdDikeDlg", make<CNHdDikeDlg>},
    {"CNadComponentDlg", make<CNadComponentDlg>},
    {"CNadStartingConditionsDlg", make<CNadStartingConditionsDlg>},
    {"CNadInitialConcentrationDlg", make<CNadInitialConcentrationDlg>},
    {"CNadDispersionCoefDlg", make<CNadDispersionCoefDlg>},
    {"CNadDecaySpecificationDlg", make<CNadDecaySpecificationDlg>},
    {"CNadHeatDissipationDlg", make<CNadHeatDissipationDlg>},
    {"CNadBoundaryDlg", make<CNadBoundaryDlg>},
    {"CNadSourceSinkDlg", make<CNadSourceSinkDlg>},
    {"CNadDepositionConcentrationDlg", make<CNadDepositionConcentrationDlg>},
    {"CNadHeatExchangeDlg", make<CNadHeatExchangeDlg>},
    {"CNadPrecipitationDlg", make<CNadPrecipitationDlg>},
    {"CNadEvaporationDlg", make<CNadEvaporationDlg>},
    {"CNadInfiltrationDlg", make<CNadInfiltrationDlg>},
    {"CNadFeedbackDlg", make<CNadFeedbackDlg>},
    {"CNadLineDischargeDlg", make<CNadLineDischargeDlg>},
    {"CNadBoxSummationDlg", make<CNadBoxSummationDlg>},
    {"CNadMassBudgetDlg", make<CNadMassBudgetDlg>},
    {"CNadResultDlg", make<CNadResultDlg>},
    {"CNmtTaskSelectionDlg", make<CNmtTaskSelectionDlg>},
    {"CNmtStartingConditionsDlg", make<CNmtStartingConditionsDlg>},
    {"CNmtInitialConcentrationDlg", make<CNmtInitialConcentrationDlg>},
    {"CNmtDispersionCoefDlg", make<CNmtDispersionCoefDlg>},
    {"CNmtBoundaryDlg", make<CNmtBoundaryDlg>},
    {"CNmtSourceSinkDlg", make<CNmtSourceSinkDlg>},
    {"CNmtLineDischargeDlg", make<CNmtLineDischargeDlg>},
    {"CNmtBoxSummationDlg", make<CNmtBoxSummationDlg>},
    {"CNmtResultDlg", make<CNmtResultDlg>},
    {"CNmtMfSettlingAndDepositionDlg", make<CNmtMfSettlingAndDepositionDlg>},
    {"CNmtSettlingAndDespositionErosionDlg", make<CNmtSettlingAndDespositionErosionDlg>},
    {"CNmtSettlingAndDespositionBedCompositionDlg", make<CNmtSettlingAndDespositionBedCompositionDlg>},
    {"CNmtMlSettlingAndDepositionDlg", make<CNmtMlSettlingAndDepositionDlg>},
    {"CNmtMfErosionCharacteristicsDlg", make<CNmtMfErosionCharacteristicsDlg>},
    {"CNmtMlErosionCharacteristicsDlg", make<CNmtMlErosionCharacteristicsDlg>},
    {"CNmtErosionLayerDlg", make<CNmtErosionLayerDlg>},
    {"CNmtErosionForEachLayerCriticalDlg", make<CNmtErosionForEachLayerCriticalDlg>},
    {"CNmtErosionForEachLayerFactorDlg", make<CNmtErosionForEachLayerFactorDlg>},
    {"CNmtErosionForEachLayerFactor1Dlg", make<CNmtErosionForEachLayerFactor1Dlg>},
    {"CNmtErosionForEachLayerFactor2Dlg", make<CNmtErosionForEachLayerFactor2Dlg>},
    {"CNmtErosionForEachLayerDensityDlg", make<CNmtErosionForEachLayerDensityDlg>},
    {"CNmtErosionForEachLayerPowerDlg", make<CNmtErosionForEachLayerPowerDlg>},
    {"CNmtSlidingDlg", make<CNmtSlidingDlg>},
    {"CNmtConstantSlidingDlg", make<CNmtConstantSlidingDlg>},
    {"CNmtVariableSlidingDlg", make<CNmtVariableSlidingDlg>},
    {"CNmtTransitionBetweenLayersDlg", make<CNmtTransitionBetweenLayersDlg>},
    {"CNmtConsolidationDlg", make<CNmtConsolidationDlg>},
    {"CNmtBedRoughnessDlg", make<CNmtBedRoughnessDlg>},
    {"CNmtWaveDataDlg", make<CNmtWaveDataDlg>},
    {"CNmtExpBedDensityDlg", make<CNmtExpBedDensityDlg>},
    {"CNmtExpBedRoughnessDlg", make<CNmtExpBedRoughnessDlg>},
    {"CNmtExpConstFrictionCoefDlg", make<CNmtExpConstFrictionCoefDlg>},
    {"CNmtExpCriticalShearStressDlg", make<CNmtExpCriticalShearStressDlg>},
    {"CNmtExpDepositionDlg", make<CNmtExpDepositionDlg>},
    {"CNmtExpDredgingsDlg", make<CNmtExpDredgingsDlg>},
    {"CNmtExpErosionCoefficientDlg", make<CNmtExpErosionCoefficientDlg>},
    {"CNmtExpErosionLayer", make<CNmtExpErosionLayer>},
    {"CNmtExpMorphologyDlg", make<CNmtExpMorphologyDlg>},
    {"CNmtExpPowerOfErosionDlg", make<CNmtExpPowerOfErosionDlg>},
    {"CNmtExpSandFractionsDlg", make<CNmtExpSandFractionsDlg>},
    {"CNmtExpSettlingParDlg", make<CNmtExpSettlingParDlg>},
    {"CNmtExpSettlingsDlg", make<CNmtExpSettlingsDlg>},
    {"CNmtExpSlidingDlg", make<CNmtExpSlidingDlg>},
    {"CNmtExpTransitionDlg", make<CNmtExpTransitionDlg>},
    {"CNmtExpVarFrictionCoefDlg", make<CNmtExpVarFrictionCoefDlg>},
    {"CNmtExpWaterColParametersDlg", make<CNmtExpWaterColParametersDlg>},
    {"CNmtExpStartingConditionsDlg", make<CNmtExpStartingConditionsDlg>},
    {"CNmtExpTaskSelectionDlg", make<CNmtExpTaskSelectionDlg>},
    {"CNmtExpInitialConditionsDlg", make<CNmtExpInitialConditionsDlg>},
    {"CNmtExpDispersionCoefDlg", make<CNmtExpDispersionCoefDlg>},
    {"CNmtExpBoundaryDlg", make<CNmtExpBoundaryDlg>},
    {"CNmtExpSourcesDlg", make<CNmtExpSourcesDlg>},
    {"CNmtExpForcingsDlg", make<CNmtExpForcingsDlg>},
    {"CNmtExpWavesDlg", make<CNmtExpWavesDlg>},
    {"CNmtExpTSVWaves", make<CNmtExpTSVWaves>},
    {"CNmtExpConstantWavesDlg", make<CNmtExpConstantWavesDlg>},
    {"CNmtExpWaveDatabaseDlg", make<CNmtExpWaveDatabaseDlg>},
    {"CNmtExpMassBudgetDlg", make<CNmtExpMassBudgetDlg>},
    {"CNmtExpLineDischargeDlg", make<CNmtExpLineDischargeDlg>},
    {"CNmtExpResultDlg", make<CNmtExpResultDlg>},
    {"CWQSModelDefinitionDlg", make<CWQSModelDefinitionDlg>},
    {"CWQSStartingConditionsDlg", make<CWQSStartingConditionsDlg>},
    {"CWQSStateVariablesDlg", make<CWQSStateVariablesDlg>},
    {"CWQSInitialConditionsDlg", make<CWQSInitialConditionsDlg>},
    {"CWQSConstantsDlg", make<CWQSConstantsDlg>},
    {"CWQSForcingsDlg", make<CWQSForcingsDlg>},
    {"CWQSADBoundaryDlg", make<CWQSADBoundaryDlg>},
    {"CWQSADDispersionDlg", make<CWQSADDispersionDlg>},
    {"CWQSADSourceSinkDlg", make<CWQSADSourceSinkDlg>},
    {"CWQSADPrecipitationDlg", make<CWQSADPrecipitationDlg>},
    {"CWQSADEvaporationDlg", make<CWQSADEvaporationDlg>},
    {"CWQSADInfiltrationDlg", make<CWQSADInfiltrationDlg>},
    {"CWQSADDepositionDlg", make<CWQSADDepositionDlg>},
    {"CWQSMassBudgetDlg", make<CWQSMassBudgetDlg>},
    {"CWQSResultsDlg", make<CWQSResultsDlg>},
};

}  // namespace

std::unique_ptr<CV27SetupFormView> makePage(std::string_view pageClass, CVdDoc& document) {
  for (const Entry& entry : kPages) {
    if (entry.pageClass != pageClass) continue;
    std::unique_ptr<CV27SetupFormView> page = entry.make(document);
    page->OnInitialUpdate();
    return page;
  }
  return nullptr;
}

}  // namespace gridbay
