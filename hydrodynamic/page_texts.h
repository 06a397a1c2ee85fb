#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr Text sineText{"%.4f sin( 2 pi (t - %.4f)/%.0f )  + %.4f"};
inline constexpr Text sineForm{"%f sin( 2 pi (t - %f)/%f )  + %f"};
inline constexpr Text sineTitle{"Edit Sine Series Boundary Parameters"};
inline constexpr Text boundaryBlock{"Boundary  %d : "};
inline constexpr FileKind timeSeriesFile{"tsb0",
                                         "Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr FileKind profileFile{"tsb1", "Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};
inline constexpr FileKind ratingCurveFile{"tsb0", "Rating curve (*.tsb0)|*.tsb0|All Files (*.*)|*.*||"};
inline constexpr FileKind flowDirectionFile{
    "tsb1", "Flow Direction (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};

inline constexpr Text outputItems{"Output items\n"};
inline constexpr Text generateHotStart{"Generate hot start"};

}  // namespace gridbay::texts
