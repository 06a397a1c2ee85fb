#pragma once

#include "core/string_table.h"

// The texts of the water column, the bed and dredging.

namespace gridbay::texts::bed {

inline constexpr Text weightsNotOne{"Total Predefined Weights different from 1.00"};

// What is asked of files.
inline constexpr Text criticalShearStressOfDeposition{"Critical Shear Stress for Deposition"};
inline constexpr Text fallVelocity{"Fall Velocity"};
inline constexpr Text erosionCoefficient{"Erosion Coefficient"};
inline constexpr Text criticalShearStress{"Critical Shear Stress"};
inline constexpr Text density{"Density of Bed Layer"};
inline constexpr Text frictionCoefficient{"Friction Coefficient"};
inline constexpr Text roughness{"Bed Roughness"};
inline constexpr Text transition{"Transition Between Layers"};
inline constexpr Text dredgerX{"X coordinate of dredger"};
inline constexpr Text dredgerY{"Y coordinate of dredger"};
inline constexpr Text dredgedMassRate{"Dredged mass rate"};
inline constexpr Text dredgingSpill{"Dredging spill"};

}  // namespace gridbay::texts::bed
