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
                            const std::string& file, const std::function<bool(double)>& progress) override {
    if (std::string fault = SetupMap::noMoreAreas(root()); !fault.empty()) return fault;
    const AreaPlace place = map_.previewNestedArea(root(), corner, opposite);
    if (!place.fault.empty()) return place.fault;
    // A copy, as the progress may bring another scene.
    const MapScene scene = map_.scene(root());
    const Outcome cut = cutNestedGrid(map_, scene, place, raster, file, progress);
    if (!cut) return cut.error();
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
  std::string addFeature(MapKind kind, const std::vector<MapPoint>& points) override {
    return record([&] { return map_.addFeature(root(), kind, points); });
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
};

}  // namespace

std::unique_ptr<MapEditor> makeMapEditor(CV27SetupDoc& document) {
  return std::make_unique<DocumentMap>(document);
}

}  // namespace gridbay
