#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "platform/result.h"

namespace gridbay {

// A projection of the library's own data base, or longitude and latitude on a datum.
struct KnownProjection {
  std::string code;  // "EPSG:28356"
  std::string name;  // "GDA94 / MGA zone 56"
  std::string area;  // where it is meant to be used
};

// The projections whose code, name and area have words that begin so, in any order and case: at most so many,
// the likeliest first. Words and numbers count apart, so that "utm32n" finds zone 32N. Those that are
// withdrawn, and those of other planets, are left out; no words find none. The first call reads the data
// base.
std::vector<KnownProjection> findProjections(std::string_view words, std::size_t most);

// A projection as setups and data files hold it: a northern zone of UTM on WGS 84 by its short name, as
// "UTM-32", any other as its full text. It is given by its code (the number alone is one of EPSG), its short
// or full name or its full text; local coordinates are one. An error for what names none.
Result<std::string> projectionText(std::string_view code);

}  // namespace gridbay
