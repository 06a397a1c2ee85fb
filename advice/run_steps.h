#pragma once

#include <string_view>

#include "core/parameter_tree.h"

namespace gridbay {

inline constexpr std::string_view kPeriodPath = "NESTED_MODEL_GLOBALS/SIMULATION_PERIOD";

// How many of the first values of a keyword are time steps of the run: 1, 2 for "TRange", whose third is an
// interval, and 0 for any other keyword.
int runStepsIn(const Node& keyword);
// The whole number that a value is.
long long wholeOf(const Value& value);

}  // namespace gridbay
