#include "structures/structures_parts.h"

#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {

StructureParts::StructureParts() = default;
StructureParts::~StructureParts() = default;

}  // namespace gridbay
