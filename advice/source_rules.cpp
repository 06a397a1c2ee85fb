// Doubts about where sources and sinks lie.

#include <fmt/format.h>

#include <map>

#include "advice/free_water.h"
#include "advice/rules.h"
#include "basic/boundary.h"
#include "basic/source_sink.h"

namespace gridbay {
namespace {

using Source = CSourceSinkObjectKvs;

// The boundary that a point of area 1 lies in, from 1; 0 for none.
int boundaryAt(AdviceContext& context, GridPoint point) {
  for (int number = 1; number <= context.model.boundary->GetCount(); ++number) {
    const std::optional<GridRectangle> points = pointsOf(*context.model.boundary->GetItem(number));
    if (points && points->contains(point.j, point.k)) return number;
  }
  return 0;
}

// The free water of areas, made where it is asked for.
class FreeWaterOfAreas {
 public:
  explicit FreeWaterOfAreas(AdviceContext& context) : context_(context) {}
  const FreeWater& of(int area) { return areas_.try_emplace(area, context_, area).first->second; }

 private:
  AdviceContext& context_;
  std::map<int, FreeWater> areas_;
};

// One end of a pair, or a source or sink that stands alone.
struct End {
  int number;
  bool isSource;
  const Source& location;

  const char* what() const { return isSource ? "source" : "sink"; }
  const char* other() const { return isSource ? "sink" : "source"; }
  GridPoint point() const { return isSource ? location.source : location.sink; }
  int area() const { return isSource ? location.sourceArea : location.sinkArea; }
  std::string keyword(std::string_view name) const {
    return fmt::format("NESTED_MODEL_GLOBALS/SOURCE_AND_SINK/SOURCE_SINK_{}/{}", number, name);
  }
};

// To the nearest free water. Where there is none it goes, and of a pair the other end stays.
AdviceFix inWater(const FreeWater& water, const End& end, const std::string& keyword) {
  if (const std::optional<FreeWater::Place> free = water.nearest(end.point()))
    return {fmt::format("Move {} {} to {}, {:.6g} m away", end.what(), end.number, pointText(free->point),
                        free->metres),
            {{keyword, valueOf(free->point)}}};
  const bool isAlone = end.location.type == (end.isSource ? Source::kIsolatedSource : Source::kIsolatedSink);
  if (isAlone)
    return {fmt::format("{} {} out", capital(end.what()), end.number),
            {},
            {},
            AdviceRemoval{AdviceRemoval::List::source, end.number}};
  return {fmt::format("{} {} without its {}", capital(end.other()), end.number, end.what()),
          {{end.keyword("Type"),
            std::to_string(end.isSource ? Source::kIsolatedSink : Source::kIsolatedSource)}}};
}

void adviseEnd(AdviceContext& context, FreeWaterOfAreas& waters, const End& end) {
  const GridPoint point = end.point();
  const int area = end.area();
  const GridFacts* grid = context.grid(area);
  if (grid == nullptr || !grid->contains(point.j, point.k)) return;
  const int inBoundary = area == 1 ? boundaryAt(context, point) : 0;
  if (inBoundary == 0 && !grid->isOnBorder(point.j, point.k)) return;
  const std::string what = capital(end.what());
  const std::string keyword = end.keyword(end.isSource ? "Source_Point" : "Sink_Point");
  context.add(
      {{},
       inBoundary != 0
           ? fmt::format("{} {} at {} lies in boundary {}.", what, end.number, pointText(point), inBoundary)
           : fmt::format("{} {} at {} lies on the edge of area {}.", what, end.number, pointText(point),
                         area),
       inBoundary != 0 ? "The boundary gives the level or flux there, and what the source brings is lost."
                       : "The edge is not calculated: what enters there is lost.",
       placeOfEntry(PageId::sourceAndSink, end.what(), {end.number, context.model.sourceSink->GetCount()},
                    keyword, what),
       {.area = area, .points = {point}},
       inWater(waters.of(area), end, keyword)});
}

}  // namespace

void adviseSources(AdviceContext& context) {
  FreeWaterOfAreas waters(context);
  for (int number = 1; number <= context.model.sourceSink->GetCount(); ++number) {
    const Source& location = *context.model.sourceSink->GetItem(number);
    if (location.type != Source::kIsolatedSink) adviseEnd(context, waters, {number, true, location});
    if (location.type != Source::kIsolatedSource) adviseEnd(context, waters, {number, false, location});
  }
}

}  // namespace gridbay
