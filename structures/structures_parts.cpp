#include "structures/structures_parts.h"

namespace gridbay {

StructureParts::StructureParts() = default;
StructureParts::~StructureParts() = default;

}  // namespace gridbay
