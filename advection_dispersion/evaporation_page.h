#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each component.
class CNadEvaporationGrid final
    : public SurfaceValuesGrid<&AdvectionDispersionParts::nadEvaporation, AdComponents> {};

// The concentrations in the water that evaporates.
class CNadEvaporationDlg final
    : public SurfaceValuesDlg<18724, PageId::adEvaporation, &AdvectionDispersionParts::nadEvaporation,
                              CNadEvaporationGrid> {
 public:
  explicit CNadEvaporationDlg(CVdDoc& document);
  ~CNadEvaporationDlg() override;
};

}  // namespace gridbay
