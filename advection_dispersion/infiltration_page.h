#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each component.
class CNadInfiltrationGrid final
    : public SurfaceValuesGrid<&AdvectionDispersionParts::nadInfiltration, AdComponents> {};

// The concentrations in the water that infiltrates.
class CNadInfiltrationDlg final
    : public SurfaceValuesDlg<18724, PageId::adInfiltration, &AdvectionDispersionParts::nadInfiltration,
                              CNadInfiltrationGrid> {
 public:
  explicit CNadInfiltrationDlg(CVdDoc& document);
  ~CNadInfiltrationDlg() override;
};

}  // namespace gridbay
