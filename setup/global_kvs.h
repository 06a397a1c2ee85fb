#pragma once

#include <string>
#include <string_view>
#include <vector>

#include "advection_dispersion/advection_dispersion_parts.h"
#include "basic/basic_parts.h"
#include "core/model_root.h"
#include "ecology/ecology_parts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "mud_transport/mud_transport_parts.h"
#include "mud_transport_expanded/mud_transport_expanded_parts.h"
#include "structures/structures_parts.h"

namespace gridbay {

// The root of a model: owns one object for each page-sized part of the setup, and knows the skeleton of the
// parameter file. Each room declares its members; a part reaches any other one through them. The orders of
// saving, loading and checking stand in setup/skeleton.cpp, who follows whom in setup/followers.cpp.
class CGlobalKvs final : public ModelRoot,
                         public BasicParts,
                         public HydrodynamicParts,
                         public StructureParts,
                         public AdvectionDispersionParts,
                         public MudTransportParts,
                         public MudTransportExpandedParts,
                         public EcologyParts {
 public:
  static constexpr std::string_view kTarget = "VANE27_NESTED_MODEL";

  // A whole default model. The host shows what a load has to say; without one those texts are dropped. It
  // must outlive the root.
  explicit CGlobalKvs(MessageHost* host = nullptr);
  ~CGlobalKvs() override;

  // Whom the next texts go to.
  void SetMessageHost(MessageHost* host) { host_ = host; }

  // All members, in the order of their creation.
  std::vector<CKvsBase*> children();

  // The loaded file from which a save passes on the options that the editor does not know; null for a new
  // model. It must stay open as long as saves are to have them.
  void SetSourceFile(const KvsFile* file) { sourceFile_ = file; }

  // Checks the whole model; with `deep` 0 nothing.
  unsigned Validate(ValidationList& messages, int deep) override;
  // Writes the target with every section of the skeleton.
  void Save(KvsFile& file, const std::string& documentPath) override;
  // Reads a file, given by the node that holds its targets. To be called once, on a fresh root.
  void Load(KvsSection file, const std::string& documentPath) override;

  // All members, each with its own.
  void AssignState(const CKvsBase& other) override;
  bool SameState(const CKvsBase& other) const override;
  // A path of the target; sections that the root opens are found too.
  bool AccessPath(std::string_view path, PathAccess& access) override;
  // Whether a save writes what the section of a loaded file holds, or its name at least; by its path.
  bool KnowsSection(std::string_view path);

  void TellOfGrids() override;
  void TellFollowers(const CKvsBase& leader, std::span<const int> counts) override;
  // By the table of setup/module_outputs.cpp.
  ModuleOutput OutputOfModule() override;

 protected:
  void ShowMessage(const std::string& text) override;

 private:
  MessageHost* host_;
  const KvsFile* sourceFile_ = nullptr;
};

}  // namespace gridbay
