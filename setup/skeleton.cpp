#include "setup/skeleton.h"

#include <algorithm>
#include <array>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/feedback.h"
#include "advection_dispersion/heat_dissipation.h"
#include "advection_dispersion/heat_exchange.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/initial_concentration.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/mass_budget.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/result.h"
#include "advection_dispersion/source_sink.h"
#include "advection_dispersion/starting_conditions.h"
#include "basic/area_description.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
#include "basic/module_selection.h"
#include "basic/simulation_period.h"
#include "basic/source_sink.h"
#include "ecology/boundary.h"
#include "ecology/constants.h"
#include "ecology/deposition.h"
#include "ecology/dispersion.h"
#include "ecology/evaporation.h"
#include "ecology/forcings.h"
#include "ecology/infiltration.h"
#include "ecology/initial_conditions.h"
#include "ecology/mass_budget.h"
#include "ecology/model_definition.h"
#include "ecology/precipitation.h"
#include "ecology/results.h"
#include "ecology/source_sink.h"
#include "ecology/starting_conditions.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "hydrodynamic/wind_conditions.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
#include "mud_transport/consolidation.h"
#include "mud_transport/dispersion_coef.h"
#include "mud_transport/erosion_characteristics.h"
#include "mud_transport/erosion_for_each_layer.h"
#include "mud_transport/initial_concentration.h"
#include "mud_transport/line_discharge.h"
#include "mud_transport/ml_settling_and_deposition.h"
#include "mud_transport/result.h"
#include "mud_transport/settling_and_desposition.h"
#include "mud_transport/sliding.h"
#include "mud_transport/source_sink.h"
#include "mud_transport/starting_conditions.h"
#include "mud_transport/task_selection.h"
#include "mud_transport/transition_between_layers.h"
#include "mud_transport/wave_data.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/bed_roughness.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/const_friction_coef.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/deposition.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/dredgings.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/forcings.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/mass_budget.h"
#include "mud_transport_expanded/morphology.h"
#include "mud_transport_expanded/power_of_erosion.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/settling_par.h"
#include "mud_transport_expanded/settlings.h"
#include "mud_transport_expanded/sliding.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/transition.h"
#include "mud_transport_expanded/var_friction_coef.h"
#include "mud_transport_expanded/water_col_parameters.h"
#include "mud_transport_expanded/wave_database.h"
#include "mud_transport_expanded/waves.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using G = CGlobalKvs;

template <auto at>
CKvsBase& object(G& root) {
  return *(root.*at);
}

constexpr FileRow in(std::string_view place, Condition condition = nullptr) {
  return {FileRow::What::place, place, nullptr, condition};
}

template <auto at>
constexpr FileRow child(Condition condition = nullptr) {
  return {FileRow::What::child, {}, object<at>, condition};
}

// The engine's options, which the editor does not know and must not lose.
constexpr FileRow options() {
  return {FileRow::What::options};
}

constexpr FileRow zeroKeyword(std::string_view keyword) {
  return {FileRow::What::zeroKeyword, keyword};
}

template <auto at>
constexpr CheckRow check(Condition condition = nullptr) {
  return {object<at>, condition};
}

template <std::int32_t code>
bool runs(const G& root) {
  return root.moduleSelection->simulationType == code;
}

constexpr Condition kAd = runs<module::kAdvectionDispersion>;
bool runsAdMassBudget(const G& root) {
  return kAd(root) && root.moduleSelection->schemeHasMassBudget();
}
constexpr Condition kMud = runs<module::kMudTransport>;
constexpr Condition kExpandedMud = runs<module::kMudTransportExpanded>;
constexpr Condition kEcology = runs<module::kEcological>;

// The two tasks of mud transport, and what erodes its layers.
bool runsFractions(const G& root) {
  return kMud(root) && root.nmtTaskSelection->multiFraction != 0;
}
bool runsLayers(const G& root) {
  return kMud(root) && root.nmtTaskSelection->multiFraction == 0;
}
bool erodesByFactor(const G& root) {
  return runsLayers(root) && root.nmtMlErosionCharacteristics->useConstantErosionCoefficient != 0;
}
bool erodesByTwoFactors(const G& root) {
  return runsLayers(root) && root.nmtMlErosionCharacteristics->useConstantErosionCoefficient == 0;
}

// The expanded module's waves, by where they come from.
bool runsWaves(const G& root) {
  return kExpandedMud(root) && root.nmtExpForcings->includeWaves != 0;
}
template <std::int32_t type>
bool runsWavesOf(const G& root) {
  return runsWaves(root) && root.nmtExpWaves->typeOfWaveVariation == type;
}
bool runsExpandedMassBudget(const G& root) {
  return kExpandedMud(root) && root.massBudget->GetCount() > 0;
}

// Orders that have parts in common are joined of these.
template <class Row, std::size_t... lengths>
constexpr auto joined(const std::array<Row, lengths>&... parts) {
  std::array<Row, (lengths + ...)> all{};
  std::size_t at = 0;
  ((std::ranges::copy(parts, all.begin() + static_cast<std::ptrdiff_t>(at)), at += lengths), ...);
  return all;
}

// The children of an order of files as one of checks.
template <std::size_t length>
constexpr auto checks(const std::array<FileRow, length>& rows, Condition condition) {
  std::array<CheckRow, length> all{};
  std::ranges::transform(rows, all.begin(), [condition](const FileRow& row) {
    return CheckRow{row.object, condition};
  });
  return all;
}

constexpr MemberRow kMembers[] = {
    object<&G::moduleSelection>,
    object<&G::bathymetry>,
    object<&G::simulationPeriod>,
    object<&G::boundary>,
    object<&G::sourceSink>,
    object<&G::massBudget>,
    object<&G::areaDescription>,

    object<&G::nhdBoundary>,
    object<&G::nhdSourceSink>,
    object<&G::nhdInfiltration>,
    object<&G::windConditions>,
    object<&G::nhdEddyViscosity>,
    object<&G::nhdWaveRadiation>,
    object<&G::nhdSurfaceElevation>,
    object<&G::nhdResistance>,
    object<&G::nhdWeir>,
    object<&G::nhdCulvert>,
    object<&G::nhdDike>,
    object<&G::nhdResult>,

    object<&G::nadComponent>,
    object<&G::nadStartingConditions>,
    object<&G::nadInitialConcentration>,
    object<&G::nadDispersionCoef>,
    object<&G::nadDecaySpecification>,
    object<&G::nadHeatDissipation>,
    object<&G::nadBoundary>,
    object<&G::nadSourceSink>,
    object<&G::nadDepositionConcentration>,
    object<&G::nadHeatExchange>,
    object<&G::nadPrecipitation>,
    object<&G::nadEvaporation>,
    object<&G::nadInfiltration>,
    object<&G::nadFeedback>,
    object<&G::nadLineDischarge>,
    object<&G::nadBoxSummation>,
    object<&G::nadMassBudget>,
    object<&G::nadResult>,

    object<&G::nmtStartingConditions>,
    object<&G::nmtTaskSelection>,
    object<&G::nmtInitialConcentration>,
    object<&G::nmtDispersionCoef>,
    object<&G::nmtSettlingAndDesposition>,
    object<&G::nmtMlSettlingAndDeposition>,
    object<&G::nmtBoundary>,
    object<&G::nmtSourceSink>,
    object<&G::nmtMfErosionCharacteristics>,
    object<&G::nmtMlErosionCharacteristics>,
    object<&G::nmtErosionLayer>,
    object<&G::nmtErosionForEachLayerCritical>,
    object<&G::nmtErosionForEachLayerFactor>,
    object<&G::nmtErosionForEachLayerFactor1>,
    object<&G::nmtErosionForEachLayerFactor2>,
    object<&G::nmtErosionForEachLayerPower>,
    object<&G::nmtErosionForEachLayerDensity>,
    object<&G::nmtSliding>,
    object<&G::nmtTransitionBetweenLayers>,
    object<&G::nmtConsolidation>,
    object<&G::nmtBedRoughness>,
    object<&G::nmtWaveData>,
    object<&G::nmtLineDischarge>,
    object<&G::nmtBoxSummation>,
    object<&G::nmtResult>,

    object<&G::nmtExpStartingConditions>,
    object<&G::nmtExpTaskSelection>,
    object<&G::nmtExpInitialConditions>,
    object<&G::nmtExpDispersionCoef>,
    object<&G::nmtExpBoundary>,
    object<&G::nmtExpForcings>,
    object<&G::nmtExpWaves>,
    object<&G::nmtExpTsvWaves>,
    object<&G::nmtExpConstantWaves>,
    object<&G::nmtExpWaveDatabase>,
    object<&G::nmtExpDredgings>,
    object<&G::nmtExpSources>,
    object<&G::nmtExpWaterColParameters>,
    object<&G::nmtExpSandFractions>,
    object<&G::nmtExpSettlings>,
    object<&G::nmtExpDeposition>,
    object<&G::nmtExpSettlingPar>,
    object<&G::nmtExpErosionLayer>,
    object<&G::nmtExpPowerOfErosion>,
    object<&G::nmtExpErosionCoefficient>,
    object<&G::nmtExpCriticalShearStress>,
    object<&G::nmtExpBedDensity>,
    object<&G::nmtExpSliding>,
    object<&G::nmtExpConstFrictionCoef>,
    object<&G::nmtExpMorphology>,
    object<&G::nmtExpVarFrictionCoef>,
    object<&G::nmtExpBedRoughness>,
    object<&G::nmtExpTransition>,
    object<&G::nmtExpMassBudget>,
    object<&G::nmtExpLineDischarge>,
    object<&G::nmtExpResult>,

    object<&G::wqsModelDefinition>,
    object<&G::wqsStartingConditions>,
    object<&G::wqsInitialConditions>,
    object<&G::wqsAdBoundary>,
    object<&G::wqsAdDispersion>,
    object<&G::wqsAdSourceSink>,
    object<&G::wqsAdPrecipitation>,
    object<&G::wqsAdEvaporation>,
    object<&G::wqsAdInfiltration>,
    object<&G::wqsAdDeposition>,
    object<&G::wqsConstants>,
    object<&G::wqsForcings>,
    object<&G::wqsMassBudget>,
    object<&G::wqsResults>,
};

constexpr void (*kStartingCounts[])(G&) = {
    [](G& root) { root.bathymetry->SetNoAreas(1); },
    [](G& root) { root.nadComponent->SetCount(1); },
    [](G& root) { root.nmtTaskSelection->SetFractions(3); },
    [](G& root) { root.nmtExpTaskSelection->SetCounts(1, 1, false); },
};

// What is saved, loaded and, where nothing else is told, checked in one order.
constexpr std::array kGlobals{
    child<&G::moduleSelection>(), child<&G::bathymetry>(),      child<&G::boundary>(),
    child<&G::sourceSink>(),      child<&G::areaDescription>(), child<&G::simulationPeriod>(),
    child<&G::massBudget>(),
};

constexpr std::array kFlow{
    child<&G::nhdBoundary>(),         child<&G::nhdSourceSink>(),    child<&G::nhdInfiltration>(),
    child<&G::windConditions>(),      child<&G::nhdEddyViscosity>(), child<&G::nhdWaveRadiation>(),
    child<&G::nhdSurfaceElevation>(), child<&G::nhdResistance>(),
};

constexpr std::array kStructures{
    in("HYDRODYNAMIC_MODULE/STRUCTURE_MODULE"),
    child<&G::nhdWeir>(),
    child<&G::nhdCulvert>(),
    in("HYDRODYNAMIC_MODULE/STRUCTURES"),
    child<&G::nhdDike>(),
    in("HYDRODYNAMIC_MODULE"),
    child<&G::nhdResult>(),
};

constexpr std::array kTransport{
    child<&G::nadStartingConditions>(),
    child<&G::nadComponent>(),
    child<&G::nadInitialConcentration>(),
    child<&G::nadDispersionCoef>(),
    child<&G::nadDecaySpecification>(),
    child<&G::nadHeatDissipation>(),
    child<&G::nadBoundary>(),
    child<&G::nadSourceSink>(),
    child<&G::nadDepositionConcentration>(),
    child<&G::nadHeatExchange>(),
    child<&G::nadPrecipitation>(),
    child<&G::nadEvaporation>(),
    child<&G::nadInfiltration>(),
    child<&G::nadFeedback>(),
    child<&G::nadLineDischarge>(),
    child<&G::nadBoxSummation>(),
};

constexpr std::array kTransportResults{
    child<&G::nadMassBudget>(),
    child<&G::nadResult>(),
};

constexpr std::array kMudWater{
    child<&G::nmtStartingConditions>(), child<&G::nmtTaskSelection>(), child<&G::nmtInitialConcentration>(),
    child<&G::nmtDispersionCoef>(),     child<&G::nmtBoundary>(),      child<&G::nmtSourceSink>(),
};

constexpr std::array kMudParameters{
    in("MUD_TRANSPORT_MODULE/MT_PARAMETERS", runsFractions),
    child<&G::nmtSettlingAndDesposition>(),
    child<&G::nmtMfErosionCharacteristics>(),
    in("MUD_TRANSPORT_MODULE/MT_PARAMETERS", runsLayers),
    child<&G::nmtMlSettlingAndDeposition>(),
    child<&G::nmtMlErosionCharacteristics>(),
    in("MUD_TRANSPORT_MODULE/MT_PARAMETERS/EROSION_CHARACTERISTICS_FOR_EACH_LAYER", runsLayers),
    child<&G::nmtErosionLayer>(),
    child<&G::nmtErosionForEachLayerCritical>(),
    child<&G::nmtErosionForEachLayerFactor>(erodesByFactor),
    child<&G::nmtErosionForEachLayerFactor1>(erodesByTwoFactors),
    child<&G::nmtErosionForEachLayerFactor2>(erodesByTwoFactors),
    child<&G::nmtErosionForEachLayerPower>(),
    child<&G::nmtErosionForEachLayerDensity>(),
    in("MUD_TRANSPORT_MODULE/FORCING_FUNCTIONS", runsLayers),
};

constexpr std::array kMudBed{
    in("MUD_TRANSPORT_MODULE", runsLayers),  child<&G::nmtSliding>(),
    child<&G::nmtTransitionBetweenLayers>(), child<&G::nmtConsolidation>(),
    in("MUD_TRANSPORT_MODULE", kMud),
};

constexpr std::array kExpandedWater{
    child<&G::nmtExpStartingConditions>(),
    child<&G::nmtExpTaskSelection>(),
    child<&G::nmtExpInitialConditions>(),
    child<&G::nmtExpDispersionCoef>(),
    child<&G::nmtExpSources>(),
    child<&G::nmtExpBoundary>(),
};

constexpr std::array kExpandedWaves{
    in("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA", kExpandedMud),
    child<&G::nmtExpWaves>(),
    child<&G::nmtExpTsvWaves>(),
    child<&G::nmtExpConstantWaves>(),
    child<&G::nmtExpWaveDatabase>(),
};

constexpr std::array kExpandedColumn{
    in("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/DREDGING", kExpandedMud),
    child<&G::nmtExpDredgings>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters", kExpandedMud),
    child<&G::nmtExpWaterColParameters>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters/FALL_VELOCITY_PARAMETERS", kExpandedMud),
    child<&G::nmtExpSettlings>(),
    child<&G::nmtExpSettlingPar>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters", kExpandedMud),
};

constexpr std::array kExpandedErosion{
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/EROSION_COEFFICIENTS", kExpandedMud),
    child<&G::nmtExpErosionLayer>(),
    child<&G::nmtExpPowerOfErosion>(),
    child<&G::nmtExpErosionCoefficient>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS", kExpandedMud),
    child<&G::nmtExpCriticalShearStress>(),
    child<&G::nmtExpBedDensity>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/SLIDING", kExpandedMud),
};

constexpr std::array kExpandedBed{
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS", kExpandedMud),
    child<&G::nmtExpMorphology>(),
    child<&G::nmtExpBedRoughness>(),
    child<&G::nmtExpTransition>(),
    in("MUD_TRANSPORT_EXPANDED_MODULE", kExpandedMud),
    child<&G::nmtExpMassBudget>(),
    child<&G::nmtExpLineDischarge>(),
    child<&G::nmtExpResult>(),
};

constexpr std::array kEcologyDefinition{
    child<&G::wqsModelDefinition>(),
    child<&G::wqsStartingConditions>(),
    child<&G::wqsInitialConditions>(),
};

constexpr std::array kEcologyTransport{
    child<&G::wqsAdBoundary>(),      child<&G::wqsAdDispersion>(),  child<&G::wqsAdSourceSink>(),
    child<&G::wqsAdPrecipitation>(), child<&G::wqsAdEvaporation>(), child<&G::wqsAdInfiltration>(),
    child<&G::wqsAdDeposition>(),
};

constexpr std::array kEcologyProcesses{
    child<&G::wqsConstants>(),
    child<&G::wqsForcings>(),
    child<&G::wqsMassBudget>(),
    child<&G::wqsResults>(),
};

constexpr auto kEcologyOrder =
    joined(kEcologyDefinition, std::array{in("BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS", kEcology)},
           kEcologyTransport, std::array{in("BIO_RIG_MODULE", kEcology)}, kEcologyProcesses);

constexpr auto kSaving = joined(
    std::array{in("NESTED_MODEL_GLOBALS"), options()}, kGlobals,  //
    std::array{in("HYDRODYNAMIC_MODULE"), options()}, kFlow, kStructures,
    std::array{in("ADVECTION_DISPERSION_MODULE"), options(),
               in("ADVECTION_DISPERSION_MODULE/Cohesive_Sediment_Conditions", kAd),
               zeroKeyword("No_of_Sediment_Fractions"), in("ADVECTION_DISPERSION_MODULE", kAd)},
    kTransport, kTransportResults,
    std::array{in("MUD_TRANSPORT_MODULE"), options(), in("MUD_TRANSPORT_MODULE", kMud)}, kMudWater,
    kMudParameters, std::array{child<&G::nmtWaveData>(), child<&G::nmtBedRoughness>()}, kMudBed,
    std::array{child<&G::nmtLineDischarge>(), child<&G::nmtBoxSummation>(), child<&G::nmtResult>()},
    std::array{in("MUD_TRANSPORT_EXPANDED_MODULE"), options(),
               in("MUD_TRANSPORT_EXPANDED_MODULE", kExpandedMud)},
    kExpandedWater, kExpandedWaves,
    std::array{in("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS", kExpandedMud),
               child<&G::nmtExpForcings>()},
    kExpandedColumn, std::array{child<&G::nmtExpDeposition>(), child<&G::nmtExpSandFractions>()},
    kExpandedErosion,
    std::array{child<&G::nmtExpSliding>(), child<&G::nmtExpVarFrictionCoef>(),
               child<&G::nmtExpConstFrictionCoef>()},
    kExpandedBed,
    // Saved in here, but looked for at the top of the source: so its options come through only from there.
    std::array{in("MUD_TRANSPORT_EXPANDED_MODULE/XENOBIOTIC_MODULE", kExpandedMud), options(),
               in("BIO_RIG_MODULE"), options(), in("BIO_RIG_MODULE", kEcology)},
    kEcologyOrder);

// The module selection comes first: what else is read depends on it.
constexpr auto kLoading =
    joined(std::array{in("NESTED_MODEL_GLOBALS")}, kGlobals,  //
           std::array{in("HYDRODYNAMIC_MODULE")}, kFlow, kStructures,
           std::array{in("ADVECTION_DISPERSION_MODULE", kAd)}, kTransport, kTransportResults,
           std::array{in("MUD_TRANSPORT_MODULE", kMud)}, kMudWater, kMudParameters,
           std::array{child<&G::nmtBedRoughness>(), child<&G::nmtWaveData>()}, kMudBed,
           std::array{child<&G::nmtBoxSummation>(), child<&G::nmtLineDischarge>(), child<&G::nmtResult>()},
           std::array{in("MUD_TRANSPORT_EXPANDED_MODULE", kExpandedMud)}, kExpandedWater,
           // The forcings are looked for among the waves, where they do not stand.
           kExpandedWaves, std::array{child<&G::nmtExpForcings>()}, kExpandedColumn,
           std::array{child<&G::nmtExpSandFractions>(), child<&G::nmtExpDeposition>()}, kExpandedErosion,
           std::array{child<&G::nmtExpVarFrictionCoef>(), child<&G::nmtExpSliding>(),
                      child<&G::nmtExpConstFrictionCoef>()},
           kExpandedBed, std::array{in("BIO_RIG_MODULE", kEcology)}, kEcologyOrder);

constexpr auto kChecking = joined(
    std::array{
        check<&G::bathymetry>(),
        check<&G::areaDescription>(),
        check<&G::simulationPeriod>(),
        check<&G::boundary>(),
        check<&G::sourceSink>(),
        check<&G::massBudget>(),
        check<&G::windConditions>(),
        check<&G::nhdEddyViscosity>(),
        check<&G::nhdWaveRadiation>(),
        check<&G::nhdSurfaceElevation>(),
        check<&G::nhdResistance>(),
        check<&G::nhdBoundary>(),
        check<&G::nhdSourceSink>(),
        check<&G::nhdInfiltration>(),
        check<&G::nhdDike>(),
        check<&G::nhdResult>(),
    },
    checks(kTransport, kAd),
    std::array{check<&G::nadMassBudget>(runsAdMassBudget), check<&G::nadResult>(kAd)},
    checks(kMudWater, kMud),
    std::array{
        check<&G::nmtSettlingAndDesposition>(runsFractions),
        check<&G::nmtMfErosionCharacteristics>(runsFractions),
        check<&G::nmtMlSettlingAndDeposition>(runsLayers),
        check<&G::nmtMlErosionCharacteristics>(runsLayers),
        check<&G::nmtErosionLayer>(runsLayers),
        check<&G::nmtErosionForEachLayerCritical>(runsLayers),
        check<&G::nmtErosionForEachLayerFactor>(runsLayers),
        check<&G::nmtErosionForEachLayerFactor1>(runsLayers),
        check<&G::nmtErosionForEachLayerFactor2>(runsLayers),
        check<&G::nmtErosionForEachLayerPower>(runsLayers),
        check<&G::nmtErosionForEachLayerDensity>(runsLayers),
        check<&G::nmtSliding>(runsLayers),
        check<&G::nmtTransitionBetweenLayers>(runsLayers),
        check<&G::nmtConsolidation>(runsLayers),
        check<&G::nmtBedRoughness>(runsLayers),
        check<&G::nmtWaveData>(kMud),
        check<&G::nmtLineDischarge>(kMud),
        check<&G::nmtBoxSummation>(kMud),
        check<&G::nmtResult>(kMud),

        check<&G::nmtExpStartingConditions>(kExpandedMud),
        check<&G::nmtExpTaskSelection>(kExpandedMud),
        check<&G::nmtExpInitialConditions>(kExpandedMud),
        check<&G::nmtExpDispersionCoef>(kExpandedMud),
        check<&G::nmtExpBoundary>(kExpandedMud),
        check<&G::nmtExpForcings>(kExpandedMud),
        check<&G::nmtExpWaves>(runsWaves),
        check<&G::nmtExpConstantWaves>(runsWavesOf<1>),
        check<&G::nmtExpTsvWaves>(runsWavesOf<2>),
        check<&G::nmtExpWaveDatabase>(runsWavesOf<3>),
        check<&G::nmtExpDredgings>(kExpandedMud),
        check<&G::nmtExpSources>(kExpandedMud),
        check<&G::nmtExpWaterColParameters>(kExpandedMud),
        check<&G::nmtExpSandFractions>(kExpandedMud),
        check<&G::nmtExpSettlings>(kExpandedMud),
        check<&G::nmtExpDeposition>(kExpandedMud),
        check<&G::nmtExpSettlingPar>(kExpandedMud),
        check<&G::nmtExpErosionLayer>(kExpandedMud),
        check<&G::nmtExpPowerOfErosion>(kExpandedMud),
        check<&G::nmtExpErosionCoefficient>(kExpandedMud),
        check<&G::nmtExpCriticalShearStress>(kExpandedMud),
        check<&G::nmtExpBedDensity>(kExpandedMud),
        check<&G::nmtExpSliding>(kExpandedMud),
        check<&G::nmtExpConstFrictionCoef>(kExpandedMud),
        check<&G::nmtExpMorphology>(kExpandedMud),
        check<&G::nmtExpVarFrictionCoef>(kExpandedMud),
        check<&G::nmtExpBedRoughness>(kExpandedMud),
        check<&G::nmtExpTransition>(kExpandedMud),
        check<&G::nmtExpMassBudget>(runsExpandedMassBudget),
        check<&G::nmtExpLineDischarge>(kExpandedMud),
        check<&G::nmtExpResult>(kExpandedMud),
    },
    checks(kEcologyDefinition, kEcology), checks(kEcologyTransport, kEcology),
    checks(kEcologyProcesses, kEcology));

}  // namespace

std::span<const MemberRow> members() {
  return kMembers;
}

std::span<void (*const)(CGlobalKvs&)> startingCounts() {
  return kStartingCounts;
}

std::span<const FileRow> savingOrder() {
  return kSaving;
}

std::span<const FileRow> loadingOrder() {
  return kLoading;
}

std::span<const CheckRow> checkingOrder() {
  return kChecking;
}

std::vector<std::string_view> sectionsOf(std::string_view place) {
  std::vector<std::string_view> parts;
  for (std::size_t start = 0; start <= place.size();) {
    const std::size_t end = std::min(place.find('/', start), place.size());
    parts.push_back(place.substr(start, end - start));
    start = end + 1;
  }
  return parts;
}

}  // namespace gridbay
