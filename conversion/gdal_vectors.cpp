#include <cpl_error.h>
#include <gdal.h>
#include <ogr_api.h>
#include <ogr_srs_api.h>

#include <memory>

#include "conversion/gdal_files.h"
#include "conversion/vector_file.h"

namespace gridbay {
namespace {

struct FreeReference {
  void operator()(OGRSpatialReferenceH reference) const { OSRDestroySpatialReference(reference); }
};
struct FreeFeature {
  void operator()(OGRFeatureH feature) const { OGR_F_Destroy(feature); }
};
struct FreeGeometry {
  void operator()(OGRGeometryH geometry) const { OGR_G_DestroyGeometry(geometry); }
};
using Reference = std::unique_ptr<std::remove_pointer_t<OGRSpatialReferenceH>, FreeReference>;
using Feature = std::unique_ptr<std::remove_pointer_t<OGRFeatureH>, FreeFeature>;
using Geometry = std::unique_ptr<std::remove_pointer_t<OGRGeometryH>, FreeGeometry>;

OGRwkbGeometryType typeOf(VectorShape shape) {
  if (shape == VectorShape::polygon) return wkbPolygon;
  return shape == VectorShape::line ? wkbLineString : wkbMultiPoint;
}

OGRFieldType typeOf(VectorLayer::Type type) {
  if (type == VectorLayer::Type::whole) return OFTInteger64;
  return type == VectorLayer::Type::real ? OFTReal : OFTString;
}

Geometry geometryOf(VectorShape shape, const std::vector<std::array<double, 2>>& points) {
  Geometry geometry(OGR_G_CreateGeometry(typeOf(shape)));
  if (shape == VectorShape::points) {
    for (const auto& point : points) {
      OGRGeometryH one = OGR_G_CreateGeometry(wkbPoint);
      OGR_G_SetPoint_2D(one, 0, point[0], point[1]);
      OGR_G_AddGeometryDirectly(geometry.get(), one);
    }
    return geometry;
  }
  OGRGeometryH line = shape == VectorShape::polygon ? OGR_G_CreateGeometry(wkbLinearRing) : geometry.get();
  for (const auto& point : points) OGR_G_AddPoint_2D(line, point[0], point[1]);
  if (shape == VectorShape::polygon) {
    OGR_G_CloseRings(line);
    OGR_G_AddGeometryDirectly(geometry.get(), line);
    OGR_G_CloseRings(geometry.get());
  }
  return geometry;
}

bool writeLayer(GDALDatasetH dataset, const VectorLayer& layer, OGRSpatialReferenceH reference) {
  OGRLayerH out =
      GDALDatasetCreateLayer(dataset, layer.name.c_str(), reference, typeOf(layer.shape), nullptr);
  if (out == nullptr) return false;
  for (const VectorLayer::Field& field : layer.fields) {
    OGRFieldDefnH definition = OGR_Fld_Create(field.name.c_str(), typeOf(field.type));
    const OGRErr made = OGR_L_CreateField(out, definition, 0);
    OGR_Fld_Destroy(definition);
    if (made != OGRERR_NONE) return false;
  }
  for (const VectorFeature& each : layer.features) {
    const Feature feature(OGR_F_Create(OGR_L_GetLayerDefn(out)));
    for (int i = 0; i < static_cast<int>(each.values.size()); ++i) {
      const auto& value = each.values[static_cast<std::size_t>(i)];
      if (const auto* whole = std::get_if<std::int64_t>(&value))
        OGR_F_SetFieldInteger64(feature.get(), i, *whole);
      if (const auto* real = std::get_if<double>(&value)) OGR_F_SetFieldDouble(feature.get(), i, *real);
      if (const auto* text = std::get_if<std::string>(&value))
        OGR_F_SetFieldString(feature.get(), i, text->c_str());
    }
    OGR_F_SetGeometry(feature.get(), geometryOf(layer.shape, each.points).get());
    if (OGR_L_CreateFeature(out, feature.get()) != OGRERR_NONE) return false;
  }
  return true;
}

bool write(const char* path, const VectorFile& file) {
  GDALDriverH driver = GDALGetDriverByName("GPKG");
  if (driver == nullptr) {
    CPLError(CE_Failure, CPLE_AppDefined, "the installed library writes no GeoPackages");
    return false;
  }
  Dataset dataset(GDALCreate(driver, path, 0, 0, 0, GDT_Unknown, nullptr));
  if (!dataset) return false;
  Reference reference;
  if (!file.projection.empty()) {
    reference.reset(OSRNewSpatialReference(file.projection.c_str()));
    if (reference) OSRSetAxisMappingStrategy(reference.get(), OAMS_TRADITIONAL_GIS_ORDER);
  }
  if (GDALDatasetStartTransaction(dataset.get(), FALSE) != OGRERR_NONE) return false;
  for (const VectorLayer& layer : file.layers) {
    if (!writeLayer(dataset.get(), layer, reference.get())) return false;
  }
  if (GDALDatasetCommitTransaction(dataset.get()) != OGRERR_NONE) return false;
  CPLErrorReset();
  dataset.reset();
  return CPLGetLastErrorType() < CE_Failure;
}

}  // namespace
}  // namespace gridbay

extern "C" bool gridbayWriteVectors(const char* path, const gridbay::VectorFile* file, std::string* error) {
  GDALAllRegister();
  CPLSetErrorHandler(CPLQuietErrorHandler);
  CPLErrorReset();
  if (gridbay::write(path, *file)) return true;
  *error = CPLGetLastErrorMsg();
  if (error->empty()) *error = "the library gives no reason";
  return false;
}
