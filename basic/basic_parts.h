#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CModuleSelectionKvs;
class CBathymetryKvs;
class CSimulationPeriodKvs;
class CBoundaryKvs;
class CSourceSinkKvs;
class CMassBudgetKvs;
class CAreaDescriptionKvs;

// What every model has, as members of its root. None is ever null while the root lives.
struct BasicParts {
  BasicParts();
  ~BasicParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CModuleSelectionKvs> moduleSelection;
  std::unique_ptr<CBathymetryKvs> bathymetry;
  std::unique_ptr<CSimulationPeriodKvs> simulationPeriod;
  std::unique_ptr<CBoundaryKvs> boundary;
  std::unique_ptr<CSourceSinkKvs> sourceSink;
  std::unique_ptr<CMassBudgetKvs> massBudget;
  std::unique_ptr<CAreaDescriptionKvs> areaDescription;
};

}  // namespace gridbay
