#pragma once

#include <cstdint>

#include "core/kvs_base.h"

// Members that are to be built: they hold and write nothing. A class leaves this file when its own stands.

namespace gridbay {

class CNmtStartingConditionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtTaskSelectionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  std::uint8_t multiFraction = 1;
  std::int32_t fractions = 3;
  void SetFractions(int) {}
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtInitialConcentrationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtDispersionCoefKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtSettlingAndDespositionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtMlSettlingAndDepositionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtBoundaryKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtSourceSinkKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtMfErosionCharacteristicsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtMlErosionCharacteristicsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  std::uint8_t useConstantErosionCoefficient = 1;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionLayerKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerCriticalKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerFactorKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerFactor1Kvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerFactor2Kvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerPowerKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtErosionForEachLayerDensityKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtSlidingKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtTransitionBetweenLayersKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtConsolidationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtBedRoughnessKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtWaveDataKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtLineDischargeKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtBoxSummationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CNmtResultKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

}  // namespace gridbay
