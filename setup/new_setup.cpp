#include "setup/new_setup.h"

#include <fmt/format.h>

#include <array>
#include <vector>

#include "basic/bathymetry.h"
#include "basic/boundary.h"
#include "core/edition.h"
#include "platform/tsb/tsb_file.h"

namespace gridbay {
namespace {

using GridSize = std::array<std::size_t, 2>;

// The number of the area that encloses one; where that isn't told it is the one before.
int enclosingOf(std::span<const NewArea> areas, std::size_t number) {
  return areas[number - 1].enclosing.value_or(static_cast<int>(number) - 1);
}

// What is wrong with the place of an area among those before it.
std::string faultOfPlace(std::span<const NewArea> areas, std::size_t number,
                         const std::vector<GridSize>& sizes) {
  const NewArea& area = areas[number - 1];
  if (number == 1) return area.origin || area.enclosing ? "The first area lies in no other" : "";
  if (!area.origin) return fmt::format("Area {} lies in another: say where its first point is", number);
  const auto [j, k] = *area.origin;
  if (j < 0 || k < 0) return fmt::format("Area {} cannot lie at {},{}: J and K count from 0", number, j, k);
  const int enclosing = enclosingOf(areas, number);
  if (enclosing < 1 || enclosing >= static_cast<int>(number)) {
    return fmt::format("Area {} cannot lie in area {}, but in one before it, {}", number, enclosing,
                       number == 2 ? "which is 1" : fmt::format("1 to {}", number - 1));
  }
  const auto [noJ, noK] = sizes[static_cast<std::size_t>(enclosing) - 1];
  if (static_cast<std::size_t>(j) < noJ && static_cast<std::size_t>(k) < noK) return {};
  return fmt::format("Area {} cannot lie at {},{}: area {} has {} x {} points", number, j, k, enclosing, noJ,
                     noK);
}

}  // namespace

std::optional<AreaFault> layAreas(CGlobalKvs& model, std::span<const NewArea> areas) {
  const std::size_t most = theEdition.wetlandSweepKit ? 1 : CBathymetryKvs::kMostAreas;
  if (areas.size() > most) {
    return AreaFault{fmt::format("The {} has at most {} area{}", theEdition.editorName.format, most,
                                 most == 1 ? "" : "s")};
  }
  std::vector<GridSize> sizes;
  for (std::size_t number = 1; number <= areas.size(); ++number) {
    if (std::string fault = faultOfPlace(areas, number, sizes); !fault.empty())
      return AreaFault{std::move(fault), number};
    const std::string& name = areas[number - 1].file;
    const Result<TsbFile> file = TsbFile::open(name);
    if (!file) return AreaFault{file.error(), number, true};
    const std::vector<TsbGridAxis>& axes = file->definition().axes;
    if (axes.size() != 2) return AreaFault{fmt::format("\"{}\" holds no map", name), number, true};
    sizes.push_back({axes[0].points, axes[1].points});
  }
  if (areas.empty()) return {};
  model.bathymetry->SetNoAreas(static_cast<int>(areas.size()));
  for (std::size_t number = 1; number <= areas.size(); ++number) {
    const NewArea& given = areas[number - 1];
    CBathymetryObjectKvs& area = *model.bathymetry->GetArea(static_cast<int>(number));
    area.fileName = given.file;
    if (!given.origin) continue;
    area.origin = *given.origin;
    area.enclosingArea = enclosingOf(areas, number);
  }
  followFirstGrid(model);
  return {};
}

void followFirstGrid(CGlobalKvs& model) {
  std::string projection;
  int coriolis = 0;
  model.bathymetry->GetProjection(&projection, &coriolis);
  model.boundary->RecalculateBoundaries();
}

}  // namespace gridbay
