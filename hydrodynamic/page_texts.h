#pragma once

#include "core/string_table.h"

namespace gridbay::texts {

inline constexpr Text sineText{"%.4f sin( 2 pi (t - %.4f)/%.0f )  + %.4f"};
inline constexpr Text sineForm{"%f sin( 2 pi (t - %f)/%f )  + %f"};
inline constexpr Text sineTitle{"Edit Sine Series Boundary Parameters"};
inline constexpr Text boundaryBlock{"Boundary  %d : "};
inline constexpr Text timeSeriesFilter{"Time series (*.tsb0;*.tb0)|*.tsb0; *.tb0|All Files (*.*)|*.*||"};
inline constexpr Text profileFilter{"Profile (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};
inline constexpr Text ratingCurveFilter{"Rating curve (*.tsb0)|*.tsb0|All Files (*.*)|*.*||"};
inline constexpr Text flowDirectionFilter{
    "Flow Direction (*.tsb1;*.tb1)|*.tsb1; *.tb1|All Files (*.*)|*.*||"};
inline constexpr Text seriesExtension{"tsb0"};
inline constexpr Text profileExtension{"tsb1"};

}  // namespace gridbay::texts
