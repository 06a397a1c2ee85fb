#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CNmtBedRoughnessKvs;
class CNmtBoundaryKvs;
class CNmtBoxSummationKvs;
class CNmtConsolidationKvs;
class CNmtDispersionCoefKvs;
class CNmtErosionForEachLayerCriticalKvs;
class CNmtErosionForEachLayerDensityKvs;
class CNmtErosionForEachLayerFactor1Kvs;
class CNmtErosionForEachLayerFactor2Kvs;
class CNmtErosionForEachLayerFactorKvs;
class CNmtErosionForEachLayerPowerKvs;
class CNmtErosionLayerKvs;
class CNmtInitialConcentrationKvs;
class CNmtLineDischargeKvs;
class CNmtMfErosionCharacteristicsKvs;
class CNmtMlErosionCharacteristicsKvs;
class CNmtMlSettlingAndDepositionKvs;
class CNmtResultKvs;
class CNmtSettlingAndDespositionKvs;
class CNmtSlidingKvs;
class CNmtSourceSinkKvs;
class CNmtStartingConditionsKvs;
class CNmtTaskSelectionKvs;
class CNmtTransitionBetweenLayersKvs;
class CNmtWaveDataKvs;

// The transport of cohesive sediment, its settling and its bed, as members of the root. None is ever null
// while the root lives.
struct MudTransportParts {
  MudTransportParts();
  ~MudTransportParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CNmtStartingConditionsKvs> nmtStartingConditions;
  std::unique_ptr<CNmtTaskSelectionKvs> nmtTaskSelection;
  std::unique_ptr<CNmtInitialConcentrationKvs> nmtInitialConcentration;
  std::unique_ptr<CNmtDispersionCoefKvs> nmtDispersionCoef;
  std::unique_ptr<CNmtSettlingAndDespositionKvs> nmtSettlingAndDesposition;
  std::unique_ptr<CNmtMlSettlingAndDepositionKvs> nmtMlSettlingAndDeposition;
  std::unique_ptr<CNmtBoundaryKvs> nmtBoundary;
  std::unique_ptr<CNmtSourceSinkKvs> nmtSourceSink;
  std::unique_ptr<CNmtMfErosionCharacteristicsKvs> nmtMfErosionCharacteristics;
  std::unique_ptr<CNmtMlErosionCharacteristicsKvs> nmtMlErosionCharacteristics;
  std::unique_ptr<CNmtErosionLayerKvs> nmtErosionLayer;
  std::unique_ptr<CNmtErosionForEachLayerCriticalKvs> nmtErosionForEachLayerCritical;
  std::unique_ptr<CNmtErosionForEachLayerFactorKvs> nmtErosionForEachLayerFactor;
  std::unique_ptr<CNmtErosionForEachLayerFactor1Kvs> nmtErosionForEachLayerFactor1;
  std::unique_ptr<CNmtErosionForEachLayerFactor2Kvs> nmtErosionForEachLayerFactor2;
  std::unique_ptr<CNmtErosionForEachLayerPowerKvs> nmtErosionForEachLayerPower;
  std::unique_ptr<CNmtErosionForEachLayerDensityKvs> nmtErosionForEachLayerDensity;
  std::unique_ptr<CNmtSlidingKvs> nmtSliding;
  std::unique_ptr<CNmtTransitionBetweenLayersKvs> nmtTransitionBetweenLayers;
  std::unique_ptr<CNmtConsolidationKvs> nmtConsolidation;
  std::unique_ptr<CNmtBedRoughnessKvs> nmtBedRoughness;
  std::unique_ptr<CNmtWaveDataKvs> nmtWaveData;
  std::unique_ptr<CNmtLineDischargeKvs> nmtLineDischarge;
  std::unique_ptr<CNmtBoxSummationKvs> nmtBoxSummation;
  std::unique_ptr<CNmtResultKvs> nmtResult;
};

}  // namespace gridbay
