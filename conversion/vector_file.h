#pragma once

#include <array>
#include <cstdint>
#include <string>
#include <variant>
#include <vector>

namespace gridbay {

// A file of points, lines and polygons with attributes, as geographic information systems read it.
enum class VectorShape { points, line, polygon };

// Nothing, or a value of its field's type.
using VectorValue = std::variant<std::monostate, std::int64_t, double, std::string>;

struct VectorFeature {
  std::vector<std::array<double, 2>> points;  // of a polygon without the first one again
  std::vector<VectorValue> values;            // in the order of the layer's fields
};

struct VectorLayer {
  enum class Type { whole, real, text };
  struct Field {
    std::string name;
    Type type;
  };

  std::string name;
  VectorShape shape = VectorShape::line;
  std::vector<Field> fields;
  std::vector<VectorFeature> features;
};

struct VectorFile {
  std::string projection;  // its full text; empty for none
  std::vector<VectorLayer> layers;
};

// The entry point of the module: writes a new GeoPackage; false with the reason.
inline constexpr const char* kWriteVectors = "gridbayWriteVectors";
using WriteVectors = bool (*)(const char* path, const VectorFile* file, std::string* error);

}  // namespace gridbay
