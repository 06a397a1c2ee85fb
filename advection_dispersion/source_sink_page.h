#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/source_values_page.h"

namespace gridbay {

// A row for each source.
class CNadSourceSinkGrid final
    : public SourceValuesGrid<&AdvectionDispersionParts::nadSourceSink, AdComponents> {};

// The concentrations in the water of the sources.
class CNadSourceSinkDlg final : public SourceValuesDlg<18736, PageId::adSourceSink, CNadSourceSinkGrid> {
 public:
  explicit CNadSourceSinkDlg(CVdDoc& document);
  ~CNadSourceSinkDlg() override;
};

}  // namespace gridbay
