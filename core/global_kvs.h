#pragma once

#include <memory>
#include <string>
#include <string_view>
#include <vector>

#include "core/kvs_base.h"

namespace gridbay {

class CModuleSelectionKvs;
class CBathymetryKvs;
class CSimulationPeriodKvs;
class CBoundaryKvs;
class CSourceSinkKvs;
class CMassBudgetKvs;
class CAreaDescriptionKvs;
class CNhdBoundaryKvs;

// The root of a model: owns one object for each page-sized part of the setup, and knows the skeleton of the
// parameter file. A part reaches any other one through a member of the root. To add a part, declare its
// member here and give it a row in each of the two tables of the source file.
class CGlobalKvs final : public CKvsBase {
 public:
  static constexpr std::string_view kTarget = "VANE27_NESTED_MODEL";

  // A whole default model. The host shows what a load has to say; without one those texts are dropped. It
  // must outlive the root.
  explicit CGlobalKvs(MessageHost* host = nullptr);
  ~CGlobalKvs() override;

  // Whom the next texts go to.
  void SetMessageHost(MessageHost* host) { host_ = host; }

  // Never null while the root lives.
  std::unique_ptr<CModuleSelectionKvs> moduleSelection;
  std::unique_ptr<CBathymetryKvs> bathymetry;
  std::unique_ptr<CSimulationPeriodKvs> simulationPeriod;
  std::unique_ptr<CBoundaryKvs> boundary;
  std::unique_ptr<CSourceSinkKvs> sourceSink;
  std::unique_ptr<CMassBudgetKvs> massBudget;
  std::unique_ptr<CAreaDescriptionKvs> areaDescription;
  std::unique_ptr<CNhdBoundaryKvs> nhdBoundary;

  // All parts, in the order of the file.
  std::vector<CKvsBase*> parts();

  // The loaded file from which a save passes on the options that the editor does not know; null for a new
  // model. It must stay open as long as saves are to have them.
  void SetSourceFile(const KvsFile* file) { sourceFile_ = file; }

  // Checks the whole model; with `deep` 0 nothing.
  unsigned Validate(ValidationList& messages, int deep) override;
  // Writes the target with every section of the skeleton.
  void Save(KvsFile& file, const std::string& documentPath) override;
  // Reads a file, given by the node that holds its targets. To be called once, on a fresh root.
  void Load(KvsSection file, const std::string& documentPath) override;

 protected:
  void ShowMessage(const std::string& text) override;

 private:
  MessageHost* host_;
  const KvsFile* sourceFile_ = nullptr;
};

}  // namespace gridbay
