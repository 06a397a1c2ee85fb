#include <array>

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

// Who follows a leader, in the order in which they are told.
struct LeaderRow {
  const CKvsBase& (*leader)(const G&);
  std::span<const Follower> followers;
};

template <auto member>
const CKvsBase& leader(const G& root) {
  return *(root.*member);
}

constexpr std::array<Follower, 5> kOfAreas{
    resize<&G::nhdEddyViscosity>, resize<&G::nhdWaveRadiation>, resize<&G::nhdSurfaceElevation>,
    resize<&G::nhdResistance>,    resize<&G::nhdResult>,
};
constexpr std::array<Follower, 1> kOfBoundaries{resize<&G::nhdBoundary>};
constexpr std::array<Follower, 1> kOfSources{resize<&G::nhdSourceSink>};

constexpr LeaderRow kLeaders[] = {
    {leader<&G::bathymetry>, kOfAreas},
    {leader<&G::boundary>, kOfBoundaries},
    {leader<&G::sourceSink>, kOfSources},
};

}  // namespace

void CGlobalKvs::TellFollowers(const CKvsBase& leader, std::span<const int> counts) {
  for (const LeaderRow& row : kLeaders) {
    if (&row.leader(*this) != &leader) continue;
    for (const Follower follower : row.followers) follower(*this, counts);
  }
}

}  // namespace gridbay
