#pragma once

#include <vector>

#include "platform/result.h"
#include "platform/tsb/tsb_types.h"

namespace gridbay {

// What a data file says of itself, and the variable of each item in the netCDF library.
struct TsbContent {
  TsbDefinition definition;
  std::vector<int> itemVariables;
};

// Reads both from a file that the library has open and that is fileSize bytes long. What is wrong is told of
// the file as "it": without its path.
Outcome readTsbContent(int file, double fileSize, TsbContent& content);

}  // namespace gridbay
