#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "basic/bathymetry.h"
#include "mud_transport_expanded/bed_density.h"
#include "mud_transport_expanded/bed_roughness.h"
#include "mud_transport_expanded/const_friction_coef.h"
#include "mud_transport_expanded/critical_shear_stress.h"
#include "mud_transport_expanded/deposition.h"
#include "mud_transport_expanded/dredgings.h"
#include "mud_transport_expanded/erosion_coefficient.h"
#include "mud_transport_expanded/erosion_layer.h"
#include "mud_transport_expanded/morphology.h"
#include "mud_transport_expanded/power_of_erosion.h"
#include "mud_transport_expanded/sand_fractions.h"
#include "mud_transport_expanded/settling_par.h"
#include "mud_transport_expanded/settlings.h"
#include "mud_transport_expanded/sliding.h"
#include "mud_transport_expanded/task_selection.h"
#include "mud_transport_expanded/transition.h"
#include "mud_transport_expanded/var_friction_coef.h"
#include "mud_transport_expanded/water_col_parameters.h"
#include "setup/global_kvs.h"

namespace gridbay::test {

// A model of so many fractions and layers.
inline void setFractionsAndLayers(CGlobalKvs& root, int fractions, int layers) {
  root.nmtExpTaskSelection->SetCounts(layers, fractions, false);
}

}  // namespace gridbay::test
