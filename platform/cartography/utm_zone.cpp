#include "platform/cartography/utm_zone.h"

#include <fmt/format.h>

#include <cmath>

namespace gridbay {

std::string withUtmZone(const std::string& projection, double longitude) {
  constexpr double kWidth = 6;  // degrees
  if (projection != "UTM") return projection;
  return fmt::format("{}-{:.0f}", projection, std::floor((longitude + 180) / kWidth + 1));
}

}  // namespace gridbay
