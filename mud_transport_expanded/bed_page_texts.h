#pragma once

#include <string>

#include "core/string_table.h"
#include "pages/file_choice.h"

// The texts of the pages of the water column, the bed and dredging.

namespace gridbay::texts::bed {

inline constexpr Text betweenLayers{"Between Layers %d and %d"};
inline constexpr Text weight{"Fraction %d"};

inline constexpr FileKind criticalShearStressFile{
    "tsb2", "Critical Shear Stress (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind fallVelocityFile{
    "tsb2", "Fall Velocity (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind erosionCoefficientFile{
    "tsb2", "Erosion Coefficient (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind densityFile{
    "tsb2", "Density of Bed Layer (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind frictionCoefficientFile{
    "tsb2", "Friction Coefficient (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind roughnessFile{"tsb2",
                                        "Bed Roughness (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind transitionFile{
    "tsb2", "Transition Between Layers (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind dredgingFile{"tsb0", "Dredging (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};

}  // namespace gridbay::texts::bed
