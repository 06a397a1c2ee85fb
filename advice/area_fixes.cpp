#include "advice/area_fixes.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <filesystem>
#include <limits>

#include "basic/bathymetry.h"
#include "basic/grid_file.h"
#include "basic/nesting.h"
#include "platform/files/paths.h"

namespace gridbay {
namespace {

std::string fileKeyword(int number) {
  return fmt::format("{}/AREA_{}/DATA_FILE/FILE_NAME", kAreasPath, number);
}

// The frame of a grid that begins at a point of another one.
GridFrame frameAt(AdviceContext& context, const GridFrame& around, GridPoint origin, double dx, double dy) {
  const double x = origin.j * around.dx;
  const double y = origin.k * around.dy;
  GridFrame frame{around.geography, around.firstX + x, around.firstY + y, dx, dy};
  if (!frame.geography) return frame;
  TsbGeography& place = *frame.geography;
  place.projection = completeProjection(place);
  const CVdMapProjection& projection = context.files.projection(place.projection);
  double easting = 0;
  double northing = 0;
  if (!projection.Geo2Proj(place.longitude, place.latitude, &easting, &northing)) return frame;
  CVdCartography({}, easting, northing, place.rotation).Xy2Proj(x, y, &frame.firstX, &frame.firstY);
  projection.Proj2Geo(frame.firstX, frame.firstY, &place.longitude, &place.latitude);
  if (place.isTurned()) frame.firstX = frame.firstY = 0;
  return frame;
}

// An area's way to a point of the grid around it, whose file and frame may be those of the fix.
struct AreaWay {
  int number;
  GridPoint origin;
  AreaPlacing placing;
  GridFrame around;
  std::string aroundFile;
};

// Whether a grid lies at a point of another one by what its file says, in the same projection.
bool liesAt(AdviceContext& context, const GridFacts& grid, GridPoint origin, const GridFrame& around) {
  const std::optional<GridSpot> spot = spotByCoordinates(context, grid, around);
  return spot && isOnPoint(grid, metresTo(*spot, origin, around)) &&
         context.isSameProjection(projectionIn(grid), around.geography ? around.geography->projection : "");
}

std::string addArea(AdviceContext& context, AdviceFix& fix, const AreaWay& way) {
  CBathymetryKvs& areas = *context.model.bathymetry;
  const GridFacts& grid = *context.grid(way.number);
  const CBathymetryObjectKvs& area = *areas.GetArea(way.number);
  const bool isResampled = way.placing == AreaPlacing::resampled;
  const GridFrame frame =
      frameAt(context, way.around, way.origin, isResampled ? way.around.dx / kNestingRatio : grid.dx,
              isResampled ? way.around.dy / kNestingRatio : grid.dy);
  std::string name;
  if (isResampled) {
    name = addAreaFile(context, fix, way.number, "nested",
                       ResampledGrid{locationOf(frame), frame.dx, frame.dy, way.aroundFile});
  } else {
    PlacedGrid placed{locationOf(frame)};
    if (areas.hotStart == 1) placed.hotStart = {area.enclosingArea, way.origin};
    name = addAreaFile(context, fix, way.number, "placed", placed);
  }
  if (area.origin != way.origin) {
    fix.settings.push_back({fmt::format("{}/AREA_{}/Origin", kAreasPath, way.number),
                            fmt::format("{},{}", way.origin.j, way.origin.k)});
  }
  const std::string file = fix.files.back().to;
  const auto isMade = [&](const std::string& path) {
    return std::ranges::find(fix.files, path, &AdviceFile::from) != fix.files.end();
  };
  for (int number = 2; number <= areas.GetCount(); ++number) {
    const CBathymetryObjectKvs& inside = *areas.GetArea(number);
    const GridFacts* inner = context.grid(number);
    if (inside.enclosingArea != way.number || inner == nullptr || isMade(inside.fileName.absolute()) ||
        liesAt(context, *inner, inside.origin, frame))
      continue;
    AreaWay further{number, inside.origin, AreaPlacing::placed, frame, file};
    if (const std::optional<GridSpot> spot = spotByCoordinates(context, *inner, frame);
        isResampled && spot && nests(*inner, grid, nearestTo(*spot))) {
      further.origin = nearestTo(*spot);
      further.placing = AreaPlacing::resampled;
    }
    addArea(context, fix, further);
  }
  return name;
}

}  // namespace

PagePlace placeOfAreaFile(AdviceContext& context, int number) {
  return placeOfEntry(PageId::bathymetry, "area", {number, context.model.bathymetry->GetCount()},
                      fileKeyword(number), "Bathymetry");
}

GridFrame frameOf(const GridFacts& grid) {
  return {grid.file.geography, grid.file.axes[0].first, grid.file.axes[1].first, grid.dx, grid.dy};
}

GridLocation locationOf(const GridFrame& frame) {
  GridLocation location{.firstX = frame.firstX, .firstY = frame.firstY};
  if (frame.geography) {
    location.projection = frame.geography->projection;
    location.longitude = frame.geography->longitude;
    location.latitude = frame.geography->latitude;
    location.rotation = frame.geography->rotation;
  }
  return location;
}

std::string projectionIn(const GridFacts& grid) {
  if (!grid.file.geography || CVdMapProjection::IsLocal(grid.file.geography->projection)) return {};
  return completeProjection(*grid.file.geography);
}

std::optional<GridSpot> spotByCoordinates(AdviceContext& context, const GridFacts& grid,
                                          const GridFrame& around) {
  const std::string projection = around.geography ? completeProjection(*around.geography) : std::string();
  const std::optional<GridSpot> spot =
      spotOfGrid(frameOf(grid), around, context.files.projection(projection));
  constexpr double kMostSpacings = 1e6;
  if (!spot || !(std::abs(spot->j) < kMostSpacings) || !(std::abs(spot->k) < kMostSpacings))
    return std::nullopt;
  return spot;
}

GridPoint nearestTo(const GridSpot& spot) {
  return {static_cast<int>(std::lround(spot.j)), static_cast<int>(std::lround(spot.k))};
}

double metresTo(const GridSpot& spot, GridPoint point, const GridFrame& around) {
  return std::hypot((spot.j - point.j) * around.dx, (spot.k - point.k) * around.dy);
}

bool isOnPoint(const GridFacts& grid, double metres) {
  constexpr double kNear = 0.25;  // of a spacing
  return metres <= kNear * std::min(grid.dx, grid.dy);
}

GridPoint lastPointOf(const GridFacts& inner, GridPoint origin) {
  const auto beyond = [](int first, int points) {
    constexpr std::int64_t kMost = std::numeric_limits<int>::max();
    return static_cast<int>(std::min(kMost, std::int64_t{first} + (points - 1) / kNestingRatio));
  };
  return {beyond(origin.j, inner.noJ), beyond(origin.k, inner.noK)};
}

bool nests(const GridFacts& inner, const GridFacts& outer, GridPoint origin) {
  return origin.j >= 1 && origin.k >= 1 && origin.j <= outer.noJ - 2 - (inner.noJ - 1) / kNestingRatio &&
         origin.k <= outer.noK - 2 - (inner.noK - 1) / kNestingRatio;
}

std::string addAreaFile(AdviceContext& context, AdviceFix& fix, int number, std::string_view what,
                        FileMaking making) {
  const std::string from = context.model.bathymetry->GetArea(number)->fileName.absolute();
  const std::filesystem::path path(from);
  const std::string name =
      context.freeName(fmt::format("{}_{}{}", path.stem().string(), what, path.extension().string()));
  std::vector<std::string> keywords = context.keywordsNaming(from);
  // A model that can't be written has its areas all the same.
  if (keywords.empty()) keywords.push_back(fileKeyword(number));
  for (const std::string& keyword : keywords) fix.settings.push_back({keyword, name});
  fix.files.push_back({from, absolutePath(name, folderOfFile(context.documentPath)), std::move(making)});
  return name;
}

std::string addPlacedArea(AdviceContext& context, AdviceFix& fix, int number, GridPoint origin,
                          AreaPlacing placing) {
  const int enclosing = context.model.bathymetry->GetArea(number)->enclosingArea;
  return addArea(context, fix,
                 {number, origin, placing, frameOf(*context.grid(enclosing)),
                  context.model.bathymetry->GetArea(enclosing)->fileName.absolute()});
}

}  // namespace gridbay
