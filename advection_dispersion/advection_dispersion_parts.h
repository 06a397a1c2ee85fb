#pragma once

#include <memory>

namespace gridbay {

// The transport of dissolved components, as members of the root. None is ever null while the root lives.
struct AdvectionDispersionParts {
  AdvectionDispersionParts();
  ~AdvectionDispersionParts();
};

}  // namespace gridbay
