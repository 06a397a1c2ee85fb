#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CNmtExpBedDensityKvs;
class CNmtExpBedRoughnessKvs;
class CNmtExpBoundaryKvs;
class CNmtExpConstFrictionCoefKvs;
class CNmtExpConstantWavesKvs;
class CNmtExpCriticalShearStressKvs;
class CNmtExpDepositionKvs;
class CNmtExpDispersionCoefKvs;
class CNmtExpDredgingsKvs;
class CNmtExpErosionCoefficientKvs;
class CNmtExpErosionLayerKvs;
class CNmtExpForcingsKvs;
class CNmtExpInitialConditionsKvs;
class CNmtExpLineDischargeKvs;
class CNmtExpMassBudgetKvs;
class CNmtExpMorphologyKvs;
class CNmtExpPowerOfErosionKvs;
class CNmtExpResultKvs;
class CNmtExpSandFractionsKvs;
class CNmtExpSettlingParKvs;
class CNmtExpSettlingsKvs;
class CNmtExpSlidingKvs;
class CNmtExpSourcesKvs;
class CNmtExpStartingConditionsKvs;
class CNmtExpTSVWavesKvs;
class CNmtExpTaskSelectionKvs;
class CNmtExpTransitionKvs;
class CNmtExpVarFrictionCoefKvs;
class CNmtExpWaterColParametersKvs;
class CNmtExpWaveDatabaseKvs;
class CNmtExpWavesKvs;

// The transport of several grain sizes over a layered bed, with waves, dredging and morphology, as members of
// the root. None is ever null while the root lives.
struct MudTransportExpandedParts {
  MudTransportExpandedParts();
  ~MudTransportExpandedParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CNmtExpStartingConditionsKvs> nmtExpStartingConditions;
  std::unique_ptr<CNmtExpTaskSelectionKvs> nmtExpTaskSelection;
  std::unique_ptr<CNmtExpInitialConditionsKvs> nmtExpInitialConditions;
  std::unique_ptr<CNmtExpDispersionCoefKvs> nmtExpDispersionCoef;
  std::unique_ptr<CNmtExpBoundaryKvs> nmtExpBoundary;
  std::unique_ptr<CNmtExpForcingsKvs> nmtExpForcings;
  std::unique_ptr<CNmtExpWavesKvs> nmtExpWaves;
  std::unique_ptr<CNmtExpTSVWavesKvs> nmtExpTsvWaves;
  std::unique_ptr<CNmtExpConstantWavesKvs> nmtExpConstantWaves;
  std::unique_ptr<CNmtExpWaveDatabaseKvs> nmtExpWaveDatabase;
  std::unique_ptr<CNmtExpDredgingsKvs> nmtExpDredgings;
  std::unique_ptr<CNmtExpSourcesKvs> nmtExpSources;
  std::unique_ptr<CNmtExpWaterColParametersKvs> nmtExpWaterColParameters;
  std::unique_ptr<CNmtExpSandFractionsKvs> nmtExpSandFractions;
  std::unique_ptr<CNmtExpSettlingsKvs> nmtExpSettlings;
  std::unique_ptr<CNmtExpDepositionKvs> nmtExpDeposition;
  std::unique_ptr<CNmtExpSettlingParKvs> nmtExpSettlingPar;
  std::unique_ptr<CNmtExpErosionLayerKvs> nmtExpErosionLayer;
  std::unique_ptr<CNmtExpPowerOfErosionKvs> nmtExpPowerOfErosion;
  std::unique_ptr<CNmtExpErosionCoefficientKvs> nmtExpErosionCoefficient;
  std::unique_ptr<CNmtExpCriticalShearStressKvs> nmtExpCriticalShearStress;
  std::unique_ptr<CNmtExpBedDensityKvs> nmtExpBedDensity;
  std::unique_ptr<CNmtExpSlidingKvs> nmtExpSliding;
  std::unique_ptr<CNmtExpConstFrictionCoefKvs> nmtExpConstFrictionCoef;
  std::unique_ptr<CNmtExpMorphologyKvs> nmtExpMorphology;
  std::unique_ptr<CNmtExpVarFrictionCoefKvs> nmtExpVarFrictionCoef;
  std::unique_ptr<CNmtExpBedRoughnessKvs> nmtExpBedRoughness;
  std::unique_ptr<CNmtExpTransitionKvs> nmtExpTransition;
  std::unique_ptr<CNmtExpMassBudgetKvs> nmtExpMassBudget;
  std::unique_ptr<CNmtExpLineDischargeKvs> nmtExpLineDischarge;
  std::unique_ptr<CNmtExpResultKvs> nmtExpResult;
};

}  // namespace gridbay
