#pragma once

#include <memory>
#include <string>
#include <string_view>

namespace gridbay {

// A map projection by its text: "UTM-32" (or "UTM-32S" south of the equator), a full projection text (WKT), a
// code as "EPSG:28356", or a PROJ string. Local coordinates, and an empty text, have no place on the earth.
class CVdMapProjection {
 public:
  explicit CVdMapProjection(std::string_view text);
  CVdMapProjection(CVdMapProjection&&) noexcept;
  CVdMapProjection& operator=(CVdMapProjection&&) noexcept;
  ~CVdMapProjection();

  // The projection of an identifier: 1 local coordinates, 2 longitude and latitude on WGS 84; else empty.
  static std::string IDtoProjectionString(int id);

  // Whether the text names a projection; a local one does.
  bool IsValid() const;
  // Of its easting and northing; 1 for local coordinates, and where nothing is said.
  double MetresPerUnit() const;
  static bool IsLocal(std::string_view text);
  bool IsLocal() const;
  // A short name for people, as "WGS 84 / UTM zone 32N".
  std::string Name() const;
  // The full projection text on one line; that of local coordinates is their name.
  std::string GetProjectionString() const;
  // The full projection text in the form that map data files carry (WKT1 of GDAL); empty when local.
  std::string Wkt() const;
  // The same in the second version of that form (WKT2 of 2019).
  std::string Wkt2() const;

  // Longitude and latitude (degrees, on the projection's own datum) to easting and northing (metres), and
  // back. False, with the results left alone, for local coordinates and for points that the projection cannot
  // hold.
  bool Geo2Proj(double longitude, double latitude, double* east, double* north) const;
  bool Proj2Geo(double east, double north, double* longitude, double* latitude) const;

 private:
  std::string wktOf(int type) const;

  struct State;
  std::unique_ptr<State> state_;
};

// A grid's place on a map: an origin in the projection (metres) and a rotation (degrees, clockwise from
// north).
class CVdCartography {
 public:
  CVdCartography(std::string_view projection, double originEast, double originNorth, double rotation);

  bool Proj2Geo(double east, double north, double* longitude, double* latitude) const;
  bool Geo2Proj(double longitude, double latitude, double* east, double* north) const;
  // Grid coordinates (metres from the origin) to the projection and back.
  void Xy2Proj(double x, double y, double* east, double* north) const;
  void Proj2Xy(double east, double north, double* x, double* y) const;

 private:
  CVdMapProjection projection_;
  double originEast_;
  double originNorth_;
  double cosine_;
  double sine_;
};

class CVdPRJParser {
 public:
  // A projection text of any form as the full text of a projection file; empty where it names none.
  static std::string Format(std::string_view projection);
};

}  // namespace gridbay
