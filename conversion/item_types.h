#pragma once

#include <string>
#include <string_view>

#include "platform/result.h"
#include "platform/units/units.h"

namespace gridbay {

// The quantity that a text names: by its code, its name, or the beginning of a name that no other has; case
// ignored. The error lists what begins so, or suggests the nearest name and tells where
// the list of all is, as in "\"tool convert types\" lists them".
Result<const QunItem*> itemTypeOfText(std::string_view text, std::string_view where);

}  // namespace gridbay
