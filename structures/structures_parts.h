#pragma once

#include <memory>

namespace gridbay {

// Weirs, culverts and dikes, as members of the root. None is ever null while the root lives.
struct StructureParts {
  StructureParts();
  ~StructureParts();
};

}  // namespace gridbay
