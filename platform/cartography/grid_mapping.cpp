#include "platform/cartography/grid_mapping.h"

#include <array>
#include <cmath>
#include <memory>
#include <numbers>
#include <span>

#include "platform/cartography/proj_objects.h"

namespace gridbay {
namespace {

using proj::Object;

// A parameter of a method, by the code of the EPSG data base, and the attribute that it stands in.
struct Parameter {
  int code;
  std::string_view attribute;
};

struct Method {
  int code;  // of the EPSG data base
  std::string_view name;
  std::array<Parameter, 7> parameters;  // those after the last have code 0
};

constexpr Method kMethods[] = {
    {9807,
     "transverse_mercator",
     {{{8801, "latitude_of_projection_origin"},
       {8802, "longitude_of_central_meridian"},
       {8805, "scale_factor_at_central_meridian"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
    {9802,
     "lambert_conformal_conic",
     {{{8823, "standard_parallel"},
       {8824, "standard_parallel"},
       {8822, "longitude_of_central_meridian"},
       {8821, "latitude_of_projection_origin"},
       {8826, "false_easting"},
       {8827, "false_northing"}}}},
    {9822,
     "albers_conical_equal_area",
     {{{8823, "standard_parallel"},
       {8824, "standard_parallel"},
       {8822, "longitude_of_central_meridian"},
       {8821, "latitude_of_projection_origin"},
       {8826, "false_easting"},
       {8827, "false_northing"}}}},
    {9820,
     "lambert_azimuthal_equal_area",
     {{{8802, "longitude_of_projection_origin"},
       {8801, "latitude_of_projection_origin"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
    {9804,
     "mercator",
     {{{8802, "longitude_of_projection_origin"},
       {8805, "scale_factor_at_projection_origin"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
    {9805,
     "mercator",
     {{{8802, "longitude_of_projection_origin"},
       {8823, "standard_parallel"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
    {9809,
     "stereographic",
     {{{8802, "longitude_of_projection_origin"},
       {8801, "latitude_of_projection_origin"},
       {8805, "scale_factor_at_projection_origin"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
    {9810,
     "polar_stereographic",
     {{{8802, "straight_vertical_longitude_from_pole"},
       {8801, "latitude_of_projection_origin"},
       {8805, "scale_factor_at_projection_origin"},
       {8806, "false_easting"},
       {8807, "false_northing"}}}},
};

class Reader {
 public:
  Reader(PJ_CONTEXT* context, GridMapping& mapping) : context_(context), mapping_(mapping) {}

  bool read(PJ* crs) {
    const PJ_TYPE type = proj_get_type(crs);
    if (type == PJ_TYPE_BOUND_CRS) {
      const Object source(proj_get_source_crs(context_, crs));
      return source && read(source.get());
    }
    if (type == PJ_TYPE_COMPOUND_CRS) {
      const Object horizontal(proj_crs_get_sub_crs(context_, crs, 0));
      return horizontal && read(horizontal.get());
    }
    if (type == PJ_TYPE_PROJECTED_CRS) {
      if (!readMethod(crs)) return false;
      putText("projected_crs_name", proj_get_name(crs));
    } else if (type == PJ_TYPE_GEOGRAPHIC_2D_CRS) {
      mapping_.name = kGeographicMapping;
    } else {
      return false;
    }
    readDatum(crs);
    return true;
  }

 private:
  bool readMethod(PJ* crs) {
    const Object conversion(proj_crs_get_coordoperation(context_, crs));
    const char* code = nullptr;
    if (!conversion ||
        proj_coordoperation_get_method_info(context_, conversion.get(), nullptr, nullptr, &code) == 0 ||
        code == nullptr) {
      return false;
    }
    for (const Method& method : kMethods) {
      if (std::to_string(method.code) != code) continue;
      mapping_.name = method.name;
      for (const Parameter& parameter : method.parameters) {
        if (parameter.code != 0 && !readParameter(conversion.get(), parameter)) return false;
      }
      return true;
    }
    return false;
  }

  bool readParameter(PJ* conversion, const Parameter& parameter) {
    const int count = proj_coordoperation_get_param_count(context_, conversion);
    for (int i = 0; i < count; ++i) {
      const char* code = nullptr;
      const char* kind = nullptr;
      double value = 0;
      double toBase = 1;
      if (proj_coordoperation_get_param(context_, conversion, i, nullptr, nullptr, &code, &value, nullptr,
                                        &toBase, nullptr, nullptr, nullptr, &kind) == 0 ||
          code == nullptr || std::to_string(parameter.code) != code) {
        continue;
      }
      // Angles come with their factor to radians, and are wanted in degrees.
      constexpr double kDegree = std::numbers::pi / 180;
      const bool isAngle = kind != nullptr && std::string_view(kind) == "angular";
      const bool isInDegrees = isAngle && std::abs(toBase - kDegree) < 1e-15;
      putNumber(parameter.attribute, isInDegrees ? value : value * toBase / (isAngle ? kDegree : 1));
      return true;
    }
    return false;
  }

  void readDatum(PJ* crs) {
    const Object geographic(proj_crs_get_geodetic_crs(context_, crs));
    const Object ellipsoid(proj_get_ellipsoid(context_, crs));
    const Object meridian(proj_get_prime_meridian(context_, crs));
    const Object datum(geographic ? proj_crs_get_datum_forced(context_, geographic.get()) : nullptr);
    double major = 0;
    double minor = 0;
    double inverseFlattening = 0;
    if (ellipsoid && proj_ellipsoid_get_parameters(context_, ellipsoid.get(), &major, &minor, nullptr,
                                                   &inverseFlattening) != 0) {
      putNumber("semi_major_axis", major);
      putNumber("semi_minor_axis", minor);
      if (inverseFlattening != 0) putNumber("inverse_flattening", inverseFlattening);
      putText("reference_ellipsoid_name", proj_get_name(ellipsoid.get()));
    }
    double longitude = 0;
    double toRadians = 0;
    if (meridian &&
        proj_prime_meridian_get_parameters(context_, meridian.get(), &longitude, &toRadians, nullptr) != 0) {
      putNumber("longitude_of_prime_meridian", longitude * toRadians * 180 / std::numbers::pi);
      putText("prime_meridian_name", proj_get_name(meridian.get()));
    }
    if (geographic) putText("geographic_crs_name", proj_get_name(geographic.get()));
    if (datum) putText("horizontal_datum_name", proj_get_name(datum.get()));
  }

  void putNumber(std::string_view name, double value) {
    if (mapping_.numbers.empty() || mapping_.numbers.back().first != name)
      mapping_.numbers.push_back({std::string(name), {}});
    mapping_.numbers.back().second.push_back(value);
  }
  void putText(const char* name, const char* text) {
    if (text != nullptr) mapping_.texts.emplace_back(name, text);
  }

  PJ_CONTEXT* context_;
  GridMapping& mapping_;
};

}  // namespace

std::optional<GridMapping> gridMappingOf(std::string_view wkt) {
  const proj::Context context = proj::quietContext();
  const Object crs(proj_create(context.get(), std::string(wkt).c_str()));
  GridMapping mapping;
  if (!crs || !Reader(context.get(), mapping).read(crs.get())) return std::nullopt;
  return mapping;
}

}  // namespace gridbay
