#pragma once

#include <string>

#include "platform/tsb/tsb_types.h"

namespace gridbay {

// When a time step is, for people: "2020-01-01 00:00:02.5" on a calendar axis, else "2.5 s". Empty for a
// moment that the calendar does not have.
std::string momentText(const TsbTimeAxis& axis, std::size_t step);

}  // namespace gridbay
