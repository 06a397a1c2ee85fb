#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CNhdBoundaryKvs;
class CNhdEddyViscosityKvs;
class CNhdInfiltrationKvs;
class CNhdResistanceKvs;
class CNhdResultKvs;
class CNhdSourceSinkKvs;
class CNhdSurfaceElevationKvs;
class CNhdWaveRadiationKvs;
class CWindConditionsKvs;

// The conditions and results of the flow calculation, as members of the root. None is ever null while the
// root lives.
struct HydrodynamicParts {
  HydrodynamicParts();
  ~HydrodynamicParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CNhdBoundaryKvs> nhdBoundary;
  std::unique_ptr<CNhdSourceSinkKvs> nhdSourceSink;
  std::unique_ptr<CNhdInfiltrationKvs> nhdInfiltration;
  std::unique_ptr<CWindConditionsKvs> windConditions;
  std::unique_ptr<CNhdEddyViscosityKvs> nhdEddyViscosity;
  std::unique_ptr<CNhdWaveRadiationKvs> nhdWaveRadiation;
  std::unique_ptr<CNhdSurfaceElevationKvs> nhdSurfaceElevation;
  std::unique_ptr<CNhdResistanceKvs> nhdResistance;
  std::unique_ptr<CNhdResultKvs> nhdResult;
};

}  // namespace gridbay
