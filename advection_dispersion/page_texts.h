#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr FileKind decayFile{"tsb0",
                                    "Decay Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind heatDissipationFile{
    "tsb0", "Heat Dissipation Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind surfaceDepositionSeriesFile{
    "tsb0", "Surface Deposition (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind surfaceDepositionMapFile{
    "tsb2", "Surface Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind soilDepositionSeriesFile{
    "tsb0", "Soil Deposition (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind soilDepositionMapFile{
    "tsb2", "Soil Deposition (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

// Heat exchange.
inline constexpr FileKind airSeriesFile{
    "tsb0", "Air Temperature Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind airMapFile{
    "tsb2", "Air Temperature Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind humidityFile{
    "tsb0", "Relative Humidity Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind clearnessFile{
    "tsb0", "Clearness Coeficient Files (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};

}  // namespace gridbay::texts
