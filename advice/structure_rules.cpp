// Doubts about the lines of weirs, culverts and dikes.

#include <fmt/format.h>

#include <algorithm>

#include "advice/rules.h"
#include "basic/bathymetry.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {
namespace {

// A line in a projection. Of a very long one some of its points tell where it lies, with both ends.
struct Line {
  PageId page;
  std::string thing;
  std::string path;
  ListEntry entry;
  AdviceRemoval::List list;
  const std::string& projection;
  std::size_t size = 0;
  std::vector<AdviceSite::MapPoint> some = {};
  std::size_t firstEqual = 0;  // the number of the first point that lies where the one before it does
  std::size_t equal = 0;       // how many of them there are

  // The points, of which `at` gives each, from 0.
  void take(std::size_t count, auto at) {
    constexpr std::size_t kMost = 1000;
    size = count;
    const std::size_t step = (std::max<std::size_t>(count, 1) - 1) / kMost + 1;
    AdviceSite::MapPoint before;
    for (std::size_t i = 0; i < count; ++i) {
      const AdviceSite::MapPoint point = at(i);
      if (i % step == 0 || i + 1 == count) some.push_back(point);
      if (i > 0 && point == before && ++equal == 1) firstEqual = i + 1;
      before = point;
    }
  }
};

// A structure that takes no part any more: a dike is left out of use.
AdviceFix outOfUse(const Line& line) {
  if (line.list == AdviceRemoval::List::dike)
    return {fmt::format("{} out of use", capital(line.thing)), {{line.path + "/include", "0"}}};
  return {fmt::format("{} out", capital(line.thing)), {}, {}, AdviceRemoval{line.list, line.entry.number}};
}

// The line without the points that lie where the one before them does.
AdviceFix withoutEqualPoints(const Line& line) {
  return {line.equal == 1 ? fmt::format("Point {} of {} out", line.firstEqual, line.thing)
                          : fmt::format("{} equal points of {} out", line.equal, line.thing),
          {},
          {},
          AdviceRemoval{line.list, line.entry.number, AdviceRemoval::What::equalPoints}};
}

// Whether a line, in a projection, lies outside of area 1 for certain: all on one side. One may also pass
// through with no point inside. Nothing where that can't be told.
std::optional<bool> isOutside(AdviceContext& context, const Line& line, const std::string& projection) {
  const GridFacts* grid = context.grid(1);
  if (grid == nullptr) return std::nullopt;
  std::optional<std::vector<GridSpot>> spots = context.spotsOn(1, projection, line.some);
  if (!spots && CVdMapProjection::IsLocal(projection) && !grid->file.geography) {
    spots.emplace();
    for (const auto& [easting, northing] : line.some)
      spots->push_back({(easting - grid->file.axes[0].first) / grid->dx,
                        (northing - grid->file.axes[1].first) / grid->dy});
  }
  if (!spots) return std::nullopt;
  const auto beyond = [&](auto isBeyond) { return std::ranges::all_of(*spots, isBeyond); };
  const double half = 0.5;
  return beyond([&](GridSpot at) { return at.j < -half; }) ||
         beyond([&](GridSpot at) { return at.k < -half; }) ||
         beyond([&](GridSpot at) { return at.j > grid->noJ - half; }) ||
         beyond([&](GridSpot at) { return at.k > grid->noK - half; });
}

void adviseLine(AdviceContext& context, const Line& line) {
  const auto add = [&](std::string doubt, std::string reason, AdviceFix fix) {
    context.add({{},
                 std::move(doubt),
                 std::move(reason),
                 {.page = line.page,
                  .thing = line.thing,
                  .keyword = line.path + "/number_of_points",
                  .entries = {line.entry}},
                 {.projection = line.projection, .mapPoints = line.some},
                 std::move(fix)});
  };
  const std::string subject = capital(line.thing);
  if (line.size < 2) {
    return add(fmt::format("{} has {} point{}.", subject, line.size, line.size == 1 ? "" : "s"),
               "A line without two ends lies nowhere.", outOfUse(line));
  }
  if (line.equal > 0) {
    const bool isOnePlace = line.equal + 1 == line.size;
    add(fmt::format("Points {} and {} of {} are equal{}.", line.firstEqual - 1, line.firstEqual, line.thing,
                    line.equal == 1 ? "" : fmt::format(", and {} further ones like them", line.equal - 1)),
        "A piece of no length has no direction for the flow across it.",
        isOnePlace ? outOfUse(line) : withoutEqualPoints(line));
    if (isOnePlace) return;
  }
  if (isOutside(context, line, line.projection) != true) return;
  // Often the points were typed in the setup's own projection.
  const std::string& own = context.model.bathymetry->projection;
  const bool isOwn = !own.empty() && isOutside(context, line, own) == false;
  add(fmt::format("{} lies outside of all areas.", subject),
      isOwn ? "It has no effect. By the setup's own projection it would lie inside."
            : "It has no effect, unless its coordinates or its projection are wrong.",
      isOwn ? AdviceFix{fmt::format("Projection of {}: {}", line.thing, context.files.projection(own).Name()),
                        {{line.path + "/coordinate_type", own}}}
            : outOfUse(line));
}

void adviseLineStructures(AdviceContext& context, PageId page, auto& list, AdviceRemoval::List removal,
                          std::string_view what, std::string_view path) {
  for (int number = 1; number <= list.GetCount(); ++number) {
    const LineStructure& structure = *list.GetItem(number);
    Line line{
        page,    thingOf(what, number),   fmt::format(fmt::runtime(path), number), {number, list.GetCount()},
        removal, structure.coordinateType};
    line.take(std::min(structure.x.size(), structure.y.size()), [&](std::size_t i) {
      return AdviceSite::MapPoint{structure.x[i], structure.y[i]};
    });
    adviseLine(context, line);
  }
}

}  // namespace

void adviseStructures(AdviceContext& context) {
  constexpr std::string_view kStructures = "HYDRODYNAMIC_MODULE/STRUCTURE_MODULE";
  adviseLineStructures(context, PageId::weirs, *context.model.nhdWeir, AdviceRemoval::List::weir, "weir",
                       fmt::format("{}/WEIR/weir_data[{{}}]", kStructures));
  adviseLineStructures(context, PageId::culverts, *context.model.nhdCulvert, AdviceRemoval::List::culvert,
                       "culvert", fmt::format("{}/CULVERTS/Culvert_data[{{}}]", kStructures));
  CNhdDikeKvs& dikes = *context.model.nhdDike;
  for (int number = 1; number <= dikes.GetCount(); ++number) {
    const CNhdDikeObjectKvs& dike = *dikes.GetItem(number);
    if (dike.include == 0) continue;
    Line line{PageId::dikes,
              thingOf("dike", number),
              fmt::format("HYDRODYNAMIC_MODULE/STRUCTURES/DIKES/DIKE_{}", number),
              {number, dikes.GetCount()},
              AdviceRemoval::List::dike,
              dike.coordinateType};
    line.take(dike.points.size(), [&points = dike.points](std::size_t i) {
      return AdviceSite::MapPoint{points[i].x, points[i].y};
    });
    adviseLine(context, line);
  }
}

}  // namespace gridbay
