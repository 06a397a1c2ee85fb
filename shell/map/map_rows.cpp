#include "shell/map/map_rows.h"

#include <algorithm>
#include <array>

#include "core/page_id.h"

namespace gridbay::shell {
namespace {

constexpr std::array kBoundaryPages{PageId::hdBoundary, PageId::adBoundary, PageId::mtBoundary,
                                    PageId::mtExpBoundary, PageId::ecoBoundary};
constexpr std::array kSourcePages{PageId::hdSourceAndSink, PageId::adSourceSink, PageId::mtSourceSink,
                                  PageId::mtExpSources, PageId::ecoSourceSink};

bool isIn(const auto& pages, std::int32_t page) {
  return std::ranges::find(pages, static_cast<PageId>(page)) != pages.end();
}

// The entry that a cell tells of, from 1: an entry may have several rows of the first table. The second table
// of boundaries has a column for each.
int entryOf(const MapScene& scene, MapKind kind, const PagePane::Cell& cell) {
  if (cell.table > 1) return kind == MapKind::boundary ? cell.column : 0;
  const int rowsOfEach = std::max(1, cell.rows / std::max(1, countOf(scene, kind)));
  return cell.row < 1 ? 0 : (cell.row - 1) / rowsOfEach + 1;
}

}  // namespace

bool isFurtherPageOf(MapKind kind, std::int32_t page) {
  return (kind == MapKind::boundary && isIn(kBoundaryPages, page)) ||
         (kind == MapKind::source && isIn(kSourcePages, page));
}

int countOf(const MapScene& scene, MapKind kind) {
  return static_cast<int>(
      std::ranges::count(scene.features, kind, [](const MapFeature& feature) { return feature.id.kind; }));
}

bool tellsOf(const MapScene& scene, std::int32_t page, const PagePane::Cell& cell,
             const MapFeature& feature) {
  if (cell.row < 1) return false;
  if (isFurtherPageOf(feature.id.kind, page))
    return entryOf(scene, feature.id.kind, cell) == feature.id.number;
  if (feature.id.page != page) return false;
  return feature.row > 0 ? feature.row == cell.row : feature.column == cell.column;
}

}  // namespace gridbay::shell
