#include "setup/skeleton.h"

#include <memory>

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
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/infiltration.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "hydrodynamic/wind_conditions.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

using G = CGlobalKvs;

template <auto at>
void create(G& root) {
  using Child = typename std::remove_reference_t<decltype(root.*at)>::element_type;
  root.*at = std::make_unique<Child>(&root);
}

template <auto at>
CKvsBase& object(G& root) {
  return *(root.*at);
}

template <auto at>
constexpr MemberRow member(void (*setUp)(G&) = nullptr) {
  return {create<at>, object<at>, setUp};
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

constexpr MemberRow kMembers[] = {
    member<&G::moduleSelection>(),
    member<&G::bathymetry>(),
    member<&G::simulationPeriod>(),
    member<&G::boundary>(),
    member<&G::sourceSink>(),
    member<&G::massBudget>(),
    member<&G::areaDescription>(),

    member<&G::nhdBoundary>(),
    member<&G::nhdSourceSink>(),
    member<&G::nhdInfiltration>(),
    member<&G::windConditions>(),
    member<&G::nhdEddyViscosity>(),
    member<&G::nhdWaveRadiation>(),
    member<&G::nhdSurfaceElevation>(),
    member<&G::nhdResistance>(),
    member<&G::nhdWeir>(),
    member<&G::nhdCulvert>(),
    member<&G::nhdDike>(),
    member<&G::nhdResult>(),

    member<&G::nadComponent>(),
    member<&G::nadStartingConditions>(),
    member<&G::nadInitialConcentration>(),
    member<&G::nadDispersionCoef>(),
    member<&G::nadDecaySpecification>(),
    member<&G::nadHeatDissipation>(),
    member<&G::nadBoundary>(),
    member<&G::nadSourceSink>(),
    member<&G::nadDepositionConcentration>(),
    member<&G::nadHeatExchange>(),
    member<&G::nadPrecipitation>(),
    member<&G::nadEvaporation>(),
    member<&G::nadInfiltration>(),
    member<&G::nadFeedback>(),
    member<&G::nadLineDischarge>(),
    member<&G::nadBoxSummation>(),
    member<&G::nadMassBudget>(),
    member<&G::nadResult>(),
};

constexpr void (*kStartingCounts[])(G&) = {
    [](G& root) { root.bathymetry->SetNoAreas(1); },
    [](G& root) { root.nadComponent->SetCount(1); },
};

constexpr FileRow kSaving[] = {
    in("NESTED_MODEL_GLOBALS"),
    options(),
    child<&G::moduleSelection>(),
    child<&G::bathymetry>(),
    child<&G::boundary>(),
    child<&G::sourceSink>(),
    child<&G::areaDescription>(),
    child<&G::simulationPeriod>(),
    child<&G::massBudget>(),

    in("HYDRODYNAMIC_MODULE"),
    options(),
    child<&G::nhdBoundary>(),
    child<&G::nhdSourceSink>(),
    child<&G::nhdInfiltration>(),
    child<&G::windConditions>(),
    child<&G::nhdEddyViscosity>(),
    child<&G::nhdWaveRadiation>(),
    child<&G::nhdSurfaceElevation>(),
    child<&G::nhdResistance>(),
    in("HYDRODYNAMIC_MODULE/STRUCTURE_MODULE"),
    child<&G::nhdWeir>(),
    child<&G::nhdCulvert>(),
    in("HYDRODYNAMIC_MODULE/STRUCTURES"),
    child<&G::nhdDike>(),
    in("HYDRODYNAMIC_MODULE"),
    child<&G::nhdResult>(),

    in("ADVECTION_DISPERSION_MODULE"),
    options(),
    in("ADVECTION_DISPERSION_MODULE/Cohesive_Sediment_Conditions", kAd),
    zeroKeyword("No_of_Sediment_Fractions"),
    in("ADVECTION_DISPERSION_MODULE", kAd),
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
    child<&G::nadMassBudget>(),
    child<&G::nadResult>(),

    in("MUD_TRANSPORT_MODULE"),
    options(),
    in("MUD_TRANSPORT_MODULE/MT_PARAMETERS", kMud),

    in("MUD_TRANSPORT_EXPANDED_MODULE"),
    options(),
    in("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/WAVE_DATA", kExpandedMud),
    in("MUD_TRANSPORT_EXPANDED_MODULE/FORCING_FUNCTIONS/DREDGING", kExpandedMud),
    in("MUD_TRANSPORT_EXPANDED_MODULE/Watercoloumn_Parameters/FALL_VELOCITY_PARAMETERS", kExpandedMud),
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/EROSION_COEFFICIENTS", kExpandedMud),
    in("MUD_TRANSPORT_EXPANDED_MODULE/BED_PARAMETERS/SLIDING", kExpandedMud),
    // Saved in here, but looked for at the top of the source: so its options come through only from there.
    in("MUD_TRANSPORT_EXPANDED_MODULE/XENOBIOTIC_MODULE", kExpandedMud),
    options(),

    in("BIO_RIG_MODULE"),
    options(),
    in("BIO_RIG_MODULE/AD_TRANSPORT_PARAMETERS", kEcology),
};

// The module selection comes first: what else is read depends on it.
constexpr FileRow kLoading[] = {
    in("NESTED_MODEL_GLOBALS"),
    child<&G::moduleSelection>(),
    child<&G::bathymetry>(),
    child<&G::boundary>(),
    child<&G::sourceSink>(),
    child<&G::areaDescription>(),
    child<&G::simulationPeriod>(),
    child<&G::massBudget>(),

    in("HYDRODYNAMIC_MODULE"),
    child<&G::nhdBoundary>(),
    child<&G::nhdSourceSink>(),
    child<&G::nhdInfiltration>(),
    child<&G::windConditions>(),
    child<&G::nhdEddyViscosity>(),
    child<&G::nhdWaveRadiation>(),
    child<&G::nhdSurfaceElevation>(),
    child<&G::nhdResistance>(),

    in("HYDRODYNAMIC_MODULE/STRUCTURE_MODULE"),
    child<&G::nhdWeir>(),
    child<&G::nhdCulvert>(),

    in("HYDRODYNAMIC_MODULE/STRUCTURES"),
    child<&G::nhdDike>(),

    in("HYDRODYNAMIC_MODULE"),
    child<&G::nhdResult>(),

    in("ADVECTION_DISPERSION_MODULE", kAd),
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
    child<&G::nadMassBudget>(),
    child<&G::nadResult>(),
};

constexpr CheckRow kChecking[] = {
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

    check<&G::nadStartingConditions>(kAd),
    check<&G::nadComponent>(kAd),
    check<&G::nadInitialConcentration>(kAd),
    check<&G::nadDispersionCoef>(kAd),
    check<&G::nadDecaySpecification>(kAd),
    check<&G::nadHeatDissipation>(kAd),
    check<&G::nadBoundary>(kAd),
    check<&G::nadSourceSink>(kAd),
    check<&G::nadDepositionConcentration>(kAd),
    check<&G::nadHeatExchange>(kAd),
    check<&G::nadPrecipitation>(kAd),
    check<&G::nadEvaporation>(kAd),
    check<&G::nadInfiltration>(kAd),
    check<&G::nadFeedback>(kAd),
    check<&G::nadLineDischarge>(kAd),
    check<&G::nadBoxSummation>(kAd),
    check<&G::nadMassBudget>(runsAdMassBudget),
    check<&G::nadResult>(kAd),
};

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
