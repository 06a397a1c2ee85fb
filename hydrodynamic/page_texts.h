#pragma once

#include "core/string_table.h"
#include "families/transport_page_texts.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr Text sineText{"%.4f sin( 2 pi (t - %.4f)/%.0f )  + %.4f"};
inline constexpr Text sineForm{"%f sin( 2 pi (t - %f)/%f )  + %f"};
inline constexpr Text sineTitle{"Edit Sine Series Boundary Parameters"};
inline constexpr Text boundaryBlock{"Boundary  %d : "};
inline constexpr FileKind ratingCurveFile{"tsb0", "Rating curve (*.tsb0)|*.tsb0|All Files (*.*)|*.*||"};
inline constexpr FileKind flowDirectionFile{
    "tsb1", "Flow Direction (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};

inline constexpr FileKind surfaceElevationMap{
    "tsb2", "Surface Elevation Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind eddyViscosityMap{
    "tsb2", "Eddy viscosity map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind resistanceMap{"tsb2",
                                        "Resistance Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind pierResistanceFile{
    "tsb1", "Pier Resistance (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};
inline constexpr FileKind grainDiameterMap{
    "tsb2", "Grain Diameter Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind waveMap{"tsb2", "Wave Field (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind windMap{"tsb2", "Wind Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind waveRadiationMap{
    "tsb2", "Wave Radiation Map (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

inline constexpr Text sourceRow{"%d: "};
inline constexpr FileKind rainSeriesFile{"tsb0",
                                         "Time Series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind evaporationMapFile{
    "tsb2", "Evaporation Map Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
inline constexpr FileKind precipitationMapFile{
    "tsb2", "Precipitation Map Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};
// The extension is that of a map, though the file is a series.
inline constexpr FileKind sourceSeriesFile{"tsb2",
                                           "Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};

inline constexpr FileKind infiltrationFile{"tsb2",
                                           "Files (*.tsb2;*.tb2)|*.tsb2; *.tb2|All Files (*.*)|*.*||"};

inline constexpr Text outputItems{"Output items\n"};
inline constexpr Text generateHotStart{"Generate hot start"};

}  // namespace gridbay::texts
