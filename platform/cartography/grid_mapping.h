#pragma once

#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace gridbay {

// A projection as the CF conventions tell it (their appendix F): the name of the grid mapping, its parameters
// (degrees, metres, ratios) and the names of what it rests on.
struct GridMapping {
  std::string name;
  std::vector<std::pair<std::string, std::vector<double>>> numbers;
  std::vector<std::pair<std::string, std::string>> texts;
};

// That of longitude and latitude without a projection.
inline constexpr std::string_view kGeographicMapping = "latitude_longitude";

// The grid mapping of a full projection text; nothing where the conventions have none for it.
std::optional<GridMapping> gridMappingOf(std::string_view wkt);

}  // namespace gridbay
