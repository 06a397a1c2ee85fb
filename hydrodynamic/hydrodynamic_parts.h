#pragma once

#include <memory>

namespace gridbay {

class CNhdBoundaryKvs;
class CNhdInfiltrationKvs;
class CNhdResultKvs;
class CNhdSourceSinkKvs;

// The conditions and results of the flow calculation, as members of the root. None is ever null while the
// root lives.
struct HydrodynamicParts {
  HydrodynamicParts();
  ~HydrodynamicParts();

  std::unique_ptr<CNhdBoundaryKvs> nhdBoundary;
  std::unique_ptr<CNhdSourceSinkKvs> nhdSourceSink;
  std::unique_ptr<CNhdInfiltrationKvs> nhdInfiltration;
  std::unique_ptr<CNhdResultKvs> nhdResult;
};

}  // namespace gridbay
