#include "map/grid_headers.h"

#include <fmt/format.h>

#include <cmath>

#include "basic/grid_file.h"
#include "core/land_value.h"
#include "platform/tsb/tsb_file.h"
#include "platform/tsb/tsb_operations.h"

namespace gridbay {
namespace {

GridHeader readHeader(const std::string& path) {
  GridHeader header;
  TsbHeader file;
  if (tsbFileRead(path, &file, &header.fault) != 0) return header;
  const TsbDefinition& definition = file.file->definition();
  if (definition.axisType() != TsbAxisType::d2) {
    header.fault = fmt::format("\"{}\" holds no two-dimensional grid", path);
    return header;
  }
  const TsbGridAxis& x = definition.axes[0];
  const TsbGridAxis& y = definition.axes[1];
  float dx = 0;
  float dy = 0;
  const bool isGrid = tsbGetItemAxisEqD2(file, 1, &header.nx, &header.ny, &dx, &dy) == 0 && dx > 0 && dy > 0;
  if (!isGrid) {
    header.fault = fmt::format("The grid of \"{}\" has no usable spacing", path);
    return header;
  }
  header.dx = x.spacing;
  header.dy = y.spacing;
  header.firstX = x.first;
  header.firstY = y.first;
  const Result<std::optional<float>> land = landValueOf(definition);
  header.landValue = land ? land->value_or(kNoLandValue) : kNoLandValue;
  header.geography = definition.geography;
  if (header.geography) header.geography->projection = completeProjection(*header.geography);
  return header;
}

}  // namespace

const GridHeader& GridHeaders::of(const std::string& path) {
  const std::optional<FileStamp> stamp = fileStamp(path);
  Known& known = known_[path];
  if (known.header.state != 0 && known.stamp == stamp) return known.header;
  known = {stamp, readHeader(path)};
  known.header.state = ++lastState_;
  return known.header;
}

}  // namespace gridbay
