#pragma once

#include "cli/info_report.h"
#include "setup/global_kvs.h"

namespace gridbay::cli {

// What a setup says of the flow calculation, topic by topic; values in base units.
Json describeHydrodynamics(CGlobalKvs& model);
// The same for a reader, from what was described.
void printHydrodynamics(const Json& report, const Line& line);

// Likewise of the module that runs beside it.
Json describeModule(CGlobalKvs& model);
void printModule(std::int32_t moduleCode, const Json& report, const Line& line);

}  // namespace gridbay::cli
