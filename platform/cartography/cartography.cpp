#include "platform/cartography/cartography.h"

#include <charconv>
#include <cmath>
#include <numbers>

#include "platform/cartography/proj_objects.h"

namespace gridbay {
namespace {

constexpr std::string_view kLocal = "Local Coordinates";
constexpr int kLocalId = 1;
constexpr int kLongitudeLatitudeId = 2;

// "UTM-32" and "UTM-32S" as the code of the projection on WGS 84; other texts as they are.
std::string libraryText(std::string_view text) {
  constexpr std::string_view kPrefix = "UTM-";
  if (!text.starts_with(kPrefix)) return std::string(text);
  const std::string_view rest = text.substr(kPrefix.size());
  int zone = 0;
  const auto [end, error] = std::from_chars(rest.data(), rest.data() + rest.size(), zone);
  const std::string_view side(end, static_cast<std::size_t>(rest.data() + rest.size() - end));
  if (error != std::errc() || zone < 1 || zone > 60 || (!side.empty() && side != "N" && side != "S"))
    return {};
  return "EPSG:" + std::to_string((side == "S" ? 32700 : 32600) + zone);
}

}  // namespace

struct CVdMapProjection::State {
  std::string text;
  proj::Context context;
  proj::Object crs;
  proj::Object fromGeographic;
};

CVdMapProjection::CVdMapProjection(std::string_view text) : state_(std::make_unique<State>()) {
  state_->text = text;
  if (IsLocal(text)) return;
  state_->context = proj::quietContext();
  PJ_CONTEXT* context = state_->context.get();
  proj::Object crs(proj_create(context, libraryText(text).c_str()));
  if (!crs || proj_is_crs(crs.get()) == 0) return;
  const proj::Object geographic(proj_crs_get_geodetic_crs(context, crs.get()));
  if (geographic) {
    const proj::Object there(
        proj_create_crs_to_crs_from_pj(context, geographic.get(), crs.get(), nullptr, nullptr));
    if (there) state_->fromGeographic.reset(proj_normalize_for_visualization(context, there.get()));
  }
  state_->crs = std::move(crs);
}

CVdMapProjection::CVdMapProjection(CVdMapProjection&&) noexcept = default;
CVdMapProjection& CVdMapProjection::operator=(CVdMapProjection&&) noexcept = default;
CVdMapProjection::~CVdMapProjection() = default;

std::string CVdMapProjection::IDtoProjectionString(int id) {
  if (id == kLocalId) return std::string(kLocal);
  return id == kLongitudeLatitudeId ? CVdMapProjection("EPSG:4326").GetProjectionString() : std::string();
}

bool CVdMapProjection::IsLocal(std::string_view text) {
  return text.empty() || text == kLocal || text.starts_with("LOCAL_CS");
}

bool CVdMapProjection::IsLocal() const {
  return IsLocal(state_->text);
}
double CVdMapProjection::MetresPerUnit() const {
  PJ_CONTEXT* context = state_->context.get();
  if (!state_->crs) return 1;
  // Of what has heights too, the part on the map.
  const proj::Object part(proj_get_type(state_->crs.get()) == PJ_TYPE_COMPOUND_CRS
                              ? proj_crs_get_sub_crs(context, state_->crs.get(), 0)
                              : nullptr);
  const proj::Object axes(proj_crs_get_coordinate_system(context, part ? part.get() : state_->crs.get()));
  double factor = 1;
  if (!axes || proj_cs_get_axis_info(context, axes.get(), 0, nullptr, nullptr, nullptr, &factor, nullptr,
                                     nullptr, nullptr) == 0)
    return 1;
  return factor;
}

bool CVdMapProjection::IsValid() const {
  return IsLocal() || state_->crs != nullptr;
}

std::string CVdMapProjection::Name() const {
  if (!state_->crs) return IsLocal() ? std::string(kLocal) : std::string();
  const char* name = proj_get_name(state_->crs.get());
  return name == nullptr ? std::string() : name;
}

std::string CVdMapProjection::GetProjectionString() const {
  if (!state_->crs) return IsLocal() ? std::string(kLocal) : std::string();
  const std::string text = wktOf(PJ_WKT1_ESRI);
  return text.empty() ? Wkt() : text;
}

std::string CVdMapProjection::Wkt() const {
  const std::string text = wktOf(PJ_WKT1_GDAL);
  return text.empty() ? Wkt2() : text;
}

std::string CVdMapProjection::Wkt2() const {
  return wktOf(PJ_WKT2_2019);
}

// On one line; empty where the form cannot tell the projection.
std::string CVdMapProjection::wktOf(int type) const {
  if (!state_->crs) return {};
  const char* options[] = {"MULTILINE=NO", nullptr};
  const char* text =
      proj_as_wkt(state_->context.get(), state_->crs.get(), static_cast<PJ_WKT_TYPE>(type), options);
  return text == nullptr ? std::string() : text;
}

bool CVdMapProjection::Geo2Proj(double longitude, double latitude, double* east, double* north) const {
  if (!state_->fromGeographic) return false;
  const PJ_COORD there =
      proj_trans(state_->fromGeographic.get(), PJ_FWD, proj_coord(longitude, latitude, 0, HUGE_VAL));
  if (!std::isfinite(there.xy.x) || !std::isfinite(there.xy.y)) return false;
  *east = there.xy.x;
  *north = there.xy.y;
  return true;
}

bool CVdMapProjection::Proj2Geo(double east, double north, double* longitude, double* latitude) const {
  if (!state_->fromGeographic) return false;
  const PJ_COORD there =
      proj_trans(state_->fromGeographic.get(), PJ_INV, proj_coord(east, north, 0, HUGE_VAL));
  if (!std::isfinite(there.lp.lam) || !std::isfinite(there.lp.phi)) return false;
  *longitude = there.lp.lam;
  *latitude = there.lp.phi;
  return true;
}

CVdCartography::CVdCartography(std::string_view projection, double originEast, double originNorth,
                               double rotation)
    : projection_(projection),
      originEast_(originEast),
      originNorth_(originNorth),
      cosine_(std::cos(rotation * std::numbers::pi / 180)),
      sine_(std::sin(rotation * std::numbers::pi / 180)) {}

bool CVdCartography::Proj2Geo(double east, double north, double* longitude, double* latitude) const {
  return projection_.Proj2Geo(east, north, longitude, latitude);
}

bool CVdCartography::Geo2Proj(double longitude, double latitude, double* east, double* north) const {
  return projection_.Geo2Proj(longitude, latitude, east, north);
}

void CVdCartography::Xy2Proj(double x, double y, double* east, double* north) const {
  *east = originEast_ + x * cosine_ + y * sine_;
  *north = originNorth_ - x * sine_ + y * cosine_;
}

void CVdCartography::Proj2Xy(double east, double north, double* x, double* y) const {
  const double e = east - originEast_;
  const double n = north - originNorth_;
  *x = e * cosine_ - n * sine_;
  *y = e * sine_ + n * cosine_;
}

std::string CVdPRJParser::Format(std::string_view projection) {
  return CVdMapProjection(projection).GetProjectionString();
}

}  // namespace gridbay
