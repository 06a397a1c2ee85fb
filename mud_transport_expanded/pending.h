#pragma once

#include <cstdint>

#include "core/kvs_base.h"

// Members that are to be built: they hold and write nothing. A class leaves this file when its own stands.

namespace gridbay {

class CNmtExpStartingConditionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpTaskSelectionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  std::uint8_t includeXenobiotics = 0;
  void SetCounts(int, int, bool) {}
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpInitialConditionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpDispersionCoefKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpBoundaryKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpForcingsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  std::int32_t includeWaves = 0;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpWavesKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  std::int32_t typeOfWaveVariation = 1;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpTSVWavesKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpConstantWavesKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpWaveDatabaseKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpDredgingsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpSourcesKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpWaterColParametersKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpSandFractionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpSettlingsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpDepositionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpSettlingParKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpErosionLayerKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpPowerOfErosionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpErosionCoefficientKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpCriticalShearStressKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpBedDensityKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpSlidingKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpConstFrictionCoefKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpMorphologyKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpVarFrictionCoefKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpBedRoughnessKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpTransitionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpMassBudgetKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpLineDischargeKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtExpResultKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

}  // namespace gridbay
