#pragma once

#include "core/string_table.h"
#include "pages/file_choice.h"

namespace gridbay::texts {

inline constexpr Text levelWidthTitle{"Level-width"};
inline constexpr Text pointSelectionTitle{"Point Selection"};
// One of the two has two blanks.
inline constexpr Text weirHeadLosses{"Head  loss factors"};
inline constexpr Text culvertHeadLosses{"Head loss factors"};

inline constexpr Text weirFormula3Title{"Weir Formula 3 (Extended Honma) Parameters"};
inline constexpr Text weirFormula3Free{"C0 = a(h1/W)^p + b"};
inline constexpr Text weirFormula3Incomplete{"C = C0 ( Al (h2/h1)^q + Be)"};
inline constexpr Text weirFormula3Submerged{"C = C0 ( Ga (h2/h1)^r + De)"};

// Dikes.
inline constexpr Text itemOfFile{"Item: %s"};
inline constexpr Text fileNotFound{"File '%s' not found"};
inline constexpr FileKind crestLevelFile{"tsb1", "Tsb1 Files (*.tsb1)|*.tsb1|"};

// Points from a file.
inline constexpr Text xyzTitle{"Select XYZ Import File"};
inline constexpr FileKind xyzFile{"xyz", "Xyz files (*.xyz) |*.xyz|All Files (*.*) |*.*||"};
inline constexpr Text xyzImport{"Importing points"};
inline constexpr Text illegalXyz{"Illegal XYZ file format."};

}  // namespace gridbay::texts
