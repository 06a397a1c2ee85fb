#include "conversion/tsb_raster.h"

#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <limits>
#include <vector>

#include "conversion/moments.h"
#include "platform/cartography/cartography.h"
#include "platform/cartography/utm_zone.h"
#include "platform/tsb/tsb_file.h"
#include "platform/units/units.h"

namespace gridbay {
namespace {

class TsbRaster final : public Raster {
 public:
  TsbRaster(TsbFile file, std::size_t item)
      : file_(std::move(file)), item_(item), geography_(definition().geography) {
    if (geography_) geography_->projection = withUtmZone(geography_->projection, geography_->longitude);
  }

  int bands() const override { return item_ == 0 ? 0 : static_cast<int>(definition().time.count); }
  std::string bandName(int band) const override {
    return momentText(definition().time, static_cast<std::size_t>(band) - 1);
  }
  std::vector<std::string> subdatasets() const override {
    std::vector<std::string> items;
    for (const TsbItem& each : definition().items)
      items.push_back(fmt::format("{} [{}]", each.name, each.unit));
    return items;
  }
  std::vector<std::string> files() const override { return {file_.path()}; }
  std::string history() const override { return definition().history; }
  std::optional<int> itemType() const override { return definition().items[item_ - 1].type; }
  std::string unit() const override { return definition().items[item_ - 1].unit; }
  void choose(int band) override { step_ = static_cast<std::size_t>(band) - 1; }

  int columns() const override { return static_cast<int>(definition().axes[0].points); }
  int rows() const override { return static_cast<int>(definition().axes[1].points); }
  bool hasPlace() const override { return true; }

  // In metres where the axes are in another unit of length.
  RasterPlace place() const override {
    const auto [x, y] = std::pair(definition().axes[0], definition().axes[1]);
    const double dx = CVdUnitConverter(x.unit, "m").Convert(x.spacing);
    const double dy = CVdUnitConverter(y.unit, "m").Convert(y.spacing);
    RasterPlace where{
        {CVdUnitConverter(x.unit, "m").Convert(x.first), CVdUnitConverter(y.unit, "m").Convert(y.first)},
        {dx, 0},
        {0, dy}};
    const std::optional<TsbGeography>& geography = geography_;
    double east = 0;
    double north = 0;
    if (!geography || !CVdMapProjection(geography->projection)
                           .Geo2Proj(geography->longitude, geography->latitude, &east, &north)) {
      return where;
    }
    // The axes have the same place with more digits, unless another program has put something else there.
    constexpr double kSame = 1e-3;
    if (geography->isTurned() || std::abs(where.first[0] - east) > kSame * std::abs(dx) ||
        std::abs(where.first[1] - north) > kSame * std::abs(dy)) {
      where.first = {east, north};
    }
    if (geography->isTurned()) {
      const CVdCartography grid(geography->projection, 0, 0, geography->rotation);
      grid.Xy2Proj(dx, 0, &where.nextColumn[0], &where.nextColumn[1]);
      grid.Xy2Proj(0, dy, &where.nextRow[0], &where.nextRow[1]);
    }
    return where;
  }

  std::string otherUnit() const override {
    for (const TsbGridAxis& axis : definition().axes) {
      if (!qunAreEquivalent(axis.unit, "m")) return axis.unit;
    }
    return {};
  }
  std::string projection() const override { return geography_ ? geography_->projection : std::string(); }
  std::optional<double> missingValue() const override { return definition().items[item_ - 1].deleteValue; }

  std::optional<float> landValue() const override {
    constexpr std::size_t kPlace = 3;
    for (const TsbCustomBlock& block : definition().customBlocks) {
      if (block.name == "V27_Misc" && block.readable && block.values.size() > kPlace)
        return block.values[kPlace];
    }
    return {};
  }

  bool readWhole(int columnCount, int rowCount, std::span<float> values, std::string* error) override {
    std::vector<float> row(definition().axes[0].points);
    const auto nearest = [](std::size_t part, int parts, std::size_t all) {
      return (2 * part + 1) * all / (2 * static_cast<std::size_t>(parts));
    };
    const auto across = static_cast<std::size_t>(columnCount);
    for (std::size_t k = 0; k < static_cast<std::size_t>(rowCount); ++k) {
      if (!read(static_cast<int>(nearest(k, rowCount, definition().axes[1].points)), row, error))
        return false;
      for (std::size_t j = 0; j < across; ++j)
        values[k * across + j] = row[nearest(j, columnCount, row.size())];
    }
    return true;
  }

  bool read(int firstRow, std::span<float> values, std::string* error) override {
    const Outcome done = file_.readRows(item_, step_, static_cast<std::size_t>(firstRow), values);
    if (!done) *error = done.error();
    return static_cast<bool>(done);
  }

 private:
  const TsbDefinition& definition() const { return file_.definition(); }

  TsbFile file_;
  std::size_t item_;  // from 1; 0 as long as none is chosen
  std::size_t step_ = 0;
  std::optional<TsbGeography> geography_;  // with a zone where the file leaves it out
};

}  // namespace

bool isTsbRaster(const std::string& path) {
  std::error_code error;
  if (!std::filesystem::is_regular_file(path, error)) return false;
  const std::string extension = std::filesystem::path(path).extension().string();
  if (extension.starts_with(".tsb") || extension.starts_with(".tb")) return true;
  return static_cast<bool>(TsbFile::open(path));
}

Result<std::unique_ptr<Raster>> openTsbRaster(const std::string& path, int subdataset) {
  Result<TsbFile> file = TsbFile::open(path);
  if (!file) return Failure{file.error()};
  const TsbDefinition& definition = file->definition();
  constexpr std::size_t kMostPoints = std::numeric_limits<int>::max();
  if (definition.axisType() != TsbAxisType::d2 || definition.axes[0].points > kMostPoints ||
      definition.axes[1].points > kMostPoints || definition.time.count > kMostPoints) {
    return Failure{fmt::format("cannot read \"{}\": it holds no map", path)};
  }
  const std::size_t item = definition.items.size() == 1 ? 1 : static_cast<std::size_t>(subdataset);
  return std::unique_ptr<Raster>(std::make_unique<TsbRaster>(std::move(*file), item));
}

}  // namespace gridbay
