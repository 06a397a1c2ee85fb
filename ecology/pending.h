#pragma once

#include <cstdint>

#include "core/kvs_base.h"

// Members that are to be built: they hold and write nothing. A class leaves this file when its own stands.

namespace gridbay {

class CWQSModelDefinitionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSStartingConditionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSInitialConditionsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADBoundaryKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADDispersionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADSourceSinkKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADPrecipitationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADEvaporationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADInfiltrationKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSADDepositionKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSConstantsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSForcingsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSMassBudgetKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

class CWQSResultsKvs final : public CKvsBase {
 public:
  using CKvsBase::CKvsBase;
  void Save(KvsFile&, const std::string&) override {}
  void Load(KvsSection, const std::string&) override {}
};

}  // namespace gridbay
