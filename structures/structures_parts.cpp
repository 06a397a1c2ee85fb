#include "structures/structures_parts.h"

#include "core/model_root.h"
#include "core/table_code.h"
#include "structures/culvert.h"
#include "structures/dike.h"
#include "structures/weir.h"

namespace gridbay {

StructureParts::StructureParts() = default;
StructureParts::~StructureParts() = default;

void StructureParts::create(CKvsBase& root) {
  makeMembers(root, nhdWeir, nhdCulvert, nhdDike);
}

}  // namespace gridbay
