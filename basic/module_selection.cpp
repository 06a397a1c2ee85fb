#include "basic/module_selection.h"

#include "core/table_code.h"

namespace gridbay {

// A pinned selection holds after a load even where the file has no section for it.
void CModuleSelectionKvs::Load(KvsSection section, const std::string& documentPath) {
  TableKvs::Load(section, documentPath);
  if (!theEdition.wetlandSweepKit) return;
  simulationType = kPinnedType;
  adScheme = kPinnedScheme;
  hydrodynamicFeatures = kPinnedFeatures;
}

}  // namespace gridbay
