#pragma once

#include <string>

namespace gridbay {

// A projection that is told as "UTM" alone gets the zone that a longitude (degrees) lies in; others stay.
std::string withUtmZone(const std::string& projection, double longitude);

}  // namespace gridbay
