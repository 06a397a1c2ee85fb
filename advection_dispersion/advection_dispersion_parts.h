#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CNadBoundaryKvs;
class CNadComponentKvs;
class CNadDecaySpecificationKvs;
class CNadDepositionConcentrationKvs;
class CNadDispersionCoefKvs;
class CNadEvaporationKvs;
class CNadHeatDissipationKvs;
class CNadInfiltrationKvs;
class CNadInitialConcentrationKvs;
class CNadPrecipitationKvs;
class CNadSourceSinkKvs;
class CNadStartingConditionsKvs;
class CNadHeatExchangeKvs;
class CNadFeedbackKvs;
class CNadLineDischargeKvs;
class CNadBoxSummationKvs;
class CNadMassBudgetKvs;
class CNadResultKvs;

// The transport of dissolved components, as members of the root. None is ever null while the root lives.
struct AdvectionDispersionParts {
  AdvectionDispersionParts();
  ~AdvectionDispersionParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CNadComponentKvs> nadComponent;
  std::unique_ptr<CNadStartingConditionsKvs> nadStartingConditions;
  std::unique_ptr<CNadInitialConcentrationKvs> nadInitialConcentration;
  std::unique_ptr<CNadDispersionCoefKvs> nadDispersionCoef;
  std::unique_ptr<CNadDecaySpecificationKvs> nadDecaySpecification;
  std::unique_ptr<CNadHeatDissipationKvs> nadHeatDissipation;
  std::unique_ptr<CNadBoundaryKvs> nadBoundary;
  std::unique_ptr<CNadSourceSinkKvs> nadSourceSink;
  std::unique_ptr<CNadDepositionConcentrationKvs> nadDepositionConcentration;
  std::unique_ptr<CNadHeatExchangeKvs> nadHeatExchange;
  std::unique_ptr<CNadPrecipitationKvs> nadPrecipitation;
  std::unique_ptr<CNadEvaporationKvs> nadEvaporation;
  std::unique_ptr<CNadInfiltrationKvs> nadInfiltration;
  std::unique_ptr<CNadFeedbackKvs> nadFeedback;
  std::unique_ptr<CNadLineDischargeKvs> nadLineDischarge;
  std::unique_ptr<CNadBoxSummationKvs> nadBoxSummation;
  std::unique_ptr<CNadMassBudgetKvs> nadMassBudget;
  std::unique_ptr<CNadResultKvs> nadResult;
};

}  // namespace gridbay
