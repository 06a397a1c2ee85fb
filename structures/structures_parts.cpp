#include "structures/structures_parts.h"

#include "structures/dike.h"

namespace gridbay {

StructureParts::StructureParts() = default;
StructureParts::~StructureParts() = default;

}  // namespace gridbay
