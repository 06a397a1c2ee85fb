#include "ecology/ecology_parts.h"

#include "ecology/pending.h"

namespace gridbay {

EcologyParts::EcologyParts() = default;
EcologyParts::~EcologyParts() = default;

}  // namespace gridbay
