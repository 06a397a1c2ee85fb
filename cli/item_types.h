#pragma once

#include <string>
#include <string_view>

#include "platform/result.h"
#include "platform/units/units.h"

namespace gridbay::cli {

// The quantity that a text names: by its code, its name, or the beginning of a name that no other has; case
// ignored. The error lists what begins so, or suggests the nearest name.
Result<const QunItem*> itemTypeOfText(std::string_view text);

}  // namespace gridbay::cli
