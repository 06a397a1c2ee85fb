#pragma once

#include <cstdint>

#include "map/map_scene.h"
#include "shell/page_pane.h"

// Which cells of pages tell of what is placed on the map.

namespace gridbay::shell {

// Whether a cell of a page tells of a feature: a row of its own page, or a column where the page has columns;
// or an entry of a page that says more of the boundaries or sources, as that of their concentrations.
bool tellsOf(const MapScene& scene, std::int32_t page, const PagePane::Cell& cell, const MapFeature& feature);

// Whether a page says more of what a kind of feature is, an entry for each in the order of their numbers.
bool isFurtherPageOf(MapKind kind, std::int32_t page);
int countOf(const MapScene& scene, MapKind kind);

}  // namespace gridbay::shell
