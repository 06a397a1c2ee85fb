#pragma once

#include <memory>

namespace gridbay {

class CKvsBase;
class CWQSADBoundaryKvs;
class CWQSADDepositionKvs;
class CWQSADDispersionKvs;
class CWQSADEvaporationKvs;
class CWQSADInfiltrationKvs;
class CWQSADPrecipitationKvs;
class CWQSADSourceSinkKvs;
class CWQSConstantsKvs;
class CWQSForcingsKvs;
class CWQSInitialConditionsKvs;
class CWQSMassBudgetKvs;
class CWQSModelDefinitionKvs;
class CWQSResultsKvs;
class CWQSStartingConditionsKvs;

// The ecological model: its definition, and the transport of what it defines, as members of the root. None is
// ever null while the root lives.
struct EcologyParts {
  EcologyParts();
  ~EcologyParts();
  // Makes them all. Their defaults may ask the whole model, which must stand but for its members.
  void create(CKvsBase& root);

  std::unique_ptr<CWQSModelDefinitionKvs> wqsModelDefinition;
  std::unique_ptr<CWQSStartingConditionsKvs> wqsStartingConditions;
  std::unique_ptr<CWQSInitialConditionsKvs> wqsInitialConditions;
  std::unique_ptr<CWQSADBoundaryKvs> wqsAdBoundary;
  std::unique_ptr<CWQSADDispersionKvs> wqsAdDispersion;
  std::unique_ptr<CWQSADSourceSinkKvs> wqsAdSourceSink;
  std::unique_ptr<CWQSADPrecipitationKvs> wqsAdPrecipitation;
  std::unique_ptr<CWQSADEvaporationKvs> wqsAdEvaporation;
  std::unique_ptr<CWQSADInfiltrationKvs> wqsAdInfiltration;
  std::unique_ptr<CWQSADDepositionKvs> wqsAdDeposition;
  std::unique_ptr<CWQSConstantsKvs> wqsConstants;
  std::unique_ptr<CWQSForcingsKvs> wqsForcings;
  std::unique_ptr<CWQSMassBudgetKvs> wqsMassBudget;
  std::unique_ptr<CWQSResultsKvs> wqsResults;
};

}  // namespace gridbay
