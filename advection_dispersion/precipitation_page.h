#pragma once

#include "advection_dispersion/advection_dispersion_parts.h"
#include "advection_dispersion/transported.h"
#include "families/surface_values_page.h"

namespace gridbay {

// A row for each component.
class CNadPrecipitationGrid final
    : public SurfaceValuesGrid<&AdvectionDispersionParts::nadPrecipitation, AdComponents> {};

// The concentrations in rain.
class CNadPrecipitationDlg final
    : public SurfaceValuesDlg<18734, PageId::adPrecipitation, &AdvectionDispersionParts::nadPrecipitation,
                              CNadPrecipitationGrid> {
 public:
  explicit CNadPrecipitationDlg(CVdDoc& document);
  ~CNadPrecipitationDlg() override;
};

}  // namespace gridbay
