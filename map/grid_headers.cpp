#include "map/grid_headers.h"

#include <fmt/format.h>

#include <cmath>
#include <filesystem>

#include "basic/grid_file.h"
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
  header.landValue = kNoLandValue;
  readLandValue(file, header.landValue);
  header.geography = definition.geography;
  if (header.geography) header.geography->projection = completeProjection(*header.geography);
  return header;
}

}  // namespace

const GridHeader& GridHeaders::of(const std::string& path) {
  std::error_code error;
  const auto written = std::filesystem::last_write_time(path, error);
  const std::int64_t time = error ? -1 : std::int64_t{written.time_since_epoch().count()};
  const auto bytes = std::filesystem::file_size(path, error);
  const std::int64_t size = error ? -1 : static_cast<std::int64_t>(bytes);
  Known& known = known_[path];
  if (known.header.state != 0 && known.time == time && known.size == size) return known.header;
  known = {time, size, readHeader(path)};
  known.header.state = ++lastState_;
  return known.header;
}

}  // namespace gridbay
