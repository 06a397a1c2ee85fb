#pragma once

#include <cstdint>
#include <string_view>

#include "core/file_name.h"
#include "core/kvs_base.h"
#include "core/message.h"
#include "core/page_id.h"
#include "core/selections.h"

// What the outputs of all modules have alike: a part of an area's grid, of the time steps, and a file whose
// kind follows from them. J, K and time steps from 0, the last ones included.

namespace gridbay {

// How far an output stretches: in no direction, in one, in both.
enum class Extent { point, line, map };

Extent extentOf(const USubArea& part);
// Whether a file name ends in an extension of that extent, "tsb2" or "tb2" for a map, letter by letter.
bool fitsExtent(std::string_view fileName, Extent extent);

// The last ones that there are; -1 for an area that does not exist, or whose grid has not been read.
struct ResultLimits {
  std::int32_t lastJ = -1;
  std::int32_t lastK = -1;
  std::int32_t lastStep = -1;
  bool hasArea = false;
};
// Of area `areaNumber`, from 1, in the object's model.
ResultLimits resultLimits(CKvsBase& object, int areaNumber);

// All that there is, with interval 1.
void takeWhole(const ResultLimits& limits, USubArea& part, USubLine& steps);

// The checks of an output, in the order in which they are made. They return the number of faults.
unsigned checkResultFileName(ValidationList& messages, PageId page, const FileNameValue& file);
unsigned checkResultPart(ValidationList& messages, PageId page, const ResultLimits& limits,
                         const USubArea& part, const USubLine& steps, const FileNameValue& file);

}  // namespace gridbay
