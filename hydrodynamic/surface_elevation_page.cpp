#include "hydrodynamic/surface_elevation_page.h"

#include "basic/page_texts.h"
#include "hydrodynamic/hydrodynamic_parts.h"
#include "hydrodynamic/page_texts.h"
#include "hydrodynamic/surface_elevation.h"
#include "platform/units/units.h"

namespace gridbay {

void CNhdSurfaceElevationGrid::LayOut() {
  using Entry = CNhdSurfaceElevationObjectKvs;
  const auto entry = RowsOf(&HydrodynamicParts::nhdSurfaceElevation);
  const auto isNot = [entry](std::int32_t type) {
    return [entry, type](GridRow row) { return entry(row)->type != type; };
  };
  ValueOrFileColumns(
      entry, ValueOrFile<Entry>{
                 .formatHeader = "Given as:",
                 .formatWidth = 110,
                 .format = &Entry::type,
                 .formats = {{Entry::kConstant, "Constant value"}, {Entry::kFromFile, "From file"}},
                 .valueHeader = "Value",
                 .valueWidth = 75,
                 .value = &Entry::constantValue,
                 .quantity = item::kSurfaceElevation,
                 .takesValue = isNot(Entry::kFromFile),
                 .file = {.file = fileOf(entry, &Entry::map, texts::surfaceElevationMap, &Entry::RequestMap),
                          .header = "File name",
                          .browse = texts::browse.format,
                          .enabled = isNot(Entry::kConstant)}});
}

}  // namespace gridbay
