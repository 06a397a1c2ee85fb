#include "map/document_map.h"

#include "basic/bathymetry.h"
#include "core/edition.h"
#include "map/nested_grid.h"
#include "map/setup_map.h"

namespace gridbay {
namespace {

class DocumentMap final : public MapEditor {
 public:
  explicit DocumentMap(CV27SetupDoc& document) : document_(document) {}

  const MapScene& scene() override { return map_.scene(root()); }
  std::optional<MapPick> pick(MapPoint place, std::int32_t area) override { return map_.pick(place, area); }
  std::optional<PickedPlace> placeFor(const CellPick& cell, MapPoint place) override {
    return map_.placeFor(cell, place);
  }
  std::optional<MapPoint> placeOf(const CellPick& cell, const PickedPlace& held) override {
    return map_.placeOf(cell, held);
  }
  std::optional<std::array<double, 2>> geographic(MapPoint place) override { return map_.geographic(place); }

  AreaPlace previewMoveArea(std::int32_t number, MapPoint first) override {
    return map_.previewMoveArea(root(), number, first);
  }
  std::string moveArea(std::int32_t number, MapPoint first) override {
    return record([&] { return map_.moveArea(root(), number, first); });
  }
  AreaPlace previewNestedArea(MapPoint corner, MapPoint opposite) override {
    return map_.previewNestedArea(root(), corner, opposite);
  }
  std::string addNestedArea(MapPoint corner, MapPoint opposite, const std::string& raster,
                            const std::string& file) override {
    if (std::string fault = SetupMap::noMoreAreas(root()); !fault.empty()) return fault;
    const AreaPlace place = map_.previewNestedArea(root(), corner, opposite);
    if (!place.fault.empty()) return place.fault;
    // Copies, as the map is drawn, and the document may even be gone, while the work lets the program go on.
    const MapScene scene = map_.scene(root());
    const std::string projection = map_.coordinates().text();
    std::string fault;
    const std::weak_ptr<const bool> alive = alive_;
    document_.host().doLongWork("Cutting the grid of the new area", [&](const Progress& progress) {
      const Outcome cut = cutNestedGrid(projection, scene, place, raster, file,
                                        [&](double done) { return progress(done) && !alive.expired(); });
      if (!cut) fault = cut.error();
    });
    if (alive.expired()) return "The setup was closed meanwhile";
    if (!fault.empty()) return fault;
    return record([&] { return map_.addArea(root(), place.enclosing, place.origin, file); });
  }

  VertexPlace previewVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) override {
    return map_.previewVertex(root(), feature, vertex, place);
  }
  std::string moveVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) override {
    return record([&] { return map_.moveVertex(root(), feature, vertex, place); });
  }
  std::string insertVertex(MapFeatureId feature, std::size_t vertex, MapPoint place) override {
    return record([&] { return map_.insertVertex(root(), feature, vertex, place); });
  }
  std::string removeVertex(MapFeatureId feature, std::size_t vertex) override {
    return record([&] { return map_.removeVertex(root(), feature, vertex); });
  }
  FeaturePlace previewFeature(MapKind kind, const std::vector<MapPoint>& points, std::int32_t page) override {
    return map_.previewFeature(root(), kind, points, page);
  }
  std::string addFeature(MapKind kind, const std::vector<MapPoint>& points, std::int32_t page) override {
    return record([&] { return map_.addFeature(root(), kind, points, page); });
  }
  std::string removeFeature(MapFeatureId feature) override {
    return record([&] { return map_.removeFeature(root(), feature); });
  }

 private:
  CGlobalKvs& root() { return document_.root(); }

  template <class Edit>
  std::string record(Edit edit) {
    MapEdit made;
    if (!document_.Attempt([&] { made = edit(); })) return "The edit could not be made";
    if (!made.fault.empty()) return made.fault;
    document_.Touch(made.page);
    document_.SetModifiedFlag();
    document_.RecordEdit(made.page, made.name);
    document_.UpdateAllViews(nullptr);
    return {};
  }

  CV27SetupDoc& document_;
  SetupMap map_;
  std::shared_ptr<const bool> alive_ = std::make_shared<const bool>(true);
};

}  // namespace

std::unique_ptr<MapEditor> makeMapEditor(CV27SetupDoc& document) {
  return std::make_unique<DocumentMap>(document);
}

}  // namespace gridbay
