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
#include "basic/source_sink.h"
#include "hydrodynamic/boundary.h"
#include "hydrodynamic/eddy_viscosity.h"
#include "hydrodynamic/resistance.h"
#include "hydrodynamic/result.h"
#include "hydrodynamic/source_sink.h"
#include "hydrodynamic/surface_elevation.h"
#include "hydrodynamic/wave_radiation.h"
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
template <auto member>
void resizeConstants(G& root, std::span<const int> counts) {
  (root.*member)->SetNoConstants(counts.front());
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

constexpr std::array kOfAreas{
    resize<&G::nhdEddyViscosity>,
    resize<&G::nhdWaveRadiation>,
    resize<&G::nhdSurfaceElevation>,
    resize<&G::nhdResistance>,
    resize<&G::nhdResult>,
    resize<&G::nadStartingConditions>,
    resizeAreas<&G::nadInitialConcentration>,
    resizeAreas<&G::nadDepositionConcentration>,
    resizeAreas<&G::nadDispersionCoef>,
    resize<&G::nadResult>,
};
constexpr std::array kOfBoundaries{
    resize<&G::nhdBoundary>,
    resize<&G::nadBoundary>,
};
constexpr std::array kOfSources{
    resize<&G::nhdSourceSink>,
    resize<&G::nadSourceSink>,
};
constexpr std::array kOfComponents{
    resize<&G::nadInitialConcentration>,    resize<&G::nadDecaySpecification>,
    resize<&G::nadHeatDissipation>,         resizeConstants<&G::nadPrecipitation>,
    resizeConstants<&G::nadEvaporation>,    resizeConstants<&G::nadInfiltration>,
    resizeConstants<&G::nadBoundary>,       resizeConstants<&G::nadSourceSink>,
    resize<&G::nadDepositionConcentration>, resizeEntries<&G::nadLineDischarge>,
    resizeEntries<&G::nadBoxSummation>,
};

constexpr LeaderRow kLeaders[] = {
    {leader<&G::bathymetry>, kOfAreas},
    {leader<&G::boundary>, kOfBoundaries},
    {leader<&G::sourceSink>, kOfSources},
    {leader<&G::nadComponent>, kOfComponents},
};

}  // namespace

void CGlobalKvs::TellFollowers(const CKvsBase& leader, std::span<const int> counts) {
  for (const LeaderRow& row : kLeaders) {
    if (&row.leader(*this) != &leader) continue;
    for (const Follower follower : row.followers) follower(*this, counts);
  }
}

}  // namespace gridbay
