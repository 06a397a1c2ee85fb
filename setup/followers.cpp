#include <algorithm>
#include <array>

#include "advection_dispersion/boundary.h"
#include "advection_dispersion/box_summation.h"
#include "advection_dispersion/component.h"
#include "advection_dispersion/decay_specification.h"
#include "advection_dispersion/deposition_concentration.h"
#include "advection_dispersion/dispersion_coef.h"
#include "advection_dispersion/evaporation.h"
#include "advection_dispersion/heat_dissipation.h"
#include "advection_dispersion/infiltration.h"
#include "advection_dispersion/initial_concentration.h"
#include "advection_dispersion/line_discharge.h"
#include "advection_dispersion/precipitation.h"
#include "advection_dispersion/result.h"
#include "advection_dispersion/source_sink.h"
#include "advection_dispersion/starting_conditions.h"
#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "basic/mass_budget.h"
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
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
#include "mud_transport/bed_roughness.h"
#include "mud_transport/boundary.h"
#include "mud_transport/box_summation.h"
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
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/bed_roughness.h"
#include "mud_transport_expanded/boundary.h"
#include "mud_transport_expanded/const_friction_coef.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/deposition.h"
#include "mud_transport_expanded/dispersion_coef.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/initial_conditions.h"
#include "mud_transport_expanded/line_discharge.h"
#include "mud_transport_expanded/power_of_erosion.h"
#include "mud_transport_expanded/result.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/settling_par.h"
#include "mud_transport_expanded/sources.h"
#include "mud_transport_expanded/starting_conditions.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/transition.h"
#include "mud_transport_expanded/var_friction_coef.h"
#include "setup/area_lists.h"
#include "setup/entry_removal.h"
#include "setup/global_kvs.h"

namespace gridbay {
namespace {

using G = CGlobalKvs;
using Follower = void (*)(G& root, std::span<const int> counts);

// The list behind a member takes the leader's count number `which`.
template <auto member, std::size_t which = 0>
void resize(G& root, std::span<const int> counts) {
  (root.*member)->SetCount(counts[which]);
}

// A list with an inner list of areas.
template <auto member>
void resizeAreas(G& root, std::span<const int> counts) {
  (root.*member)->SetNoAreas(counts.front());
}

// One with a constant for each of what a module carries with the water, or with such in each item.
template <auto member, std::size_t which = 0>
void resizeConstants(G& root, std::span<const int> counts) {
  (root.*member)->SetNoConstants(counts[which]);
}

// What a task of mud transport is told of: an item comes in before all others, or the first one goes.
template <auto member>
void changeHead(G& root, std::span<const int> counts) {
  auto& items = (root.*member)->itemList();
  if (counts[CNmtTaskSelectionKvs::kHead] > 0) items.InsertHead();
  if (counts[CNmtTaskSelectionKvs::kHead] < 0) items.RemoveHead();
}

// The same for the first constant of each item.
template <auto member>
void changeHeadConstant(G& root, std::span<const int> counts) {
  if (counts[CNmtTaskSelectionKvs::kHead] > 0) (root.*member)->InsertHeadConstant();
  if (counts[CNmtTaskSelectionKvs::kHead] < 0) (root.*member)->RemoveHeadConstant();
}

// What is made of a model definition is cleared, and made anew of what is declared now.
template <auto member>
void rebuild(G& root, std::span<const int>) {
  (root.*member)->Rebuild();
}

// The same for the flags of each line or box.
template <auto member, std::size_t which = 0>
void resizeEntries(G& root, std::span<const int> counts) {
  (root.*member)->SetEntryCount(counts[which]);
}

// Who follows a leader, in the order in which they are told.
struct LeaderRow {
  const CKvsBase& (*leader)(const G&);
  std::span<const Follower> followers;
};

template <auto member>
const CKvsBase& leader(const G& root) {
  return *(root.*member);
}

// Who follows the areas: it takes their count, and an area out of its middle.
struct AreaFollower {
  Follower resize;
  void (*moveUp)(G& root, int area);
};

// The entries behind that of an area come forward by one, so that the last one can go.
template <auto member>
void moveAreasUp(G& root, int area) {
  visitAreaLists(*(root.*member), [area](auto& list) {
    if constexpr (requires { list.GetCount(); }) {
      moveUp(list, area);
    } else if (static_cast<std::size_t>(area) < list.size()) {
      std::rotate(list.begin() + area - 1, list.begin() + area, list.end());
    }
  });
}

template <auto member>
constexpr AreaFollower areaList{resize<member>, moveAreasUp<member>};
// What has lists of areas inside.
template <auto member>
constexpr AreaFollower areaLists{resizeAreas<member>, moveAreasUp<member>};

constexpr std::array kAreaFollowers{
    areaList<&G::nhdEddyViscosity>,
    areaList<&G::nhdWaveRadiation>,
    areaList<&G::nhdSurfaceElevation>,
    areaList<&G::nhdResistance>,
    areaList<&G::nhdResult>,
    areaList<&G::nadStartingConditions>,
    areaLists<&G::nadInitialConcentration>,
    areaLists<&G::nadDepositionConcentration>,
    areaLists<&G::nadDispersionCoef>,
    areaList<&G::nadResult>,
    areaList<&G::nmtStartingConditions>,
    areaLists<&G::nmtInitialConcentration>,
    areaLists<&G::nmtDispersionCoef>,
    areaLists<&G::nmtSettlingAndDesposition>,
    areaLists<&G::nmtMlSettlingAndDeposition>,
    areaLists<&G::nmtErosionForEachLayerCritical>,
    areaLists<&G::nmtErosionForEachLayerFactor>,
    areaLists<&G::nmtErosionForEachLayerFactor1>,
    areaLists<&G::nmtErosionForEachLayerFactor2>,
    areaLists<&G::nmtErosionForEachLayerPower>,
    areaLists<&G::nmtErosionForEachLayerDensity>,
    areaLists<&G::nmtSliding>,
    areaLists<&G::nmtTransitionBetweenLayers>,
    areaList<&G::nmtBedRoughness>,
    areaList<&G::nmtResult>,
    areaList<&G::nmtExpStartingConditions>,
    areaLists<&G::nmtExpInitialConditions>,
    areaLists<&G::nmtExpDispersionCoef>,
    areaLists<&G::nmtExpDeposition>,
    areaLists<&G::nmtExpSettlingPar>,
    areaLists<&G::nmtExpErosionCoefficient>,
    areaLists<&G::nmtExpCriticalShearStress>,
    areaLists<&G::nmtExpBedDensity>,
    areaLists<&G::nmtExpConstFrictionCoef>,
    areaList<&G::nmtExpVarFrictionCoef>,
    areaList<&G::nmtExpBedRoughness>,
    areaLists<&G::nmtExpTransition>,
    areaList<&G::nmtExpResult>,
    areaList<&G::wqsStartingConditions>,
    areaLists<&G::wqsInitialConditions>,
    areaLists<&G::wqsAdDispersion>,
    areaLists<&G::wqsAdDeposition>,
    areaLists<&G::wqsConstants>,
    areaList<&G::wqsResults>,
};
constexpr auto kOfAreas = [] {
  std::array<Follower, kAreaFollowers.size()> all{};
  std::ranges::transform(kAreaFollowers, all.begin(), &AreaFollower::resize);
  return all;
}();
constexpr std::array kOfBoundaries{
    resize<&G::nhdBoundary>,    resize<&G::nadBoundary>,   resize<&G::nmtBoundary>,
    resize<&G::nmtExpBoundary>, resize<&G::wqsAdBoundary>,
};
constexpr std::array kOfSources{
    resize<&G::nhdSourceSink>, resize<&G::nadSourceSink>,   resize<&G::nmtSourceSink>,
    resize<&G::nmtExpSources>, resize<&G::wqsAdSourceSink>,
};
constexpr std::array kOfComponents{
    resize<&G::nadInitialConcentration>,    resize<&G::nadDecaySpecification>,
    resize<&G::nadHeatDissipation>,         resizeConstants<&G::nadPrecipitation>,
    resizeConstants<&G::nadEvaporation>,    resizeConstants<&G::nadInfiltration>,
    resizeConstants<&G::nadBoundary>,       resizeConstants<&G::nadSourceSink>,
    resize<&G::nadDepositionConcentration>, resizeEntries<&G::nadLineDischarge>,
    resizeEntries<&G::nadBoxSummation>,
};

// A count that is below 0 leaves them as they are: so each task has followers of its own, and salinity too.
using Task = CNmtTaskSelectionKvs;
constexpr std::array kOfMudTask{
    resize<&G::nmtInitialConcentration, Task::kEntries>,
    changeHead<&G::nmtInitialConcentration>,
    resizeConstants<&G::nmtSourceSink, Task::kOfFractions>,
    resize<&G::nmtSettlingAndDesposition, Task::kTransported>,
    changeHead<&G::nmtSettlingAndDesposition>,
    resizeConstants<&G::nmtBoundary, Task::kTransported>,
    changeHeadConstant<&G::nmtBoundary>,
    resizeEntries<&G::nmtLineDischarge, Task::kOfFractions>,
    resizeEntries<&G::nmtBoxSummation, Task::kOfFractions>,
    resize<&G::nmtErosionForEachLayerCritical, Task::kLayers>,
    resize<&G::nmtErosionForEachLayerFactor, Task::kLayers>,
    resize<&G::nmtErosionForEachLayerFactor1, Task::kLayers>,
    resize<&G::nmtErosionForEachLayerFactor2, Task::kLayers>,
    resize<&G::nmtErosionForEachLayerPower, Task::kLayers>,
    resize<&G::nmtErosionForEachLayerDensity, Task::kLayers>,
    resize<&G::nmtSliding, Task::kLayers>,
    resize<&G::nmtTransitionBetweenLayers, Task::kLayers>,
    resize<&G::nmtErosionLayer, Task::kLayers>,
};

// The counts of expanded mud transport.
constexpr std::size_t kLayers = 0;
constexpr std::size_t kFractions = 1;
constexpr std::size_t kCarried = 2;  // the fractions, and salinity where it is included
constexpr std::array<Follower, 14> kOfExpandedMud{
    [](G& root, std::span<const int> counts) {
      root.nmtExpInitialConditions->SetCounts(counts[kCarried], counts[kLayers], counts[kFractions]);
    },
    resizeConstants<&G::nmtExpBoundary, kCarried>,
    resizeConstants<&G::nmtExpSources, kCarried>,
    resize<&G::nmtExpSandFractions, kFractions>,
    resize<&G::nmtExpDeposition, kFractions>,
    resize<&G::nmtExpSettlingPar, kFractions>,
    resize<&G::nmtExpErosionLayer, kLayers>,
    resize<&G::nmtExpPowerOfErosion, kLayers>,
    resize<&G::nmtExpErosionCoefficient, kLayers>,
    resize<&G::nmtExpCriticalShearStress, kLayers>,
    resize<&G::nmtExpBedDensity, kLayers>,
    resize<&G::nmtExpConstFrictionCoef, kLayers>,
    // Between two layers each: a count that is negative leaves none.
    [](G& root, std::span<const int> counts) {
      root.nmtExpTransition->SetCount(std::max(counts[kLayers] - 1, 0));
    },
    [](G& root, std::span<const int> counts) {
      root.nmtExpResult->SetItemCounts(counts[kLayers], counts[kFractions]);
    },
};

// What is made of the model definition, in the order in which it is made anew.
constexpr std::array kOfDefinition{
    rebuild<&G::wqsInitialConditions>, rebuild<&G::wqsAdBoundary>,    rebuild<&G::wqsAdSourceSink>,
    rebuild<&G::wqsAdPrecipitation>,   rebuild<&G::wqsAdEvaporation>, rebuild<&G::wqsAdInfiltration>,
    rebuild<&G::wqsAdDeposition>,      rebuild<&G::wqsConstants>,     rebuild<&G::wqsForcings>,
    rebuild<&G::wqsMassBudget>,        rebuild<&G::wqsResults>,
};

constexpr std::array<Follower, 1> kOfPeriod{
    [](G& root, std::span<const int> steps) { root.nmtExpStartingConditions->SetPeriod(steps[0], steps[1]); },
};

constexpr LeaderRow kLeaders[] = {
    {leader<&G::bathymetry>, kOfAreas},
    {leader<&G::simulationPeriod>, kOfPeriod},
    {leader<&G::boundary>, kOfBoundaries},
    {leader<&G::sourceSink>, kOfSources},
    {leader<&G::nadComponent>, kOfComponents},
    {leader<&G::nmtTaskSelection>, kOfMudTask},
    {leader<&G::nmtExpTaskSelection>, kOfExpandedMud},
    {leader<&G::wqsModelDefinition>, kOfDefinition},
};

}  // namespace

void removeBoundary(CGlobalKvs& root, int number) {
  moveUp(*root.nhdBoundary, number);
  moveUp(*root.nadBoundary, number);
  moveUp(*root.nmtBoundary, number);
  moveUp(*root.nmtExpBoundary, number);
  moveUp(*root.wqsAdBoundary, number);
  removeEntry(*root.boundary, number);
}

void removeSource(CGlobalKvs& root, int number) {
  moveUp(*root.nhdSourceSink, number);
  moveUp(*root.nadSourceSink, number);
  moveUp(*root.nmtSourceSink, number);
  moveUp(*root.nmtExpSources, number);
  moveUp(*root.wqsAdSourceSink, number);
  removeEntry(*root.sourceSink, number);
}

void removeArea(CGlobalKvs& root, int number) {
  const int last = root.bathymetry->GetCount();
  for (const AreaFollower& follower : kAreaFollowers) follower.moveUp(root, number);
  moveUp(*root.bathymetry, number);
  root.bathymetry->SetNoAreas(last - 1);

  const auto renumber = [number, last](std::int32_t& area) {
    if (area == number) {
      area = last;
    } else if (area > number) {
      --area;
    }
  };
  const auto each = [](auto& entries, const auto& change) {
    for (int entry = 1; entry <= entries.GetCount(); ++entry) change(entries.at(entry));
  };
  each(*root.bathymetry, [&](CBathymetryObjectKvs& area) { renumber(area.enclosingArea); });
  each(*root.sourceSink, [&](CSourceSinkObjectKvs& source) {
    renumber(source.sourceArea);
    renumber(source.sinkArea);
  });
  each(*root.massBudget, [&](CMassBudgetItemKvs& polygon) { renumber(polygon.associatedArea); });
  const auto written = [&](auto& entry) { renumber(entry.areaNumber); };
  each(root.nadResult->outputs, written);
  each(root.nmtResult->outputs, written);
  each(root.nmtExpResult->outputs, written);
  each(root.wqsResults->outputs, written);
  each(*root.nadLineDischarge, written);
  each(*root.nadBoxSummation, written);
  each(*root.nmtLineDischarge, written);
  each(*root.nmtBoxSummation, written);
  each(*root.nmtExpLineDischarge, written);
}

void CGlobalKvs::TellFollowers(const CKvsBase& leader, std::span<const int> counts) {
  for (const LeaderRow& row : kLeaders) {
    if (&row.leader(*this) != &leader) continue;
    for (const Follower follower : row.followers) follower(*this, counts);
  }
}

void CGlobalKvs::TellOfGrids() {
  nmtExpDispersionCoef->SetToGrids();
}

}  // namespace gridbay
